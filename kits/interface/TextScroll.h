// SPDX-License-Identifier: MIT
// What a text view tells itself.
#ifndef KITS_INTERFACE_TEXT_SCROLL_H
#define KITS_INTERFACE_TEXT_SCROLL_H

#include <SupportDefs.h>

namespace BPrivate {

// While the pointer selects beyond the view's edge.
constexpr uint32 kMsgScrollOn = '_TSc';

} // namespace BPrivate

#endif // KITS_INTERFACE_TEXT_SCROLL_H

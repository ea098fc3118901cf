// SPDX-License-Identifier: MIT
// How the program's menus look, as get_menu_info() tells it.
#ifndef INTERFACE_MENU_INFO_H
#define INTERFACE_MENU_INFO_H

#include <Font.h>

namespace BPrivate {

/// The font of new menus. Any thread.
BFont MenuFont();

} // namespace BPrivate

#endif // INTERFACE_MENU_INFO_H

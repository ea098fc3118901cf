// SPDX-License-Identifier: MIT
// The arrow heads of scroll bars and outline lists.
#ifndef KITS_INTERFACE_ARROW_LOOK_H
#define KITS_INTERFACE_ARROW_LOOK_H

#include <GraphicsDefs.h>
#include <Rect.h>

class BView;

namespace BPrivate {

enum class ArrowDirection { kLeft, kRight, kUp, kDown };

/// A filled arrow head in the middle of \a frame; \a size is half its base, in pixels.
void DrawArrowHead(BView* view, BRect frame, ArrowDirection direction, float size, rgb_color color);

} // namespace BPrivate

#endif // KITS_INTERFACE_ARROW_LOOK_H

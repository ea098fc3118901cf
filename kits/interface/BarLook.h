// SPDX-License-Identifier: MIT
// How the parts of sliders, status bars and tabs are drawn; see ControlLook.h.
#ifndef KITS_INTERFACE_BAR_LOOK_H
#define KITS_INTERFACE_BAR_LOOK_H

#include <InterfaceDefs.h>
#include <Rect.h>
#include <TabView.h>

#include "ControlLook.h"

namespace BPrivate {

/// A bar with a thin border. \a filled, a part of \a frame, has a colour of its own; invalid for none.
void DrawBar(BView* view, BRect frame, rgb_color color, BRect filled, rgb_color fillColor);

/// The thumb of a slider that moves along \a direction.
void DrawBlockThumb(BView* view, BRect frame, orientation direction, ControlState state);
/// Its tip is up, or to the left for a vertical slider.
void DrawTriangleThumb(BView* view, BRect frame, orientation direction, ControlState state);

/// What a tab is filled with: the colour of what it opens onto when it is selected.
rgb_color TabColor(const BView* view, bool selected, bool enabled);
/// The border of tabs and of the box they belong to.
rgb_color TabBorderColor(const BView* view);
/// A tab whose side away from the box has round corners. It is open to the box when it is selected.
void DrawTabSurface(BView* view, BRect frame, BTabView::tab_side side, bool selected, bool enabled);

/// A small arrow in the middle of \a frame; \a dx and \a dy, one of them 0, are where it points.
void DrawArrow(BView* view, BRect frame, int32 dx, int32 dy, bool enabled);

/// What stands above or beside a bar needs this height, right minus left as everywhere.
float TextLineHeight(const BView* view);

} // namespace BPrivate

#endif // KITS_INTERFACE_BAR_LOOK_H

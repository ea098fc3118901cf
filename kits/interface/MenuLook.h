// SPDX-License-Identifier: MIT
// How menus are drawn: derived from the system colours, in the manner of the controls.
#ifndef INTERFACE_MENU_LOOK_H
#define INTERFACE_MENU_LOOK_H

#include <GraphicsDefs.h>
#include <Rect.h>
#include <String.h>

class BView;

namespace BPrivate {

/// The border around an open menu, and the space between it and the items, in pixels.
const float kMenuBorder = 1;
const float kMenuPadding = 2;
/// The space that the mark takes at the left of an item, and the arrow at its right.
const float kMarkWidth = 18;
const float kArrowWidth = 18;
/// The least space between a label and its shortcut.
const float kShortcutGap = 18;

rgb_color MenuBackgroundColor();
/// What lies behind an item.
rgb_color MenuItemBackground(bool selected);
rgb_color MenuTextColor(bool enabled, bool selected);
/// Of lines that part items, and of the border.
rgb_color MenuLineColor();
rgb_color MenuBorderColor();

/// "Ctrl+Shift+S": the keys of the user's keyboard that \a shortcut stands for. Empty for none.
BString ShortcutText(char shortcut, uint32 modifiers);

/// The tick of a marked item, and the arrow of one that leads to a submenu, in a square of the item.
void DrawMenuTick(BView* view, BRect square, rgb_color color);
void DrawMenuArrow(BView* view, BRect square, rgb_color color);
/// The arrow that says that a menu field opens.
void DrawDropDownArrow(BView* view, BRect square, rgb_color color);
/// The arrow of a long menu's end, for scrolling.
void DrawScrollArrow(BView* view, BRect frame, bool up, bool active);

} // namespace BPrivate

#endif // INTERFACE_MENU_LOOK_H

// SPDX-License-Identifier: MIT
// The gallery's menus.
#ifndef GALLERY_MENUS_H
#define GALLERY_MENUS_H

class BMenu;
class BMenuBar;
class BWindow;

/// The window's menu bar. Its items send the window what Commands.h lists.
BMenuBar* MakeMenuBar(BWindow* window);

/// What a menu can hold: a mark, a disabled item, shortcuts, submenus.
BMenu* MakeSampleMenu(const char* name);

#endif // GALLERY_MENUS_H

// SPDX-License-Identifier: MIT
// What menus and items keep, and what the kit's classes do with them beyond the public classes.
#ifndef INTERFACE_MENU_PRIVATE_H
#define INTERFACE_MENU_PRIVATE_H

#include <atomic>
#include <vector>

#include <Menu.h>
#include <MenuItem.h>
#include <Messenger.h>
#include <Rect.h>
#include <Size.h>
#include <String.h>

class BWindow;

namespace BPrivate {

/// Internal messages to a menu bar: its items changed, so that shortcuts and targets may have.
const uint32 kMsgInstallItems = '_MIn';

/// The fields of a menu. With the lock of its looper, if it has one.
class MenuData {
public:
	explicit MenuData(menu_layout layout)
		: layout(layout)
	{
	}

	menu_layout layout;
	std::vector<BMenuItem*> items;
	BMenuItem* superitem = nullptr;
	/// The bar at the root while that is in a window, and that window: the target of items without one.
	BMenu* root = nullptr;
	BMessenger target;

	float left = 0;
	float top = 0;
	float right = 0;
	float bottom = 0;
	float maxContentWidth = 0;
	/// The least width of the open menu, for a menu field's.
	float minWidth = 0;
	/// Of a matrix.
	BSize matrixSize;
	std::atomic<bool> enabled{true};
	bool radioMode = false;
	bool labelFromMarked = false;
	bool triggersEnabled = true;
	bool isBar = false;
	/// A bar that takes the size that its items need.
	bool resizeToFit = false;
	/// Of a menu field: it shows the field's choice, and stretches its only item.
	bool isFieldBar = false;

	bool isLaidOut = false;
	/// With borders, in the right - left sense.
	BSize size;
	float ascent = 0;
	float textHeight = 0;
	/// The width of the widest shortcut, with the gap before it; 0: there is none.
	float shortcutWidth = 0;
	BMenuItem* selected = nullptr;
};


/// The fields of an item. With the lock of its menu's looper, if that has one.
class MenuItemData {
public:
	BString label;
	BMenu* super = nullptr;
	BMenu* submenu = nullptr;
	BRect frame;
	char shortcut = 0;
	uint32 modifiers = 0;
	/// What the program chose, and what the item has; its place in the label in bytes, -1 for none.
	char wantedTrigger = 0;
	char trigger = 0;
	int32 triggerIndex = -1;
	bool marked = false;
	std::atomic<bool> enabled{true};
	bool selected = false;
	/// No other item has had it: tells an item from a later one at the same address.
	uint64 serial = 0;
};


/// The lock of the looper that a menu is in; nothing for a menu that is in none.
class MenuLock {
public:
	explicit MenuLock(const BMenu* menu);
	~MenuLock();

	/// Whether the menu is in a looper, where it stays as long as this exists.
	bool IsLocked() const { return fLooper != nullptr; }

	MenuLock(const MenuLock&) = delete;
	MenuLock& operator=(const MenuLock&) = delete;

private:
	BLooper* fLooper;
};


/// The private side of menus and items. Menu locked.
class MenuModel {
public:
	static MenuData& Of(const BMenu* menu) { return *menu->fData; }
	static MenuItemData& Of(const BMenuItem* item) { return *item->fData; }

	// Layout
	static void LayOut(BMenu* menu);
	/// The items or what they show changed: lays out anew, and shows it where the menu is shown.
	static void Changed(BMenu* menu);
	static void Redraw(BMenuItem* item);
	/// Menu coordinates; null between and outside of items.
	static BMenuItem* ItemAt(BMenu* menu, BPoint where);

	// Choosing
	/// Where the keys begin: the present choice of a menu that has one, else the first or last item.
	static BMenuItem* StartForKeys(BMenu* menu, bool forward);
	/// The next item from \a from (null: from the end) that can be chosen, around the end; null for none.
	static BMenuItem* Next(BMenu* menu, const BMenuItem* from, bool forward);
	static bool CanBeChosen(const BMenuItem* item);
	static BMenuItem* ItemForTrigger(BMenu* menu, char letter);
	/// Null selects none.
	static void Select(BMenu* menu, BMenuItem* item);
	/// Whether the item is in \a menu or below.
	static bool Contains(const BMenu* menu, const BMenuItem* item);
	static status_t Invoke(BMenuItem* item) { return item->Invoke(); }

	// Opening
	static BPoint ScreenLocation(BMenu* menu) { return menu->ScreenLocation(); }
	/// Lets the program add its items.
	static void AddDynamicItems(BMenu* menu, const std::atomic<bool>& aborted);
	/// Takes the menu, and those that are open below it, out of the windows that show them.
	static void CloseWindows(BMenu* menu);

	// Being in a window by way of a bar
	/// The items of \a bar and below get their shortcuts, and targets where they have none.
	static void Install(BMenu* bar, BWindow* window);
	static void Uninstall(BMenu* bar, BWindow* window);
	/// After a change somewhere below a bar.
	static void InstallAgain(BMenu* menu);

	static void DrawItem(BMenuItem* item) { item->Draw(); }
	static void GetContentSize(BMenuItem* item, float* width, float* height)
	{
		item->GetContentSize(width, height);
	}

private:
	static void LayOutColumn(BMenu* menu);
	static void LayOutRow(BMenu* menu);
	static void ChooseTriggers(BMenu* menu);
	static void InstallItems(BMenu* menu, BMenu* root, const BMessenger& target);
	static void AddShortcuts(BMenu* menu, BMenu* root, BWindow* window);
	static void UninstallItems(BMenu* menu);
};

} // namespace BPrivate

#endif // INTERFACE_MENU_PRIVATE_H

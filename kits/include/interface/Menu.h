// SPDX-License-Identifier: MIT
// A list of choices that opens when it is needed.
#ifndef _MENU_H
#define _MENU_H

#include <memory>

#include <InterfaceDefs.h>
#include <View.h>

class BList;
class BMenuItem;
class BMessenger;

namespace BPrivate {
class MenuData;
class MenuModel;
} // namespace BPrivate

enum menu_layout {
	B_ITEMS_IN_ROW = 0,
	B_ITEMS_IN_COLUMN = 1,
	/// Each item has the frame that it was added with.
	B_ITEMS_IN_MATRIX = 2,
};

/// How menus look and act, for all programs of the user.
struct menu_info {
	float font_size;
	font_family f_family;
	font_style f_style;
	rgb_color background_color;
	int32 separator;
	bool click_to_open;
	bool triggers_always_shown;
};

/// \a info: changes it for this program. B_BAD_VALUE for null.
status_t set_menu_info(menu_info* info);
status_t get_menu_info(menu_info* info);

/// A list of items, which is shown in a window of its own while it is open as a submenu or pop-up.
///
/// A menu owns its items, an item its submenu. Index -1 and null stand for no item. While the menu is
/// open it belongs to its little window, and the operations below take that window's lock themselves;
/// a menu bar is a view like others and needs its window locked. No hook runs with two locks.
class BMenu : public BView {
public:
	BMenu(const char* name, menu_layout layout = B_ITEMS_IN_COLUMN);
	/// A menu of B_ITEMS_IN_MATRIX, \a width and \a height pixels large.
	BMenu(const char* name, float width, float height);
	BMenu(BMessage* archive);
	virtual ~BMenu();

	static BArchivable* Instantiate(BMessage* archive);
	status_t Archive(BMessage* archive, bool deep = true) const override;

	void AttachedToWindow() override;
	void DetachedFromWindow() override;
	void AllAttached() override;
	void AllDetached() override;
	void Draw(BRect updateRect) override;
	void MessageReceived(BMessage* message) override;
	void KeyDown(const char* bytes, int32 numBytes) override;
	void GetPreferredSize(float* _width, float* _height) override;
	void ResizeToPreferred() override;
	void FrameMoved(BPoint newPosition) override;
	void FrameResized(float newWidth, float newHeight) override;
	void MakeFocus(bool focus = true) override;
	void Show() override;

	/// The item is the menu's from here on. False, and nothing changed, for null, an item that is in a
	/// menu already, and an index that is no place.
	bool AddItem(BMenuItem* item);
	bool AddItem(BMenuItem* item, int32 index);
	/// Only in a menu of B_ITEMS_IN_MATRIX; \a frame: the item's, in the menu's coordinates.
	bool AddItem(BMenuItem* item, BRect frame);
	/// A new item that leads to \a menu, which must be no submenu yet.
	bool AddItem(BMenu* menu);
	bool AddItem(BMenu* menu, int32 index);
	bool AddItem(BMenu* menu, BRect frame);
	/// The items of \a list, which stays the caller's. All or none.
	bool AddList(BList* list, int32 index);
	bool AddSeparatorItem();

	/// Removed items are the caller's. False when \a item is not in the menu.
	bool RemoveItem(BMenuItem* item);
	BMenuItem* RemoveItem(int32 index);
	/// \a count items from \a index on; with \a deleteItems they are deleted.
	bool RemoveItems(int32 index, int32 count, bool deleteItems = false);
	/// The item that leads to \a menu. It is deleted, the menu is the caller's.
	bool RemoveItem(BMenu* menu);

	BMenuItem* ItemAt(int32 index) const;
	BMenu* SubmenuAt(int32 index) const;
	int32 CountItems() const;
	int32 IndexOf(BMenuItem* item) const;
	int32 IndexOf(BMenu* menu) const;
	/// The first one with this code or label; submenus are searched too. Null for none.
	BMenuItem* FindItem(uint32 command) const;
	BMenuItem* FindItem(const char* name) const;
	/// \a compare: negative when the first goes before the second. Equal ones keep their order.
	void SortItems(int (*compare)(const BMenuItem*, const BMenuItem*));
	bool SwapItems(int32 indexA, int32 indexB);
	bool MoveItem(int32 indexFrom, int32 indexTo);

	/// The target of all present items, not of submenus' items. The first failure ends it.
	virtual status_t SetTargetForItems(BHandler* target);
	virtual status_t SetTargetForItems(BMessenger messenger);
	/// Greys the menu's items and the item that leads to it.
	virtual void SetEnabled(bool enable);
	/// At most one item is marked, and invoking an item marks it.
	virtual void SetRadioMode(bool on);
	virtual void SetTriggersEnabled(bool enable);
	/// Longer contents are cut, in pixels; 0: none are.
	virtual void SetMaxContentWidth(float maxWidth);
	/// The item that leads here shows the label of the marked item; turns radio mode on.
	void SetLabelFromMarked(bool on);

	bool IsLabelFromMarked();
	bool IsEnabled() const;
	bool IsRadioMode() const;
	bool AreTriggersEnabled() const;
	float MaxContentWidth() const;
	BMenuItem* FindMarked();
	int32 FindMarkedIndex();
	BMenu* Supermenu() const;
	BMenuItem* Superitem() const;

protected:
	/// For menu bars and the like, which are laid out within \a frame.
	BMenu(BRect frame, const char* name, uint32 resizeMask, uint32 flags, menu_layout layout,
		bool resizeToFit);

	/// Where the menu's left-top goes when it opens, in screen coordinates.
	virtual BPoint ScreenLocation();
	void SetItemMargins(float left, float top, float right, float bottom);
	void GetItemMargins(float* _left, float* _top, float* _right, float* _bottom) const;
	menu_layout Layout() const;

	/// Opens the menu in a window of its own at ScreenLocation(); Hide() closes that.
	virtual void Show(bool selectFirstItem);
	void Hide() override;
	/// Lets the user choose and returns the item, null for none, when the menu has closed. Calling it in a
	/// window's thread keeps repainting that window.
	///
	/// \a startOpened: opened by a click, so that releasing the button outside keeps it open.
	/// \a specialRect: releasing in there keeps it open too; screen coordinates.
	BMenuItem* Track(bool startOpened = false, BRect* specialRect = NULL);

public:
	enum add_state { B_INITIAL_ADD, B_PROCESSING, B_ABORT };
	/// Hook: adds items just before the menu opens. Called with B_INITIAL_ADD first, then, as long as
	/// it returns true, with B_PROCESSING; with B_ABORT when the menu closes before it said false.
	virtual bool AddDynamicItem(add_state state);
	/// Draws what is behind the items.
	virtual void DrawBackground(BRect updateRect);

private:
	friend class BMenuBar;
	friend class BMenuField;
	friend class BMenuItem;
	friend class BPopUpMenu;
	friend class BPrivate::MenuModel;

	std::unique_ptr<BPrivate::MenuData> fData;
};

#endif // _MENU_H

// SPDX-License-Identifier: MIT
// Menus whose items are given as one text.

#pragma once

#include <Handler.h>
#include <Menu.h>
#include <MenuBar.h>
#include <MenuField.h>
#include <MenuItem.h>
#include <Message.h>
#include <PopUpMenu.h>

#include <ormi/views/ItemText.h>

namespace Ormi {

/// What the items of such menus send: "source" is the item.
const uint32 kMenuItemChosen = 'OrmM';

/// Adds \a items from \a from on to \a menu, down to the end of its level; returns the next one.
///
/// "-" is a line between items; an item before a deeper one leads to a menu with it.
inline size_t
AddMenuItems(BMenu* menu, const std::vector<item_text>& items, size_t from = 0)
{
	const int32 level = from < items.size() ? items[from].level : 0;
	while (from < items.size() && items[from].level >= level) {
		const item_text& item = items[from++];
		if (from < items.size() && items[from].level > level) {
			BMenu* submenu = new BMenu(item.label.String());
			from = AddMenuItems(submenu, items, from);
			menu->AddItem(submenu);
		} else if (item.label == "-")
			menu->AddSeparatorItem();
		else
			menu->AddItem(new BMenuItem(item.label.String(), new BMessage(kMenuItemChosen)));
	}
	return from;
}


/// Makes \a target, which is in a window, the target of all items of \a menu and its submenus.
inline void
TargetMenuItems(BMenu* menu, BHandler* target)
{
	for (int32 i = 0; i < menu->CountItems(); i++) {
		BMenuItem* item = menu->ItemAt(i);
		if (item->Submenu() != nullptr)
			TargetMenuItems(item->Submenu(), target);
		else
			item->SetTarget(target);
	}
}


/// Whether \a item is in \a menu or in a submenu of it.
inline bool
HasMenuItem(const BMenu* menu, const BMenuItem* item)
{
	for (int32 i = 0; i < menu->CountItems(); i++) {
		const BMenuItem* own = menu->ItemAt(i);
		if (own == item || (own->Submenu() != nullptr && HasMenuItem(own->Submenu(), item)))
			return true;
	}
	return false;
}


/// The item of \a menu that sent \a message; null when there is none (any more).
inline BMenuItem*
ChosenMenuItem(const BMenu* menu, const BMessage* message)
{
	void* source;
	if (message->what != kMenuItemChosen || message->FindPointer("source", &source) != B_OK)
		return nullptr;
	BMenuItem* item = static_cast<BMenuItem*>(source);
	return HasMenuItem(menu, item) ? item : nullptr;
}


/// A menu bar that lies where it was put; its items send to itself.
class MenuRow : public BMenuBar {
public:
	MenuRow(BRect frame, const char* name)
		: BMenuBar(frame, name, B_FOLLOW_NONE, B_ITEMS_IN_ROW, false)
	{
	}

	/// In place of the items so far (see ParseItems() and AddMenuItems()).
	void SetItems(const char* text)
	{
		RemoveItems(0, CountItems(), true);
		AddMenuItems(this, ParseItems(text));
		if (Window() != nullptr)
			TargetMenuItems(this, this);
	}

	void AttachedToWindow() override
	{
		BMenuBar::AttachedToWindow();
		TargetMenuItems(this, this);
	}
};

/// A menu field whose bar fills it; its items send to itself.
class ChoiceField : public BMenuField {
public:
	ChoiceField(BRect frame, const char* name, const char* label)
		: BMenuField(frame, name, label, new BPopUpMenu(""), true, B_FOLLOW_NONE)
	{
		if (*label == '\0')
			SetDivider(0);
	}

	/// In place of the items so far (see ParseItems() and AddMenuItems()). The first one is selected.
	void SetItems(const char* text)
	{
		Menu()->RemoveItems(0, Menu()->CountItems(), true);
		AddMenuItems(Menu(), ParseItems(text));
		if (Window() != nullptr)
			TargetMenuItems(Menu(), this);
		SetSelected(0);
	}

	/// The field shows the item; indices that are none are ignored.
	void SetSelected(int32 index)
	{
		BMenuItem* item = Menu()->ItemAt(index);
		if (item != nullptr)
			item->SetMarked(true);
		MenuBar()->Invalidate();
	}

	/// -1 when there is none.
	int32 Selected() const { return Menu()->FindMarkedIndex(); }

	void AttachedToWindow() override
	{
		BMenuField::AttachedToWindow();
		TargetMenuItems(Menu(), this);
	}
};

} // namespace Ormi

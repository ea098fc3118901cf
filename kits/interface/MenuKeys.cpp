// SPDX-License-Identifier: MIT
// MenuTracker: what the keys do.
#include <cctype>

#include <MenuItem.h>
#include <Message.h>

#include "interface/LockedMenu.h"
#include "interface/MenuPrivate.h"
#include "interface/MenuTracker.h"
#include "interface/MenuWindow.h"

namespace BPrivate {

void
MenuTracker::KeyPressed(const BMessage& message)
{
	const char* bytes;
	if (fEnded || fLevels.empty() || message.FindString("bytes", &bytes) != B_OK)
		return;

	// Only the bar, and no menu of it, is open.
	const bool isInBar = fIsBar && fLevels.size() == 1;
	bool isRow = false;
	if (fIsBar) {
		LockedMenu bar(fLevels[0].menu);
		isRow = bar != nullptr && MenuModel::Of(bar).layout == B_ITEMS_IN_ROW;
	}
	switch (bytes[0]) {
		case B_UP_ARROW:
		case B_DOWN_ARROW:
			if (isInBar && isRow)
				GoIn();
			else
				SelectByKey(bytes[0] == B_DOWN_ARROW, false);
			break;

		case B_LEFT_ARROW:
		case B_RIGHT_ARROW:
			if (isInBar && isRow)
				SelectByKey(bytes[0] == B_RIGHT_ARROW, false);
			else if (bytes[0] == B_RIGHT_ARROW)
				GoIn();
			else
				GoOut();
			break;

		case B_HOME:
		case B_END:
			SelectByKey(bytes[0] == B_HOME, true);
			break;

		case B_ENTER:
		case B_SPACE:
			ChooseByKey();
			break;

		case B_ESCAPE:
			if (fLevels.size() > (fIsBar ? 2u : 1u))
				CloseLevel();
			else
				Finish(nullptr, 0);
			break;

		default:
			ChooseByTrigger(bytes[0]);
			break;
	}
}


void
MenuTracker::SelectByKey(bool forward, bool fromEnd)
{
	fTimer.reset();
	LockedMenu menu(fLevels.back().menu);
	if (menu == nullptr)
		return;
	BMenuItem* from = fromEnd ? nullptr : MenuModel::Of(menu).selected;
	BMenuItem* item = from == nullptr && !fromEnd ? MenuModel::StartForKeys(menu, forward)
												  : MenuModel::Next(menu, from, forward);
	MenuModel::Select(menu, item);
	auto window = dynamic_cast<MenuWindow*>(menu->Window());
	if (window != nullptr && item != nullptr)
		window->Reveal(item);
}


// Into the submenu of the selected item; from one without, to the bar's next menu.
void
MenuTracker::GoIn()
{
	fTimer.reset();
	{
		LockedMenu menu(fLevels.back().menu);
		if (menu == nullptr)
			return;
		BMenuItem* item = MenuModel::Of(menu).selected;
		if (item != nullptr && item->Submenu() != nullptr && item->IsEnabled()) {
			OpenSubmenu(fLevels.size() - 1, item, true);
			return;
		}
	}
	if (fIsBar && fLevels.size() > 1)
		MoveInBar(true);
}


void
MenuTracker::GoOut()
{
	fTimer.reset();
	if (fLevels.size() > (fIsBar ? 2u : 1u))
		CloseLevel();
	else if (fIsBar && fLevels.size() == 2)
		MoveInBar(false);
}


void
MenuTracker::MoveInBar(bool forward)
{
	LockedMenu bar(fLevels[0].menu);
	if (bar == nullptr)
		return;
	if (MenuModel::Of(bar).layout != B_ITEMS_IN_ROW) {
		if (!forward)
			CloseAbove(0);
		return;
	}
	BMenuItem* item = MenuModel::Next(bar, MenuModel::Of(bar).selected, forward);
	if (item == nullptr || item == MenuModel::Of(bar).selected)
		return;
	SelectItem(0, bar, item, false);
	if (item->Submenu() != nullptr)
		OpenSubmenu(0, item, true);
}


void
MenuTracker::ChooseByKey()
{
	BMenuItem* item;
	uint64 serial;
	{
		LockedMenu menu(fLevels.back().menu);
		item = menu != nullptr ? MenuModel::Of(menu).selected : nullptr;
		if (item == nullptr || !MenuModel::CanBeChosen(item))
			return;
		if (item->Submenu() != nullptr) {
			OpenSubmenu(fLevels.size() - 1, item, true);
			return;
		}
		serial = MenuModel::Of(item).serial;
	}
	Finish(item, serial);
}


void
MenuTracker::ChooseByTrigger(char letter)
{
	if (std::isgraph(static_cast<unsigned char>(letter)) == 0)
		return;
	{
		LockedMenu menu(fLevels.back().menu);
		BMenuItem* item = menu != nullptr ? MenuModel::ItemForTrigger(menu, letter) : nullptr;
		if (item == nullptr)
			return;
		SelectItem(fLevels.size() - 1, menu, item, false);
	}
	ChooseByKey();
}

} // namespace BPrivate

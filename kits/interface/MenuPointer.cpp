// SPDX-License-Identifier: MIT
// MenuTracker: what the pointer does.
#include <algorithm>
#include <cmath>

#include <MenuItem.h>
#include <Message.h>
#include <OS.h>

#include "interface/LockedMenu.h"
#include "interface/MenuPrivate.h"
#include "interface/MenuTracker.h"
#include "interface/MenuWindow.h"

namespace BPrivate {

namespace {

// How long the pointer rests on an item before its submenu opens.
const bigtime_t kOpenDelay = 160000;
// How long an open submenu waits for a pointer that is on its way to it.
const bigtime_t kSwitchDelay = 350000;
// A press that is shorter, and does not move, leaves the menu open.
const bigtime_t kShortClick = 300000;
const float kClickDistance = 4;
// Pointing at the end of a long menu scrolls it this often.
const bigtime_t kScrollInterval = 50000;
const float kItemsPerNotch = 3;

} // namespace


// While a button is held the window of the press gets the input too and hands it on: once is enough.
bool
MenuTracker::IsNews(const BMessage& message)
{
	const bigtime_t when = message.GetInt64("when", 0);
	if (when < fLastWhen)
		return false;
	if (when > fLastWhen)
		fSeen.clear();
	fLastWhen = when;
	if (std::find(fSeen.begin(), fSeen.end(), message.what) != fSeen.end())
		return false;
	fSeen.push_back(message.what);
	return true;
}


void
MenuTracker::PointerMessage(const BMessage& message)
{
	BPoint where;
	if (fEnded || message.FindPoint("screen_where", &where) != B_OK || !IsNews(message))
		return;

	fNow = message.GetInt64("when", system_time());
	if (message.what == B_MOUSE_WHEEL_CHANGED) {
		Wheel(where, message.GetFloat("be:wheel_delta_y", 0));
		return;
	}

	const bool isHeld = message.GetInt32("buttons", 0) != 0;
	if (message.what == B_MOUSE_MOVED && fIsPressed && !isHeld) {
		// The window of the press is late with the release: it was not here, but where the pointer was last.
		Released(fWhere);
		if (fEnded)
			return;
	}

	fWhere = where;
	if (std::fabs(where.x - fPressWhere.x) > kClickDistance
		|| std::fabs(where.y - fPressWhere.y) > kClickDistance)
		fHasWandered = true;
	if (message.what == B_MOUSE_DOWN) {
		if (!fIsPressed)
			Pressed(where);
	} else if (fIsPressed && !isHeld) {
		Hover(where);
		if (!fEnded)
			Released(where);
	} else if (message.what == B_MOUSE_MOVED)
		Hover(where);
}


void
MenuTracker::Pressed(BPoint where)
{
	fIsPressed = true;
	fIsOpeningPress = false;
	fClosesOnRelease = false;
	fPressWhere = where;
	fPressWhen = fNow;
	fHasWandered = false;

	const int32 level = LevelAt(where);
	if (level < 0) {
		Finish(nullptr, 0);
		return;
	}
	LockedMenu menu(fLevels[level].menu);
	if (menu == nullptr)
		return;
	BMenuItem* item = MenuModel::ItemAt(menu, menu->ConvertFromScreen(where));
	if (item == nullptr || !MenuModel::CanBeChosen(item))
		return;
	const bool isOpen =
		item == MenuModel::Of(menu).selected && fLevels.size() > static_cast<size_t>(level) + 1;
	if (!isOpen)
		SelectItem(level, menu, item, true);
	else if (fIsBar && level == 0)
		fClosesOnRelease = true;
}


void
MenuTracker::Released(BPoint where)
{
	const bool wasOpening = fIsOpeningPress;
	fIsPressed = false;
	fIsOpeningPress = false;
	const int32 level = LevelAt(where);
	const bool isOnBar = fIsBar && level == 0;
	// Who opens a menu and lets go at once wants to choose by another click.
	if (wasOpening && !isOnBar && !fHasWandered && fNow - fPressWhen < kShortClick)
		return;

	if (level < 0) {
		const BRect through = fStart.clickThrough;
		if (!wasOpening || !through.IsValid() || !through.Contains(where))
			Finish(nullptr, 0);
		return;
	}

	BMenuItem* item;
	uint64 serial;
	{
		LockedMenu menu(fLevels[level].menu);
		if (menu == nullptr)
			return;
		item = MenuModel::ItemAt(menu, menu->ConvertFromScreen(where));
		if (item == nullptr || !MenuModel::CanBeChosen(item)) {
			// An empty place of a menu is no choice; of a bar without a menu open, it is the end.
			if (!fIsBar || fLevels.size() > 1)
				return;
			item = nullptr;
			serial = 0;
		} else if (item->Submenu() != nullptr) {
			const bool isOpen = fLevels.size() > static_cast<size_t>(level) + 1;
			if (!isOpen)
				SelectItem(level, menu, item, true);
			if (!fClosesOnRelease || fHasWandered)
				return;
			item = nullptr;
			serial = 0;
		} else
			serial = MenuModel::Of(item).serial;
	}
	Finish(item, serial);
}


void
MenuTracker::Hover(BPoint where)
{
	const int32 level = LevelAt(where);
	if (level < 0) {
		// The pointer has left: what leads to an open submenu stays selected, nothing else.
		fTimer.reset();
		LockedMenu menu(fLevels.back().menu);
		if (menu != nullptr && !MenuModel::Of(menu).isBar)
			MenuModel::Select(menu, nullptr);
		return;
	}

	LockedMenu menu(fLevels[level].menu);
	if (menu == nullptr)
		return;
	const size_t place = static_cast<size_t>(level);
	const bool hasSubmenu = fLevels.size() > place + 1;
	auto window = dynamic_cast<MenuWindow*>(menu->Window());
	if (window != nullptr && window->ScrollDirectionAt(where) != 0) {
		SelectItem(place, menu, nullptr, false);
		StartTimer(kScrollInterval);
		return;
	}

	BMenuItem* item = MenuModel::ItemAt(menu, menu->ConvertFromScreen(where));
	if (item != nullptr && !MenuModel::CanBeChosen(item))
		item = nullptr;
	BMenuItem* selected = MenuModel::Of(menu).selected;
	if (item == selected) {
		fLastOnSelected = where;
		if (item == nullptr)
			return;
		if (!hasSubmenu) {
			if (item->Submenu() != nullptr && fTimer == nullptr && !MenuModel::Of(menu).isBar)
				StartTimer(kOpenDelay);
			return;
		}
		fTimer.reset();
		CloseAbove(place + 1);
		LockedMenu below(fLevels.back().menu);
		if (below != nullptr)
			MenuModel::Select(below, nullptr);
		return;
	}

	if (MenuModel::Of(menu).isBar) {
		if (item != nullptr)
			SelectItem(place, menu, item, hasSubmenu || fIsPressed);
		return;
	}
	if (hasSubmenu && (item == nullptr || HeadsForSubmenu(place, where))) {
		if (fTimer == nullptr)
			StartTimer(kSwitchDelay);
		return;
	}
	SelectItem(place, menu, item, false);
	if (item != nullptr && item->Submenu() != nullptr)
		StartTimer(kOpenDelay);
}


// Within the triangle from where the pointer left the item to the submenu's near side.
bool
MenuTracker::HeadsForSubmenu(size_t level, BPoint where) const
{
	const BRect below = fLevels[level + 1].frame;
	const bool isRight = below.left > fLastOnSelected.x;
	const float side = isRight ? below.left : below.right;
	const float whole = side - fLastOnSelected.x;
	const float part = where.x - fLastOnSelected.x;
	if (whole == 0 || part / whole <= 0)
		return false;
	const float share = std::min(part / whole, 1.0f);
	const float top = fLastOnSelected.y + (below.top - fLastOnSelected.y) * share;
	const float bottom = fLastOnSelected.y + (below.bottom - fLastOnSelected.y) * share;
	return where.y >= top && where.y <= bottom;
}


// The pointer has rested: what it points at now counts.
void
MenuTracker::TimePassed()
{
	fTimer.reset();
	const int32 level = LevelAt(fWhere);
	if (fEnded || level < 0)
		return;
	LockedMenu menu(fLevels[level].menu);
	if (menu == nullptr)
		return;
	auto window = dynamic_cast<MenuWindow*>(menu->Window());
	const int32 direction = window != nullptr ? window->ScrollDirectionAt(fWhere) : 0;
	if (direction != 0) {
		window->ScrollItems(direction * MenuModel::Of(menu).textHeight);
		StartTimer(kScrollInterval);
		return;
	}

	BMenuItem* item = MenuModel::ItemAt(menu, menu->ConvertFromScreen(fWhere));
	if (item != nullptr && !MenuModel::CanBeChosen(item))
		item = nullptr;
	const bool hasSubmenu = fLevels.size() > static_cast<size_t>(level) + 1;
	if (item != MenuModel::Of(menu).selected || (item != nullptr && !hasSubmenu))
		SelectItem(level, menu, item, true);
}


void
MenuTracker::Wheel(BPoint where, float delta)
{
	const int32 level = LevelAt(where);
	if (level < 0)
		return;
	LockedMenu menu(fLevels[level].menu);
	auto window = menu != nullptr ? dynamic_cast<MenuWindow*>(menu->Window()) : nullptr;
	if (window == nullptr)
		return;
	window->ScrollItems(delta * kItemsPerNotch * MenuModel::Of(menu).textHeight);
	Hover(where);
}

} // namespace BPrivate

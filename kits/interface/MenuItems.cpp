// SPDX-License-Identifier: MIT
// BMenu: the list of its items.
#include <Menu.h>

#include <algorithm>
#include <cstring>

#include <List.h>
#include <MenuItem.h>
#include <SeparatorItem.h>

#include "interface/MenuPrivate.h"

using BPrivate::MenuLock;
using BPrivate::MenuModel;

bool
BMenu::AddItem(BMenuItem* item)
{
	return AddItem(item, CountItems());
}


bool
BMenu::AddItem(BMenuItem* item, int32 index)
{
	if (item == NULL || item->Menu() != NULL || index < 0 || index > CountItems()
		|| fData->layout == B_ITEMS_IN_MATRIX)
		return false;

	MenuLock lock(this);
	MenuModel::Of(item).super = this;
	fData->items.insert(fData->items.begin() + index, item);
	MenuModel::Changed(this);
	MenuModel::InstallAgain(this);
	return true;
}


bool
BMenu::AddItem(BMenuItem* item, BRect frame)
{
	if (item == NULL || item->Menu() != NULL || fData->layout != B_ITEMS_IN_MATRIX)
		return false;

	MenuLock lock(this);
	MenuModel::Of(item).super = this;
	MenuModel::Of(item).frame = frame;
	fData->items.push_back(item);
	MenuModel::Changed(this);
	MenuModel::InstallAgain(this);
	return true;
}


bool
BMenu::AddItem(BMenu* menu)
{
	return AddItem(menu, CountItems());
}


bool
BMenu::AddItem(BMenu* menu, int32 index)
{
	if (menu == NULL || menu->Superitem() != NULL || index < 0 || index > CountItems()
		|| fData->layout == B_ITEMS_IN_MATRIX)
		return false;
	return AddItem(new BMenuItem(menu), index);
}


bool
BMenu::AddItem(BMenu* menu, BRect frame)
{
	if (menu == NULL || menu->Superitem() != NULL || fData->layout != B_ITEMS_IN_MATRIX)
		return false;
	return AddItem(new BMenuItem(menu), frame);
}


bool
BMenu::AddList(BList* list, int32 index)
{
	if (list == NULL || index < 0 || index > CountItems() || fData->layout == B_ITEMS_IN_MATRIX)
		return false;
	for (int32 i = 0; i < list->CountItems(); i++) {
		BMenuItem* item = static_cast<BMenuItem*>(list->ItemAt(i));
		if (item == NULL || item->Menu() != NULL || list->IndexOf(item) != i)
			return false;
	}

	MenuLock lock(this);
	for (int32 i = 0; i < list->CountItems(); i++)
		AddItem(static_cast<BMenuItem*>(list->ItemAt(i)), index + i);
	return true;
}


bool
BMenu::AddSeparatorItem()
{
	BMenuItem* separator = new BSeparatorItem;
	if (AddItem(separator))
		return true;
	delete separator;
	return false;
}


bool
BMenu::RemoveItem(BMenuItem* item)
{
	return item != NULL && RemoveItem(IndexOf(item)) != NULL;
}


BMenuItem*
BMenu::RemoveItem(int32 index)
{
	BMenuItem* item = ItemAt(index);
	if (item == NULL)
		return NULL;

	MenuLock lock(this);
	if (item->Submenu() != NULL)
		MenuModel::CloseWindows(item->Submenu());
	if (fData->selected == item)
		fData->selected = NULL;
	MenuModel::Of(item).selected = false;
	fData->items.erase(fData->items.begin() + index);
	MenuModel::Of(item).super = NULL;
	MenuModel::Changed(this);
	MenuModel::InstallAgain(this);
	return item;
}


bool
BMenu::RemoveItems(int32 index, int32 count, bool deleteItems)
{
	if (index < 0 || count < 0 || count > CountItems() - index)
		return false;

	MenuLock lock(this);
	for (int32 i = 0; i < count; i++) {
		BMenuItem* item = RemoveItem(index);
		if (deleteItems)
			delete item;
	}
	return true;
}


bool
BMenu::RemoveItem(BMenu* menu)
{
	BMenuItem* item = ItemAt(IndexOf(menu));
	if (item == NULL || !RemoveItem(item))
		return false;
	MenuModel::Of(item).submenu = NULL;
	MenuModel::Of(menu).superitem = NULL;
	delete item;
	return true;
}


BMenuItem*
BMenu::ItemAt(int32 index) const
{
	return index >= 0 && index < CountItems() ? fData->items[index] : NULL;
}


BMenu*
BMenu::SubmenuAt(int32 index) const
{
	const BMenuItem* item = ItemAt(index);
	return item != NULL ? item->Submenu() : NULL;
}


int32
BMenu::CountItems() const
{
	return static_cast<int32>(fData->items.size());
}


int32
BMenu::IndexOf(BMenuItem* item) const
{
	const auto place = std::find(fData->items.begin(), fData->items.end(), item);
	return place != fData->items.end() ? static_cast<int32>(place - fData->items.begin()) : -1;
}


int32
BMenu::IndexOf(BMenu* menu) const
{
	for (int32 i = 0; menu != NULL && i < CountItems(); i++) {
		if (SubmenuAt(i) == menu)
			return i;
	}
	return -1;
}


BMenuItem*
BMenu::FindItem(uint32 command) const
{
	for (BMenuItem* item : fData->items) {
		if (item->Message() != NULL && item->Command() == command)
			return item;
		BMenuItem* below = item->Submenu() != NULL ? item->Submenu()->FindItem(command) : NULL;
		if (below != NULL)
			return below;
	}
	return NULL;
}


BMenuItem*
BMenu::FindItem(const char* name) const
{
	for (BMenuItem* item : fData->items) {
		if (name != NULL && std::strcmp(item->Label(), name) == 0)
			return item;
		BMenuItem* below = item->Submenu() != NULL ? item->Submenu()->FindItem(name) : NULL;
		if (below != NULL)
			return below;
	}
	return NULL;
}


void
BMenu::SortItems(int (*compare)(const BMenuItem*, const BMenuItem*))
{
	MenuLock lock(this);
	std::stable_sort(fData->items.begin(), fData->items.end(),
		[&](const BMenuItem* a, const BMenuItem* b) { return compare(a, b) < 0; });
	MenuModel::Changed(this);
}


bool
BMenu::SwapItems(int32 indexA, int32 indexB)
{
	if (ItemAt(indexA) == NULL || ItemAt(indexB) == NULL)
		return false;
	MenuLock lock(this);
	std::swap(fData->items[indexA], fData->items[indexB]);
	MenuModel::Changed(this);
	return true;
}


bool
BMenu::MoveItem(int32 indexFrom, int32 indexTo)
{
	if (ItemAt(indexFrom) == NULL || ItemAt(indexTo) == NULL)
		return false;
	MenuLock lock(this);
	const auto begin = fData->items.begin();
	if (indexFrom < indexTo)
		std::rotate(begin + indexFrom, begin + indexFrom + 1, begin + indexTo + 1);
	else
		std::rotate(begin + indexTo, begin + indexFrom, begin + indexFrom + 1);
	MenuModel::Changed(this);
	return true;
}


BMenuItem*
BMenu::FindMarked()
{
	return ItemAt(FindMarkedIndex());
}


int32
BMenu::FindMarkedIndex()
{
	for (int32 i = 0; i < CountItems(); i++) {
		if (fData->items[i]->IsMarked())
			return i;
	}
	return -1;
}


BMenu*
BMenu::Supermenu() const
{
	return fData->superitem != NULL ? fData->superitem->Menu() : NULL;
}


BMenuItem*
BMenu::Superitem() const
{
	return fData->superitem;
}

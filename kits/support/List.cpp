// SPDX-License-Identifier: MIT
// BList.

#include <List.h>

#include <stdlib.h>

#include <algorithm>

BList::BList(int32 blockSize)
{
	fItems.reserve(std::clamp<int32>(blockSize, 0, 1024));
}


BList::BList(const BList& other)
	: fItems(other.fItems)
{
}


BList::~BList() {}


BList&
BList::operator=(const BList& other)
{
	fItems = other.fItems;
	return *this;
}


bool
BList::operator==(const BList& other) const
{
	return fItems == other.fItems;
}


bool
BList::operator!=(const BList& other) const
{
	return fItems != other.fItems;
}


bool
BList::AddItem(void* item, int32 index)
{
	if (index < 0 || index > CountItems())
		return false;
	fItems.insert(fItems.begin() + index, item);
	return true;
}


bool
BList::AddItem(void* item)
{
	fItems.push_back(item);
	return true;
}


bool
BList::AddList(const BList* list, int32 index)
{
	if (list == nullptr || index < 0 || index > CountItems())
		return false;
	// The list may be this one.
	std::vector<void*> added = list->fItems;
	fItems.insert(fItems.begin() + index, added.begin(), added.end());
	return true;
}


bool
BList::AddList(const BList* list)
{
	return AddList(list, CountItems());
}


bool
BList::RemoveItem(void* item)
{
	auto found = std::find(fItems.begin(), fItems.end(), item);
	if (found == fItems.end())
		return false;
	fItems.erase(found);
	return true;
}


void*
BList::RemoveItem(int32 index)
{
	if (index < 0 || index >= CountItems())
		return nullptr;
	void* item = fItems[index];
	fItems.erase(fItems.begin() + index);
	return item;
}


bool
BList::RemoveItems(int32 index, int32 count)
{
	if (index < 0 || index > CountItems() || count < 0)
		return false;
	count = std::min(count, CountItems() - index);
	fItems.erase(fItems.begin() + index, fItems.begin() + index + count);
	return true;
}


bool
BList::ReplaceItem(int32 index, void* item)
{
	if (index < 0 || index >= CountItems())
		return false;
	fItems[index] = item;
	return true;
}


void
BList::MakeEmpty()
{
	fItems.clear();
}


void
BList::SortItems(int (*compareFunc)(const void*, const void*))
{
	if (compareFunc != nullptr && !fItems.empty())
		qsort(fItems.data(), fItems.size(), sizeof(void*), compareFunc);
}


bool
BList::SwapItems(int32 indexA, int32 indexB)
{
	if (indexA < 0 || indexA >= CountItems() || indexB < 0 || indexB >= CountItems())
		return false;
	std::swap(fItems[indexA], fItems[indexB]);
	return true;
}


bool
BList::MoveItem(int32 from, int32 to)
{
	if (from < 0 || from >= CountItems() || to < 0 || to >= CountItems())
		return false;

	auto items = fItems.begin();
	if (from < to)
		std::rotate(items + from, items + from + 1, items + to + 1);
	else
		std::rotate(items + to, items + from, items + from + 1);
	return true;
}


void*
BList::FirstItem() const
{
	return ItemAt(0);
}


void*
BList::LastItem() const
{
	return ItemAt(CountItems() - 1);
}


void*
BList::ItemAtFast(int32 index) const
{
	return fItems.data()[index];
}


void*
BList::Items() const
{
	return fItems.empty() ? nullptr : const_cast<void**>(fItems.data());
}


bool
BList::HasItem(void* item) const
{
	return IndexOf(item) >= 0;
}


bool
BList::HasItem(const void* item) const
{
	return IndexOf(item) >= 0;
}


int32
BList::IndexOf(void* item) const
{
	return IndexOf(const_cast<const void*>(item));
}


int32
BList::IndexOf(const void* item) const
{
	auto found = std::find(fItems.begin(), fItems.end(), item);
	return found == fItems.end() ? -1 : static_cast<int32>(found - fItems.begin());
}


bool
BList::IsEmpty() const
{
	return fItems.empty();
}


void
BList::DoForEach(bool (*func)(void* item))
{
	if (func == nullptr)
		return;
	// By index: the function may change the list.
	for (int32 i = 0; i < CountItems(); i++) {
		if (func(fItems[i]))
			return;
	}
}


void
BList::DoForEach(bool (*func)(void* item, void* arg2), void* arg2)
{
	if (func == nullptr)
		return;
	for (int32 i = 0; i < CountItems(); i++) {
		if (func(fItems[i], arg2))
			return;
	}
}

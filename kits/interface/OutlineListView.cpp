// SPDX-License-Identifier: MIT
// BOutlineListView: the full list, and what of it is shown.
#include <OutlineListView.h>

#include <algorithm>

#include <List.h>
#include <Message.h>
#include <Window.h>

BOutlineListView::BOutlineListView(
	BRect frame, const char* name, list_view_type type, uint32 resizingMode, uint32 flags)
	: BListView(frame, name, type, resizingMode, flags),
	  fLastFound(0),
	  fPressedLatch(NULL),
	  fLatchMisTracked(false)
{
}


BOutlineListView::BOutlineListView(const char* name, list_view_type type, uint32 flags)
	: BListView(name, type, flags),
	  fLastFound(0),
	  fPressedLatch(NULL),
	  fLatchMisTracked(false)
{
}


BOutlineListView::BOutlineListView(BMessage* archive)
	: BListView(archive),
	  fLastFound(0),
	  fPressedLatch(NULL),
	  fLatchMisTracked(false)
{
	// The base made rows of all items.
	const std::vector<BListItem*> items = fItems;
	std::vector<BListItem*> selected;
	std::copy_if(items.begin(), items.end(), std::back_inserter(selected),
		[](const BListItem* item) { return item->IsSelected(); });
	ForgetAll();
	for (BListItem* item : items) {
		Stamp(item);
		InsertFull(FullListCountItems(), item);
	}
	for (BListItem* item : selected) {
		const int32 row = IndexOf(item);
		SelectRange(row, row);
	}
}


BOutlineListView::~BOutlineListView() {}


BArchivable*
BOutlineListView::Instantiate(BMessage* archive)
{
	return validate_instantiation(archive, "BOutlineListView") ? new BOutlineListView(archive)
															   : NULL;
}


status_t
BOutlineListView::Archive(BMessage* archive, bool deep) const
{
	return BListView::Archive(archive, deep);
}


bool
BOutlineListView::AddUnder(BListItem* item, BListItem* superItem)
{
	if (item == NULL || IsStamped(item) || item == superItem)
		return false;
	int32 index = 0;
	uint32 level = 0;
	if (superItem != NULL) {
		const int32 above = FullListIndexOf(superItem);
		if (above < 0)
			return false;
		index = above + 1;
		level = superItem->fLevel + 1;
	}
	item->fLevel = level;
	Stamp(item);
	InsertFull(index, item);
	return true;
}


bool
BOutlineListView::AddItem(BListItem* item)
{
	return BOutlineListView::AddItem(item, FullListCountItems());
}


bool
BOutlineListView::AddItem(BListItem* item, int32 fullListIndex)
{
	if (item == NULL || IsStamped(item) || fullListIndex < 0
		|| fullListIndex > FullListCountItems())
		return false;
	Stamp(item);
	InsertFull(fullListIndex, item);
	return true;
}


bool
BOutlineListView::AddList(BList* newItems)
{
	return BOutlineListView::AddList(newItems, FullListCountItems());
}


bool
BOutlineListView::AddList(BList* newItems, int32 fullListIndex)
{
	std::vector<BListItem*> items;
	if (newItems == NULL || fullListIndex < 0 || fullListIndex > FullListCountItems()
		|| !StampAll(newItems, &items))
		return false;
	for (BListItem* item : items)
		InsertFull(fullListIndex++, item);
	return true;
}


bool
BOutlineListView::RemoveItem(BListItem* item)
{
	return BOutlineListView::RemoveItem(FullListIndexOf(item)) != NULL;
}


BListItem*
BOutlineListView::RemoveItem(int32 fullListIndex)
{
	BListItem* item = FullListItemAt(fullListIndex);
	if (item != NULL)
		TakeOut(fullListIndex, EndOfBranch(fullListIndex) - fullListIndex);
	return item;
}


bool
BOutlineListView::RemoveItems(int32 fullListIndex, int32 count)
{
	if (FullListItemAt(fullListIndex) == NULL || count < 0)
		return false;
	count = std::min(count, FullListCountItems() - fullListIndex);
	int32 end = fullListIndex;
	while (end < fullListIndex + count)
		end = EndOfBranch(end);
	TakeOut(fullListIndex, end - fullListIndex);
	return true;
}


void
BOutlineListView::MakeEmpty()
{
	fFullItems.clear();
	fPressedLatch = NULL;
	BListView::MakeEmpty();
}


BListItem*
BOutlineListView::FullListItemAt(int32 fullListIndex) const
{
	return fullListIndex >= 0 && fullListIndex < FullListCountItems() ? fFullItems[fullListIndex]
																	  : NULL;
}


int32
BOutlineListView::FullListIndexOf(BPoint where) const
{
	return FullListIndexOf(ItemAt(IndexOf(where)));
}


int32
BOutlineListView::FullListIndexOf(BListItem* item) const
{
	if (item == NULL)
		return -1;
	// Who builds or walks a tree asks for neighbours.
	const int32 count = FullListCountItems();
	int32 below = std::clamp(fLastFound, int32(0), std::max(count - 1, int32(0)));
	int32 above = below - 1;
	for (; below < count || above >= 0; below++, above--) {
		if (below < count && fFullItems[below] == item)
			return fLastFound = below;
		if (above >= 0 && fFullItems[above] == item)
			return fLastFound = above;
	}
	return -1;
}


BListItem*
BOutlineListView::FullListFirstItem() const
{
	return FullListItemAt(0);
}


BListItem*
BOutlineListView::FullListLastItem() const
{
	return FullListItemAt(FullListCountItems() - 1);
}


bool
BOutlineListView::FullListHasItem(BListItem* item) const
{
	return FullListIndexOf(item) >= 0;
}


int32
BOutlineListView::FullListCountItems() const
{
	return static_cast<int32>(fFullItems.size());
}


bool
BOutlineListView::FullListIsEmpty() const
{
	return fFullItems.empty();
}


int32
BOutlineListView::FullListCurrentSelection(int32 index) const
{
	// Hidden items are never selected.
	return FullListIndexOf(ItemAt(CurrentSelection(index)));
}


void
BOutlineListView::FullListDoForEach(bool (*func)(BListItem* item))
{
	if (func == NULL)
		return;
	for (int32 i = 0; i < FullListCountItems(); i++) {
		if (func(fFullItems[i]))
			return;
	}
}


void
BOutlineListView::FullListDoForEach(bool (*func)(BListItem* item, void* arg), void* arg)
{
	if (func == NULL)
		return;
	for (int32 i = 0; i < FullListCountItems(); i++) {
		if (func(fFullItems[i], arg))
			return;
	}
}


void
BOutlineListView::FullListSortItems(
	int (*compareFunc)(const BListItem* first, const BListItem* second))
{
	SortItemsUnder(NULL, false, compareFunc);
}


BListItem*
BOutlineListView::Superitem(const BListItem* item)
{
	const int32 index = FullListIndexOf(const_cast<BListItem*>(item));
	return index >= 0 ? FullListItemAt(SuperIndex(index)) : NULL;
}


bool
BOutlineListView::IsExpanded(int32 fullListIndex)
{
	const BListItem* item = FullListItemAt(fullListIndex);
	return item != NULL && item->fExpanded;
}


void
BOutlineListView::SortItemsUnder(BListItem* superItem, bool oneLevelOnly,
	int (*compareFunc)(const BListItem* first, const BListItem* second))
{
	int32 first, end;
	if (compareFunc == NULL || !GetUnder(superItem, &first, &end))
		return;
	SortBranches(first, end, oneLevelOnly,
		[compareFunc](const BListItem* a, const BListItem* b) { return compareFunc(a, b) < 0; });
	RebuildRows();
}


int32
BOutlineListView::CountItemsUnder(BListItem* superItem, bool oneLevelOnly) const
{
	int32 first, end;
	if (!GetUnder(superItem, &first, &end))
		return 0;
	if (!oneLevelOnly)
		return end - first;
	int32 count = 0;
	for (int32 i = first; i < end; i = EndOfBranch(i))
		count++;
	return count;
}


BListItem*
BOutlineListView::EachItemUnder(BListItem* superItem, bool oneLevelOnly,
	BListItem* (*eachFunc)(BListItem* item, void* arg), void* arg)
{
	int32 first, end;
	if (eachFunc == NULL || !GetUnder(superItem, &first, &end))
		return NULL;
	for (int32 i = first; i < std::min(end, FullListCountItems()); i = NextUnder(i, oneLevelOnly)) {
		if (BListItem* found = eachFunc(fFullItems[i], arg))
			return found;
	}
	return NULL;
}


BListItem*
BOutlineListView::ItemUnderAt(BListItem* superItem, bool oneLevelOnly, int32 index) const
{
	int32 first, end;
	if (index < 0 || !GetUnder(superItem, &first, &end))
		return NULL;
	for (int32 i = first; i < end; i = NextUnder(i, oneLevelOnly)) {
		if (index-- == 0)
			return fFullItems[i];
	}
	return NULL;
}


void
BOutlineListView::SortAll(int (*cmp)(const void*, const void*))
{
	SortBranches(0, FullListCountItems(), false,
		[cmp](const BListItem* a, const BListItem* b) { return cmp(&a, &b) < 0; });
	RebuildRows();
}


// Each takes its subitems along. They must have the same superitem.
bool
BOutlineListView::SwapChecked(int32 a, int32 b)
{
	if (a == b)
		return true;
	const int32 first = FullListIndexOf(fItems[std::min(a, b)]);
	const int32 second = FullListIndexOf(fItems[std::max(a, b)]);
	if (SuperIndex(first) != SuperIndex(second))
		return false;

	const auto items = fFullItems.begin();
	std::vector<BListItem*> swapped(items + second, items + EndOfBranch(second));
	swapped.insert(swapped.end(), items + EndOfBranch(first), items + second);
	swapped.insert(swapped.end(), items + first, items + EndOfBranch(first));
	std::copy(swapped.begin(), swapped.end(), items + first);
	RebuildRows();
	return true;
}


// With its subitems, before the row there, or behind it and what is under it. Not into its own subitems.
bool
BOutlineListView::MoveChecked(int32 from, int32 to)
{
	if (from == to)
		return true;
	const int32 first = FullListIndexOf(fItems[from]);
	const int32 end = EndOfBranch(first);
	const int32 target = FullListIndexOf(fItems[to]);
	if (target > first && target < end)
		return false;

	const auto items = fFullItems.begin();
	if (target < first)
		std::rotate(items + target, items + first, items + end);
	else
		std::rotate(items + first, items + end, items + EndOfBranch(target));
	RebuildRows();
	return true;
}


// The new item takes the level and the subitems of the old one.
bool
BOutlineListView::ReplaceChecked(int32 index, BListItem* item)
{
	BListItem* old = fItems[index];
	const int32 fullIndex = FullListIndexOf(old);
	ReleaseLatch();
	item->fLevel = old->fLevel;
	item->fExpanded = old->fExpanded;
	item->fHasSubitems = old->fHasSubitems;
	item->fVisible = true;
	old->fVisible = false;
	old->fStamp = 0;
	Stamp(item);
	fFullItems[fullIndex] = item;
	ReplaceAt(index, item);
	return true;
}


const std::vector<BListItem*>&
BOutlineListView::ArchivedItems() const
{
	return fFullItems;
}


// Behind the last of the items under the one at an index.
int32
BOutlineListView::EndOfBranch(int32 fullIndex) const
{
	const uint32 level = fFullItems[fullIndex]->fLevel;
	int32 end = fullIndex + 1;
	while (end < FullListCountItems() && fFullItems[end]->fLevel > level)
		end++;
	return end;
}


int32
BOutlineListView::SuperIndex(int32 fullIndex) const
{
	const uint32 level = fFullItems[fullIndex]->fLevel;
	int32 index = level > 0 ? fullIndex - 1 : -1;
	while (index >= 0 && fFullItems[index]->fLevel >= level)
		index--;
	return index;
}


bool
BOutlineListView::GetUnder(BListItem* superItem, int32* first, int32* end) const
{
	if (superItem == NULL) {
		*first = 0;
		*end = FullListCountItems();
		return true;
	}
	const int32 index = FullListIndexOf(superItem);
	if (index < 0)
		return false;
	*first = index + 1;
	*end = EndOfBranch(index);
	return true;
}


int32
BOutlineListView::NextUnder(int32 fullIndex, bool oneLevelOnly) const
{
	return oneLevelOnly && fullIndex < FullListCountItems() ? EndOfBranch(fullIndex)
															: fullIndex + 1;
}


// The item is a new one of this list.
void
BOutlineListView::InsertFull(int32 fullIndex, BListItem* item)
{
	fFullItems.insert(fFullItems.begin() + fullIndex, item);
	fLastFound = fullIndex;
	item->fVisible = false;
	item->fSelected = false;
	FindSubitems(fullIndex);
	FindSubitems(fullIndex - 1);
	// It may take those behind it from under another item.
	if (item->fHasSubitems) {
		RebuildRows();
		return;
	}
	if (!ShouldShow(fullIndex))
		return;
	const int32 row = RowFor(fullIndex);
	item->fVisible = true;
	InsertAt(row, &item, 1);
}


// Whole branches. Selected ones are deselected first.
void
BOutlineListView::TakeOut(int32 first, int32 count)
{
	BListItem* const firstItem = FullListItemAt(first);
	if (firstItem == NULL || count == 0)
		return;
	int32 rows = CountRows(first, first + count);
	int32 row = rows > 0 ? RowFor(first) : -1;
	if (rows > 0 && DeselectRange(row, row + rows - 1)) {
		TellSelectionChanged();
		// The hook may have changed the list.
		first = FullListIndexOf(firstItem);
		if (first < 0)
			return;
		count = std::min(count, FullListCountItems() - first);
		rows = CountRows(first, first + count);
		row = rows > 0 ? RowFor(first) : -1;
	}

	ReleaseLatch();
	if (rows > 0)
		RemoveRange(row, rows);
	const auto items = fFullItems.begin();
	for (int32 i = first; i < first + count; i++) {
		fFullItems[i]->fVisible = false;
		fFullItems[i]->fHasSubitems = false;
		fFullItems[i]->fStamp = 0;
	}
	fFullItems.erase(items + first, items + first + count);
	FindSubitems(first - 1);
}


// Whether the item at an index has subitems; its latch comes or goes.
void
BOutlineListView::FindSubitems(int32 fullIndex)
{
	BListItem* item = FullListItemAt(fullIndex);
	if (item == NULL)
		return;
	const BListItem* next = FullListItemAt(fullIndex + 1);
	const bool has = next != NULL && next->fLevel > item->fLevel;
	if (has == item->fHasSubitems)
		return;
	item->fHasSubitems = has;
	if (item->fVisible && Window() != NULL) {
		const int32 row = IndexOf(item);
		InvalidateRows(row, row);
	}
}


// Branches are sorted by their first items and move as a whole.
template <typename Less>
void
BOutlineListView::SortBranches(int32 first, int32 end, bool oneLevelOnly, const Less& less)
{
	struct Branch {
		int32 first;
		int32 end;
	};
	std::vector<Branch> branches;
	for (int32 i = first; i < end;) {
		const Branch branch = {i, EndOfBranch(i)};
		if (!oneLevelOnly && branch.end > i + 1)
			SortBranches(i + 1, branch.end, false, less);
		branches.push_back(branch);
		i = branch.end;
	}
	std::stable_sort(branches.begin(), branches.end(), [&](const Branch& a, const Branch& b) {
		return less(fFullItems[a.first], fFullItems[b.first]);
	});

	const auto items = fFullItems.begin();
	std::vector<BListItem*> sorted;
	sorted.reserve(static_cast<size_t>(end - first));
	for (const Branch& branch : branches)
		sorted.insert(sorted.end(), items + branch.first, items + branch.end);
	std::copy(sorted.begin(), sorted.end(), items + first);
}

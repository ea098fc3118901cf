// SPDX-License-Identifier: MIT
// BListView: its items and messages.
#include <ListView.h>

#include <algorithm>
#include <atomic>

#include <List.h>
#include <Message.h>
#include <Messenger.h>
#include <OS.h>
#include <Window.h>

#include "ListTyping.h"

namespace {

// Tells lists apart, and the time before a list was emptied from the time after: the items are not asked
// then, as they may be deleted already.
uint64
NewStamp()
{
	static std::atomic<uint64> last = 0;
	return ++last;
}


// Where a row is after some were added (\a by above 0) or removed from \a index on; -1 when it went.
int32
Shifted(int32 row, int32 index, int32 by)
{
	if (row < index)
		return row;
	if (row < index - by)
		return -1;
	return row + by;
}

} // namespace


BListView::BListView(
	BRect frame, const char* name, list_view_type type, uint32 resizeMask, uint32 flags)
	: BView(frame, name, resizeMask, flags),
	  BInvoker(NULL, NULL),
	  fTyping(std::make_unique<BPrivate::ListTyping>()),
	  fScrollView(NULL),
	  fStamp(NewStamp()),
	  fListType(type),
	  fValidTops(0),
	  fContentHeight(0),
	  fWidest(0),
	  fFirstSelected(-1),
	  fLastSelected(-1),
	  fAnchor(-1),
	  fCursor(-1),
	  fShowsCursor(false)
{
	SetViewUIColor(B_LIST_BACKGROUND_COLOR);
	SetLowUIColor(B_LIST_BACKGROUND_COLOR);
}


BListView::BListView(const char* name, list_view_type type, uint32 flags)
	: BListView(BRect(0, 0, -1, -1), name, type, B_FOLLOW_LEFT_TOP, flags)
{
}


BListView::BListView(list_view_type type)
	: BListView(static_cast<const char*>(NULL), type)
{
}


BListView::BListView(BMessage* archive)
	: BView(archive),
	  BInvoker(NULL, NULL),
	  fTyping(std::make_unique<BPrivate::ListTyping>()),
	  fScrollView(NULL),
	  fStamp(NewStamp()),
	  fListType(archive->GetInt32("_lv_type", B_SINGLE_SELECTION_LIST) == B_MULTIPLE_SELECTION_LIST
			  ? B_MULTIPLE_SELECTION_LIST
			  : B_SINGLE_SELECTION_LIST),
	  fValidTops(0),
	  fContentHeight(0),
	  fWidest(0),
	  fFirstSelected(-1),
	  fLastSelected(-1),
	  fAnchor(-1),
	  fCursor(-1),
	  fShowsCursor(false)
{
	BMessage message;
	if (archive->FindMessage("_msg", &message) == B_OK)
		SetInvocationMessage(new BMessage(message));
	if (archive->FindMessage("_2nd_msg", &message) == B_OK)
		SetSelectionMessage(new BMessage(message));

	for (int32 i = 0; archive->FindMessage("_l_items", i, &message) == B_OK; i++) {
		BArchivable* object = instantiate_object(&message);
		BListItem* item = dynamic_cast<BListItem*>(object);
		if (item == NULL) {
			delete object;
			continue;
		}
		const bool selected = item->IsSelected();
		// Not the subclass's, which is not there yet.
		BListView::AddItem(item);
		if (selected)
			SelectRange(CountItems() - 1, CountItems() - 1);
	}
}


BListView::~BListView() {}


BArchivable*
BListView::Instantiate(BMessage* archive)
{
	return validate_instantiation(archive, "BListView") ? new BListView(archive) : NULL;
}


status_t
BListView::Archive(BMessage* archive, bool deep) const
{
	status_t status = BView::Archive(archive, deep);
	if (status == B_OK)
		status = archive->AddInt32("_lv_type", fListType);
	if (status == B_OK && InvocationMessage() != NULL)
		status = archive->AddMessage("_msg", InvocationMessage());
	if (status == B_OK && fSelectMessage != NULL)
		status = archive->AddMessage("_2nd_msg", fSelectMessage.get());
	if (!deep)
		return status;
	const std::vector<BListItem*>& items = ArchivedItems();
	for (size_t i = 0; status == B_OK && i < items.size(); i++) {
		BMessage item;
		status = items[i]->Archive(&item, true);
		if (status == B_OK)
			status = archive->AddMessage("_l_items", &item);
	}
	return status;
}


bool
BListView::AddItem(BListItem* item)
{
	return BListView::AddItem(item, CountItems());
}


bool
BListView::AddItem(BListItem* item, int32 atIndex)
{
	if (item == NULL || IsStamped(item) || atIndex < 0 || atIndex > CountItems())
		return false;
	Stamp(item);
	InsertAt(atIndex, &item, 1);
	return true;
}


bool
BListView::AddList(BList* newItems)
{
	return BListView::AddList(newItems, CountItems());
}


bool
BListView::AddList(BList* newItems, int32 atIndex)
{
	if (newItems == NULL || atIndex < 0 || atIndex > CountItems())
		return false;
	std::vector<BListItem*> items;
	if (!StampAll(newItems, &items))
		return false;
	if (!items.empty())
		InsertAt(atIndex, items.data(), static_cast<int32>(items.size()));
	return true;
}


bool
BListView::RemoveItem(BListItem* item)
{
	return BListView::RemoveItem(IndexOf(item)) != NULL;
}


BListItem*
BListView::RemoveItem(int32 index)
{
	BListItem* item = BListView::ItemAt(index);
	if (item == NULL)
		return NULL;
	if (DeselectRange(index, index))
		TellSelectionChanged();
	// The hook may have changed the list.
	index = IndexOf(item);
	if (index >= 0) {
		RemoveRange(index, 1);
		item->fStamp = 0;
	}
	return item;
}


bool
BListView::RemoveItems(int32 index, int32 count)
{
	if (index < 0 || index >= CountItems() || count < 0)
		return false;
	count = std::min(count, CountItems() - index);
	if (DeselectRange(index, index + count - 1))
		TellSelectionChanged();
	count = std::min(count, CountItems() - index);
	for (int32 i = 0; i < count; i++)
		fItems[index + i]->fStamp = 0;
	if (count > 0)
		RemoveRange(index, count);
	return true;
}


void
BListView::MakeEmpty()
{
	ForgetAll();
	FixScrollBars();
	if (Window() != NULL)
		Invalidate();
}


void
BListView::SetSelectionMessage(BMessage* message)
{
	if (message != fSelectMessage.get())
		fSelectMessage.reset(message);
}


void
BListView::SetInvocationMessage(BMessage* message)
{
	SetMessage(message);
}


BMessage*
BListView::SelectionMessage() const
{
	return fSelectMessage.get();
}


BMessage*
BListView::InvocationMessage() const
{
	return Message();
}


uint32
BListView::SelectionCommand() const
{
	return fSelectMessage != NULL ? fSelectMessage->what : 0;
}


uint32
BListView::InvocationCommand() const
{
	return Command();
}


list_view_type
BListView::ListType() const
{
	return fListType;
}


BListItem*
BListView::ItemAt(int32 index) const
{
	return index >= 0 && index < CountItems() ? fItems[index] : NULL;
}


int32
BListView::IndexOf(BListItem* item) const
{
	const auto found = std::find(fItems.begin(), fItems.end(), item);
	return found != fItems.end() ? static_cast<int32>(found - fItems.begin()) : -1;
}


BListItem*
BListView::FirstItem() const
{
	return ItemAt(0);
}


BListItem*
BListView::LastItem() const
{
	return ItemAt(CountItems() - 1);
}


bool
BListView::HasItem(BListItem* item) const
{
	return IndexOf(item) >= 0;
}


int32
BListView::CountItems() const
{
	return static_cast<int32>(fItems.size());
}


bool
BListView::IsEmpty() const
{
	return fItems.empty();
}


void
BListView::DoForEach(bool (*func)(BListItem* item))
{
	if (func == NULL)
		return;
	// The function may remove items.
	for (int32 i = 0; i < CountItems(); i++) {
		if (func(fItems[i]))
			return;
	}
}


void
BListView::DoForEach(bool (*func)(BListItem* item, void* arg), void* arg)
{
	if (func == NULL)
		return;
	for (int32 i = 0; i < CountItems(); i++) {
		if (func(fItems[i], arg))
			return;
	}
}


const BListItem**
BListView::Items() const
{
	if (fItems.empty())
		return NULL;
	return const_cast<const BListItem**>(const_cast<BListItem**>(fItems.data()));
}


void
BListView::SortItems(int (*cmp)(const void*, const void*))
{
	if (cmp != NULL)
		SortAll(cmp);
}


bool
BListView::SwapItems(int32 a, int32 b)
{
	return ItemAt(a) != NULL && ItemAt(b) != NULL && SwapChecked(a, b);
}


bool
BListView::MoveItem(int32 from, int32 to)
{
	return ItemAt(from) != NULL && ItemAt(to) != NULL && MoveChecked(from, to);
}


bool
BListView::ReplaceItem(int32 index, BListItem* item)
{
	return ItemAt(index) != NULL && item != NULL && !IsStamped(item) && ReplaceChecked(index, item);
}


status_t
BListView::Invoke(BMessage* message)
{
	bool notify;
	const uint32 kind = InvokeKind(&notify);
	if (message == NULL && !notify)
		message = Message();
	if (message == NULL && !IsWatched())
		return B_BAD_VALUE;

	BMessage copy(kind);
	if (message != NULL)
		copy = *message;
	copy.AddInt64("when", system_time());
	copy.AddPointer("source", this);
	copy.AddMessenger("be:sender", BMessenger(this));
	for (int32 i = fFirstSelected; i >= 0 && i <= fLastSelected; i++) {
		if (fItems[i]->fSelected)
			copy.AddInt32("index", i);
	}
	if (fListType == B_SINGLE_SELECTION_LIST && fFirstSelected < 0)
		copy.AddInt32("index", -1);

	status_t status = B_BAD_VALUE;
	if (message != NULL)
		status = Messenger().SendMessage(&copy, HandlerForReply(), Timeout());
	SendNotices(kind, &copy);
	return status;
}


void
BListView::SortAll(int (*cmp)(const void*, const void*))
{
	std::stable_sort(fItems.begin(), fItems.end(),
		[cmp](const BListItem* a, const BListItem* b) { return cmp(&a, &b) < 0; });
	OrderChanged(0, CountItems() - 1);
}


bool
BListView::SwapChecked(int32 a, int32 b)
{
	std::swap(fItems[a], fItems[b]);
	OrderChanged(std::min(a, b), std::max(a, b));
	return true;
}


bool
BListView::MoveChecked(int32 from, int32 to)
{
	const auto items = fItems.begin();
	if (from < to)
		std::rotate(items + from, items + from + 1, items + to + 1);
	else
		std::rotate(items + to, items + from, items + from + 1);
	OrderChanged(std::min(from, to), std::max(from, to));
	return true;
}


bool
BListView::ReplaceChecked(int32 index, BListItem* item)
{
	fItems[index]->fStamp = 0;
	Stamp(item);
	ReplaceAt(index, item);
	return true;
}


const std::vector<BListItem*>&
BListView::ArchivedItems() const
{
	return fItems;
}


void
BListView::Stamp(BListItem* item)
{
	item->fStamp = fStamp;
}


bool
BListView::IsStamped(const BListItem* item) const
{
	return item->fStamp == fStamp;
}


// All or nothing; an item that comes twice is found by its stamp.
bool
BListView::StampAll(const BList* list, std::vector<BListItem*>* items)
{
	for (int32 i = 0; i < list->CountItems(); i++) {
		BListItem* item = static_cast<BListItem*>(list->ItemAt(i));
		if (item == NULL || IsStamped(item)) {
			for (BListItem* stamped : *items)
				stamped->fStamp = 0;
			return false;
		}
		Stamp(item);
		items->push_back(item);
	}
	return true;
}


// The items are new ones of this list, not selected.
void
BListView::InsertAt(int32 index, BListItem* const* items, int32 count)
{
	fItems.insert(fItems.begin() + index, items, items + count);
	fFirstSelected = Shifted(fFirstSelected, index, count);
	fLastSelected = Shifted(fLastSelected, index, count);
	fAnchor = Shifted(fAnchor, index, count);
	fCursor = Shifted(fCursor, index, count);
	fPress.index = Shifted(fPress.index, index, count);
	fValidTops = std::min(fValidTops, index);

	BFont font;
	if (Window() != NULL)
		GetFont(&font);
	for (int32 i = 0; i < count; i++) {
		BListItem* item = items[i];
		item->fSelected = false;
		item->fRowHeight = 0;
		if (Window() != NULL)
			UpdateItem(item, font);
		FitRow(item);
		if (fWidest >= 0)
			fWidest = std::max(fWidest, item->Width() + RowIndent(item));
	}
	FixScrollBars();
	InvalidateFrom(index);
}


// None of them is selected any more.
void
BListView::RemoveRange(int32 index, int32 count)
{
	// Before the rows move up: those that are to go may reach further down.
	InvalidateFrom(index);
	for (int32 i = index; i < index + count; i++) {
		fContentHeight -= fItems[i]->fRowHeight;
		if (fItems[i]->Width() + RowIndent(fItems[i]) >= fWidest)
			fWidest = -1;
	}
	fItems.erase(fItems.begin() + index, fItems.begin() + index + count);
	fFirstSelected = Shifted(fFirstSelected, index, -count);
	fLastSelected = Shifted(fLastSelected, index, -count);
	fAnchor = Shifted(fAnchor, index, -count);
	fCursor = Shifted(fCursor, index, -count);
	fPress.index = Shifted(fPress.index, index, -count);
	if (fPress.index < 0)
		fPress = Press();
	fValidTops = std::min(fValidTops, index);
	FixScrollBars();
}


// The row keeps its selection, unless the new item cannot have it.
void
BListView::ReplaceAt(int32 index, BListItem* item)
{
	BListItem* old = fItems[index];
	const bool wasSelected = old->fSelected;
	if (old->Width() + RowIndent(old) >= fWidest)
		fWidest = -1;
	fContentHeight -= old->fRowHeight;
	old->fSelected = false;
	fItems[index] = item;
	item->fSelected = wasSelected && item->fEnabled;
	item->fRowHeight = 0;
	if (Window() != NULL) {
		BFont font;
		GetFont(&font);
		UpdateItem(item, font);
	}
	FitRow(item);
	if (fWidest >= 0)
		fWidest = std::max(fWidest, item->Width() + RowIndent(item));
	fValidTops = std::min(fValidTops, index);
	FixScrollBars();
	InvalidateFrom(index);
	if (wasSelected && !item->fSelected) {
		FindSelectionAgain();
		TellSelectionChanged();
	}
}


void
BListView::OrderChanged(int32 first, int32 last)
{
	fValidTops = std::min(fValidTops, first);
	FindSelectionAgain();
	fAnchor = fFirstSelected;
	fCursor = fFirstSelected;
	fPress = Press();
	InvalidateRows(first, last);
}


void
BListView::ForgetAll()
{
	fItems.clear();
	fStamp = NewStamp();
	fPress = Press();
	fValidTops = 0;
	fContentHeight = 0;
	fWidest = 0;
	fFirstSelected = -1;
	fLastSelected = -1;
	fAnchor = -1;
	fCursor = -1;
	fShowsCursor = false;
}

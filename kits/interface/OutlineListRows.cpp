// SPDX-License-Identifier: MIT
// BOutlineListView: its rows, latches, mouse and keyboard.
#include <OutlineListView.h>

#include <algorithm>

#include <Window.h>

#include "ArrowLook.h"
#include "ControlLook.h"

namespace {

// The latch's width, and how much further right each level begins.
constexpr float kLatchWidth = 16;
constexpr float kLatchSize = 4;

} // namespace


void
BOutlineListView::MouseDown(BPoint where)
{
	BListItem* item = LatchAt(where);
	if (item == NULL) {
		BListView::MouseDown(where);
		return;
	}
	MakeFocus(true);
	SetMouseEventMask(B_POINTER_EVENTS, B_NO_POINTER_HISTORY);
	// No double click is made of a press on the latch and one on the row.
	fPress = Press();
	fPressedLatch = item;
	fLatchMisTracked = false;
	InvalidateItem(IndexOf(item));
}


void
BOutlineListView::MouseMoved(BPoint where, uint32 code, const BMessage* dragMessage)
{
	if (fPressedLatch == NULL) {
		BListView::MouseMoved(where, code, dragMessage);
		return;
	}
	const bool misTracked = LatchAt(where) != fPressedLatch;
	if (misTracked == fLatchMisTracked)
		return;
	fLatchMisTracked = misTracked;
	InvalidateItem(IndexOf(fPressedLatch));
}


void
BOutlineListView::MouseUp(BPoint where)
{
	if (fPressedLatch == NULL) {
		BListView::MouseUp(where);
		return;
	}
	BListItem* item = fPressedLatch;
	ReleaseLatch();
	if (LatchAt(where) != item)
		return;
	if (item->fExpanded)
		Collapse(item);
	else
		Expand(item);
}


void
BOutlineListView::KeyDown(const char* bytes, int32 numBytes)
{
	if (numBytes == 1 && (bytes[0] == B_LEFT_ARROW || bytes[0] == B_RIGHT_ARROW)
		&& MoveByOutlineKey(bytes[0]))
		return;
	BListView::KeyDown(bytes, numBytes);
}


void
BOutlineListView::FrameMoved(BPoint newPosition)
{
	BListView::FrameMoved(newPosition);
}


void
BOutlineListView::FrameResized(float newWidth, float newHeight)
{
	BListView::FrameResized(newWidth, newHeight);
}


void
BOutlineListView::ResizeToPreferred()
{
	BListView::ResizeToPreferred();
}


void
BOutlineListView::GetPreferredSize(float* _width, float* _height)
{
	BListView::GetPreferredSize(_width, _height);
}


void
BOutlineListView::MakeFocus(bool focus)
{
	BListView::MakeFocus(focus);
}


void
BOutlineListView::AllAttached()
{
	BListView::AllAttached();
}


void
BOutlineListView::AllDetached()
{
	BListView::AllDetached();
}


void
BOutlineListView::DetachedFromWindow()
{
	fPressedLatch = NULL;
	BListView::DetachedFromWindow();
}


void
BOutlineListView::MessageReceived(BMessage* message)
{
	BListView::MessageReceived(message);
}


void
BOutlineListView::Expand(BListItem* item)
{
	ExpandOrCollapse(item, true);
}


void
BOutlineListView::Collapse(BListItem* item)
{
	ExpandOrCollapse(item, false);
}


void
BOutlineListView::ExpandOrCollapse(BListItem* superItem, bool expand)
{
	const int32 index = FullListIndexOf(superItem);
	if (index < 0)
		return;
	superItem->fExpanded = expand;
	// What is shown counts: the item's own state may have been set before.
	if (!superItem->fVisible || !superItem->fHasSubitems
		|| fFullItems[index + 1]->fVisible == expand)
		return;
	if (expand)
		ShowBranch(index);
	else
		HideBranch(index);
}


BRect
BOutlineListView::LatchRect(BRect itemRect, int32 level) const
{
	const float left = itemRect.left + static_cast<float>(level) * kLatchWidth;
	return BRect(left, itemRect.top, left + kLatchWidth - 1, itemRect.bottom);
}


void
BOutlineListView::DrawLatch(
	BRect itemRect, int32 level, bool collapsed, bool highlighted, bool misTracked)
{
	const rgb_color background = highlighted ? ui_color(B_LIST_SELECTED_BACKGROUND_COLOR)
		: ViewColor() == B_TRANSPARENT_COLOR ? LowColor()
											 : ViewColor();
	const rgb_color text = BPrivate::ControlTextColor(true, background);
	const bool pressed = fPressedLatch != NULL && !misTracked
		&& fPressedLatch == ItemAt(IndexOf(itemRect.LeftTop()));
	BPrivate::DrawArrowHead(this, LatchRect(itemRect, level),
		collapsed ? BPrivate::ArrowDirection::kRight : BPrivate::ArrowDirection::kDown, kLatchSize,
		BPrivate::BlendColors(background, text, pressed ? 1.0f : 0.6f));
}


void
BOutlineListView::DrawItem(BListItem* item, BRect itemRect, bool complete)
{
	const rgb_color high = HighColor();
	const rgb_color low = LowColor();
	// Left of what the item draws itself.
	if (item->IsSelected() || complete) {
		const rgb_color plain = ViewColor() == B_TRANSPARENT_COLOR ? low : ViewColor();
		SetLowColor(item->IsSelected() ? ui_color(B_LIST_SELECTED_BACKGROUND_COLOR) : plain);
		FillRect(itemRect, B_SOLID_LOW);
	}
	if (item->fHasSubitems) {
		DrawLatch(itemRect, static_cast<int32>(item->fLevel), !item->fExpanded, item->IsSelected(),
			item == fPressedLatch && fLatchMisTracked);
	}
	SetHighColor(high);
	SetLowColor(low);
	itemRect.left += RowIndent(item);
	BListView::DrawItem(item, itemRect, complete);
}


float
BOutlineListView::RowIndent(const BListItem* item) const
{
	return (static_cast<float>(item->fLevel) + 1) * kLatchWidth;
}


// Whether all that the item lies under is expanded.
bool
BOutlineListView::ShouldShow(int32 fullIndex) const
{
	const uint32 level = fFullItems[fullIndex]->fLevel;
	for (int32 i = fullIndex - 1; i >= 0; i--) {
		const BListItem* before = fFullItems[i];
		if (before->fLevel == level)
			return before->fVisible;
		if (before->fLevel < level)
			return before->fVisible && before->fExpanded;
	}
	return true;
}


// The row that an item is in, or would be in.
int32
BOutlineListView::RowFor(int32 fullIndex) const
{
	int32 before = fullIndex - 1;
	while (before >= 0 && !fFullItems[before]->fVisible)
		before--;
	if (before < 0)
		return 0;
	// Most items are added at the end.
	BListItem* item = fFullItems[before];
	return LastItem() == item ? CountItems() : IndexOf(item) + 1;
}


int32
BOutlineListView::CountRows(int32 first, int32 end) const
{
	return static_cast<int32>(std::count_if(fFullItems.begin() + first, fFullItems.begin() + end,
		[](const BListItem* item) { return item->fVisible; }));
}


void
BOutlineListView::GetShown(int32 first, int32 end, std::vector<BListItem*>* shown) const
{
	for (int32 i = first; i < end;) {
		BListItem* item = fFullItems[i];
		shown->push_back(item);
		i = item->fExpanded ? i + 1 : EndOfBranch(i);
	}
}


// After the full list got another order. Items that stay in sight keep their selection.
void
BOutlineListView::RebuildRows()
{
	ReleaseLatch();
	std::vector<BListItem*> shown;
	GetShown(0, FullListCountItems(), &shown);

	const std::vector<BListItem*> before = std::move(fItems);
	std::vector<BListItem*> selected;
	for (BListItem* item : before) {
		if (item->fSelected)
			selected.push_back(item);
		item->fVisible = false;
	}
	fItems.clear();
	fContentHeight = 0;
	fWidest = 0;
	fFirstSelected = -1;
	fLastSelected = -1;
	for (int32 i = 0; i < FullListCountItems(); i++) {
		const BListItem* next = FullListItemAt(i + 1);
		fFullItems[i]->fHasSubitems = next != NULL && next->fLevel > fFullItems[i]->fLevel;
	}
	for (BListItem* item : shown)
		item->fVisible = true;
	InsertAt(0, shown.data(), static_cast<int32>(shown.size()));

	bool lost = false;
	for (BListItem* item : selected) {
		item->fSelected = item->fVisible;
		lost = lost || !item->fVisible;
	}
	OrderChanged(0, CountItems() - 1);
	if (Window() != NULL)
		Invalidate();
	if (lost)
		TellSelectionChanged();
}


void
BOutlineListView::ShowBranch(int32 fullIndex)
{
	std::vector<BListItem*> shown;
	GetShown(fullIndex + 1, EndOfBranch(fullIndex), &shown);
	const int32 row = RowFor(fullIndex);
	for (BListItem* item : shown)
		item->fVisible = true;
	InsertAt(row + 1, shown.data(), static_cast<int32>(shown.size()));
	InvalidateRows(row, row);
}


void
BOutlineListView::HideBranch(int32 fullIndex)
{
	const int32 end = EndOfBranch(fullIndex);
	const int32 row = RowFor(fullIndex);
	const int32 count = CountRows(fullIndex + 1, end);
	const bool deselected = DeselectRange(row + 1, row + count);
	RemoveRange(row + 1, count);
	for (int32 i = fullIndex + 1; i < end; i++)
		fFullItems[i]->fVisible = false;
	InvalidateRows(row, row);

	if (!deselected)
		return;
	// The keyboard goes on from what the hidden row lay under.
	if (fFirstSelected < 0 && SelectRange(row, row)) {
		fAnchor = row;
		SetCursor(row, false);
	}
	TellSelectionChanged();
}


// Right opens an item and then goes to its first subitem; left closes it and then goes up.
bool
BOutlineListView::MoveByOutlineKey(char key)
{
	BListItem* item = ItemAt(KeyboardRow());
	if (item == NULL)
		return false;
	const bool open = item->fHasSubitems && item->fExpanded;
	BListItem* next = NULL;
	if (key == B_RIGHT_ARROW) {
		if (!item->fHasSubitems)
			return true;
		if (!open) {
			Expand(item);
			return true;
		}
		next = ItemAt(IndexOf(item) + 1);
	} else {
		if (open) {
			Collapse(item);
			return true;
		}
		next = Superitem(item);
	}
	if (next == NULL || !next->fEnabled)
		return true;
	Select(IndexOf(next));
	ScrollTo(IndexOf(next));
	return true;
}


// The item whose latch is at a place; null when there is none.
BListItem*
BOutlineListView::LatchAt(BPoint where)
{
	const int32 row = IndexOf(where);
	BListItem* item = ItemAt(row);
	if (item == NULL || !item->fHasSubitems)
		return NULL;
	const BRect latch = LatchRect(ItemFrame(row), static_cast<int32>(item->fLevel));
	return latch.Contains(where) ? item : NULL;
}


void
BOutlineListView::ReleaseLatch()
{
	BListItem* item = fPressedLatch;
	fPressedLatch = NULL;
	if (item != NULL && Window() != NULL)
		InvalidateItem(IndexOf(item));
}

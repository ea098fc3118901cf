// SPDX-License-Identifier: MIT
// BListView: where its rows are, their picture, and its scroll bars.
#include <ListView.h>

#include <algorithm>
#include <cmath>

#include <ScrollBar.h>
#include <ScrollView.h>
#include <Window.h>

namespace {

constexpr float kSidewaysStep = 10;


// What a bar shows of \a content pixels, of which \a seen (right-left sense) are seen.
void
FitBar(BScrollBar* bar, float content, float seen, float smallStep)
{
	if (bar == NULL)
		return;
	seen = std::max(seen, 0.0f);
	bar->SetRange(0, std::max(content - 1 - seen, 0.0f));
	bar->SetProportion(content > 0 ? (seen + 1) / content : 1);
	bar->SetSteps(smallStep, std::max(seen, smallStep));
}

} // namespace


void
BListView::AttachedToWindow()
{
	BView::AttachedToWindow();
	if (!Messenger().IsValid())
		SetTarget(Window(), NULL);
	UpdateAllItems();
}


void
BListView::DetachedFromWindow()
{
	fPress = Press();
	BView::DetachedFromWindow();
}


void
BListView::AllAttached()
{
	BView::AllAttached();
}


void
BListView::AllDetached()
{
	BView::AllDetached();
}


void
BListView::FrameResized(float newWidth, float newHeight)
{
	BView::FrameResized(newWidth, newHeight);
	FixScrollBars();
	// Rows reach to the right edge, which moved.
	Invalidate();
}


void
BListView::FrameMoved(BPoint newPosition)
{
	BView::FrameMoved(newPosition);
}


void
BListView::TargetedByScrollView(BScrollView* scrollView)
{
	fScrollView = scrollView;
	BView::TargetedByScrollView(scrollView);
	FixScrollBars();
}


void
BListView::WindowActivated(bool active)
{
	BView::WindowActivated(active);
	if (IsFocus())
		FocusChanged();
}


void
BListView::MakeFocus(bool focus)
{
	if (focus == IsFocus())
		return;
	BView::MakeFocus(focus);
	FocusChanged();
}


void
BListView::SetFont(const BFont* font, uint32 mask)
{
	BView::SetFont(font, mask);
	if (Window() != NULL)
		UpdateAllItems();
}


void
BListView::GetPreferredSize(float* _width, float* _height)
{
	if (_width != NULL)
		*_width = fItems.empty() ? Bounds().Width() : ContentWidth() - 1;
	if (_height != NULL)
		*_height = fItems.empty() ? Bounds().Height() : ContentHeight() - 1;
}


void
BListView::ResizeToPreferred()
{
	BView::ResizeToPreferred();
}


void
BListView::Draw(BRect updateRect)
{
	const rgb_color high = HighColor();
	const rgb_color low = LowColor();
	const int32 first = std::max(RowAt(std::max(updateRect.top, 0.0f)), int32(0));
	for (int32 i = first; i < CountItems() && TopOf(i) <= updateRect.bottom; i++) {
		DrawItem(fItems[i], ItemFrame(i));
		SetHighColor(high);
		SetLowColor(low);
	}

	const bool focused = IsFocus() && Window()->IsActive();
	SetHighColor(ui_color(B_KEYBOARD_NAVIGATION_COLOR));
	if (focused && fShowsCursor && fCursor >= 0)
		StrokeRect(ItemFrame(fCursor));
	if (focused && DrawsOwnFocus())
		StrokeRect(Bounds());
	SetHighColor(high);
}


void
BListView::DrawItem(BListItem* item, BRect itemRect, bool complete)
{
	item->DrawItem(this, itemRect, complete);
}


void
BListView::InvalidateItem(int32 index)
{
	BListItem* item = ItemAt(index);
	if (item == NULL)
		return;
	if (fWidest >= 0)
		fWidest = item->Width() + RowIndent(item) < fWidest ? -1 : fWidest;
	if (!FitRow(item)) {
		InvalidateRows(index, index);
		return;
	}
	fValidTops = std::min(fValidTops, index + 1);
	FixScrollBars();
	InvalidateFrom(index);
}


BRect
BListView::ItemFrame(int32 index)
{
	if (index < 0 || index >= CountItems())
		return BRect();
	const float top = TopOf(index);
	return BRect(0, top, Bounds().right, top + fItems[index]->fRowHeight - 1);
}


int32
BListView::IndexOf(BPoint point) const
{
	return point.y < 0 ? -1 : RowAt(point.y);
}


void
BListView::ScrollTo(BPoint where)
{
	const BPoint before = LeftTop();
	BView::ScrollTo(where);
	// The focus ring stays where it is while the rows move.
	if (Window() != NULL && LeftTop() != before && IsFocus() && DrawsOwnFocus())
		Invalidate();
}


void
BListView::ScrollTo(float x, float y)
{
	ScrollTo(BPoint(x, y));
}


void
BListView::ScrollTo(int32 index)
{
	if (index < 0 || index >= CountItems())
		return;
	const BRect frame = ItemFrame(index);
	const BRect bounds = Bounds();
	// A row that is higher than the view shows its top.
	if (frame.top < bounds.top || frame.Height() > bounds.Height())
		ScrollTo(BPoint(bounds.left, frame.top));
	else if (frame.bottom > bounds.bottom)
		ScrollTo(BPoint(bounds.left, frame.bottom - bounds.Height()));
}


void
BListView::ScrollToSelection()
{
	ScrollTo(CurrentSelection());
}


float
BListView::RowIndent(const BListItem*) const
{
	return 0;
}


void
BListView::UpdateItem(BListItem* item, const BFont& font)
{
	item->Update(this, &font);
}


void
BListView::UpdateAllItems()
{
	BFont font;
	GetFont(&font);
	fValidTops = 0;
	fWidest = -1;
	for (int32 i = 0; i < CountItems(); i++) {
		UpdateItem(fItems[i], font);
		FitRow(fItems[i]);
	}
	FixScrollBars();
	Invalidate();
}


// The row becomes as high as the item wants it; false when it is already. Those below move.
bool
BListView::FitRow(BListItem* item)
{
	const float height = std::ceil(std::max(item->Height(), 0.0f)) + 1;
	if (height == item->fRowHeight)
		return false;
	fContentHeight += height - item->fRowHeight;
	item->fRowHeight = height;
	return true;
}


float
BListView::TopOf(int32 index) const
{
	for (; fValidTops <= index; fValidTops++) {
		const BListItem* above = fValidTops > 0 ? fItems[fValidTops - 1] : NULL;
		fItems[fValidTops]->fTop = above != NULL ? above->fTop + above->fRowHeight : 0;
	}
	return fItems[index]->fTop;
}


float
BListView::ContentHeight() const
{
	return static_cast<float>(fContentHeight);
}


float
BListView::ContentWidth() const
{
	if (fWidest < 0) {
		fWidest = 0;
		for (const BListItem* item : fItems)
			fWidest = std::max(fWidest, item->Width() + RowIndent(item));
	}
	return std::ceil(fWidest);
}


// -1 beyond the last row.
int32
BListView::RowAt(float y) const
{
	if (fItems.empty() || y >= ContentHeight())
		return -1;
	TopOf(CountItems() - 1);
	const auto after = std::upper_bound(fItems.begin(), fItems.end(), y,
		[](float place, const BListItem* item) { return place < item->fTop; });
	return std::max(static_cast<int32>(after - fItems.begin()) - 1, int32(0));
}


// The row and what is below it, to the bottom.
void
BListView::InvalidateFrom(int32 index)
{
	if (Window() == NULL)
		return;
	BRect rest = Bounds();
	if (index > 0)
		rest.top = std::max(rest.top, TopOf(index - 1) + fItems[index - 1]->fRowHeight);
	if (rest.IsValid())
		Invalidate(rest);
}


void
BListView::InvalidateRows(int32 first, int32 last)
{
	if (Window() == NULL || first < 0 || last < first)
		return;
	last = std::min(last, CountItems() - 1);
	BRect rows = Bounds();
	rows.top = std::max(rows.top, TopOf(first));
	rows.bottom = std::min(rows.bottom, TopOf(last) + fItems[last]->fRowHeight - 1);
	if (rows.IsValid())
		Invalidate(rows);
}


void
BListView::FixScrollBars()
{
	const BRect bounds = Bounds();
	const float row = fItems.empty() ? kSidewaysStep : fItems[0]->fRowHeight;
	FitBar(ScrollBar(B_VERTICAL), ContentHeight(), bounds.Height(), row);
	if (ScrollBar(B_HORIZONTAL) != NULL)
		FitBar(ScrollBar(B_HORIZONTAL), ContentWidth(), bounds.Width(), kSidewaysStep);
}


// A scroll view's border shows it otherwise.
bool
BListView::DrawsOwnFocus() const
{
	return fScrollView == NULL || fScrollView->Border() == B_NO_BORDER;
}


void
BListView::FocusChanged()
{
	if (fScrollView != NULL)
		fScrollView->SetBorderHighlighted(IsFocus() && Window() != NULL && Window()->IsActive());
	if (Window() == NULL)
		return;
	if (DrawsOwnFocus() || fShowsCursor)
		Invalidate();
}

// SPDX-License-Identifier: MIT
// BTabView: where its tabs and its box are, and how they are drawn.
#include <TabView.h>

#include <algorithm>
#include <cmath>

#include <Window.h>

#include "BarLook.h"

namespace {

// Before the first tab.
constexpr float kStripInset = 6;
// A tab of the usual width, and what a label has around it in the others.
constexpr float kUsualWidth = 100;
constexpr float kLabelSpace = 20;
// How far a tab that is not selected stays behind the selected one.
constexpr float kSetBack = 2;
constexpr float kArrowLength = 18;
constexpr float kFancyBorder = 3;
constexpr float kPlainBorder = 1;

} // namespace


void
BTabView::FrameResized(float newWidth, float newHeight)
{
	BView::FrameResized(newWidth, newHeight);
	TabChanged();
	ShowTab(fSelection);
}


void
BTabView::GetPreferredSize(float* _width, float* _height)
{
	// Room for all tabs, and for the largest view.
	float along = 2 * kStripInset;
	float width = 0;
	float height = 0;
	for (int32 i = 0; i < CountTabs(); i++) {
		along += LengthOfTab(i);
		const BView* view = ViewForTab(i);
		if (view == NULL)
			continue;
		width = std::max(width, view->Frame().right);
		height = std::max(height, view->Frame().bottom);
	}
	width += 2 * BorderWidth();
	height += 2 * BorderWidth();
	const float strip = StripThickness();
	if (_width != NULL)
		*_width = IsSideways() ? width + strip : std::max(width, along);
	if (_height != NULL)
		*_height = IsSideways() ? std::max(height, along) : height + strip;
}


void
BTabView::SetFont(const BFont* font, uint32 mask)
{
	BView::SetFont(font, mask);
	// While the object is being made there is no container yet.
	if (fContainer == NULL)
		return;
	if ((mask & B_FONT_SIZE) != 0)
		fTabHeight = std::max(fTabHeight, DefaultTabHeight());
	TabChanged();
}


void
BTabView::SetTabHeight(float height)
{
	fTabHeight = std::max(std::floor(height), 1.0f);
	TabChanged();
}


float
BTabView::TabHeight() const
{
	return fTabHeight;
}


void
BTabView::SetBorder(border_style borderStyle)
{
	fBorder = borderStyle;
	LayOutContainer();
	Redraw();
}


border_style
BTabView::Border() const
{
	return fBorder;
}


void
BTabView::SetTabSide(tab_side tabSide)
{
	fTabSide = tabSide;
	TabChanged();
}


BTabView::tab_side
BTabView::TabSide() const
{
	return fTabSide;
}


BRect
BTabView::TabFrame(int32 index) const
{
	if (index < fFirstTab || index >= CountTabs())
		return BRect();
	float start = kStripInset;
	for (int32 i = fFirstTab; i < index; i++)
		start += LengthOfTab(i);
	const float end = start + LengthOfTab(index);
	// Of the first one as much is shown as there is room for; others are shown whole.
	if (index > fFirstTab && end > RoomForTabs())
		return BRect();

	const BRect strip = StripFrame();
	if (IsSideways())
		return BRect(
			strip.left, strip.top + start, strip.right, strip.top + std::min(end, RoomForTabs()));
	return BRect(
		strip.left + start, strip.top, strip.left + std::min(end, RoomForTabs()), strip.bottom);
}


void
BTabView::Draw(BRect)
{
	DrawBox(DrawTabs());
	if (!NeedsArrows())
		return;
	for (int32 direction : {-1, 1}) {
		const bool works = direction < 0 ? fFirstTab > 0 : fFirstTab < LastFirstTab();
		BPrivate::DrawArrow(this, ArrowFrame(direction), IsSideways() ? 0 : direction,
			IsSideways() ? direction : 0, works);
	}
}


BRect
BTabView::DrawTabs()
{
	for (int32 i = 0; i < CountTabs(); i++) {
		BRect frame = TabFrame(i);
		if (i == fSelection || !frame.IsValid())
			continue;
		switch (fTabSide) {
			case kBottomSide:
				frame.bottom -= kSetBack;
				break;
			case kLeftSide:
				frame.left += kSetBack;
				break;
			case kRightSide:
				frame.right -= kSetBack;
				break;
			default:
				frame.top += kSetBack;
				break;
		}
		TabAt(i)->DrawTab(this, frame, i == 0 ? B_TAB_FIRST : B_TAB_ANY);
		DrawFocus(i, frame);
	}

	// The selected one last: it covers the edges of its neighbours.
	const BRect selected = TabFrame(fSelection);
	if (selected.IsValid()) {
		TabAt(fSelection)->DrawTab(this, selected, B_TAB_FRONT);
		DrawFocus(fSelection, selected);
	}
	return selected;
}


void
BTabView::DrawBox(BRect selectedTabRect)
{
	const BRect box = BoxFrame();
	BRect border = box;
	if (fBorder == B_NO_BORDER) {
		// Only the line that the tabs stand on: the other sides lie outside of the view.
		const float outside = 2;
		border.InsetBy(-outside, -outside);
		if (fTabSide == kBottomSide)
			border.bottom = box.bottom;
		else if (fTabSide == kLeftSide)
			border.left = box.left;
		else if (fTabSide == kRightSide)
			border.right = box.right;
		else
			border.top = box.top;
	}
	SetHighColor(BPrivate::TabBorderColor(this));
	StrokeRect(border);
	if (!selectedTabRect.IsValid())
		return;

	// The selected tab opens onto the box.
	BRect opening = selectedTabRect & box;
	if (IsSideways())
		opening.InsetBy(0, 1);
	else
		opening.InsetBy(1, 0);
	SetHighColor(BPrivate::TabColor(this, true, true));
	if (opening.IsValid())
		FillRect(opening);
}


/// The container keeps to the box; the views in it follow.
void
BTabView::LayOutContainer()
{
	BRect inner = BoxFrame().InsetByCopy(BorderWidth(), BorderWidth());
	if (fBorder == B_NO_BORDER) {
		// The line that the tabs stand on is left free.
		if (fTabSide == kBottomSide)
			inner.bottom--;
		else if (fTabSide == kLeftSide)
			inner.left++;
		else if (fTabSide == kRightSide)
			inner.right--;
		else
			inner.top++;
	}
	fContainer->MoveTo(inner.LeftTop());
	fContainer->ResizeTo(inner.Width(), inner.Height());
}


bool
BTabView::IsSideways() const
{
	return fTabSide == kLeftSide || fTabSide == kRightSide;
}


float
BTabView::BorderWidth() const
{
	switch (fBorder) {
		case B_PLAIN_BORDER:
			return kPlainBorder;
		case B_NO_BORDER:
			return 0;
		default:
			return kFancyBorder;
	}
}


float
BTabView::DefaultTabHeight() const
{
	return BPrivate::TextLineHeight(this) + 6;
}


/// What a label needs, or the usual width.
float
BTabView::WidthOfTab(int32 index) const
{
	switch (fTabWidth) {
		case B_WIDTH_FROM_LABEL:
			return TabAt(index)->fLabelWidth + kLabelSpace;
		case B_WIDTH_FROM_WIDEST:
			return fWidestLabel + kLabelSpace;
		default:
			return kUsualWidth;
	}
}


/// The labels' widths are asked for again and again: they are measured once for each change.
void
BTabView::MeasureLabels()
{
	fWidestLabel = 0;
	for (int32 i = 0; i < CountTabs(); i++) {
		BTab* tab = TabAt(i);
		tab->fLabelWidth = std::ceil(StringWidth(tab->Label()));
		fWidestLabel = std::max(fWidestLabel, tab->fLabelWidth);
	}
}


/// How far the strip of tabs reaches from its side, up to the box's border.
float
BTabView::StripThickness() const
{
	if (!IsSideways())
		return fTabHeight;
	float widest = 0;
	for (int32 i = 0; i < CountTabs(); i++)
		widest = std::max(widest, WidthOfTab(i));
	return CountTabs() > 0 ? widest : kUsualWidth;
}


/// Along the strip.
float
BTabView::LengthOfTab(int32 index) const
{
	return IsSideways() ? fTabHeight : WidthOfTab(index);
}


BRect
BTabView::StripFrame() const
{
	BRect strip = Bounds();
	switch (fTabSide) {
		case kBottomSide:
			strip.top = strip.bottom - StripThickness();
			break;
		case kLeftSide:
			strip.right = strip.left + StripThickness();
			break;
		case kRightSide:
			strip.left = strip.right - StripThickness();
			break;
		default:
			strip.bottom = strip.top + StripThickness();
			break;
	}
	return strip;
}


/// The border's frame; it shares a line with the strip.
BRect
BTabView::BoxFrame() const
{
	BRect box = Bounds();
	switch (fTabSide) {
		case kBottomSide:
			box.bottom -= StripThickness();
			break;
		case kLeftSide:
			box.left += StripThickness();
			break;
		case kRightSide:
			box.right -= StripThickness();
			break;
		default:
			box.top += StripThickness();
			break;
	}
	return box;
}


float
BTabView::LengthOfStrip() const
{
	const BRect bounds = Bounds();
	return IsSideways() ? bounds.Height() : bounds.Width();
}


bool
BTabView::NeedsArrows() const
{
	float needed = kStripInset;
	for (int32 i = 0; i < CountTabs(); i++)
		needed += LengthOfTab(i);
	return needed > LengthOfStrip();
}


/// How far tabs may reach along the strip.
float
BTabView::RoomForTabs() const
{
	return NeedsArrows() ? LengthOfStrip() - 2 * kArrowLength - 2 : LengthOfStrip();
}


/// The arrow that scrolls backwards (-1) or forwards (1).
BRect
BTabView::ArrowFrame(int32 direction) const
{
	BRect frame = StripFrame();
	if (IsSideways()) {
		frame.bottom -= direction < 0 ? kArrowLength : 0;
		frame.top = frame.bottom - kArrowLength + 1;
	} else {
		frame.right -= direction < 0 ? kArrowLength : 0;
		frame.left = frame.right - kArrowLength + 1;
	}
	return frame;
}


/// The tab that is first when the strip is scrolled to its end.
int32
BTabView::LastFirstTab() const
{
	int32 first = std::max<int32>(CountTabs() - 1, 0);
	if (CountTabs() == 0)
		return 0;
	float needed = kStripInset + LengthOfTab(first);
	while (first > 0 && needed + LengthOfTab(first - 1) <= RoomForTabs()) {
		first--;
		needed += LengthOfTab(first);
	}
	return first;
}


void
BTabView::ScrollTabs(int32 direction)
{
	const int32 first = std::clamp<int32>(fFirstTab + direction, 0, LastFirstTab());
	if (first == fFirstTab)
		return;
	fFirstTab = first;
	Redraw();
}


/// Scrolls the strip until the tab is whole, as far as there is room for it.
void
BTabView::ShowTab(int32 index)
{
	if (index < 0)
		return;
	const int32 before = fFirstTab;
	fFirstTab = std::clamp<int32>(std::min(fFirstTab, index), 0, LastFirstTab());
	while (fFirstTab < index && !TabFrame(index).IsValid())
		fFirstTab++;
	if (fFirstTab != before)
		Redraw();
}


void
BTabView::DrawFocus(int32 index, BRect frame)
{
	if (index == fFocusTab && IsFocus() && Window()->IsActive())
		TabAt(index)->DrawFocusMark(this, frame);
}

// SPDX-License-Identifier: MIT
// A row of tabs, each with a page below.

#include "props/TabView.h"

#include <algorithm>
#include <cmath>

#include <Font.h>
#include <InterfaceDefs.h>
#include <Region.h>
#include <Window.h>

namespace {

constexpr rgb_color kSurfaceColor = {216, 216, 216, 255};
constexpr rgb_color kLabelColor = {0, 0, 0, 255};
constexpr rgb_color kLightColor = {255, 255, 255, 255};
constexpr rgb_color kCornerColor = {190, 190, 190, 255};
constexpr rgb_color kShadowColor = {152, 152, 152, 255};

constexpr float kLabelTop = 5;
constexpr float kTabPadding = 6;
constexpr float kLabelPadding = 18;
constexpr float kTabGap = 2;
constexpr float kCorner = 2; // how much of a tab's upper corners is cut

} // namespace

TabView::TabView(BRect frame, const char* name, const char** labels, long count,
	uint32 resizingMode, uint32 flags, const BFont* font)
	: BView(frame, name, resizingMode, flags | B_FRAME_EVENTS),
	  fSelected(0),
	  fTabHeight(0),
	  fBounds(Bounds())
{
	SetViewColor(kSurfaceColor);
	SetLowColor(kSurfaceColor);
	if (font != nullptr)
		SetFont(font);
	for (long i = 0; i < count; i++)
		fTabs.push_back({labels[i], BRect(), BRect(), BPoint(), nullptr});
	PlaceTabs();
}


TabView::~TabView() {}


void
TabView::AddViews(BView** views)
{
	for (size_t i = 0; i < fTabs.size(); i++) {
		fTabs[i].page = views[i];
		if (views[i] == nullptr)
			continue;
		if (static_cast<long>(i) != fSelected)
			views[i]->Hide();
		AddChild(views[i]);
	}
}


void
TabView::SelectTab(long index)
{
	if (index == fSelected || index < 0 || index >= static_cast<long>(fTabs.size()))
		return;

	tab_entry& oldTab = fTabs[fSelected];
	Invalidate(DrawnFrame(oldTab));
	if (oldTab.page != nullptr)
		oldTab.page->Hide();

	fSelected = index;
	tab_entry& newTab = fTabs[fSelected];
	Invalidate(DrawnFrame(newTab));
	if (newTab.page != nullptr)
		newTab.page->Show();
}


float
TabView::GetTabsWidth() const
{
	return fTabs.empty() ? 3 : fTabs.back().frame.right + 3;
}


void
TabView::Draw(BRect updateRect)
{
	BRegion clipping;
	GetClippingRegion(&clipping);
	for (const tab_entry& tab : fTabs) {
		if (clipping.Intersects(DrawnFrame(tab)))
			DrawTab(tab);
	}
	DrawContentFrame(updateRect);
}


void
TabView::MouseDown(BPoint where)
{
	for (size_t i = 0; i < fTabs.size(); i++) {
		const long index = static_cast<long>(i);
		if (index != fSelected && fTabs[i].frame.Contains(where))
			SelectTab(index);
	}
	MakeFocus(true);
}


void
TabView::KeyDown(const char* bytes, int32 numBytes)
{
	const char key = numBytes == 1 ? bytes[0] : '\0';
	if (key == B_LEFT_ARROW)
		SelectTab(fSelected - 1);
	else if (key == B_RIGHT_ARROW)
		SelectTab(fSelected + 1);
	else
		BView::KeyDown(bytes, numBytes);
}


void
TabView::MakeFocus(bool focus)
{
	BView::MakeFocus(focus);
	if (!fTabs.empty())
		Invalidate(fTabs[fSelected].frame);
}


void
TabView::FrameResized(float width, float height)
{
	BView::FrameResized(width, height);
	const BRect old = fBounds;
	fBounds = Bounds();
	// The frame's right and bottom lines leave their old place and appear at the new one.
	const float left = std::min(old.right, fBounds.right) - 1;
	const float top = std::min(old.bottom, fBounds.bottom) - 1;
	const float right = std::max(old.right, fBounds.right);
	const float bottom = std::max(old.bottom, fBounds.bottom);
	if (old.right != fBounds.right)
		Invalidate(BRect(left, 0, right, bottom));
	if (old.bottom != fBounds.bottom)
		Invalidate(BRect(0, top, right, bottom));
}


void
TabView::PlaceTabs()
{
	font_height height;
	GetFontHeight(&height);
	const float ascent = std::ceil(height.ascent);
	const float labelHeight = ascent + std::ceil(height.descent);
	fTabHeight = labelHeight + kTabPadding;

	float widest = 0;
	for (const tab_entry& tab : fTabs)
		widest = std::max(widest, StringWidth(tab.label.String()));
	const float tabWidth = std::floor(widest + kLabelPadding);

	for (size_t i = 0; i < fTabs.size(); i++) {
		tab_entry& tab = fTabs[i];
		const float left = (tabWidth + kTabGap) * static_cast<float>(i);
		tab.frame.Set(left, 0, left + tabWidth + kTabGap - 1, fTabHeight);
		const float labelWidth = StringWidth(tab.label.String());
		const float labelLeft = left + std::floor((tabWidth - labelWidth) / 2);
		tab.labelFrame.Set(labelLeft, kLabelTop, labelLeft + labelWidth, kLabelTop + labelHeight);
		tab.pen.Set(labelLeft, kLabelTop + ascent);
	}
	fContentArea.Set(fBounds.left + 1, fTabHeight + 1, fBounds.right - 1, fBounds.bottom - 1);
}


/// A tab and the line below it, which the selected tab covers.
BRect
TabView::DrawnFrame(const tab_entry& tab) const
{
	BRect frame(tab.frame);
	frame.bottom++;
	return frame;
}


void
TabView::DrawTab(const tab_entry& tab)
{
	const bool selected = &tab == &fTabs[fSelected];
	BRect frame(tab.frame);
	SetHighColor(kSurfaceColor);
	FillRect(selected ? DrawnFrame(tab) : frame);

	SetHighColor(kLabelColor);
	DrawString(tab.label.String(), tab.pen);
	if (selected && IsFocus() && Window() != nullptr && Window()->IsActive()) {
		SetHighColor(keyboard_navigation_color());
		const float line = tab.labelFrame.bottom - 1;
		StrokeLine(BPoint(tab.labelFrame.left, line), BPoint(tab.labelFrame.right, line));
	}

	// The selected tab's edges run on into the frame of the content area.
	const float bottom = selected ? frame.bottom : frame.bottom - 1;
	BeginLineArray(5);
	AddLine(BPoint(frame.left, bottom), BPoint(frame.left, frame.top + kCorner), kLightColor);
	AddLine(BPoint(frame.left, frame.top + kCorner), BPoint(frame.left + kCorner, frame.top),
		kLightColor);
	AddLine(BPoint(frame.left + kCorner, frame.top), BPoint(frame.right - kCorner, frame.top),
		kLightColor);
	AddLine(BPoint(frame.right - kCorner, frame.top), BPoint(frame.right, frame.top + kCorner),
		kCornerColor);
	AddLine(BPoint(frame.right, frame.top + kCorner), BPoint(frame.right, frame.bottom - 1),
		kShadowColor);
	EndLineArray();
	SetHighColor(kLabelColor);
}


void
TabView::DrawContentFrame(BRect updateRect)
{
	const float top = fTabHeight;
	const BRect frame(fBounds.left, top, fBounds.right, fBounds.bottom);
	BeginLineArray(5);
	if (updateRect.top <= top && updateRect.bottom >= top && !fTabs.empty()) {
		const BRect selected = fTabs[fSelected].frame;
		if (selected.left > frame.left)
			AddLine(frame.LeftTop(), BPoint(selected.left, top), kLightColor);
		if (selected.right < frame.right)
			AddLine(BPoint(selected.right, top), frame.RightTop(), kLightColor);
	}
	if (updateRect.left <= frame.left)
		AddLine(BPoint(frame.left, top), frame.LeftBottom(), kLightColor);
	if (updateRect.right >= frame.right)
		AddLine(BPoint(frame.right, top), frame.RightBottom(), kShadowColor);
	if (updateRect.bottom >= frame.bottom)
		AddLine(frame.LeftBottom(), frame.RightBottom(), kShadowColor);
	EndLineArray();
}

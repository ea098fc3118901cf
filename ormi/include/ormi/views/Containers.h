// SPDX-License-Identifier: MIT
// Views that show one part of what they hold.

#pragma once

#include <algorithm>

#include <ListView.h>
#include <ScrollBar.h>
#include <ScrollView.h>
#include <TabView.h>
#include <TextView.h>

#include <ormi/views/ItemText.h>

namespace Ormi {

/// The part of a scroll view's \a frame, in its coordinates, that is left to what it scrolls.
inline BRect
ScrolledFrame(BRect frame, bool horizontal, bool vertical, border_style border)
{
	const float line = border == B_NO_BORDER ? 1 : 0;
	const float edge = border == B_FANCY_BORDER ? 2 : border == B_PLAIN_BORDER ? 1 : 0;
	BRect scrolled = frame.OffsetToCopy(B_ORIGIN).InsetByCopy(edge, edge);
	if (vertical)
		scrolled.right -= B_V_SCROLL_BAR_WIDTH + line;
	if (horizontal)
		scrolled.bottom -= B_H_SCROLL_BAR_HEIGHT + line;
	return scrolled;
}


/// Lets \a bar, which may be null, scroll what is \a used of a page through what is \a seen of it: the
/// page's last pixel and the view's, along the bar.
inline void
FitScrollBar(BScrollBar* bar, float used, float seen)
{
	const float kStep = 10;
	if (bar == nullptr)
		return;
	bar->SetRange(0, std::max(0.0f, used - seen));
	bar->SetProportion(used > seen ? (seen + 1) / (used + 1) : 1);
	bar->SetSteps(kStep, std::max(kStep, seen - kStep));
}


/// Whether a scroll view lets \a view scroll itself.
inline bool
IsScrollable(const BView* view)
{
	return dynamic_cast<const BListView*>(view) != nullptr
		|| dynamic_cast<const BTextView*>(view) != nullptr;
}


/// A scroll view that other views are added to.
///
/// A list or a text that is added first fills it and is scrolled. Everything else lies on a page that is
/// as large as what it holds, and the page is scrolled. Frames of added views are in the scroll view's
/// coordinates until they are added.
class ScrollPane : public BScrollView {
public:
	ScrollPane(BRect frame, const char* name, bool horizontal, bool vertical, border_style border)
		: ScrollPane(frame, name, MakePage(frame, horizontal, vertical, border), horizontal,
			vertical, border)
	{
		MoveTo(frame.LeftTop());
	}

	virtual ~ScrollPane()
	{
		if (fPage->Parent() == nullptr)
			delete fPage;
	}

	/// Hides the base's: see above for where \a child goes.
	void AddChild(BView* child, BView* before = nullptr)
	{
		if (IsScrollable(child) && Target() == fPage && fPage->CountChildren() == 0) {
			const BRect frame = fPage->Frame();
			SetTarget(child);
			Place(child, frame);
			return;
		}
		const BPoint corner = fPage->Frame().LeftTop();
		child->MoveBy(-corner.x, -corner.y);
		fPage->AddChild(child, before);
		FitBars();
	}

	/// The view that holds the added ones; it lies in the scroll view unless a list or text fills that.
	BView* Page() const { return fPage; }

	/// The bars reach as far as the page's views. Called when a view is added and the size changes.
	void FitBars()
	{
		if (Target() != fPage)
			return;
		BRect used(0, 0, -1, -1);
		for (BView* child = fPage->ChildAt(0); child != nullptr; child = child->NextSibling())
			used = used | child->Frame();
		FitScrollBar(ScrollBar(B_HORIZONTAL), used.right, fPage->Bounds().Width());
		FitScrollBar(ScrollBar(B_VERTICAL), used.bottom, fPage->Bounds().Height());
	}

	using BScrollView::SetViewColor;

	/// The page's, too.
	void SetViewColor(rgb_color color) override
	{
		BScrollView::SetViewColor(color);
		fPage->SetViewColor(color);
	}

	void SetBorder(border_style border) override
	{
		BScrollView::SetBorder(border);
		FitTarget();
	}

	void AttachedToWindow() override
	{
		BScrollView::AttachedToWindow();
		FitTarget();
	}

	void FrameResized(float newWidth, float newHeight) override
	{
		BScrollView::FrameResized(newWidth, newHeight);
		FitTarget();
	}

private:
	ScrollPane(
		BRect, const char* name, BView* page, bool horizontal, bool vertical, border_style border)
		: BScrollView(
			name, page, B_FOLLOW_NONE, B_WILL_DRAW | B_FRAME_EVENTS, horizontal, vertical, border),
		  fPage(page)
	{
	}

	static BView* MakePage(BRect frame, bool horizontal, bool vertical, border_style border)
	{
		BView* page = new BView(ScrolledFrame(frame, horizontal, vertical, border), "page",
			B_FOLLOW_ALL_SIDES, B_WILL_DRAW);
		page->SetViewColor(ui_color(B_PANEL_BACKGROUND_COLOR));
		return page;
	}

	static void Place(BView* view, BRect frame)
	{
		view->MoveTo(frame.LeftTop());
		view->ResizeTo(frame.Width(), frame.Height());
	}

	/// A target may follow no side of its own accord.
	void FitTarget()
	{
		if (Target() == nullptr)
			return;
		Place(Target(),
			ScrolledFrame(Frame(), ScrollBar(B_HORIZONTAL) != nullptr,
				ScrollBar(B_VERTICAL) != nullptr, Border()));
		FitBars();
	}

	BView* fPage;
};

/// A tab view with pages of its own, on which views are put.
class TabPane : public BTabView {
public:
	TabPane(BRect frame, const char* name)
		: BTabView(frame, name, B_WIDTH_FROM_LABEL, B_FOLLOW_NONE)
	{
	}

	/// The labels of the tabs (see ParseItems()). Tabs are added and taken away at the end; what lies on
	/// a page that goes is deleted. The selected tab stays, if it is there.
	void SetTabs(const char* text)
	{
		const std::vector<item_text> labels = ParseItems(text);
		const int32 count = static_cast<int32>(labels.size());
		while (CountTabs() > count)
			delete RemoveTab(CountTabs() - 1);
		for (int32 i = CountTabs(); i < count; i++)
			AddTab(MakePage());
		for (int32 i = 0; i < count; i++)
			TabAt(i)->SetLabel(labels[i].label.String());
		if (Selection() < 0 || Selection() >= count)
			Select(0);
		if (Window() != nullptr)
			Invalidate();
	}

	/// Hides the base's: \a child, whose frame is in the tab view's coordinates, goes onto the first page,
	/// or over the tab view when it has none.
	void AddChild(BView* child, BView* before = nullptr)
	{
		if (CountTabs() == 0) {
			BTabView::AddChild(child, before);
			return;
		}
		const BPoint corner = ContainerView()->Frame().LeftTop();
		child->MoveBy(-corner.x, -corner.y);
		Page(0)->AddChild(child, before);
	}

	/// Puts a view that lies on a page onto the page \a index, or the last one when there are not so many.
	void SetPage(BView* child, int32 index)
	{
		BView* page = Page(std::clamp<int32>(index, 0, CountTabs() - 1));
		if (page == nullptr || child->Parent() == page)
			return;
		child->RemoveSelf();
		page->AddChild(child);
	}

	using BTabView::SetViewColor;

	/// The pages', too.
	void SetViewColor(rgb_color color) override
	{
		BTabView::SetViewColor(color);
		ContainerView()->SetViewColor(color);
		for (int32 i = 0; i < CountTabs(); i++)
			Page(i)->SetViewColor(color);
	}

	/// Null when there is none.
	BView* Page(int32 index) const { return ViewForTab(index); }

private:
	BView* MakePage()
	{
		BView* page = new BView(ContainerView()->Bounds().OffsetToCopy(B_ORIGIN), "page",
			B_FOLLOW_ALL_SIDES, B_WILL_DRAW);
		page->SetViewColor(ViewColor());
		return page;
	}
};

} // namespace Ormi

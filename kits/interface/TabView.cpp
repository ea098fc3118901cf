// SPDX-License-Identifier: MIT
// BTabView: its tabs, the selection and the input. TabViewDrawing.cpp has its layout and its look.
#include <TabView.h>

#include <algorithm>

#include <Message.h>
#include <Window.h>

#include "ControlLook.h"
#include "interface/ArchivedEnum.h"

using BPrivate::EnumAmong;
using BPrivate::EnumBetween;

BTabView::BTabView(
	BRect frame, const char* name, button_width width, uint32 resizeMask, uint32 flags)
	: BView(frame, name, resizeMask, flags | B_WILL_DRAW | B_FRAME_EVENTS | B_FULL_UPDATE_ON_RESIZE)
{
	Init(width);
}


BTabView::BTabView(const char* name, button_width width, uint32 flags)
	: BTabView(BRect(0, 0, -1, -1), name, width, B_FOLLOW_LEFT_TOP, flags)
{
}


BTabView::BTabView(BMessage* archive)
	: BView(archive)
{
	// The archive of another system holds the container, which is made anew here.
	while (BView* view = ChildAt(0)) {
		view->RemoveSelf();
		delete view;
	}
	Init(EnumBetween(archive->GetInt16("_but_width", B_WIDTH_AS_USUAL), B_WIDTH_AS_USUAL,
		B_WIDTH_FROM_LABEL, B_WIDTH_AS_USUAL));
	fTabHeight = std::max(archive->GetFloat("_high", fTabHeight), 1.0f);
	fBorder = EnumBetween(archive->GetInt32("_border_style", B_FANCY_BORDER), B_PLAIN_BORDER,
		B_NO_BORDER, B_FANCY_BORDER);
	fTabSide = EnumAmong(archive->GetInt32("_TabSide", kTopSide),
		{kLeftSide, kRightSide, kTopSide, kBottomSide}, kTopSide);
	LayOutContainer();

	BMessage tabArchive;
	for (int32 i = 0; archive->FindMessage("_l_items", i, &tabArchive) == B_OK; i++) {
		BArchivable* object = instantiate_object(&tabArchive);
		if (BTab* tab = dynamic_cast<BTab*>(object))
			AddTab(NULL, tab);
		else
			delete object;
	}
	Select(archive->GetInt32("_sel", -1));
}


BTabView::~BTabView()
{
	// The views that are not in the container have no other owner than their tab.
	for (int32 i = 0; i < CountTabs(); i++)
		delete static_cast<BTab*>(fTabs.ItemAt(i));
}


BArchivable*
BTabView::Instantiate(BMessage* archive)
{
	return validate_instantiation(archive, "BTabView") ? new BTabView(archive) : NULL;
}


status_t
BTabView::Archive(BMessage* archive, bool deep) const
{
	// The container is made anew, and the views are in their tabs.
	status_t status = BView::Archive(archive, false);
	if (status == B_OK)
		status = archive->AddInt16("_but_width", static_cast<int16>(fTabWidth));
	if (status == B_OK)
		status = archive->AddFloat("_high", fTabHeight);
	if (status == B_OK)
		status = archive->AddInt32("_border_style", fBorder);
	if (status == B_OK)
		status = archive->AddInt32("_TabSide", fTabSide);
	if (status == B_OK)
		status = archive->AddInt32("_sel", fSelection);
	for (int32 i = 0; deep && status == B_OK && i < CountTabs(); i++) {
		BMessage tabArchive;
		status = TabAt(i)->Archive(&tabArchive, true);
		if (status == B_OK)
			status = archive->AddMessage("_l_items", &tabArchive);
	}
	return status;
}


void
BTabView::AttachedToWindow()
{
	BPrivate::AdoptParentColors(this);
	fContainer->SetViewColor(ViewColor());
	fContainer->SetLowColor(ViewColor());
	LayOutContainer();
	BView::AttachedToWindow();
	if (fSelection < 0)
		Select(0);
}


void
BTabView::KeyDown(const char* bytes, int32 numBytes)
{
	const char key = numBytes == 1 ? bytes[0] : 0;
	switch (key) {
		case B_LEFT_ARROW:
		case B_UP_ARROW:
			SelectByKey(NextEnabledTab(FocusTab(), -1));
			break;
		case B_RIGHT_ARROW:
		case B_DOWN_ARROW:
			SelectByKey(NextEnabledTab(FocusTab(), 1));
			break;
		case B_HOME:
			SelectByKey(NextEnabledTab(-1, 1));
			break;
		case B_END:
			SelectByKey(NextEnabledTab(CountTabs(), -1));
			break;
		case B_ENTER:
		case B_SPACE:
			SelectByKey(FocusTab());
			break;
		default:
			BView::KeyDown(bytes, numBytes);
			break;
	}
}


void
BTabView::MouseDown(BPoint where)
{
	for (int32 direction : {-1, 1}) {
		if (NeedsArrows() && ArrowFrame(direction).Contains(where)) {
			ScrollTabs(direction);
			return;
		}
	}
	for (int32 i = 0; i < CountTabs(); i++) {
		if (!TabFrame(i).Contains(where))
			continue;
		if (TabAt(i)->IsEnabled() && i != fSelection)
			Select(i);
		return;
	}
}


void
BTabView::WindowActivated(bool active)
{
	BView::WindowActivated(active);
	if (IsFocus())
		Invalidate(StripFrame());
}


void
BTabView::MakeFocus(bool focus)
{
	BView::MakeFocus(focus);
	SetFocusTab(fSelection, focus);
}


void
BTabView::Select(int32 index)
{
	BTab* tab = TabAt(index);
	if (tab == NULL || index == fSelection)
		return;
	Deselect();
	fSelection = index;
	AttachContents(tab);
	if (IsFocus())
		SetFocusTab(index, true);
	ShowTab(index);
	Redraw();
}


int32
BTabView::Selection() const
{
	return fSelection;
}


void
BTabView::SetFocusTab(int32 tab, bool focused)
{
	const int32 focus = focused && TabAt(tab) != NULL ? tab : -1;
	if (focus == fFocusTab)
		return;
	if (BTab* before = TabAt(fFocusTab))
		before->MakeFocus(false);
	fFocusTab = focus;
	if (focus >= 0) {
		TabAt(focus)->MakeFocus(true);
		ShowTab(focus);
	}
	if (Window() != NULL)
		Invalidate(StripFrame());
}


int32
BTabView::FocusTab() const
{
	return fFocusTab;
}


void
BTabView::AddTab(BView* target, BTab* tab)
{
	if (tab == NULL)
		tab = new BTab(target);
	else if (target != NULL)
		tab->SetView(target);
	if (tab->fTabView != NULL)
		return;
	tab->fTabView = this;
	tab->fContainerSize = fContainer->Bounds();
	fTabs.AddItem(tab);
	TabChanged();
	if (Window() != NULL && fSelection < 0)
		Select(0);
}


BTab*
BTabView::RemoveTab(int32 tabIndex)
{
	BTab* tab = TabAt(tabIndex);
	if (tab == NULL)
		return NULL;

	const bool hadFocus = fFocusTab >= 0;
	SetFocusTab(-1, false);
	const bool wasSelected = tabIndex == fSelection;
	if (wasSelected)
		Deselect();
	fTabs.RemoveItem(tabIndex);
	tab->fTabView = NULL;
	if (fSelection > tabIndex)
		fSelection--;
	TabChanged();
	if (wasSelected)
		Select(std::max<int32>(tabIndex - 1, 0));
	if (hadFocus)
		SetFocusTab(fSelection, true);
	return tab;
}


BTab*
BTabView::TabAt(int32 index) const
{
	return static_cast<BTab*>(fTabs.ItemAt(index));
}


void
BTabView::SetTabWidth(button_width width)
{
	fTabWidth = width;
	TabChanged();
}


button_width
BTabView::TabWidth() const
{
	return fTabWidth;
}


BView*
BTabView::ContainerView() const
{
	return fContainer;
}


int32
BTabView::CountTabs() const
{
	return fTabs.CountItems();
}


BView*
BTabView::ViewForTab(int32 tabIndex) const
{
	const BTab* tab = TabAt(tabIndex);
	return tab != NULL ? tab->View() : NULL;
}


int32
BTabView::IndexOf(BTab* tab) const
{
	return tab != NULL ? fTabs.IndexOf(tab) : -1;
}


void
BTabView::Init(button_width width)
{
	fTabWidth = width;
	fTabHeight = DefaultTabHeight();
	fTabSide = kTopSide;
	fBorder = B_FANCY_BORDER;
	fSelection = -1;
	fFocusTab = -1;
	fFirstTab = 0;
	fWidestLabel = 0;
	fContainer = new BView(BRect(0, 0, 0, 0), "view container", B_FOLLOW_ALL, B_WILL_DRAW);
	LayOutContainer();
	AddChild(fContainer);
}


/// A tab's label, state or number has changed.
void
BTabView::TabChanged()
{
	MeasureLabels();
	LayOutContainer();
	fFirstTab = std::clamp<int32>(fFirstTab, 0, LastFirstTab());
	Redraw();
}


void
BTabView::Deselect()
{
	BTab* tab = TabAt(fSelection);
	fSelection = -1;
	if (tab == NULL)
		return;
	tab->fContainerSize = fContainer->Bounds();
	tab->Deselect();
}


/// Shows a tab's view. The container may have another size than when the view was last in it: the view
/// follows that as it would have, had it been there.
void
BTabView::AttachContents(BTab* tab)
{
	const BRect present = fContainer->Bounds();
	const bool follows = Window() != NULL && tab->fContainerSize != present;
	if (follows)
		fContainer->ResizeTo(tab->fContainerSize.Width(), tab->fContainerSize.Height());
	tab->Select(fContainer);
	if (follows)
		fContainer->ResizeTo(present.Width(), present.Height());
}


void
BTabView::SelectByKey(int32 index)
{
	const BTab* tab = TabAt(index);
	if (tab == NULL || !tab->IsEnabled())
		return;
	if (index != fSelection)
		Select(index);
	SetFocusTab(index, true);
}


/// The first enabled tab after \a from in steps of 1 or -1; -1 for none.
int32
BTabView::NextEnabledTab(int32 from, int32 step) const
{
	for (int32 i = from + step; i >= 0 && i < CountTabs(); i += step) {
		if (TabAt(i)->IsEnabled())
			return i;
	}
	return -1;
}


void
BTabView::Redraw()
{
	if (Window() != NULL)
		Invalidate();
}

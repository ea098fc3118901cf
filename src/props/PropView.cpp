// SPDX-License-Identifier: MIT
// The property window's page of properties.

#include "props/PropView.h"

#include <ListView.h>
#include <ScrollBar.h>
#include <ScrollView.h>

#include "props/ComponentRows.h"
#include "props/ListRow.h"
#include "props/PropertyListItem.h"
#include "props/PropertyWin.h"

namespace {

constexpr float kInset = 2;
constexpr float kPaneHeight = 30;

} // namespace

TPropView::TPropView(BRect frame)
	: BView(frame, "PropertyView", B_FOLLOW_ALL_SIDES, B_WILL_DRAW | B_FRAME_EVENTS),
	  fList(nullptr)
{
	SetViewColor(kPageColor);

	BRect listFrame = Bounds().InsetByCopy(kInset, kInset);
	listFrame.right -= B_V_SCROLL_BAR_WIDTH;
	listFrame.bottom -= kPaneHeight;
	fList = new BListView(listFrame, "lvProperties", B_SINGLE_SELECTION_LIST, B_FOLLOW_ALL_SIDES);
	fList->SetSelectionMessage(new BMessage(PWM_PROPERTY_SELECTED));
	fList->SetInvocationMessage(new BMessage(PWM_PROPERTY_INVOKED));
	AddChild(new BScrollView("svProperties", fList, B_FOLLOW_ALL_SIDES, 0, false, true));
}


TPropView::~TPropView()
{
	ClearItems();
}


void
TPropView::SetRows(TComponentRows* rows)
{
	ClearItems();
	AddRows(fList, &rows->properties);
	if (fList->CountItems() == 0)
		return;
	fList->DeselectAll();
	fList->Select(0);
	fList->ScrollToSelection();
}


void
TPropView::UpdateRows(TComponentRows* rows)
{
	if (static_cast<int32>(rows->properties.size()) != fList->CountItems()) {
		SetRows(rows);
		return;
	}
	for (int32 i = 0; i < fList->CountItems(); i++) {
		if (static_cast<TPropertyListItem*>(fList->ItemAt(i))->TakeOver(*rows->properties[i]))
			fList->InvalidateItem(i);
	}
}


void
TPropView::ClearItems()
{
	for (int32 i = 0; i < fList->CountItems(); i++)
		static_cast<TPropertyListItem*>(fList->ItemAt(i))->Clear();
	DeleteRows(fList);
}


BRect
TPropView::PaneFrame() const
{
	BRect frame = Bounds();
	frame.top = frame.bottom - kPaneHeight + 1;
	return frame;
}


void
TPropView::FrameResized(float width, float height)
{
	BView::FrameResized(width, height);
	// The panes hang on the page's top, but their strip is at its bottom.
	const BRect pane = PaneFrame();
	for (BView* child = ChildAt(1); child != nullptr; child = child->NextSibling())
		child->MoveTo(child->Frame().left, pane.top);
}

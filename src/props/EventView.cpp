// SPDX-License-Identifier: MIT
// The property window's page of events.

#include "props/EventView.h"

#include <cmath>

#include <ListView.h>
#include <ScrollBar.h>
#include <ScrollView.h>
#include <StringView.h>

#include "app/Dialogs.h"
#include "props/ComponentRows.h"
#include "props/EventListItem.h"
#include "props/ListRow.h"
#include "props/PropertyWin.h"

namespace {

constexpr float kInset = 2;
constexpr float kNameLeft = 6;
constexpr float kLabelGap = 2;

} // namespace

TEventView::TEventView(BRect frame)
	: BView(frame, "EventView", B_FOLLOW_ALL_SIDES, B_WILL_DRAW),
	  fList(nullptr)
{
	SetViewColor(kPageColor);

	const float labelHeight = FontHeight(this, true);
	const BRect bounds = Bounds();
	const float labelBottom = kLabelGap + labelHeight;
	BRect listFrame = bounds.InsetByCopy(kInset, kInset);
	listFrame.top = labelBottom + kLabelGap + kInset;
	listFrame.right -= B_V_SCROLL_BAR_WIDTH;

	BStringView* name = new BStringView(
		BRect(kNameLeft, kLabelGap, kNameLeft + 10, labelBottom), "lblEventName", "Name:");
	BStringView* selected = new BStringView(BRect(0, kLabelGap, 10, labelBottom),
		"lblEventSelected", "Selected:", B_FOLLOW_RIGHT | B_FOLLOW_TOP);
	for (BStringView* label : {name, selected}) {
		label->SetViewColor(kPageColor);
		label->SetLowColor(kPageColor);
		label->ResizeTo(std::ceil(label->StringWidth(label->Text())) + 1, labelHeight);
		AddChild(label);
	}
	// Above the marks, which keep their distance from the right edge.
	const float marks = listFrame.right - TEventListItem::kMarkFromRight;
	selected->MoveTo(std::floor(marks - selected->Bounds().Width() / 2), kLabelGap);

	fList = new BListView(listFrame, "lvEvents", B_SINGLE_SELECTION_LIST, B_FOLLOW_ALL_SIDES);
	fList->SetSelectionMessage(new BMessage(PWM_EVENT_SELECTED));
	fList->SetInvocationMessage(new BMessage(PWM_EVENT_INVOKED));
	AddChild(new BScrollView("svEvents", fList, B_FOLLOW_ALL_SIDES, 0, false, true));
}


TEventView::~TEventView()
{
	ClearItems();
}


void
TEventView::SetRows(TComponentRows* rows)
{
	ClearItems();
	AddRows(fList, &rows->events);
}


void
TEventView::UpdateRows(TComponentRows* rows)
{
	if (static_cast<int32>(rows->events.size()) != fList->CountItems()) {
		SetRows(rows);
		return;
	}
	for (int32 i = 0; i < fList->CountItems(); i++) {
		if (static_cast<TEventListItem*>(fList->ItemAt(i))->TakeOver(*rows->events[i]))
			fList->InvalidateItem(i);
	}
}


void
TEventView::ClearItems()
{
	for (int32 i = 0; i < fList->CountItems(); i++)
		static_cast<TEventListItem*>(fList->ItemAt(i))->Clear();
	DeleteRows(fList);
}

// SPDX-License-Identifier: MIT
// A row of the property window's list of events.

#include "props/EventListItem.h"

#include <View.h>

#include "model/Event.h"
#include "props/ListRow.h"

namespace {

constexpr float kSeparator = 140;

// Half of the mark's width, and how far it stays from the row's top and bottom.
constexpr float kMarkReach = 3;
constexpr float kMarkInset = 3;
constexpr float kMarkRadius = 2;

} // namespace

TEventListItem::TEventListItem(TEvent* event)
	: fEvent(event),
	  fName(event->name),
	  fMarked(event->selected)
{
}


TEventListItem::~TEventListItem() {}


bool
TEventListItem::TakeOver(const TEventListItem& fresh)
{
	const bool changed = fName != fresh.fName || fMarked != fresh.fMarked;
	fEvent = fresh.fEvent;
	fName = fresh.fName;
	fMarked = fresh.fMarked;
	return changed;
}


void
TEventListItem::DrawItem(BView* owner, BRect frame, bool)
{
	const rgb_color highColor = owner->HighColor();
	const rgb_color lowColor = owner->LowColor();

	DrawListRow(owner, frame, this, fName, kSeparator);
	if (fMarked) {
		const float middle = frame.right - kMarkFromRight;
		const BRect mark(middle - kMarkReach, frame.top + kMarkInset, middle + kMarkReach,
			frame.bottom - kMarkInset);
		owner->SetHighColor(kRowValueColor);
		owner->FillRoundRect(mark, kMarkRadius, kMarkRadius);
	}

	owner->SetHighColor(highColor);
	owner->SetLowColor(lowColor);
}

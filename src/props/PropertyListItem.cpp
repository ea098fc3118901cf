// SPDX-License-Identifier: MIT
// A row of the property window's list of properties.

#include "props/PropertyListItem.h"

#include <View.h>

#include "model/Property.h"
#include "props/ListRow.h"
#include "props/PropertyEditor.h"
#include "props/ShownValue.h"

namespace {

constexpr float kSeparator = 100;
constexpr float kValueLeft = 110;
constexpr float kRightMargin = 4;
constexpr float kBaseline = 2; // above the bottom

} // namespace

TPropertyListItem::TPropertyListItem(TProperty* property)
	: fProperty(property),
	  fEditor(property->Editor()),
	  fName(property->Name())
{
	fValue = ShownValue(fEditor != nullptr ? fEditor->GetDisplayValue() : property->Value());
}


TPropertyListItem::~TPropertyListItem() {}


void
TPropertyListItem::GetProperty(TPropertyWatch* property, TPropertyEditor** editor) const
{
	property->SetTo(fProperty);
	*editor = fEditor;
}


bool
TPropertyListItem::TakeOver(const TPropertyListItem& fresh)
{
	fProperty.SetTo(fresh.fProperty);
	fEditor = fresh.fEditor;
	if (fValue == fresh.fValue && fName == fresh.fName)
		return false;
	fName = fresh.fName;
	fValue = fresh.fValue;
	return true;
}


void
TPropertyListItem::DrawItem(BView* owner, BRect frame, bool)
{
	const rgb_color highColor = owner->HighColor();
	const rgb_color lowColor = owner->LowColor();

	DrawListRow(owner, frame, this, fName.String(), kSeparator);
	const float room = frame.Width() + 1 - kValueLeft - kRightMargin;
	BString value(fValue);
	owner->TruncateString(&value, B_TRUNCATE_MIDDLE, room);
	owner->SetHighColor(kRowValueColor);
	owner->DrawString(value.String(), BPoint(frame.left + kValueLeft, frame.bottom - kBaseline));

	owner->SetHighColor(highColor);
	owner->SetLowColor(lowColor);
}

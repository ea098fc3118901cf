// SPDX-License-Identifier: MIT
// A row of the property window's list of properties.

#include "props/PropertyListItem.h"

#include <View.h>

#include "model/Property.h"
#include "props/ListRow.h"
#include "props/PropertyEditor.h"

namespace {

constexpr float kSeparator = 100;
constexpr float kValueLeft = 110;
constexpr float kRightMargin = 4;
constexpr float kBaseline = 2; // above the bottom

/// At most what a property's text holds: one filled to its last byte has no terminator of its own.
BString
ShownText(const char* text)
{
	return text != nullptr ? BString(text, TPropertyText::kSize) : BString();
}

} // namespace

TPropertyListItem::TPropertyListItem(TProperty* property)
	: fProperty(property),
	  fName(property->Name())
{
	const TPropertyEditor* editor = property->Editor();
	fValue = ShownText(editor != nullptr ? editor->GetDisplayValue() : property->Value());
}


TPropertyListItem::~TPropertyListItem() {}


bool
TPropertyListItem::Update(const TPropertyListItem& fresh)
{
	fProperty.SetTo(fresh.fProperty);
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
	BString value(fValue);
	owner->TruncateString(&value, B_TRUNCATE_MIDDLE, frame.Width() + 1 - kValueLeft - kRightMargin);
	owner->SetHighColor(kRowValueColor);
	owner->DrawString(value.String(), BPoint(frame.left + kValueLeft, frame.bottom - kBaseline));

	owner->SetHighColor(highColor);
	owner->SetLowColor(lowColor);
}

// SPDX-License-Identifier: MIT

#include <StringItem.h>

#include <cmath>

#include <Message.h>
#include <View.h>

#include "ControlLook.h"

namespace {

constexpr float kMargin = 6;
constexpr float kExtraHeight = 4;


rgb_color
TextColor(bool enabled, bool selected, rgb_color background)
{
	rgb_color text = ui_color(selected ? B_LIST_SELECTED_ITEM_TEXT_COLOR : B_LIST_ITEM_TEXT_COLOR);
	// On a background of its own kind the system's text could not be read.
	if (text.IsDark() == background.IsDark())
		text = background.IsDark() ? make_color(255, 255, 255) : make_color(0, 0, 0);
	return BPrivate::StrengthOf(enabled, text, background);
}

} // namespace


BStringItem::BStringItem(const char* text, uint32 outlineLevel, bool expanded)
	: BListItem(outlineLevel, expanded),
	  fText(text),
	  fHasText(text != NULL),
	  fBaselineOffset(0)
{
}


BStringItem::BStringItem(BMessage* archive)
	: BListItem(archive),
	  fHasText(archive->FindString("_label", &fText) == B_OK),
	  fBaselineOffset(0)
{
}


BStringItem::~BStringItem() {}


BArchivable*
BStringItem::Instantiate(BMessage* archive)
{
	return validate_instantiation(archive, "BStringItem") ? new BStringItem(archive) : NULL;
}


status_t
BStringItem::Archive(BMessage* archive, bool deep) const
{
	status_t status = BListItem::Archive(archive, deep);
	if (status == B_OK && fHasText)
		status = archive->AddString("_label", fText);
	return status;
}


void
BStringItem::DrawItem(BView* owner, BRect frame, bool complete)
{
	const rgb_color high = owner->HighColor();
	const rgb_color low = owner->LowColor();
	rgb_color background = owner->ViewColor();
	// An owner that paints all itself tells its background by the low colour.
	if (background == B_TRANSPARENT_COLOR)
		background = low;
	if (IsSelected())
		background = ui_color(B_LIST_SELECTED_BACKGROUND_COLOR);

	owner->SetLowColor(background);
	if (IsSelected() || complete)
		owner->FillRect(frame, B_SOLID_LOW);
	if (fHasText) {
		owner->SetHighColor(TextColor(IsEnabled(), IsSelected(), background));
		owner->DrawString(
			fText.String(), BPoint(frame.left + kMargin, frame.top + fBaselineOffset));
	}
	owner->SetHighColor(high);
	owner->SetLowColor(low);
}


void
BStringItem::Update(BView* owner, const BFont* font)
{
	BListItem::Update(owner, font);
	font_height height;
	font->GetHeight(&height);
	SetHeight(Height() + kExtraHeight);
	SetWidth(2 * kMargin + std::ceil(font->StringWidth(fText.String())));
	fBaselineOffset = kExtraHeight / 2 + std::ceil(height.ascent + height.leading / 2);
}


void
BStringItem::SetText(const char* text)
{
	fHasText = text != NULL;
	fText = text;
}


const char*
BStringItem::Text() const
{
	return fHasText ? fText.String() : NULL;
}


float
BStringItem::BaselineOffset() const
{
	return fBaselineOffset;
}

// SPDX-License-Identifier: MIT

#include <RadioButton.h>

#include <Window.h>

#include "ClickTracking.h"
#include "ControlLook.h"

BRadioButton::BRadioButton(BRect frame, const char* name, const char* label, BMessage* message,
	uint32 resizingMode, uint32 flags)
	: BControl(frame, name, label, message, resizingMode, flags | B_FULL_UPDATE_ON_RESIZE),
	  fTracking(std::make_unique<BPrivate::ClickTracking>(this))
{
}


BRadioButton::BRadioButton(const char* name, const char* label, BMessage* message, uint32 flags)
	: BControl(name, label, message, flags | B_FULL_UPDATE_ON_RESIZE),
	  fTracking(std::make_unique<BPrivate::ClickTracking>(this))
{
}


BRadioButton::BRadioButton(const char* label, BMessage* message)
	: BRadioButton(NULL, label, message)
{
}


BRadioButton::BRadioButton(BMessage* archive)
	: BControl(archive),
	  fTracking(std::make_unique<BPrivate::ClickTracking>(this))
{
}


BRadioButton::~BRadioButton() {}


BArchivable*
BRadioButton::Instantiate(BMessage* archive)
{
	return validate_instantiation(archive, "BRadioButton") ? new BRadioButton(archive) : NULL;
}


void
BRadioButton::Draw(BRect)
{
	BPrivate::DrawRoundField(this, BPrivate::MarkFrame(this),
		{IsEnabled(), IsFocus() && Window()->IsActive(), fTracking->IsPressed()},
		Value() != B_CONTROL_OFF);
	BPrivate::DrawMarkLabel(this, Label(), IsEnabled());
}


void
BRadioButton::DetachedFromWindow()
{
	fTracking->Cancel();
	BControl::DetachedFromWindow();
}


void
BRadioButton::MouseDown(BPoint)
{
	fTracking->MouseDown();
}


void
BRadioButton::MouseUp(BPoint where)
{
	if (fTracking->MouseUp(where))
		Choose();
}


void
BRadioButton::MouseMoved(BPoint where, uint32, const BMessage*)
{
	fTracking->MouseMoved(where);
}


void
BRadioButton::KeyDown(const char* bytes, int32 numBytes)
{
	if (!BPrivate::ClickTracking::IsClickKey(bytes, numBytes))
		BControl::KeyDown(bytes, numBytes);
	else if (IsEnabled())
		Choose();
}


void
BRadioButton::GetPreferredSize(float* _width, float* _height)
{
	BPrivate::GetMarkSize(this, Label(), _width, _height);
}


void
BRadioButton::SetValue(int32 value)
{
	BControl::SetValue(value != B_CONTROL_OFF ? B_CONTROL_ON : B_CONTROL_OFF);
	if (value == B_CONTROL_OFF)
		return;

	// By the siblings: directly in a window there is no parent to ask.
	BView* sibling = this;
	while (sibling->PreviousSibling() != NULL)
		sibling = sibling->PreviousSibling();
	for (; sibling != NULL; sibling = sibling->NextSibling()) {
		BRadioButton* other = dynamic_cast<BRadioButton*>(sibling);
		if (other != NULL && other != this && other->Value() != B_CONTROL_OFF)
			other->SetValue(B_CONTROL_OFF);
	}
}


void
BRadioButton::Choose()
{
	SetValue(B_CONTROL_ON);
	// What is sent may have the button deleted: nothing comes after it.
	Invoke();
}

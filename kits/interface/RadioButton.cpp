// SPDX-License-Identifier: MIT

#include <RadioButton.h>

#include <Window.h>

#include "ControlLook.h"

BRadioButton::BRadioButton(BRect frame, const char* name, const char* label, BMessage* message,
	uint32 resizingMode, uint32 flags)
	: BControl(frame, name, label, message, resizingMode, flags | B_FULL_UPDATE_ON_RESIZE),
	  fPressed(false)
{
}


BRadioButton::BRadioButton(const char* name, const char* label, BMessage* message, uint32 flags)
	: BControl(name, label, message, flags | B_FULL_UPDATE_ON_RESIZE),
	  fPressed(false)
{
}


BRadioButton::BRadioButton(const char* label, BMessage* message)
	: BRadioButton(NULL, label, message)
{
}


BRadioButton::BRadioButton(BMessage* archive)
	: BControl(archive),
	  fPressed(false)
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
		{IsEnabled(), IsFocus() && Window()->IsActive(), fPressed}, Value() != B_CONTROL_OFF);
	BPrivate::DrawMarkLabel(this, Label(), IsEnabled());
}


void
BRadioButton::DetachedFromWindow()
{
	fPressed = false;
	BControl::DetachedFromWindow();
}


void
BRadioButton::MouseDown(BPoint)
{
	if (!IsEnabled())
		return;
	SetMouseEventMask(B_POINTER_EVENTS, B_NO_POINTER_HISTORY | B_SUSPEND_VIEW_FOCUS);
	SetTracking(true);
	fPressed = true;
	Invalidate();
}


void
BRadioButton::MouseUp(BPoint where)
{
	if (!IsTracking())
		return;
	SetTracking(false);
	fPressed = false;
	Invalidate();
	if (IsEnabled() && Bounds().Contains(where))
		Choose();
}


void
BRadioButton::MouseMoved(BPoint where, uint32, const BMessage*)
{
	if (!IsTracking())
		return;
	const bool inside = Bounds().Contains(where);
	if (inside != fPressed) {
		fPressed = inside;
		Invalidate();
	}
}


void
BRadioButton::KeyDown(const char* bytes, int32 numBytes)
{
	if (numBytes != 1 || (bytes[0] != B_ENTER && bytes[0] != B_SPACE)) {
		BView::KeyDown(bytes, numBytes);
		return;
	}
	if (IsEnabled())
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

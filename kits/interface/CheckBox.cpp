// SPDX-License-Identifier: MIT

#include <CheckBox.h>

#include <Window.h>

#include "ClickTracking.h"
#include "ControlLook.h"

BCheckBox::BCheckBox(BRect frame, const char* name, const char* label, BMessage* message,
	uint32 resizingMode, uint32 flags)
	: BControl(frame, name, label, message, resizingMode, flags | B_FULL_UPDATE_ON_RESIZE),
	  fTracking(std::make_unique<BPrivate::ClickTracking>(this))
{
}


BCheckBox::BCheckBox(const char* name, const char* label, BMessage* message, uint32 flags)
	: BControl(name, label, message, flags | B_FULL_UPDATE_ON_RESIZE),
	  fTracking(std::make_unique<BPrivate::ClickTracking>(this))
{
}


BCheckBox::BCheckBox(const char* label, BMessage* message)
	: BCheckBox(NULL, label, message)
{
}


BCheckBox::BCheckBox(BMessage* archive)
	: BControl(archive),
	  fTracking(std::make_unique<BPrivate::ClickTracking>(this))
{
}


BCheckBox::~BCheckBox() {}


BArchivable*
BCheckBox::Instantiate(BMessage* archive)
{
	return validate_instantiation(archive, "BCheckBox") ? new BCheckBox(archive) : NULL;
}


void
BCheckBox::Draw(BRect)
{
	const BPrivate::ControlState state = {
		IsEnabled(), IsFocus() && Window()->IsActive(), fTracking->IsPressed()};
	const BRect box = BPrivate::MarkFrame(this);
	BPrivate::DrawFieldSurface(this, box, state);
	if (Value() != B_CONTROL_OFF)
		BPrivate::DrawTick(this, box, state, Value() == B_CONTROL_PARTIALLY_ON);
	BPrivate::DrawMarkLabel(this, Label(), IsEnabled());
}


void
BCheckBox::DetachedFromWindow()
{
	fTracking->Cancel();
	BControl::DetachedFromWindow();
}


void
BCheckBox::MouseDown(BPoint)
{
	fTracking->MouseDown();
}


void
BCheckBox::MouseUp(BPoint where)
{
	if (fTracking->MouseUp(where))
		Toggle();
}


void
BCheckBox::MouseMoved(BPoint where, uint32, const BMessage*)
{
	fTracking->MouseMoved(where);
}


void
BCheckBox::KeyDown(const char* bytes, int32 numBytes)
{
	if (!BPrivate::ClickTracking::IsClickKey(bytes, numBytes))
		BControl::KeyDown(bytes, numBytes);
	else if (IsEnabled())
		Toggle();
}


void
BCheckBox::GetPreferredSize(float* _width, float* _height)
{
	BPrivate::GetMarkSize(this, Label(), _width, _height);
}


void
BCheckBox::SetValue(int32 value)
{
	if (value < B_CONTROL_OFF || value > B_CONTROL_PARTIALLY_ON)
		value = B_CONTROL_ON;
	BControl::SetValue(value);
}


void
BCheckBox::Toggle()
{
	SetValue(Value() == B_CONTROL_ON ? B_CONTROL_OFF : B_CONTROL_ON);
	// What is sent may have the box deleted: nothing comes after it.
	Invoke();
}

// SPDX-License-Identifier: MIT

#include <CheckBox.h>

#include <algorithm>
#include <cmath>

#include <Window.h>

#include "ControlLook.h"

namespace {

// The side of the box, right minus left, and the space between box and label.
constexpr float kBoxSize = 12;
constexpr float kLabelGap = 6;

BRect
BoxFrame(const BView* view)
{
	const BRect bounds = view->Bounds();
	const float top = std::floor((bounds.Height() - kBoxSize) / 2 + 0.5f);
	return BRect(
		bounds.left + 1, bounds.top + top, bounds.left + 1 + kBoxSize, bounds.top + top + kBoxSize);
}

} // namespace

BCheckBox::BCheckBox(BRect frame, const char* name, const char* label, BMessage* message,
	uint32 resizingMode, uint32 flags)
	: BControl(frame, name, label, message, resizingMode, flags),
	  fPressed(false)
{
}


BCheckBox::BCheckBox(const char* name, const char* label, BMessage* message, uint32 flags)
	: BControl(name, label, message, flags),
	  fPressed(false)
{
}


BCheckBox::BCheckBox(const char* label, BMessage* message)
	: BCheckBox(NULL, label, message)
{
}


BCheckBox::BCheckBox(BMessage* archive)
	: BControl(archive),
	  fPressed(false)
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
	const BPrivate::ControlState state = {IsEnabled(), IsFocus() && Window()->IsActive(), fPressed};
	const BRect box = BoxFrame(this);
	BPrivate::DrawFieldSurface(this, box, state);
	if (Value() != B_CONTROL_OFF)
		BPrivate::DrawTick(this, box, state, Value() == B_CONTROL_PARTIALLY_ON);
	if (Label() == NULL)
		return;

	font_height height;
	GetFontHeight(&height);
	SetHighColor(BPrivate::ControlTextColor(IsEnabled(), LowColor()));
	SetDrawingMode(B_OP_OVER);
	DrawString(Label(),
		BPoint(box.right + kLabelGap,
			std::floor((box.top + box.bottom + height.ascent - height.descent) / 2 + 0.5f)));
	SetDrawingMode(B_OP_COPY);
}


void
BCheckBox::MouseDown(BPoint)
{
	if (!IsEnabled())
		return;
	SetMouseEventMask(B_POINTER_EVENTS, B_NO_POINTER_HISTORY | B_SUSPEND_VIEW_FOCUS);
	SetTracking(true);
	fPressed = true;
	Invalidate();
}


void
BCheckBox::MouseUp(BPoint where)
{
	if (!IsTracking())
		return;
	SetTracking(false);
	fPressed = false;
	Invalidate();
	if (Bounds().Contains(where))
		Toggle();
}


void
BCheckBox::MouseMoved(BPoint where, uint32, const BMessage*)
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
BCheckBox::KeyDown(const char* bytes, int32 numBytes)
{
	if (bytes[0] != B_ENTER && bytes[0] != B_SPACE) {
		BView::KeyDown(bytes, numBytes);
		return;
	}
	if (IsEnabled())
		Toggle();
}


void
BCheckBox::GetPreferredSize(float* _width, float* _height)
{
	font_height height;
	GetFontHeight(&height);
	const float label = Label() != NULL ? kLabelGap + std::ceil(StringWidth(Label())) : 0;
	if (_width != NULL)
		*_width = 1 + kBoxSize + label + 1;
	if (_height != NULL) {
		*_height = std::max(kBoxSize + 2, std::ceil(height.ascent) + std::ceil(height.descent) + 2);
	}
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
	Invoke();
}

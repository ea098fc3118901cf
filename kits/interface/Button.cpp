// SPDX-License-Identifier: MIT

#include <Button.h>

#include <algorithm>
#include <cmath>

#include <Message.h>
#include <Window.h>

#include "ControlLook.h"

namespace {

// How far the frame of a default button reaches beyond the button.
constexpr float kDefaultInset = 3;

} // namespace

BButton::BButton(BRect frame, const char* name, const char* label, BMessage* message,
	uint32 resizingMode, uint32 flags)
	: BControl(frame, name, label, message, resizingMode, flags),
	  fDefault(false)
{
}


BButton::BButton(const char* name, const char* label, BMessage* message, uint32 flags)
	: BControl(name, label, message, flags),
	  fDefault(false)
{
}


BButton::BButton(const char* label, BMessage* message)
	: BButton(NULL, label, message)
{
}


BButton::BButton(BMessage* archive)
	: BControl(archive),
	  fDefault(false)
{
	archive->FindBool("_default", &fDefault);
}


BButton::~BButton()
{
	// As long as this is a button: the window tells its default button that it is none any more.
	RemoveSelf();
}


BArchivable*
BButton::Instantiate(BMessage* archive)
{
	return validate_instantiation(archive, "BButton") ? new BButton(archive) : NULL;
}


status_t
BButton::Archive(BMessage* archive, bool deep) const
{
	status_t status = BControl::Archive(archive, deep);
	if (status == B_OK && fDefault)
		status = archive->AddBool("_default", true);
	return status;
}


void
BButton::Draw(BRect)
{
	BRect frame = Bounds();
	if (fDefault)
		frame.InsetBy(kDefaultInset, kDefaultInset);
	const bool focused = IsFocus() && Window()->IsActive();
	const BPrivate::ControlState state = {IsEnabled(), focused, Value() != B_CONTROL_OFF};
	BPrivate::DrawButtonSurface(this, frame, state, fDefault);
	if (Label() == NULL)
		return;

	font_height height;
	GetFontHeight(&height);
	BString label(Label());
	TruncateString(&label, B_TRUNCATE_END, frame.Width() - 6);
	const float width = StringWidth(label.String());
	SetHighColor(BPrivate::ControlTextColor(IsEnabled(), BPrivate::ButtonSurfaceColor(state)));
	SetDrawingMode(B_OP_OVER);
	DrawString(label.String(),
		BPoint(std::floor((frame.left + frame.right - width) / 2 + 0.5f),
			std::floor((frame.top + frame.bottom + height.ascent - height.descent) / 2 + 0.5f)));
	SetDrawingMode(B_OP_COPY);
}


void
BButton::MouseDown(BPoint)
{
	if (!IsEnabled())
		return;
	SetMouseEventMask(B_POINTER_EVENTS, B_NO_POINTER_HISTORY | B_SUSPEND_VIEW_FOCUS);
	SetTracking(true);
	SetValue(B_CONTROL_ON);
}


void
BButton::MouseUp(BPoint where)
{
	if (!IsTracking())
		return;
	SetTracking(false);
	// What is sent may have the button deleted: nothing comes after it.
	if (IsEnabled() && Bounds().Contains(where)) {
		SetValue(B_CONTROL_ON);
		Invoke();
	} else
		SetValue(B_CONTROL_OFF);
}


void
BButton::MouseMoved(BPoint where, uint32, const BMessage*)
{
	if (IsTracking())
		SetValue(Bounds().Contains(where) ? B_CONTROL_ON : B_CONTROL_OFF);
}


void
BButton::AttachedToWindow()
{
	BControl::AttachedToWindow();
	if (fDefault)
		Window()->SetDefaultButton(this);
}


void
BButton::DetachedFromWindow()
{
	SetValue(B_CONTROL_OFF);
	BControl::DetachedFromWindow();
}


void
BButton::KeyDown(const char* bytes, int32 numBytes)
{
	if (numBytes != 1 || (bytes[0] != B_ENTER && bytes[0] != B_SPACE)) {
		BControl::KeyDown(bytes, numBytes);
		return;
	}
	if (!IsEnabled())
		return;
	SetValue(B_CONTROL_ON);
	Invoke();
}


void
BButton::GetPreferredSize(float* _width, float* _height)
{
	font_height height;
	GetFontHeight(&height);
	BFont font;
	GetFont(&font);
	const float space = std::ceil(font.Size() / 2);
	const float mark = fDefault ? 2 * kDefaultInset : 0;
	const float label = Label() != NULL ? std::ceil(StringWidth(Label())) : 0;
	if (_width != NULL)
		*_width = std::max(label + std::ceil(4.3f * space), std::ceil(12.5f * space)) + mark;
	if (_height != NULL)
		*_height = std::ceil((std::ceil(height.ascent) + std::ceil(height.descent)) * 1.8f) + mark;
}


status_t
BButton::Invoke(BMessage* message)
{
	const status_t status = BControl::Invoke(message);
	SetValue(B_CONTROL_OFF);
	return status;
}


void
BButton::MakeDefault(bool flag)
{
	// The window calls this, too, when it is told: the second call has nothing left to do.
	if (flag == fDefault)
		return;
	const float grow = flag ? kDefaultInset : -kDefaultInset;
	fDefault = flag;
	MoveBy(-grow, -grow);
	ResizeBy(2 * grow, 2 * grow);

	if (Window() == NULL)
		return;
	Invalidate();
	if (flag)
		Window()->SetDefaultButton(this);
	else if (Window()->DefaultButton() == this)
		Window()->SetDefaultButton(NULL);
}


bool
BButton::IsDefault() const
{
	return fDefault;
}


void
BButton::SetLabel(const char* string)
{
	BControl::SetLabel(string);
}

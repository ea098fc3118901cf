// SPDX-License-Identifier: MIT

#include <PictureButton.h>

#include <Message.h>
#include <Window.h>

#include "ClickTracking.h"
#include "ControlLook.h"

namespace {

// How much of the background lies over the picture of a disabled button that has no own one.
constexpr uint8 kDisabledVeil = 150;

std::unique_ptr<BPicture>
ArchivedPicture(BMessage* archive, const char* field)
{
	BMessage picture;
	if (archive->FindMessage(field, &picture) != B_OK)
		return nullptr;
	return std::make_unique<BPicture>(&picture);
}

} // namespace

BPictureButton::BPictureButton(BRect frame, const char* name, BPicture* off, BPicture* on,
	BMessage* message, uint32 behavior, uint32 resizingMode, uint32 flags)
	: BControl(frame, name, NULL, message, resizingMode, flags | B_FULL_UPDATE_ON_RESIZE),
	  fBehavior(behavior),
	  fValueBefore(B_CONTROL_OFF)
{
	SetPicture(&fEnabledOff, off);
	SetPicture(&fEnabledOn, on);
}


BPictureButton::BPictureButton(BMessage* archive)
	: BControl(archive),
	  fEnabledOff(ArchivedPicture(archive, "_deoff")),
	  fEnabledOn(ArchivedPicture(archive, "_denon")),
	  fDisabledOff(ArchivedPicture(archive, "_ddoff")),
	  fDisabledOn(ArchivedPicture(archive, "_ddon")),
	  fBehavior(static_cast<uint32>(archive->GetInt32("_behave", B_ONE_STATE_BUTTON))),
	  fValueBefore(B_CONTROL_OFF)
{
}


BPictureButton::~BPictureButton() {}


BArchivable*
BPictureButton::Instantiate(BMessage* archive)
{
	return validate_instantiation(archive, "BPictureButton") ? new BPictureButton(archive) : NULL;
}


status_t
BPictureButton::Archive(BMessage* archive, bool deep) const
{
	status_t status = BControl::Archive(archive, deep);
	if (status == B_OK)
		status = archive->AddInt32("_behave", static_cast<int32>(fBehavior));
	if (!deep)
		return status;

	const struct {
		const char* field;
		const BPicture* picture;
	} kPictures[] = {{"_denon", fEnabledOn.get()}, {"_deoff", fEnabledOff.get()},
		{"_ddon", fDisabledOn.get()}, {"_ddoff", fDisabledOff.get()}};
	for (const auto& entry : kPictures) {
		if (status != B_OK || entry.picture == NULL)
			continue;
		BMessage picture;
		status = entry.picture->Archive(&picture, true);
		if (status == B_OK)
			status = archive->AddMessage(entry.field, &picture);
	}
	return status;
}


void
BPictureButton::Draw(BRect)
{
	const bool on = Value() != B_CONTROL_OFF;
	const BPicture* picture = on ? fEnabledOn.get() : fEnabledOff.get();
	const BPicture* disabled = on ? fDisabledOn.get() : fDisabledOff.get();
	const bool hasOwn = !IsEnabled() && disabled != NULL;
	if (hasOwn)
		picture = disabled;

	if (picture != NULL)
		DrawPicture(picture, B_ORIGIN);
	if (!IsEnabled() && !hasOwn) {
		rgb_color veil = ViewColor();
		veil.alpha = kDisabledVeil;
		SetDrawingMode(B_OP_ALPHA);
		SetHighColor(veil);
		FillRect(Bounds());
		SetDrawingMode(B_OP_COPY);
	}
	if (IsFocus() && Window()->IsActive()) {
		SetHighColor(ui_color(B_KEYBOARD_NAVIGATION_COLOR));
		StrokeRect(Bounds());
	}
}


void
BPictureButton::DetachedFromWindow()
{
	if (IsTracking())
		SetValue(fValueBefore);
	BControl::DetachedFromWindow();
}


void
BPictureButton::KeyDown(const char* bytes, int32 numBytes)
{
	if (!BPrivate::ClickTracking::IsClickKey(bytes, numBytes)) {
		BControl::KeyDown(bytes, numBytes);
		return;
	}
	if (!IsEnabled())
		return;
	fValueBefore = Value();
	SetValue(PressedValue());
	Invoke();
}


void
BPictureButton::MouseDown(BPoint)
{
	if (!IsEnabled())
		return;
	SetMouseEventMask(B_POINTER_EVENTS, B_NO_POINTER_HISTORY | B_SUSPEND_VIEW_FOCUS);
	SetTracking(true);
	fValueBefore = Value();
	SetValue(PressedValue());
}


void
BPictureButton::MouseMoved(BPoint where, uint32, const BMessage*)
{
	if (IsTracking())
		SetValue(Bounds().Contains(where) ? PressedValue() : fValueBefore);
}


void
BPictureButton::MouseUp(BPoint where)
{
	if (!IsTracking())
		return;
	SetTracking(false);
	const bool clicked = IsEnabled() && Bounds().Contains(where);
	SetValue(clicked ? PressedValue() : fValueBefore);
	// What is sent may have the button deleted: nothing comes after it.
	if (clicked)
		Invoke();
}


status_t
BPictureButton::Invoke(BMessage* message)
{
	const status_t status = BControl::Invoke(message);
	if (fBehavior != B_TWO_STATE_BUTTON)
		SetValue(B_CONTROL_OFF);
	return status;
}


void
BPictureButton::SetEnabledOn(BPicture* picture)
{
	SetPicture(&fEnabledOn, picture);
}


void
BPictureButton::SetEnabledOff(BPicture* picture)
{
	SetPicture(&fEnabledOff, picture);
}


void
BPictureButton::SetDisabledOn(BPicture* picture)
{
	SetPicture(&fDisabledOn, picture);
}


void
BPictureButton::SetDisabledOff(BPicture* picture)
{
	SetPicture(&fDisabledOff, picture);
}


BPicture*
BPictureButton::EnabledOn() const
{
	return fEnabledOn.get();
}


BPicture*
BPictureButton::EnabledOff() const
{
	return fEnabledOff.get();
}


BPicture*
BPictureButton::DisabledOn() const
{
	return fDisabledOn.get();
}


BPicture*
BPictureButton::DisabledOff() const
{
	return fDisabledOff.get();
}


void
BPictureButton::SetBehavior(uint32 behavior)
{
	fBehavior = behavior;
}


uint32
BPictureButton::Behavior() const
{
	return fBehavior;
}


void
BPictureButton::SetPicture(std::unique_ptr<BPicture>* place, BPicture* picture)
{
	// Copied before the old one goes: it may be the same.
	std::unique_ptr<BPicture> copy(picture != NULL ? new BPicture(*picture) : NULL);
	place->swap(copy);
	if (Window() != NULL)
		Invalidate();
}


/// What the value is while the button is held.
int32
BPictureButton::PressedValue() const
{
	if (fBehavior == B_TWO_STATE_BUTTON && fValueBefore != B_CONTROL_OFF)
		return B_CONTROL_OFF;
	return B_CONTROL_ON;
}

// SPDX-License-Identifier: MIT

#include <Control.h>

#include <Message.h>
#include <Messenger.h>
#include <OS.h>
#include <Window.h>

#include "ControlLook.h"

BControl::BControl(BRect frame, const char* name, const char* label, BMessage* message,
	uint32 resizingMode, uint32 flags)
	: BView(frame, name, resizingMode, flags),
	  BInvoker(message, NULL),
	  fLabel(label),
	  fValue(B_CONTROL_OFF),
	  fEnabled(true),
	  fFocusChanging(false),
	  fTracking(false),
	  fWantsNavigation((flags & B_NAVIGABLE) != 0)
{
}


BControl::BControl(const char* name, const char* label, BMessage* message, uint32 flags)
	: BControl(BRect(0, 0, -1, -1), name, label, message, B_FOLLOW_LEFT_TOP, flags)
{
}


BControl::BControl(BMessage* archive)
	: BView(archive),
	  BInvoker(NULL, NULL),
	  fValue(B_CONTROL_OFF),
	  fEnabled(true),
	  fFocusChanging(false),
	  fTracking(false),
	  fWantsNavigation((Flags() & B_NAVIGABLE) != 0)
{
	BMessage message;
	if (archive->FindMessage("_msg", &message) == B_OK)
		SetMessage(new BMessage(message));
	archive->FindString("_label", &fLabel);
	archive->FindInt32("_val", &fValue);
	bool disabled = false;
	if (archive->FindBool("_disable", &disabled) == B_OK && disabled) {
		fEnabled = false;
		// The archived flags are those of a disabled control.
		fWantsNavigation = true;
		BView::SetFlags(Flags() & ~B_NAVIGABLE);
	}
}


BControl::~BControl() {}


BArchivable*
BControl::Instantiate(BMessage* archive)
{
	return validate_instantiation(archive, "BControl") ? new BControl(archive) : NULL;
}


status_t
BControl::Archive(BMessage* archive, bool deep) const
{
	status_t status = BView::Archive(archive, deep);
	if (status == B_OK && Message() != NULL)
		status = archive->AddMessage("_msg", Message());
	if (status == B_OK && !fLabel.IsEmpty())
		status = archive->AddString("_label", fLabel);
	if (status == B_OK && fValue != B_CONTROL_OFF)
		status = archive->AddInt32("_val", fValue);
	if (status == B_OK && !fEnabled)
		status = archive->AddBool("_disable", true);
	return status;
}


void
BControl::WindowActivated(bool active)
{
	BView::WindowActivated(active);
	if (IsFocus())
		Invalidate();
}


void
BControl::AttachedToWindow()
{
	BPrivate::AdoptParentColors(this);
	if (!Messenger().IsValid())
		SetTarget(Window());
	BView::AttachedToWindow();
}


void
BControl::DetachedFromWindow()
{
	fTracking = false;
	BView::DetachedFromWindow();
}


void
BControl::AllAttached()
{
	BView::AllAttached();
}


void
BControl::AllDetached()
{
	BView::AllDetached();
}


void
BControl::MessageReceived(BMessage* message)
{
	BView::MessageReceived(message);
}


void
BControl::MakeFocus(bool focus)
{
	if (focus == IsFocus())
		return;
	BView::MakeFocus(focus);
	if (Window() == NULL)
		return;
	fFocusChanging = true;
	Invalidate();
	fFocusChanging = false;
}


void
BControl::KeyDown(const char* bytes, int32 numBytes)
{
	if (!fEnabled || numBytes != 1 || (bytes[0] != B_ENTER && bytes[0] != B_SPACE)) {
		BView::KeyDown(bytes, numBytes);
		return;
	}
	SetValue(fValue == B_CONTROL_OFF ? B_CONTROL_ON : B_CONTROL_OFF);
	Invoke();
}


void
BControl::MouseDown(BPoint where)
{
	BView::MouseDown(where);
}


void
BControl::MouseUp(BPoint where)
{
	BView::MouseUp(where);
}


void
BControl::MouseMoved(BPoint where, uint32 code, const BMessage* dragMessage)
{
	BView::MouseMoved(where, code, dragMessage);
}


void
BControl::GetPreferredSize(float* _width, float* _height)
{
	BView::GetPreferredSize(_width, _height);
}


void
BControl::ResizeToPreferred()
{
	BView::ResizeToPreferred();
}


void
BControl::SetLabel(const char* string)
{
	if (fLabel == (string != NULL ? string : ""))
		return;
	fLabel = string;
	if (Window() != NULL)
		Invalidate();
}


const char*
BControl::Label() const
{
	return fLabel.IsEmpty() ? NULL : fLabel.String();
}


void
BControl::SetValue(int32 value)
{
	if (value == fValue)
		return;
	fValue = value;
	if (Window() != NULL)
		Invalidate();
}


int32
BControl::Value() const
{
	return fValue;
}


void
BControl::SetEnabled(bool enabled)
{
	if (enabled == fEnabled)
		return;
	fEnabled = enabled;

	if (!enabled) {
		fWantsNavigation = (Flags() & B_NAVIGABLE) != 0;
		if (fWantsNavigation)
			SetFlags(Flags() & ~B_NAVIGABLE);
		if (IsFocus())
			MakeFocus(false);
	} else if (fWantsNavigation)
		SetFlags(Flags() | B_NAVIGABLE);

	if (Window() != NULL)
		Invalidate();
}


bool
BControl::IsEnabled() const
{
	return fEnabled;
}


status_t
BControl::Invoke(BMessage* message)
{
	bool notify;
	const uint32 kind = InvokeKind(&notify);
	if (message == NULL && !notify)
		message = Message();
	if (message == NULL && !IsWatched())
		return B_BAD_VALUE;

	BMessage copy(kind);
	if (message != NULL)
		copy = *message;
	copy.AddInt64("when", system_time());
	copy.AddPointer("source", this);
	copy.AddInt32("be:value", fValue);
	copy.AddMessenger("be:sender", BMessenger(this));

	// Not by BInvoker::Invoke(), which would add fields of its own, with the invoker as the source.
	status_t status = B_BAD_VALUE;
	if (message != NULL)
		status = Messenger().SendMessage(&copy, HandlerForReply(), Timeout());
	SendNotices(kind, &copy);
	return status;
}


bool
BControl::IsFocusChanging() const
{
	return fFocusChanging;
}


bool
BControl::IsTracking() const
{
	return fTracking;
}


void
BControl::SetTracking(bool state)
{
	fTracking = state;
}


void
BControl::SetValueNoUpdate(int32 value)
{
	fValue = value;
}

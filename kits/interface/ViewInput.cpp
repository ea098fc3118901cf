// SPDX-License-Identifier: MIT
// BView: input hooks, event masks, the pointer, dragging and tracking.
#include <View.h>

#include <Bitmap.h>
#include <Message.h>
#include <Window.h>

#include "interface/ScrollBarLink.h"
#include "interface/WindowPrivate.h"

void
BView::MessageReceived(BMessage* message)
{
	switch (message->what) {
		case B_MOUSE_WHEEL_CHANGED:
		{
			float deltaX = message->GetFloat("be:wheel_delta_x", 0);
			float deltaY = message->GetFloat("be:wheel_delta_y", 0);
			bool usesX = deltaX != 0 && fHorizontalBar != nullptr;
			bool usesY = deltaY != 0 && fVerticalBar != nullptr;
			if (usesX)
				fHorizontalBar->WheelTurned(deltaX);
			if (usesY)
				fVerticalBar->WheelTurned(deltaY);
			if (!usesX && !usesY)
				BHandler::MessageReceived(message);
			break;
		}

		default:
			BHandler::MessageReceived(message);
			break;
	}
}


void
BView::MouseDown(BPoint)
{
}


void
BView::MouseUp(BPoint)
{
}


void
BView::MouseMoved(BPoint, uint32, const BMessage*)
{
}


void
BView::KeyDown(const char* bytes, int32 numBytes)
{
	if (fOwner != nullptr && numBytes == 1 && bytes[0] == B_TAB)
		fOwner->fData->input.NavigateByKeyboard();
}


void
BView::KeyUp(const char*, int32)
{
}


status_t
BView::SetEventMask(uint32 mask, uint32 options)
{
	CheckLock();
	fEventMask = static_cast<uint8>(mask & (B_POINTER_EVENTS | B_KEYBOARD_EVENTS));
	fEventOptions = static_cast<uint8>(options);
	if (fOwner != nullptr)
		fOwner->fData->input.EventMaskChanged(this);
	return B_OK;
}


uint32
BView::EventMask()
{
	return fEventMask;
}


status_t
BView::SetMouseEventMask(uint32 mask, uint32 options)
{
	CheckLock();
	if (fOwner == nullptr || !fOwner->fData->input.IsInMouseDown())
		return B_ERROR;

	fMouseEventMask = static_cast<uint8>(mask & (B_POINTER_EVENTS | B_KEYBOARD_EVENTS));
	fMouseEventOptions = static_cast<uint8>(options);
	fOwner->fData->input.MouseEventMaskChanged(this);
	return B_OK;
}


void
BView::GetMouse(BPoint* location, uint32* buttons, bool checkMessageQueue)
{
	CheckLock();
	if (fOwner == nullptr)
		return;

	BPoint screenWhere;
	uint32 pressed;
	fOwner->fData->input.GetMouse(this, &screenWhere, &pressed, checkMessageQueue);
	if (location != nullptr)
		*location = ConvertFromScreen(screenWhere);
	if (buttons != nullptr)
		*buttons = pressed;
}


void
BView::BeginRectTracking(BRect startRect, uint32 style)
{
	CheckLock();
	if (fOwner != nullptr)
		fOwner->fData->input.BeginRectTracking(ConvertToScreen(startRect), style);
}


void
BView::EndRectTracking()
{
	CheckLock();
	if (fOwner != nullptr)
		fOwner->fData->input.EndRectTracking();
}


void
BView::DragMessage(BMessage* message, BRect dragRect, BHandler* replyTo)
{
	CheckLock();
	if (message == nullptr || fOwner == nullptr)
		return;
	fOwner->fData->input.StartDrag(
		this, *message, ConvertToScreen(dragRect), nullptr, B_ORIGIN, replyTo);
}


void
BView::DragMessage(BMessage* message, BBitmap* bitmap, BPoint offset, BHandler* replyTo)
{
	DragMessage(message, bitmap, B_OP_COPY, offset, replyTo);
}


void
BView::DragMessage(
	BMessage* message, BBitmap* bitmap, drawing_mode, BPoint offset, BHandler* replyTo)
{
	std::unique_ptr<BBitmap> image(bitmap);
	CheckLock();
	if (message == nullptr || fOwner == nullptr)
		return;
	fOwner->fData->input.StartDrag(this, *message, BRect(), image.get(), offset, replyTo);
}

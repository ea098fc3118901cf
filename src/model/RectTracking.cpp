// SPDX-License-Identifier: MIT
// Dragging a rectangle's corner with the mouse.

#include "model/RectTracking.h"

#include <InterfaceDefs.h>
#include <Message.h>
#include <MessageQueue.h>
#include <OS.h>
#include <View.h>
#include <Window.h>

namespace {

constexpr bigtime_t kPollInterval = 30000; // microseconds
constexpr uint32 kEscapeKey = 0x01;        // as keyboards number their keys

bool
IsEscapeDown()
{
	key_info info;
	return get_key_info(&info) == B_OK
		&& (info.key_states[kEscapeKey >> 3] & (0x80 >> (kEscapeKey & 7))) != 0;
}


/// Takes Escape out of the messages that wait for \a window: a short press is over before the keys are asked.
bool
TakeEscape(BWindow* window)
{
	BMessageQueue* queue = window->MessageQueue();
	queue->Lock();
	BMessage* press = nullptr;
	for (int32 i = 0; press == nullptr; i++) {
		BMessage* message = queue->FindMessage(B_KEY_DOWN, i);
		const char* bytes;
		if (message == nullptr)
			break;
		if (message->FindString("bytes", &bytes) == B_OK && bytes[0] == B_ESCAPE)
			press = message;
	}
	if (press != nullptr)
		queue->RemoveMessage(press);
	queue->Unlock();
	delete press;
	return press != nullptr;
}

} // namespace

bool
TrackCorner(BView* view, BRect* rect)
{
	view->BeginRectTracking(*rect, B_TRACK_RECT_CORNER);
	BPoint point;
	uint32 buttons;
	bool cancelled = false;
	do {
		snooze(kPollInterval);
		view->GetMouse(&point, &buttons);
		cancelled = TakeEscape(view->Window()) || IsEscapeDown();
	} while (buttons != 0 && !cancelled);
	view->EndRectTracking();
	if (cancelled)
		return false;

	rect->right = point.x;
	rect->bottom = point.y;
	return true;
}

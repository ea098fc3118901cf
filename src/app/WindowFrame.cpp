// SPDX-License-Identifier: MIT

#include "app/WindowFrame.h"

#include <algorithm>

#include <Screen.h>
#include <Window.h>

#include "app/Preferences.h"
#include "model/FiniteRect.h"

namespace {

// Where the platform takes any number for a screen.
constexpr int32 kMostScreens = 16;

bool
IsFrame(BRect frame)
{
	return IsFinite(frame) && frame.IsValid();
}


bool
FindFrame(const char* key, BRect* frame)
{
	std::lock_guard<std::mutex> lock(AppSettingsLock);
	return AppSettings.FindRect(key, frame) == B_OK;
}


bool
IsOnAnyScreen(BRect frame)
{
	for (screen_id id = B_MAIN_SCREEN_ID; id.id < kMostScreens; id.id++) {
		BScreen screen(id);
		if (!screen.IsValid())
			break;
		if (screen.Frame().Intersects(frame))
			return true;
	}
	return false;
}

} // namespace


bool
RestoreWindowFrame(BWindow* window, const char* key)
{
	BRect frame;
	if (!FindFrame(key, &frame) || !IsFrame(frame))
		return false;

	if (!IsOnAnyScreen(frame))
		frame = FrameOnScreen(frame, BScreen(B_MAIN_SCREEN_ID).Frame());
	window->MoveTo(frame.LeftTop());
	window->ResizeTo(frame.Width(), frame.Height());
	return true;
}


void
StoreWindowFrame(const BWindow* window, const char* key)
{
	const BRect frame = window->Frame();
	std::lock_guard<std::mutex> lock(AppSettingsLock);
	AppSettings.SetRect(key, frame);
}


BRect
FrameOnScreen(BRect frame, BRect screen)
{
	if (!screen.IsValid() || screen.Intersects(frame))
		return frame;

	// As near to its old place as it can be seen whole; a larger one begins in the screen's left top corner.
	const float left = std::max(screen.left, std::min(frame.left, screen.right - frame.Width()));
	const float top = std::max(screen.top, std::min(frame.top, screen.bottom - frame.Height()));
	return frame.OffsetToCopy(left, top);
}

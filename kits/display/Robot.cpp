// SPDX-License-Identifier: MIT
// The robot's hands: pointer and keys, and waiting for the windows.
#include "display/Robot.h"

#include <algorithm>
#include <cmath>
#include <cstring>
#include <string>

#include <OS.h>
#include <Window.h>

#include "app/LooperPrivate.h"
#include "display/Display.h"
#include "display/KeyMap.h"
#include "display/Utf8.h"

namespace BPrivate {

namespace {

const uint32 kMsgPing = '_rPg';
// While a button is held the window's thread may sit in a loop that asks for the pointer now and then
// and answers nothing: it gets the time for one more look. Those that answer are not kept waiting.
const bigtime_t kLookTime = 60000;
const bigtime_t kStepTime = 15000;
// How long a window may take for what it is doing before it counts as busy.
const bigtime_t kBusyTime = 700000;
const bigtime_t kWaitStep = 20000;
// What a message caused, another message or drawing, is in the queue behind it: the second round finds
// it done, the third what that caused in turn.
const int kRounds = 3;

struct Modifier {
	const char* name;
	uint32 bits;
	int32 rawKey;
};

const Modifier kModifiers[] = {{"shift+", B_SHIFT_KEY, kRawLeftShift},
	{"command+", B_COMMAND_KEY, kRawLeftCommand}, {"control+", B_CONTROL_KEY, kRawLeftControl},
	{"option+", B_OPTION_KEY, kRawLeftOption}};

} // namespace


Robot::Robot(bigtime_t limit)
	: fLimit(limit),
	  fButtons(0)
{
}


void
Robot::Pause(bigtime_t time)
{
	snooze(time);
}


// #pragma mark - pointer


void
Robot::MoveTo(BPoint where)
{
	fWhere = where;
	Display::Get().InjectPointer(where, fButtons);
	if (fButtons == 0)
		Settle();
	else
		Look(kStepTime);
}


void
Robot::Press(uint32 button)
{
	fButtons |= button;
	Display::Get().InjectPointer(fWhere, fButtons);
	Look(kLookTime);
}


void
Robot::Release()
{
	Look(kLookTime);
	fButtons = 0;
	Display::Get().InjectPointer(fWhere, 0);
	Settle();
}


void
Robot::Click(BPoint where, int32 count, uint32 button)
{
	MoveTo(where);
	for (int32 i = 0; i < count; i++) {
		fButtons |= button;
		Display::Get().InjectPointer(fWhere, fButtons);
		// A double click must stay one, so only the last release waits for the windows.
		Look(kLookTime);
		fButtons = 0;
		Display::Get().InjectPointer(fWhere, 0);
	}
	Settle();
}


void
Robot::Drag(BPoint from, BPoint to, int32 steps)
{
	MoveTo(from);
	Press();
	for (int32 i = 1; i <= steps; i++) {
		float part = static_cast<float>(i) / steps;
		MoveTo(BPoint(std::round(from.x + (to.x - from.x) * part),
			std::round(from.y + (to.y - from.y) * part)));
	}
	Release();
}


void
Robot::Wheel(float deltaX, float deltaY)
{
	Display::Get().InjectWheel(deltaX, deltaY);
	Settle();
}


// #pragma mark - keys


void
Robot::PressKey(int32 rawKey, const char* bytes, uint32 modifiers)
{
	Display& display = Display::Get();
	uint32 held = 0;
	for (const Modifier& modifier : kModifiers) {
		if ((modifiers & modifier.bits) == 0)
			continue;
		held |= modifier.bits;
		display.InjectKey({modifier.rawKey, "", held}, true);
	}
	display.InjectKey({rawKey, bytes, modifiers}, true);
	display.InjectKey({rawKey, bytes, modifiers}, false);
	for (const Modifier& modifier : kModifiers) {
		if ((modifiers & modifier.bits) == 0)
			continue;
		held &= ~modifier.bits;
		display.InjectKey({modifier.rawKey, "", held}, false);
	}
}


void
Robot::Type(const char* text)
{
	const char* end = text + strlen(text);
	while (text < end) {
		const char* start = text;
		NextCharacter(&text, end);
		bool needsShift = false;
		int32 rawKey = text - start == 1 ? KeyForChar(*start, &needsShift) : 0;
		std::string bytes(start, text);
		PressKey(rawKey, bytes.c_str(), needsShift ? B_SHIFT_KEY : 0);
	}
	Settle();
}


status_t
Robot::Key(const char* key)
{
	uint32 modifiers = 0;
	for (bool again = true; again;) {
		again = false;
		for (const Modifier& modifier : kModifiers) {
			size_t length = strlen(modifier.name);
			if (strncasecmp(key, modifier.name, length) != 0 || key[length] == '\0')
				continue;
			modifiers |= modifier.bits;
			key += length;
			again = true;
		}
	}

	int32 rawKey = KeyForName(key);
	if (rawKey == 0)
		return B_BAD_VALUE;
	char bytes[2] = {};
	BytesForKey(rawKey, modifiers, bytes);
	PressKey(rawKey, bytes, modifiers);
	Settle();
	return B_OK;
}


// #pragma mark - waiting


bool
Robot::Ping(const BLooper* looper, const BMessenger& target, bigtime_t limit)
{
	// An open menu or an alert may begin meanwhile, so the wait goes on step by step.
	const bigtime_t end = system_time() + limit;
	do {
		if (LooperAccess::IsInUserWait(looper))
			return true;
		BMessage ping(kMsgPing);
		BMessage reply;
		const bigtime_t step = std::min(limit, kWaitStep);
		status_t status = target.SendMessage(&ping, &reply, step, step);
		// A window that has gone meanwhile has nothing left to do.
		if (status != B_TIMED_OUT && status != B_WOULD_BLOCK)
			return true;
	} while (system_time() < end);
	return false;
}


bool
Robot::SettleWindow(BWindow* window, bigtime_t limit)
{
	const bigtime_t end = system_time() + limit;
	while (true) {
		const status_t status = LooperAccess::LockIfThere(window, std::min(limit, kWaitStep));
		if (status == B_OK)
			break;
		// A window that has gone meanwhile has nothing left to do.
		if (status == B_BAD_VALUE || LooperAccess::IsInUserWait(window))
			return true;
		if (system_time() >= end)
			return false;
	}
	BMessenger messenger(window);
	bool isRunning = !window->IsHidden();
	window->Unlock();
	return !isRunning || Ping(window, messenger, limit);
}


bool
Robot::SettleOnce(bigtime_t limit)
{
	// A test may do without the application's loop.
	bool settled = true;
	const BMessenger application = LooperAccess::RunningApplication();
	if (application.IsValid()) {
		BLooper* looper;
		application.Target(&looper);
		settled = Ping(looper, application, limit);
	}
	for (BWindow* window : LooperAccess::Windows())
		settled = SettleWindow(window, limit) && settled;
	// What follows an open menu counts too: it opens and closes the menus' windows.
	for (const BMessenger& menu : LooperAccess::LoopersOfKind(kMenuWindowLooper, limit)) {
		BLooper* looper;
		menu.Target(&looper);
		settled = Ping(looper, menu, limit) && settled;
	}
	return settled;
}


void
Robot::Look(bigtime_t time)
{
	const bigtime_t end = system_time() + time;
	for (int round = 0; round < kRounds; round++) {
		const bigtime_t left = end - system_time();
		if (left <= 0 || !SettleOnce(left)) {
			snooze_until(end, B_SYSTEM_TIMEBASE);
			return;
		}
	}
}


bool
Robot::Settle()
{
	bool settled = true;
	for (int round = 0; round < kRounds && settled; round++)
		settled = SettleOnce(kBusyTime);
	// The pointer is left alone: it may be somebody else's, where the robot only looks.
	Display::Get().Sync();
	return settled;
}

} // namespace BPrivate

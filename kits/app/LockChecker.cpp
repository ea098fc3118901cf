// SPDX-License-Identifier: MIT
// Finds threads that hold locks in a way that can deadlock.

#include "app/LockChecker.h"

#include <atomic>
#include <cstdarg>
#include <cstdio>
#include <cstdlib>
#include <cstring>

#include <execinfo.h>
#include <unistd.h>

#include "app/LooperPort.h"
#include "app/LooperPrivate.h"

namespace BPrivate {

namespace {

enum checker_mode { kOff, kReport, kAbort };

std::atomic<int32> sViolations(0);


checker_mode
Mode()
{
	static const checker_mode mode = [] {
		const char* value = getenv("BE_CHECK_LOCKS");
		if (value == nullptr || value[0] == '\0' || strcmp(value, "0") == 0)
			return kOff;
		return strcmp(value, "abort") == 0 ? kAbort : kReport;
	}();
	return mode;
}


/// The looper's name; its lock is held by the calling thread.
const char*
NameOf(const LooperPort* port)
{
	const char* name = port->Looper()->Name();
	return name != nullptr ? name : "unnamed";
}


__attribute__((format(printf, 1, 2))) void
Report(const char* format, ...)
{
	sViolations++;

	// In one piece: other threads may report too.
	char text[512];
	int length =
		snprintf(text, sizeof(text), "BE_CHECK_LOCKS: thread %" B_PRId32 " ", CurrentThread());
	va_list arguments;
	va_start(arguments, format);
	vsnprintf(text + length, sizeof(text) - length, format, arguments);
	va_end(arguments);
	fprintf(stderr, "%s\n", text);
	fflush(stderr);

	void* frames[64];
	int count = backtrace(frames, 64);
	backtrace_symbols_fd(frames, count, STDERR_FILENO);

	if (Mode() == kAbort)
		abort();
}


bool
IsRunningWindow(const LooperPort* port)
{
	// What follows an open menu counts among the menus' windows, and is none.
	const bool isTracker = port->Kind() == kMenuWindowLooper && port->Window() == nullptr;
	return port->IsRunning() && !isTracker && port->Kind() != kPlainLooper
		&& port->Kind() != kOffscreenWindowLooper;
}

} // namespace


bool
LockCheckerIsOn()
{
	return Mode() != kOff;
}


void
CheckTaken(const LooperPort* taken, const LooperPort* held)
{
	// The window of an open menu may be taken last: its threads wait for no other.
	if (!IsRunningWindow(taken) || taken->Kind() == kMenuWindowLooper)
		return;

	for (; held != nullptr; held = held->OlderHeld()) {
		if (IsRunningWindow(held)) {
			Report("takes the lock of window \"%s\" while it holds that of window \"%s\"",
				NameOf(taken), NameOf(held));
			return;
		}
	}
}


void
CheckWait(const char* what)
{
	if (!LockCheckerIsOn())
		return;

	for (LooperPort* held = LooperPort::NewestHeld(); held != nullptr; held = held->OlderHeld()) {
		if (held->IsRunning() && held->Thread() != CurrentThread()) {
			Report("waits for %s while it holds the lock of \"%s\"", what, NameOf(held));
			return;
		}
	}
}

} // namespace BPrivate


int32
be_count_lock_violations()
{
	return BPrivate::sViolations;
}

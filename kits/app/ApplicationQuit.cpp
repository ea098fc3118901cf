// SPDX-License-Identifier: MIT
// The application's windows and loopers, and how it quits them and itself.

#include <Application.h>

#include <algorithm>
#include <cstdio>

#include <Autolock.h>

#include "app/LooperPort.h"
#include "app/LooperPrivate.h"
#include "app/Registry.h"
#include "kernel/Kernel.h"

using BPrivate::CurrentThread;
using BPrivate::LooperAccess;
using BPrivate::LooperPort;
using BPrivate::Registry;

typedef std::shared_ptr<LooperPort> PortRef;

// Nobody is to wait for the destructor of a looper that hangs.
static constexpr bigtime_t kLeavingLimit = 5'000'000;


/// The ports of the program's windows that \a wanted holds for, the oldest first.
template <typename Wanted>
static std::vector<PortRef>
Windows(Wanted wanted)
{
	std::vector<PortRef> windows;
	for (const PortRef& port : Registry::Default().Loopers()) {
		if (wanted(port->Kind()))
			windows.push_back(port);
	}
	return windows;
}


int32
BApplication::CountWindows() const
{
	return int32(BPrivate::LooperAccess::Windows().size());
}


BWindow*
BApplication::WindowAt(int32 index) const
{
	const std::vector<BWindow*> windows = BPrivate::LooperAccess::Windows();
	return index >= 0 && size_t(index) < windows.size() ? windows[index] : nullptr;
}


void
BApplication::Quit()
{
	if (!IsLocked()) {
		fprintf(stderr, "ERROR - you must Lock the application object before calling Quit()\n");
		if (!Lock())
			return;
	}

	if (!fRunCalled) {
		delete this;
		return;
	}
	if (Thread() == CurrentThread())
		fTerminating = true;
	else
		PostMessage(_QUIT_);
}


bool
BApplication::QuitRequested()
{
	return QuitAllWindows(false);
}


status_t
BApplication::RegisterLooper(BLooper* looper)
{
	PortRef port = Registry::Default().PortFor(looper);
	if (port == nullptr || port->Kind() != BPrivate::kPlainLooper || looper == this)
		return B_BAD_VALUE;

	BAutolock lock(this);
	auto found = std::find(fRegisteredLoopers.begin(), fRegisteredLoopers.end(), looper);
	if (found != fRegisteredLoopers.end())
		return B_ERROR;
	fRegisteredLoopers.push_back(looper);
	return B_OK;
}


status_t
BApplication::UnregisterLooper(BLooper* looper)
{
	if (looper == nullptr)
		return B_BAD_VALUE;

	BAutolock lock(this);
	auto found = std::find(fRegisteredLoopers.begin(), fRegisteredLoopers.end(), looper);
	if (found == fRegisteredLoopers.end())
		return B_ERROR;
	fRegisteredLoopers.erase(found);
	return B_OK;
}


/// Asks the window at \a port, unless \a force, and quits it. False when it refuses.
static bool
QuitWindow(const PortRef& port, bool force)
{
	// It may have gone since it was listed: that is what is wanted.
	if (port->Lock(B_INFINITE_TIMEOUT) != B_OK)
		return true;

	BLooper* window = port->Looper();
	if (!force && !window->QuitRequested()) {
		port->Unlock();
		return false;
	}
	// The hook may have unlocked the window, or quit it.
	if (port->IsLockedByCaller() || port->Lock(B_INFINITE_TIMEOUT) == B_OK)
		window->Quit();
	return true;
}


/// Quits the windows, file panels last. Without \a force each is asked, and the first to refuse stops it: false.
bool
BApplication::QuitAllWindows(bool force)
{
	// A window that is asked, or that is at work, may need the application's lock.
	int32 levels = LooperAccess::UnlockFully(this);
	bool quit = true;

	// New windows may open meanwhile: look again after each.
	auto quitKind = [&](auto wanted, bool forceKind) {
		while (quit) {
			std::vector<PortRef> windows = Windows(wanted);
			if (windows.empty())
				return;
			quit = QuitWindow(windows.front(), forceKind);
		}
	};
	quitKind([](auto kind) { return kind == BPrivate::kWindowLooper; }, force);
	// A panel is told, but its answer does not count.
	while (quit) {
		std::vector<PortRef> panels =
			Windows([](auto kind) { return kind == BPrivate::kFilePanelWindowLooper; });
		if (panels.empty())
			break;
		if (!QuitWindow(panels.front(), force))
			QuitWindow(panels.front(), true);
	}
	if (force)
		quitKind([](auto kind) { return kind == BPrivate::kMenuWindowLooper; }, true);

	LooperAccess::LockAgain(this, levels);
	return quit;
}


void
BApplication::QuitRegisteredLoopers()
{
	std::vector<BLooper*> loopers;
	loopers.swap(fRegisteredLoopers);
	int32 levels = LooperAccess::UnlockFully(this);
	for (BLooper* looper : loopers) {
		if (looper->Lock())
			looper->Quit();
	}
	// Some have quit by themselves, and nobody has waited for their threads. The program may end right after this, and
	// destroys the static objects of the host's libraries then: a thread that has used these, as every window's has,
	// must not clean up at the same time.
	BPrivate::wait_for_announced_ends(kLeavingLimit);
	LooperAccess::LockAgain(this, levels);
}

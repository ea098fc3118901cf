// SPDX-License-Identifier: MIT
// Waiting for the user in the middle of a program's function: an open menu, an alert.
#include "interface/UserWait.h"

#include <Looper.h>
#include <Window.h>

#include "app/LooperPrivate.h"

namespace BPrivate {

namespace {

// While a window waits it looks after its picture this often.
constexpr bigtime_t kRepaintInterval = 50000;

} // namespace


UserWait::UserWait()
	: fEnded(create_sem(0, "user wait"))
{
}


UserWait::~UserWait()
{
	delete_sem(fEnded);
}


void
UserWait::Wait(const char* what)
{
	CheckWait(what);
	BLooper* caller = BLooper::LooperForThread(find_thread(nullptr));
	BWindow* window = dynamic_cast<BWindow*>(caller);
	const uint32 flags = window != nullptr ? B_RELATIVE_TIMEOUT : 0;
	const bigtime_t timeout = window != nullptr ? kRepaintInterval : B_INFINITE_TIMEOUT;

	{
		std::lock_guard lock(fLock);
		if (caller != nullptr && !fIsOver) {
			LooperAccess::BeginUserWait(caller);
			fWaiting = caller;
		}
	}
	status_t status;
	do {
		status = acquire_sem_etc(fEnded, 1, flags, timeout);
		if (status == B_TIMED_OUT && window->LockWithTimeout(0) == B_OK) {
			window->UpdateIfNeeded();
			window->Unlock();
		}
	} while (status == B_TIMED_OUT || status == B_WOULD_BLOCK || status == B_INTERRUPTED);
	Leave();
}


void
UserWait::End()
{
	Leave();
	release_sem(fEnded);
}


void
UserWait::Leave()
{
	std::lock_guard lock(fLock);
	fIsOver = true;
	if (fWaiting != nullptr)
		LooperAccess::EndUserWait(fWaiting);
	fWaiting = nullptr;
}

} // namespace BPrivate

// SPDX-License-Identifier: MIT

#include "app/WindowGuard.h"

#include <Looper.h>
#include <OS.h>

namespace {

thread_local WindowGuard* sInnermost = nullptr;

} // namespace

WindowGuard::WindowGuard(BLooper* target, bigtime_t patience)
	: fTarget(target),
	  fIsLocked(target != nullptr && target->IsLocked()),
	  fHasTaken(false),
	  fGivenUp(nullptr),
	  fLevels(0),
	  fOuter(sInnermost)
{
	// Loading a form takes a guard for every property, with the form's window locked all the while.
	if (target != nullptr && !fIsLocked) {
		fGivenUp = HeldLooper();
		fLevels = GiveUp(fGivenUp);
		fHasTaken = target->LockWithTimeout(patience) == B_OK;
		fIsLocked = fHasTaken;
	}
	sInnermost = this;
}


WindowGuard::~WindowGuard()
{
	sInnermost = fOuter;
	// The block may have quit the target, whose lock is gone with it.
	if (fHasTaken && fTarget->IsLocked())
		fTarget->Unlock();
	TakeBack(fGivenUp, fLevels);
}


/// The looper whose lock this thread holds, as far as guards can know; none when it holds none.
BLooper*
WindowGuard::HeldLooper()
{
	for (const WindowGuard* guard = sInnermost; guard != nullptr; guard = guard->fOuter) {
		if (guard->fIsLocked)
			return guard->fTarget->IsLocked() ? guard->fTarget : nullptr;
	}
	BLooper* own = BLooper::LooperForThread(find_thread(nullptr));
	return own != nullptr && own->IsLocked() ? own : nullptr;
}


int32
WindowGuard::GiveUp(BLooper* looper)
{
	if (looper == nullptr)
		return 0;
	const int32 levels = looper->CountLocks();
	for (int32 i = levels; i > 0 && looper->IsLocked(); i--)
		looper->Unlock();
	return levels;
}


void
WindowGuard::TakeBack(BLooper* looper, int32 levels)
{
	for (; levels > 0; levels--) {
		if (!looper->Lock())
			return;
	}
}


WindowRelease::WindowRelease()
	: fGivenUp(WindowGuard::HeldLooper()),
	  fLevels(WindowGuard::GiveUp(fGivenUp))
{
}


WindowRelease::~WindowRelease()
{
	WindowGuard::TakeBack(fGivenUp, fLevels);
}

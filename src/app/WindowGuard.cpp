// SPDX-License-Identifier: MIT

#include "app/WindowGuard.h"

#include <Looper.h>
#include <OS.h>

namespace {

thread_local WindowGuard* sInnermost = nullptr;

} // namespace

WindowGuard::WindowGuard(BLooper* target, bigtime_t patience)
	: fTarget(target),
	  fIsLocked(false),
	  fGivenUp(nullptr),
	  fLevels(0),
	  fOuter(sInnermost)
{
	BLooper* held = HeldLooper();
	if (target != nullptr && target != held)
		GiveUp(held);
	if (target != nullptr)
		fIsLocked = target->LockWithTimeout(patience) == B_OK;
	sInnermost = this;
}


WindowGuard::~WindowGuard()
{
	sInnermost = fOuter;
	// The block may have quit the target, whose lock is gone with it.
	if (fIsLocked && fTarget->IsLocked())
		fTarget->Unlock();
	TakeBack();
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


void
WindowGuard::GiveUp(BLooper* looper)
{
	if (looper == nullptr)
		return;
	fGivenUp = looper;
	for (fLevels = looper->CountLocks(); fLevels > 0 && looper->IsLocked(); looper->Unlock()) {
	}
}


void
WindowGuard::TakeBack()
{
	for (; fLevels > 0; fLevels--) {
		if (!fGivenUp->Lock())
			return;
	}
}

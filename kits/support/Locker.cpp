// SPDX-License-Identifier: MIT
// BLocker.
//
// In benaphore style fRequests counts who has the lock or asks for it, and the semaphore starts
// empty: only a thread that finds others before it waits there. Otherwise the semaphore starts with
// one place, and fRequests only counts.

#include <Locker.h>

BLocker::BLocker()
	: BLocker("some BLocker", true)
{
}


BLocker::BLocker(const char* name)
	: BLocker(name, true)
{
}


BLocker::BLocker(bool benaphoreStyle)
	: BLocker("some BLocker", benaphoreStyle)
{
}


BLocker::BLocker(const char* name, bool benaphoreStyle)
	: fIsBenaphore(benaphoreStyle),
	  fSemaphore(create_sem(benaphoreStyle ? 0 : 1, name)),
	  fRequests(0),
	  fOwner(-1),
	  fDepth(0)
{
}


BLocker::~BLocker()
{
	delete_sem(fSemaphore);
}


status_t
BLocker::InitCheck() const
{
	return fSemaphore >= 0 ? B_OK : fSemaphore;
}


bool
BLocker::Lock()
{
	return AcquireLock(B_INFINITE_TIMEOUT) == B_OK;
}


status_t
BLocker::LockWithTimeout(bigtime_t timeout)
{
	status_t status = AcquireLock(timeout);
	if (status == B_WOULD_BLOCK)
		return B_TIMED_OUT;
	return status == B_BAD_SEM_ID ? B_BAD_VALUE : status;
}


status_t
BLocker::AcquireLock(bigtime_t timeout)
{
	if (IsLocked()) {
		fDepth++;
		return B_OK;
	}

	// In benaphore style a request that times out is not taken back: the next Unlock() may have made a place in the
	// semaphore for it already. It costs the next one who locks a look at the semaphore.
	int32 before = atomic_add(&fRequests, 1);
	if (!fIsBenaphore || before > 0) {
		bigtime_t end;
		if (__builtin_add_overflow(timeout, system_time(), &end))
			end = B_INFINITE_TIMEOUT;
		uint32 flags = timeout <= 0 ? B_RELATIVE_TIMEOUT : B_ABSOLUTE_TIMEOUT;
		sem_id semaphore = fSemaphore;
		status_t status;
		do {
			status = acquire_sem_etc(semaphore, 1, flags, timeout <= 0 ? 0 : end);
		} while (status == B_INTERRUPTED);
		if (status != B_OK) {
			// With its semaphore the locker is gone, and must not be looked at any more.
			if (status != B_BAD_SEM_ID && !fIsBenaphore)
				atomic_add(&fRequests, -1);
			return status;
		}
	}

	atomic_set(&fOwner, find_thread(nullptr));
	fDepth = 1;
	return B_OK;
}


void
BLocker::Unlock()
{
	if (!IsLocked())
		return;
	fDepth--;
	if (fDepth > 0)
		return;

	atomic_set(&fOwner, -1);
	int32 before = atomic_add(&fRequests, -1);
	if (!fIsBenaphore || before > 1)
		release_sem(fSemaphore);
}


thread_id
BLocker::LockingThread() const
{
	return atomic_get(const_cast<int32*>(&fOwner));
}


bool
BLocker::IsLocked() const
{
	return LockingThread() == find_thread(nullptr);
}


int32
BLocker::CountLocks() const
{
	return fDepth;
}


int32
BLocker::CountLockRequests() const
{
	return atomic_get(const_cast<int32*>(&fRequests));
}


sem_id
BLocker::Sem() const
{
	return fSemaphore;
}

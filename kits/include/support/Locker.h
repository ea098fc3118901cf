// SPDX-License-Identifier: MIT
// A lock for one thread at a time.

#ifndef _SUPPORT_LOCKER_H
#define _SUPPORT_LOCKER_H

#include <OS.h>

/// A lock that its holder may take again; it is free after as many Unlock() calls.
///
/// Deleting a locker wakes the threads that wait for it: their Lock() fails.
class BLocker {
public:
	BLocker();
	BLocker(const char* name);
	/// \a benaphoreStyle: an uncontended lock costs no semaphore operation.
	BLocker(bool benaphoreStyle);
	BLocker(const char* name, bool benaphoreStyle);
	virtual ~BLocker();

	status_t InitCheck() const;

	/// Waits without limit; false only when the locker is gone.
	bool Lock();
	/// \a timeout: microseconds. B_OK, B_TIMED_OUT, or B_BAD_VALUE when the locker is gone.
	status_t LockWithTimeout(bigtime_t timeout);
	/// Does nothing in a thread that does not hold the lock.
	void Unlock();

	/// The holder, or a negative number.
	thread_id LockingThread() const;
	/// Whether the calling thread holds the lock.
	bool IsLocked() const;
	/// The holder's nesting depth.
	int32 CountLocks() const;
	/// How many threads have the lock or asked for it.
	int32 CountLockRequests() const;
	sem_id Sem() const;

private:
	BLocker(const BLocker&) = delete;
	BLocker& operator=(const BLocker&) = delete;

	status_t AcquireLock(bigtime_t timeout);

	bool fIsBenaphore;
	sem_id fSemaphore;
	int32 fRequests;
	thread_id fOwner;
	int32 fDepth;
};

#endif // _SUPPORT_LOCKER_H

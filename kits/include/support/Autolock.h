// SPDX-License-Identifier: MIT
// A lock for the length of a block.

#ifndef _SUPPORT_AUTOLOCK_H
#define _SUPPORT_AUTOLOCK_H

#include <Locker.h>

class BLooper;

/// Locks a locker or a looper, and unlocks it at the end of the block. A looper that has quit does
/// not lock: test IsLocked(). The locked object is borrowed.
class BAutolock {
public:
	BAutolock(BLooper* looper);
	BAutolock(BLocker* locker);
	BAutolock(BLocker& locker);
	~BAutolock();

	bool IsLocked();
	/// Locks again after an Unlock(); does nothing while locked.
	bool Lock();
	void Unlock();

private:
	BAutolock(const BAutolock&) = delete;
	BAutolock& operator=(const BAutolock&) = delete;

	BLocker* fLocker;
	BLooper* fLooper;
	bool fIsLocked;
};

#endif // _SUPPORT_AUTOLOCK_H

// SPDX-License-Identifier: MIT
// Reaching for another window without ever holding two window locks.

#pragma once

#include <SupportDefs.h>

class BLooper;

/// The lock of a window (or another looper) for the length of a block.
///
/// The lock that the thread holds so far, with all its levels, is given up before the other is taken, and
/// taken back afterwards. So a thread that reaches other windows only through guards never holds two window
/// locks, and windows that reach for each other cannot deadlock. Guards nest.
///
/// While a guard lives, and until its constructor returns, other threads may change what the given-up lock
/// protects: look such things up again. The lock that is given up is that of the guard around this one or,
/// outside any, of the looper whose thread this is; a lock that a thread took on some other looper by itself
/// is not known here and must not be held. With a looper that the thread has locked already a guard does nothing.
class WindowGuard {
public:
	/// Long enough for a window that is busy drawing or loading, short enough for a user who waits; in microseconds.
	static constexpr bigtime_t kPatience = 10 * 1000000;

	/// Waits for \a target's lock up to \a patience microseconds. \a target may be gone, or null.
	explicit WindowGuard(BLooper* target, bigtime_t patience = kPatience);
	~WindowGuard();

	WindowGuard(const WindowGuard&) = delete;
	WindowGuard& operator=(const WindowGuard&) = delete;

	/// False when the target is none, is gone, or was not to be had in time: leave it alone then.
	bool IsLocked() const { return fIsLocked; }

private:
	friend class WindowRelease;

	static BLooper* HeldLooper();
	/// Unlocks \a looper completely; returns how often it was locked.
	static int32 GiveUp(BLooper* looper);
	static void TakeBack(BLooper* looper, int32 levels);

	BLooper* fTarget;
	bool fIsLocked;
	bool fHasTaken; // the lock is the guard's own, and not that of somebody around it
	BLooper* fGivenUp;
	int32 fLevels;
	WindowGuard* fOuter;
};

/// Gives up the lock that the thread holds, as far as guards know it, for the length of a block.
///
/// For what must be done with no window's lock held: waiting for another thread's answer, making a window that
/// shows itself. Guards within the block work as ever. Look up again afterwards what the lock protects.
class WindowRelease {
public:
	WindowRelease();
	~WindowRelease();

	WindowRelease(const WindowRelease&) = delete;
	WindowRelease& operator=(const WindowRelease&) = delete;

private:
	BLooper* fGivenUp;
	int32 fLevels;
};

// SPDX-License-Identifier: MIT
// A clock for measuring how long something takes.

#ifndef _STOP_WATCH_H
#define _STOP_WATCH_H

#include <vector>

#include <OS.h>
#include <String.h>

/// Runs from its construction; the destructor prints its name and the time unless silent.
/// All times are microseconds.
class BStopWatch {
public:
	BStopWatch(const char* name, bool silent = false);
	virtual ~BStopWatch();

	void Suspend();
	void Resume();
	/// The time from the start; remembered and printed at the end. 0 while suspended.
	bigtime_t Lap();
	/// Without the time spent suspended.
	bigtime_t ElapsedTime() const;
	/// Starts again at 0, and forgets the laps.
	void Reset();
	const char* Name() const;

private:
	BStopWatch(const BStopWatch&) = delete;
	BStopWatch& operator=(const BStopWatch&) = delete;

	bigtime_t fStart;
	bigtime_t fSuspendTime;
	std::vector<bigtime_t> fLaps;
	BString fName;
	bool fSilent;
};

#endif // _STOP_WATCH_H

// SPDX-License-Identifier: MIT
// BStopWatch.

#include <StopWatch.h>

#include <stdio.h>

BStopWatch::BStopWatch(const char* name, bool silent)
	: fStart(system_time()),
	  fSuspendTime(0),
	  fName(name),
	  fSilent(silent)
{
}


BStopWatch::~BStopWatch()
{
	if (fSilent)
		return;

	printf("StopWatch \"%s\": %" B_PRId64 " usecs.\n", Name(), ElapsedTime());
	bigtime_t before = 0;
	for (size_t i = 0; i < fLaps.size(); i++) {
		printf("   [%zu: %" B_PRId64 "#%" B_PRId64 "]\n", i + 1, fLaps[i], fLaps[i] - before);
		before = fLaps[i];
	}
	fflush(stdout);
}


void
BStopWatch::Suspend()
{
	if (fSuspendTime == 0)
		fSuspendTime = system_time();
}


void
BStopWatch::Resume()
{
	if (fSuspendTime == 0)
		return;
	fStart += system_time() - fSuspendTime;
	fSuspendTime = 0;
}


bigtime_t
BStopWatch::Lap()
{
	if (fSuspendTime != 0)
		return 0;
	fLaps.push_back(ElapsedTime());
	return fLaps.back();
}


bigtime_t
BStopWatch::ElapsedTime() const
{
	return (fSuspendTime == 0 ? system_time() : fSuspendTime) - fStart;
}


void
BStopWatch::Reset()
{
	fStart = system_time();
	fSuspendTime = 0;
	fLaps.clear();
}


const char*
BStopWatch::Name() const
{
	return fName.String();
}

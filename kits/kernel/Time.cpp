// SPDX-License-Identifier: MIT
// Time and sleep.

#include <OS.h>

#include <errno.h>
#include <time.h>

#include "kernel/Kernel.h"
#include "support/HostError.h"

using namespace BPrivate;

namespace {

bigtime_t
clock_usecs(clockid_t clock)
{
	timespec now;
	clock_gettime(clock, &now);
	return static_cast<bigtime_t>(now.tv_sec) * 1000000 + now.tv_nsec / 1000;
}


status_t
sleep_until(bigtime_t time)
{
	timespec end;
	end.tv_sec = time / 1000000;
	end.tv_nsec = time % 1000000 * 1000;

	was_own_interrupt();
	for (;;) {
		int error = clock_nanosleep(CLOCK_MONOTONIC, TIMER_ABSTIME, &end, nullptr);
		// Being suspended and resumed is no reason to wake up early.
		if (error != EINTR || !was_own_interrupt())
			return host_error(error);
	}
}

} // namespace


bigtime_t
system_time()
{
	return clock_usecs(CLOCK_MONOTONIC);
}


unsigned long
real_time_clock()
{
	return real_time_clock_usecs() / 1000000;
}


bigtime_t
real_time_clock_usecs()
{
	return clock_usecs(CLOCK_REALTIME);
}


status_t
snooze(bigtime_t amount)
{
	bigtime_t end;
	if (__builtin_add_overflow(system_time(), amount, &end))
		end = B_INFINITE_TIMEOUT;
	return snooze_until(end, B_SYSTEM_TIMEBASE);
}


status_t
snooze_until(bigtime_t time, int timeBase)
{
	if (timeBase != B_SYSTEM_TIMEBASE)
		return B_ERROR;
	if (time <= system_time())
		return B_OK;

	Thread* thread;
	{
		KernelSection section;
		thread = section.Current();
	}
	thread->activity = B_THREAD_ASLEEP;
	status_t status = sleep_until(time);
	thread->activity = B_THREAD_RUNNING;
	return status;
}

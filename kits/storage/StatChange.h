// SPDX-License-Identifier: MIT
// Times of a file, as the host's calls take them.

#ifndef _STAT_CHANGE_H
#define _STAT_CHANGE_H

#include <sys/stat.h>

namespace BPrivate {

/// One time to set, the other to keep.
struct time_change {
	struct timespec times[2] = {{0, UTIME_OMIT}, {0, UTIME_OMIT}};

	static time_change Access(time_t time)
	{
		time_change change;
		change.times[0] = {time, 0};
		return change;
	}
	static time_change Modification(time_t time)
	{
		time_change change;
		change.times[1] = {time, 0};
		return change;
	}
};

} // namespace BPrivate

#endif

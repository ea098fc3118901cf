// SPDX-License-Identifier: MIT
// How long tests wait where programs are slow.

#pragma once

#include <cstdlib>

/// How many times as long as usual a test waits: more than 1 where a sanitizer makes programs slow.
inline int
Patience()
{
	const char* patience = getenv("PLIM_PATIENCE");
	return patience != nullptr ? atoi(patience) : 1;
}

// SPDX-License-Identifier: MIT
// An add-on that tells when it comes and goes.

#include <stdlib.h>

extern "C" {

int addon_value = 42;


int
addon_function(int number)
{
	return number + addon_value;
}

} // extern "C"


/// What is in several add-ons alike must not keep this one in memory.
inline int shared_counter = 0;


namespace {

/// Leaves its trace where the test can see it while the add-on is not loaded.
struct Trace {
	Trace() { setenv("ADDON_TRACE", shared_counter++ == 0 ? "loaded" : "again", 1); }
	~Trace() { setenv("ADDON_TRACE", "unloaded", 1); }
} sTrace;

} // namespace

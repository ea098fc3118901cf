// SPDX-License-Identifier: MIT
// What must hold for every input, in tests and under the fuzzer alike.

#pragma once

#include <cstdio>
#include <cstdlib>

/// Ends the program, with a line on standard error, when \a condition does not hold.
#define REQUIRE(condition)                                                                         \
	do {                                                                                           \
		if (!(condition)) {                                                                        \
			fprintf(stderr, "%s:%d: does not hold: %s\n", __FILE__, __LINE__, #condition);         \
			abort();                                                                               \
		}                                                                                          \
	} while (false)

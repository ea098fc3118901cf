// SPDX-License-Identifier: MIT
// Comparing the names of properties and events. Not for component libraries.

#pragma once

#include <cstring>

/// Whether the names are the same. Loading a form compares names more than it does anything else, and few of
/// them begin alike.
inline bool
IsSameName(const char* name, const char* other)
{
	for (int i = 0; i < 3; i++) {
		if (name[i] != other[i])
			return false;
		if (name[i] == '\0')
			return true;
	}
	return strcmp(name + 3, other + 3) == 0;
}

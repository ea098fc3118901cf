// SPDX-License-Identifier: MIT
// Small helpers for the diagnostics on standard output.

#include "model/Diagnostics.h"

#include <cstdio>
#include <cstring>

static bool sDiscardsCalls = false;


void
PrintCall(const char* function, const char* first, const char* second)
{
	if (sDiscardsCalls)
		return;

	// Put together here, a line takes a fraction of what printf() takes for it.
	const char* const parts[] = {
		function, "('", ShownText(first), "', '", ShownText(second), "')\n"};
	char line[256];
	size_t length = 0;
	for (const char* part : parts) {
		const size_t partLength = strlen(part);
		if (partLength > sizeof(line) - length) {
			printf("%s('%s', '%s')\n", function, parts[2], parts[4]);
			return;
		}
		memcpy(line + length, part, partLength);
		length += partLength;
	}
	fwrite(line, 1, length, stdout);
}


void
DiscardCalls()
{
	sDiscardsCalls = true;
}

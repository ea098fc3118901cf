// SPDX-License-Identifier: MIT
// The diagnostics on standard output.

#include "model/Diagnostics.h"

#include <cstdarg>
#include <cstdio>
#include <cstring>

bool gDiagnosticsShown = true;
static thread_local bool sSilent = false;


void
PrintDiagnostic(const char* format, ...)
{
	if (!gDiagnosticsShown || sSilent)
		return;
	va_list arguments;
	va_start(arguments, format);
	vprintf(format, arguments);
	va_end(arguments);
}


void
PrintShownCall(const char* function, const char* first, const char* second)
{
	if (sSilent)
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
		// NOLINTNEXTLINE(bugprone-not-null-terminated-result): the line is written by its length
		memcpy(line + length, part, partLength);
		length += partLength;
	}
	fwrite(line, 1, length, stdout);
}


void
ShowDiagnostics(bool shown)
{
	gDiagnosticsShown = shown;
}


TDiagnosticSilence::TDiagnosticSilence()
	: fWasSilent(sSilent)
{
	sSilent = true;
}


TDiagnosticSilence::~TDiagnosticSilence()
{
	sSilent = fWasSilent;
}

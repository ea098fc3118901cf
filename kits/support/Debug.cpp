// SPDX-License-Identifier: MIT
// What the macros of Debug.h call.

#define DEBUG 1
#include <Debug.h>

#include <stdarg.h>
#include <stdio.h>

int
_debugPrintf(const char* format, ...)
{
	va_list arguments;
	va_start(arguments, format);
	int length = vfprintf(stderr, format, arguments);
	va_end(arguments);
	return length;
}


int
_debuggerAssert(const char* file, int line, const char* message)
{
	char text[1024];
	snprintf(text, sizeof(text), "Assert failed: File: %s, Line: %d. %s", file, line, message);
	debugger(text);
	return 0;
}

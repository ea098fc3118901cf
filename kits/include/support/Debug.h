// SPDX-License-Identifier: MIT
// Checks and traces that are compiled in only when DEBUG is defined as other than 0.

#ifndef _DEBUG_H
#define _DEBUG_H

#include <OS.h>
#include <SupportDefs.h>

#if DEBUG

int _debugPrintf(const char* format, ...) __attribute__((format(printf, 1, 2)));
/// Stops in the debugger with \a message; always 0.
int _debuggerAssert(const char* file, int line, const char* message);

#define SERIAL_PRINT(ARGS) _debugPrintf ARGS
#define PRINT(ARGS) _debugPrintf ARGS
#define TRACE()                                                                                    \
	_debugPrintf("File: %s, Line: %d, Thread: %d\n", __FILE__, __LINE__, find_thread(NULL))
#define SERIAL_TRACE() TRACE()
#define DEBUGGER(MSG) debugger(MSG)
#define ASSERT(E) (!(E) ? _debuggerAssert(__FILE__, __LINE__, #E) : (int)0)
#define ASSERT_WITH_MESSAGE(expr, msg) (!(expr) ? _debuggerAssert(__FILE__, __LINE__, msg) : (int)0)
#define TRESPASS() DEBUGGER("Should not be here")

#else

#define SERIAL_PRINT(ARGS) (void)0
#define PRINT(ARGS) (void)0
#define TRACE() (void)0
#define SERIAL_TRACE() (void)0
#define DEBUGGER(MSG) (void)0
#define ASSERT(E) (void)0
#define ASSERT_WITH_MESSAGE(expr, msg) (void)0
#define TRESPASS() (void)0

#endif

#endif // _DEBUG_H

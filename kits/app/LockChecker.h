// SPDX-License-Identifier: MIT
// Finds threads that hold locks in a way that can deadlock.
//
// BE_CHECK_LOCKS=1 reports to standard error, with a stack trace, each thread that takes the lock of a second running
// window, or waits for a reply while it holds the lock of a running looper other than its own thread's.
// BE_CHECK_LOCKS=abort also ends the program there. A window that does not run yet is its creator's alone and does not
// count, nor does one of an open menu that is taken last.

#ifndef _LOCK_CHECKER_H
#define _LOCK_CHECKER_H

#include <SupportDefs.h>

/// How many violations were found since the start; 0 when the checker is off. Any thread.
extern "C" int32 be_count_lock_violations();

namespace BPrivate {

class LooperPort;

/// Whether BE_CHECK_LOCKS asks for checks.
bool LockCheckerIsOn();

/// Called when the calling thread got the first level of \a taken's lock; \a held is the newest lock it had before.
void CheckTaken(const LooperPort* taken, const LooperPort* held);

} // namespace BPrivate

#endif // _LOCK_CHECKER_H

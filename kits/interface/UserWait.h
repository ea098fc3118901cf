// SPDX-License-Identifier: MIT
// Waiting for the user in the middle of a program's function: an open menu, an alert.
#ifndef INTERFACE_USER_WAIT_H
#define INTERFACE_USER_WAIT_H

#include <OS.h>

namespace BPrivate {

/// Returns when \a ended is released or deleted. A window's thread keeps its picture up to date meanwhile.
/// \a what: what is waited for, for the report on locks that the thread must not hold.
void WaitForUser(sem_id ended, const char* what);

} // namespace BPrivate

#endif // INTERFACE_USER_WAIT_H

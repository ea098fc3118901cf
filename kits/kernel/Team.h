// SPDX-License-Identifier: MIT
// The processes that load_image() makes, as the threads that stand for them.

#ifndef _KERNEL_TEAM_H
#define _KERNEL_TEAM_H

#include <OS.h>

namespace BPrivate {

struct Thread;

// All are used inside a KernelSection.

/// Starts the process, or lets a stopped one go on; false when it is running.
bool resume_team(Thread* team);
status_t suspend_team(Thread* team);
status_t signal_team(Thread* team, int signal);

} // namespace BPrivate

#endif // _KERNEL_TEAM_H

// SPDX-License-Identifier: MIT
// Sounds of the system.

#ifndef _BEEP_H
#define _BEEP_H

#include <SupportDefs.h>

/// Rings the terminal's bell. B_ERROR when the program has no terminal.
status_t beep();
/// As beep(), for a known event; B_NAME_NOT_FOUND for another.
status_t system_beep(const char* eventName);
/// Makes an event known to this program.
status_t add_system_beep_event(const char* eventName, uint32 flags = 0);

#endif // _BEEP_H

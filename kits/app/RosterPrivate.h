// SPDX-License-Identifier: MIT
// How the application object tells the roster about itself.

#ifndef _ROSTER_PRIVATE_H
#define _ROSTER_PRIVATE_H

#include <OS.h>

namespace BPrivate {

/// This program's application runs from now on; watchers are told, as they are by the next two.
void RegisterApplication(const char* signature, thread_id thread, port_id port);
void UnregisterApplication();
void SetApplicationActive(bool active);

} // namespace BPrivate

#endif // _ROSTER_PRIVATE_H

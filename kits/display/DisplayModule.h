// SPDX-License-Identifier: MIT
// What a display module, a library of its own, offers to the kits.
#ifndef DISPLAY_DISPLAY_MODULE_H
#define DISPLAY_DISPLAY_MODULE_H

namespace BPrivate {

class Display;

/// "be_display_start": connects to the host. Null when that fails; \a *reason then says why, in words
/// that fit behind a colon. Called once; the display is the module's and lives until the program ends.
typedef Display* (*StartDisplay)(const char** reason);

/// "be_display_stop": ends the module's threads. Called when the program exits; what is called on the
/// display later does nothing.
typedef void (*StopDisplay)();

} // namespace BPrivate

#endif // DISPLAY_DISPLAY_MODULE_H

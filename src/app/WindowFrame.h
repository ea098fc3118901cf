// SPDX-License-Identifier: MIT
// Window frames that survive the program.

#pragma once

#include <Rect.h>

class BWindow;

/// Moves and resizes \a window to the frame that the settings hold under \a key; false, and the window
/// stays as it is, when they hold none or an invalid one.
///
/// A frame that no screen shows any part of is moved onto the main screen. Lock the window. Any thread.
bool RestoreWindowFrame(BWindow* window, const char* key);

/// Stores the frame of \a window in the settings under \a key. Lock the window. Any thread.
void StoreWindowFrame(const BWindow* window, const char* key);

/// Where a window with \a frame is put: there, or, when it does not meet \a screen, with its left top moved onto it.
BRect FrameOnScreen(BRect frame, BRect screen);

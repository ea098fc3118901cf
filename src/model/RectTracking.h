// SPDX-License-Identifier: MIT
// Dragging a rectangle's corner with the mouse.

#pragma once

#include <Rect.h>

class BView;

/// Lets the user move the right bottom corner of \a rect until all buttons are up, polling every 30 ms.
///
/// \a rect: in \a view's coordinates; \a view is attached, and a button is down. False, with \a rect as it was, when
/// Escape is pressed meanwhile. The view's window thread, locked.
bool TrackCorner(BView* view, BRect* rect);

// SPDX-License-Identifier: MIT
// Locks the window of a design-time view for the length of a block. Not for component libraries.

#pragma once

#include <View.h>

#include "app/WindowGuard.h"

/// A design-time view with its window locked, or nothing: without a view, without a window, or when the
/// window is gone. The lock of another window that the thread holds is given up meanwhile.
class TViewLock {
public:
	explicit TViewLock(BView* view)
		: fGuard(view != nullptr ? view->Looper() : nullptr)
	{
	}

	bool IsLocked() const { return fGuard.IsLocked(); }

private:
	WindowGuard fGuard;
};

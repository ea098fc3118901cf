// SPDX-License-Identifier: MIT
// Locks the window of a design-time view for the length of a block. Not for component libraries.

#pragma once

#include <View.h>

/// A design-time view with its window locked, or nothing: without a view, without a window, or when the
/// window is gone.
class TViewLock {
public:
	explicit TViewLock(BView* view)
		: fView(view != nullptr && view->LockLooper() ? view : nullptr)
	{
	}

	~TViewLock()
	{
		if (fView != nullptr)
			fView->UnlockLooper();
	}

	TViewLock(const TViewLock&) = delete;
	TViewLock& operator=(const TViewLock&) = delete;

	bool IsLocked() const { return fView != nullptr; }

private:
	BView* fView;
};

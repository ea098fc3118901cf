// SPDX-License-Identifier: MIT
// The rows that show a component in the property window.

#pragma once

#include <atomic>
#include <memory>
#include <vector>

#include <SupportDefs.h>

class BLooper;
class TComponent;
class TEventListItem;
class TPropertyListItem;

/// A row for each property and each event of a component, in its order, read at one moment.
struct TComponentRows {
	TComponentRows();
	~TComponentRows();

	/// Reads \a component with the lock of its form's window, or \a otherLock (may be null) when it lies on none.
	///
	/// The lock that the thread holds is given up meanwhile. \a count counts what is shown: nothing is read, and the
	/// result is false, when it has changed before the lock was there, as the component may be gone then.
	bool Read(TComponent* component, BLooper* otherLock, const std::atomic<uint32>& count);

	/// The lock that was taken, or null.
	BLooper* lock;
	std::vector<std::unique_ptr<TPropertyListItem>> properties;
	std::vector<std::unique_ptr<TEventListItem>> events;
};

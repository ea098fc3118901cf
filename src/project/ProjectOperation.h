// SPDX-License-Identifier: MIT
// One thread at a time works on a project.

#pragma once

#include <OS.h>

class TProject;

/// The right to work on a project for the length of a block: to load or save it, to make, add and remove
/// forms, to walk over its application's forms and generate their sources.
///
/// As long as an operation is under way in a thread, no other thread begins one, and no form and no
/// application component goes. A thread may begin further ones within its own. Windows are no part of it:
/// an operation holds no window's lock, and whoever waits for one gives up the lock that it has.
class TProjectOperation {
public:
	/// Waits up to \a patience microseconds for the operation of another thread to end.
	explicit TProjectOperation(TProject* project, bigtime_t patience = B_INFINITE_TIMEOUT);
	~TProjectOperation();

	TProjectOperation(const TProjectOperation&) = delete;
	TProjectOperation& operator=(const TProjectOperation&) = delete;

	/// False when another thread's operation is still under way: leave the project alone.
	bool IsBegun() const { return fIsBegun; }

private:
	TProject* fProject;
	bool fIsBegun;
};

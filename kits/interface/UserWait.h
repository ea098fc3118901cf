// SPDX-License-Identifier: MIT
// Waiting for the user in the middle of a program's function: an open menu, an alert.
#ifndef INTERFACE_USER_WAIT_H
#define INTERFACE_USER_WAIT_H

#include <mutex>

#include <OS.h>

class BLooper;

namespace BPrivate {

/// The wait of a thread until another one says that the user has done with a menu or an alert.
///
/// While it lasts, the looper of the waiting thread counts as one that waits for the user.
class UserWait {
public:
	UserWait();
	/// Ends the wait, too.
	~UserWait();

	UserWait(const UserWait&) = delete;
	UserWait& operator=(const UserWait&) = delete;

	/// B_OK, or why there is nothing to wait with.
	status_t InitCheck() const { return fEnded < B_OK ? fEnded : B_OK; }

	/// Returns when End() was called. A window's thread keeps its picture up to date meanwhile.
	/// \a what: what is waited for, for the report on locks that the thread must not hold. Once.
	void Wait(const char* what);

	/// Any thread. When it returns, the waiting looper counts as busy, though its thread may be yet to run.
	void End();

private:
	void Leave();

	const sem_id fEnded;
	std::mutex fLock;
	BLooper* fWaiting = nullptr; // counted as waiting
	bool fIsOver = false;
};

} // namespace BPrivate

#endif // INTERFACE_USER_WAIT_H

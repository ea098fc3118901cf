// SPDX-License-Identifier: MIT
// What other kits may do with loopers, handlers and messengers beyond the public classes.

#ifndef _LOOPER_PRIVATE_H
#define _LOOPER_PRIVATE_H

#include <vector>

#include <Looper.h>
#include <Messenger.h>

namespace BPrivate {

/// What sort of looper a looper is: it decides which ones BApplication counts and how it quits them.
enum looper_kind {
	kPlainLooper,
	kWindowLooper,
	kMenuWindowLooper,      // not counted, quit without asking
	kFilePanelWindowLooper, // asked last, closed in any case
	kOffscreenWindowLooper  // the views of a bitmap: not counted, never asked nor quit
};


/// The private side of a looper, for the interface kit and the display.
struct LooperAccess {
	/// A BWindow is kWindowLooper from its construction on; this makes it a more special one. Locked.
	static void SetKind(BLooper* looper, looper_kind kind);
	static looper_kind Kind(const BLooper* looper);
	/// The window that \a looper is, NULL for a plain one.
	static BWindow* Window(BLooper* looper);

	/// Gives up the caller's lock with all its levels and returns how many there were (0: it was not locked).
	static int32 UnlockFully(BLooper* looper);
	/// Takes the lock back with \a levels levels. B_BAD_VALUE when the looper has gone meanwhile: nothing of it may
	/// be touched then.
	static status_t LockAgain(BLooper* looper, int32 levels);

	/// Queues \a message, which the looper owns from here on, for the handler with \a token (kNoToken: the looper,
	/// kPreferredToken). Spares the copy that PostMessage() makes. B_BAD_PORT_ID, message deleted, when it is gone.
	static status_t PostOwned(port_id port, int32 token, BMessage* message);

	/// The running loopers of \a kind, the oldest first. Locks each for a moment, and leaves out those
	/// that stay locked for \a timeout microseconds.
	static std::vector<BMessenger> LoopersOfKind(looper_kind kind, bigtime_t timeout);

	/// The application while its loop runs, else one that is not valid. For threads that may outlive it: be_app goes.
	static BMessenger RunningApplication();
	/// As BApplication::WindowAt() has them. Any of them may be gone.
	static std::vector<BWindow*> Windows();

	/// The looper's port, which outlives it: for threads that must not touch the looper itself.
	static port_id Port(const BLooper* looper);
	static int32 Token(const BHandler* handler);
	/// The handler with \a token if it belongs to \a looper now, else NULL. \a looper locked.
	static BHandler* HandlerFor(const BLooper* looper, int32 token);
	/// As BLooper::LockWithTimeout(), for a looper that may be gone: B_BAD_VALUE then. Touches the looper's port only.
	static status_t LockIfThere(const BLooper* looper, bigtime_t timeout);
	/// Whether Run() or Loop() was called.
	static bool IsRunning(const BLooper* looper);

	/// The looper's thread waits for what the user does elsewhere and answers no messages, or no longer. Begun by
	/// that thread, ended by any while it waits; calls nest.
	static void BeginUserWait(BLooper* looper);
	static void EndUserWait(BLooper* looper);
	/// Any thread; \a looper may be gone.
	static bool IsInUserWait(const BLooper* looper);
};


/// For waits that messages do not show (an alert, a file panel): reports the calling thread when it holds the lock of
/// a looper that runs in another thread. See LockChecker.h. \a what: of the wait, for the report.
void CheckWait(const char* what);

} // namespace BPrivate

#endif // _LOOPER_PRIVATE_H

// SPDX-License-Identifier: MIT
// The part of a looper that outlives it: its lock and the messages that arrive.

#ifndef _LOOPER_PORT_H
#define _LOOPER_PORT_H

#include <atomic>
#include <condition_variable>
#include <deque>
#include <memory>
#include <mutex>

#include <OS.h>
#include <SupportDefs.h>

#include "app/LooperPrivate.h"

class BMessage;
class BMessageQueue;

namespace BPrivate {

/// The calling thread's identifier, kept so that asking for it costs nothing.
thread_id CurrentThread();


/// Lock and arrivals of one looper. Shared by the looper and by whoever is about to use it, so that a thread which
/// waits for a looper that is being deleted waits on something that exists.
///
/// The lock is recursive and fair: it is handed to the thread that has waited longest.
class LooperPort : public std::enable_shared_from_this<LooperPort> {
public:
	/// Begins locked by the calling thread once TakeFirstLock() was called.
	LooperPort(port_id id, BLooper* looper, BWindow* window);
	~LooperPort();

	port_id Id() const { return fId; }
	/// For identity, or for those who hold the lock.
	BLooper* Looper() const { return fLooper; }
	BWindow* Window() const { return fWindow; }
	looper_kind Kind() const { return fKind; }
	void SetKind(looper_kind kind) { fKind = kind; }
	thread_id Thread() const { return fThread; }
	void SetThread(thread_id thread) { fThread = thread; }
	/// Whether the loop has been started.
	bool IsRunning() const { return fRunning; }
	void SetRunning() { fRunning = true; }
	/// How many waits for the user the looper's thread is in.
	int32 CountUserWaits() const { return fUserWaits; }
	void ChangeUserWaits(int32 difference) { fUserWaits += difference; }

	/// B_OK; B_BAD_VALUE when the looper is gone or goes meanwhile; B_TIMED_OUT, B_WOULD_BLOCK.
	status_t Lock(bigtime_t timeout);
	/// Nothing happens when the calling thread has not locked it.
	void Unlock();
	int32 UnlockFully();
	status_t LockAgain(int32 levels);
	bool IsLockedByCaller() const;
	thread_id LockingThread() const { return fOwner; }
	int32 CountLocks() const { return fLevels; }
	int32 CountLockRequests() const;

	/// Takes over \a message; B_BAD_PORT_ID, and the message stays the caller's, when closed.
	status_t Post(BMessage* message);
	bool HasMessages() const;
	/// Waits until a message arrives, or another thread than the looper's has moved some. False after \a timeout.
	bool WaitForMessage(bigtime_t timeout);
	/// Takes the next message, NULL when there is none.
	BMessage* Take();
	void MoveInto(BMessageQueue* queue);

	/// The looper is about to go; the caller holds the lock. Waiters fail, later posts too. Returns the messages that
	/// nobody will handle: the caller deletes them.
	std::deque<BMessage*> Close();
	void WaitUntilClosed();

	/// The port of \a looper if the calling thread has it locked, else NULL; \a looper is not touched.
	static LooperPort* HeldPort(const BLooper* looper);
	/// The locks the calling thread holds: the newest, and the one before.
	static LooperPort* NewestHeld();
	LooperPort* OlderHeld() const { return fOlderHeld; }

private:
	struct Waiter;

	void Taken();
	void Released();
	void HandOver();

	const port_id fId;
	BLooper* const fLooper;
	BWindow* const fWindow;
	std::atomic<looper_kind> fKind;
	std::atomic<thread_id> fThread;
	std::atomic<bool> fRunning;
	std::atomic<int32> fUserWaits;

	mutable std::mutex fMutex;
	std::condition_variable fArrived;
	std::condition_variable fClosedCondition;
	bool fClosed;
	bool fMovedByOthers;
	std::deque<BMessage*> fMessages;
	std::deque<Waiter*> fWaiters;

	// Written under fMutex, except that the owner counts its own levels.
	std::atomic<thread_id> fOwner;
	std::atomic<int32> fLevels;

	// The owner's alone: the list of what its thread has locked, whose ports must not go.
	LooperPort* fOlderHeld;
	std::shared_ptr<LooperPort> fKeepWhileHeld;
};

} // namespace BPrivate

#endif // _LOOPER_PORT_H

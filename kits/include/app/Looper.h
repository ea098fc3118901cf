// SPDX-License-Identifier: MIT
// A thread that takes messages from a queue and hands them to handlers.

#ifndef _LOOPER_H
#define _LOOPER_H

#include <deque>
#include <memory>

#include <Handler.h>
#include <Message.h>

class BMessageQueue;
class BWindow;

namespace BPrivate {
struct LoopFrame;
} // namespace BPrivate

#define B_LOOPER_PORT_DEFAULT_CAPACITY 200


/// A message queue with a thread of its own and a recursive lock.
///
/// It is made locked by the thread that makes it, and not running: Run() gives up that lock and starts the thread.
/// The looper is locked while it dispatches a message. It is never deleted while it runs: it ends by Quit().
class BLooper : public BHandler {
public:
	/// \a priority: of the thread. \a portCapacity is kept for the caller; the queue has no limit.
	BLooper(const char* name = NULL, int32 priority = B_NORMAL_PRIORITY,
		int32 portCapacity = B_LOOPER_PORT_DEFAULT_CAPACITY);
	BLooper(BMessage* archive);
	virtual ~BLooper();

	static BArchivable* Instantiate(BMessage* archive);
	virtual status_t Archive(BMessage* archive, bool deep = true) const override;

	/// Queues a message for the looper itself, or for \a handler, which must belong to it (NULL: the preferred handler,
	/// else the looper). The message is copied and stays the caller's. Any thread; never waits.
	/// \a replyTo gets the reply (NULL: the application). Returns B_OK; B_BAD_VALUE without a message;
	/// B_MISMATCHED_VALUES for a handler of another looper; B_BAD_PORT_ID when the looper is gone.
	status_t PostMessage(uint32 command);
	status_t PostMessage(BMessage* message);
	status_t PostMessage(uint32 command, BHandler* handler, BHandler* replyTo = NULL);
	status_t PostMessage(BMessage* message, BHandler* handler, BHandler* replyTo = NULL);

	/// Hands a message to its handler. Looper thread, locked.
	virtual void DispatchMessage(BMessage* message, BHandler* handler);
	virtual void MessageReceived(BMessage* message) override;

	/// The message being dispatched, NULL outside the loop. Looper thread only.
	BMessage* CurrentMessage() const;
	/// As CurrentMessage(), and the caller becomes its owner: deleting it without a reply releases a waiting sender.
	BMessage* DetachCurrentMessage();
	/// The messages that wait, all that were posted before this call included; the looper's.
	BMessageQueue* MessageQueue() const;
	bool IsMessageWaiting() const;

	/// Makes a handler of no looper one of this. The handler stays the caller's. Locked.
	void AddHandler(BHandler* handler);
	/// Returns false when it is not a handler of this. Locked.
	bool RemoveHandler(BHandler* handler);
	/// The looper itself is its handler 0.
	int32 CountHandlers() const;
	BHandler* HandlerAt(int32 index) const;
	int32 IndexOf(BHandler* handler) const;

	BHandler* PreferredHandler() const;
	void SetPreferredHandler(BHandler* handler);

	/// Starts the loop's thread and gives up the creator's lock. Returns the thread or an error; once only.
	virtual thread_id Run();
	/// Runs the loop in the calling thread, and returns when the looper has quit. Instead of Run().
	void Loop();
	/// Ends the looper and deletes it; needs the lock. In the looper's own thread it does not return. From another
	/// thread it handles what was queued before, and returns when the looper is gone.
	virtual void Quit();
	/// Asks whether B_QUIT_REQUESTED may end the looper. The base agrees.
	virtual bool QuitRequested();

	/// Waits for the lock; false when the looper is gone, also if it goes while waiting. Recursive. Any thread.
	bool Lock();
	void Unlock();
	/// Whether the calling thread holds the lock.
	bool IsLocked() const;
	/// B_OK; B_TIMED_OUT; B_WOULD_BLOCK for a \a timeout of 0; B_BAD_VALUE when the looper is gone. Microseconds.
	status_t LockWithTimeout(bigtime_t timeout);
	thread_id Thread() const;
	team_id Team() const;
	/// The looper whose loop runs in \a thread, NULL when there is none.
	static BLooper* LooperForThread(thread_id thread);
	thread_id LockingThread() const;
	int32 CountLocks() const;
	int32 CountLockRequests() const;

	/// Filters that run on every message of the looper, before the target's own; owned from then on.
	virtual void AddCommonFilter(BMessageFilter* filter);
	virtual bool RemoveCommonFilter(BMessageFilter* filter);
	virtual void SetCommonFilterList(BList* filters);
	BList* CommonFilterList() const;

protected:
	/// Takes the next message from the port, not from MessageQueue(); the caller owns it. NULL after \a timeout.
	BMessage* MessageFromPort(bigtime_t timeout = B_INFINITE_TIMEOUT);

private:
	friend class BApplication;
	friend class BHandler;
	friend class BMessenger;
	friend class BWindow;
	friend struct BPrivate::LooperAccess;

	/// For BWindow's constructors: a looper of window kind.
	BLooper(BWindow* window, const char* name, int32 priority, int32 portCapacity);

	/// Looks up, or changes, where a message goes. Looper thread, locked, before any filter. \a target is what the
	/// message itself names, \a preferred that it named the preferred handler. NULL drops the message. BWindow finds
	/// the focus view or the view under the pointer here.
	virtual BHandler* ChooseTarget(BMessage* message, BHandler* target, bool preferred);
	/// Called in the looper's thread without the lock when the queue has run empty, before the loop waits.
	virtual void QueueRanEmpty();

	// What works with a looper that may be gone never touches it.
	static status_t PostTo(
		const BLooper* looper, BMessage* message, BHandler* handler, BHandler* replyTo);
	static status_t LockPortOf(const BLooper* looper, bigtime_t timeout);

	static status_t TaskEntry(void* looper);
	void Register(BWindow* window);
	void RunLoop();
	void EnterLoop();
	void DispatchNext(BMessage* message);
	BHandler* FilterMessage(BMessage* message, BHandler* target);
	BHandler* RunFilters(bool common, BMessage* message, BHandler* target);
	void HandleQuitRequest(BMessage* message);
	[[noreturn]] void DeleteAndLeave();

	std::shared_ptr<BPrivate::LooperPort> fPort;
	BMessageQueue* fQueue;
	BMessage* fLastMessage;
	std::deque<BHandler*> fHandlers;
	BHandler* fPreferred;
	BList* fCommonFilters;
	int32 fPriority;
	int32 fPortCapacity;
	bool fRunCalled;
	// Loop() rather than Run(): there is no thread to wait for.
	bool fLoopsInCaller;
	bool fTerminating;
	// Its creator deletes it after the loop; the loop itself never does (the application).
	bool fOutlivesLoop;
};

#endif // _LOOPER_H

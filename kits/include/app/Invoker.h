// SPDX-License-Identifier: MIT
// A message with a target, sent when something happens.

#ifndef _INVOKER_H
#define _INVOKER_H

#include <AppDefs.h>
#include <Messenger.h>
#include <SupportDefs.h>

class BHandler;
class BLooper;
class BMessage;


/// Holds a message and the target it goes to; controls, menus, lists are invokers.
class BInvoker {
public:
	BInvoker();
	/// The message is the invoker's from now on.
	BInvoker(BMessage* message, const BHandler* handler, const BLooper* looper = NULL);
	BInvoker(BMessage* message, BMessenger target);
	virtual ~BInvoker();

	/// Takes over \a message and deletes the one before. Returns B_OK.
	virtual status_t SetMessage(BMessage* message);
	/// The invoker's own message, NULL when there is none.
	BMessage* Message() const;
	/// The message's code, 0 without a message.
	uint32 Command() const;

	/// The handler must belong to a looper now; otherwise the target becomes invalid. Results as BMessenger's.
	virtual status_t SetTarget(const BHandler* handler, const BLooper* looper = NULL);
	virtual status_t SetTarget(BMessenger messenger);
	bool IsTargetLocal() const;
	/// The target handler; NULL when it is the looper's preferred one.
	BHandler* Target(BLooper** _looper = NULL) const;
	BMessenger Messenger() const;

	/// Who gets replies to the messages sent; NULL (the application) by default.
	status_t SetHandlerForReply(BHandler* handler);
	BHandler* HandlerForReply() const;

	/// Sends a copy of \a message, NULL for the own one, with "when" (int64), "source" (pointer) and, of a handler in
	/// a looper, "be:sender" (messenger) added. B_BAD_VALUE when there is no message.
	virtual status_t Invoke(BMessage* message = NULL);
	/// As Invoke(), and tells observers of \a kind too.
	status_t InvokeNotify(BMessage* message, uint32 kind = B_CONTROL_INVOKED);
	/// How long a sender waits to deliver, in microseconds; kept for programs that ask, delivery never waits.
	status_t SetTimeout(bigtime_t timeout);
	bigtime_t Timeout() const;

protected:
	/// The kind of the invocation being handled; \a _notify tells whether InvokeNotify() was called.
	uint32 InvokeKind(bool* _notify = NULL);
	void BeginInvokeNotify(uint32 kind = B_CONTROL_INVOKED);
	void EndInvokeNotify();

private:
	BInvoker(const BInvoker&) = delete;
	BInvoker& operator=(const BInvoker&) = delete;

	BMessage* fMessage;
	BMessenger fMessenger;
	BHandler* fReplyTo;
	bigtime_t fTimeout;
	uint32 fNotifyKind;
	bool fNotify;
};

#endif // _INVOKER_H

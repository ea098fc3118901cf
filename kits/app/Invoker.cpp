// SPDX-License-Identifier: MIT
// A message with a target, sent when something happens.

#include <Invoker.h>

#include <Handler.h>
#include <Looper.h>
#include <Message.h>


BInvoker::BInvoker()
	: BInvoker(nullptr, BMessenger())
{
}


BInvoker::BInvoker(BMessage* message, const BHandler* handler, const BLooper* looper)
	: BInvoker(message, BMessenger(handler, looper))
{
}


BInvoker::BInvoker(BMessage* message, BMessenger target)
	: fMessage(message),
	  fMessenger(target),
	  fReplyTo(nullptr),
	  fTimeout(B_INFINITE_TIMEOUT),
	  fNotifyKind(0),
	  fNotify(false)
{
}


BInvoker::~BInvoker()
{
	delete fMessage;
}


status_t
BInvoker::SetMessage(BMessage* message)
{
	if (message != fMessage) {
		delete fMessage;
		fMessage = message;
	}
	return B_OK;
}


BMessage*
BInvoker::Message() const
{
	return fMessage;
}


uint32
BInvoker::Command() const
{
	return fMessage != nullptr ? fMessage->what : 0;
}


status_t
BInvoker::SetTarget(const BHandler* handler, const BLooper* looper)
{
	status_t status;
	fMessenger = BMessenger(handler, looper, &status);
	return status;
}


status_t
BInvoker::SetTarget(BMessenger messenger)
{
	fMessenger = messenger;
	return B_OK;
}


bool
BInvoker::IsTargetLocal() const
{
	return fMessenger.IsTargetLocal();
}


BHandler*
BInvoker::Target(BLooper** _looper) const
{
	return fMessenger.Target(_looper);
}


BMessenger
BInvoker::Messenger() const
{
	return fMessenger;
}


status_t
BInvoker::SetHandlerForReply(BHandler* handler)
{
	fReplyTo = handler;
	return B_OK;
}


BHandler*
BInvoker::HandlerForReply() const
{
	return fReplyTo;
}


status_t
BInvoker::Invoke(BMessage* message)
{
	if (message == nullptr)
		message = fMessage;

	// Observers of a notification are told even when there is no message for the target.
	bool notify;
	uint32 kind = InvokeKind(&notify);
	BMessage copy(kind);
	if (message != nullptr)
		copy = *message;
	else if (!notify)
		return B_BAD_VALUE;

	BHandler* sender = dynamic_cast<BHandler*>(this);
	copy.AddInt64("when", system_time());
	copy.AddPointer("source", this);
	if (sender != nullptr) {
		BMessenger address(sender);
		if (address.IsValid())
			copy.AddMessenger("be:sender", address);
	}

	status_t status = B_BAD_VALUE;
	if (message != nullptr)
		status = fMessenger.SendMessage(&copy, fReplyTo, fTimeout);
	if (notify && sender != nullptr)
		sender->SendNotices(kind, &copy);
	return status;
}


status_t
BInvoker::InvokeNotify(BMessage* message, uint32 kind)
{
	BeginInvokeNotify(kind);
	status_t status = Invoke(message);
	EndInvokeNotify();
	return status;
}


status_t
BInvoker::SetTimeout(bigtime_t timeout)
{
	fTimeout = timeout;
	return B_OK;
}


bigtime_t
BInvoker::Timeout() const
{
	return fTimeout;
}


uint32
BInvoker::InvokeKind(bool* _notify)
{
	if (_notify != nullptr)
		*_notify = fNotify;
	return fNotify ? fNotifyKind : uint32(B_CONTROL_INVOKED);
}


void
BInvoker::BeginInvokeNotify(uint32 kind)
{
	fNotifyKind = kind;
	fNotify = true;
}


void
BInvoker::EndInvokeNotify()
{
	fNotifyKind = 0;
	fNotify = false;
}

// SPDX-License-Identifier: MIT
// Sends a message again and again.

#ifndef _MESSAGE_RUNNER_H
#define _MESSAGE_RUNNER_H

#include <Messenger.h>
#include <SupportDefs.h>

class BMessage;


/// Sends copies of a message at an interval, a number of times or until it is deleted.
///
/// Intervals are microseconds, one millisecond the shortest that is kept to; a tick that is late is not made up for.
/// A count of -1 sends for ever. The messages come from a thread of the kit.
class BMessageRunner {
public:
	/// \a target and \a message: who gets what; the message is copied. The reply goes to \a replyTo, by default the
	/// application. See InitCheck().
	BMessageRunner(
		BMessenger target, const BMessage* message, bigtime_t interval, int32 count = -1);
	BMessageRunner(
		BMessenger target, const BMessage& message, bigtime_t interval, int32 count = -1);
	BMessageRunner(BMessenger target, const BMessage* message, bigtime_t interval, int32 count,
		BMessenger replyTo);
	BMessageRunner(BMessenger target, const BMessage& message, bigtime_t interval, int32 count,
		BMessenger replyTo);
	virtual ~BMessageRunner();

	/// B_OK; B_BAD_VALUE without a message, for an interval of 0 or less or an invalid target; B_ERROR for a count of 0.
	status_t InitCheck() const;

	/// Both start a new interval now. B_BAD_VALUE when all messages have been sent, or for a bad value.
	status_t SetInterval(bigtime_t interval);
	status_t SetCount(int32 count);
	/// How many messages are still to be sent, and at which interval. B_BAD_VALUE when all have been sent.
	status_t GetInfo(bigtime_t* interval, int32* count) const;

	/// Sends without a runner to keep: it stops after \a count messages, or when the target is gone.
	static status_t StartSending(
		BMessenger target, const BMessage* message, bigtime_t interval, int32 count);
	static status_t StartSending(BMessenger target, const BMessage* message, bigtime_t interval,
		int32 count, BMessenger replyTo);

private:
	BMessageRunner(const BMessageRunner&) = delete;
	BMessageRunner& operator=(const BMessageRunner&) = delete;

	int64 fToken;
	status_t fStatus;
};

#endif // _MESSAGE_RUNNER_H

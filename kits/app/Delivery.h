// SPDX-License-Identifier: MIT
// Bringing messages to loopers and replies to those who wait for them.

#ifndef _DELIVERY_H
#define _DELIVERY_H

#include <condition_variable>
#include <memory>
#include <mutex>

#include "app/MessagePrivate.h"

namespace BPrivate {

/// This program's team.
team_id ThisTeam();

/// The application's preferred handler; invalid without an application.
MessageAddress ApplicationAddress();

/// Queues a copy of \a message. An invalid \a replyTo means the application. B_OK or B_BAD_PORT_ID.
status_t Deliver(const MessageAddress& to, const BMessage& message, const MessageAddress& replyTo);

/// Queues a copy and waits for the answer. B_OK, B_BAD_PORT_ID, B_TIMED_OUT, B_WOULD_BLOCK.
status_t DeliverAndWait(
	const MessageAddress& to, const BMessage& message, BMessage* answer, bigtime_t replyTimeout);


/// Where one sender waits for one answer.
class ReplyPort {
public:
	ReplyPort();
	~ReplyPort();

	/// Takes over \a answer. False, and it stays the caller's, when one is there already or nobody waits any more.
	bool Put(BMessage* answer);
	/// The answer, the caller's; NULL after \a timeout: later answers are refused then.
	BMessage* Wait(bigtime_t timeout);

private:
	std::mutex fMutex;
	std::condition_variable fArrived;
	BMessage* fAnswer;
	bool fOver;
};

} // namespace BPrivate

#endif // _DELIVERY_H

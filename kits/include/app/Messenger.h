// SPDX-License-Identifier: MIT
// The address of a handler: sends messages to it from any thread, whether or not it still exists.

#ifndef _MESSENGER_H
#define _MESSENGER_H

#include <OS.h>
#include <SupportDefs.h>

class BHandler;
class BLooper;
class BMessage;

namespace BPrivate {
struct MessengerAccess;
} // namespace BPrivate


/// Names a handler of this program by the looper's port and the handler's token; a small value, copied freely.
///
/// No lock is needed for anything here. A messenger whose looper has gone is invalid; using it is harmless.
class BMessenger {
public:
	/// An invalid messenger.
	constexpr BMessenger()
		: fPort(-1),
		  fHandlerToken(-1),
		  fTeam(-1)
	{
	}
	/// Targets the application with \a signature (and \a team, -1 for any). Only this program's own can be reached.
	/// \a result: B_OK; B_BAD_VALUE without signature and team; B_BAD_TEAM_ID when no such team runs;
	/// B_MISMATCHED_VALUES when the team has another signature; else the roster's error.
	BMessenger(const char* signature, team_id team = -1, status_t* result = NULL);
	/// Targets \a handler, which must belong to a looper (to \a looper if given), or \a looper's preferred handler.
	/// \a result: B_OK; B_BAD_VALUE for neither; B_MISMATCHED_VALUES for a handler that is not in a (that) looper.
	BMessenger(const BHandler* handler, const BLooper* looper = NULL, status_t* result = NULL);
	BMessenger(const BMessenger& other) = default;

	bool IsTargetLocal() const;
	/// The handler, NULL when it is gone or is the preferred one; \a looper gets its looper or NULL.
	BHandler* Target(BLooper** looper) const;
	/// Locks the target's looper; false when it is gone. Safe at any time.
	bool LockTarget() const;
	/// As LockTarget(), with a limit in microseconds: B_OK, B_TIMED_OUT, B_WOULD_BLOCK, B_BAD_VALUE for a dead target.
	status_t LockTargetWithTimeout(bigtime_t timeout) const;

	/// Queues a copy of the message and returns at once. The reply goes to \a replyTo, by default the application.
	/// B_OK; B_BAD_VALUE without a message; B_BAD_PORT_ID when the target's looper is gone.
	status_t SendMessage(uint32 command, BHandler* replyTo = NULL) const;
	status_t SendMessage(
		BMessage* message, BHandler* replyTo = NULL, bigtime_t timeout = B_INFINITE_TIMEOUT) const;
	status_t SendMessage(
		BMessage* message, BMessenger replyTo, bigtime_t timeout = B_INFINITE_TIMEOUT) const;
	/// Queues a copy and waits until the receiver answers, or deletes the message (\a reply is then B_NO_REPLY).
	/// B_OK; B_TIMED_OUT, B_WOULD_BLOCK after \a replyTimeout microseconds; B_BAD_PORT_ID. Not with a lock held
	/// that the receiver may need.
	status_t SendMessage(uint32 command, BMessage* reply) const;
	status_t SendMessage(BMessage* message, BMessage* reply,
		bigtime_t deliveryTimeout = B_INFINITE_TIMEOUT,
		bigtime_t replyTimeout = B_INFINITE_TIMEOUT) const;

	status_t SetTo(const char* signature, team_id team = -1);
	status_t SetTo(const BHandler* handler, const BLooper* looper = NULL);

	BMessenger& operator=(const BMessenger& other) = default;
	bool operator==(const BMessenger& other) const;

	/// Whether the target's looper still exists.
	bool IsValid() const;
	team_id Team() const;

private:
	friend struct BPrivate::MessengerAccess;

	port_id fPort;
	int32 fHandlerToken;
	team_id fTeam;
};

#endif // _MESSENGER_H

// SPDX-License-Identifier: MIT
// How a message was delivered, and answering it.

#include <unistd.h>

#include <Errors.h>
#include <Messenger.h>
#include <Point.h>

#include "app/MessagePrivate.h"

BPrivate::MessageAddress
BMessage::Private::ReplyAddress() const
{
	return {fMessage->fReplyPort, fMessage->fReplyTarget, fMessage->fReplyTeam};
}


void
BMessage::Private::SetReplyAddress(const BPrivate::MessageAddress& address)
{
	fMessage->fReplyPort = address.port;
	fMessage->fReplyTarget = address.token;
	fMessage->fReplyTeam = address.team;
}


void
BMessage::Private::ClearDelivery()
{
	const uint32 specifiers = fMessage->fFlags & kHasSpecifiers;
	const int32 currentSpecifier = fMessage->fCurrentSpecifier;
	fMessage->InitHeader();
	fMessage->fFlags |= specifiers;
	fMessage->fCurrentSpecifier = currentSpecifier;
	delete fMessage->fOriginal;
	fMessage->fOriginal = nullptr;
}


void
BMessage::Private::MarkDelivered(bool replyRequired)
{
	fMessage->fFlags &= ~uint32(kReplyRequired | kReplyDone);
	fMessage->fFlags |= kWasDelivered;
	if (replyRequired)
		fMessage->fFlags |= kReplyRequired;
	fMessage->fIsLive = true;
}


void
BMessage::Private::MarkReply(const BMessage* original)
{
	fMessage->fFlags |= kIsReply;
	if (original != fMessage->fOriginal)
		delete fMessage->fOriginal;
	fMessage->fOriginal = original;
}


void
BMessage::Private::MarkDropped()
{
	fMessage->fFlags |= kWasDropped;
}


// #pragma mark - How it came


bool
BMessage::WasDelivered() const
{
	return (fFlags & Private::kWasDelivered) != 0;
}


bool
BMessage::IsReply() const
{
	return (fFlags & Private::kIsReply) != 0;
}


bool
BMessage::IsSourceWaiting() const
{
	// Only a delivery has a sender; the flags alone may have come from a file.
	return fIsLive && (fFlags & Private::kReplyRequired) != 0
		&& (fFlags & Private::kReplyDone) == 0;
}


bool
BMessage::IsSourceRemote() const
{
	return fIsLive && fReplyTeam >= 0 && fReplyTeam != getpid();
}


BMessenger
BMessage::ReturnAddress() const
{
	if (!fIsLive)
		return BMessenger();
	return BPrivate::MessengerFor({fReplyPort, fReplyTarget, fReplyTeam});
}


const BMessage*
BMessage::Previous() const
{
	return fOriginal;
}


bool
BMessage::WasDropped() const
{
	return (fFlags & Private::kWasDropped) != 0;
}


BPoint
BMessage::DropPoint(BPoint* offset) const
{
	if (offset != nullptr)
		*offset = FindPoint("_drop_offset_");
	return FindPoint("_drop_point_");
}


// #pragma mark - Answering


status_t
BMessage::SendReply(uint32 command, BHandler* replyTo)
{
	BMessage reply(command);
	return SendReply(&reply, replyTo);
}


status_t
BMessage::SendReply(BMessage* reply, BHandler* replyTo, bigtime_t timeout)
{
	BMessenger messenger;
	if (replyTo != nullptr) {
		status_t status;
		messenger = BMessenger(replyTo, nullptr, &status);
		if (status != B_OK)
			return status;
	}
	return SendReply(reply, messenger, timeout);
}


status_t
BMessage::SendReply(BMessage* reply, BMessenger replyTo, bigtime_t timeout)
{
	if (reply == nullptr)
		return B_BAD_VALUE;
	return DeliverReply(*reply, &replyTo, nullptr, timeout, 0);
}


status_t
BMessage::SendReply(uint32 command, BMessage* replyToReply)
{
	BMessage reply(command);
	return SendReply(&reply, replyToReply);
}


status_t
BMessage::SendReply(
	BMessage* reply, BMessage* replyToReply, bigtime_t sendTimeout, bigtime_t replyTimeout)
{
	if (reply == nullptr || replyToReply == nullptr)
		return B_BAD_VALUE;
	return DeliverReply(*reply, nullptr, replyToReply, sendTimeout, replyTimeout);
}


/// Sends the reply to the sender, and waits for its answer when \a answer is not null.
status_t
BMessage::DeliverReply(const BMessage& reply, const BMessenger* replyTo, BMessage* answer,
	bigtime_t sendTimeout, bigtime_t replyTimeout)
{
	if (!fIsLive)
		return B_BAD_REPLY;

	// A waiting sender takes one reply and still has the original at hand.
	const bool isAwaited = (fFlags & Private::kReplyRequired) != 0;
	if (isAwaited && (fFlags & Private::kReplyDone) != 0)
		return B_DUPLICATE_REPLY;
	if (isAwaited)
		fFlags |= Private::kReplyDone;
	const BMessage* original = isAwaited ? nullptr : new BMessage(*this);

	const BPrivate::MessageAddress address = {fReplyPort, fReplyTarget, fReplyTeam};
	const status_t status = answer != nullptr
		? BPrivate::DeliverReplyAndWait(address, reply, original, answer, sendTimeout, replyTimeout)
		: BPrivate::DeliverReply(address, reply, original, *replyTo, sendTimeout);
	if (status != B_OK && isAwaited)
		fFlags &= ~uint32(Private::kReplyDone);
	return status;
}

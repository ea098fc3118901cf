// SPDX-License-Identifier: MIT
// What the kits do to messages beyond the public class: delivery state, replies and flattened forms.
#ifndef _MESSAGE_PRIVATE_H
#define _MESSAGE_PRIVATE_H

#include <Message.h>

class MessageBytes;

/// Tokens of handlers: none, and the preferred handler of the looper.
inline constexpr int32 kNoToken = -1;
inline constexpr int32 kPreferredToken = -2;


namespace BPrivate {

/// Where messages go: a looper's (or a waiting sender's) port, a handler of it, the team. These are
/// also the bytes of an item of B_MESSENGER_TYPE, in this order.
struct MessageAddress {
	int32 port = -1;
	int32 token = kNoToken;
	int32 team = -1;

	bool operator==(const MessageAddress& other) const = default;
};

// The messenger side of messages. These are implemented beside BMessenger.

/// The address that \a messenger sends to, and a messenger that sends to \a address; an address that
/// does not exist makes a messenger that is not valid.
MessageAddress AddressOf(const BMessenger& messenger);
BMessenger MessengerFor(const MessageAddress& address);

/// Brings a copy of \a reply to \a to: wakes the sender that waits there, or queues it in the looper.
///
/// The copy is marked with MarkReply(original) and MarkDelivered(). \a original: the caller's copy of
/// the answered message for Previous(), owned by the callee from here on (deleted on failure too); null
/// when the sender waits. An invalid \a replyTo means the application object.
/// Returns B_OK; B_BAD_PORT_ID when nobody is there (any more), B_TIMED_OUT, B_WOULD_BLOCK.
status_t DeliverReply(const MessageAddress& to, const BMessage& reply, const BMessage* original,
	const BMessenger& replyTo, bigtime_t timeout);

/// The same, and then waits until the copy is answered or deleted. \a answer is filled on B_OK.
status_t DeliverReplyAndWait(const MessageAddress& to, const BMessage& reply,
	const BMessage* original, BMessage* answer, bigtime_t sendTimeout, bigtime_t replyTimeout);

} // namespace BPrivate


/// A message as the kits see it. Copyable and cheap; it borrows the message.
///
/// A delivery takes these steps with a copy of the sender's message: ClearDelivery(), SetTarget(),
/// SetReplyAddress(), MarkDelivered(). When the copy is deleted or emptied unanswered and was delivered
/// with replyRequired, it answers B_NO_REPLY through DeliverReply() by itself.
class BMessage::Private {
public:
	/// Flags of the flattened header.
	enum {
		kValid = 0x1,
		kReplyRequired = 0x2,
		kReplyDone = 0x4,
		kIsReply = 0x8,
		kWasDelivered = 0x10,
		kHasSpecifiers = 0x20,
		kWasDropped = 0x40,
		kPassedByArea = 0x80
	};

	explicit Private(BMessage* message)
		: fMessage(message)
	{
	}
	explicit Private(BMessage& message)
		: fMessage(&message)
	{
	}

	uint32 Flags() const { return fMessage->fFlags; }

	/// The handler's token, kNoToken (the looper itself) or kPreferredToken.
	int32 Target() const { return fMessage->fTarget; }
	void SetTarget(int32 token) { fMessage->fTarget = token; }

	BPrivate::MessageAddress ReplyAddress() const;
	void SetReplyAddress(const BPrivate::MessageAddress& address);

	/// Forgets delivery, reply, drop and reply address: the message is as if never sent. Specifiers stay.
	void ClearDelivery();

	/// \a replyRequired: the sender is blocked until the message is answered or deleted.
	void MarkDelivered(bool replyRequired = false);

	/// \a original: what Previous() gives, owned by the message from here on; may be null.
	void MarkReply(const BMessage* original);

	/// Set it after MarkDelivered(); the drop fields are the caller's to add.
	void MarkDropped();

	/// Unflatten() from \a size bytes at most. \a used: bytes of the message; may be null. With \a shared, in which the
	/// buffer lies, the message may go on using its bytes.
	status_t Unflatten(
		const void* buffer, size_t size, size_t* used = nullptr, MessageBytes* shared = nullptr);

	/// The R5 format in little endian, as the platform writes it on request.
	ssize_t R5FlattenedSize() const;
	status_t FlattenR5(char* buffer, ssize_t size) const;

	/// BMessage::HasSameData() of messages that are \a depth levels deep in others.
	static bool HasSameData(
		const BMessage& one, const BMessage& other, bool ignoreFieldOrder, bool deep, int32 depth);

	/// The hash of a field's name as the flattened hash table has it: a step for each of its bytes, from 0 on, and
	/// the end. Bytes from 0x80 up enter as negative numbers, whatever char is here.
	static uint32 HashStep(uint32 hash, uint8 byte)
	{
		return (hash << 7) ^ (hash >> 24) ^ uint32(int32(int8(byte)));
	}
	static uint32 HashEnd(uint32 hash) { return hash ^ (hash << 12); }
	static uint32 HashName(const char* name);

private:
	static Body* ParseHaiku(
		const uint8* buffer, size_t size, BMessage* header, size_t* used, MessageBytes* shared);
	static Body* ParseR5(const uint8* buffer, size_t size, BMessage* header, size_t* used);
	uint8 R5Flags() const;
	uint64 R5DataSize(int32 field) const;

	BMessage* fMessage;
};

#endif // _MESSAGE_PRIVATE_H

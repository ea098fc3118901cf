// SPDX-License-Identifier: MIT
// The bytes of a flattened message, for the messages that read them where they lie.
#ifndef _MESSAGE_BYTES_H
#define _MESSAGE_BYTES_H

#include <atomic>

#include <SupportDefs.h>


/// A block of bytes that nobody changes, with a count of its users. The last one that lets go of it frees it.
///
/// The messages that lie in one block may belong to different threads.
class MessageBytes {
public:
	/// Takes over \a bytes, from malloc(), for a first user. Null without memory: the bytes stay the caller's.
	static MessageBytes* Adopt(uint8* bytes, size_t size);

	MessageBytes(const MessageBytes&) = delete;
	MessageBytes& operator=(const MessageBytes&) = delete;

	void Acquire() { fUsers.fetch_add(1, std::memory_order_relaxed); }
	void Release();

	uint8* Bytes() const { return fBytes; }
	size_t Size() const { return fSize; }

private:
	MessageBytes(uint8* bytes, size_t size);
	~MessageBytes();

	uint8* fBytes;
	size_t fSize;
	std::atomic<int32> fUsers;
};

#endif // _MESSAGE_BYTES_H

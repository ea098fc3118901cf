// SPDX-License-Identifier: MIT
// The R5 format of flattened messages: its flags, and the head of a field record.
#ifndef _MESSAGE_R5_H
#define _MESSAGE_R5_H

#include <SupportDefs.h>

/// Flags of the message header.
enum { kR5Valid = 0x1, kR5HasTarget = 0x2, kR5HasReply = 0x4, kR5HasSpecifiers = 0x8 };

/// Flags of a field record.
enum { kR5FieldValid = 0x1, kR5FieldMini = 0x2, kR5FieldFixedSize = 0x4, kR5FieldSingle = 0x8 };

inline constexpr size_t kR5FlagsOffset = 16;


/// Bytes of the message header, from the magic to the first record.
constexpr size_t
R5HeaderSize(uint8 flags)
{
	size_t size = kR5FlagsOffset + 1;
	if ((flags & kR5HasTarget) != 0)
		size += 4;
	if ((flags & kR5HasReply) != 0)
		size += 3 * 4 + 4;
	return size;
}


/// Bytes of a record in front of its name.
constexpr size_t
R5RecordHeaderSize(uint8 flags)
{
	const size_t numberSize = (flags & kR5FieldMini) != 0 ? 1 : 4;
	const size_t countSize = (flags & kR5FieldSingle) != 0 ? 0 : numberSize;
	return 1 + 4 + countSize + numberSize + 1;
}


/// Bytes of a variable item: size word, bytes, and zeroes up to a multiple of eight.
constexpr uint64
R5ItemSize(uint32 size)
{
	return (uint64(size) + 4 + 7) & ~uint64(7);
}


/// A field record of a flattened message.
struct R5Record {
	uint8 flags;
	uint32 type;
	uint32 count;
	uint32 dataSize;
	uint8 nameLength;
	const uint8* name;
	const uint8* items;
	int32 next; // the next record of the same field, or -1

	bool IsFixedSize() const { return (flags & kR5FieldFixedSize) != 0; }

	/// Reads R5RecordHeaderSize() bytes. False for a count or size that is not greater than zero.
	bool ReadHeader(const uint8* bytes, bool isSwapped);
};

#endif // _MESSAGE_R5_H

// SPDX-License-Identifier: MIT
// How a message keeps its fields in memory, and the layout of the flattened form they come from.
#ifndef _MESSAGE_BODY_H
#define _MESSAGE_BODY_H

#include <bit>

#include <Message.h>

class MessageBytes;

// The data block holds numbers exactly as a file does.
static_assert(std::endian::native == std::endian::little);

inline constexpr uint32 kBucketCount = 5;

/// Messages with that many fields have a table of their names.
inline constexpr uint32 kIndexedFieldCount = 64;

/// The most bytes that the names and items of one message can take.
inline constexpr uint32 kMaxDataSize = 0x7fffffff;

/// Messages of that many bytes are read where they lie; smaller ones are copied. A nested message must also take half of
/// the bytes that it lies in, which it keeps in memory.
inline constexpr size_t kSharedSize = 64 * 1024;

/// Functions that call themselves for nested messages go this deep. A file can nest far deeper.
inline constexpr int32 kMaxNesting = 64;


/// A field: a name and items in the data block, and a link of a hash chain.
struct BMessage::Field {
	enum { kValid = 0x1, kFixedSize = 0x2 };

	uint16 flags;
	uint16 nameLength; // with the terminator
	uint32 type;
	uint32 count;
	uint32 dataSize; // of the items, with the size words of variable items
	uint32 offset;   // of the name in the data block
	int32 next;      // the next field of the same chain, or -1
	uint32 hash;

	bool IsFixedSize() const { return (flags & kFixedSize) != 0; }
	uint32 ItemsOffset() const { return offset + nameLength; }
	uint32 EndOffset() const { return offset + nameLength + dataSize; }
};


/// A name to look for, with what the look-up and a new field need to know of it.
struct BMessage::FieldName {
	explicit FieldName(const char* name);
	/// The name of a field that is there.
	FieldName(const char* name, const Field& field)
		: text(name),
		  length(field.nameLength),
		  hash(field.hash)
	{
	}

	const char* text;
	uint32 length; // with the terminator
	uint32 hash;
};


/// The fields of a message in one block of memory: this header, room for fieldCapacity fields, room
/// for dataCapacity bytes.
///
/// The data of a large message that was read lies in the bytes it came from instead. Nobody changes those: Reserve() and
/// ResizeBytes() make a block of the message's own first.
///
/// Invariant: the data block holds, per field in the order of the fields and without gaps, the name
/// with its terminator and the items. So the end of a field is the start of the next.
struct BMessage::Body {
	int32 buckets[kBucketCount];
	uint32 fieldCount;
	uint32 dataSize;
	uint32 fieldCapacity;
	uint32 dataCapacity;
	uint8* data;
	// What the data lies in; null when it is the message's own, behind the fields.
	MessageBytes* bytes;
	// The variable item that was found last, index << 32 | offset of its size word, or 0: a loop over
	// the items of a field would else walk from the first one each time. Several threads may be
	// reading, so it is only touched by the functions below.
	uint64 cursor;
	// The field that GetInfo() found last, index among the fields of its type << 32 | field: a loop over
	// the names would else count from the first field each time. Read and written as the other.
	uint64 nameCursor;

	// The last field of each hash chain, or -1 when it is not known: adding at the end need not walk there.
	int32 lastLinks[kBucketCount];
	// The fields by name, for messages with many of them, whose five chains are long: a hash table with
	// open addressing, a power of two in size, -1 where it is empty. Null without.
	int32* names;
	uint32 namesSize;
	// Whether looking for the name of any field finds that field. In a file names can occur twice, and in chains of others.
	bool isRegular;

	/// An empty body with room for that much; null when there is no memory.
	static Body* Create(uint32 fieldCapacity, uint32 dataCapacity);
	/// Frees the body, which may be null.
	static void Destroy(Body* body);

	Field* Fields() { return reinterpret_cast<Field*>(this + 1); }
	uint8* Data() { return data; }
	const char* NameOf(const Field& field)
	{
		return reinterpret_cast<const char*>(Data()) + field.offset;
	}
	/// Whether the field has that name.
	bool HasName(const Field& field, const FieldName& name)
	{
		return field.hash == name.hash && field.nameLength == name.length
			&& (NameOf(field) == name.text
				|| __builtin_memcmp(NameOf(field), name.text, name.length) == 0);
	}

	/// Has the data lie at \a start in \a shared, which is acquired.
	void ShareData(MessageBytes* shared, uint8* start, uint32 size);

	/// Makes the table of names when there are enough fields for one; without memory there is none.
	void IndexNames();
	/// The slot of the table with the field of that name, or the empty one where it belongs.
	int32* NameSlot(const FieldName& name);
	/// Enters a field that was linked at the end of its chain.
	void AddName(int32 index);
	/// Follows the hash chains; false when one never ends. Finds out whether the fields are regular, if they are few.
	bool CheckChains();
	/// Forgets the table and the ends of the chains, before a field goes or gets another name.
	void DropNames();

	uint64 Cursor() { return __atomic_load_n(&cursor, __ATOMIC_RELAXED); }
	void SetCursor(uint64 position) { __atomic_store_n(&cursor, position, __ATOMIC_RELAXED); }
	uint64 NameCursor() { return __atomic_load_n(&nameCursor, __ATOMIC_RELAXED); }
	void SetNameCursor(uint64 position)
	{
		__atomic_store_n(&nameCursor, position, __ATOMIC_RELAXED);
	}
};


/// The message header of the Haiku format, as it lies in a file.
struct FlatMessageHeader {
	uint32 format;
	uint32 what;
	uint32 flags;
	int32 target;
	int32 currentSpecifier;
	int32 area;
	int32 replyPort;
	int32 replyTarget;
	int32 replyTeam;
	uint32 dataSize;
	uint32 fieldCount;
	uint32 bucketCount;
	int32 buckets[kBucketCount];
};
static_assert(sizeof(FlatMessageHeader) == 68);

/// A field header of the Haiku format.
struct FlatFieldHeader {
	uint16 flags;
	uint16 nameLength;
	uint32 type;
	uint32 count;
	uint32 dataSize;
	uint32 offset;
	int32 next;
};
static_assert(sizeof(FlatFieldHeader) == 24);

/// First words of the two formats; R5's is in the byte order of its writer.
inline constexpr uint32 kHaikuFormat = 0x31464d48;
inline constexpr uint32 kR5Format = 0x464f4231;
inline constexpr uint32 kR5SwappedFormat = 0x31424f46;


/// A number from bytes at any address.
template <typename Number>
inline Number
ReadNumber(const void* bytes)
{
	Number number;
	__builtin_memcpy(&number, bytes, sizeof(number));
	return number;
}

#endif // _MESSAGE_BODY_H

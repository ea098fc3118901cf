// SPDX-License-Identifier: MIT
// Messages in the R5 format: reading both byte orders, writing little endian.

#include "app/MessageR5.h"

#include <algorithm>
#include <cstdlib>
#include <cstring>
#include <string_view>
#include <unordered_map>
#include <vector>

#include <Errors.h>

#include "app/MessageBody.h"
#include "app/MessagePrivate.h"

namespace {

uint32
ReadWord(const uint8* bytes, bool isSwapped)
{
	const uint32 word = ReadNumber<uint32>(bytes);
	return isSwapped ? __builtin_bswap32(word) : word;
}


/// How many bytes of an item change places together in the other byte order.
size_t
SwapUnit(type_code type)
{
	switch (type) {
		case B_INT16_TYPE:
		case B_UINT16_TYPE:
			return 2;

		case B_INT32_TYPE:
		case B_UINT32_TYPE:
		case B_FLOAT_TYPE:
		case B_TIME_TYPE:
		case B_POINT_TYPE:
		case B_RECT_TYPE:
			return 4;

		case B_INT64_TYPE:
		case B_UINT64_TYPE:
		case B_DOUBLE_TYPE:
		case B_OFF_T_TYPE:
			return 8;

		default:
			return 1;
	}
}


void
SwapItem(uint8* item, uint32 size, size_t unit)
{
	for (; size >= unit; item += unit, size -= uint32(unit))
		std::reverse(item, item + unit);
}


/// Calls visit(bytes, size) for each item of a record. False, halfway, when its bytes do not hold
/// exactly its items.
template <typename Visitor>
bool
VisitItems(const R5Record& record, bool isSwapped, Visitor visit)
{
	if (record.IsFixedSize()) {
		const uint32 size = record.dataSize / record.count;
		if (size * record.count != record.dataSize)
			return false;
		for (uint32 i = 0; i < record.count; i++)
			visit(record.items + i * size, size);
		return true;
	}

	uint32 offset = 0;
	for (uint32 i = 0; i < record.count; i++) {
		const uint32 left = record.dataSize - offset;
		if (left < sizeof(uint32))
			return false;
		const uint32 size = ReadWord(record.items + offset, isSwapped);
		if (size == 0 || R5ItemSize(size) > left)
			return false;
		visit(record.items + offset + sizeof(uint32), size);
		offset += uint32(R5ItemSize(size));
	}
	return offset == record.dataSize;
}


/// A field to be made of one or more records.
struct R5Field {
	std::string_view name;
	uint32 type;
	bool isFixedSize;
	uint32 itemSize; // of a fixed size field
	uint64 count;
	uint64 dataSize; // with a size word for every variable item
	int32 first;
	int32 last;
};


/// Reads the records of a message and sorts them into fields, checking everything on the way.
class R5Reader {
public:
	R5Reader(const uint8* buffer, size_t size, bool isSwapped)
		: fBuffer(buffer),
		  fSize(size),
		  fIsSwapped(isSwapped),
		  fDataSize(0)
	{
	}

	/// \a offset: of the first record; afterwards, behind the final zero byte.
	bool ReadRecords(size_t* offset);

	const std::vector<R5Field>& Fields() const { return fFields; }
	const R5Record& RecordAt(int32 index) const { return fRecords[index]; }
	uint64 DataSize() const { return fDataSize; }

private:
	bool AddRecord(R5Record record);

	const uint8* fBuffer;
	size_t fSize;
	bool fIsSwapped;
	uint64 fDataSize;
	std::vector<R5Record> fRecords;
	std::vector<R5Field> fFields;
	std::unordered_map<std::string_view, uint32> fIndexes;
};


bool
R5Reader::ReadRecords(size_t* offset)
{
	size_t at = *offset;
	while (at < fSize) {
		const uint8 flags = fBuffer[at];
		if ((flags & kR5FieldValid) == 0) {
			*offset = at + 1;
			return fDataSize <= kMaxDataSize;
		}

		const size_t headerSize = R5RecordHeaderSize(flags);
		R5Record record;
		if (fSize - at < headerSize || !record.ReadHeader(fBuffer + at, fIsSwapped))
			return false;
		at += headerSize;
		if (fSize - at < size_t(record.nameLength) + record.dataSize)
			return false;
		record.name = fBuffer + at;
		record.items = record.name + record.nameLength;
		at += size_t(record.nameLength) + record.dataSize;
		if (!AddRecord(record))
			return false;
	}
	return false;
}


bool
R5Reader::AddRecord(R5Record record)
{
	const std::string_view name(reinterpret_cast<const char*>(record.name), record.nameLength);
	const auto [position, isNew] = fIndexes.emplace(name, uint32(fFields.size()));
	if (isNew) {
		if (name.find('\0') != name.npos)
			return false;
		fFields.push_back({name, record.type, record.IsFixedSize(), record.dataSize / record.count,
			0, 0, -1, -1});
		fDataSize += name.size() + 1;
	}

	R5Field& field = fFields[position->second];
	if (record.type != field.type)
		return false;

	uint64 size = 0;
	bool isUniform = true;
	const bool areSound = VisitItems(record, fIsSwapped, [&](const uint8*, uint32 itemSize) {
		size += field.isFixedSize ? itemSize : sizeof(uint32) + itemSize;
		isUniform = isUniform && itemSize == field.itemSize;
	});
	if (!areSound || (field.isFixedSize && !isUniform))
		return false;

	const int32 index = int32(fRecords.size());
	record.next = -1;
	fRecords.push_back(record);
	if (field.first < 0)
		field.first = index;
	else
		fRecords[field.last].next = index;
	field.last = index;
	field.count += record.count;
	field.dataSize += size;
	fDataSize += size;
	return true;
}


/// What the checksum of a header comes to: the sum of big-endian words, the last one of what is left.
uint32
Checksum(const uint8* bytes, size_t size)
{
	uint32 sum = 0;
	while (size > 0) {
		const size_t wordSize = std::min<size_t>(size, sizeof(uint32));
		uint32 word = 0;
		for (size_t i = 0; i < wordSize; i++)
			word = word << 8 | bytes[i];
		sum += word;
		bytes += wordSize;
		size -= wordSize;
	}
	return sum;
}


/// Writes numbers and bytes one after the other.
class Output {
public:
	explicit Output(char* buffer)
		: fNext(buffer)
	{
	}

	template <typename Number>
	void WriteNumber(Number number)
	{
		Write(&number, sizeof(number));
	}

	void Write(const void* bytes, size_t size)
	{
		memcpy(fNext, bytes, size);
		fNext += size;
	}

	void WriteZeroes(size_t count)
	{
		memset(fNext, 0, count);
		fNext += count;
	}

private:
	char* fNext;
};

} // namespace


bool
R5Record::ReadHeader(const uint8* bytes, bool isSwapped)
{
	flags = bytes[0];
	type = ReadWord(bytes + 1, isSwapped);
	bytes += 5;
	const bool isMini = (flags & kR5FieldMini) != 0;
	const size_t numberSize = isMini ? 1 : 4;
	count = 1;
	if ((flags & kR5FieldSingle) == 0) {
		count = isMini ? *bytes : ReadWord(bytes, isSwapped);
		bytes += numberSize;
	}
	dataSize = isMini ? *bytes : ReadWord(bytes, isSwapped);
	nameLength = bytes[numberSize];
	return int32(count) > 0 && int32(dataSize) > 0;
}


// #pragma mark - Reading


/// As ParseHaiku().
BMessage::Body*
BMessage::Private::ParseR5(const uint8* buffer, size_t size, BMessage* message, size_t* used)
{
	if (size < kR5FlagsOffset + 1)
		return nullptr;
	const bool isSwapped = ReadNumber<uint32>(buffer) == kR5SwappedFormat;
	const uint8 flags = buffer[kR5FlagsOffset];
	size_t offset = R5HeaderSize(flags);
	if ((flags & kR5Valid) == 0 || size < offset)
		return nullptr;

	R5Reader reader(buffer, size, isSwapped);
	if (!reader.ReadRecords(&offset))
		return nullptr;

	Body* body = Body::Create(uint32(reader.Fields().size()), uint32(reader.DataSize()));
	if (body == nullptr)
		return nullptr;

	int32* chainEnds[kBucketCount];
	for (uint32 i = 0; i < kBucketCount; i++)
		chainEnds[i] = &body->buckets[i];
	for (const R5Field& source : reader.Fields()) {
		uint8* bytes = body->Data() + body->dataSize;
		Field& field = body->Fields()[body->fieldCount];
		field.flags = source.isFixedSize ? Field::kValid | Field::kFixedSize : Field::kValid;
		field.nameLength = uint16(source.name.size() + 1);
		field.type = source.type;
		field.count = uint32(source.count);
		field.dataSize = uint32(source.dataSize);
		field.offset = body->dataSize;
		field.next = -1;

		memcpy(bytes, source.name.data(), source.name.size());
		bytes[source.name.size()] = '\0';
		field.hash = HashName(reinterpret_cast<const char*>(bytes));
		bytes += field.nameLength;
		const size_t unit = isSwapped ? SwapUnit(source.type) : 1;
		for (int32 i = source.first; i >= 0; i = reader.RecordAt(i).next) {
			VisitItems(reader.RecordAt(i), isSwapped, [&](const uint8* item, uint32 itemSize) {
				if (!source.isFixedSize) {
					memcpy(bytes, &itemSize, sizeof(itemSize));
					bytes += sizeof(itemSize);
				}
				memcpy(bytes, item, itemSize);
				if (unit > 1)
					SwapItem(bytes, itemSize, unit);
				bytes += itemSize;
			});
		}

		int32*& chainEnd = chainEnds[field.hash % kBucketCount];
		*chainEnd = int32(body->fieldCount);
		chainEnd = &field.next;
		body->fieldCount++;
		body->dataSize = field.EndOffset();
	}
	body->CheckChains();

	message->what = ReadWord(buffer + 12, isSwapped);
	if ((flags & kR5HasSpecifiers) != 0)
		message->fFlags |= kHasSpecifiers;
	const uint8* optional = buffer + kR5FlagsOffset + 1;
	if ((flags & kR5HasTarget) != 0) {
		message->fTarget = int32(ReadWord(optional, isSwapped));
		optional += 4;
	}
	if ((flags & kR5HasReply) != 0) {
		message->fReplyPort = int32(ReadWord(optional, isSwapped));
		message->fReplyTarget = int32(ReadWord(optional + 4, isSwapped));
		message->fReplyTeam = int32(ReadWord(optional + 8, isSwapped));
		if (optional[12] != 0)
			message->fReplyTarget = kPreferredToken;
		if (optional[13] != 0)
			message->fFlags |= kReplyRequired;
		if (optional[14] != 0)
			message->fFlags |= kReplyDone;
		if (optional[15] != 0)
			message->fFlags |= kIsReply;
	}
	*used = offset;
	return body;
}


// #pragma mark - Writing


uint8
BMessage::Private::R5Flags() const
{
	uint8 flags = kR5Valid;
	if (fMessage->fTarget != kNoToken)
		flags |= kR5HasTarget;
	if (fMessage->fReplyPort >= 0 && fMessage->fReplyTeam >= 0
		&& fMessage->fReplyTarget != kNoToken) {
		flags |= kR5HasReply;
	}
	if ((fMessage->fFlags & kHasSpecifiers) != 0)
		flags |= kR5HasSpecifiers;
	return flags;
}


/// Bytes of a field's items with their padding.
uint64
BMessage::Private::R5DataSize(int32 fieldIndex) const
{
	const Field& field = fMessage->fBody->Fields()[fieldIndex];
	if (field.IsFixedSize())
		return field.dataSize;

	uint64 dataSize = 0;
	for (uint32 i = 0; i < field.count; i++) {
		const uint8* item;
		uint32 size;
		fMessage->FindItem(fieldIndex, int32(i), &item, &size);
		dataSize += R5ItemSize(size);
	}
	return dataSize;
}


ssize_t
BMessage::Private::R5FlattenedSize() const
{
	uint64 total = R5HeaderSize(R5Flags()) + 1;
	for (int32 i = 0; i < fMessage->CountFields(); i++) {
		const Field& field = fMessage->fBody->Fields()[i];
		total += R5RecordHeaderSize(field.count == 1 ? kR5FieldSingle : 0)
			+ std::min<size_t>(field.nameLength - 1, UINT8_MAX) + R5DataSize(i);
	}
	// The format's sizes are signed numbers of 32 bits.
	return total > INT32_MAX ? B_NO_MEMORY : ssize_t(total);
}


status_t
BMessage::Private::FlattenR5(char* buffer, ssize_t size) const
{
	const ssize_t flattenedSize = R5FlattenedSize();
	if (flattenedSize < 0)
		return status_t(flattenedSize);
	if (buffer == nullptr)
		return B_BAD_VALUE;
	if (size < flattenedSize)
		return B_BUFFER_OVERFLOW;

	Output output(buffer);
	const uint8 flags = R5Flags();
	output.WriteNumber(kR5Format);
	output.WriteZeroes(sizeof(uint32));
	output.WriteNumber(int32(flattenedSize));
	output.WriteNumber(fMessage->what);
	output.WriteNumber(flags);
	if ((flags & kR5HasTarget) != 0)
		output.WriteNumber(fMessage->fTarget);
	if ((flags & kR5HasReply) != 0) {
		output.WriteNumber(fMessage->fReplyPort);
		output.WriteNumber(fMessage->fReplyTarget);
		output.WriteNumber(fMessage->fReplyTeam);
		output.WriteNumber(uint8(fMessage->fReplyTarget == kPreferredToken));
		output.WriteNumber(uint8((fMessage->fFlags & kReplyRequired) != 0));
		output.WriteNumber(uint8((fMessage->fFlags & kReplyDone) != 0));
		output.WriteNumber(uint8((fMessage->fFlags & kIsReply) != 0));
	}
	const uint32 checksum =
		Checksum(reinterpret_cast<const uint8*>(buffer) + 8, R5HeaderSize(flags) - 8);
	memcpy(buffer + 4, &checksum, sizeof(checksum));

	for (int32 i = 0; i < fMessage->CountFields(); i++) {
		const Field& field = fMessage->fBody->Fields()[i];
		uint8 fieldFlags = kR5FieldValid;
		if (field.IsFixedSize())
			fieldFlags |= kR5FieldFixedSize;
		if (field.count == 1)
			fieldFlags |= kR5FieldSingle;
		output.WriteNumber(fieldFlags);
		output.WriteNumber(field.type);
		if (field.count != 1)
			output.WriteNumber(field.count);
		output.WriteNumber(uint32(R5DataSize(i)));
		const uint8 nameLength = uint8(std::min<size_t>(field.nameLength - 1, UINT8_MAX));
		output.WriteNumber(nameLength);
		output.Write(fMessage->fBody->NameOf(field), nameLength);

		for (uint32 k = 0; k < field.count; k++) {
			const uint8* item;
			uint32 itemSize;
			fMessage->FindItem(i, int32(k), &item, &itemSize);
			if (field.IsFixedSize()) {
				output.Write(item, itemSize);
				continue;
			}
			output.WriteNumber(itemSize);
			output.Write(item, itemSize);
			output.WriteZeroes(R5ItemSize(itemSize) - sizeof(uint32) - itemSize);
		}
	}
	output.WriteZeroes(1);
	return B_OK;
}

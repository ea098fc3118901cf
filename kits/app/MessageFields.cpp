// SPDX-License-Identifier: MIT
// The fields of a message in memory: finding, adding, removing, and the hash chains between them.

#include <algorithm>
#include <bit>
#include <cstdlib>
#include <cstring>

#include "app/MessageBody.h"
#include "app/MessageBytes.h"
#include "app/MessagePrivate.h"

namespace {

/// Messages start with room for so many fields and bytes. From twice as much on they grow slower.
constexpr uint32 kSmallFieldCount = 8;
constexpr uint32 kSmallDataSize = 128;


/// A capacity of \a needed or more that keeps adding at the end cheap, in time and, for large messages, in memory.
uint32
GrownCapacity(uint32 old, uint32 needed, uint32 small)
{
	const uint64 grown = old < 2 * small ? uint64(old) * 2 : uint64(old) + old / 2;
	return uint32(std::max<uint64>({needed, small, grown}));
}

} // namespace


BMessage::Body*
BMessage::Body::Create(uint32 fieldCapacity, uint32 dataCapacity)
{
	const size_t size = sizeof(Body) + size_t(fieldCapacity) * sizeof(Field) + dataCapacity;
	Body* body = static_cast<Body*>(malloc(size));
	if (body == nullptr)
		return nullptr;

	std::fill_n(body->buckets, kBucketCount, -1);
	body->fieldCount = 0;
	body->dataSize = 0;
	body->fieldCapacity = fieldCapacity;
	body->dataCapacity = dataCapacity;
	body->data = reinterpret_cast<uint8*>(body->Fields() + fieldCapacity);
	body->bytes = nullptr;
	body->cursor = 0;
	body->nameCursor = 0;
	std::fill_n(body->lastLinks, kBucketCount, -1);
	body->names = nullptr;
	body->namesSize = 0;
	body->isRegular = true;
	return body;
}


void
BMessage::Body::Destroy(Body* body)
{
	if (body == nullptr)
		return;
	if (body->bytes != nullptr)
		body->bytes->Release();
	free(body->names);
	free(body);
}


void
BMessage::Body::ShareData(MessageBytes* shared, uint8* start, uint32 size)
{
	shared->Acquire();
	bytes = shared;
	data = start;
	dataSize = size;
	// Nothing can be added there.
	dataCapacity = size;
}


void
BMessage::Body::IndexNames()
{
	free(names);
	names = nullptr;
	namesSize = 0;
	if (fieldCount < kIndexedFieldCount)
		return;

	// At most half full now, and refilled when three quarters are.
	const uint32 size = std::bit_ceil(fieldCount * 2);
	names = static_cast<int32*>(malloc(size * sizeof(int32)));
	if (names == nullptr)
		return;
	namesSize = size;
	std::fill_n(names, size, -1);

	// What a walk along the chain would find: the first field of its name, in the chain of its name.
	for (uint32 bucket = 0; bucket < kBucketCount; bucket++) {
		for (int32 i = buckets[bucket]; i >= 0; i = Fields()[i].next) {
			const Field& field = Fields()[i];
			if (field.hash % kBucketCount != bucket)
				continue;
			int32* slot = NameSlot(FieldName(NameOf(field), field));
			if (*slot < 0)
				*slot = i;
		}
	}
}


int32*
BMessage::Body::NameSlot(const FieldName& name)
{
	// Fibonacci hashing: the low bits of the hash know the last letters only.
	const int shift = std::countl_zero(namesSize - 1);
	uint32 slot = (name.hash * 2654435769u) >> shift;
	while (names[slot] >= 0 && !HasName(Fields()[names[slot]], name))
		slot = (slot + 1) & (namesSize - 1);
	return &names[slot];
}


void
BMessage::Body::AddName(int32 index)
{
	if (names == nullptr) {
		// Not with every field: a table that there was no memory for, or that was dropped, can wait.
		if (std::has_single_bit(fieldCount))
			IndexNames();
		return;
	}
	if (fieldCount > namesSize / 4 * 3) {
		IndexNames();
		return;
	}
	const Field& field = Fields()[index];
	int32* slot = NameSlot(FieldName(NameOf(field), field));
	if (*slot < 0)
		*slot = index;
}


bool
BMessage::Body::CheckChains()
{
	const Field* fields = Fields();
	uint32 found = 0;
	isRegular = fieldCount < kIndexedFieldCount;
	for (uint32 bucket = 0; bucket < kBucketCount; bucket++) {
		const int32 first = buckets[bucket];
		uint32 length = 0;
		for (int32 link = first; link >= 0; link = fields[link].next) {
			if (++length > fieldCount)
				return false;
			if (!isRegular)
				continue;
			isRegular = fields[link].hash % kBucketCount == bucket;
			for (int32 other = first; other != link && isRegular; other = fields[other].next)
				isRegular = fields[other].hash != fields[link].hash;
		}
		found += length;
	}
	isRegular = isRegular && found == fieldCount;
	return true;
}


void
BMessage::Body::DropNames()
{
	isRegular = false;
	free(names);
	names = nullptr;
	namesSize = 0;
	std::fill_n(lastLinks, kBucketCount, -1);
}


BMessage::FieldName::FieldName(const char* name)
	: text(name),
	  hash(0)
{
	const char* end = name;
	for (; *end != '\0'; end++)
		hash = Private::HashStep(hash, *end);
	hash = Private::HashEnd(hash);
	length = uint32(end - name) + 1;
}


uint32
BMessage::Private::HashName(const char* name)
{
	return FieldName(name).hash;
}


int32
BMessage::CountFields() const
{
	return fBody == nullptr ? 0 : int32(fBody->fieldCount);
}


int32
BMessage::IndexOf(const char* name) const
{
	if (fBody == nullptr)
		return -1;

	// A loop over the fields asks for each by the very name that GetInfo() handed out.
	const uint32 cursorField = uint32(fBody->NameCursor());
	if (cursorField < fBody->fieldCount) {
		const Field& field = fBody->Fields()[cursorField];
		if (name == fBody->NameOf(field))
			return fBody->isRegular ? int32(cursorField) : IndexOf(FieldName(name, field));
	}
	return IndexOf(FieldName(name));
}


int32
BMessage::IndexOf(const FieldName& name) const
{
	if (fBody == nullptr)
		return -1;
	if (fBody->names != nullptr)
		return *fBody->NameSlot(name);

	const Field* fields = fBody->Fields();
	int32 index = fBody->buckets[name.hash % kBucketCount];
	while (index >= 0 && !fBody->HasName(fields[index], name))
		index = fields[index].next;
	return index;
}


status_t
BMessage::FindField(const char* name, type_code type, int32* field) const
{
	if (name == nullptr)
		return B_BAD_VALUE;

	*field = IndexOf(name);
	if (*field < 0)
		return B_NAME_NOT_FOUND;
	if (type != B_ANY_TYPE && fBody->Fields()[*field].type != type)
		return B_BAD_TYPE;
	return B_OK;
}


status_t
BMessage::FindItem(int32 fieldIndex, int32 index, const uint8** data, uint32* size) const
{
	const Field& field = fBody->Fields()[fieldIndex];
	if (index < 0 || uint32(index) >= field.count)
		return B_BAD_INDEX;

	if (field.IsFixedSize()) {
		*size = field.dataSize / field.count;
		*data = fBody->Data() + field.ItemsOffset() + uint32(index) * *size;
		return B_OK;
	}

	uint32 at = 0;
	uint32 offset = field.ItemsOffset();
	if (index > 0) {
		const uint64 cursor = fBody->Cursor();
		const uint32 cursorOffset = uint32(cursor);
		const uint32 cursorIndex = uint32(cursor >> 32);
		if (cursorIndex <= uint32(index) && cursorOffset >= offset
			&& cursorOffset < field.EndOffset()) {
			at = cursorIndex;
			offset = cursorOffset;
		}
		for (; at < uint32(index); at++)
			offset += sizeof(uint32) + ReadNumber<uint32>(fBody->Data() + offset);
		fBody->SetCursor(uint64(at) << 32 | offset);
	}

	*size = ReadNumber<uint32>(fBody->Data() + offset);
	*data = fBody->Data() + offset + sizeof(uint32);
	return B_OK;
}


bool
BMessage::Owns(const void* bytes) const
{
	if (fBody == nullptr)
		return false;
	const uintptr_t address = reinterpret_cast<uintptr_t>(bytes);
	const uintptr_t start = reinterpret_cast<uintptr_t>(fBody->Data());
	return address >= start && address < start + fBody->dataCapacity;
}


status_t
BMessage::Reserve(uint32 moreFields, uint32 moreData)
{
	const uint32 oldFields = fBody == nullptr ? 0 : fBody->fieldCapacity;
	const uint32 oldData = fBody == nullptr ? 0 : fBody->dataCapacity;
	const uint64 fields = uint64(CountFields()) + moreFields;
	const uint64 data = uint64(fBody == nullptr ? 0 : fBody->dataSize) + moreData;
	if (data > kMaxDataSize || fields > kMaxDataSize)
		return B_NO_MEMORY;
	const bool isOwn = fBody == nullptr || fBody->bytes == nullptr;
	if (fBody != nullptr && isOwn && fields <= oldFields && data <= oldData)
		return B_OK;

	// What is nearly full grows along, and is not copied again soon.
	uint32 newFields = oldFields;
	if (fields > oldFields - oldFields / 4)
		newFields = GrownCapacity(oldFields, uint32(fields), kSmallFieldCount);
	uint32 newData = oldData;
	if (data > oldData - oldData / 4)
		newData = GrownCapacity(oldData, uint32(data), kSmallDataSize);

	Body* body = Body::Create(newFields, newData);
	if (body == nullptr)
		return B_NO_MEMORY;
	if (fBody != nullptr) {
		std::copy_n(fBody->buckets, kBucketCount, body->buckets);
		body->fieldCount = fBody->fieldCount;
		body->dataSize = fBody->dataSize;
		body->cursor = fBody->cursor;
		body->nameCursor = fBody->nameCursor;
		std::copy_n(fBody->lastLinks, kBucketCount, body->lastLinks);
		body->names = fBody->names;
		body->namesSize = fBody->namesSize;
		body->isRegular = fBody->isRegular;
		memcpy(body->Fields(), fBody->Fields(), fBody->fieldCount * sizeof(Field));
		memcpy(body->Data(), fBody->Data(), fBody->dataSize);
		fBody->names = nullptr;
		Body::Destroy(fBody);
	}
	fBody = body;
	return B_OK;
}


/// Makes oldSize bytes at offset, which belong to the field, newSize bytes, which the caller may then set; the rest moves.
/// Afterwards, data and fields may lie elsewhere.
///
/// The names and items behind move along, and their fields know it. Sizes inside the field are the
/// caller's to set.
status_t
BMessage::ResizeBytes(int32 fieldIndex, uint32 offset, uint32 oldSize, uint32 newSize)
{
	const status_t status = Reserve(0, newSize > oldSize ? newSize - oldSize : 0);
	if (status != B_OK || newSize == oldSize)
		return status;

	uint8* bytes = fBody->Data() + offset;
	memmove(bytes + newSize, bytes + oldSize, fBody->dataSize - offset - oldSize);
	fBody->dataSize += newSize - oldSize;
	fBody->SetCursor(0);

	Field* fields = fBody->Fields();
	for (uint32 i = uint32(fieldIndex) + 1; i < fBody->fieldCount; i++)
		fields[i].offset += newSize - oldSize;
	return B_OK;
}


/// Adds a field that does not exist yet, with its first item.
status_t
BMessage::AddField(
	const FieldName& name, type_code type, bool isFixedSize, const void* data, uint32 size)
{
	if (name.length > B_FIELD_NAME_LENGTH + 1)
		return B_BAD_VALUE;

	const uint32 sizeWord = isFixedSize ? 0 : sizeof(uint32);
	if (size > kMaxDataSize - sizeWord - name.length)
		return B_NO_MEMORY;
	const status_t status = Reserve(1, name.length + sizeWord + size);
	if (status != B_OK)
		return status;

	const int32 index = int32(fBody->fieldCount);
	Field& field = fBody->Fields()[index];
	field.flags = isFixedSize ? Field::kValid | Field::kFixedSize : Field::kValid;
	field.nameLength = uint16(name.length);
	field.type = type;
	field.count = 1;
	field.dataSize = sizeWord + size;
	field.offset = fBody->dataSize;
	field.hash = name.hash;

	uint8* bytes = fBody->Data() + field.offset;
	memcpy(bytes, name.text, name.length);
	bytes += name.length;
	if (!isFixedSize)
		memcpy(bytes, &size, sizeof(size));
	memcpy(bytes + sizeWord, data, size);
	fBody->dataSize = field.EndOffset();
	fBody->fieldCount++;
	Link(index);
	fBody->AddName(index);
	return B_OK;
}


/// Adds an item behind the last one of a field. The size must suit a field of fixed size.
status_t
BMessage::AddItem(int32 fieldIndex, const void* data, uint32 size)
{
	const Field& old = fBody->Fields()[fieldIndex];
	const uint32 sizeWord = old.IsFixedSize() ? 0 : sizeof(uint32);
	if (size > kMaxDataSize - sizeWord)
		return B_NO_MEMORY;

	const uint32 offset = old.EndOffset();
	const uint64 cursor = fBody->Cursor();
	const status_t status = ResizeBytes(fieldIndex, offset, 0, sizeWord + size);
	if (status != B_OK)
		return status;
	// Nothing moved in front of it, so programs that add and find in turns keep their place.
	if (uint32(cursor) < offset)
		fBody->SetCursor(cursor);

	Field& field = fBody->Fields()[fieldIndex];
	memcpy(fBody->Data() + offset, &size, sizeWord);
	memcpy(fBody->Data() + offset + sizeWord, data, size);
	field.dataSize += sizeWord + size;
	field.count++;
	return B_OK;
}


status_t
BMessage::RemoveField(int32 index)
{
	const uint32 offset = fBody->Fields()[index].offset;
	const uint32 size = fBody->Fields()[index].EndOffset() - offset;
	const status_t status = ResizeBytes(index, offset, size, 0);
	if (status != B_OK)
		return status;

	fBody->DropNames();
	Unlink(index);
	Field* fields = fBody->Fields();
	fBody->SetNameCursor(0);
	fBody->fieldCount--;
	memmove(fields + index, fields + index + 1, (fBody->fieldCount - index) * sizeof(Field));

	for (int32& bucket : fBody->buckets) {
		if (bucket > index)
			bucket--;
	}
	for (uint32 i = 0; i < fBody->fieldCount; i++) {
		if (fields[i].next > index)
			fields[i].next--;
	}
	return B_OK;
}


/// Puts a field at the end of the chain of its name.
void
BMessage::Link(int32 index)
{
	Field* fields = fBody->Fields();
	fields[index].next = -1;
	const uint32 bucket = fields[index].hash % kBucketCount;
	const int32 last = fBody->lastLinks[bucket];
	int32* link = last >= 0 ? &fields[last].next : &fBody->buckets[bucket];
	while (*link >= 0)
		link = &fields[*link].next;
	*link = index;
	fBody->lastLinks[bucket] = index;
}


/// Takes a field out of its chain. All links are looked at: in a file, chains may share their ends.
void
BMessage::Unlink(int32 index)
{
	Field* fields = fBody->Fields();
	const int32 next = fields[index].next;
	std::replace(fBody->buckets, fBody->buckets + kBucketCount, index, next);
	for (uint32 i = 0; i < fBody->fieldCount; i++) {
		if (fields[i].next == index)
			fields[i].next = next;
	}
}

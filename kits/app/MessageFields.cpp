// SPDX-License-Identifier: MIT
// The fields of a message in memory: finding, adding, removing, and the hash chains between them.

#include <algorithm>
#include <bit>
#include <cstdlib>
#include <cstring>

#include "app/MessageBody.h"
#include "app/MessagePrivate.h"

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
	body->cursor = 0;
	body->nameCursor = 0;
	std::fill_n(body->lastLinks, kBucketCount, -1);
	body->names = nullptr;
	body->namesSize = 0;
	return body;
}


void
BMessage::Body::Destroy(Body* body)
{
	if (body != nullptr)
		free(body->names);
	free(body);
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
			int32* slot = NameSlot(NameOf(field), field.nameLength, field.hash);
			if (*slot < 0)
				*slot = i;
		}
	}
}


int32*
BMessage::Body::NameSlot(const char* name, uint32 nameLength, uint32 hash)
{
	// Fibonacci hashing: the low bits of the hash know the last letters only.
	const int shift = std::countl_zero(namesSize - 1);
	uint32 slot = (hash * 2654435769u) >> shift;
	for (;; slot = (slot + 1) & (namesSize - 1)) {
		if (names[slot] < 0)
			return &names[slot];
		const Field& field = Fields()[names[slot]];
		if (field.hash == hash && field.nameLength == nameLength
			&& memcmp(NameOf(field), name, nameLength) == 0)
			return &names[slot];
	}
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
	int32* slot = NameSlot(NameOf(field), field.nameLength, field.hash);
	if (*slot < 0)
		*slot = index;
}


void
BMessage::Body::DropNames()
{
	free(names);
	names = nullptr;
	namesSize = 0;
	std::fill_n(lastLinks, kBucketCount, -1);
}


uint32
BMessage::Private::HashName(const char* name)
{
	uint32 hash = 0;
	for (; *name != '\0'; name++) {
		hash = (hash << 7) ^ (hash >> 24);
		// Bytes from 0x80 up enter as negative numbers, whatever char is here.
		hash ^= uint32(int32(int8(*name)));
	}
	return hash ^ (hash << 12);
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
	const Field* fields = fBody->Fields();
	const uint32 cursorField = uint32(fBody->NameCursor());
	const bool isCursor =
		cursorField < fBody->fieldCount && name == fBody->NameOf(fields[cursorField]);
	const uint32 hash = isCursor ? fields[cursorField].hash : Private::HashName(name);
	const size_t nameLength = isCursor ? fields[cursorField].nameLength : strlen(name) + 1;
	if (fBody->names != nullptr)
		return *fBody->NameSlot(name, uint32(nameLength), hash);

	int32 index = fBody->buckets[hash % kBucketCount];
	while (index >= 0) {
		const Field& field = fields[index];
		if (field.hash == hash && field.nameLength == nameLength
			&& (fBody->NameOf(field) == name
				|| memcmp(fBody->NameOf(field), name, nameLength) == 0)) {
			return index;
		}
		index = field.next;
	}
	return -1;
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
	const uintptr_t start = reinterpret_cast<uintptr_t>(fBody);
	return address >= start
		&& address < reinterpret_cast<uintptr_t>(fBody->Data()) + fBody->dataCapacity;
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
	if (fBody != nullptr && fields <= oldFields && data <= oldData)
		return B_OK;

	// Growing by half each time keeps adding at the end cheap, in time and in memory. What is nearly
	// full grows along, and is not copied again soon.
	uint32 newFields = oldFields;
	if (fields > oldFields - oldFields / 4)
		newFields = uint32(std::max<uint64>({fields, 8, uint64(oldFields) + oldFields / 2}));
	uint32 newData = oldData;
	if (data > oldData - oldData / 4)
		newData = uint32(std::max<uint64>({data, 128, uint64(oldData) + oldData / 2}));

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
		memcpy(body->Fields(), fBody->Fields(), fBody->fieldCount * sizeof(Field));
		memcpy(body->Data(), fBody->Data(), fBody->dataSize);
		free(fBody);
	}
	fBody = body;
	return B_OK;
}


/// Makes oldSize bytes at offset, which belong to the field, newSize bytes; the rest moves.
///
/// The names and items behind move along, and their fields know it. Sizes inside the field are the
/// caller's to set.
status_t
BMessage::ResizeBytes(int32 fieldIndex, uint32 offset, uint32 oldSize, uint32 newSize)
{
	if (newSize == oldSize)
		return B_OK;
	if (newSize > oldSize) {
		const status_t status = Reserve(0, newSize - oldSize);
		if (status != B_OK)
			return status;
	}

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
	const char* name, type_code type, bool isFixedSize, const void* data, uint32 size)
{
	const size_t nameLength = strlen(name) + 1;
	if (nameLength > B_FIELD_NAME_LENGTH + 1)
		return B_BAD_VALUE;

	const uint32 sizeWord = isFixedSize ? 0 : sizeof(uint32);
	if (size > kMaxDataSize - sizeWord - nameLength)
		return B_NO_MEMORY;
	const status_t status = Reserve(1, uint32(nameLength) + sizeWord + size);
	if (status != B_OK)
		return status;

	const int32 index = int32(fBody->fieldCount);
	Field& field = fBody->Fields()[index];
	field.flags = isFixedSize ? Field::kValid | Field::kFixedSize : Field::kValid;
	field.nameLength = uint16(nameLength);
	field.type = type;
	field.count = 1;
	field.dataSize = sizeWord + size;
	field.offset = fBody->dataSize;
	field.hash = Private::HashName(name);

	uint8* bytes = fBody->Data() + field.offset;
	memcpy(bytes, name, nameLength);
	memcpy(bytes + nameLength, &size, sizeWord);
	memcpy(bytes + nameLength + sizeWord, data, size);
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


void
BMessage::RemoveField(int32 index)
{
	fBody->DropNames();
	Unlink(index);

	Field* fields = fBody->Fields();
	const uint32 offset = fields[index].offset;
	const uint32 size = fields[index].EndOffset() - offset;
	ResizeBytes(index, offset, size, 0);

	fBody->SetNameCursor(0);
	fBody->fieldCount--;
	memmove(fields + index, fields + index + 1, (fBody->fieldCount - index) * sizeof(Field));

	for (uint32 i = 0; i < kBucketCount; i++) {
		if (fBody->buckets[i] > index)
			fBody->buckets[i]--;
	}
	for (uint32 i = 0; i < fBody->fieldCount; i++) {
		if (fields[i].next > index)
			fields[i].next--;
	}
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

// SPDX-License-Identifier: MIT
// The message: making, copying and emptying it, what it holds, and items of any type.

#include <Message.h>

#include <cctype>
#include <cstdlib>
#include <cstring>
#include <memory>
#include <string>
#include <vector>

#include <Errors.h>

#include "app/MessageBody.h"
#include "app/MessagePrivate.h"

BMessage::BMessage()
	: BMessage(0)
{
}


BMessage::BMessage(uint32 what)
	: what(what),
	  fBody(nullptr),
	  fOriginal(nullptr)
{
	InitHeader();
}


BMessage::BMessage(const BMessage& other)
	: what(other.what),
	  fBody(nullptr),
	  fOriginal(nullptr)
{
	CopyFrom(other);
}


BMessage&
BMessage::operator=(const BMessage& other)
{
	if (this != &other) {
		Clear();
		CopyFrom(other);
	}
	return *this;
}


BMessage::~BMessage()
{
	Clear();
}


void
BMessage::InitHeader()
{
	fFlags = Private::kValid;
	fTarget = kNoToken;
	fCurrentSpecifier = -1;
	fReplyPort = -1;
	fReplyTarget = kNoToken;
	fReplyTeam = -1;
	fIsLive = false;
}


/// Gives up the fields and the delivery. The header stays for the caller to set.
void
BMessage::Clear()
{
	// A sender that is still blocked would wait for ever.
	if (IsSourceWaiting())
		SendReply(B_NO_REPLY);

	fIsLive = false;
	Body::Destroy(fBody);
	fBody = nullptr;
	delete fOriginal;
	fOriginal = nullptr;
}


/// Takes over code, header and fields; this message has no fields.
void
BMessage::CopyFrom(const BMessage& other)
{
	what = other.what;
	fFlags = other.fFlags
		& ~uint32(Private::kReplyRequired | Private::kReplyDone | Private::kIsReply
			| Private::kWasDelivered | Private::kPassedByArea);
	fTarget = other.fTarget;
	fCurrentSpecifier = other.fCurrentSpecifier;
	fReplyPort = other.fReplyPort;
	fReplyTarget = other.fReplyTarget;
	fReplyTeam = other.fReplyTeam;
	fIsLive = false;

	if (other.IsEmpty())
		return;
	fBody = Body::Create(other.fBody->fieldCount, other.fBody->dataSize);
	if (fBody == nullptr)
		return;
	memcpy(fBody->buckets, other.fBody->buckets, sizeof(fBody->buckets));
	fBody->fieldCount = other.fBody->fieldCount;
	fBody->dataSize = other.fBody->dataSize;
	fBody->isRegular = other.fBody->isRegular;
	memcpy(fBody->Fields(), other.fBody->Fields(), fBody->fieldCount * sizeof(Field));
	memcpy(fBody->Data(), other.fBody->Data(), fBody->dataSize);
	fBody->IndexNames();
}


status_t
BMessage::MakeEmpty()
{
	Clear();
	InitHeader();
	return B_OK;
}


// #pragma mark - What it holds


status_t
BMessage::GetInfo(type_code typeRequested, int32 index, char** nameFound, type_code* typeFound,
	int32* countFound) const
{
	bool typeExists = typeRequested == B_ANY_TYPE;
	int32 i = 0;
	int32 left = index;
	const int32 count = index >= 0 ? CountFields() : 0;
	if (typeExists) {
		i = index;
		left = 0;
	} else if (count > 0) {
		const uint64 cursor = fBody->NameCursor();
		const int32 cursorField = int32(uint32(cursor));
		const int32 cursorIndex = int32(cursor >> 32);
		if (cursorIndex <= index && fBody->Fields()[cursorField].type == typeRequested
			&& cursorField > 0) {
			i = cursorField;
			left = index - cursorIndex;
		}
	}

	for (; i < count; i++) {
		const Field& field = fBody->Fields()[i];
		if (typeRequested != B_ANY_TYPE && field.type != typeRequested)
			continue;
		typeExists = true;
		if (left-- > 0)
			continue;

		if (typeRequested != B_ANY_TYPE)
			fBody->SetNameCursor(uint64(index) << 32 | uint32(i));
		if (nameFound != nullptr)
			*nameFound = const_cast<char*>(fBody->NameOf(field));
		if (typeFound != nullptr)
			*typeFound = field.type;
		if (countFound != nullptr)
			*countFound = int32(field.count);
		return B_OK;
	}

	if (nameFound != nullptr)
		*nameFound = nullptr;
	if (typeFound != nullptr)
		*typeFound = 0;
	if (countFound != nullptr)
		*countFound = 0;
	return typeExists || index < 0 ? B_BAD_INDEX : B_BAD_TYPE;
}


status_t
BMessage::GetInfo(const char* name, type_code* typeFound, int32* countFound) const
{
	return GetInfo(name, typeFound, countFound, nullptr);
}


status_t
BMessage::GetInfo(const char* name, type_code* typeFound, bool* fixedSize) const
{
	return GetInfo(name, typeFound, nullptr, fixedSize);
}


status_t
BMessage::GetInfo(const char* name, type_code* typeFound, int32* countFound, bool* fixedSize) const
{
	int32 index;
	const status_t status = FindField(name, B_ANY_TYPE, &index);
	const Field* field = status == B_OK ? &fBody->Fields()[index] : nullptr;
	if (typeFound != nullptr)
		*typeFound = field != nullptr ? field->type : 0;
	if (countFound != nullptr)
		*countFound = field != nullptr ? int32(field->count) : 0;
	if (fixedSize != nullptr)
		*fixedSize = field != nullptr && field->IsFixedSize();
	return status;
}


int32
BMessage::CountNames(type_code type) const
{
	if (type == B_ANY_TYPE)
		return CountFields();

	int32 count = 0;
	for (int32 i = 0; i < CountFields(); i++) {
		if (fBody->Fields()[i].type == type)
			count++;
	}
	return count;
}


bool
BMessage::IsEmpty() const
{
	return CountFields() == 0;
}


bool
BMessage::IsSystem() const
{
	return what >> 24 == '_' && isupper(what >> 16 & 0xff) != 0 && isupper(what >> 8 & 0xff) != 0
		&& isupper(what & 0xff) != 0;
}


bool
BMessage::HasSameData(const BMessage& other, bool ignoreFieldOrder, bool deep) const
{
	return Private::HasSameData(*this, other, ignoreFieldOrder, deep, 0);
}


bool
BMessage::Private::HasSameData(
	const BMessage& one, const BMessage& other, bool ignoreFieldOrder, bool deep, int32 depth)
{
	if (one.CountFields() != other.CountFields())
		return false;

	for (int32 i = 0; i < one.CountFields(); i++) {
		const Field& field = one.fBody->Fields()[i];
		const char* name = one.fBody->NameOf(field);
		const int32 j = ignoreFieldOrder ? other.IndexOf(name) : i;
		if (j < 0)
			return false;

		const Field& otherField = other.fBody->Fields()[j];
		if (otherField.type != field.type || otherField.count != field.count
			|| strcmp(other.fBody->NameOf(otherField), name) != 0) {
			return false;
		}
		for (uint32 k = 0; k < field.count; k++) {
			const uint8* data;
			const uint8* otherData;
			uint32 size;
			uint32 otherSize;
			one.FindItem(i, int32(k), &data, &size);
			other.FindItem(j, int32(k), &otherData, &otherSize);
			if (size == otherSize && memcmp(data, otherData, size) == 0)
				continue;
			if (!deep || field.type != B_MESSAGE_TYPE || depth >= kMaxNesting)
				return false;

			BMessage nested;
			BMessage otherNested;
			if (Private(nested).Unflatten(data, size) != B_OK
				|| Private(otherNested).Unflatten(otherData, otherSize) != B_OK
				|| nested.what != otherNested.what
				|| !HasSameData(nested, otherNested, ignoreFieldOrder, deep, depth + 1)) {
				return false;
			}
		}
	}
	return true;
}


// #pragma mark - Items of any type


status_t
BMessage::AddData(
	const char* name, type_code type, const void* data, ssize_t numBytes, bool isFixedSize, int32)
{
	if (name == nullptr || data == nullptr || numBytes <= 0 || type == B_ANY_TYPE)
		return B_BAD_VALUE;
	if (numBytes > kMaxDataSize)
		return B_NO_MEMORY;

	// Bytes of this message's own move while it grows.
	if (Owns(name)) {
		const std::string copy(name);
		return AddData(copy.c_str(), type, data, numBytes, isFixedSize);
	}
	if (Owns(data)) {
		const uint8* bytes = static_cast<const uint8*>(data);
		const std::vector<uint8> copy(bytes, bytes + numBytes);
		return AddData(name, type, copy.data(), numBytes, isFixedSize);
	}

	const FieldName fieldName(name);
	const int32 index = IndexOf(fieldName);
	if (index < 0)
		return AddField(fieldName, type, isFixedSize, data, uint32(numBytes));

	const Field& field = fBody->Fields()[index];
	if (field.type != type)
		return B_BAD_TYPE;
	if (field.IsFixedSize() && field.dataSize / field.count != size_t(numBytes))
		return B_BAD_VALUE;
	return AddItem(index, data, uint32(numBytes));
}


status_t
BMessage::ReplaceData(const char* name, type_code type, const void* data, ssize_t numBytes)
{
	return ReplaceData(name, type, 0, data, numBytes);
}


status_t
BMessage::ReplaceData(
	const char* name, type_code type, int32 index, const void* data, ssize_t numBytes)
{
	if (data == nullptr || numBytes <= 0 || type == B_ANY_TYPE)
		return B_BAD_VALUE;
	if (numBytes > kMaxDataSize)
		return B_NO_MEMORY;

	int32 fieldIndex;
	const status_t status = FindField(name, type, &fieldIndex);
	return status == B_OK ? ReplaceItem(fieldIndex, index, data, uint32(numBytes)) : status;
}


/// Replaces an item of a field by \a newSize bytes, 1 or more, which may be this message's own.
status_t
BMessage::ReplaceItem(int32 fieldIndex, int32 index, const void* data, uint32 newSize)
{
	if (Owns(data)) {
		const uint8* bytes = static_cast<const uint8*>(data);
		const std::vector<uint8> copy(bytes, bytes + newSize);
		return ReplaceItem(fieldIndex, index, copy.data(), newSize);
	}

	const uint8* oldData;
	uint32 oldSize;
	status_t status = FindItem(fieldIndex, index, &oldData, &oldSize);
	if (status != B_OK)
		return status;

	const bool isFixedSize = fBody->Fields()[fieldIndex].IsFixedSize();
	if (isFixedSize && newSize != oldSize)
		return B_BAD_VALUE;

	const uint32 offset = uint32(oldData - fBody->Data());
	status = ResizeBytes(fieldIndex, offset, oldSize, newSize);
	if (status != B_OK)
		return status;

	uint8* bytes = fBody->Data() + offset;
	memcpy(bytes, data, newSize);
	if (!isFixedSize)
		memcpy(bytes - sizeof(uint32), &newSize, sizeof(uint32));
	fBody->Fields()[fieldIndex].dataSize += newSize - oldSize;
	return B_OK;
}


status_t
BMessage::SetData(const char* name, type_code type, const void* data, ssize_t numBytes,
	bool isFixedSize, int32 count)
{
	if (name == nullptr || data == nullptr || numBytes <= 0 || type == B_ANY_TYPE)
		return B_BAD_VALUE;
	if (numBytes > kMaxDataSize)
		return B_NO_MEMORY;

	const FieldName fieldName(name);
	const int32 index = IndexOf(fieldName);
	if (index >= 0) {
		return fBody->Fields()[index].type == type ? ReplaceItem(index, 0, data, uint32(numBytes))
												   : B_BAD_TYPE;
	}
	// Bytes of this message's own move while it grows.
	if (Owns(name) || Owns(data))
		return AddData(name, type, data, numBytes, isFixedSize, count);
	return AddField(fieldName, type, isFixedSize, data, uint32(numBytes));
}


status_t
BMessage::FindData(const char* name, type_code type, const void** data, ssize_t* numBytes) const
{
	return FindData(name, type, 0, data, numBytes);
}


status_t
BMessage::FindData(
	const char* name, type_code type, int32 index, const void** data, ssize_t* numBytes) const
{
	if (data == nullptr)
		return B_BAD_VALUE;

	int32 field;
	const uint8* bytes = nullptr;
	uint32 size = 0;
	status_t status = FindField(name, type, &field);
	if (status == B_OK)
		status = FindItem(field, index, &bytes, &size);
	if (status == B_OK && size == 0) {
		bytes = nullptr;
		status = B_BAD_DATA;
	}

	*data = bytes;
	if (numBytes != nullptr)
		*numBytes = size;
	return status;
}


bool
BMessage::HasData(const char* name, type_code type, int32 index) const
{
	const void* data;
	return FindData(name, type, index, &data, nullptr) == B_OK;
}


status_t
BMessage::RemoveData(const char* name, int32 index)
{
	int32 fieldIndex;
	status_t status = FindField(name, B_ANY_TYPE, &fieldIndex);
	if (status != B_OK)
		return status;
	const uint8* data;
	uint32 size;
	status = FindItem(fieldIndex, index, &data, &size);
	if (status != B_OK)
		return status;

	const Field& old = fBody->Fields()[fieldIndex];
	if (old.count == 1)
		return RemoveField(fieldIndex);

	uint32 offset = uint32(data - fBody->Data());
	if (!old.IsFixedSize()) {
		offset -= sizeof(uint32);
		size += sizeof(uint32);
	}
	status = ResizeBytes(fieldIndex, offset, size, 0);
	if (status != B_OK)
		return status;
	Field& field = fBody->Fields()[fieldIndex];
	field.dataSize -= size;
	field.count--;
	return B_OK;
}


status_t
BMessage::RemoveName(const char* name)
{
	int32 index;
	const status_t status = FindField(name, B_ANY_TYPE, &index);
	return status == B_OK ? RemoveField(index) : status;
}


status_t
BMessage::Rename(const char* oldEntry, const char* newEntry)
{
	if (newEntry == nullptr)
		return B_BAD_VALUE;
	if (Owns(newEntry))
		return Rename(oldEntry, std::string(newEntry).c_str());

	int32 index;
	status_t status = FindField(oldEntry, B_ANY_TYPE, &index);
	if (status != B_OK)
		return status;
	const FieldName newName(newEntry);
	if (newName.length > B_FIELD_NAME_LENGTH + 1)
		return B_BAD_VALUE;
	if (IndexOf(newName) >= 0)
		return B_NAME_IN_USE;

	const Field& old = fBody->Fields()[index];
	const uint32 offset = old.offset;
	status = ResizeBytes(index, offset, old.nameLength, newName.length);
	if (status != B_OK)
		return status;

	memcpy(fBody->Data() + offset, newEntry, newName.length);
	fBody->DropNames();
	Unlink(index);
	Field& field = fBody->Fields()[index];
	field.nameLength = uint16(newName.length);
	field.hash = newName.hash;
	Link(index);
	return B_OK;
}


status_t
BMessage::Append(const BMessage& message)
{
	// Into a copy first: a field of another type halfway through must not leave half of them here.
	BMessage result(*this);
	for (int32 i = 0; i < message.CountFields(); i++) {
		const Field& field = message.fBody->Fields()[i];
		for (uint32 k = 0; k < field.count; k++) {
			const uint8* data;
			uint32 size;
			message.FindItem(i, int32(k), &data, &size);
			const status_t status = result.AddData(
				message.fBody->NameOf(field), field.type, data, size, field.IsFixedSize());
			if (status != B_OK)
				return status;
		}
	}
	std::swap(fBody, result.fBody);
	return B_OK;
}

// SPDX-License-Identifier: MIT
// Fields of strings, nested messages, messengers, entry references and flattenable objects.

#include <Message.h>

#include <cstring>
#include <memory>
#include <string>
#include <vector>

#include <Entry.h>
#include <Errors.h>
#include <Flattenable.h>
#include <Messenger.h>
#include <String.h>
#include <StringList.h>

#include "app/MessageBody.h"
#include "app/MessagePrivate.h"
#include "storage/EntryRefFlattening.h"

namespace {

/// Whether the bytes are a text with its terminator, and no other zero byte in it.
bool
IsText(const void* data, size_t size)
{
	return size > 0 && memchr(data, '\0', size) == static_cast<const uint8*>(data) + size - 1;
}


/// The bytes of a flattenable object; empty when it cannot be flattened, with the reason in status.
std::vector<uint8>
FlattenObject(const BFlattenable* object, status_t* status)
{
	const ssize_t size = object->FlattenedSize();
	if (size <= 0 || size_t(size) > kMaxDataSize) {
		*status = size < 0 ? status_t(size) : B_BAD_VALUE;
		return {};
	}
	std::vector<uint8> bytes(size);
	*status = object->Flatten(bytes.data(), size);
	return bytes;
}

} // namespace


// #pragma mark - Strings


status_t
BMessage::AddString(const char* name, const char* value)
{
	if (value == nullptr)
		return B_BAD_VALUE;
	return AddData(name, B_STRING_TYPE, value, ssize_t(strlen(value)) + 1, false);
}


status_t
BMessage::AddString(const char* name, const BString& value)
{
	return AddString(name, value.String());
}


status_t
BMessage::AddStrings(const char* name, const BStringList& list)
{
	for (int32 i = 0; i < list.CountStrings(); i++) {
		const status_t status = AddString(name, list.StringAt(i));
		if (status != B_OK)
			return status;
	}
	return B_OK;
}


status_t
BMessage::ReplaceString(const char* name, const char* value)
{
	return ReplaceString(name, 0, value);
}


status_t
BMessage::ReplaceString(const char* name, int32 index, const char* value)
{
	if (value == nullptr)
		return B_BAD_VALUE;
	return ReplaceData(name, B_STRING_TYPE, index, value, ssize_t(strlen(value)) + 1);
}


status_t
BMessage::ReplaceString(const char* name, const BString& value)
{
	return ReplaceString(name, 0, value.String());
}


status_t
BMessage::ReplaceString(const char* name, int32 index, const BString& value)
{
	return ReplaceString(name, index, value.String());
}


status_t
BMessage::SetString(const char* name, const char* value)
{
	if (value == nullptr)
		return B_BAD_VALUE;
	return SetData(name, B_STRING_TYPE, value, ssize_t(strlen(value)) + 1, false);
}


status_t
BMessage::SetString(const char* name, const BString& value)
{
	return SetString(name, value.String());
}


status_t
BMessage::FindString(const char* name, const char** value) const
{
	return FindString(name, 0, value);
}


status_t
BMessage::FindString(const char* name, int32 index, const char** value) const
{
	if (value == nullptr)
		return B_BAD_VALUE;

	const void* data;
	ssize_t size;
	status_t status = FindData(name, B_STRING_TYPE, index, &data, &size);
	if (status == B_OK && !IsText(data, size))
		status = B_BAD_DATA;
	*value = status == B_OK ? static_cast<const char*>(data) : nullptr;
	return status;
}


status_t
BMessage::FindString(const char* name, BString* value) const
{
	return FindString(name, 0, value);
}


status_t
BMessage::FindString(const char* name, int32 index, BString* value) const
{
	if (value == nullptr)
		return B_BAD_VALUE;

	const char* text;
	const status_t status = FindString(name, index, &text);
	value->SetTo(text != nullptr ? text : "");
	return status;
}


status_t
BMessage::FindStrings(const char* name, BStringList* list) const
{
	if (list == nullptr)
		return B_BAD_VALUE;

	list->MakeEmpty();
	int32 field;
	const status_t status = FindField(name, B_STRING_TYPE, &field);
	if (status != B_OK)
		return status;
	const uint32 count = fBody->Fields()[field].count;
	for (uint32 i = 0; i < count; i++) {
		const char* text;
		if (FindString(name, int32(i), &text) == B_OK && !list->Add(text))
			return B_NO_MEMORY;
	}
	return B_OK;
}


const char*
BMessage::FindString(const char* name, int32 index) const
{
	return GetString(name, index, nullptr);
}


const char*
BMessage::GetString(const char* name, const char* defaultValue) const
{
	return GetString(name, 0, defaultValue);
}


const char*
BMessage::GetString(const char* name, int32 index, const char* defaultValue) const
{
	const char* value;
	return FindString(name, index, &value) == B_OK ? value : defaultValue;
}


bool
BMessage::HasString(const char* name, int32 index) const
{
	const char* value;
	return FindString(name, index, &value) == B_OK;
}


// #pragma mark - Messages


status_t
BMessage::AddMessage(const char* name, const BMessage* value)
{
	if (name == nullptr || value == nullptr)
		return B_BAD_VALUE;

	const ssize_t size = value->FlattenedSize();
	std::unique_ptr<char[]> bytes(new char[size]);
	const status_t status = value->Flatten(bytes.get(), size);
	if (status != B_OK)
		return status;
	return AddData(name, B_MESSAGE_TYPE, bytes.get(), size, false);
}


status_t
BMessage::ReplaceMessage(const char* name, const BMessage* value)
{
	return ReplaceMessage(name, 0, value);
}


status_t
BMessage::ReplaceMessage(const char* name, int32 index, const BMessage* value)
{
	if (value == nullptr)
		return B_BAD_VALUE;

	const ssize_t size = value->FlattenedSize();
	std::unique_ptr<char[]> bytes(new char[size]);
	const status_t status = value->Flatten(bytes.get(), size);
	if (status != B_OK)
		return status;
	return ReplaceData(name, B_MESSAGE_TYPE, index, bytes.get(), size);
}


status_t
BMessage::FindMessage(const char* name, BMessage* value) const
{
	return FindMessage(name, 0, value);
}


status_t
BMessage::FindMessage(const char* name, int32 index, BMessage* value) const
{
	if (value == nullptr)
		return B_BAD_VALUE;

	const void* data;
	ssize_t size;
	status_t status = FindData(name, B_MESSAGE_TYPE, index, &data, &size);
	if (status == B_OK && Private(value).Unflatten(data, size, nullptr, fBody->bytes) != B_OK)
		status = B_BAD_DATA;
	if (status != B_OK)
		*value = BMessage();
	return status;
}


bool
BMessage::HasMessage(const char* name, int32 index) const
{
	return HasData(name, B_MESSAGE_TYPE, index);
}


// #pragma mark - Messengers


status_t
BMessage::AddMessenger(const char* name, BMessenger value)
{
	const BPrivate::MessageAddress address = BPrivate::AddressOf(value);
	return AddData(name, B_MESSENGER_TYPE, &address, sizeof(address), true);
}


status_t
BMessage::ReplaceMessenger(const char* name, BMessenger value)
{
	return ReplaceMessenger(name, 0, value);
}


status_t
BMessage::ReplaceMessenger(const char* name, int32 index, BMessenger value)
{
	const BPrivate::MessageAddress address = BPrivate::AddressOf(value);
	return ReplaceData(name, B_MESSENGER_TYPE, index, &address, sizeof(address));
}


status_t
BMessage::FindMessenger(const char* name, BMessenger* value) const
{
	return FindMessenger(name, 0, value);
}


status_t
BMessage::FindMessenger(const char* name, int32 index, BMessenger* value) const
{
	if (value == nullptr)
		return B_BAD_VALUE;

	BPrivate::MessageAddress address;
	const status_t status = FindValue(name, B_MESSENGER_TYPE, index, &address, sizeof(address));
	*value = status == B_OK ? BPrivate::MessengerFor(address) : BMessenger();
	return status;
}


bool
BMessage::HasMessenger(const char* name, int32 index) const
{
	return HasValue(name, B_MESSENGER_TYPE, index, sizeof(BPrivate::MessageAddress));
}


// #pragma mark - Entry references


status_t
BMessage::AddRef(const char* name, const entry_ref* value)
{
	if (value == nullptr)
		return B_BAD_VALUE;
	const std::string bytes = BPrivate::flatten_entry_ref(*value);
	return AddData(name, B_REF_TYPE, bytes.data(), ssize_t(bytes.size()), false);
}


status_t
BMessage::ReplaceRef(const char* name, const entry_ref* value)
{
	return ReplaceRef(name, 0, value);
}


status_t
BMessage::ReplaceRef(const char* name, int32 index, const entry_ref* value)
{
	if (value == nullptr)
		return B_BAD_VALUE;
	const std::string bytes = BPrivate::flatten_entry_ref(*value);
	return ReplaceData(name, B_REF_TYPE, index, bytes.data(), ssize_t(bytes.size()));
}


status_t
BMessage::FindRef(const char* name, entry_ref* value) const
{
	return FindRef(name, 0, value);
}


status_t
BMessage::FindRef(const char* name, int32 index, entry_ref* value) const
{
	if (value == nullptr)
		return B_BAD_VALUE;

	const void* data;
	ssize_t size;
	status_t status = FindData(name, B_REF_TYPE, index, &data, &size);
	if (status == B_OK && BPrivate::unflatten_entry_ref(data, size, value) != B_OK)
		status = B_BAD_DATA;
	if (status != B_OK)
		*value = entry_ref();
	return status;
}


bool
BMessage::HasRef(const char* name, int32 index) const
{
	return HasData(name, B_REF_TYPE, index);
}


// #pragma mark - Flattenable objects


status_t
BMessage::AddFlat(const char* name, BFlattenable* object, int32 count)
{
	return AddFlat(name, const_cast<const BFlattenable*>(object), count);
}


status_t
BMessage::AddFlat(const char* name, const BFlattenable* object, int32 count)
{
	if (object == nullptr)
		return B_BAD_VALUE;

	status_t status;
	const std::vector<uint8> bytes = FlattenObject(object, &status);
	if (status != B_OK)
		return status;
	return AddData(name, object->TypeCode(), bytes.data(), ssize_t(bytes.size()), false, count);
}


status_t
BMessage::ReplaceFlat(const char* name, BFlattenable* object)
{
	return ReplaceFlat(name, 0, object);
}


status_t
BMessage::ReplaceFlat(const char* name, int32 index, BFlattenable* object)
{
	if (object == nullptr)
		return B_BAD_VALUE;

	status_t status;
	const std::vector<uint8> bytes = FlattenObject(object, &status);
	if (status != B_OK)
		return status;
	return ReplaceData(name, object->TypeCode(), index, bytes.data(), ssize_t(bytes.size()));
}


status_t
BMessage::SetFlat(const char* name, const BFlattenable* object, int32 count)
{
	if (object == nullptr)
		return B_BAD_VALUE;

	status_t status;
	const std::vector<uint8> bytes = FlattenObject(object, &status);
	if (status != B_OK)
		return status;
	return SetData(name, object->TypeCode(), bytes.data(), ssize_t(bytes.size()), false, count);
}


status_t
BMessage::FindFlat(const char* name, BFlattenable* object) const
{
	return FindFlat(name, 0, object);
}


status_t
BMessage::FindFlat(const char* name, int32 index, BFlattenable* object) const
{
	if (object == nullptr)
		return B_BAD_VALUE;

	type_code type;
	status_t status = GetInfo(name, &type);
	if (status == B_OK && !object->AllowsTypeCode(type))
		status = B_BAD_TYPE;
	if (status != B_OK)
		return status;

	const void* data;
	ssize_t size;
	status = FindData(name, type, index, &data, &size);
	return status == B_OK ? object->Unflatten(type, data, size) : status;
}


bool
BMessage::HasFlat(const char* name, const BFlattenable* object) const
{
	return HasFlat(name, 0, object);
}


bool
BMessage::HasFlat(const char* name, int32 index, const BFlattenable* object) const
{
	type_code type;
	return object != nullptr && GetInfo(name, &type) == B_OK && object->AllowsTypeCode(type)
		&& HasData(name, type, index);
}

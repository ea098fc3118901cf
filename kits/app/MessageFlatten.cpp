// SPDX-License-Identifier: MIT
// Messages as bytes: the Haiku format both ways, and telling the formats apart when reading.

#include <algorithm>
#include <cstdlib>
#include <cstring>
#include <vector>

#include <DataIO.h>
#include <Errors.h>

#include "app/MessageBody.h"
#include "app/MessageBytes.h"
#include "app/MessagePrivate.h"
#include "app/MessageStream.h"

namespace {

/// A link of a hash chain: the index of a field, or -1.
bool
IsLink(int32 link, uint32 fieldCount)
{
	return link == -1 || (link >= 0 && uint32(link) < fieldCount);
}


/// Whether the size words of a variable field lead from its first byte to its end, item by item.
bool
HasSoundItems(const uint8* items, uint32 size, uint32 count)
{
	uint32 offset = 0;
	for (uint32 i = 0; i < count; i++) {
		if (size - offset < sizeof(uint32))
			return false;
		const uint32 itemSize = ReadNumber<uint32>(items + offset);
		offset += sizeof(uint32);
		if (itemSize > size - offset)
			return false;
		offset += itemSize;
	}
	return offset == size;
}


/// Hashes a name; false when its first zero byte is not its last one.
bool
HashTerminated(const uint8* name, uint32 length, uint32* hash)
{
	uint32 value = 0;
	for (const uint8* last = name + length - 1; name != last; name++) {
		if (*name == '\0')
			return false;
		value = BMessage::Private::HashStep(value, *name);
	}
	*hash = BMessage::Private::HashEnd(value);
	return *name == '\0';
}


/// Checks one field header against the data block, and hashes the field's name. Nothing in it is trusted.
bool
IsSound(const FlatFieldHeader& field, const uint8* data, uint32 dataSize, uint32* hash)
{
	if (uint64(field.offset) + field.nameLength + field.dataSize > dataSize)
		return false;
	if (field.nameLength == 0 || field.count == 0)
		return false;

	const uint8* name = data + field.offset;
	if (!HashTerminated(name, field.nameLength, hash))
		return false;
	if ((field.flags & 0x2) != 0)
		return field.dataSize > 0 && field.dataSize % field.count == 0;
	return HasSoundItems(name + field.nameLength, field.dataSize, field.count);
}

} // namespace


// #pragma mark - Writing


ssize_t
BMessage::FlattenedSize() const
{
	ssize_t size = sizeof(FlatMessageHeader);
	if (fBody != nullptr)
		size += fBody->fieldCount * sizeof(FlatFieldHeader) + fBody->dataSize;
	return size;
}


/// Writes the message header and the field headers: everything in front of the data block.
void
BMessage::FlattenHeaders(char* buffer) const
{
	FlatMessageHeader header;
	header.format = kHaikuFormat;
	header.what = what;
	header.flags = fFlags;
	header.target = fTarget;
	header.currentSpecifier = fCurrentSpecifier;
	header.area = -1;
	header.replyPort = fReplyPort;
	header.replyTarget = fReplyTarget;
	header.replyTeam = fReplyTeam;
	header.dataSize = fBody != nullptr ? fBody->dataSize : 0;
	header.fieldCount = uint32(CountFields());
	header.bucketCount = kBucketCount;
	for (uint32 i = 0; i < kBucketCount; i++)
		header.buckets[i] = fBody != nullptr ? fBody->buckets[i] : -1;
	memcpy(buffer, &header, sizeof(header));
	buffer += sizeof(header);

	for (int32 i = 0; i < CountFields(); i++) {
		const Field& field = fBody->Fields()[i];
		const FlatFieldHeader flat = {field.flags, field.nameLength, field.type, field.count,
			field.dataSize, field.offset, field.next};
		memcpy(buffer, &flat, sizeof(flat));
		buffer += sizeof(flat);
	}
}


status_t
BMessage::Flatten(char* buffer, ssize_t size) const
{
	if (buffer == nullptr)
		return B_BAD_VALUE;
	const ssize_t flattenedSize = FlattenedSize();
	if (size < flattenedSize)
		return B_BUFFER_OVERFLOW;

	FlattenHeaders(buffer);
	if (fBody != nullptr) {
		const uint32 dataSize = fBody->dataSize;
		memcpy(buffer + flattenedSize - dataSize, fBody->Data(), dataSize);
	}
	return B_OK;
}


status_t
BMessage::Flatten(BDataIO* stream, ssize_t* size) const
{
	if (stream == nullptr)
		return B_BAD_VALUE;

	const uint32 dataSize = fBody != nullptr ? fBody->dataSize : 0;
	std::vector<char> headers(FlattenedSize() - dataSize);
	FlattenHeaders(headers.data());
	status_t status = WriteFully(stream, headers.data(), headers.size());
	if (status == B_OK && dataSize > 0)
		status = WriteFully(stream, fBody->Data(), dataSize);
	if (status == B_OK && size != nullptr)
		*size = FlattenedSize();
	return status;
}


// #pragma mark - Reading


/// Reads a message in the Haiku format. Returns its fields (null when it is damaged), sets code and
/// header of \a message, and the bytes of the message; nothing else is touched.
BMessage::Body*
BMessage::Private::ParseHaiku(
	const uint8* buffer, size_t size, BMessage* message, size_t* used, MessageBytes* shared)
{
	FlatMessageHeader header;
	if (size < sizeof(header))
		return nullptr;
	memcpy(&header, buffer, sizeof(header));
	if ((header.flags & kValid) == 0 || header.bucketCount != kBucketCount)
		return nullptr;

	const uint64 fieldsSize = uint64(header.fieldCount) * sizeof(FlatFieldHeader);
	const uint64 total = sizeof(header) + fieldsSize + header.dataSize;
	if (total > size || header.dataSize > kMaxDataSize)
		return nullptr;
	for (int32 bucket : header.buckets) {
		if (!IsLink(bucket, header.fieldCount))
			return nullptr;
	}

	if (shared != nullptr && (total < kSharedSize || total < shared->Size() / 2))
		shared = nullptr;
	Body* body = Body::Create(header.fieldCount, shared != nullptr ? 0 : header.dataSize);
	if (body == nullptr)
		return nullptr;
	memcpy(body->buckets, header.buckets, sizeof(body->buckets));
	body->fieldCount = header.fieldCount;

	const uint8* flatFields = buffer + sizeof(header);
	const uint8* data = flatFields + fieldsSize;
	uint64 offset = 0;
	bool isDense = true;
	for (uint32 i = 0; i < header.fieldCount; i++) {
		const FlatFieldHeader flat =
			ReadNumber<FlatFieldHeader>(flatFields + i * sizeof(FlatFieldHeader));
		uint32 hash;
		if (!IsSound(flat, data, header.dataSize, &hash) || !IsLink(flat.next, header.fieldCount)) {
			free(body);
			return nullptr;
		}
		isDense = isDense && flat.offset == offset;
		body->Fields()[i] = {flat.flags, flat.nameLength, flat.type, flat.count, flat.dataSize,
			uint32(offset), flat.next, hash};
		offset += flat.nameLength + flat.dataSize;
		// Fields that lie over each other could make more of the bytes than there are.
		if (offset > header.dataSize) {
			free(body);
			return nullptr;
		}
	}
	body->dataSize = uint32(offset);

	if (isDense && shared != nullptr) {
		body->ShareData(shared, const_cast<uint8*>(data), body->dataSize);
	} else if (isDense) {
		memcpy(body->Data(), data, body->dataSize);
	} else if (shared != nullptr) {
		free(body);
		return ParseHaiku(buffer, size, message, used, nullptr);
	} else {
		// Gaps or another order: sound, but everything else here relies on the writer's layout.
		for (uint32 i = 0; i < header.fieldCount; i++) {
			const FlatFieldHeader flat =
				ReadNumber<FlatFieldHeader>(flatFields + i * sizeof(FlatFieldHeader));
			memcpy(body->Data() + body->Fields()[i].offset, data + flat.offset,
				flat.nameLength + flat.dataSize);
		}
	}

	if (!body->CheckChains()) {
		Body::Destroy(body);
		return nullptr;
	}
	body->IndexNames();

	message->what = header.what;
	message->fFlags = header.flags;
	message->fTarget = header.target;
	message->fCurrentSpecifier = header.currentSpecifier;
	message->fReplyPort = header.replyPort;
	message->fReplyTarget = header.replyTarget;
	message->fReplyTeam = header.replyTeam;
	*used = size_t(total);
	return body;
}


status_t
BMessage::Private::Unflatten(const void* buffer, size_t size, size_t* used, MessageBytes* shared)
{
	if (size < sizeof(uint32))
		return B_NOT_A_MESSAGE;
	if (buffer == nullptr)
		return B_BAD_VALUE;

	const uint8* bytes = static_cast<const uint8*>(buffer);
	const uint32 format = ReadNumber<uint32>(bytes);
	// The bytes may be an item of this very message: everything is read before anything is given up.
	BMessage result;
	size_t length = 0;
	Body* body;
	if (format == kHaikuFormat)
		body = ParseHaiku(bytes, size, &result, &length, shared);
	else if (format == kR5Format || format == kR5SwappedFormat)
		body = ParseR5(bytes, size, &result, &length);
	else
		return B_NOT_A_MESSAGE;

	fMessage->MakeEmpty();
	if (body == nullptr)
		return B_BAD_VALUE;

	fMessage->what = result.what;
	fMessage->fFlags = result.fFlags;
	fMessage->fTarget = result.fTarget;
	fMessage->fCurrentSpecifier = result.fCurrentSpecifier;
	fMessage->fReplyPort = result.fReplyPort;
	fMessage->fReplyTarget = result.fReplyTarget;
	fMessage->fReplyTeam = result.fReplyTeam;
	fMessage->fBody = body;
	if (used != nullptr)
		*used = length;
	return B_OK;
}


status_t
BMessage::Unflatten(const char* flatBuffer)
{
	if (flatBuffer == nullptr)
		return B_BAD_VALUE;

	// Without a size, what the header claims has to do.
	const uint32 format = ReadNumber<uint32>(flatBuffer);
	size_t size = SIZE_MAX;
	if (format == kR5Format || format == kR5SwappedFormat) {
		const uint32 claimed = ReadNumber<uint32>(flatBuffer + 8);
		size = format == kR5Format ? claimed : __builtin_bswap32(claimed);
	}
	return Private(this).Unflatten(flatBuffer, size);
}


status_t
BMessage::Unflatten(BDataIO* stream)
{
	if (stream == nullptr)
		return B_BAD_VALUE;

	MessageStream input(stream);
	status_t status = input.Fill(sizeof(uint32));
	if (status != B_OK)
		return status == B_BAD_VALUE ? B_NOT_A_MESSAGE : status;

	const uint32 format = ReadNumber<uint32>(input.Bytes());
	if (format == kHaikuFormat)
		status = FillHaiku(&input);
	else if (format == kR5Format || format == kR5SwappedFormat)
		status = FillR5(&input);
	else
		return B_NOT_A_MESSAGE;

	if (status != B_OK) {
		MakeEmpty();
		return status;
	}
	const uint8* bytes = input.Bytes();
	MessageBytes* shared = input.Size() >= kSharedSize ? input.Share() : nullptr;
	size_t used = 0;
	status = Private(this).Unflatten(bytes, input.Size(), &used, shared);
	if (shared != nullptr)
		shared->Release();
	return status == B_OK ? input.Finish(used) : status;
}

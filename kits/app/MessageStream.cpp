// SPDX-License-Identifier: MIT
// Reading a flattened message from a stream: how many bytes it has, and fetching no more than those.

#include "app/MessageStream.h"

#include <algorithm>
#include <cstdio>
#include <cstdlib>

#include <DataIO.h>
#include <Errors.h>

#include "app/MessageBody.h"
#include "app/MessageBytes.h"
#include "app/MessageR5.h"

namespace {

constexpr size_t kPieceSize = 65536;

} // namespace


void
MessageStream::Free::operator()(uint8* bytes) const
{
	free(bytes);
}


MessageStream::MessageStream(BDataIO* stream)
	: fStream(stream),
	  fPositionStream(dynamic_cast<BPositionIO*>(stream)),
	  fSize(0),
	  fCapacity(0)
{
}


status_t
MessageStream::Fill(uint64 size)
{
	if (size <= fSize)
		return B_OK;
	if (fPositionStream == nullptr)
		return ReadUpTo(size, size);
	return ReadUpTo(std::max<size_t>(size, fSize + kPieceSize), size);
}


/// Reads until there are \a size bytes; fewer do at the end of the stream if there are \a enough.
status_t
MessageStream::ReadUpTo(size_t size, size_t enough)
{
	while (fSize < size) {
		if (fSize == fCapacity) {
			const size_t capacity =
				HasBytes(size - fSize) ? size : std::min(size, std::max(fCapacity * 2, kPieceSize));
			uint8* bytes = static_cast<uint8*>(realloc(fBytes.get(), capacity));
			if (bytes == nullptr)
				return B_NO_MEMORY;
			static_cast<void>(fBytes.release());
			fBytes.reset(bytes);
			fCapacity = capacity;
		}

		const ssize_t bytesRead =
			fStream->Read(fBytes.get() + fSize, std::min(size, fCapacity) - fSize);
		if (bytesRead < 0)
			return status_t(bytesRead);
		if (bytesRead == 0)
			return fSize >= enough ? B_OK : B_BAD_VALUE;
		fSize += bytesRead;
	}
	return B_OK;
}


/// Whether so many bytes follow for certain.
bool
MessageStream::HasBytes(size_t count) const
{
	off_t end;
	return count > kPieceSize && fPositionStream != nullptr
		&& fPositionStream->GetSize(&end) == B_OK
		&& end - fPositionStream->Position() >= off_t(count);
}


MessageBytes*
MessageStream::Share()
{
	MessageBytes* shared = MessageBytes::Adopt(fBytes.get(), fSize);
	if (shared != nullptr)
		static_cast<void>(fBytes.release());
	return shared;
}


status_t
MessageStream::Finish(size_t used)
{
	if (fSize <= used)
		return B_OK;
	const off_t position = fPositionStream->Seek(-off_t(fSize - used), SEEK_CUR);
	return position < 0 ? status_t(position) : B_OK;
}


status_t
FillHaiku(MessageStream* input)
{
	const status_t status = input->Fill(sizeof(FlatMessageHeader));
	if (status != B_OK)
		return status;
	const FlatMessageHeader header = ReadNumber<FlatMessageHeader>(input->Bytes());
	// A field takes at least two bytes; claims beyond that are not worth waiting for the stream's end.
	if (header.dataSize > kMaxDataSize || header.fieldCount > header.dataSize / 2)
		return B_BAD_VALUE;
	return input->Fill(
		sizeof(header) + uint64(header.fieldCount) * sizeof(FlatFieldHeader) + header.dataSize);
}


status_t
FillR5(MessageStream* input)
{
	uint64 offset = kR5FlagsOffset + 1;
	status_t status = input->Fill(offset);
	if (status != B_OK)
		return status;
	offset = R5HeaderSize(input->Bytes()[kR5FlagsOffset]);

	const bool isSwapped = ReadNumber<uint32>(input->Bytes()) == kR5SwappedFormat;
	while (true) {
		status = input->Fill(offset + 1);
		if (status != B_OK)
			return status;
		const uint8 flags = input->Bytes()[offset];
		if ((flags & kR5FieldValid) == 0)
			return B_OK;

		const size_t recordHeaderSize = R5RecordHeaderSize(flags);
		status = input->Fill(offset + recordHeaderSize);
		if (status != B_OK)
			return status;
		R5Record record;
		if (!record.ReadHeader(input->Bytes() + offset, isSwapped))
			return B_BAD_VALUE;
		offset += recordHeaderSize + record.nameLength + record.dataSize;
	}
}


status_t
WriteFully(BDataIO* stream, const void* buffer, size_t size)
{
	const uint8* bytes = static_cast<const uint8*>(buffer);
	while (size > 0) {
		const ssize_t written = stream->Write(bytes, size);
		if (written < 0)
			return status_t(written);
		if (written == 0)
			return B_IO_ERROR;
		bytes += written;
		size -= written;
	}
	return B_OK;
}

// SPDX-License-Identifier: MIT
// BMemoryIO and BMallocIO: streams in memory.

#include <DataIO.h>

#include <stdint.h>
#include <stdio.h>
#include <stdlib.h>
#include <string.h>

#include <algorithm>

namespace {

off_t
seek_to(off_t current, size_t length, off_t offset, uint32 seekMode)
{
	off_t base;
	switch (seekMode) {
		case SEEK_SET:
			base = 0;
			break;
		case SEEK_CUR:
			base = current;
			break;
		case SEEK_END:
			base = length;
			break;
		default:
			return B_BAD_VALUE;
	}

	off_t position;
	if (__builtin_add_overflow(base, offset, &position) || position < 0)
		return B_BAD_VALUE;
	return position;
}


ssize_t
read_from(const char* data, size_t length, off_t position, void* buffer, size_t size)
{
	if (position < 0 || (buffer == nullptr && size > 0))
		return B_BAD_VALUE;
	if (static_cast<uint64>(position) >= length || size == 0)
		return 0;
	size = std::min(size, length - static_cast<size_t>(position));
	memcpy(buffer, data + position, size);
	return size;
}

} // namespace


BMemoryIO::BMemoryIO(void* data, size_t length)
	: fReadOnly(false),
	  fBuffer(static_cast<char*>(data)),
	  fLength(data == nullptr ? 0 : length),
	  fBufferSize(fLength),
	  fPosition(0)
{
}


BMemoryIO::BMemoryIO(const void* data, size_t length)
	: BMemoryIO(const_cast<void*>(data), length)
{
	fReadOnly = true;
}


BMemoryIO::~BMemoryIO() {}


ssize_t
BMemoryIO::ReadAt(off_t position, void* buffer, size_t size)
{
	return read_from(fBuffer, fLength, position, buffer, size);
}


ssize_t
BMemoryIO::WriteAt(off_t position, const void* buffer, size_t size)
{
	if (fReadOnly)
		return B_NOT_ALLOWED;
	if (position < 0 || (buffer == nullptr && size > 0))
		return B_BAD_VALUE;
	if (static_cast<uint64>(position) >= fBufferSize || size == 0)
		return 0;

	size_t start = static_cast<size_t>(position);
	size = std::min(size, fBufferSize - start);
	// After SetSize() to less, a write beyond the end leaves a gap of old bytes.
	if (start > fLength)
		memset(fBuffer + fLength, 0, start - fLength);
	memcpy(fBuffer + start, buffer, size);
	fLength = std::max(fLength, start + size);
	return size;
}


off_t
BMemoryIO::Seek(off_t position, uint32 seekMode)
{
	position = seek_to(fPosition, fLength, position, seekMode);
	if (position >= 0)
		fPosition = position;
	return position;
}


off_t
BMemoryIO::Position() const
{
	return fPosition;
}


status_t
BMemoryIO::SetSize(off_t size)
{
	if (fReadOnly)
		return B_NOT_ALLOWED;
	if (size < 0)
		return B_BAD_VALUE;
	if (static_cast<uint64>(size) > fBufferSize)
		return B_ERROR;

	size_t length = static_cast<size_t>(size);
	if (length > fLength)
		memset(fBuffer + fLength, 0, length - fLength);
	fLength = length;
	return B_OK;
}


BMallocIO::BMallocIO()
	: fBlockSize(256),
	  fMallocSize(0),
	  fLength(0),
	  fData(nullptr),
	  fPosition(0)
{
}


BMallocIO::~BMallocIO()
{
	free(fData);
}


ssize_t
BMallocIO::ReadAt(off_t position, void* buffer, size_t size)
{
	return read_from(fData, fLength, position, buffer, size);
}


ssize_t
BMallocIO::WriteAt(off_t position, const void* buffer, size_t size)
{
	if (position < 0 || (buffer == nullptr && size > 0))
		return B_BAD_VALUE;
	if (size == 0)
		return 0;

	size_t start = static_cast<size_t>(position);
	if (size > static_cast<size_t>(SSIZE_MAX) - start)
		return B_NO_MEMORY;
	status_t status = ReserveBytes(start + size);
	if (status != B_OK)
		return status;

	if (start > fLength)
		memset(fData + fLength, 0, start - fLength);
	memcpy(fData + start, buffer, size);
	fLength = std::max(fLength, start + size);
	return size;
}


off_t
BMallocIO::Seek(off_t position, uint32 seekMode)
{
	position = seek_to(fPosition, fLength, position, seekMode);
	if (position >= 0)
		fPosition = position;
	return position;
}


off_t
BMallocIO::Position() const
{
	return fPosition;
}


status_t
BMallocIO::SetSize(off_t size)
{
	if (size < 0)
		return B_BAD_VALUE;

	size_t length = static_cast<size_t>(size);
	status_t status = ReserveBytes(length);
	if (status != B_OK)
		return status;
	if (length > fLength)
		memset(fData + fLength, 0, length - fLength);
	fLength = length;
	return B_OK;
}


void
BMallocIO::SetBlockSize(size_t blockSize)
{
	fBlockSize = std::max<size_t>(blockSize, 1);
}


const void*
BMallocIO::Buffer() const
{
	return fData;
}


size_t
BMallocIO::BufferLength() const
{
	return fLength;
}


status_t
BMallocIO::ReserveBytes(size_t size)
{
	if (size <= fMallocSize)
		return B_OK;

	// Doubling keeps many small writes linear; the block size is the least step.
	size_t wanted = std::max(size, fMallocSize < SSIZE_MAX / 2 ? fMallocSize * 2 : size);
	size_t rest = wanted % fBlockSize;
	if (rest != 0 && fBlockSize - rest <= static_cast<size_t>(SSIZE_MAX) - wanted)
		wanted += fBlockSize - rest;
	void* data = realloc(fData, wanted);
	if (data == nullptr)
		return B_NO_MEMORY;
	fData = static_cast<char*>(data);
	fMallocSize = wanted;
	return B_OK;
}

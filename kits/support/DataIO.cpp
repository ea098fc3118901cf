// SPDX-License-Identifier: MIT
// BDataIO and BPositionIO: what every stream has in common.

#include <DataIO.h>

#include <stdio.h>

namespace {

/// Calls \a transfer(bytesDone) until \a size bytes are done. A stream that claims to have done
/// more than it was asked for is broken, and must not make us count beyond the buffer.
template <typename Transfer>
status_t
transfer_exactly(size_t size, size_t* _bytesDone, status_t partial, Transfer transfer)
{
	size_t done = 0;
	status_t status = B_OK;
	while (status == B_OK && done < size) {
		ssize_t bytes = transfer(done);
		if (bytes < 0)
			status = static_cast<status_t>(bytes);
		else if (static_cast<size_t>(bytes) > size - done)
			status = B_IO_ERROR;
		else if (bytes == 0)
			status = partial;
		else
			done += bytes;
	}

	if (_bytesDone != nullptr)
		*_bytesDone = done;
	return status;
}

} // namespace


BDataIO::BDataIO() {}


BDataIO::~BDataIO() {}


ssize_t
BDataIO::Read(void*, size_t)
{
	return B_NOT_SUPPORTED;
}


ssize_t
BDataIO::Write(const void*, size_t)
{
	return B_NOT_SUPPORTED;
}


status_t
BDataIO::Flush()
{
	return B_OK;
}


status_t
BDataIO::ReadExactly(void* buffer, size_t size, size_t* _bytesRead)
{
	char* bytes = static_cast<char*>(buffer);
	return transfer_exactly(size, _bytesRead, B_PARTIAL_READ,
		[&](size_t done) { return Read(bytes + done, size - done); });
}


status_t
BDataIO::WriteExactly(const void* buffer, size_t size, size_t* _bytesWritten)
{
	const char* bytes = static_cast<const char*>(buffer);
	return transfer_exactly(size, _bytesWritten, B_PARTIAL_WRITE,
		[&](size_t done) { return Write(bytes + done, size - done); });
}


BPositionIO::BPositionIO() {}


BPositionIO::~BPositionIO() {}


ssize_t
BPositionIO::Read(void* buffer, size_t size)
{
	off_t position = Position();
	ssize_t bytes = ReadAt(position, buffer, size);
	if (bytes > 0)
		Seek(position + bytes, SEEK_SET);
	return bytes;
}


ssize_t
BPositionIO::Write(const void* buffer, size_t size)
{
	off_t position = Position();
	ssize_t bytes = WriteAt(position, buffer, size);
	if (bytes > 0)
		Seek(position + bytes, SEEK_SET);
	return bytes;
}


status_t
BPositionIO::ReadAtExactly(off_t position, void* buffer, size_t size, size_t* _bytesRead)
{
	char* bytes = static_cast<char*>(buffer);
	return transfer_exactly(size, _bytesRead, B_PARTIAL_READ,
		[&](size_t done) { return ReadAt(position + done, bytes + done, size - done); });
}


status_t
BPositionIO::WriteAtExactly(off_t position, const void* buffer, size_t size, size_t* _bytesWritten)
{
	const char* bytes = static_cast<const char*>(buffer);
	return transfer_exactly(size, _bytesWritten, B_PARTIAL_WRITE,
		[&](size_t done) { return WriteAt(position + done, bytes + done, size - done); });
}


status_t
BPositionIO::SetSize(off_t)
{
	return B_ERROR;
}


status_t
BPositionIO::GetSize(off_t* size) const
{
	if (size == nullptr)
		return B_BAD_VALUE;

	// The position is moved and put back: for the caller nothing changes.
	BPositionIO* stream = const_cast<BPositionIO*>(this);
	off_t position = Position();
	if (position < 0)
		return static_cast<status_t>(position);
	off_t end = stream->Seek(0, SEEK_END);
	if (end < 0)
		return static_cast<status_t>(end);
	*size = end;

	position = stream->Seek(position, SEEK_SET);
	return position < 0 ? static_cast<status_t>(position) : B_OK;
}

// SPDX-License-Identifier: MIT
// Streams: the abstract ones, and those in memory.

#ifndef _DATA_IO_H
#define _DATA_IO_H

#include <SupportDefs.h>

/// Something that bytes are read from and written to, one after another.
class BDataIO {
public:
	BDataIO();
	virtual ~BDataIO();

	/// The bytes done, 0 at the end of the data, or a negative status. Here: B_NOT_SUPPORTED.
	virtual ssize_t Read(void* buffer, size_t size);
	virtual ssize_t Write(const void* buffer, size_t size);
	virtual status_t Flush();

	/// Reads \a size bytes or fails: B_PARTIAL_READ when the data ends before, or what Read() gave.
	/// \a _bytesRead, unless null, is written in every case.
	status_t ReadExactly(void* buffer, size_t size, size_t* _bytesRead = NULL);
	/// As above, with B_PARTIAL_WRITE.
	status_t WriteExactly(const void* buffer, size_t size, size_t* _bytesWritten = NULL);

private:
	BDataIO(const BDataIO&) = delete;
	BDataIO& operator=(const BDataIO&) = delete;
};


/// Something with a position, a byte offset that Read() and Write() move and the others do not.
class BPositionIO : public BDataIO {
public:
	BPositionIO();
	virtual ~BPositionIO();

	virtual ssize_t Read(void* buffer, size_t size);
	virtual ssize_t Write(const void* buffer, size_t size);

	virtual ssize_t ReadAt(off_t position, void* buffer, size_t size) = 0;
	virtual ssize_t WriteAt(off_t position, const void* buffer, size_t size) = 0;
	status_t ReadAtExactly(off_t position, void* buffer, size_t size, size_t* _bytesRead = NULL);
	status_t WriteAtExactly(
		off_t position, const void* buffer, size_t size, size_t* _bytesWritten = NULL);

	/// \a seekMode: SEEK_SET, SEEK_CUR or SEEK_END. Returns the new position or a negative status.
	virtual off_t Seek(off_t position, uint32 seekMode) = 0;
	virtual off_t Position() const = 0;

	virtual status_t SetSize(off_t size);
	virtual status_t GetSize(off_t* size) const;
};


/// A stream over the caller's memory, which must outlive it. Its size is fixed: writing beyond the
/// end returns the bytes that fit. One made from const data refuses writing with B_NOT_ALLOWED.
class BMemoryIO : public BPositionIO {
public:
	BMemoryIO(void* data, size_t length);
	BMemoryIO(const void* data, size_t length);
	virtual ~BMemoryIO();

	virtual ssize_t ReadAt(off_t position, void* buffer, size_t size);
	virtual ssize_t WriteAt(off_t position, const void* buffer, size_t size);
	virtual off_t Seek(off_t position, uint32 seekMode);
	virtual off_t Position() const;
	/// Never more than the memory has: B_ERROR.
	virtual status_t SetSize(off_t size);

private:
	bool fReadOnly;
	char* fBuffer;
	size_t fLength;
	size_t fBufferSize;
	off_t fPosition;
};


/// A stream over memory of its own that grows by itself. A gap left by a write is filled with 0.
class BMallocIO : public BPositionIO {
public:
	BMallocIO();
	virtual ~BMallocIO();

	virtual ssize_t ReadAt(off_t position, void* buffer, size_t size);
	virtual ssize_t WriteAt(off_t position, const void* buffer, size_t size);
	virtual off_t Seek(off_t position, uint32 seekMode);
	virtual off_t Position() const;
	virtual status_t SetSize(off_t size);

	/// The memory grows in steps of \a blockSize bytes, 256 unless set.
	void SetBlockSize(size_t blockSize);
	/// Valid until the next write or SetSize(); null while nothing was written.
	const void* Buffer() const;
	size_t BufferLength() const;

private:
	status_t ReserveBytes(size_t size);

	size_t fBlockSize;
	size_t fMallocSize;
	size_t fLength;
	char* fData;
	off_t fPosition;
};

#endif // _DATA_IO_H

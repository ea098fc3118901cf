// SPDX-License-Identifier: MIT
// BFile: reading and writing the content of a file.

#include <File.h>

#include <string.h>

#include <Directory.h>
#include <Entry.h>
#include <Errors.h>

#include "storage/EntryResolving.h"
#include "storage/StorageStatus.h"

using BPrivate::status_from_errno;
using BPrivate::status_of;

const mode_t kNewFileMode = 0666;
const uint32 kModeFlags = O_ACCMODE | B_FAIL_IF_EXISTS | B_CREATE_FILE | B_ERASE_FILE
	| B_OPEN_AT_END | O_SYNC | O_DSYNC | O_NONBLOCK | O_NOCTTY | O_NOFOLLOW | O_CLOEXEC
	| O_DIRECTORY;


BFile::BFile() {}


BFile::BFile(const BFile& file)
	: BNode(file),
	  BPositionIO()
{
}


BFile::BFile(const entry_ref* ref, uint32 openMode)
{
	SetTo(ref, openMode);
}


BFile::BFile(const BEntry* entry, uint32 openMode)
{
	SetTo(entry, openMode);
}


BFile::BFile(const char* path, uint32 openMode)
{
	SetTo(path, openMode);
}


BFile::BFile(const BDirectory* dir, const char* path, uint32 openMode)
{
	SetTo(dir, path, openMode);
}


BFile::~BFile() {}


status_t
BFile::SetTo(const entry_ref* ref, uint32 openMode)
{
	if (ref == nullptr)
		return Adopt(B_BAD_VALUE);
	std::string path;
	const status_t status = BPrivate::find_ref_path(*ref, &path);
	return status == B_OK ? SetTo(path.c_str(), openMode) : Adopt(status);
}


status_t
BFile::SetTo(const BEntry* entry, uint32 openMode)
{
	if (entry == nullptr)
		return Adopt(B_BAD_VALUE);
	entry_ref ref;
	const status_t status = entry->GetRef(&ref);
	return status == B_OK ? SetTo(&ref, openMode) : Adopt(status);
}


status_t
BFile::SetTo(const char* path, uint32 openMode)
{
	return Open(AT_FDCWD, path, openMode);
}


status_t
BFile::SetTo(const BDirectory* dir, const char* path, uint32 openMode)
{
	if (dir == nullptr || path == nullptr)
		return Adopt(B_BAD_VALUE);
	const int folder = dir->Dup();
	if (folder < 0)
		return Adopt(folder);
	const status_t status = Open(folder, path, openMode);
	close(folder);
	return status;
}


bool
BFile::IsReadable() const
{
	const int flags = fcntl(Descriptor(), F_GETFL);
	return flags >= 0 && (flags & O_ACCMODE) != O_WRONLY;
}


bool
BFile::IsWritable() const
{
	const int flags = fcntl(Descriptor(), F_GETFL);
	return flags >= 0 && (flags & O_ACCMODE) != O_RDONLY;
}


ssize_t
BFile::Read(void* buffer, size_t size)
{
	if (InitCheck() != B_OK)
		return InitCheck();
	ssize_t bytes;
	do {
		bytes = read(Descriptor(), buffer, size);
	} while (bytes < 0 && errno == EINTR);
	return bytes < 0 ? status_from_errno(errno) : bytes;
}


ssize_t
BFile::ReadAt(off_t location, void* buffer, size_t size)
{
	if (InitCheck() != B_OK)
		return InitCheck();
	ssize_t bytes;
	do {
		bytes = pread(Descriptor(), buffer, size, location);
	} while (bytes < 0 && errno == EINTR);
	return bytes < 0 ? status_from_errno(errno) : bytes;
}


// Calls \a write(bytes, count, done) until all bytes are written or one call fails.
template <typename Writer>
static ssize_t
WriteAll(const void* buffer, size_t size, Writer write)
{
	size_t done = 0;
	do {
		const ssize_t bytes = write((const char*)buffer + done, size - done, done);
		if (bytes < 0 && errno == EINTR)
			continue;
		// What went in before counts: the next call tells the reason.
		if (bytes < 0)
			return done > 0 ? (ssize_t)done : status_from_errno(errno);
		if (bytes == 0)
			break;
		done += bytes;
	} while (done < size);
	return done;
}


ssize_t
BFile::Write(const void* buffer, size_t size)
{
	if (InitCheck() != B_OK)
		return InitCheck();
	return WriteAll(buffer, size, [this](const char* bytes, size_t count, size_t) {
		return write(Descriptor(), bytes, count);
	});
}


ssize_t
BFile::WriteAt(off_t location, const void* buffer, size_t size)
{
	if (InitCheck() != B_OK)
		return InitCheck();
	return WriteAll(buffer, size, [=, this](const char* bytes, size_t count, size_t done) {
		return pwrite(Descriptor(), bytes, count, location + (off_t)done);
	});
}


off_t
BFile::Seek(off_t offset, uint32 seekMode)
{
	if (InitCheck() != B_OK)
		return InitCheck();
	const off_t position = lseek(Descriptor(), offset, (int)seekMode);
	return position < 0 ? status_from_errno(errno) : position;
}


off_t
BFile::Position() const
{
	if (InitCheck() != B_OK)
		return InitCheck();
	const off_t position = lseek(Descriptor(), 0, SEEK_CUR);
	return position < 0 ? status_from_errno(errno) : position;
}


status_t
BFile::SetSize(off_t size)
{
	if (InitCheck() != B_OK)
		return InitCheck();
	if (size < 0)
		return B_BAD_VALUE;
	return IsWritable() ? status_of(ftruncate(Descriptor(), size)) : B_FILE_ERROR;
}


status_t
BFile::GetSize(off_t* size) const
{
	return BStatable::GetSize(size);
}


BFile&
BFile::operator=(const BFile& file)
{
	BNode::operator=(file);
	return *this;
}


status_t
BFile::Open(int folder, const char* path, uint32 openMode)
{
	if (path == nullptr || (openMode & O_ACCMODE) == O_ACCMODE || (openMode & ~kModeFlags) != 0)
		return Adopt(B_BAD_VALUE);
	if (strlen(path) >= B_PATH_NAME_LENGTH)
		return Adopt(B_NAME_TOO_LONG);

	const int fd = openat(folder, path, (int)openMode | O_CLOEXEC | O_NOCTTY, kNewFileMode);
	if (fd < 0)
		return Adopt(status_from_errno(errno));
	// The host moves the position only when something is appended.
	if ((openMode & B_OPEN_AT_END) != 0)
		lseek(fd, 0, SEEK_END);
	return Adopt(fd);
}

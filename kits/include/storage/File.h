// SPDX-License-Identifier: MIT
// BFile: reading and writing the content of a file.

#ifndef _FILE_H
#define _FILE_H

#include <DataIO.h>
#include <Node.h>
#include <StorageDefs.h>

/// An open file. It is closed by Unset() and by destruction.
///
/// A symbolic link is followed. Reading and writing return the bytes done or an error; a write that
/// runs out of room returns the bytes that went in, and B_DEVICE_FULL when there are none.
class BFile : public BNode, public BPositionIO {
public:
	BFile();
	/// A copy shares the open file, its position included.
	BFile(const BFile& file);
	BFile(const entry_ref* ref, uint32 openMode);
	BFile(const BEntry* entry, uint32 openMode);
	BFile(const char* path, uint32 openMode);
	BFile(const BDirectory* dir, const char* path, uint32 openMode);
	~BFile() override;

	/// B_ENTRY_NOT_FOUND, B_PERMISSION_DENIED, B_FILE_EXISTS, B_IS_A_DIRECTORY (a folder can be
	/// opened for reading alone), B_BAD_VALUE for a mode that is none, ...
	status_t SetTo(const entry_ref* ref, uint32 openMode);
	status_t SetTo(const BEntry* entry, uint32 openMode);
	status_t SetTo(const char* path, uint32 openMode);
	status_t SetTo(const BDirectory* dir, const char* path, uint32 openMode);

	bool IsReadable() const;
	bool IsWritable() const;

	ssize_t Read(void* buffer, size_t size) override;
	ssize_t ReadAt(off_t location, void* buffer, size_t size) override;
	ssize_t Write(const void* buffer, size_t size) override;
	ssize_t WriteAt(off_t location, const void* buffer, size_t size) override;

	/// The new position or an error; a position before the beginning is B_BAD_VALUE.
	off_t Seek(off_t offset, uint32 seekMode) override;
	off_t Position() const override;

	status_t SetSize(off_t size) override;
	status_t GetSize(off_t* size) const override;

	BFile& operator=(const BFile& file);

private:
	status_t Open(int folder, const char* path, uint32 openMode);
};

#endif

// SPDX-License-Identifier: MIT

#include "app/ReplacementFile.h"

#include <cstring>
#include <mutex>
#include <vector>

#include <sys/stat.h>

#include <Directory.h>
#include <Entry.h>
#include <OS.h>
#include <Path.h>
#include <fs_attr.h>

const char* const kReplacementPrefix = ".plim-save-";

namespace {

constexpr size_t kBlockSize = 64 * 1024;
constexpr int32 kMostAttempts = 100;


/// Removes what programs that were killed left in \a folder. What a running one is writing is locked.
void
RemoveLeftovers(const char* folder)
{
	BDirectory directory(folder);
	entry_ref ref;
	while (directory.GetNextRef(&ref) == B_OK) {
		if (strncmp(ref.name, kReplacementPrefix, strlen(kReplacementPrefix)) != 0)
			continue;
		BEntry place(&directory, ref.name);
		BNode leftover;
		if (place.IsFile() && leftover.SetTo(&place) == B_OK && leftover.Lock() == B_OK)
			place.Remove();
	}
}


/// The same, but only when the folder is another one than the last time: for many files at once.
void
RemoveLeftoversOnce(const char* folder)
{
	static std::mutex sLock;
	static BString sLastFolder;
	{
		std::lock_guard<std::mutex> lock(sLock);
		if (sLastFolder == folder)
			return;
		sLastFolder = folder;
	}
	RemoveLeftovers(folder);
}

} // namespace

TReplacementFile::TReplacementFile(const char* path, replacement_sync sync)
	: fSync(sync),
	  fStatus(path == nullptr || *path == '\0' ? B_BAD_VALUE : OpenBeside(path))
{
}


TReplacementFile::~TReplacementFile()
{
	// While it is locked nobody else takes it for left behind.
	if (!fNewPath.IsEmpty())
		BEntry(fNewPath.String()).Remove();
	fNewFile.Unset();
}


status_t
TReplacementFile::KeepTail()
{
	if (fStatus != B_OK || fNewPath.IsEmpty())
		return fStatus;

	BFile present(fPath.String(), B_READ_ONLY);
	if (present.InitCheck() == B_ENTRY_NOT_FOUND)
		return B_OK;
	if (present.InitCheck() != B_OK)
		return present.InitCheck();

	std::vector<char> block(kBlockSize);
	off_t position = fNewFile.Seek(0, SEEK_END);
	for (;;) {
		const ssize_t length = present.ReadAt(position, block.data(), block.size());
		if (length <= 0)
			return length;
		const ssize_t written = fNewFile.WriteAt(position, block.data(), length);
		if (written != length)
			return written < 0 ? written : B_DEVICE_FULL;
		position += length;
	}
}


status_t
TReplacementFile::Replace()
{
	if (fStatus != B_OK)
		return fStatus;
	if (fNewPath.IsEmpty())
		return B_OK;

	BFile present(fPath.String(), B_READ_ONLY);
	if (present.InitCheck() == B_OK) {
		TakeOverAttributes(present);
		mode_t permissions;
		if (present.GetPermissions(&permissions) == B_OK)
			fNewFile.SetPermissions(permissions & 07777);
	}

	// The content has to be on the disk before the name leads to it.
	status_t status = fSync == REPLACE_SYNCED ? fNewFile.Sync() : B_OK;
	if (status == B_OK)
		status = BEntry(fNewPath.String()).Rename(fPath.String(), true);
	if (status == B_OK) {
		fNewPath = "";
		fStatus = B_NO_INIT;
	}
	return status;
}


status_t
TReplacementFile::OpenBeside(const char* path)
{
	BEntry entry(path, true);
	if (entry.InitCheck() != B_OK)
		return entry.InitCheck();
	BPath resolved;
	status_t status = entry.GetPath(&resolved);
	if (status != B_OK)
		return status;
	fPath = resolved.Path();

	if (entry.Exists()) {
		// Opening a pipe would wait for somebody to read from it.
		struct stat kind;
		if (entry.GetStat(&kind) == B_OK && S_ISFIFO(kind.st_mode))
			return B_NOT_ALLOWED;
		// A file that may not be written is not replaced either, though its folder would allow it.
		BFile present(&entry, B_WRITE_ONLY);
		if (present.InitCheck() != B_OK)
			return present.InitCheck();
		if (!entry.IsFile())
			return fNewFile.SetTo(&entry, entry.IsDirectory() ? B_READ_WRITE : B_WRITE_ONLY);
	}

	BPath folder;
	status = resolved.GetParent(&folder);
	return status == B_OK ? MakeNewFile(folder.Path()) : status;
}


status_t
TReplacementFile::MakeNewFile(const char* folder)
{
	if (fSync == REPLACE_SYNCED)
		RemoveLeftovers(folder);
	else
		RemoveLeftoversOnce(folder);

	status_t status = B_ERROR;
	for (int32 attempt = 0; attempt < kMostAttempts; attempt++) {
		// Not longer than the name of a file may be, however long the document's own is.
		BString name(folder);
		name << "/" << kReplacementPrefix << static_cast<int64>(find_thread(nullptr)) << "-"
			 << attempt;
		status = fNewFile.SetTo(name.String(), B_READ_WRITE | B_CREATE_FILE | B_FAIL_IF_EXISTS);
		if (status == B_FILE_EXISTS) {
			// Of a program that had this thread's number, perhaps.
			if (attempt == 0)
				RemoveLeftovers(folder);
			continue;
		}
		if (status != B_OK)
			return status;
		fNewPath = name;
		// Before it was locked, somebody else may have taken it for left behind. Where files cannot be locked, nobody
		// does.
		if (fNewFile.Lock() != B_BUSY && IsNewFileInPlace())
			return B_OK;
		fNewPath = "";
		status = B_BUSY;
	}
	return status;
}


bool
TReplacementFile::IsNewFileInPlace() const
{
	node_ref opened;
	node_ref present;
	return fNewFile.GetNodeRef(&opened) == B_OK
		&& BEntry(fNewPath.String()).GetNodeRef(&present) == B_OK && opened == present;
}


void
TReplacementFile::TakeOverAttributes(BFile& present)
{
	char name[B_ATTR_NAME_LENGTH];
	while (present.GetNextAttrName(name) == B_OK) {
		attr_info info;
		if (fNewFile.GetAttrInfo(name, &info) == B_OK)
			continue;
		if (present.GetAttrInfo(name, &info) != B_OK)
			continue;
		std::vector<char> value(info.size);
		if (present.ReadAttr(name, info.type, 0, value.data(), value.size()) >= 0)
			fNewFile.WriteAttr(name, info.type, 0, value.data(), value.size());
	}
}

// SPDX-License-Identifier: MIT
// node_ref and BNode: a node of the file system with its attributes.

#include <Node.h>

#include <fcntl.h>
#include <string.h>
#include <sys/file.h>
#include <unistd.h>

#include <Directory.h>
#include <Entry.h>
#include <Errors.h>
#include <Path.h>
#include <String.h>
#include <TypeConstants.h>
#include <fs_attr.h>

#include "storage/EntryResolving.h"
#include "storage/KnownNodes.h"
#include "storage/StatChange.h"
#include "storage/StorageStatus.h"

using BPrivate::status_from_errno;
using BPrivate::status_of;


// #pragma mark - node_ref


node_ref::node_ref()
	: device((dev_t)-1),
	  node((ino_t)-1)
{
}


node_ref::node_ref(dev_t device, ino_t node)
	: device(device),
	  node(node)
{
}


node_ref::node_ref(const node_ref& other) = default;


bool
node_ref::operator==(const node_ref& other) const
{
	return device == other.device && node == other.node;
}


bool
node_ref::operator!=(const node_ref& other) const
{
	return !(*this == other);
}


bool
node_ref::operator<(const node_ref& other) const
{
	return device != other.device ? device < other.device : node < other.node;
}


node_ref& node_ref::operator=(const node_ref& other) = default;


// #pragma mark - BNode


/// The names that are walked by GetNextAttrName().
struct BNode::AttributeListing {
	explicit AttributeListing(int fd)
		: directory(fs_fopen_attr_dir(fd))
	{
	}
	~AttributeListing()
	{
		if (directory != nullptr)
			fs_close_attr_dir(directory);
	}

	DIR* directory;
};


BNode::BNode()
	: fFd(-1),
	  fStatus(B_NO_INIT)
{
}


BNode::BNode(const entry_ref* ref)
	: BNode()
{
	SetTo(ref);
}


BNode::BNode(const BEntry* entry)
	: BNode()
{
	SetTo(entry);
}


BNode::BNode(const char* path)
	: BNode()
{
	SetTo(path);
}


BNode::BNode(const BDirectory* dir, const char* path)
	: BNode()
{
	SetTo(dir, path);
}


BNode::BNode(const BNode& node)
	: BNode()
{
	*this = node;
}


BNode::~BNode()
{
	Unset();
}


status_t
BNode::InitCheck() const
{
	return fStatus;
}


status_t
BNode::GetStat(struct stat* stat) const
{
	if (stat == nullptr)
		return B_BAD_VALUE;
	return fStatus == B_OK ? status_of(fstat(fFd, stat)) : fStatus;
}


status_t
BNode::SetTo(const entry_ref* ref)
{
	if (ref == nullptr)
		return Adopt(B_BAD_VALUE);
	std::string path;
	const status_t status = BPrivate::find_ref_path(*ref, &path);
	return Adopt(status == B_OK ? OpenAt(AT_FDCWD, path.c_str()) : status);
}


status_t
BNode::SetTo(const BEntry* entry)
{
	if (entry == nullptr)
		return Adopt(B_BAD_VALUE);
	entry_ref ref;
	const status_t status = entry->GetRef(&ref);
	return status == B_OK ? SetTo(&ref) : Adopt(status);
}


status_t
BNode::SetTo(const char* path)
{
	return Adopt(OpenAt(AT_FDCWD, path));
}


status_t
BNode::SetTo(const BDirectory* dir, const char* path)
{
	if (dir == nullptr)
		return Adopt(B_BAD_VALUE);
	if (dir->InitCheck() != B_OK)
		return Adopt(dir->InitCheck());
	return Adopt(OpenAt(dir->fFd, path == nullptr ? "." : path));
}


void
BNode::Unset()
{
	Adopt(B_NO_INIT);
}


status_t
BNode::Lock()
{
	if (fStatus != B_OK)
		return fStatus;
	const status_t status = status_of(flock(fFd, LOCK_EX | LOCK_NB));
	return status == B_WOULD_BLOCK ? B_BUSY : status;
}


status_t
BNode::Unlock()
{
	return fStatus == B_OK ? status_of(flock(fFd, LOCK_UN)) : fStatus;
}


status_t
BNode::Sync()
{
	return fStatus == B_OK ? status_of(fsync(fFd)) : fStatus;
}


ssize_t
BNode::WriteAttr(const char* name, type_code type, off_t offset, const void* buffer, size_t length)
{
	if (fStatus != B_OK)
		return fStatus;
	if (name == nullptr || offset < 0 || (buffer == nullptr && length > 0))
		return B_BAD_VALUE;
	const ssize_t written = fs_write_attr(fFd, name, type, offset, buffer, length);
	return written < 0 ? AttributeError() : written;
}


ssize_t
BNode::ReadAttr(const char* name, type_code type, off_t offset, void* buffer, size_t length) const
{
	if (fStatus != B_OK)
		return fStatus;
	if (name == nullptr || offset < 0 || (buffer == nullptr && length > 0))
		return B_BAD_VALUE;
	const ssize_t bytes = fs_read_attr(fFd, name, type, offset, buffer, length);
	return bytes < 0 ? AttributeError() : bytes;
}


status_t
BNode::RemoveAttr(const char* name)
{
	if (fStatus != B_OK)
		return fStatus;
	if (name == nullptr)
		return B_BAD_VALUE;
	return fs_remove_attr(fFd, name) < 0 ? AttributeError() : B_OK;
}


status_t
BNode::RenameAttr(const char* oldName, const char* newName)
{
	if (oldName == nullptr || newName == nullptr)
		return B_BAD_VALUE;
	attr_info info;
	status_t status = GetAttrInfo(oldName, &info);
	if (status != B_OK)
		return status;
	if (strcmp(oldName, newName) == 0)
		return B_OK;

	std::string data(info.size, '\0');
	const ssize_t bytes = ReadAttr(oldName, info.type, 0, data.data(), data.size());
	if (bytes < 0)
		return bytes;
	const ssize_t written = WriteAttr(newName, info.type, 0, data.data(), bytes);
	return written < 0 ? written : RemoveAttr(oldName);
}


status_t
BNode::GetAttrInfo(const char* name, struct attr_info* info) const
{
	if (fStatus != B_OK)
		return fStatus;
	if (name == nullptr || info == nullptr)
		return B_BAD_VALUE;
	return fs_stat_attr(fFd, name, info) < 0 ? AttributeError() : B_OK;
}


status_t
BNode::GetNextAttrName(char* buffer)
{
	if (buffer == nullptr)
		return B_BAD_VALUE;
	if (fStatus != B_OK)
		return fStatus;

	if (fAttributes == nullptr)
		fAttributes = std::make_unique<AttributeListing>(fFd);
	if (fAttributes->directory == nullptr) {
		fAttributes = nullptr;
		return AttributeError();
	}
	const dirent* entry = fs_read_attr_dir(fAttributes->directory);
	if (entry == nullptr)
		return B_ENTRY_NOT_FOUND;
	const size_t length = strnlen(entry->d_name, B_ATTR_NAME_LENGTH - 1);
	memcpy(buffer, entry->d_name, length);
	buffer[length] = '\0';
	return B_OK;
}


status_t
BNode::RewindAttrs()
{
	// The listing is made anew, so that it shows what was written since.
	fAttributes = nullptr;
	return fStatus;
}


status_t
BNode::WriteAttrString(const char* name, const BString* data)
{
	if (data == nullptr)
		return B_BAD_VALUE;
	const ssize_t written =
		WriteAttr(name, B_STRING_TYPE, 0, data->String(), (size_t)data->Length() + 1);
	return written < 0 ? written : B_OK;
}


status_t
BNode::ReadAttrString(const char* name, BString* result) const
{
	if (result == nullptr)
		return B_BAD_VALUE;
	attr_info info;
	const status_t status = GetAttrInfo(name, &info);
	if (status != B_OK)
		return status;

	std::string text(info.size, '\0');
	const ssize_t bytes = ReadAttr(name, B_STRING_TYPE, 0, text.data(), text.size());
	if (bytes < 0)
		return bytes;
	text.resize(bytes);
	// The terminator of the text, or of the string object where the text has none, ends it.
	result->SetTo(text.c_str());
	return B_OK;
}


BNode&
BNode::operator=(const BNode& node)
{
	if (this != &node)
		Adopt(node.fStatus == B_OK ? node.Dup() : node.fStatus);
	return *this;
}


bool
BNode::operator==(const BNode& node) const
{
	if (fStatus != B_OK || node.fStatus != B_OK)
		return fStatus != B_OK && node.fStatus != B_OK;
	struct stat mine;
	struct stat other;
	return GetStat(&mine) == B_OK && node.GetStat(&other) == B_OK && mine.st_dev == other.st_dev
		&& mine.st_ino == other.st_ino;
}


bool
BNode::operator!=(const BNode& node) const
{
	return !(*this == node);
}


int
BNode::Dup() const
{
	if (fStatus != B_OK)
		return fStatus;
	const int fd = fcntl(fFd, F_DUPFD_CLOEXEC, 0);
	return fd < 0 ? status_from_errno(errno) : fd;
}


int
BNode::OpenAt(int folder, const char* path) const
{
	if (path == nullptr)
		return B_BAD_VALUE;
	if (strlen(path) >= B_PATH_NAME_LENGTH)
		return B_NAME_TOO_LONG;

	// A device or a pipe must not notice that somebody asks for its status.
	struct stat stat;
	if (fstatat(folder, path, &stat, AT_SYMLINK_NOFOLLOW) != 0)
		return status_from_errno(errno);
	const int common = O_NOFOLLOW | O_CLOEXEC;
	int fd = -1;
	if (S_ISREG(stat.st_mode) || S_ISDIR(stat.st_mode))
		fd = openat(folder, path, O_RDONLY | O_NONBLOCK | O_NOCTTY | common);
	if (fd < 0)
		fd = openat(folder, path, O_PATH | common);
	return fd < 0 ? status_from_errno(errno) : fd;
}


status_t
BNode::Adopt(int fdOrError)
{
	fAttributes = nullptr;
	if (fFd >= 0)
		close(fFd);
	fFd = fdOrError < 0 ? -1 : fdOrError;
	fStatus = fdOrError < 0 ? fdOrError : B_OK;
	return fStatus;
}


status_t
BNode::AttributeError() const
{
	const int error = errno;
	struct stat stat;
	const bool isFileOrFolder =
		fstat(fFd, &stat) == 0 && (S_ISREG(stat.st_mode) || S_ISDIR(stat.st_mode));
	// The host has attributes for files and folders alone, and refuses those of other nodes, and of
	// nodes that could only be opened for their status, with numbers that tell little.
	if (error == EPERM && !isFileOrFolder)
		return B_NOT_SUPPORTED;
	if (error == EBADF)
		return isFileOrFolder ? B_PERMISSION_DENIED : B_NOT_SUPPORTED;
	return status_from_errno(error);
}


status_t
BNode::SetStat(const struct stat& stat, stat_field field)
{
	if (fStatus != B_OK)
		return fStatus;

	// By way of the descriptor's link, because a descriptor for the status alone takes no changes.
	const std::string path = "/proc/self/fd/" + std::to_string(fFd);
	using BPrivate::time_change;
	switch (field) {
		case kOwnerField:
			return status_of(chown(path.c_str(), stat.st_uid, (gid_t)-1));
		case kGroupField:
			return status_of(chown(path.c_str(), (uid_t)-1, stat.st_gid));
		case kModeField:
			return status_of(chmod(path.c_str(), stat.st_mode));
		case kModificationTimeField:
			return status_of(utimensat(
				AT_FDCWD, path.c_str(), time_change::Modification(stat.st_mtime).times, 0));
		case kAccessTimeField:
			return status_of(
				utimensat(AT_FDCWD, path.c_str(), time_change::Access(stat.st_atime).times, 0));
	}
	return B_BAD_VALUE;
}


status_t
BNode::FindPath(std::string* path) const
{
	return fStatus == B_OK ? BPrivate::find_descriptor_path(fFd, path) : fStatus;
}

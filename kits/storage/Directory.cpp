// SPDX-License-Identifier: MIT
// BDirectory: a folder, its entries, and making new ones.

#include <Directory.h>

#include <string.h>
#include <unistd.h>

#include <Entry.h>
#include <Errors.h>
#include <File.h>
#include <Path.h>
#include <SymLink.h>

#include "storage/EntryResolving.h"
#include "storage/KnownNodes.h"
#include "storage/StorageStatus.h"

using BPrivate::status_from_errno;

const mode_t kNewDirectoryMode = 0777;


BDirectory::BDirectory()
	: fListing(nullptr)
{
}


BDirectory::BDirectory(const BDirectory& dir)
	: BNode(dir),
	  BEntryList(),
	  fListing(nullptr)
{
}


BDirectory::BDirectory(const entry_ref* ref)
	: fListing(nullptr)
{
	SetTo(ref);
}


BDirectory::BDirectory(const node_ref* nref)
	: fListing(nullptr)
{
	SetTo(nref);
}


BDirectory::BDirectory(const BEntry* entry)
	: fListing(nullptr)
{
	SetTo(entry);
}


BDirectory::BDirectory(const char* path)
	: fListing(nullptr)
{
	SetTo(path);
}


BDirectory::BDirectory(const BDirectory* dir, const char* path)
	: fListing(nullptr)
{
	SetTo(dir, path);
}


BDirectory::~BDirectory()
{
	CloseListing();
}


status_t
BDirectory::SetTo(const entry_ref* ref)
{
	CloseListing();
	if (ref == nullptr)
		return Adopt(B_BAD_VALUE);
	std::string path;
	const status_t status = BPrivate::find_ref_path(*ref, &path);
	return status == B_OK ? SetTo(path.c_str()) : Adopt(status);
}


status_t
BDirectory::SetTo(const node_ref* nref)
{
	CloseListing();
	if (nref == nullptr)
		return Adopt(B_BAD_VALUE);
	std::string path;
	const status_t status = BPrivate::find_node_path(nref->device, nref->node, &path);
	return status == B_OK ? SetTo(path.c_str()) : Adopt(status);
}


status_t
BDirectory::SetTo(const BEntry* entry)
{
	CloseListing();
	if (entry == nullptr)
		return Adopt(B_BAD_VALUE);
	entry_ref ref;
	const status_t status = entry->GetRef(&ref);
	return status == B_OK ? SetTo(&ref) : Adopt(status);
}


status_t
BDirectory::SetTo(const char* path)
{
	return Open(AT_FDCWD, path);
}


status_t
BDirectory::SetTo(const BDirectory* dir, const char* path)
{
	if (dir == nullptr || path == nullptr) {
		CloseListing();
		return Adopt(B_BAD_VALUE);
	}
	const int folder = dir->Dup();
	if (folder < 0) {
		CloseListing();
		return Adopt(folder);
	}
	const status_t status = Open(folder, path);
	close(folder);
	return status;
}


void
BDirectory::Unset()
{
	CloseListing();
	BNode::Unset();
}


status_t
BDirectory::GetEntry(BEntry* entry) const
{
	if (entry == nullptr)
		return B_BAD_VALUE;
	if (InitCheck() != B_OK)
		return InitCheck();
	std::string path;
	const status_t status = BPrivate::find_descriptor_path(Descriptor(), &path);
	return status == B_OK ? entry->SetTo(path.c_str()) : status;
}


bool
BDirectory::IsRootDirectory() const
{
	// The root of a volume: the folder above is on another one, or is the folder itself.
	struct stat here;
	struct stat above;
	if (GetStat(&here) != B_OK || fstatat(Descriptor(), "..", &above, 0) != 0)
		return false;
	return here.st_dev != above.st_dev || here.st_ino == above.st_ino;
}


status_t
BDirectory::FindEntry(const char* path, BEntry* entry, bool traverse) const
{
	if (entry == nullptr)
		return B_BAD_VALUE;
	entry->Unset();
	if (path == nullptr)
		return B_BAD_VALUE;

	status_t status = entry->SetTo(this, path, traverse);
	if (status == B_OK && !entry->Exists())
		status = B_ENTRY_NOT_FOUND;
	if (status != B_OK)
		entry->Unset();
	return status;
}


static bool
HasFlavor(const BEntry& entry, int32 nodeFlags)
{
	struct stat stat;
	if (entry.GetStat(&stat) != B_OK)
		return false;
	if (S_ISLNK(stat.st_mode))
		return (nodeFlags & B_SYMLINK_NODE) != 0;
	if (S_ISDIR(stat.st_mode))
		return (nodeFlags & B_DIRECTORY_NODE) != 0;
	return (nodeFlags & B_FILE_NODE) != 0;
}


bool
BDirectory::Contains(const char* path, int32 nodeFlags) const
{
	BEntry entry;
	if ((path == nullptr ? GetEntry(&entry) : FindEntry(path, &entry)) != B_OK)
		return false;
	return Contains(&entry, nodeFlags);
}


bool
BDirectory::Contains(const BEntry* entry, int32 nodeFlags) const
{
	if (entry == nullptr || !HasFlavor(*entry, nodeFlags))
		return false;
	BPath entryPath;
	std::string folder;
	if (entry->GetPath(&entryPath) != B_OK
		|| BPrivate::find_descriptor_path(Descriptor(), &folder) != B_OK)
		return false;

	if (entryPath == folder.c_str())
		return true;
	if (folder != "/")
		folder += '/';
	return strncmp(entryPath.Path(), folder.c_str(), folder.size()) == 0;
}


status_t
BDirectory::GetNextEntry(BEntry* entry, bool traverse)
{
	if (entry == nullptr)
		return B_BAD_VALUE;
	entry_ref ref;
	const status_t status = GetNextRef(&ref);
	if (status != B_OK)
		return status;

	// A link that leads nowhere must not end the walk: it stands for itself.
	if (traverse && entry->SetTo(&ref, true) == B_OK)
		return B_OK;
	return entry->SetTo(&ref);
}


status_t
BDirectory::GetNextRef(entry_ref* ref)
{
	if (ref == nullptr)
		return B_BAD_VALUE;
	const char* name;
	status_t status = NextName(&name);
	if (status != B_OK)
		return status;

	struct stat stat;
	status = GetStat(&stat);
	if (status != B_OK)
		return status;
	ref->device = stat.st_dev;
	ref->directory = stat.st_ino;
	return ref->set_name(name);
}


status_t
BDirectory::Rewind()
{
	CloseListing();
	return InitCheck();
}


int32
BDirectory::CountEntries()
{
	status_t status = Rewind();
	int32 count = 0;
	const char* name;
	while (status == B_OK) {
		status = NextName(&name);
		if (status == B_OK)
			count++;
	}
	Rewind();
	return status == B_ENTRY_NOT_FOUND ? count : status;
}


status_t
BDirectory::CreateDirectory(const char* path, BDirectory* dir)
{
	if (path == nullptr)
		return B_BAD_VALUE;
	if (InitCheck() != B_OK)
		return InitCheck();
	if (strlen(path) >= B_PATH_NAME_LENGTH)
		return B_NAME_TOO_LONG;
	if (mkdirat(Descriptor(), path, kNewDirectoryMode) != 0)
		return status_from_errno(errno);
	return dir == nullptr ? B_OK : dir->SetTo(this, path);
}


status_t
BDirectory::CreateFile(const char* path, BFile* file, bool failIfExists)
{
	if (path == nullptr)
		return B_BAD_VALUE;
	if (InitCheck() != B_OK)
		return InitCheck();
	BFile unwanted;
	BFile* created = file == nullptr ? &unwanted : file;
	return created->SetTo(this, path,
		B_READ_WRITE | B_CREATE_FILE | (failIfExists ? B_FAIL_IF_EXISTS : B_ERASE_FILE));
}


status_t
BDirectory::CreateSymLink(const char* path, const char* linkToPath, BSymLink* link)
{
	if (path == nullptr || linkToPath == nullptr)
		return B_BAD_VALUE;
	if (InitCheck() != B_OK)
		return InitCheck();
	if (strlen(path) >= B_PATH_NAME_LENGTH || strlen(linkToPath) >= B_PATH_NAME_LENGTH)
		return B_NAME_TOO_LONG;
	if (symlinkat(linkToPath, Descriptor(), path) != 0)
		return status_from_errno(errno);
	return link == nullptr ? B_OK : link->SetTo(this, path);
}


BDirectory&
BDirectory::operator=(const BDirectory& dir)
{
	if (this != &dir) {
		CloseListing();
		BNode::operator=(dir);
	}
	return *this;
}


status_t
BDirectory::Open(int folder, const char* path)
{
	CloseListing();
	if (path == nullptr)
		return Adopt(B_BAD_VALUE);
	if (strlen(path) >= B_PATH_NAME_LENGTH)
		return Adopt(B_NAME_TOO_LONG);
	const int fd = openat(folder, path, O_RDONLY | O_DIRECTORY | O_CLOEXEC);
	if (fd < 0)
		return Adopt(status_from_errno(errno));

	// Entries that are made of this folder lead back to it.
	std::string ignored;
	BPrivate::find_descriptor_path(fd, &ignored);
	return Adopt(fd);
}


status_t
BDirectory::NextName(const char** name)
{
	if (InitCheck() != B_OK)
		return InitCheck();
	if (fListing == nullptr) {
		const int fd = openat(Descriptor(), ".", O_RDONLY | O_DIRECTORY | O_CLOEXEC);
		if (fd < 0)
			return status_from_errno(errno);
		fListing = fdopendir(fd);
		if (fListing == nullptr) {
			const status_t status = status_from_errno(errno);
			close(fd);
			return status;
		}
	}

	while (true) {
		errno = 0;
		const dirent* entry = readdir(fListing);
		if (entry == nullptr)
			return errno == 0 ? B_ENTRY_NOT_FOUND : status_from_errno(errno);
		if (strcmp(entry->d_name, ".") != 0 && strcmp(entry->d_name, "..") != 0) {
			*name = entry->d_name;
			return B_OK;
		}
	}
}


void
BDirectory::CloseListing()
{
	if (fListing != nullptr)
		closedir(fListing);
	fListing = nullptr;
}


status_t
create_directory(const char* path, mode_t mode)
{
	if (path == nullptr)
		return B_BAD_VALUE;
	const std::string whole = path;
	if (whole.empty())
		return B_ENTRY_NOT_FOUND;
	if (whole.size() >= B_PATH_NAME_LENGTH)
		return B_NAME_TOO_LONG;

	size_t end = 0;
	while (end != std::string::npos) {
		end = whole.find('/', end + 1);
		const std::string level = whole.substr(0, end);
		if (mkdir(level.c_str(), mode) == 0)
			continue;
		// Where a folder is there already, hosts differ in the reason that they give.
		const status_t status = status_from_errno(errno);
		struct stat stat;
		if (::stat(level.c_str(), &stat) != 0)
			return status;
		if (!S_ISDIR(stat.st_mode))
			return B_NOT_A_DIRECTORY;
	}
	return B_OK;
}

// SPDX-License-Identifier: MIT
// entry_ref and BEntry: a place in a folder, whether or not something is there.

#include <Entry.h>

#include <stdio.h>
#include <stdlib.h>
#include <string.h>
#include <unistd.h>

#include <Directory.h>
#include <Errors.h>
#include <Path.h>

#include "storage/EntryResolving.h"
#include "storage/StatChange.h"
#include "storage/StorageStatus.h"

using BPrivate::status_from_errno;
using BPrivate::status_of;


// #pragma mark - entry_ref


entry_ref::entry_ref()
	: device((dev_t)-1),
	  directory((ino_t)-1),
	  name(nullptr)
{
}


entry_ref::entry_ref(dev_t dev, ino_t dir, const char* name)
	: device(dev),
	  directory(dir),
	  name(nullptr)
{
	set_name(name);
}


entry_ref::entry_ref(const entry_ref& ref)
	: device(ref.device),
	  directory(ref.directory),
	  name(nullptr)
{
	set_name(ref.name);
}


entry_ref::~entry_ref()
{
	free(name);
}


status_t
entry_ref::set_name(const char* newName)
{
	char* copy = nullptr;
	if (newName != nullptr) {
		copy = strdup(newName);
		if (copy == nullptr)
			return B_NO_MEMORY;
	}
	free(name);
	name = copy;
	return B_OK;
}


bool
entry_ref::operator==(const entry_ref& ref) const
{
	if (device != ref.device || directory != ref.directory)
		return false;
	if (name == nullptr || ref.name == nullptr)
		return name == ref.name;
	return strcmp(name, ref.name) == 0;
}


bool
entry_ref::operator!=(const entry_ref& ref) const
{
	return !(*this == ref);
}


entry_ref&
entry_ref::operator=(const entry_ref& ref)
{
	if (this == &ref)
		return *this;
	device = ref.device;
	directory = ref.directory;
	set_name(ref.name);
	return *this;
}


// #pragma mark - BEntry


BEntry::BEntry()
	: fStatus(B_NO_INIT)
{
}


BEntry::BEntry(const BDirectory* dir, const char* path, bool traverse)
	: fStatus(B_NO_INIT)
{
	SetTo(dir, path, traverse);
}


BEntry::BEntry(const entry_ref* ref, bool traverse)
	: fStatus(B_NO_INIT)
{
	SetTo(ref, traverse);
}


BEntry::BEntry(const char* path, bool traverse)
	: fStatus(B_NO_INIT)
{
	SetTo(path, traverse);
}


BEntry::BEntry(const BEntry& entry)
	: BStatable(entry),
	  fRef(entry.fRef),
	  fStatus(entry.fStatus)
{
}


BEntry::~BEntry() {}


status_t
BEntry::InitCheck() const
{
	return fStatus;
}


bool
BEntry::Exists() const
{
	struct stat stat;
	return GetStat(&stat) == B_OK;
}


const char*
BEntry::Name() const
{
	return fStatus == B_OK ? fRef.name : nullptr;
}


status_t
BEntry::GetStat(struct stat* stat) const
{
	if (stat == nullptr)
		return B_BAD_VALUE;
	std::string path;
	const status_t status = FindPath(&path);
	return status == B_OK ? status_of(lstat(path.c_str(), stat)) : status;
}


status_t
BEntry::SetTo(const BDirectory* dir, const char* path, bool traverse)
{
	if (dir == nullptr)
		return Fail(B_BAD_VALUE);

	BEntry self;
	status_t status = dir->GetEntry(&self);
	if (status != B_OK)
		return Fail(status);
	if (path == nullptr || path[0] == '\0') {
		*this = self;
		return fStatus;
	}
	if (path[0] == '/')
		return SetTo(path, traverse);

	std::string folder;
	status = self.FindPath(&folder);
	if (status != B_OK)
		return Fail(status);
	return SetTo(BPrivate::join_path(folder, path).c_str(), traverse);
}


status_t
BEntry::SetTo(const entry_ref* ref, bool traverse)
{
	if (ref == nullptr)
		return Fail(B_BAD_VALUE);

	std::string path;
	const status_t status = BPrivate::find_ref_path(*ref, &path);
	if (status != B_OK)
		return Fail(status);
	if (traverse || strcmp(ref->name, "..") == 0)
		return SetTo(path.c_str(), traverse);

	fRef = *ref;
	fStatus = B_OK;
	return B_OK;
}


status_t
BEntry::SetTo(const char* path, bool traverse)
{
	entry_ref ref;
	const status_t status = BPrivate::resolve_path(path, traverse, &ref);
	if (status != B_OK)
		return Fail(status);
	fRef = ref;
	fStatus = B_OK;
	return B_OK;
}


void
BEntry::Unset()
{
	Fail(B_NO_INIT);
}


status_t
BEntry::GetRef(entry_ref* ref) const
{
	if (ref == nullptr)
		return B_BAD_VALUE;
	if (fStatus == B_OK)
		*ref = fRef;
	return fStatus;
}


status_t
BEntry::GetPath(BPath* path) const
{
	return path == nullptr ? B_BAD_VALUE : path->SetTo(this);
}


status_t
BEntry::GetParent(BEntry* entry) const
{
	if (entry == nullptr)
		return B_BAD_VALUE;
	std::string path;
	const status_t status = FindPath(&path);
	if (status != B_OK)
		return status;
	if (path == "/")
		return B_ENTRY_NOT_FOUND;
	return entry->SetTo(path.substr(0, path.rfind('/') + 1).c_str());
}


status_t
BEntry::GetParent(BDirectory* dir) const
{
	if (dir == nullptr)
		return B_BAD_VALUE;
	BEntry parent;
	const status_t status = GetParent(&parent);
	return status == B_OK ? dir->SetTo(&parent) : status;
}


status_t
BEntry::GetName(char* buffer) const
{
	if (buffer == nullptr)
		return B_BAD_VALUE;
	if (fStatus == B_OK)
		strcpy(buffer, fRef.name);
	return fStatus;
}


status_t
BEntry::Rename(const char* path, bool clobber)
{
	if (path == nullptr || path[0] == '\0')
		return B_BAD_VALUE;
	std::string source;
	status_t status = FindPath(&source);
	if (status != B_OK)
		return status;

	entry_ref target;
	std::string place = path;
	if (place[0] != '/')
		place = source.substr(0, source.rfind('/') + 1) + place;
	status = BPrivate::resolve_path(place.c_str(), false, &target);
	if (status == B_OK)
		status = BPrivate::find_ref_path(target, &place);
	if (status != B_OK)
		return status;

	int result = renameat2(
		AT_FDCWD, source.c_str(), AT_FDCWD, place.c_str(), clobber ? 0 : RENAME_NOREPLACE);
	if (result != 0 && !clobber && (errno == EINVAL || errno == ENOSYS)) {
		// Not every file system can refuse to replace by itself.
		struct stat stat;
		if (lstat(place.c_str(), &stat) == 0)
			return B_FILE_EXISTS;
		result = rename(source.c_str(), place.c_str());
	}
	if (result != 0)
		return status_from_errno(errno);
	fRef = target;
	return B_OK;
}


status_t
BEntry::MoveTo(BDirectory* dir, const char* path, bool clobber)
{
	if (dir == nullptr)
		return B_BAD_VALUE;
	if (fStatus != B_OK)
		return fStatus;

	const BEntry place(dir, path == nullptr ? fRef.name : path);
	BPath placePath;
	const status_t status = place.GetPath(&placePath);
	return status == B_OK ? Rename(placePath.Path(), clobber) : status;
}


status_t
BEntry::Remove()
{
	std::string path;
	status_t status = FindPath(&path);
	if (status != B_OK)
		return status;

	status = status_of(IsDirectory() ? rmdir(path.c_str()) : unlink(path.c_str()));
	// Some file systems tell of a folder with content as of one that exists.
	return status == B_FILE_EXISTS ? B_DIRECTORY_NOT_EMPTY : status;
}


bool
BEntry::operator==(const BEntry& item) const
{
	if (fStatus != B_OK || item.fStatus != B_OK)
		return fStatus != B_OK && item.fStatus != B_OK;
	return fRef == item.fRef;
}


bool
BEntry::operator!=(const BEntry& item) const
{
	return !(*this == item);
}


BEntry&
BEntry::operator=(const BEntry& item)
{
	fRef = item.fRef;
	fStatus = item.fStatus;
	return *this;
}


status_t
BEntry::SetStat(const struct stat& stat, stat_field field)
{
	std::string path;
	const status_t status = FindPath(&path);
	if (status != B_OK)
		return status;

	using BPrivate::time_change;
	switch (field) {
		case kOwnerField:
			return status_of(lchown(path.c_str(), stat.st_uid, (gid_t)-1));
		case kGroupField:
			return status_of(lchown(path.c_str(), (uid_t)-1, stat.st_gid));
		case kModeField:
			// The host's links have no permissions, and those of the target are not meant.
			return IsSymLink() ? B_NOT_SUPPORTED : status_of(chmod(path.c_str(), stat.st_mode));
		case kModificationTimeField:
			return status_of(utimensat(AT_FDCWD, path.c_str(),
				time_change::Modification(stat.st_mtime).times, AT_SYMLINK_NOFOLLOW));
		case kAccessTimeField:
			return status_of(utimensat(AT_FDCWD, path.c_str(),
				time_change::Access(stat.st_atime).times, AT_SYMLINK_NOFOLLOW));
	}
	return B_BAD_VALUE;
}


status_t
BEntry::FindPath(std::string* path) const
{
	return fStatus == B_OK ? BPrivate::find_ref_path(fRef, path) : fStatus;
}


status_t
BEntry::Fail(status_t status)
{
	fRef = entry_ref();
	fStatus = status;
	return status;
}


// #pragma mark - functions


status_t
get_ref_for_path(const char* path, entry_ref* ref)
{
	return ref == nullptr ? B_BAD_VALUE : BPrivate::resolve_path(path, false, ref);
}


bool
operator<(const entry_ref& a, const entry_ref& b)
{
	if (a.device != b.device)
		return a.device < b.device;
	if (a.directory != b.directory)
		return a.directory < b.directory;
	if (a.name == nullptr || b.name == nullptr)
		return a.name == nullptr && b.name != nullptr;
	return strcmp(a.name, b.name) < 0;
}

// SPDX-License-Identifier: MIT
// BStatable: what entries and nodes tell about a file's status.

#include <Statable.h>

#include <Errors.h>
#include <Node.h>

#include "storage/KnownNodes.h"

const mode_t kPermissionBits = 07777;


BStatable::~BStatable() {}


bool
BStatable::IsFile() const
{
	struct stat stat;
	return GetStat(&stat) == B_OK && S_ISREG(stat.st_mode);
}


bool
BStatable::IsDirectory() const
{
	struct stat stat;
	return GetStat(&stat) == B_OK && S_ISDIR(stat.st_mode);
}


bool
BStatable::IsSymLink() const
{
	struct stat stat;
	return GetStat(&stat) == B_OK && S_ISLNK(stat.st_mode);
}


status_t
BStatable::GetNodeRef(node_ref* ref) const
{
	if (ref == nullptr)
		return B_BAD_VALUE;
	struct stat stat;
	const status_t status = GetStat(&stat);
	if (status != B_OK)
		return status;

	// The numbers alone would not lead back to the node.
	std::string path;
	if (FindPath(&path) == B_OK)
		BPrivate::remember_node(stat, path);
	*ref = node_ref(stat.st_dev, stat.st_ino);
	return B_OK;
}


status_t
BStatable::GetOwner(uid_t* owner) const
{
	struct stat stat;
	const status_t status = owner == nullptr ? B_BAD_VALUE : GetStat(&stat);
	if (status == B_OK)
		*owner = stat.st_uid;
	return status;
}


status_t
BStatable::SetOwner(uid_t owner)
{
	struct stat stat = {};
	stat.st_uid = owner;
	return SetStat(stat, kOwnerField);
}


status_t
BStatable::GetGroup(gid_t* group) const
{
	struct stat stat;
	const status_t status = group == nullptr ? B_BAD_VALUE : GetStat(&stat);
	if (status == B_OK)
		*group = stat.st_gid;
	return status;
}


status_t
BStatable::SetGroup(gid_t group)
{
	struct stat stat = {};
	stat.st_gid = group;
	return SetStat(stat, kGroupField);
}


status_t
BStatable::GetPermissions(mode_t* permissions) const
{
	struct stat stat;
	const status_t status = permissions == nullptr ? B_BAD_VALUE : GetStat(&stat);
	if (status == B_OK)
		*permissions = stat.st_mode & kPermissionBits;
	return status;
}


status_t
BStatable::SetPermissions(mode_t permissions)
{
	struct stat stat = {};
	stat.st_mode = permissions & kPermissionBits;
	return SetStat(stat, kModeField);
}


status_t
BStatable::GetSize(off_t* size) const
{
	struct stat stat;
	const status_t status = size == nullptr ? B_BAD_VALUE : GetStat(&stat);
	if (status == B_OK)
		*size = stat.st_size;
	return status;
}


status_t
BStatable::GetModificationTime(time_t* mtime) const
{
	struct stat stat;
	const status_t status = mtime == nullptr ? B_BAD_VALUE : GetStat(&stat);
	if (status == B_OK)
		*mtime = stat.st_mtime;
	return status;
}


status_t
BStatable::SetModificationTime(time_t mtime)
{
	struct stat stat = {};
	stat.st_mtime = mtime;
	return SetStat(stat, kModificationTimeField);
}


status_t
BStatable::GetCreationTime(time_t* ctime) const
{
	struct stat stat;
	const status_t status = ctime == nullptr ? B_BAD_VALUE : GetStat(&stat);
	if (status == B_OK)
		*ctime = stat.st_ctime;
	return status;
}


status_t
BStatable::SetCreationTime(time_t)
{
	struct stat stat;
	const status_t status = GetStat(&stat);
	return status == B_OK ? B_NOT_SUPPORTED : status;
}


status_t
BStatable::GetAccessTime(time_t* atime) const
{
	struct stat stat;
	const status_t status = atime == nullptr ? B_BAD_VALUE : GetStat(&stat);
	if (status == B_OK)
		*atime = stat.st_atime;
	return status;
}


status_t
BStatable::SetAccessTime(time_t atime)
{
	struct stat stat = {};
	stat.st_atime = atime;
	return SetStat(stat, kAccessTimeField);
}

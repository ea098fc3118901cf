// SPDX-License-Identifier: MIT
// BStatable: what entries and nodes tell about a file's status.

#ifndef _STATABLE_H
#define _STATABLE_H

#include <string>

#include <sys/stat.h>
#include <sys/types.h>

#include <SupportDefs.h>

struct node_ref;

/// The questions and settings that an entry and a node have in common.
///
/// Every function asks the file system anew. A failed one leaves its out parameter alone and returns
/// B_BAD_VALUE for a null pointer, else what GetStat() returned: B_NO_INIT, B_ENTRY_NOT_FOUND, ...
class BStatable {
public:
	virtual ~BStatable();

	/// Never follows a symbolic link: a link's own status is given.
	virtual status_t GetStat(struct stat* stat) const = 0;

	bool IsFile() const;
	bool IsDirectory() const;
	bool IsSymLink() const;

	status_t GetNodeRef(node_ref* ref) const;

	/// The owner of the node; the numbers of user and group.
	status_t GetOwner(uid_t* owner) const;
	status_t SetOwner(uid_t owner);
	status_t GetGroup(gid_t* group) const;
	status_t SetGroup(gid_t group);

	/// Permission bits alone, without the kind of file.
	status_t GetPermissions(mode_t* permissions) const;
	status_t SetPermissions(mode_t permissions);

	/// Bytes.
	status_t GetSize(off_t* size) const;

	/// Times are in seconds since 1970. The host keeps no time of creation that a program could
	/// set: the time of the last change of status stands in, and setting it is B_NOT_SUPPORTED.
	status_t GetModificationTime(time_t* mtime) const;
	status_t SetModificationTime(time_t mtime);
	status_t GetCreationTime(time_t* ctime) const;
	status_t SetCreationTime(time_t ctime);
	status_t GetAccessTime(time_t* atime) const;
	status_t SetAccessTime(time_t atime);

protected:
	enum stat_field {
		kOwnerField,
		kGroupField,
		kModeField,
		kModificationTimeField,
		kAccessTimeField
	};

private:
	// Sets the one field of the node to its value in the given status.
	virtual status_t SetStat(const struct stat& stat, stat_field field) = 0;
	// Where the node is, as far as it can be told.
	virtual status_t FindPath(std::string* path) const = 0;
};

#endif

// SPDX-License-Identifier: MIT
// Attributes of files: named, typed blobs.
//
// They are the host's extended attributes of the "user." name space. "BEOS:TYPE" is
// "user.mime_type", as other programs know it. The functions return -1 on failure and set errno.

#ifndef _FS_ATTR_H
#define _FS_ATTR_H

#include <dirent.h>

#include <SupportDefs.h>

struct attr_info {
	uint32 type;
	/// Bytes.
	off_t size;
};

/// The bytes read, 0 at the end. ENOENT when there is no such attribute. \a type is not looked at.
ssize_t fs_read_attr(
	int fd, const char* attribute, uint32 type, off_t pos, void* buffer, size_t readBytes);
/// The bytes written, always all. At position 0 the attribute is replaced, elsewhere it is extended
/// as needed, a gap filled with 0.
ssize_t fs_write_attr(
	int fd, const char* attribute, uint32 type, off_t pos, const void* buffer, size_t readBytes);
int fs_remove_attr(int fd, const char* attribute);
/// An attribute that another program made has the type B_XATTR_TYPE.
int fs_stat_attr(int fd, const char* attribute, struct attr_info* attrInfo);

/// A directory of attribute names for fs_read_attr_dir(); it is no other function's.
DIR* fs_open_attr_dir(const char* path);
DIR* fs_fopen_attr_dir(int fd);
int fs_close_attr_dir(DIR* dir);
/// The next entry, valid until the next call; null at the end.
struct dirent* fs_read_attr_dir(DIR* dir);
void fs_rewind_attr_dir(DIR* dir);

#endif // _FS_ATTR_H

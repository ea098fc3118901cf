// SPDX-License-Identifier: MIT
// Lengths, kinds of node and open modes of the Storage Kit.

#ifndef _STORAGE_DEFS_H
#define _STORAGE_DEFS_H

#include <fcntl.h>
#include <limits.h>
#include <sys/types.h>
#include <unistd.h>

#include <SupportDefs.h>

/// Sizes of buffers, the terminator included.
#define B_DEV_NAME_LENGTH 128
#define B_FILE_NAME_LENGTH 256
#define B_PATH_NAME_LENGTH 1024
#define B_ATTR_NAME_LENGTH 255
#define B_MIME_TYPE_LENGTH 240
/// The longest chain of symbolic links that is followed.
#define B_MAX_SYMLINKS 16

/// How to open a file: exactly one of the first three, with any of the others. They are the host's
/// own values, are never stored, and may be mixed with the host's O_... flags.
#define B_READ_ONLY O_RDONLY
#define B_WRITE_ONLY O_WRONLY
#define B_READ_WRITE O_RDWR
#define B_FAIL_IF_EXISTS O_EXCL
#define B_CREATE_FILE O_CREAT
#define B_ERASE_FILE O_TRUNC
#define B_OPEN_AT_END O_APPEND

enum node_flavor {
	B_FILE_NODE = 0x01,
	B_SYMLINK_NODE = 0x02,
	B_DIRECTORY_NODE = 0x04,
	B_ANY_NODE = 0x07
};

#endif

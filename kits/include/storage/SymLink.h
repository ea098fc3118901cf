// SPDX-License-Identifier: MIT
// BSymLink: a symbolic link.

#ifndef _SYM_LINK_H
#define _SYM_LINK_H

#include <Node.h>
#include <StorageDefs.h>

class BPath;

/// A symbolic link itself, not what it points to.
class BSymLink : public BNode {
public:
	BSymLink();
	BSymLink(const BSymLink& other);
	BSymLink(const entry_ref* ref);
	BSymLink(const BEntry* entry);
	BSymLink(const char* path);
	BSymLink(const BDirectory* dir, const char* path);
	~BSymLink() override;

	/// Copies the target's path, with a terminator where there is room. Returns the length of the
	/// whole text; B_BAD_VALUE when the node is no link.
	ssize_t ReadLink(char* buf, size_t size);
	/// The absolute path of the target, the link lying in the given folder. Returns its length.
	ssize_t MakeLinkedPath(const char* dirPath, BPath* path);
	ssize_t MakeLinkedPath(const BDirectory* dir, BPath* path);
	bool IsAbsolute();
};

#endif

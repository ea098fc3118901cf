// SPDX-License-Identifier: MIT
// node_ref and BNode: a node of the file system with its attributes.

#ifndef _NODE_H
#define _NODE_H

#include <memory>

#include <Statable.h>

class BDirectory;
class BEntry;
class BString;
struct attr_info;
struct entry_ref;

/// Names a node by its device and inode.
struct node_ref {
	node_ref();
	node_ref(dev_t device, ino_t node);
	node_ref(const node_ref& other);

	bool operator==(const node_ref& other) const;
	bool operator!=(const node_ref& other) const;
	bool operator<(const node_ref& other) const;
	node_ref& operator=(const node_ref& other);

	dev_t device;
	ino_t node;
};

/// A node (file, folder or symbolic link) opened for its status and attributes.
///
/// Holds one file descriptor from a successful SetTo() until Unset(), the next SetTo() or
/// destruction. A link is not followed. A copy shares the node but not the listing of attributes.
///
/// Attributes are extended attributes of the host in the namespace "user."; "BEOS:TYPE" is
/// "user.mime_type". Names have at most 250 bytes (B_NAME_TOO_LONG). On a file system without
/// extended attributes every attribute function gives B_NOT_SUPPORTED, as do symbolic links.
class BNode : public BStatable {
public:
	BNode();
	BNode(const entry_ref* ref);
	BNode(const BEntry* entry);
	BNode(const char* path);
	BNode(const BDirectory* dir, const char* path);
	BNode(const BNode& node);
	~BNode() override;

	/// B_OK, or why there is no node; B_NO_INIT when none was asked for.
	status_t InitCheck() const;
	status_t GetStat(struct stat* stat) const override;

	status_t SetTo(const entry_ref* ref);
	status_t SetTo(const BEntry* entry);
	status_t SetTo(const char* path);
	status_t SetTo(const BDirectory* dir, const char* path);
	void Unset();

	/// Keeps other programs that ask likewise from locking the node; B_BUSY when one has.
	status_t Lock();
	status_t Unlock();
	/// Waits until the file's content is on the disk.
	status_t Sync();

	/// Writes \a length bytes at \a offset of the attribute and gives it the type.
	///
	/// At offset 0 the attribute is replaced; elsewhere its other bytes stay, and a gap is filled
	/// with zeros. Returns \a length or an error; B_DEVICE_FULL when the file system has no room.
	ssize_t WriteAttr(
		const char* name, type_code type, off_t offset, const void* buffer, size_t length);
	/// Returns the bytes read, 0 behind the end, or an error; B_ENTRY_NOT_FOUND without such an
	/// attribute. The type is not compared.
	ssize_t ReadAttr(
		const char* name, type_code type, off_t offset, void* buffer, size_t length) const;
	status_t RemoveAttr(const char* name);
	/// Replaces an attribute \a newName.
	status_t RenameAttr(const char* oldName, const char* newName);
	status_t GetAttrInfo(const char* name, struct attr_info* info) const;
	/// \a buffer: B_ATTR_NAME_LENGTH bytes. B_ENTRY_NOT_FOUND behind the last one.
	status_t GetNextAttrName(char* buffer);
	status_t RewindAttrs();

	/// The text is stored with its terminator as B_STRING_TYPE.
	status_t WriteAttrString(const char* name, const BString* data);
	status_t ReadAttrString(const char* name, BString* result) const;

	BNode& operator=(const BNode& node);
	/// Whether both are the same node; two without a node are equal.
	bool operator==(const BNode& node) const;
	bool operator!=(const BNode& node) const;

	/// A duplicate of the descriptor, the caller's to close, or an error.
	int Dup() const;

protected:
	// Opens the path, which starts at the folder's descriptor (AT_FDCWD: the current directory).
	int OpenAt(int folder, const char* path) const;
	// Takes over an open descriptor, or the reason why there is none (a negative status).
	status_t Adopt(int fdOrError);
	int Descriptor() const { return fFd; }

private:
	struct AttributeListing;

	status_t SetStat(const struct stat& stat, stat_field field) override;
	status_t FindPath(std::string* path) const override;
	// The status for the errno that a failed attribute function left.
	status_t AttributeError() const;

	int fFd;
	status_t fStatus;
	std::unique_ptr<AttributeListing> fAttributes;
};

#endif

// SPDX-License-Identifier: MIT
// BPath: an absolute path as text.

#ifndef _PATH_H
#define _PATH_H

#include <string>

#include <Flattenable.h>

class BDirectory;
class BEntry;
struct entry_ref;

/// An absolute path.
///
/// A path is taken as text, without a look at the file system, when it is absolute and clean. It is
/// normalised (links in its folders resolved, "." and ".." taken out) when asked for, when it is
/// relative, and when it contains "//", "/./", "/../" or a trailing "/"; that needs every folder but
/// the last name to exist. A failed call unsets the path, and InitCheck() returns its status.
class BPath : public BFlattenable {
public:
	BPath();
	BPath(const BPath& path);
	BPath(const entry_ref* ref);
	BPath(const BEntry* entry);
	BPath(const char* dir, const char* leaf = NULL, bool normalize = false);
	BPath(const BDirectory* dir, const char* leaf = NULL, bool normalize = false);
	~BPath() override;

	status_t InitCheck() const;

	status_t SetTo(const entry_ref* ref);
	status_t SetTo(const BEntry* entry);
	/// B_BAD_VALUE for a null path or an absolute \a leaf; B_NAME_TOO_LONG from B_PATH_NAME_LENGTH
	/// bytes on, the terminator counted.
	status_t SetTo(const char* path, const char* leaf = NULL, bool normalize = false);
	status_t SetTo(const BDirectory* dir, const char* leaf = NULL, bool normalize = false);
	void Unset();

	/// B_BAD_VALUE for an absolute path.
	status_t Append(const char* path, bool normalize = false);

	/// Null when unset. Valid until the object changes.
	const char* Path() const;
	/// The last name, pointing into Path(); empty for "/".
	const char* Leaf() const;
	/// B_ENTRY_NOT_FOUND for "/", B_NO_INIT when unset.
	status_t GetParent(BPath* path) const;
	bool IsAbsolute() const;

	/// Paths are compared as text.
	bool operator==(const BPath& item) const;
	bool operator==(const char* path) const;
	bool operator!=(const BPath& item) const;
	bool operator!=(const char* path) const;
	BPath& operator=(const BPath& item);
	BPath& operator=(const char* path);

	/// Flattens as a reference, B_REF_TYPE.
	bool IsFixedSize() const override;
	type_code TypeCode() const override;
	ssize_t FlattenedSize() const override;
	status_t Flatten(void* buffer, ssize_t size) const override;
	bool AllowsTypeCode(type_code code) const override;
	status_t Unflatten(type_code code, const void* buffer, ssize_t size) override;

private:
	status_t Fail(status_t status);

	std::string fPath;
	status_t fStatus;
};

#endif

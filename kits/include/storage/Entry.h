// SPDX-License-Identifier: MIT
// entry_ref and BEntry: a place in a folder, whether or not something is there.

#ifndef _ENTRY_H
#define _ENTRY_H

#include <Statable.h>

class BDirectory;
class BPath;

/// Names a place: the folder (device and inode) and the leaf name, which is owned.
///
/// The kits remember the path of every folder that a reference was made of, and check it against
/// device and inode when the reference is used. A folder that was renamed inside its own folder is
/// found again; one that was moved elsewhere is not, and neither is one of which only the numbers
/// are known, unless it is the root of a volume.
struct entry_ref {
	entry_ref();
	entry_ref(dev_t dev, ino_t dir, const char* name);
	entry_ref(const entry_ref& ref);
	~entry_ref();

	/// Copies \a name; null empties it. B_NO_MEMORY, nothing changed, when it cannot be copied.
	status_t set_name(const char* name);

	bool operator==(const entry_ref& ref) const;
	bool operator!=(const entry_ref& ref) const;
	entry_ref& operator=(const entry_ref& ref);

	dev_t device;
	ino_t directory;
	char* name;
};

/// An entry of a folder. Holds no file descriptor.
class BEntry : public BStatable {
public:
	BEntry();
	/// With \a traverse a symbolic link is followed to its target, which need not exist.
	BEntry(const BDirectory* dir, const char* path, bool traverse = false);
	BEntry(const entry_ref* ref, bool traverse = false);
	BEntry(const char* path, bool traverse = false);
	BEntry(const BEntry& entry);
	~BEntry() override;

	/// B_OK when the entry's folder exists, even if the entry itself does not; B_NO_INIT when unset.
	status_t InitCheck() const;
	bool Exists() const;
	/// The leaf name, or null when unset. Valid until the object changes.
	const char* Name() const;

	status_t GetStat(struct stat* stat) const override;

	/// Relative paths start at \a dir, or at the current directory. Fails with B_ENTRY_NOT_FOUND,
	/// B_NOT_A_DIRECTORY, B_NAME_TOO_LONG, B_LINK_LIMIT, B_PERMISSION_DENIED or B_BAD_VALUE; the
	/// object is then unset and keeps that status.
	status_t SetTo(const BDirectory* dir, const char* path, bool traverse = false);
	status_t SetTo(const entry_ref* ref, bool traverse = false);
	status_t SetTo(const char* path, bool traverse = false);
	void Unset();

	status_t GetRef(entry_ref* ref) const;
	/// The absolute path. B_ENTRY_NOT_FOUND when the folder has vanished.
	status_t GetPath(BPath* path) const;
	/// B_ENTRY_NOT_FOUND for the root.
	status_t GetParent(BEntry* entry) const;
	status_t GetParent(BDirectory* dir) const;
	/// \a buffer: B_FILE_NAME_LENGTH bytes.
	status_t GetName(char* buffer) const;

	/// Renames inside the folder, or to an absolute path on the same volume. B_FILE_EXISTS when
	/// \a path is taken and \a clobber is false. The object then stands for the new place.
	status_t Rename(const char* path, bool clobber = false);
	/// Moves to \a dir, under the present name when \a path is null.
	status_t MoveTo(BDirectory* dir, const char* path = NULL, bool clobber = false);
	/// Deletes a file, a link or an empty folder (else B_DIRECTORY_NOT_EMPTY).
	status_t Remove();

	bool operator==(const BEntry& item) const;
	bool operator!=(const BEntry& item) const;
	BEntry& operator=(const BEntry& item);

private:
	status_t SetStat(const struct stat& stat, stat_field field) override;
	status_t FindPath(std::string* path) const override;
	status_t Fail(status_t status);

	entry_ref fRef;
	status_t fStatus;
};

/// The reference of \a path. B_OK when its folder exists, also for a missing leaf.
status_t get_ref_for_path(const char* path, entry_ref* ref);
/// By device, then folder, then name.
bool operator<(const entry_ref& a, const entry_ref& b);

#endif

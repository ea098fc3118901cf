// SPDX-License-Identifier: MIT
// BDirectory: a folder, its entries, and making new ones.

#ifndef _DIRECTORY_H
#define _DIRECTORY_H

#include <dirent.h>

#include <EntryList.h>
#include <Node.h>
#include <StorageDefs.h>

class BFile;
class BSymLink;

/// A folder. Holds its file descriptor, and a second one while its entries are walked.
class BDirectory : public BNode, public BEntryList {
public:
	BDirectory();
	BDirectory(const BDirectory& dir);
	BDirectory(const entry_ref* ref);
	BDirectory(const node_ref* nref);
	BDirectory(const BEntry* entry);
	BDirectory(const char* path);
	BDirectory(const BDirectory* dir, const char* path);
	~BDirectory() override;

	/// A symbolic link to a folder is followed. B_NOT_A_DIRECTORY for anything else.
	status_t SetTo(const entry_ref* ref);
	status_t SetTo(const node_ref* nref);
	status_t SetTo(const BEntry* entry);
	status_t SetTo(const char* path);
	status_t SetTo(const BDirectory* dir, const char* path);
	void Unset();

	/// The entry of the folder itself.
	status_t GetEntry(BEntry* entry) const;
	bool IsRootDirectory() const;
	/// The entry of an existing \a path, which starts here unless it is absolute. On failure the
	/// entry is unset. B_ENTRY_NOT_FOUND when nothing is there.
	status_t FindEntry(const char* path, BEntry* entry, bool traverse = false) const;
	/// Whether the entry exists anywhere below this folder and is of one of the kinds. A null path
	/// stands for the folder itself.
	bool Contains(const char* path, int32 nodeFlags = B_ANY_NODE) const;
	bool Contains(const BEntry* entry, int32 nodeFlags = B_ANY_NODE) const;

	/// "." and ".." are left out; the order is the file system's. A link that cannot be followed
	/// stands for itself.
	status_t GetNextEntry(BEntry* entry, bool traverse = false) override;
	status_t GetNextRef(entry_ref* ref) override;
	status_t Rewind() override;
	int32 CountEntries() override;

	/// Makes one level, mode 0777 less the umask. \a dir may be null.
	status_t CreateDirectory(const char* path, BDirectory* dir);
	/// Truncates a file that is there unless \a failIfExists. \a file may be null.
	status_t CreateFile(const char* path, BFile* file, bool failIfExists = false);
	/// \a link may be null.
	status_t CreateSymLink(const char* path, const char* linkToPath, BSymLink* link);

	BDirectory& operator=(const BDirectory& dir);

private:
	status_t Open(int folder, const char* path);
	status_t NextName(const char** name);
	void CloseListing();

	DIR* fListing;
};

/// Makes all missing levels of \a path. B_OK when it is there already; B_NOT_A_DIRECTORY when a
/// file is in the way.
status_t create_directory(const char* path, mode_t mode);

#endif

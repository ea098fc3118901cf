// SPDX-License-Identifier: MIT
// Writing a file so that it is never found half-written.

#pragma once

#include <File.h>
#include <String.h>

/// Whether Replace() waits until the new content is on the disk.
enum replacement_sync {
	REPLACE_SYNCED, // for documents: a power failure, too, finds the old content or the new one
	REPLACE_UNSYNCED // for files that can be made again: leaves the order of writing to the file system
};

/// What the names of files begin with that are about to take another one's place.
extern const char* const kReplacementPrefix;

/// The next content of a file: written beside the present one, and put in its place in one step.
///
/// Whoever reads the path meanwhile, or after a crash, finds the old content or the new one, whole.
/// A link is followed: the file that it leads to is replaced. Something that is no regular file (a
/// device, for instance) has no content to lose and is written directly. Not thread-safe.
///
/// The new file is locked (BNode::Lock()) as long as it is being written. One that nobody has locked was left
/// behind by a program that was killed, and goes when the next file in its folder is written.
class TReplacementFile {
public:
	/// Makes the new file beside \a path. Nothing that exists is touched before Replace().
	explicit TReplacementFile(const char* path, replacement_sync sync = REPLACE_SYNCED);
	/// Without a successful Replace() the new file is removed again.
	~TReplacementFile();

	TReplacementFile(const TReplacementFile&) = delete;
	TReplacementFile& operator=(const TReplacementFile&) = delete;

	/// B_OK, or why the path cannot be written: its folder is missing, it may not be written, ...
	status_t InitCheck() const { return fStatus; }

	/// Where the new content goes. Owned by this object; valid when InitCheck() is B_OK.
	BFile* Stream() { return &fNewFile; }

	/// Appends what the present file has beyond the length written so far; B_OK when it has none.
	status_t KeepTail();

	/// Finishes: the new file takes over the present one's attributes and permissions and its name.
	///
	/// Attributes already set on Stream() win over those of the present file. On failure the present
	/// file is as it was. B_DEVICE_FULL and the like tell why.
	status_t Replace();

private:
	status_t OpenBeside(const char* path);
	status_t MakeNewFile(const char* folder);
	bool IsNewFileInPlace() const;
	void TakeOverAttributes(BFile& present);

	BString fPath;
	BString fNewPath; // empty when the path is written directly
	BFile fNewFile;
	const replacement_sync fSync;
	status_t fStatus;
};

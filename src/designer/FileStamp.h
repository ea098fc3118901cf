// SPDX-License-Identifier: MIT
// Telling whether somebody else has changed a file.

#pragma once

#include <SupportDefs.h>

class BFile;

/// What a file held at some time: its size and a fingerprint of its bytes.
///
/// The content decides, not the time of a change: a file that was copied back, or written again with the same
/// content, is no other one, and two changes within the clock's resolution are two.
class TFileStamp {
public:
	/// Of no file.
	TFileStamp();
	TFileStamp(off_t size, uint64 fingerprint);

	/// Takes the stamp of an open file, from its first byte to its last; on failure it is of no file.
	void Take(BFile* file);

	bool IsTaken() const { return fSize >= 0; }
	off_t Size() const { return fSize; }
	uint64 Fingerprint() const { return fFingerprint; }

	/// Whether the file at \a path has another content than this one. A file that is gone, or cannot be read, has
	/// none; nothing differs from the stamp of no file.
	bool Differs(const char* path) const;

private:
	off_t fSize; // negative: of no file
	uint64 fFingerprint;
};

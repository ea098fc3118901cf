// SPDX-License-Identifier: MIT

#include "designer/FileStamp.h"

#include <vector>

#include <File.h>

namespace {

constexpr size_t kBlockSize = 64 * 1024;

// FNV-1a of 64 bits.
constexpr uint64 kFirstFingerprint = 0xcbf29ce484222325ULL;
constexpr uint64 kPrime = 0x100000001b3ULL;

} // namespace

TFileStamp::TFileStamp()
	: TFileStamp(-1, 0)
{
}


TFileStamp::TFileStamp(off_t size, uint64 fingerprint)
	: fSize(size),
	  fFingerprint(fingerprint)
{
}


void
TFileStamp::Take(BFile* file)
{
	std::vector<uint8> block(kBlockSize);
	off_t size = 0;
	uint64 fingerprint = kFirstFingerprint;
	ssize_t length;
	do {
		length = file->ReadAt(size, block.data(), block.size());
		for (ssize_t i = 0; i < length; i++)
			fingerprint = (fingerprint ^ block[i]) * kPrime;
		size += length;
	} while (length > 0);
	*this = length == 0 ? TFileStamp(size, fingerprint) : TFileStamp();
}


bool
TFileStamp::Differs(const char* path) const
{
	if (!IsTaken())
		return false;
	BFile file(path, B_READ_ONLY);
	// Something else than a file may have no end.
	if (file.InitCheck() != B_OK || !file.IsFile())
		return false;
	TFileStamp present;
	present.Take(&file);
	return present.IsTaken() && (present.fSize != fSize || present.fFingerprint != fFingerprint);
}

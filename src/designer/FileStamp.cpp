// SPDX-License-Identifier: MIT

#include "designer/FileStamp.h"

#include <bit>
#include <cstring>
#include <vector>

#include <ByteOrder.h>
#include <File.h>

namespace {

constexpr size_t kBlockSize = 64 * 1024;

constexpr uint64 kFirstFingerprint = 0xcbf29ce484222325ULL;
constexpr uint64 kPrime = 0x9e3779b185ebca87ULL;

/// The fingerprint of bytes that come block by block.
///
/// Four sums take the words of eight bytes in turn, so that the processor can work on all of them at once: a large
/// document is read for it each time that it is opened.
class ContentSum {
public:
	/// All blocks but the last one are multiples of kStride.
	void Add(const uint8* bytes, size_t length)
	{
		for (; length >= kStride; bytes += kStride, length -= kStride)
			AddStride(bytes);
		if (length == 0)
			return;
		uint8 rest[kStride] = {};
		memcpy(rest, bytes, length);
		AddStride(rest);
	}

	/// \a size: of all the bytes, so that zeros at the end count.
	uint64 Result(off_t size) const
	{
		uint64 result = Step(kFirstFingerprint, static_cast<uint64>(size));
		for (uint64 sum : fSums)
			result = Step(result, sum);
		return result ^ (result >> 32);
	}

	static constexpr size_t kStride = 32;

private:
	static uint64 Step(uint64 sum, uint64 word) { return std::rotl((sum ^ word) * kPrime, 31); }

	void AddStride(const uint8* bytes)
	{
		for (size_t i = 0; i < 4; i++) {
			uint64 word;
			memcpy(&word, bytes + i * sizeof(word), sizeof(word));
			fSums[i] = Step(fSums[i], B_LENDIAN_TO_HOST_INT64(word));
		}
	}

	uint64 fSums[4] = {1, 2, 3, 4};
};


/// Reads up to a whole block. Returns the bytes read, fewer at the end of the file only, or an error.
ssize_t
ReadBlock(BFile* file, off_t position, std::vector<uint8>* block)
{
	size_t length = 0;
	while (length < block->size()) {
		const ssize_t read =
			file->ReadAt(position + length, block->data() + length, block->size() - length);
		if (read < 0)
			return read;
		if (read == 0)
			break;
		length += read;
	}
	return length;
}

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
	static_assert(kBlockSize % ContentSum::kStride == 0);
	ContentSum sum;
	off_t size = 0;
	ssize_t length;
	do {
		length = ReadBlock(file, size, &block);
		if (length < 0) {
			*this = TFileStamp();
			return;
		}
		sum.Add(block.data(), length);
		size += length;
	} while (static_cast<size_t>(length) == block.size());
	*this = TFileStamp(size, sum.Result(size));
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

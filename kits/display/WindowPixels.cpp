// SPDX-License-Identifier: MIT
// The memory of a window's picture: as its thread draws it, and as it was last finished.
#include "display/WindowPixels.h"

#include <algorithm>

#if defined(__linux__)
#include <sys/mman.h>
#include <unistd.h>
#endif

namespace BPrivate {

namespace {

const uint32 kWhite = 0xffffffff;
// Smaller pictures are not worth the calls to the system.
const size_t kLeastShared = 64 * 1024;

} // namespace


WindowPixels::WindowPixels(size_t count)
	: fCount(count),
	  fFile(-1),
	  fDrawn(nullptr),
	  fFinished(nullptr),
	  fIsBegun(false)
{
	if (count >= kLeastShared && Share())
		return;
	fOwnDrawn.reset(new uint32[count]);
	fDrawn = fOwnDrawn.get();
	std::fill_n(fDrawn, count, kWhite);
}


uint32*
WindowPixels::Finished()
{
	// Many canvases are never shown.
	if (fFinished == nullptr) {
		fOwnFinished.reset(new uint32[fCount]);
		fFinished = fOwnFinished.get();
		std::fill_n(fFinished, fCount, kWhite);
	}
	return fFinished;
}


void
WindowPixels::BeginDrawing()
{
	std::lock_guard<std::mutex> lock(fMutex);
	fIsBegun = true;
}


void
WindowPixels::End()
{
	std::lock_guard<std::mutex> lock(fMutex);
	fIsBegun = false;
}

#if defined(__linux__)

WindowPixels::~WindowPixels()
{
	if (fOwnDrawn != nullptr)
		return;
	munmap(fDrawn, fCount * sizeof(uint32));
	munmap(fFinished, fCount * sizeof(uint32));
	close(fFile);
}


// A file in memory, mapped twice. The drawn picture's mapping is private: the system copies a page of the finished one
// when it is first written to.
bool
WindowPixels::Share()
{
	const size_t bytes = fCount * sizeof(uint32);
	int file = memfd_create("window", MFD_CLOEXEC);
	if (file < 0)
		return false;
	void* finished = MAP_FAILED;
	void* drawn = MAP_FAILED;
	if (ftruncate(file, static_cast<off_t>(bytes)) == 0) {
		finished = mmap(nullptr, bytes, PROT_READ | PROT_WRITE, MAP_SHARED, file, 0);
		drawn = mmap(nullptr, bytes, PROT_READ | PROT_WRITE, MAP_PRIVATE, file, 0);
	}
	if (finished == MAP_FAILED || drawn == MAP_FAILED) {
		close(file);
		if (finished != MAP_FAILED)
			munmap(finished, bytes);
		if (drawn != MAP_FAILED)
			munmap(drawn, bytes);
		return false;
	}
	fFile = file;
	fFinished = static_cast<uint32*>(finished);
	fDrawn = static_cast<uint32*>(drawn);
	std::fill_n(fFinished, fCount, kWhite);
	return true;
}


void
WindowPixels::Rest()
{
	if (fOwnDrawn != nullptr)
		return;
	std::lock_guard<std::mutex> lock(fMutex);
	if (!fIsBegun)
		madvise(fDrawn, fCount * sizeof(uint32), MADV_DONTNEED);
}

#else

WindowPixels::~WindowPixels() = default;


bool
WindowPixels::Share()
{
	return false;
}


void
WindowPixels::Rest()
{
}

#endif

} // namespace BPrivate

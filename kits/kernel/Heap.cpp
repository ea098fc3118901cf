// SPDX-License-Identifier: MIT
// How the C library's heap grows on this host.

#include "kernel/Heap.h"

#include <stdlib.h>

#if defined(__GLIBC__) && defined(__linux__)

#include <malloc.h>
#include <stdint.h>
#include <sys/mman.h>
#include <unistd.h>

#include <mutex>

namespace {

constexpr int kMegabyte = 1024 * 1024;

/// This much address space is set aside for the heap at once. Memory is taken as it is touched.
constexpr int kReservedSize = 128 * kMegabyte;

/// Free memory at the end of the heap goes back to the host from this size on.
constexpr int kTrimThreshold = 2 * kReservedSize;

/// Single blocks from this size on get a mapping of their own.
constexpr int kMappingThreshold = 4 * kMegabyte;

constexpr int kGrowth = kMegabyte;

constexpr uintptr_t kLargePage = 2 * kMegabyte;


void
ReserveHeap()
{
	mallopt(M_TRIM_THRESHOLD, kTrimThreshold);
	mallopt(M_MMAP_THRESHOLD, kMappingThreshold);

	// A block that does not fit yet makes the heap grow. When so much cannot be had, it grows as it is needed.
	const uintptr_t oldEnd = reinterpret_cast<uintptr_t>(sbrk(0));
	mallopt(M_TOP_PAD, kReservedSize);
	void* volatile block = malloc(kMegabyte);
	free(block);
	mallopt(M_TOP_PAD, kGrowth);

	// Loading a form touches new memory all the time, which costs a lot in small pages.
	const uintptr_t end = reinterpret_cast<uintptr_t>(sbrk(0)) & ~(kLargePage - 1);
	const uintptr_t start = (oldEnd + kLargePage - 1) & ~(kLargePage - 1);
	if (start < end)
		madvise(reinterpret_cast<void*>(start), end - start, MADV_HUGEPAGE);
}

} // namespace


void
BPrivate::PrepareHeap()
{
	static std::once_flag sOnce;
	std::call_once(sOnce, ReserveHeap);
}

#else


void
BPrivate::PrepareHeap()
{
}

#endif

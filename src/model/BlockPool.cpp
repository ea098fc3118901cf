// SPDX-License-Identifier: MIT
// The memory of the small objects that components consist of.

#include "model/BlockPool.h"

#include <atomic>
#include <functional>
#include <mutex>
#include <new>
#include <thread>

// The sanitizers watch the heap, so under them all blocks are the heap's. Clang has its own way to tell.
#if defined(__SANITIZE_ADDRESS__) || defined(__SANITIZE_THREAD__)
#define BLOCKS_ARE_WATCHED 1
#elif defined(__has_feature)
#if __has_feature(address_sanitizer) || __has_feature(thread_sanitizer)
#define BLOCKS_ARE_WATCHED 1
#endif
#endif

#ifdef BLOCKS_ARE_WATCHED
// Of the sanitizers' allocator, whose header not every compiler brings along.
extern "C" int __sanitizer_get_ownership(const volatile void* block);
#endif

namespace {

constexpr size_t kUnit = 16;

/// Larger blocks come from the heap.
constexpr size_t kLargestUnits = 16;

constexpr size_t kChunkSize = 64 * 1024;

/// What lies before a block, at the end of a unit, so that the block is aligned as the units are.
struct BlockHeader {
	size_t units; // 0: the block is the heap's
};

/// What lies at the beginning of a chunk, in its first unit.
struct ChunkHeader {
	ChunkHeader* previous;
};
static_assert(sizeof(ChunkHeader) <= kUnit - sizeof(BlockHeader));

struct FreeBlock {
	FreeBlock* next;
};

/// A lock that is held for a few instructions only, so that asking the system for it would take longer.
class ShortLock {
public:
	void lock()
	{
		while (fTaken.test_and_set(std::memory_order_acquire))
			std::this_thread::yield();
	}
	void unlock() { fTaken.clear(std::memory_order_release); }

private:
	std::atomic_flag fTaken = ATOMIC_FLAG_INIT;
};

// All of it without constructors and destructors that run: static objects allocate, too. Under the
// sanitizers it lies idle.
ShortLock sLock;
[[maybe_unused]] FreeBlock* sFree[kLargestUnits + 1];
[[maybe_unused]] ChunkHeader* sLastChunk = nullptr;
char* sChunk = nullptr;
char* sChunkEnd = nullptr;


BlockHeader*
HeaderOf(void* block)
{
	return static_cast<BlockHeader*>(block) - 1;
}


/// Cuts a new block from the chunk. What is left of a chunk that is too small for it is given up.
[[maybe_unused]] void*
CutBlock(size_t units)
{
	const size_t size = units * kUnit;
	if (static_cast<size_t>(sChunkEnd - sChunk) < size) {
		ChunkHeader* chunk = static_cast<ChunkHeader*>(::operator new(kChunkSize));
		chunk->previous = sLastChunk;
		sLastChunk = chunk;
		sChunk = reinterpret_cast<char*>(chunk) + kUnit;
		sChunkEnd = reinterpret_cast<char*>(chunk) + kChunkSize;
	}
	void* block = sChunk;
	sChunk += size;
	HeaderOf(block)->units = units;
	return block;
}

} // namespace


void*
TBlockPool::Allocate(size_t size)
{
#ifdef BLOCKS_ARE_WATCHED
	return ::operator new(size);
#else
	const size_t units = (size + sizeof(BlockHeader) + kUnit - 1) / kUnit;
	if (units > kLargestUnits) {
		char* block = static_cast<char*>(::operator new(size + kUnit)) + kUnit;
		HeaderOf(block)->units = 0;
		return block;
	}

	const std::lock_guard<ShortLock> lock(sLock);
	FreeBlock* block = sFree[units];
	if (block == nullptr)
		return CutBlock(units);
	sFree[units] = block->next;
	return block;
#endif
}


bool
TBlockPool::Owns(const void* block)
{
#ifdef BLOCKS_ARE_WATCHED
	return __sanitizer_get_ownership(block) != 0;
#else
	const std::less<const void*> isBefore;
	const std::lock_guard<ShortLock> lock(sLock);
	for (const ChunkHeader* chunk = sLastChunk; chunk != nullptr; chunk = chunk->previous) {
		if (!isBefore(block, chunk)
			&& isBefore(block, reinterpret_cast<const char*>(chunk) + kChunkSize))
			return true;
	}
	return false;
#endif
}


void
TBlockPool::Free(void* block)
{
#ifdef BLOCKS_ARE_WATCHED
	::operator delete(block);
#else
	if (block == nullptr)
		return;
	const size_t units = HeaderOf(block)->units;
	if (units == 0) {
		::operator delete(static_cast<char*>(block) - kUnit);
		return;
	}

	const std::lock_guard<ShortLock> lock(sLock);
	FreeBlock* freed = static_cast<FreeBlock*>(block);
	freed->next = sFree[units];
	sFree[units] = freed;
#endif
}

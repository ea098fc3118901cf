// SPDX-License-Identifier: MIT

#include <cstdint>
#include <cstring>
#include <thread>
#include <vector>

#include <gtest/gtest.h>

#include "model/BlockPool.h"

namespace {

/// A block that is filled to its end.
struct filled_block {
	unsigned char* bytes;
	size_t size;
	unsigned char fill;
};


filled_block
Fill(size_t size, unsigned char fill)
{
	filled_block block = {static_cast<unsigned char*>(TBlockPool::Allocate(size)), size, fill};
	memset(block.bytes, fill, size);
	return block;
}


bool
IsUntouched(const filled_block& block)
{
	for (size_t i = 0; i < block.size; i++) {
		if (block.bytes[i] != block.fill)
			return false;
	}
	return true;
}


/// Allocates blocks of all sizes, frees some in between, and says whether each kept its content.
bool
KeepsBlocks(unsigned seed)
{
	bool sound = true;
	std::vector<filled_block> blocks;
	for (unsigned i = 0; i < 20000; i++) {
		seed = seed * 1103515245 + 12345;
		if (blocks.size() < 500 || (seed >> 16) % 2 == 0) {
			blocks.push_back(Fill((seed >> 8) % 400, static_cast<unsigned char>(i)));
			continue;
		}
		filled_block& chosen = blocks[(seed >> 16) % blocks.size()];
		sound = sound && IsUntouched(chosen);
		TBlockPool::Free(chosen.bytes);
		chosen = blocks.back();
		blocks.pop_back();
	}
	for (const filled_block& block : blocks) {
		sound = sound && IsUntouched(block);
		TBlockPool::Free(block.bytes);
	}
	return sound;
}

} // namespace

TEST(BlockPoolTest, BlocksOfEverySizeAreAlignedForEverything)
{
	for (size_t size = 0; size < 1000; size++) {
		const filled_block block = Fill(size, 0xa5);
		EXPECT_EQ(reinterpret_cast<uintptr_t>(block.bytes) % alignof(std::max_align_t), 0u) << size;
		TBlockPool::Free(block.bytes);
	}
}


TEST(BlockPoolTest, BlocksDoNotOverlap)
{
	EXPECT_TRUE(KeepsBlocks(1));
}


TEST(BlockPoolTest, FreeingNothingIsHarmless)
{
	TBlockPool::Free(nullptr);
	TBlockPool::Free(TBlockPool::Allocate(1));
}


TEST(BlockPoolTest, ThreadsGetBlocksOfTheirOwn)
{
	bool isSound[4] = {};
	std::vector<std::thread> threads;
	for (unsigned i = 0; i < 4; i++)
		threads.emplace_back([&isSound, i] { isSound[i] = KeepsBlocks(i); });
	for (std::thread& thread : threads)
		thread.join();
	for (unsigned i = 0; i < 4; i++)
		EXPECT_TRUE(isSound[i]) << "thread " << i;
}

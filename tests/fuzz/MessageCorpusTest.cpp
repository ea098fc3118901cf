// SPDX-License-Identifier: MIT
// The inputs that fuzzing found worth keeping, and the samples, checked with the sanitizers on.

#include <algorithm>
#include <cstdio>
#include <filesystem>
#include <fstream>
#include <iterator>
#include <string>
#include <vector>

#include <gtest/gtest.h>

#include "fuzz/MessageChecks.h"

/// Checks every file of a folder, and returns how many there were.
static int
CheckFolder(const std::string& folder)
{
	std::vector<std::filesystem::path> paths;
	for (const auto& entry : std::filesystem::directory_iterator(folder))
		paths.push_back(entry.path());
	std::sort(paths.begin(), paths.end());

	for (const auto& path : paths) {
		// A failed check ends the program; then this line says where.
		printf("%s\n", path.c_str());
		fflush(stdout);
		std::ifstream file(path, std::ios::binary);
		const std::string content{std::istreambuf_iterator<char>(file), {}};
		// Exactly these bytes on the heap.
		const std::vector<uint8_t> bytes(content.begin(), content.end());
		CheckMessageBytes(bytes.data(), bytes.size());
	}
	return int(paths.size());
}


TEST(MessageCorpusTest, EveryInputHoldsWhatMustHold)
{
	EXPECT_GT(CheckFolder(TEST_DATA_DIR "/corpus/message"), 50);
}


TEST(MessageCorpusTest, EverySampleHoldsWhatMustHold)
{
	EXPECT_GT(CheckFolder(PLIM_SOURCE_DIR "/tests/kits/app/samples"), 16);
}

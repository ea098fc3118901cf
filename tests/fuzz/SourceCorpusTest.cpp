// SPDX-License-Identifier: MIT
// The edited sources that fuzzing found worth keeping.

#include <filesystem>
#include <fstream>
#include <iterator>
#include <vector>

#include <gtest/gtest.h>

#include "fuzz/SourceChecks.h"
#include "support/CapturedOutput.h"

TEST(SourceCorpusTest, EveryKeptInputHoldsWhatMustHold)
{
	CapturedOutput output;
	int count = 0;
	for (const auto& entry : std::filesystem::directory_iterator(TEST_DATA_DIR "/corpus/source")) {
		// A failed check ends the program; then this line says where.
		fprintf(stderr, "%s\n", entry.path().c_str());
		std::ifstream file(entry.path(), std::ios::binary);
		const std::vector<uint8_t> bytes(std::istreambuf_iterator<char>(file), {});
		CheckSourceBytes(bytes.data(), bytes.size());
		count++;
	}
	EXPECT_GT(count, 5);
}

// SPDX-License-Identifier: MIT
// The inputs that fuzzing found worth keeping: texts of properties and whole projects.

#include <filesystem>
#include <fstream>
#include <iterator>
#include <string>
#include <vector>

#include <gtest/gtest.h>

#include "fuzz/FormChecks.h"
#include "fuzz/TextChecks.h"
#include "support/CapturedOutput.h"

namespace {

class TextCorpusTest : public testing::Test {
protected:
	static void SetUpTestSuite()
	{
		CapturedOutput output;
		PrepareFormChecks(PLIM_BUILD_DIR "/bin/Components");
	}

	/// Checks every kept input, and returns how many there are.
	template <typename Check>
	static int ForEach(const char* corpus, Check check)
	{
		CapturedOutput output;
		int count = 0;
		for (const auto& entry :
			std::filesystem::directory_iterator(TEST_DATA_DIR "/corpus/" + std::string(corpus))) {
			// A failed check ends the program; then this line says where.
			fprintf(stderr, "%s\n", entry.path().c_str());
			std::ifstream file(entry.path(), std::ios::binary);
			const std::vector<uint8_t> bytes(std::istreambuf_iterator<char>(file), {});
			check(bytes.data(), bytes.size());
			count++;
		}
		return count;
	}
};

} // namespace


TEST_F(TextCorpusTest, EveryKeptTextHoldsWhatMustHold)
{
	EXPECT_GT(ForEach("text", CheckPropertyText), 5);
}


TEST_F(TextCorpusTest, EveryKeptProjectHoldsWhatMustHold)
{
	int loaded = 0;
	EXPECT_GT(ForEach("project",
				  [&loaded](const uint8_t* bytes, size_t size) {
					  loaded += CheckWholeProject(bytes, size) ? 1 : 0;
				  }),
		5);
	EXPECT_GT(loaded, 0);
}

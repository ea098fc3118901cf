// SPDX-License-Identifier: MIT
// Damaged form and project files: the inputs that fuzzing found worth keeping, and the example's
// documents cut off everywhere and with single bytes changed.

#include <algorithm>
#include <filesystem>
#include <fstream>
#include <iterator>
#include <string>
#include <vector>

#include <gtest/gtest.h>

#include "fuzz/FormChecks.h"
#include "support/CapturedOutput.h"
#include "support/TemporaryFolder.h"

namespace {

typedef bool (*check_function)(const uint8_t*, size_t);

std::string
Read(const std::filesystem::path& path)
{
	std::ifstream file(path, std::ios::binary);
	return std::string(std::istreambuf_iterator<char>(file), {});
}


/// Checks exactly these bytes, on the heap.
bool
Check(check_function check, const std::string& content, size_t size)
{
	const std::vector<uint8_t> bytes(content.begin(), content.begin() + size);
	return check(bytes.data(), bytes.size());
}


struct document {
	const char* name;
	check_function check;
	size_t step; // between the places that are damaged, in bytes
};

const document kDocuments[] = {
	{"MainForm.frm", CheckFormBytes, 97},
	{"NoteForm.frm", CheckFormBytes, 41},
	{"hello.plim", CheckProjectBytes, 3},
};


class FormCorpusTest : public testing::Test {
protected:
	static void SetUpTestSuite()
	{
		CapturedOutput output;
		PrepareFormChecks(PLIM_BUILD_DIR "/bin/Components");
	}

	static std::string Content(const document& document)
	{
		return Read(std::string(PLIM_SOURCE_DIR "/examples/hello/") + document.name);
	}

	/// Those of \a sizes that the document loads with when it is cut off there.
	static std::vector<size_t> LoadedSizes(
		const document& document, const std::string& content, const std::vector<size_t>& sizes)
	{
		CapturedOutput output;
		std::vector<size_t> loaded;
		for (size_t size : sizes) {
			if (Check(document.check, content, size))
				loaded.push_back(size);
		}
		return loaded;
	}
};

} // namespace


TEST_F(FormCorpusTest, EveryKeptInputHoldsWhatMustHold)
{
	int count = 0;
	int loaded = 0;
	{
		CapturedOutput output;
		for (const auto& entry :
			std::filesystem::directory_iterator(TEST_DATA_DIR "/corpus/form")) {
			// A failed check ends the program; then this line says where.
			fprintf(stderr, "%s\n", entry.path().c_str());
			const std::string content = Read(entry.path());
			count++;
			loaded += Check(CheckFormBytes, content, content.size());
			loaded += Check(CheckProjectBytes, content, content.size());
		}
	}
	EXPECT_GT(count, 20);
	EXPECT_GT(loaded, 10);
}


TEST_F(FormCorpusTest, WholeDocumentsLoad)
{
	for (const document& document : kDocuments) {
		const std::string content = Content(document);
		ASSERT_GT(content.size(), 500u) << document.name;
		EXPECT_EQ(LoadedSizes(document, content, {content.size()}).size(), 1u) << document.name;
	}
}


TEST_F(FormCorpusTest, TruncatedDocumentsDoNotLoad)
{
	for (const document& document : kDocuments) {
		const std::string content = Content(document);
		std::vector<size_t> sizes;
		for (size_t size = 0; size < content.size(); size += document.step)
			sizes.push_back(size);
		sizes.push_back(content.size() - 1);
		EXPECT_EQ(LoadedSizes(document, content, sizes), std::vector<size_t>()) << document.name;
	}
}


TEST_F(FormCorpusTest, DocumentsWithAChangedByteLoadOrAreRefused)
{
	for (const document& document : kDocuments) {
		std::string content = Content(document);
		size_t loaded = 0;
		size_t refused = 0;
		{
			CapturedOutput output;
			for (size_t place = 0; place < content.size(); place += document.step) {
				const char byte = content[place];
				// Over the places, every bit, and the largest value.
				for (int value : {byte ^ (1 << place % 8), 0xff}) {
					content[place] = static_cast<char>(value);
					if (Check(document.check, content, content.size()))
						loaded++;
					else
						refused++;
				}
				content[place] = byte;
			}
		}
		// Changed text loads, a changed size or count does not.
		EXPECT_GT(loaded, 10u) << document.name;
		EXPECT_GT(refused, 0u) << document.name;
		printf("%s: %zu loaded, %zu refused\n", document.name, loaded, refused);
	}
}

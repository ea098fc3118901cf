// SPDX-License-Identifier: MIT
// A folder of a test's own, and comparing files with those kept beside the tests.

#pragma once

#include <sys/stat.h>
#include <unistd.h>

#include <cstdlib>
#include <filesystem>
#include <fstream>
#include <sstream>
#include <string>

#include <gtest/gtest.h>

#include "codegen/UnifiedDiff.h"

/// A new folder, removed with everything in it at the end.
class TestFolder {
public:
	TestFolder()
	{
		std::string pattern =
			(std::filesystem::temp_directory_path() / "plim-codegen-XXXXXX").string();
		fPath = mkdtemp(pattern.data());
	}

	~TestFolder()
	{
		std::error_code ignored;
		std::filesystem::remove_all(fPath, ignored);
	}

	TestFolder(const TestFolder&) = delete;
	TestFolder& operator=(const TestFolder&) = delete;

	const std::string& Path() const { return fPath; }

	/// The path of \a name in the folder.
	std::string At(const std::string& name) const { return fPath + "/" + name; }

private:
	std::string fPath;
};


inline std::string
ReadText(const std::string& path)
{
	std::ifstream stream(path, std::ios::binary);
	EXPECT_TRUE(stream.good()) << "cannot read " << path;
	std::ostringstream text;
	text << stream.rdbuf();
	return text.str();
}


inline void
WriteText(const std::string& path, const std::string& text)
{
	std::ofstream stream(path, std::ios::binary);
	stream << text;
	ASSERT_TRUE(stream.good()) << "cannot write " << path;
}


/// The text of a file kept beside the tests.
inline std::string
GoldenText(const std::string& name)
{
	return ReadText(std::string(TEST_DATA_DIR "/golden/") + name + ".txt");
}


/// Expects a text, and prints the difference when it is another one.
inline void
ExpectText(const std::string& expected, const std::string& actual, const std::string& name)
{
	EXPECT_EQ(UnifiedDiff("expected/" + name, "actual/" + name, expected, actual), "");
}


/// The names of the entries in a folder, sorted and joined by blanks.
inline std::string
EntryNames(const std::string& folder)
{
	std::vector<std::string> names;
	for (const auto& entry : std::filesystem::directory_iterator(folder))
		names.push_back(entry.path().filename().string());
	std::sort(names.begin(), names.end());
	std::string joined;
	for (const std::string& name : names)
		joined += (joined.empty() ? "" : " ") + name;
	return joined;
}

// SPDX-License-Identifier: MIT

#include "app/ReplacementFile.h"

#include <gtest/gtest.h>

#include <cstring>
#include <filesystem>

#include <Node.h>
#include <TypeConstants.h>
#include <sys/stat.h>

#include "support/TemporaryFolder.h"

namespace {

status_t
WriteText(TReplacementFile& file, const char* text)
{
	const ssize_t length = static_cast<ssize_t>(strlen(text));
	return file.Stream()->Write(text, length) == length ? B_OK : B_ERROR;
}


size_t
CountEntries(const TemporaryFolder& folder)
{
	const std::filesystem::directory_iterator entries(folder.Path());
	return std::distance(begin(entries), end(entries));
}

} // namespace

TEST(ReplacementFileTest, TheOldContentStaysUntilTheReplacing)
{
	TemporaryFolder folder;
	const std::string path = folder.Write("file", "old");

	TReplacementFile file(path.c_str());
	ASSERT_EQ(file.InitCheck(), B_OK);
	ASSERT_EQ(WriteText(file, "new content"), B_OK);
	EXPECT_EQ(folder.Read("file"), "old");

	EXPECT_EQ(file.Replace(), B_OK);
	EXPECT_EQ(folder.Read("file"), "new content");
	EXPECT_EQ(CountEntries(folder), 1u);
}


TEST(ReplacementFileTest, WithoutReplacingNothingIsLeftBehind)
{
	TemporaryFolder folder;
	const std::string path = folder.Write("file", "old");
	{
		TReplacementFile file(path.c_str());
		ASSERT_EQ(WriteText(file, "new"), B_OK);
	}
	EXPECT_EQ(folder.Read("file"), "old");
	EXPECT_EQ(CountEntries(folder), 1u);
}


TEST(ReplacementFileTest, TheTailOfALongerFileIsKept)
{
	TemporaryFolder folder;
	const std::string path = folder.Write("file", "a long old content");

	TReplacementFile file(path.c_str());
	ASSERT_EQ(WriteText(file, "short"), B_OK);
	ASSERT_EQ(file.KeepTail(), B_OK);
	ASSERT_EQ(file.Replace(), B_OK);
	EXPECT_EQ(folder.Read("file"), "shortg old content");
}


TEST(ReplacementFileTest, PermissionsAndAttributesAreTakenOver)
{
	TemporaryFolder folder;
	SKIP_WITHOUT_ATTRIBUTES(folder);
	const std::string path = folder.Write("file", "old");
	ASSERT_EQ(chmod(path.c_str(), 0640), 0);
	BNode node(path.c_str());
	ASSERT_EQ(node.WriteAttr("mark", B_STRING_TYPE, 0, "kept", 5), 5);

	TReplacementFile file(path.c_str());
	ASSERT_EQ(WriteText(file, "new"), B_OK);
	ASSERT_EQ(file.Replace(), B_OK);

	struct stat status;
	ASSERT_EQ(stat(path.c_str(), &status), 0);
	EXPECT_EQ(status.st_mode & 07777, 0640u);
	char value[16] = "";
	BNode replaced(path.c_str());
	EXPECT_EQ(replaced.ReadAttr("mark", B_STRING_TYPE, 0, value, sizeof(value)), 5);
	EXPECT_STREQ(value, "kept");
}


TEST(ReplacementFileTest, ALinkStaysALink)
{
	TemporaryFolder folder;
	folder.Write("target", "old");
	folder.Link("target", "link");

	TReplacementFile file((folder / "link").c_str());
	ASSERT_EQ(WriteText(file, "new"), B_OK);
	ASSERT_EQ(file.Replace(), B_OK);
	EXPECT_TRUE(std::filesystem::is_symlink(folder / "link"));
	EXPECT_EQ(folder.Read("target"), "new");
}


TEST(ReplacementFileTest, AMissingFolderIsReported)
{
	TemporaryFolder folder;
	TReplacementFile file((folder / "missing/file").c_str());
	EXPECT_EQ(file.InitCheck(), B_ENTRY_NOT_FOUND);
	EXPECT_EQ(file.Replace(), B_ENTRY_NOT_FOUND);
}


TEST(ReplacementFileTest, AFolderIsNoFileToReplace)
{
	TemporaryFolder folder;
	folder.Make("inner");
	TReplacementFile file((folder / "inner").c_str());
	EXPECT_NE(file.InitCheck(), B_OK);
	EXPECT_TRUE(std::filesystem::is_directory(folder / "inner"));
}


TEST(ReplacementFileTest, AFullDiskIsReported)
{
	TReplacementFile file("/dev/full");
	ASSERT_EQ(file.InitCheck(), B_OK);
	EXPECT_EQ(file.Stream()->Write("new", 3), B_DEVICE_FULL);
}


TEST(ReplacementFileTest, AMissingOrEmptyPathIsRefused)
{
	EXPECT_EQ(TReplacementFile(nullptr).InitCheck(), B_BAD_VALUE);
	EXPECT_EQ(TReplacementFile("").InitCheck(), B_BAD_VALUE);
}

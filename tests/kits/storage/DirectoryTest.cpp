// SPDX-License-Identifier: MIT
// Folders: walking and finding entries, making new ones, and what fails how.

#include <Directory.h>

#include <set>

#include <gtest/gtest.h>

#include <Entry.h>
#include <Errors.h>
#include <File.h>
#include <Path.h>
#include <SymLink.h>

#include "OrdinaryUser.h"
#include "support/TemporaryFolder.h"

namespace {

std::multiset<std::string>
Names(BDirectory& directory)
{
	std::multiset<std::string> names;
	entry_ref ref;
	while (directory.GetNextRef(&ref) == B_OK)
		names.insert(ref.name);
	return names;
}

} // namespace


TEST(DirectoryTest, WalkGivesEveryEntryOnceWithoutDots)
{
	const TemporaryFolder folder;
	folder.Write("file");
	folder.Write(".hidden");
	folder.Make("sub");
	folder.Link("nowhere", "link");
	BDirectory directory(folder.Path().c_str());
	const std::multiset<std::string> expected = {"file", ".hidden", "sub", "link"};
	EXPECT_EQ(Names(directory), expected);

	entry_ref ref;
	EXPECT_EQ(directory.GetNextRef(&ref), B_ENTRY_NOT_FOUND);
	EXPECT_EQ(directory.Rewind(), B_OK);
	EXPECT_EQ(Names(directory), expected);
}


TEST(DirectoryTest, CountingRewinds)
{
	const TemporaryFolder folder;
	folder.Write("a");
	folder.Write("b");
	BDirectory directory(folder.Path().c_str());
	BEntry entry;
	ASSERT_EQ(directory.GetNextEntry(&entry), B_OK);
	EXPECT_EQ(directory.CountEntries(), 2);
	EXPECT_EQ(Names(directory).size(), 2u);
	EXPECT_EQ(BDirectory().CountEntries(), B_NO_INIT);
}


TEST(DirectoryTest, LinkThatCannotBeFollowedDoesNotEndTheWalk)
{
	const TemporaryFolder folder;
	folder.Link("loop", "loop");
	folder.Link("no/where", "lost");
	folder.Write("file");
	BDirectory directory(folder.Path().c_str());
	std::set<std::string> names;
	BEntry entry;
	while (directory.GetNextEntry(&entry, true) == B_OK)
		names.insert(entry.Name());
	EXPECT_EQ(names, (std::set<std::string>{"loop", "lost", "file"}));
}


TEST(DirectoryTest, OpeningFailsWithTheReason)
{
	const TemporaryFolder folder;
	folder.Write("file");
	folder.Link("nowhere", "dangling");
	EXPECT_EQ(BDirectory((folder / "file").c_str()).InitCheck(), B_NOT_A_DIRECTORY);
	EXPECT_EQ(BDirectory((folder / "none").c_str()).InitCheck(), B_ENTRY_NOT_FOUND);
	EXPECT_EQ(BDirectory((folder / "dangling").c_str()).InitCheck(), B_ENTRY_NOT_FOUND);
	EXPECT_EQ(BDirectory((const char*)nullptr).InitCheck(), B_BAD_VALUE);
	EXPECT_EQ(BDirectory((const entry_ref*)nullptr).InitCheck(), B_BAD_VALUE);
	EXPECT_EQ(BDirectory((const node_ref*)nullptr).InitCheck(), B_BAD_VALUE);
	EXPECT_EQ(BDirectory().InitCheck(), B_NO_INIT);
	EXPECT_EQ(BDirectory(std::string(2000, 'x').c_str()).InitCheck(), B_NAME_TOO_LONG);
}


TEST(DirectoryTest, UnreadableFolderIsReported)
{
	const TemporaryFolder folder;
	std::filesystem::permissions(folder.Path(), std::filesystem::perms(0755));
	folder.Make("closed");
	std::filesystem::permissions(folder / "closed", std::filesystem::perms(0));
	{
		const OrdinaryUser user;
		EXPECT_EQ(BDirectory((folder / "closed").c_str()).InitCheck(), B_PERMISSION_DENIED);
		EXPECT_EQ(BEntry((folder / "closed/x").c_str()).Exists(), false);
		BFile file((folder / "closed/x").c_str(), B_READ_ONLY);
		EXPECT_EQ(file.InitCheck(), B_PERMISSION_DENIED);
	}
	std::filesystem::permissions(folder / "closed", std::filesystem::perms(0755));
}


TEST(DirectoryTest, FolderThatVanishesEndsTheWalk)
{
	const TemporaryFolder folder;
	folder.Make("gone");
	BDirectory directory((folder / "gone").c_str());
	std::filesystem::remove(folder / "gone");
	BEntry entry;
	EXPECT_EQ(directory.GetNextEntry(&entry), B_ENTRY_NOT_FOUND);
	EXPECT_EQ(directory.GetEntry(&entry), B_ENTRY_NOT_FOUND);
	EXPECT_EQ(directory.CreateFile("x", nullptr), B_ENTRY_NOT_FOUND);
}


TEST(DirectoryTest, FindsExistingEntriesOnly)
{
	const TemporaryFolder folder;
	folder.Make("sub");
	folder.Write("sub/file");
	const BDirectory directory(folder.Path().c_str());
	BEntry entry;
	EXPECT_EQ(directory.FindEntry("sub/file", &entry), B_OK);
	EXPECT_STREQ(entry.Name(), "file");
	EXPECT_EQ(directory.FindEntry("none", &entry), B_ENTRY_NOT_FOUND);
	EXPECT_EQ(entry.InitCheck(), B_NO_INIT);
	EXPECT_EQ(directory.FindEntry(nullptr, &entry), B_BAD_VALUE);
	EXPECT_EQ(directory.FindEntry("sub", nullptr), B_BAD_VALUE);
}


TEST(DirectoryTest, ContainsWhatLiesBelowAndIsOfTheKind)
{
	const TemporaryFolder folder;
	folder.Make("sub/inner");
	folder.Make("sub2");
	folder.Write("sub/inner/file");
	folder.Link("nowhere", "sub/link");
	const BDirectory directory((folder / "sub").c_str());
	EXPECT_TRUE(directory.Contains("inner/file"));
	EXPECT_TRUE(directory.Contains("inner/file", B_FILE_NODE));
	EXPECT_FALSE(directory.Contains("inner/file", B_DIRECTORY_NODE));
	EXPECT_TRUE(directory.Contains("inner", B_DIRECTORY_NODE));
	EXPECT_TRUE(directory.Contains("link", B_SYMLINK_NODE));
	EXPECT_FALSE(directory.Contains("link", B_FILE_NODE));
	EXPECT_FALSE(directory.Contains("none"));
	EXPECT_FALSE(directory.Contains((folder / "sub2").c_str()));
	EXPECT_TRUE(directory.Contains((const char*)nullptr));
	EXPECT_FALSE(directory.Contains((const BEntry*)nullptr));
}


TEST(DirectoryTest, CreatesOneLevelOfFolders)
{
	const TemporaryFolder folder;
	BDirectory directory(folder.Path().c_str());
	BDirectory made;
	ASSERT_EQ(directory.CreateDirectory("new", &made), B_OK);
	EXPECT_EQ(made.InitCheck(), B_OK);
	EXPECT_EQ(directory.CreateDirectory("new", nullptr), B_FILE_EXISTS);
	EXPECT_EQ(directory.CreateDirectory("no/new", nullptr), B_ENTRY_NOT_FOUND);
	EXPECT_EQ(directory.CreateDirectory(nullptr, nullptr), B_BAD_VALUE);
	EXPECT_EQ(BDirectory().CreateDirectory("x", nullptr), B_NO_INIT);
	EXPECT_EQ(directory.CreateDirectory(std::string(256, 'x').c_str(), nullptr), B_NAME_TOO_LONG);
}


TEST(DirectoryTest, CreateFileTruncatesUnlessItMustNotExist)
{
	const TemporaryFolder folder;
	folder.Write("old", "content");
	BDirectory directory(folder.Path().c_str());
	BFile file;
	EXPECT_EQ(directory.CreateFile("old", &file, true), B_FILE_EXISTS);
	EXPECT_EQ(folder.Read("old"), "content");
	ASSERT_EQ(directory.CreateFile("old", &file), B_OK);
	EXPECT_EQ(folder.Read("old"), "");
	EXPECT_TRUE(file.IsReadable());
	EXPECT_TRUE(file.IsWritable());
	EXPECT_EQ(directory.CreateFile("new", nullptr), B_OK);
	EXPECT_TRUE(std::filesystem::exists(folder / "new"));
}


TEST(DirectoryTest, LinksAreMadeAndRead)
{
	const TemporaryFolder folder;
	BDirectory directory(folder.Path().c_str());
	BSymLink link;
	ASSERT_EQ(directory.CreateSymLink("link", "sub/../target", &link), B_OK);
	char target[64];
	EXPECT_EQ(link.ReadLink(target, sizeof(target)), (ssize_t)strlen("sub/../target"));
	EXPECT_STREQ(target, "sub/../target");
	EXPECT_FALSE(link.IsAbsolute());
	char small[4] = "###";
	EXPECT_EQ(link.ReadLink(small, 2), (ssize_t)strlen("sub/../target"));
	EXPECT_STREQ(small, "su#");

	BPath path;
	EXPECT_EQ(link.MakeLinkedPath(folder.Path().c_str(), &path), B_ENTRY_NOT_FOUND);
	folder.Make("sub");
	EXPECT_EQ(link.MakeLinkedPath(&directory, &path), (ssize_t)(folder / "target").size());
	EXPECT_EQ(path, (folder / "target").c_str());
	EXPECT_EQ(directory.CreateSymLink("link", "x", nullptr), B_FILE_EXISTS);
	EXPECT_EQ(BSymLink((folder / "sub").c_str()).ReadLink(target, sizeof(target)), B_BAD_VALUE);
}


TEST(DirectoryTest, CopyWalksByItself)
{
	const TemporaryFolder folder;
	folder.Write("a");
	folder.Write("b");
	BDirectory directory(folder.Path().c_str());
	entry_ref ref;
	ASSERT_EQ(directory.GetNextRef(&ref), B_OK);
	BDirectory copy(directory);
	EXPECT_EQ(Names(copy).size(), 2u);
	EXPECT_EQ(Names(directory).size(), 1u);
	EXPECT_EQ(copy, directory);
}


TEST(DirectoryTest, RootOfAVolumeIsRecognised)
{
	const TemporaryFolder folder;
	EXPECT_TRUE(BDirectory("/").IsRootDirectory());
	EXPECT_FALSE(BDirectory(folder.Make("sub").c_str()).IsRootDirectory());
}


TEST(DirectoryTest, CreateDirectoryMakesAllLevels)
{
	const TemporaryFolder folder;
	EXPECT_EQ(create_directory((folder / "a/b/c").c_str(), 0755), B_OK);
	EXPECT_TRUE(std::filesystem::is_directory(folder / "a/b/c"));
	EXPECT_EQ(create_directory((folder / "a/b/c/").c_str(), 0755), B_OK);
	EXPECT_EQ(create_directory("/", 0755), B_OK);
	folder.Write("file");
	EXPECT_EQ(create_directory((folder / "file").c_str(), 0755), B_NOT_A_DIRECTORY);
	EXPECT_EQ(create_directory((folder / "file/x").c_str(), 0755), B_NOT_A_DIRECTORY);
	EXPECT_EQ(create_directory("", 0755), B_ENTRY_NOT_FOUND);
	EXPECT_EQ(create_directory(nullptr, 0755), B_BAD_VALUE);
	EXPECT_EQ(create_directory(std::string(2000, 'x').c_str(), 0755), B_NAME_TOO_LONG);
}

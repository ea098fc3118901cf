// SPDX-License-Identifier: MIT
// Tests of typed paths and names.
#include "interface/panel/PanelPaths.h"

#include <sys/stat.h>

#include <gtest/gtest.h>

#include <Entry.h>

#include "../../storage/OrdinaryUser.h"
#include "support/TemporaryFolder.h"

using namespace BPrivate;

TEST(PanelPathsTest, NamesThatNoFileCanHaveAreExplained)
{
	EXPECT_EQ(NameProblem(""), "Please type a name.");
	EXPECT_EQ(NameProblem("."), "\".\" is no name for a file.");
	EXPECT_EQ(NameProblem(".."), "\"..\" is no name for a file.");
	EXPECT_EQ(NameProblem("a/b"), "A name cannot contain a slash (\"/\").");
	EXPECT_EQ(NameProblem(std::string(256, 'x')), "The name is too long.");
	EXPECT_EQ(NameProblem(std::string(255, 'x')), "");
	EXPECT_EQ(NameProblem("..."), "");
	EXPECT_EQ(NameProblem("name"), "");
}


TEST(PanelPathsTest, TypedPathsBeginInTheShownFolderOrAtHome)
{
	const ScopedVariable home("HOME", "/home/somebody");
	EXPECT_EQ(TypedPath("", "/tmp"), "");
	EXPECT_EQ(TypedPath("  ", "/tmp"), "");
	EXPECT_EQ(TypedPath("/usr", "/tmp"), "/usr");
	EXPECT_EQ(TypedPath(" /usr ", "/tmp"), "/usr");
	EXPECT_EQ(TypedPath("sub/x", "/tmp"), "/tmp/sub/x");
	EXPECT_EQ(TypedPath("sub", "/"), "/sub");
	EXPECT_EQ(TypedPath("~", "/tmp"), "/home/somebody");
	EXPECT_EQ(TypedPath("~/x", "/tmp"), "/home/somebody/x");
	EXPECT_EQ(TypedPath("~x", "/tmp"), "/tmp/~x");
}


TEST(PanelPathsTest, PathsAreCompletedAsFarAsFoldersAgree)
{
	TemporaryFolder folder;
	folder.Make("project-one");
	folder.Make("project-two");
	folder.Make("pictures");
	folder.Make("\xc3\xa4pfel");
	folder.Make("\xc3\xb6l");
	folder.Write("project.txt");
	const std::string& path = folder.Path();
	EXPECT_EQ(PathCompletion(path + "/pr", "/"), "oject-");
	EXPECT_EQ(PathCompletion(path + "/project-o", "/"), "ne/");
	EXPECT_EQ(PathCompletion("pic", path), "tures/");
	EXPECT_EQ(PathCompletion("pictures", path), "/");
	EXPECT_EQ(PathCompletion("p", path), "");
	EXPECT_EQ(PathCompletion("x", path), "");
	EXPECT_EQ(PathCompletion("", path), "");
	EXPECT_EQ(PathCompletion("pic ", path), "");
	EXPECT_EQ(PathCompletion(path + "/", "/"), "");
	EXPECT_EQ(PathCompletion("no/such/pl", path), "");
	// Two characters with the same first byte have nothing in common.
	EXPECT_EQ(PathCompletion("\xc3", path), "");
}


TEST(PanelPathsTest, ParentsAndLeavesOfPaths)
{
	EXPECT_EQ(ParentPath("/a/b"), "/a");
	EXPECT_EQ(ParentPath("/a"), "/");
	EXPECT_EQ(ParentPath("/"), "/");
	EXPECT_EQ(LeafName("/a/b"), "b");
	EXPECT_EQ(LeafName("/"), "/");
}


TEST(PanelPathsTest, TheNearestFolderIsFoundAboveAVanishedOne)
{
	TemporaryFolder folder;
	folder.Make("a");
	EXPECT_EQ(NearestFolder(folder / "a"), folder / "a");
	EXPECT_EQ(NearestFolder(folder / "a/b/c"), folder / "a");
	EXPECT_EQ(NearestFolder(folder.Write("file")), folder.Path());
	EXPECT_EQ(NearestFolder("/no-such-folder/x"), "/");
}


TEST(PanelPathsTest, FoldersAreFoundThroughLinks)
{
	TemporaryFolder folder;
	folder.MakeUnknown("real");
	folder.Link("real", "link");
	folder.Write("file");
	std::string found = "before";
	EXPECT_EQ(FindFolder("", &found), B_ENTRY_NOT_FOUND);
	EXPECT_EQ(FindFolder(folder / "none", &found), B_ENTRY_NOT_FOUND);
	EXPECT_EQ(FindFolder(folder / "file", &found), B_NOT_A_DIRECTORY);
	EXPECT_EQ(found, "before");
	EXPECT_EQ(FindFolder(folder / "link", &found), B_OK);
	EXPECT_EQ(found, folder / "real");

	entry_ref ref;
	ASSERT_EQ(get_ref_for_path((folder / "link").c_str(), &ref), B_OK);
	found.clear();
	EXPECT_EQ(FindFolder(ref, &found), B_OK);
	EXPECT_EQ(found, folder / "real");
	EXPECT_EQ(FindFolder(entry_ref(), &found), B_BAD_VALUE);
}


TEST(PanelPathsTest, ReferencesOfAFoundFoldersEntriesResolve)
{
	TemporaryFolder folder;
	const std::string path = folder.MakeUnknown("sub");
	std::string found;
	ASSERT_EQ(FindFolder(path, &found), B_OK);
	struct stat stat;
	ASSERT_EQ(::stat(path.c_str(), &stat), 0);
	folder.Write("sub/file");
	const entry_ref ref(stat.st_dev, stat.st_ino, "file");
	EXPECT_TRUE(BEntry(&ref).Exists());
}


TEST(PanelPathsTest, AFolderThatCannotBeReadIsRefused)
{
	TemporaryFolder folder;
	ASSERT_EQ(chmod(folder.Path().c_str(), 0755), 0);
	const std::string path = folder.Make("closed");
	ASSERT_EQ(chmod(path.c_str(), 0), 0);
	std::string found;
	status_t status;
	{
		OrdinaryUser user;
		status = FindFolder(path, &found);
	}
	chmod(path.c_str(), 0755);
	EXPECT_EQ(status, B_PERMISSION_DENIED);
	EXPECT_EQ(found, "");
}


TEST(PanelPathsTest, UnusedNamesAreNumbered)
{
	TemporaryFolder folder;
	EXPECT_EQ(UnusedName(folder.Path(), "New folder"), "New folder");
	folder.Make("New folder");
	EXPECT_EQ(UnusedName(folder.Path(), "New folder"), "New folder 2");
	folder.Link("nowhere", "New folder 2");
	EXPECT_EQ(UnusedName(folder.Path(), "New folder"), "New folder 3");
}

// SPDX-License-Identifier: MIT
// Entries and references: what resolves, what fails how, and what survives renaming.

#include <Entry.h>

#include <unistd.h>

#include <gtest/gtest.h>

#include <Directory.h>
#include <Errors.h>
#include <Node.h>
#include <Path.h>
#include <StorageDefs.h>

#include "support/TemporaryFolder.h"

namespace {

std::string
PathOf(const BEntry& entry)
{
	BPath path;
	return entry.GetPath(&path) == B_OK ? path.Path() : "";
}

} // namespace


TEST(EntryRefTest, CopiesOwnTheirNames)
{
	entry_ref ref(1, 2, "name");
	const entry_ref copy(ref);
	ASSERT_EQ(ref.set_name("other"), B_OK);

	EXPECT_STREQ(copy.name, "name");
	EXPECT_NE(ref, copy);
	ref = copy;
	EXPECT_EQ(ref, copy);
	ref.set_name(nullptr);
	EXPECT_EQ(ref.name, nullptr);
	EXPECT_NE(ref, copy);
	EXPECT_TRUE(ref < copy);
}


TEST(EntryRefTest, AssignmentToItselfKeepsTheName)
{
	entry_ref ref(1, 2, "name");
	const entry_ref& same = ref;
	ref = same;
	EXPECT_STREQ(ref.name, "name");
}


TEST(EntryRefTest, OrderIsByDeviceThenFolderThenName)
{
	EXPECT_TRUE(entry_ref(1, 9, "z") < entry_ref(2, 1, "a"));
	EXPECT_TRUE(entry_ref(1, 1, "z") < entry_ref(1, 2, "a"));
	EXPECT_TRUE(entry_ref(1, 1, "a") < entry_ref(1, 1, "b"));
	EXPECT_FALSE(entry_ref(1, 1, "a") < entry_ref(1, 1, "a"));
}


TEST(EntryTest, UnsetEntryIsNotInitialised)
{
	const BEntry entry;
	struct stat stat;
	EXPECT_EQ(entry.InitCheck(), B_NO_INIT);
	EXPECT_FALSE(entry.Exists());
	EXPECT_EQ(entry.Name(), nullptr);
	EXPECT_EQ(entry.GetStat(&stat), B_NO_INIT);
}


TEST(EntryTest, MissingLeafOfAnExistingFolderIsAnEntry)
{
	const TemporaryFolder folder;
	const BEntry entry((folder / "new").c_str());
	ASSERT_EQ(entry.InitCheck(), B_OK);
	EXPECT_FALSE(entry.Exists());
	EXPECT_STREQ(entry.Name(), "new");
	EXPECT_EQ(PathOf(entry), folder / "new");
}


TEST(EntryTest, MissingFolderIsAnError)
{
	const TemporaryFolder folder;
	BEntry entry(folder.Write("old").c_str());
	EXPECT_EQ(entry.SetTo((folder / "no/new").c_str()), B_ENTRY_NOT_FOUND);
	EXPECT_EQ(entry.InitCheck(), B_ENTRY_NOT_FOUND);
	EXPECT_EQ(entry.Name(), nullptr);
}


TEST(EntryTest, BadPathsTellWhatIsWrong)
{
	const TemporaryFolder folder;
	folder.Write("file");
	folder.Link("loop", "loop");
	const struct {
		std::string path;
		bool traverse;
		status_t status;
	} cases[] = {
		{"", false, B_ENTRY_NOT_FOUND},
		{folder / "file/leaf", false, B_NOT_A_DIRECTORY},
		{folder / "missing/..", false, B_ENTRY_NOT_FOUND},
		{folder / std::string(B_FILE_NAME_LENGTH, 'n'), false, B_NAME_TOO_LONG},
		{folder / std::string(B_FILE_NAME_LENGTH - 1, 'n'), false, B_OK},
		{std::string(B_PATH_NAME_LENGTH, '/'), false, B_NAME_TOO_LONG},
		{folder / "loop", true, B_LINK_LIMIT},
		{folder / "loop", false, B_OK},
		{folder / "loop/leaf", false, B_LINK_LIMIT},
	};
	for (const auto& test : cases)
		EXPECT_EQ(BEntry(test.path.c_str(), test.traverse).InitCheck(), test.status) << test.path;
	EXPECT_EQ(BEntry((const char*)nullptr).InitCheck(), B_BAD_VALUE);
	EXPECT_EQ(BEntry((const entry_ref*)nullptr).InitCheck(), B_BAD_VALUE);
	EXPECT_EQ(BEntry((const BDirectory*)nullptr, "x").InitCheck(), B_BAD_VALUE);
}


TEST(EntryTest, NamesThatAreNoneAreRefused)
{
	const TemporaryFolder folder;
	entry_ref ref;
	ASSERT_EQ(get_ref_for_path((folder / "a").c_str(), &ref), B_OK);
	for (const char* name : {"", "a/b", "/"}) {
		ref.set_name(name);
		EXPECT_EQ(BEntry(&ref).InitCheck(), B_BAD_VALUE) << name;
	}
	ref.set_name(nullptr);
	EXPECT_EQ(BEntry(&ref).InitCheck(), B_BAD_VALUE);
}


TEST(EntryTest, DotsAndDoubleSlashesAreResolved)
{
	const TemporaryFolder folder;
	folder.Make("a/b");
	EXPECT_EQ(PathOf(BEntry((folder / "a//b/../b/.").c_str())), folder / "a/b");
	EXPECT_EQ(PathOf(BEntry((folder / "a/b/..").c_str())), folder / "a");
	EXPECT_EQ(PathOf(BEntry((folder / "a/").c_str())), folder / "a");
}


TEST(EntryTest, RelativePathsStartAtTheFolderGiven)
{
	const TemporaryFolder folder;
	folder.Write("a");
	const BDirectory directory(folder.Path().c_str());
	EXPECT_EQ(PathOf(BEntry(&directory, "a")), folder / "a");
	EXPECT_EQ(PathOf(BEntry(&directory, nullptr)), folder.Path());
	EXPECT_EQ(PathOf(BEntry(&directory, "/")), "/");
}


TEST(EntryTest, RelativePathsStartAtTheCurrentDirectory)
{
	const TemporaryFolder folder;
	const auto before = std::filesystem::current_path();
	std::filesystem::current_path(folder.Path());
	const BEntry entry("leaf");
	std::filesystem::current_path(before);
	EXPECT_EQ(PathOf(entry), folder / "leaf");
}


TEST(EntryTest, RootIsItsOwnEntryWithoutParent)
{
	const BEntry root("/");
	BEntry parent;
	ASSERT_EQ(root.InitCheck(), B_OK);
	EXPECT_TRUE(root.IsDirectory());
	EXPECT_EQ(PathOf(root), "/");
	EXPECT_EQ(root.GetParent(&parent), B_ENTRY_NOT_FOUND);
	EXPECT_EQ(BEntry("/."), root);
	EXPECT_EQ(BEntry("/.."), root);
}


TEST(EntryTest, ParentOfAnEntryOfTheRootIsTheRoot)
{
	BEntry parent;
	ASSERT_EQ(BEntry("/new").GetParent(&parent), B_OK);
	EXPECT_EQ(parent, BEntry("/"));
}


TEST(EntryTest, LinkIsFollowedOnlyWhenTraversed)
{
	const TemporaryFolder folder;
	folder.Write("target", "12345");
	folder.Link("target", "link");
	const BEntry link((folder / "link").c_str());
	EXPECT_TRUE(link.IsSymLink());
	EXPECT_EQ(PathOf(link), folder / "link");

	const BEntry target((folder / "link").c_str(), true);
	EXPECT_TRUE(target.IsFile());
	EXPECT_EQ(PathOf(target), folder / "target");
}


TEST(EntryTest, DanglingLinkTraversesToItsMissingTarget)
{
	const TemporaryFolder folder;
	folder.Link("missing", "link");
	const BEntry target((folder / "link").c_str(), true);
	ASSERT_EQ(target.InitCheck(), B_OK);
	EXPECT_EQ(PathOf(target), folder / "missing");
	EXPECT_FALSE(target.Exists());

	folder.Link("no/where", "lost");
	EXPECT_EQ(BEntry((folder / "lost").c_str(), true).InitCheck(), B_ENTRY_NOT_FOUND);
	EXPECT_TRUE(BEntry((folder / "lost").c_str()).Exists());
}


TEST(EntryTest, ChainOfLinksHasALimit)
{
	const TemporaryFolder folder;
	folder.Write("link0");
	for (int i = 1; i <= B_MAX_SYMLINKS + 1; i++)
		folder.Link("link" + std::to_string(i - 1), "link" + std::to_string(i));
	const std::string last = folder / ("link" + std::to_string(B_MAX_SYMLINKS));
	EXPECT_EQ(PathOf(BEntry(last.c_str(), true)), folder / "link0");
	const std::string tooFar = folder / ("link" + std::to_string(B_MAX_SYMLINKS + 1));
	EXPECT_EQ(BEntry(tooFar.c_str(), true).InitCheck(), B_LINK_LIMIT);
}


TEST(EntryTest, FolderReachedThroughALinkIsTheSameEntry)
{
	const TemporaryFolder folder;
	folder.Make("real");
	folder.Link("real", "alias");
	EXPECT_EQ(BEntry((folder / "alias/leaf").c_str()), BEntry((folder / "real/leaf").c_str()));
}


TEST(EntryTest, ReferenceFollowsARenamedFolder)
{
	const TemporaryFolder folder;
	folder.Make("above/old");
	folder.Write("above/old/leaf");
	entry_ref ref;
	ASSERT_EQ(get_ref_for_path((folder / "above/old/leaf").c_str(), &ref), B_OK);

	std::filesystem::rename(folder / "above/old", folder / "above/new");
	EXPECT_EQ(PathOf(BEntry(&ref)), folder / "above/new/leaf");
	std::filesystem::rename(folder / "above", folder / "below");
	EXPECT_EQ(PathOf(BEntry(&ref)), folder / "below/new/leaf");
}


TEST(EntryTest, ReferenceIsNotFooledByAnotherFolderOfTheSameName)
{
	const TemporaryFolder folder;
	folder.Make("place");
	const BEntry entry((folder / "place/leaf").c_str());
	std::filesystem::rename(folder / "place", folder / "moved");
	folder.Make("place");
	folder.Write("place/leaf");

	EXPECT_EQ(PathOf(entry), folder / "moved/leaf");
	EXPECT_FALSE(entry.Exists());
}


TEST(EntryTest, VanishedFolderIsReported)
{
	const TemporaryFolder folder;
	folder.Make("gone");
	const BEntry entry((folder / "gone/leaf").c_str());
	std::filesystem::remove_all(folder / "gone");

	BPath path;
	struct stat stat;
	EXPECT_EQ(entry.InitCheck(), B_OK);
	EXPECT_EQ(entry.GetPath(&path), B_ENTRY_NOT_FOUND);
	EXPECT_EQ(entry.GetStat(&stat), B_ENTRY_NOT_FOUND);
}


TEST(EntryTest, NumbersAloneAreFoundForKnownFoldersAndRootsOnly)
{
	struct stat stat;
	ASSERT_EQ(lstat("/", &stat), 0);
	const entry_ref root(stat.st_dev, stat.st_ino, "leaf");
	EXPECT_EQ(PathOf(BEntry(&root)), "/leaf");

	const TemporaryFolder folder;
	folder.MakeUnknown("never/seen");
	ASSERT_EQ(lstat((folder / "never/seen").c_str(), &stat), 0);
	const entry_ref unknown(stat.st_dev, stat.st_ino, "leaf");
	EXPECT_EQ(BEntry(&unknown).InitCheck(), B_ENTRY_NOT_FOUND);
}


TEST(EntryTest, HoldsNoDescriptor)
{
	const TemporaryFolder folder;
	const auto count = [] {
		return std::distance(std::filesystem::directory_iterator("/proc/self/fd"), {});
	};
	const auto before = count();
	std::vector<BEntry> entries;
	for (int i = 0; i < 50; i++)
		entries.emplace_back((folder / std::to_string(i)).c_str());
	EXPECT_EQ(count(), before);
}


TEST(EntryTest, RenameStaysInTheFolderAndFollowsTheEntry)
{
	const TemporaryFolder folder;
	BEntry entry(folder.Write("old", "content").c_str());
	ASSERT_EQ(entry.Rename("new"), B_OK);
	EXPECT_STREQ(entry.Name(), "new");
	EXPECT_EQ(folder.Read("new"), "content");
	EXPECT_FALSE(std::filesystem::exists(folder / "old"));
}


TEST(EntryTest, RenameReplacesOnlyWhenToldTo)
{
	const TemporaryFolder folder;
	BEntry entry(folder.Write("a", "1").c_str());
	folder.Write("b", "2");
	EXPECT_EQ(entry.Rename("b"), B_FILE_EXISTS);
	EXPECT_STREQ(entry.Name(), "a");
	EXPECT_EQ(folder.Read("b"), "2");
	EXPECT_EQ(entry.Rename("b", true), B_OK);
	EXPECT_EQ(folder.Read("b"), "1");
}


TEST(EntryTest, RenameFailuresKeepTheEntry)
{
	const TemporaryFolder folder;
	folder.Make("full");
	folder.Write("full/x");
	folder.Make("source");
	BEntry entry((folder / "source").c_str());
	EXPECT_EQ(entry.Rename("full", true), B_DIRECTORY_NOT_EMPTY);
	EXPECT_EQ(entry.Rename("missing/name"), B_ENTRY_NOT_FOUND);
	EXPECT_EQ(entry.Rename(""), B_BAD_VALUE);
	EXPECT_EQ(entry.Rename(nullptr), B_BAD_VALUE);
	EXPECT_EQ(PathOf(entry), folder / "source");

	BEntry missing((folder / "missing").c_str());
	EXPECT_EQ(missing.Rename("other"), B_ENTRY_NOT_FOUND);
}


TEST(EntryTest, MoveToAnotherFolderKeepsTheName)
{
	const TemporaryFolder folder;
	BEntry entry(folder.Write("file").c_str());
	BDirectory target(folder.Make("sub").c_str());
	ASSERT_EQ(entry.MoveTo(&target), B_OK);
	EXPECT_EQ(PathOf(entry), folder / "sub/file");
	EXPECT_TRUE(entry.Exists());
	ASSERT_EQ(entry.MoveTo(&target, "other"), B_OK);
	EXPECT_EQ(PathOf(entry), folder / "sub/other");
	EXPECT_EQ(entry.MoveTo(nullptr), B_BAD_VALUE);
}


TEST(EntryTest, RemoveDeletesFilesLinksAndEmptyFolders)
{
	const TemporaryFolder folder;
	folder.Write("target");
	folder.Link("target", "link");
	folder.Make("empty");
	folder.Make("full/inner");
	EXPECT_EQ(BEntry((folder / "link").c_str()).Remove(), B_OK);
	EXPECT_TRUE(std::filesystem::exists(folder / "target"));
	EXPECT_EQ(BEntry((folder / "target").c_str()).Remove(), B_OK);
	EXPECT_EQ(BEntry((folder / "empty").c_str()).Remove(), B_OK);
	EXPECT_EQ(BEntry((folder / "full").c_str()).Remove(), B_DIRECTORY_NOT_EMPTY);
	EXPECT_EQ(BEntry((folder / "target").c_str()).Remove(), B_ENTRY_NOT_FOUND);
}


TEST(EntryTest, StatusIsReadAndChanged)
{
	const TemporaryFolder folder;
	BEntry entry(folder.Write("file", "12345").c_str());
	off_t size = 0;
	mode_t permissions = 0;
	time_t time = 0;
	EXPECT_EQ(entry.GetSize(&size), B_OK);
	EXPECT_EQ(size, 5);
	EXPECT_EQ(entry.SetPermissions(0640), B_OK);
	EXPECT_EQ(entry.GetPermissions(&permissions), B_OK);
	EXPECT_EQ(permissions, 0640u);
	EXPECT_EQ(entry.SetModificationTime(1000000), B_OK);
	EXPECT_EQ(entry.SetAccessTime(2000000), B_OK);
	EXPECT_EQ(entry.GetModificationTime(&time), B_OK);
	EXPECT_EQ(time, 1000000);
	EXPECT_EQ(entry.GetAccessTime(&time), B_OK);
	EXPECT_EQ(time, 2000000);
	EXPECT_EQ(entry.SetCreationTime(1), B_NOT_SUPPORTED);
	EXPECT_EQ(entry.GetSize(nullptr), B_BAD_VALUE);
	EXPECT_EQ(BEntry((folder / "none").c_str()).SetPermissions(0600), B_ENTRY_NOT_FOUND);
}


TEST(EntryTest, NodeReferenceLeadsBackToTheFolder)
{
	const TemporaryFolder folder;
	folder.Make("seen");
	node_ref node;
	ASSERT_EQ(BEntry((folder / "seen").c_str()).GetNodeRef(&node), B_OK);
	BEntry entry;
	ASSERT_EQ(BDirectory(&node).GetEntry(&entry), B_OK);
	EXPECT_EQ(PathOf(entry), folder / "seen");
}


TEST(EntryTest, GetRefForPathNeedsTheFolderOnly)
{
	const TemporaryFolder folder;
	entry_ref ref;
	EXPECT_EQ(get_ref_for_path((folder / "new").c_str(), &ref), B_OK);
	EXPECT_STREQ(ref.name, "new");
	EXPECT_EQ(get_ref_for_path((folder / "no/new").c_str(), &ref), B_ENTRY_NOT_FOUND);
	EXPECT_STREQ(ref.name, "new") << "a failure leaves the reference alone";
	EXPECT_EQ(get_ref_for_path(nullptr, &ref), B_BAD_VALUE);
	EXPECT_EQ(get_ref_for_path("/", nullptr), B_BAD_VALUE);
}

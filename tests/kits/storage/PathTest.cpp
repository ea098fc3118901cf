// SPDX-License-Identifier: MIT
// Paths: taken as text, normalised, taken apart, and flattened.

#include <Path.h>

#include <gtest/gtest.h>

#include <Directory.h>
#include <Entry.h>
#include <Errors.h>
#include <Message.h>
#include <StorageDefs.h>
#include <TypeConstants.h>

#include "support/TemporaryFolder.h"


TEST(PathTest, CleanAbsolutePathIsTakenAsText)
{
	const BPath path("/no/such/folder/leaf");
	ASSERT_EQ(path.InitCheck(), B_OK);
	EXPECT_STREQ(path.Path(), "/no/such/folder/leaf");
	EXPECT_STREQ(path.Leaf(), "leaf");
	EXPECT_TRUE(path.IsAbsolute());
}


TEST(PathTest, FolderAndLeafAreJoinedWithOneSlash)
{
	EXPECT_STREQ(BPath("/a", "b").Path(), "/a/b");
	EXPECT_STREQ(BPath("/", "b").Path(), "/b");
	EXPECT_STREQ(BPath("/a", "").Path(), "/a");
	EXPECT_STREQ(BPath("/a", nullptr).Path(), "/a");
	EXPECT_EQ(BPath("/a", "/b").InitCheck(), B_BAD_VALUE);
}


TEST(PathTest, UncleanPathsNeedTheirFoldersAndAreNormalised)
{
	const TemporaryFolder folder;
	folder.Make("a/b");
	folder.Link("a", "link");
	const struct {
		std::string path;
		const char* normalised;
	} cases[] = {
		{folder / "a//b", "a/b"},
		{folder / "a/./b", "a/b"},
		{folder / "a/../a/b", "a/b"},
		{folder / "a/b/", "a/b"},
		{folder / "a/b/..", "a"},
		{folder / "a/.", "a"},
		{folder / "link//b", "a/b"},
		{folder / "link/", "link"},
	};
	for (const auto& test : cases)
		EXPECT_EQ(BPath(test.path.c_str()), (folder / test.normalised).c_str()) << test.path;
	EXPECT_EQ(BPath((folder / "none/../a").c_str()).InitCheck(), B_ENTRY_NOT_FOUND);
	EXPECT_STREQ(BPath((folder / "link/b").c_str()).Path(), (folder / "link/b").c_str());
	EXPECT_STREQ(
		BPath((folder / "link/b").c_str(), nullptr, true).Path(), (folder / "a/b").c_str());
}


TEST(PathTest, RelativePathStartsAtTheCurrentDirectory)
{
	const TemporaryFolder folder;
	const auto before = std::filesystem::current_path();
	std::filesystem::current_path(folder.Path());
	const BPath path("leaf");
	std::filesystem::current_path(before);
	EXPECT_STREQ(path.Path(), (folder / "leaf").c_str());
}


TEST(PathTest, FailureUnsetsThePathAndKeepsItsStatus)
{
	BPath path("/a");
	EXPECT_EQ(path.SetTo((const char*)nullptr), B_BAD_VALUE);
	EXPECT_EQ(path.InitCheck(), B_BAD_VALUE);
	EXPECT_EQ(path.Path(), nullptr);
	EXPECT_EQ(path.Leaf(), nullptr);
	EXPECT_EQ(path.SetTo(""), B_ENTRY_NOT_FOUND);
	EXPECT_EQ(path.SetTo((const entry_ref*)nullptr), B_BAD_VALUE);
	EXPECT_EQ(path.SetTo((const BEntry*)nullptr), B_BAD_VALUE);
	EXPECT_EQ(path.SetTo((const BDirectory*)nullptr), B_BAD_VALUE);
	const BEntry unset;
	EXPECT_EQ(path.SetTo(&unset), B_NO_INIT);
	path.Unset();
	EXPECT_EQ(path.InitCheck(), B_NO_INIT);
}


TEST(PathTest, LengthIsLimited)
{
	const std::string longest = "/" + std::string(B_PATH_NAME_LENGTH - 2, 'x');
	EXPECT_EQ(BPath(longest.c_str()).InitCheck(), B_OK);
	EXPECT_EQ(BPath((longest + "x").c_str()).InitCheck(), B_NAME_TOO_LONG);
	BPath path(longest.c_str());
	EXPECT_EQ(path.Append("y"), B_NAME_TOO_LONG);
	EXPECT_EQ(path.Path(), nullptr);
}


TEST(PathTest, AppendTakesRelativePathsOnly)
{
	BPath path("/a");
	EXPECT_EQ(path.Append("b/c"), B_OK);
	EXPECT_STREQ(path.Path(), "/a/b/c");
	EXPECT_EQ(path.Append("/d"), B_BAD_VALUE);
	EXPECT_EQ(path.InitCheck(), B_BAD_VALUE);
	EXPECT_EQ(BPath().Append("x"), B_BAD_VALUE);
}


TEST(PathTest, PathMayBeSetToAPartOfItself)
{
	BPath path("/a/b");
	EXPECT_EQ(path.GetParent(&path), B_OK);
	EXPECT_STREQ(path.Path(), "/a");
	EXPECT_EQ(path.SetTo(path.Path(), "c"), B_OK);
	EXPECT_STREQ(path.Path(), "/a/c");
}


TEST(PathTest, ParentEndsAtTheRoot)
{
	BPath path("/a");
	EXPECT_EQ(path.GetParent(&path), B_OK);
	EXPECT_STREQ(path.Path(), "/");
	EXPECT_STREQ(path.Leaf(), "");
	EXPECT_EQ(path.GetParent(&path), B_ENTRY_NOT_FOUND);
	EXPECT_STREQ(path.Path(), "/");
	EXPECT_EQ(BPath().GetParent(&path), B_NO_INIT);
	EXPECT_EQ(path.GetParent(nullptr), B_BAD_VALUE);
}


TEST(PathTest, ComparesAsText)
{
	EXPECT_TRUE(BPath("/a") == "/a");
	EXPECT_TRUE(BPath("/a") == BPath("/a"));
	EXPECT_TRUE(BPath("/a") != BPath("/b"));
	EXPECT_TRUE(BPath() == BPath());
	EXPECT_TRUE(BPath() != BPath("/a"));
	BPath path;
	path = "/x";
	EXPECT_TRUE(path == "/x");
	path = (const char*)nullptr;
	EXPECT_EQ(path.InitCheck(), B_NO_INIT);
}


TEST(PathTest, FlattensAsAReference)
{
	const TemporaryFolder folder;
	const BPath path((folder / "leaf").c_str());
	EXPECT_EQ(path.TypeCode(), (type_code)B_REF_TYPE);
	EXPECT_FALSE(path.IsFixedSize());
	EXPECT_TRUE(path.AllowsTypeCode(B_REF_TYPE));
	EXPECT_FALSE(path.AllowsTypeCode(B_STRING_TYPE));

	std::string bytes(path.FlattenedSize(), '\0');
	ASSERT_EQ(path.Flatten(bytes.data(), bytes.size()), B_OK);
	EXPECT_EQ(path.Flatten(bytes.data(), bytes.size() - 1), B_BAD_VALUE);
	BPath copy;
	ASSERT_EQ(copy.Unflatten(B_REF_TYPE, bytes.data(), bytes.size()), B_OK);
	EXPECT_EQ(copy, path);
	EXPECT_EQ(copy.Unflatten(B_STRING_TYPE, bytes.data(), bytes.size()), B_BAD_VALUE);
	EXPECT_EQ(copy.Path(), nullptr);
}


TEST(PathTest, UnsetPathFlattensAndComesBackUnset)
{
	const BPath path;
	std::string bytes(path.FlattenedSize(), '\0');
	ASSERT_EQ(path.Flatten(bytes.data(), bytes.size()), B_OK);
	BPath copy("/a");
	EXPECT_EQ(copy.Unflatten(B_REF_TYPE, bytes.data(), bytes.size()), B_OK);
	EXPECT_EQ(copy.InitCheck(), B_NO_INIT);
}


TEST(PathTest, EveryCutOffReferenceIsRefusedOrStillAReference)
{
	const TemporaryFolder folder;
	const BPath path((folder / "leaf").c_str());
	std::string bytes(path.FlattenedSize(), '\0');
	ASSERT_EQ(path.Flatten(bytes.data(), bytes.size()), B_OK);
	const size_t numbers = 12;
	const size_t withName = numbers + sizeof("leaf");
	for (size_t size = 0; size < bytes.size(); size++) {
		BPath copy;
		const std::string part = bytes.substr(0, size);
		const status_t status = copy.Unflatten(B_REF_TYPE, part.data(), part.size());
		EXPECT_EQ(status, size == numbers || size == withName ? B_OK : B_BAD_DATA) << size;
	}
}


TEST(PathTest, FolderOfAForeignReferenceIsBelievedOnlyWhenItIsTheOne)
{
	const TemporaryFolder folder;
	folder.MakeUnknown("one");
	folder.Make("two");
	// Made without the kit, so that it knows neither folder.
	struct stat stat;
	ASSERT_EQ(lstat((folder / "one").c_str(), &stat), 0);
	const uint32 device = (uint32)stat.st_dev;
	const uint64 node = stat.st_ino;
	std::string bytes((const char*)&device, sizeof(device));
	bytes.append((const char*)&node, sizeof(node));
	bytes.append("leaf", 5);

	const std::string liar = bytes + (folder / "two") + '\0';
	BPath path;
	EXPECT_EQ(path.Unflatten(B_REF_TYPE, liar.data(), liar.size()), B_ENTRY_NOT_FOUND);
	const std::string honest = bytes + (folder / "one") + '\0';
	EXPECT_EQ(path.Unflatten(B_REF_TYPE, honest.data(), honest.size()), B_OK);
	EXPECT_EQ(path, (folder / "one/leaf").c_str());
}


TEST(PathTest, ReferencesTravelInMessages)
{
	const TemporaryFolder folder;
	entry_ref ref;
	ASSERT_EQ(get_ref_for_path((folder / "leaf").c_str(), &ref), B_OK);
	const BPath path((folder / "other").c_str());
	BMessage message;
	ASSERT_EQ(message.AddRef("refs", &ref), B_OK);
	ASSERT_EQ(message.AddFlat("refs", &path), B_OK);

	entry_ref found;
	ASSERT_EQ(message.FindRef("refs", 0, &found), B_OK);
	EXPECT_EQ(found, ref);
	ASSERT_EQ(message.FindRef("refs", 1, &found), B_OK);
	EXPECT_EQ(BPath(&found), path);
}

// SPDX-License-Identifier: MIT
// Nodes: attributes with their types, and how other programs see them.

#include <Node.h>

#include <sys/xattr.h>

#include <set>

#include <gtest/gtest.h>

#include <Entry.h>
#include <Errors.h>
#include <File.h>
#include <StorageDefs.h>
#include <String.h>
#include <TypeConstants.h>
#include <fs_attr.h>

#include "support/TemporaryFolder.h"

namespace {

/// A file on a file system with attributes; without one the tests have nothing to test.
class NodeTest : public testing::Test {
protected:
	void SetUp() override
	{
		fPath = fFolder.Write("file", "content");
		if (setxattr(fPath.c_str(), "user.probe", "", 0, 0) != 0)
			GTEST_SKIP() << "the temporary folder has no extended attributes";
		removexattr(fPath.c_str(), "user.probe");
		ASSERT_EQ(fNode.SetTo(fPath.c_str()), B_OK);
	}

	TemporaryFolder fFolder;
	std::string fPath;
	BNode fNode;
};

} // namespace


TEST_F(NodeTest, AttributeKeepsItsBytesAndItsType)
{
	const struct {
		type_code type;
		std::string data;
	} cases[] = {
		{B_INT32_TYPE, std::string("\1\2\3\4", 4)},
		{B_STRING_TYPE, std::string("text", 5)},
		{B_STRING_TYPE, "no terminator"},
		{B_STRING_TYPE, std::string("in\0side", 8)},
		{B_STRING_TYPE, std::string("", 1)},
		{B_RAW_TYPE, std::string("\0\0\0", 3)},
		{B_RAW_TYPE, std::string("text", 5)},
		{'abcd', "x"},
		{B_MIME_STRING_TYPE, std::string("text/plain", 11)},
		{0xffffffff, std::string(1000, '\xff')},
	};
	for (const auto& test : cases) {
		ASSERT_EQ(fNode.WriteAttr("a", test.type, 0, test.data.data(), test.data.size()),
			(ssize_t)test.data.size());
		attr_info info;
		ASSERT_EQ(fNode.GetAttrInfo("a", &info), B_OK);
		EXPECT_EQ(info.type, test.type);
		EXPECT_EQ(info.size, (off_t)test.data.size());
		std::string read(2000, '#');
		read.resize(fNode.ReadAttr("a", test.type, 0, read.data(), read.size()));
		EXPECT_EQ(read, test.data);
	}
}


TEST_F(NodeTest, WritingAtTheBeginningReplacesAndElsewherePatches)
{
	EXPECT_EQ(fNode.WriteAttr("a", B_RAW_TYPE, 0, "0123456789", 10), 10);
	EXPECT_EQ(fNode.WriteAttr("a", B_RAW_TYPE, 4, "xy", 2), 2);
	char buffer[16] = {};
	EXPECT_EQ(fNode.ReadAttr("a", B_RAW_TYPE, 0, buffer, sizeof(buffer)), 10);
	EXPECT_STREQ(buffer, "0123xy6789");
	EXPECT_EQ(fNode.ReadAttr("a", B_RAW_TYPE, 8, buffer, sizeof(buffer)), 2);
	EXPECT_EQ(fNode.ReadAttr("a", B_RAW_TYPE, 10, buffer, sizeof(buffer)), 0);
	EXPECT_EQ(fNode.WriteAttr("a", B_RAW_TYPE, 12, "z", 1), 1);
	EXPECT_EQ(fNode.ReadAttr("a", B_RAW_TYPE, 10, buffer, sizeof(buffer)), 3);
	EXPECT_EQ(std::string(buffer, 3), std::string("\0\0z", 3));
	EXPECT_EQ(fNode.WriteAttr("a", B_RAW_TYPE, 0, "12", 2), 2);
	EXPECT_EQ(fNode.ReadAttr("a", B_RAW_TYPE, 0, buffer, sizeof(buffer)), 2);
}


TEST_F(NodeTest, ListingGivesEveryNameOnce)
{
	fNode.WriteAttr("one", B_RAW_TYPE, 0, "1", 1);
	fNode.WriteAttr("BEOS:TYPE", B_MIME_STRING_TYPE, 0, "text/plain", 11);
	std::multiset<std::string> names;
	char name[B_ATTR_NAME_LENGTH];
	while (fNode.GetNextAttrName(name) == B_OK)
		names.insert(name);
	EXPECT_EQ(names, (std::multiset<std::string>{"one", "BEOS:TYPE"}));
	EXPECT_EQ(fNode.GetNextAttrName(name), B_ENTRY_NOT_FOUND);

	fNode.WriteAttr("two", B_RAW_TYPE, 0, "2", 1);
	EXPECT_EQ(fNode.RewindAttrs(), B_OK);
	int count = 0;
	while (fNode.GetNextAttrName(name) == B_OK)
		count++;
	EXPECT_EQ(count, 3);
}


TEST_F(NodeTest, TypeIsPlainTextForOtherPrograms)
{
	ASSERT_EQ(fNode.WriteAttr("BEOS:TYPE", B_MIME_STRING_TYPE, 0, "text/x-test", 12), 12);
	char value[64] = {};
	EXPECT_EQ(getxattr(fPath.c_str(), "user.mime_type", value, sizeof(value)),
		(ssize_t)strlen("text/x-test"));
	EXPECT_STREQ(value, "text/x-test");

	ASSERT_EQ(setxattr(fPath.c_str(), "user.mime_type", "image/png", 9, 0), 0);
	attr_info info;
	ASSERT_EQ(fNode.GetAttrInfo("BEOS:TYPE", &info), B_OK);
	EXPECT_EQ(info.type, (type_code)B_MIME_STRING_TYPE);
	EXPECT_EQ(fNode.ReadAttr("BEOS:TYPE", B_MIME_STRING_TYPE, 0, value, sizeof(value)), 10);
	EXPECT_STREQ(value, "image/png");
}


TEST_F(NodeTest, AttributeOfAnotherProgramIsReadAsItIs)
{
	ASSERT_EQ(setxattr(fPath.c_str(), "user.foreign", "\1\2\3", 3, 0), 0);
	char value[8];
	EXPECT_EQ(fNode.ReadAttr("foreign", B_RAW_TYPE, 0, value, sizeof(value)), 3);
	EXPECT_EQ(std::string(value, 3), "\1\2\3");
}


TEST_F(NodeTest, MissingAttributesAndBadArgumentsAreRefused)
{
	char buffer[8];
	attr_info info;
	EXPECT_EQ(fNode.ReadAttr("none", B_RAW_TYPE, 0, buffer, 8), B_ENTRY_NOT_FOUND);
	EXPECT_EQ(fNode.RemoveAttr("none"), B_ENTRY_NOT_FOUND);
	EXPECT_EQ(fNode.GetAttrInfo("none", &info), B_ENTRY_NOT_FOUND);
	EXPECT_EQ(fNode.RenameAttr("none", "other"), B_ENTRY_NOT_FOUND);
	EXPECT_EQ(fNode.ReadAttr(nullptr, B_RAW_TYPE, 0, buffer, 8), B_BAD_VALUE);
	EXPECT_EQ(fNode.WriteAttr("a", B_RAW_TYPE, -1, "x", 1), B_BAD_VALUE);
	EXPECT_EQ(fNode.WriteAttr("a", B_RAW_TYPE, 0, nullptr, 1), B_BAD_VALUE);
	EXPECT_EQ(
		fNode.WriteAttr(std::string(300, 'n').c_str(), B_RAW_TYPE, 0, "x", 1), B_NAME_TOO_LONG);
	EXPECT_EQ(BNode().WriteAttr("a", B_RAW_TYPE, 0, "x", 1), B_NO_INIT);
}


TEST_F(NodeTest, RenamingAndRemovingAttributes)
{
	fNode.WriteAttr("old", B_INT32_TYPE, 0, "1234", 4);
	fNode.WriteAttr("new", B_RAW_TYPE, 0, "x", 1);
	EXPECT_EQ(fNode.RenameAttr("old", "new"), B_OK);
	attr_info info;
	EXPECT_EQ(fNode.GetAttrInfo("old", &info), B_ENTRY_NOT_FOUND);
	ASSERT_EQ(fNode.GetAttrInfo("new", &info), B_OK);
	EXPECT_EQ(info.type, (type_code)B_INT32_TYPE);
	EXPECT_EQ(info.size, 4);
	EXPECT_EQ(fNode.RenameAttr("new", "new"), B_OK);
	EXPECT_EQ(fNode.RemoveAttr("new"), B_OK);
	EXPECT_EQ(fNode.GetAttrInfo("new", &info), B_ENTRY_NOT_FOUND);
}


TEST_F(NodeTest, StringsComeBack)
{
	const BString text("caf\xc3\xa9");
	EXPECT_EQ(fNode.WriteAttrString("text", &text), B_OK);
	BString read;
	EXPECT_EQ(fNode.ReadAttrString("text", &read), B_OK);
	EXPECT_STREQ(read.String(), text.String());
	EXPECT_EQ(fNode.ReadAttrString("none", &read), B_ENTRY_NOT_FOUND);
	EXPECT_EQ(fNode.WriteAttrString("text", nullptr), B_BAD_VALUE);
}


TEST_F(NodeTest, FileOpenForWritingHasAttributesToo)
{
	BFile file(fPath.c_str(), B_WRITE_ONLY);
	EXPECT_EQ(file.WriteAttr("a", B_RAW_TYPE, 0, "x", 1), 1);
	char byte;
	EXPECT_EQ(file.ReadAttr("a", B_RAW_TYPE, 0, &byte, 1), 1);
}


TEST_F(NodeTest, LinkHasNoAttributes)
{
	fFolder.Link("file", "link");
	BNode link((fFolder / "link").c_str());
	ASSERT_EQ(link.InitCheck(), B_OK);
	EXPECT_TRUE(link.IsSymLink());
	EXPECT_EQ(link.WriteAttr("a", B_RAW_TYPE, 0, "x", 1), B_NOT_SUPPORTED);
}


TEST_F(NodeTest, AttributeThatIsTooLargeChangesNothing)
{
	ASSERT_EQ(fNode.WriteAttr("a", B_RAW_TYPE, 0, "old", 3), 3);
	const std::string large(1 << 20, 'x');
	EXPECT_LT(fNode.WriteAttr("a", B_RAW_TYPE, 0, large.data(), large.size()), 0);
	char buffer[8];
	EXPECT_EQ(fNode.ReadAttr("a", B_RAW_TYPE, 0, buffer, 8), 3);
}


TEST(NodeOfAnyFileSystemTest, FileSystemWithoutAttributesIsNotSupported)
{
	BNode node("/proc/version");
	if (node.InitCheck() != B_OK)
		GTEST_SKIP() << "the host has no file system that is known to have no attributes";
	char buffer[8];
	EXPECT_EQ(node.ReadAttr("a", B_RAW_TYPE, 0, buffer, 8), B_NOT_SUPPORTED);
	EXPECT_EQ(node.WriteAttr("a", B_RAW_TYPE, 0, "x", 1), B_NOT_SUPPORTED);
}


TEST(NodeOfAnyFileSystemTest, OpeningFailsWithTheReason)
{
	const TemporaryFolder folder;
	EXPECT_EQ(BNode().InitCheck(), B_NO_INIT);
	EXPECT_EQ(BNode((folder / "none").c_str()).InitCheck(), B_ENTRY_NOT_FOUND);
	EXPECT_EQ(BNode((const char*)nullptr).InitCheck(), B_BAD_VALUE);
	EXPECT_EQ(BNode((const entry_ref*)nullptr).InitCheck(), B_BAD_VALUE);
	EXPECT_EQ(BNode((folder.Write("file") + "/x").c_str()).InitCheck(), B_NOT_A_DIRECTORY);
}


TEST(NodeOfAnyFileSystemTest, StatusOutlivesTheName)
{
	const TemporaryFolder folder;
	BNode node(folder.Write("file", "12345").c_str());
	std::filesystem::remove(folder / "file");
	off_t size = 0;
	EXPECT_EQ(node.GetSize(&size), B_OK);
	EXPECT_EQ(size, 5);
}


TEST(NodeOfAnyFileSystemTest, CopiesAreTheSameNode)
{
	const TemporaryFolder folder;
	const BNode node(folder.Write("a").c_str());
	const BNode copy(node);
	const BNode other(folder.Write("b").c_str());
	EXPECT_EQ(copy, node);
	EXPECT_NE(other, node);
	EXPECT_EQ(BNode(), BNode());
	EXPECT_NE(BNode(), node);
}


TEST(NodeOfAnyFileSystemTest, LockKeepsASecondOneOut)
{
	const TemporaryFolder folder;
	const std::string path = folder.Write("file");
	BNode first(path.c_str());
	BNode second(path.c_str());
	EXPECT_EQ(first.Lock(), B_OK);
	EXPECT_EQ(second.Lock(), B_BUSY);
	EXPECT_EQ(first.Unlock(), B_OK);
	EXPECT_EQ(second.Lock(), B_OK);
	EXPECT_EQ(second.Sync(), B_OK);
}


TEST(NodeOfAnyFileSystemTest, StatusIsChanged)
{
	const TemporaryFolder folder;
	BNode node(folder.Write("file").c_str());
	EXPECT_EQ(node.SetPermissions(0600), B_OK);
	EXPECT_EQ(node.SetModificationTime(1234567), B_OK);
	mode_t permissions = 0;
	time_t time = 0;
	EXPECT_EQ(node.GetPermissions(&permissions), B_OK);
	EXPECT_EQ(permissions, 0600u);
	EXPECT_EQ(node.GetModificationTime(&time), B_OK);
	EXPECT_EQ(time, 1234567);
}

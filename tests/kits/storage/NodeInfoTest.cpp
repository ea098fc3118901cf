// SPDX-License-Identifier: MIT
// The type and preferred application of a file, and what an application's file tells.

#include <NodeInfo.h>

#include <sys/xattr.h>

#include <gtest/gtest.h>

#include <AppFileInfo.h>
#include <Errors.h>
#include <File.h>
#include <Message.h>
#include <StorageDefs.h>

#include "support/TemporaryFolder.h"

namespace {

class NodeInfoTest : public testing::Test {
protected:
	NodeInfoTest()
		: fDataHome("XDG_DATA_HOME", fFolder.Path()),
		  fDataDirectories("XDG_DATA_DIRS", fFolder / "system")
	{
	}

	void SetUp() override
	{
		fPath = fFolder.Write("file", std::string("\0\1\2", 3));
		if (setxattr(fPath.c_str(), "user.probe", "", 0, 0) != 0)
			GTEST_SKIP() << "the temporary folder has no extended attributes";
		ASSERT_EQ(fFile.SetTo(fPath.c_str(), B_READ_WRITE), B_OK);
	}

	TemporaryFolder fFolder;
	ScopedVariable fDataHome;
	ScopedVariable fDataDirectories;
	std::string fPath;
	BFile fFile;
	char fText[B_MIME_TYPE_LENGTH] = "old";
};

} // namespace


TEST_F(NodeInfoTest, TypeIsWrittenReadAndRemoved)
{
	BNodeInfo info(&fFile);
	EXPECT_EQ(info.GetType(fText), B_ENTRY_NOT_FOUND);
	EXPECT_EQ(info.SetType("application/x-test"), B_OK);
	EXPECT_EQ(info.GetType(fText), B_OK);
	EXPECT_STREQ(fText, "application/x-test");
	char value[64] = {};
	getxattr(fPath.c_str(), "user.mime_type", value, sizeof(value));
	EXPECT_STREQ(value, "application/x-test");
	EXPECT_EQ(info.SetType(nullptr), B_OK);
	EXPECT_EQ(info.SetType(nullptr), B_OK);
	EXPECT_EQ(info.GetType(fText), B_ENTRY_NOT_FOUND);
}


TEST_F(NodeInfoTest, BadTypesAreRefusedAndIgnored)
{
	BNodeInfo info(&fFile);
	ASSERT_EQ(info.SetType("text/plain"), B_OK);
	EXPECT_EQ(info.SetType("not a type"), B_BAD_VALUE);
	EXPECT_EQ(info.SetType(std::string(300, 'x').c_str()), B_BAD_VALUE);
	EXPECT_EQ(info.GetType(fText), B_OK);
	EXPECT_STREQ(fText, "text/plain");

	const std::string rubbish(1000, ' ');
	ASSERT_EQ(setxattr(fPath.c_str(), "user.mime_type", rubbish.data(), rubbish.size(), 0), 0);
	EXPECT_EQ(info.GetType(fText), B_ENTRY_NOT_FOUND);
	EXPECT_EQ(info.GetType(nullptr), B_BAD_VALUE);
}


TEST_F(NodeInfoTest, PreferredApplicationIsWrittenAndRead)
{
	BNodeInfo info(&fFile);
	EXPECT_EQ(info.GetPreferredApp(fText), B_ENTRY_NOT_FOUND);
	EXPECT_EQ(info.SetPreferredApp("application/x-vnd.Test", B_OPEN), B_OK);
	EXPECT_EQ(info.GetPreferredApp(fText), B_OK);
	EXPECT_STREQ(fText, "application/x-vnd.Test");
	EXPECT_EQ(info.SetPreferredApp(nullptr), B_OK);
	EXPECT_EQ(info.GetPreferredApp(fText), B_ENTRY_NOT_FOUND);
}


TEST_F(NodeInfoTest, NodeMustBeThere)
{
	BNode unset;
	EXPECT_EQ(BNodeInfo().InitCheck(), B_NO_INIT);
	EXPECT_EQ(BNodeInfo(nullptr).InitCheck(), B_BAD_VALUE);
	EXPECT_EQ(BNodeInfo(&unset).InitCheck(), B_NO_INIT);
	EXPECT_EQ(BNodeInfo(&unset).SetType("a/b"), B_NO_INIT);
}


TEST_F(NodeInfoTest, IconIsTheAttribute)
{
	uint8* data = nullptr;
	size_t size = 0;
	type_code type = 0;
	const BNodeInfo info(&fFile);
	EXPECT_EQ(info.GetIcon(&data, &size, &type), B_ENTRY_NOT_FOUND);
	fFile.WriteAttr("BEOS:ICON", 'VICN', 0, "ncif", 4);
	ASSERT_EQ(info.GetIcon(&data, &size, &type), B_OK);
	EXPECT_EQ(std::string((char*)data, size), "ncif");
	EXPECT_EQ(type, (type_code)'VICN');
	delete[] data;
}


TEST_F(NodeInfoTest, ApplicationInformationComesBack)
{
	BAppFileInfo info(&fFile);
	uint32 flags = 0;
	EXPECT_EQ(info.GetSignature(fText), B_ENTRY_NOT_FOUND);
	EXPECT_EQ(info.SetSignature("application/x-vnd.Test"), B_OK);
	EXPECT_EQ(info.GetSignature(fText), B_OK);
	EXPECT_STREQ(fText, "application/x-vnd.Test");
	EXPECT_EQ(info.GetAppFlags(&flags), B_ENTRY_NOT_FOUND);
	EXPECT_EQ(info.SetAppFlags(3), B_OK);
	EXPECT_EQ(info.GetAppFlags(&flags), B_OK);
	EXPECT_EQ(flags, 3u);
	EXPECT_EQ(info.RemoveAppFlags(), B_OK);
	EXPECT_EQ(info.GetAppFlags(&flags), B_ENTRY_NOT_FOUND);
}


TEST_F(NodeInfoTest, SupportedTypesAreKeptAndInstalled)
{
	BAppFileInfo info(&fFile);
	BMessage types;
	EXPECT_EQ(info.GetSupportedTypes(&types), B_ENTRY_NOT_FOUND);
	types.AddString("types", "text");
	types.AddString("types", "application/x-test");
	EXPECT_EQ(info.SetSupportedTypes(&types, true, false), B_OK);
	EXPECT_TRUE(BMimeType("application/x-test").IsInstalled());
	EXPECT_TRUE(info.IsSupportedType("text/plain"));
	EXPECT_TRUE(info.IsSupportedType("application/X-Test"));
	EXPECT_FALSE(info.IsSupportedType("application/x-other"));
	BMessage read;
	ASSERT_EQ(info.GetSupportedTypes(&read), B_OK);
	EXPECT_STREQ(read.FindString("types", 1), "application/x-test");

	fFile.WriteAttr("BEOS:FILE_TYPES", 'MSGG', 0, "rubbish", 7);
	EXPECT_EQ(info.GetSupportedTypes(&read), B_BAD_DATA);
	types.AddString("types", "no type");
	EXPECT_EQ(info.SetSupportedTypes(&types), B_BAD_VALUE);
}

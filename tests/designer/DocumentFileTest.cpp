// SPDX-License-Identifier: MIT

#include "designer/DocumentFile.h"

#include <gtest/gtest.h>

#include <sys/stat.h>

#include <filesystem>

#include <Node.h>
#include <NodeInfo.h>

#include "designer/FormFile.h"
#include "support/TemporaryFolder.h"

namespace {

constexpr const char* kType = "application/x-plim-project";

} // namespace

TEST(DocumentFileTest, ANewDocumentIsEmptyAndHasNoStatusYet)
{
	TPLIMFile file;
	EXPECT_EQ(file.what, static_cast<uint32>('PlmF'));
	EXPECT_STREQ(file.Filename(), "");
	EXPECT_STREQ(file.FileType(), "");
	EXPECT_EQ(file.InitCheck(), B_NO_INIT);
}


TEST(DocumentFileTest, WhatWasSavedIsOpenedWithItsCode)
{
	TemporaryFolder folder;
	TPLIMFile saved(kType);
	saved.what = 'PPrj';
	saved.SetString("text", "value");
	saved.SetFilename((folder / "document").c_str());
	ASSERT_TRUE(saved.SaveFile());

	TPLIMFile opened(kType, (folder / "document").c_str());
	EXPECT_EQ(opened.InitCheck(), B_OK);
	EXPECT_EQ(opened.what, static_cast<uint32>('PPrj'));
	EXPECT_STREQ(opened.FindString("text"), "value");
}


TEST(DocumentFileTest, SavingRecordsTypeAndPreferredApplication)
{
	TemporaryFolder folder;
	SKIP_WITHOUT_ATTRIBUTES(folder);
	TPLIMFile file(kType);
	file.SetFilename((folder / "document").c_str());
	ASSERT_TRUE(file.SaveFile());

	BNode node((folder / "document").c_str());
	BNodeInfo info(&node);
	char text[B_MIME_TYPE_LENGTH];
	ASSERT_EQ(info.GetType(text), B_OK);
	EXPECT_STREQ(text, kType);
	ASSERT_EQ(info.GetPreferredApp(text), B_OK);
	EXPECT_STREQ(text, "application/x-qtx.Plim");
}


TEST(DocumentFileTest, ALongerOldFileKeepsItsTailAndOpensAsTheNewDocument)
{
	TemporaryFolder folder;
	TPLIMFile file(kType);
	file.SetFilename((folder / "document").c_str());
	file.SetString("text", std::string(1000, 'x').c_str());
	ASSERT_TRUE(file.SaveFile());
	const std::string before = folder.Read("document");

	file.SetString("text", "short");
	ASSERT_TRUE(file.SaveFile());
	const std::string after = folder.Read("document");
	const size_t length = file.FlattenedSize();
	EXPECT_EQ(after.size(), before.size());
	EXPECT_TRUE(after.substr(length) == before.substr(length));

	TPLIMFile opened(kType, (folder / "document").c_str());
	EXPECT_EQ(opened.InitCheck(), B_OK);
	EXPECT_STREQ(opened.FindString("text"), "short");
}


TEST(DocumentFileTest, AFileThatCannotBeOpenedLeavesTheFields)
{
	TemporaryFolder folder;
	TPLIMFile file(kType);
	file.SetString("text", "kept");
	file.SetFilename((folder / "missing").c_str());
	EXPECT_FALSE(file.OpenFile());
	EXPECT_EQ(file.InitCheck(), B_ENTRY_NOT_FOUND);
	EXPECT_STREQ(file.FindString("text"), "kept");
}


TEST(DocumentFileTest, WhatIsNoWholeDocumentIsReported)
{
	TemporaryFolder folder;
	TPLIMFile saved(kType);
	saved.SetString("text", "value");
	saved.SetFilename((folder / "whole").c_str());
	ASSERT_TRUE(saved.SaveFile());
	const std::string whole = folder.Read("whole");

	for (size_t length = 0; length < static_cast<size_t>(saved.FlattenedSize()); length++) {
		folder.Write("part", whole.substr(0, length));
		TPLIMFile opened(kType, (folder / "part").c_str());
		EXPECT_NE(opened.InitCheck(), B_OK) << length << " bytes";
	}
	folder.Write("foreign", "#!/bin/sh\necho this is no document at all, but it is long enough\n");
	EXPECT_EQ(TPLIMFile(kType, (folder / "foreign").c_str()).InitCheck(), B_NOT_A_MESSAGE);
	EXPECT_NE(TPLIMFile(kType, folder.Path().c_str()).InitCheck(), B_OK);
}


TEST(DocumentFileTest, AFailedSaveLeavesTheOldFile)
{
	TemporaryFolder folder;
	TPLIMFile file(kType);
	file.SetFilename((folder / "missing/document").c_str());
	EXPECT_FALSE(file.SaveFile());
	EXPECT_EQ(file.InitCheck(), B_ENTRY_NOT_FOUND);

	file.SetFilename("/dev/full");
	EXPECT_FALSE(file.SaveFile());
	EXPECT_EQ(file.InitCheck(), B_DEVICE_FULL);
}


TEST(DocumentFileTest, APipeIsNeitherReadNorWritten)
{
	TemporaryFolder folder;
	ASSERT_EQ(mkfifo((folder / "pipe").c_str(), 0600), 0);
	TPLIMFile file(kType);
	file.SetFilename((folder / "pipe").c_str());
	EXPECT_FALSE(file.OpenFile());
	EXPECT_EQ(file.InitCheck(), B_NOT_ALLOWED);
	EXPECT_FALSE(file.SaveFile());
	EXPECT_EQ(file.InitCheck(), B_NOT_ALLOWED);
}


TEST(DocumentFileTest, ANameThatHadToBeCutReachesNoOtherFile)
{
	TemporaryFolder folder;
	std::string path = folder.Path();
	while (path.size() < 300)
		path += "/./.";
	path += "/document";
	TPLIMFile file(kType);
	file.SetFilename(path.c_str());
	EXPECT_FALSE(file.SaveFile());
	EXPECT_EQ(file.InitCheck(), B_NAME_TOO_LONG);
	EXPECT_FALSE(file.OpenFile());
	EXPECT_TRUE(std::filesystem::is_empty(folder.Path()));
}


TEST(DocumentFileTest, ANullNameIsIgnored)
{
	TPLIMFile file;
	file.SetFilename("name");
	file.SetFilename(nullptr);
	EXPECT_STREQ(file.Filename(), "name");
}


TEST(DocumentFileTest, AFormFileHasItsTypeAndCode)
{
	TPLIMFormFile file;
	EXPECT_EQ(file.what, static_cast<uint32>('PFrm'));
	EXPECT_STREQ(file.FileType(), "application/x-plim-form");
}


TEST(DocumentFileTest, ItsOwnFilenameMayBeSetAgain)
{
	TPLIMFile file("application/x-plim-project");
	file.SetFilename("/a/name.plim");
	file.SetFilename(file.Filename());
	EXPECT_STREQ(file.Filename(), "/a/name.plim");
}

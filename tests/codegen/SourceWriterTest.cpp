// SPDX-License-Identifier: MIT
// Reading and writing generated files.

#include "codegen/SourceWriter.h"

#include <signal.h>
#include <sys/resource.h>

#include "codegen/SourceFiles.h"
#include "codegen/TestFolder.h"

namespace {

mode_t
ModeOf(const std::string& path)
{
	struct stat status = {};
	EXPECT_EQ(stat(path.c_str(), &status), 0) << path;
	return status.st_mode & 07777;
}


generated_outcome
Write(TSourceWriter& writer, const std::string& path, const char* text)
{
	writer.WriteText(path.c_str(), text);
	return writer.Files().back().outcome;
}

} // namespace


TEST(SourceFilesTest, PathExistsFollowsLinksAndFileExistsDoesNot)
{
	TestFolder folder;
	WriteText(folder.At("file"), "x");
	ASSERT_EQ(symlink("nowhere", folder.At("dangling").c_str()), 0);
	EXPECT_TRUE(PathExists(folder.Path().c_str()));
	EXPECT_TRUE(PathExists(folder.At("file").c_str()));
	EXPECT_FALSE(PathExists(folder.At("dangling").c_str()));
	EXPECT_FALSE(PathExists(folder.At("missing").c_str()));
	EXPECT_TRUE(FileExists(folder.At("file").c_str()));
	EXPECT_TRUE(FileExists(folder.At("dangling").c_str()));
	EXPECT_FALSE(FileExists(folder.At("missing").c_str()));
	EXPECT_FALSE(FileExists(folder.At("missing/file").c_str()));
}


TEST(SourceFilesTest, CreatePathMakesOneFolderAndAcceptsAnExistingOne)
{
	TestFolder folder;
	EXPECT_TRUE(CreatePath(folder.At("new").c_str()));
	EXPECT_TRUE(std::filesystem::is_directory(folder.At("new")));
	EXPECT_TRUE(CreatePath(folder.At("new").c_str()));
	EXPECT_FALSE(CreatePath(folder.At("missing/new").c_str()));
	EXPECT_FALSE(CreatePath(""));
}


TEST(SourceFilesTest, ReadFileIntoNormalizesTheContent)
{
	TestFolder folder;
	WriteText(folder.At("f"), "a\tb\n");
	BString text("old");
	EXPECT_EQ(ReadFileInto(text, folder.At("f").c_str()), B_OK);
	EXPECT_STREQ(text.String(), "a  b\n\n");
}


TEST(SourceFilesTest, ReadFileIntoOfAnUnreadableFileGivesAnErrorAndNoText)
{
	TestFolder folder;
	BString text("old");
	EXPECT_EQ(ReadFileInto(text, folder.At("missing").c_str()), B_ENTRY_NOT_FOUND);
	EXPECT_STREQ(text.String(), "");
	EXPECT_EQ(ReadFileInto(text, folder.Path().c_str()), B_IS_A_DIRECTORY);
}


TEST(SourceFilesTest, ReadFileIntoTellsTheLineThatWasCut)
{
	TestFolder folder;
	WriteText(folder.At("f"), "1\n2\n" + std::string(2000, 'x') + "\n4\n");
	BString text;
	int32 cutLine = 0;
	EXPECT_EQ(ReadFileInto(text, folder.At("f").c_str(), &cutLine), B_OK);
	EXPECT_EQ(cutLine, 3);
	EXPECT_EQ(text.String(), "1\n2\n" + std::string(1023, 'x') + "\n");
}


TEST(SourceWriterTest, CreatesAFileThatGroupMayWriteAndNobodyExecute)
{
	TestFolder folder;
	TSourceWriter writer;
	const mode_t mask = umask(0);
	EXPECT_EQ(Write(writer, folder.At("f"), "text\n"), GENERATED_CREATED);
	umask(mask);
	EXPECT_EQ(ReadText(folder.At("f")), "text\n");
	EXPECT_EQ(ModeOf(folder.At("f")), 0664u);
}


TEST(SourceWriterTest, HeedsTheMaskOfNewFiles)
{
	TestFolder folder;
	TSourceWriter writer;
	const mode_t mask = umask(027);
	Write(writer, folder.At("f"), "text\n");
	umask(mask);
	EXPECT_EQ(ModeOf(folder.At("f")), 0640u);
}


TEST(SourceWriterTest, ReplacesALongerFileWholeAndKeepsItsPermissions)
{
	TestFolder folder;
	WriteText(folder.At("f"), "a much longer old text\n");
	ASSERT_EQ(chmod(folder.At("f").c_str(), 0640), 0);
	TSourceWriter writer;
	EXPECT_EQ(Write(writer, folder.At("f"), "new\n"), GENERATED_CHANGED);
	EXPECT_EQ(ReadText(folder.At("f")), "new\n");
	EXPECT_EQ(ModeOf(folder.At("f")), 0640u);
	EXPECT_EQ(EntryNames(folder.Path()), "f");
}


TEST(SourceWriterTest, DoesNotTouchAFileThatHasTheTextAlready)
{
	TestFolder folder;
	WriteText(folder.At("f"), "same\n");
	const auto longAgo = std::filesystem::file_time_type::clock::now() - std::chrono::hours(5);
	std::filesystem::last_write_time(folder.At("f"), longAgo);
	const auto before = std::filesystem::last_write_time(folder.At("f"));
	struct stat oldStatus = {};
	stat(folder.At("f").c_str(), &oldStatus);

	TSourceWriter writer;
	EXPECT_EQ(Write(writer, folder.At("f"), "same\n"), GENERATED_UNCHANGED);
	EXPECT_EQ(std::filesystem::last_write_time(folder.At("f")), before);
	struct stat newStatus = {};
	stat(folder.At("f").c_str(), &newStatus);
	EXPECT_EQ(newStatus.st_ino, oldStatus.st_ino);
}


TEST(SourceWriterTest, FollowsALinkToTheFileAndKeepsTheLink)
{
	TestFolder folder;
	WriteText(folder.At("real"), "old\n");
	ASSERT_EQ(symlink("real", folder.At("link").c_str()), 0);
	TSourceWriter writer;
	EXPECT_EQ(Write(writer, folder.At("link"), "new\n"), GENERATED_CHANGED);
	EXPECT_TRUE(std::filesystem::is_symlink(folder.At("link")));
	EXPECT_EQ(ReadText(folder.At("real")), "new\n");
}


TEST(SourceWriterTest, TellsOfAMissingFolderAndOfAFolderInTheFilesPlace)
{
	TestFolder folder;
	TSourceWriter writer;
	EXPECT_EQ(Write(writer, folder.At("missing/f"), "x"), GENERATED_UNWRITABLE);
	EXPECT_EQ(writer.Files().back().status, B_ENTRY_NOT_FOUND);
	std::filesystem::create_directory(folder.At("f"));
	EXPECT_EQ(Write(writer, folder.At("f"), "x"), GENERATED_UNWRITABLE);
	EXPECT_LT(writer.Files().back().status, B_OK);
	EXPECT_EQ(EntryNames(folder.Path()), "f");
}


TEST(SourceWriterTest, LeavesTheOldFileWhenTheDiskIsFull)
{
	TestFolder folder;
	WriteText(folder.At("f"), "the user's work\n");
	signal(SIGXFSZ, SIG_IGN);
	rlimit unlimited;
	getrlimit(RLIMIT_FSIZE, &unlimited);
	const rlimit limited = {4096, unlimited.rlim_max};
	TSourceWriter writer;
	const std::string large(20000, 'x');

	setrlimit(RLIMIT_FSIZE, &limited);
	const generated_outcome outcome = Write(writer, folder.At("f"), large.c_str());
	setrlimit(RLIMIT_FSIZE, &unlimited);

	EXPECT_EQ(outcome, GENERATED_UNWRITABLE);
	EXPECT_LT(writer.Files().back().status, B_OK);
	EXPECT_EQ(ReadText(folder.At("f")), "the user's work\n");
	EXPECT_EQ(EntryNames(folder.Path()), "f");
}


TEST(SourceWriterTest, OfADryRunWritesNothingAndKeepsTheTexts)
{
	TestFolder folder;
	WriteText(folder.At("changed"), "old\n");
	WriteText(folder.At("same"), "same\n");
	TSourceWriter writer;
	writer.SetDryRun(true);
	EXPECT_TRUE(writer.PrepareFolder(folder.At("new").c_str()));
	EXPECT_EQ(Write(writer, folder.At("changed"), "new\n"), GENERATED_CHANGED);
	EXPECT_EQ(writer.Files().back().text, "new\n");
	EXPECT_EQ(Write(writer, folder.At("same"), "same\n"), GENERATED_UNCHANGED);
	EXPECT_EQ(Write(writer, folder.At("created"), "x\n"), GENERATED_CREATED);
	EXPECT_TRUE(writer.KeepCopy(folder.At("changed").c_str()));
	EXPECT_EQ(EntryNames(folder.Path()), "changed same");
	EXPECT_EQ(ReadText(folder.At("changed")), "old\n");
}


TEST(SourceWriterTest, KeepsACopyByteForByte)
{
	TestFolder folder;
	const std::string content("a\0b\tc", 5);
	WriteText(folder.At("f"), content);
	TSourceWriter writer;
	EXPECT_TRUE(writer.KeepCopy(folder.At("f").c_str()));
	EXPECT_EQ(ReadText(folder.At("f~")), content);
	EXPECT_FALSE(writer.KeepCopy(folder.At("missing").c_str()));
	EXPECT_EQ(writer.Files().back().outcome, GENERATED_UNWRITABLE);
}

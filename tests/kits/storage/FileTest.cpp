// SPDX-License-Identifier: MIT
// Files: open modes, reading and writing, positions and sizes, full disks.

#include <File.h>

#include <sys/resource.h>
#include <sys/stat.h>

#include <csignal>

#include <gtest/gtest.h>

#include <Directory.h>
#include <Entry.h>
#include <Errors.h>

#include "support/TemporaryFolder.h"


TEST(FileTest, OpenModesDoWhatTheySay)
{
	const TemporaryFolder folder;
	const std::string missing = folder / "missing";
	const std::string file = folder.Write("file", "content");
	EXPECT_EQ(BFile(missing.c_str(), B_READ_ONLY).InitCheck(), B_ENTRY_NOT_FOUND);
	EXPECT_EQ(BFile(file.c_str(), B_READ_WRITE | B_CREATE_FILE).InitCheck(), B_OK);
	EXPECT_EQ(folder.Read("file"), "content");
	EXPECT_EQ(BFile(file.c_str(), B_READ_WRITE | B_CREATE_FILE | B_FAIL_IF_EXISTS).InitCheck(),
		B_FILE_EXISTS);
	EXPECT_EQ(BFile(file.c_str(), B_WRITE_ONLY | B_ERASE_FILE).InitCheck(), B_OK);
	EXPECT_EQ(folder.Read("file"), "");
	EXPECT_EQ(BFile(missing.c_str(), B_WRITE_ONLY | B_CREATE_FILE).InitCheck(), B_OK);
	EXPECT_TRUE(std::filesystem::exists(missing));
	EXPECT_EQ(BFile(file.c_str(), O_ACCMODE).InitCheck(), B_BAD_VALUE);
	EXPECT_EQ(BFile(file.c_str(), 0x10000000).InitCheck(), B_BAD_VALUE);
}


TEST(FileTest, OpeningFailsWithTheReason)
{
	const TemporaryFolder folder;
	const BEntry unset;
	EXPECT_EQ(BFile().InitCheck(), B_NO_INIT);
	EXPECT_EQ(BFile((const char*)nullptr, B_READ_ONLY).InitCheck(), B_BAD_VALUE);
	EXPECT_EQ(BFile((const entry_ref*)nullptr, B_READ_ONLY).InitCheck(), B_BAD_VALUE);
	EXPECT_EQ(BFile(&unset, B_READ_ONLY).InitCheck(), B_NO_INIT);
	EXPECT_EQ(BFile(folder.Path().c_str(), B_READ_ONLY).InitCheck(), B_OK);
	EXPECT_EQ(BFile(folder.Path().c_str(), B_READ_WRITE).InitCheck(), B_IS_A_DIRECTORY);
	EXPECT_EQ(BFile((folder / "no/file").c_str(), B_WRITE_ONLY | B_CREATE_FILE).InitCheck(),
		B_ENTRY_NOT_FOUND);
	const BDirectory directory;
	EXPECT_EQ(BFile(&directory, "x", B_READ_ONLY).InitCheck(), B_NO_INIT);
	EXPECT_EQ(BFile(std::string(3000, 'x').c_str(), B_READ_ONLY).InitCheck(), B_NAME_TOO_LONG);
}


TEST(FileTest, NewFilesHaveTheUsualPermissions)
{
	const TemporaryFolder folder;
	const mode_t mask = umask(022);
	const BFile file((folder / "new").c_str(), B_WRITE_ONLY | B_CREATE_FILE);
	umask(mask);
	mode_t permissions;
	ASSERT_EQ(file.GetPermissions(&permissions), B_OK);
	EXPECT_EQ(permissions, 0644u);
}


TEST(FileTest, ReadAndWriteMoveThePosition)
{
	const TemporaryFolder folder;
	BFile file((folder / "file").c_str(), B_READ_WRITE | B_CREATE_FILE);
	EXPECT_EQ(file.Write("0123456789", 10), 10);
	EXPECT_EQ(file.Position(), 10);
	EXPECT_EQ(file.Seek(-4, SEEK_END), 6);
	char buffer[16] = {};
	EXPECT_EQ(file.Read(buffer, sizeof(buffer)), 4);
	EXPECT_STREQ(buffer, "6789");
	EXPECT_EQ(file.Read(buffer, sizeof(buffer)), 0);
	EXPECT_EQ(file.Seek(2, SEEK_SET), 2);
	EXPECT_EQ(file.ReadAt(8, buffer, 2), 2);
	EXPECT_EQ(file.WriteAt(0, "ab", 2), 2);
	EXPECT_EQ(file.Position(), 2);
	EXPECT_EQ(folder.Read("file"), "ab23456789");
	EXPECT_EQ(file.Seek(-1, SEEK_SET), B_BAD_VALUE);
	EXPECT_EQ(file.ReadAt(-1, buffer, 1), B_BAD_VALUE);
	EXPECT_EQ(file.Write("", 0), 0);
}


TEST(FileTest, AppendingStartsAtTheEnd)
{
	const TemporaryFolder folder;
	BFile file(folder.Write("file", "one").c_str(), B_READ_WRITE | B_OPEN_AT_END);
	EXPECT_EQ(file.Position(), 3);
	EXPECT_EQ(file.Write("two", 3), 3);
	EXPECT_EQ(folder.Read("file"), "onetwo");
}


TEST(FileTest, SizeGrowsWithZerosAndShrinks)
{
	const TemporaryFolder folder;
	BFile file(folder.Write("file", "12345").c_str(), B_READ_WRITE);
	EXPECT_EQ(file.SetSize(7), B_OK);
	EXPECT_EQ(folder.Read("file"), std::string("12345\0\0", 7));
	EXPECT_EQ(file.SetSize(2), B_OK);
	off_t size;
	EXPECT_EQ(file.GetSize(&size), B_OK);
	EXPECT_EQ(size, 2);
	EXPECT_EQ(file.SetSize(-1), B_BAD_VALUE);
}


TEST(FileTest, WrongDirectionIsRefused)
{
	const TemporaryFolder folder;
	char buffer[4];
	BFile reader(folder.Write("file", "1234").c_str(), B_READ_ONLY);
	EXPECT_TRUE(reader.IsReadable());
	EXPECT_FALSE(reader.IsWritable());
	EXPECT_EQ(reader.Write("x", 1), B_FILE_ERROR);
	EXPECT_EQ(reader.SetSize(0), B_FILE_ERROR);
	BFile writer((folder / "file").c_str(), B_WRITE_ONLY);
	EXPECT_FALSE(writer.IsReadable());
	EXPECT_EQ(writer.Read(buffer, 4), B_FILE_ERROR);
	EXPECT_EQ(folder.Read("file"), "1234");
}


TEST(FileTest, UnsetFileDoesNothing)
{
	const TemporaryFolder folder;
	BFile file(folder.Write("file").c_str(), B_READ_WRITE);
	file.Unset();
	char byte;
	off_t size;
	EXPECT_EQ(file.InitCheck(), B_NO_INIT);
	EXPECT_EQ(file.Read(&byte, 1), B_NO_INIT);
	EXPECT_EQ(file.Write(&byte, 1), B_NO_INIT);
	EXPECT_EQ(file.Seek(0, SEEK_SET), B_NO_INIT);
	EXPECT_EQ(file.GetSize(&size), B_NO_INIT);
	EXPECT_FALSE(file.IsReadable());
}


TEST(FileTest, CopySharesThePosition)
{
	const TemporaryFolder folder;
	BFile file(folder.Write("file", "1234").c_str(), B_READ_ONLY);
	BFile copy(file);
	char buffer[2];
	EXPECT_EQ(copy.Read(buffer, 2), 2);
	EXPECT_EQ(file.Position(), 2);
	file.Unset();
	EXPECT_EQ(copy.Read(buffer, 2), 2);
}


TEST(FileTest, LinkIsFollowed)
{
	const TemporaryFolder folder;
	folder.Write("target", "1234");
	folder.Link("target", "link");
	const BFile file((folder / "link").c_str(), B_READ_ONLY);
	EXPECT_TRUE(file.IsFile());
	folder.Link("missing", "dangling");
	EXPECT_EQ(BFile((folder / "dangling").c_str(), B_READ_ONLY).InitCheck(), B_ENTRY_NOT_FOUND);
}


TEST(FileTest, FullDeviceIsReported)
{
	BFile file("/dev/full", B_WRITE_ONLY);
	if (file.InitCheck() != B_OK)
		GTEST_SKIP() << "the host has no device that is always full";
	EXPECT_EQ(file.Write("x", 1), B_DEVICE_FULL);
}


TEST(FileTest, WriteThatRunsIntoALimitTellsWhatWentInThenWhy)
{
	const TemporaryFolder folder;
	BFile file((folder / "file").c_str(), B_WRITE_ONLY | B_CREATE_FILE);
	struct rlimit old;
	ASSERT_EQ(getrlimit(RLIMIT_FSIZE, &old), 0);
	const auto handler = signal(SIGXFSZ, SIG_IGN);
	const struct rlimit limit = {100, old.rlim_max};
	ASSERT_EQ(setrlimit(RLIMIT_FSIZE, &limit), 0);
	const std::string data(150, 'x');
	const ssize_t first = file.Write(data.data(), data.size());
	const ssize_t second = file.Write(data.data(), data.size());
	setrlimit(RLIMIT_FSIZE, &old);
	signal(SIGXFSZ, handler);
	EXPECT_EQ(first, 100);
	EXPECT_EQ(second, B_FILE_TOO_LARGE);
}

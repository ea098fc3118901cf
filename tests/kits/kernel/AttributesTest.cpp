// SPDX-License-Identifier: MIT
// Attributes of files. Where the build folder's file system has none, the tests are skipped.

#include <fs_attr.h>

#include <errno.h>
#include <fcntl.h>
#include <string.h>
#include <sys/xattr.h>
#include <unistd.h>

#include <set>
#include <string>
#include <vector>

#include <TypeConstants.h>

#include <gtest/gtest.h>

namespace {

class AttributesTest : public testing::Test {
protected:
	void SetUp() override
	{
		fPath = std::string(PLIM_BUILD_DIR) + "/tests/attributes_" + std::to_string(getpid());
		fFd = open(fPath.c_str(), O_RDWR | O_CREAT | O_TRUNC, 0600);
		ASSERT_GE(fFd, 0);
		if (fsetxattr(fFd, "user.probe", "x", 1, 0) != 0)
			GTEST_SKIP() << "no extended attributes here";
		fremovexattr(fFd, "user.probe");
	}
	void TearDown() override
	{
		close(fFd);
		unlink(fPath.c_str());
	}

	std::string Read(const char* name)
	{
		char buffer[256];
		ssize_t bytes = fs_read_attr(fFd, name, B_ANY_TYPE, 0, buffer, sizeof(buffer));
		return bytes < 0 ? "failed" : std::string(buffer, bytes);
	}

	std::string HostValue(const char* name)
	{
		char buffer[256];
		ssize_t bytes = fgetxattr(fFd, name, buffer, sizeof(buffer));
		return bytes < 0 ? "failed" : std::string(buffer, bytes);
	}

	std::string fPath;
	int fFd = -1;
};


TEST_F(AttributesTest, KeepTheirTypeAndData)
{
	const char data[] = {'a', '\0', 'b'};
	EXPECT_EQ(fs_write_attr(fFd, "test", B_RECT_TYPE, 0, data, 3), 3);
	attr_info info;
	ASSERT_EQ(fs_stat_attr(fFd, "test", &info), 0);
	EXPECT_EQ(info.type, uint32(B_RECT_TYPE));
	EXPECT_EQ(info.size, 3);
	EXPECT_EQ(Read("test"), std::string(data, 3));
	char byte;
	EXPECT_EQ(fs_read_attr(fFd, "test", B_ANY_TYPE, 2, &byte, 1), 1);
	EXPECT_EQ(byte, 'b');
	EXPECT_EQ(fs_read_attr(fFd, "test", B_ANY_TYPE, 3, &byte, 1), 0);
	EXPECT_EQ(fs_write_attr(fFd, "empty", B_RAW_TYPE, 0, nullptr, 0), 0);
	EXPECT_EQ(Read("empty"), "");
}


TEST_F(AttributesTest, AreReplacedAtTheStartAndExtendedElsewhere)
{
	fs_write_attr(fFd, "test", B_STRING_TYPE, 0, "abcdef", 6);
	EXPECT_EQ(fs_write_attr(fFd, "test", B_STRING_TYPE, 0, "xy", 2), 2);
	EXPECT_EQ(Read("test"), "xy");
	EXPECT_EQ(fs_write_attr(fFd, "test", B_STRING_TYPE, 1, "z", 1), 1);
	EXPECT_EQ(Read("test"), "xz");
	EXPECT_EQ(fs_write_attr(fFd, "test", B_STRING_TYPE, 3, "w", 1), 1);
	EXPECT_EQ(Read("test"), std::string("xz\0w", 4));
	EXPECT_EQ(fs_write_attr(fFd, "new", B_STRING_TYPE, 1, "w", 1), 1);
	EXPECT_EQ(Read("new"), std::string("\0w", 2));
}


TEST_F(AttributesTest, TheMimeTypeIsWhatOtherProgramsKnow)
{
	EXPECT_EQ(fs_write_attr(fFd, "BEOS:TYPE", B_MIME_STRING_TYPE, 0, "text/plain", 11), 11);
	EXPECT_EQ(HostValue("user.mime_type"), "text/plain");
	EXPECT_EQ(Read("BEOS:TYPE"), std::string("text/plain", 11));

	fsetxattr(fFd, "user.mime_type", "image/png", 9, 0);
	EXPECT_EQ(Read("BEOS:TYPE"), std::string("image/png", 10));
	attr_info info;
	ASSERT_EQ(fs_stat_attr(fFd, "BEOS:TYPE", &info), 0);
	EXPECT_EQ(info.type, uint32(B_MIME_STRING_TYPE));
	EXPECT_EQ(info.size, 10);
	EXPECT_EQ(fs_remove_attr(fFd, "BEOS:TYPE"), 0);
	EXPECT_EQ(HostValue("user.mime_type"), "failed");
}


TEST_F(AttributesTest, ThoseOfOtherProgramsAreReadAsTheyAre)
{
	fsetxattr(fFd, "user.other", "plain", 5, 0);
	EXPECT_EQ(Read("other"), "plain");
	attr_info info;
	ASSERT_EQ(fs_stat_attr(fFd, "other", &info), 0);
	EXPECT_EQ(info.type, uint32(B_XATTR_TYPE));
}


TEST_F(AttributesTest, AreListed)
{
	fs_write_attr(fFd, "one", B_RAW_TYPE, 0, "1", 1);
	fs_write_attr(fFd, "BEOS:TYPE", B_MIME_STRING_TYPE, 0, "a/b", 4);
	for (DIR* directory : {fs_fopen_attr_dir(fFd), fs_open_attr_dir(fPath.c_str())}) {
		ASSERT_NE(directory, nullptr);
		std::set<std::string> names;
		while (dirent* entry = fs_read_attr_dir(directory))
			names.insert(entry->d_name);
		EXPECT_EQ(names, (std::set<std::string>{"BEOS:TYPE", "one"}));
		fs_rewind_attr_dir(directory);
		EXPECT_NE(fs_read_attr_dir(directory), nullptr);
		EXPECT_EQ(fs_close_attr_dir(directory), 0);
	}
}


TEST_F(AttributesTest, WhatFailsSaysWhy)
{
	char byte = 0;
	attr_info info;
	EXPECT_EQ(fs_read_attr(fFd, "missing", B_ANY_TYPE, 0, &byte, 1), -1);
	EXPECT_EQ(errno, ENOENT);
	EXPECT_EQ(fs_stat_attr(fFd, "missing", &info), -1);
	EXPECT_EQ(errno, ENOENT);
	EXPECT_EQ(fs_remove_attr(fFd, "missing"), -1);
	EXPECT_EQ(errno, ENOENT);
	EXPECT_EQ(fs_write_attr(fFd, std::string(300, 'n').c_str(), 'a', 0, "x", 1), -1);
	EXPECT_EQ(errno, ENAMETOOLONG);
	EXPECT_EQ(fs_write_attr(fFd, "", 'a', 0, "x", 1), -1);
	EXPECT_EQ(errno, EINVAL);
	EXPECT_EQ(fs_write_attr(fFd, "test", 'a', -1, "x", 1), -1);
	EXPECT_EQ(errno, EINVAL);
	EXPECT_EQ(fs_write_attr(-1, "test", 'a', 0, "x", 1), -1);
	EXPECT_EQ(errno, EBADF);
	std::vector<char> large(100000);
	EXPECT_EQ(fs_write_attr(fFd, "test", 'a', 0, large.data(), large.size()), -1);
	EXPECT_EQ(errno, ENOSPC);
	EXPECT_EQ(fs_open_attr_dir("/nothing/here"), nullptr);
	EXPECT_EQ(errno, ENOENT);
	EXPECT_EQ(fs_close_attr_dir(nullptr), -1);
}

} // namespace

// SPDX-License-Identifier: MIT
// find_directory: the user's folders by the XDG conventions.

#include <FindDirectory.h>

#include <gtest/gtest.h>

#include <Errors.h>
#include <Path.h>

#include "support/TemporaryFolder.h"

namespace {

std::string
Find(directory_which which, bool createIt = false)
{
	BPath path;
	return find_directory(which, &path, createIt) == B_OK ? path.Path() : "";
}

} // namespace


TEST(FindDirectoryTest, SettingsFollowTheConfigHome)
{
	const ScopedVariable config("XDG_CONFIG_HOME", "/somewhere/config/");
	EXPECT_EQ(Find(B_USER_SETTINGS_DIRECTORY), "/somewhere/config");
	EXPECT_EQ(Find(B_SYSTEM_SETTINGS_DIRECTORY), "/somewhere/config");
	EXPECT_EQ(Find(B_COMMON_SETTINGS_DIRECTORY), "/somewhere/config");
}


TEST(FindDirectoryTest, DefaultsAreInTheHome)
{
	const ScopedVariable home("HOME", "/home/somebody");
	for (const char* name : {"", "relative/path"}) {
		const ScopedVariable config("XDG_CONFIG_HOME", name);
		const ScopedVariable data("XDG_DATA_HOME", name);
		const ScopedVariable cache("XDG_CACHE_HOME", name);
		EXPECT_EQ(Find(B_USER_SETTINGS_DIRECTORY), "/home/somebody/.config");
		EXPECT_EQ(Find(B_USER_DATA_DIRECTORY), "/home/somebody/.local/share");
		EXPECT_EQ(Find(B_USER_CACHE_DIRECTORY), "/home/somebody/.cache");
		EXPECT_EQ(Find(B_USER_DIRECTORY), "/home/somebody");
		EXPECT_EQ(Find(B_DESKTOP_DIRECTORY), "/home/somebody/Desktop");
	}
}


TEST(FindDirectoryTest, DesktopIsWhereTheUserPutIt)
{
	const TemporaryFolder folder;
	const ScopedVariable home("HOME", "/home/somebody");
	const ScopedVariable config("XDG_CONFIG_HOME", folder.Path());
	folder.Write("user-dirs.dirs", "# comment\nXDG_DESKTOP_DIR=\"$HOME/Schreib\\\"tisch/\"\n");
	EXPECT_EQ(Find(B_DESKTOP_DIRECTORY), "/home/somebody/Schreib\"tisch");
	folder.Write("user-dirs.dirs", "XDG_DESKTOP_DIR=\"/desk\"\n");
	EXPECT_EQ(Find(B_DESKTOP_DIRECTORY), "/desk");
	folder.Write(
		"user-dirs.dirs", "XDG_DESKTOP_DIR=\"\nXDG_DESKTOP_DIR=\"relative\"\nXDG_DESKTOP_DIR");
	EXPECT_EQ(Find(B_DESKTOP_DIRECTORY), "/home/somebody/Desktop");
}


TEST(FindDirectoryTest, FolderIsMadeOnlyWhenAsked)
{
	const TemporaryFolder folder;
	const ScopedVariable config("XDG_CONFIG_HOME", folder / "a/b");
	EXPECT_EQ(Find(B_USER_SETTINGS_DIRECTORY), folder / "a/b");
	EXPECT_FALSE(std::filesystem::exists(folder / "a"));
	EXPECT_EQ(Find(B_USER_SETTINGS_DIRECTORY, true), folder / "a/b");
	EXPECT_TRUE(std::filesystem::is_directory(folder / "a/b"));
}


TEST(FindDirectoryTest, FolderThatCannotBeMadeIsAnError)
{
	const TemporaryFolder folder;
	folder.Write("file");
	const ScopedVariable config("XDG_CONFIG_HOME", folder / "file/config");
	BPath path("/old");
	EXPECT_EQ(find_directory(B_USER_SETTINGS_DIRECTORY, &path, true), B_NOT_A_DIRECTORY);
	EXPECT_EQ(path.Path(), nullptr);
}


TEST(FindDirectoryTest, UnknownFoldersAndNullAreBadValues)
{
	BPath path;
	char buffer[16];
	EXPECT_EQ(find_directory((directory_which)-1, &path), B_BAD_VALUE);
	EXPECT_EQ(find_directory((directory_which)123456, &path), B_BAD_VALUE);
	EXPECT_EQ(find_directory(B_USER_DIRECTORY, nullptr), B_BAD_VALUE);
	EXPECT_EQ(find_directory(B_USER_DIRECTORY, 0, false, nullptr, 16), B_BAD_VALUE);
	EXPECT_EQ(find_directory(B_USER_DIRECTORY, 0, false, buffer, 0), B_BAD_VALUE);
}


TEST(FindDirectoryTest, BufferMustHoldThePathAndItsEnd)
{
	const ScopedVariable home("HOME", "/home/me");
	char buffer[16] = "old";
	EXPECT_EQ(find_directory(B_USER_DIRECTORY, 0, false, buffer, 8), B_BUFFER_OVERFLOW);
	EXPECT_STREQ(buffer, "old");
	EXPECT_EQ(find_directory(B_USER_DIRECTORY, 0, false, buffer, 9), B_OK);
	EXPECT_STREQ(buffer, "/home/me");
}


TEST(FindDirectoryTest, TemporaryFolderFollowsTheHost)
{
	const ScopedVariable temporary("TMPDIR", "/var/somewhere");
	EXPECT_EQ(Find(B_SYSTEM_TEMP_DIRECTORY), "/var/somewhere");
}


TEST(FindDirectoryTest, EveryFolderHasAnAbsolutePath)
{
	for (int which = 0; which < 5000; which++) {
		BPath path;
		const status_t status = find_directory((directory_which)which, &path);
		if (status == B_OK)
			EXPECT_TRUE(path.IsAbsolute()) << which;
		else
			EXPECT_EQ(status, B_BAD_VALUE) << which;
	}
	for (int which : {0, 1, 1000, 1019, 2010, 2034, 3000, 3037, 4000, 4003})
		EXPECT_NE(Find((directory_which)which), "") << which;
}

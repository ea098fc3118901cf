// SPDX-License-Identifier: MIT
// Tests of what file panels remember.
#include "interface/panel/PanelMemory.h"

#include <cmath>

#include <gtest/gtest.h>

#include "support/TemporaryFolder.h"

using namespace BPrivate;

class PanelMemoryTest : public ::testing::Test {
protected:
	TemporaryFolder fFolder;
	const std::string fSettings = fFolder.Make("settings");
	const ScopedVariable fConfig{"XDG_CONFIG_HOME", fSettings};
};


TEST_F(PanelMemoryTest, WhatIsSavedIsLoaded)
{
	PanelMemory memory("application/x-vnd.test");
	memory.AddFolder(fFolder.Make("a"));
	memory.AddFolder(fFolder.Make("b"));
	memory.SetSize(640.7f, 480);
	memory.SetShowsHidden(true);
	ASSERT_EQ(memory.Save(), B_OK);

	PanelMemory loaded("application/x-vnd.test");
	ASSERT_EQ(loaded.Load(), B_OK);
	EXPECT_EQ(loaded.Folders(), (std::vector<std::string>{fFolder / "b", fFolder / "a"}));
	EXPECT_EQ(loaded.Width(), 640);
	EXPECT_EQ(loaded.Height(), 480);
	EXPECT_TRUE(loaded.ShowsHidden());
}


TEST_F(PanelMemoryTest, EachApplicationHasItsOwn)
{
	PanelMemory memory("application/x-vnd.one");
	memory.AddFolder(fFolder.Path());
	ASSERT_EQ(memory.Save(), B_OK);
	PanelMemory other("application/x-vnd.other");
	EXPECT_EQ(other.Load(), B_ENTRY_NOT_FOUND);
	EXPECT_TRUE(other.Folders().empty());
}


TEST_F(PanelMemoryTest, ASignatureLeadsNowhereElse)
{
	PanelMemory memory("../../escaped");
	memory.AddFolder(fFolder.Path());
	ASSERT_EQ(memory.Save(), B_OK);
	EXPECT_TRUE(std::filesystem::is_empty(fFolder.Make("empty")));
	EXPECT_FALSE(std::filesystem::exists(fFolder / "escaped"));
	int32 files = 0;
	for (const auto& entry : std::filesystem::recursive_directory_iterator(fSettings))
		files += entry.is_regular_file();
	EXPECT_EQ(files, 1);
	PanelMemory without("");
	EXPECT_EQ(without.Save(), B_OK);
}


TEST_F(PanelMemoryTest, TheNewestFoldersComeFirstAndTheOldestGo)
{
	PanelMemory memory("x");
	for (int i = 0; i < 7; i++)
		memory.AddFolder(fFolder.Make("f" + std::to_string(i)));
	memory.AddFolder(fFolder / "f4");
	EXPECT_EQ(memory.Folders(),
		(std::vector<std::string>{
			fFolder / "f4", fFolder / "f6", fFolder / "f5", fFolder / "f3", fFolder / "f2"}));
}


TEST_F(PanelMemoryTest, FoldersThatAreGoneAreLeftOut)
{
	PanelMemory memory("x");
	memory.AddFolder(fFolder.Make("stays"));
	memory.AddFolder(fFolder / "gone");
	EXPECT_EQ(memory.Folders(), std::vector<std::string>{fFolder / "stays"});
}


TEST_F(PanelMemoryTest, ADamagedFileCountsAsEmpty)
{
	PanelMemory memory("x");
	memory.AddFolder(fFolder.Path());
	memory.SetSize(600, 400);
	ASSERT_EQ(memory.Save(), B_OK);
	std::string file;
	for (const auto& entry : std::filesystem::recursive_directory_iterator(fSettings)) {
		if (entry.is_regular_file())
			file = entry.path();
	}
	std::ifstream stream(file, std::ios::binary);
	const std::string content(std::istreambuf_iterator<char>(stream), {});

	for (size_t length = 0; length < content.size(); length++) {
		std::ofstream(file, std::ios::binary) << content.substr(0, length);
		PanelMemory damaged("x");
		EXPECT_NE(damaged.Load(), B_OK) << length;
		EXPECT_TRUE(damaged.Folders().empty()) << length;
		EXPECT_EQ(damaged.Width(), 0) << length;
	}
}


TEST_F(PanelMemoryTest, SizesThatAreNoneAreZero)
{
	PanelMemory memory("x");
	memory.SetSize(NAN, -5);
	EXPECT_EQ(memory.Width(), 0);
	EXPECT_EQ(memory.Height(), 0);
	memory.SetSize(1e9f, 10.5f);
	EXPECT_EQ(memory.Width(), 10000);
	EXPECT_EQ(memory.Height(), 10);
}


TEST_F(PanelMemoryTest, WithoutAPlaceForItNothingIsSaved)
{
	const ScopedVariable config("XDG_CONFIG_HOME", fFolder.Write("file") + "/config");
	PanelMemory memory("x");
	memory.AddFolder(fFolder.Path());
	EXPECT_NE(memory.Save(), B_OK);
	EXPECT_NE(PanelMemory("x").Load(), B_OK);
}


TEST_F(PanelMemoryTest, APanelStartsInTheCurrentFolder)
{
	const ScopedVariable home("HOME", fFolder.Make("home"));
	const std::filesystem::path before = std::filesystem::current_path();
	PanelMemory memory("x");
	memory.AddFolder(fFolder.Make("remembered"));
	std::filesystem::current_path(fFolder.Make("current"));
	EXPECT_EQ(StartFolder(memory), fFolder / "current");
	std::filesystem::current_path(before);
}


TEST_F(PanelMemoryTest, APanelOfTheDesktopStartsWhereItWasLast)
{
	const ScopedVariable home("HOME", fFolder.Make("home"));
	const std::filesystem::path before = std::filesystem::current_path();
	PanelMemory memory("x");
	std::filesystem::current_path(fFolder / "home");
	EXPECT_EQ(StartFolder(memory), fFolder / "home");
	memory.AddFolder(fFolder.Make("remembered"));
	EXPECT_EQ(StartFolder(memory), fFolder / "remembered");
	std::filesystem::current_path("/");
	EXPECT_EQ(StartFolder(memory), fFolder / "remembered");
	std::filesystem::remove(fFolder / "remembered");
	EXPECT_EQ(StartFolder(memory), "/");
	std::filesystem::current_path(before);
}

// SPDX-License-Identifier: MIT

#include "app/Preferences.h"

#include <gtest/gtest.h>

#include <filesystem>

#include <Rect.h>

#include "support/Printers.h"
#include "support/TemporaryFolder.h"

class PreferencesTest : public testing::Test {
protected:
	TemporaryFolder fFolder;
	ScopedVariable fHome{"XDG_CONFIG_HOME", fFolder.Path()};
};


TEST_F(PreferencesTest, AMissingFileLeavesNoFields)
{
	TPreferences preferences("Plim_Settings");
	EXPECT_EQ(preferences.InitCheck(), B_ENTRY_NOT_FOUND);
	EXPECT_TRUE(preferences.IsEmpty());
	EXPECT_EQ(preferences.what, static_cast<uint32>('pref'));
}


TEST_F(PreferencesTest, WhatWasSetIsThereInTheNextRun)
{
	const BRect frames[] = {
		BRect(1, 2, 3, 4), BRect(5, 6, 7, 8), BRect(9, 9, 10, 10), BRect(11, 12, 13, 14)};
	{
		TPreferences preferences("Plim_Settings");
		preferences.SetRect("MainWindowFrame", frames[0]);
		preferences.SetRect("PaletteFrame", frames[1]);
		preferences.SetRect("PropertyWinFrame", frames[2]);
		preferences.SetRect("ProjectWinFrame", frames[3]);
	}
	TPreferences preferences("Plim_Settings");
	EXPECT_EQ(preferences.InitCheck(), B_OK);
	EXPECT_EQ(preferences.FindRect("MainWindowFrame"), frames[0]);
	EXPECT_EQ(preferences.FindRect("PaletteFrame"), frames[1]);
	EXPECT_EQ(preferences.FindRect("PropertyWinFrame"), frames[2]);
	EXPECT_EQ(preferences.FindRect("ProjectWinFrame"), frames[3]);
}


TEST_F(PreferencesTest, ALongerOldFileKeepsItsTail)
{
	size_t longLength;
	{
		TPreferences preferences("Plim_Settings");
		preferences.SetString("text", std::string(500, 'x').c_str());
	}
	longLength = fFolder.Read("Plim_Settings").size();
	{
		TPreferences preferences("Plim_Settings");
		preferences.SetString("text", "short");
	}
	EXPECT_EQ(fFolder.Read("Plim_Settings").size(), longLength);
	TPreferences preferences("Plim_Settings");
	EXPECT_STREQ(preferences.FindString("text"), "short");
}


TEST_F(PreferencesTest, AFileThatIsNoMessageIsReportedAndLeavesNoFields)
{
	fFolder.Write("Plim_Settings", "no message at all, but long enough to look at");
	TPreferences preferences("Plim_Settings");
	EXPECT_EQ(preferences.InitCheck(), B_NOT_A_MESSAGE);
	EXPECT_TRUE(preferences.IsEmpty());
	preferences.LeaveFileAlone();
}


TEST_F(PreferencesTest, AProgramThatOnlyReadsLeavesTheFileAlone)
{
	{
		TPreferences preferences("Plim_Settings");
		preferences.SetString("text", "lost");
		preferences.LeaveFileAlone();
	}
	EXPECT_FALSE(std::filesystem::exists(fFolder / "Plim_Settings"));
}


TEST_F(PreferencesTest, AMissingSettingsFolderIsMadeForTheFirstFile)
{
	ScopedVariable home("XDG_CONFIG_HOME", fFolder / "new/config");
	{
		TPreferences preferences("Plim_Settings");
		preferences.SetBool("set", true);
	}
	EXPECT_TRUE(std::filesystem::exists(fFolder / "new/config/Plim_Settings"));
}

// SPDX-License-Identifier: MIT

#include "palette/PaletteCatalog.h"

#include <gtest/gtest.h>

#include "palette/PaletteEntry.h"

TEST(PaletteCatalogTest, FindsTheFirstEntryOfExactlyThatClass)
{
	TPaletteEntry first(0, "Button", "TButton");
	TPaletteEntry second(1, "OtherButton", "TButton");
	TPaletteCatalog catalog;
	catalog.AddPalEntry(&first);
	catalog.AddPalEntry(&second);

	EXPECT_EQ(catalog.FindPalEntry("TButton"), &first);
	EXPECT_EQ(catalog.FindPalEntry("tbutton"), nullptr);
	EXPECT_EQ(catalog.FindPalEntry("TButton "), nullptr);
	EXPECT_EQ(catalog.FindPalEntry(nullptr), nullptr);
}


TEST(PaletteCatalogTest, KeepsTheDropEntryUntilItIsReplaced)
{
	TPaletteEntry entry(0, "Button", "TButton");
	TPaletteCatalog catalog;
	EXPECT_EQ(catalog.DropEntry(), nullptr);
	catalog.SetDropEntry(&entry);
	EXPECT_EQ(catalog.DropEntry(), &entry);
	catalog.SetDropEntry(nullptr);
	EXPECT_EQ(catalog.DropEntry(), nullptr);
}


TEST(PaletteEntryTest, KeepsWhatItWasMadeWith)
{
	TPaletteEntry entry(7, "Button", "TButton");
	EXPECT_EQ(entry.EntryNumber(), 7);
	EXPECT_STREQ(entry.ComponentName(), "Button");
	EXPECT_STREQ(entry.ClassName(), "TButton");
	EXPECT_EQ(entry.Component(), nullptr);
	EXPECT_EQ(entry.CreateComponent(nullptr, nullptr, BRect(0, 0, 9, 9)), nullptr);
	EXPECT_STREQ(entry.Copyright(), "Your name here");
}


TEST(PaletteEntryTest, WithoutAButtonTheSizeStaysAsItWas)
{
	TPaletteEntry entry(7, "Button", "TButton");
	BPoint size(3, 4);
	entry.GetButtonSize(&size);
	EXPECT_EQ(size, BPoint(3, 4));
}

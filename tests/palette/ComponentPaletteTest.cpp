// SPDX-License-Identifier: MIT

#include "palette/ComponentPalette.h"

#include <cmath>

#include <gtest/gtest.h>

#include <Application.h>
#include <Autolock.h>
#include <Button.h>
#include <Entry.h>
#include <Messenger.h>
#include <Screen.h>
#include <ScrollBar.h>

#include "app/Preferences.h"
#include "palette/ComponentPaletteView.h"
#include "palette/LibraryLoader.h"
#include "palette/PaletteCatalog.h"
#include "palette/PaletteEntry.h"
#include "support/CapturedOutput.h"
#include "support/Printers.h"
#include "support/Robot.h"

extern "C" int32 be_count_lock_violations();

class ComponentPaletteTest : public testing::Test {
protected:
	ComponentPaletteTest()
	{
		AppSettings.LeaveFileAlone();
		AppSettings.MakeEmpty();
	}

	~ComponentPaletteTest()
	{
		EXPECT_EQ(be_count_lock_violations(), 0);
		PaletteCatalog().SetDropEntry(nullptr);
	}

	/// The palette with the entries of the test's library, shown.
	ComponentPalette* ShowPalette()
	{
		CapturedOutput output;
		ComponentPalette* palette = new ComponentPalette;
		TLibraryLoader loader(&PaletteCatalog(), palette->View());
		loader.LoadFolder(PLIM_BUILD_DIR "/tests/libraries/good");
		palette->View()->SetColumnHeight(loader.ColumnHeight());
		palette->Show();
		return palette;
	}

	static void Close(BWindow* window)
	{
		ASSERT_TRUE(window->Lock());
		window->Quit();
	}

	static BRect StoredFrame()
	{
		BRect frame;
		return AppSettings.FindRect("PaletteFrame", &frame) == B_OK ? frame : BRect();
	}

	BApplication fApplication{"application/x-vnd.Plimworks-ComponentPaletteTest"};
};


TEST_F(ComponentPaletteTest, StandsInTheMiddleOfTheScreenToBeginWith)
{
	CapturedOutput output;
	ComponentPalette* palette = new ComponentPalette;
	EXPECT_NE(output.Text().find("BPoint(x:"), std::string::npos);
	const BRect screen = BScreen(B_MAIN_SCREEN_ID).Frame();
	EXPECT_EQ(
		palette->Frame().LeftTop(), BPoint(std::round((screen.right - screen.left) / 2 - 50), 120));
	EXPECT_EQ(palette->Bounds(), BRect(0, 0, 115, 300));
	EXPECT_STREQ(palette->Title(), "Components");
	EXPECT_EQ(palette->Feel(), B_FLOATING_APP_WINDOW_FEEL);
	EXPECT_EQ(palette->Flags() & 0x54u, 0x54u);
	EXPECT_STREQ(palette->View()->Name(), "vwComponentPalette");
	EXPECT_NE(palette->FindView("svPalette"), nullptr);
	palette->Quit();
}


TEST_F(ComponentPaletteTest, AStoredFrameWinsOverTheDefaultPlace)
{
	AppSettings.SetRect("PaletteFrame", BRect(30, 40, 150, 290));
	CapturedOutput output;
	ComponentPalette* palette = new ComponentPalette;
	EXPECT_EQ(palette->Frame(), BRect(30, 40, 150, 290));
	palette->Quit();
}


TEST_F(ComponentPaletteTest, ClosingHidesItUntilItMayClose)
{
	ComponentPalette* palette = ShowPalette();
	const BMessenger messenger(palette);
	messenger.SendMessage(B_QUIT_REQUESTED);
	Robot robot;
	EXPECT_TRUE(robot.WaitForNoWindow("Components"));
	ASSERT_TRUE(messenger.IsValid());
	{
		BAutolock lock(palette);
		EXPECT_TRUE(palette->IsHidden());
	}
	EXPECT_FALSE(StoredFrame().IsValid());
	Close(palette);
}


TEST_F(ComponentPaletteTest, ClosingForGoodStoresTheFrame)
{
	ComponentPalette* palette = ShowPalette();
	const BMessenger messenger(palette);
	palette->OKToClose(true);
	{
		BAutolock lock(palette);
		palette->MoveTo(33, 44);
		EXPECT_TRUE(palette->QuitRequested());
		EXPECT_EQ(StoredFrame(), palette->Frame());
		EXPECT_EQ(StoredFrame().LeftTop(), BPoint(33, 44));
	}
	Close(palette);
	EXPECT_FALSE(messenger.IsValid());
}


TEST_F(ComponentPaletteTest, APressedButtonMakesItsEntryTheDropEntry)
{
	ComponentPalette* palette = ShowPalette();
	EXPECT_EQ(palette->DropEntry(), nullptr);
	Robot robot(palette);
	ASSERT_TRUE(robot.ClickView("Second"));
	EXPECT_EQ(palette->DropEntry(), palette->View()->FindPalEntry("TSecond"));
	ASSERT_TRUE(robot.ClickView("First"));
	ASSERT_NE(palette->DropEntry(), nullptr);
	EXPECT_STREQ(palette->DropEntry()->ClassName(), "TFirst");
	Close(palette);
}


TEST_F(ComponentPaletteTest, DroppedFilesAndOtherMessagesAreIgnored)
{
	ComponentPalette* palette = ShowPalette();
	BMessage drop(B_SIMPLE_DATA);
	entry_ref ref;
	get_ref_for_path("/tmp", &ref);
	drop.AddRef("refs", &ref);
	BMessage noEntry(kPaletteEntryPressed);
	{
		CapturedOutput output;
		const BMessenger window(palette);
		const BMessenger view(palette->View());
		BMessage reply;
		window.SendMessage(&drop, &reply);
		view.SendMessage(&drop, &reply);
		view.SendMessage(&noEntry, &reply);
		// The view prints what it gets.
		EXPECT_NE(output.Text().find("refs"), std::string::npos);
	}
	EXPECT_EQ(palette->DropEntry(), nullptr);
	Close(palette);
}


TEST_F(ComponentPaletteTest, EntriesAreFoundByTheExactNameOfTheirClass)
{
	ComponentPalette* palette = ShowPalette();
	ComponentPaletteView* view = palette->View();
	ASSERT_NE(view->FindPalEntry("TThird"), nullptr);
	EXPECT_STREQ(view->FindPalEntry("TThird")->ComponentName(), "Third");
	EXPECT_EQ(view->FindPalEntry("tthird"), nullptr);
	EXPECT_EQ(view->FindPalEntry("TThir"), nullptr);
	EXPECT_EQ(view->FindPalEntry(""), nullptr);
	EXPECT_EQ(view->FindPalEntry(nullptr), nullptr);

	TPaletteEntry fourth(4, "Fourth", "TFourth");
	view->AddPalEntry(&fourth);
	EXPECT_EQ(view->FindPalEntry("TFourth"), &fourth);
	EXPECT_EQ(PaletteCatalog().FindPalEntry("TFourth"), &fourth);
	Close(palette);
}


TEST_F(ComponentPaletteTest, AColumnThatIsLongerThanTheWindowCanBeScrolled)
{
	ComponentPalette* palette = ShowPalette();
	ASSERT_TRUE(palette->Lock());
	palette->View()->SetColumnHeight(500);
	const float height = palette->View()->Bounds().Height();
	float smallest;
	float largest;
	palette->View()->ScrollBar(B_VERTICAL)->GetRange(&smallest, &largest);
	EXPECT_EQ(smallest, 0);
	EXPECT_EQ(largest, 500 - height);

	palette->View()->SetColumnHeight(40);
	palette->View()->ScrollBar(B_VERTICAL)->GetRange(&smallest, &largest);
	EXPECT_EQ(largest, 0);
	palette->Quit();
}

// SPDX-License-Identifier: MIT

#include "app/WindowFrame.h"

#include <cmath>

#include <gtest/gtest.h>

#include <Application.h>
#include <Screen.h>
#include <Window.h>

#include "app/Preferences.h"
#include "support/Printers.h"

namespace {

const BRect kBuiltIn(100, 100, 200, 180);

} // namespace

class WindowFrameTest : public testing::Test {
protected:
	WindowFrameTest()
		: fWindow(new BWindow(kBuiltIn, "frame", B_TITLED_WINDOW, 0)),
		  fScreen(BScreen(B_MAIN_SCREEN_ID).Frame())
	{
		AppSettings.LeaveFileAlone();
		AppSettings.MakeEmpty();
	}

	~WindowFrameTest() { fWindow->Quit(); }

	BApplication fApplication{"application/x-vnd.Plimworks-WindowFrameTest"};
	BWindow* fWindow;
	BRect fScreen;
};


TEST_F(WindowFrameTest, WithoutASettingTheWindowKeepsItsFrame)
{
	EXPECT_FALSE(RestoreWindowFrame(fWindow, "TestFrame"));
	EXPECT_EQ(fWindow->Frame(), kBuiltIn);
}


TEST_F(WindowFrameTest, AStoredFrameComesBack)
{
	fWindow->MoveTo(40, 50);
	fWindow->ResizeTo(300, 120);
	StoreWindowFrame(fWindow, "TestFrame");
	fWindow->MoveTo(0, 0);
	fWindow->ResizeTo(10, 10);

	EXPECT_TRUE(RestoreWindowFrame(fWindow, "TestFrame"));
	EXPECT_EQ(fWindow->Frame(), BRect(40, 50, 340, 170));
}


TEST_F(WindowFrameTest, StoringAgainReplacesTheFrame)
{
	AppSettings.SetRect("TestFrame", BRect(1, 2, 3, 4));
	StoreWindowFrame(fWindow, "TestFrame");
	BRect frame;
	ASSERT_EQ(AppSettings.FindRect("TestFrame", &frame), B_OK);
	EXPECT_EQ(frame, kBuiltIn);
	EXPECT_NE(AppSettings.FindRect("TestFrame", 1, &frame), B_OK);
}


TEST_F(WindowFrameTest, AFrameOutsideEveryScreenIsBroughtOntoTheMainOne)
{
	AppSettings.SetRect("TestFrame", fScreen.OffsetByCopy(50000, 60000));
	AppSettings.SetRect("SmallFrame", BRect(-900, -900, -800, -850));

	EXPECT_TRUE(RestoreWindowFrame(fWindow, "TestFrame"));
	EXPECT_EQ(fWindow->Frame().LeftTop(), fScreen.LeftTop());
	EXPECT_TRUE(RestoreWindowFrame(fWindow, "SmallFrame"));
	EXPECT_EQ(fWindow->Frame(), BRect(0, 0, 100, 50));
}


TEST_F(WindowFrameTest, AFrameOfWhichTheScreenShowsAPartStaysWhereItIs)
{
	const BRect frame(fScreen.right - 10, 50, fScreen.right + 90, 150);
	AppSettings.SetRect("TestFrame", frame);
	EXPECT_TRUE(RestoreWindowFrame(fWindow, "TestFrame"));
	EXPECT_EQ(fWindow->Frame(), frame);
}


TEST_F(WindowFrameTest, AFrameThatIsNoneIsIgnored)
{
	AppSettings.SetRect("Inverted", BRect(50, 50, 20, 20));
	AppSettings.SetRect("NoNumber", BRect(NAN, 0, 100, 100));
	AppSettings.SetRect("Endless", BRect(0, 0, INFINITY, 100));
	AppSettings.SetString("Text", "100,100,200,200");
	for (const char* key : {"Inverted", "NoNumber", "Endless", "Text"}) {
		EXPECT_FALSE(RestoreWindowFrame(fWindow, key)) << key;
		EXPECT_EQ(fWindow->Frame(), kBuiltIn) << key;
	}
}


TEST(FrameOnScreenTest, MovesNoFurtherThanNeeded)
{
	const BRect screen(0, 0, 799, 599);
	EXPECT_EQ(FrameOnScreen(BRect(900, 20, 999, 119), screen), BRect(700, 20, 799, 119));
	EXPECT_EQ(FrameOnScreen(BRect(20, -500, 119, -401), screen), BRect(20, 0, 119, 99));
	EXPECT_EQ(FrameOnScreen(BRect(10, 10, 50, 50), screen), BRect(10, 10, 50, 50));
	EXPECT_EQ(FrameOnScreen(BRect(900, 700, 2899, 1899), screen), BRect(0, 0, 1999, 1199));
}

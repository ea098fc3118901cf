// SPDX-License-Identifier: MIT
// Menus used by clicks, by dragging and by pointing.
#include <Button.h>

#include "MenuFixture.h"

namespace {

class MenuPointerTest : public MenuTrackingTest {};

} // namespace


TEST_F(MenuPointerTest, ClickOpensAndAnotherClickChooses)
{
	Show();
	fRobot->ClickItem("File");
	ASSERT_TRUE(Opens(fFile));
	EXPECT_EQ(fMenuWindow->beginnings, 1);
	EXPECT_EQ(fMenuWindow->endings, 0);
	EXPECT_EQ(Selected(fBar), "File");
	fRobot->ClickItem("Save");
	EXPECT_TRUE(AllClosed());
	EXPECT_EQ(TakeCodes(), "save ");
	EXPECT_EQ(Selected(fBar), "");
	EXPECT_EQ(fMenuWindow->beginnings, 1);
}


TEST_F(MenuPointerTest, PressDragAndReleaseChooses)
{
	Show();
	fRobot->MoveTo(MiddleOf("File"));
	fRobot->Press();
	ASSERT_TRUE(Opens(fFile));
	fRobot->MoveTo(MiddleOf("Save"));
	EXPECT_EQ(Selected(fFile), "Save");
	fRobot->MoveTo(MiddleOf("Open"));
	EXPECT_EQ(Selected(fFile), "Open");
	fRobot->Release();
	EXPECT_TRUE(AllClosed());
	EXPECT_EQ(TakeCodes(), "open ");
}


TEST_F(MenuPointerTest, AReleaseThatIsToldLateWasWhereThePointerWasBefore)
{
	Show();
	fRobot->MoveTo(MiddleOf("File"));
	fRobot->Press();
	ASSERT_TRUE(Opens(fFile));
	// The pointer goes on to nowhere before the window of the press has handed on the release.
	BMessage moved(B_MOUSE_MOVED);
	moved.AddPoint("screen_where", BPoint(700, 500));
	moved.AddInt32("buttons", 0);
	moved.AddInt64("when", system_time());
	ASSERT_EQ(BMessenger(fFile).SendMessage(&moved), B_OK);
	fRobot->Settle();
	EXPECT_TRUE(IsOpen(fFile));
	fRobot->Release();
	EXPECT_TRUE(IsOpen(fFile));
	fRobot->ClickItem("Save");
	EXPECT_TRUE(AllClosed());
	EXPECT_EQ(TakeCodes(), "save ");
}


TEST_F(MenuPointerTest, DraggedOutAndReleasedChoosesNothing)
{
	Show();
	fRobot->MoveTo(MiddleOf("File"));
	fRobot->Press();
	ASSERT_TRUE(Opens(fFile));
	fRobot->MoveTo(MiddleOf("Save"));
	fRobot->MoveTo(BPoint(280, 190));
	EXPECT_EQ(Selected(fFile), "");
	fRobot->Release();
	EXPECT_TRUE(AllClosed());
	EXPECT_EQ(TakeCodes(), "");
}


TEST_F(MenuPointerTest, ClickElsewhereClosesAndDoesNothingElse)
{
	BButton* button =
		Add(new BButton(BRect(180, 150, 279, 179), "button", "Button", new BMessage('butn')));
	Show();
	fRobot->ClickItem("File");
	ASSERT_TRUE(Opens(fFile));
	fRobot->ClickView("button");
	EXPECT_TRUE(AllClosed());
	EXPECT_EQ(TakeCodes(), "");
	fRobot->ClickView("button");
	EXPECT_EQ(TakeCodes(), "butn ") << "now it is the button's again";
	EXPECT_EQ(ValueOf(button), 0);
}


TEST_F(MenuPointerTest, ClickOnTheOpenMenusTitleClosesIt)
{
	Show();
	fRobot->ClickItem("File");
	ASSERT_TRUE(Opens(fFile));
	// Not a double click.
	snooze(550000);
	fRobot->ClickItem("File");
	EXPECT_TRUE(AllClosed());
	EXPECT_EQ(TakeCodes(), "");
}


TEST_F(MenuPointerTest, OpenMenusFollowThePointerAlongTheBar)
{
	Show();
	fRobot->ClickItem("File");
	ASSERT_TRUE(Opens(fFile));
	fRobot->MoveTo(MiddleOf("Edit"));
	EXPECT_TRUE(Opens(fEdit));
	EXPECT_FALSE(IsOpen(fFile));
	fRobot->MoveTo(MiddleOf("Act"));
	EXPECT_TRUE(Closes(fEdit));
	EXPECT_EQ(Selected(fBar), "Act");
	fRobot->MoveTo(MiddleOf("File"));
	fRobot->Press();
	EXPECT_TRUE(Opens(fFile));
	fRobot->MoveTo(MiddleOf("Open"));
	fRobot->Release();
	EXPECT_TRUE(AllClosed());
	EXPECT_EQ(TakeCodes(), "open ");
	EXPECT_EQ(fMenuWindow->beginnings, 1);
}


TEST_F(MenuPointerTest, BarItemWithoutMenuActsWhenClicked)
{
	Show();
	fRobot->ClickItem("Act");
	EXPECT_TRUE(AllClosed());
	EXPECT_EQ(TakeCodes(), "acts ");
}


TEST_F(MenuPointerTest, DisabledItemsAndLinesAreNotChosen)
{
	Show();
	fRobot->ClickItem("File");
	ASSERT_TRUE(Opens(fFile));
	fRobot->ClickItem("Gone");
	EXPECT_TRUE(IsOpen(fFile));
	EXPECT_EQ(Selected(fFile), "");
	fRobot->ClickItem("");
	EXPECT_TRUE(IsOpen(fFile));
	fRobot->ClickItem("Open");
	EXPECT_TRUE(AllClosed());
	EXPECT_EQ(TakeCodes(), "open ");
}


TEST_F(MenuPointerTest, SubmenusOpenWhenThePointerRests)
{
	Show();
	fRobot->ClickItem("File");
	ASSERT_TRUE(Opens(fFile));
	fRobot->MoveTo(MiddleOf("More"));
	ASSERT_TRUE(Opens(fMore));
	fRobot->MoveTo(MiddleOf("Deeper"));
	ASSERT_TRUE(Opens(fDeeper));
	EXPECT_EQ(Selected(fFile), "More");
	EXPECT_EQ(Selected(fMore), "Deeper");
	fRobot->ClickItem("Deepest");
	EXPECT_TRUE(AllClosed());
	EXPECT_EQ(TakeCodes(), "dpst ");
}


TEST_F(MenuPointerTest, SubmenuClosesForAnotherItem)
{
	Show();
	fRobot->ClickItem("File");
	ASSERT_TRUE(Opens(fFile));
	fRobot->MoveTo(MiddleOf("More"));
	ASSERT_TRUE(Opens(fMore));
	fRobot->MoveTo(MiddleOf("Open"));
	EXPECT_TRUE(Closes(fMore));
	EXPECT_EQ(Selected(fFile), "Open");
	EXPECT_TRUE(IsOpen(fFile));
	fRobot->Key("escape");
	EXPECT_TRUE(AllClosed());
}


TEST_F(MenuPointerTest, SubmenuWaitsForAPointerOnItsWay)
{
	fFile->AddItem(new BMenuItem("A last item below", new BMessage('last')));
	for (int32 i = 0; i < 8; i++)
		fMore->AddItem(new BMenuItem("filler", nullptr));
	Show();
	fRobot->ClickItem("File");
	ASSERT_TRUE(Opens(fFile));
	fRobot->MoveTo(MiddleOf("More"));
	ASSERT_TRUE(Opens(fMore));
	// Over the next item, but slantwise towards the submenu.
	ASSERT_TRUE(fMore->LockLooper());
	const float left = fMore->Window()->Frame().left - fWindow->Frame().left;
	fMore->UnlockLooper();
	fRobot->MoveTo(BPoint(left - 12, MiddleOf("More").y));
	fRobot->MoveTo(BPoint(left - 4, MiddleOf("A last item below").y));
	EXPECT_TRUE(IsOpen(fMore));
	fRobot->MoveTo(MiddleOf("Deep"));
	EXPECT_EQ(Selected(fMore), "Deep");
	fRobot->ClickItem("Deep");
	EXPECT_TRUE(AllClosed());
	EXPECT_EQ(TakeCodes(), "deep ");
}

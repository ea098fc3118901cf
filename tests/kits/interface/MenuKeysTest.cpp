// SPDX-License-Identifier: MIT
// Menus used by the keyboard: arrows, triggers, shortcuts.
#include "MenuFixture.h"

namespace {

class MenuKeysTest : public MenuTrackingTest {};

} // namespace


TEST_F(MenuKeysTest, CommandEscapeOpensTheBar)
{
	Show();
	fRobot->Key("command+escape");
	ASSERT_TRUE(Becomes([&] { return Selected(fBar) == "File"; }));
	EXPECT_FALSE(IsOpen(fFile));
	EXPECT_EQ(fMenuWindow->beginnings, 1);
	fRobot->Key("right");
	EXPECT_EQ(Selected(fBar), "Edit");
	fRobot->Key("left");
	fRobot->Key("left");
	EXPECT_EQ(Selected(fBar), "Act") << "around the end";
	fRobot->Key("enter");
	EXPECT_TRUE(AllClosed());
	EXPECT_EQ(TakeCodes(), "acts ");
}


TEST_F(MenuKeysTest, ArrowsMoveAndEnterChooses)
{
	Show();
	fRobot->Key("command+escape");
	fRobot->Key("down");
	ASSERT_TRUE(Opens(fFile));
	EXPECT_EQ(Selected(fFile), "Open");
	fRobot->Key("down");
	EXPECT_EQ(Selected(fFile), "Save");
	fRobot->Key("down");
	EXPECT_EQ(Selected(fFile), "More") << "past the line and what is disabled";
	fRobot->Key("down");
	EXPECT_EQ(Selected(fFile), "Open");
	fRobot->Key("up");
	EXPECT_EQ(Selected(fFile), "More");
	fRobot->Key("home");
	EXPECT_EQ(Selected(fFile), "Open");
	fRobot->Key("end");
	fRobot->Key("right");
	ASSERT_TRUE(Opens(fMore));
	EXPECT_EQ(Selected(fMore), "Deep");
	fRobot->Key("left");
	EXPECT_TRUE(Closes(fMore));
	EXPECT_EQ(Selected(fFile), "More");
	fRobot->Key("enter");
	ASSERT_TRUE(Opens(fMore)) << "Enter opens too";
	fRobot->Key("enter");
	EXPECT_TRUE(AllClosed());
	EXPECT_EQ(TakeCodes(), "deep ");
}


TEST_F(MenuKeysTest, SidewaysArrowsGoToTheNextMenuOfTheBar)
{
	Show();
	fRobot->Key("command+escape");
	fRobot->Key("down");
	ASSERT_TRUE(Opens(fFile));
	fRobot->Key("right");
	ASSERT_TRUE(Opens(fEdit));
	EXPECT_TRUE(Closes(fFile));
	EXPECT_EQ(Selected(fEdit), "Copy");
	fRobot->Key("left");
	ASSERT_TRUE(Opens(fFile));
	EXPECT_TRUE(Closes(fEdit));
	fRobot->Key("escape");
	EXPECT_TRUE(AllClosed());
	EXPECT_EQ(TakeCodes(), "");
}


TEST_F(MenuKeysTest, EscapeClosesOneSubmenuAtATime)
{
	Show();
	fRobot->ClickItem("File");
	ASSERT_TRUE(Opens(fFile));
	fRobot->Key("end");
	fRobot->Key("right");
	ASSERT_TRUE(Opens(fMore));
	fRobot->Key("escape");
	EXPECT_TRUE(Closes(fMore));
	EXPECT_TRUE(IsOpen(fFile));
	fRobot->Key("escape");
	EXPECT_TRUE(AllClosed());
}


TEST_F(MenuKeysTest, LettersChooseByTrigger)
{
	Show();
	fRobot->Key("command+escape");
	fRobot->Type("e");
	ASSERT_TRUE(Opens(fEdit));
	fRobot->Type("p");
	EXPECT_TRUE(AllClosed());
	EXPECT_EQ(TakeCodes(), "past ");
}


TEST_F(MenuKeysTest, TriggerOfTheProgramComesFirst)
{
	fEdit->ItemAt(1)->SetTrigger('c');
	Show();
	fRobot->ClickItem("Edit");
	ASSERT_TRUE(Opens(fEdit));
	fRobot->Type("c");
	EXPECT_TRUE(AllClosed());
	EXPECT_EQ(TakeCodes(), "past ") << "Copy has to be content with another letter";
}


TEST_F(MenuKeysTest, KeysGoToTheMenuAndNotToTheFocus)
{
	BTextView* text = Add(new BTextView(
		BRect(150, 100, 249, 149), "text", BRect(2, 2, 90, 40), B_FOLLOW_NONE, B_WILL_DRAW));
	Show();
	Do([text] { text->MakeFocus(); });
	fRobot->Type("a");
	fRobot->ClickItem("File");
	ASSERT_TRUE(Opens(fFile));
	fRobot->Type("zz");
	fRobot->Key("escape");
	EXPECT_TRUE(AllClosed());
	fRobot->Type("b");
	EXPECT_EQ(TextOf(text), "ab");
}


TEST_F(MenuKeysTest, ShortcutsWorkWhereTheItemIsEnabled)
{
	fMore->AddItem(new BMenuItem("Inside", new BMessage('insi'), 'I', B_SHIFT_KEY));
	Show();
	fRobot->Key("command+s");
	EXPECT_EQ(TakeCodes(), "save ");
	EXPECT_EQ(fMenuWindow->beginnings, 1) << "the program may bring its items up to date";
	fRobot->Key("command+shift+i");
	EXPECT_EQ(TakeCodes(), "insi ");
	fRobot->Key("command+i");
	EXPECT_EQ(TakeCodes(), "");
	Do([this] { fFile->ItemAt(1)->SetEnabled(false); });
	fRobot->Key("command+s");
	EXPECT_EQ(TakeCodes(), "");
	Do([this] {
		fFile->ItemAt(1)->SetEnabled(true);
		fFile->ItemAt(1)->SetShortcut('K', 0);
	});
	fRobot->Key("command+s");
	fRobot->Key("command+k");
	EXPECT_EQ(TakeCodes(), "save ");
	Do([this] { delete fFile->RemoveItem(1); });
	fRobot->Key("command+k");
	EXPECT_EQ(TakeCodes(), "");
}


TEST_F(MenuKeysTest, ShortcutsGoWithTheirBar)
{
	Show();
	Do([this] { fBackground->RemoveChild(fBar); });
	fRobot->Key("command+s");
	EXPECT_EQ(TakeCodes(), "");
	Do([this] { fBackground->AddChild(fBar); });
	fRobot->Key("command+s");
	EXPECT_EQ(TakeCodes(), "save ");
}

// SPDX-License-Identifier: MIT
// What programs do to windows, menus and items while a menu is open.
#include <atomic>

#include <Screen.h>

#include "MenuFixture.h"

namespace {

// Adds its items when it opens.
class DynamicMenu : public BMenu {
public:
	DynamicMenu()
		: BMenu("Dynamic")
	{
	}

	bool AddDynamicItem(add_state state) override
	{
		if (state == B_INITIAL_ADD) {
			RemoveItems(0, CountItems(), true);
			initials++;
		} else if (state == B_ABORT) {
			aborts++;
			return false;
		}
		if (CountItems() == count)
			return false;
		BString label("Item ");
		label << CountItems() + 1;
		AddItem(new BMenuItem(label.String(), new BMessage('dyna'), '1' + CountItems()));
		return true;
	}

	int32 count = 3;
	std::atomic<int32> initials{0};
	std::atomic<int32> aborts{0};
};


class MenuChangesTest : public MenuTrackingTest {};

} // namespace


TEST_F(MenuChangesTest, WindowGoesOnWhileAMenuIsOpen)
{
	Show();
	fRobot->ClickItem("File");
	ASSERT_TRUE(Opens(fFile));
	BMessenger(fWindow).SendMessage('work');
	EXPECT_EQ(TakeCodes(), "work ");
	EXPECT_TRUE(IsOpen(fFile));
	fRobot->Key("escape");
	EXPECT_TRUE(AllClosed());
}


TEST_F(MenuChangesTest, WindowClosesWithItsMenusOpen)
{
	Show();
	for (int32 depth = 0; depth < 3; depth++) {
		fRobot->ClickItem("File");
		ASSERT_TRUE(Opens(fFile));
		if (depth > 0) {
			fRobot->Key("end");
			fRobot->Key("right");
			ASSERT_TRUE(Opens(fMore));
		}
		if (depth > 1) {
			fRobot->Key("down");
			fRobot->Key("right");
			ASSERT_TRUE(Opens(fDeeper));
		}
		ASSERT_TRUE(fWindow->Lock());
		fWindow->Quit();
		ASSERT_TRUE(fRobot->WaitForNoWindow("File"));
		ASSERT_TRUE(fRobot->WaitForNoWindow("More"));
		ASSERT_TRUE(fRobot->WaitForNoWindow("Deeper"));
		SetUp();
		Show();
	}
}


TEST_F(MenuChangesTest, WindowThatQuitsByMessageTakesItsMenusAlong)
{
	Show();
	fRobot->ClickItem("Edit");
	ASSERT_TRUE(Opens(fEdit));
	BMessenger(fWindow).SendMessage(B_QUIT_REQUESTED);
	EXPECT_TRUE(fRobot->WaitForNoWindow("controls"));
	EXPECT_TRUE(fRobot->WaitForNoWindow("Edit"));
	SetUp();
	Show();
}


TEST_F(MenuChangesTest, BarThatIsTakenOutClosesItsMenus)
{
	Show();
	fRobot->ClickItem("File");
	ASSERT_TRUE(Opens(fFile));
	Do([this] { fBackground->RemoveChild(fBar); });
	EXPECT_TRUE(AllClosed());
	Do([this] { fBackground->AddChild(fBar); });
	fRobot->ClickItem("Edit");
	EXPECT_TRUE(Opens(fEdit));
	fRobot->ClickItem("Copy");
	EXPECT_TRUE(AllClosed());
	EXPECT_EQ(TakeCodes(), "copy ");
}


TEST_F(MenuChangesTest, OpenMenuShowsWhatChangesInIt)
{
	Show();
	fRobot->ClickItem("File");
	ASSERT_TRUE(Opens(fFile));
	Do([this] {
		fFile->ItemAt(0)->SetLabel("A much longer label than before");
		fFile->AddItem(new BMenuItem("New", new BMessage('news')));
		fFile->ItemAt(3)->SetEnabled(true);
	});
	fRobot->ClickItem("New");
	EXPECT_TRUE(AllClosed());
	EXPECT_EQ(TakeCodes(), "news ");
}


TEST_F(MenuChangesTest, ItemsOfAnOpenMenuMayGo)
{
	Show();
	fRobot->ClickItem("File");
	ASSERT_TRUE(Opens(fFile));
	fRobot->Key("end");
	fRobot->Key("right");
	ASSERT_TRUE(Opens(fMore));
	Do([this] { delete fFile->RemoveItem(4); });
	EXPECT_TRUE(IsOpen(fFile));
	EXPECT_TRUE(fRobot->WaitForNoWindow("More"));
	Do([this] { fFile->RemoveItems(0, 1, true); });
	fRobot->ClickItem("Save");
	EXPECT_TRUE(fRobot->WaitForNoWindow("File"));
	EXPECT_EQ(TakeCodes(), "save ");
}


TEST_F(MenuChangesTest, ItemThatWasChosenMayGo)
{
	Show();
	for (int32 i = 0; i < 3; i++) {
		fRobot->ClickItem("Edit");
		ASSERT_TRUE(Opens(fEdit));
		fRobot->ClickItem("Copy");
		EXPECT_TRUE(Closes(fEdit));
		EXPECT_EQ(TakeCodes(), "copy ");
		Do([this] {
			delete fEdit->RemoveItem(static_cast<int32>(0));
			fEdit->AddItem(new BMenuItem("Copy", new BMessage('copy')), 0);
		});
	}
}


TEST_F(MenuChangesTest, DisabledBarDoesNotOpen)
{
	Show();
	Do([this] { fFile->SetEnabled(false); });
	fRobot->ClickItem("File");
	EXPECT_FALSE(IsOpen(fFile));
	Do([this] { fBar->SetEnabled(false); });
	fRobot->ClickItem("Edit");
	EXPECT_FALSE(IsOpen(fEdit));
	EXPECT_TRUE(AllClosed());
}


TEST_F(MenuChangesTest, DynamicItemsComeWithEachOpening)
{
	DynamicMenu* menu = new DynamicMenu;
	fBar->AddItem(menu);
	Show();
	fRobot->ClickItem("Dynamic");
	ASSERT_TRUE(Opens(menu));
	fRobot->ClickItem("Item 3");
	EXPECT_TRUE(Closes(menu));
	EXPECT_EQ(TakeCodes(), "dyna ");
	EXPECT_EQ(menu->initials, 1);
	fRobot->Key("command+2");
	EXPECT_EQ(TakeCodes(), "dyna ") << "their shortcuts work from then on";
	fRobot->ClickItem("Dynamic");
	ASSERT_TRUE(Opens(menu));
	EXPECT_EQ(menu->CountItems(), 3);
	EXPECT_EQ(menu->initials, 2);
	EXPECT_EQ(menu->aborts, 0);
	fRobot->Key("escape");
	EXPECT_TRUE(Closes(menu));
}


TEST_F(MenuChangesTest, LongMenuStaysOnTheScreenAndScrolls)
{
	BMenu* longMenu = new BMenu("Long");
	for (int32 i = 1; i <= 200; i++) {
		BString label("Line ");
		label << i;
		longMenu->AddItem(new BMenuItem(label.String(), new BMessage('line')));
	}
	fBar->AddItem(longMenu);
	Show();
	fRobot->Key("command+escape");
	fRobot->Type("l");
	ASSERT_TRUE(Opens(longMenu));
	const BRect screen = BScreen().Frame();
	ASSERT_TRUE(longMenu->LockLooper());
	const BRect frame = longMenu->Window()->Frame();
	longMenu->UnlockLooper();
	EXPECT_GE(frame.top, screen.top);
	EXPECT_LE(frame.bottom, screen.bottom);
	const BRect bar = Ask([this] { return fBar->ConvertToScreen(fBar->Bounds()); });
	EXPECT_GE(frame.top, bar.bottom) << "it does not lie on its item";

	fRobot->Key("end");
	EXPECT_EQ(Selected(longMenu), "Line 200");
	ASSERT_TRUE(longMenu->LockLooper());
	EXPECT_EQ(longMenu->Bounds().bottom, longMenu->ItemAt(199)->Frame().bottom);
	longMenu->UnlockLooper();
	fRobot->Key("home");
	// Pointing at the lower end scrolls down.
	fRobot->MoveTo(BPoint(frame.left + 20, frame.bottom - 4) - BPoint(100, 100));
	EXPECT_TRUE(Becomes([&] {
		bool isScrolled = false;
		if (longMenu->LockLooper()) {
			isScrolled = longMenu->Bounds().top > 100;
			longMenu->UnlockLooper();
		}
		return isScrolled;
	}));
	fRobot->Key("end");
	fRobot->ClickItem("Line 199");
	EXPECT_TRUE(Closes(longMenu));
	EXPECT_EQ(TakeCodes(), "line ");
}

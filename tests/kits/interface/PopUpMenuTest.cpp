// SPDX-License-Identifier: MIT
// Pop-up menus in use: how they open, how they stay open, what they return.
#include <atomic>

#include <Application.h>
#include <PopUpMenu.h>
#include <Screen.h>

#include "MenuFixture.h"
#include "display/Display.h"

namespace {

// Opens a pop-up menu from within its window's thread when it is told.
class PopUpView : public BView {
public:
	explicit PopUpView(BRect frame)
		: BView(frame, "pop up", B_FOLLOW_ALL, B_WILL_DRAW),
		  menu("menu", false, false)
	{
		menu.AddItem(new BMenuItem("One", new BMessage('ones')));
		menu.AddItem(new BMenuItem("Two", new BMessage('twos')));
		BMenu* sub = new BMenu("Sub");
		sub->AddItem(new BMenuItem("Inner", new BMessage('innr')));
		menu.AddItem(sub);
	}

	void AttachedToWindow() override
	{
		menu.SetTargetForItems(Window());
		menu.SubmenuAt(2)->SetTargetForItems(Window());
	}

	void MouseDown(BPoint where) override { Go(where); }

	void MessageReceived(BMessage* message) override
	{
		if (message->what == 'GoGo')
			Go(BPoint(50, 50));
		else
			BView::MessageReceived(message);
	}

	void MouseUp(BPoint) override { releases++; }

	void Go(BPoint where)
	{
		if (openRect.IsValid())
			chosen =
				menu.Go(ConvertToScreen(where), delivers, keepsOpen, ConvertToScreen(openRect));
		else
			chosen = menu.Go(ConvertToScreen(where), delivers, keepsOpen);
		returns++;
	}

	BPopUpMenu menu;
	BRect openRect;
	bool delivers = false;
	bool keepsOpen = false;
	std::atomic<BMenuItem*> chosen{nullptr};
	std::atomic<int32> returns{0};
	std::atomic<int32> releases{0};
};


class PopUpMenuTest : public MenuTrackingTest {
protected:
	void SetUp() override
	{
		MenuTrackingTest::SetUp();
		fView = new PopUpView(BRect(0, 50, 299, 199));
		fBackground->AddChild(fView);
	}

	bool Returned(int32 count)
	{
		return Becomes([&] { return fView->returns == count; });
	}

	PopUpView* fView;
};

} // namespace


TEST_F(PopUpMenuTest, ShortClickKeepsItOpenAndTheNextChooses)
{
	Show();
	fRobot->Click(BPoint(100, 120));
	ASSERT_TRUE(Opens(&fView->menu));
	EXPECT_EQ(fView->returns, 0);
	fRobot->ClickItem("Two");
	ASSERT_TRUE(Returned(1));
	EXPECT_EQ(fView->chosen, fView->menu.ItemAt(1));
	EXPECT_EQ(TakeCodes(), "") << "the caller looks at the item itself";
	EXPECT_FALSE(IsOpen(&fView->menu));
	EXPECT_EQ(fMenuWindow->beginnings, 0);
	EXPECT_TRUE(Becomes([&] { return fView->releases >= 1; })) << "the press was the view's";
}


TEST_F(PopUpMenuTest, ClickThatEndsBeforeTheMenuIsOpenKeepsItOpen)
{
	Show();
	// The robot learns where the window is while that can be asked.
	fRobot->MoveTo(BPoint(5, 60));
	// The window gets to the press only when the button is up again.
	ASSERT_TRUE(fWindow->Lock());
	BPrivate::Display::Get().InjectPointer(BPoint(200, 220), 0);
	BPrivate::Display::Get().InjectPointer(BPoint(200, 220), 1);
	BPrivate::Display::Get().InjectPointer(BPoint(200, 220), 0);
	fWindow->Unlock();
	ASSERT_TRUE(Opens(&fView->menu));
	fRobot->MoveTo(MiddleOf("Two"));
	EXPECT_TRUE(IsOpen(&fView->menu));
	EXPECT_EQ(fView->returns, 0);
	fRobot->Key("escape");
	ASSERT_TRUE(Returned(1));
}


TEST_F(PopUpMenuTest, FirstItemLiesAtTheGivenPlace)
{
	Show();
	fRobot->Click(BPoint(100, 120));
	ASSERT_TRUE(Opens(&fView->menu));
	ASSERT_TRUE(fView->menu.LockLooper());
	const BPoint place = fView->menu.ConvertToScreen(fView->menu.ItemAt(0)->Frame().LeftTop());
	fView->menu.UnlockLooper();
	EXPECT_EQ(place, BPoint(200, 220));
	fRobot->Key("escape");
	ASSERT_TRUE(Returned(1));
	EXPECT_EQ(fView->chosen, nullptr);
}


TEST_F(PopUpMenuTest, PressHeldAndReleasedOverAnItemChooses)
{
	fView->delivers = true;
	Show();
	fRobot->MoveTo(BPoint(100, 120));
	fRobot->Press(B_SECONDARY_MOUSE_BUTTON);
	ASSERT_TRUE(Opens(&fView->menu));
	fRobot->MoveTo(MiddleOf("Two"));
	fRobot->Release();
	ASSERT_TRUE(Returned(1));
	EXPECT_EQ(fView->chosen, fView->menu.ItemAt(1));
	EXPECT_EQ(TakeCodes(), "twos ");
}


TEST_F(PopUpMenuTest, ReleaseInsideTheOpenRectKeepsItOpen)
{
	fView->openRect = BRect(0, 60, 299, 149);
	Show();
	fRobot->MoveTo(BPoint(100, 120));
	fRobot->Press();
	ASSERT_TRUE(Opens(&fView->menu));
	fRobot->MoveTo(BPoint(40, 190));
	fRobot->Release();
	EXPECT_TRUE(IsOpen(&fView->menu));
	fRobot->Click(BPoint(40, 190));
	ASSERT_TRUE(Returned(1)) << "the next click outside closes it";

	fRobot->MoveTo(BPoint(100, 120));
	fRobot->Press();
	ASSERT_TRUE(Opens(&fView->menu));
	fRobot->MoveTo(BPoint(40, 60));
	fRobot->Release();
	ASSERT_TRUE(Returned(2)) << "outside of the rect releasing closes it";
	EXPECT_EQ(fView->chosen, nullptr);
}


TEST_F(PopUpMenuTest, KeptOpenWithoutAButton)
{
	fView->keepsOpen = true;
	Show();
	BMessenger(fView).SendMessage('GoGo');
	ASSERT_TRUE(Opens(&fView->menu));
	fRobot->Key("down");
	fRobot->Key("down");
	fRobot->Key("enter");
	ASSERT_TRUE(Returned(1));
	EXPECT_EQ(fView->chosen, fView->menu.ItemAt(1));
}


TEST_F(PopUpMenuTest, SubmenusOfAPopUpWork)
{
	fView->delivers = true;
	Show();
	fRobot->Click(BPoint(100, 120));
	ASSERT_TRUE(Opens(&fView->menu));
	fRobot->ClickItem("Sub");
	ASSERT_TRUE(Opens(fView->menu.SubmenuAt(2)));
	fRobot->ClickItem("Inner");
	ASSERT_TRUE(Returned(1));
	EXPECT_EQ(TakeCodes(), "innr ");
}


TEST_F(PopUpMenuTest, AsynchronousGoReturnsAtOnceAndInvokes)
{
	Show();
	BMenuItem* result = fView->menu.ItemAt(0);
	Do([&] { result = fView->menu.Go(BPoint(250, 250), true, true, true); });
	EXPECT_EQ(result, nullptr);
	ASSERT_TRUE(Opens(&fView->menu));
	BMessenger(fWindow).SendMessage('work');
	EXPECT_EQ(TakeCodes(), "work ") << "the window goes on";
	fRobot->ClickItem("One");
	EXPECT_TRUE(Closes(&fView->menu));
	EXPECT_EQ(TakeCodes(), "ones ");

	Do([&] { fView->menu.Go(BPoint(250, 250), true, true, BRect(0, 0, 10, 10), true); });
	ASSERT_TRUE(Opens(&fView->menu));
	fRobot->Key("escape");
	EXPECT_TRUE(Closes(&fView->menu));
	EXPECT_EQ(TakeCodes(), "");
}


TEST_F(PopUpMenuTest, AsynchronousMenuDeletesItself)
{
	static std::atomic<int32> sDeleted;
	sDeleted = 0;
	class GoingMenu : public BPopUpMenu {
	public:
		GoingMenu()
			: BPopUpMenu("going", false, false)
		{
		}
		~GoingMenu() override { sDeleted++; }
	};

	Show();
	for (int32 i = 0; i < 2; i++) {
		GoingMenu* menu = new GoingMenu;
		menu->AddItem(new BMenuItem("Go", new BMessage('goes')));
		menu->SetTargetForItems(BMessenger(fWindow));
		EXPECT_FALSE(menu->AsyncAutoDestruct());
		menu->SetAsyncAutoDestruct(true);
		menu->Go(BPoint(250, 250), true, true, true);
		ASSERT_TRUE(fRobot->WaitForWindow("going"));
		fRobot->SetWindow(BMessenger(fWindow));
		if (i == 0)
			fRobot->ClickItem("Go");
		else
			fRobot->Key("escape");
		EXPECT_TRUE(Becomes([&] { return sDeleted == i + 1; }));
	}
	EXPECT_EQ(TakeCodes(), "goes ");
}


TEST_F(PopUpMenuTest, OpenMenuMayBeDeleted)
{
	Show();
	BPopUpMenu* menu = new BPopUpMenu("doomed", false, false);
	menu->AddItem(new BMenuItem("Item", new BMessage('item')));
	menu->Go(BPoint(250, 250), true, true, true);
	ASSERT_TRUE(fRobot->WaitForWindow("doomed"));
	delete menu;
	EXPECT_TRUE(fRobot->WaitForNoWindow("doomed"));
}


TEST_F(PopUpMenuTest, GoFromAThreadThatRunsNoWindow)
{
	Show();
	BPopUpMenu menu("loose", false, false);
	menu.AddItem(new BMenuItem("Item", nullptr));
	static BMenuItem* sChosen;
	sChosen = nullptr;
	const thread_id thread = spawn_thread(
		[](void* data) -> int32 {
			sChosen = static_cast<BPopUpMenu*>(data)->Go(BPoint(250, 250), true, true);
			return 0;
		},
		"chooser", B_NORMAL_PRIORITY, &menu);
	resume_thread(thread);
	ASSERT_TRUE(fRobot->WaitForWindow("loose"));
	fRobot->SetWindow(BMessenger(fWindow));
	fRobot->ClickItem("Item");
	int32 result;
	wait_for_thread(thread, &result);
	EXPECT_EQ(sChosen, menu.ItemAt(0));
}


TEST_F(PopUpMenuTest, ANewMenuEndsTheOldOne)
{
	Show();
	fRobot->ClickItem("File");
	ASSERT_TRUE(Opens(fFile));
	Do([&] { fView->menu.Go(BPoint(300, 250), true, true, true); });
	ASSERT_TRUE(Opens(&fView->menu));
	EXPECT_TRUE(AllClosed());
	fRobot->ClickItem("One");
	EXPECT_TRUE(Closes(&fView->menu));
	EXPECT_EQ(TakeCodes(), "ones ");
}


TEST_F(PopUpMenuTest, PopUpStaysOnTheScreen)
{
	Show();
	const BRect screen = BScreen().Frame();
	Do([&] { fView->menu.Go(screen.RightBottom(), true, true, true); });
	ASSERT_TRUE(Opens(&fView->menu));
	ASSERT_TRUE(fView->menu.LockLooper());
	const BRect frame = fView->menu.Window()->Frame();
	fView->menu.UnlockLooper();
	EXPECT_LE(frame.right, screen.right);
	EXPECT_LE(frame.bottom, screen.bottom);
	// Its submenu has no room at the right.
	fRobot->ClickItem("Sub");
	BMenu* sub = fView->menu.SubmenuAt(2);
	ASSERT_TRUE(Opens(sub));
	ASSERT_TRUE(sub->LockLooper());
	EXPECT_LE(sub->Window()->Frame().right, frame.left);
	sub->UnlockLooper();
	fRobot->Key("escape");
	fRobot->Key("escape");
	EXPECT_TRUE(Closes(&fView->menu));
}


TEST_F(PopUpMenuTest, KeysBeginAtTheChoice)
{
	fView->menu.SetRadioMode(true);
	fView->menu.ItemAt(1)->SetMarked(true);
	fView->keepsOpen = true;
	Show();
	for (const char* key : {"down", "up"}) {
		BMessenger(fView).SendMessage('GoGo');
		ASSERT_TRUE(Opens(&fView->menu));
		fRobot->Key(key);
		EXPECT_EQ(Selected(&fView->menu), "Two") << key;
		fRobot->Key("up");
		EXPECT_EQ(Selected(&fView->menu), "One");
		fRobot->Key("escape");
		EXPECT_TRUE(Closes(&fView->menu));
	}
	EXPECT_TRUE(Returned(2));
}

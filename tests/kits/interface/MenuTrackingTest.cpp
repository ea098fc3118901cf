// SPDX-License-Identifier: MIT
// Menus as they are used: by clicks, by dragging, by keys, and while the program changes things below them.
#include <atomic>

#include <Application.h>
#include <Button.h>
#include <MenuField.h>
#include <PopUpMenu.h>
#include <Screen.h>

#include "MenuFixture.h"
#include "display/Display.h"

extern "C" int32 be_count_lock_violations();

namespace {

class MenuTrackingTest : public OpenMenuTest {
protected:
	void TearDown() override
	{
		OpenMenuTest::TearDown();
		EXPECT_EQ(be_count_lock_violations(), 0);
	}

	/// The label of the item that is selected in an open menu or the bar, "" for none.
	std::string Selected(BMenu* menu)
	{
		fRobot->Settle();
		if (!menu->LockLooper())
			return "closed";
		std::string label;
		for (int32 i = 0; i < menu->CountItems(); i++) {
			if (IsSelected(menu->ItemAt(i)))
				label = menu->ItemAt(i)->Label();
		}
		menu->UnlockLooper();
		return label;
	}

	static bool IsSelected(BMenuItem* item)
	{
		struct Opened : BMenuItem {
			using BMenuItem::IsSelected;
		};
		return (item->*&Opened::IsSelected)();
	}
};


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


class PopUpTest : public MenuTrackingTest {
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

} // namespace


// #pragma mark - the pointer


TEST_F(MenuTrackingTest, ClickOpensAndAnotherClickChooses)
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


TEST_F(MenuTrackingTest, PressDragAndReleaseChooses)
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


TEST_F(MenuTrackingTest, DraggedOutAndReleasedChoosesNothing)
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


TEST_F(MenuTrackingTest, ClickElsewhereClosesAndDoesNothingElse)
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


TEST_F(MenuTrackingTest, ClickOnTheOpenMenusTitleClosesIt)
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


TEST_F(MenuTrackingTest, OpenMenusFollowThePointerAlongTheBar)
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


TEST_F(MenuTrackingTest, BarItemWithoutMenuActsWhenClicked)
{
	Show();
	fRobot->ClickItem("Act");
	EXPECT_TRUE(AllClosed());
	EXPECT_EQ(TakeCodes(), "acts ");
}


TEST_F(MenuTrackingTest, DisabledItemsAndLinesAreNotChosen)
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


TEST_F(MenuTrackingTest, SubmenusOpenWhenThePointerRests)
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


TEST_F(MenuTrackingTest, SubmenuClosesForAnotherItem)
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


TEST_F(MenuTrackingTest, SubmenuWaitsForAPointerOnItsWay)
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


// #pragma mark - the keyboard


TEST_F(MenuTrackingTest, CommandEscapeOpensTheBar)
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


TEST_F(MenuTrackingTest, ArrowsMoveAndEnterChooses)
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


TEST_F(MenuTrackingTest, SidewaysArrowsGoToTheNextMenuOfTheBar)
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


TEST_F(MenuTrackingTest, EscapeClosesOneSubmenuAtATime)
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


TEST_F(MenuTrackingTest, LettersChooseByTrigger)
{
	Show();
	fRobot->Key("command+escape");
	fRobot->Type("e");
	ASSERT_TRUE(Opens(fEdit));
	fRobot->Type("p");
	EXPECT_TRUE(AllClosed());
	EXPECT_EQ(TakeCodes(), "past ");
}


TEST_F(MenuTrackingTest, TriggerOfTheProgramComesFirst)
{
	fEdit->ItemAt(1)->SetTrigger('c');
	Show();
	fRobot->ClickItem("Edit");
	ASSERT_TRUE(Opens(fEdit));
	fRobot->Type("c");
	EXPECT_TRUE(AllClosed());
	EXPECT_EQ(TakeCodes(), "past ") << "Copy has to be content with another letter";
}


TEST_F(MenuTrackingTest, KeysGoToTheMenuAndNotToTheFocus)
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


TEST_F(MenuTrackingTest, ShortcutsWorkWhereTheItemIsEnabled)
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


TEST_F(MenuTrackingTest, ShortcutsGoWithTheirBar)
{
	Show();
	Do([this] { fBackground->RemoveChild(fBar); });
	fRobot->Key("command+s");
	EXPECT_EQ(TakeCodes(), "");
	Do([this] { fBackground->AddChild(fBar); });
	fRobot->Key("command+s");
	EXPECT_EQ(TakeCodes(), "save ");
}


// #pragma mark - what programs do meanwhile


TEST_F(MenuTrackingTest, WindowGoesOnWhileAMenuIsOpen)
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


TEST_F(MenuTrackingTest, WindowClosesWithItsMenusOpen)
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


TEST_F(MenuTrackingTest, WindowThatQuitsByMessageTakesItsMenusAlong)
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


TEST_F(MenuTrackingTest, BarThatIsTakenOutClosesItsMenus)
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


TEST_F(MenuTrackingTest, OpenMenuShowsWhatChangesInIt)
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


TEST_F(MenuTrackingTest, ItemsOfAnOpenMenuMayGo)
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


TEST_F(MenuTrackingTest, ItemThatWasChosenMayGo)
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


TEST_F(MenuTrackingTest, DisabledBarDoesNotOpen)
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


TEST_F(MenuTrackingTest, DynamicItemsComeWithEachOpening)
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


TEST_F(MenuTrackingTest, LongMenuStaysOnTheScreenAndScrolls)
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


// #pragma mark - menu fields


TEST_F(MenuTrackingTest, FieldChoosesAndShowsTheChoice)
{
	BPopUpMenu* menu = new BPopUpMenu("choices");
	for (const char* label : {"red", "green", "blue"})
		menu->AddItem(new BMenuItem(label, new BMessage('colr')));
	BMenuField* field = Add(new BMenuField(BRect(20, 100, 219, 119), "field", "Colour:", menu));
	Show();
	EXPECT_EQ(Ask([field] { return std::string(field->MenuItem()->Label()); }), "red");
	fRobot->ClickView("_mc_mb_");
	ASSERT_TRUE(Opens(menu));
	EXPECT_EQ(fMenuWindow->beginnings, 1);
	fRobot->ClickItem("blue");
	EXPECT_TRUE(Closes(menu));
	const std::vector<BMessage> received = Take();
	ASSERT_EQ(received.size(), 1u);
	EXPECT_EQ(received[0].GetInt32("index", -1), 2);
	EXPECT_EQ(Ask([menu] { return menu->FindMarkedIndex(); }), 2);
	EXPECT_EQ(Ask([field] { return std::string(field->MenuItem()->Label()); }), "blue");

	// A click on the label opens it too, with the marked item under the bar's.
	fRobot->Click(BPoint(25, 108));
	ASSERT_TRUE(Opens(menu));
	ASSERT_TRUE(menu->LockLooper());
	const BRect marked = menu->ConvertToScreen(menu->ItemAt(2)->Frame());
	menu->UnlockLooper();
	const BRect bar =
		Ask([field] { return field->MenuBar()->ConvertToScreen(field->MenuBar()->Bounds()); });
	EXPECT_NEAR(marked.top + marked.bottom, bar.top + bar.bottom, 1);
	fRobot->Key("escape");
	EXPECT_TRUE(Closes(menu));
	EXPECT_EQ(TakeCodes(), "");
}


TEST_F(MenuTrackingTest, FieldIsUsedByKeyboard)
{
	BPopUpMenu* menu = new BPopUpMenu("choices");
	for (const char* label : {"red", "green", "blue"})
		menu->AddItem(new BMenuItem(label, new BMessage('colr')));
	BMenuField* field = Add(new BMenuField(BRect(20, 100, 219, 119), "field", "Colour:", menu));
	Show();
	Do([field] { field->MakeFocus(); });
	fRobot->Key("space");
	ASSERT_TRUE(Opens(menu));
	EXPECT_EQ(Selected(menu), "red");
	fRobot->Key("down");
	fRobot->Key("enter");
	EXPECT_TRUE(Closes(menu));
	EXPECT_EQ(TakeCodes(), "colr ");
	EXPECT_EQ(Ask([field] { return std::string(field->MenuItem()->Label()); }), "green");
	Do([field] { field->SetEnabled(false); });
	EXPECT_FALSE(Ask([field] { return field->IsFocus(); }));
	fRobot->ClickView("_mc_mb_");
	EXPECT_FALSE(IsOpen(menu));
}


// #pragma mark - pop-up menus


TEST_F(PopUpTest, ShortClickKeepsItOpenAndTheNextChooses)
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


TEST_F(PopUpTest, ClickThatEndsBeforeTheMenuIsOpenKeepsItOpen)
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


TEST_F(PopUpTest, FirstItemLiesAtTheGivenPlace)
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


TEST_F(PopUpTest, PressHeldAndReleasedOverAnItemChooses)
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


TEST_F(PopUpTest, ReleaseInsideTheOpenRectKeepsItOpen)
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


TEST_F(PopUpTest, KeptOpenWithoutAButton)
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


TEST_F(PopUpTest, SubmenusOfAPopUpWork)
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


TEST_F(PopUpTest, AsynchronousGoReturnsAtOnceAndInvokes)
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


TEST_F(PopUpTest, AsynchronousMenuDeletesItself)
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


TEST_F(PopUpTest, OpenMenuMayBeDeleted)
{
	Show();
	BPopUpMenu* menu = new BPopUpMenu("doomed", false, false);
	menu->AddItem(new BMenuItem("Item", new BMessage('item')));
	menu->Go(BPoint(250, 250), true, true, true);
	ASSERT_TRUE(fRobot->WaitForWindow("doomed"));
	delete menu;
	EXPECT_TRUE(fRobot->WaitForNoWindow("doomed"));
}


TEST_F(PopUpTest, GoFromAThreadThatRunsNoWindow)
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


TEST_F(PopUpTest, ANewMenuEndsTheOldOne)
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


TEST_F(PopUpTest, PopUpStaysOnTheScreen)
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

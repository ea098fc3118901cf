// SPDX-License-Identifier: MIT
// What menus, bars and fields show of their states.
#include <Bitmap.h>
#include <MenuField.h>
#include <PopUpMenu.h>

#include "MenuFixture.h"

namespace {

class MenuDrawingTest : public OpenMenuTest {
protected:
	/// The picture of the open menu, and the frame of an item in it.
	WindowPicture MenuPicture(BMenu* menu)
	{
		EXPECT_TRUE(Opens(menu));
		EXPECT_TRUE(menu->LockLooper());
		fRobot->SetWindow(BMessenger(menu->Window()));
		menu->UnlockLooper();
		fRobot->Settle();
		const WindowPicture picture = fRobot->Picture();
		fRobot->SetWindow(BMessenger(fWindow));
		return picture;
	}

	BRect InWindow(BMenu* menu, int32 index)
	{
		EXPECT_TRUE(menu->LockLooper());
		const BRect frame =
			menu->Window()->ConvertFromScreen(menu->ConvertToScreen(menu->ItemAt(index)->Frame()));
		menu->UnlockLooper();
		return frame;
	}

	WindowPicture Picture()
	{
		fRobot->Settle();
		return fRobot->Picture();
	}

	static int32 Dark(const WindowPicture& picture, BRect rect, int32 limit = 90)
	{
		int32 count = 0;
		for (int32 y = static_cast<int32>(rect.top); y <= rect.bottom; y++) {
			for (int32 x = static_cast<int32>(rect.left); x <= rect.right; x++)
				count += picture.At(x, y).Brightness() < limit ? 1 : 0;
		}
		return count;
	}

	static BRect LeftOf(BRect frame, float width)
	{
		frame.right = frame.left + width - 1;
		return frame;
	}

	static BRect RightOf(BRect frame, float width)
	{
		frame.left = frame.right - width + 1;
		return frame;
	}
};


// An item with a picture of its own.
class SwatchItem : public BMenuItem {
public:
	SwatchItem()
		: BMenuItem("swatch", nullptr)
	{
	}

	void GetContentSize(float* width, float* height) override
	{
		*width = 40;
		*height = 30;
	}

	void DrawContent() override
	{
		Menu()->SetHighColor(255, 0, 0);
		Menu()->FillRect(BRect(ContentLocation(), BSize(39, 29)));
	}
};

// Counts how often it is drawn, and waits for a menu when it is told.
class WaitingView : public BView {
public:
	explicit WaitingView(BRect frame)
		: BView(frame, "waiting", B_FOLLOW_NONE, B_WILL_DRAW),
		  menu("menu", false, false)
	{
		menu.AddItem(new BMenuItem("Item", nullptr));
	}

	void Draw(BRect) override { draws++; }

	void MessageReceived(BMessage* message) override
	{
		if (message->what != 'GoGo') {
			BView::MessageReceived(message);
			return;
		}
		draws = 0;
		Invalidate();
		menu.Go(ConvertToScreen(BPoint(10, 10)), false, true);
	}

	BPopUpMenu menu;
	std::atomic<int32> draws{0};
};

const rgb_color kRed = {255, 0, 0, 255};

} // namespace


TEST_F(MenuDrawingTest, BarShowsWhichMenuIsOpen)
{
	Show();
	const rgb_color background = ui_color(B_MENU_BACKGROUND_COLOR);
	const rgb_color selected = ui_color(B_MENU_SELECTED_BACKGROUND_COLOR);
	const BRect file = Ask([this] { return fBar->ItemAt(0)->Frame(); });
	const BRect edit = Ask([this] { return fBar->ItemAt(1)->Frame(); });
	const WindowPicture closed = Picture();
	EXPECT_EQ(closed.Count(file, selected), 0);
	EXPECT_GT(closed.Count(file, background), file.Width() * file.Height() / 2);
	EXPECT_GT(Dark(closed, file), 10) << "its label";
	fRobot->ClickItem("File");
	ASSERT_TRUE(Opens(fFile));
	const WindowPicture open = Picture();
	EXPECT_GT(open.Count(file, selected), file.Width() * file.Height() / 2);
	EXPECT_EQ(open.Count(edit, selected), 0);
	fRobot->Key("escape");
	ASSERT_TRUE(AllClosed());
	EXPECT_TRUE(closed.SameIn(Picture(), BRect(0, 0, 299, 30)));
}


TEST_F(MenuDrawingTest, SelectedItemIsFilled)
{
	Show();
	fRobot->ClickItem("File");
	const rgb_color selected = ui_color(B_MENU_SELECTED_BACKGROUND_COLOR);
	const WindowPicture before = MenuPicture(fFile);
	const BRect open = InWindow(fFile, 0);
	EXPECT_EQ(before.Count(open, selected), 0);
	fRobot->Key("down");
	const WindowPicture after = MenuPicture(fFile);
	EXPECT_GT(after.Count(open, selected), open.Width() * open.Height() / 2);
	fRobot->Key("down");
	EXPECT_EQ(MenuPicture(fFile).Count(open, selected), 0);
}


TEST_F(MenuDrawingTest, DisabledItemsArePaler)
{
	fFile->ItemAt(0)->SetTrigger('x');
	fFile->ItemAt(3)->SetLabel("Open");
	fFile->ItemAt(3)->SetTrigger('y');
	Show();
	fRobot->ClickItem("File");
	const WindowPicture picture = MenuPicture(fFile);
	EXPECT_GT(Dark(picture, InWindow(fFile, 0)), 20);
	EXPECT_EQ(Dark(picture, InWindow(fFile, 3)), 0);
	EXPECT_GT(Dark(picture, InWindow(fFile, 3), 190), 20);
}


TEST_F(MenuDrawingTest, MarkStandsLeftOfTheLabel)
{
	Show();
	fRobot->ClickItem("File");
	const BRect mark = LeftOf((MenuPicture(fFile), InWindow(fFile, 0)), 17);
	EXPECT_EQ(Dark(MenuPicture(fFile), mark), 0);
	Do([this] { fFile->ItemAt(0)->SetMarked(true); });
	EXPECT_GT(Dark(MenuPicture(fFile), mark), 8);
	Do([this] { fFile->ItemAt(0)->SetMarked(false); });
	EXPECT_EQ(Dark(MenuPicture(fFile), mark), 0);
}


TEST_F(MenuDrawingTest, ShortcutAndArrowStandAtTheRight)
{
	Show();
	fRobot->ClickItem("File");
	const WindowPicture picture = MenuPicture(fFile);
	EXPECT_EQ(Dark(picture, RightOf(InWindow(fFile, 0), 50)), 0);
	EXPECT_GT(Dark(picture, RightOf(InWindow(fFile, 1), 70)), 20) << "Ctrl+S";
	EXPECT_GT(Dark(picture, RightOf(InWindow(fFile, 4), 17)), 8) << "the arrow";
	EXPECT_EQ(Dark(picture, RightOf(InWindow(fFile, 1), 17)), 0);
}


TEST_F(MenuDrawingTest, LineAndBorderAreDrawnOnce)
{
	Show();
	fRobot->ClickItem("File");
	const WindowPicture picture = MenuPicture(fFile);
	const rgb_color line = tint_color(ui_color(B_MENU_BACKGROUND_COLOR), B_DARKEN_2_TINT);
	const rgb_color border = tint_color(ui_color(B_MENU_BACKGROUND_COLOR), B_DARKEN_3_TINT);
	const BRect separator = InWindow(fFile, 2);
	EXPECT_EQ(picture.Count(separator, line), separator.Width() + 1 - 6);
	EXPECT_EQ(picture.Count(BRect(0, 0, picture.width - 1, 0), border), picture.width);
	EXPECT_EQ(picture.Count(BRect(0, 0, 0, picture.height - 1), border), picture.height);
	EXPECT_EQ(picture.At(picture.width - 1, picture.height - 1), border);
}


TEST_F(MenuDrawingTest, TriggerIsUnderlined)
{
	Show();
	fRobot->ClickItem("Edit");
	const WindowPicture with = MenuPicture(fEdit);
	const BRect copy = InWindow(fEdit, 0);
	fRobot->Key("escape");
	ASSERT_TRUE(AllClosed());
	fEdit->SetTriggersEnabled(false);
	fRobot->ClickItem("Edit");
	const WindowPicture without = MenuPicture(fEdit);
	EXPECT_FALSE(with.SameIn(without, copy));
	EXPECT_GT(Dark(with, copy), Dark(without, copy) + 3);
}


TEST_F(MenuDrawingTest, LongLabelsAreCutAtTheMaximum)
{
	fEdit->AddItem(new BMenuItem("mmmmmmmmmmmmmmmmmmmmmmmmmmmmmmmmmmmmmmm", nullptr));
	fEdit->SetMaxContentWidth(60);
	Show();
	fRobot->ClickItem("Edit");
	const WindowPicture picture = MenuPicture(fEdit);
	EXPECT_LT(picture.width, 110);
	EXPECT_EQ(Dark(picture, RightOf(InWindow(fEdit, 2), 16)), 0);
	EXPECT_GT(Dark(picture, InWindow(fEdit, 2)), 50);
}


TEST_F(MenuDrawingTest, ItemsMayDrawThemselves)
{
	fEdit->AddItem(new SwatchItem);
	Show();
	fRobot->ClickItem("Edit");
	const WindowPicture picture = MenuPicture(fEdit);
	EXPECT_EQ(picture.Count(InWindow(fEdit, 2), kRed), 40 * 30);
}


TEST_F(MenuDrawingTest, FieldShowsLabelChoiceAndState)
{
	BPopUpMenu* menu = new BPopUpMenu("choices");
	menu->AddItem(new BMenuItem("iii", nullptr));
	menu->AddItem(new BMenuItem("MMMMMM", nullptr));
	BMenuField* field = Add(new BMenuField(BRect(20, 100, 219, 119), "field", "Label:", menu));
	Show();
	const BRect bar =
		Ask([field] { return field->MenuBar()->Frame().OffsetByCopy(field->Frame().LeftTop()); });
	const BRect label(20, bar.top, bar.left - 2, bar.bottom);
	const WindowPicture first = Picture();
	EXPECT_GT(Dark(first, label), 20);
	Do([menu] { menu->ItemAt(1)->SetMarked(true); });
	const WindowPicture second = Picture();
	EXPECT_TRUE(first.SameIn(second, label));
	EXPECT_GT(Dark(second, bar), Dark(first, bar) + 20);

	const rgb_color ring = ui_color(B_KEYBOARD_NAVIGATION_COLOR);
	EXPECT_EQ(second.Count(bar, ring), 0);
	Do([field] { field->MakeFocus(); });
	EXPECT_GT(Picture().Count(bar, ring), 60);
	Do([field] { field->SetEnabled(false); });
	const WindowPicture disabled = Picture();
	EXPECT_EQ(disabled.Count(bar, ring), 0);
	EXPECT_EQ(Dark(disabled, bar), 0);
	EXPECT_EQ(Dark(disabled, label), 0);
	Do([field] {
		field->SetEnabled(true);
		field->SetAlignment(B_ALIGN_RIGHT);
	});
	EXPECT_EQ(Dark(Picture(), BRect(20, bar.top, 40, bar.bottom)), 0);
}


TEST_F(MenuDrawingTest, BarHasALineBelow)
{
	Show();
	const rgb_color line = tint_color(ui_color(B_MENU_BACKGROUND_COLOR), B_DARKEN_2_TINT);
	const float bottom = Ask([this] { return fBar->Frame().bottom; });
	EXPECT_EQ(Picture().Count(BRect(0, bottom, 299, bottom), line), 300);
	EXPECT_EQ(Ask([this] { return fBar->Border(); }), B_BORDER_FRAME);
	Do([this] { fBar->SetBorder(B_BORDER_EACH_ITEM); });
	const BRect file = Ask([this] { return fBar->ItemAt(0)->Frame(); });
	EXPECT_GT(Picture().Count(BRect(file.right, file.top, file.right, file.bottom), line), 10);
}


TEST_F(MenuDrawingTest, WindowThatWaitsForAMenuIsRepainted)
{
	WaitingView* view = Add(new WaitingView(BRect(20, 100, 279, 189)));
	Show();
	BMessenger(view).SendMessage('GoGo');
	ASSERT_TRUE(Opens(&view->menu));
	EXPECT_TRUE(Becomes([&] { return view->draws == 1; }));
	fRobot->Key("escape");
	EXPECT_TRUE(Closes(&view->menu));
}

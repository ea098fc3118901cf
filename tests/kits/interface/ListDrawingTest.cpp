// SPDX-License-Identifier: MIT
// Tests of what lists and scroll bars show, on a display that draws without a screen.
#include <cstdlib>
#include <string>

#include <OutlineListView.h>
#include <ScrollView.h>

#include "ControlsFixture.h"

namespace {

class ListDrawingTest : public ControlsTest {
protected:
	void TearDown() override
	{
		ControlsTest::TearDown();
		for (BListItem* item : fItems)
			delete item;
	}

	BStringItem* NewItem(const char* text, uint32 level = 0)
	{
		BStringItem* item = new BStringItem(text, level);
		fItems.push_back(item);
		return item;
	}

	WindowPicture Picture()
	{
		fRobot->Settle();
		return fRobot->Picture();
	}

	/// A view's rectangle in the window.
	BRect InWindow(BView* view, BRect rect)
	{
		return Ask([view, rect] {
			return view->Window()->ConvertFromScreen(view->ConvertToScreen(rect));
		});
	}

	std::vector<BListItem*> fItems;
};

} // namespace


TEST_F(ListDrawingTest, SelectedRowHasTheSelectionsColour)
{
	BListView* list = Add(new BListView(BRect(10, 10, 159, 109), "list"));
	list->AddItem(NewItem("first"));
	list->AddItem(NewItem("second"));
	Show();
	const BRect row = InWindow(list, Ask([list] { return list->ItemFrame(1); }));
	const BRect end(row.right - 20, row.top, row.right - 1, row.bottom);
	const int32 all = static_cast<int32>((end.Width() + 1) * (end.Height() + 1));
	EXPECT_EQ(Picture().Count(end, ui_color(B_LIST_BACKGROUND_COLOR)), all);
	Do([list] { list->Select(1); });
	EXPECT_EQ(Picture().Count(end, ui_color(B_LIST_SELECTED_BACKGROUND_COLOR)), all);
	Do([list] { list->DeselectAll(); });
	EXPECT_EQ(Picture().Count(end, ui_color(B_LIST_BACKGROUND_COLOR)), all);
}


TEST_F(ListDrawingTest, DisabledRowIsPaler)
{
	BListView* list = Add(new BListView(BRect(10, 10, 159, 109), "list"));
	BStringItem* item = NewItem("IIIIII");
	list->AddItem(item);
	Show();
	const BRect row = InWindow(list, Ask([list] { return list->ItemFrame(0); }));
	const auto darkest = [&] {
		const WindowPicture picture = Picture();
		int32 least = 255;
		for (int32 y = row.IntegerHeight(); y >= 0; y--) {
			for (int32 x = 60; x >= 0; x--) {
				least = std::min<int32>(least, picture.At(row.left + x, row.top + y).red);
			}
		}
		return least;
	};
	const int32 enabled = darkest();
	Do([&] {
		item->SetEnabled(false);
		list->InvalidateItem(0);
	});
	EXPECT_GT(darkest(), enabled + 50);
}


TEST_F(ListDrawingTest, RowsMoveUpWhenOneIsRemoved)
{
	BListView* list = Add(new BListView(BRect(10, 10, 159, 109), "list"));
	for (const char* text : {"one", "two", "three"})
		list->AddItem(NewItem(text));
	Show();
	const BRect second = InWindow(list, Ask([list] { return list->ItemFrame(1); }));
	const BRect third = InWindow(list, Ask([list] { return list->ItemFrame(2); }));
	const WindowPicture before = Picture();
	Do([list] { list->RemoveItem(int32(0)); });
	const WindowPicture after = Picture();
	for (int32 y = 0; y <= second.IntegerHeight(); y++) {
		for (int32 x = 0; x <= second.IntegerWidth(); x++) {
			ASSERT_EQ(after.At(second.left + x, second.top + y),
				before.At(third.left + x, third.top + y));
		}
	}
	EXPECT_EQ(after.Count(third, ui_color(B_LIST_BACKGROUND_COLOR)),
		(third.IntegerWidth() + 1) * (third.IntegerHeight() + 1));
}


TEST_F(ListDrawingTest, ScrolledListShowsWhatADrawingOfItWould)
{
	BListView* list =
		new BListView(BRect(10, 10, 159, 109), "list", B_SINGLE_SELECTION_LIST, B_FOLLOW_ALL);
	Add(new BScrollView("scroll", list, B_FOLLOW_NONE, 0, true, true));
	for (int i = 0; i < 60; i++)
		list->AddItem(NewItem(("row " + std::to_string(i)).c_str()));
	Show();
	fRobot->MoveTo(BPoint(60, 60));
	for (float turn : {1.0f, 3.0f, -2.0f, 5.0f})
		fRobot->Wheel(turn);
	const WindowPicture scrolled = Picture();
	Do([this] { fBackground->Invalidate(); });
	const BRect bounds(0, 0, 299, 199);
	EXPECT_TRUE(Picture().SameIn(scrolled, bounds));
}


TEST_F(ListDrawingTest, FocusShowsInTheBorderOfTheScrollView)
{
	BListView* list =
		new BListView(BRect(20, 20, 119, 99), "list", B_SINGLE_SELECTION_LIST, B_FOLLOW_ALL);
	BScrollView* view = Add(new BScrollView("scroll", list, B_FOLLOW_NONE, 0, true, true));
	Show();
	const BRect frame = Ask([view] { return view->Frame(); });
	const rgb_color focus = ui_color(B_KEYBOARD_NAVIGATION_COLOR);
	EXPECT_EQ(Picture().Count(frame, focus), 0);
	Do([list] { list->MakeFocus(true); });
	const int32 around = 2 * (frame.IntegerWidth() + 1) + 2 * (frame.IntegerHeight() - 1);
	EXPECT_EQ(Picture().Count(frame, focus), around);
	Do([list] { list->MakeFocus(false); });
	EXPECT_EQ(Picture().Count(frame, focus), 0);
}


TEST_F(ListDrawingTest, ListWithoutAScrollViewShowsItsFocus)
{
	BListView* list = Add(new BListView(BRect(20, 20, 119, 99), "list"));
	for (int i = 0; i < 30; i++)
		list->AddItem(NewItem(""));
	Show();
	Do([list] { list->MakeFocus(true); });
	const rgb_color focus = ui_color(B_KEYBOARD_NAVIGATION_COLOR);
	const BRect frame(20, 20, 119, 99);
	EXPECT_EQ(Picture().Count(frame, focus), 2 * 100 + 2 * 78);
	Do([list] { list->ScrollTo(BPoint(0, 31)); });
	EXPECT_EQ(Picture().Count(frame, focus), 2 * 100 + 2 * 78);
}


TEST_F(ListDrawingTest, BorderFollowsTheSizeOfTheScrollView)
{
	BView* target = new BView(BRect(20, 20, 119, 99), "target", B_FOLLOW_ALL, 0);
	BScrollView* view =
		Add(new BScrollView("scroll", target, B_FOLLOW_NONE, 0, false, false, B_PLAIN_BORDER));
	view->SetBorderHighlighted(true);
	Show();
	const rgb_color focus = ui_color(B_KEYBOARD_NAVIGATION_COLOR);
	const BRect everything(0, 0, 299, 199);
	for (float grow : {30.0f, -50.0f, 11.0f}) {
		Do([view, grow] { view->ResizeBy(grow, grow); });
		const BRect frame = Ask([view] { return view->Frame(); });
		EXPECT_EQ(Picture().Count(everything, focus),
			2 * (frame.IntegerWidth() + 1) + 2 * (frame.IntegerHeight() - 1));
	}
}


TEST_F(ListDrawingTest, ThumbShowsPlaceAndShare)
{
	BScrollBar* bar = Add(new BScrollBar(BRect(50, 10, 64, 159), "bar", NULL, 0, 100, B_VERTICAL));
	bar->SetProportion(0.5f);
	Show();
	const WindowPicture top = Picture();
	// Half of the 122 pixels between the arrows' lines, the lines included.
	const rgb_color thumb = top.At(52, 30);
	const rgb_color track = top.At(52, 130);
	EXPECT_NE(thumb, track);
	EXPECT_EQ(top.At(52, 26 + 57), thumb);
	EXPECT_EQ(top.At(52, 26 + 62), track);
	Do([bar] { bar->SetValue(100); });
	const WindowPicture bottom = Picture();
	EXPECT_EQ(bottom.At(52, 30), track);
	EXPECT_EQ(bottom.At(52, 130), thumb);
	Do([bar] { bar->SetRange(0, 0); });
	const WindowPicture disabled = Picture();
	EXPECT_EQ(disabled.Count(BRect(51, 26, 63, 143), ui_color(B_PANEL_BACKGROUND_COLOR)), 13 * 118);
}


TEST_F(ListDrawingTest, PressedPartsShowIt)
{
	BScrollBar* bar = Add(new BScrollBar(BRect(50, 10, 64, 159), "bar", NULL, 0, 100, B_VERTICAL));
	Show();
	Do([bar] { bar->SetValue(50); });
	const WindowPicture before = Picture();
	fRobot->MoveTo(BPoint(57, 150));
	fRobot->Press();
	const WindowPicture pressed = Picture();
	EXPECT_NE(pressed.At(52, 148), before.At(52, 148));
	fRobot->MoveTo(BPoint(150, 150));
	EXPECT_EQ(Picture().At(52, 148), before.At(52, 148));
	fRobot->Release();
}


TEST_F(ListDrawingTest, LatchTurnsWithItsItem)
{
	BOutlineListView* list = Add(new BOutlineListView(BRect(10, 10, 159, 109), "outline"));
	list->AddItem(NewItem("super"));
	list->AddItem(NewItem("sub", 1));
	Show();
	const BRect row = InWindow(list, Ask([list] { return list->ItemFrame(0); }));
	const BRect latch(row.left, row.top, row.left + 15, row.bottom);
	const WindowPicture open = Picture();
	EXPECT_LT(open.Count(latch, ui_color(B_LIST_BACKGROUND_COLOR)),
		(latch.IntegerWidth() + 1) * (latch.IntegerHeight() + 1));
	Do([list] { list->Collapse(list->FullListItemAt(0)); });
	const WindowPicture closed = Picture();
	EXPECT_FALSE(closed.SameIn(open, latch));
	// Without subitems there is no latch.
	Do([list] { list->RemoveItem(int32(1)); });
	EXPECT_EQ(Picture().Count(latch, ui_color(B_LIST_BACKGROUND_COLOR)),
		(latch.IntegerWidth() + 1) * (latch.IntegerHeight() + 1));
}

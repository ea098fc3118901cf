// SPDX-License-Identifier: MIT

#include "props/TabView.h"

#include <cmath>

#include <Font.h>

#include "WindowTest.h"

namespace {

class TabViewTest : public WindowTest {
protected:
	void SetUp() override
	{
		window = new BWindow(BRect(100, 100, 599, 299), "Tabs", B_TITLED_WINDOW, 0);
		const char* labels[] = {"Short", "A much longer label", "Mid label"};
		tabs = new TabView(window->Bounds(), "tabs", labels, 3, B_FOLLOW_ALL_SIDES,
			B_WILL_DRAW | B_NAVIGABLE, be_plain_font);
		for (int32 i = 0; i < 3; i++)
			pages[i] = new BView(tabs->GetContentArea(), "page", B_FOLLOW_ALL_SIDES, 0);
		tabs->AddViews(pages);
		window->AddChild(tabs);
		window->Show();
		robot = std::make_unique<Robot>(window);
		ASSERT_TRUE(robot->WaitForWindow("Tabs"));
		tabWidth = std::floor(be_plain_font->StringWidth(labels[1]) + 18);
	}

	void TearDown() override
	{
		robot.reset();
		QuitWindow(window);
	}

	float Middle(int32 tab) const
	{
		return (tabWidth + 2) * static_cast<float>(tab) + tabWidth / 2;
	}

	/// The index of the only page that is shown, -1 when it is not just one.
	int32 ShownPage()
	{
		robot->Settle();
		BWindow* locked = window;
		if (!locked->Lock())
			return -1;
		int32 shown = -1;
		int32 count = 0;
		for (int32 i = 0; i < 3; i++) {
			if (!pages[i]->IsHidden()) {
				shown = i;
				count++;
			}
		}
		locked->Unlock();
		return count == 1 ? shown : -1;
	}

	bool HasFocus()
	{
		robot->Settle();
		window->Lock();
		const bool focus = tabs->IsFocus();
		window->Unlock();
		return focus;
	}

	BWindow* window = nullptr;
	TabView* tabs = nullptr;
	BView* pages[3] = {};
	std::unique_ptr<Robot> robot;
	float tabWidth = 0;
};

} // namespace

TEST_F(TabViewTest, TabsAreAsWideAsTheWidestLabelAnd18)
{
	EXPECT_EQ(tabs->GetTabsWidth(), (tabWidth + 2) * 3 - 1 + 3);
	// The last pixel of the first tab, and the first of the second.
	robot->Click(BPoint(tabWidth + 2, 5));
	EXPECT_EQ(ShownPage(), 1);
	robot->Click(BPoint(tabWidth + 1, 5));
	EXPECT_EQ(ShownPage(), 0);
}


TEST_F(TabViewTest, ContentLiesBelowTheTabs)
{
	font_height height;
	be_plain_font->GetHeight(&height);
	const float tabHeight = std::ceil(height.ascent) + std::ceil(height.descent) + 6;
	EXPECT_EQ(tabs->GetContentArea(), BRect(1, tabHeight + 1, 498, 198));
}


TEST_F(TabViewTest, AClickShowsThePageOfItsTab)
{
	EXPECT_EQ(ShownPage(), 0);
	robot->Click(BPoint(Middle(2), 8));
	EXPECT_EQ(ShownPage(), 2);
	EXPECT_EQ(tabs->SelectedTab(), 2);
}


TEST_F(TabViewTest, AClickOnTheSelectedTabTakesTheFocusOnly)
{
	EXPECT_FALSE(HasFocus());
	robot->Click(BPoint(Middle(0), 8));
	EXPECT_EQ(ShownPage(), 0);
	EXPECT_TRUE(HasFocus());
}


TEST_F(TabViewTest, AClickBesideTheTabsTakesTheFocusOnly)
{
	robot->Click(BPoint(Middle(1), 8));
	window->Lock();
	tabs->MakeFocus(false);
	window->Unlock();
	robot->Click(BPoint(495, 5));
	EXPECT_EQ(ShownPage(), 1);
	EXPECT_TRUE(HasFocus());
}


TEST_F(TabViewTest, ArrowsGoFromTabToTab)
{
	robot->Click(BPoint(Middle(0), 8));
	robot->Key("right");
	EXPECT_EQ(ShownPage(), 1);
	robot->Key("right");
	robot->Key("right");
	EXPECT_EQ(ShownPage(), 2);
	robot->Key("left");
	EXPECT_EQ(ShownPage(), 1);
}


TEST_F(TabViewTest, IndicesOutOfRangeAreIgnored)
{
	window->Lock();
	tabs->SelectTab(-1);
	tabs->SelectTab(3);
	window->Unlock();
	EXPECT_EQ(ShownPage(), 0);
}


TEST_F(TabViewTest, TheContentAreaStaysThatOfTheStart)
{
	const BRect before = tabs->GetContentArea();
	window->Lock();
	window->ResizeTo(550, 350);
	window->Unlock();
	robot->Settle();
	EXPECT_EQ(tabs->GetContentArea(), before);
	window->Lock();
	EXPECT_EQ(pages[0]->Frame().right, before.right + (550 - 499));
	window->Unlock();
}


TEST_F(TabViewTest, TheSelectedTabJoinsTheContent)
{
	const BRect content = tabs->GetContentArea();
	const int32 line = static_cast<int32>(content.top) - 1;
	const rgb_color white = {255, 255, 255, 255};
	robot->Click(BPoint(Middle(1), 8));
	robot->Settle();
	const WindowPicture picture = robot->Picture();
	EXPECT_EQ(picture.At(static_cast<int32>(Middle(0)), line).blue, white.blue);
	EXPECT_EQ(picture.At(static_cast<int32>(Middle(1)), line).blue, 216);
	// The edges of the selected tab.
	const int32 left = static_cast<int32>(tabWidth) + 2;
	EXPECT_EQ(picture.At(left, 10).blue, white.blue);
	EXPECT_EQ(picture.At(left + static_cast<int32>(tabWidth) + 1, 10).blue, 152);
}

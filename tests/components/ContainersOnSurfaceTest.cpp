// SPDX-License-Identifier: MIT
// Tests of the containers on the design surface, used with the mouse.

#include <ListView.h>
#include <ScrollBar.h>

#include "designer/SurfaceTest.h"
#include "model/Component.h"
#include "model/ComponentOwner.h"
#include "support/Printers.h"

class ContainersOnSurfaceTest : public SurfaceTest {
protected:
	bool IsHidden(TComponent* component)
	{
		bool isHidden = false;
		Locked([&] { isHidden = component->DTView()->IsHidden(component->DTView()); });
		return isHidden;
	}
};


TEST_F(ContainersOnSurfaceTest, AListDrawnIntoAScrollViewFillsItAndFollowsItsSize)
{
	TComponent* scroll = Draw("TScrollView", BRect(20, 20, 120, 100));
	ASSERT_NE(scroll, nullptr);
	TComponent* list = Draw("TListView", BRect(40, 40, 80, 70));
	ASSERT_NE(list, nullptr);
	EXPECT_EQ(Parent(list), "ScrollView1");
	EXPECT_EQ(Frame(list), BRect(2, 2, 84, 64));
	EXPECT_EQ(ToldFrame(list), BRect(2, 2, 84, 64));

	// By its handle; and it cannot be dragged off its place, nor made smaller.
	fRobot.Drag(BPoint(118, 98), BPoint(158, 128));
	fRobot.Settle();
	EXPECT_EQ(ToldFrame(list).RightBottom() - BPoint(84, 64),
		Frame(scroll).RightBottom() - BPoint(120, 100));
	const BRect filled = Frame(list);
	fRobot.Drag(BPoint(60, 50), BPoint(80, 70));
	fRobot.Settle();
	EXPECT_EQ(Parent(list), "ScrollView1");
	EXPECT_EQ(Frame(list), filled);
	EXPECT_EQ(ToldFrame(list), filled);
	const BRect onForm = FrameOnForm(list);
	fRobot.Drag(onForm.RightBottom() - BPoint(2, 2), onForm.RightBottom() - BPoint(30, 30));
	fRobot.Settle();
	EXPECT_EQ(Frame(list), filled);
	EXPECT_EQ(ToldFrame(list), filled);
}


TEST_F(ContainersOnSurfaceTest, DeletingAScrollViewLeavesItsListsToTheForm)
{
	TComponent* scroll = Draw("TScrollView", BRect(20, 20, 180, 140));
	ASSERT_NE(scroll, nullptr);
	ASSERT_NE(Draw("TListView", BRect(40, 40, 80, 70)), nullptr);
	// Over the bar: the list covers all else.
	TComponent* check = Draw("TCheckBox", BRect(169, 30, 178, 50));
	ASSERT_NE(check, nullptr);
	EXPECT_EQ(Parent(check), "ScrollView1");
	const BRect frame = Frame(check);
	ASSERT_TRUE(ChooseFromMenu(BPoint(173, 120), "Delete"));
	fRobot.Settle();
	EXPECT_EQ(Names(), "ListView1 CheckBox1");
	EXPECT_EQ(Parent(check), "");
	EXPECT_EQ(Frame(check), frame);
	fRobot.Wheel(1);
	fRobot.Settle();
}


TEST_F(ContainersOnSurfaceTest, WhatIsDrawnIntoATabViewIsOnThePageThatIsShown)
{
	TComponent* tabs = Draw("TTabView", BRect(20, 20, 220, 150));
	ASSERT_NE(tabs, nullptr);
	TComponent* first = Draw("TCheckBox", BRect(40, 60, 120, 80));
	ASSERT_NE(first, nullptr);
	EXPECT_EQ(Value(first, "Page"), "0");
	Locked([&] { tabs->SetPropertyValue("Selection", "1"); });
	EXPECT_TRUE(IsHidden(first));
	TComponent* second = Draw("TCheckBox", BRect(60, 90, 140, 110));
	ASSERT_NE(second, nullptr);
	EXPECT_EQ(Value(second, "Page"), "1");
	EXPECT_EQ(Parent(second), "TabView1");

	// Deleting it brings all of them onto the form, where they are seen.
	ASSERT_TRUE(ChooseFromMenu(BPoint(200, 140), "Delete"));
	fRobot.Settle();
	EXPECT_EQ(Names(), "CheckBox1 CheckBox2");
	EXPECT_FALSE(IsHidden(first));
	EXPECT_FALSE(IsHidden(second));
	EXPECT_EQ(Parent(first), "");
}

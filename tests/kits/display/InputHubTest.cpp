// SPDX-License-Identifier: MIT
// Which window gets what of the pointer and the keyboard.
#include <cstring>
#include <memory>
#include <string>

#include <gtest/gtest.h>

#include <OS.h>
#include <View.h>
#include <Window.h>

#include "RecordingClient.h"
#include "display/Display.h"
#include "display/InputHub.h"
#include "display/KeyMap.h"
#include "support/Printers.h"

using BPrivate::InputHub;
using BPrivate::StackedWindow;

namespace {

struct TestWindow {
	TestWindow(InputHub& hub, BRect frame, uint32 feel = B_NORMAL_WINDOW_FEEL, uint32 flags = 0,
		bool isMenu = false)
		: hub(hub)
	{
		stacked.client = &client;
		stacked.frame = frame;
		stacked.style.feel = feel;
		stacked.style.flags = flags;
		stacked.style.isMenu = isMenu;
		hub.AddWindow(&stacked);
		hub.SetVisible(&stacked, true);
	}

	~TestWindow() { hub.RemoveWindow(&stacked); }

	InputHub& hub;
	RecordingClient client;
	StackedWindow stacked;
};

} // namespace

class InputHubTest : public testing::Test {
protected:
	InputHubTest()
		: fHub(true)
	{
	}

	void Pointer(float x, float y, uint32 buttons = 0)
	{
		fHub.PointerAt(BPoint(x, y), buttons, std::nullopt);
	}

	void Forget(std::initializer_list<TestWindow*> windows)
	{
		for (TestWindow* window : windows)
			window->client.Codes();
	}

	InputHub fHub;
};

TEST_F(InputHubTest, AShownWindowBecomesActive)
{
	TestWindow first(fHub, BRect(0, 0, 99, 99));
	EXPECT_EQ(first.client.Codes(), "active");
	TestWindow second(fHub, BRect(200, 0, 299, 99));
	EXPECT_EQ(first.client.Codes(), "inactive");
	EXPECT_EQ(second.client.Codes(), "active");
	fHub.SetVisible(&second.stacked, false);
	EXPECT_EQ(second.client.Codes(), "inactive");
	EXPECT_EQ(first.client.Codes(), "active");
}


TEST_F(InputHubTest, AWindowThatIsRestoredBecomesActive)
{
	TestWindow first(fHub, BRect(0, 0, 99, 99));
	TestWindow second(fHub, BRect(50, 0, 149, 99));
	fHub.SetMinimized(&second.stacked, true);
	Forget({&first, &second});
	fHub.SetMinimized(&second.stacked, false);
	EXPECT_EQ(first.client.Codes(), "inactive");
	EXPECT_EQ(second.client.Codes(), "active");
	EXPECT_TRUE(fHub.IsFront(&second.stacked));
	// It is that already.
	fHub.Activate(&first.stacked);
	Forget({&first, &second});
	fHub.SetMinimized(&second.stacked, false);
	EXPECT_EQ(second.client.Codes(), "");
}


TEST_F(InputHubTest, APressCarriesItsFields)
{
	TestWindow window(fHub, BRect(100, 50, 199, 149));
	Pointer(110, 70);
	Pointer(110, 70, B_SECONDARY_MOUSE_BUTTON);
	BMessage down = window.client.Last();
	EXPECT_EQ(down.what, B_MOUSE_DOWN);
	EXPECT_EQ(down.GetPoint("screen_where", BPoint()), BPoint(110, 70));
	EXPECT_EQ(down.GetPoint("where", BPoint()), BPoint(10, 20));
	EXPECT_EQ(down.GetInt32("buttons", 0), B_SECONDARY_MOUSE_BUTTON);
	EXPECT_EQ(down.GetInt32("clicks", 0), 1);
	EXPECT_TRUE(down.HasInt32("modifiers"));
	EXPECT_TRUE(down.HasInt64("when"));

	Pointer(110, 70);
	BMessage up = window.client.Last();
	EXPECT_EQ(up.what, B_MOUSE_UP);
	EXPECT_EQ(up.GetInt32("buttons", -1), 0);
}


TEST_F(InputHubTest, QuickPressesAtOnePlaceAreCounted)
{
	TestWindow window(fHub, BRect(0, 0, 99, 99));
	for (int32 clicks = 1; clicks <= 3; clicks++) {
		Pointer(10, 10, 1);
		EXPECT_EQ(window.client.Last().GetInt32("clicks", 0), clicks);
		Pointer(10, 10);
	}
	// Another place, and another button, begin anew.
	Pointer(40, 10, 1);
	EXPECT_EQ(window.client.Last().GetInt32("clicks", 0), 1);
	Pointer(40, 10);
	Pointer(40, 10, 2);
	EXPECT_EQ(window.client.Last().GetInt32("clicks", 0), 1);
}


TEST_F(InputHubTest, ALatePressByTheHostsClockIsANewClick)
{
	TestWindow window(fHub, BRect(0, 0, 99, 99));
	fHub.PointerAt(BPoint(10, 10), 1, std::nullopt, 1000000);
	fHub.PointerAt(BPoint(10, 10), 0, std::nullopt, 1010000);
	fHub.PointerAt(BPoint(10, 10), 1, std::nullopt, 1500001);
	EXPECT_EQ(window.client.Last().GetInt32("clicks", 0), 1);
	// Until the host's word arrives, time may pass.
	fHub.PointerAt(BPoint(10, 10), 0, std::nullopt, 1510000);
	snooze(550000);
	fHub.PointerAt(BPoint(10, 10), 1, std::nullopt, 1600000);
	EXPECT_EQ(window.client.Last().GetInt32("clicks", 0), 2);
}


TEST_F(InputHubTest, EachButtonIsReported)
{
	TestWindow window(fHub, BRect(0, 0, 99, 99));
	Pointer(10, 10);
	window.client.Codes();
	Pointer(10, 10, 3);
	EXPECT_EQ(window.client.Codes(), "down down");
	Pointer(10, 10, 2);
	EXPECT_EQ(window.client.Codes(), "up");
	EXPECT_EQ(window.client.Last().GetInt32("buttons", 0), 2);
	Pointer(10, 10, 0);
	EXPECT_EQ(window.client.Codes(), "up");
}


TEST_F(InputHubTest, MovesGoToTheWindowUnderThePointerAndTheOldOneHearsThatItLeft)
{
	TestWindow left(fHub, BRect(0, 0, 99, 99));
	TestWindow right(fHub, BRect(100, 0, 199, 99));
	Forget({&left, &right});
	Pointer(99.5, 50);
	Pointer(100, 50);
	EXPECT_EQ(left.client.Codes(), "move leave");
	EXPECT_EQ(right.client.Codes(), "move");
	fHub.PointerLeft();
	EXPECT_EQ(right.client.Codes(), "leave");
	Pointer(300, 50);
	EXPECT_EQ(right.client.Codes(), "");
}


TEST_F(InputHubTest, WhileAButtonIsHeldAllGoesToTheWindowOfThePress)
{
	TestWindow left(fHub, BRect(0, 0, 99, 99));
	TestWindow right(fHub, BRect(100, 0, 199, 99));
	Pointer(50, 50);
	Forget({&left, &right});
	Pointer(50, 50, 1);
	Pointer(150, 50, 1);
	EXPECT_EQ(left.client.Last().GetPoint("where", BPoint()), BPoint(150, 50));
	EXPECT_EQ(left.client.Codes(), "active down move");
	Pointer(150, 50, 0);
	EXPECT_EQ(left.client.Codes(), "up leave");
	EXPECT_EQ(right.client.Codes(), "inactive move");
}


TEST_F(InputHubTest, TheTopmostWindowGetsThePress)
{
	TestWindow below(fHub, BRect(0, 0, 99, 99));
	TestWindow above(fHub, BRect(50, 0, 149, 99));
	Forget({&below, &above});
	Pointer(60, 50, 1);
	Pointer(60, 50);
	EXPECT_EQ(above.client.Codes(), "move down up");
	EXPECT_EQ(below.client.Codes(), "");

	// A press raises a window.
	Pointer(10, 50, 1);
	Pointer(10, 50);
	Forget({&below, &above});
	Pointer(60, 50, 1);
	EXPECT_EQ(below.client.Codes(), "move down");
	EXPECT_TRUE(fHub.IsFront(&below.stacked));
	EXPECT_FALSE(fHub.IsFront(&above.stacked));
}


TEST_F(InputHubTest, AWindowThatAvoidsTheFrontStaysWhereItIs)
{
	TestWindow below(
		fHub, BRect(0, 0, 99, 99), B_NORMAL_WINDOW_FEEL, B_AVOID_FRONT | B_AVOID_FOCUS);
	TestWindow above(fHub, BRect(50, 0, 149, 99));
	Forget({&below, &above});
	Pointer(10, 50, 1);
	EXPECT_EQ(below.client.Codes(), "move down");
	EXPECT_EQ(above.client.Codes(), "");
	EXPECT_TRUE(fHub.IsFront(&above.stacked));
}


TEST_F(InputHubTest, AModalWindowKeepsInputFromTheOthers)
{
	TestWindow normal(fHub, BRect(0, 0, 99, 99));
	TestWindow modal(fHub, BRect(100, 0, 199, 99), B_MODAL_APP_WINDOW_FEEL);
	Forget({&normal, &modal});
	Pointer(50, 50);
	Pointer(50, 50, 1);
	Pointer(50, 50);
	fHub.Wheel(0, 1, std::nullopt);
	EXPECT_EQ(normal.client.Codes(), "");
	EXPECT_EQ(modal.client.Codes(), "");
	Pointer(150, 50, 1);
	EXPECT_EQ(modal.client.Codes(), "move down");
	Pointer(150, 50);

	fHub.SetVisible(&modal.stacked, false);
	modal.client.Codes();
	Pointer(50, 50, 1);
	EXPECT_EQ(normal.client.Codes(), "active move down");
}


TEST_F(InputHubTest, OfTwoModalWindowsTheNewerOneBlocks)
{
	TestWindow first(fHub, BRect(0, 0, 99, 99), B_MODAL_APP_WINDOW_FEEL);
	TestWindow second(fHub, BRect(100, 0, 199, 99), B_MODAL_APP_WINDOW_FEEL);
	Forget({&first, &second});
	Pointer(50, 50, 1);
	Pointer(50, 50);
	EXPECT_EQ(first.client.Codes(), "");
	Pointer(150, 50, 1);
	EXPECT_EQ(second.client.Codes(), "move down");
}


TEST_F(InputHubTest, ASubsetModalWindowBlocksItsSubsetOnly)
{
	TestWindow member(fHub, BRect(0, 0, 99, 99));
	TestWindow other(fHub, BRect(100, 0, 199, 99));
	TestWindow modal(fHub, BRect(200, 0, 299, 99), B_MODAL_SUBSET_WINDOW_FEEL);
	fHub.AddToSubset(&modal.stacked, &member.stacked);
	Forget({&member, &other, &modal});
	Pointer(50, 50, 1);
	Pointer(50, 50);
	EXPECT_EQ(member.client.Codes(), "");
	Pointer(150, 50, 1);
	EXPECT_EQ(other.client.Codes(), "move active down");
}


TEST_F(InputHubTest, FloatingWindowsStayAboveAndMenusAboveThem)
{
	TestWindow menu(fHub, BRect(0, 0, 99, 99), B_NORMAL_WINDOW_FEEL, 0, true);
	TestWindow floating(fHub, BRect(0, 0, 99, 99), B_FLOATING_APP_WINDOW_FEEL);
	TestWindow normal(fHub, BRect(0, 0, 99, 99));
	Forget({&menu, &floating, &normal});
	Pointer(50, 50);
	EXPECT_EQ(menu.client.Codes(), "move");
	fHub.SetVisible(&menu.stacked, false);
	Pointer(51, 50);
	EXPECT_EQ(floating.client.Codes(), "move");
	EXPECT_TRUE(fHub.IsFront(&normal.stacked));
}


TEST_F(InputHubTest, AModalWindowStaysAboveWhatItBlocks)
{
	TestWindow modal(fHub, BRect(0, 0, 99, 99), B_MODAL_APP_WINDOW_FEEL);
	TestWindow normal(fHub, BRect(0, 0, 99, 99));
	TestWindow floating(fHub, BRect(0, 0, 99, 99), B_FLOATING_APP_WINDOW_FEEL);
	fHub.Raise(&normal.stacked);
	Forget({&modal, &normal, &floating});
	Pointer(50, 50);
	EXPECT_EQ(modal.client.Codes(), "move");
	EXPECT_TRUE(fHub.IsFront(&modal.stacked));
	EXPECT_FALSE(fHub.IsFront(&normal.stacked));
	fHub.SetVisible(&modal.stacked, false);
	Pointer(51, 50);
	EXPECT_EQ(floating.client.Codes(), "move");
	EXPECT_TRUE(fHub.IsFront(&normal.stacked));
}


TEST_F(InputHubTest, SubsetWindowsStayAboveTheirSubsetOnly)
{
	for (uint32 feel : {B_FLOATING_SUBSET_WINDOW_FEEL, B_MODAL_SUBSET_WINDOW_FEEL}) {
		TestWindow upper(fHub, BRect(0, 0, 99, 99), feel);
		TestWindow member(fHub, BRect(0, 0, 99, 99));
		TestWindow other(fHub, BRect(0, 0, 99, 99));
		fHub.AddToSubset(&upper.stacked, &member.stacked);
		fHub.Raise(&other.stacked);
		Forget({&upper, &member, &other});
		Pointer(50, 50);
		EXPECT_EQ(other.client.Codes(), "move") << feel;
		fHub.SetVisible(&other.stacked, false);
		fHub.Raise(&member.stacked);
		Forget({&upper, &member});
		Pointer(51, 50);
		EXPECT_EQ(upper.client.Codes(), "move") << feel;

		fHub.RemoveFromSubset(&upper.stacked, &member.stacked);
		fHub.Raise(&member.stacked);
		Forget({&upper, &member});
		Pointer(52, 50);
		EXPECT_EQ(member.client.Codes(), "move") << feel;
		Pointer(300, 300);
	}
}


TEST_F(InputHubTest, TheCloseButtonOfABlockedWindowBringsTheModalOne)
{
	TestWindow window(fHub, BRect(0, 0, 99, 99));
	fHub.RequestClose(&window.stacked);
	EXPECT_EQ(window.client.Last().what, B_QUIT_REQUESTED);
	TestWindow modal(fHub, BRect(100, 0, 199, 99), B_MODAL_APP_WINDOW_FEEL);
	const StackedWindow* raised = nullptr;
	fHub.SetRaiseListener([&](StackedWindow* one) { raised = one; });
	window.client.Codes();
	fHub.RequestClose(&window.stacked);
	EXPECT_EQ(window.client.Codes(), "");
	EXPECT_EQ(raised, &modal.stacked);
	fHub.RequestClose(&modal.stacked);
	EXPECT_EQ(modal.client.Last().what, B_QUIT_REQUESTED);
}


TEST_F(InputHubTest, AWindowThatIsNotClosableIsNotClosed)
{
	TestWindow window(fHub, BRect(0, 0, 99, 99), B_NORMAL_WINDOW_FEEL, B_NOT_CLOSABLE);
	window.client.Codes();
	fHub.RequestClose(&window.stacked);
	EXPECT_EQ(window.client.Codes(), "");
}


TEST_F(InputHubTest, AnActivatedWindowThatAvoidsTheFrontStaysWhereItIs)
{
	TestWindow lower(fHub, BRect(0, 0, 99, 99), B_NORMAL_WINDOW_FEEL, B_AVOID_FRONT);
	TestWindow upper(fHub, BRect(0, 0, 99, 99));
	fHub.Activate(&lower.stacked);
	EXPECT_TRUE(fHub.IsFront(&upper.stacked));
	EXPECT_EQ(lower.client.Codes(), "active inactive active");
}


TEST_F(InputHubTest, AMenuNeverBecomesActive)
{
	TestWindow normal(fHub, BRect(0, 0, 99, 99));
	TestWindow menu(fHub, BRect(100, 0, 199, 99), B_NORMAL_WINDOW_FEEL, 0, true);
	Pointer(150, 50, 1);
	EXPECT_EQ(menu.client.Codes(), "move down");
	EXPECT_EQ(normal.client.Codes(), "active");
}


TEST_F(InputHubTest, AGrabTakesPressesFromEverywhere)
{
	TestWindow normal(fHub, BRect(0, 0, 99, 99));
	TestWindow menu(fHub, BRect(100, 0, 199, 99), B_NORMAL_WINDOW_FEEL, 0, true);
	fHub.SetGrab(&menu.stacked, true);
	Forget({&normal, &menu});
	Pointer(50, 50);
	Pointer(50, 50, 1);
	Pointer(50, 50);
	EXPECT_EQ(menu.client.Codes(), "move down up");
	EXPECT_EQ(normal.client.Codes(), "");
	fHub.SetGrab(&menu.stacked, false);
	Pointer(51, 50, 1);
	EXPECT_EQ(normal.client.Codes(), "move down");
}


TEST_F(InputHubTest, ADraggedMessageIsDroppedWhereTheButtonIsReleased)
{
	TestWindow source(fHub, BRect(0, 0, 99, 99));
	TestWindow target(fHub, BRect(100, 0, 199, 99));
	Pointer(50, 50, 1);
	BMessage dragged('drag');
	dragged.AddString("text", "carried");
	fHub.BeginDrag(dragged, BRect(40, 45, 60, 55), nullptr, BPoint(10, 5));
	Forget({&source, &target});
	Pointer(150, 60, 1);
	EXPECT_EQ(source.client.Codes(), "leave move");
	EXPECT_EQ(target.client.Codes(), "move");
	BMessage carried;
	ASSERT_EQ(target.client.Last().FindMessage("be:drag_message", &carried), B_OK);
	EXPECT_EQ(carried.what, static_cast<uint32>('drag'));
	EXPECT_EQ(carried.GetInt32("buttons", 0), 1);
	EXPECT_EQ(fHub.Overlay().dragged, BRect(140, 55, 160, 65));

	Pointer(150, 60, 0);
	ASSERT_EQ(target.client.Drops().size(), 1u);
	BMessage drop = target.client.Drops()[0];
	EXPECT_STREQ(drop.GetString("text", ""), "carried");
	EXPECT_EQ(drop.GetPoint("test:where", BPoint()), BPoint(150, 60));
	EXPECT_EQ(drop.GetPoint("test:offset", BPoint()), BPoint(10, 5));
	EXPECT_TRUE(source.client.Drops().empty());
	EXPECT_FALSE(fHub.Overlay().dragged.IsValid());
	Pointer(151, 60, 0);
	EXPECT_FALSE(target.client.Last().HasMessage("be:drag_message"));
}


TEST_F(InputHubTest, ADropOutsideOfAllWindowsIsSilent)
{
	TestWindow source(fHub, BRect(0, 0, 99, 99));
	Pointer(50, 50, 1);
	fHub.BeginDrag(BMessage('drag'), BRect(40, 45, 60, 55), nullptr, BPoint(10, 5));
	Pointer(500, 500, 0);
	EXPECT_TRUE(source.client.Drops().empty());
}


TEST_F(InputHubTest, EscapeEndsADragWithoutADrop)
{
	TestWindow source(fHub, BRect(0, 0, 99, 99));
	TestWindow target(fHub, BRect(100, 0, 199, 99));
	Pointer(50, 50, 1);
	fHub.BeginDrag(BMessage('drag'), BRect(40, 45, 60, 55), nullptr, BPoint(10, 5));
	Pointer(150, 60, 1);
	Forget({&source, &target});
	BPrivate::InjectedKey escape{BPrivate::KeyForName("escape"), "\x1b", 0};
	fHub.InjectKey(escape, true);
	EXPECT_FALSE(fHub.IsDragging());
	EXPECT_FALSE(fHub.Overlay().dragged.IsValid());
	// The one that it was over hears that it left, the one of the press that it is over; nobody of the key.
	EXPECT_EQ(target.client.Codes(), "leave");
	EXPECT_EQ(source.client.Codes(), "move");
	EXPECT_FALSE(source.client.Last().HasMessage("be:drag_message"));

	Pointer(150, 60, 0);
	EXPECT_TRUE(target.client.Drops().empty());
	EXPECT_TRUE(source.client.Drops().empty());
}


TEST_F(InputHubTest, ADragOntoABlockedWindowIsSilent)
{
	TestWindow blocked(fHub, BRect(0, 0, 99, 99));
	TestWindow modal(fHub, BRect(100, 0, 199, 99), B_MODAL_APP_WINDOW_FEEL);
	Pointer(150, 50, 1);
	fHub.BeginDrag(BMessage('drag'), BRect(140, 45, 160, 55), nullptr, BPoint(10, 5));
	Forget({&blocked, &modal});
	Pointer(50, 50, 1);
	Pointer(50, 50, 0);
	EXPECT_EQ(blocked.client.Codes(), "");
	EXPECT_TRUE(blocked.client.Drops().empty());
}


TEST_F(InputHubTest, WhatAnotherProgramDragsIsInTheMovesAndThenDropped)
{
	TestWindow window(fHub, BRect(0, 0, 99, 99));
	TestWindow other(fHub, BRect(100, 0, 199, 99));
	Forget({&window, &other});
	auto visitor = [] {
		auto message = std::make_unique<BMessage>(B_SIMPLE_DATA);
		message->AddString("text", "foreign");
		return message;
	};
	EXPECT_TRUE(fHub.VisitorAt(&window.stacked, visitor(), BPoint(10, 20)));
	BMessage dragged;
	ASSERT_EQ(window.client.Last().FindMessage("be:drag_message", &dragged), B_OK);
	EXPECT_STREQ(dragged.GetString("text", ""), "foreign");
	EXPECT_TRUE(fHub.VisitorAt(&other.stacked, nullptr, BPoint(110, 20)));
	EXPECT_EQ(window.client.Codes(), "move leave");
	EXPECT_TRUE(other.client.Last().HasMessage("be:drag_message"));
	fHub.VisitorLeft();
	EXPECT_EQ(other.client.Codes(), "move leave");

	EXPECT_TRUE(fHub.VisitorAt(&window.stacked, visitor(), BPoint(10, 20)));
	auto dropped = visitor();
	dropped->AddPoint("be:drag_offset", BPoint(3, 4));
	fHub.Drop(std::move(dropped), BPoint(11, 21), &window.stacked);
	ASSERT_EQ(window.client.Drops().size(), 1u);
	BMessage drop = window.client.Drops()[0];
	EXPECT_EQ(drop.GetPoint("test:where", BPoint()), BPoint(11, 21));
	EXPECT_EQ(drop.GetPoint("test:offset", BPoint()), BPoint(3, 4));
	EXPECT_FALSE(drop.HasPoint("be:drag_offset"));
	Pointer(12, 21);
	EXPECT_FALSE(window.client.Last().HasMessage("be:drag_message"));
}


TEST_F(InputHubTest, ABlockedWindowRefusesWhatAnotherProgramDrags)
{
	TestWindow blocked(fHub, BRect(0, 0, 99, 99));
	TestWindow modal(fHub, BRect(100, 0, 199, 99), B_MODAL_APP_WINDOW_FEEL);
	Forget({&blocked, &modal});
	auto message = std::make_unique<BMessage>(B_SIMPLE_DATA);
	EXPECT_FALSE(fHub.VisitorAt(&blocked.stacked, std::move(message), BPoint(10, 20)));
	fHub.Drop(std::make_unique<BMessage>(B_SIMPLE_DATA), BPoint(10, 20), &blocked.stacked);
	EXPECT_EQ(blocked.client.Codes(), "");
	EXPECT_TRUE(blocked.client.Drops().empty());
}


TEST_F(InputHubTest, TheTrackedRectFollowsThePointerUntilTheRelease)
{
	TestWindow window(fHub, BRect(0, 0, 199, 199));
	Pointer(50, 50, 1);
	fHub.BeginTracking(BRect(40, 40, 60, 60), B_TRACK_WHOLE_RECT, BPoint(50, 50));
	Pointer(60, 70, 1);
	EXPECT_EQ(fHub.Overlay().tracking, BRect(50, 60, 70, 80));
	fHub.EndTracking();
	EXPECT_FALSE(fHub.Overlay().tracking.IsValid());

	fHub.BeginTracking(BRect(40, 40, 60, 60), B_TRACK_RECT_CORNER, BPoint(60, 70));
	Pointer(65, 80, 1);
	EXPECT_EQ(fHub.Overlay().tracking, BRect(40, 40, 65, 70));
	Pointer(65, 80, 0);
	EXPECT_FALSE(fHub.Overlay().tracking.IsValid());
}


TEST_F(InputHubTest, TheTrackedRectKnowsOfMovesThatCameBeforeItBegan)
{
	TestWindow window(fHub, BRect(0, 0, 199, 199));
	Pointer(50, 50, 1);
	Pointer(60, 70, 1);
	fHub.BeginTracking(BRect(50, 50, 50, 50), B_TRACK_RECT_CORNER, BPoint(50, 50));
	EXPECT_EQ(fHub.Overlay().tracking, BRect(50, 50, 60, 70));
}


TEST_F(InputHubTest, AWindowThatGoesInTheMiddleOfAPressIsForgotten)
{
	auto window = std::make_unique<TestWindow>(fHub, BRect(0, 0, 99, 99));
	TestWindow other(fHub, BRect(100, 0, 199, 99));
	Pointer(50, 50, 1);
	window.reset();
	Forget({&other});
	Pointer(150, 50, 1);
	EXPECT_EQ(other.client.Codes(), "");
	Pointer(150, 50, 0);
	EXPECT_EQ(other.client.Codes(), "move");
	BPoint where;
	uint32 buttons;
	fHub.GetPointer(&where, &buttons);
	EXPECT_EQ(where, BPoint(150, 50));
	EXPECT_EQ(buttons, 0u);
}


TEST_F(InputHubTest, TheWheelTurnsForTheWindowUnderThePointer)
{
	TestWindow window(fHub, BRect(0, 0, 99, 99));
	Pointer(50, 50);
	fHub.Wheel(0.5f, -2, std::nullopt);
	BMessage wheel = window.client.Last();
	EXPECT_EQ(wheel.what, B_MOUSE_WHEEL_CHANGED);
	EXPECT_EQ(wheel.GetFloat("be:wheel_delta_x", 0), 0.5f);
	EXPECT_EQ(wheel.GetFloat("be:wheel_delta_y", 0), -2.0f);
}


// #pragma mark - keys


TEST_F(InputHubTest, AKeyCarriesItsFields)
{
	TestWindow window(fHub, BRect(0, 0, 99, 99));
	fHub.InjectKey({BPrivate::kRawLeftShift, "", B_SHIFT_KEY}, true);
	fHub.InjectKey({0x3c, "A", B_SHIFT_KEY}, true);
	BMessage key = window.client.Last();
	EXPECT_EQ(key.what, B_KEY_DOWN);
	EXPECT_EQ(key.GetInt32("key", 0), 0x3c);
	EXPECT_EQ(key.GetInt32("raw_char", 0), 'a');
	EXPECT_EQ(key.GetInt8("byte", 0), 'A');
	EXPECT_STREQ(key.GetString("bytes", ""), "A");
	EXPECT_EQ(key.GetInt32("modifiers", 0), B_SHIFT_KEY | B_LEFT_SHIFT_KEY);
	EXPECT_FALSE(key.HasInt32("be:key_repeat"));
	const void* states;
	ssize_t size;
	ASSERT_EQ(key.FindData("states", B_UINT8_TYPE, &states, &size), B_OK);
	ASSERT_EQ(size, 16);
	EXPECT_EQ(static_cast<const uint8*>(states)[0x3c >> 3], 0x80 >> (0x3c & 7));
	EXPECT_EQ(window.client.Codes(), "active modifiers unmapped key");
}


TEST_F(InputHubTest, ACharacterOfSeveralBytesHasThemAll)
{
	TestWindow window(fHub, BRect(0, 0, 99, 99));
	fHub.InjectKey({0, "\xc3\xa4", 0}, true);
	BMessage key = window.client.Last();
	EXPECT_STREQ(key.GetString("bytes", ""), "\xc3\xa4");
	EXPECT_EQ(key.GetInt8("byte", 0, 0), static_cast<int8>(0xc3));
	EXPECT_EQ(key.GetInt8("byte", 1, 0), static_cast<int8>(0xa4));
}


TEST_F(InputHubTest, ModifiersLastUntilTheirKeyIsReleased)
{
	TestWindow window(fHub, BRect(0, 0, 99, 99));
	fHub.InjectKey({BPrivate::kRawLeftCommand, "", B_COMMAND_KEY}, true);
	key_info keys;
	fHub.GetKeys(&keys);
	EXPECT_EQ(keys.modifiers, static_cast<uint32>(B_COMMAND_KEY | B_LEFT_COMMAND_KEY));
	Pointer(10, 10, 1);
	EXPECT_EQ(window.client.Last().GetInt32("modifiers", 0), B_COMMAND_KEY | B_LEFT_COMMAND_KEY);
	fHub.InjectKey({BPrivate::kRawLeftCommand, "", 0}, false);
	fHub.GetKeys(&keys);
	EXPECT_EQ(keys.modifiers, 0u);
	EXPECT_EQ(keys.key_states[BPrivate::kRawLeftCommand >> 3], 0);
}


TEST_F(InputHubTest, KeysGoToTheActiveWindowAndNotPastAModalOne)
{
	TestWindow normal(fHub, BRect(0, 0, 99, 99));
	TestWindow modal(fHub, BRect(100, 0, 199, 99), B_MODAL_APP_WINDOW_FEEL);
	Forget({&normal, &modal});
	fHub.InjectKey({0x3c, "a", 0}, true);
	EXPECT_EQ(modal.client.Codes(), "key");
	EXPECT_EQ(normal.client.Codes(), "");
}


// #pragma mark - the key map


TEST(KeyMapTest, EveryAsciiCharacterIsOnAKeyThatGivesIt)
{
	for (char character = ' '; character < 0x7f; character++) {
		bool needsShift;
		int32 rawKey = BPrivate::KeyForChar(character, &needsShift);
		ASSERT_NE(rawKey, 0) << character;
		char byte;
		ASSERT_EQ(BPrivate::BytesForKey(rawKey, needsShift ? B_SHIFT_KEY : 0, &byte), 1);
		EXPECT_EQ(byte, character);
	}
}


TEST(KeyMapTest, NamesGiveTheirRawCodes)
{
	struct {
		const char* name;
		int32 rawKey;
	} cases[] = {{"enter", 0x47}, {"Escape", 0x01}, {"tab", 0x26}, {"left", 0x61}, {"up", 0x57},
		{"f1", 0x02}, {"F12", 0x0d}, {"a", 0x3c}, {"delete", 0x34}, {"page-down", 0x36}, {"f13", 0},
		{"f0", 0}, {"nothing", 0}, {"", 0}};
	for (const auto& one : cases)
		EXPECT_EQ(BPrivate::KeyForName(one.name), one.rawKey) << one.name;
}


TEST(KeyMapTest, ControlCapsAndNumLockChangeTheByte)
{
	char byte;
	EXPECT_EQ(BPrivate::BytesForKey(0x4e, B_CONTROL_KEY, &byte), 1);
	EXPECT_EQ(byte, 3);
	EXPECT_EQ(BPrivate::BytesForKey(0x3c, B_CAPS_LOCK, &byte), 1);
	EXPECT_EQ(byte, 'A');
	EXPECT_EQ(BPrivate::BytesForKey(0x3c, B_CAPS_LOCK | B_SHIFT_KEY, &byte), 1);
	EXPECT_EQ(byte, 'a');
	EXPECT_EQ(BPrivate::BytesForKey(0x12, B_CAPS_LOCK, &byte), 1);
	EXPECT_EQ(byte, '1');
	EXPECT_EQ(BPrivate::BytesForKey(0x37, 0, &byte), 1);
	EXPECT_EQ(byte, B_HOME);
	EXPECT_EQ(BPrivate::BytesForKey(0x37, B_NUM_LOCK, &byte), 1);
	EXPECT_EQ(byte, '7');
	EXPECT_EQ(BPrivate::BytesForKey(BPrivate::kRawLeftShift, 0, &byte), 0);
}


TEST(KeyMapTest, TheControlKeyOfTheKeyboardIsCommand)
{
	// 29 and 97 are the left and right Control key, 56 and 125 Alt and the logo key.
	EXPECT_EQ(BPrivate::KeyForEventCode(29), BPrivate::kRawLeftCommand);
	EXPECT_EQ(BPrivate::KeyForEventCode(97), BPrivate::kRawRightCommand);
	EXPECT_EQ(BPrivate::KeyForEventCode(56), BPrivate::kRawLeftControl);
	EXPECT_EQ(BPrivate::KeyForEventCode(125), BPrivate::kRawLeftOption);
	EXPECT_EQ(BPrivate::KeyForEventCode(30), 0x3c);
	EXPECT_EQ(BPrivate::KeyForEventCode(5000), 0);
}

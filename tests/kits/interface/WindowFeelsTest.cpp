// SPDX-License-Identifier: MIT
// Tests of windows among each other: which is above, which has the keyboard, and which blocks which.
#include <Window.h>

#include <algorithm>

#include "InterfaceFixture.h"
#include "display/Display.h"
#include "support/Printers.h"

using BPrivate::Display;
using BPrivate::InjectedKey;

namespace {

/// Notes the presses, releases, wheels and keys that reach it.
class FeltView : public BView {
public:
	explicit FeltView(BRect frame)
		: BView(frame, "felt", B_FOLLOW_ALL, B_NAVIGABLE)
	{
	}

	void AttachedToWindow() override { MakeFocus(); }
	void MouseDown(BPoint) override
	{
		if (keyboardOptions >= 0)
			SetMouseEventMask(B_POINTER_EVENTS | B_KEYBOARD_EVENTS, keyboardOptions);
		log.push_back("down");
	}
	void MouseUp(BPoint) override { log.push_back("up"); }
	void KeyDown(const char* bytes, int32) override { log.push_back(bytes); }
	void MessageReceived(BMessage* message) override
	{
		if (message->what == B_MOUSE_WHEEL_CHANGED)
			log.push_back("wheel");
		else if (message->WasDropped())
			log.push_back(message->SendReply('answ') == B_OK ? "answered" : "dropped");
		else
			BView::MessageReceived(message);
	}

	Log log;
	/// Options of a mask for the keyboard while the button is held; less than 0: none.
	int32 keyboardOptions = -1;
};


/// A window full of one such view; it quits with the object.
class FeltWindow {
public:
	FeltWindow(BRect frame, window_feel feel = B_NORMAL_WINDOW_FEEL, uint32 flags = 0)
		: window(new BWindow(
			frame, "felt", B_TITLED_WINDOW_LOOK, feel, flags | B_WILL_ACCEPT_FIRST_CLICK)),
		  view(new FeltView(window->Bounds())),
		  fMessenger(window)
	{
		window->AddChild(view);
	}

	~FeltWindow()
	{
		if (fMessenger.LockTarget())
			window->Quit();
	}

	FeltWindow& Show()
	{
		window->Show();
		Settle(window);
		return *this;
	}

	Log Take()
	{
		Settle(window);
		window->Lock();
		Log taken;
		taken.swap(view->log);
		window->Unlock();
		return taken;
	}

	template <typename Call>
	void Locked(Call call)
	{
		ASSERT_TRUE(window->Lock());
		call();
		window->Unlock();
		Settle(window);
	}

	bool IsActive()
	{
		Settle(window);
		return window->IsActive();
	}

	BWindow* window;
	FeltView* view;

private:
	const BMessenger fMessenger;
};


const Log kClick = {"down", "up"};

// Two windows' places, and one that covers a part of the first.
const BRect kLeft(100, 100, 199, 199);
const BRect kRight(300, 100, 399, 199);
const BRect kOnLeft(120, 120, 179, 179);
const BPoint kInLeft(110, 110);
const BPoint kInRight(350, 150);
const BPoint kInOverlap(150, 150);


class WindowFeelsTest : public InterfaceTest {
protected:
	~WindowFeelsTest() override { Display::Get().InjectPointer(BPoint(700, 500), 0); }

	void Click(BPoint where)
	{
		Display::Get().InjectPointer(where, 0);
		Display::Get().InjectPointer(where, B_PRIMARY_MOUSE_BUTTON);
		Display::Get().InjectPointer(where, 0);
	}

	void Key(const char* bytes)
	{
		InjectedKey key{0x3c, bytes, 0};
		Display::Get().InjectKey(key, true);
		Display::Get().InjectKey(key, false);
	}
};

} // namespace


TEST_F(WindowFeelsTest, WhatAModalWindowBlocksGetsNoInputAndGoesOn)
{
	for (window_feel feel : {B_MODAL_APP_WINDOW_FEEL, B_MODAL_ALL_WINDOW_FEEL}) {
		FeltWindow blocked(kLeft);
		FeltWindow modal(kRight, feel);
		blocked.Show();
		modal.Show();
		EXPECT_TRUE(modal.IsActive());
		EXPECT_TRUE(modal.window->IsModal());

		Click(kInLeft);
		Display::Get().InjectWheel(0, 1);
		Key("x");
		EXPECT_EQ(blocked.Take(), Log());
		EXPECT_EQ(modal.Take(), Log{"x"});
		EXPECT_FALSE(blocked.IsActive());
		blocked.Locked([&] { blocked.window->Activate(); });
		EXPECT_TRUE(modal.IsActive());

		// Its thread handles what the program itself does.
		blocked.Locked([&] { blocked.window->ResizeTo(120, 130); });
		EXPECT_EQ(blocked.window->Bounds(), BRect(0, 0, 120, 130));

		modal.Locked([&] { modal.window->Hide(); });
		EXPECT_TRUE(blocked.IsActive());
		Click(kInLeft);
		Key("y");
		EXPECT_EQ(blocked.Take(), (Log{"down", "up", "y"}));
	}
}


TEST_F(WindowFeelsTest, AModalWindowOfASubsetBlocksThatOnly)
{
	FeltWindow member(kLeft);
	FeltWindow other(kRight);
	FeltWindow modal(BRect(500, 100, 599, 199), B_MODAL_SUBSET_WINDOW_FEEL);
	EXPECT_EQ(modal.window->AddToSubset(member.window), B_OK);
	member.Show();
	other.Show();
	modal.Show();
	Click(kInLeft);
	EXPECT_EQ(member.Take(), Log());
	Click(kInRight);
	EXPECT_EQ(other.Take(), kClick);
	EXPECT_TRUE(other.IsActive());

	modal.Locked([&] { EXPECT_EQ(modal.window->RemoveFromSubset(member.window), B_OK); });
	Click(kInLeft);
	EXPECT_EQ(member.Take(), kClick);
}


TEST_F(WindowFeelsTest, OnlyNormalWindowsJoinTheSubsetOfASubsetFeel)
{
	FeltWindow normal(kLeft);
	FeltWindow modal(kRight, B_MODAL_SUBSET_WINDOW_FEEL);
	FeltWindow floating(kRight, B_FLOATING_SUBSET_WINDOW_FEEL);
	EXPECT_EQ(modal.window->AddToSubset(nullptr), B_BAD_VALUE);
	EXPECT_EQ(modal.window->AddToSubset(modal.window), B_BAD_VALUE);
	EXPECT_EQ(modal.window->AddToSubset(floating.window), B_BAD_VALUE);
	EXPECT_EQ(normal.window->AddToSubset(normal.window), B_BAD_VALUE);
	EXPECT_EQ(modal.window->RemoveFromSubset(nullptr), B_BAD_VALUE);
	EXPECT_EQ(modal.window->AddToSubset(normal.window), B_OK);
	EXPECT_EQ(floating.window->AddToSubset(normal.window), B_OK);
	{
		// Of a window that goes nothing is left.
		FeltWindow leaving(kLeft);
		EXPECT_EQ(modal.window->AddToSubset(leaving.window), B_OK);
	}
	modal.Show();
	Click(kInRight);
	EXPECT_EQ(modal.Take(), kClick);
}


TEST_F(WindowFeelsTest, FloatingWindowsStayAboveAndLeaveTheKeyboard)
{
	for (window_feel feel : {B_FLOATING_APP_WINDOW_FEEL, B_FLOATING_ALL_WINDOW_FEEL}) {
		FeltWindow normal(kLeft);
		FeltWindow floating(kOnLeft, feel);
		normal.Show();
		floating.Show();
		EXPECT_TRUE(normal.IsActive());
		EXPECT_TRUE(floating.window->IsFloating());
		Click(kInLeft);
		normal.Take();
		Click(kInOverlap);
		EXPECT_EQ(normal.Take(), Log());
		EXPECT_EQ(floating.Take(), kClick);
	}
}


TEST_F(WindowFeelsTest, AFloatingWindowOfASubsetStaysAboveThatOnly)
{
	FeltWindow member(kLeft);
	FeltWindow other(kLeft);
	FeltWindow floating(kOnLeft, B_FLOATING_SUBSET_WINDOW_FEEL);
	floating.window->AddToSubset(member.window);
	member.Show();
	floating.Show();
	other.Show();
	Click(kInOverlap);
	EXPECT_EQ(other.Take(), kClick);
	member.Locked([&] { member.window->Activate(); });
	Click(kInOverlap);
	EXPECT_EQ(floating.Take(), kClick);
	EXPECT_EQ(other.Take(), Log());
}


TEST_F(WindowFeelsTest, TheFeelMayChangeAtAnyTime)
{
	FeltWindow normal(kLeft);
	FeltWindow upper(kOnLeft);
	normal.Show();
	upper.Show();
	Click(kInLeft);
	Click(kInOverlap);
	EXPECT_EQ(normal.Take(), (Log{"down", "up", "down", "up"}));
	upper.Locked([&] { EXPECT_EQ(upper.window->SetFeel(B_FLOATING_APP_WINDOW_FEEL), B_OK); });
	Click(kInOverlap);
	EXPECT_EQ(upper.Take(), kClick);
	upper.Locked([&] { upper.window->SetFeel(B_MODAL_APP_WINDOW_FEEL); });
	Click(kInLeft);
	EXPECT_EQ(normal.Take(), Log());
	upper.Locked([&] { upper.window->SetFeel(B_NORMAL_WINDOW_FEEL); });
	Click(kInLeft);
	EXPECT_EQ(normal.Take(), kClick);
}


TEST_F(WindowFeelsTest, AWindowThatAvoidsTheFocusTakesClicksAndNoKeys)
{
	FeltWindow normal(kLeft);
	FeltWindow avoiding(kRight, B_NORMAL_WINDOW_FEEL, B_AVOID_FOCUS);
	normal.Show();
	avoiding.Show();
	EXPECT_TRUE(normal.IsActive());
	Click(kInRight);
	Key("x");
	EXPECT_EQ(avoiding.Take(), kClick);
	EXPECT_EQ(normal.Take(), Log{"x"});
	avoiding.Locked([&] { avoiding.window->Activate(); });
	EXPECT_FALSE(avoiding.IsActive());
	// The flag may go at any time.
	avoiding.Locked([&] {
		avoiding.window->SetFlags(avoiding.window->Flags() & ~B_AVOID_FOCUS);
		avoiding.window->Activate();
	});
	EXPECT_TRUE(avoiding.IsActive());
}


TEST_F(WindowFeelsTest, AWindowThatAvoidsTheFrontBecomesActiveWhereItIs)
{
	FeltWindow avoiding(kLeft, B_NORMAL_WINDOW_FEEL, B_AVOID_FRONT);
	FeltWindow upper(kOnLeft);
	avoiding.Show();
	upper.Show();
	Click(kInLeft);
	EXPECT_EQ(avoiding.Take(), kClick);
	EXPECT_TRUE(avoiding.IsActive());
	EXPECT_FALSE(avoiding.window->IsFront());
	Click(kInOverlap);
	EXPECT_EQ(upper.Take(), kClick);
}


TEST_F(WindowFeelsTest, AWindowMayBeSentBehindAnotherOrAll)
{
	FeltWindow lowest(kLeft);
	FeltWindow middle(kLeft);
	FeltWindow top(kLeft);
	lowest.Show();
	middle.Show();
	top.Show();
	EXPECT_TRUE(top.window->IsFront());
	top.Locked([&] { EXPECT_EQ(top.window->SendBehind(middle.window), B_OK); });
	EXPECT_TRUE(middle.window->IsFront());
	middle.Locked([&] { EXPECT_EQ(middle.window->SendBehind(nullptr), B_OK); });
	EXPECT_TRUE(top.window->IsFront());
	top.Locked([&] {
		top.window->SendBehind(nullptr);
		EXPECT_EQ(top.window->SendBehind(top.window), B_BAD_VALUE);
	});
	EXPECT_TRUE(lowest.window->IsFront());
	Click(kInOverlap);
	EXPECT_EQ(lowest.Take(), kClick);
}


TEST_F(WindowFeelsTest, AMinimizedWindowIsBackWhenItIsActivated)
{
	FeltWindow lower(kLeft);
	FeltWindow upper(kLeft);
	lower.Show();
	upper.Show();
	upper.Locked([&] { upper.window->Minimize(true); });
	EXPECT_TRUE(upper.window->IsMinimized());
	EXPECT_FALSE(upper.window->IsHidden());
	EXPECT_TRUE(lower.IsActive());
	Click(kInOverlap);
	EXPECT_EQ(lower.Take(), kClick);
	EXPECT_EQ(upper.Take(), Log());

	upper.Locked([&] { upper.window->Activate(); });
	EXPECT_FALSE(upper.window->IsMinimized());
	EXPECT_TRUE(upper.IsActive());
	Click(kInOverlap);
	EXPECT_EQ(upper.Take(), kClick);
}


TEST_F(WindowFeelsTest, AHiddenWindowIsNotActivated)
{
	FeltWindow shown(kLeft);
	FeltWindow hidden(kRight);
	shown.Show();
	hidden.Show();
	hidden.Locked([&] {
		hidden.window->Hide();
		hidden.window->Activate();
	});
	EXPECT_FALSE(hidden.IsActive());
	EXPECT_TRUE(shown.IsActive());
	Click(kInRight);
	EXPECT_EQ(hidden.Take(), Log());
}


TEST_F(WindowFeelsTest, AViewMayHaveTheKeyboardWhileAButtonIsHeld)
{
	FeltWindow window(kLeft);
	auto* focus = new FeltView(BRect(50, 50, 99, 99));
	window.view->AddChild(focus);
	window.Show();
	auto taken = [&] {
		Log log;
		window.Locked([&] { log.swap(focus->log); });
		return log;
	};
	auto press = [&](int32 options) {
		window.Locked([&] { window.view->keyboardOptions = options; });
		Display::Get().InjectPointer(kInLeft, B_PRIMARY_MOUSE_BUTTON);
		Settle(window.window);
		Key("x");
		Settle(window.window);
		Display::Get().InjectPointer(kInLeft, 0);
		Key("y");
	};

	press(-1);
	EXPECT_EQ(window.Take(), kClick);
	EXPECT_EQ(taken(), (Log{"x", "y"}));
	press(0);
	EXPECT_EQ(window.Take(), (Log{"down", "x", "up"}));
	EXPECT_EQ(taken(), (Log{"x", "y"}));
	press(B_SUSPEND_VIEW_FOCUS);
	EXPECT_EQ(window.Take(), (Log{"down", "x", "up"}));
	EXPECT_EQ(taken(), Log{"y"});
}


// The message was given away: it is dropped, and the answer finds nobody.
TEST_F(WindowFeelsTest, AWindowMayGoInTheMiddleOfItsDrag)
{
	FeltWindow other(kRight);
	other.Show();
	{
		FeltWindow source(kLeft);
		source.Show();
		Display::Get().InjectPointer(kInLeft, B_PRIMARY_MOUSE_BUTTON);
		source.Locked([&] {
			BMessage message('drag');
			source.view->DragMessage(&message, BRect(0, 0, 20, 20));
		});
		Display::Get().InjectPointer(kInOverlap, B_PRIMARY_MOUSE_BUTTON);
	}
	Display::Get().InjectPointer(kInRight, B_PRIMARY_MOUSE_BUTTON);
	Display::Get().InjectPointer(kInRight, 0);
	Log log = other.Take();
	EXPECT_EQ(std::count(log.begin(), log.end(), "dropped"), 1);
	Click(kInRight);
	log = other.Take();
	EXPECT_EQ(std::count(log.begin(), log.end(), "down"), 1);
}

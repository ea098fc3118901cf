// SPDX-License-Identifier: MIT
// A window of a program as its user sees it: drawn, clicked, drawn again.
#include <View.h>

#include <Bitmap.h>
#include <OS.h>
#include <Screen.h>
#include <Window.h>

#include "InterfaceFixture.h"
#include "display/Display.h"
#include "support/Printers.h"

using BPrivate::Display;

namespace {

const rgb_color kRed = {255, 0, 0, 255};
const rgb_color kBlue = {0, 0, 255, 255};


class ClickedView : public BView {
public:
	ClickedView()
		: BView(BRect(0, 0, 200, 100), "clicked", B_FOLLOW_ALL, B_WILL_DRAW)
	{
	}

	void Draw(BRect) override
	{
		SetHighColor(fClicked ? kRed : kBlue);
		FillRect(Bounds());
	}

	void MouseDown(BPoint) override
	{
		fClicked = true;
		Invalidate();
	}

private:
	bool fClicked = false;
};


class OnScreenTest : public InterfaceTest {
protected:
	rgb_color ColorAt(BPoint where)
	{
		BBitmap* bitmap = nullptr;
		BRect frame(where, where);
		if (BScreen().GetBitmap(&bitmap, false, &frame) != B_OK)
			return B_TRANSPARENT_COLOR;
		const uint8* pixel = static_cast<const uint8*>(bitmap->Bits());
		rgb_color color = {pixel[2], pixel[1], pixel[0], 255};
		delete bitmap;
		return color;
	}

	// The colour there, once it is the expected one or five seconds have passed.
	rgb_color AwaitColor(BPoint where, rgb_color expected)
	{
		rgb_color color = ColorAt(where);
		for (int i = 0; i < 500 && color != expected; i++) {
			snooze(10000);
			color = ColorAt(where);
		}
		return color;
	}
};

} // namespace


TEST_F(OnScreenTest, AClickChangesWhatIsShown)
{
	BWindow* window = MakeWindow(B_WILL_ACCEPT_FIRST_CLICK);
	window->AddChild(new ClickedView);
	window->Show();
	EXPECT_EQ(AwaitColor(BPoint(200, 150), kBlue), kBlue);

	Display::Get().InjectPointer(BPoint(200, 150), B_PRIMARY_MOUSE_BUTTON);
	Display::Get().InjectPointer(BPoint(200, 150), 0);
	EXPECT_EQ(AwaitColor(BPoint(200, 150), kRed), kRed);

	window->ResizeTo(300, 150);
	EXPECT_EQ(AwaitColor(BPoint(390, 240), kRed), kRed);
	Quit(window);
}


TEST_F(OnScreenTest, WhatIsDrawnFromAnotherThreadAppears)
{
	BWindow* window = MakeWindow();
	BView* view = new BView(window->Bounds(), "view", B_FOLLOW_ALL, B_WILL_DRAW);
	view->SetViewColor(kBlue);
	window->AddChild(view);
	window->Show();
	EXPECT_EQ(AwaitColor(BPoint(200, 150), kBlue), kBlue);

	window->Lock();
	view->SetHighColor(kRed);
	view->FillRect(BRect(90, 40, 110, 60));
	window->Unlock();
	EXPECT_EQ(AwaitColor(BPoint(200, 150), kRed), kRed);
	EXPECT_EQ(ColorAt(BPoint(120, 110)), kBlue);
	Quit(window);
}


TEST_F(OnScreenTest, WhatIsDrawnInATransactionAppearsAtItsEnd)
{
	BWindow* window = MakeWindow();
	BView* view = new BView(window->Bounds(), "view", B_FOLLOW_ALL, B_WILL_DRAW);
	view->SetViewColor(kBlue);
	window->AddChild(view);
	window->Show();
	EXPECT_EQ(AwaitColor(BPoint(200, 150), kBlue), kBlue);

	window->Lock();
	window->BeginViewTransaction();
	window->BeginViewTransaction();
	EXPECT_TRUE(window->InViewTransaction());
	view->SetHighColor(kRed);
	view->FillRect(BRect(90, 40, 110, 60));
	view->Sync();
	window->EndViewTransaction();
	window->Sync();
	EXPECT_EQ(ColorAt(BPoint(200, 150)), kBlue);
	window->EndViewTransaction();
	EXPECT_FALSE(window->InViewTransaction());
	// One end too many counts for nothing.
	window->EndViewTransaction();
	EXPECT_FALSE(window->InViewTransaction());
	window->Sync();
	EXPECT_EQ(ColorAt(BPoint(200, 150)), kRed);
	window->Unlock();
	Quit(window);
}

// SPDX-License-Identifier: MIT
// Tests of the user's input from the display on: activation, keys, polling, dragging and dropping.
#include <View.h>

#include <Bitmap.h>
#include <OS.h>
#include <Window.h>

#include "InterfaceFixture.h"
#include "display/Display.h"
#include "display/Robot.h"
#include "support/Printers.h"

using BPrivate::Display;
using BPrivate::InjectedKey;

namespace {

const uint32 kMsgDragged = 'drag';
const uint32 kMsgAnswer = 'answ';


class HostView : public BView {
public:
	HostView(const char* name, Log* log)
		: BView(BRect(0, 0, 99, 99), name, B_FOLLOW_ALL, B_NAVIGABLE),
		  fLog(log)
	{
	}

	void MouseDown(BPoint where) override
	{
		Add("down");
		if (drags) {
			BMessage message(kMsgDragged);
			message.AddString("text", "dragged");
			DragMessage(&message, BRect(where.x - 5, where.y - 6, where.x + 10, where.y + 10));
		}
		if (dragsImage) {
			BMessage message(kMsgDragged);
			DragMessage(&message, new BBitmap(BRect(0, 0, 9, 9), B_RGBA32), BPoint(2, 3));
		}
		if (tracks) {
			BeginRectTracking(BRect(where, where + BPoint(20, 20)), B_TRACK_RECT_CORNER);
			uint32 buttons;
			do {
				snooze(5000);
				GetMouse(&where, &buttons);
			} while (buttons != 0);
			EndRectTracking();
			tracked = where;
			Add("tracked");
		}
	}

	void MouseUp(BPoint) override { Add("up"); }

	void MouseMoved(BPoint, uint32 transit, const BMessage* dragMessage) override
	{
		if (dragMessage != nullptr && transit == B_ENTERED_VIEW) {
			EXPECT_EQ(dragMessage->what, kMsgDragged);
			EXPECT_TRUE(dragMessage->HasInt32("buttons"));
			// Only what was dragged: how the answer finds back is no business of the view.
			EXPECT_EQ(dragMessage->CountNames(B_MESSENGER_TYPE), 0);
			Add("drag entered");
		}
	}

	void KeyDown(const char* bytes, int32 numBytes) override
	{
		keys.append(bytes, numBytes);
		heldModifiers = modifiers();
	}

	void MessageReceived(BMessage* message) override
	{
		if (message->what == kMsgDragged || message->what == B_SIMPLE_DATA) {
			EXPECT_TRUE(message->WasDropped());
			dropPoint = message->DropPoint(&dropOffset);
			Add("dropped");
			message->SendReply(kMsgAnswer);
		} else if (message->what == kMsgAnswer)
			Add("answered");
		else
			BView::MessageReceived(message);
	}

	bool drags = false, dragsImage = false, tracks = false;
	BPoint tracked, dropPoint, dropOffset;
	std::string keys;
	uint32 heldModifiers = 0;

private:
	void Add(const char* what) { fLog->push_back(std::string(Name()) + " " + what); }

	Log* fLog;
};


// Two windows side by side, each full of one view; the right one is active.
class HostInputTest : public InterfaceTest {
protected:
	void SetUp() override
	{
		fLeft = new HostView("left", &fLeftLog);
		fRight = new HostView("right", &fRightLog);
		fLeftWindow = MakeShown(BRect(100, 100, 199, 199), fLeft);
		fRightWindow = MakeShown(BRect(300, 100, 399, 199), fRight);
	}

	void TearDown() override
	{
		Display::Get().InjectPointer(BPoint(700, 500), 0);
		Quit(fLeftWindow);
		Quit(fRightWindow);
	}

	BWindow* MakeShown(BRect frame, BView* view)
	{
		auto* window = new BWindow(frame, "window", B_TITLED_WINDOW, 0);
		window->AddChild(view);
		window->Show();
		Settle(window);
		return window;
	}

	void Point(float x, float y, uint32 buttons = 0)
	{
		Display::Get().InjectPointer(BPoint(x, y), buttons);
	}

	Log Take(BWindow* window, Log& from)
	{
		Settle(window);
		window->Lock();
		Log log;
		log.swap(from);
		window->Unlock();
		return log;
	}
	Log TakeLeft() { return Take(fLeftWindow, fLeftLog); }
	Log TakeRight() { return Take(fRightWindow, fRightLog); }

	BWindow* fLeftWindow;
	BWindow* fRightWindow;
	HostView* fLeft;
	HostView* fRight;
	Log fLeftLog, fRightLog;
};

} // namespace


// The windows may be driven by a hand of the host, while a robot waits for what that brings about.
TEST_F(HostInputTest, ARobotThatOnlyWaitsLeavesThePointerAlone)
{
	Point(340, 150, B_PRIMARY_MOUSE_BUTTON);
	EXPECT_TRUE(BPrivate::Robot().Settle());

	BPoint where;
	uint32 buttons;
	Display::Get().GetPointer(&where, &buttons);
	EXPECT_EQ(where, BPoint(340, 150));
	EXPECT_EQ(buttons, uint32(B_PRIMARY_MOUSE_BUTTON));
	EXPECT_EQ(TakeRight(), Log({"right down"}));

	Point(340, 150);
	EXPECT_EQ(TakeRight(), Log({"right up"}));
}


TEST_F(HostInputTest, AClickInAnInactiveWindowOnlyActivatesIt)
{
	EXPECT_TRUE(fRightWindow->IsActive());
	Point(150, 150, 1);
	Point(150, 150, 0);
	EXPECT_EQ(TakeLeft(), (Log{"left up"}));
	EXPECT_TRUE(fLeftWindow->IsActive());
	EXPECT_TRUE(fLeftWindow->IsFront());
	Settle(fRightWindow);
	EXPECT_FALSE(fRightWindow->IsActive());

	Point(150, 150, 1);
	Point(150, 150, 0);
	EXPECT_EQ(TakeLeft(), (Log{"left down", "left up"}));
}


TEST_F(HostInputTest, AWindowMayTakeTheFirstClick)
{
	fLeftWindow->Lock();
	fLeftWindow->SetFlags(B_WILL_ACCEPT_FIRST_CLICK);
	fLeftWindow->Unlock();
	Point(150, 150, 1);
	Point(150, 150, 0);
	EXPECT_EQ(TakeLeft(), (Log{"left down", "left up"}));
}


TEST_F(HostInputTest, KeysGoToTheActiveWindowsFocus)
{
	fRightWindow->Lock();
	fRight->MakeFocus();
	fRightWindow->Unlock();
	Display::Get().InjectKey(InjectedKey{0x3c, "A", B_SHIFT_KEY}, true);
	TakeRight();
	fRightWindow->Lock();
	EXPECT_EQ(fRight->keys, "A");
	EXPECT_NE(fRight->heldModifiers & B_SHIFT_KEY, 0u);
	EXPECT_EQ(fLeft->keys, "");
	fRightWindow->Unlock();
	Display::Get().InjectKey(InjectedKey{0x3c, "A", B_SHIFT_KEY}, false);
}


TEST_F(HostInputTest, ATrackingLoopEndsWithTheRelease)
{
	fRightWindow->Lock();
	fRight->tracks = true;
	fRightWindow->Unlock();
	Point(320, 120, 1);
	snooze(20000);
	Point(330, 125, 1);
	snooze(20000);
	// Outside of the window too.
	Point(450, 190, 1);
	Point(450, 190, 0);
	EXPECT_EQ(TakeRight(), (Log{"right down", "right tracked"}));
	EXPECT_EQ(fRight->tracked, BPoint(150, 90));
}


TEST_F(HostInputTest, ADraggedMessageIsDroppedUnderThePointer)
{
	fRightWindow->Lock();
	fRight->drags = true;
	fRightWindow->Unlock();
	Point(320, 120, 1);
	EXPECT_EQ(TakeRight(), (Log{"right down"}));
	Point(160, 140, 1);
	Settle(fLeftWindow);
	Point(150, 130, 0);
	EXPECT_EQ(TakeLeft(), (Log{"left drag entered", "left dropped"}));
	EXPECT_EQ(fLeft->dropPoint, BPoint(150, 130));
	EXPECT_EQ(fLeft->dropOffset, BPoint(5, 6));
	Log log = TakeRight();
	EXPECT_EQ(std::count(log.begin(), log.end(), "right answered"), 1);
}


TEST_F(HostInputTest, ADraggedPictureHasItsOwnOffset)
{
	fRightWindow->Lock();
	fRight->dragsImage = true;
	fRightWindow->Unlock();
	Point(320, 120, 1);
	TakeRight();
	Point(150, 130, 1);
	Point(150, 130, 0);
	Log log = TakeLeft();
	EXPECT_EQ(std::count(log.begin(), log.end(), "left dropped"), 1);
	EXPECT_EQ(fLeft->dropOffset, BPoint(2, 3));
}


TEST_F(HostInputTest, ADropBesideAllWindowsIsForgotten)
{
	fRightWindow->Lock();
	fRight->drags = true;
	fRightWindow->Unlock();
	Point(320, 120, 1);
	TakeRight();
	Point(600, 500, 1);
	Point(600, 500, 0);
	EXPECT_EQ(TakeLeft(), Log());
	EXPECT_EQ(TakeRight(), Log());
}


TEST_F(HostInputTest, FilesFromOutsideReachTheView)
{
	auto files = std::make_unique<BMessage>(B_SIMPLE_DATA);
	Display::Get().InjectDrop(std::move(files), BPoint(350, 150));
	EXPECT_EQ(TakeRight(), (Log{"right dropped"}));
	EXPECT_EQ(fRight->dropPoint, BPoint(350, 150));
	EXPECT_EQ(fRight->dropOffset, B_ORIGIN);
}


TEST_F(HostInputTest, EscapeCancelsADragAndIsNoKey)
{
	fRightWindow->Lock();
	fRight->drags = true;
	fRight->MakeFocus();
	fRightWindow->Unlock();
	Point(320, 120, 1);
	TakeRight();
	Point(160, 140, 1);
	EXPECT_EQ(TakeLeft(), (Log{"left drag entered"}));
	InjectedKey escape{0x01, "\x1b", 0};
	Display::Get().InjectKey(escape, true);
	Point(150, 130, 1);
	Point(150, 130, 0);
	EXPECT_EQ(TakeLeft(), Log());
	EXPECT_EQ(TakeRight(), Log());
	EXPECT_EQ(fRight->keys, "");
}


TEST_F(HostInputTest, AModalWindowBlocksTheOthers)
{
	Log log;
	auto* view = new HostView("modal", &log);
	auto* modal = new BWindow(BRect(500, 100, 599, 199), "modal", B_MODAL_WINDOW, 0);
	modal->AddChild(view);
	modal->Show();
	Settle(modal);
	Point(150, 150, 1);
	Point(150, 150, 0);
	Point(350, 150, 1);
	Point(350, 150, 0);
	EXPECT_EQ(TakeLeft(), Log());
	EXPECT_EQ(TakeRight(), Log());
	Point(550, 150, 1);
	Point(550, 150, 0);
	EXPECT_EQ(Take(modal, log), (Log{"modal down", "modal up"}));
	Quit(modal);
	Point(350, 150, 1);
	Point(350, 150, 0);
	EXPECT_EQ(TakeRight(), (Log{"right down", "right up"}));
}

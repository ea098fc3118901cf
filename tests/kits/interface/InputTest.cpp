// SPDX-License-Identifier: MIT
// Tests of the way of pointer messages to views: targets, transits, event masks, polling and drops.
#include <View.h>

#include <Application.h>
#include <OS.h>
#include <Window.h>

#include "InterfaceFixture.h"
#include "support/Printers.h"

namespace {

// Writes down its pointer hooks with their places; may ask for all pointer events on a press.
class PointerView : public BView {
public:
	PointerView(BRect frame, const char* name, Log* log)
		: BView(frame, name, B_FOLLOW_NONE, 0),
		  fLog(log)
	{
	}

	void MouseDown(BPoint where) override
	{
		Add("down", where);
		if (mask != 0)
			maskStatus = SetMouseEventMask(mask, 0);
		if (polls) {
			// The window's thread is here: what is posted now waits in the queue.
			release_sem(inHook);
			acquire_sem(goOn);
			uint32 buttons = 1;
			for (int i = 0; i < 10 && buttons != 0; i++) {
				BPoint place;
				GetMouse(&place, &buttons);
				Add(buttons != 0 ? "polled" : "polled release", place);
			}
		}
	}

	void MouseUp(BPoint where) override { Add("up", where); }

	void MouseMoved(BPoint where, uint32 transit, const BMessage* dragMessage) override
	{
		const char* const names[] = {"entered", "inside", "exited", "outside"};
		Add(names[transit], where);
		if (dragMessage != nullptr)
			fLog->push_back("dragging");
	}

	void MessageReceived(BMessage* message) override
	{
		if (message->what == B_MOUSE_WHEEL_CHANGED)
			Add("wheel", message->GetPoint("be:view_where", BPoint()));
		BView::MessageReceived(message);
	}

	uint32 mask = 0;
	status_t maskStatus = B_OK;
	bool polls = false;
	sem_id inHook = -1, goOn = -1;

private:
	void Add(const char* what, BPoint where)
	{
		char place[32];
		snprintf(place, sizeof(place), " %g,%g", where.x, where.y);
		fLog->push_back(std::string(Name()) + " " + what + place);
	}

	Log* fLog;
};


class PointerTest : public InterfaceTest {
protected:
	void SetUp() override
	{
		fWindow = MakeWindow(B_WILL_ACCEPT_FIRST_CLICK);
		fLeft = new PointerView(BRect(0, 0, 99, 99), "left", &fLog);
		fRight = new PointerView(BRect(100, 0, 200, 99), "right", &fLog);
		fInner = new PointerView(BRect(10, 10, 29, 29), "inner", &fLog);
		fWindow->AddChild(fLeft);
		fWindow->AddChild(fRight);
		fLeft->AddChild(fInner);
		fWindow->Run();
	}

	void TearDown() override { Quit(fWindow); }

	void Post(uint32 what, BPoint where, int32 buttons = 0)
	{
		BMessage message(what);
		message.AddInt64("when", system_time());
		message.AddPoint("screen_where", where + BPoint(100, 100));
		message.AddInt32("buttons", buttons);
		fWindow->PostMessage(&message);
	}

	Log TakeLog()
	{
		Settle(fWindow);
		fWindow->Lock();
		Log log;
		log.swap(fLog);
		fWindow->Unlock();
		return log;
	}

	BWindow* fWindow;
	PointerView* fLeft;
	PointerView* fRight;
	PointerView* fInner;
	Log fLog;
};

} // namespace


TEST_F(PointerTest, PressesGoToTheTopMostView)
{
	Post(B_MOUSE_DOWN, BPoint(15, 16), 1);
	Post(B_MOUSE_UP, BPoint(15, 16));
	Post(B_MOUSE_DOWN, BPoint(50, 60), 1);
	Post(B_MOUSE_UP, BPoint(150, 60));
	EXPECT_EQ(
		TakeLog(), (Log{"inner down 5,6", "inner up 5,6", "left down 50,60", "right up 50,60"}));
}


TEST_F(PointerTest, HiddenViewsGetNoPresses)
{
	fWindow->Lock();
	fInner->Hide();
	fWindow->Unlock();
	Post(B_MOUSE_DOWN, BPoint(15, 16), 1);
	EXPECT_EQ(TakeLog(), (Log{"left down 15,16"}));
}


TEST_F(PointerTest, MovesTellOfEnteringAndLeaving)
{
	Post(B_MOUSE_MOVED, BPoint(5, 5));
	Post(B_MOUSE_MOVED, BPoint(6, 5));
	Post(B_MOUSE_MOVED, BPoint(12, 12));
	Post(B_MOUSE_MOVED, BPoint(150, 5));
	BMessage left(B_MOUSE_MOVED);
	left.AddPoint("screen_where", BPoint(5000, 100));
	left.AddInt32("be:transit", B_EXITED_VIEW);
	fWindow->PostMessage(&left);
	EXPECT_EQ(TakeLog(),
		(Log{"left entered 5,5", "left inside 6,5", "left exited 12,12", "inner entered 2,2",
			"inner exited 140,-5", "right entered 50,5", "right exited 4800,0"}));
}


TEST_F(PointerTest, TheEventMaskHoldsThePointerUntilTheRelease)
{
	fLeft->mask = B_POINTER_EVENTS;
	Post(B_MOUSE_MOVED, BPoint(50, 50));
	Post(B_MOUSE_DOWN, BPoint(50, 50), 1);
	Post(B_MOUSE_MOVED, BPoint(51, 50), 1);
	Post(B_MOUSE_MOVED, BPoint(150, 50), 1);
	Post(B_MOUSE_MOVED, BPoint(300, 300), 1);
	Post(B_MOUSE_MOVED, BPoint(50, 50), 1);
	Post(B_MOUSE_MOVED, BPoint(150, 50), 1);
	Post(B_MOUSE_UP, BPoint(150, 50));
	Post(B_MOUSE_MOVED, BPoint(151, 50));
	EXPECT_EQ(TakeLog(),
		(Log{"left entered 50,50", "left down 50,50", "left inside 51,50", "left exited 150,50",
			"left outside 300,300", "left entered 50,50", "left exited 150,50", "left up 150,50",
			"right entered 51,50"}));
	EXPECT_EQ(fLeft->maskStatus, B_OK);
}


TEST_F(PointerTest, TheEventMaskFailsOutsideOfAPress)
{
	fWindow->Lock();
	EXPECT_NE(fLeft->SetMouseEventMask(B_POINTER_EVENTS), B_OK);
	fWindow->Unlock();
}


TEST_F(PointerTest, AViewMayAskForThePointerAlways)
{
	fWindow->Lock();
	EXPECT_EQ(fRight->SetEventMask(B_POINTER_EVENTS), B_OK);
	EXPECT_EQ(fRight->EventMask(), B_POINTER_EVENTS);
	fWindow->Unlock();
	Post(B_MOUSE_MOVED, BPoint(50, 50));
	Post(B_MOUSE_DOWN, BPoint(50, 50), 1);
	EXPECT_EQ(TakeLog(),
		(Log{
			"right outside -50,50", "left entered 50,50", "right down -50,50", "left down 50,50"}));
	fWindow->Lock();
	fRight->SetEventMask(0);
	fWindow->Unlock();
	Post(B_MOUSE_UP, BPoint(50, 50));
	EXPECT_EQ(TakeLog(), (Log{"left up 50,50"}));
}


TEST_F(PointerTest, AViewHearsOfOtherWindowsToo)
{
	fWindow->Lock();
	fRight->SetEventMask(B_POINTER_EVENTS);
	fWindow->Unlock();
	BWindow* other =
		new BWindow(BRect(400, 400, 500, 500), "other", B_TITLED_WINDOW, B_WILL_ACCEPT_FIRST_CLICK);
	other->Run();
	BMessage message(B_MOUSE_DOWN);
	message.AddPoint("screen_where", BPoint(410, 410));
	message.AddInt32("buttons", 1);
	other->PostMessage(&message);
	Settle(other);
	EXPECT_EQ(TakeLog(), (Log{"right down 210,310"}));
	Quit(other);
}


TEST_F(PointerTest, TheWheelGoesToTheViewUnderThePointer)
{
	Post(B_MOUSE_WHEEL_CHANGED, BPoint(15, 15));
	// Nobody has a scroll bar: the message goes up to the parent.
	EXPECT_EQ(TakeLog(), (Log{"inner wheel 5,5", "left wheel 5,5"}));
}


TEST_F(PointerTest, PollingTakesWaitingMessagesOneByOne)
{
	fLeft->polls = true;
	fLeft->inHook = create_sem(0, "in hook");
	fLeft->goOn = create_sem(0, "go on");
	Post(B_MOUSE_DOWN, BPoint(50, 50), 1);
	acquire_sem(fLeft->inHook);
	Post(B_MOUSE_DOWN, BPoint(60, 60), 3);
	Post(B_MOUSE_UP, BPoint(70, 70), 1);
	Post(B_MOUSE_UP, BPoint(80, 80), 0);
	release_sem(fLeft->goOn);
	// MouseUp() does not see what the loop took.
	EXPECT_EQ(TakeLog(),
		(Log{"left down 50,50", "left polled 60,60", "left polled 70,70",
			"left polled release 80,80"}));
	delete_sem(fLeft->inHook);
	delete_sem(fLeft->goOn);
}


TEST_F(PointerTest, ARemovedViewIsForgotten)
{
	fInner->mask = B_POINTER_EVENTS;
	Post(B_MOUSE_MOVED, BPoint(15, 15));
	Post(B_MOUSE_DOWN, BPoint(15, 15), 1);
	TakeLog();
	fWindow->Lock();
	fInner->RemoveSelf();
	delete fInner;
	fWindow->Unlock();
	Post(B_MOUSE_MOVED, BPoint(16, 15), 1);
	Post(B_MOUSE_UP, BPoint(16, 15));
	EXPECT_EQ(TakeLog(), (Log{"left entered 16,15", "left up 16,15"}));
}

// SPDX-License-Identifier: MIT
// Tests of forms: when they call which handlers, and how they end.

#include <ormi/Form.h>

#include <string>
#include <vector>

#include "EventFormFixture.h"
#include "support/Printers.h"

class FormTest : public EventFormTest {};


TEST_F(FormTest, NoHandlerIsCalledBeforeTheFirstShow)
{
	Locked([&] {
		fForm->Button1->MoveBy(1, 1);
		fForm->TextControl1->SetText("changed");
		fForm->TextControl1->MakeFocus();
	});
	EXPECT_FALSE(fForm->IsOpen());
	EXPECT_EQ(gEvents.Take(), Lines{"FormCreate"});
}


TEST_F(FormTest, TheFirstShowTellsTheFormAndEachComponentThatTheyAreAttached)
{
	gEvents.Take();
	fForm->Show();
	EXPECT_TRUE(fForm->IsOpen());
	Lines events = TakeEvents();
	ASSERT_GE(events.size(), 16u);
	events.resize(16);
	EXPECT_EQ(events,
		(Lines{"Show", "AttachedToWindow", "Button1AttachedToWindow", "Button1AllAttached",
			"CheckBox1AttachedToWindow", "CheckBox1AllAttached", "TextControl1AttachedToWindow",
			"TextControl1AllAttached", "StringView1AttachedToWindow", "StringView1AllAttached",
			"Box1AttachedToWindow", "Button2AttachedToWindow", "Button2AllAttached",
			"Box1AllAttached", "AllAttached", "GotFocus"}));
}


TEST_F(FormTest, LaterShowsTellNothingAgain)
{
	Open();
	Locked([&] {
		fForm->Hide();
		fForm->Show();
	});
	const Lines events = Without(TakeEvents(), "WindowActivated");
	EXPECT_EQ(events, (Lines{"Hide", "Show"}));
}


TEST_F(FormTest, AComponentThatHasTheFocusAtTheFirstShowKeepsIt)
{
	Locked([&] { fForm->TextControl1->MakeFocus(); });
	fForm->Show();
	const Lines events = TakeEvents();
	EXPECT_EQ(Count(events, "TextControl1GotFocus"), 1);
	EXPECT_EQ(Count(events, "GotFocus"), 0);
}


TEST_F(FormTest, QuitTellsOfTheDetachingAndCallsNoHandlerOnTheDestroyedForm)
{
	Open();
	Close();
	Lines events = Without(gEvents.Take(), "Draw");
	events = Without(Without(Without(events, "Hide"), "WindowActivated"), "Focus");
	EXPECT_EQ(events,
		(Lines{"Quit", "Button1AllDetached", "CheckBox1AllDetached", "TextControl1AllDetached",
			"StringView1AllDetached", "Button2AllDetached", "Box1AllDetached", "AllDetached",
			"FormDestroy text"}));
}


TEST_F(FormTest, AFormThatWasNeverShownEndsWithoutOtherEvents)
{
	gEvents.Take();
	Close();
	EXPECT_EQ(gEvents.Take(), (Lines{"Quit", "FormDestroy text"}));
}


TEST_F(FormTest, DeletingAFormCallsNoHandlerOfItsComponents)
{
	fForm->Lock();
	gEvents.Take();
	delete fForm;
	fForm = nullptr;
	EXPECT_EQ(gEvents.Take(), Lines{"FormDestroy text"});
}


TEST_F(FormTest, AHandlerMayQuitTheForm)
{
	Open();
	fForm->quitsOnClick = true;
	Click(BPoint(20, 20));
	WaitUntilGone();
	const Lines events = gEvents.Take();
	EXPECT_EQ(Count(events, "Button1Click"), 1);
	ASSERT_FALSE(events.empty());
	EXPECT_EQ(events.back(), "FormDestroy text");
}


TEST_F(FormTest, AHandlerMayOpenAnotherForm)
{
	Open();
	fForm->opensOnClick = true;
	Click(BPoint(20, 20));
	const Lines events = TakeEvents();
	EXPECT_EQ(Count(events, "FormCreate"), 1);
	EXPECT_EQ(Count(events, "Show"), 1);

	ASSERT_EQ(fApplication.CountWindows(), 2);
	TForm* other = dynamic_cast<TForm*>(fApplication.WindowAt(1));
	ASSERT_NE(other, nullptr);
	ASSERT_TRUE(other->Lock());
	EXPECT_STREQ(other->Title(), "opened");
	EXPECT_NE(other->Thread(), fThread);
	other->Quit();
	Click(BPoint(250, 150));
	EXPECT_EQ(Count(TakeEvents(), "MouseDown 250,150"), 1);
}


TEST_F(FormTest, AFormMayRefuseToQuit)
{
	Open();
	fForm->mayQuit = false;
	fForm->PostMessage(B_QUIT_REQUESTED);
	EXPECT_EQ(TakeEvents(), Lines{"QuitRequested"});
	fForm->mayQuit = true;
	fForm->PostMessage(B_QUIT_REQUESTED);
	WaitUntilGone();
	const Lines events = gEvents.Take();
	ASSERT_FALSE(events.empty());
	EXPECT_EQ(events.back(), "FormDestroy text");
}


TEST_F(FormTest, MessagesComeToTheFormsOwnOperation)
{
	Open();
	fForm->PostMessage('mine');
	EXPECT_EQ(TakeEvents(), Lines{"MessageReceived"});
}


TEST_F(FormTest, FramesAreReported)
{
	Open();
	Locked([&] {
		fForm->MoveTo(120, 130);
		fForm->ResizeTo(250, 160);
	});
	EXPECT_EQ(TakeEvents(), (Lines{"FrameMoved 120,130", "FrameResized 250,160"}));
	Locked([&] { EXPECT_EQ(fForm->FormView()->Frame(), BRect(0, 0, 250, 160)); });
}


TEST_F(FormTest, EventsOfTheWindowReachTheirHandlers)
{
	struct {
		uint32 what;
		const char* event;
	} const cases[] = {
		{B_SCREEN_CHANGED, "ScreenChanged 1023,767,8"},
		{B_WORKSPACE_ACTIVATED, "WorkspaceActivated 2,1"},
		{B_WORKSPACES_CHANGED, "WorkspacesChanged 1,2"},
		{B_MINIMIZE, "Minimize"},
		{B_ZOOM, "Zoom"},
	};
	Open();
	for (const auto& test : cases) {
		BMessage message(test.what);
		message.AddRect("frame", BRect(0, 0, 1023, 767));
		message.AddInt32("mode", B_RGB32);
		message.AddInt32("workspace", 2);
		message.AddBool("active", true);
		message.AddInt32("old", 1);
		message.AddInt32("new", 2);
		message.AddBool("minimize", true);
		fForm->PostMessage(&message);
		EXPECT_EQ(Count(TakeEvents(), test.event), 1) << test.event;
	}
}


TEST_F(FormTest, ActivationIsReported)
{
	fForm->Show();
	Settle(fForm);
	BMessage off(B_WINDOW_ACTIVATED);
	off.AddBool("active", false);
	BMessage on(B_WINDOW_ACTIVATED);
	on.AddBool("active", true);
	fForm->PostMessage(&off);
	fForm->PostMessage(&on);
	fForm->PostMessage(&off);
	const Lines events = TakeEvents();
	EXPECT_GE(Count(events, "WindowActivated"), 1);
	EXPECT_GE(Count(events, "WindowActivated no more"), 1);
}


TEST_F(FormTest, MenuHooksAreCalledForAShortcut)
{
	Open();
	Key('y', B_COMMAND_KEY);
	const Lines events = TakeEvents();
	EXPECT_EQ(Count(events, "MenusBeginning"), 1);
	EXPECT_EQ(Count(events, "MenusEnded"), 1);
}


TEST_F(FormTest, ViewTransactionsAreHooksOfTheForm)
{
	Open();
	TForm* form = fForm;
	Locked([&] {
		form->OpenViewTransaction();
		form->CommitViewTransaction();
	});
	EXPECT_EQ(TakeEvents(), (Lines{"OpenViewTransaction", "CommitViewTransaction"}));
}


TEST_F(FormTest, TheFormsViewHasTheKeysThatNoComponentHas)
{
	Open();
	Key('x');
	EXPECT_EQ(TakeEvents(), (Lines{"KeyDown", "KeyUp"}));
}


TEST_F(FormTest, TheFormsViewHearsTheMouseBesideTheComponents)
{
	Open();
	Pointer(B_MOUSE_MOVED, BPoint(200, 150));
	Click(BPoint(200, 150));
	EXPECT_EQ(
		TakeEvents(), (Lines{"MouseMoved 200,150,0", "MouseDown 200,150", "MouseUp 200,150"}));
}


TEST_F(FormTest, EachInstanceHasHandlersOfItsOwn)
{
	TEventForm* other = new TEventForm;
	fForm->name = "first ";
	other->name = "second ";
	Open();
	other->Show();
	Settle(other);
	gEvents.Take();

	for (TForm* form : {static_cast<TForm*>(other), static_cast<TForm*>(fForm)}) {
		BMessage active(B_WINDOW_ACTIVATED);
		active.AddBool("active", true);
		form->PostMessage(&active);
		PointerIn(form, B_MOUSE_DOWN, BPoint(20, 20), B_PRIMARY_MOUSE_BUTTON);
		PointerIn(form, B_MOUSE_UP, BPoint(20, 20));
		Settle(form);
	}
	const Lines events = gEvents.Take();
	EXPECT_EQ(Count(events, "second Button1Click"), 1);
	EXPECT_EQ(Count(events, "first Button1Click"), 1);

	other->Lock();
	other->Quit();
	gEvents.Take();
	Pointer(B_MOUSE_MOVED, BPoint(200, 150));
	EXPECT_EQ(TakeEvents(), Lines{"MouseMoved 200,150,0"});
}


TEST_F(FormTest, AComponentMayBeInvisibleFromTheBeginning)
{
	Locked([&] { fForm->Button1->SetVisible(false); });
	Open();
	Locked([&] { EXPECT_TRUE(fForm->Button1->IsHidden()); });
	Click(BPoint(20, 20));
	EXPECT_EQ(TakeEvents(), (Lines{"MouseDown 20,20", "MouseUp 20,20"}));
	Locked([&] { fForm->Button1->SetVisible(true); });
	Click(BPoint(20, 20));
	EXPECT_EQ(Count(TakeEvents(), "Button1Click"), 1);
}


TEST_F(FormTest, ManyFormsOpenAndCloseAtOnce)
{
	const int kForms = 40;
	gEvents.Take();
	std::vector<thread_id> threads;
	for (int i = 0; i < kForms; i++) {
		TEventForm* form = new TEventForm;
		form->Show();
		threads.push_back(form->Thread());
		BMessage active(B_WINDOW_ACTIVATED);
		active.AddBool("active", true);
		form->PostMessage(&active);
		PointerIn(form, B_MOUSE_DOWN, BPoint(20, 20), B_PRIMARY_MOUSE_BUTTON);
		PointerIn(form, B_MOUSE_UP, BPoint(20, 20));
		form->PostMessage(B_QUIT_REQUESTED);
	}
	for (thread_id thread : threads) {
		status_t result;
		wait_for_thread(thread, &result);
	}
	const Lines events = gEvents.Take();
	EXPECT_EQ(Count(events, "FormCreate"), kForms);
	EXPECT_EQ(Count(events, "Button1Click"), kForms);
	EXPECT_EQ(Count(events, "AllDetached"), kForms);
	EXPECT_EQ(Count(events, "FormDestroy text"), kForms);
	EXPECT_EQ(fApplication.CountWindows(), 1);
}


TEST_F(FormTest, TheFirstViewStays)
{
	TFormView* view = fForm->FormView();
	TFormView* other = new TFormView(fForm, "other");
	fForm->SetFormView(other);
	fForm->SetFormView(nullptr);
	EXPECT_EQ(fForm->FormView(), view);
	EXPECT_EQ(other->Window(), nullptr);
	delete other;
}


TEST_F(FormTest, AHandlerMayMoveTheFocusBack)
{
	class TStubbornForm : public TEventForm {
	public:
		void TextControl1LostFocus() override
		{
			TEventForm::TextControl1LostFocus();
			TextControl1->MakeFocus();
		}
	};
	Close();
	fForm = new TStubbornForm;
	Open();
	Locked([&] { fForm->TextControl1->MakeFocus(); });
	TakeEvents();
	Locked([&] { fForm->Button1->MakeFocus(); });
	EXPECT_EQ(TakeEvents(), (Lines{"TextControl1LostFocus", "TextControl1GotFocus"}));
	EXPECT_TRUE(fForm->TextControl1->TextView()->IsFocus());
}


TEST_F(FormTest, AHandlerMayDeleteTheComponentThatLostTheFocus)
{
	class TTidyForm : public TEventForm {
	public:
		void Button1LostFocus() override
		{
			TEventForm::Button1LostFocus();
			Button1->RemoveSelf();
			delete Button1;
		}
	};
	Close();
	fForm = new TTidyForm;
	Open();
	Locked([&] { fForm->Button1->MakeFocus(); });
	TakeEvents();
	Locked([&] { fForm->CheckBox1->MakeFocus(); });
	EXPECT_EQ(Beginning(TakeEvents(), "CheckBox1"), Lines{"CheckBox1GotFocus"});
}

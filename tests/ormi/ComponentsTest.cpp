// SPDX-License-Identifier: MIT
// Tests of the components that generated programs use: their events and the statements of their properties.

#include <ormi/Components.h>

#include <CheckBox.h>
#include <TextView.h>

#include "EventFormFixture.h"
#include "support/Printers.h"

class ComponentsTest : public EventFormTest {
protected:
	void SetUp() override
	{
		EventFormTest::SetUp();
		Open();
	}

	/// Handles what moving and typing gave so far, and forgets it.
	void Forget() { TakeEvents(); }
};


TEST_F(ComponentsTest, AButtonIsClickedByTheMouse)
{
	Click(BPoint(20, 22));
	EXPECT_EQ(Without(TakeEvents(), "Focus"),
		(Lines{"Button1MouseDown 10,12", "Button1Click", "Button1MouseUp 10,12"}));
}


TEST_F(ComponentsTest, AButtonIsNotClickedWhenTheMouseIsReleasedOutside)
{
	Pointer(B_MOUSE_DOWN, BPoint(20, 22), B_PRIMARY_MOUSE_BUTTON);
	Pointer(B_MOUSE_MOVED, BPoint(20, 150), B_PRIMARY_MOUSE_BUTTON);
	Pointer(B_MOUSE_UP, BPoint(20, 150));
	const Lines events = TakeEvents();
	EXPECT_EQ(Count(events, "Button1MouseUp 10,140"), 1);
	EXPECT_EQ(Count(events, "Button1Click"), 0);
}


TEST_F(ComponentsTest, AButtonIsClickedByTheKeyboard)
{
	Locked([&] { fForm->Button1->MakeFocus(); });
	Forget();
	Key(B_SPACE);
	EXPECT_EQ(TakeEvents(), (Lines{"Button1Click", "Button1KeyDown", "Button1KeyUp"}));
}


TEST_F(ComponentsTest, TheDefaultButtonIsClickedByEnter)
{
	Locked([&] { fForm->Button1->MakeDefault(true); });
	Forget();
	Key(B_ENTER);
	EXPECT_EQ(Count(TakeEvents(), "Button1Click"), 1);
}


TEST_F(ComponentsTest, ADisabledButtonIsNotClicked)
{
	Locked([&] { fForm->Button1->SetEnabled(false); });
	Forget();
	Click(BPoint(20, 22));
	const Lines events = TakeEvents();
	EXPECT_EQ(Count(events, "Button1Click"), 0);
	EXPECT_EQ(Count(events, "Button1MouseDown 10,12"), 1);
}


TEST_F(ComponentsTest, ACheckBoxChangesByTheUserOnly)
{
	Locked([&] {
		EXPECT_EQ(fForm->CheckBox1->Value(), B_CONTROL_ON);
		fForm->CheckBox1->SetValue(B_CONTROL_ON);
	});
	EXPECT_EQ(TakeEvents(), Lines());
	Click(BPoint(18, 48));
	EXPECT_EQ(Count(TakeEvents(), "CheckBox1Change 0"), 1);
	Locked([&] { fForm->CheckBox1->MakeFocus(); });
	Forget();
	Key(B_SPACE);
	EXPECT_EQ(TakeEvents(), (Lines{"CheckBox1Change 1", "CheckBox1KeyDown", "CheckBox1KeyUp"}));
}


TEST_F(ComponentsTest, TypingChangesATextField)
{
	Locked([&] {
		fForm->TextControl1->MakeFocus();
		fForm->TextControl1->TextView()->Select(4, 4);
	});
	Forget();
	Key('s');
	EXPECT_EQ(TakeEvents(),
		(Lines{"TextControl1Change texts", "TextControl1KeyDown", "TextControl1KeyUp"}));
}


TEST_F(ComponentsTest, SettingTheTextChangesATextFieldToo)
{
	Locked([&] { fForm->TextControl1->SetText("other"); });
	const Lines events = TakeEvents();
	ASSERT_FALSE(events.empty());
	EXPECT_EQ(events.back(), "TextControl1Change other");
	EXPECT_EQ(Count(events, "TextControl1Enter other"), 0);
}


TEST_F(ComponentsTest, EnterEndsATextThatChanged)
{
	Locked([&] {
		fForm->TextControl1->MakeFocus();
		fForm->TextControl1->TextView()->Select(4, 4);
	});
	Key('s');
	Forget();
	Key(B_ENTER);
	EXPECT_EQ(Count(TakeEvents(), "TextControl1Enter texts"), 1);
	Key(B_ENTER);
	EXPECT_EQ(Count(TakeEvents(), "TextControl1Enter texts"), 0);
}


TEST_F(ComponentsTest, LosingTheFocusEndsATextThatChanged)
{
	Locked([&] {
		fForm->TextControl1->MakeFocus();
		fForm->TextControl1->TextView()->Select(4, 4);
	});
	Key('s');
	Forget();
	Locked([&] { fForm->Button1->MakeFocus(); });
	EXPECT_EQ(TakeEvents(),
		(Lines{"TextControl1Enter texts", "TextControl1LostFocus", "Button1GotFocus"}));
}


TEST_F(ComponentsTest, ATextFieldHasTheMouseEventsOfItsTextView)
{
	Click(BPoint(50, 80));
	const Lines events = TakeEvents();
	EXPECT_EQ(Count(events, "TextControl1MouseDown 40,10"), 1);
	EXPECT_EQ(Count(events, "TextControl1MouseUp 40,10"), 1);
	EXPECT_EQ(Count(events, "TextControl1GotFocus"), 1);
	EXPECT_EQ(Count(events, "LostFocus"), 1);
}


TEST_F(ComponentsTest, TabMovesTheFocusFromTheFormThroughTheComponents)
{
	Key(B_TAB);
	EXPECT_EQ(TakeEvents(), (Lines{"KeyDown", "LostFocus", "Button1GotFocus", "Button1KeyUp"}));
	Key(B_TAB);
	EXPECT_EQ(TakeEvents(),
		(Lines{"Button1KeyDown", "Button1LostFocus", "CheckBox1GotFocus", "CheckBox1KeyUp"}));
	Key(B_TAB);
	EXPECT_EQ(TakeEvents(),
		(Lines{"CheckBox1KeyDown", "CheckBox1LostFocus", "TextControl1GotFocus",
			"TextControl1KeyUp"}));
	Key(B_TAB);
	EXPECT_EQ(TakeEvents(),
		(Lines{"TextControl1KeyDown", "TextControl1LostFocus", "StringView1GotFocus",
			"StringView1KeyUp"}));
	// The button in the box is disabled.
	Key(B_TAB);
	EXPECT_EQ(TakeEvents(),
		(Lines{"StringView1KeyDown", "StringView1LostFocus", "Box1GotFocus", "Box1KeyUp"}));
}


TEST_F(ComponentsTest, AStringViewIsClickedByPressAndReleaseInside)
{
	Click(BPoint(20, 110));
	EXPECT_EQ(TakeEvents(),
		(Lines{"StringView1MouseDown 10,10", "StringView1MouseUp 10,10", "StringView1Click"}));

	Pointer(B_MOUSE_MOVED, BPoint(20, 110));
	Pointer(B_MOUSE_DOWN, BPoint(20, 110), B_PRIMARY_MOUSE_BUTTON);
	Pointer(B_MOUSE_MOVED, BPoint(20, 150), B_PRIMARY_MOUSE_BUTTON);
	Pointer(B_MOUSE_UP, BPoint(20, 150));
	// A press that began elsewhere is no click either.
	Pointer(B_MOUSE_UP, BPoint(20, 110));
	EXPECT_EQ(Count(TakeEvents(), "StringView1Click"), 0);
}


TEST_F(ComponentsTest, ABoxIsClickedBesideWhatItHolds)
{
	Click(BPoint(270, 40));
	EXPECT_EQ(TakeEvents(), (Lines{"Box1MouseDown 110,30", "Box1MouseUp 110,30", "Box1Click"}));
	Click(BPoint(180, 40));
	EXPECT_EQ(Count(TakeEvents(), "Box1Click"), 0);
}


TEST_F(ComponentsTest, MovesOfThePointerAreReportedWithTheirTransit)
{
	struct {
		const char* component;
		BPoint inside;
	} const cases[] = {
		{"Button1", BPoint(20, 20)},
		{"CheckBox1", BPoint(20, 50)},
		{"TextControl1", BPoint(50, 80)},
		{"StringView1", BPoint(20, 110)},
		{"Box1", BPoint(270, 40)},
		{"Button2", BPoint(180, 40)},
	};
	for (const auto& test : cases) {
		Pointer(B_MOUSE_MOVED, test.inside);
		Pointer(B_MOUSE_MOVED, BPoint(250, 180));
		const Lines events = Beginning(TakeEvents(), std::string(test.component) + "MouseMoved ");
		ASSERT_EQ(events.size(), 2u) << test.component;
		EXPECT_EQ(events[0].substr(events[0].size() - 2), ",0") << events[0];
		EXPECT_EQ(events[1].substr(events[1].size() - 2), ",2") << events[1];
	}
}


TEST_F(ComponentsTest, FramesAreReportedWhateverFlagsTheDesignerChose)
{
	struct {
		BView* view;
		const char* moved;
		const char* resized;
	} const cases[] = {
		{fForm->Button1, "Button1FrameMoved 5,6", "Button1FrameResized 50,30"},
		{fForm->CheckBox1, "CheckBox1FrameMoved 5,6", "CheckBox1FrameResized 50,30"},
		{fForm->TextControl1, "TextControl1FrameMoved 5,6", "TextControl1FrameResized 50,30"},
		{fForm->StringView1, "StringView1FrameMoved 5,6", "StringView1FrameResized 50,30"},
		{fForm->Box1, "Box1FrameMoved 5,6", "Box1FrameResized 50,30"},
		{fForm->Button2, "Button2FrameMoved 5,6", "Button2FrameResized 50,30"},
	};
	for (const auto& test : cases) {
		Locked([&] {
			test.view->SetFlags(B_WILL_DRAW);
			test.view->MoveTo(5, 6);
			test.view->ResizeTo(50, 30);
		});
		const Lines events = TakeEvents();
		EXPECT_EQ(Count(events, test.moved), 1) << test.moved;
		EXPECT_EQ(Count(events, test.resized), 1) << test.resized;
	}
}


TEST_F(ComponentsTest, RemovingAComponentDetachesItAndAddingItAttachesItAgain)
{
	Locked([&] {
		fForm->Button1->RemoveSelf();
		fForm->FormView()->AddChild(fForm->Button1);
	});
	EXPECT_EQ(TakeEvents(),
		(Lines{"Button1AllDetached", "Button1AttachedToWindow", "Button1AllAttached"}));
}


TEST_F(ComponentsTest, SetVisibleHidesAndShowsOnceEach)
{
	Locked([&] {
		fForm->Button1->SetVisible(false);
		fForm->Button1->SetVisible(false);
		EXPECT_TRUE(fForm->Button1->IsHidden(fForm->Button1));
		fForm->Button1->SetVisible(true);
		EXPECT_FALSE(fForm->Button1->IsHidden());
		fForm->Button1->SetVisible(true);
		fForm->Button1->Hide();
		EXPECT_TRUE(fForm->Button1->IsHidden());
		fForm->Button1->SetVisible(false);
	});
	Forget();
	Click(BPoint(20, 20));
	EXPECT_EQ(TakeEvents(), (Lines{"MouseDown 20,20", "MouseUp 20,20"}));
}


TEST_F(ComponentsTest, SetVisibleIsAboutTheComponentAndNotItsContainer)
{
	Locked([&] {
		fForm->Box1->SetVisible(false);
		fForm->Button2->SetVisible(true);
		fForm->Box1->SetVisible(true);
		EXPECT_FALSE(fForm->Button2->IsHidden());
		fForm->Box1->SetVisible(false);
		fForm->Button2->SetVisible(false);
		fForm->Box1->SetVisible(true);
		EXPECT_TRUE(fForm->Button2->IsHidden());
	});
}


TEST_F(ComponentsTest, TheStatementsOfThePropertiesTakeEffect)
{
	Locked([&] {
		EXPECT_STREQ(fForm->Button1->Label(), "Press");
		EXPECT_FALSE(fForm->Button2->IsEnabled());
		EXPECT_STREQ(fForm->TextControl1->Text(), "text");
		EXPECT_EQ(fForm->TextControl1->Divider(), 0);
		EXPECT_STREQ(fForm->StringView1->Text(), "String");
		EXPECT_EQ(fForm->StringView1->Alignment(), B_ALIGN_RIGHT);
		EXPECT_STREQ(fForm->Box1->Label(), "Box");
		EXPECT_EQ(fForm->Box1->Border(), B_PLAIN_BORDER);
		EXPECT_EQ(fForm->Button2->Parent(), fForm->Box1);
		EXPECT_EQ(fForm->StringView1->ResizingMode(), static_cast<uint32>(B_FOLLOW_NONE));
		EXPECT_STREQ(fForm->StringView1->Name(), "StringView1");
		BFont font;
		fForm->StringView1->GetFont(&font);
		EXPECT_EQ(font.Size(), 10);
		fForm->TextControl1->TextView()->GetFont(&font);
		EXPECT_EQ(font.Size(), 10);
	});
}


TEST_F(ComponentsTest, AComponentWithoutHandlersKeepsQuiet)
{
	TButton<TEventForm>* button = nullptr;
	Locked([&] {
		button = new TButton<TEventForm>(fForm, BRect(10, 130, 89, 154), "plain", "Plain");
		fForm->FormView()->AddChild(button);
	});
	Click(BPoint(20, 140));
	EXPECT_EQ(TakeEvents(), Lines());
	Locked([&] { EXPECT_EQ(button->ParentForm(), fForm); });
}


TEST_F(ComponentsTest, AFrameThatIsChangedAndGivenBackIsNoNews)
{
	Locked([&] {
		fForm->Button1->ResizeTo(300, 10);
		fForm->Button1->MoveTo(0, 0);
		fForm->Button1->MoveTo(10, 10);
		fForm->Button1->ResizeTo(79, 24);
		fForm->CheckBox1->ResizeTo(50, 10);
		fForm->CheckBox1->ResizeTo(60, 10);
	});
	EXPECT_EQ(TakeEvents(), Lines{"CheckBox1FrameResized 60,10"});
}


TEST_F(ComponentsTest, WhatAComponentIsMadeOfCountsAsTheComponent)
{
	TScrollView<TEventForm>* scroll = nullptr;
	Locked([&] {
		scroll = new TScrollView<TEventForm>(
			fForm, BRect(160, 110, 259, 189), "scroll", true, true, B_PLAIN_BORDER);
		scroll->OnMouseDown = &TEventForm::Box1MouseDown;
		scroll->OnMouseMoved = &TEventForm::Box1MouseMoved;
		scroll->OnKeyDown = &TEventForm::Box1KeyDown;
		scroll->OnGotFocus = &TEventForm::Box1GotFocus;
		scroll->OnLostFocus = &TEventForm::Box1LostFocus;
		fForm->FormView()->AddChild(scroll);
		scroll->Page()->SetFlags(scroll->Page()->Flags() | B_NAVIGABLE);
	});
	Forget();
	Pointer(B_MOUSE_MOVED, BPoint(200, 140));
	Click(BPoint(200, 140));
	EXPECT_EQ(TakeEvents(), (Lines{"Box1MouseMoved 40,30,0", "Box1MouseDown 40,30"}));
	Locked([&] { scroll->Page()->MakeFocus(); });
	EXPECT_EQ(TakeEvents(), (Lines{"LostFocus", "Box1GotFocus"}));
	Key('x');
	EXPECT_EQ(TakeEvents(), Lines{"Box1KeyDown"});
	// From one of its views to another.
	Locked([&] { scroll->MakeFocus(); });
	EXPECT_EQ(TakeEvents(), Lines());
	Locked([&] { fForm->Button1->MakeFocus(); });
	EXPECT_EQ(TakeEvents(), (Lines{"Box1LostFocus", "Button1GotFocus"}));
}


TEST_F(ComponentsTest, AComponentThatComesBackIsToldOfTheFocusAgain)
{
	Locked([&] { fForm->Button1->MakeFocus(); });
	Locked([&] { fForm->Button1->RemoveSelf(); });
	Forget();
	Locked([&] { fForm->FormView()->AddChild(fForm->Button1); });
	Forget();
	Locked([&] { fForm->Button1->MakeFocus(); });
	EXPECT_EQ(TakeEvents(), Lines{"Button1GotFocus"});
}

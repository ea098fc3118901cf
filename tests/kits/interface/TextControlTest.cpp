// SPDX-License-Identifier: MIT
// Tests of BTextControl: its messages, its focus, its field and its flags.
#include <TextControl.h>

#include <Button.h>
#include <Clipboard.h>

#include "ControlsFixture.h"

namespace {

class TextControlTest : public ControlsTest {
protected:
	void SetUp() override
	{
		ControlsTest::SetUp();
		fControl = Add(new BTextControl(
			BRect(10, 10, 209, 99), "control", "Label:", "text", new BMessage('entr')));
		fOther = Add(new BTextControl(BRect(10, 50, 209, 69), "other", nullptr, "", nullptr));
	}

	void Focus()
	{
		Do([this] { fControl->MakeFocus(); });
	}

	std::string Text() { return TextOf(fControl->TextView()); }

	BTextControl* fControl = nullptr;
	BTextControl* fOther = nullptr;
};


// Notes which message it is invoked with, and answers each change with another one.
class ListeningControl : public BTextControl {
public:
	ListeningControl()
		: BTextControl(BRect(10, 90, 209, 109), "listening", "", "", new BMessage('entr'))
	{
		SetModificationMessage(new BMessage('modi'));
	}

	status_t Invoke(BMessage* message) override
	{
		changes += message != nullptr && message == ModificationMessage();
		enters += message == nullptr;
		if (answers)
			SetText((std::string(Text()) + "!").c_str());
		return BTextControl::Invoke(message);
	}

	int changes = 0;
	int enters = 0;
	bool answers = false;
};

} // namespace


TEST_F(TextControlTest, HeightIsWhatTheFontNeeds)
{
	font_height height;
	fControl->GetFontHeight(&height);
	EXPECT_EQ(fControl->Bounds().Width(), 199);
	EXPECT_EQ(fControl->Bounds().Height(), fOther->Bounds().Height());
	EXPECT_GE(fControl->Bounds().Height(), height.ascent + height.descent);
	EXPECT_LT(fControl->Bounds().Height(), 40);
}


TEST_F(TextControlTest, DividerStartsInTheMiddleOrAtTheEdge)
{
	EXPECT_EQ(fControl->Divider(), 99);
	EXPECT_EQ(fOther->Divider(), 0);
	BTextControl empty(BRect(0, 0, 99, 20), "empty", "", "", nullptr);
	EXPECT_EQ(empty.Divider(), 0);
}


TEST_F(TextControlTest, FieldLiesTwoPixelsInside)
{
	fControl->SetDivider(60);
	EXPECT_EQ(fControl->Divider(), 60);
	const BRect bounds = fControl->Bounds();
	EXPECT_EQ(fControl->TextView()->Frame(), BRect(62, 2, bounds.right - 2, bounds.bottom - 2));
}


TEST_F(TextControlTest, FieldFollowsTheControlsSize)
{
	Show();
	Do([this] { fControl->ResizeTo(149, 30); });
	EXPECT_EQ(Ask([this] { return fControl->TextView()->Frame(); }), BRect(101, 2, 147, 28));
}


TEST_F(TextControlTest, FieldFollowsASizeGivenBeforeAttaching)
{
	BTextControl* control = new BTextControl(BRect(0, 0, 99, 20), "c", nullptr, "", nullptr);
	control->ResizeTo(199, control->Bounds().Height());
	Add(control);
	EXPECT_EQ(control->TextView()->Frame().right, 197);
}


TEST_F(TextControlTest, NavigabilityIsTheTextViews)
{
	EXPECT_EQ(fControl->Flags() & B_NAVIGABLE, 0u);
	EXPECT_EQ(fControl->TextView()->Flags() & B_NAVIGABLE, B_NAVIGABLE);
	fControl->SetFlags(fControl->Flags() | B_NAVIGABLE);
	EXPECT_EQ(fControl->Flags() & B_NAVIGABLE, 0u);
	EXPECT_EQ(fControl->TextView()->Flags() & B_NAVIGABLE, B_NAVIGABLE);
	fControl->SetFlags(fControl->Flags());
	EXPECT_EQ(fControl->TextView()->Flags() & B_NAVIGABLE, 0u);
}


TEST_F(TextControlTest, DisablingTakesAndGivesBackNavigation)
{
	fControl->SetEnabled(false);
	EXPECT_FALSE(fControl->IsEnabled());
	EXPECT_EQ(fControl->TextView()->Flags() & B_NAVIGABLE, 0u);
	fControl->SetEnabled(true);
	EXPECT_EQ(fControl->TextView()->Flags() & B_NAVIGABLE, B_NAVIGABLE);
	EXPECT_EQ(fControl->Flags() & B_NAVIGABLE, 0u);
}


TEST_F(TextControlTest, EnablingKeepsATextViewReadOnly)
{
	fControl->TextView()->MakeEditable(false);
	fControl->SetEnabled(false);
	fControl->SetEnabled(true);
	EXPECT_FALSE(fControl->TextView()->IsEditable());
}


TEST_F(TextControlTest, MakeFocusFocusesTheTextViewAndSelectsAll)
{
	Show();
	Focus();
	int32 start, end;
	Do([&] {
		EXPECT_FALSE(fControl->IsFocus());
		EXPECT_TRUE(fControl->TextView()->IsFocus());
		fControl->TextView()->GetSelection(&start, &end);
	});
	EXPECT_EQ(start, 0);
	EXPECT_EQ(end, 4);
	fRobot->Type("new");
	EXPECT_EQ(Text(), "new");
}


TEST_F(TextControlTest, EnterSendsAfterAChangeOnly)
{
	Show();
	Focus();
	fRobot->Key("enter");
	EXPECT_EQ(TakeCodes(), "");
	fRobot->Type("new");
	fRobot->Key("enter");
	EXPECT_EQ(TakeCodes(), "entr ");
	fRobot->Key("enter");
	EXPECT_EQ(TakeCodes(), "");
	fRobot->Type("new");
	fRobot->Key("enter");
	EXPECT_EQ(TakeCodes(), "") << "the text is the one that was sent last";
}


TEST_F(TextControlTest, EnterSelectsAll)
{
	Show();
	Focus();
	fRobot->Type("abc");
	fRobot->Key("enter");
	fRobot->Type("d");
	EXPECT_EQ(Text(), "d");
}


TEST_F(TextControlTest, LeavingSendsAfterAChangeOnly)
{
	Show();
	Focus();
	fRobot->Key("tab");
	EXPECT_EQ(TakeCodes(), "");
	EXPECT_TRUE(Ask([this] { return fOther->TextView()->IsFocus(); }));
	fRobot->Key("shift+tab");
	fRobot->Type("new");
	fRobot->Key("tab");
	const std::vector<BMessage> received = Take();
	ASSERT_EQ(received.size(), 1u);
	EXPECT_EQ(received[0].what, 'entr');
	EXPECT_EQ(received[0].GetInt32("be:value", -1), 0);
	void* source = nullptr;
	EXPECT_EQ(received[0].FindPointer("source", &source), B_OK);
	EXPECT_EQ(static_cast<BControl*>(source), fControl);
}


TEST_F(TextControlTest, EachChangeByTheUserSendsTheModificationMessageOnce)
{
	fControl->SetModificationMessage(new BMessage('modi'));
	Show();
	Focus();
	fRobot->Type("ab");
	EXPECT_EQ(TakeCodes(), "modi modi ") << "typing over the selection is one change";
	fRobot->Key("backspace");
	EXPECT_EQ(TakeCodes(), "modi ");
	fRobot->Key("left");
	EXPECT_EQ(TakeCodes(), "");
	fRobot->Key("backspace");
	EXPECT_EQ(TakeCodes(), "") << "there is nothing to delete";
}


TEST_F(TextControlTest, SetTextCountsAsAModification)
{
	fControl->SetModificationMessage(new BMessage('modi'));
	Show();
	Do([this] { fControl->SetText("other"); });
	EXPECT_EQ(TakeCodes(), "modi ");
	Do([this] { fControl->TextView()->Insert("more"); });
	EXPECT_EQ(TakeCodes(), "modi ");
	Do([this] { fControl->SetText(nullptr); });
	EXPECT_EQ(TakeCodes(), "modi ");
	EXPECT_EQ(Text(), "");
	EXPECT_EQ(Ask([this] { return fControl->TextLength(); }), 0);
}


TEST_F(TextControlTest, InvokeIsCalledWithTheModificationMessageItself)
{
	ListeningControl* control = Add(new ListeningControl);
	Show();
	Do([control] { control->MakeFocus(); });
	fRobot->Type("x");
	EXPECT_EQ(Ask([control] { return control->changes; }), 1);
	EXPECT_EQ(Ask([control] { return control->enters; }), 0);
	fRobot->Key("enter");
	EXPECT_EQ(Ask([control] { return control->enters; }), 1);
}


TEST_F(TextControlTest, ChangeInAnswerToAChangeIsNotToldAgain)
{
	ListeningControl* control = Add(new ListeningControl);
	control->answers = true;
	Show();
	Do([control] { control->SetText("a"); });
	EXPECT_EQ(Ask([control] { return control->changes; }), 1);
	EXPECT_EQ(Ask([control] { return std::string(control->Text()); }), "a!");
}


TEST_F(TextControlTest, TabMovesOnAndIsNoText)
{
	Show();
	Focus();
	fRobot->Key("tab");
	EXPECT_EQ(Text(), "text");
	EXPECT_FALSE(Ask([this] { return fControl->TextView()->IsFocus(); }));
}


TEST_F(TextControlTest, PastedLineBreaksBecomeSpaces)
{
	Show();
	Focus();
	Do([this] {
		ASSERT_TRUE(be_clipboard->Lock());
		be_clipboard->Clear();
		be_clipboard->Data()->AddData("text/plain", B_MIME_TYPE, "a\nb\r\nc", 6);
		be_clipboard->Commit();
		be_clipboard->Unlock();
		fControl->TextView()->Paste(be_clipboard);
	});
	EXPECT_EQ(Text(), "a b  c");
}


TEST_F(TextControlTest, DisabledControlTakesNoInput)
{
	Show();
	Focus();
	Do([this] { fControl->SetEnabled(false); });
	EXPECT_FALSE(Ask([this] { return fControl->TextView()->IsFocus(); }));
	fRobot->Click(BPoint(150, 20));
	fRobot->Type("x");
	EXPECT_EQ(Text(), "text");
	Do([this] { fControl->MakeFocus(); });
	EXPECT_FALSE(Ask([this] { return fControl->TextView()->IsFocus(); }));
}


TEST_F(TextControlTest, ClickOnTheLabelFocusesTheField)
{
	Show();
	fRobot->Click(BPoint(20, 20));
	EXPECT_TRUE(Ask([this] { return fControl->TextView()->IsFocus(); }));
}


TEST_F(TextControlTest, EscapeChangesNothing)
{
	Show();
	Focus();
	fRobot->Type("abc");
	fRobot->Key("escape");
	EXPECT_EQ(Text(), "abc");
	EXPECT_TRUE(Ask([this] { return fControl->TextView()->IsFocus(); }));
}


TEST_F(TextControlTest, LongTextScrollsWithTheCaret)
{
	fControl->SetText("A text that is by far too long for the small field of the control");
	Show();
	Focus();
	fRobot->Key("end");
	BTextView* view = fControl->TextView();
	Do([view] {
		const BPoint caret = view->PointAt(view->TextLength());
		EXPECT_GT(view->Bounds().left, 0);
		EXPECT_TRUE(view->Bounds().Contains(caret));
	});
	fRobot->Key("home");
	EXPECT_EQ(Ask([view] { return view->Bounds().left; }), 0);
}


TEST_F(TextControlTest, ShortenedTextLeavesNoEmptySpace)
{
	fControl->SetText("A text that is by far too long for the small field");
	Show();
	Focus();
	fRobot->Key("end");
	for (int i = 0; i < 45; i++)
		fRobot->Key("backspace");
	EXPECT_EQ(Text(), "A tex");
	EXPECT_EQ(Ask([this] { return fControl->TextView()->Bounds().left; }), 0);
}


TEST_F(TextControlTest, RemovedControlSendsNothing)
{
	Show();
	Focus();
	fRobot->Type("changed");
	Do([this] {
		fControl->RemoveSelf();
		delete fControl;
	});
	EXPECT_EQ(TakeCodes(), "");
}


TEST_F(TextControlTest, EnterGoesToTheDefaultButton)
{
	BButton* button = Add(new BButton(BRect(10, 120, 89, 144), "b", "OK", new BMessage('push')));
	button->MakeDefault(true);
	Show();
	Focus();
	fRobot->Type("new");
	fRobot->Key("enter");
	EXPECT_EQ(TakeCodes(), "push ");
}


TEST_F(TextControlTest, AlignmentsAreKept)
{
	fControl->SetAlignment(B_ALIGN_RIGHT, B_ALIGN_CENTER);
	alignment label, text;
	fControl->GetAlignment(&label, &text);
	EXPECT_EQ(label, B_ALIGN_RIGHT);
	EXPECT_EQ(text, B_ALIGN_CENTER);
	EXPECT_EQ(fControl->TextView()->Alignment(), B_ALIGN_CENTER);
}


TEST_F(TextControlTest, ArchiveBringsBackTheState)
{
	fControl->SetDivider(40);
	fControl->SetEnabled(false);
	fControl->SetModificationMessage(new BMessage('modi'));
	BMessage archive;
	ASSERT_EQ(fControl->Archive(&archive), B_OK);
	std::unique_ptr<BArchivable> object(BTextControl::Instantiate(&archive));
	BTextControl* copy = dynamic_cast<BTextControl*>(object.get());
	ASSERT_NE(copy, nullptr);
	EXPECT_STREQ(copy->Text(), "text");
	EXPECT_STREQ(copy->Label(), "Label:");
	EXPECT_EQ(copy->Divider(), 40);
	EXPECT_FALSE(copy->IsEnabled());
	ASSERT_NE(copy->ModificationMessage(), nullptr);
	EXPECT_EQ(copy->ModificationMessage()->what, 'modi');
	EXPECT_EQ(copy->TextView()->Flags() & B_NAVIGABLE, 0u);
}

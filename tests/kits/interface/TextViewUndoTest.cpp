// SPDX-License-Identifier: MIT
// Tests of BTextView: taking back changes, and doing them again.
#include <TextView.h>

#include <Clipboard.h>

#include "ControlsFixture.h"

namespace {

class TextViewUndoTest : public ControlsTest {
protected:
	/// An editable view with this text and selection.
	void Edit(const char* text, int32 start, int32 end)
	{
		fView = Add(new BTextView(BRect(10, 10, 209, 109), "text", BRect(4, 4, 195, 95),
			B_FOLLOW_LEFT_TOP, B_WILL_DRAW | B_NAVIGABLE));
		Show();
		Do([&] {
			fView->SetText(text);
			fView->MakeFocus();
			fView->Select(start, end);
		});
	}

	std::string Text() { return TextOf(fView); }

	std::string Undo()
	{
		fRobot->Key("command+z");
		return Text();
	}

	std::string Redo()
	{
		fRobot->Key("command+shift+z");
		return Text();
	}

	BTextView* fView = nullptr;
};


// What is put in comes in upper case.
class UpperCaseView : public BTextView {
public:
	UpperCaseView()
		: BTextView(BRect(0, 0, 99, 99), "upper", BRect(0, 0, 99, 99), B_FOLLOW_NONE, B_WILL_DRAW)
	{
	}

	using BTextView::DeleteText;

protected:
	void InsertText(
		const char* text, int32 length, int32 offset, const text_run_array* runs) override
	{
		std::string upper(text, length);
		for (char& letter : upper)
			letter = static_cast<char>(toupper(letter));
		BTextView::InsertText(upper.data(), length, offset, runs);
	}
};

} // namespace


TEST_F(TextViewUndoTest, TypingIsTakenBackAndDoneAgain)
{
	Edit("one", 3, 3);
	fRobot->Type(" two");
	EXPECT_EQ(Undo(), "one");
	EXPECT_EQ(Redo(), "one two");
	EXPECT_EQ(Undo(), "one");
}


TEST_F(TextViewUndoTest, ChangesAreTakenBackOneAfterTheOther)
{
	Edit("", 0, 0);
	fRobot->Type("abc");
	fRobot->Key("left");
	fRobot->Type("d");
	Do([this] { fView->Select(0, 1); });
	fRobot->Type("X");
	EXPECT_EQ(Text(), "Xbdc");
	EXPECT_EQ(Undo(), "abdc");
	EXPECT_EQ(Undo(), "abc");
	EXPECT_EQ(Undo(), "");
	EXPECT_EQ(Undo(), "");
	EXPECT_EQ(Redo(), "abc");
	EXPECT_EQ(Redo(), "abdc");
	EXPECT_EQ(Undo(), "abc");
	EXPECT_EQ(Redo(), "abdc");
	EXPECT_EQ(Redo(), "Xbdc");
	EXPECT_EQ(Redo(), "Xbdc");
}


TEST_F(TextViewUndoTest, WhatWasDeletedComesBack)
{
	Edit("one two", 0, 4);
	fRobot->Key("delete");
	EXPECT_EQ(Text(), "two");
	EXPECT_EQ(Undo(), "one two");
}


TEST_F(TextViewUndoTest, DeletionsSideBySideAreOne)
{
	Edit("one two", 7, 7);
	for (int i = 0; i < 3; i++)
		fRobot->Key("backspace");
	fRobot->Key("home");
	fRobot->Key("delete");
	fRobot->Key("delete");
	EXPECT_EQ(Text(), "e ");
	EXPECT_EQ(Undo(), "one ");
	EXPECT_EQ(Undo(), "one two");
}


TEST_F(TextViewUndoTest, CutAndPasteAreChangesOfTheirOwn)
{
	Edit("one two", 0, 3);
	fRobot->Key("command+x");
	fRobot->Type("a");
	fRobot->Key("command+v");
	fRobot->Type("b");
	EXPECT_EQ(Text(), "aoneb two");
	EXPECT_EQ(Undo(), "aone two");
	EXPECT_EQ(Undo(), "a two");
	EXPECT_EQ(Undo(), " two");
	EXPECT_EQ(Undo(), "one two");
}


TEST_F(TextViewUndoTest, AnotherChangeEndsWhatCouldBeDoneAgain)
{
	Edit("", 0, 0);
	fRobot->Type("one");
	Undo();
	fRobot->Type("two");
	EXPECT_EQ(Redo(), "two");
	EXPECT_EQ(Undo(), "");
}


TEST_F(TextViewUndoTest, NothingIsTakenBackInATextThatIsOnlyRead)
{
	Edit("", 0, 0);
	fRobot->Type("one");
	Do([this] { fView->MakeEditable(false); });
	EXPECT_EQ(Undo(), "one");
	Do([this] { fView->MakeEditable(true); });
	EXPECT_EQ(Undo(), "");
}


TEST_F(TextViewUndoTest, NothingIsTakenBackWithoutUndo)
{
	Edit("one", 3, 3);
	Do([this] { fView->SetDoesUndo(false); });
	fRobot->Key("backspace");
	EXPECT_EQ(Undo(), "on");
	Do([this] { fView->SetDoesUndo(true); });
	EXPECT_EQ(Undo(), "on");
	EXPECT_EQ(Redo(), "on");
}


TEST_F(TextViewUndoTest, SetTextEndsWhatCouldBeTakenBack)
{
	Edit("", 0, 0);
	fRobot->Type("one");
	Do([this] { fView->SetText("two"); });
	EXPECT_EQ(Undo(), "two");
}


TEST_F(TextViewUndoTest, WhatTheLimitCutOffDoesNotComeBack)
{
	Edit("", 0, 0);
	fRobot->Type("one two");
	Do([this] { fView->SetMaxBytes(3); });
	EXPECT_EQ(Undo(), "one");
}


TEST_F(TextViewUndoTest, MessagesTakeBackAndDoAgain)
{
	Edit("", 0, 0);
	fRobot->Type("one");
	Do([this] { fWindow->PostMessage(B_UNDO, fView); });
	EXPECT_EQ(Text(), "");
	Do([this] { fWindow->PostMessage(B_REDO, fView); });
	EXPECT_EQ(Text(), "one");
}


TEST_F(TextViewUndoTest, ProgramsShortcutsComeFirst)
{
	fWindow->AddShortcut('z', B_COMMAND_KEY | B_SHIFT_KEY, new BMessage('mine'));
	Edit("", 0, 0);
	fRobot->Type("one");
	Undo();
	EXPECT_EQ(Redo(), "");
	EXPECT_EQ(TakeCodes(), "mine ");
}


TEST_F(TextViewUndoTest, ChangesThatASubclassMakesAreTakenBackAsTheyAre)
{
	UpperCaseView view;
	view.Insert(0, "one", 3);
	view.Insert(3, "two", 3);
	EXPECT_STREQ(view.Text(), "ONETWO");
	view.Undo(NULL);
	EXPECT_STREQ(view.Text(), "ONE");
	view.Undo(NULL);
	EXPECT_STREQ(view.Text(), "");
}


TEST_F(TextViewUndoTest, ChangesBehindItsBackEndTheHistory)
{
	UpperCaseView view;
	view.Insert(0, "one", 3);
	view.Insert(3, "two", 3);
	view.DeleteText(0, 4);
	view.Undo(NULL);
	EXPECT_STREQ(view.Text(), "WO");
	view.Insert(2, "x", 1);
	view.Undo(NULL);
	EXPECT_STREQ(view.Text(), "WO");
	view.Undo(NULL);
	EXPECT_STREQ(view.Text(), "WO");
}


TEST_F(TextViewUndoTest, ManyChangesAreKept)
{
	BTextView view(BRect(0, 0, 99, 99), "many", BRect(0, 0, 99, 99), B_FOLLOW_NONE, B_WILL_DRAW);
	for (int i = 0; i < 200; i++)
		view.Insert(0, "a", 1);
	for (int i = 0; i < 199; i++)
		view.Undo(NULL);
	EXPECT_STREQ(view.Text(), "a");
}

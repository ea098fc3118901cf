// SPDX-License-Identifier: MIT
// Tests of BTextView and BTextControl: what is selected is dragged to another place, to another view.
#include <TextView.h>

#include <TextControl.h>

#include "ControlsFixture.h"

namespace {

/// Keeps what is dropped on it.
class DropSink : public BView {
public:
	DropSink()
		: BView(BRect(200, 150, 290, 190), "sink", B_FOLLOW_NONE, 0)
	{
	}

	void MessageReceived(BMessage* message) override
	{
		if (message->WasDropped())
			dropped.push_back(*message);
		else
			BView::MessageReceived(message);
	}

	std::vector<BMessage> dropped;
};


class TextDropTest : public ControlsTest {
protected:
	void SetUp() override
	{
		ControlsTest::SetUp();
		fFirst = AddView("first", 10);
		fSecond = AddView("second", 70);
		fSink = Add(new DropSink);
	}

	BTextView* AddView(const char* name, float top)
	{
		return Add(new BTextView(BRect(10, top, 290, top + 50), name, BRect(4, 4, 276, 46),
			B_FOLLOW_NONE, B_WILL_DRAW | B_NAVIGABLE));
	}

	/// With the first view's text, of which a part is selected.
	void Show(const char* text, int32 start, int32 end)
	{
		ControlsTest::Show();
		Do([&] {
			fFirst->SetText(text);
			fFirst->MakeFocus();
			fFirst->Select(start, end);
		});
	}

	/// A little to the right of where the character at the offset begins, in the window.
	BPoint PlaceOf(BTextView* view, int32 offset)
	{
		return Ask([&] {
			return fWindow->ConvertFromScreen(
				view->ConvertToScreen(view->PointAt(offset) + BPoint(1, 5)));
		});
	}

	void Drag(BTextView* from, int32 start, BTextView* to, int32 end)
	{
		fRobot->Drag(PlaceOf(from, start), PlaceOf(to, end));
		fRobot->Settle();
	}

	/// "START END" of the selection.
	std::string Selection(BTextView* view)
	{
		return Ask([view] {
			int32 start, end;
			view->GetSelection(&start, &end);
			return std::to_string(start) + " " + std::to_string(end);
		});
	}

	BTextView* fFirst = nullptr;
	BTextView* fSecond = nullptr;
	DropSink* fSink = nullptr;
};

} // namespace


TEST_F(TextDropTest, WhatIsDraggedWithinAViewMoves)
{
	const struct {
		int32 start, end, press, drop;
		const char* text;
		const char* selection;
	} kMoves[] = {
		// Each press is far enough from the last one to be no double click.
		{4, 8, 5, 0, "two one three four", "0 4"},
		{4, 8, 7, 14, "one three two four", "10 14"},
		{4, 8, 5, 18, "one three fourtwo ", "14 18"},
		{0, 4, 1, 8, "two one three four", "4 8"},
		{14, 18, 16, 4, "one fourtwo three ", "4 8"},
	};
	Show("", 0, 0);
	for (const auto& move : kMoves) {
		Do([&] {
			fFirst->SetText("one two three four");
			fFirst->Select(move.start, move.end);
		});
		Drag(fFirst, move.press, fFirst, move.drop);
		EXPECT_EQ(TextOf(fFirst), move.text);
		EXPECT_EQ(Selection(fFirst), move.selection);
	}
}


TEST_F(TextDropTest, AMoveIsTakenBackAtOnce)
{
	Show("one two three", 4, 8);
	Drag(fFirst, 5, fFirst, 0);
	ASSERT_EQ(TextOf(fFirst), "two one three");
	EXPECT_TRUE(fRobot->Key("command+z"));
	EXPECT_EQ(TextOf(fFirst), "one two three");
	EXPECT_TRUE(fRobot->Key("command+shift+z"));
	EXPECT_EQ(TextOf(fFirst), "two one three");
}


TEST_F(TextDropTest, WhatIsDroppedOnItselfStays)
{
	Show("one two three", 4, 8);
	Drag(fFirst, 4, fFirst, 7);
	EXPECT_EQ(TextOf(fFirst), "one two three");
	EXPECT_EQ(Selection(fFirst), "4 8");
}


TEST_F(TextDropTest, WhatIsDraggedToAnotherViewIsCopied)
{
	Show("one two three", 4, 8);
	Do([this] { fSecond->SetText("[]"); });
	Drag(fFirst, 5, fSecond, 1);
	EXPECT_EQ(TextOf(fFirst), "one two three");
	EXPECT_EQ(Selection(fFirst), "4 8");
	EXPECT_EQ(TextOf(fSecond), "[two ]");
	// It is not the other view's own because it came from it once.
	Do([this] {
		fSecond->MakeFocus();
		fSecond->Select(1, 5);
	});
	Drag(fSecond, 2, fFirst, 0);
	EXPECT_EQ(TextOf(fFirst), "two one two three");
	EXPECT_EQ(TextOf(fSecond), "[two ]");
}


TEST_F(TextDropTest, LinesAreDraggedAsTheyAre)
{
	Show("one\ntwo\nthree", 2, 9);
	// In the second line, the whole of which is marked.
	Drag(fFirst, 5, fSecond, 0);
	EXPECT_EQ(TextOf(fSecond), "e\ntwo\nt");
}


TEST_F(TextDropTest, TheDragIsPlainTextForAnyView)
{
	Show("one two three", 4, 7);
	fRobot->Drag(PlaceOf(fFirst, 5), BPoint(240, 170));
	const std::vector<BMessage> dropped = Ask([this] { return fSink->dropped; });
	ASSERT_EQ(dropped.size(), 1u);
	EXPECT_EQ(dropped[0].what, static_cast<uint32>(B_MIME_DATA));
	const void* data = nullptr;
	ssize_t size = 0;
	ASSERT_EQ(dropped[0].FindData("text/plain", B_MIME_TYPE, &data, &size), B_OK);
	EXPECT_EQ(std::string(static_cast<const char*>(data), size), "two");
	EXPECT_EQ(TextOf(fFirst), "one two three");
}


TEST_F(TextDropTest, AClickOnTheSelectionPutsTheCaretThere)
{
	Show("one two three", 4, 12);
	fRobot->Click(PlaceOf(fFirst, 6));
	EXPECT_EQ(Selection(fFirst), "6 6");
	EXPECT_TRUE(fRobot->Key("x"));
	EXPECT_EQ(TextOf(fFirst), "one twxo three");
}


TEST_F(TextDropTest, TheCaretGoesThereWhenTheButtonIsReleased)
{
	Show("one two three", 4, 12);
	fRobot->MoveTo(PlaceOf(fFirst, 6));
	fRobot->Press();
	EXPECT_EQ(Selection(fFirst), "4 12");
	fRobot->Release();
	EXPECT_EQ(Selection(fFirst), "6 6");
}


TEST_F(TextDropTest, AShortWayIsAClick)
{
	Show("one two three", 4, 12);
	const BPoint place = PlaceOf(fFirst, 6);
	fRobot->Drag(place, place + BPoint(3, 3));
	EXPECT_EQ(Selection(fFirst), "6 6");
	EXPECT_EQ(TextOf(fFirst), "one two three");
}


TEST_F(TextDropTest, ADoubleClickOnTheSelectionSelectsTheWord)
{
	Show("one two three", 0, 13);
	fRobot->Click(PlaceOf(fFirst, 5), 2);
	EXPECT_EQ(Selection(fFirst), "4 7");
}


TEST_F(TextDropTest, APressBesideTheSelectionSelectsAnew)
{
	Show("one two three", 4, 7);
	Drag(fFirst, 8, fFirst, 11);
	EXPECT_EQ(Selection(fFirst), "8 11");
	// Behind the end of a line, where nothing is marked.
	Do([this] { fFirst->Select(8, 13); });
	fRobot->Drag(PlaceOf(fFirst, 13) + BPoint(60, 0), PlaceOf(fFirst, 2));
	EXPECT_EQ(Selection(fFirst), "2 13");
	// With Shift the selection reaches to the press.
	Do([this] { fFirst->Select(4, 12); });
	fRobot->Hold(B_SHIFT_KEY);
	fRobot->Click(PlaceOf(fFirst, 8));
	fRobot->Hold(0);
	EXPECT_EQ(Selection(fFirst), "4 8");
	EXPECT_EQ(TextOf(fFirst), "one two three");
}


TEST_F(TextDropTest, APressThatGivesTheFocusSelectsAnew)
{
	Show("one two three", 0, 13);
	Do([this] { fSecond->MakeFocus(); });
	Drag(fFirst, 4, fFirst, 7);
	EXPECT_EQ(Selection(fFirst), "4 7");
	EXPECT_EQ(TextOf(fFirst), "one two three");
}


TEST_F(TextDropTest, OtherButtonsDragNothing)
{
	Show("one two three", 4, 8);
	fRobot->MoveTo(PlaceOf(fFirst, 5));
	fRobot->Press(B_SECONDARY_MOUSE_BUTTON);
	fRobot->MoveTo(PlaceOf(fSecond, 0));
	fRobot->Release();
	EXPECT_EQ(TextOf(fSecond), "");
}


TEST_F(TextDropTest, EscapeEndsTheDrag)
{
	Show("one two three", 4, 8);
	fRobot->MoveTo(PlaceOf(fFirst, 5));
	fRobot->Press();
	fRobot->MoveTo(PlaceOf(fSecond, 0));
	EXPECT_TRUE(fRobot->Key("escape"));
	fRobot->Release();
	EXPECT_EQ(TextOf(fFirst), "one two three");
	EXPECT_EQ(Selection(fFirst), "4 8");
	EXPECT_EQ(TextOf(fSecond), "");
}


TEST_F(TextDropTest, ReadOnlyTextCanBeDraggedAndTakesNothing)
{
	Show("one two three", 4, 8);
	Do([this] { fFirst->MakeEditable(false); });
	Drag(fFirst, 5, fSecond, 0);
	EXPECT_EQ(TextOf(fSecond), "two ");
	Drag(fFirst, 5, fFirst, 0);
	EXPECT_EQ(TextOf(fFirst), "one two three");
	Do([this] {
		fSecond->MakeFocus();
		fSecond->SelectAll();
	});
	Drag(fSecond, 1, fFirst, 0);
	EXPECT_EQ(TextOf(fFirst), "one two three");
}


TEST_F(TextDropTest, HiddenTextIsNotDragged)
{
	fFirst->HideTyping(true);
	Show("secret", 0, 6);
	Drag(fFirst, 2, fSecond, 0);
	EXPECT_EQ(TextOf(fSecond), "");
}


TEST_F(TextDropTest, TextMovesInAFullViewAndNoneIsAdded)
{
	Show("one two three", 4, 8);
	Do([this] {
		fFirst->SetMaxBytes(13);
		fSecond->SetMaxBytes(3);
	});
	Drag(fFirst, 5, fFirst, 0);
	EXPECT_EQ(TextOf(fFirst), "two one three");
	Drag(fFirst, 1, fSecond, 0);
	EXPECT_EQ(TextOf(fSecond), "");
}


TEST_F(TextDropTest, StylesGoAlong)
{
	constexpr rgb_color kRed = {200, 0, 0, 255};
	Show("one two three", 4, 8);
	Do([&] {
		fFirst->SetStylable(true);
		fSecond->SetStylable(true);
		fFirst->SetFontAndColor(5, 7, nullptr, 0, &kRed);
	});
	const auto Colors = [](BTextView* view) {
		std::string colors;
		for (int32 i = 0; i < view->TextLength(); i++) {
			rgb_color color;
			view->GetFontAndColor(i, nullptr, &color);
			colors += color.red == 200 ? 'r' : '.';
		}
		return colors;
	};
	Drag(fFirst, 5, fSecond, 0);
	EXPECT_EQ(TextOf(fSecond), "two ");
	EXPECT_EQ(Ask([&] { return Colors(fSecond); }), ".rr.");
	Drag(fFirst, 7, fFirst, 0);
	EXPECT_EQ(TextOf(fFirst), "two one three");
	EXPECT_EQ(Ask([&] { return Colors(fFirst); }), ".rr..........");
	Drag(fFirst, 1, fFirst, 13);
	EXPECT_EQ(TextOf(fFirst), "one threetwo ");
	EXPECT_EQ(Ask([&] { return Colors(fFirst); }), "..........rr.");
	EXPECT_TRUE(fRobot->Key("command+z"));
	EXPECT_EQ(Ask([&] { return Colors(fFirst); }), ".rr..........");
}


TEST_F(TextDropTest, ATextControlTakesALineAndTellsOfTheChange)
{
	BTextControl* control = Add(
		new BTextControl(BRect(10, 130, 180, 160), "control", nullptr, "ab", new BMessage('sent')));
	control->SetModificationMessage(new BMessage('modi'));
	Show("one\ntwo", 2, 5);
	Drag(fFirst, 2, control->TextView(), 1);
	EXPECT_EQ(TextOf(control->TextView()), "ae tb");
	const std::vector<BMessage> sent = Take();
	ASSERT_EQ(sent.size(), 1u);
	EXPECT_EQ(sent[0].what, static_cast<uint32>('modi'));

	// The press that gives the control the focus selects all, and drags nothing.
	Drag(control->TextView(), 1, control->TextView(), 3);
	EXPECT_EQ(Selection(control->TextView()), "1 3");
	EXPECT_EQ(TextOf(control->TextView()), "ae tb");
	Drag(control->TextView(), 2, control->TextView(), 5);
	EXPECT_EQ(TextOf(control->TextView()), "atbe ");
}


TEST_F(TextDropTest, ADisabledTextControlTakesNothing)
{
	BTextControl* control =
		Add(new BTextControl(BRect(10, 130, 180, 160), "control", nullptr, "ab", nullptr));
	control->SetEnabled(false);
	Show("one two", 4, 7);
	Drag(fFirst, 5, control->TextView(), 1);
	EXPECT_EQ(TextOf(control->TextView()), "ab");
}

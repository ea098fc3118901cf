// SPDX-License-Identifier: MIT
// Tests of BTextView: text, selection, lines, keys, mouse, clipboard.
#include <TextView.h>

#include <cmath>

#include <Clipboard.h>

#include "ControlsFixture.h"

namespace {

class TextViewTest : public ControlsTest {
protected:
	void SetUp() override
	{
		ControlsTest::SetUp();
		fView = Add(new BTextView(BRect(10, 10, 209, 109), "text", BRect(4, 4, 195, 95),
			B_FOLLOW_LEFT_TOP, B_WILL_DRAW | B_NAVIGABLE));
	}

	void Edit(const char* text, int32 start, int32 end)
	{
		Show();
		Do([&] {
			fView->SetText(text);
			fView->MakeFocus();
			fView->Select(start, end);
		});
	}

	std::string Text() { return TextOf(fView); }

	std::string Selection()
	{
		return Ask([this] {
			int32 start, end;
			fView->GetSelection(&start, &end);
			return std::to_string(start) + "-" + std::to_string(end);
		});
	}

	void SetClipboard(const std::string& text)
	{
		ASSERT_TRUE(be_clipboard->Lock());
		be_clipboard->Clear();
		be_clipboard->Data()->AddData("text/plain", B_MIME_TYPE, text.data(), text.size());
		be_clipboard->Commit();
		be_clipboard->Unlock();
	}

	std::string Clipboard()
	{
		const void* data = nullptr;
		ssize_t size = 0;
		std::string text;
		if (be_clipboard->Lock()) {
			if (be_clipboard->Data()->FindData("text/plain", B_MIME_TYPE, &data, &size) == B_OK)
				text.assign(static_cast<const char*>(data), size);
			be_clipboard->Unlock();
		}
		return text;
	}

	BTextView* fView = nullptr;
};


// Writes down what passes the hooks.
class HookedView : public BTextView {
public:
	HookedView()
		: BTextView(BRect(0, 0, 99, 99), "hooked", BRect(0, 0, 99, 99), B_FOLLOW_NONE, B_WILL_DRAW)
	{
	}

	std::string log;

protected:
	void InsertText(
		const char* text, int32 length, int32 offset, const text_run_array* runs) override
	{
		log += "+" + std::to_string(offset) + std::string(text, length);
		BTextView::InsertText(text, length, offset, runs);
	}

	void DeleteText(int32 from, int32 to) override
	{
		log += "-" + std::to_string(from) + "," + std::to_string(to);
		BTextView::DeleteText(from, to);
	}
};

} // namespace


TEST_F(TextViewTest, NewViewHasTheDocumentedState)
{
	EXPECT_STREQ(fView->Text(), "");
	EXPECT_EQ(fView->TextLength(), 0);
	EXPECT_EQ(fView->CountLines(), 1);
	EXPECT_TRUE(fView->IsEditable());
	EXPECT_TRUE(fView->IsSelectable());
	EXPECT_FALSE(fView->IsStylable());
	EXPECT_TRUE(fView->DoesWordWrap());
	EXPECT_TRUE(fView->DoesUndo());
	EXPECT_EQ(fView->Alignment(), B_ALIGN_LEFT);
}


TEST_F(TextViewTest, SetTextTakesItsOwnText)
{
	fView->SetText("own text");
	fView->SetText(fView->Text() + 4);
	EXPECT_STREQ(fView->Text(), "text");
	fView->Insert(0, fView->Text(), fView->TextLength());
	EXPECT_STREQ(fView->Text(), "texttext");
}


TEST_F(TextViewTest, SetTextTakesNoMoreThanItsLength)
{
	fView->SetText("abcdef", 3);
	EXPECT_STREQ(fView->Text(), "abc");
	fView->SetText("ab", 100);
	EXPECT_STREQ(fView->Text(), "ab");
	fView->SetText(nullptr);
	EXPECT_STREQ(fView->Text(), "");
}


TEST_F(TextViewTest, InsertPutsTheTextAtTheSelection)
{
	fView->SetText("ad");
	fView->Select(1, 1);
	fView->Insert("bc");
	EXPECT_STREQ(fView->Text(), "abcd");
	int32 start, end;
	fView->GetSelection(&start, &end);
	EXPECT_EQ(start, 3);
	EXPECT_EQ(end, 3);
}


TEST_F(TextViewTest, InsertBeyondTheEndAppends)
{
	fView->SetText("ab");
	fView->Insert(99, "c", 1);
	EXPECT_STREQ(fView->Text(), "abc");
	fView->Insert(-5, "_", 1);
	EXPECT_STREQ(fView->Text(), "_abc");
}


TEST_F(TextViewTest, DeleteTakesARange)
{
	fView->SetText("abcdef");
	fView->Delete(1, 3);
	EXPECT_STREQ(fView->Text(), "adef");
	fView->Delete(2, 99);
	EXPECT_STREQ(fView->Text(), "ad");
	fView->Delete(2, 1);
	EXPECT_STREQ(fView->Text(), "ad");
}


TEST_F(TextViewTest, GetTextStaysWithinTheText)
{
	fView->SetText("abcdef");
	char buffer[16];
	fView->GetText(2, 3, buffer);
	EXPECT_STREQ(buffer, "cde");
	fView->GetText(4, 10, buffer);
	EXPECT_STREQ(buffer, "ef");
	fView->GetText(9, 3, buffer);
	EXPECT_STREQ(buffer, "");
}


TEST_F(TextViewTest, EveryChangePassesTheHooks)
{
	HookedView view;
	view.SetText("abc");
	view.Insert(1, "x", 1);
	view.Delete(0, 2);
	view.SetText("z");
	EXPECT_EQ(view.log, "+0abc+1x-0,2-0,2+0z");
}


TEST_F(TextViewTest, TypingReplacesTheSelection)
{
	Edit("hello", 1, 4);
	fRobot->Type("X");
	EXPECT_EQ(Text(), "hXo");
	EXPECT_EQ(Selection(), "2-2");
}


TEST_F(TextViewTest, KeysMoveAndSelectByCharacters)
{
	Edit("aä ö.", 1, 1);
	ASSERT_EQ(Text().size(), 7u);
	fRobot->Key("right");
	EXPECT_EQ(Selection(), "3-3") << "over both bytes of the umlaut";
	fRobot->Key("shift+right");
	fRobot->Key("shift+right");
	EXPECT_EQ(Selection(), "3-6");
	fRobot->Key("left");
	EXPECT_EQ(Selection(), "3-3") << "without Shift to the selection's edge";
	fRobot->Key("shift+end");
	EXPECT_EQ(Selection(), "3-7");
	fRobot->Key("right");
	EXPECT_EQ(Selection(), "7-7");
	fRobot->Key("control+left");
	EXPECT_EQ(Selection(), "4-4");
	fRobot->Key("home");
	EXPECT_EQ(Selection(), "0-0");
	fRobot->Key("left");
	EXPECT_EQ(Selection(), "0-0");
	fRobot->Key("control+right");
	EXPECT_EQ(Selection(), "3-3");
}


TEST_F(TextViewTest, BackspaceAndDeleteTakeWholeCharacters)
{
	Edit("aäb", 3, 3);
	fRobot->Key("backspace");
	EXPECT_EQ(Text(), "ab");
	fRobot->Key("delete");
	EXPECT_EQ(Text(), "a");
	fRobot->Key("delete");
	EXPECT_EQ(Text(), "a");
	fRobot->Key("backspace");
	fRobot->Key("backspace");
	EXPECT_EQ(Text(), "");
}


TEST_F(TextViewTest, InvalidBytesAreSteppedOverOneByOne)
{
	Edit("a\xff\xc3"
		 "b",
		4, 4);
	fRobot->Key("left");
	fRobot->Key("left");
	EXPECT_EQ(Selection(), "2-2");
	fRobot->Key("backspace");
	EXPECT_EQ(Text(),
		"a\xc3"
		"b");
}


TEST_F(TextViewTest, UpAndDownKeepTheColumn)
{
	Edit("long line\nab\nlong line", 6, 6);
	fRobot->Key("down");
	EXPECT_EQ(Selection(), "12-12");
	fRobot->Key("down");
	EXPECT_EQ(Selection(), "19-19");
	fRobot->Key("down");
	EXPECT_EQ(Selection(), "22-22");
	fRobot->Key("up");
	fRobot->Key("up");
	fRobot->Key("up");
	EXPECT_EQ(Selection(), "0-0");
}


TEST_F(TextViewTest, EnterBreaksTheLineAndTabIsText)
{
	Edit("ab", 1, 1);
	fRobot->Key("enter");
	fRobot->Key("tab");
	EXPECT_EQ(Text(), "a\n\tb");
	EXPECT_EQ(Ask([this] { return fView->CountLines(); }), 2);
	EXPECT_EQ(Ask([this] { return fView->CurrentLine(); }), 1);
}


TEST_F(TextViewTest, AutoindentRepeatsTheBlanksOfTheLine)
{
	fView->SetAutoindent(true);
	Edit("\t  ab", 5, 5);
	fRobot->Key("enter");
	EXPECT_EQ(Text(), "\t  ab\n\t  ");
}


TEST_F(TextViewTest, ControlKeysAreNoText)
{
	Edit("ab", 1, 1);
	fRobot->Key("escape");
	fRobot->Key("insert");
	fRobot->Key("f5");
	EXPECT_EQ(Text(), "ab");
}


TEST_F(TextViewTest, ReadOnlyTextIsSelectedAndCopiedButNotChanged)
{
	fView->MakeEditable(false);
	Edit("some text", 5, 9);
	fRobot->Type("x");
	fRobot->Key("backspace");
	fRobot->Key("command+x");
	EXPECT_EQ(Text(), "some text");
	fRobot->Key("command+c");
	EXPECT_EQ(Clipboard(), "text");
	fRobot->Key("command+v");
	EXPECT_EQ(Text(), "some text");
}


TEST_F(TextViewTest, TabInReadOnlyTextNavigates)
{
	BTextView* next = Add(new BTextView(BRect(10, 120, 209, 139), "next", BRect(0, 0, 199, 19),
		B_FOLLOW_LEFT_TOP, B_WILL_DRAW | B_NAVIGABLE));
	fView->MakeEditable(false);
	Edit("some text", 0, 0);
	fRobot->Key("tab");
	EXPECT_TRUE(Ask([next] { return next->IsFocus(); }));
}


TEST_F(TextViewTest, ClipboardShortcutsWork)
{
	Edit("one two", 0, 3);
	fRobot->Key("command+c");
	EXPECT_EQ(Clipboard(), "one");
	fRobot->Key("command+x");
	EXPECT_EQ(Text(), " two");
	fRobot->Key("end");
	fRobot->Key("command+v");
	EXPECT_EQ(Text(), " twoone");
	fRobot->Key("command+a");
	EXPECT_EQ(Selection(), "0-7");
}


TEST_F(TextViewTest, CopyOfNothingKeepsTheClipboard)
{
	Edit("text", 2, 2);
	SetClipboard("kept");
	fRobot->Key("command+c");
	fRobot->Key("command+x");
	EXPECT_EQ(Clipboard(), "kept");
	EXPECT_EQ(Text(), "text");
}


TEST_F(TextViewTest, AcceptsPasteOfTextOnly)
{
	SetClipboard("text");
	EXPECT_TRUE(fView->AcceptsPaste(be_clipboard));
	fView->MakeEditable(false);
	EXPECT_FALSE(fView->AcceptsPaste(be_clipboard));
	fView->MakeEditable(true);
	ASSERT_TRUE(be_clipboard->Lock());
	be_clipboard->Clear();
	be_clipboard->Commit();
	be_clipboard->Unlock();
	EXPECT_FALSE(fView->AcceptsPaste(be_clipboard));
}


TEST_F(TextViewTest, SetMaxBytesCutsAtACharacter)
{
	fView->SetText("abä");
	fView->SetMaxBytes(3);
	EXPECT_STREQ(fView->Text(), "ab");
	EXPECT_EQ(fView->MaxBytes(), 3);
	fView->SetText("longer");
	EXPECT_STREQ(fView->Text(), "longer") << "the limit is the user's only";
}


TEST_F(TextViewTest, WhatGoesBeyondTheLimitIsRefusedAsAWhole)
{
	Edit("abc", 3, 3);
	Do([this] { fView->SetMaxBytes(4); });
	SetClipboard("xy");
	fRobot->Key("command+v");
	EXPECT_EQ(Text(), "abc");
	fRobot->Type("de");
	EXPECT_EQ(Text(), "abcd");
	fRobot->Key("command+a");
	fRobot->Key("command+v");
	EXPECT_EQ(Text(), "xy");
}


TEST_F(TextViewTest, DisallowedCharactersAreRefused)
{
	fView->DisallowChar('x');
	fView->DisallowChar(0xe4);
	Edit("", 0, 0);
	fRobot->Type("axä");
	EXPECT_EQ(Text(), "a");
	SetClipboard("bxc");
	fRobot->Key("command+v");
	EXPECT_EQ(Text(), "a");
	Do([this] { fView->AllowChar('x'); });
	fRobot->Type("x");
	EXPECT_EQ(Text(), "ax");
}


TEST_F(TextViewTest, LinesBreakBetweenWords)
{
	fView->SetText("aaaa bbbb cccc dddd eeee ffff gggg hhhh iiii jjjj kkkk llll mmmm");
	ASSERT_GT(fView->CountLines(), 1);
	for (int32 line = 1; line < fView->CountLines(); line++) {
		EXPECT_EQ(fView->Text()[fView->OffsetAt(line) - 1], ' ') << line;
		EXPECT_LE(fView->LineWidth(line), 196) << line;
	}
	fView->SetWordWrap(false);
	EXPECT_EQ(fView->CountLines(), 1);
}


TEST_F(TextViewTest, LinesAreThoseOfTheWholeTextAfterEachChange)
{
	const char* const kPieces[] = {"a", "\n", "two words ", "\n\n", "ä", "\t",
		"several words that do not fit into one line\nand some more of them "};
	uint32 random = 1;
	const auto next = [&random](uint32 limit) {
		random = random * 1103515245 + 12345;
		return static_cast<int32>((random >> 16) % limit);
	};
	BTextView whole(BRect(0, 0, 199, 99), "whole", BRect(4, 4, 195, 95), B_FOLLOW_NONE, 0);
	for (int round = 0; round < 300; round++) {
		const int32 offset = next(fView->TextLength() + 1);
		if (next(3) == 0)
			fView->Delete(offset, offset + next(30));
		else
			fView->Insert(offset, kPieces[next(B_COUNT_OF(kPieces))], 100);

		whole.SetText(fView->Text());
		ASSERT_EQ(fView->CountLines(), whole.CountLines()) << round << ": " << fView->Text();
		for (int32 line = 0; line < whole.CountLines(); line++)
			ASSERT_EQ(fView->OffsetAt(line), whole.OffsetAt(line)) << round << ", line " << line;
	}
}


TEST_F(TextViewTest, WordWiderThanTheLineIsBroken)
{
	fView->SetText("mmmmmmmmmmmmmmmmmmmmmmmmmmmmmmmmmmmmmmmmmmmmmm");
	EXPECT_GT(fView->CountLines(), 1);
	EXPECT_LE(fView->LineWidth(0), 191);
	fView->SetTextRect(BRect(0, 0, 0, 10));
	EXPECT_EQ(fView->CountLines(), 46) << "one character a line at least";
}


TEST_F(TextViewTest, LongWordThatFitsIsNotBroken)
{
	std::string word;
	for (int i = 0; i < 100; i++)
		word += "ä";
	fView->SetTextRect(BRect(0, 0, std::ceil(fView->StringWidth(word.c_str())), 10));
	fView->SetText(("a " + word + " b").c_str());
	ASSERT_EQ(fView->CountLines(), 3);
	EXPECT_EQ(fView->OffsetAt(static_cast<int32>(1)), 2);
	EXPECT_EQ(fView->OffsetAt(static_cast<int32>(2)), 203);
}


TEST_F(TextViewTest, EndOfABrokenLineStaysInIt)
{
	Edit("aaaa bbbb cccc dddd eeee ffff gggg hhhh iiii jjjj kkkk llll mmmm", 0, 0);
	fRobot->Key("end");
	EXPECT_EQ(Ask([this] { return fView->CurrentLine(); }), 0);
}


TEST_F(TextViewTest, LinesAndOffsetsAgree)
{
	fView->SetText("ab\n\ncd\n");
	EXPECT_EQ(fView->CountLines(), 4);
	EXPECT_EQ(fView->LineAt(static_cast<int32>(2)), 0);
	EXPECT_EQ(fView->LineAt(static_cast<int32>(3)), 1);
	EXPECT_EQ(fView->LineAt(static_cast<int32>(7)), 3);
	EXPECT_EQ(fView->OffsetAt(static_cast<int32>(2)), 4);
	EXPECT_EQ(fView->OffsetAt(static_cast<int32>(9)), 7);
	const float height = fView->LineHeight();
	EXPECT_EQ(fView->TextHeight(0, 3), 4 * height);
	EXPECT_EQ(fView->TextHeight(1, 1), height);
	EXPECT_EQ(fView->PointAt(4), BPoint(4, 4 + 2 * height));
}


TEST_F(TextViewTest, PointsAndOffsetsAgree)
{
	fView->SetText("aä€mi\nsecond\tline");
	for (const int32 offset : {0, 1, 3, 6, 7, 8, 9, 14, 15, 16, 20}) {
		float height;
		BPoint point = fView->PointAt(offset, &height);
		point.y += height / 2;
		EXPECT_EQ(fView->OffsetAt(point), offset);
	}
	EXPECT_EQ(fView->OffsetAt(BPoint(500, 5)), 8);
	EXPECT_EQ(fView->OffsetAt(BPoint(-5, -5)), 0);
	EXPECT_EQ(fView->OffsetAt(BPoint(5, 500)), fView->TextLength());
}


TEST_F(TextViewTest, AlignedLinesEndAtTheTextRect)
{
	fView->SetText("ab\nabcd");
	fView->SetAlignment(B_ALIGN_RIGHT);
	EXPECT_NEAR(fView->PointAt(0).x + fView->LineWidth(0), 195, 1);
	EXPECT_NEAR(fView->PointAt(3).x + fView->LineWidth(1), 195, 1);
	fView->SetAlignment(B_ALIGN_CENTER);
	EXPECT_NEAR(fView->PointAt(0).x + fView->LineWidth(0) / 2, 99.5f, 1);
}


TEST_F(TextViewTest, ClickPutsTheCaretThere)
{
	Edit("hello world", 0, 0);
	const BPoint where = Ask([this] { return fView->ConvertToParent(fView->PointAt(5)); });
	fRobot->Click(where + BPoint(1, 5));
	EXPECT_EQ(Selection(), "5-5");
}


TEST_F(TextViewTest, DraggingSelects)
{
	Edit("hello world", 0, 0);
	const BPoint from = Ask([this] { return fView->ConvertToParent(fView->PointAt(2)); });
	const BPoint to = Ask([this] { return fView->ConvertToParent(fView->PointAt(8)); });
	fRobot->Drag(from + BPoint(1, 5), to + BPoint(1, 5));
	EXPECT_EQ(Selection(), "2-8");
	fRobot->Drag(to + BPoint(1, 5), from + BPoint(1, 5));
	EXPECT_EQ(Selection(), "2-8");
}


TEST_F(TextViewTest, DoubleClickSelectsTheWordAndTripleClickTheLine)
{
	Edit("hello world\nagain", 0, 0);
	const BPoint where = Ask([this] { return fView->ConvertToParent(fView->PointAt(8)); });
	fRobot->Click(where + BPoint(1, 5), 2);
	EXPECT_EQ(Selection(), "6-11");
	fRobot->Click(where + BPoint(1, 5), 3);
	EXPECT_EQ(Selection(), "0-11");
}


TEST_F(TextViewTest, CaretIsKeptInView)
{
	Edit("1\n2\n3\n4\n5\n6\n7\n8\n9\n10\n11\n12", 0, 0);
	for (int i = 0; i < 11; i++)
		fRobot->Key("down");
	Do([this] {
		float height;
		const BPoint caret = fView->PointAt(fView->TextLength(), &height);
		EXPECT_GT(fView->Bounds().top, 0);
		EXPECT_LE(caret.y + height, fView->Bounds().bottom + 1);
	});
	fRobot->Key("control+home");
	EXPECT_EQ(Ask([this] { return fView->Bounds().top; }), 0);
}


TEST_F(TextViewTest, ArrowKeysScrollReadOnlyText)
{
	fView->MakeEditable(false);
	Edit("1\n2\n3\n4\n5\n6\n7\n8\n9\n10\n11\n12", 0, 0);
	fRobot->Key("down");
	EXPECT_EQ(Ask([this] { return fView->Bounds().top; }), fView->LineHeight());
	fRobot->Key("home");
	EXPECT_EQ(Ask([this] { return fView->Bounds().top; }), 0);
}


TEST_F(TextViewTest, FontAndColourAreTheWholeTexts)
{
	fView->SetText("some text");
	BFont font(be_bold_font);
	font.SetSize(20);
	const rgb_color red = {255, 0, 0, 255};
	const float before = fView->LineHeight();
	fView->SetFontAndColor(0, 4, &font, B_FONT_ALL, &red);
	BFont got;
	rgb_color color;
	fView->GetFontAndColor(8, &got, &color);
	EXPECT_EQ(got.Size(), 20);
	EXPECT_EQ(color, red);
	EXPECT_GT(fView->LineHeight(), before);
}


TEST_F(TextViewTest, InsetsAreTheTextRects)
{
	fView->SetInsets(5, 6, 7, 8);
	EXPECT_EQ(fView->TextRect(), BRect(5, 6, 192, 91));
	float left, top, right, bottom;
	fView->GetInsets(&left, &top, &right, &bottom);
	EXPECT_EQ(BRect(left, top, right, bottom), BRect(5, 6, 7, 8));
}


TEST_F(TextViewTest, ArchiveBringsBackTheState)
{
	fView->SetText("line\nline");
	fView->MakeEditable(false);
	fView->SetWordWrap(false);
	fView->SetMaxBytes(100);
	BMessage archive;
	ASSERT_EQ(fView->Archive(&archive), B_OK);
	std::unique_ptr<BArchivable> object(BTextView::Instantiate(&archive));
	BTextView* copy = dynamic_cast<BTextView*>(object.get());
	ASSERT_NE(copy, nullptr);
	EXPECT_STREQ(copy->Text(), "line\nline");
	EXPECT_EQ(copy->CountLines(), 2);
	EXPECT_EQ(copy->Frame(), fView->Frame());
	EXPECT_EQ(copy->Flags(), fView->Flags());
	EXPECT_EQ(copy->ResizingMode(), fView->ResizingMode());
	EXPECT_FALSE(copy->IsEditable());
	EXPECT_FALSE(copy->DoesWordWrap());
	EXPECT_EQ(copy->MaxBytes(), 100);
	EXPECT_EQ(copy->TextRect(), fView->TextRect());
}

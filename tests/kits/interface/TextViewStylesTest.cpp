// SPDX-License-Identifier: MIT
// Tests of BTextView's styles: fonts and colours of ranges, run arrays, undo and clipboard with them.
#include <TextView.h>

#include <algorithm>
#include <cstdlib>
#include <cstring>

#include <Clipboard.h>

#include "ControlsFixture.h"

namespace {

constexpr const char* kRunArray = "application/x-vnd.Be-text_run_array";
const rgb_color kRed = {255, 0, 0, 255};
const rgb_color kGreen = {0, 160, 0, 255};

struct FreeRuns {
	void operator()(text_run_array* runs) const { BTextView::FreeRunArray(runs); }
};
typedef std::unique_ptr<text_run_array, FreeRuns> Runs;


class TextViewStylesTest : public ControlsTest {
protected:
	void SetUp() override
	{
		ControlsTest::SetUp();
		fView = Add(new BTextView(BRect(10, 10, 209, 109), "text", BRect(4, 4, 195, 95),
			B_FOLLOW_LEFT_TOP, B_WILL_DRAW | B_NAVIGABLE));
		fView->SetStylable(true);
		fView->SetText("red green plain");
		fView->SetFontAndColor(0, 3, NULL, B_FONT_ALL, &kRed);
		fView->SetFontAndColor(4, 9, NULL, B_FONT_ALL, &kGreen);
	}

	/// A letter for the colour of each byte.
	std::string Colours()
	{
		std::string colours;
		for (int32 i = 0; i < fView->TextLength(); i++) {
			rgb_color color;
			fView->GetFontAndColor(i, NULL, &color);
			colours += color == kRed ? 'r' : color == kGreen ? 'g' : '.';
		}
		return colours;
	}

	std::string AskColours()
	{
		return Ask([this] { return Colours(); });
	}

	Runs TakeRuns(int32 start, int32 end) { return Runs(fView->RunArray(start, end)); }

	BTextView* fView = nullptr;
};

} // namespace


TEST_F(TextViewStylesTest, RangesHaveTheirOwnColours)
{
	EXPECT_EQ(Colours(), "rrr.ggggg......");
	fView->SetFontAndColor(2, 6, NULL, B_FONT_ALL, &kRed);
	EXPECT_EQ(Colours(), "rrrrrrggg......");
	fView->SetFontAndColor(9, 9, NULL, B_FONT_ALL, &kRed);
	fView->SetFontAndColor(12, 4, NULL, B_FONT_ALL, &kRed);
	EXPECT_EQ(Colours(), "rrrrrrggg......");
	fView->SetFontAndColor(-5, 500, NULL, B_FONT_ALL, &kGreen);
	EXPECT_EQ(Colours(), "ggggggggggggggg");
}


TEST_F(TextViewStylesTest, MaskNamesWhatIsTakenOfTheFont)
{
	BFont font(be_bold_font);
	font.SetSize(30);
	fView->SetFontAndColor(4, 9, &font, B_FONT_SIZE);
	BFont got;
	fView->GetFontAndColor(5, &got);
	EXPECT_EQ(got.Size(), 30);
	EXPECT_EQ(got.FamilyAndStyle(), be_plain_font->FamilyAndStyle());
	fView->GetFontAndColor(3, &got);
	EXPECT_EQ(got.Size(), be_plain_font->Size());
}


TEST_F(TextViewStylesTest, SelectionTellsWhatIsTheSameInIt)
{
	BFont font;
	font.SetSize(30);
	fView->SetFontAndColor(4, 9, &font, B_FONT_SIZE);
	fView->Select(0, 9);
	BFont got;
	uint32 mode;
	rgb_color color;
	bool same;
	fView->GetFontAndColor(&got, &mode, &color, &same);
	EXPECT_EQ(color, kRed);
	EXPECT_FALSE(same);
	EXPECT_EQ(mode & B_FONT_SIZE, 0u);
	EXPECT_NE(mode & B_FONT_FAMILY_AND_STYLE, 0u);
	fView->Select(5, 8);
	fView->GetFontAndColor(&got, &mode, &color, &same);
	EXPECT_EQ(color, kGreen);
	EXPECT_TRUE(same);
	EXPECT_EQ(mode, uint32(B_FONT_ALL));
}


TEST_F(TextViewStylesTest, HighestStyleMakesTheLineHigh)
{
	fView->SetText("one\ntwo\nthree");
	const float line = fView->LineHeight(0);
	BFont font;
	font.SetSize(40);
	fView->SetFontAndColor(5, 6, &font, B_FONT_SIZE);
	EXPECT_EQ(fView->LineHeight(0), line);
	EXPECT_GE(fView->LineHeight(1), 40);
	EXPECT_EQ(fView->LineHeight(2), line);
	EXPECT_EQ(fView->PointAt(8).y, fView->TextRect().top + line + fView->LineHeight(1));
	EXPECT_EQ(fView->TextHeight(0, 2), 2 * line + fView->LineHeight(1));
	EXPECT_EQ(fView->LineAt(BPoint(10, fView->PointAt(8).y - 1)), 1);
	EXPECT_EQ(fView->LineAt(BPoint(10, fView->PointAt(8).y)), 2);
	for (int32 offset = 0; offset <= fView->TextLength(); offset++)
		EXPECT_EQ(fView->OffsetAt(fView->PointAt(offset) + BPoint(0.1f, 2)), offset);
}


TEST_F(TextViewStylesTest, InsertedTextGoesOnInTheStyleBeforeIt)
{
	fView->Insert(3, "dish", 4);
	EXPECT_EQ(Colours(), "rrrrrrr.ggggg......");
	fView->Insert(0, ">", 1);
	EXPECT_EQ(Colours(), "rrrrrrrr.ggggg......");
	fView->Insert(fView->TextLength(), "<", 1);
	EXPECT_EQ(Colours(), "rrrrrrrr.ggggg.......");
}


TEST_F(TextViewStylesTest, DeletedTextTakesItsStyleAlong)
{
	fView->Delete(2, 5);
	EXPECT_EQ(Colours(), "rrgggg......");
	fView->Delete(2, 6);
	EXPECT_EQ(Colours(), "rr......");
	fView->Delete(0, 8);
	fView->Insert("again");
	EXPECT_EQ(Colours(), "rrrrr");
}


TEST_F(TextViewStylesTest, InsertTakesRuns)
{
	Runs runs(BTextView::AllocRunArray(2));
	runs->runs[0] = {0, *be_plain_font, kGreen};
	runs->runs[1] = {2, *be_plain_font, kRed};
	fView->Insert(12, "abcd", 4, runs.get());
	EXPECT_EQ(Colours(), "rrr.ggggg...ggrr...");
	fView->SetText("abcdef", runs.get());
	EXPECT_EQ(Colours(), "ggrrrr");
}


TEST_F(TextViewStylesTest, RunsInAnyOrderDoNoHarm)
{
	Runs runs(BTextView::AllocRunArray(5));
	const int32 offsets[] = {7, -3, 2, 900, 1};
	for (int i = 0; i < 5; i++)
		runs->runs[i] = {offsets[i], *be_plain_font, i % 2 == 0 ? kRed : kGreen};
	fView->SetText("abcd", runs.get());
	EXPECT_EQ(Colours().size(), 4u);
	runs->count = 0;
	fView->SetText("abcd", runs.get());
	fView->SetRunArray(0, 4, NULL);
	EXPECT_STREQ(fView->Text(), "abcd");
	runs->count = 5;
}


TEST_F(TextViewStylesTest, StyleChosenWithoutASelectionIsTyped)
{
	Show();
	Do([this] {
		fView->MakeFocus();
		fView->Select(15, 15);
		fView->SetFontAndColor(NULL, B_FONT_ALL, &kRed);
	});
	EXPECT_EQ(AskColours(), "rrr.ggggg......");
	fRobot->Type("ab");
	EXPECT_EQ(AskColours(), "rrr.ggggg......rr");
	Do([this] {
		fView->SetFontAndColor(NULL, B_FONT_ALL, &kGreen);
		fView->Select(0, 0);
		fView->Select(15, 15);
	});
	fRobot->Type("c");
	EXPECT_EQ(AskColours(), "rrr.ggggg.......rr");
}


TEST_F(TextViewStylesTest, TypingOverASelectionKeepsItsStyle)
{
	Show();
	Do([this] {
		fView->MakeFocus();
		fView->Select(4, 9);
	});
	fRobot->Type("gg");
	EXPECT_EQ(TextOf(fView), "red gg plain");
	EXPECT_EQ(AskColours(), "rrr.gg......");
}


TEST_F(TextViewStylesTest, TextThatIsNotStylableHasOneStyle)
{
	fView->SetStylable(false);
	EXPECT_EQ(Colours(), "rrrrrrrrrrrrrrr");
	fView->SetFontAndColor(4, 6, NULL, B_FONT_ALL, &kGreen);
	EXPECT_EQ(Colours(), "ggggggggggggggg");
	Runs runs(BTextView::AllocRunArray(2));
	runs->runs[0] = {0, *be_plain_font, kRed};
	runs->runs[1] = {2, *be_plain_font, kGreen};
	fView->Insert(0, "abcd", 4, runs.get());
	EXPECT_EQ(Colours(), std::string(19, 'g'));
}


TEST_F(TextViewStylesTest, UndoBringsTheStylesBack)
{
	Show();
	Do([this] {
		fView->MakeFocus();
		fView->Select(1, 12);
	});
	fRobot->Key("delete");
	EXPECT_EQ(AskColours(), "r...");
	Do([this] { fView->Undo(NULL); });
	EXPECT_EQ(TextOf(fView), "red green plain");
	EXPECT_EQ(AskColours(), "rrr.ggggg......");
	fRobot->Key("command+shift+z");
	EXPECT_EQ(AskColours(), "r...");
	Do([this] { fView->Undo(NULL); });
	EXPECT_EQ(AskColours(), "rrr.ggggg......");
}


TEST_F(TextViewStylesTest, RedoBringsTheStylesOfAPastedTextBack)
{
	Show();
	Do([this] {
		fView->MakeFocus();
		fView->Select(0, 9);
		fView->Copy(be_clipboard);
		fView->Select(15, 15);
		fView->Paste(be_clipboard);
	});
	const std::string pasted = AskColours();
	Do([this] { fView->Undo(NULL); });
	EXPECT_EQ(TextOf(fView), "red green plain");
	fRobot->Key("command+shift+z");
	EXPECT_EQ(TextOf(fView), "red green plainred green");
	EXPECT_EQ(AskColours(), pasted);
}


TEST_F(TextViewStylesTest, ClipboardKeepsTheStylesBesideTheText)
{
	fView->Select(1, 8);
	fView->Copy(be_clipboard);
	ASSERT_TRUE(be_clipboard->Lock());
	EXPECT_TRUE(be_clipboard->Data()->HasData("text/plain", B_MIME_TYPE));
	EXPECT_TRUE(be_clipboard->Data()->HasData(kRunArray, B_MIME_TYPE));
	be_clipboard->Unlock();
	fView->Select(12, 12);
	fView->Paste(be_clipboard);
	EXPECT_STREQ(fView->Text(), "red green pled greeain");
	EXPECT_EQ(Colours(), "rrr.ggggg...rr.gggg...");
}


TEST_F(TextViewStylesTest, DamagedRunsOnTheClipboardAreLeftOut)
{
	const Runs runs = TakeRuns(0, 15);
	int32 size = 0;
	void* flat = BTextView::FlattenRunArray(runs.get(), &size);
	std::vector<std::string> damaged = {"", "Ali!", std::string(12, '\xff'),
		std::string("Ali!\0\0\0\0\x7f\xff\xff\xff", 12), std::string("Ali!\0\0\0\0\0\0\0\1", 12),
		std::string(static_cast<char*>(flat), size - 1)};
	free(flat);
	for (const std::string& data : damaged) {
		ASSERT_TRUE(be_clipboard->Lock());
		be_clipboard->Clear();
		be_clipboard->Data()->AddData("text/plain", B_MIME_TYPE, "x", 1);
		be_clipboard->Data()->AddData(kRunArray, B_MIME_TYPE, data.data(), data.size());
		be_clipboard->Commit();
		be_clipboard->Unlock();
		fView->Select(15, 15);
		fView->Paste(be_clipboard);
		EXPECT_EQ(Colours().substr(0, 15), "rrr.ggggg......");
	}
}


TEST_F(TextViewStylesTest, FlattenedRunsComeBack)
{
	BFont font(be_bold_font);
	font.SetSize(17);
	fView->SetFontAndColor(4, 9, &font);
	const Runs runs = TakeRuns(2, 12);
	ASSERT_EQ(runs->count, 4);
	EXPECT_EQ(runs->runs[0].offset, 0);
	EXPECT_EQ(runs->runs[1].offset, 1);
	EXPECT_EQ(runs->runs[2].offset, 2);
	EXPECT_EQ(runs->runs[3].offset, 7);

	int32 size = 0;
	void* flat = BTextView::FlattenRunArray(runs.get(), &size);
	ASSERT_NE(flat, nullptr);
	EXPECT_EQ(size, 12 + 4 * 148);
	EXPECT_EQ(memcmp(flat, "Ali!\0\0\0\0\0\0\0\4", 12), 0);
	const Runs back(BTextView::UnflattenRunArray(flat));
	free(flat);
	ASSERT_NE(back, nullptr);
	ASSERT_EQ(back->count, 4);
	EXPECT_EQ(back->runs[2].font.Size(), 17);
	EXPECT_EQ(back->runs[2].color, kGreen);
	EXPECT_EQ(back->runs[3].offset, 7);
	EXPECT_EQ(BTextView::FlattenRunArray(NULL), nullptr);
	EXPECT_EQ(BTextView::UnflattenRunArray(NULL), nullptr);
	EXPECT_EQ(BTextView::AllocRunArray(-1), nullptr);
}


TEST_F(TextViewStylesTest, RunArraysAreCopiedLongerAndShorter)
{
	const Runs runs = TakeRuns(0, 15);
	ASSERT_EQ(runs->count, 4);
	const Runs longer(BTextView::CopyRunArray(runs.get(), 2));
	EXPECT_EQ(longer->count, 6);
	EXPECT_EQ(longer->runs[2].offset, 4);
	const Runs shorter(BTextView::CopyRunArray(runs.get(), -3));
	EXPECT_EQ(shorter->count, 1);
	EXPECT_EQ(BTextView::CopyRunArray(runs.get(), -5), nullptr);
	EXPECT_EQ(BTextView::CopyRunArray(NULL), nullptr);
}


TEST_F(TextViewStylesTest, ArchiveKeepsTheStyles)
{
	BMessage archive;
	ASSERT_EQ(fView->Archive(&archive), B_OK);
	std::unique_ptr<BArchivable> object(BTextView::Instantiate(&archive));
	BTextView* copy = dynamic_cast<BTextView*>(object.get());
	ASSERT_NE(copy, nullptr);
	EXPECT_TRUE(copy->IsStylable());
	rgb_color color;
	copy->GetFontAndColor(6, NULL, &color);
	EXPECT_EQ(color, kGreen);
}


TEST_F(TextViewStylesTest, HiddenTypingShowsAndTellsNothing)
{
	fView->SetStylable(false);
	fView->HideTyping(true);
	EXPECT_TRUE(fView->IsTypingHidden());
	fView->SetText("iW\xc3\xa4 x\t.");
	EXPECT_STREQ(fView->Text(), "iW\xc3\xa4 x\t.");
	const float dot = fView->StringWidth("\xe2\x80\xa2");
	EXPECT_FLOAT_EQ(fView->LineWidth(0), 7 * dot);
	EXPECT_FLOAT_EQ(fView->PointAt(4).x - fView->PointAt(2).x, dot);

	ASSERT_TRUE(be_clipboard->Lock());
	be_clipboard->Clear();
	be_clipboard->Commit();
	be_clipboard->Unlock();
	fView->SelectAll();
	fView->Copy(be_clipboard);
	fView->Cut(be_clipboard);
	EXPECT_STREQ(fView->Text(), "iW\xc3\xa4 x\t.");
	ASSERT_TRUE(be_clipboard->Lock());
	EXPECT_FALSE(be_clipboard->Data()->HasData("text/plain", B_MIME_TYPE));
	be_clipboard->Unlock();

	Show();
	Do([this] {
		fView->MakeFocus();
		fView->Select(8, 8);
	});
	fRobot->Key("control+left");
	int32 start = -1;
	Do([&] { fView->GetSelection(&start, NULL); });
	EXPECT_EQ(start, 0) << "words would show";
	fRobot->Key("end");
	fRobot->Key("backspace");
	EXPECT_EQ(TextOf(fView), "iW\xc3\xa4 x\t");
}

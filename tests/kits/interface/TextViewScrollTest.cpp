// SPDX-License-Identifier: MIT
// Tests of BTextView in a scroll view, and with texts that are large or no text.
#include <TextView.h>

#include <Clipboard.h>
#include <ScrollView.h>

#include "ControlsFixture.h"

namespace {

class TextViewScrollTest : public ControlsTest {
protected:
	void SetUp() override
	{
		ControlsTest::SetUp();
		fView = new BTextView(BRect(10, 10, 209, 109), "text", BRect(4, 4, 195, 95), B_FOLLOW_ALL,
			B_WILL_DRAW | B_NAVIGABLE);
		fScroll = Add(new BScrollView("scroll", fView, B_FOLLOW_LEFT_TOP, 0, true, true));
	}

	float Maximum(orientation direction)
	{
		return Ask([this, direction] {
			float max;
			fScroll->ScrollBar(direction)->GetRange(NULL, &max);
			return max;
		});
	}

	void Paste(const std::string& text)
	{
		ASSERT_TRUE(be_clipboard->Lock());
		be_clipboard->Clear();
		be_clipboard->Data()->AddData("text/plain", B_MIME_TYPE, text.data(), text.size());
		be_clipboard->Commit();
		be_clipboard->Unlock();
		Do([this] { fView->Paste(be_clipboard); });
	}

	/// Uses what is there by mouse and keyboard.
	void UseText()
	{
		fRobot->Click(BPoint(100, 50));
		fRobot->Key("end");
		fRobot->Key("command+end");
		fRobot->Type("x");
		fRobot->Key("backspace");
		fRobot->Key("command+home");
		fRobot->Key("down");
		WaitForWindow();
	}

	/// The robot does not wait for a window that is busy for long.
	void WaitForWindow()
	{
		BMessage reply;
		EXPECT_EQ(BMessenger(fWindow).SendMessage(static_cast<uint32>('SYNC'), &reply), B_OK);
	}

	static std::string Lines(int32 count)
	{
		std::string text;
		for (int32 i = 0; i < count; i++)
			text += "line\n";
		return text;
	}

	BTextView* fView = nullptr;
	BScrollView* fScroll = nullptr;
};

} // namespace


TEST_F(TextViewScrollTest, BarsFollowTheText)
{
	Show();
	EXPECT_EQ(Maximum(B_VERTICAL), 0);
	EXPECT_EQ(Maximum(B_HORIZONTAL), 0);
	Do([this] { fView->SetText(Lines(30).c_str()); });
	const float height = Ask([this] { return fView->TextHeight(0, 30); });
	EXPECT_EQ(Maximum(B_VERTICAL), height + 8 - 100);
	Do([this] { fView->Delete(10, 150); });
	EXPECT_EQ(Maximum(B_VERTICAL), 0);

	Do([this] {
		fView->SetWordWrap(false);
		fView->SetText(std::string(100, 'm').c_str());
	});
	const float width = Ask([this] { return fView->LineWidth(0); });
	EXPECT_NEAR(Maximum(B_HORIZONTAL), width + 8 - 200, 3);
	Do([this] { fView->SetText("m"); });
	EXPECT_EQ(Maximum(B_HORIZONTAL), 0);
}


TEST_F(TextViewScrollTest, TextThatShrinksScrollsBack)
{
	Show();
	Do([this] {
		fView->SetText(Lines(50).c_str());
		fView->Select(250, 250);
		fView->ScrollToSelection();
	});
	EXPECT_GT(Ask([this] { return fView->Bounds().top; }), 0);
	Do([this] { fView->SetText("short"); });
	EXPECT_EQ(Ask([this] { return fView->Bounds().top; }), 0);
}


TEST_F(TextViewScrollTest, TypingKeepsTheCaretInSightAndTheBarRight)
{
	Show();
	Do([this] { fView->MakeFocus(true); });
	for (int i = 0; i < 12; i++)
		fRobot->Key("enter");
	const BRect bounds = Ask([this] { return fView->Bounds(); });
	EXPECT_GT(bounds.top, 0);
	EXPECT_EQ(Ask([this] { return fScroll->ScrollBar(B_VERTICAL)->Value(); }), bounds.top);
	float height;
	const BPoint caret = Ask([&] { return fView->PointAt(12, &height); });
	EXPECT_TRUE(bounds.Contains(caret));
	EXPECT_LE(caret.y + height, bounds.bottom + 1);
}


TEST_F(TextViewScrollTest, WheelScrollsTheText)
{
	Show();
	Do([this] { fView->SetText(Lines(50).c_str()); });
	fRobot->MoveTo(BPoint(100, 50));
	fRobot->Wheel(1);
	EXPECT_EQ(Ask([this] { return fView->Bounds().top; }),
		Ask([this] { return 3 * fView->LineHeight(0); }));
}


TEST_F(TextViewScrollTest, FocusHighlightsTheBorder)
{
	Show();
	Do([this] { fView->MakeFocus(true); });
	EXPECT_TRUE(Ask([this] { return fScroll->IsBorderHighlighted(); }));
	Do([this] { fView->MakeFocus(false); });
	EXPECT_FALSE(Ask([this] { return fScroll->IsBorderHighlighted(); }));
}


TEST_F(TextViewScrollTest, ResizingFitsTheBars)
{
	Show();
	Do([this] { fView->SetText(Lines(30).c_str()); });
	const float before = Maximum(B_VERTICAL);
	Do([this] { fScroll->ResizeBy(0, 30); });
	EXPECT_EQ(Maximum(B_VERTICAL), before - 30);
}


TEST_F(TextViewScrollTest, LargeTextsArePasted)
{
	constexpr size_t kSize = 10 * 1024 * 1024;
	std::string words;
	while (words.size() < kSize)
		words += "some words and \xc3\xa4 line\tbreak\n";
	Show();
	Paste(words);
	EXPECT_EQ(Ask([this] { return fView->TextLength(); }), static_cast<int32>(words.size()));
	UseText();
	EXPECT_TRUE(Ask([&] { return words == fView->Text(); }));
}


TEST_F(TextViewScrollTest, LargeTextsWithoutABreakArePasted)
{
	Show();
	for (bool wrap : {true, false}) {
		const size_t size = (wrap ? 10 : 3) * 1024 * 1024;
		Do([this, wrap] {
			fView->SetText("");
			fView->SetWordWrap(wrap);
		});
		Paste(std::string(size, 'a'));
		EXPECT_EQ(Ask([this] { return fView->TextLength(); }), static_cast<int32>(size));
		UseText();
	}
}


TEST_F(TextViewScrollTest, LinesOfBlanksArePasted)
{
	Show();
	for (const char* blank : {" ", "\t", " \t"}) {
		std::string text;
		while (text.size() < 1000000)
			text += blank;
		Do([this] { fView->SetText(""); });
		Paste(text);
		UseText();
		EXPECT_EQ(Ask([this] { return fView->TextLength(); }), static_cast<int32>(text.size()));
	}
}


TEST_F(TextViewScrollTest, BytesThatAreNoTextArePastedAndEdited)
{
	std::string bytes;
	uint32 random = 1;
	for (int i = 0; i < 50000; i++) {
		random = random * 1664525 + 1013904223;
		const char byte = static_cast<char>(random >> 24);
		bytes += byte != '\0' ? byte : '\n';
	}
	Show();
	for (const std::string& text : {bytes, std::string(50000, '\x80'), std::string(50000, '\xf0'),
			 std::string("a\xe2\x80"), std::string("\xff\xfe\xc0\xaf\xed\xa0\x80")}) {
		Do([this] { fView->SetText(""); });
		Paste(text);
		UseText();
		EXPECT_TRUE(Ask([&] { return text == fView->Text(); }));
	}
}

// SPDX-License-Identifier: MIT
// Tests of the texts of BTranslationUtils: what is written, and what is read back.
#include <TranslationUtils.h>

#include <cstring>
#include <string>

#include <gtest/gtest.h>

#include <Application.h>
#include <DataIO.h>
#include <TextView.h>

#include "support/Printers.h"

namespace {

class StyledTextTest : public ::testing::Test {
protected:
	std::string Written()
	{
		BMallocIO stream;
		EXPECT_EQ(BTranslationUtils::PutStyledText(&fView, &stream), B_OK);
		return std::string(static_cast<const char*>(stream.Buffer()), stream.BufferLength());
	}

	status_t Read(const std::string& bytes, const char* encoding = nullptr)
	{
		BMemoryIO stream(static_cast<const void*>(bytes.data()), bytes.size());
		return BTranslationUtils::GetStyledText(&stream, &fView, encoding);
	}

	BApplication fApplication{"application/x-vnd.plimworks-styled-text-test"};
	BTextView fView{BRect(0, 0, 99, 99), "text", BRect(0, 0, 99, 99), B_FOLLOW_NONE, B_WILL_DRAW};
};

} // namespace


TEST_F(StyledTextTest, RecordsFollowEachOther)
{
	fView.SetText("h\xc3\xa4");
	const std::string bytes = Written();
	const std::string head("STXT\0\0\0\x10\0\0\0\0\0\0\0\x64"
						   "TEXT\0\0\0\x10\0\0\0\x03\0\0\xff\xffh\xc3\xa4"
						   "STYL\0\0\0\x14\0\0\0\xa0\0\0\0\0\0\0\0\x03"
						   "Ali!\0\0\0\0\0\0\0\x01",
		67);
	ASSERT_EQ(bytes.size(), 55u + 160u);
	EXPECT_TRUE(bytes.compare(0, 67, head) == 0);
}


TEST_F(StyledTextTest, WrittenTextIsReadBack)
{
	fView.SetText("one\ntwo \xe2\x82\xac");
	const std::string bytes = Written();
	fView.SetText("");
	EXPECT_EQ(Read(bytes), B_OK);
	EXPECT_STREQ(fView.Text(), "one\ntwo \xe2\x82\xac");
	fView.SetText("");
	EXPECT_EQ(Read(Written()), B_OK);
	EXPECT_STREQ(fView.Text(), "");
}


TEST_F(StyledTextTest, StylesAreReadBackIntoAStylableView)
{
	fView.SetStylable(true);
	fView.SetText("one two");
	const rgb_color red = make_color(255, 0, 0);
	BFont large(be_plain_font);
	large.SetSize(33);
	fView.SetFontAndColor(4, 7, &large, B_FONT_ALL, &red);
	const std::string bytes = Written();
	fView.SetText("");
	ASSERT_EQ(Read(bytes), B_OK);
	ASSERT_STREQ(fView.Text(), "one two");
	BFont font;
	rgb_color color;
	fView.GetFontAndColor(5, &font, &color);
	EXPECT_EQ(font.Size(), 33);
	EXPECT_EQ(color, red);
	fView.GetFontAndColor(1, &font, &color);
	EXPECT_NE(font.Size(), 33);
	EXPECT_NE(color, red);
}


TEST_F(StyledTextTest, PlainTextIsInsertedAtTheCaret)
{
	fView.SetText("ad");
	fView.Select(1, 1);
	EXPECT_EQ(Read("bc", "UTF-8"), B_OK);
	EXPECT_STREQ(fView.Text(), "abcd");
}


TEST_F(StyledTextTest, DamagedRecordsInsertNothing)
{
	fView.SetText("text");
	const std::string bytes = Written();
	fView.SetText("kept");
	for (size_t size = 12; size < bytes.size(); size++) {
		// Without any styles it is a whole text.
		if (size == 36)
			continue;
		EXPECT_EQ(Read(bytes.substr(0, size)), B_BAD_DATA) << size;
		EXPECT_STREQ(fView.Text(), "kept") << size;
	}
	std::string damaged = bytes;
	damaged[7] = 0;
	EXPECT_EQ(Read(damaged), B_BAD_DATA);
	// A run array that is none is left out; the caret is at the beginning.
	damaged = bytes;
	damaged[56] = 'x';
	EXPECT_EQ(Read(damaged), B_OK);
	EXPECT_STREQ(fView.Text(), "textkept");
	fView.SetText("kept");
	damaged = bytes;
	damaged[24] = '\x7f';
	EXPECT_EQ(Read(damaged), B_BAD_DATA);
	EXPECT_STREQ(fView.Text(), "kept");
}


TEST_F(StyledTextTest, NullsAndUnknownEncodingsAreRefused)
{
	BMallocIO stream;
	EXPECT_EQ(BTranslationUtils::GetStyledText(nullptr, &fView), B_BAD_VALUE);
	EXPECT_EQ(BTranslationUtils::GetStyledText(&stream, nullptr), B_BAD_VALUE);
	EXPECT_EQ(BTranslationUtils::PutStyledText(nullptr, &stream), B_BAD_VALUE);
	EXPECT_EQ(BTranslationUtils::PutStyledText(&fView, nullptr), B_BAD_VALUE);
	EXPECT_EQ(Read("text", "ISO-8859-1"), B_BAD_VALUE);
}


TEST_F(StyledTextTest, StreamThatCannotBeWrittenTellsItsError)
{
	const char kBuffer[4] = {};
	BMemoryIO stream(static_cast<const void*>(kBuffer), sizeof(kBuffer));
	fView.SetText("text");
	EXPECT_EQ(BTranslationUtils::PutStyledText(&fView, &stream), B_NOT_ALLOWED);
}

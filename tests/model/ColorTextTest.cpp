// SPDX-License-Identifier: MIT
// Tests of colours as text.

#include "model/ColorText.h"

#include <string>

#include <gtest/gtest.h>

#include "support/Printers.h"

namespace {

rgb_color
Color(uint8 red, uint8 green, uint8 blue, uint8 alpha)
{
	return rgb_color{red, green, blue, alpha};
}


struct ParseCase {
	const char* text;
	rgb_color expected;
};

// Read into 1, 2, 3, 4.
const ParseCase kParseCases[] = {
	{"{216,216,216,255}", {216, 216, 216, 255}},
	{"  {216, 216, 216, 255}  ", {216, 216, 216, 255}},
	{"216,216,216,255", {216, 216, 216, 255}},
	{"{10,20,30,40}", {10, 20, 30, 40}},
	{"{0,0,0}", {0, 0, 0, 4}},
	{"{300,-1,0,0}", {44, 255, 0, 0}},
	{"{256,511,-256,257}", {0, 255, 0, 1}},
	{"{1,,2}", {1, 2, 3, 4}},
	{",,,9", {9, 2, 3, 4}},
	{"{1,2,3,4,5,6}", {1, 2, 3, 4}},
	{"{{{7,8,9,10}}}", {7, 8, 9, 10}},
	{"{7,8,9,10 }", {7, 8, 9, 10}},
	{"{7,8,9,10} } ", {7, 8, 9, 10}},
	{"{9x,x9, 8,7}", {9, 0, 8, 7}},
	{"{ {9,8", {0, 8, 3, 4}},
	{"\t{9,8", {0, 8, 3, 4}},
	{"+9,- 8", {9, 0, 3, 4}},
	{"", {1, 2, 3, 4}},
	{"{}", {1, 2, 3, 4}},
	{"   ", {1, 2, 3, 4}},
	{"}}}", {1, 2, 3, 4}},
	{"red", {0, 2, 3, 4}},
	{"99999999999999999999,5", {255, 5, 3, 4}},
	{"-99999999999999999999,-5", {0, 251, 3, 4}},
	{"9223372036854775807,-9223372036854775808", {255, 0, 3, 4}},
	{"9223372036854775552,9223372036854775808", {0, 255, 3, 4}},
	{"\n\t9,\v8,\f\r 7", {9, 8, 7, 4}},
	{"+-9,--8,+", {0, 0, 0, 4}},
};

} // namespace

TEST(ColorTextTest, ColoursAreReadFromEveryTextForm)
{
	for (const ParseCase& row : kParseCases) {
		rgb_color color = Color(1, 2, 3, 4);
		const rgb_color result = StrToRGBColor(row.text, &color);
		EXPECT_EQ(color, row.expected) << "text: '" << row.text << "'";
		EXPECT_EQ(result, row.expected) << "text: '" << row.text << "'";
	}
}


TEST(ColorTextTest, AMissingTextLeavesTheColour)
{
	rgb_color color = Color(1, 2, 3, 4);
	EXPECT_EQ(StrToRGBColor(nullptr, &color), Color(1, 2, 3, 4));
	EXPECT_EQ(color, Color(1, 2, 3, 4));
}


TEST(ColorTextTest, AMissingColourIsHarmless)
{
	StrToRGBColor("{1,2,3,4}", nullptr);
	StrToRGBColor(nullptr, nullptr);
	SUCCEED();
}


TEST(ColorTextTest, OnlyTheFirst1023BytesAreRead)
{
	// The second number begins where the working buffer ends.
	rgb_color color = Color(1, 2, 3, 4);
	const std::string text = "5," + std::string(1020, ' ') + "78,9";
	StrToRGBColor(text.c_str(), &color);
	EXPECT_EQ(color, Color(5, 7, 3, 4));
}


TEST(ColorTextTest, ColoursAreWrittenAsFourDecimalsInBraces)
{
	char buffer[kColorTextSize];
	EXPECT_STREQ(RGBColorToStr(Color(10, 20, 30, 40), buffer), "{10,20,30,40}");
	EXPECT_STREQ(RGBColorToStr(Color(216, 216, 216, 255), buffer), "{216,216,216,255}");
	EXPECT_STREQ(RGBColorToStr(Color(255, 255, 255, 255), buffer), "{255,255,255,255}");
	EXPECT_STREQ(RGBColorToStr(Color(0, 0, 0, 0), buffer), "{0,0,0,0}");
}


TEST(ColorTextTest, WritingReturnsTheBuffer)
{
	char buffer[kColorTextSize];
	EXPECT_EQ(RGBColorToStr(Color(1, 2, 3, 4), buffer), buffer);
	EXPECT_EQ(RGBColorToStr(Color(1, 2, 3, 4), nullptr), nullptr);
}


TEST(ColorTextTest, WrittenColoursAreReadBack)
{
	const uint8 values[] = {0, 1, 9, 10, 99, 100, 127, 128, 254, 255};
	for (uint8 red : values) {
		for (uint8 alpha : values) {
			char buffer[kColorTextSize];
			const rgb_color written = Color(red, 255 - red, 17, alpha);
			rgb_color read = Color(0, 0, 0, 0);
			StrToRGBColor(RGBColorToStr(written, buffer), &read);
			EXPECT_EQ(read, written) << buffer;
		}
	}
}

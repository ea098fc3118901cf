// SPDX-License-Identifier: MIT
// Conversion between UTF-8 and other encodings.

#include <UTF8.h>

#include <string>

#include <gtest/gtest.h>

namespace {

struct Result {
	status_t status;
	std::string text;
	int32 used;
};


using Function = status_t (*)(uint32, const char*, int32*, char*, int32*, int32*, char);


Result
convert(Function function, uint32 encoding, const std::string& text, int32 room = 100,
	char substitute = '?')
{
	char buffer[100];
	int32 used = static_cast<int32>(text.size());
	int32 written = room;
	int32 state = 0;
	status_t status = function(encoding, text.data(), &used, buffer, &written, &state, substitute);
	return {status, std::string(buffer, status == B_OK ? written : 0), used};
}


TEST(TextEncodingTest, ConvertsToUtf8)
{
	EXPECT_EQ(convert(convert_to_utf8, B_ISO1_CONVERSION, "\xe4z").text, "\xc3\xa4z");
	EXPECT_EQ(convert(convert_to_utf8, B_MS_WINDOWS_CONVERSION, "\x80").text, "\xe2\x82\xac");
	EXPECT_EQ(convert(convert_to_utf8, B_KOI8R_CONVERSION, "\xc1").text, "\xd0\xb0");
	EXPECT_EQ(convert(convert_to_utf8, B_MAC_ROMAN_CONVERSION, "\x8a").text, "\xc3\xa4");
	EXPECT_EQ(convert(convert_to_utf8, B_UTF16_CONVERSION, std::string("\x20\xac", 2)).text,
		"\xe2\x82\xac");
	EXPECT_EQ(convert(convert_to_utf8, B_SJIS_CONVERSION, "\x82\xa0").text, "\xe3\x81\x82");
}


TEST(TextEncodingTest, ConvertsFromUtf8)
{
	EXPECT_EQ(convert(convert_from_utf8, B_ISO1_CONVERSION, "\xc3\xa4z").text, "\xe4z");
	EXPECT_EQ(convert(convert_from_utf8, B_ISO15_CONVERSION, "\xe2\x82\xac").text, "\xa4");
	EXPECT_EQ(convert(convert_from_utf8, B_UNICODE_CONVERSION, "\xe2\x82\xac").text,
		std::string("\x20\xac", 2));
}


TEST(TextEncodingTest, EveryEncodingIsThere)
{
	for (uint32 i = 0; i <= B_MS_WINDOWS_1250_CONVERSION; i++) {
		Result there = convert(convert_from_utf8, i, "A");
		ASSERT_EQ(there.status, B_OK) << i;
		EXPECT_EQ(convert(convert_to_utf8, i, there.text).text, "A") << i;
	}
	EXPECT_EQ(convert(convert_to_utf8, 28, "A").status, B_BAD_VALUE);
}


TEST(TextEncodingTest, SubstitutesWhatCannotBeWritten)
{
	EXPECT_EQ(convert(convert_from_utf8, B_ISO1_CONVERSION,
				  "a\xe2\x82\xac"
				  "b")
				  .text,
		"a?b");
	EXPECT_EQ(convert(convert_from_utf8, B_ISO1_CONVERSION,
				  "a\xe2\x82\xac"
				  "b",
				  100, 0)
				  .text,
		"ab");
	EXPECT_EQ(convert(convert_from_utf8, B_UTF16_CONVERSION, "\xff").text, std::string("\0?", 2));
	EXPECT_EQ(convert(convert_to_utf8, B_EUC_CONVERSION,
				  "a\xff"
				  "b")
				  .text,
		"a?b");
}


TEST(TextEncodingTest, TellsHowFarItCame)
{
	// No room for the second character.
	Result full = convert(convert_to_utf8, B_ISO1_CONVERSION, "\xe4\xe4", 3);
	EXPECT_EQ(full.status, B_OK);
	EXPECT_EQ(full.used, 1);
	EXPECT_EQ(full.text, "\xc3\xa4");

	// Cut off in the middle of a character.
	Result cut = convert(convert_from_utf8, B_ISO1_CONVERSION, "a\xc3");
	EXPECT_EQ(cut.used, 1);
	EXPECT_EQ(cut.text, "a");

	EXPECT_EQ(convert(convert_to_utf8, B_ISO1_CONVERSION, "\xe4", 1).status, B_ERROR);
	EXPECT_EQ(convert(convert_to_utf8, B_ISO1_CONVERSION, "").status, B_OK);
}


TEST(TextEncodingTest, RefusesBadArguments)
{
	char buffer[4];
	int32 length = 1;
	int32 room = 4;
	int32 state = 0;
	EXPECT_EQ(convert_to_utf8(0, nullptr, &length, buffer, &room, &state), B_BAD_VALUE);
	EXPECT_EQ(convert_to_utf8(0, "a", nullptr, buffer, &room, &state), B_BAD_VALUE);
	EXPECT_EQ(convert_to_utf8(0, "a", &length, nullptr, &room, &state), B_BAD_VALUE);
	length = -1;
	EXPECT_EQ(convert_to_utf8(0, "a", &length, buffer, &room, &state), B_BAD_VALUE);
}

} // namespace

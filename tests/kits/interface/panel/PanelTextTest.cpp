// SPDX-License-Identifier: MIT
// Tests of how names, sizes and times are shown and ordered.
#include "interface/panel/PanelText.h"

#include <algorithm>
#include <vector>

#include <gtest/gtest.h>

#include "support/TemporaryFolder.h"

using namespace BPrivate;

TEST(PanelTextTest, OnlyWellFormedTextIsValid)
{
	const struct {
		const char* text;
		bool valid;
	} kCases[] = {
		{"", true},
		{"plain", true},
		{"\xc3\xa9", true},
		{"\xe2\x82\xac", true},
		{"\xf0\x9f\x99\x82", true},
		{"\xff", false},
		{"caf\xe9", false},
		{"\x80", false},
		{"\xc3", false},
		{"\xc0\xaf", false},
		{"\xe0\x80\xaf", false},
		{"\xed\xa0\x80", false},
		{"\xf4\x90\x80\x80", false},
		{"\xf0\x9f\x99", false},
	};
	for (const auto& testCase : kCases)
		EXPECT_EQ(IsValidText(testCase.text), testCase.valid)
			<< testing::PrintToString(testCase.text);
}


TEST(PanelTextTest, WhatCannotBeDrawnIsReplaced)
{
	EXPECT_EQ(DisplayName("caf\xe9.txt"), "caf\xef\xbf\xbd.txt");
	EXPECT_EQ(DisplayName("a\nb\tc\x7f"),
		"a\xef\xbf\xbd"
		"b\xef\xbf\xbd"
		"c\xef\xbf\xbd");
	EXPECT_EQ(DisplayName("gr\xc3\xbc\xc3\x9f"
						  "e"),
		"gr\xc3\xbc\xc3\x9f"
		"e");
	EXPECT_EQ(DisplayName(""), "");
}


TEST(PanelTextTest, NamesAreOrderedAsPeopleDo)
{
	const std::vector<std::string> ordered = {"alpha", "Beta", "file1", "file2", "File10",
		"file10a", "file20", "\xc3\x84pfel", "\xc3\xa4pfel2"};
	std::vector<NameKey> keys;
	for (auto name = ordered.rbegin(); name != ordered.rend(); ++name)
		keys.emplace_back(*name);
	std::sort(keys.begin(), keys.end());
	for (size_t i = 0; i < ordered.size(); i++)
		EXPECT_EQ(keys[i].name, ordered[i]);
}


TEST(PanelTextTest, OrderIsStrictForNamesThatFoldToTheSame)
{
	const char* const kNames[] = {"a", "A", "a1", "a01", "a001", "", "\xff", "\xfe"};
	for (const char* one : kNames) {
		for (const char* other : kNames) {
			const NameKey a(one);
			const NameKey b(other);
			EXPECT_EQ((a < b) + (b < a), std::string(one) == other ? 0 : 1) << one << ", " << other;
		}
	}
}


TEST(PanelTextTest, NumbersOfAnyLengthAreCompared)
{
	const NameKey smaller("v99999999999999999999999999999998");
	const NameKey larger("v99999999999999999999999999999999");
	EXPECT_TRUE(smaller < larger);
	EXPECT_FALSE(larger < smaller);
	EXPECT_TRUE(NameKey("v9") < smaller);
}


TEST(PanelTextTest, BeginningsAreFoundWithoutRegardToCase)
{
	EXPECT_TRUE(BeginsWith("Documents", "doc"));
	EXPECT_TRUE(BeginsWith("\xc3\x84pfel", "\xc3\xa4"));
	EXPECT_TRUE(BeginsWith("x", ""));
	EXPECT_FALSE(BeginsWith("do", "doc"));
}


TEST(PanelTextTest, SizesHaveTheUnitThatFits)
{
	EXPECT_EQ(SizeText(0), "0 bytes");
	EXPECT_EQ(SizeText(1), "1 byte");
	EXPECT_EQ(SizeText(1023), "1023 bytes");
	EXPECT_EQ(SizeText(1024), "1.0 KiB");
	EXPECT_EQ(SizeText(1536), "1.5 KiB");
	EXPECT_EQ(SizeText(1024 * 1024 - 1), "1.0 MiB");
	EXPECT_EQ(SizeText(INT64_MAX), "8.0 EiB");
}


TEST(PanelTextTest, TimesAreLocal)
{
	const ScopedVariable zone("TZ", "UTC-2");
	tzset();
	EXPECT_EQ(TimeText(0), "1970-01-01 02:00");
	EXPECT_EQ(TimeText(1710000000), "2024-03-09 18:00");
}

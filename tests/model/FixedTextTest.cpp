// SPDX-License-Identifier: MIT

#include <gtest/gtest.h>

#include "model/FixedText.h"

TEST(FixedTextTest, ATextThatFitsIsCopiedWhole)
{
	char field[8] = "before";
	SetFixedText(field, "1234567");
	EXPECT_STREQ(field, "1234567");
	SetFixedText(field, "");
	EXPECT_STREQ(field, "");
}


TEST(FixedTextTest, ALongTextIsCutAndTerminated)
{
	struct {
		char field[4];
		char behind;
	} record = {"", '!'};
	SetFixedText(record.field, "123456");
	EXPECT_STREQ(record.field, "123");
	EXPECT_EQ(record.behind, '!');
}


TEST(FixedTextTest, AMissingTextLeavesTheField)
{
	char field[8] = "before";
	SetFixedText(field, nullptr);
	EXPECT_STREQ(field, "before");
}


TEST(FixedTextTest, TheTextMayBePartOfTheField)
{
	char field[8] = "before";
	SetFixedText(field, field + 2);
	EXPECT_STREQ(field, "fore");
	SetFixedText(field, field);
	EXPECT_STREQ(field, "fore");
}

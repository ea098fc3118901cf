// SPDX-License-Identifier: MIT

#include "app/TypedMessage.h"

#include <gtest/gtest.h>

#include <Path.h>
#include <Point.h>
#include <Rect.h>

#include "support/Printers.h"

TEST(TypedMessageTest, SettingAFieldTwiceLeavesOneValue)
{
	TTypedMessage message('test');
	EXPECT_EQ(message.SetString("Left", "5"), B_OK);
	EXPECT_EQ(message.SetString("Left", "7"), B_OK);

	type_code type;
	int32 count;
	ASSERT_EQ(message.GetInfo("Left", &type, &count), B_OK);
	EXPECT_EQ(count, 1);
	EXPECT_STREQ(message.FindString("Left"), "7");
}


TEST(TypedMessageTest, EveryTypeIsAddedAndThenReplaced)
{
	TTypedMessage message('test');
	for (int32 round = 1; round <= 2; round++) {
		EXPECT_EQ(message.SetBool("bool", round == 2), B_OK);
		EXPECT_EQ(message.SetInt8("int8", round), B_OK);
		EXPECT_EQ(message.SetInt16("int16", round), B_OK);
		EXPECT_EQ(message.SetInt32("int32", round), B_OK);
		EXPECT_EQ(message.SetInt64("int64", round), B_OK);
		EXPECT_EQ(message.SetFloat("float", round), B_OK);
		EXPECT_EQ(message.SetDouble("double", round), B_OK);
		EXPECT_EQ(message.SetPoint("point", BPoint(round, round)), B_OK);
		EXPECT_EQ(message.SetRect("rect", BRect(0, 0, round, round)), B_OK);
		BMessage nested(round);
		EXPECT_EQ(message.SetMessage("message", &nested), B_OK);
		BPath path(round == 1 ? "/tmp" : "/usr");
		EXPECT_EQ(message.SetFlat("path", &path), B_OK);
	}

	EXPECT_EQ(message.CountNames(B_ANY_TYPE), 11);
	EXPECT_TRUE(message.FindBool("bool"));
	EXPECT_EQ(message.FindInt8("int8"), 2);
	EXPECT_EQ(message.FindInt16("int16"), 2);
	EXPECT_EQ(message.FindInt32("int32"), 2);
	EXPECT_EQ(message.FindInt64("int64"), 2);
	EXPECT_EQ(message.FindFloat("float"), 2);
	EXPECT_EQ(message.FindDouble("double"), 2);
	EXPECT_EQ(message.FindPoint("point"), BPoint(2, 2));
	EXPECT_EQ(message.FindRect("rect"), BRect(0, 0, 2, 2));
	BMessage nested;
	ASSERT_EQ(message.FindMessage("message", &nested), B_OK);
	EXPECT_EQ(nested.what, 2u);
	BPath path;
	ASSERT_EQ(message.FindFlat("path", &path), B_OK);
	EXPECT_STREQ(path.Path(), "/usr");
}


TEST(TypedMessageTest, AFieldOfAnotherTypeIsNotReplaced)
{
	TTypedMessage message('test');
	ASSERT_EQ(message.SetInt32("Left", 5), B_OK);
	EXPECT_EQ(message.SetString("Left", "5"), B_BAD_TYPE);
	EXPECT_EQ(message.FindInt32("Left"), 5);
}


TEST(TypedMessageTest, AMissingValueIsRefused)
{
	TTypedMessage message('test');
	EXPECT_EQ(message.SetMessage("message", nullptr), B_BAD_VALUE);
	EXPECT_EQ(message.SetFlat("flat", nullptr), B_BAD_VALUE);
	EXPECT_EQ(message.SetString("string", nullptr), B_BAD_VALUE);
	EXPECT_TRUE(message.IsEmpty());
}

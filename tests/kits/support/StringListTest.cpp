// SPDX-License-Identifier: MIT
// BStringList.

#include <StringList.h>

#include <string.h>

#include <gtest/gtest.h>

namespace {

BStringList
make_list(std::initializer_list<const char*> texts)
{
	BStringList list;
	for (const char* text : texts)
		list.Add(text);
	return list;
}


TEST(StringListTest, AddsInsideOnly)
{
	BStringList list;
	EXPECT_TRUE(list.IsEmpty());
	EXPECT_TRUE(list.Add("b"));
	EXPECT_TRUE(list.Add("a", 0));
	EXPECT_FALSE(list.Add("x", 3));
	EXPECT_FALSE(list.Add("x", -1));
	EXPECT_TRUE(list.Add(list, 1));
	EXPECT_EQ(list.Join(","), "a,a,b,b");
	EXPECT_FALSE(list.Add(list, 5));
}


TEST(StringListTest, RemovesEveryMatch)
{
	BStringList list = make_list({"a", "B", "a", "b"});
	EXPECT_TRUE(list.Remove(BString("a")));
	EXPECT_FALSE(list.Remove(BString("a")));
	EXPECT_TRUE(list.Remove(BString("b"), true));
	EXPECT_TRUE(list.IsEmpty());

	list = make_list({"a", "b", "c", "d", "e"});
	EXPECT_TRUE(list.Remove(make_list({"b", "d", "x"})));
	EXPECT_EQ(list.Join(""), "ace");
	EXPECT_EQ(list.Remove(int32(1)), "c");
	EXPECT_EQ(list.Remove(int32(9)), "");
	EXPECT_TRUE(list.Remove(1, 100));
	EXPECT_FALSE(list.Remove(2, 1));
	EXPECT_FALSE(list.Remove(-1, 1));
	EXPECT_EQ(list.Join(""), "a");
	EXPECT_TRUE(list.Remove(list));
	EXPECT_TRUE(list.IsEmpty());
}


TEST(StringListTest, MovesSwapsAndReplaces)
{
	BStringList list = make_list({"a", "b", "c", "d"});
	EXPECT_TRUE(list.Move(0, 2));
	EXPECT_EQ(list.Join(""), "bcad");
	EXPECT_TRUE(list.Move(3, 0));
	EXPECT_EQ(list.Join(""), "dbca");
	EXPECT_TRUE(list.Swap(0, 3));
	EXPECT_TRUE(list.Swap(1, 1));
	EXPECT_EQ(list.Join(""), "abcd");
	EXPECT_TRUE(list.Replace(1, "x"));
	EXPECT_FALSE(list.Replace(4, "x"));
	EXPECT_FALSE(list.Move(0, 4));
	EXPECT_FALSE(list.Swap(-1, 0));
	EXPECT_EQ(list.Join(", ", 1), "a,x,c,d");
}


TEST(StringListTest, FindsTexts)
{
	BStringList list = make_list({"one", "Two", "two"});
	EXPECT_EQ(list.IndexOf("two"), 2);
	EXPECT_EQ(list.IndexOf("two", true), 1);
	EXPECT_EQ(list.IndexOf("three"), -1);
	EXPECT_TRUE(list.HasString("ONE", true));
	EXPECT_FALSE(list.HasString("ONE"));
	EXPECT_EQ(list.First(), "one");
	EXPECT_EQ(list.Last(), "two");
	EXPECT_EQ(list.StringAt(3), "");
	EXPECT_EQ(BStringList().First(), "");
}


TEST(StringListTest, ComesBackFromItsFlatForm)
{
	BStringList list = make_list({"one", "", "three"});
	ASSERT_EQ(list.FlattenedSize(), 4 + 1 + 6);
	char buffer[11];
	EXPECT_EQ(list.Flatten(buffer, 10), B_BAD_VALUE);
	ASSERT_EQ(list.Flatten(buffer, 11), B_OK);
	EXPECT_EQ(memcmp(buffer, "one\0\0three", 11), 0);

	BStringList copy = make_list({"old"});
	ASSERT_EQ(copy.Unflatten(B_STRING_LIST_TYPE, buffer, 11), B_OK);
	EXPECT_TRUE(copy == list);
	EXPECT_FALSE(copy != list);
	ASSERT_EQ(copy.Unflatten(B_STRING_LIST_TYPE, nullptr, 0), B_OK);
	EXPECT_TRUE(copy.IsEmpty());
}


TEST(StringListTest, BadDataLeavesItAlone)
{
	BStringList list = make_list({"kept"});
	const char data[] = {'a', '\0', 'b'};
	EXPECT_EQ(list.Unflatten(B_STRING_LIST_TYPE, data, 3), B_BAD_DATA);
	EXPECT_EQ(list.Unflatten(B_STRING_TYPE, data, 2), B_BAD_TYPE);
	EXPECT_EQ(list.Unflatten(B_STRING_LIST_TYPE, nullptr, 2), B_BAD_VALUE);
	EXPECT_EQ(list.Unflatten(B_STRING_LIST_TYPE, data, -1), B_BAD_VALUE);
	EXPECT_EQ(list.Join(""), "kept");
	EXPECT_TRUE(list.AllowsTypeCode(B_STRING_LIST_TYPE));
	EXPECT_FALSE(list.AllowsTypeCode(B_STRING_TYPE));
	EXPECT_FALSE(list.IsFixedSize());
}

} // namespace

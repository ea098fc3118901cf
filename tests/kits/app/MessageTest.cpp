// SPDX-License-Identifier: MIT
// The fields of a message: adding, finding, replacing, removing, renaming, and asking about them.

#include <string>
#include <vector>

#include <Errors.h>
#include <GraphicsDefs.h>
#include <Message.h>
#include <Point.h>
#include <Size.h>
#include <gtest/gtest.h>

#include "kits/app/MessageText.h"
#include "support/Printers.h"

namespace {

/// Built before main, as the designer's settings are.
BMessage sStatic('stat');
const status_t sStaticStatus = sStatic.AddString("early", "bird");

} // namespace


TEST(MessageTest, StaticMessageWorksBeforeMain)
{
	EXPECT_EQ(sStaticStatus, B_OK);
	EXPECT_STREQ(sStatic.FindString("early"), "bird");
	EXPECT_EQ(sStatic.what, uint32('stat'));
}


TEST(MessageTest, MessageWithoutFieldsIsSmall)
{
	EXPECT_LE(sizeof(BMessage), 64u);
	BMessage message;
	EXPECT_EQ(message.what, 0u);
	EXPECT_TRUE(message.IsEmpty());
	EXPECT_EQ(message.FlattenedSize(), 68);
}


// One type of one size: every line of its family.
template <typename Value>
struct Family {
	status_t (BMessage::*add)(const char*, Value);
	status_t (BMessage::*find)(const char*, Value*) const;
	status_t (BMessage::*findAt)(const char*, int32, Value*) const;
	status_t (BMessage::*replace)(const char*, Value);
	status_t (BMessage::*replaceAt)(const char*, int32, Value);
	bool (BMessage::*has)(const char*, int32) const;
	type_code type;
};


template <typename Value>
static void
CheckFamily(const Family<Value>& family, Value first, Value second)
{
	BMessage message;
	Value value = first;
	EXPECT_EQ((message.*family.find)("field", &value), B_NAME_NOT_FOUND);
	EXPECT_EQ(value, Value());
	EXPECT_EQ((message.*family.replace)("field", first), B_NAME_NOT_FOUND);
	EXPECT_TRUE(message.IsEmpty());
	EXPECT_FALSE((message.*family.has)("field", 0));

	EXPECT_EQ((message.*family.add)("field", first), B_OK);
	EXPECT_EQ((message.*family.add)("field", second), B_OK);
	EXPECT_EQ((message.*family.find)("field", &value), B_OK);
	EXPECT_EQ(value, first);
	EXPECT_EQ((message.*family.findAt)("field", 1, &value), B_OK);
	EXPECT_EQ(value, second);
	EXPECT_TRUE((message.*family.has)("field", 1));
	EXPECT_FALSE((message.*family.has)("field", 2));
	EXPECT_FALSE((message.*family.has)("field", -1));

	for (int32 index : {2, -1}) {
		value = first;
		EXPECT_EQ((message.*family.findAt)("field", index, &value), B_BAD_INDEX);
		EXPECT_EQ(value, Value());
		EXPECT_EQ((message.*family.replaceAt)("field", index, first), B_BAD_INDEX);
	}

	EXPECT_EQ((message.*family.replace)("field", second), B_OK);
	EXPECT_EQ((message.*family.replaceAt)("field", 1, first), B_OK);
	EXPECT_EQ((message.*family.findAt)("field", 0, &value), B_OK);
	EXPECT_EQ(value, second);
	EXPECT_EQ((message.*family.findAt)("field", 1, &value), B_OK);
	EXPECT_EQ(value, first);

	type_code type;
	int32 count;
	bool isFixedSize = false;
	EXPECT_EQ(message.GetInfo("field", &type, &count, &isFixedSize), B_OK);
	EXPECT_EQ(type, family.type);
	EXPECT_EQ(count, 2);
	EXPECT_TRUE(isFixedSize);

	message.AddString("other", "text");
	value = first;
	EXPECT_EQ((message.*family.add)("other", first), B_BAD_TYPE);
	EXPECT_EQ((message.*family.find)("other", &value), B_BAD_TYPE);
	EXPECT_EQ(value, Value());
	EXPECT_EQ((message.*family.replace)("other", first), B_BAD_TYPE);
	EXPECT_FALSE((message.*family.has)("other", 0));
	EXPECT_STREQ(message.FindString("other"), "text");

	EXPECT_EQ((message.*family.add)(nullptr, first), B_BAD_VALUE);
	EXPECT_EQ((message.*family.find)(nullptr, &value), B_BAD_VALUE);
	EXPECT_EQ((message.*family.find)("field", nullptr), B_BAD_VALUE);
	EXPECT_EQ((message.*family.replace)(nullptr, first), B_BAD_VALUE);
	EXPECT_FALSE((message.*family.has)(nullptr, 0));

	// An item of another size, as a damaged file may hold, is not there.
	BMessage damaged;
	damaged.AddData("field", family.type, "123456789012345678901", 21);
	value = first;
	EXPECT_EQ((damaged.*family.find)("field", &value), B_BAD_DATA);
	EXPECT_EQ(value, Value());
	EXPECT_FALSE((damaged.*family.has)("field", 0));
}


#define TEST_FAMILY(Name, Value, type, first, second)                                              \
	TEST(MessageTest, Name##FieldKeepsItsRules)                                                    \
	{                                                                                              \
		CheckFamily<Value>(                                                                        \
			{&BMessage::Add##Name, &BMessage::Find##Name, &BMessage::Find##Name,                   \
				&BMessage::Replace##Name, &BMessage::Replace##Name, &BMessage::Has##Name, type},   \
			first, second);                                                                        \
                                                                                                   \
		BMessage message;                                                                          \
		EXPECT_EQ(message.Get##Name("field", second), second);                                     \
		EXPECT_EQ(message.Set##Name("field", first), B_OK);                                        \
		EXPECT_EQ(message.Get##Name("field", second), first);                                      \
		EXPECT_EQ(message.Add##Name("field", first), B_OK);                                        \
		EXPECT_EQ(message.Set##Name("field", second), B_OK);                                       \
		EXPECT_EQ(message.Get##Name("field", 0, first), second);                                   \
		EXPECT_EQ(message.Get##Name("field", 1, second), first);                                   \
		EXPECT_EQ(message.Get##Name("field", 2, second), second);                                  \
		message.AddString("other", "text");                                                        \
		EXPECT_EQ(message.Set##Name("other", first), B_BAD_TYPE);                                  \
	}

TEST_FAMILY(Bool, bool, B_BOOL_TYPE, true, false)
TEST_FAMILY(Int8, int8, B_INT8_TYPE, int8(-128), int8(127))
TEST_FAMILY(UInt8, uint8, B_UINT8_TYPE, uint8(255), uint8(1))
TEST_FAMILY(Int16, int16, B_INT16_TYPE, int16(-32768), int16(32767))
TEST_FAMILY(UInt16, uint16, B_UINT16_TYPE, uint16(65535), uint16(1))
TEST_FAMILY(Int32, int32, B_INT32_TYPE, INT32_MIN, INT32_MAX)
TEST_FAMILY(UInt32, uint32, B_UINT32_TYPE, UINT32_MAX, 1u)
TEST_FAMILY(Int64, int64, B_INT64_TYPE, int64(INT64_MIN), int64(INT64_MAX))
TEST_FAMILY(UInt64, uint64, B_UINT64_TYPE, uint64(UINT64_MAX), uint64(1))
TEST_FAMILY(Float, float, B_FLOAT_TYPE, -1.5f, 3.25f)
TEST_FAMILY(Double, double, B_DOUBLE_TYPE, -0.1, 1e300)
TEST_FAMILY(Point, BPoint, B_POINT_TYPE, BPoint(1, 2), BPoint(-3.5, 4))
TEST_FAMILY(Rect, BRect, B_RECT_TYPE, BRect(1, 2, 3, 4), BRect(-5, 0, 5, 9))
TEST_FAMILY(Color, rgb_color, B_RGB_COLOR_TYPE, (rgb_color{1, 2, 3, 4}), (rgb_color{5, 6, 7, 255}))


TEST(MessageTest, SizeFieldKeepsItsRules)
{
	BMessage message;
	BSize size;
	EXPECT_EQ(message.FindSize("size", &size), B_NAME_NOT_FOUND);
	EXPECT_EQ(message.AddSize("size", BSize(3, 4)), B_OK);
	EXPECT_EQ(message.FindSize("size", 0, &size), B_OK);
	EXPECT_EQ(size.width, 3);
	EXPECT_EQ(size.height, 4);
	EXPECT_EQ(message.ReplaceSize("size", BSize(5, 6)), B_OK);
	EXPECT_EQ(message.ReplaceSize("size", 1, BSize(5, 6)), B_BAD_INDEX);
	EXPECT_EQ(message.SetSize("size", BSize(7, 8)), B_OK);
	EXPECT_EQ(message.GetSize("size", BSize(0, 0)).Width(), 7);
	EXPECT_EQ(message.GetSize("none", BSize(1, 0)).Width(), 1);
	EXPECT_EQ(message.GetSize("size", 1, BSize(2, 0)).Width(), 2);
	EXPECT_TRUE(message.HasSize("size"));
	EXPECT_FALSE(message.HasSize("size", 1));
}


TEST(MessageTest, FindByValueGivesZeroForWhatIsNotThere)
{
	BMessage message;
	message.AddInt32("n", 1);
	EXPECT_FALSE(message.FindBool("n"));
	EXPECT_EQ(message.FindInt8("n"), 0);
	EXPECT_EQ(message.FindInt16("n"), 0);
	EXPECT_EQ(message.FindInt32("n"), 1);
	EXPECT_EQ(message.FindInt32("n", 1), 0);
	EXPECT_EQ(message.FindInt64("n"), 0);
	EXPECT_EQ(message.FindFloat("n"), 0);
	EXPECT_EQ(message.FindDouble("n"), 0);
	EXPECT_EQ(message.FindPoint("n"), BPoint());
	EXPECT_EQ(message.FindRect("n"), BRect());
	EXPECT_EQ(message.FindString("n"), nullptr);
}


TEST(MessageTest, PointerFieldKeepsItsRules)
{
	BMessage message;
	void* value = &message;
	EXPECT_EQ(message.FindPointer("pointer", &value), B_NAME_NOT_FOUND);
	EXPECT_EQ(value, nullptr);
	EXPECT_EQ(message.AddPointer("pointer", &message), B_OK);
	EXPECT_EQ(message.AddPointer("pointer", nullptr), B_OK);
	EXPECT_EQ(message.FindPointer("pointer", &value), B_OK);
	EXPECT_EQ(value, &message);
	EXPECT_EQ(message.FindPointer("pointer", 1, &value), B_OK);
	EXPECT_EQ(value, nullptr);
	EXPECT_EQ(message.ReplacePointer("pointer", 1, &value), B_OK);
	EXPECT_EQ(message.GetPointer("pointer", 1, nullptr), &value);
	EXPECT_EQ(message.ReplacePointer("pointer", nullptr), B_OK);
	EXPECT_EQ(message.GetPointer("pointer"), nullptr);
	EXPECT_EQ(message.GetPointer("none", &value), &value);
	EXPECT_EQ(message.SetPointer("new", &value), B_OK);
	EXPECT_TRUE(message.HasPointer("new"));
	EXPECT_FALSE(message.HasPointer("new", 1));
	EXPECT_EQ(message.FindPointer("pointer", nullptr), B_BAD_VALUE);
}


// #pragma mark - Raw data


TEST(MessageTest, DataNeedsANameAndBytes)
{
	BMessage message;
	EXPECT_EQ(message.AddData(nullptr, B_RAW_TYPE, "x", 1), B_BAD_VALUE);
	EXPECT_EQ(message.AddData("raw", B_RAW_TYPE, nullptr, 1), B_BAD_VALUE);
	EXPECT_EQ(message.AddData("raw", B_RAW_TYPE, "x", 0), B_BAD_VALUE);
	EXPECT_EQ(message.AddData("raw", B_RAW_TYPE, "x", -1), B_BAD_VALUE);
	EXPECT_EQ(message.AddData("raw", B_ANY_TYPE, "x", 1), B_BAD_VALUE);
	EXPECT_EQ(message.AddData("raw", B_RAW_TYPE, "x", ssize_t(1) << 40), B_NO_MEMORY);
	EXPECT_TRUE(message.IsEmpty());
}


TEST(MessageTest, NamesHaveUpTo255Bytes)
{
	const std::string longest(255, 'n');
	BMessage message;
	EXPECT_EQ(message.AddBool(longest.c_str(), true), B_OK);
	EXPECT_EQ(message.AddBool((longest + "n").c_str(), true), B_BAD_VALUE);
	EXPECT_EQ(message.Rename(longest.c_str(), (longest + "n").c_str()), B_BAD_VALUE);
	EXPECT_TRUE(message.FindBool(longest.c_str()));
	EXPECT_EQ(message.AddBool("", true), B_OK);
	EXPECT_TRUE(message.FindBool(""));
	EXPECT_EQ(message.CountNames(B_ANY_TYPE), 2);
}


TEST(MessageTest, ItemsOfAFixedFieldHaveOneSize)
{
	BMessage message;
	EXPECT_EQ(message.AddData("fixed", B_RAW_TYPE, "abcd", 4), B_OK);
	EXPECT_EQ(message.AddData("fixed", B_RAW_TYPE, "abc", 3), B_BAD_VALUE);
	// The first item decided what the field is.
	EXPECT_EQ(message.AddData("fixed", B_RAW_TYPE, "abc", 3, false), B_BAD_VALUE);
	EXPECT_EQ(message.AddData("fixed", B_RAW_TYPE, "efgh", 4, false), B_OK);
	EXPECT_EQ(message.ReplaceData("fixed", B_RAW_TYPE, "abc", 3), B_BAD_VALUE);
	EXPECT_EQ(message.ReplaceData("fixed", B_RAW_TYPE, 1, "ijkl", 4), B_OK);

	const void* data;
	ssize_t size;
	EXPECT_EQ(message.FindData("fixed", B_RAW_TYPE, 1, &data, &size), B_OK);
	EXPECT_EQ(std::string(static_cast<const char*>(data), size), "ijkl");
}


TEST(MessageTest, ItemsOfAVariableFieldHaveAnySize)
{
	BMessage message;
	EXPECT_EQ(message.AddData("raw", B_RAW_TYPE, "abcd", 4, false), B_OK);
	EXPECT_EQ(message.AddData("raw", B_RAW_TYPE, "efg", 3, true), B_OK);
	EXPECT_EQ(message.AddData("raw", B_RAW_TYPE, "h", 1, false, 7), B_OK);
	EXPECT_EQ(message.ReplaceData("raw", B_RAW_TYPE, 1, "123456", 6), B_OK);
	EXPECT_EQ(message.ReplaceData("raw", B_RAW_TYPE, "", 0), B_BAD_VALUE);
	EXPECT_EQ(message.ReplaceData("raw", B_RAW_TYPE, nullptr, 1), B_BAD_VALUE);
	EXPECT_EQ(message.ReplaceData("raw", B_ANY_TYPE, "x", 1), B_BAD_VALUE);
	EXPECT_EQ(message.ReplaceData("raw", B_RAW_TYPE, "x", ssize_t(1) << 40), B_NO_MEMORY);

	type_code type;
	bool isFixedSize = true;
	EXPECT_EQ(message.GetInfo("raw", &type, &isFixedSize), B_OK);
	EXPECT_FALSE(isFixedSize);
	std::string all;
	const void* data;
	ssize_t size;
	for (int32 i = 0; message.FindData("raw", B_ANY_TYPE, i, &data, &size) == B_OK; i++)
		all += std::string(static_cast<const char*>(data), size) + ",";
	EXPECT_EQ(all, "abcd,123456,h,");
}


TEST(MessageTest, FindDataTellsWhyAndGivesNothingOnFailure)
{
	BMessage message;
	message.AddData("raw", B_RAW_TYPE, "abcd", 4);
	const void* data = &message;
	ssize_t size = 1;
	EXPECT_EQ(message.FindData("none", B_RAW_TYPE, &data, &size), B_NAME_NOT_FOUND);
	EXPECT_EQ(data, nullptr);
	EXPECT_EQ(size, 0);
	EXPECT_EQ(message.FindData("raw", B_STRING_TYPE, &data, &size), B_BAD_TYPE);
	EXPECT_EQ(message.FindData("raw", B_RAW_TYPE, 1, &data, &size), B_BAD_INDEX);
	EXPECT_EQ(message.FindData("raw", B_RAW_TYPE, nullptr, &size), B_BAD_VALUE);
	EXPECT_EQ(message.FindData("raw", B_RAW_TYPE, &data, nullptr), B_OK);
	EXPECT_TRUE(message.HasData("raw", B_RAW_TYPE));
	EXPECT_TRUE(message.HasData("raw", B_ANY_TYPE));
	EXPECT_FALSE(message.HasData("raw", B_RAW_TYPE, 1));
	EXPECT_FALSE(message.HasData("raw", B_STRING_TYPE));
}


TEST(MessageTest, SetDataReplacesOrAdds)
{
	BMessage message;
	EXPECT_EQ(message.SetData("raw", B_RAW_TYPE, "ab", 2, false), B_OK);
	EXPECT_EQ(message.SetData("raw", B_RAW_TYPE, "cdef", 4, false), B_OK);
	EXPECT_EQ(message.SetData("raw", B_STRING_TYPE, "x", 2), B_BAD_TYPE);
	const void* data;
	ssize_t size;
	EXPECT_EQ(message.FindData("raw", B_RAW_TYPE, &data, &size), B_OK);
	EXPECT_EQ(size, 4);
	EXPECT_FALSE(message.HasData("raw", B_RAW_TYPE, 1));
}


TEST(MessageTest, FindingItemsInAnyOrderGivesEachOne)
{
	BMessage message;
	message.AddString("before", "x");
	for (int i = 0; i < 50; i++)
		message.AddString("list", std::string(i % 7, 'a' + i % 26).c_str());
	message.AddString("after", "y");
	for (int i = 0; i < 200; i++) {
		const int index = i * 37 % 50;
		ASSERT_EQ(std::string(message.FindString("list", index)),
			std::string(index % 7, 'a' + index % 26));
		if (i % 5 == 0)
			message.ReplaceString("before", std::string(i % 11, 'x').c_str());
		if (i % 7 == 0)
			message.AddString("before", "more");
		ASSERT_STREQ(message.FindString("after"), "y");
	}
	message.RemoveData("list", 10);
	for (int i = 10; i < 49; i++) {
		ASSERT_EQ(std::string(message.FindString("list", i)),
			std::string((i + 1) % 7, 'a' + (i + 1) % 26));
	}
}


// #pragma mark - Asking


TEST(MessageTest, GetInfoEnumeratesFieldsInTheirOrder)
{
	BMessage message;
	message.AddString("one", "1");
	message.AddInt32("two", 2);
	message.AddString("three", "3");
	message.AddString("one", "1 again");

	char* name;
	type_code type;
	int32 count;
	std::string strings;
	for (int32 i = 0; message.GetInfo(B_STRING_TYPE, i, &name, &type, &count) == B_OK; i++)
		strings += std::string(name) + std::to_string(count) + " ";
	EXPECT_EQ(strings, "one2 three1 ");
	EXPECT_EQ(message.GetInfo(B_STRING_TYPE, 2, &name, &type, &count), B_BAD_INDEX);
	EXPECT_EQ(name, nullptr);
	EXPECT_EQ(count, 0);
	EXPECT_EQ(message.GetInfo(B_STRING_TYPE, -1, &name, &type), B_BAD_INDEX);
	EXPECT_EQ(message.GetInfo(B_RECT_TYPE, 0, &name, &type), B_BAD_TYPE);

	EXPECT_EQ(message.GetInfo(B_ANY_TYPE, 1, &name, &type), B_OK);
	EXPECT_STREQ(name, "two");
	EXPECT_EQ(type, uint32(B_INT32_TYPE));
	EXPECT_EQ(message.GetInfo(B_ANY_TYPE, 3, &name, &type), B_BAD_INDEX);
	EXPECT_EQ(message.GetInfo(B_ANY_TYPE, 0, nullptr, nullptr, nullptr), B_OK);
	EXPECT_EQ(BMessage().GetInfo(B_ANY_TYPE, 0, &name, &type), B_BAD_INDEX);
	EXPECT_EQ(BMessage().GetInfo(B_STRING_TYPE, 0, &name, &type), B_BAD_TYPE);

	EXPECT_EQ(message.CountNames(B_ANY_TYPE), 3);
	EXPECT_EQ(message.CountNames(B_STRING_TYPE), 2);
	EXPECT_EQ(message.CountNames(B_RECT_TYPE), 0);
	EXPECT_FALSE(message.IsEmpty());
}


TEST(MessageTest, TheNameThatGetInfoFoundIsAsGoodAsAnother)
{
	BMessage message;
	for (int32 i = 0; i < 100; i++) {
		const std::string name = "field" + std::to_string(i);
		message.AddInt32(name.c_str(), i);
		message.AddString(("s" + name).c_str(), name.c_str());

		char* found;
		type_code type;
		ASSERT_EQ(message.GetInfo(B_INT32_TYPE, i, &found, &type), B_OK) << i;
		EXPECT_EQ(message.FindInt32(found), i);
		EXPECT_EQ(message.FindString(found), nullptr);
		ASSERT_EQ(message.GetInfo(B_STRING_TYPE, i / 2, &found, &type), B_OK) << i;
		EXPECT_EQ(message.FindString(found), "field" + std::to_string(i / 2));
		EXPECT_STREQ(message.FindString(found + 1), nullptr);
		EXPECT_EQ(message.FindInt32(found + 1), i / 2);
	}

	char* name;
	type_code type;
	ASSERT_EQ(message.GetInfo(B_STRING_TYPE, 7, &name, &type), B_OK);
	EXPECT_EQ(message.Rename("sfield7", "another"), B_OK);
	EXPECT_STREQ(message.FindString("another"), "field7");
	EXPECT_EQ(message.FindString("sfield7"), nullptr);
	ASSERT_EQ(message.GetInfo(B_STRING_TYPE, 7, &name, &type), B_OK);
	EXPECT_STREQ(message.FindString(name), "field7");
	EXPECT_EQ(message.RemoveName(name), B_OK);
	ASSERT_EQ(message.GetInfo(B_STRING_TYPE, 7, &name, &type), B_OK);
	EXPECT_STREQ(message.FindString(name), "field8");
}


TEST(MessageTest, GetInfoByNameTellsOfOneField)
{
	BMessage message;
	message.AddString("text", "x");
	type_code type;
	int32 count;
	bool isFixedSize = true;
	EXPECT_EQ(message.GetInfo("text", &type, &count, &isFixedSize), B_OK);
	EXPECT_EQ(type, uint32(B_STRING_TYPE));
	EXPECT_EQ(count, 1);
	EXPECT_FALSE(isFixedSize);
	EXPECT_EQ(message.GetInfo("text", nullptr), B_OK);
	EXPECT_EQ(message.GetInfo("none", &type, &count), B_NAME_NOT_FOUND);
	EXPECT_EQ(count, 0);
	EXPECT_EQ(message.GetInfo(nullptr, &type, &count), B_BAD_VALUE);
}


TEST(MessageTest, SystemMessagesAreTold)
{
	EXPECT_TRUE(BMessage(B_QUIT_REQUESTED).IsSystem());
	EXPECT_TRUE(BMessage('_ABC').IsSystem());
	EXPECT_FALSE(BMessage('_AbC').IsSystem());
	EXPECT_FALSE(BMessage('_AB1').IsSystem());
	EXPECT_FALSE(BMessage('ABCD').IsSystem());
	EXPECT_FALSE(BMessage().IsSystem());
}


// #pragma mark - Removing, renaming, copying


TEST(MessageTest, RemovingTheLastItemRemovesTheField)
{
	BMessage message;
	message.AddString("text", "a");
	message.AddString("text", "b");
	message.AddInt32("number", 1);
	message.AddInt32("number", 2);
	EXPECT_EQ(message.RemoveData("text", 2), B_BAD_INDEX);
	EXPECT_EQ(message.RemoveData("text", -1), B_BAD_INDEX);
	EXPECT_EQ(message.RemoveData("none"), B_NAME_NOT_FOUND);
	EXPECT_EQ(message.RemoveData(nullptr), B_BAD_VALUE);
	EXPECT_EQ(message.RemoveData("text"), B_OK);
	EXPECT_STREQ(message.FindString("text"), "b");
	EXPECT_EQ(message.RemoveData("number", 1), B_OK);
	EXPECT_EQ(message.FindInt32("number"), 1);
	EXPECT_FALSE(message.HasInt32("number", 1));
	EXPECT_EQ(message.RemoveData("text"), B_OK);
	EXPECT_FALSE(message.HasString("text"));
	EXPECT_EQ(message.CountNames(B_ANY_TYPE), 1);
	EXPECT_EQ(message.AddBool("text", true), B_OK);
}


TEST(MessageTest, RemoveNameRemovesAllItems)
{
	BMessage message;
	message.AddString("text", "a");
	message.AddString("text", "b");
	message.AddBool("flag", true);
	EXPECT_EQ(message.RemoveName("text"), B_OK);
	EXPECT_EQ(message.RemoveName("text"), B_NAME_NOT_FOUND);
	EXPECT_EQ(message.RemoveName(nullptr), B_BAD_VALUE);
	EXPECT_TRUE(message.FindBool("flag"));
}


TEST(MessageTest, MakeEmptyKeepsTheCode)
{
	BMessage message('code');
	message.AddBool("flag", true);
	EXPECT_EQ(message.MakeEmpty(), B_OK);
	EXPECT_TRUE(message.IsEmpty());
	EXPECT_EQ(message.what, uint32('code'));
	EXPECT_EQ(FlatBytes(message), FlatBytes(BMessage('code')));
	EXPECT_EQ(message.AddBool("flag", true), B_OK);
}


TEST(MessageTest, RenameKeepsPlaceAndItems)
{
	BMessage message;
	message.AddString("one", "1");
	message.AddString("two", "2");
	EXPECT_EQ(message.Rename("one", "a much longer name"), B_OK);
	EXPECT_FALSE(message.HasString("one"));
	EXPECT_STREQ(message.FindString("a much longer name"), "1");
	EXPECT_STREQ(message.FindString("two"), "2");
	char* name;
	type_code type;
	EXPECT_EQ(message.GetInfo(B_ANY_TYPE, 0, &name, &type), B_OK);
	EXPECT_STREQ(name, "a much longer name");

	EXPECT_EQ(message.Rename("two", "a much longer name"), B_NAME_IN_USE);
	EXPECT_EQ(message.Rename("two", "two"), B_NAME_IN_USE);
	EXPECT_EQ(message.Rename("none", "new"), B_NAME_NOT_FOUND);
	EXPECT_EQ(message.Rename(nullptr, "new"), B_BAD_VALUE);
	EXPECT_EQ(message.Rename("two", nullptr), B_BAD_VALUE);
	EXPECT_STREQ(message.FindString("two"), "2");
}


TEST(MessageTest, CopiesAreIndependent)
{
	BMessage message('orig');
	message.AddString("text", "original");
	BMessage copy(message);
	BMessage assigned;
	assigned.AddBool("old", true);
	assigned = message;
	message.ReplaceString("text", "changed");

	for (const BMessage* each : {&copy, &assigned}) {
		EXPECT_EQ(each->what, uint32('orig'));
		EXPECT_STREQ(each->FindString("text"), "original");
		EXPECT_EQ(each->CountNames(B_ANY_TYPE), 1);
	}
	BMessage& self = copy;
	copy = self;
	EXPECT_STREQ(copy.FindString("text"), "original");
}


TEST(MessageTest, AppendAddsEveryItemOrNone)
{
	BMessage message;
	message.AddString("text", "a");
	BMessage other('othr');
	other.AddString("text", "b");
	other.AddInt32("number", 1);
	other.AddData("raw", B_RAW_TYPE, "xyz", 3, false);
	EXPECT_EQ(message.Append(other), B_OK);
	EXPECT_EQ(message.what, 0u);
	EXPECT_STREQ(message.FindString("text", 1), "b");
	EXPECT_EQ(message.FindInt32("number"), 1);
	type_code type;
	bool isFixedSize = true;
	EXPECT_EQ(message.GetInfo("raw", &type, &isFixedSize), B_OK);
	EXPECT_FALSE(isFixedSize);

	BMessage mismatched;
	mismatched.AddInt32("number", 2);
	mismatched.AddBool("text", true);
	EXPECT_EQ(message.Append(mismatched), B_BAD_TYPE);
	EXPECT_FALSE(message.HasInt32("number", 1));

	EXPECT_EQ(message.Append(message), B_OK);
	EXPECT_STREQ(message.FindString("text", 3), "b");
}


TEST(MessageTest, HasSameDataComparesFieldsAndItems)
{
	BMessage one('one ');
	one.AddString("a", "x");
	one.AddInt32("b", 1);
	BMessage other('two ');
	other.AddInt32("b", 1);
	other.AddString("a", "x");
	EXPECT_TRUE(one.HasSameData(other));
	EXPECT_FALSE(one.HasSameData(other, false));
	other.AddInt32("b", 2);
	EXPECT_FALSE(one.HasSameData(other));
	other.RemoveData("b", 1);
	other.ReplaceInt32("b", 2);
	EXPECT_FALSE(one.HasSameData(other));
	other.ReplaceInt32("b", 1);
	other.AddBool("c", true);
	EXPECT_FALSE(one.HasSameData(other));
	one.AddBool("d", true);
	EXPECT_FALSE(one.HasSameData(other));
	EXPECT_TRUE(BMessage().HasSameData(BMessage('x')));
}


TEST(MessageTest, HasSameDataLooksIntoNestedMessagesWhenDeep)
{
	BMessage inner('innr');
	inner.AddBool("a", true);
	inner.AddBool("b", true);
	BMessage reversed('innr');
	reversed.AddBool("b", true);
	reversed.AddBool("a", true);
	BMessage one;
	one.AddMessage("inner", &inner);
	BMessage other;
	other.AddMessage("inner", &reversed);
	EXPECT_FALSE(one.HasSameData(other));
	EXPECT_TRUE(one.HasSameData(other, true, true));
	EXPECT_FALSE(one.HasSameData(other, false, true));
	reversed.what = 'else';
	other.ReplaceMessage("inner", &reversed);
	EXPECT_FALSE(one.HasSameData(other, true, true));
}


// #pragma mark - Many fields


TEST(MessageTest, ManyFieldsAreAllFound)
{
	BMessage message;
	for (int i = 0; i < 3000; i++) {
		const std::string name = "field" + std::to_string(i);
		ASSERT_EQ(message.AddString(name.c_str(), std::to_string(i * i).c_str()), B_OK);
	}
	for (int i = 0; i < 3000; i += 3)
		ASSERT_EQ(message.RemoveName(("field" + std::to_string(i)).c_str()), B_OK);
	for (int i = 0; i < 3000; i++) {
		const char* value = message.FindString(("field" + std::to_string(i)).c_str());
		if (i % 3 == 0)
			ASSERT_EQ(value, nullptr) << i;
		else
			ASSERT_EQ(std::string(value), std::to_string(i * i));
	}
}


// Messages with many fields find them by another way than small ones.
TEST(MessageTest, ManyFieldsAreFoundByTheirNames)
{
	BMessage message;
	const int32 count = 1000;
	for (int32 i = 0; i < count; i++) {
		const std::string name = "Button" + std::to_string(i);
		ASSERT_EQ(message.AddInt32(name.c_str(), i), B_OK);
		ASSERT_FALSE(message.HasInt32(("Button" + std::to_string(i + 1)).c_str()));
	}
	ASSERT_EQ(message.RemoveName("Button500"), B_OK);
	ASSERT_EQ(message.Rename("Button501", "Renamed"), B_OK);
	ASSERT_EQ(message.AddInt32("Button500", -1), B_OK);

	BMessage copy(message);
	std::vector<char> flat(message.FlattenedSize());
	ASSERT_EQ(message.Flatten(flat.data(), ssize_t(flat.size())), B_OK);
	BMessage read;
	ASSERT_EQ(read.Unflatten(flat.data()), B_OK);
	for (const BMessage* each : {&message, &copy, &read}) {
		EXPECT_EQ(each->CountNames(B_ANY_TYPE), count);
		EXPECT_FALSE(each->HasInt32("Button501"));
		EXPECT_EQ(each->FindInt32("Renamed"), 501);
		EXPECT_EQ(each->FindInt32("Button500"), -1);
		for (int32 i = 0; i < count; i++) {
			if (i == 500 || i == 501)
				continue;
			ASSERT_EQ(each->FindInt32(("Button" + std::to_string(i)).c_str()), i);
		}
	}
}


TEST(MessageTest, ManyFieldsOfTwoTypesAreListedInOrder)
{
	BMessage message;
	for (int32 i = 0; i < 200; i++) {
		message.AddInt32(("number" + std::to_string(i)).c_str(), i);
		message.AddString(("text" + std::to_string(i)).c_str(), "");
	}
	message.RemoveName("number0");
	const auto nameAt = [&message](type_code type, int32 index) {
		char* name;
		type_code found;
		return message.GetInfo(type, index, &name, &found) == B_OK ? std::string(name) : "";
	};

	// Up, down and by turns: the place of the last answer must not show.
	for (int32 i = 0; i < 199; i++) {
		EXPECT_EQ(nameAt(B_INT32_TYPE, i), "number" + std::to_string(i + 1));
		EXPECT_EQ(nameAt(B_STRING_TYPE, 199 - i), "text" + std::to_string(199 - i));
		EXPECT_EQ(nameAt(B_STRING_TYPE, i), "text" + std::to_string(i));
	}
	EXPECT_EQ(nameAt(B_INT32_TYPE, 199), "");
	EXPECT_EQ(nameAt(B_INT32_TYPE, 10), "number11");
	EXPECT_EQ(nameAt(B_ANY_TYPE, 398), "text199");
	EXPECT_EQ(nameAt(B_ANY_TYPE, 399), "");
	message.RemoveName("text3");
	EXPECT_EQ(nameAt(B_STRING_TYPE, 3), "text4");
	EXPECT_EQ(nameAt(B_INT32_TYPE, 10), "number11");
}

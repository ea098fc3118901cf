// SPDX-License-Identifier: MIT
// Tests of the property store.

#include "model/PropertyStore.h"

#include <string>

#include <Flattenable.h>
#include <Point.h>
#include <Rect.h>
#include <gtest/gtest.h>

#include "model/Component.h"
#include "support/Printers.h"

namespace {

int32
CountItems(const BMessage& message, const char* name)
{
	type_code type;
	int32 count = 0;
	return message.GetInfo(name, &type, &count) == B_OK ? count : 0;
}


/// One byte that can be put into a message.
class FlatByte : public BFlattenable {
public:
	explicit FlatByte(uint8 value)
		: fValue(value)
	{
	}

	bool IsFixedSize() const override { return true; }
	type_code TypeCode() const override { return 'tByt'; }
	ssize_t FlattenedSize() const override { return 1; }

	status_t Flatten(void* buffer, ssize_t size) const override
	{
		if (size < 1)
			return B_BAD_VALUE;
		*static_cast<uint8*>(buffer) = fValue;
		return B_OK;
	}

	status_t Unflatten(type_code, const void* buffer, ssize_t) override
	{
		fValue = *static_cast<const uint8*>(buffer);
		return B_OK;
	}

	uint8 Value() const { return fValue; }

private:
	uint8 fValue;
};

} // namespace

TEST(PropertyStoreTest, ANewStoreIsEmptyAndKnowsItsComponent)
{
	TComponent component(nullptr, nullptr, CT_VISUAL);
	TComponent other(nullptr, nullptr, CT_VISUAL);
	TPropertyStore store(&component);
	EXPECT_EQ(store.what, uint32('prop'));
	EXPECT_TRUE(store.IsEmpty());
	EXPECT_EQ(store.Component(), &component);
	store.SetComponent(&other);
	EXPECT_EQ(store.Component(), &other);
}


TEST(PropertyStoreTest, AStringSetAgainReplacesTheFirst)
{
	TPropertyStore store(nullptr);
	EXPECT_EQ(store.SetString("Left", "5"), B_OK);
	EXPECT_EQ(store.SetString("Left", "5"), B_OK);
	EXPECT_EQ(CountItems(store, "Left"), 1);
	EXPECT_STREQ(store.FindString("Left"), "5");

	EXPECT_EQ(store.SetString("Left", "7"), B_OK);
	EXPECT_EQ(CountItems(store, "Left"), 1);
	EXPECT_STREQ(store.FindString("Left"), "7");
}


TEST(PropertyStoreTest, ANullStringIsStoredAsTheEmptyOne)
{
	TPropertyStore store(nullptr);
	EXPECT_EQ(store.SetString("Left", "5"), B_OK);
	EXPECT_EQ(store.SetString("Left", nullptr), B_OK);
	EXPECT_STREQ(store.FindString("Left"), "");
	EXPECT_EQ(store.SetString("Top", nullptr), B_OK);
	EXPECT_TRUE(store.HasString("Top"));
	EXPECT_STREQ(store.FindString("Top"), "");
}


TEST(PropertyStoreTest, ANullNameIsRefused)
{
	TPropertyStore store(nullptr);
	EXPECT_NE(store.SetString(nullptr, "5"), B_OK);
	EXPECT_NE(store.SetInt32(nullptr, 5), B_OK);
	EXPECT_TRUE(store.IsEmpty());
}


TEST(PropertyStoreTest, ATextOfTheStoreCanBeStoredElsewhere)
{
	TPropertyStore store(nullptr);
	for (size_t length : {3, 255, 256, 3000}) {
		const std::string text(length, 'x');
		ASSERT_EQ(store.SetString("From", text.c_str()), B_OK);
		ASSERT_EQ(store.SetString(std::to_string(length).c_str(), store.FindString("From")), B_OK);
		ASSERT_EQ(store.SetString("Other", "o"), B_OK);
		ASSERT_EQ(store.SetString("Other", store.FindString("From")), B_OK);
		EXPECT_EQ(store.FindString(std::to_string(length).c_str()), text);
		EXPECT_EQ(store.FindString("Other"), text);
	}
}


TEST(PropertyStoreTest, ANameTakenByAnotherTypeIsLeftAlone)
{
	TPropertyStore store(nullptr);
	ASSERT_EQ(store.SetRect("Frame", BRect(1, 2, 3, 4)), B_OK);
	EXPECT_EQ(store.SetString("Frame", "text"), B_BAD_TYPE);
	EXPECT_EQ(store.FindRect("Frame"), BRect(1, 2, 3, 4));
}


TEST(PropertyStoreTest, SettersOfEveryTypeReplaceTheFirstItem)
{
	TPropertyStore store(nullptr);
	for (int32 i = 1; i <= 2; i++) {
		EXPECT_EQ(store.SetBool("bool", i == 2), B_OK);
		EXPECT_EQ(store.SetInt8("int8", i), B_OK);
		EXPECT_EQ(store.SetInt16("int16", i), B_OK);
		EXPECT_EQ(store.SetInt32("int32", i), B_OK);
		EXPECT_EQ(store.SetInt64("int64", i), B_OK);
		EXPECT_EQ(store.SetFloat("float", i), B_OK);
		EXPECT_EQ(store.SetDouble("double", i), B_OK);
		EXPECT_EQ(store.SetPoint("point", BPoint(i, i)), B_OK);
		EXPECT_EQ(store.SetRect("rect", BRect(i, i, i, i)), B_OK);
		const BMessage message('0' + i);
		EXPECT_EQ(store.SetMessage("message", &message), B_OK);
		const FlatByte flat(i);
		EXPECT_EQ(store.SetFlat("flat", &flat), B_OK);
	}

	EXPECT_EQ(store.CountNames(B_ANY_TYPE), 11);
	for (const char* name : {"bool", "int8", "int16", "int32", "int64", "float", "double", "point",
			 "rect", "message", "flat"})
		EXPECT_EQ(CountItems(store, name), 1) << name;

	EXPECT_TRUE(store.FindBool("bool"));
	EXPECT_EQ(store.FindInt8("int8"), 2);
	EXPECT_EQ(store.FindInt16("int16"), 2);
	EXPECT_EQ(store.FindInt32("int32"), 2);
	EXPECT_EQ(store.FindInt64("int64"), 2);
	EXPECT_EQ(store.FindFloat("float"), 2);
	EXPECT_EQ(store.FindDouble("double"), 2);
	EXPECT_EQ(store.FindPoint("point"), BPoint(2, 2));
	EXPECT_EQ(store.FindRect("rect"), BRect(2, 2, 2, 2));
	BMessage message;
	ASSERT_EQ(store.FindMessage("message", &message), B_OK);
	EXPECT_EQ(message.what, uint32('2'));
	FlatByte flat(0);
	ASSERT_EQ(store.FindFlat("flat", &flat), B_OK);
	EXPECT_EQ(flat.Value(), 2);
}


TEST(PropertyStoreTest, OtherItemsOfAFieldStay)
{
	TPropertyStore store(nullptr);
	store.AddString("Items", "a");
	store.AddString("Items", "b");
	EXPECT_EQ(store.SetString("Items", "c"), B_OK);
	EXPECT_STREQ(store.FindString("Items", int32(0)), "c");
	EXPECT_STREQ(store.FindString("Items", int32(1)), "b");
}


TEST(PropertyStoreTest, MissingObjectsAreRefused)
{
	TPropertyStore store(nullptr);
	EXPECT_EQ(store.SetMessage("message", nullptr), B_BAD_VALUE);
	EXPECT_EQ(store.SetFlat("flat", nullptr), B_BAD_VALUE);
	EXPECT_TRUE(store.IsEmpty());
}

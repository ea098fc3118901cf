// SPDX-License-Identifier: MIT
// Fields of strings, nested messages, references, messengers and flattenable objects.

#include <cstring>

#include <Entry.h>
#include <Errors.h>
#include <Flattenable.h>
#include <Message.h>
#include <Messenger.h>
#include <String.h>
#include <StringList.h>
#include <gtest/gtest.h>

#include "kits/app/Recorder.h"

namespace {

/// A flattenable object of four bytes that also takes the type of a raw item.
class Token : public BFlattenable {
public:
	bool IsFixedSize() const override { return true; }
	type_code TypeCode() const override { return 'tokn'; }
	bool AllowsTypeCode(type_code code) const override
	{
		return code == 'tokn' || code == B_RAW_TYPE;
	}
	ssize_t FlattenedSize() const override { return sizeof(value); }
	status_t Flatten(void* buffer, ssize_t size) const override
	{
		if (failure != B_OK || size < ssize_t(sizeof(value)))
			return failure != B_OK ? failure : B_BAD_VALUE;
		memcpy(buffer, &value, sizeof(value));
		return B_OK;
	}
	status_t Unflatten(type_code code, const void* buffer, ssize_t size) override
	{
		if (!AllowsTypeCode(code) || size != sizeof(value))
			return B_BAD_VALUE;
		memcpy(&value, buffer, sizeof(value));
		return B_OK;
	}

	int32 value = 0;
	status_t failure = B_OK;
};

} // namespace


// #pragma mark - Strings


TEST(MessageObjectsTest, StringFieldKeepsItsRules)
{
	BMessage message;
	const char* text = "old";
	EXPECT_EQ(message.FindString("text", &text), B_NAME_NOT_FOUND);
	EXPECT_EQ(text, nullptr);
	EXPECT_EQ(message.ReplaceString("text", "new"), B_NAME_NOT_FOUND);
	EXPECT_EQ(message.AddString("text", static_cast<const char*>(nullptr)), B_BAD_VALUE);
	EXPECT_EQ(message.AddString(nullptr, "text"), B_BAD_VALUE);
	EXPECT_TRUE(message.IsEmpty());

	EXPECT_EQ(message.AddString("text", "one"), B_OK);
	EXPECT_EQ(message.AddString("text", BString("twenty")), B_OK);
	EXPECT_EQ(message.AddString("text", ""), B_OK);
	EXPECT_EQ(message.FindString("text", 1, &text), B_OK);
	EXPECT_STREQ(text, "twenty");
	EXPECT_EQ(message.FindString("text", 3, &text), B_BAD_INDEX);
	EXPECT_EQ(text, nullptr);
	EXPECT_EQ(message.FindString("text", static_cast<const char**>(nullptr)), B_BAD_VALUE);

	BString string("old");
	EXPECT_EQ(message.FindString("text", 2, &string), B_OK);
	EXPECT_EQ(string, "");
	EXPECT_EQ(message.FindString("text", &string), B_OK);
	EXPECT_EQ(string, "one");
	EXPECT_EQ(message.FindString("none", &string), B_NAME_NOT_FOUND);
	EXPECT_EQ(string, "");
	EXPECT_EQ(message.FindString("text", static_cast<BString*>(nullptr)), B_BAD_VALUE);

	EXPECT_EQ(message.ReplaceString("text", "longer than before"), B_OK);
	EXPECT_EQ(message.ReplaceString("text", 1, BString("2")), B_OK);
	EXPECT_EQ(message.ReplaceString("text", 3, "x"), B_BAD_INDEX);
	EXPECT_EQ(message.ReplaceString("text", static_cast<const char*>(nullptr)), B_BAD_VALUE);
	EXPECT_STREQ(message.FindString("text"), "longer than before");
	EXPECT_STREQ(message.FindString("text", 1), "2");
	EXPECT_STREQ(message.FindString("text", 2), "");

	message.AddInt32("number", 1);
	EXPECT_EQ(message.AddString("number", "x"), B_BAD_TYPE);
	EXPECT_EQ(message.ReplaceString("number", "x"), B_BAD_TYPE);
	EXPECT_EQ(message.FindString("number", &text), B_BAD_TYPE);
	EXPECT_TRUE(message.HasString("text", 2));
	EXPECT_FALSE(message.HasString("text", 3));
	EXPECT_FALSE(message.HasString("number"));
}


TEST(MessageObjectsTest, SetAndGetStringReplaceTheFirstItemOrAdd)
{
	BMessage message;
	EXPECT_EQ(message.GetString("text"), nullptr);
	EXPECT_STREQ(message.GetString("text", "default"), "default");
	EXPECT_EQ(message.SetString("text", "one"), B_OK);
	EXPECT_EQ(message.SetString("text", BString("two")), B_OK);
	EXPECT_EQ(message.SetString("text", static_cast<const char*>(nullptr)), B_BAD_VALUE);
	EXPECT_STREQ(message.GetString("text", "default"), "two");
	EXPECT_STREQ(message.GetString("text", 1, "default"), "default");
	int32 count;
	type_code type;
	EXPECT_EQ(message.GetInfo("text", &type, &count), B_OK);
	EXPECT_EQ(count, 1);
}


TEST(MessageObjectsTest, StringListsAddAndFindAllItems)
{
	BStringList list;
	list.Add("a");
	list.Add("b");
	BMessage message;
	EXPECT_EQ(message.AddStrings("list", list), B_OK);
	EXPECT_STREQ(message.FindString("list", 1), "b");

	BStringList found;
	found.Add("old");
	EXPECT_EQ(message.FindStrings("list", &found), B_OK);
	EXPECT_EQ(found, list);
	EXPECT_EQ(message.FindStrings("none", &found), B_NAME_NOT_FOUND);
	EXPECT_TRUE(found.IsEmpty());
	message.AddBool("flag", true);
	EXPECT_EQ(message.FindStrings("flag", &found), B_BAD_TYPE);
	EXPECT_EQ(message.FindStrings("list", nullptr), B_BAD_VALUE);
}


TEST(MessageObjectsTest, StringWithoutItsTerminatorIsNotThere)
{
	BMessage message;
	message.AddData("unterminated", B_STRING_TYPE, "abc", 3, false);
	message.AddData("two", B_STRING_TYPE, "a\0b", 4, false);
	for (const char* name : {"unterminated", "two"}) {
		const char* text = "old";
		EXPECT_EQ(message.FindString(name, &text), B_BAD_DATA) << name;
		EXPECT_EQ(text, nullptr) << name;
		EXPECT_FALSE(message.HasString(name)) << name;
		EXPECT_EQ(message.FindString(name), nullptr) << name;
		EXPECT_TRUE(message.HasData(name, B_STRING_TYPE)) << name;
	}
}


// A program may hand a message its own strings and names; they move while it grows.
TEST(MessageObjectsTest, OwnBytesCanBeAddedAndReplaced)
{
	BMessage message;
	message.AddString("text", "the first item");
	for (int i = 0; i < 100; i++)
		ASSERT_EQ(message.AddString("text", message.FindString("text")), B_OK);
	EXPECT_STREQ(message.FindString("text", 100), "the first item");

	for (int i = 0; i < 10; i++) {
		const char* last = message.FindString("text", 100);
		ASSERT_EQ(message.AddString(last, last), B_OK);
	}
	EXPECT_STREQ(message.FindString("the first item", 9), "the first item");

	message.ReplaceString("text", 1, "longer than all the others");
	ASSERT_EQ(message.ReplaceString("text", message.FindString("text", 1)), B_OK);
	EXPECT_STREQ(message.FindString("text"), "longer than all the others");
	ASSERT_EQ(message.Rename("text", message.FindString("text", 1)), B_OK);
	EXPECT_STREQ(message.FindString("longer than all the others", 2), "the first item");

	char* name;
	type_code type;
	ASSERT_EQ(message.GetInfo(B_ANY_TYPE, 0, &name, &type), B_OK);
	EXPECT_EQ(message.RemoveName(name), B_OK);
	EXPECT_EQ(message.CountNames(B_ANY_TYPE), 1);
}


// #pragma mark - Nested messages


TEST(MessageObjectsTest, MessageFieldKeepsItsRules)
{
	BMessage inner('innr');
	inner.AddString("text", "inside");
	BMessage message('outr');
	BMessage found('old ');
	found.AddBool("old", true);
	EXPECT_EQ(message.FindMessage("inner", &found), B_NAME_NOT_FOUND);
	EXPECT_TRUE(found.IsEmpty());
	EXPECT_EQ(found.what, 0u);

	EXPECT_EQ(message.AddMessage("inner", &inner), B_OK);
	inner.ReplaceString("text", "changed since");
	EXPECT_EQ(message.AddMessage("inner", &inner), B_OK);
	EXPECT_EQ(message.FindMessage("inner", &found), B_OK);
	EXPECT_EQ(found.what, uint32('innr'));
	EXPECT_STREQ(found.FindString("text"), "inside");
	EXPECT_EQ(message.FindMessage("inner", 1, &found), B_OK);
	EXPECT_STREQ(found.FindString("text"), "changed since");
	EXPECT_EQ(message.FindMessage("inner", 2, &found), B_BAD_INDEX);
	EXPECT_TRUE(found.IsEmpty());

	BMessage empty('empt');
	EXPECT_EQ(message.ReplaceMessage("inner", &empty), B_OK);
	EXPECT_EQ(message.FindMessage("inner", &found), B_OK);
	EXPECT_EQ(found.what, uint32('empt'));
	EXPECT_EQ(message.ReplaceMessage("inner", 2, &empty), B_BAD_INDEX);
	EXPECT_EQ(message.ReplaceMessage("none", &empty), B_NAME_NOT_FOUND);
	EXPECT_EQ(message.ReplaceMessage("inner", nullptr), B_BAD_VALUE);
	EXPECT_EQ(message.AddMessage("inner", nullptr), B_BAD_VALUE);
	EXPECT_EQ(message.AddMessage(nullptr, &inner), B_BAD_VALUE);
	EXPECT_EQ(message.FindMessage("inner", nullptr), B_BAD_VALUE);
	EXPECT_TRUE(message.HasMessage("inner", 1));
	EXPECT_FALSE(message.HasMessage("inner", 2));

	message.AddBool("flag", true);
	EXPECT_EQ(message.AddMessage("flag", &inner), B_BAD_TYPE);
	EXPECT_EQ(message.FindMessage("flag", &found), B_BAD_TYPE);
}


TEST(MessageObjectsTest, DamagedNestedMessageIsNotThereAndTheRestIs)
{
	BMessage message;
	message.AddData("inner", B_MESSAGE_TYPE, "HMF1 and no more", 16, false);
	message.AddData("inner", B_MESSAGE_TYPE, "no message", 10, false);
	message.AddString("after", "sound");
	BMessage found('old ');
	EXPECT_EQ(message.FindMessage("inner", &found), B_BAD_DATA);
	EXPECT_TRUE(found.IsEmpty());
	found.AddBool("old", true);
	EXPECT_EQ(message.FindMessage("inner", 1, &found), B_BAD_DATA);
	EXPECT_TRUE(found.IsEmpty());
	EXPECT_STREQ(message.FindString("after"), "sound");
}


TEST(MessageObjectsTest, MessageCanBeFoundInItselfAndAddedToItself)
{
	BMessage message('outr');
	message.AddString("text", "outer");
	ASSERT_EQ(message.AddMessage("inner", &message), B_OK);
	ASSERT_EQ(message.FindMessage("inner", &message), B_OK);
	EXPECT_STREQ(message.FindString("text"), "outer");
	EXPECT_FALSE(message.HasMessage("inner"));
}


// #pragma mark - Flattenable objects


TEST(MessageObjectsTest, FlattenableObjectsAreVariableFields)
{
	Token token;
	token.value = 42;
	BMessage message;
	EXPECT_EQ(message.AddFlat("token", &token), B_OK);
	const Token constant;
	EXPECT_EQ(message.AddFlat("token", &constant, 2), B_OK);
	type_code type;
	bool isFixedSize = true;
	EXPECT_EQ(message.GetInfo("token", &type, &isFixedSize), B_OK);
	EXPECT_EQ(type, uint32('tokn'));
	EXPECT_FALSE(isFixedSize);

	Token found;
	EXPECT_EQ(message.FindFlat("token", &found), B_OK);
	EXPECT_EQ(found.value, 42);
	EXPECT_EQ(message.FindFlat("token", 1, &found), B_OK);
	EXPECT_EQ(found.value, 0);
	EXPECT_EQ(message.FindFlat("token", 2, &found), B_BAD_INDEX);
	EXPECT_EQ(message.FindFlat("none", &found), B_NAME_NOT_FOUND);
	EXPECT_EQ(message.FindFlat("token", nullptr), B_BAD_VALUE);
	EXPECT_TRUE(message.HasFlat("token", &found));
	EXPECT_TRUE(message.HasFlat("token", 1, &found));
	EXPECT_FALSE(message.HasFlat("token", 2, &found));
	EXPECT_FALSE(message.HasFlat("token", nullptr));

	token.value = 7;
	EXPECT_EQ(message.ReplaceFlat("token", 1, &token), B_OK);
	EXPECT_EQ(message.FindFlat("token", 1, &found), B_OK);
	EXPECT_EQ(found.value, 7);
	EXPECT_EQ(message.ReplaceFlat("token", &token), B_OK);
	EXPECT_EQ(message.ReplaceFlat("none", &token), B_NAME_NOT_FOUND);
	EXPECT_EQ(message.ReplaceFlat("token", nullptr), B_BAD_VALUE);
	EXPECT_EQ(message.SetFlat("token", &token), B_OK);
	EXPECT_EQ(message.SetFlat("fresh", &token), B_OK);
	EXPECT_EQ(message.SetFlat("fresh", nullptr), B_BAD_VALUE);
	EXPECT_EQ(message.AddFlat("token", static_cast<BFlattenable*>(nullptr)), B_BAD_VALUE);

	message.AddBool("flag", true);
	EXPECT_EQ(message.FindFlat("flag", &found), B_BAD_TYPE);
	EXPECT_EQ(message.AddFlat("flag", &token), B_BAD_TYPE);
	EXPECT_FALSE(message.HasFlat("flag", &found));
}


TEST(MessageObjectsTest, FlattenableObjectTakesEveryTypeItAllows)
{
	BMessage message;
	message.AddData("raw", B_RAW_TYPE, "\1\0\0\0", 4);
	message.AddData("short", B_RAW_TYPE, "\1", 1);
	Token found;
	EXPECT_EQ(message.FindFlat("raw", &found), B_OK);
	EXPECT_EQ(found.value, 1);
	EXPECT_EQ(message.FindFlat("short", &found), B_BAD_VALUE);
}


TEST(MessageObjectsTest, ObjectThatCannotBeFlattenedIsNotAdded)
{
	Token token;
	token.failure = B_NO_INIT;
	BMessage message;
	EXPECT_EQ(message.AddFlat("token", &token), B_NO_INIT);
	EXPECT_TRUE(message.IsEmpty());
}


// #pragma mark - Messengers and entry references


TEST(MessageObjectsTest, MessengerFieldKeepsItsRules)
{
	RecordingLooper* looper = new RecordingLooper();
	looper->Unlock();
	const BMessenger target(NULL, looper);
	BMessage message;
	BMessenger found(target);
	EXPECT_EQ(message.FindMessenger("target", &found), B_NAME_NOT_FOUND);
	EXPECT_FALSE(found.IsValid());
	EXPECT_EQ(message.AddMessenger("target", target), B_OK);
	EXPECT_EQ(message.AddMessenger("target", BMessenger()), B_OK);
	EXPECT_EQ(message.FindMessenger("target", &found), B_OK);
	EXPECT_EQ(found, target);
	EXPECT_EQ(message.FindMessenger("target", 1, &found), B_OK);
	EXPECT_FALSE(found.IsValid());
	EXPECT_EQ(message.FindMessenger("target", 2, &found), B_BAD_INDEX);
	EXPECT_EQ(message.FindMessenger("target", nullptr), B_BAD_VALUE);
	EXPECT_EQ(message.ReplaceMessenger("target", 1, target), B_OK);
	EXPECT_EQ(message.ReplaceMessenger("target", BMessenger()), B_OK);
	EXPECT_EQ(message.ReplaceMessenger("none", target), B_NAME_NOT_FOUND);
	EXPECT_EQ(message.FindMessenger("target", 1, &found), B_OK);
	EXPECT_EQ(found, target);
	EXPECT_TRUE(message.HasMessenger("target", 1));
	EXPECT_FALSE(message.HasMessenger("target", 2));

	message.AddData("short", B_MESSENGER_TYPE, "abc", 3);
	EXPECT_EQ(message.FindMessenger("short", &found), B_BAD_DATA);
	EXPECT_FALSE(found.IsValid());
	message.AddBool("flag", true);
	EXPECT_EQ(message.AddMessenger("flag", target), B_BAD_TYPE);
	looper->Lock();
	looper->Quit();
}


TEST(MessageObjectsTest, ReferenceFieldKeepsItsRules)
{
	const entry_ref first(3, 4567890123, "leaf name");
	const entry_ref second(5, 6, "x");
	BMessage message;
	entry_ref found(first);
	EXPECT_EQ(message.FindRef("refs", &found), B_NAME_NOT_FOUND);
	EXPECT_EQ(found, entry_ref());
	EXPECT_EQ(message.AddRef("refs", &first), B_OK);
	EXPECT_EQ(message.AddRef("refs", &second), B_OK);
	EXPECT_EQ(message.FindRef("refs", &found), B_OK);
	EXPECT_EQ(found, first);
	EXPECT_EQ(message.FindRef("refs", 1, &found), B_OK);
	EXPECT_EQ(found, second);
	EXPECT_EQ(message.FindRef("refs", 2, &found), B_BAD_INDEX);
	EXPECT_EQ(found, entry_ref());
	EXPECT_EQ(message.FindRef("refs", nullptr), B_BAD_VALUE);
	EXPECT_EQ(message.AddRef("refs", nullptr), B_BAD_VALUE);
	EXPECT_EQ(message.ReplaceRef("refs", nullptr), B_BAD_VALUE);
	EXPECT_EQ(message.ReplaceRef("refs", &second), B_OK);
	EXPECT_EQ(message.ReplaceRef("refs", 1, &first), B_OK);
	EXPECT_EQ(message.ReplaceRef("none", &first), B_NAME_NOT_FOUND);
	EXPECT_EQ(message.FindRef("refs", &found), B_OK);
	EXPECT_EQ(found, second);
	EXPECT_TRUE(message.HasRef("refs", 1));
	EXPECT_FALSE(message.HasRef("refs", 2));
	type_code type;
	bool isFixedSize = true;
	EXPECT_EQ(message.GetInfo("refs", &type, &isFixedSize), B_OK);
	EXPECT_EQ(type, uint32(B_REF_TYPE));
	EXPECT_FALSE(isFixedSize);

	const entry_ref unset;
	EXPECT_EQ(message.AddRef("unset", &unset), B_OK);
	EXPECT_EQ(message.FindRef("unset", &found), B_OK);
	EXPECT_EQ(found, unset);
	message.AddData("short", B_REF_TYPE, "abc", 3, false);
	message.AddData("unterminated", B_REF_TYPE, "123456789012abc", 15, false);
	for (const char* name : {"short", "unterminated"}) {
		found = first;
		EXPECT_EQ(message.FindRef(name, &found), B_BAD_DATA) << name;
		EXPECT_EQ(found, unset) << name;
	}
}

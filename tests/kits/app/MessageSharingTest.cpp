// SPDX-License-Identifier: MIT
// Large messages that were read use the bytes that they came from together: what changes one leaves the others alone.

#include <cstring>
#include <functional>
#include <memory>
#include <string>

#include <DataIO.h>
#include <Errors.h>
#include <Message.h>
#include <gtest/gtest.h>

#include "kits/app/MessageText.h"

namespace {

constexpr int kPartCount = 40;
constexpr size_t kHeaderSize = 68;
constexpr size_t kFieldHeaderSize = 24;


std::string
PartName(int i)
{
	return "Part" + std::to_string(i);
}


/// More than what is copied, with every kind of field.
BMessage
Parts()
{
	BMessage parts('prts');
	for (int i = 0; i < kPartCount; i++)
		parts.AddString(PartName(i).c_str(), std::string(4000, char('a' + i % 26)).c_str());
	parts.AddInt32("Number", 7);
	for (const char* name : {"one", "two", "three"})
		parts.AddString("List", name);
	return parts;
}


BMessage
Document()
{
	const BMessage parts = Parts();
	BMessage document('docu');
	document.AddString("Title", "A document");
	document.AddMessage("Parts", &parts);
	document.AddInt32("Number", 8);
	document.AddString("List", "four");
	document.AddString("List", "five");
	return document;
}


status_t
Read(const std::string& bytes, BMessage* message)
{
	BMemoryIO stream(bytes.data(), bytes.size());
	return message->Unflatten(&stream);
}


/// Every way to change the fields that Parts() and Document() have both.
const struct {
	const char* name;
	std::function<status_t(BMessage&)> apply;
} kChanges[] = {
	{"a new field", [](BMessage& message) { return message.AddString("New", "text"); }},
	{"a new item", [](BMessage& message) { return message.AddString("List", "more"); }},
	{"an item of another size",
		[](BMessage& message) { return message.ReplaceString("List", 1, "a longer text"); }},
	{"an item of the same size",
		[](BMessage& message) { return message.ReplaceInt32("Number", 99); }},
	{"a set field", [](BMessage& message) { return message.SetInt32("Number", 77); }},
	{"an item less", [](BMessage& message) { return message.RemoveData("List", 0); }},
	{"a field less", [](BMessage& message) { return message.RemoveName("Number"); }},
	{"another name", [](BMessage& message) { return message.Rename("List", "Names"); }},
	{"another name of the same length",
		[](BMessage& message) { return message.Rename("List", "Last"); }},
	{"fields of another message",
		[](BMessage& message) {
			BMessage other;
			other.AddInt32("Other", 1);
			return message.Append(other);
		}},
	{"no fields", [](BMessage& message) { return message.MakeEmpty(); }},
};

} // namespace


TEST(MessageSharingTest, ChangesOfANestedMessageAreItsOwn)
{
	const std::string bytes = FlatBytes(Document());
	for (const auto& change : kChanges) {
		BMessage document;
		BMessage parts;
		ASSERT_EQ(Read(bytes, &document), B_OK);
		ASSERT_EQ(document.FindMessage("Parts", &parts), B_OK);
		BMessage expected = Parts();

		EXPECT_EQ(change.apply(parts), B_OK) << change.name;
		EXPECT_EQ(change.apply(expected), B_OK) << change.name;
		EXPECT_TRUE(FlatBytes(parts) == FlatBytes(expected)) << change.name;
		EXPECT_TRUE(FlatBytes(document) == bytes) << change.name;
	}
}


TEST(MessageSharingTest, ChangesOfADocumentLeaveItsNestedMessagesAlone)
{
	const std::string bytes = FlatBytes(Document());
	for (const auto& change : kChanges) {
		BMessage document;
		BMessage parts;
		ASSERT_EQ(Read(bytes, &document), B_OK);
		ASSERT_EQ(document.FindMessage("Parts", &parts), B_OK);
		BMessage expected = Document();

		EXPECT_EQ(change.apply(document), B_OK) << change.name;
		EXPECT_EQ(change.apply(expected), B_OK) << change.name;
		EXPECT_TRUE(FlatBytes(document) == FlatBytes(expected)) << change.name;
		EXPECT_TRUE(FlatBytes(parts) == FlatBytes(Parts())) << change.name;
	}
}


TEST(MessageSharingTest, NestedMessagesAndCopiesOutliveTheirDocument)
{
	auto document = std::make_unique<BMessage>();
	BMessage parts;
	ASSERT_EQ(Read(FlatBytes(Document()), document.get()), B_OK);
	ASSERT_EQ(document->FindMessage("Parts", &parts), B_OK);
	const BMessage copy(*document);
	document.reset();

	EXPECT_TRUE(FlatBytes(parts) == FlatBytes(Parts()));
	EXPECT_TRUE(FlatBytes(copy) == FlatBytes(Document()));
	EXPECT_STREQ(parts.FindString("List", 2), "three");
}


TEST(MessageSharingTest, ADocumentCanTurnIntoItsNestedMessage)
{
	BMessage document;
	ASSERT_EQ(Read(FlatBytes(Document()), &document), B_OK);
	EXPECT_EQ(document.FindMessage("Parts", &document), B_OK);
	EXPECT_TRUE(FlatBytes(document) == FlatBytes(Parts()));
}


TEST(MessageSharingTest, TextsOfTheMessageItselfCanBeAdded)
{
	auto document = std::make_unique<BMessage>();
	BMessage parts;
	ASSERT_EQ(Read(FlatBytes(Document()), document.get()), B_OK);
	ASSERT_EQ(document->FindMessage("Parts", &parts), B_OK);
	document.reset();

	// With the first change, the last user lets go of the bytes that the texts lie in.
	const char* name = nullptr;
	type_code type;
	ASSERT_EQ(parts.GetInfo(B_STRING_TYPE, 1, const_cast<char**>(&name), &type), B_OK);
	EXPECT_EQ(parts.SetString(name, parts.FindString("List", 1)), B_OK);
	EXPECT_STREQ(parts.FindString("Part1"), "two");
	EXPECT_STREQ(parts.FindString("List", 1), "two");
}


TEST(MessageSharingTest, LargeMessagesWithGapsAreRead)
{
	std::string bytes = FlatBytes(Parts());
	const int fieldCount = kPartCount + 2;
	const auto add = [&bytes](size_t offset, uint32 gap) {
		uint32 number;
		memcpy(&number, bytes.data() + offset, sizeof(number));
		number += gap;
		memcpy(bytes.data() + offset, &number, sizeof(number));
	};
	add(36, 8);
	for (int i = 0; i < fieldCount; i++)
		add(kHeaderSize + kFieldHeaderSize * i + 16, 8);
	bytes.insert(kHeaderSize + kFieldHeaderSize * fieldCount, "no field");

	BMessage parts;
	ASSERT_EQ(Read(bytes, &parts), B_OK);
	EXPECT_TRUE(FlatBytes(parts) == FlatBytes(Parts()));
}


TEST(MessageSharingTest, LargeDamagedMessagesAreRefused)
{
	std::string bytes = FlatBytes(Parts());
	// The first field's chain comes back to it.
	memset(bytes.data() + kHeaderSize + 20, 0, sizeof(int32));
	BMessage parts('old ');
	EXPECT_EQ(Read(bytes, &parts), B_BAD_VALUE);
	EXPECT_TRUE(parts.IsEmpty());

	bytes = FlatBytes(Document());
	bytes.resize(bytes.size() - 1);
	EXPECT_EQ(Read(bytes, &parts), B_BAD_VALUE);
	EXPECT_TRUE(parts.IsEmpty());
}

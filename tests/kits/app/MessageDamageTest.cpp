// SPDX-License-Identifier: MIT
// Damaged and hostile files in the Haiku format: everything that a reader must not believe.

#include <sys/resource.h>

#include <cstring>
#include <functional>
#include <vector>

#include <DataIO.h>
#include <Errors.h>
#include <Message.h>
#include <gtest/gtest.h>

#include "app/MessagePrivate.h"
#include "kits/app/MessageText.h"

namespace {

constexpr size_t kFields = 68;
constexpr size_t kFieldSize = 24;
constexpr size_t kData = kFields + 3 * kFieldSize;


/// Strings "Name" and "Left", booleans "Set": 34 bytes of data at kData, "Left" at 17 in it, "Set" at 28.
std::string
Sound()
{
	BMessage message('prop');
	message.AddString("Name", "Button1");
	message.AddString("Left", "5");
	message.AddBool("Set", true);
	message.AddBool("Set", false);
	return FlatBytes(message);
}


template <typename Number>
void
Put(std::string* bytes, size_t offset, Number number)
{
	memcpy(bytes->data() + offset, &number, sizeof(number));
}


status_t
Read(const std::string& bytes, BMessage* message)
{
	// Just these bytes on the heap, so that the address sanitizer sees a step beyond them.
	const std::vector<char> exact(bytes.begin(), bytes.end());
	return BMessage::Private(message).Unflatten(exact.data(), exact.size());
}

} // namespace


TEST(MessageDamageTest, DamagedMessageIsRefusedAndLeavesNoFields)
{
	const struct {
		const char* damage;
		std::function<void(std::string*)> apply;
	} kRows[] = {
		{"no valid flag", [](std::string* b) { Put<uint32>(b, 8, 0); }},
		{"only other flags", [](std::string* b) { Put<uint32>(b, 8, 0xfffffffe); }},
		{"hash table of 4", [](std::string* b) { Put<uint32>(b, 44, 4); }},
		{"hash table of 0", [](std::string* b) { Put<uint32>(b, 44, 0); }},
		{"hash table of all ones", [](std::string* b) { Put<uint32>(b, 44, 0xffffffff); }},
		{"one byte cut off", [](std::string* b) { b->pop_back(); }},
		{"data cut off", [](std::string* b) { b->resize(kData); }},
		{"fields cut off", [](std::string* b) { b->resize(kFields + 30); }},
		{"header cut off", [](std::string* b) { b->resize(67); }},
		{"format alone", [](std::string* b) { b->resize(4); }},
		{"data size one more than there is", [](std::string* b) { Put<uint32>(b, 36, 35); }},
		{"data size of all ones", [](std::string* b) { Put<uint32>(b, 36, 0xffffffff); }},
		{"data size that overflows with the header",
			[](std::string* b) { Put<uint32>(b, 36, 0xffffff80); }},
		{"one field more than there is", [](std::string* b) { Put<uint32>(b, 40, 4); }},
		{"field count of all ones", [](std::string* b) { Put<uint32>(b, 40, 0xffffffff); }},
		// 24 times this is 0x100000008, which is 8 in 32 bits.
		{"field count whose product overflows",
			[](std::string* b) { Put<uint32>(b, 40, 0x0aaaaaab); }},
		{"field offset beyond the data", [](std::string* b) { Put<uint32>(b, kFields + 16, 35); }},
		{"field that ends beyond the data",
			[](std::string* b) { Put<uint32>(b, kFields + 2 * kFieldSize + 16, 29); }},
		{"field offset whose sum overflows",
			[](std::string* b) { Put<uint32>(b, kFields + 16, 0xffffffff - 8); }},
		{"field data size of all ones",
			[](std::string* b) { Put<uint32>(b, kFields + 12, 0xffffffff); }},
		{"field data size whose sum overflows",
			[](std::string* b) { Put<uint32>(b, kFields + 12, 0xfffffffb); }},
		{"name length of zero", [](std::string* b) { Put<uint16>(b, kFields + 2, 0); }},
		{"name length beyond the data",
			[](std::string* b) { Put<uint16>(b, kFields + 2, 0xffff); }},
		{"name without its zero byte", [](std::string* b) { (*b)[kData + 4] = 'x'; }},
		{"name with a zero byte in it", [](std::string* b) { (*b)[kData + 2] = '\0'; }},
		{"name length one short", [](std::string* b) { Put<uint16>(b, kFields + 2, 4); }},
		{"count of zero", [](std::string* b) { Put<uint32>(b, kFields + 8, 0); }},
		{"count of zero in a fixed field",
			[](std::string* b) { Put<uint32>(b, kFields + 2 * kFieldSize + 8, 0); }},
		{"fixed items of unequal size",
			[](std::string* b) {
				Put<uint32>(b, kFields + 2 * kFieldSize + 8, 3);
				Put<uint32>(b, kFields + 2 * kFieldSize + 12, 2);
			}},
		{"more fixed items than bytes",
			[](std::string* b) { Put<uint32>(b, kFields + 2 * kFieldSize + 8, 0x80000000); }},
		{"fixed field without bytes",
			[](std::string* b) { Put<uint32>(b, kFields + 2 * kFieldSize + 12, 0); }},
		{"variable field of fewer items", [](std::string* b) { Put<uint32>(b, kFields + 8, 2); }},
		{"variable field of very many items",
			[](std::string* b) { Put<uint32>(b, kFields + 8, 0xffffffff); }},
		{"size word beyond the field", [](std::string* b) { Put<uint32>(b, kData + 5, 9); }},
		{"size word of all ones", [](std::string* b) { Put<uint32>(b, kData + 5, 0xffffffff); }},
		{"size word that overflows", [](std::string* b) { Put<uint32>(b, kData + 5, 0xfffffffc); }},
		{"bytes after the last item", [](std::string* b) { Put<uint32>(b, kData + 5, 7); }},
		{"size word cut off", [](std::string* b) { Put<uint32>(b, kFields + 12, 3); }},
		{"table entry beyond the fields", [](std::string* b) { Put<int32>(b, 48, 3); }},
		{"table entry of -2", [](std::string* b) { Put<int32>(b, 56, -2); }},
		{"table entry of the largest number",
			[](std::string* b) { Put<int32>(b, 56, 0x7fffffff); }},
		{"next field beyond the fields", [](std::string* b) { Put<int32>(b, kFields + 20, 3); }},
		{"next field of -2", [](std::string* b) { Put<int32>(b, kFields + 20, -2); }},
		{"next field of the smallest number",
			[](std::string* b) { Put<int32>(b, kFields + 20, INT32_MIN); }},
		{"chain of a field with itself", [](std::string* b) { Put<int32>(b, kFields + 20, 0); }},
		{"chain of two fields in a circle",
			[](std::string* b) {
				Put<int32>(b, kFields + 20, 1);
				Put<int32>(b, kFields + kFieldSize + 20, 0);
			}},
		{"chain that runs into a circle",
			[](std::string* b) {
				Put<int32>(b, kFields + 20, 1);
				Put<int32>(b, kFields + kFieldSize + 20, 2);
				Put<int32>(b, kFields + 2 * kFieldSize + 20, 1);
			}},
	};

	for (const auto& row : kRows) {
		std::string bytes = Sound();
		row.apply(&bytes);
		BMessage message('kept');
		message.AddBool("field", true);
		EXPECT_EQ(Read(bytes, &message), B_BAD_VALUE) << row.damage;
		EXPECT_TRUE(message.IsEmpty()) << row.damage;
		EXPECT_EQ(message.what, uint32('kept')) << row.damage;

		message.AddBool("field", true);
		BMemoryIO stream(bytes.data(), bytes.size());
		EXPECT_EQ(message.Unflatten(&stream), B_BAD_VALUE) << row.damage;
		EXPECT_TRUE(message.IsEmpty()) << row.damage;

		// The same inside a sound message is merely not there.
		BMessage outer;
		outer.AddData("inner", B_MESSAGE_TYPE, bytes.data(), ssize_t(bytes.size()), false);
		EXPECT_EQ(outer.FindMessage("inner", &message), B_BAD_DATA) << row.damage;
	}
}


TEST(MessageDamageTest, WhatIsNoMessageChangesNothing)
{
	const std::string kRows[] = {"", "H", "HMF",
		"1FMH and a header that is as long as the one of a "
		"message, so that it is not the size",
		"hmf1", "BOF1",
		"\x7f"
		"ELF",
		std::string(100, '\0')};
	for (const std::string& bytes : kRows) {
		BMessage message('kept');
		message.AddBool("field", true);
		EXPECT_EQ(Read(bytes, &message), B_NOT_A_MESSAGE) << bytes;
		BMemoryIO stream(bytes.data(), bytes.size());
		EXPECT_EQ(message.Unflatten(&stream), B_NOT_A_MESSAGE) << bytes;
		EXPECT_TRUE(message.FindBool("field")) << bytes;
		EXPECT_EQ(message.what, uint32('kept')) << bytes;
	}
	BMessage message('kept');
	EXPECT_EQ(message.Unflatten("1FMH"), B_NOT_A_MESSAGE);
}


// Each field in bounds, all over the same bytes: reading them must not make megabytes of a few.
TEST(MessageDamageTest, FieldsOverEachOtherAreRefused)
{
	std::string bytes = Sound();
	Put<uint32>(&bytes, kFields + kFieldSize + 2, 0); // keeps the sizes of the first field below
	const std::string first = bytes.substr(kFields, kFieldSize);
	for (size_t i = 1; i < 3; i++)
		bytes.replace(kFields + i * kFieldSize, kFieldSize, first);
	BMessage message;
	EXPECT_EQ(Read(bytes, &message), B_BAD_VALUE);
}


TEST(MessageDamageTest, ClaimsAreNotAllocated)
{
	// With a limit on memory the claimed gigabytes could not be had, and a stream is read as it comes.
	std::string bytes = Sound();
	Put<uint32>(&bytes, 36, 0x7fffffff);
	Put<uint32>(&bytes, 40, 0x20000000);
	bytes.resize(1000);
	struct rusage before;
	getrusage(RUSAGE_SELF, &before);
	for (int i = 0; i < 100; i++) {
		BMessage message;
		ASSERT_EQ(Read(bytes, &message), B_BAD_VALUE);
		BMemoryIO stream(bytes.data(), bytes.size());
		ASSERT_EQ(message.Unflatten(&stream), B_BAD_VALUE);
	}
	struct rusage after;
	getrusage(RUSAGE_SELF, &after);
	EXPECT_LT(after.ru_maxrss - before.ru_maxrss, 50000) << "kilobytes";
}


// #pragma mark - Sound, though no writer makes it


TEST(MessageDamageTest, EmptyItemIsNotThere)
{
	std::string bytes = Sound();
	// "Left": two items of no bytes, in 8 bytes of the data block.
	bytes.insert(kData + 28, 2, '\0');
	Put<uint32>(&bytes, 36, 36);
	Put<uint32>(&bytes, kFields + kFieldSize + 8, 2);
	Put<uint32>(&bytes, kFields + kFieldSize + 12, 8);
	Put<uint64>(&bytes, kData + 22, 0);
	Put<uint32>(&bytes, kFields + 2 * kFieldSize + 16, 30);
	BMessage message;
	ASSERT_EQ(Read(bytes, &message), B_OK);
	const void* data;
	ssize_t size;
	for (int32 i : {0, 1}) {
		EXPECT_EQ(message.FindData("Left", B_STRING_TYPE, i, &data, &size), B_BAD_DATA);
		EXPECT_EQ(message.FindString("Left", i), nullptr);
	}
	EXPECT_EQ(message.FindString("Left", 2), nullptr);
	EXPECT_EQ(message.ReplaceString("Left", 1, "there"), B_OK);
	EXPECT_STREQ(message.FindString("Left", 1), "there");
	EXPECT_EQ(message.RemoveData("Left"), B_OK);
	EXPECT_STREQ(message.FindString("Left"), "there");
	EXPECT_TRUE(message.FindBool("Set"));
}


TEST(MessageDamageTest, ChainsThatShareTheirEndsSurviveChanges)
{
	std::string bytes = Sound();
	// Every bucket begins with field 0, and its chain goes on through 2 and 1.
	for (size_t i = 0; i < 5; i++)
		Put<int32>(&bytes, 48 + 4 * i, 0);
	Put<int32>(&bytes, kFields + 20, 2);
	Put<int32>(&bytes, kFields + 2 * kFieldSize + 20, 1);
	for (const char* name : {"Name", "Left", "Set"}) {
		BMessage message;
		ASSERT_EQ(Read(bytes, &message), B_OK);
		ASSERT_EQ(message.Rename(name, "renamed"), B_OK) << name;
		EXPECT_TRUE(message.HasData("renamed", B_ANY_TYPE)) << name;
		BMessage again;
		EXPECT_EQ(Read(FlatBytes(message), &again), B_OK) << name;
		ASSERT_EQ(message.RemoveName("renamed"), B_OK) << name;
		EXPECT_EQ(Read(FlatBytes(message), &again), B_OK) << name;
		EXPECT_EQ(again.CountNames(B_ANY_TYPE), 2) << name;
		ASSERT_EQ(message.AddBool("new", true), B_OK) << name;
		EXPECT_EQ(Read(FlatBytes(message), &again), B_OK) << name;
	}
}


TEST(MessageDamageTest, FieldOutsideEveryChainIsOnlyEnumerated)
{
	std::string bytes = Sound();
	for (size_t i = 0; i < 5; i++)
		Put<int32>(&bytes, 48 + 4 * i, -1);
	BMessage message;
	ASSERT_EQ(Read(bytes, &message), B_OK);
	char* name;
	type_code type;
	EXPECT_EQ(message.GetInfo(B_ANY_TYPE, 0, &name, &type), B_OK);
	EXPECT_STREQ(name, "Name");
	EXPECT_FALSE(message.HasString("Name"));
	EXPECT_EQ(message.GetInfo(type, 0, &name, &type), B_OK);
	EXPECT_FALSE(message.HasString(name));
	EXPECT_EQ(message.AddString("Name", "again"), B_OK);
	EXPECT_STREQ(message.FindString("Name"), "again");
}


TEST(MessageDamageTest, ANameThatOccursTwiceIsLookedForAsAnyOther)
{
	std::string bytes = Sound();
	memcpy(bytes.data() + kData, "Left", 4);
	BMessage message;
	ASSERT_EQ(Read(bytes, &message), B_OK);
	const BMessage copy(message);
	for (const BMessage* each : {const_cast<const BMessage*>(&message), &copy}) {
		for (int32 i = 0; i < 2; i++) {
			char* name;
			type_code type;
			ASSERT_EQ(each->GetInfo(B_STRING_TYPE, i, &name, &type), B_OK);
			EXPECT_STREQ(name, "Left");
			EXPECT_STREQ(each->FindString(name), "5");
		}
	}
}


TEST(MessageDamageTest, ItemsOfOtherFormsAreNotThere)
{
	BMessage message;
	message.AddData("bool", B_BOOL_TYPE, "\2", 1);
	message.AddData("short", B_INT32_TYPE, "ab", 2, false);
	message.AddData("rect", B_RECT_TYPE, "123456789012345", 15);
	EXPECT_TRUE(message.FindBool("bool"));
	int32 number = 5;
	EXPECT_EQ(message.FindInt32("short", &number), B_BAD_DATA);
	EXPECT_EQ(number, 0);
	BRect rect(1, 2, 3, 4);
	EXPECT_EQ(message.FindRect("rect", &rect), B_BAD_DATA);
	EXPECT_EQ(rect, BRect());
	EXPECT_EQ(message.ReplaceInt32("short", 5), B_OK);
	EXPECT_EQ(message.FindInt32("short"), 5);
}


// #pragma mark - Depth


/// Messages nested so deep, as a file can hold them: made from the inside by hand, in linear time.
static std::string
Deep(int depth)
{
	BMessage innermost('deep');
	innermost.AddBool("end", true);
	const std::string inner = FlatBytes(innermost);

	// Every level has the same header but for its sizes, and nothing behind the nested message.
	BMessage level('deep');
	level.AddMessage("m", &innermost);
	const std::string frame =
		FlatBytes(level).substr(0, size_t(level.FlattenedSize()) - inner.size());
	std::string bytes;
	for (int i = depth; i > 0; i--) {
		std::string head = frame;
		const uint32 nested = uint32(inner.size() + (i - 1) * frame.size());
		Put<uint32>(&head, 36, nested + 6);
		Put<uint32>(&head, 68 + 12, nested + 4);
		Put<uint32>(&head, frame.size() - 4, nested);
		bytes += head;
	}
	return bytes + inner;
}


TEST(MessageDamageTest, DeeplyNestedMessagesAreRead)
{
	const std::string bytes = Deep(10000);
	EXPECT_GT(bytes.size(), 900000u);
	BMessage message;
	for (int i = 0; i < 10; i++)
		ASSERT_EQ(Read(bytes, &message), B_OK);

	BMessage nested;
	ASSERT_EQ(message.FindMessage("m", &nested), B_OK);
	EXPECT_EQ(nested.what, uint32('deep'));
}


TEST(MessageDamageTest, FunctionsThatGoIntoTheDepthHaveALimit)
{
	BMessage message;
	ASSERT_EQ(Read(Deep(10000), &message), B_OK);
	testing::internal::CaptureStdout();
	message.PrintToStream();
	EXPECT_NE(testing::internal::GetCapturedStdout().find("(type = 'MSGG')"), std::string::npos);

	// Alike for so long that the difference is out of reach; the bytes tell.
	std::string other = Deep(10000);
	other.back() = '\0';
	BMessage different;
	ASSERT_EQ(Read(other, &different), B_OK);
	EXPECT_FALSE(message.HasSameData(different, true, true));
	EXPECT_TRUE(message.HasSameData(message, true, true));

	BMessage copy(message);
	ASSERT_EQ(copy.AddMessage("more", &message), B_OK);
	EXPECT_TRUE(copy.HasMessage("more"));
}

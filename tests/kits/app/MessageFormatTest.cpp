// SPDX-License-Identifier: MIT
// The bytes of flattened messages: the Haiku format to the byte, what changes do to it, and what is ignored.

#include <cstring>
#include <functional>

#include <DataIO.h>
#include <Errors.h>
#include <Message.h>
#include <gtest/gtest.h>

#include "app/MessagePrivate.h"
#include "kits/app/MessageText.h"

namespace {

// Code 'prop'; strings "Name" = "Button1" and "Left" = "5"; booleans "Set" = true, false.
constexpr char kExample[] = "48 4d 46 31 70 6f 72 70 01 00 00 00 ff ff ff ff"
							"ff ff ff ff ff ff ff ff ff ff ff ff ff ff ff ff"
							"ff ff ff ff 22 00 00 00 03 00 00 00 05 00 00 00"
							"02 00 00 00 00 00 00 00 ff ff ff ff ff ff ff ff"
							"01 00 00 00"
							"01 00 05 00 52 54 53 43 01 00 00 00"
							"0c 00 00 00 00 00 00 00 ff ff ff ff"
							"01 00 05 00 52 54 53 43 01 00 00 00"
							"06 00 00 00 11 00 00 00 ff ff ff ff"
							"03 00 04 00 4c 4f 4f 42 02 00 00 00"
							"02 00 00 00 1c 00 00 00 ff ff ff ff"
							"4e 61 6d 65 00 08 00 00 00 42 75 74 74 6f 6e 31"
							"00 4c 65 66 74 00 02 00 00 00 35 00 53 65 74 00"
							"01 00";


BMessage
Example()
{
	BMessage message('prop');
	message.AddString("Name", "Button1");
	message.AddString("Left", "5");
	message.AddBool("Set", true);
	message.AddBool("Set", false);
	return message;
}


int32
WordAt(const std::string& bytes, size_t offset)
{
	int32 word;
	memcpy(&word, bytes.data() + offset, sizeof(word));
	return word;
}


/// The chain of a bucket as the indexes of its fields.
std::string
Chain(const BMessage& message, int bucket)
{
	const std::string bytes = FlatBytes(message);
	std::string chain;
	for (int32 i = WordAt(bytes, 48 + 4 * bucket); i >= 0; i = WordAt(bytes, 68 + 24 * i + 20))
		chain += std::to_string(i) + " ";
	return chain;
}

} // namespace


TEST(MessageFormatTest, ExampleIsWrittenToTheByte)
{
	EXPECT_EQ(FlatBytes(Example()), Bytes(kExample));
	EXPECT_EQ(Example().FlattenedSize(), 174);
}


TEST(MessageFormatTest, EmptyMessageIsItsHeader)
{
	EXPECT_EQ(FlatBytes(BMessage('empt')),
		Bytes("484d4631 74706d65 01000000 ffffffff ffffffff ffffffff ffffffff ffffffff ffffffff"
			  "00000000 00000000 05000000 ffffffff ffffffff ffffffff ffffffff ffffffff"));
}


TEST(MessageFormatTest, HashTakesBytesAsSignedNumbers)
{
	const struct {
		const char* name;
		uint32 hash;
		uint32 bucket;
	} kRows[] = {
		{"", 0x00000000, 0},
		{"Name", 0x8eb626e5, 1},
		{"Left", 0x9eae3374, 4},
		{"Title", 0x9e5bc66f, 3},
		{"_Frame", 0xe961a39d, 0},
		{"Components", 0xe0ecac09, 1},
		{"\xc3\x89tat", 0x0dd200f3, 1},
	};
	for (const auto& row : kRows) {
		EXPECT_EQ(BMessage::Private::HashName(row.name), row.hash) << row.name;
		BMessage message;
		message.AddBool(row.name, true);
		EXPECT_EQ(Chain(message, int(row.bucket)), "0 ") << row.name;
	}
}


TEST(MessageFormatTest, FlattenNeedsRoom)
{
	const BMessage message = Example();
	std::string bytes(200, 'x');
	EXPECT_EQ(message.Flatten(bytes.data(), 173), B_BUFFER_OVERFLOW);
	EXPECT_EQ(bytes, std::string(200, 'x'));
	EXPECT_EQ(message.Flatten(bytes.data(), 200), B_OK);
	EXPECT_EQ(bytes.substr(0, 174), Bytes(kExample));
	EXPECT_EQ(bytes.substr(174), std::string(26, 'x'));
	EXPECT_EQ(message.Flatten(static_cast<char*>(nullptr), 200), B_BAD_VALUE);
	EXPECT_EQ(message.Flatten(static_cast<BDataIO*>(nullptr)), B_BAD_VALUE);
}


TEST(MessageFormatTest, UnflattenReplacesCodeAndFields)
{
	BMessage message('old ');
	message.AddBool("old", true);
	EXPECT_EQ(message.Unflatten(Bytes(kExample).c_str()), B_OK);
	EXPECT_EQ(message.what, uint32('prop'));
	EXPECT_FALSE(message.HasBool("old"));
	EXPECT_STREQ(message.FindString("Name"), "Button1");
	EXPECT_FALSE(message.FindBool("Set", 1));
	EXPECT_EQ(message.Unflatten(static_cast<const char*>(nullptr)), B_BAD_VALUE);
	EXPECT_EQ(message.Unflatten(static_cast<BDataIO*>(nullptr)), B_BAD_VALUE);
	EXPECT_EQ(message.CountNames(B_ANY_TYPE), 3);
}


TEST(MessageFormatTest, WhatFollowsTheMessageIsIgnored)
{
	const std::string bytes = Bytes(kExample) + std::string(1000, '\x7f');
	BMessage message;
	EXPECT_EQ(message.Unflatten(bytes.c_str()), B_OK);
	EXPECT_EQ(FlatBytes(message), Bytes(kExample));
	size_t used = 0;
	EXPECT_EQ(BMessage::Private(message).Unflatten(bytes.data(), bytes.size(), &used), B_OK);
	EXPECT_EQ(used, 174u);
}


TEST(MessageFormatTest, MessagesFollowEachOtherInAStream)
{
	const std::string bytes = Bytes(kExample) + FlatBytes(BMessage('next'));
	BMemoryIO stream(bytes.data(), bytes.size());
	BMessage message;
	EXPECT_EQ(message.Unflatten(&stream), B_OK);
	EXPECT_EQ(message.what, uint32('prop'));
	EXPECT_EQ(message.Unflatten(&stream), B_OK);
	EXPECT_EQ(message.what, uint32('next'));
	EXPECT_EQ(message.Unflatten(&stream), B_NOT_A_MESSAGE);
	EXPECT_EQ(message.what, uint32('next'));
}


TEST(MessageFormatTest, HeaderValuesAreKeptAndTheAreaIsNot)
{
	std::string bytes = Bytes(kExample);
	const int32 values[] = {0x7f, 7, 0, 99, 3, 4, 5};
	memcpy(bytes.data() + 8, values, sizeof(values));
	BMessage message;
	ASSERT_EQ(message.Unflatten(bytes.c_str()), B_OK);
	const int32 area = -1;
	memcpy(bytes.data() + 20, &area, sizeof(area));
	EXPECT_EQ(FlatBytes(message), bytes);
	EXPECT_TRUE(message.WasDelivered());
	EXPECT_TRUE(message.WasDropped());
	EXPECT_TRUE(message.IsReply());
	EXPECT_TRUE(message.HasSpecifiers());

	// A copy was never sent, whatever the file says; the rest of the header stays.
	const int32 flags = 0x61;
	memcpy(bytes.data() + 8, &flags, sizeof(flags));
	EXPECT_EQ(FlatBytes(BMessage(message)), bytes);
}


TEST(MessageFormatTest, FlagsOfAFileAnswerNobody)
{
	std::string bytes = Bytes(kExample);
	const int32 values[] = {0x13, -1, -1, -1, 1, 1, 1};
	memcpy(bytes.data() + 8, values, sizeof(values));
	BMessage message;
	ASSERT_EQ(message.Unflatten(bytes.c_str()), B_OK);
	EXPECT_FALSE(message.IsSourceWaiting());
	EXPECT_EQ(message.SendReply('repl'), B_BAD_REPLY);
}


// #pragma mark - What changes do to the bytes


TEST(MessageFormatTest, ChangedMessageEqualsOneBuiltAfresh)
{
	const struct {
		const char* change;
		std::function<void(BMessage*)> apply;
		std::function<void(BMessage*)> build;
	} kRows[] = {
		{"add to a field in the middle", [](BMessage* m) { m->AddString("Name", "x"); },
			[](BMessage* m) {
				m->AddString("Name", "Button1");
				m->AddString("Name", "x");
				m->AddString("Left", "5");
				m->AddBool("Set", true);
				m->AddBool("Set", false);
			}},
		{"replace by a longer one", [](BMessage* m) { m->ReplaceString("Left", "12345"); },
			[](BMessage* m) {
				m->AddString("Name", "Button1");
				m->AddString("Left", "12345");
				m->AddBool("Set", true);
				m->AddBool("Set", false);
			}},
		{"replace by a shorter one", [](BMessage* m) { m->ReplaceString("Name", ""); },
			[](BMessage* m) {
				m->AddString("Name", "");
				m->AddString("Left", "5");
				m->AddBool("Set", true);
				m->AddBool("Set", false);
			}},
		{"replace in a fixed field", [](BMessage* m) { m->ReplaceBool("Set", 1, true); },
			[](BMessage* m) {
				m->AddString("Name", "Button1");
				m->AddString("Left", "5");
				m->AddBool("Set", true);
				m->AddBool("Set", true);
			}},
		{"remove one of several items", [](BMessage* m) { m->RemoveData("Set", 0); },
			[](BMessage* m) {
				m->AddString("Name", "Button1");
				m->AddString("Left", "5");
				m->AddBool("Set", false);
			}},
		{"remove the only item", [](BMessage* m) { m->RemoveData("Name"); },
			[](BMessage* m) {
				m->AddString("Left", "5");
				m->AddBool("Set", true);
				m->AddBool("Set", false);
			}},
		{"remove a field in the middle", [](BMessage* m) { m->RemoveName("Left"); },
			[](BMessage* m) {
				m->AddString("Name", "Button1");
				m->AddBool("Set", true);
				m->AddBool("Set", false);
			}},
		{"empty", [](BMessage* m) { m->MakeEmpty(); }, [](BMessage*) {}},
		{"remove everything",
			[](BMessage* m) {
				m->RemoveName("Left");
				m->RemoveName("Set");
				m->RemoveName("Name");
			},
			[](BMessage*) {}},
	};
	for (const auto& row : kRows) {
		BMessage changed = Example();
		row.apply(&changed);
		BMessage built('prop');
		row.build(&built);
		EXPECT_EQ(FlatBytes(changed), FlatBytes(built)) << row.change;

		// The same change after a journey through a file.
		BMessage read;
		ASSERT_EQ(read.Unflatten(Bytes(kExample).c_str()), B_OK);
		row.apply(&read);
		EXPECT_EQ(FlatBytes(read), FlatBytes(built)) << row.change << ", read";
	}
}


TEST(MessageFormatTest, NewFieldGoesToTheEndOfItsChain)
{
	// "Name", "Components" and a name beyond ASCII share bucket 1.
	BMessage message;
	message.AddBool("Name", true);
	message.AddBool("Left", true);
	message.AddBool("Components", true);
	message.AddBool("\xc3\x89tat", true);
	EXPECT_EQ(Chain(message, 1), "0 2 3 ");
	EXPECT_EQ(Chain(message, 4), "1 ");

	message.RemoveName("Left");
	EXPECT_EQ(Chain(message, 1), "0 1 2 ");
	EXPECT_EQ(Chain(message, 4), "");
	message.RemoveName("Components");
	EXPECT_EQ(Chain(message, 1), "0 1 ");
	EXPECT_TRUE(message.FindBool("\xc3\x89tat"));
}


TEST(MessageFormatTest, RenamedFieldGoesToTheEndOfItsNewChain)
{
	BMessage message;
	message.AddBool("Left", true);
	message.AddBool("Name", true);
	message.AddBool("Title", true);
	ASSERT_EQ(message.Rename("Left", "Components"), B_OK);
	EXPECT_EQ(Chain(message, 4), "");
	EXPECT_EQ(Chain(message, 1), "1 0 ");

	// Also within one bucket.
	ASSERT_EQ(message.Rename("Name", "\xc3\x89tat"), B_OK);
	EXPECT_EQ(Chain(message, 1), "0 1 ");

	BMessage read;
	ASSERT_EQ(read.Unflatten(FlatBytes(message).c_str()), B_OK);
	EXPECT_EQ(FlatBytes(read), FlatBytes(message));
	read.RemoveName("Components");
	EXPECT_EQ(Chain(read, 1), "0 ");
	EXPECT_EQ(Chain(read, 3), "1 ");
}


TEST(MessageFormatTest, RenamedFieldOfAnEmptyBucketEqualsOneBuiltAfresh)
{
	BMessage message = Example();
	ASSERT_EQ(message.Rename("Left", "Title"), B_OK);
	BMessage built('prop');
	built.AddString("Name", "Button1");
	built.AddString("Title", "5");
	built.AddBool("Set", true);
	built.AddBool("Set", false);
	EXPECT_EQ(FlatBytes(message), FlatBytes(built));
}


// Gaps and another order are sound by every rule of the reader, though nobody writes them.
TEST(MessageFormatTest, FieldsAnywhereInTheDataBlockAreRead)
{
	std::string bytes = Bytes(kExample);
	const std::string data = bytes.substr(68 + 3 * 24);
	const std::string moved = data.substr(28) + "gap" + data.substr(0, 28) + "end";
	const uint32 dataSize = uint32(moved.size());
	const uint32 offsets[] = {9, 26, 0};
	memcpy(bytes.data() + 36, &dataSize, 4);
	for (int i = 0; i < 3; i++)
		memcpy(bytes.data() + 68 + i * 24 + 16, &offsets[i], 4);
	bytes.replace(68 + 3 * 24, data.size(), moved);

	BMessage message;
	size_t used = 0;
	ASSERT_EQ(BMessage::Private(message).Unflatten(bytes.data(), bytes.size(), &used), B_OK);
	EXPECT_EQ(used, bytes.size());
	EXPECT_EQ(FlatBytes(message), Bytes(kExample));
}


// #pragma mark - Streams


namespace {

/// Fails or stops after so many bytes; gives and takes little at a time.
class LimitedStream : public BDataIO {
public:
	LimitedStream(const std::string& bytes, ssize_t limit, status_t failure)
		: fBytes(bytes),
		  fLimit(limit),
		  fFailure(failure)
	{
	}

	ssize_t Read(void* buffer, size_t size) override
	{
		const size_t left = std::min<size_t>(fBytes.size(), fLimit) - fPosition;
		size = std::min<size_t>({size, left, 5});
		if (size == 0)
			return fFailure;
		memcpy(buffer, fBytes.data() + fPosition, size);
		fPosition += size;
		return ssize_t(size);
	}

	ssize_t Write(const void* buffer, size_t size) override
	{
		size = std::min<size_t>({size, size_t(fLimit) - fBytes.size(), 5});
		if (size == 0)
			return fFailure;
		fBytes.append(static_cast<const char*>(buffer), size);
		return ssize_t(size);
	}

	const std::string& Content() const { return fBytes; }
	size_t Position() const { return fPosition; }

private:
	std::string fBytes;
	size_t fPosition = 0;
	ssize_t fLimit;
	status_t fFailure;
};

} // namespace


TEST(MessageFormatTest, StreamThatGivesLittleAtATimeIsReadToTheMessagesEndOnly)
{
	LimitedStream stream(Bytes(kExample) + "tail", 1000, B_IO_ERROR);
	BMessage message;
	EXPECT_EQ(message.Unflatten(&stream), B_OK);
	EXPECT_EQ(FlatBytes(message), Bytes(kExample));
	EXPECT_EQ(stream.Position(), 174u);
}


TEST(MessageFormatTest, StreamsErrorIsTheStatusAndLeavesNoFields)
{
	BMessage message('kept');
	message.AddBool("field", true);
	LimitedStream atOnce(Bytes(kExample), 0, B_IO_ERROR);
	EXPECT_EQ(message.Unflatten(&atOnce), B_IO_ERROR);
	EXPECT_TRUE(message.HasBool("field"));

	LimitedStream later(Bytes(kExample), 100, B_IO_ERROR);
	EXPECT_EQ(message.Unflatten(&later), B_IO_ERROR);
	EXPECT_TRUE(message.IsEmpty());
	EXPECT_EQ(message.what, uint32('kept'));
}


TEST(MessageFormatTest, WritingTellsOfAFullStream)
{
	LimitedStream whole("", 1000, B_OK);
	ssize_t size = 0;
	EXPECT_EQ(Example().Flatten(&whole, &size), B_OK);
	EXPECT_EQ(size, 174);
	EXPECT_EQ(whole.Content(), Bytes(kExample));

	size = 5;
	LimitedStream full("", 100, B_DEVICE_FULL);
	EXPECT_EQ(Example().Flatten(&full, &size), B_DEVICE_FULL);
	EXPECT_EQ(size, 5);
	LimitedStream stuck("", 100, B_OK);
	EXPECT_EQ(Example().Flatten(&stuck), B_IO_ERROR);
}

// SPDX-License-Identifier: MIT
// The older format of flattened messages: both byte orders, small numbers, split fields, and damage.

#include <cstring>

#include <DataIO.h>
#include <Errors.h>
#include <Message.h>
#include <gtest/gtest.h>

#include "app/MessagePrivate.h"
#include "kits/app/MessageText.h"
#include "kits/app/SwappedMessage.h"

namespace {

// Code 'prop'; strings "Name" = "Button1" and "Left" = "5"; booleans "Set" = true, false.
constexpr char kLittle[] = "31 42 4f 46 71 72 6f c9 59 00 00 00 70 6f 72 70 01"
						   "09 52 54 53 43 10 00 00 00 04 4e 61 6d 65"
						   "08 00 00 00 42 75 74 74 6f 6e 31 00 00 00 00 00"
						   "09 52 54 53 43 08 00 00 00 04 4c 65 66 74"
						   "02 00 00 00 35 00 00 00"
						   "05 4c 4f 4f 42 02 00 00 00 02 00 00 00 03 53 65 74"
						   "01 00"
						   "00";
constexpr char kMini[] = "31 42 4f 46 71 72 6f bd 4d 00 00 00 70 6f 72 70 01"
						 "0b 52 54 53 43 10 04 4e 61 6d 65"
						 "08 00 00 00 42 75 74 74 6f 6e 31 00 00 00 00 00"
						 "0b 52 54 53 43 08 04 4c 65 66 74 02 00 00 00 35 00 00 00"
						 "07 4c 4f 4f 42 02 02 03 53 65 74 01 00"
						 "00";
constexpr char kBig[] = "46 4f 42 31 70 72 6f ca 00 00 00 59 70 72 6f 70 01"
						"09 43 53 54 52 00 00 00 10 04 4e 61 6d 65"
						"00 00 00 08 42 75 74 74 6f 6e 31 00 00 00 00 00"
						"09 43 53 54 52 00 00 00 08 04 4c 65 66 74"
						"00 00 00 02 35 00 00 00"
						"05 42 4f 4f 4c 00 00 00 02 00 00 00 02 03 53 65 74"
						"01 00"
						"00";

constexpr char kHeader[] = "31424f46 00000000 00000000 65646f63 01";
constexpr char kText[] = "message 'prop'\n"
						 "  field \"Name\" 'CSTR' variable 1\n"
						 "    string \"Button1\"\n"
						 "  field \"Left\" 'CSTR' variable 1\n"
						 "    string \"5\"\n"
						 "  field \"Set\" 'BOOL' fixed 2\n"
						 "    bool true\n"
						 "    bool false\n";


status_t
Read(const std::string& bytes, BMessage* message)
{
	// From a stream too: it finds the end of the message in another way.
	BMessage streamed;
	BMemoryIO stream(bytes.data(), bytes.size());
	const status_t streamStatus = streamed.Unflatten(&stream);
	const status_t status = BMessage::Private(message).Unflatten(bytes.data(), bytes.size());
	EXPECT_EQ(status, streamStatus);
	EXPECT_TRUE(streamed.HasSameData(*message, false));
	return status;
}


std::string
Written(BMessage& message)
{
	BMessage::Private r5(message);
	std::string bytes(r5.R5FlattenedSize(), '\0');
	EXPECT_EQ(r5.FlattenR5(bytes.data(), ssize_t(bytes.size())), B_OK);
	return bytes;
}

} // namespace


TEST(MessageR5Test, ExamplesOfAllThreeWritersReadAlike)
{
	for (const char* bytes : {kLittle, kMini, kBig}) {
		BMessage message;
		ASSERT_EQ(Read(Bytes(bytes), &message), B_OK) << bytes;
		EXPECT_EQ(MessageText(message), kText) << bytes;
		EXPECT_EQ(message.Unflatten(Bytes(bytes).c_str()), B_OK) << bytes;
	}
}


TEST(MessageR5Test, ExampleIsWrittenToTheByte)
{
	BMessage message;
	ASSERT_TRUE(BuildMessage(kText, &message));
	EXPECT_EQ(Written(message), Bytes(kLittle));
	EXPECT_EQ(SwapR5(Bytes(kLittle)), Bytes(kBig));

	std::string bytes(100, 'x');
	BMessage::Private r5(message);
	EXPECT_EQ(r5.FlattenR5(bytes.data(), 88), B_BUFFER_OVERFLOW);
	EXPECT_EQ(r5.FlattenR5(nullptr, 100), B_BAD_VALUE);
}


TEST(MessageR5Test, ChecksumAndSizeOfTheHeaderAreNotTrusted)
{
	for (uint32 size : {0u, 1u, 17u, 88u, 90u, 0x7fffffffu, 0xffffffffu}) {
		std::string bytes = Bytes(kLittle) + "tail";
		memset(&bytes[4], 0x55, 4);
		memcpy(&bytes[8], &size, 4);
		BMessage message;
		ASSERT_EQ(Read(bytes, &message), B_OK) << size;
		EXPECT_EQ(MessageText(message), kText) << size;
	}
}


TEST(MessageR5Test, RecordsOfOneNameAddToOneField)
{
	const std::string bytes = Bytes(kHeader)
		+ Bytes("09 52545343 08000000 01 61  02000000 3100 0000") // a: "1"
		+ Bytes("0d 474e4f4c 04000000 01 62  05000000")           // b: 5
		+ Bytes("09 52545343 08000000 01 61  02000000 3200 0000") // a: "2"
		+ Bytes("05 474e4f4c 02000000 08000000 01 62  06000000 07000000") + Bytes("00");
	BMessage message;
	ASSERT_EQ(Read(bytes, &message), B_OK);
	EXPECT_EQ(MessageText(message),
		"message 'code'\n"
		"  field \"a\" 'CSTR' variable 2\n"
		"    string \"1\"\n"
		"    string \"2\"\n"
		"  field \"b\" 'LONG' fixed 3\n"
		"    int32 5\n"
		"    int32 6\n"
		"    int32 7\n");

	BMessage built;
	ASSERT_TRUE(BuildMessage(MessageText(message), &built));
	EXPECT_EQ(FlatBytes(message), FlatBytes(built));
}


TEST(MessageR5Test, FirstRecordDecidesTheFieldsKind)
{
	const std::string variableFirst = Bytes(kHeader)
		+ Bytes("09 54574152 08000000 01 61  02000000 3132 0000")
		+ Bytes("05 54574152 02000000 06000000 01 61  313233 343536") + Bytes("00");
	BMessage message;
	ASSERT_EQ(Read(variableFirst, &message), B_OK);
	EXPECT_EQ(MessageText(message),
		"message 'code'\n"
		"  field \"a\" 'RAWT' variable 3\n"
		"    data 3132\n"
		"    data 313233\n"
		"    data 343536\n");

	const std::string fixedFirst = Bytes(kHeader) + Bytes("0d 54574152 02000000 01 61  3132")
		+ Bytes("09 54574152 08000000 01 61  02000000 3334 0000") + Bytes("00");
	ASSERT_EQ(Read(fixedFirst, &message), B_OK);
	EXPECT_EQ(MessageText(message),
		"message 'code'\n"
		"  field \"a\" 'RAWT' fixed 2\n"
		"    data 3132\n"
		"    data 3334\n");
}


TEST(MessageR5Test, BigEndianItemsAreSwappedByTheirType)
{
	const std::string bytes = Bytes("464f4231 00000000 00000000 636f6465 01")
		+ Bytes("0d 53485254 00000002 01 61  fffe")
		+ Bytes("0d 4c4c4e47 00000008 01 62  0000000000000102")
		+ Bytes("0d 42504e54 00000008 01 63  3f800000 40000000")
		+ Bytes("0d 54494d45 00000004 01 64  00000001")
		+ Bytes("0d 4f464654 00000008 01 65  0000000000000001")
		+ Bytes("0d 52415754 00000004 01 66  00000001")
		+ Bytes("0d 44424c45 00000008 01 67  3ff8000000000000") + Bytes("00");
	BMessage message;
	ASSERT_EQ(Read(bytes, &message), B_OK);
	EXPECT_EQ(MessageText(message),
		"message 'code'\n"
		"  field \"a\" 'SHRT' fixed 1\n"
		"    int16 -2\n"
		"  field \"b\" 'LLNG' fixed 1\n"
		"    int64 258\n"
		"  field \"c\" 'BPNT' fixed 1\n"
		"    point 1 2\n"
		"  field \"d\" 'TIME' fixed 1\n"
		"    data 01000000\n"
		"  field \"e\" 'OFFT' fixed 1\n"
		"    data 0100000000000000\n"
		"  field \"f\" 'RAWT' fixed 1\n"
		"    data 00000001\n"
		"  field \"g\" 'DBLE' fixed 1\n"
		"    double 1.5\n");
}


TEST(MessageR5Test, NestedMessagesMayBeInAnyFormat)
{
	for (const char* inner : {kLittle, kMini, kBig}) {
		const std::string nested = Bytes(inner);
		BMessage message;
		message.AddData("inner", B_MESSAGE_TYPE, nested.data(), ssize_t(nested.size()), false);
		BMessage read;
		ASSERT_EQ(Read(Written(message), &read), B_OK);
		BMessage found;
		ASSERT_EQ(read.FindMessage("inner", &found), B_OK);
		EXPECT_EQ(MessageText(found), kText);
		// The bytes inside are not touched by the format around them.
		EXPECT_EQ(FlatBytes(read), FlatBytes(message));
	}
}


TEST(MessageR5Test, OptionalHeaderPartsAreReadAndWritten)
{
	BMessage message('code');
	message.AddSpecifier("property");
	BMessage::Private delivery(message);
	delivery.SetTarget(7);
	delivery.SetReplyAddress({1, kPreferredToken, 3});
	const std::string bytes = Written(message);
	EXPECT_EQ(bytes[16], '\x0f');
	EXPECT_EQ(bytes.substr(17, 20), Bytes("07000000 01000000 feffffff 03000000 01000000"));
	// The words 12 bytes from the size on and the last byte: 33 bytes, summed up big-endian.
	uint32 sum = uint8(bytes[36]);
	for (size_t i = 8; i < 36; i += 4) {
		sum += uint32(uint8(bytes[i])) << 24 | uint8(bytes[i + 1]) << 16 | uint8(bytes[i + 2]) << 8
			| uint8(bytes[i + 3]);
	}
	uint32 checksum;
	memcpy(&checksum, &bytes[4], 4);
	EXPECT_EQ(checksum, sum);

	BMessage read;
	ASSERT_EQ(Read(bytes, &read), B_OK);
	EXPECT_TRUE(read.HasSpecifiers());
	EXPECT_EQ(BMessage::Private(read).Target(), 7);
	EXPECT_EQ(
		BMessage::Private(read).ReplyAddress(), (BPrivate::MessageAddress{1, kPreferredToken, 3}));
	EXPECT_EQ(Written(read), bytes);

	std::string flags = bytes;
	flags[34] = flags[35] = flags[36] = 1;
	ASSERT_EQ(Read(flags, &read), B_OK);
	EXPECT_TRUE(read.IsReply());
	EXPECT_FALSE(read.IsSourceWaiting());
	EXPECT_EQ(BMessage::Private(read).Flags() & 0xe, 0xeu);
	EXPECT_EQ(Written(read).substr(16), flags.substr(16));
	for (size_t size = 4; size < 37; size++)
		EXPECT_EQ(Read(bytes.substr(0, size), &read), B_BAD_VALUE) << size;
}


TEST(MessageR5Test, LongNameIsCut)
{
	// Only a file can bring such a name.
	const std::string longName(300, 'n');
	BMessage message;
	message.AddBool("name", true);
	std::string bytes = FlatBytes(message);
	bytes.replace(68 + 24, 4, longName);
	const uint16 nameLength = 301;
	memcpy(&bytes[70], &nameLength, 2);
	const uint32 dataSize = 302;
	memcpy(&bytes[36], &dataSize, 4);
	ASSERT_EQ(Read(bytes, &message), B_OK);

	BMessage cut;
	ASSERT_EQ(Read(Written(message), &cut), B_OK);
	EXPECT_TRUE(cut.FindBool(longName.substr(0, 255).c_str()));
}


TEST(MessageR5Test, DamagedMessageIsRefusedAndLeavesNoFields)
{
	const struct {
		const char* damage;
		std::string bytes;
	} kRows[] = {
		{"no valid flag", Bytes("31424f46 00000000 00000000 65646f63 00") + Bytes("00")},
		{"header cut off", Bytes("31424f46 00000000 00000000 65646f63")},
		{"target cut off", Bytes("31424f46 00000000 00000000 65646f63 03 0000")},
		{"reply cut off", Bytes("31424f46 00000000 00000000 65646f63 05 00000000 00000000")},
		{"no final zero byte", Bytes(kHeader)},
		{"record header cut off", Bytes(kHeader) + Bytes("09 52545343 0800")},
		{"name cut off", Bytes(kHeader) + Bytes("09 52545343 08000000 05 61")},
		{"items cut off", Bytes(kHeader) + Bytes("09 52545343 08000000 01 61 02000000")},
		{"no zero byte after the last record",
			Bytes(kHeader) + Bytes("0d 4c4f4f42 01000000 01 61 01")},
		{"count of zero", Bytes(kHeader) + Bytes("05 4c4f4f42 00000000 01000000 01 61 01 00")},
		{"mini count of zero", Bytes(kHeader) + Bytes("07 4c4f4f42 00 01 01 61 01 00")},
		{"negative count", Bytes(kHeader) + Bytes("05 4c4f4f42 ffffffff 01000000 01 61 01 00")},
		{"data size of zero", Bytes(kHeader) + Bytes("0d 4c4f4f42 00000000 01 61 00")},
		{"mini data size of zero", Bytes(kHeader) + Bytes("0f 4c4f4f42 00 01 61 00")},
		{"negative data size", Bytes(kHeader) + Bytes("0d 4c4f4f42 ffffffff 01 61 01 00")},
		{"data size beyond everything", Bytes(kHeader) + Bytes("0d 4c4f4f42 ffffff7f 01 61 01 00")},
		{"fixed items of unequal size",
			Bytes(kHeader) + Bytes("05 4c4f4f42 02000000 03000000 01 61 010101 00")},
		{"more fixed items than bytes",
			Bytes(kHeader) + Bytes("05 4c4f4f42 04000000 03000000 01 61 010101 00")},
		{"later record of another size",
			Bytes(kHeader)
				+ Bytes("0d 54574152 02000000 01 61 3132 0d 54574152 01000000 01 61 33 00")},
		{"later record of another type",
			Bytes(kHeader)
				+ Bytes("0d 4c4f4f42 01000000 01 61 01 0d 45545942 01000000 01 61 01 00")},
		{"size word that overflows",
			Bytes(kHeader) + Bytes("09 52545343 08000000 01 61 fcffffff 61000000 00")},
		{"size word that overflows when padded",
			Bytes(kHeader) + Bytes("09 52545343 08000000 01 61 f9ffffff 61000000 00")},
		{"size word of all ones",
			Bytes(kHeader) + Bytes("09 52545343 08000000 01 61 ffffffff 61000000 00")},
		{"size word beyond the record",
			Bytes(kHeader) + Bytes("09 52545343 08000000 01 61 05000000 61000000 00")},
		{"size word of zero",
			Bytes(kHeader) + Bytes("09 52545343 08000000 01 61 00000000 00000000 00")},
		{"size word cut off", Bytes(kHeader) + Bytes("09 52545343 03000000 01 61 010000 00")},
		{"item without its padding",
			Bytes(kHeader) + Bytes("09 52545343 06000000 01 61 02000000 6100 00")},
		{"fewer items than counted",
			Bytes(kHeader) + Bytes("01 52545343 02000000 08000000 01 61 02000000 61000000 00")},
		{"bytes after the last item",
			Bytes(kHeader)
				+ Bytes("09 52545343 10000000 01 61 02000000 61000000 02000000 61000000 00")},
		{"zero byte in a name", Bytes(kHeader) + Bytes("0d 4c4f4f42 01000000 02 6100 01 00")},
	};
	for (const auto& row : kRows) {
		BMessage message('kept');
		message.AddBool("field", true);
		EXPECT_EQ(Read(row.bytes, &message), B_BAD_VALUE) << row.damage;
		EXPECT_TRUE(message.IsEmpty()) << row.damage;
		EXPECT_EQ(message.what, uint32('kept')) << row.damage;
	}
}


TEST(MessageR5Test, ManyRecordsAreReadInOneGo)
{
	// In turns, so that a reader that inserted each item would move the other field's every time.
	std::string bytes = Bytes(kHeader);
	for (int i = 0; i < 20000; i++) {
		bytes += Bytes("0d 4c4f4f42 01000000 01 61 01");
		bytes += Bytes("0d 45545942 01000000 01 62 07");
		const std::string name = std::to_string(i);
		bytes += Bytes("0d 4c4f4f42 01000000") + char(name.size()) + name + '\x01';
	}
	bytes += '\0';
	BMessage message;
	ASSERT_EQ(Read(bytes, &message), B_OK);
	EXPECT_EQ(message.CountNames(B_ANY_TYPE), 20002);
	EXPECT_TRUE(message.FindBool("a", 19999));
	EXPECT_EQ(message.FindInt8("b", 19999), 7);
	EXPECT_TRUE(message.FindBool("19999"));
}

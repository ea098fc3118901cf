// SPDX-License-Identifier: MIT
// The text that a message prints.

#include <string>
#include <thread>

#include <Entry.h>
#include <GraphicsDefs.h>
#include <Message.h>
#include <Point.h>
#include <gtest/gtest.h>

static std::string
Printed(const BMessage& message)
{
	testing::internal::CaptureStdout();
	message.PrintToStream();
	return testing::internal::GetCapturedStdout();
}


TEST(MessagePrintTest, CodeIsShownAsCharactersOrNumber)
{
	EXPECT_EQ(Printed(BMessage('ABCD')), "BMessage('ABCD') {\n}\n");
	EXPECT_EQ(Printed(BMessage(0x1fabc)), "BMessage(0x1fabc) {\n}\n");
	EXPECT_EQ(Printed(BMessage()), "BMessage(0x0) {\n}\n");
}


TEST(MessagePrintTest, EveryTypeHasItsForm)
{
	BMessage message('type');
	message.AddString("text", "Hello");
	message.AddInt8("byte", 'a');
	message.AddUInt8("ubyte", 200);
	message.AddInt16("short", -1);
	message.AddUInt16("ushort", 65535);
	message.AddInt32("number", 31);
	message.AddInt32("number", -1);
	message.AddUInt32("unsigned", 4000000000u);
	message.AddInt64("long", 1ll << 40);
	message.AddUInt64("ulong", 1);
	message.AddBool("yes", true);
	message.AddBool("no", false);
	message.AddFloat("float", 1.5);
	message.AddDouble("double", -0.1);
	message.AddRect("rect", BRect(1, 2.25, 3, 4));
	message.AddPoint("point", BPoint(1, -2.5));
	message.AddColor("color", rgb_color{1, 2, 3, 255});
	message.AddPointer("pointer", nullptr);
	message.AddData("damaged", B_INT32_TYPE, "abc", 3);
	EXPECT_EQ(Printed(message),
		"BMessage('type') {\n"
		"        text = string(\"Hello\", 6 bytes)\n"
		"        byte = int8(0x61 or 97 or 'a')\n"
		"        ubyte = uint8(0xc8 or 200 or '.')\n"
		"        short = int16(0xffff or -1)\n"
		"        ushort = uint16(0xffff or 65535)\n"
		"        number[0] = int32(0x1f or 31)\n"
		"        number[1] = int32(0xffffffff or -1)\n"
		"        unsigned = uint32(0xee6b2800 or 4000000000)\n"
		"        long = int64(0x10000000000 or 1099511627776)\n"
		"        ulong = uint64(0x1 or 1)\n"
		"        yes = bool(true)\n"
		"        no = bool(false)\n"
		"        float = float(1.5000)\n"
		"        double = double(-0.10000000)\n"
		"        rect = BRect(l:1.0, t:2.2, r:3.0, b:4.0)\n"
		"        point = BPoint(x:1.000000, y:-2.500000)\n"
		"        color = rgb_color(1, 2, 3, 255)\n"
		"        pointer = (type = 'PNTR')(size = 8)\n"
		"        damaged = (type = 'LONG')(size = 3)\n"
		"}\n");
}


TEST(MessagePrintTest, NestedMessagesStandDeeper)
{
	BMessage inner('innr');
	inner.AddBool("flag", true);
	BMessage message('outr');
	message.AddMessage("inner", &inner);
	message.AddMessage("inner", &inner);
	message.AddData("damaged", B_MESSAGE_TYPE, "HMF1", 4, false);
	EXPECT_EQ(Printed(message),
		"BMessage('outr') {\n"
		"        inner[0] = BMessage('innr') {\n"
		"                flag = bool(true)\n"
		"        }\n"
		"        inner[1] = BMessage('innr') {\n"
		"                flag = bool(true)\n"
		"        }\n"
		"        damaged = (type = 'MSGG')(size = 4)\n"
		"}\n");
}


TEST(MessagePrintTest, ReferencesShowTheirPath)
{
	entry_ref ref;
	ASSERT_EQ(get_ref_for_path("/usr/no such entry", &ref), B_OK);
	BMessage message('refs');
	message.AddRef("refs", &ref);
	EXPECT_EQ(Printed(message),
		"BMessage('refs') {\n        refs = entry_ref(device=" + std::to_string(int32(ref.device))
			+ ", directory=" + std::to_string(ref.directory)
			+ ", name=\"no such entry\", path=\"/usr/no such entry\")\n}\n");
}


TEST(MessagePrintTest, WhatTwoThreadsPrintIsNotMixed)
{
	const size_t kCount = 3000;
	BMessage one('one ');
	one.AddInt32("number", 1);
	BMessage two('two ');
	two.AddInt32("number", 2);
	const std::string texts[] = {Printed(one), Printed(two)};

	testing::internal::CaptureStdout();
	const auto printOften = [](const BMessage& message) {
		for (size_t i = 0; i < kCount; i++)
			message.PrintToStream();
	};
	std::thread other([&] { printOften(two); });
	printOften(one);
	other.join();
	const std::string printed = testing::internal::GetCapturedStdout();

	size_t at = 0;
	while (at < printed.size()) {
		const std::string& text =
			texts[printed.compare(at, texts[0].size(), texts[0]) == 0 ? 0 : 1];
		ASSERT_EQ(printed.compare(at, text.size(), text), 0) << printed.substr(at, 200);
		at += text.size();
	}
	EXPECT_EQ(printed.size(), kCount * (texts[0].size() + texts[1].size()));
}

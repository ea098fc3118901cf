// SPDX-License-Identifier: MIT
// Tests of BBitmapStream: what it reads as, what it makes of what is written, and damaged bytes.
#include <BitmapStream.h>

#include <cstdio>
#include <cstring>
#include <memory>

#include <gtest/gtest.h>

#include <Bitmap.h>

#include "support/Printers.h"

namespace {

/// Two rows of three pixels, 0 to 23.
BBitmap*
MakeBitmap()
{
	BBitmap* bitmap = new BBitmap(BRect(0, 0, 2, 1), 0, B_RGBA32);
	uint8* bits = static_cast<uint8*>(bitmap->Bits());
	for (int i = 0; i < bitmap->BitsLength(); i++)
		bits[i] = static_cast<uint8>(i);
	return bitmap;
}


std::vector<uint8>
MakeBytes()
{
	BBitmapStream stream(MakeBitmap());
	std::vector<uint8> bytes(static_cast<size_t>(stream.Size()));
	EXPECT_EQ(stream.Read(bytes.data(), bytes.size()), static_cast<ssize_t>(bytes.size()));
	return bytes;
}

} // namespace


TEST(BitmapStreamTest, BitmapReadsAsHeaderAndPixels)
{
	const std::vector<uint8> bytes = MakeBytes();
	ASSERT_EQ(bytes.size(), 32u + 24u);
	const uint8 kHeader[] = {'b', 'i', 't', 's', 0, 0, 0, 0, 0, 0, 0, 0, 0x40, 0, 0, 0, 0x3f, 0x80,
		0, 0, 0, 0, 0, 12, 0, 0, 0x20, 0x08, 0, 0, 0, 24};
	EXPECT_EQ(std::memcmp(bytes.data(), kHeader, sizeof(kHeader)), 0);
	for (int i = 0; i < 24; i++)
		EXPECT_EQ(bytes[32 + i], i);
}


TEST(BitmapStreamTest, ReadsAcrossHeaderAndPixelsAndEndsAtTheEnd)
{
	BBitmapStream stream(MakeBitmap());
	uint8 bytes[8];
	EXPECT_EQ(stream.ReadAt(30, bytes, 4), 4);
	EXPECT_EQ(bytes[1], 24);
	EXPECT_EQ(bytes[3], 1);
	EXPECT_EQ(stream.ReadAt(54, bytes, 8), 2);
	EXPECT_EQ(stream.ReadAt(56, bytes, 8), 0);
	EXPECT_EQ(stream.ReadAt(-1, bytes, 8), B_BAD_VALUE);
	EXPECT_EQ(stream.Seek(-6, SEEK_END), 50);
	EXPECT_EQ(stream.Read(bytes, 8), 6);
	EXPECT_EQ(stream.Position(), 56);
	EXPECT_EQ(stream.Seek(-60, SEEK_CUR), B_BAD_VALUE);
	EXPECT_EQ(stream.Position(), 56);
}


TEST(BitmapStreamTest, UntouchedBitmapIsGivenBackOnce)
{
	BBitmap* bitmap = MakeBitmap();
	BBitmapStream stream(bitmap);
	EXPECT_EQ(stream.DetachBitmap(nullptr), B_BAD_VALUE);
	BBitmap* detached;
	ASSERT_EQ(stream.DetachBitmap(&detached), B_OK);
	EXPECT_EQ(detached, bitmap);
	EXPECT_EQ(stream.DetachBitmap(&detached), B_ERROR);
	EXPECT_EQ(detached, nullptr);
	EXPECT_EQ(stream.Size(), 0);
	EXPECT_EQ(stream.Write("x", 1), B_ERROR);
	delete bitmap;
}


TEST(BitmapStreamTest, WrittenBytesBecomeABitmap)
{
	const std::vector<uint8> bytes = MakeBytes();
	BBitmapStream stream;
	BBitmap* detached;
	EXPECT_EQ(stream.DetachBitmap(&detached), B_BAD_DATA);
	// In two pieces, the second first.
	EXPECT_EQ(stream.WriteAt(40, bytes.data() + 40, 16), 16);
	EXPECT_EQ(stream.WriteAt(0, bytes.data(), 40), 40);
	ASSERT_EQ(stream.DetachBitmap(&detached), B_OK);
	std::unique_ptr<BBitmap> bitmap(detached);
	EXPECT_EQ(bitmap->Bounds(), BRect(0, 0, 2, 1));
	EXPECT_EQ(bitmap->ColorSpace(), B_RGBA32);
	EXPECT_EQ(std::memcmp(bitmap->Bits(), &bytes[32], 24), 0);
}


TEST(BitmapStreamTest, WritingChangesTheBitmapThatWasGiven)
{
	BBitmapStream stream(MakeBitmap());
	const uint8 kValue = 200;
	EXPECT_EQ(stream.WriteAt(33, &kValue, 1), 1);
	EXPECT_EQ(stream.Size(), 56);
	BBitmap* detached;
	ASSERT_EQ(stream.DetachBitmap(&detached), B_OK);
	std::unique_ptr<BBitmap> bitmap(detached);
	EXPECT_EQ(static_cast<uint8*>(bitmap->Bits())[0], 0);
	EXPECT_EQ(static_cast<uint8*>(bitmap->Bits())[1], kValue);
}


TEST(BitmapStreamTest, DamagedBytesAreNoBitmap)
{
	const struct {
		const char* what;
		size_t place;
		uint8 value;
	} kRows[] = {{"the magic", 0, 'x'}, {"an upside-down frame", 16, 0xbf},
		{"a huge frame", 12, 0x7f}, {"too long a row", 20, 1}, {"too many bytes", 28, 0xff},
		{"an unknown colour space", 24, 0x77}};
	for (const auto& row : kRows) {
		std::vector<uint8> bytes = MakeBytes();
		bytes[row.place] = row.value;
		BBitmapStream stream;
		stream.Write(bytes.data(), bytes.size());
		BBitmap* detached;
		EXPECT_EQ(stream.DetachBitmap(&detached), B_BAD_DATA) << row.what;
		EXPECT_EQ(detached, nullptr) << row.what;
	}
}


TEST(BitmapStreamTest, EveryCutStreamIsNoBitmap)
{
	const std::vector<uint8> bytes = MakeBytes();
	for (size_t size = 0; size < bytes.size(); size++) {
		BBitmapStream stream;
		stream.Write(bytes.data(), size);
		BBitmap* detached;
		EXPECT_EQ(stream.DetachBitmap(&detached), B_BAD_DATA) << size;
	}
	BBitmapStream stream(MakeBitmap());
	EXPECT_EQ(stream.SetSize(-1), B_BAD_VALUE);
	EXPECT_EQ(stream.SetSize(55), B_OK);
	BBitmap* detached;
	EXPECT_EQ(stream.DetachBitmap(&detached), B_BAD_DATA);
	EXPECT_EQ(stream.WriteAt(INT64_MAX - 1, "xx", 2), B_NO_MEMORY);
}

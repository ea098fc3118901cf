// SPDX-License-Identifier: MIT
// Tests of BBitmap's memory and conversions.
#include <Bitmap.h>

#include <gtest/gtest.h>

#include <Errors.h>
#include <Message.h>

#include "support/Printers.h"

TEST(BitmapTest, RowsArePaddedToFourBytes)
{
	struct {
		color_space space;
		int32 bytesPerRow;
	} const rows[] = {{B_RGB32, 20}, {B_RGBA32, 20}, {B_RGB24, 16}, {B_RGB16, 12}, {B_RGB15, 12},
		{B_CMAP8, 8}, {B_GRAY8, 8}, {B_GRAY1, 4}};
	for (const auto& row : rows) {
		SCOPED_TRACE(row.space);
		BBitmap bitmap(BRect(0, 0, 4, 2), row.space);
		EXPECT_EQ(bitmap.InitCheck(), B_OK);
		EXPECT_EQ(bitmap.BytesPerRow(), row.bytesPerRow);
		EXPECT_EQ(bitmap.BitsLength(), row.bytesPerRow * 3);
		EXPECT_EQ(bitmap.ColorSpace(), row.space);
	}
}


TEST(BitmapTest, ImpossibleBitmapsAreTold)
{
	EXPECT_NE(BBitmap(BRect(), B_RGB32).InitCheck(), B_OK);
	EXPECT_NE(BBitmap(BRect(0, 0, 9, 9), B_NO_COLOR_SPACE).InitCheck(), B_OK);
	EXPECT_NE(BBitmap(BRect(0, 0, 1e6f, 1e6f), B_RGB32).InitCheck(), B_OK);
	BBitmap bad(BRect(), B_RGB32);
	EXPECT_FALSE(bad.IsValid());
	EXPECT_EQ(bad.Bits(), nullptr);
	EXPECT_EQ(bad.ImportBits("1234", 4, 4, 0, B_RGB32), B_NO_INIT);
}


TEST(BitmapTest, SetBitsConverts)
{
	const uint8 grey[] = {0, 0x80, 0xff, 0};
	BBitmap bitmap(BRect(0, 0, 2, 0), B_RGB32);
	bitmap.SetBits(grey, sizeof(grey), 0, B_GRAY8);
	const uint8* bits = static_cast<const uint8*>(bitmap.Bits());
	EXPECT_EQ(bits[0], 0);
	EXPECT_EQ(bits[4], 0x80);
	EXPECT_EQ(bits[8], 0xff);
	EXPECT_EQ(bits[9], 0xff);
}


TEST(BitmapTest, ShortDataWritesWhatItHas)
{
	BBitmap bitmap(BRect(0, 0, 1, 1), B_RGB32);
	const uint32 one = 0xff112233;
	EXPECT_EQ(bitmap.ImportBits(&one, 4, 8, 0, B_RGB32), B_OK);
	const uint32* bits = static_cast<const uint32*>(bitmap.Bits());
	EXPECT_EQ(bits[0], one);
	EXPECT_EQ(bits[1], 0u);
	EXPECT_EQ(bitmap.ImportBits(&one, 4, 8, 5000, B_RGB32), B_BAD_VALUE);
	EXPECT_EQ(bitmap.ImportBits(nullptr, 4, 8, 0, B_RGB32), B_BAD_VALUE);
	EXPECT_EQ(bitmap.ImportBits(&one, 4, 8, 0, B_NO_COLOR_SPACE), B_BAD_VALUE);
}


TEST(BitmapTest, PartsAreCopiedToTheirPlaceAndCutAtTheEdges)
{
	BBitmap source(BRect(0, 0, 3, 3), B_RGB32);
	auto* from = static_cast<uint32*>(source.Bits());
	for (uint32 i = 0; i < 16; i++)
		from[i] = 0xff000000 | i;
	BBitmap target(BRect(0, 0, 3, 3), B_RGB32);
	EXPECT_EQ(target.ImportBits(&source, BPoint(1, 1), BPoint(2, 2), BSize(2, 2)), B_OK);
	const auto* to = static_cast<const uint32*>(target.Bits());
	EXPECT_EQ(to[2 * 4 + 2], 0xff000005);
	EXPECT_EQ(to[3 * 4 + 3], 0xff00000a);
	EXPECT_EQ(to[0], 0u);

	BBitmap cut(BRect(0, 0, 3, 3), B_RGB32);
	EXPECT_EQ(cut.ImportBits(&source, BPoint(0, 0), BPoint(-2, -2), BSize(3, 3)), B_OK);
	to = static_cast<const uint32*>(cut.Bits());
	EXPECT_EQ(to[0], 0xff00000a);
	EXPECT_EQ(to[5], 0xff00000f);
	EXPECT_EQ(to[2], 0u);
}


TEST(BitmapTest, ColorsSurviveTheWayThroughEachColorSpace)
{
	const uint32 colors[] = {0xffff0000, 0xff00ff00, 0xff0000ff, 0xffffffff, 0xff000000};
	for (color_space space : {B_RGB32, B_RGBA32, B_RGB24, B_RGB16, B_RGB15, B_RGBA15, B_RGB32_BIG,
			 B_RGBA32_BIG, B_RGB24_BIG, B_RGB16_BIG, B_RGB15_BIG, B_RGBA15_BIG, B_CMAP8}) {
		SCOPED_TRACE(space);
		BBitmap there(BRect(0, 0, 4, 0), space);
		EXPECT_EQ(there.ImportBits(colors, sizeof(colors), 20, 0, B_RGBA32), B_OK);
		BBitmap back(BRect(0, 0, 4, 0), B_RGBA32);
		EXPECT_EQ(back.ImportBits(&there), B_OK);
		for (int i = 0; i < 5; i++)
			EXPECT_EQ(static_cast<uint32*>(back.Bits())[i], colors[i]) << i;
	}
}


TEST(BitmapTest, TransparentColorStaysTransparent)
{
	const uint8 indices[] = {255, 0, 0, 0};
	BBitmap bitmap(BRect(0, 0, 0, 0), B_RGBA32);
	EXPECT_EQ(bitmap.ImportBits(indices, 4, 4, 0, B_CMAP8), B_OK);
	EXPECT_EQ(static_cast<uint8*>(bitmap.Bits())[3], 0);
}


TEST(BitmapTest, CopiesAndArchivesHaveTheSamePixels)
{
	BBitmap bitmap(BRect(0, 0, 3, 1), B_RGB16);
	auto* bits = static_cast<uint8*>(bitmap.Bits());
	for (int32 i = 0; i < bitmap.BitsLength(); i++)
		bits[i] = static_cast<uint8>(i * 7);
	BBitmap copy(bitmap);
	ASSERT_EQ(copy.BitsLength(), bitmap.BitsLength());
	EXPECT_EQ(memcmp(copy.Bits(), bits, bitmap.BitsLength()), 0);

	BMessage archive;
	ASSERT_EQ(bitmap.Archive(&archive), B_OK);
	std::unique_ptr<BArchivable> object(BBitmap::Instantiate(&archive));
	auto* made = dynamic_cast<BBitmap*>(object.get());
	ASSERT_NE(made, nullptr);
	EXPECT_EQ(made->Bounds(), bitmap.Bounds());
	EXPECT_EQ(made->ColorSpace(), B_RGB16);
	EXPECT_EQ(memcmp(made->Bits(), bits, bitmap.BitsLength()), 0);
}


TEST(BitmapTest, AnArchiveWithAColourSpaceThatDoesNotExistIsNoBitmap)
{
	BMessage archive;
	ASSERT_EQ(BBitmap(BRect(0, 0, 3, 1), B_RGB32).Archive(&archive), B_OK);
	for (int32 space : {0x77000008, -1, 7, INT32_MAX}) {
		SCOPED_TRACE(space);
		ASSERT_EQ(archive.ReplaceInt32("_cspace", space), B_OK);
		const BBitmap bitmap(&archive);
		EXPECT_EQ(bitmap.InitCheck(), B_BAD_VALUE);
		EXPECT_EQ(bitmap.ColorSpace(), B_NO_COLOR_SPACE);
		EXPECT_EQ(bitmap.BitsLength(), 0);
	}
}

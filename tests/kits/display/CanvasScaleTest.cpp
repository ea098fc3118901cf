// SPDX-License-Identifier: MIT
// Canvases with more device pixels than the API counts.
#include <cmath>

#include <Region.h>

#include "CanvasFixture.h"

class CanvasScaleTest : public CanvasFixture, public testing::WithParamInterface<float> {
protected:
	CanvasScaleTest()
		: CanvasFixture(GetParam())
	{
	}

	/// How many rows of device pixels have something dark.
	static int32 InkHeight(const BPrivate::Picture& picture)
	{
		int32 rows = 0;
		for (int32 y = 0; y < picture.height; y++) {
			bool isDark = false;
			for (int32 x = 0; x < picture.width; x++)
				isDark = isDark || (picture.pixels[y * picture.width + x] & 0xff) < 128;
			rows += isDark ? 1 : 0;
		}
		return rows;
	}

	int32 CountDark()
	{
		int32 count = 0;
		for (uint32 pixel : fCanvas->ReadPicture().pixels)
			count += (pixel & 0xff) < 128 ? 1 : 0;
		return count;
	}
};

TEST_P(CanvasScaleTest, TheBufferHasDevicePixels)
{
	BPrivate::Picture picture = fCanvas->ReadPicture();
	EXPECT_EQ(picture.width, 20 * GetParam());
	EXPECT_EQ(picture.height, 12 * GetParam());
	EXPECT_EQ(fCanvas->Width(), 20);
	EXPECT_EQ(fCanvas->Scale(), GetParam());
}


TEST_P(CanvasScaleTest, RectsSideBySideLeaveNoGapAndDoNotOverlap)
{
	fState.mode = B_OP_INVERT;
	SetState();
	for (int32 x = 0; x < 20; x++)
		fCanvas->FillRect(BRect(x, 0, x, 11), B_SOLID_HIGH);
	EXPECT_EQ(CountOf(kBlack), 20 * GetParam() * 12 * GetParam());
}


TEST_P(CanvasScaleTest, FillRectCoversTheScaledArea)
{
	fCanvas->FillRect(BRect(2, 2, 5, 5), B_SOLID_HIGH);
	EXPECT_EQ(CountOf(kBlack), 4 * GetParam() * 4 * GetParam());
	EXPECT_EQ(fCanvas->PixelAt(BPoint(2, 2)), kBlack);
	EXPECT_EQ(fCanvas->PixelAt(BPoint(6, 2)), kWhite);
}


TEST_P(CanvasScaleTest, LinesAreWholePixelsWide)
{
	fCanvas->StrokeLine(BPoint(2, 4), BPoint(9, 4), B_SOLID_HIGH);
	EXPECT_EQ(CountOf(kBlack), std::floor(8 * GetParam()) * std::floor(GetParam()));
	EXPECT_EQ(CountOf(kBlack) + CountOf(kWhite), 20 * GetParam() * 12 * GetParam());
}


TEST_P(CanvasScaleTest, TheClipIsScaledToo)
{
	BRegion clip(BRect(4, 4, 7, 7));
	fCanvas->SetClip(&clip);
	fCanvas->FillRect(BRect(0, 0, 19, 11), B_SOLID_HIGH);
	EXPECT_EQ(CountOf(kBlack), 4 * GetParam() * 4 * GetParam());
}


TEST_P(CanvasScaleTest, TextGrowsWithTheScale)
{
	BPoint end = fCanvas->DrawString("H", 1, BPoint(2, 11), nullptr);
	auto single = BPrivate::Display::Get().MakeCanvas(20, 12, 1);
	BPoint singleEnd = single->DrawString("H", 1, BPoint(2, 11), nullptr);
	EXPECT_EQ(end, singleEnd);
	EXPECT_NEAR(
		InkHeight(fCanvas->ReadPicture()), InkHeight(single->ReadPicture()) * GetParam(), 1.01f);
}


TEST_P(CanvasScaleTest, CopyBitsMovesDevicePixels)
{
	fCanvas->FillRect(BRect(0, 0, 3, 3), B_SOLID_HIGH);
	fCanvas->CopyBits(BRect(0, 0, 3, 3), BRect(8, 4, 11, 7));
	EXPECT_EQ(CountOf(kBlack), 2 * 4 * GetParam() * 4 * GetParam());
	EXPECT_EQ(fCanvas->PixelAt(BPoint(8, 4)), kBlack);
	EXPECT_EQ(fCanvas->PixelAt(BPoint(11, 7)), kBlack);
	EXPECT_EQ(fCanvas->PixelAt(BPoint(12, 7)), kWhite);
}


TEST_P(CanvasScaleTest, ADiagonalLineIsSmoothAndAsLong)
{
	fCanvas->StrokeLine(BPoint(1, 1), BPoint(10, 7), B_SOLID_HIGH);
	EXPECT_NE(fCanvas->PixelAt(BPoint(5, 4)), fCanvas->PixelAt(BPoint(5, 9)));
	EXPECT_GT(CountDark(), 5 * GetParam());
}

INSTANTIATE_TEST_SUITE_P(Scales, CanvasScaleTest, testing::Values(1.0f, 1.5f, 2.0f));

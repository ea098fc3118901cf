// SPDX-License-Identifier: MIT
// Bitmaps on the canvas, and moving pixels within it.
#include <Region.h>

#include "CanvasFixture.h"

namespace {

const uint32 kRedPixel = 0xffff0000;
const uint32 kBluePixel = 0xff0000ff;
const uint32 kClearPixel = 0x00ffffff;

} // namespace

class CanvasBitmapTest : public CanvasFixture {
protected:
	/// Two by two: red, blue; blue, transparent.
	BPrivate::PixelBuffer Bitmap() { return {fPixels, 2, 2, 8, true}; }

	uint32 fPixels[4] = {kRedPixel, kBluePixel, kBluePixel, kClearPixel};
};

TEST_F(CanvasBitmapTest, CopyDrawsEveryPixelOpaque)
{
	fCanvas->FillRect(BRect(0, 0, 19, 11), B_SOLID_HIGH);
	fCanvas->DrawBitmap(Bitmap(), BRect(0, 0, 1, 1), BRect(1, 1, 2, 2), 0);
	EXPECT_EQ(Rows(4, 4), "####\n#rb#\n#b.#\n####\n");
}


TEST_F(CanvasBitmapTest, OverLeavesOutTransparentPixels)
{
	fCanvas->FillRect(BRect(0, 0, 19, 11), B_SOLID_HIGH);
	fState.mode = B_OP_OVER;
	SetState();
	fCanvas->DrawBitmap(Bitmap(), BRect(0, 0, 1, 1), BRect(1, 1, 2, 2), 0);
	EXPECT_EQ(Rows(4, 4), "####\n#rb#\n#b##\n####\n");
}


TEST_F(CanvasBitmapTest, OverKnowsTheTransparentValueOfBitmapsWithoutAlpha)
{
	uint32 pixels[] = {kRedPixel, B_TRANSPARENT_MAGIC_RGBA32};
	BPrivate::PixelBuffer bitmap{pixels, 2, 1, 8, false};
	fState.mode = B_OP_OVER;
	SetState();
	fCanvas->DrawBitmap(bitmap, BRect(0, 0, 1, 0), BRect(0, 0, 1, 0), 0);
	EXPECT_EQ(Rows(2, 1), "r.\n");
}


TEST_F(CanvasBitmapTest, AlphaBlendsByThePixelsOrTheConstant)
{
	uint32 pixel = 0x33ff0000;
	BPrivate::PixelBuffer bitmap{&pixel, 1, 1, 4, true};
	fState.mode = B_OP_ALPHA;
	SetState();
	fCanvas->DrawBitmap(bitmap, BRect(0, 0, 0, 0), BRect(0, 0, 0, 0), 0);
	EXPECT_EQ(fCanvas->PixelAt(BPoint(0, 0)), (rgb_color{255, 204, 204, 255}));

	fState.alphaSource = B_CONSTANT_ALPHA;
	SetState();
	fCanvas->DrawBitmap(bitmap, BRect(0, 0, 0, 0), BRect(1, 0, 1, 0), 0);
	EXPECT_EQ(fCanvas->PixelAt(BPoint(1, 0)), kRed);
}


TEST_F(CanvasBitmapTest, ALargerDestinationStretches)
{
	fCanvas->DrawBitmap(Bitmap(), BRect(0, 0, 1, 0), BRect(0, 0, 3, 1), 0);
	EXPECT_EQ(Rows(5, 3), "rrbb.\nrrbb.\n.....\n");
}


TEST_F(CanvasBitmapTest, OnlyTheSourceRectIsDrawn)
{
	fCanvas->DrawBitmap(Bitmap(), BRect(1, 0, 1, 0), BRect(3, 0, 3, 0), 0);
	EXPECT_EQ(Rows(5, 1), "...b.\n");
}


TEST_F(CanvasBitmapTest, ASourceBeyondTheBitmapLeavesTheRestAlone)
{
	fCanvas->DrawBitmap(Bitmap(), BRect(0, 0, 3, 0), BRect(0, 0, 3, 0), 0);
	EXPECT_EQ(Rows(5, 1), "rb...\n");
	fCanvas->DrawBitmap(Bitmap(), BRect(7, 7, 9, 9), BRect(0, 0, 2, 2), 0);
	EXPECT_EQ(Rows(5, 1), "rb...\n");
}


TEST_F(CanvasBitmapTest, TilingRepeatsFromTheLeftTop)
{
	fCanvas->DrawBitmap(Bitmap(), BRect(0, 0, 1, 0), BRect(1, 0, 5, 1), B_TILE_BITMAP);
	EXPECT_EQ(Rows(7, 2), ".rbrbr.\n.rbrbr.\n");
}


TEST_F(CanvasBitmapTest, SmoothStretchingHasColoursInBetween)
{
	fCanvas->DrawBitmap(Bitmap(), BRect(0, 0, 1, 0), BRect(0, 0, 7, 0), B_FILTER_BITMAP_BILINEAR);
	EXPECT_EQ(fCanvas->PixelAt(BPoint(0, 0)), kRed);
	EXPECT_EQ(fCanvas->PixelAt(BPoint(7, 0)), kBlue);
	rgb_color middle = fCanvas->PixelAt(BPoint(4, 0));
	EXPECT_GT(middle.red, 60);
	EXPECT_GT(middle.blue, 60);
}


TEST_F(CanvasBitmapTest, CopyBitsMovesPixelsOntoOverlappingOnes)
{
	fState.highColor = kRed;
	SetState();
	fCanvas->FillRect(BRect(0, 0, 0, 0), B_SOLID_HIGH);
	fState.highColor = kBlue;
	SetState();
	fCanvas->FillRect(BRect(1, 0, 1, 0), B_SOLID_HIGH);
	fCanvas->CopyBits(BRect(0, 0, 2, 0), BRect(1, 0, 3, 0));
	EXPECT_EQ(Rows(5, 1), "rrb..\n");
	fCanvas->CopyBits(BRect(1, 0, 4, 0), BRect(0, 0, 3, 0));
	EXPECT_EQ(Rows(5, 1), "rb...\n");
}


TEST_F(CanvasBitmapTest, CopyBitsKeepsToTheClipAndTheBuffer)
{
	fCanvas->FillRect(BRect(0, 0, 3, 0), B_SOLID_HIGH);
	BRegion clip(BRect(6, 0, 7, 0));
	fCanvas->SetClip(&clip);
	fCanvas->CopyBits(BRect(0, 0, 3, 0), BRect(5, 0, 8, 0));
	EXPECT_EQ(Rows(10, 1), "####..##..\n");

	fCanvas->SetClip(nullptr);
	fCanvas->CopyBits(BRect(-2, 0, 1, 0), BRect(12, 0, 15, 0));
	EXPECT_EQ(Rows(17, 1), "####..##......##.\n");
}

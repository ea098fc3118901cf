// SPDX-License-Identifier: MIT
// Which pixels lines, rects and outlines cover.
#include <cmath>
#include <limits>
#include <vector>

#include <Region.h>

#include "CanvasFixture.h"

class CanvasShapesTest : public CanvasFixture {};

TEST_F(CanvasShapesTest, ANewCanvasIsWhite)
{
	EXPECT_EQ(CountOf(kWhite), 20 * 12);
	EXPECT_EQ(fCanvas->Width(), 20);
	EXPECT_EQ(fCanvas->Height(), 12);
}


TEST_F(CanvasShapesTest, FillRectCoversAllFourSides)
{
	fCanvas->FillRect(BRect(0, 0, 9, 9), B_SOLID_HIGH);
	EXPECT_EQ(CountOf(kBlack), 100);
	EXPECT_EQ(fCanvas->PixelAt(BPoint(9, 9)), kBlack);
	EXPECT_EQ(fCanvas->PixelAt(BPoint(10, 9)), kWhite);
}


TEST_F(CanvasShapesTest, FillRectOfOneColumnIsOnePixelWide)
{
	fCanvas->FillRect(BRect(2, 1, 2, 3), B_SOLID_HIGH);
	EXPECT_EQ(Rows(4, 5), "....\n..#.\n..#.\n..#.\n....\n");
}


TEST_F(CanvasShapesTest, AnInvalidRectDrawsNothing)
{
	fCanvas->FillRect(BRect(), B_SOLID_HIGH);
	fCanvas->StrokeRect(BRect(5, 5, 4, 9), B_SOLID_HIGH);
	fCanvas->InvertRect(BRect(5, 5, 4, 9));
	fCanvas->FillEllipse(BRect(5, 5, 4, 9), B_SOLID_HIGH);
	fCanvas->StrokeRoundRect(BRect(5, 5, 4, 9), 1, 1, B_SOLID_HIGH);
	EXPECT_EQ(CountOf(kWhite), 20 * 12);
}


TEST_F(CanvasShapesTest, CoordinatesFarOutsideAndNoNumbersDrawNothingWrong)
{
	const float huge = 1e30f;
	const float nan = std::numeric_limits<float>::quiet_NaN();
	fCanvas->StrokeLine(BPoint(-huge, 5), BPoint(huge, 5), B_SOLID_HIGH);
	EXPECT_EQ(CountOf(kBlack), 20);
	fCanvas->StrokeLine(BPoint(nan, nan), BPoint(3, nan), B_SOLID_HIGH);
	fCanvas->FillRect(BRect(nan, 0, nan, 1), B_SOLID_HIGH);
	fCanvas->FillEllipse(BRect(-huge, -huge, -huge / 2, -huge / 2), B_SOLID_HIGH);
	EXPECT_EQ(CountOf(kBlack), 20);
}


TEST_F(CanvasShapesTest, StrokeRectDrawsItsFourSides)
{
	fCanvas->StrokeRect(BRect(1, 1, 4, 3), B_SOLID_HIGH);
	EXPECT_EQ(Rows(6, 5), "......\n.####.\n.#..#.\n.####.\n......\n");
}


TEST_F(CanvasShapesTest, StrokeRectOfOnePixelIsThatPixel)
{
	fCanvas->StrokeRect(BRect(1, 1, 1, 1), B_SOLID_HIGH);
	EXPECT_EQ(Rows(3, 3), "...\n.#.\n...\n");
}


TEST_F(CanvasShapesTest, StrokeRectWithAWiderPenIsCentredOnTheSides)
{
	fState.penSize = 3;
	SetState();
	fCanvas->StrokeRect(BRect(2, 2, 9, 8), B_SOLID_HIGH);
	EXPECT_EQ(Rows(12, 11),
		"............\n"
		".##########.\n"
		".##########.\n"
		".##########.\n"
		".###....###.\n"
		".###....###.\n"
		".###....###.\n"
		".##########.\n"
		".##########.\n"
		".##########.\n"
		"............\n");
}


TEST_F(CanvasShapesTest, StrokeLineCoversBothEnds)
{
	fCanvas->StrokeLine(BPoint(1, 1), BPoint(4, 1), B_SOLID_HIGH);
	fCanvas->StrokeLine(BPoint(6, 4), BPoint(6, 1), B_SOLID_HIGH);
	EXPECT_EQ(Rows(8, 6), "........\n.####.#.\n......#.\n......#.\n......#.\n........\n");
}


TEST_F(CanvasShapesTest, ADiagonalLineIsNotSmoothed)
{
	fCanvas->StrokeLine(BPoint(0, 0), BPoint(4, 4), B_SOLID_HIGH);
	EXPECT_EQ(Rows(5, 5), "#....\n.#...\n..#..\n...#.\n....#\n");
}


TEST_F(CanvasShapesTest, ALineHasTheSamePixelsInBothDirections)
{
	const BPoint ends[][2] = {
		{{0, 0}, {9, 3}}, {{0, 7}, {9, 2}}, {{3, 0}, {5, 9}}, {{8, 1}, {2, 10}}};
	for (const auto& end : ends) {
		auto forth = BPrivate::Display::Get().MakeCanvas(20, 12, 1);
		auto back = BPrivate::Display::Get().MakeCanvas(20, 12, 1);
		forth->StrokeLine(end[0], end[1], B_SOLID_HIGH);
		back->StrokeLine(end[1], end[0], B_SOLID_HIGH);
		EXPECT_EQ(forth->ReadPicture().pixels, back->ReadPicture().pixels);
		EXPECT_EQ(forth->PixelAt(end[0]), kBlack);
		EXPECT_EQ(forth->PixelAt(end[1]), kBlack);
	}
}


TEST_F(CanvasShapesTest, ALineOfNoLengthIsOnePixel)
{
	fCanvas->StrokeLine(BPoint(3, 3), BPoint(3, 3), B_SOLID_HIGH);
	EXPECT_EQ(CountOf(kBlack), 1);
	EXPECT_EQ(fCanvas->PixelAt(BPoint(3, 3)), kBlack);
}


TEST_F(CanvasShapesTest, AColouredLineLeavesTheHighColourAlone)
{
	fCanvas->StrokeLine(BPoint(0, 0), BPoint(3, 0), kRed);
	fCanvas->StrokeLine(BPoint(0, 1), BPoint(3, 1), B_SOLID_HIGH);
	EXPECT_EQ(Rows(4, 2), "rrrr\n####\n");
}


TEST_F(CanvasShapesTest, FillPolygonCoversItsCorners)
{
	const BPoint corners[] = {{1, 1}, {7, 1}, {4, 4}};
	fCanvas->FillPolygon(corners, 3, B_SOLID_HIGH);
	EXPECT_EQ(Rows(9, 6), ".........\n.#######.\n..#####..\n...###...\n....#....\n.........\n");
}


TEST_F(CanvasShapesTest, StrokePolygonInvertsEachPixelOnce)
{
	fState.mode = B_OP_INVERT;
	SetState();
	const BPoint corners[] = {{1, 1}, {7, 1}, {4, 4}};
	fCanvas->StrokePolygon(corners, 3, true, B_SOLID_HIGH);
	EXPECT_EQ(Rows(9, 6), ".........\n.#######.\n..#...#..\n...#.#...\n....#....\n.........\n");
}


TEST_F(CanvasShapesTest, AnEllipseFillsItsRectButNotTheCorners)
{
	fCanvas->FillEllipse(BRect(2, 1, 12, 9), B_SOLID_HIGH);
	EXPECT_EQ(fCanvas->PixelAt(BPoint(7, 5)), kBlack);
	EXPECT_EQ(fCanvas->PixelAt(BPoint(2, 1)), kWhite);
	EXPECT_NE(fCanvas->PixelAt(BPoint(2, 5)), kWhite);
	EXPECT_NE(fCanvas->PixelAt(BPoint(12, 5)), kWhite);
	EXPECT_EQ(fCanvas->PixelAt(BPoint(1, 5)), kWhite);
	EXPECT_EQ(fCanvas->PixelAt(BPoint(13, 5)), kWhite);
}


TEST_F(CanvasShapesTest, ARoundRectHasStraightSidesAndOpenCorners)
{
	fCanvas->StrokeRoundRect(BRect(1, 1, 14, 9), 3, 3, B_SOLID_HIGH);
	EXPECT_EQ(fCanvas->PixelAt(BPoint(7, 1)), kBlack);
	EXPECT_EQ(fCanvas->PixelAt(BPoint(1, 5)), kBlack);
	EXPECT_EQ(fCanvas->PixelAt(BPoint(14, 5)), kBlack);
	EXPECT_EQ(fCanvas->PixelAt(BPoint(7, 9)), kBlack);
	EXPECT_EQ(fCanvas->PixelAt(BPoint(1, 1)), kWhite);
	EXPECT_EQ(fCanvas->PixelAt(BPoint(7, 5)), kWhite);
}


TEST_F(CanvasShapesTest, ARoundRectIsTheSameOfOneColourAsOfAPatternOfIt)
{
	fState.highColor = kRed;
	fState.lowColor = kRed;
	const BRect kRects[] = {BRect(1, 1, 18, 10), BRect(2, 1, 10, 9), BRect(3, 2, 6, 5),
		BRect(-6, -4, 9, 8), BRect(1.5f, 1, 15, 10.25f)};
	for (const BRect& rect : kRects) {
		for (float radius : {0.0f, 0.5f, 1.0f, 2.0f, 3.0f, 4.5f}) {
			for (bool stroked : {false, true}) {
				std::vector<uint32> pixels[2];
				for (const pattern& pattern : {B_SOLID_HIGH, B_MIXED_COLORS}) {
					auto canvas = BPrivate::Display::Get().MakeCanvas(20, 12, 1);
					canvas->SetState(fState);
					if (stroked)
						canvas->StrokeRoundRect(rect, radius, radius / 2 + 1, pattern);
					else
						canvas->FillRoundRect(rect, radius, radius / 2 + 1, pattern);
					pixels[pattern == B_SOLID_HIGH ? 0 : 1] = canvas->ReadPicture().pixels;
				}
				EXPECT_TRUE(pixels[0] == pixels[1])
					<< testing::PrintToString(rect) << " with a radius of " << radius
					<< (stroked ? ", stroked" : "");
			}
		}
	}
}


TEST_F(CanvasShapesTest, AnArcRunsCounterClockwiseFromTheRight)
{
	// The quarter from the right to the top.
	fCanvas->FillArc(BRect(0, 0, 10, 10), 0, 90, B_SOLID_HIGH);
	EXPECT_EQ(fCanvas->PixelAt(BPoint(7, 3)), kBlack);
	EXPECT_EQ(fCanvas->PixelAt(BPoint(3, 3)), kWhite);
	EXPECT_EQ(fCanvas->PixelAt(BPoint(7, 7)), kWhite);
}


TEST_F(CanvasShapesTest, APathIsFilledAndStroked)
{
	BPrivate::CanvasPath path;
	path.MoveTo(BPoint(2, 2));
	path.LineTo(BPoint(12, 2));
	path.BezierTo(BPoint(14, 5), BPoint(14, 7), BPoint(12, 9));
	path.LineTo(BPoint(2, 9));
	path.Close();
	fCanvas->FillPath(path, B_SOLID_HIGH);
	EXPECT_EQ(fCanvas->PixelAt(BPoint(6, 5)), kBlack);
	EXPECT_EQ(fCanvas->PixelAt(BPoint(0, 5)), kWhite);

	fState.highColor = kRed;
	SetState();
	fCanvas->StrokePath(path, B_SOLID_HIGH);
	EXPECT_EQ(fCanvas->PixelAt(BPoint(6, 2)), kRed);
	EXPECT_EQ(fCanvas->PixelAt(BPoint(6, 5)), kBlack);
}


TEST_F(CanvasShapesTest, TheOriginMovesEverything)
{
	fState.origin = BPoint(5, 2);
	SetState();
	fCanvas->FillRect(BRect(0, 0, 1, 0), B_SOLID_HIGH);
	EXPECT_EQ(Rows(8, 3), "........\n........\n.....##.\n");
}


TEST_F(CanvasShapesTest, TheClipKeepsDrawingInside)
{
	BRegion clip(BRect(2, 0, 3, 1));
	clip.Include(BRect(5, 1, 5, 2));
	fCanvas->SetClip(&clip);
	fState.origin = BPoint(1, 0);
	SetState();
	fCanvas->FillRect(BRect(-10, -10, 30, 30), B_SOLID_HIGH);
	EXPECT_EQ(Rows(7, 4), "..##...\n..##.#.\n.....#.\n.......\n");

	fCanvas->SetClip(nullptr);
	fCanvas->FillRect(BRect(-10, -10, 30, 30), B_SOLID_HIGH);
	EXPECT_EQ(CountOf(kBlack), 20 * 12);
}


TEST_F(CanvasShapesTest, AnEmptyClipLetsNothingThrough)
{
	BRegion nothing;
	fCanvas->SetClip(&nothing);
	fCanvas->FillRect(BRect(0, 0, 19, 11), B_SOLID_HIGH);
	fCanvas->FillEllipse(BRect(0, 0, 19, 11), B_SOLID_HIGH);
	fCanvas->DrawString("text", 4, BPoint(0, 10), nullptr);
	fCanvas->SetClip(nullptr);
	EXPECT_EQ(CountOf(kWhite), 20 * 12);
}


TEST_F(CanvasShapesTest, APatternHasTheLowColourWhereItsBitsAreZero)
{
	fState.highColor = kRed;
	fState.lowColor = kBlue;
	SetState();
	const pattern stripes = {{0xf0, 0x0f, 0xf0, 0x0f, 0xf0, 0x0f, 0xf0, 0x0f}};
	fCanvas->FillRect(BRect(0, 0, 7, 1), stripes);
	EXPECT_EQ(Rows(8, 2), "rrrrbbbb\nbbbbrrrr\n");
}


TEST_F(CanvasShapesTest, FillRegionFillsItsRects)
{
	BRegion region(BRect(0, 0, 1, 0));
	region.Include(BRect(3, 1, 3, 1));
	fCanvas->FillRegion(region, B_SOLID_HIGH);
	EXPECT_EQ(Rows(5, 2), "##...\n...#.\n");
}


TEST_F(CanvasShapesTest, PixelsOutsideTheBufferAreTransparent)
{
	EXPECT_EQ(fCanvas->PixelAt(BPoint(-1, 0)), (rgb_color{0, 0, 0, 0}));
	EXPECT_EQ(fCanvas->PixelAt(BPoint(20, 0)), (rgb_color{0, 0, 0, 0}));
}

// SPDX-License-Identifier: MIT
// Strokes on canvases whose device pixels do not divide evenly among the API's.
#include <cmath>
#include <set>
#include <string>
#include <vector>

#include "CanvasFixture.h"

namespace {

/// The device pixels as text: '.' for white, '#' for black, 'r' for red, '?' for others.
std::vector<std::string>
DeviceRows(const BPrivate::Canvas& canvas)
{
	const BPrivate::Picture picture = canvas.ReadPicture();
	std::vector<std::string> rows(picture.height);
	for (int32 y = 0; y < picture.height; y++) {
		for (int32 x = 0; x < picture.width; x++) {
			const uint32 color = picture.pixels[y * picture.width + x] & 0xffffff;
			rows[y] += color == 0xffffff ? '.' : color == 0 ? '#' : color == 0xff0000 ? 'r' : '?';
		}
	}
	return rows;
}

} // namespace


class CanvasStrokesTest : public CanvasFixture, public testing::WithParamInterface<float> {
protected:
	CanvasStrokesTest()
		: CanvasFixture(GetParam())
	{
	}

	void Clear()
	{
		fState.highColor = kWhite;
		SetState();
		fCanvas->FillRect(BRect(0, 0, 19, 11), B_SOLID_HIGH);
		fState.highColor = kBlack;
		SetState();
	}

	/// The numbers of device pixels that \a draw makes black in one row or column, for each place from 1 to 10.
	template <typename Function>
	std::set<int> WidthsOf(Function draw, bool inRow)
	{
		std::set<int> widths;
		for (int32 place = 1; place <= 10; place++) {
			Clear();
			draw(place);
			const std::vector<std::string> rows = DeviceRows(*fCanvas);
			int width = 0;
			if (inRow) {
				for (char pixel : rows[rows.size() / 2])
					width += pixel == '#' ? 1 : 0;
			} else {
				for (const std::string& row : rows)
					width += row[row.size() / 2] == '#' ? 1 : 0;
			}
			widths.insert(width);
		}
		return widths;
	}

	int Fitting(int pixels) const { return static_cast<int>(std::floor(pixels * GetParam())); }
};

TEST_P(CanvasStrokesTest, UprightLinesHaveTheSameWidthEverywhere)
{
	auto draw = [this](float x) { fCanvas->StrokeLine(BPoint(x, 0), BPoint(x, 11), B_SOLID_HIGH); };
	EXPECT_EQ(WidthsOf(draw, true), std::set<int>{Fitting(1)});
}


TEST_P(CanvasStrokesTest, LevelLinesHaveTheSameWidthEverywhere)
{
	auto draw = [this](float y) { fCanvas->StrokeLine(BPoint(0, y), BPoint(19, y), B_SOLID_HIGH); };
	EXPECT_EQ(WidthsOf(draw, false), std::set<int>{Fitting(1)});
}


TEST_P(CanvasStrokesTest, ThickLinesHaveTheSameWidthEverywhere)
{
	for (int pen : {2, 3, 4}) {
		auto draw = [&](float x) {
			fState.penSize = pen;
			SetState();
			fCanvas->StrokeLine(BPoint(x, 0), BPoint(x, 11), B_SOLID_HIGH);
		};
		EXPECT_EQ(WidthsOf(draw, true), std::set<int>{Fitting(pen)}) << pen;
	}
}


TEST_P(CanvasStrokesTest, SidesOfPolygonsAreAsWideAsLines)
{
	auto draw = [this](float x) {
		const BPoint corners[] = {BPoint(x, -20), BPoint(x, 30), BPoint(50, 30)};
		fCanvas->StrokePolygon(corners, 3, false, B_SOLID_HIGH);
	};
	EXPECT_EQ(WidthsOf(draw, true), std::set<int>{Fitting(1)});
}


TEST_P(CanvasStrokesTest, SidesOfRectsAreAsWideAsLines)
{
	auto draw = [this](float x) { fCanvas->StrokeRect(BRect(x, -5, x + 5, 20), B_SOLID_HIGH); };
	EXPECT_EQ(WidthsOf(draw, true), std::set<int>{2 * Fitting(1)});
}


TEST_P(CanvasStrokesTest, SidesOfRoundedRectsAreAsWideAsLines)
{
	auto draw = [this](float x) {
		fCanvas->StrokeRoundRect(BRect(x, -5, x + 7, 20), 2, 2, B_SOLID_HIGH);
	};
	EXPECT_EQ(WidthsOf(draw, true), std::set<int>{2 * Fitting(1)});
}


TEST_P(CanvasStrokesTest, LinesStayInTheirPixels)
{
	for (int32 x = 1; x <= 10; x++) {
		Clear();
		fCanvas->StrokeLine(BPoint(x, 2), BPoint(x, 8), B_SOLID_HIGH);
		fState.highColor = kWhite;
		SetState();
		fCanvas->FillRect(BRect(x, 2, x, 8), B_SOLID_HIGH);
		EXPECT_EQ(CountOf(kBlack), 0) << x;
	}
}


TEST_P(CanvasStrokesTest, TheStrokeOfARectCoversTheSidesOfItsFill)
{
	for (int32 x = 1; x <= 6; x++) {
		Clear();
		const BRect rect(x, 1, x + 8, x + 4);
		fState.highColor = kRed;
		SetState();
		fCanvas->FillRect(rect, B_SOLID_HIGH);
		fState.highColor = kBlack;
		SetState();
		fCanvas->StrokeRect(rect, B_SOLID_HIGH);
		for (const std::string& row : DeviceRows(*fCanvas)) {
			EXPECT_EQ(row.find(".r"), std::string::npos) << x << ": " << row;
			EXPECT_EQ(row.find("r."), std::string::npos) << x << ": " << row;
		}
	}
}


TEST_P(CanvasStrokesTest, LinesMeetAtTheirCorners)
{
	for (int32 side = 4; side <= 8; side++) {
		Clear();
		const BPoint corners[] = {
			BPoint(2, 2), BPoint(2 + side, 2), BPoint(2 + side, 9), BPoint(2, 9)};
		for (int i = 0; i < 4; i++)
			fCanvas->StrokeLine(corners[i], corners[(i + 1) % 4], B_SOLID_HIGH);

		// The rows that have anything begin and end in the same columns.
		std::set<size_t> firsts;
		std::set<size_t> lasts;
		for (const std::string& row : DeviceRows(*fCanvas)) {
			if (row.find('#') == std::string::npos)
				continue;
			firsts.insert(row.find('#'));
			lasts.insert(row.rfind('#'));
		}
		EXPECT_EQ(firsts.size(), 1u) << side;
		EXPECT_EQ(lasts.size(), 1u) << side;
	}
}


TEST_P(CanvasStrokesTest, CirclesAreAsWideAsHighEverywhere)
{
	std::set<size_t> sizes;
	for (int32 x = 1; x <= 6; x++) {
		Clear();
		fCanvas->FillEllipse(BRect(x, 1, x + 8, 9), B_SOLID_HIGH);
		const std::vector<std::string> rows = DeviceRows(*fCanvas);
		size_t height = 0;
		size_t width = 0;
		for (const std::string& row : rows) {
			const size_t first = row.find_first_not_of('.');
			if (first == std::string::npos)
				continue;
			height++;
			width = std::max(width, row.find_last_not_of('.') - first + 1);
		}
		EXPECT_EQ(width, height) << x;
		sizes.insert(width);
	}
	EXPECT_EQ(sizes, std::set<size_t>{static_cast<size_t>(Fitting(9))});
}


TEST_P(CanvasStrokesTest, LinesSideBySideFillAnArea)
{
	// Each device pixel is inverted once, or it would be white again.
	fState.mode = B_OP_INVERT;
	SetState();
	for (int32 x = 2; x <= 9; x++)
		fCanvas->StrokeLine(BPoint(x, 2), BPoint(x, 8), B_SOLID_HIGH);
	const int32 drawn = CountOf(kBlack);

	fState.mode = B_OP_COPY;
	Clear();
	fCanvas->FillRect(BRect(2, 2, 9, 8), B_SOLID_HIGH);
	EXPECT_EQ(drawn, CountOf(kBlack));
}


TEST_P(CanvasStrokesTest, LinesSideBySideKeepTheirColours)
{
	for (int32 y = 2; y <= 9; y++)
		fCanvas->StrokeLine(BPoint(15, y), BPoint(0, y), y % 2 == 0 ? kBlack : kRed);
	const std::vector<std::string> drawn = DeviceRows(*fCanvas);

	Clear();
	for (int32 y = 2; y <= 9; y++) {
		fState.highColor = y % 2 == 0 ? kBlack : kRed;
		SetState();
		fCanvas->FillRect(BRect(0, y, 15, y), B_SOLID_HIGH);
	}
	EXPECT_EQ(drawn, DeviceRows(*fCanvas));
}


TEST_P(CanvasStrokesTest, PointsFillTheirPixels)
{
	fState.mode = B_OP_INVERT;
	SetState();
	for (int32 y = 0; y < 12; y++) {
		for (int32 x = 0; x < 20; x++)
			fCanvas->StrokeLine(BPoint(x, y), BPoint(x, y), B_SOLID_HIGH);
	}
	EXPECT_EQ(CountOf(kWhite), 0);
	EXPECT_EQ(CountOf(kBlack), std::lround(20 * GetParam()) * std::lround(12 * GetParam()));
}

INSTANTIATE_TEST_SUITE_P(
	Scales, CanvasStrokesTest, testing::Values(1.0f, 1.25f, 1.5f, 1.75f, 2.0f, 2.5f));


class CanvasAtOneAndAHalfTest : public CanvasFixture {
protected:
	CanvasAtOneAndAHalfTest()
		: CanvasFixture(1.5f)
	{
	}
};

TEST_F(CanvasAtOneAndAHalfTest, AFrameIsOneDevicePixelWideOnAllSides)
{
	auto canvas = BPrivate::Display::Get().MakeCanvas(6, 4, 1.5f);
	canvas->StrokeRect(BRect(1, 0, 4, 3), B_SOLID_HIGH);
	EXPECT_EQ(DeviceRows(*canvas),
		(std::vector<std::string>{
			"..######.", "..#....#.", "..#....#.", "..#....#.", "..#....#.", "..######."}));
}


TEST_F(CanvasAtOneAndAHalfTest, ALineLiesAtTheLeftAndTopOfItsPixels)
{
	auto canvas = BPrivate::Display::Get().MakeCanvas(4, 2, 1.5f);
	canvas->StrokeLine(BPoint(0, 0), BPoint(0, 1), B_SOLID_HIGH);
	canvas->StrokeLine(BPoint(2, 0), BPoint(3, 0), B_SOLID_HIGH);
	EXPECT_EQ(DeviceRows(*canvas), (std::vector<std::string>{"#..###", "#.....", "#....."}));
}


TEST_F(CanvasAtOneAndAHalfTest, TwoLinesSideBySideStayAnEdge)
{
	auto canvas = BPrivate::Display::Get().MakeCanvas(4, 2, 1.5f);
	canvas->StrokeLine(BPoint(0, 0), BPoint(0, 1), kBlack);
	canvas->StrokeLine(BPoint(1, 0), BPoint(1, 1), kRed);
	EXPECT_EQ(DeviceRows(*canvas), (std::vector<std::string>{"#.r...", "#.r...", "#.r..."}));
}


TEST_F(CanvasAtOneAndAHalfTest, WhatIsDrawnBetweenLinesStays)
{
	auto canvas = BPrivate::Display::Get().MakeCanvas(4, 2, 1.5f);
	canvas->StrokeLine(BPoint(0, 0), BPoint(0, 1), kBlack);
	canvas->StrokeLine(BPoint(1, 0), BPoint(1, 1), kBlack);
	BPrivate::CanvasState state;
	state.highColor = kRed;
	canvas->SetState(state);
	canvas->FillRect(BRect(0, 0, 0, 1), B_SOLID_HIGH);
	canvas->StrokeLine(BPoint(2, 0), BPoint(2, 1), kBlack);
	EXPECT_EQ(DeviceRows(*canvas), (std::vector<std::string>{"rr##..", "rr##..", "rr##.."}));
}

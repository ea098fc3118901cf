// SPDX-License-Identifier: MIT
// What the drawing modes make of the pixels that are there.
#include <string>

#include "CanvasFixture.h"

namespace {

const rgb_color kBelow = {100, 150, 200, 255};
const rgb_color kHigh = {200, 50, 50, 255};
const rgb_color kLow = {10, 250, 20, 255};

struct ModeCase {
	const char* name;
	drawing_mode mode;
	rgb_color high;
	rgb_color low;
};

} // namespace

class CanvasModesTest : public CanvasFixture {
protected:
	CanvasModesTest()
	{
		fState.highColor = kBelow;
		SetState();
		fCanvas->FillRect(BRect(0, 0, 19, 11), B_SOLID_HIGH);
		fState.highColor = kHigh;
		fState.lowColor = kLow;
	}
};

TEST_F(CanvasModesTest, EachModeTreatsHighAndLowPixels)
{
	const ModeCase cases[] = {
		{"copy", B_OP_COPY, kHigh, kLow},
		{"over leaves low", B_OP_OVER, kHigh, kBelow},
		{"erase draws low", B_OP_ERASE, kLow, kBelow},
		{"invert", B_OP_INVERT, {155, 105, 55, 255}, kBelow},
		{"add", B_OP_ADD, {255, 200, 250, 255}, {110, 255, 220, 255}},
		{"subtract", B_OP_SUBTRACT, {0, 100, 150, 255}, {90, 0, 180, 255}},
		{"blend", B_OP_BLEND, {150, 100, 125, 255}, {55, 200, 110, 255}},
		{"min takes the darker", B_OP_MIN, kHigh, kBelow},
		{"max takes the brighter", B_OP_MAX, kBelow, kLow},
		{"select leaves other colours", B_OP_SELECT, kBelow, kBelow},
		{"alpha with opaque colours", B_OP_ALPHA, kHigh, kLow},
	};
	int32 y = 0;
	for (const ModeCase& one : cases) {
		SCOPED_TRACE(one.name);
		fState.mode = one.mode;
		SetState();
		fCanvas->FillRect(BRect(0, y, 0, y), B_SOLID_HIGH);
		fCanvas->FillRect(BRect(1, y, 1, y), B_SOLID_LOW);
		EXPECT_EQ(fCanvas->PixelAt(BPoint(0, y)), one.high);
		EXPECT_EQ(fCanvas->PixelAt(BPoint(1, y)), one.low);
		y++;
	}
}


TEST_F(CanvasModesTest, SelectSwapsHighAndLow)
{
	fState.highColor = kBelow;
	fState.mode = B_OP_SELECT;
	SetState();
	fCanvas->FillRect(BRect(0, 0, 0, 0), B_SOLID_HIGH);
	EXPECT_EQ(fCanvas->PixelAt(BPoint(0, 0)), kLow);
	fCanvas->FillRect(BRect(0, 0, 0, 0), B_SOLID_HIGH);
	EXPECT_EQ(fCanvas->PixelAt(BPoint(0, 0)), kBelow);
}


TEST_F(CanvasModesTest, InvertTwiceGivesBackWhatWasThere)
{
	fCanvas->InvertRect(BRect(2, 2, 5, 5));
	EXPECT_EQ(fCanvas->PixelAt(BPoint(3, 3)), (rgb_color{155, 105, 55, 255}));
	fCanvas->InvertRect(BRect(2, 2, 5, 5));
	EXPECT_EQ(CountOf(kBelow), 20 * 12);
}


TEST_F(CanvasModesTest, AlphaBlendsByTheColoursOpacity)
{
	fState.mode = B_OP_ALPHA;
	fState.highColor = {200, 50, 0, 51};
	SetState();
	fCanvas->FillRect(BRect(0, 0, 0, 0), B_SOLID_HIGH);
	// A fifth of the way.
	EXPECT_EQ(fCanvas->PixelAt(BPoint(0, 0)), (rgb_color{120, 130, 160, 255}));

	fState.highColor.alpha = 0;
	SetState();
	fCanvas->FillRect(BRect(1, 0, 1, 0), B_SOLID_HIGH);
	EXPECT_EQ(fCanvas->PixelAt(BPoint(1, 0)), kBelow);
}


TEST_F(CanvasModesTest, ConstantAlphaTakesTheHighColoursOpacityForPatternsToo)
{
	fState.mode = B_OP_ALPHA;
	fState.alphaSource = B_CONSTANT_ALPHA;
	fState.highColor = {0, 0, 0, 51};
	fState.lowColor = {200, 50, 0, 255};
	SetState();
	fCanvas->FillRect(BRect(0, 0, 0, 0), B_SOLID_LOW);
	EXPECT_EQ(fCanvas->PixelAt(BPoint(0, 0)), (rgb_color{120, 130, 160, 255}));
}


TEST_F(CanvasModesTest, TheTransparentColourDrawsNothingOver)
{
	fState.mode = B_OP_OVER;
	fState.highColor = B_TRANSPARENT_COLOR;
	SetState();
	fCanvas->FillRect(BRect(0, 0, 19, 11), B_SOLID_HIGH);
	EXPECT_EQ(CountOf(kBelow), 20 * 12);
}


TEST_F(CanvasModesTest, ASmoothedShapeInAddStaysWithinBounds)
{
	fState.mode = B_OP_ADD;
	SetState();
	fCanvas->FillEllipse(BRect(0, 0, 9, 9), B_SOLID_HIGH);
	for (int32 x = 0; x < 10; x++) {
		rgb_color color = fCanvas->PixelAt(BPoint(x, 5));
		EXPECT_GE(color.red, kBelow.red);
		EXPECT_GE(color.green, kBelow.green);
	}
	EXPECT_EQ(fCanvas->PixelAt(BPoint(5, 5)), (rgb_color{255, 200, 250, 255}));
}


// #pragma mark - buffers with alpha


TEST(CanvasBufferTest, DrawingGoesIntoTheCallersPixels)
{
	uint32 pixels[4 * 2] = {};
	BPrivate::PixelBuffer buffer{pixels, 4, 2, 16, true};
	auto canvas = BPrivate::Display::Get().MakeCanvas(buffer);
	BPrivate::CanvasState state;
	state.highColor = {0x11, 0x22, 0x33, 0x44};
	canvas->SetState(state);
	canvas->FillRect(BRect(1, 0, 1, 0), B_SOLID_HIGH);
	EXPECT_EQ(pixels[1], 0x44112233u);
	EXPECT_EQ(pixels[0], 0u);
}


TEST(CanvasBufferTest, RowsMayBeLongerThanThePicture)
{
	uint32 pixels[6 * 2] = {};
	BPrivate::PixelBuffer buffer{pixels, 4, 2, 24, true};
	auto canvas = BPrivate::Display::Get().MakeCanvas(buffer);
	canvas->FillRect(BRect(-5, -5, 50, 50), B_SOLID_HIGH);
	EXPECT_EQ(pixels[3], 0xff000000u);
	EXPECT_EQ(pixels[4], 0u);
	EXPECT_EQ(pixels[5], 0u);
	EXPECT_EQ(pixels[6], 0xff000000u);
	EXPECT_EQ(pixels[11], 0u);
}


TEST(CanvasBufferTest, AlphaOnTransparentKeepsTheColour)
{
	uint32 pixel = 0;
	BPrivate::PixelBuffer buffer{&pixel, 1, 1, 4, true};
	auto canvas = BPrivate::Display::Get().MakeCanvas(buffer);
	BPrivate::CanvasState state;
	state.mode = B_OP_ALPHA;
	state.highColor = {200, 100, 50, 128};
	canvas->SetState(state);
	canvas->FillRect(BRect(0, 0, 0, 0), B_SOLID_HIGH);
	EXPECT_EQ(pixel, 0x80c86432u);
}


TEST(CanvasBufferTest, CompositionFollowsItsFunction)
{
	// Source {200, 100, 0} opaque on {0, 100, 200} half transparent.
	struct {
		alpha_function function;
		uint32 result;
	} cases[] = {
		{B_ALPHA_COMPOSITE_SOURCE_OVER, 0xffc86400},
		{B_ALPHA_COMPOSITE_SOURCE_IN, 0x80c86400},
		{B_ALPHA_COMPOSITE_SOURCE_OUT, 0x7fc86400},
		{B_ALPHA_COMPOSITE_DESTINATION_IN, 0x800064c8},
		{B_ALPHA_COMPOSITE_DESTINATION_OUT, 0x00000000},
		{B_ALPHA_COMPOSITE_CLEAR, 0x00000000},
	};
	for (const auto& one : cases) {
		SCOPED_TRACE(one.function);
		uint32 pixel = 0x800064c8;
		BPrivate::PixelBuffer buffer{&pixel, 1, 1, 4, true};
		auto canvas = BPrivate::Display::Get().MakeCanvas(buffer);
		BPrivate::CanvasState state;
		state.mode = B_OP_ALPHA;
		state.alphaFunction = one.function;
		state.highColor = {200, 100, 0, 255};
		canvas->SetState(state);
		canvas->FillRect(BRect(0, 0, 0, 0), B_SOLID_HIGH);
		EXPECT_EQ(pixel, one.result);
	}
}

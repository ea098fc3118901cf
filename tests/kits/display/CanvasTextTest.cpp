// SPDX-License-Identifier: MIT
// Text on the canvas, and what it measures.
#include <cstring>
#include <string>
#include <thread>
#include <vector>

#include <Region.h>
#include <String.h>

#include "CanvasFixture.h"
#include "display/FontEngine.h"

namespace {

using BPrivate::FontEngine;
using BPrivate::FontKey;

FontEngine&
Fonts()
{
	return BPrivate::Display::Get().Fonts();
}


FontKey
KeyFor(BPrivate::standard_font which, float size = 12)
{
	FontKey key = FontKey::Of(BFont());
	float standardSize;
	Fonts().GetStandardFont(which, &key.family, &key.style, &standardSize);
	key.size = size;
	return key;
}


float
Width(const FontKey& font, const char* text)
{
	return Fonts().StringWidth(font, text, static_cast<int32>(strlen(text)));
}

} // namespace

class CanvasTextTest : public testing::Test {
protected:
	CanvasTextTest()
		: fCanvas(BPrivate::Display::Get().MakeCanvas(200, 60, 1))
	{
	}

	/// The smallest rect around all that is not white.
	BRect Ink()
	{
		BRect ink;
		for (int32 y = 0; y < 60; y++) {
			for (int32 x = 0; x < 200; x++) {
				if (fCanvas->PixelAt(BPoint(x, y)) == kWhite)
					continue;
				BRect pixel(x, y, x, y);
				ink = ink.IsValid() ? ink | pixel : pixel;
			}
		}
		return ink;
	}

	void Draw(const char* text, BPoint where)
	{
		fEnd = fCanvas->DrawString(text, static_cast<int32>(strlen(text)), where, nullptr);
	}

	std::unique_ptr<BPrivate::Canvas> fCanvas;
	BPrivate::CanvasState fState;
	BPoint fEnd;
};

TEST_F(CanvasTextTest, ACapitalStandsOnTheBaseline)
{
	Draw("H", BPoint(20, 30));
	BRect ink = Ink();
	ASSERT_TRUE(ink.IsValid());
	EXPECT_EQ(ink.bottom, 29);
	EXPECT_GE(ink.left, 20);
	EXPECT_GT(ink.Height(), 6);
	EXPECT_LT(ink.Height(), 12);
}


TEST_F(CanvasTextTest, ThePenEndsBehindTheText)
{
	Draw("Hello", BPoint(20, 30));
	EXPECT_FLOAT_EQ(fEnd.x, 20 + Width(FontKey::Of(fState.font), "Hello"));
	EXPECT_EQ(fEnd.y, 30);
	EXPECT_LE(Ink().right, fEnd.x);
}


TEST_F(CanvasTextTest, NoTextDrawsNothing)
{
	Draw("", BPoint(20, 30));
	EXPECT_FALSE(Ink().IsValid());
	EXPECT_EQ(fEnd, BPoint(20, 30));
}


TEST_F(CanvasTextTest, CopySmoothsAgainstTheLowColour)
{
	fState.lowColor = kRed;
	fCanvas->SetState(fState);
	Draw("O", BPoint(20, 30));
	bool hasRedEdge = false;
	for (uint32 pixel : fCanvas->ReadPicture().pixels)
		hasRedEdge = hasRedEdge || ((pixel >> 16 & 0xff) > 40 && (pixel & 0xffff) == 0);
	EXPECT_TRUE(hasRedEdge);
}


TEST_F(CanvasTextTest, OverSmoothsAgainstWhatIsThere)
{
	fState.lowColor = kRed;
	fState.mode = B_OP_OVER;
	fCanvas->SetState(fState);
	Draw("O", BPoint(20, 30));
	for (uint32 pixel : fCanvas->ReadPicture().pixels) {
		rgb_color color = {static_cast<uint8>(pixel >> 16), static_cast<uint8>(pixel >> 8),
			static_cast<uint8>(pixel), 255};
		ASSERT_EQ(color.red, color.green);
	}
}


TEST_F(CanvasTextTest, ATextThatIsDrawnAgainHasTheSamePixels)
{
	const auto drawnAt = [](BPoint where, const BRegion* clip = nullptr) {
		auto canvas = BPrivate::Display::Get().MakeCanvas(200, 60, 1);
		canvas->SetClip(clip);
		canvas->DrawString("A label", 7, where, nullptr);
		return canvas->ReadPicture().pixels;
	};
	const std::vector<uint32> first = drawnAt(BPoint(10, 40));
	const std::vector<uint32> shifted = drawnAt(BPoint(10.5f, 40));
	EXPECT_FALSE(shifted == first);
	EXPECT_TRUE(drawnAt(BPoint(10, 40)) == first);
	EXPECT_TRUE(drawnAt(BPoint(10.5f, 40)) == shifted);

	const BRegion clip(BRect(14, 34, 30, 60));
	std::vector<uint32> clipped = first;
	for (int32 i = 0; i < 200 * 60; i++) {
		if (!clip.Contains(i % 200, i / 200))
			clipped[i] = 0xffffffff;
	}
	EXPECT_TRUE(drawnAt(BPoint(10, 40), &clip) == clipped);
}


TEST_F(CanvasTextTest, TextLeavesTheUnusedByteOfPixelsBesideItAlone)
{
	std::vector<uint32> pixels(61 * 20, 0x00ffffff);
	BPrivate::PixelBuffer buffer{pixels.data(), 61, 20, 61 * 4, false};
	auto canvas = BPrivate::Display::Get().MakeCanvas(buffer);
	BPrivate::CanvasState state;
	state.mode = B_OP_OVER;
	canvas->SetState(state);
	canvas->DrawString("Label", 5, BPoint(2, 15), nullptr);
	int32 inked = 0;
	for (uint32 pixel : pixels) {
		if (pixel == 0x00ffffff)
			continue;
		EXPECT_EQ(pixel >> 24, 0xffu);
		inked++;
	}
	EXPECT_GT(inked, 50);
}


TEST_F(CanvasTextTest, ExtraRoomSpreadsTheCharacters)
{
	escapement_delta delta = {3, 10};
	BPoint end = fCanvas->DrawString("a b", 3, BPoint(10, 30), &delta);
	EXPECT_NEAR(end.x, 10 + Width(FontKey::Of(fState.font), "a b") + 3 + 10 + 3, 0.01);
}


TEST_F(CanvasTextTest, CharactersGoToTheirOwnPlaces)
{
	const BPoint places[] = {{10, 30}, {100, 50}};
	fCanvas->DrawString("HH", 2, places, 2);
	BRect ink = Ink();
	EXPECT_LT(ink.left, 14);
	EXPECT_GE(ink.right, 100);
	EXPECT_EQ(ink.bottom, 49);
}


TEST_F(CanvasTextTest, RotatedTextRunsUpwards)
{
	fState.font.SetRotation(90);
	fCanvas->SetState(fState);
	Draw("HHHH", BPoint(50, 55));
	BRect ink = Ink();
	EXPECT_GT(ink.Height(), ink.Width());
	EXPECT_LE(ink.right, 51);
	EXPECT_NEAR(fEnd.x, 50, 0.01);
	EXPECT_LT(fEnd.y, 30);
}


// #pragma mark - measuring


TEST(FontEngineTest, ThePlainFontHasSize12)
{
	uint16 family;
	uint16 style;
	float size;
	Fonts().GetStandardFont(BPrivate::kPlainFont, &family, &style, &size);
	EXPECT_EQ(size, 12);
	font_family name;
	EXPECT_EQ(Fonts().GetFamily(family, &name), B_OK);
}


TEST(FontEngineTest, TheBoldFontIsBoldAndTheFixedOneFixed)
{
	FontKey bold = KeyFor(BPrivate::kBoldFont);
	FontKey fixed = KeyFor(BPrivate::kFixedFont);
	BPrivate::FontStyleInfo info;
	ASSERT_EQ(Fonts().GetStyle(bold.family, bold.style, &info), B_OK);
	EXPECT_TRUE((info.face & B_BOLD_FACE) != 0);
	EXPECT_TRUE((info.face & B_ITALIC_FACE) == 0);
	EXPECT_FLOAT_EQ(Width(fixed, "iiii"), Width(fixed, "MMMM"));
	EXPECT_GT(Width(bold, "Hello"), Width(KeyFor(BPrivate::kPlainFont), "Hello"));
}


TEST(FontEngineTest, WidthsAreTheSumOfTheEscapements)
{
	FontKey font = KeyFor(BPrivate::kPlainFont);
	const char* text = "AVATAR To\xc3\xa4\xe2\x82\xac.";
	float escapements[12];
	Fonts().GetEscapements(font, text, 12, escapements);
	float sum = 0;
	for (float one : escapements)
		sum += one;
	EXPECT_NEAR(sum, Width(font, text), 0.05);
}


TEST(FontEngineTest, WidthsGrowWithTheSize)
{
	FontKey twelve = KeyFor(BPrivate::kPlainFont, 12);
	FontKey twentyFour = KeyFor(BPrivate::kPlainFont, 24);
	EXPECT_NEAR(Width(twentyFour, "Some text"), 2 * Width(twelve, "Some text"), 0.5);
	EXPECT_EQ(Width(twelve, ""), 0);
	font_height height = Fonts().Height(twelve);
	EXPECT_GT(height.ascent, 8);
	EXPECT_LT(height.ascent, 16);
	EXPECT_GT(height.descent, 1);
	EXPECT_LT(height.descent, 6);
	EXPECT_GE(height.leading, 0);
}


TEST(FontEngineTest, DamagedTextIsMeasuredWithoutHarm)
{
	FontKey font = KeyFor(BPrivate::kPlainFont);
	const char* texts[] = {"\xff", "a\xc3", "\xe2\x82", "\xf0\x9f\x98", "\x80\x80", "\xed\xa0\x80"};
	for (const char* text : texts) {
		float escapements[4];
		Fonts().GetEscapements(font, text, 4, escapements);
		EXPECT_GE(Width(font, text), 0);
		BRect bounds[4];
		Fonts().GetGlyphBounds(font, text, 4, bounds);
	}
}


TEST(FontEngineTest, NumbersOutOfRangeAreRefused)
{
	font_family family;
	BPrivate::FontStyleInfo info;
	EXPECT_EQ(Fonts().GetFamily(-1, &family), B_BAD_INDEX);
	EXPECT_EQ(Fonts().GetFamily(Fonts().CountFamilies(), &family), B_BAD_INDEX);
	EXPECT_EQ(Fonts().GetStyle(0, 1000, &info), B_BAD_INDEX);
	EXPECT_EQ(Fonts().CountStyles(-5), 0);
	EXPECT_EQ(Fonts().FindFamily("No Such Family"), B_NAME_NOT_FOUND);
	FontKey unknown = {60000, 60000, 12, 90, 0, 0, 0, 0};
	EXPECT_GT(Width(unknown, "text"), 0);
}


TEST(FontEngineTest, EveryFamilyIsFoundByItsName)
{
	for (int32 i = 0; i < Fonts().CountFamilies(); i++) {
		font_family name;
		ASSERT_EQ(Fonts().GetFamily(i, &name), B_OK);
		EXPECT_EQ(Fonts().FindFamily(name), i) << name;
	}
}


TEST(FontEngineTest, TruncationPutsTheEllipsisWhereItCuts)
{
	FontKey font = KeyFor(BPrivate::kFixedFont, 10);
	float width = Width(font, "12345");
	struct {
		uint32 mode;
		const char* result;
	} cases[] = {{B_TRUNCATE_END, "abcd" B_UTF8_ELLIPSIS},
		{B_TRUNCATE_BEGINNING, B_UTF8_ELLIPSIS "ghij"},
		{B_TRUNCATE_MIDDLE, "ab" B_UTF8_ELLIPSIS "ij"}, {B_NO_TRUNCATION, "abcdefghij"}};
	for (const auto& one : cases) {
		BString text("abcdefghij");
		Fonts().TruncateString(font, &text, one.mode, width + 0.1f);
		EXPECT_STREQ(text.String(), one.result) << "mode " << one.mode;
	}
}


TEST(FontEngineTest, TruncationLeavesAloneWhatFitsAndEmptiesWhatCannot)
{
	FontKey font = KeyFor(BPrivate::kFixedFont, 10);
	BString fits("abc");
	Fonts().TruncateString(font, &fits, B_TRUNCATE_END, Width(font, "abc"));
	EXPECT_STREQ(fits.String(), "abc");
	BString cannot("abc");
	Fonts().TruncateString(font, &cannot, B_TRUNCATE_END, 1);
	EXPECT_STREQ(cannot.String(), "");
	BString wide("\xc3\xa4\xc3\xa4\xc3\xa4\xc3\xa4");
	Fonts().TruncateString(font, &wide, B_TRUNCATE_END, Width(font, "12") + 0.1f);
	EXPECT_STREQ(wide.String(), "\xc3\xa4" B_UTF8_ELLIPSIS);
}


TEST(FontEngineTest, ManyThreadsMayMeasureAndDrawAtOnce)
{
	FontKey font = KeyFor(BPrivate::kPlainFont);
	float expected = Width(font, "The same in every thread");
	std::vector<std::thread> threads;
	std::vector<float> found(4);
	for (size_t i = 0; i < found.size(); i++) {
		threads.emplace_back([&, i] {
			auto canvas = BPrivate::Display::Get().MakeCanvas(200, 20, 1);
			for (int round = 0; round < 20; round++) {
				canvas->DrawString("The same in every thread", 24, BPoint(0, 15), nullptr);
				found[i] = Width(font, "The same in every thread");
			}
		});
	}
	for (std::thread& thread : threads)
		thread.join();
	for (float width : found)
		EXPECT_FLOAT_EQ(width, expected);
}

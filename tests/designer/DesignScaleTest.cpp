// SPDX-License-Identifier: MIT
// The design surface on displays of any scale: components are where the pointer put them, and are drawn there.

#include "designer/SurfaceTest.h"

#include <cmath>
#include <cstdlib>

#include "support/Printers.h"

class DesignScaleTest : public SurfaceTest {
protected:
	/// Whether any of the device pixels that belong to a pixel of the API has a selection's colour: a line need
	/// not fill them.
	static bool IsMarked(const WindowPicture& picture, float x, float y)
	{
		const float scale = picture.width / 301.0f;
		for (int32 row = std::lround(y * scale); row < std::lround((y + 1) * scale); row++) {
			for (int32 column = std::lround(x * scale); column < std::lround((x + 1) * scale);
				 column++) {
				const rgb_color color = picture.At(column, row);
				if (color.red == 0 && color.green == 200 && color.blue == 200)
					return true;
			}
		}
		return false;
	}

	/// Whether all pixels are the same, but for one step of a channel: where smoothed letters and corners of two
	/// components meet, the order of drawing rounds differently.
	static bool LookAlike(const WindowPicture& one, const WindowPicture& other)
	{
		if (one.pixels.size() != other.pixels.size())
			return false;
		for (size_t i = 0; i < one.pixels.size(); i++) {
			for (int32 shift = 0; shift < 32; shift += 8) {
				const int32 first = (one.pixels[i] >> shift) & 0xff;
				const int32 second = (other.pixels[i] >> shift) & 0xff;
				if (std::abs(first - second) > 1)
					return false;
			}
		}
		return true;
	}

	void CheckSelected(TComponent* component, BRect frame)
	{
		EXPECT_EQ(FrameOnForm(component), frame);
		EXPECT_EQ(ToldFrame(component), Frame(component));
		const WindowPicture picture = fRobot.Picture();
		for (float x = frame.left; x <= frame.right; x++) {
			EXPECT_TRUE(IsMarked(picture, x, frame.top)) << x;
			EXPECT_TRUE(IsMarked(picture, x, frame.bottom)) << x;
			EXPECT_FALSE(IsMarked(picture, x, frame.top - 1)) << x;
			EXPECT_FALSE(IsMarked(picture, x, frame.bottom + 1)) << x;
		}
		for (float y = frame.top; y <= frame.bottom; y++) {
			EXPECT_TRUE(IsMarked(picture, frame.left, y)) << y;
			EXPECT_TRUE(IsMarked(picture, frame.right, y)) << y;
			EXPECT_FALSE(IsMarked(picture, frame.left - 1, y)) << y;
			EXPECT_FALSE(IsMarked(picture, frame.right + 1, y)) << y;
		}
		for (float x = frame.left + 1; x < frame.right; x++) {
			for (float y = frame.top + 1; y < frame.bottom; y++) {
				const bool isHandle = x >= frame.right - 5 && y >= frame.bottom - 5;
				EXPECT_EQ(IsMarked(picture, x, y), isHandle) << x << ", " << y;
			}
		}
	}
};


TEST_F(DesignScaleTest, ComponentsAreDrawnWhereTheyWerePut)
{
	TComponent* button = Draw("TButton", BRect(21, 33, 121, 63));
	ASSERT_NE(button, nullptr);
	CheckSelected(button, BRect(21, 33, 121, 63));
	fRobot.Drag(BPoint(40, 40), BPoint(77, 155));
	CheckSelected(button, BRect(58, 148, 158, 178));
	fRobot.Drag(BPoint(155, 175), BPoint(203, 211));
	CheckSelected(button, BRect(58, 148, 203, 211));

	// Within a box
	Draw("TBox", BRect(5, 5, 295, 140));
	TComponent* inside = Draw("TTextControl", BRect(31, 27, 150, 51));
	CheckSelected(inside, BRect(31, 27, 150, 51));
	EXPECT_EQ(Frame(inside), BRect(26, 22, 145, 46));
	fRobot.Drag(BPoint(147, 49), BPoint(160, 60));
	CheckSelected(inside, BRect(31, 27, 160, 60));
}


TEST_F(DesignScaleTest, WhatIsMarkedOtherwiseLooksAsIfAllWereDrawnAnew)
{
	// Side by side, over each other, one inside another, and one whose child covers it.
	Draw("TButton", BRect(21, 33, 121, 63));
	Draw("TButton", BRect(122, 33, 180, 63));
	Draw("TCheckBox", BRect(101, 50, 200, 80));
	Draw("TBox", BRect(5, 101, 200, 190));
	Draw("TButton", BRect(11, 111, 100, 141));
	Draw("TTextControl", BRect(101, 121, 190, 151));
	const BPoint clicks[] = {BPoint(40, 40), BPoint(150, 40), BPoint(111, 70), BPoint(20, 180),
		BPoint(60, 130), BPoint(150, 130), BPoint(250, 20), BPoint(60, 130), BPoint(250, 20)};
	for (BPoint where : clicks) {
		fRobot.Click(where);
		const WindowPicture picture = fRobot.Picture();
		Locked([&] { Form()->View()->Invalidate(); });
		fRobot.Settle();
		const WindowPicture whole = fRobot.Picture();
		ASSERT_FALSE(whole.pixels.empty());
		EXPECT_TRUE(LookAlike(picture, whole)) << where.x << ", " << where.y;
	}
}

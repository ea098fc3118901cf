// SPDX-License-Identifier: MIT
// What windows show where a pixel of the API is no whole number of the device's.
#include <set>

#include <gtest/gtest.h>

#include "InterfaceFixture.h"
#include "support/Robot.h"

namespace {

/// Draws a line in every third row.
class LinesView : public BView {
public:
	LinesView()
		: BView(BRect(10, 10, 69, 69), "lines", B_FOLLOW_NONE, B_WILL_DRAW)
	{
	}

	void Draw(BRect) override
	{
		for (float y = 0; y < 300; y += 3)
			StrokeLine(BPoint(0, y), BPoint(59, y));
	}
};


class ScaledPaintingTest : public InterfaceTest {
protected:
	void SetUp() override
	{
		fWindow = new BWindow(BRect(100, 100, 179, 179), "Scaled", B_TITLED_WINDOW, 0);
		fView = new LinesView;
		fWindow->AddChild(fView);
		fWindow->Show();
		fRobot = std::make_unique<Robot>(fWindow);
		ASSERT_TRUE(fRobot->Settle());
	}

	void TearDown() override { Quit(fWindow); }

	WindowPicture ShownAfter(void (*change)(BView*))
	{
		fWindow->Lock();
		change(fView);
		fWindow->Unlock();
		EXPECT_TRUE(fRobot->Settle());
		return fRobot->Picture();
	}

	BWindow* fWindow = nullptr;
	BView* fView = nullptr;
	std::unique_ptr<Robot> fRobot;
};

} // namespace


TEST_F(ScaledPaintingTest, ScrollingShowsWhatDrawingAnewWould)
{
	auto redraw = [](BView* view) { view->Invalidate(); };
	for (int step = 1; step <= 4; step++) {
		const WindowPicture scrolled = ShownAfter([](BView* view) { view->ScrollBy(0, 7); });
		const WindowPicture drawn = ShownAfter(redraw);
		ASSERT_EQ(scrolled.height, drawn.height);
		EXPECT_TRUE(scrolled.pixels == drawn.pixels) << step;
	}
}


TEST_F(ScaledPaintingTest, LinesAreOfTheSameHeightEverywhere)
{
	const WindowPicture picture = ShownAfter([](BView*) {});
	ASSERT_EQ(picture.height, 120);
	std::set<int> heights;
	int height = 0;
	for (int32 y = 16; y < 104; y++) {
		const bool isDark = picture.At(60, y).red < 128;
		if (!isDark && height > 0)
			heights.insert(height);
		height = isDark ? height + 1 : 0;
	}
	EXPECT_EQ(heights, std::set<int>{1});
}

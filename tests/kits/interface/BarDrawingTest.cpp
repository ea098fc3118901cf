// SPDX-License-Identifier: MIT
// Tests of what sliders, status bars, tabs, colour and picture controls show: the pixels that tell a state.
#include <ColorControl.h>
#include <PictureButton.h>
#include <Slider.h>
#include <StatusBar.h>
#include <TabView.h>

#include "ControlsFixture.h"

namespace {

const rgb_color kRed = {255, 0, 0, 255};
const rgb_color kGreen = {0, 255, 0, 255};

class BarDrawingTest : public ControlsTest {
protected:
	WindowPicture Picture()
	{
		fRobot->Settle();
		return fRobot->Picture();
	}

	/// How many pixels have the colour of the focus.
	int32 FocusPixels(BRect frame)
	{
		return Picture().Count(frame, ui_color(B_KEYBOARD_NAVIGATION_COLOR));
	}
};


// A picture of one filled square. Attached: views of a window record pictures.
std::unique_ptr<BPicture>
Square(BView* view, rgb_color color)
{
	std::unique_ptr<BPicture> picture(new BPicture);
	view->BeginPicture(picture.get());
	view->SetHighColor(color);
	view->FillRect(BRect(0, 0, 19, 19));
	view->EndPicture();
	return picture;
}

} // namespace


TEST_F(BarDrawingTest, StatusBarIsFilledUpToItsValue)
{
	BStatusBar* bar = Add(new BStatusBar(BRect(10, 10, 211, 30), "bar"));
	bar->SetBarColor(kRed);
	Show();
	const BRect row(10, 18, 211, 18);
	EXPECT_EQ(Picture().Count(row, kRed), 0);
	// The border takes a pixel at each end.
	Do([=] { bar->SetTo(50); });
	EXPECT_NEAR(Picture().Count(row, kRed), 100, 1);
	Do([=] { bar->Update(25); });
	EXPECT_NEAR(Picture().Count(row, kRed), 150, 1);
	Do([=] { bar->SetTo(100); });
	EXPECT_EQ(Picture().Count(row, kRed), 200);
	Do([=] { bar->SetTo(25); });
	EXPECT_NEAR(Picture().Count(row, kRed), 50, 1);
	Do([=] { bar->Reset(); });
	EXPECT_EQ(Picture().Count(row, kRed), 0);
	Do([=] { bar->SetMaxValue(0); });
	EXPECT_EQ(Picture().Count(row, kRed), 0);
}


TEST_F(BarDrawingTest, StatusBarShowsNewTexts)
{
	BStatusBar* bar = Add(new BStatusBar(BRect(10, 10, 211, 30), "bar", "Label"));
	Show();
	const BRect line(10, 10, 211, 26);
	const WindowPicture before = Picture();
	Do([=] { bar->SetTrailingText("42"); });
	const WindowPicture after = Picture();
	EXPECT_TRUE(before.SameIn(after, BRect(10, 10, 110, 26)));
	EXPECT_FALSE(before.SameIn(after, BRect(180, 10, 211, 26)));
	Do([=] { bar->SetTrailingText(nullptr); });
	EXPECT_TRUE(before.SameIn(Picture(), line));
}


TEST_F(BarDrawingTest, SliderIsFilledUpToItsThumb)
{
	BSlider* slider = Add(new BSlider(BRect(10, 10, 226, 40), "slider", nullptr, nullptr, 0, 100));
	slider->SetBarColor(kRed);
	slider->UseFillColor(true, &kGreen);
	slider->SetValue(50);
	Show();
	const BRect row(10, 19, 226, 19);
	// The block covers 13 pixels in the middle, the border one at each end.
	WindowPicture picture = Picture();
	EXPECT_NEAR(picture.Count(row, kGreen), 93, 2);
	EXPECT_NEAR(picture.Count(row, kRed), 93, 2);
	Do([=] { slider->SetValue(100); });
	picture = Picture();
	EXPECT_EQ(picture.Count(row, kRed), 0);
	Do([=] { slider->UseFillColor(false); });
	picture = Picture();
	EXPECT_EQ(picture.Count(row, kGreen), 0);
	EXPECT_GT(picture.Count(row, kRed), 180);
}


TEST_F(BarDrawingTest, SliderDrawsAsManyHashMarksAsAskedFor)
{
	BSlider* slider = Add(new BSlider(BRect(10, 10, 226, 40), "slider", nullptr, nullptr, 0, 100));
	slider->SetHashMarkCount(5);
	Show();
	// Above the bar, and above the thumb.
	const BRect above(10, 10, 226, 11);
	const rgb_color panel = ui_color(B_PANEL_BACKGROUND_COLOR);
	const int32 all = 217 * 2;
	EXPECT_EQ(Picture().Count(above, panel), all);
	Do([=] { slider->SetHashMarks(B_HASH_MARKS_TOP); });
	EXPECT_EQ(Picture().Count(above, panel), all - 5 * 2);
	Do([=] { slider->SetHashMarkCount(11); });
	EXPECT_EQ(Picture().Count(above, panel), all - 11 * 2);
	Do([=] { slider->SetHashMarks(B_HASH_MARKS_BOTTOM); });
	EXPECT_EQ(Picture().Count(above, panel), all);
	EXPECT_LT(Picture().Count(BRect(10, 27, 226, 28), panel), all);
}


TEST_F(BarDrawingTest, LongSliderLabelEndsBeforeTheUpdateText)
{
	class TellingSlider : public BSlider {
	public:
		using BSlider::BSlider;
		const char* UpdateText() const override { return "42"; }
	};
	BSlider* slider = Add(new TellingSlider(BRect(10, 10, 109, 60), "slider", "", nullptr, 0, 100));
	Show();
	const float text = Ask([=] { return slider->StringWidth("42"); });
	const BRect end(109 - text - 4, 10, 109, 22);
	const WindowPicture before = Picture();
	Do([=] { slider->SetLabel("A label that is much longer than the slider"); });
	const WindowPicture after = Picture();
	EXPECT_TRUE(before.SameIn(after, end));
	EXPECT_FALSE(before.SameIn(after, BRect(10, 10, 60, 22)));
}


TEST_F(BarDrawingTest, FocusIsSeen)
{
	BSlider* slider = Add(new BSlider(BRect(10, 10, 226, 40), "slider", nullptr, nullptr, 0, 100));
	BColorControl* colors = Add(new BColorControl(BPoint(10, 50), B_CELLS_16x16, 6, "colors"));
	BTabView* tabs = Add(new BTabView(BRect(200, 50, 290, 120), "tabs"));
	tabs->AddTab(new BView(BRect(0, 0, 9, 9), "page", B_FOLLOW_NONE, 0));
	BPictureButton* button =
		Add(new BPictureButton(BRect(10, 160, 40, 190), "button", nullptr, nullptr, nullptr));
	Show();
	for (BView* view : std::initializer_list<BView*>{slider, colors, tabs, button}) {
		const BRect frame = Ask([=] { return view->Frame(); });
		// A ramp passes through all kinds of blue.
		const int32 before = FocusPixels(frame);
		Do([=] { view->MakeFocus(); });
		EXPECT_GT(FocusPixels(frame), before + 10) << view->Name();
		Do([=] { view->MakeFocus(false); });
		EXPECT_EQ(FocusPixels(frame), before) << view->Name();
	}
}


TEST_F(BarDrawingTest, DisabledControlsLookDifferent)
{
	BSlider* slider = Add(new BSlider(BRect(10, 10, 226, 40), "slider", "Label", nullptr, 0, 100));
	BColorControl* colors = Add(new BColorControl(BPoint(10, 70), B_CELLS_16x16, 6, "colors"));
	Show();
	for (BControl* control : std::initializer_list<BControl*>{slider, colors}) {
		const BRect frame = Ask([=] { return control->Frame(); });
		const WindowPicture before = Picture();
		Do([=] { control->SetEnabled(false); });
		EXPECT_FALSE(before.SameIn(Picture(), frame)) << control->Name();
		Do([=] { control->SetEnabled(true); });
		EXPECT_TRUE(before.SameIn(Picture(), frame)) << control->Name();
	}
}


TEST_F(BarDrawingTest, RampsGoFromBlackToTheirColor)
{
	Add(new BColorControl(BPoint(10, 10), B_CELLS_32x8, 6, "colors"));
	Show();
	const WindowPicture picture = Picture();
	const rgb_color kEnds[] = {{255, 255, 255, 255}, kRed, kGreen, {0, 0, 255, 255}};
	for (int32 ramp = 0; ramp < 4; ramp++) {
		// Four ramps of 192 x 12 pixels from (12, 12) on, at their lower edge, below the markers.
		const int32 y = 12 + 12 * ramp + 11;
		EXPECT_EQ(picture.At(203, y), kEnds[ramp]) << ramp;
		EXPECT_EQ(picture.At(12, y), make_color(0, 0, 0)) << ramp;
		const rgb_color middle = picture.At(108, y);
		EXPECT_NEAR(middle.red, kEnds[ramp].red / 2, 4) << ramp;
		EXPECT_NEAR(middle.green, kEnds[ramp].green / 2, 4) << ramp;
		EXPECT_NEAR(middle.blue, kEnds[ramp].blue / 2, 4) << ramp;
	}
}


TEST_F(BarDrawingTest, ChosenColorIsShown)
{
	BColorControl* colors = Add(new BColorControl(BPoint(10, 10), B_CELLS_32x8, 6, "colors"));
	Show();
	const rgb_color color = make_color(123, 45, 67);
	const BRect frame = Ask([=] { return colors->Frame(); });
	EXPECT_EQ(Picture().Count(frame, color), 0);
	Do([=] { colors->SetValue(color); });
	EXPECT_GT(Picture().Count(frame, color), 500);
}


TEST_F(BarDrawingTest, TabsShowTheViewOfTheSelectedOne)
{
	BTabView* tabs = Add(new BTabView(BRect(10, 10, 209, 109), "tabs"));
	for (rgb_color color : {kRed, kGreen}) {
		BView* page = new BView(BRect(10, 10, 29, 29), "page", B_FOLLOW_NONE, B_WILL_DRAW);
		page->SetViewColor(color);
		tabs->AddTab(page);
	}
	Show();
	const BRect frame(10, 10, 209, 109);
	EXPECT_EQ(Picture().Count(frame, kRed), 400);
	EXPECT_EQ(Picture().Count(frame, kGreen), 0);
	Do([=] { tabs->Select(1); });
	EXPECT_EQ(Picture().Count(frame, kRed), 0);
	EXPECT_EQ(Picture().Count(frame, kGreen), 400);
}


TEST_F(BarDrawingTest, SelectedTabIsOpenToItsBox)
{
	BTabView* tabs = Add(new BTabView(BRect(10, 10, 289, 109), "tabs"));
	for (const char* name : {"one", "two"})
		tabs->AddTab(new BView(BRect(0, 0, 9, 9), name, B_FOLLOW_NONE, 0));
	Show();
	const rgb_color panel = ui_color(B_PANEL_BACKGROUND_COLOR);
	for (int32 selected : {0, 1}) {
		Do([=] { tabs->Select(selected); });
		const WindowPicture picture = Picture();
		for (int32 i : {0, 1}) {
			const BRect tab = Ask([=] { return tabs->ConvertToParent(tabs->TabFrame(i)); });
			const BRect edge(tab.left + 1, tab.bottom, tab.right - 1, tab.bottom);
			const int32 open = picture.Count(edge, panel);
			EXPECT_EQ(open, i == selected ? edge.IntegerWidth() + 1 : 0) << i << ' ' << selected;
		}
	}
}


TEST_F(BarDrawingTest, PictureButtonShowsThePictureOfItsState)
{
	Show();
	BPictureButton* button = nullptr;
	Do([&] {
		const auto off = Square(fBackground, kRed);
		const auto on = Square(fBackground, kGreen);
		button = new BPictureButton(BRect(10, 10, 29, 29), "button", off.get(), on.get(), nullptr);
		fBackground->AddChild(button);
	});
	const BRect frame(10, 10, 29, 29);
	EXPECT_EQ(Picture().Count(frame, kRed), 400);
	Do([=] { button->SetValue(1); });
	EXPECT_EQ(Picture().Count(frame, kGreen), 400);

	// Without a picture of its own the disabled state shows the other one, but fainter.
	Do([=] { button->SetEnabled(false); });
	const rgb_color faint = Picture().At(15, 15);
	EXPECT_GT(faint.green, faint.red);
	EXPECT_NE(faint, kGreen);
	Do([=] { button->SetDisabledOn(button->EnabledOff()); });
	EXPECT_EQ(Picture().Count(frame, kRed), 400);
	Do([=] {
		button->SetEnabled(true);
		button->SetEnabledOn(nullptr);
	});
	EXPECT_EQ(Picture().Count(frame, ui_color(B_PANEL_BACKGROUND_COLOR)), 400);
}

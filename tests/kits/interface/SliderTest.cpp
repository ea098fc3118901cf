// SPDX-License-Identifier: MIT
// Tests of BSlider: values and limits, keyboard and mouse, messages, and where its parts are.
#include <Slider.h>

#include <climits>
#include <cmath>

#include "ControlsFixture.h"

namespace {

// Tells its value, in a buffer that the next call changes.
class TellingSlider : public BSlider {
public:
	using BSlider::BSlider;

	const char* UpdateText() const override
	{
		fText = std::to_string(Value());
		return fText.c_str();
	}

private:
	mutable std::string fText;
};


class SliderTest : public ControlsTest {
protected:
	void SetUp() override
	{
		ControlsTest::SetUp();
		// The bar goes from 18 to 218 in the window.
		fSlider = Add(
			new BSlider(BRect(10, 10, 226, 40), "slider", nullptr, new BMessage('slid'), 0, 100));
		fSlider->SetModificationMessage(new BMessage('smod'));
	}

	/// In the window, on the middle of the bar.
	BPoint PlaceOf(float position)
	{
		const BRect bar = Ask([this] { return fSlider->ConvertToParent(fSlider->BarFrame()); });
		return BPoint(std::round(bar.left + position * bar.Width()), bar.top + 2);
	}

	BSlider* fSlider = nullptr;
};

} // namespace


TEST_F(SliderTest, NewSliderHasTheLowerLimitForValue)
{
	BSlider slider("slider", nullptr, nullptr, -7, 12, B_VERTICAL);
	EXPECT_EQ(slider.Value(), -7);
	EXPECT_EQ(slider.Position(), 0);
	EXPECT_EQ(slider.Orientation(), B_VERTICAL);
	EXPECT_EQ(slider.Style(), B_BLOCK_THUMB);
	EXPECT_EQ(slider.BarThickness(), 6);
	EXPECT_EQ(slider.KeyIncrementValue(), 1);
	EXPECT_EQ(slider.HashMarks(), B_HASH_MARKS_NONE);
	EXPECT_FALSE(slider.FillColor(nullptr));
}


TEST_F(SliderTest, ValueIsBroughtIntoTheLimits)
{
	const struct {
		int32 given;
		int32 kept;
	} kRows[] = {{50, 50}, {101, 100}, {INT_MAX, 100}, {-1, 0}, {INT_MIN, 0}};
	for (const auto& row : kRows) {
		fSlider->SetValue(row.given);
		EXPECT_EQ(fSlider->Value(), row.kept) << row.given;
	}
}


TEST_F(SliderTest, NewLimitsTakeTheValueAlong)
{
	fSlider->SetValue(80);
	fSlider->SetLimits(10, 50);
	EXPECT_EQ(fSlider->Value(), 50);
	// An empty range upside down changes nothing.
	fSlider->SetLimits(9, 8);
	int32 minimum, maximum;
	fSlider->GetLimits(&minimum, &maximum);
	EXPECT_EQ(minimum, 10);
	EXPECT_EQ(maximum, 50);
}


TEST_F(SliderTest, PositionGoesFromNoughtToOne)
{
	fSlider->SetValue(25);
	EXPECT_FLOAT_EQ(fSlider->Position(), 0.25f);
	const struct {
		float given;
		int32 value;
	} kRows[] = {{0.5f, 50}, {1, 100}, {2, 100}, {-1, 0}, {NAN, 0}, {0.004f, 0}, {0.006f, 1}};
	for (const auto& row : kRows) {
		fSlider->SetPosition(row.given);
		EXPECT_EQ(fSlider->Value(), row.value) << row.given;
	}
}


TEST_F(SliderTest, WholeRangeOfNumbersWorks)
{
	fSlider->SetLimits(INT_MIN, INT_MAX);
	fSlider->SetPosition(1);
	EXPECT_EQ(fSlider->Value(), INT_MAX);
	EXPECT_EQ(fSlider->Position(), 1);
	fSlider->SetPosition(0);
	EXPECT_EQ(fSlider->Value(), INT_MIN);
	fSlider->SetLimits(3, 3);
	EXPECT_EQ(fSlider->Position(), 0);
	EXPECT_EQ(fSlider->ValueForPoint(BPoint(100, 10)), 3);
}


TEST_F(SliderTest, ClickMovesTheThumbThereAndSendsBothMessages)
{
	Show();
	fRobot->Click(PlaceOf(0.75f));
	EXPECT_EQ(ValueOf(fSlider), 75);
	const std::vector<BMessage> received = Take();
	ASSERT_EQ(received.size(), 2u);
	EXPECT_EQ(received[0].what, static_cast<uint32>('smod'));
	EXPECT_EQ(received[0].GetInt32("be:value", -1), 75);
	EXPECT_EQ(received[1].what, static_cast<uint32>('slid'));
	EXPECT_EQ(received[1].GetInt32("be:value", -1), 75);
}


TEST_F(SliderTest, DragSendsEachChangeAndTheMessageOnceAtTheEnd)
{
	Show();
	fRobot->Drag(PlaceOf(0), PlaceOf(0.4f), 4);
	EXPECT_EQ(ValueOf(fSlider), 40);
	const std::vector<BMessage> received = Take();
	ASSERT_GE(received.size(), 2u);
	int32 last = 0;
	for (size_t i = 0; i + 1 < received.size(); i++) {
		EXPECT_EQ(received[i].what, static_cast<uint32>('smod'));
		EXPECT_GT(received[i].GetInt32("be:value", -1), last);
		last = received[i].GetInt32("be:value", -1);
	}
	EXPECT_EQ(last, 40);
	EXPECT_EQ(received.back().what, static_cast<uint32>('slid'));
}


TEST_F(SliderTest, DragThatComesBackSendsNoMessageAtTheEnd)
{
	Show();
	fRobot->MoveTo(PlaceOf(0));
	fRobot->Press();
	fRobot->MoveTo(PlaceOf(0.2f));
	fRobot->MoveTo(PlaceOf(0));
	fRobot->Release();
	EXPECT_EQ(ValueOf(fSlider), 0);
	EXPECT_EQ(TakeCodes(), "smod smod ");
}


TEST_F(SliderTest, ThumbTakenBesideItsMiddleDoesNotJump)
{
	fSlider->SetValue(50);
	Show();
	const BPoint middle = PlaceOf(0.5f);
	fRobot->Click(middle + BPoint(4, 0));
	EXPECT_EQ(ValueOf(fSlider), 50);
	EXPECT_EQ(TakeCodes(), "");
	fRobot->Drag(middle + BPoint(4, 0), middle + BPoint(24, 0));
	EXPECT_EQ(ValueOf(fSlider), 60);
}


TEST_F(SliderTest, DragBeyondTheEndsStaysInTheLimits)
{
	Show();
	fRobot->Drag(PlaceOf(0.5f), BPoint(290, 100));
	EXPECT_EQ(ValueOf(fSlider), 100);
	fRobot->Drag(PlaceOf(1), BPoint(1, 5));
	EXPECT_EQ(ValueOf(fSlider), 0);
}


TEST_F(SliderTest, ArrowKeysChangeByTheIncrementAndSendOnRelease)
{
	fSlider->SetKeyIncrementValue(7);
	fSlider->SetValue(50);
	Show();
	Do([this] { fSlider->MakeFocus(); });
	const struct {
		const char* key;
		int32 value;
	} kRows[] = {{"right", 57}, {"up", 64}, {"left", 57}, {"down", 50}, {"end", 100}, {"home", 0}};
	for (const auto& row : kRows) {
		fRobot->Key(row.key);
		EXPECT_EQ(ValueOf(fSlider), row.value) << row.key;
		EXPECT_EQ(TakeCodes(), "smod slid ") << row.key;
	}
	// At the limit nothing changes, so nothing is told.
	fRobot->Key("left");
	EXPECT_EQ(ValueOf(fSlider), 0);
	EXPECT_EQ(TakeCodes(), "");
}


TEST_F(SliderTest, IncrementNearTheLimitStopsAtIt)
{
	fSlider->SetKeyIncrementValue(INT_MAX);
	fSlider->SetValue(99);
	Show();
	Do([this] { fSlider->MakeFocus(); });
	fRobot->Key("right");
	EXPECT_EQ(ValueOf(fSlider), 100);
	fRobot->Key("left");
	EXPECT_EQ(ValueOf(fSlider), 0);
}


TEST_F(SliderTest, DisabledSliderTakesNoInput)
{
	fSlider->SetEnabled(false);
	Show();
	fRobot->Click(PlaceOf(0.5f));
	EXPECT_EQ(ValueOf(fSlider), 0);
	EXPECT_EQ(TakeCodes(), "");
}


TEST_F(SliderTest, SliderDisabledDuringADragFinishesIt)
{
	Show();
	fRobot->MoveTo(PlaceOf(0.5f));
	fRobot->Press();
	Do([this] { fSlider->SetEnabled(false); });
	EXPECT_EQ(TakeCodes(), "smod slid ");
	fRobot->MoveTo(PlaceOf(0.8f));
	fRobot->Release();
	EXPECT_EQ(ValueOf(fSlider), 50);
	EXPECT_EQ(TakeCodes(), "");
}


TEST_F(SliderTest, SetValueSendsNothing)
{
	Show();
	Do([this] { fSlider->SetValue(30); });
	EXPECT_EQ(TakeCodes(), "");
}


TEST_F(SliderTest, SliderWithoutMessagesCanBeUsed)
{
	fSlider->SetMessage(nullptr);
	fSlider->SetModificationMessage(nullptr);
	Show();
	fRobot->Click(PlaceOf(0.5f));
	EXPECT_EQ(ValueOf(fSlider), 50);
	EXPECT_EQ(TakeCodes(), "");
}


TEST_F(SliderTest, VerticalSliderGrowsUpwards)
{
	BSlider* slider = Add(new BSlider(
		BRect(240, 10, 270, 180), "upright", nullptr, new BMessage('uprt'), 0, 10, B_VERTICAL));
	Show();
	const BRect bar = Ask([=] { return slider->ConvertToParent(slider->BarFrame()); });
	fRobot->Click(BPoint(bar.left + 2, bar.top));
	EXPECT_EQ(ValueOf(slider), 10);
	fRobot->Drag(
		BPoint(bar.left + 2, bar.top), BPoint(bar.left + 2, bar.bottom - bar.Height() / 5));
	EXPECT_EQ(ValueOf(slider), 2);
}


TEST_F(SliderTest, ValueForThePlaceOfAThumbIsItsValue)
{
	for (orientation posture : {B_HORIZONTAL, B_VERTICAL}) {
		for (thumb_style style : {B_BLOCK_THUMB, B_TRIANGLE_THUMB}) {
			BSlider slider(
				BRect(0, 0, 120, 120), "slider", "Label", nullptr, 0, 10, posture, style);
			slider.SetLimitLabels("low", "high");
			for (int32 value = 0; value <= 10; value++) {
				slider.SetValue(value);
				const BRect thumb = slider.ThumbFrame();
				// A triangle's tip is where the value is; it is in the middle of its other sides.
				const BPoint middle((thumb.left + thumb.right) / 2, (thumb.top + thumb.bottom) / 2);
				EXPECT_EQ(slider.ValueForPoint(middle), value) << posture << ' ' << style;
			}
		}
	}
}


TEST_F(SliderTest, PreferredHeightHasALineForTheLabelAndOneForTheLimits)
{
	font_height font;
	fSlider->GetFontHeight(&font);
	const float line = std::ceil(font.ascent) + std::ceil(font.descent) + 4;
	float height;
	fSlider->GetPreferredSize(nullptr, &height);
	EXPECT_EQ(height, 12 + 6);
	fSlider->SetBarThickness(10);
	fSlider->GetPreferredSize(nullptr, &height);
	EXPECT_EQ(height, 12 + 10);
	fSlider->SetLabel("Label");
	fSlider->GetPreferredSize(nullptr, &height);
	EXPECT_EQ(height, 12 + 10 + line);
	fSlider->SetLimitLabels("low", nullptr);
	fSlider->GetPreferredSize(nullptr, &height);
	EXPECT_EQ(height, 12 + 10 + 2 * line);
}


TEST_F(SliderTest, FrameIsKeptUntilItIsResized)
{
	Show();
	EXPECT_EQ(Ask([this] { return fSlider->Frame(); }), BRect(10, 10, 226, 40));
	Do([this] { fSlider->ResizeToPreferred(); });
	EXPECT_EQ(Ask([this] { return fSlider->Frame(); }), BRect(10, 10, 226, 28));
}


TEST_F(SliderTest, UpdateTextHasRoomInThePreferredWidth)
{
	TellingSlider slider("telling", "Label", nullptr, 0, 1000000, B_HORIZONTAL);
	slider.SetValue(3);
	EXPECT_STREQ(slider.UpdateText(), "3");
	EXPECT_GE(slider.MaxUpdateTextWidth(), slider.StringWidth("1000000"));
	// The measuring leaves value and text as they were.
	EXPECT_EQ(slider.Value(), 3);
	float width;
	slider.GetPreferredSize(&width, nullptr);
	EXPECT_GE(width, slider.StringWidth("1000000") + slider.StringWidth("Label"));
	BSlider silent("silent", nullptr, nullptr, 0, 10, B_HORIZONTAL);
	EXPECT_EQ(silent.UpdateText(), nullptr);
	EXPECT_EQ(silent.MaxUpdateTextWidth(), 0);
}


TEST_F(SliderTest, PropertiesAreKept)
{
	fSlider->SetHashMarks(B_HASH_MARKS_BOTH);
	fSlider->SetHashMarkCount(-3);
	EXPECT_EQ(fSlider->HashMarks(), B_HASH_MARKS_BOTH);
	EXPECT_EQ(fSlider->HashMarkCount(), 0);
	fSlider->SetBarThickness(-4);
	EXPECT_EQ(fSlider->BarThickness(), 1);
	fSlider->SetSnoozeAmount(2000000);
	EXPECT_EQ(fSlider->SnoozeAmount(), 1000000);
	fSlider->SetLimitLabels("", nullptr);
	EXPECT_EQ(fSlider->MinLimitLabel(), nullptr);
	EXPECT_EQ(fSlider->MaxLimitLabel(), nullptr);

	const rgb_color color = make_color(1, 2, 3);
	rgb_color found;
	fSlider->UseFillColor(true, &color);
	EXPECT_TRUE(fSlider->FillColor(&found));
	EXPECT_EQ(found, color);
	fSlider->UseFillColor(false);
	EXPECT_FALSE(fSlider->FillColor(&found));
	EXPECT_EQ(found, color);
}


TEST_F(SliderTest, ArchiveKeepsTheSlider)
{
	fSlider->SetLimits(-5, 5);
	fSlider->SetValue(3);
	fSlider->SetLabel("Label");
	fSlider->SetLimitLabels("low", "high");
	fSlider->SetHashMarks(B_HASH_MARKS_TOP);
	fSlider->SetHashMarkCount(5);
	fSlider->SetStyle(B_TRIANGLE_THUMB);
	fSlider->SetOrientation(B_VERTICAL);
	fSlider->SetBarColor(make_color(9, 8, 7));
	fSlider->UseFillColor(true);
	BMessage archive;
	ASSERT_EQ(fSlider->Archive(&archive), B_OK);
	std::unique_ptr<BArchivable> object(instantiate_object(&archive));
	const BSlider* slider = dynamic_cast<BSlider*>(object.get());
	ASSERT_NE(slider, nullptr);
	EXPECT_EQ(slider->Value(), 3);
	EXPECT_STREQ(slider->Label(), "Label");
	EXPECT_STREQ(slider->MinLimitLabel(), "low");
	EXPECT_STREQ(slider->MaxLimitLabel(), "high");
	EXPECT_EQ(slider->HashMarks(), B_HASH_MARKS_TOP);
	EXPECT_EQ(slider->HashMarkCount(), 5);
	EXPECT_EQ(slider->Style(), B_TRIANGLE_THUMB);
	EXPECT_EQ(slider->Orientation(), B_VERTICAL);
	EXPECT_EQ(slider->BarColor(), make_color(9, 8, 7));
	EXPECT_TRUE(slider->FillColor(nullptr));
	ASSERT_NE(slider->ModificationMessage(), nullptr);
	EXPECT_EQ(slider->ModificationMessage()->what, static_cast<uint32>('smod'));
	int32 minimum, maximum;
	slider->GetLimits(&minimum, &maximum);
	EXPECT_EQ(minimum, -5);
	EXPECT_EQ(maximum, 5);
}

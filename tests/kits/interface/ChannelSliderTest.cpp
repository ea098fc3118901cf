// SPDX-License-Identifier: MIT
// Tests of BChannelControl and BChannelSlider: channels, limits, messages, keyboard and mouse.
#include <ChannelSlider.h>

#include <climits>

#include "ControlsFixture.h"

namespace {

class ChannelSliderTest : public ControlsTest {
protected:
	void SetUp() override
	{
		ControlsTest::SetUp();
		// The bars go from 18 to 108; the channels are 30 wide.
		fSlider = Add(new BChannelSlider(BRect(10, 10, 99, 109), "slider", nullptr,
			new BMessage('slid'), B_VERTICAL, 3, B_FOLLOW_LEFT_TOP, B_WILL_DRAW | B_NAVIGABLE));
		fSlider->SetLimits(0, 83);
		fSlider->SetModificationMessage(new BMessage('smod'));
	}

	/// In the window, on the middle of the channel's bar.
	static BPoint PlaceOf(int32 channel, int32 value)
	{
		return BPoint(25 + 30 * channel, 101 - value);
	}

	std::string Values()
	{
		return Ask([this] { return ValuesOf(*fSlider); });
	}

	static std::string ValuesOf(const BChannelControl& control)
	{
		std::string values;
		for (int32 i = 0; i < control.CountChannels(); i++)
			values += std::to_string(control.ValueFor(i)) + " ";
		return values;
	}

	BChannelSlider* fSlider = nullptr;
};

} // namespace


TEST_F(ChannelSliderTest, NewControlHasItsChannels)
{
	BChannelSlider slider(BRect(0, 0, 9, 99), "slider", "Label", nullptr, 4);
	EXPECT_EQ(slider.CountChannels(), 4);
	EXPECT_EQ(slider.CurrentChannel(), 0);
	EXPECT_EQ(slider.Orientation(), B_VERTICAL);
	EXPECT_EQ(ValuesOf(slider), "0 0 0 0 ");
	int32 minimum, maximum;
	EXPECT_EQ(slider.GetLimitsFor(3, &minimum, &maximum), B_OK);
	EXPECT_EQ(minimum, 0);
	EXPECT_EQ(maximum, 10000);
	EXPECT_EQ(
		BChannelSlider(BRect(0, 0, 99, 9), "wide", nullptr, nullptr).Orientation(), B_HORIZONTAL);
	EXPECT_EQ(BChannelSlider("none", nullptr, nullptr, B_VERTICAL, -1).CountChannels(), 0);
	EXPECT_EQ(BChannelSlider("many", nullptr, nullptr, B_VERTICAL, 99).CountChannels(), 32);
}


TEST_F(ChannelSliderTest, ValuesAreBroughtIntoTheLimitsOfTheirChannel)
{
	EXPECT_EQ(fSlider->SetLimitsFor(1, -10, 10), B_OK);
	EXPECT_EQ(fSlider->SetAllValue(50), B_OK);
	EXPECT_EQ(ValuesOf(*fSlider), "50 10 50 ");
	EXPECT_EQ(fSlider->SetAllValue(INT_MIN), B_OK);
	EXPECT_EQ(ValuesOf(*fSlider), "0 -10 0 ");
	EXPECT_EQ(fSlider->SetValueFor(2, 7), B_OK);
	EXPECT_EQ(fSlider->SetLimits(20, 30), B_OK);
	EXPECT_EQ(ValuesOf(*fSlider), "20 20 20 ");
}


TEST_F(ChannelSliderTest, ValueIsThatOfTheCurrentChannel)
{
	EXPECT_EQ(fSlider->SetCurrentChannel(1), B_OK);
	fSlider->SetValue(40);
	EXPECT_EQ(fSlider->Value(), 40);
	EXPECT_EQ(ValuesOf(*fSlider), "0 40 0 ");
	EXPECT_EQ(fSlider->SetCurrentChannel(0), B_OK);
	EXPECT_EQ(fSlider->Value(), 0);
	EXPECT_EQ(fSlider->SetValueFor(0, 9), B_OK);
	EXPECT_EQ(fSlider->Value(), 9);
	EXPECT_EQ(fSlider->SetLimitsFor(0, 12, 12), B_OK);
	EXPECT_EQ(fSlider->Value(), 12);
}


TEST_F(ChannelSliderTest, ChannelsThatAreNotThereAreRefused)
{
	int32 number;
	for (int32 channel : {-1, 3, INT_MAX, INT_MIN}) {
		EXPECT_EQ(fSlider->SetCurrentChannel(channel), B_BAD_INDEX) << channel;
		EXPECT_EQ(fSlider->SetValueFor(channel, 1), B_BAD_INDEX) << channel;
		EXPECT_EQ(fSlider->ValueFor(channel), 0) << channel;
		EXPECT_EQ(fSlider->SetLimitsFor(channel, 0, 1), B_BAD_INDEX) << channel;
		EXPECT_EQ(fSlider->GetLimitsFor(channel, &number, &number), B_BAD_INDEX) << channel;
		EXPECT_EQ(fSlider->SetLimitLabelsFor(channel, "a", "b"), B_BAD_INDEX) << channel;
		EXPECT_EQ(fSlider->MinLimitLabelFor(channel), nullptr) << channel;
	}
	const int32 numbers[4] = {};
	EXPECT_EQ(fSlider->SetLimitsFor(1, 3, numbers, numbers), B_BAD_INDEX);
	EXPECT_EQ(fSlider->SetLimitsFor(1, INT_MAX, numbers, numbers), B_BAD_INDEX);
	EXPECT_EQ(fSlider->SetLimitsFor(1, -1, numbers, numbers), B_BAD_INDEX);
	EXPECT_EQ(fSlider->InvokeChannel(nullptr, 2, 2), B_BAD_INDEX);
	EXPECT_EQ(fSlider->InvokeChannel(nullptr, INT_MAX), B_BAD_INDEX);
	EXPECT_EQ(fSlider->InvokeChannel(nullptr, INT_MIN), B_BAD_INDEX);
}


TEST_F(ChannelSliderTest, LimitsUpsideDownChangeNothing)
{
	const int32 minima[] = {1, 5};
	const int32 maxima[] = {2, 4};
	EXPECT_EQ(fSlider->SetLimitsFor(0, 2, minima, maxima), B_BAD_VALUE);
	EXPECT_EQ(fSlider->SetLimitsFor(0, 2, minima, nullptr), B_BAD_VALUE);
	int32 minimum, maximum;
	EXPECT_EQ(fSlider->GetLimits(&minimum, &maximum), B_OK);
	EXPECT_EQ(minimum, 0);
	EXPECT_EQ(maximum, 83);
}


TEST_F(ChannelSliderTest, ValuesAreCopiedAsFarAsThereAreChannels)
{
	fSlider->SetValueFor(1, 5);
	fSlider->SetValueFor(2, 6);
	int32 values[4] = {-1, -1, -1, -1};
	EXPECT_EQ(fSlider->GetValue(values, 1, 4), 2);
	EXPECT_EQ(values[0], 5);
	EXPECT_EQ(values[1], 6);
	EXPECT_EQ(values[2], -1);
	EXPECT_EQ(fSlider->GetValue(values, 5, 1), 0);
	EXPECT_EQ(fSlider->GetValue(values, -1, 1), 0);
	EXPECT_EQ(fSlider->GetValue(nullptr, 0, 1), 0);
}


TEST_F(ChannelSliderTest, ChannelCountKeepsWhatStays)
{
	fSlider->SetValueFor(0, 5);
	fSlider->SetCurrentChannel(2);
	EXPECT_EQ(fSlider->SetChannelCount(2), B_OK);
	EXPECT_EQ(ValuesOf(*fSlider), "5 0 ");
	EXPECT_EQ(fSlider->CurrentChannel(), 1);
	EXPECT_EQ(fSlider->SetChannelCount(33), B_BAD_VALUE);
	EXPECT_EQ(fSlider->SetChannelCount(-1), B_BAD_VALUE);
	EXPECT_EQ(fSlider->SetChannelCount(0), B_OK);
	EXPECT_EQ(fSlider->Value(), 0);
	fSlider->SetValue(3);
	EXPECT_EQ(fSlider->SetChannelCount(1), B_OK);
	EXPECT_EQ(ValuesOf(*fSlider), "0 ");
}


TEST_F(ChannelSliderTest, LabelsAreOfTheControlAndOfItsChannels)
{
	EXPECT_EQ(fSlider->MinLimitLabel(), nullptr);
	EXPECT_EQ(fSlider->SetLimitLabels("low", "high"), B_OK);
	EXPECT_EQ(fSlider->SetLimitLabelsFor(1, 2, "l", "h"), B_OK);
	EXPECT_STREQ(fSlider->MinLimitLabel(), "low");
	EXPECT_STREQ(fSlider->MaxLimitLabel(), "high");
	EXPECT_EQ(fSlider->MaxLimitLabelFor(0), nullptr);
	EXPECT_STREQ(fSlider->MaxLimitLabelFor(2), "h");
}


TEST_F(ChannelSliderTest, ArchiveBringsAllBack)
{
	fSlider->SetLimitsFor(1, -5, 5);
	fSlider->SetAllValue(3);
	fSlider->SetCurrentChannel(2);
	fSlider->SetLimitLabels("low", nullptr);
	fSlider->SetLimitLabelsFor(1, nullptr, "h");
	BMessage archive;
	ASSERT_EQ(fSlider->Archive(&archive), B_OK);
	std::unique_ptr<BArchivable> object(BChannelSlider::Instantiate(&archive));
	auto copy = dynamic_cast<BChannelSlider*>(object.get());
	ASSERT_NE(copy, nullptr);
	EXPECT_EQ(ValuesOf(*copy), "3 3 3 ");
	EXPECT_EQ(copy->CurrentChannel(), 2);
	EXPECT_EQ(copy->Value(), 3);
	EXPECT_EQ(copy->Orientation(), B_VERTICAL);
	EXPECT_STREQ(copy->MinLimitLabel(), "low");
	EXPECT_STREQ(copy->MaxLimitLabelFor(1), "h");
	EXPECT_EQ(copy->MaxLimitLabelFor(2), nullptr);
	ASSERT_NE(copy->ModificationMessage(), nullptr);
	int32 minimum, maximum;
	copy->GetLimitsFor(1, &minimum, &maximum);
	EXPECT_EQ(minimum, -5);
	EXPECT_EQ(maximum, 5);
}


TEST_F(ChannelSliderTest, DamagedArchiveGivesSoundChannels)
{
	BMessage archive;
	archive.AddString("class", "BChannelSlider");
	archive.AddInt32("be:_m_channel_count", INT_MAX);
	archive.AddInt32("be:_m_channel_min", 9);
	archive.AddInt32("be:_m_channel_max", -9);
	archive.AddInt32("be:_m_value_channel", 99);
	BChannelSlider slider(&archive);
	EXPECT_EQ(slider.CountChannels(), 32);
	EXPECT_LT(slider.CurrentChannel(), 32);
	int32 minimum, maximum;
	EXPECT_EQ(slider.GetLimitsFor(0, &minimum, &maximum), B_OK);
	EXPECT_LE(minimum, maximum);
}


TEST_F(ChannelSliderTest, InvokeTellsTheChannels)
{
	Show();
	const bool mask[] = {false, true};
	Do([&] {
		fSlider->SetValueFor(1, 11);
		fSlider->SetValueFor(2, 22);
		EXPECT_EQ(fSlider->SetCurrentChannel(2), B_OK);
		EXPECT_EQ(fSlider->InvokeChannel(nullptr, 1, 2, mask), B_OK);
		EXPECT_EQ(fSlider->Invoke(), B_OK);
	});
	const std::vector<BMessage> received = Take();
	ASSERT_EQ(received.size(), 2u);
	EXPECT_EQ(received[0].GetInt32("be:current_channel", -1), 2);
	EXPECT_EQ(received[0].GetInt32("be:value", -1), 22);
	EXPECT_EQ(received[0].GetInt32("be:channel_value", 0, -1), 11);
	EXPECT_EQ(received[0].GetInt32("be:channel_value", 1, -1), 22);
	EXPECT_FALSE(received[0].GetBool("be:channel_changed", 0, true));
	EXPECT_TRUE(received[0].GetBool("be:channel_changed", 1, false));
	EXPECT_EQ(received[1].GetInt32("be:current_channel", -1), 2);
	EXPECT_FALSE(received[1].HasInt32("be:channel_value"));
	BChannelSlider silent("silent", nullptr, nullptr, B_VERTICAL);
	EXPECT_EQ(silent.Invoke(), B_BAD_VALUE);
	EXPECT_EQ(silent.InvokeChannel(), B_BAD_VALUE);
}


TEST_F(ChannelSliderTest, DraggingMovesOneChannel)
{
	Show();
	fRobot->Drag(PlaceOf(1, 0), PlaceOf(1, 40), 4);
	EXPECT_EQ(Values(), "0 40 0 ");
	EXPECT_EQ(Ask([this] { return fSlider->CurrentChannel(); }), 1);
	const std::vector<BMessage> received = Take();
	ASSERT_GE(received.size(), 2u);
	EXPECT_EQ(received.front().what, static_cast<uint32>('smod'));
	EXPECT_EQ(received.back().what, static_cast<uint32>('slid'));
	EXPECT_EQ(received.back().GetInt32("be:channel_value", 1, -1), 40);
	EXPECT_FALSE(received.back().GetBool("be:channel_changed", 0, true));
	EXPECT_TRUE(received.back().GetBool("be:channel_changed", 1, false));
}


TEST_F(ChannelSliderTest, PressBesideTheThumbBringsItThere)
{
	Show();
	fRobot->Click(PlaceOf(2, 60));
	EXPECT_EQ(Values(), "0 0 60 ");
	EXPECT_EQ(TakeCodes(), "smod slid ");
	// Taken hold of a little off its middle, it stays under the pointer.
	fRobot->Click(PlaceOf(2, 62));
	EXPECT_EQ(Values(), "0 0 60 ");
	EXPECT_EQ(TakeCodes(), "");
}


TEST_F(ChannelSliderTest, ShiftOrTheOtherButtonMovesAll)
{
	Show();
	Do([this] { fSlider->SetValueFor(2, 70); });
	fRobot->Hold(B_SHIFT_KEY);
	fRobot->Drag(PlaceOf(0, 0), PlaceOf(0, 20), 4);
	fRobot->Hold(0);
	EXPECT_EQ(Values(), "20 20 83 ");
	fRobot->MoveTo(PlaceOf(0, 20));
	fRobot->Press(2);
	fRobot->MoveTo(PlaceOf(0, 10));
	fRobot->Release();
	EXPECT_EQ(Values(), "10 10 73 ");
}


TEST_F(ChannelSliderTest, KeysMoveTheCurrentChannel)
{
	Show();
	Do([this] { fSlider->MakeFocus(); });
	fRobot->Key("up");
	EXPECT_EQ(Values(), "1 0 0 ");
	EXPECT_EQ(TakeCodes(), "smod slid ");
	fRobot->Key("right");
	EXPECT_EQ(TakeCodes(), "");
	fRobot->Key("end");
	fRobot->Key("down");
	EXPECT_EQ(Values(), "1 82 0 ");
	fRobot->Key("home");
	fRobot->Key("left");
	fRobot->Key("left");
	EXPECT_EQ(Ask([this] { return fSlider->CurrentChannel(); }), 0);
	EXPECT_EQ(Values(), "1 0 0 ");
}


TEST_F(ChannelSliderTest, HorizontalSliderTakesTheArrowsTheOtherWay)
{
	Show();
	Do([this] {
		fSlider->SetOrientation(B_HORIZONTAL);
		fSlider->MakeFocus();
	});
	fRobot->Key("right");
	EXPECT_EQ(Values(), "1 0 0 ");
	fRobot->Key("down");
	EXPECT_EQ(Ask([this] { return fSlider->CurrentChannel(); }), 1);
	fRobot->Key("end");
	fRobot->Key("left");
	EXPECT_EQ(Values(), "1 82 0 ");
}


TEST_F(ChannelSliderTest, DisabledSliderStandsStill)
{
	fSlider->SetEnabled(false);
	Show();
	fRobot->Drag(PlaceOf(1, 0), PlaceOf(1, 40), 2);
	EXPECT_EQ(Values(), "0 0 0 ");
	EXPECT_EQ(TakeCodes(), "");
}


TEST_F(ChannelSliderTest, ChannelsMayGoWhileOneIsDragged)
{
	Show();
	fRobot->MoveTo(PlaceOf(2, 0));
	fRobot->Press();
	fRobot->MoveTo(PlaceOf(2, 10));
	Do([this] { fSlider->SetChannelCount(0); });
	fRobot->MoveTo(PlaceOf(2, 20));
	fRobot->Release();
	EXPECT_EQ(Values(), "");
	fRobot->Click(PlaceOf(0, 20));
	Do([this] {
		fSlider->MakeFocus();
		fSlider->SetChannelCount(1);
	});
	fRobot->Key("end");
	EXPECT_EQ(Values(), "10000 ");
}


TEST_F(ChannelSliderTest, DerivedClassMayHaveMoreChannels)
{
	class Wide : public BChannelSlider {
	public:
		using BChannelSlider::BChannelSlider;
		int32 MaxChannelCount() const override { return 100; }
	};
	Wide* wide = Add(new Wide(BRect(10, 120, 289, 189), "wide", nullptr, new BMessage('wide'),
		B_VERTICAL, 1, B_FOLLOW_LEFT_TOP, B_WILL_DRAW | B_NAVIGABLE));
	ASSERT_EQ(wide->SetChannelCount(100), B_OK);
	wide->SetModificationMessage(new BMessage('wmod'));
	Show();
	Do([&] {
		wide->SetCurrentChannel(99);
		wide->MakeFocus();
	});
	fRobot->Key("end");
	const std::vector<BMessage> received = Take();
	ASSERT_EQ(received.size(), 2u);
	EXPECT_FALSE(received[1].GetBool("be:channel_changed", 98, true));
	EXPECT_TRUE(received[1].GetBool("be:channel_changed", 99, false));
}


TEST_F(ChannelSliderTest, PreferredSizeHoldsChannelsAndLabels)
{
	Show();
	Do([this] {
		float width, height;
		fSlider->GetPreferredSize(&width, &height);
		fSlider->SetChannelCount(6);
		fSlider->SetLimitLabels("low", "high");
		float wider, higher;
		fSlider->GetPreferredSize(&wider, &higher);
		EXPECT_GT(wider, width);
		EXPECT_GT(higher, height);
		for (int32 i = 0; i < 6; i++)
			fSlider->SetLimitLabelsFor(i, "a long label", nullptr);
		float widest;
		fSlider->GetPreferredSize(&widest, nullptr);
		EXPECT_GE(widest, 6 * fSlider->StringWidth("a long label"));
	});
}

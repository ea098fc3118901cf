// SPDX-License-Identifier: MIT
// Tests of BColorControl: the packed value, ramps and keys, the number fields, layouts.
#include <ColorControl.h>

#include <TextControl.h>

#include "ControlsFixture.h"

namespace {

class ColorControlTest : public ControlsTest {
protected:
	void SetUp() override
	{
		ControlsTest::SetUp();
		// The ramps are 16 rows of pixels each, from (12, 12) on, and 256 columns wide.
		fControl =
			Add(new BColorControl(BPoint(10, 10), B_CELLS_32x8, 8, "colors", new BMessage('clrC')));
		fWindow->ResizeTo(420, 300);
	}

	/// A place on a ramp: 0 grey, 1 red, 2 green, 3 blue.
	static BPoint On(int32 ramp, int32 level) { return BPoint(12 + level, 20 + 16 * ramp); }

	rgb_color Color()
	{
		return Ask([this] { return fControl->ValueAsColor(); });
	}

	BTextControl* Number(const char* name)
	{
		return dynamic_cast<BTextControl*>(fControl->FindView(name));
	}

	std::string Numbers()
	{
		return Ask([this] {
			return std::string(Number("_red")->Text()) + ' ' + Number("_green")->Text() + ' '
				+ Number("_blue")->Text();
		});
	}

	BColorControl* fControl = nullptr;
};

} // namespace


TEST_F(ColorControlTest, ValueHoldsRedGreenAndBlueFromTheHighestByteDown)
{
	EXPECT_EQ(fControl->Value(), 0);
	EXPECT_EQ(fControl->ValueAsColor(), make_color(0, 0, 0));
	fControl->SetValue(make_color(0x12, 0x34, 0x56, 0x78));
	EXPECT_EQ(fControl->Value(), 0x12345600);
	EXPECT_EQ(fControl->ValueAsColor(), make_color(0x12, 0x34, 0x56, 255));
	fControl->SetValue(static_cast<int32>(0xfffefd00u));
	EXPECT_EQ(fControl->ValueAsColor(), make_color(0xff, 0xfe, 0xfd));
	EXPECT_EQ(static_cast<uint32>(fControl->Value()), 0xfffefd00u);
}


TEST_F(ColorControlTest, NumbersShowTheValue)
{
	EXPECT_STREQ(Number("_red")->Label(), "Red:");
	EXPECT_STREQ(Number("_green")->Label(), "Green:");
	EXPECT_STREQ(Number("_blue")->Label(), "Blue:");
	Show();
	EXPECT_EQ(Numbers(), "0 0 0");
	Do([this] { fControl->SetValue(make_color(1, 20, 255)); });
	EXPECT_EQ(Numbers(), "1 20 255");
	EXPECT_EQ(TakeCodes(), "");
}


TEST_F(ColorControlTest, ClickOnARampSetsItsPart)
{
	Show();
	fRobot->Click(On(1, 200));
	EXPECT_EQ(Color(), make_color(200, 0, 0));
	fRobot->Click(On(2, 100));
	fRobot->Click(On(3, 255));
	EXPECT_EQ(Color(), make_color(200, 100, 255));
	EXPECT_EQ(Numbers(), "200 100 255");
	const std::vector<BMessage> received = Take();
	ASSERT_EQ(received.size(), 3u);
	EXPECT_EQ(received[2].GetInt32("be:value", 0), static_cast<int32>(0xc864ff00u));
	fRobot->Click(On(0, 90));
	EXPECT_EQ(Color(), make_color(90, 90, 90));
}


TEST_F(ColorControlTest, DragKeepsToItsRampAndSendsEachChange)
{
	Show();
	fRobot->Drag(On(1, 10), On(3, 60), 5);
	EXPECT_EQ(Color(), make_color(60, 0, 0));
	EXPECT_GE(Take().size(), 2u);
	fRobot->Drag(On(2, 10), BPoint(400, 150));
	EXPECT_EQ(Color(), make_color(60, 255, 0));
	fRobot->Drag(On(2, 10), BPoint(0, 150));
	EXPECT_EQ(Color(), make_color(60, 0, 0));
}


TEST_F(ColorControlTest, ClickThatChangesNothingSendsNothing)
{
	fControl->SetValue(make_color(50, 0, 0));
	Show();
	fRobot->Click(On(1, 50));
	EXPECT_EQ(TakeCodes(), "");
}


TEST_F(ColorControlTest, EditedNumberChangesTheColor)
{
	Show();
	Do([this] { Number("_green")->MakeFocus(); });
	fRobot->Type("77");
	fRobot->Key("enter");
	EXPECT_EQ(Color(), make_color(0, 77, 0));
	const std::vector<BMessage> received = Take();
	ASSERT_EQ(received.size(), 1u);
	EXPECT_EQ(received[0].what, static_cast<uint32>('clrC'));
	EXPECT_EQ(received[0].GetInt32("be:value", 0), 77 << 16);

	// So does leaving the field.
	Do([this] { Number("_blue")->MakeFocus(); });
	fRobot->Type("8");
	fRobot->Key("tab");
	EXPECT_EQ(Color(), make_color(0, 77, 8));
}


TEST_F(ColorControlTest, NumbersTakeDigitsUpTo255Only)
{
	Show();
	Do([this] { Number("_red")->MakeFocus(); });
	fRobot->Type("9x9-9");
	fRobot->Key("enter");
	EXPECT_EQ(Color(), make_color(255, 0, 0));
	EXPECT_EQ(Numbers(), "255 0 0");
	fRobot->Type("007");
	fRobot->Key("enter");
	EXPECT_EQ(Numbers(), "7 0 0");
	fRobot->Type("1234");
	fRobot->Key("enter");
	EXPECT_EQ(Numbers(), "123 0 0");
	// Without any digit it is none.
	fRobot->Key("backspace");
	fRobot->Key("enter");
	EXPECT_EQ(Numbers(), "0 0 0");
}


TEST_F(ColorControlTest, KeysWalkTheRampsAndChangeTheLevel)
{
	Show();
	Do([this] { fControl->MakeFocus(); });
	fRobot->Key("right");
	EXPECT_EQ(Color(), make_color(1, 1, 1));
	fRobot->Key("down");
	fRobot->Key("right");
	EXPECT_EQ(Color(), make_color(2, 1, 1));
	fRobot->Key("end");
	EXPECT_EQ(Color(), make_color(255, 1, 1));
	fRobot->Key("right");
	EXPECT_EQ(Color(), make_color(255, 1, 1));
	fRobot->Key("down");
	fRobot->Key("down");
	fRobot->Key("down");
	fRobot->Key("page-up");
	EXPECT_EQ(Color(), make_color(255, 1, 17));
	fRobot->Key("home");
	EXPECT_EQ(Color(), make_color(255, 1, 0));
	EXPECT_EQ(Take().size(), 5u);
}


TEST_F(ColorControlTest, TabGoesFromTheRampsToTheNumbers)
{
	Show();
	Do([this] { fControl->MakeFocus(); });
	for (const char* name : {"_red", "_green", "_blue"}) {
		fRobot->Key("tab");
		EXPECT_TRUE(Ask([&] { return Number(name)->TextView()->IsFocus(); })) << name;
	}
}


TEST_F(ColorControlTest, DisabledControlTakesNoInput)
{
	fControl->SetEnabled(false);
	Show();
	fRobot->Click(On(1, 200));
	EXPECT_EQ(Color(), make_color(0, 0, 0));
	EXPECT_FALSE(Number("_red")->IsEnabled());
	EXPECT_EQ(TakeCodes(), "");
	Do([this] { fControl->SetEnabled(true); });
	EXPECT_TRUE(Number("_red")->IsEnabled());
}


TEST_F(ColorControlTest, SizeFollowsFromLayoutAndCells)
{
	const struct {
		color_control_layout layout;
		float columns;
		float rows;
	} kRows[] = {{B_CELLS_4x64, 4, 64}, {B_CELLS_8x32, 8, 32}, {B_CELLS_16x16, 16, 16},
		{B_CELLS_32x8, 32, 8}, {B_CELLS_64x4, 64, 4}};
	for (const auto& row : kRows) {
		BColorControl control(BPoint(7, 9), row.layout, 10, "control");
		const BTextControl* red = dynamic_cast<BTextControl*>(control.FindView("_red"));
		ASSERT_NE(red, nullptr);
		EXPECT_EQ(control.Frame().LeftTop(), BPoint(7, 9));
		EXPECT_EQ(red->Frame().left, row.columns * 10 + 4 + 6) << row.layout;
		EXPECT_EQ(control.Bounds().right, red->Frame().right) << row.layout;
		EXPECT_GE(control.Bounds().bottom, row.rows * 10 + 3) << row.layout;
		EXPECT_EQ(control.Layout(), row.layout);
	}
}


TEST_F(ColorControlTest, CellsAreAtLeastSixPixels)
{
	BColorControl control(BPoint(0, 0), B_CELLS_16x16, 2, "control");
	EXPECT_EQ(control.CellSize(), 6);
	const BRect before = control.Frame();
	control.SetCellSize(20);
	EXPECT_EQ(control.CellSize(), 20);
	EXPECT_EQ(control.Frame().Width(), before.Width() + 16 * 14);
	control.SetLayout(B_CELLS_8x32);
	EXPECT_EQ(control.Frame().Width(), before.Width() + 16 * 14 - 8 * 20);
}


TEST_F(ColorControlTest, UprightRampsGrowUpwards)
{
	fWindow->ResizeTo(500, 300);
	BColorControl* control =
		Add(new BColorControl(BPoint(400, 10), B_CELLS_8x32, 8, "upright", new BMessage('uprt')));
	Show();
	// Four columns of 16 pixels from (402, 12) on, 256 rows.
	fRobot->Click(BPoint(426, 12));
	EXPECT_EQ(Ask([&] { return control->ValueAsColor(); }), make_color(255, 0, 0));
	Do([&] { control->MakeFocus(); });
	fRobot->Key("right");
	fRobot->Key("up");
	EXPECT_EQ(Ask([&] { return control->ValueAsColor(); }), make_color(255, 1, 0));
}


TEST_F(ColorControlTest, ArchiveKeepsTheControl)
{
	fControl->SetValue(make_color(1, 2, 3));
	fControl->SetEnabled(false);
	BMessage archive;
	ASSERT_EQ(fControl->Archive(&archive), B_OK);
	std::unique_ptr<BArchivable> object(instantiate_object(&archive));
	BColorControl* control = dynamic_cast<BColorControl*>(object.get());
	ASSERT_NE(control, nullptr);
	EXPECT_EQ(control->ValueAsColor(), make_color(1, 2, 3));
	EXPECT_EQ(control->Layout(), B_CELLS_32x8);
	EXPECT_EQ(control->CellSize(), 8);
	EXPECT_EQ(control->Frame(), fControl->Frame());
	EXPECT_EQ(control->CountChildren(), 3);
	EXPECT_FALSE(control->IsEnabled());
}

// SPDX-License-Identifier: MIT
// Tests of BCheckBox and BRadioButton: values, keyboard and mouse, groups.
#include <CheckBox.h>

#include <Box.h>
#include <RadioButton.h>

#include "ControlsFixture.h"

namespace {

class CheckBoxTest : public ControlsTest {
protected:
	void SetUp() override
	{
		ControlsTest::SetUp();
		fBox = Add(new BCheckBox(BRect(10, 10, 99, 28), "box", "Box", new BMessage('tick')));
	}

	BCheckBox* fBox = nullptr;
};


class RadioButtonTest : public ControlsTest {
protected:
	void SetUp() override
	{
		ControlsTest::SetUp();
		fOne = Add(new BRadioButton(BRect(10, 10, 99, 28), "one", "One", new BMessage('rone')));
		fTwo = Add(new BRadioButton(BRect(10, 30, 99, 48), "two", "Two", new BMessage('rtwo')));
		BBox* group = Add(new BBox(BRect(110, 10, 289, 99), "group"));
		fElsewhere = new BRadioButton(BRect(10, 20, 99, 38), "else", "Elsewhere", nullptr);
		group->AddChild(fElsewhere);
	}

	BRadioButton* fOne = nullptr;
	BRadioButton* fTwo = nullptr;
	BRadioButton* fElsewhere = nullptr;
};

} // namespace


TEST_F(CheckBoxTest, ClickTogglesAndSendsTheNewValue)
{
	Show();
	fRobot->Click(BPoint(60, 20));
	EXPECT_EQ(ValueOf(fBox), 1);
	fRobot->Click(BPoint(15, 20));
	EXPECT_EQ(ValueOf(fBox), 0);
	const std::vector<BMessage> received = Take();
	ASSERT_EQ(received.size(), 2u);
	EXPECT_EQ(received[0].GetInt32("be:value", -1), 1);
	EXPECT_EQ(received[1].GetInt32("be:value", -1), 0);
}


TEST_F(CheckBoxTest, ReleaseOutsideLeavesTheValue)
{
	Show();
	fRobot->Drag(BPoint(60, 20), BPoint(60, 100));
	EXPECT_EQ(ValueOf(fBox), 0);
	EXPECT_EQ(TakeCodes(), "");
}


TEST_F(CheckBoxTest, SpaceAndEnterToggle)
{
	Show();
	Do([this] { fBox->MakeFocus(); });
	fRobot->Key("space");
	EXPECT_EQ(ValueOf(fBox), 1);
	fRobot->Key("enter");
	EXPECT_EQ(ValueOf(fBox), 0);
	EXPECT_EQ(TakeCodes(), "tick tick ");
}


TEST_F(CheckBoxTest, DisabledBoxKeepsItsValue)
{
	fBox->SetEnabled(false);
	Show();
	fRobot->Click(BPoint(60, 20));
	EXPECT_EQ(ValueOf(fBox), 0);
	EXPECT_EQ(TakeCodes(), "");
}


TEST_F(CheckBoxTest, SetValueSendsNothing)
{
	Show();
	Do([this] { fBox->SetValue(1); });
	EXPECT_EQ(TakeCodes(), "");
}


TEST_F(CheckBoxTest, SetValueTakesOffOnAndPartly)
{
	const struct {
		int32 given;
		int32 kept;
	} kRows[] = {{0, 0}, {1, 1}, {2, 2}, {3, 1}, {-1, 1}};
	for (const auto& row : kRows) {
		fBox->SetValue(row.given);
		EXPECT_EQ(fBox->Value(), row.kept) << row.given;
	}
}


TEST_F(CheckBoxTest, PreferredWidthHoldsTheLabel)
{
	float width, height;
	fBox->GetPreferredSize(&width, &height);
	EXPECT_GT(width, fBox->StringWidth("Box") + 12);
	EXPECT_GE(height, 12);
	fBox->SetLabel(nullptr);
	float bare;
	fBox->GetPreferredSize(&bare, nullptr);
	EXPECT_LT(bare, width);
}


TEST_F(RadioButtonTest, ClickTurnsTheOthersOfTheParentOff)
{
	fTwo->SetValue(1);
	fElsewhere->SetValue(1);
	Show();
	fRobot->Click(BPoint(40, 20));
	EXPECT_EQ(ValueOf(fOne), 1);
	EXPECT_EQ(ValueOf(fTwo), 0);
	EXPECT_EQ(ValueOf(fElsewhere), 1);
	EXPECT_EQ(TakeCodes(), "rone ");
}


TEST_F(RadioButtonTest, ClickOnOneThatIsOnSendsAgain)
{
	fOne->SetValue(1);
	Show();
	fRobot->Click(BPoint(40, 20));
	EXPECT_EQ(ValueOf(fOne), 1);
	EXPECT_EQ(TakeCodes(), "rone ");
}


TEST_F(RadioButtonTest, SpaceAndEnterChoose)
{
	Show();
	Do([this] { fTwo->MakeFocus(); });
	fRobot->Key("space");
	EXPECT_EQ(ValueOf(fTwo), 1);
	Do([this] { fOne->MakeFocus(); });
	fRobot->Key("enter");
	EXPECT_EQ(ValueOf(fOne), 1);
	EXPECT_EQ(ValueOf(fTwo), 0);
	EXPECT_EQ(TakeCodes(), "rtwo rone ");
}


TEST_F(RadioButtonTest, TurningOneOffTouchesNoOther)
{
	fOne->SetValue(1);
	fTwo->SetValue(0);
	EXPECT_EQ(fOne->Value(), 1);
	fOne->SetValue(0);
	EXPECT_EQ(fOne->Value(), 0);
	EXPECT_EQ(fTwo->Value(), 0);
}


TEST_F(RadioButtonTest, ButtonsDirectlyInAWindowAreAGroup)
{
	BRadioButton* a = new BRadioButton("a", nullptr);
	BRadioButton* b = new BRadioButton("b", nullptr);
	fWindow->AddChild(a);
	fWindow->AddChild(b);
	a->SetValue(1);
	b->SetValue(1);
	EXPECT_EQ(a->Value(), 0);
	EXPECT_EQ(b->Value(), 1);
}


TEST_F(RadioButtonTest, GroupWorksBeforeItIsAttached)
{
	BView parent(BRect(0, 0, 99, 99), "parent", B_FOLLOW_NONE, 0);
	BRadioButton* a = new BRadioButton("a", nullptr);
	BRadioButton* b = new BRadioButton("b", nullptr);
	parent.AddChild(a);
	parent.AddChild(b);
	b->SetValue(1);
	a->SetValue(1);
	EXPECT_EQ(a->Value(), 1);
	EXPECT_EQ(b->Value(), 0);
}


TEST_F(RadioButtonTest, DisabledButtonIsNotChosen)
{
	fOne->SetEnabled(false);
	Show();
	fRobot->Click(BPoint(40, 20));
	EXPECT_EQ(ValueOf(fOne), 0);
	EXPECT_EQ(TakeCodes(), "");
}

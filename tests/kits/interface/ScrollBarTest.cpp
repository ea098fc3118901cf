// SPDX-License-Identifier: MIT
// Tests of BScrollBar: values and ranges, its target, the parts that the mouse works, the wheel.
#include <ScrollBar.h>

#include <cmath>
#include <limits>

#include <OS.h>

#include "ControlsFixture.h"

namespace {

// Keeps the values that it is told.
class TellingBar : public BScrollBar {
public:
	TellingBar(BRect frame, BView* target, float min, float max, orientation direction)
		: BScrollBar(frame, "bar", target, min, max, direction)
	{
	}

	void ValueChanged(float value) override
	{
		told.push_back(value);
		BScrollBar::ValueChanged(value);
	}

	std::vector<float> told;
};


// A vertical bar at x 200, 150 pixels high: arrows of 15, a track from 15 to 134.
class ScrollBarTest : public ControlsTest {
protected:
	void SetUp() override
	{
		ControlsTest::SetUp();
		fTarget = Add(new BView(BRect(10, 10, 189, 159), "target", B_FOLLOW_NONE, B_WILL_DRAW));
		fBar = Add(new TellingBar(BRect(200, 10, 214, 159), fTarget, 0, 1000, B_VERTICAL));
		fBar->SetSteps(5, 100);
	}

	float Value()
	{
		return Ask([this] { return fBar->Value(); });
	}

	/// In the middle of the bar, \a along pixels from its top.
	BPoint At(float along) const { return BPoint(207, 10 + along); }

	BView* fTarget = nullptr;
	TellingBar* fBar = nullptr;
};

} // namespace


TEST_F(ScrollBarTest, NewBarHasTheDocumentedState)
{
	BScrollBar bar(BRect(0, 0, 14, 99), "bar", NULL, -5, 50, B_VERTICAL);
	float min, max, small, large;
	bar.GetRange(&min, &max);
	bar.GetSteps(&small, &large);
	EXPECT_EQ(min, -5);
	EXPECT_EQ(max, 50);
	EXPECT_EQ(small, 1);
	EXPECT_EQ(large, 10);
	EXPECT_EQ(bar.Value(), 0);
	EXPECT_EQ(bar.Proportion(), 0);
	EXPECT_EQ(bar.Orientation(), B_VERTICAL);
	EXPECT_EQ(bar.Target(), nullptr);
	EXPECT_EQ(B_V_SCROLL_BAR_WIDTH, 14);
	EXPECT_EQ(B_H_SCROLL_BAR_HEIGHT, 14);
}


TEST_F(ScrollBarTest, ValueIsRoundedAndKeptInTheRange)
{
	fBar->SetValue(12.4f);
	EXPECT_EQ(fBar->Value(), 12);
	fBar->SetValue(12.6f);
	EXPECT_EQ(fBar->Value(), 13);
	fBar->SetValue(5000);
	EXPECT_EQ(fBar->Value(), 1000);
	fBar->SetValue(-3);
	EXPECT_EQ(fBar->Value(), 0);
	fBar->SetValue(std::numeric_limits<float>::quiet_NaN());
	EXPECT_EQ(fBar->Value(), 0);
}


TEST_F(ScrollBarTest, ValueChangedIsCalledForAnotherValueOnly)
{
	fBar->SetValue(10);
	fBar->SetValue(10);
	fBar->SetValue(20);
	EXPECT_EQ(fBar->told, (std::vector<float>{10, 20}));
}


TEST_F(ScrollBarTest, RangeThatShrinksTakesTheValueAndTheTargetAlong)
{
	fBar->SetValue(900);
	fBar->SetRange(0, 300);
	EXPECT_EQ(fBar->Value(), 300);
	EXPECT_EQ(fTarget->LeftTop(), BPoint(0, 300));
	fBar->SetRange(10, 5);
	float min, max;
	fBar->GetRange(&min, &max);
	EXPECT_EQ(min, 10);
	EXPECT_EQ(max, 10);
	EXPECT_EQ(fBar->Value(), 10);
}


TEST_F(ScrollBarTest, BarAndTargetScrollEachOther)
{
	fBar->SetValue(40);
	EXPECT_EQ(fTarget->Bounds().top, 40);
	fTarget->ScrollTo(0, 70);
	EXPECT_EQ(fBar->Value(), 70);
	fTarget->ScrollTo(0, 7000);
	EXPECT_EQ(fTarget->Bounds().top, 1000);
	EXPECT_EQ(fTarget->ScrollBar(B_VERTICAL), fBar);
	EXPECT_EQ(fTarget->ScrollBar(B_HORIZONTAL), nullptr);
}


TEST_F(ScrollBarTest, TargetHasOneBarInADirection)
{
	BScrollBar* other =
		Add(new BScrollBar(BRect(220, 10, 234, 159), "other", fTarget, 0, 50, B_VERTICAL));
	EXPECT_EQ(fTarget->ScrollBar(B_VERTICAL), other);
	EXPECT_EQ(fBar->Target(), nullptr);
	fBar->SetValue(30);
	EXPECT_EQ(fTarget->Bounds().top, 0);
}


TEST_F(ScrollBarTest, TargetMayGoBeforeItsBarAndAfterIt)
{
	fTarget->RemoveSelf();
	delete fTarget;
	EXPECT_EQ(fBar->Target(), nullptr);
	fBar->SetValue(30);
	EXPECT_EQ(fBar->Value(), 30);

	BView* target = Add(new BView(BRect(0, 0, 9, 9), "late", B_FOLLOW_NONE, 0));
	fBar->SetTarget(target);
	fBar->RemoveSelf();
	delete fBar;
	EXPECT_EQ(target->ScrollBar(B_VERTICAL), nullptr);
	target->ScrollTo(0, 3);
	EXPECT_EQ(target->Bounds().top, 3);
}


TEST_F(ScrollBarTest, NamedTargetIsFoundInTheWindow)
{
	BScrollBar* bar = new BScrollBar(BRect(220, 10, 234, 159), "named", NULL, 0, 50, B_VERTICAL);
	bar->SetTarget("target");
	EXPECT_EQ(bar->Target(), nullptr);
	Add(bar);
	EXPECT_EQ(bar->Target(), fTarget);
	bar->SetTarget("nobody");
	EXPECT_EQ(bar->Target(), nullptr);
	EXPECT_EQ(fTarget->ScrollBar(B_VERTICAL), nullptr);
}


TEST_F(ScrollBarTest, ArrowsMoveBySmallSteps)
{
	Show();
	fRobot->Click(At(142));
	EXPECT_EQ(Value(), 5);
	fRobot->Click(At(142));
	EXPECT_EQ(Value(), 10);
	fRobot->Click(At(7));
	EXPECT_EQ(Value(), 5);
}


TEST_F(ScrollBarTest, ClicksBesideTheThumbMoveByLargeSteps)
{
	Show();
	fRobot->Click(At(120));
	EXPECT_EQ(Value(), 100);
	fRobot->Click(At(120));
	EXPECT_EQ(Value(), 200);
	fRobot->Click(At(17));
	EXPECT_EQ(Value(), 100);
}


TEST_F(ScrollBarTest, HeldArrowRepeatsAndStopsWhenItIsReleased)
{
	Show();
	fRobot->MoveTo(At(142));
	fRobot->Press();
	for (int i = 0; i < 500 && Value() < 20; i++)
		snooze(20000);
	fRobot->Release();
	EXPECT_GE(Value(), 20);

	const float released = Value();
	const auto ticks = Ask([this] { return fBar->told.size(); });
	snooze(150000);
	EXPECT_EQ(Value(), released);
	EXPECT_EQ(Ask([this] { return fBar->told.size(); }), ticks);
}


TEST_F(ScrollBarTest, HeldArrowWaitsWhileThePointerIsElsewhere)
{
	Show();
	fRobot->MoveTo(At(142));
	fRobot->Press();
	fRobot->MoveTo(BPoint(50, 50));
	const float left = Value();
	snooze(500000);
	EXPECT_EQ(Value(), left);
	fRobot->MoveTo(At(142));
	for (int i = 0; i < 500 && Value() == left; i++)
		snooze(20000);
	fRobot->Release();
	EXPECT_GT(Value(), left);
}


TEST_F(ScrollBarTest, HeldPageClickStopsWithTheThumbUnderThePointer)
{
	Show();
	Do([this] { fBar->SetProportion(0.2f); });
	fRobot->MoveTo(At(80));
	fRobot->Press();
	// The thumb is 24 high and has 98 pixels to go.
	for (int i = 0; i < 500 && Value() < 500; i++)
		snooze(20000);
	snooze(200000);
	fRobot->Release();
	EXPECT_GE(Value(), 450);
	EXPECT_LE(Value(), 700);
}


TEST_F(ScrollBarTest, ThumbFollowsThePointerToTheEndsAndBeyond)
{
	Show();
	// Without a proportion the thumb is 15 high; from 14 to 28 at value 0.
	fRobot->Drag(At(20), At(200));
	EXPECT_EQ(Value(), 1000);
	fRobot->Drag(At(130), At(-100));
	EXPECT_EQ(Value(), 0);
	fRobot->Drag(At(20), At(74));
	EXPECT_NEAR(Value(), 54 / 107.0 * 1000, 15);
	EXPECT_EQ(Ask([this] { return fTarget->Bounds().top; }), Value());
}


TEST_F(ScrollBarTest, DraggingGoesOnBesideTheBar)
{
	Show();
	fRobot->Drag(At(20), BPoint(20, 84));
	EXPECT_GT(Value(), 300);
}


TEST_F(ScrollBarTest, TertiaryButtonBringsTheThumbUnderThePointer)
{
	Show();
	fRobot->Click(At(75), 1, B_TERTIARY_MOUSE_BUTTON);
	EXPECT_NEAR(Value(), 500, 10);
}


TEST_F(ScrollBarTest, WheelScrollsOverTheBarAndOverItsTarget)
{
	Show();
	fRobot->MoveTo(At(80));
	fRobot->Wheel(1);
	EXPECT_EQ(Value(), 15);
	fRobot->MoveTo(BPoint(50, 50));
	fRobot->Wheel(2);
	EXPECT_EQ(Value(), 45);
	fRobot->Wheel(-10);
	EXPECT_EQ(Value(), 0);
}


TEST_F(ScrollBarTest, FineTurnsOfTheWheelAddUp)
{
	Show();
	Do([this] { fBar->SetSteps(1, 10); });
	fRobot->MoveTo(At(80));
	for (int i = 0; i < 10; i++)
		fRobot->Wheel(0.125f);
	EXPECT_EQ(Value(), 3);
}


TEST_F(ScrollBarTest, HorizontalBarTakesBothKindsOfWheel)
{
	BScrollBar* bar =
		Add(new BScrollBar(BRect(10, 170, 189, 184), "across", fTarget, 0, 500, B_HORIZONTAL));
	Show();
	fRobot->MoveTo(BPoint(100, 177));
	fRobot->Wheel(2);
	EXPECT_EQ(Ask([bar] { return bar->Value(); }), 6);
	fRobot->Wheel(0, 1);
	EXPECT_EQ(Ask([bar] { return bar->Value(); }), 9);
	EXPECT_EQ(Ask([this] { return fTarget->LeftTop(); }), BPoint(9, 0));
	fRobot->Click(BPoint(182, 177));
	EXPECT_EQ(Ask([bar] { return bar->Value(); }), 10);
	fRobot->Click(BPoint(150, 177));
	EXPECT_EQ(Ask([bar] { return bar->Value(); }), 20);
}


TEST_F(ScrollBarTest, BarWithoutARangeTakesNoInput)
{
	Show();
	Do([this] {
		fBar->SetRange(0, 0);
		fBar->told.clear();
	});
	fRobot->Click(At(142));
	fRobot->Click(At(80));
	fRobot->MoveTo(At(80));
	fRobot->Wheel(3);
	EXPECT_EQ(Ask([this] { return fBar->told.size(); }), 0u);
}


TEST_F(ScrollBarTest, BarTooShortForItsPartsStillWorks)
{
	Show();
	for (float height : {40.0f, 20.0f, 5.0f, 1.0f, 0.0f, -1.0f}) {
		Do([this, height] {
			fBar->ResizeTo(14, height);
			fBar->SetValue(10);
		});
		fRobot->Click(At(0));
	}
	EXPECT_LE(Value(), 10);
}


TEST_F(ScrollBarTest, BarThatIsTakenOutWhileHeldStopsRepeating)
{
	Show();
	fRobot->MoveTo(At(142));
	fRobot->Press();
	Do([this] { fBar->RemoveSelf(); });
	const auto ticks = fBar->told.size();
	snooze(450000);
	fRobot->Release();
	EXPECT_EQ(fBar->told.size(), ticks);
	delete fBar;
}


TEST_F(ScrollBarTest, OrientationSwapsTheSidesAndTheDirection)
{
	fBar->SetOrientation(B_HORIZONTAL);
	EXPECT_EQ(fBar->Frame(), BRect(200, 10, 349, 24));
	EXPECT_EQ(fTarget->ScrollBar(B_HORIZONTAL), fBar);
	EXPECT_EQ(fTarget->ScrollBar(B_VERTICAL), nullptr);
	fBar->SetValue(11);
	EXPECT_EQ(fTarget->LeftTop(), BPoint(11, 0));
}


TEST_F(ScrollBarTest, ArchiveKeepsRangeStepsAndValue)
{
	fBar->SetValue(77);
	fBar->SetProportion(0.25f);
	BMessage archive;
	ASSERT_EQ(fBar->BScrollBar::Archive(&archive), B_OK);
	archive.ReplaceString("class", "BScrollBar");
	std::unique_ptr<BArchivable> object(BScrollBar::Instantiate(&archive));
	BScrollBar* bar = dynamic_cast<BScrollBar*>(object.get());
	ASSERT_NE(bar, nullptr);
	float min, max, small, large;
	bar->GetRange(&min, &max);
	bar->GetSteps(&small, &large);
	EXPECT_EQ(max, 1000);
	EXPECT_EQ(small, 5);
	EXPECT_EQ(large, 100);
	EXPECT_EQ(bar->Value(), 77);
	EXPECT_EQ(bar->Proportion(), 0.25f);
	EXPECT_EQ(bar->Orientation(), B_VERTICAL);
}

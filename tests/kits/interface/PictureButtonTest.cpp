// SPDX-License-Identifier: MIT
// Tests of BPictureButton: its two behaviours, and that it copies its pictures.
#include <PictureButton.h>

#include "ControlsFixture.h"

namespace {

class PictureButtonTest : public ControlsTest {
protected:
	BPictureButton* AddButton(uint32 behavior)
	{
		BPicture off, on;
		return Add(new BPictureButton(
			BRect(10, 10, 49, 49), "button", &off, &on, new BMessage('pict'), behavior));
	}
};

} // namespace


TEST_F(PictureButtonTest, ButtonWithOneStateIsOnWhileItIsPressed)
{
	BPictureButton* button = AddButton(B_ONE_STATE_BUTTON);
	Show();
	fRobot->MoveTo(BPoint(20, 20));
	fRobot->Press();
	EXPECT_EQ(ValueOf(button), 1);
	fRobot->MoveTo(BPoint(100, 100));
	EXPECT_EQ(ValueOf(button), 0);
	fRobot->MoveTo(BPoint(30, 30));
	EXPECT_EQ(ValueOf(button), 1);
	fRobot->Release();
	EXPECT_EQ(ValueOf(button), 0);
	const std::vector<BMessage> received = Take();
	ASSERT_EQ(received.size(), 1u);
	EXPECT_EQ(received[0].GetInt32("be:value", -1), 1);
}


TEST_F(PictureButtonTest, ButtonWithTwoStatesTogglesAtEachClick)
{
	BPictureButton* button = AddButton(B_TWO_STATE_BUTTON);
	Show();
	fRobot->Click(BPoint(20, 20));
	EXPECT_EQ(ValueOf(button), 1);
	fRobot->Click(BPoint(20, 20));
	EXPECT_EQ(ValueOf(button), 0);
	const std::vector<BMessage> received = Take();
	ASSERT_EQ(received.size(), 2u);
	EXPECT_EQ(received[0].GetInt32("be:value", -1), 1);
	EXPECT_EQ(received[1].GetInt32("be:value", -1), 0);
}


TEST_F(PictureButtonTest, ReleaseOutsideLeavesTheValue)
{
	for (uint32 behavior : {B_ONE_STATE_BUTTON, B_TWO_STATE_BUTTON}) {
		BPictureButton* button = AddButton(behavior);
		button->SetValue(behavior == B_TWO_STATE_BUTTON ? 1 : 0);
	}
	Show();
	fRobot->Drag(BPoint(20, 20), BPoint(200, 150));
	EXPECT_EQ(Ask([this] {
		BView* top = fBackground->ChildAt(1);
		return dynamic_cast<BControl*>(top)->Value();
	}),
		1);
	EXPECT_EQ(TakeCodes(), "");
}


TEST_F(PictureButtonTest, SpaceAndEnterClick)
{
	BPictureButton* button = AddButton(B_TWO_STATE_BUTTON);
	Show();
	Do([&] { button->MakeFocus(); });
	fRobot->Key("space");
	EXPECT_EQ(ValueOf(button), 1);
	fRobot->Key("enter");
	EXPECT_EQ(ValueOf(button), 0);
	EXPECT_EQ(TakeCodes(), "pict pict ");
	Do([&] { button->SetBehavior(B_ONE_STATE_BUTTON); });
	fRobot->Key("space");
	EXPECT_EQ(ValueOf(button), 0);
	EXPECT_EQ(TakeCodes(), "pict ");
}


TEST_F(PictureButtonTest, DisabledButtonTakesNoInput)
{
	BPictureButton* button = AddButton(B_TWO_STATE_BUTTON);
	button->SetEnabled(false);
	Show();
	fRobot->Click(BPoint(20, 20));
	EXPECT_EQ(ValueOf(button), 0);
	EXPECT_EQ(TakeCodes(), "");
}


TEST_F(PictureButtonTest, PicturesAreCopiedAndMayBeTakenAway)
{
	BPicture picture;
	BPictureButton button(BRect(0, 0, 9, 9), "button", &picture, nullptr, nullptr);
	ASSERT_NE(button.EnabledOff(), nullptr);
	EXPECT_NE(button.EnabledOff(), &picture);
	EXPECT_EQ(button.EnabledOn(), nullptr);
	EXPECT_EQ(button.DisabledOff(), nullptr);
	// Its own picture may be given to it again.
	button.SetDisabledOn(button.EnabledOff());
	EXPECT_NE(button.DisabledOn(), nullptr);
	button.SetDisabledOn(button.DisabledOn());
	EXPECT_NE(button.DisabledOn(), nullptr);
	button.SetEnabledOff(nullptr);
	EXPECT_EQ(button.EnabledOff(), nullptr);
}


TEST_F(PictureButtonTest, ArchiveKeepsTheButton)
{
	BPictureButton* button = AddButton(B_TWO_STATE_BUTTON);
	button->SetValue(1);
	BMessage archive;
	ASSERT_EQ(button->Archive(&archive), B_OK);
	std::unique_ptr<BArchivable> object(instantiate_object(&archive));
	const BPictureButton* copy = dynamic_cast<BPictureButton*>(object.get());
	ASSERT_NE(copy, nullptr);
	EXPECT_EQ(copy->Behavior(), static_cast<uint32>(B_TWO_STATE_BUTTON));
	EXPECT_EQ(copy->Value(), 1);
	EXPECT_NE(copy->EnabledOff(), nullptr);
	EXPECT_NE(copy->EnabledOn(), nullptr);
	EXPECT_EQ(copy->DisabledOff(), nullptr);
}

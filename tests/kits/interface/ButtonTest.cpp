// SPDX-License-Identifier: MIT
// Tests of BControl by way of BButton: messages, keyboard, mouse, enabled state, default button.
#include <Button.h>

#include <CheckBox.h>
#include <StringView.h>

#include "ControlsFixture.h"

namespace {

class ButtonTest : public ControlsTest {
protected:
	void SetUp() override
	{
		ControlsTest::SetUp();
		fButton = Add(new BButton(BRect(10, 10, 89, 34), "button", "Push", new BMessage('push')));
		fOther = Add(new BButton(BRect(110, 10, 189, 34), "other", "Other", new BMessage('othr')));
	}

	BButton* fButton = nullptr;
	BButton* fOther = nullptr;
};


// Deletes itself when it is used.
class VanishingButton : public BButton {
public:
	VanishingButton()
		: BButton(BRect(10, 50, 89, 74), "vanishing", "Vanish", new BMessage('gone'))
	{
	}

	status_t Invoke(BMessage* message) override
	{
		const status_t status = BButton::Invoke(message);
		RemoveSelf();
		delete this;
		return status;
	}
};

} // namespace


TEST_F(ButtonTest, NewButtonHasTheDocumentedState)
{
	EXPECT_STREQ(fButton->Label(), "Push");
	EXPECT_EQ(fButton->Value(), 0);
	EXPECT_TRUE(fButton->IsEnabled());
	EXPECT_FALSE(fButton->IsDefault());
	EXPECT_EQ(fButton->Frame(), BRect(10, 10, 89, 34));
	EXPECT_EQ(fButton->Flags(), B_WILL_DRAW | B_NAVIGABLE | B_FULL_UPDATE_ON_RESIZE);
}


TEST_F(ButtonTest, ClickSendsTheMessageWithItsFieldsOnce)
{
	Show();
	fRobot->Click(BPoint(40, 20));
	const std::vector<BMessage> received = Take();
	ASSERT_EQ(received.size(), 1u);
	const BMessage& message = received[0];
	EXPECT_EQ(message.what, 'push');
	EXPECT_TRUE(message.HasInt64("when"));
	EXPECT_FALSE(message.HasInt64("when", 1));
	void* source = nullptr;
	EXPECT_EQ(message.FindPointer("source", &source), B_OK);
	EXPECT_EQ(static_cast<BControl*>(source), fButton);
	EXPECT_FALSE(message.HasPointer("source", 1));
	EXPECT_EQ(message.GetInt32("be:value", -1), 1);
	BMessenger sender;
	EXPECT_EQ(message.FindMessenger("be:sender", &sender), B_OK);
	EXPECT_EQ(sender.Target(nullptr), fButton);
	EXPECT_FALSE(message.HasMessenger("be:sender", 1));
}


TEST_F(ButtonTest, SentMessageIsACopyOfTheOwn)
{
	fButton->Message()->AddString("extra", "field");
	Show();
	fRobot->Click(BPoint(40, 20));
	fRobot->Click(BPoint(40, 20));
	const std::vector<BMessage> received = Take();
	ASSERT_EQ(received.size(), 2u);
	EXPECT_STREQ(received[1].GetString("extra", ""), "field");
	EXPECT_FALSE(received[1].HasInt64("when", 1));
	EXPECT_FALSE(Ask([this] { return fButton->Message()->HasInt64("when"); }));
}


TEST_F(ButtonTest, InvokeWithoutAMessageIsABadValue)
{
	Show();
	Do([this] {
		fButton->SetMessage(nullptr);
		EXPECT_EQ(fButton->Invoke(), B_BAD_VALUE);
		BMessage given('givn');
		EXPECT_EQ(fButton->Invoke(&given), B_OK);
	});
	EXPECT_EQ(TakeCodes(), "givn ");
}


TEST_F(ButtonTest, ValueIsOneWhilePressed)
{
	Show();
	fRobot->MoveTo(BPoint(40, 20));
	fRobot->Press();
	EXPECT_EQ(ValueOf(fButton), 1);
	EXPECT_EQ(TakeCodes(), "");
	fRobot->MoveTo(BPoint(40, 120));
	EXPECT_EQ(ValueOf(fButton), 0);
	fRobot->MoveTo(BPoint(40, 22));
	EXPECT_EQ(ValueOf(fButton), 1);
	fRobot->Release();
	EXPECT_EQ(ValueOf(fButton), 0);
	EXPECT_EQ(TakeCodes(), "push ");
}


TEST_F(ButtonTest, ReleaseOutsideSendsNothing)
{
	Show();
	fRobot->Drag(BPoint(40, 20), BPoint(140, 20));
	EXPECT_EQ(ValueOf(fButton), 0);
	EXPECT_EQ(ValueOf(fOther), 0);
	EXPECT_EQ(TakeCodes(), "");
}


TEST_F(ButtonTest, SpaceAndEnterPressTheFocusedButton)
{
	Show();
	Do([this] { fButton->MakeFocus(); });
	fRobot->Key("space");
	EXPECT_EQ(TakeCodes(), "push ");
	fRobot->Key("enter");
	EXPECT_EQ(TakeCodes(), "push ");
	fRobot->Type("x");
	EXPECT_EQ(TakeCodes(), "");
	EXPECT_EQ(ValueOf(fButton), 0);
}


TEST_F(ButtonTest, DisabledButtonTakesNoInput)
{
	Show();
	Do([this] {
		fButton->MakeFocus();
		fButton->SetEnabled(false);
	});
	EXPECT_FALSE(Ask([this] { return fButton->IsFocus(); }));
	fRobot->Click(BPoint(40, 20));
	EXPECT_EQ(TakeCodes(), "");
	EXPECT_EQ(ValueOf(fButton), 0);
}


TEST_F(ButtonTest, ButtonDisabledWhilePressedSendsNothing)
{
	Show();
	fRobot->MoveTo(BPoint(40, 20));
	fRobot->Press();
	Do([this] { fButton->SetEnabled(false); });
	fRobot->Release();
	EXPECT_EQ(TakeCodes(), "");
	EXPECT_EQ(ValueOf(fButton), 0);
}


TEST_F(ButtonTest, DisablingTakesAndGivesBackNavigation)
{
	fButton->SetEnabled(false);
	EXPECT_EQ(fButton->Flags() & B_NAVIGABLE, 0u);
	fButton->SetEnabled(false);
	fButton->SetEnabled(true);
	EXPECT_EQ(fButton->Flags() & B_NAVIGABLE, B_NAVIGABLE);

	fButton->SetFlags(fButton->Flags() & ~B_NAVIGABLE);
	fButton->SetEnabled(false);
	fButton->SetEnabled(true);
	EXPECT_EQ(fButton->Flags() & B_NAVIGABLE, 0u);
}


TEST_F(ButtonTest, TabSkipsDisabledControls)
{
	BButton* third = Add(new BButton(BRect(210, 10, 289, 34), "third", "Third", nullptr));
	fOther->SetEnabled(false);
	Show();
	Do([this] { fButton->MakeFocus(); });
	fRobot->Key("tab");
	EXPECT_TRUE(Ask([third] { return third->IsFocus(); }));
	fRobot->Key("shift+tab");
	EXPECT_TRUE(Ask([this] { return fButton->IsFocus(); }));
	fRobot->Key("shift+tab");
	EXPECT_TRUE(Ask([third] { return third->IsFocus(); }));
}


TEST_F(ButtonTest, AttachedControlWithoutATargetTargetsItsWindow)
{
	EXPECT_EQ(fButton->Target(), fWindow);
	BButton* elsewhere = new BButton(BRect(0, 0, 9, 9), "elsewhere", "", new BMessage('else'));
	elsewhere->SetTarget(fBackground);
	Add(elsewhere);
	EXPECT_EQ(elsewhere->Target(), fBackground);
}


TEST_F(ButtonTest, TargetThatIsNotAttachedIsRefused)
{
	BView lonely(BRect(0, 0, 9, 9), "lonely", B_FOLLOW_NONE, 0);
	EXPECT_NE(fButton->SetTarget(&lonely), B_OK);
}


TEST_F(ButtonTest, EmptyLabelEqualsNone)
{
	fButton->SetLabel("");
	EXPECT_EQ(fButton->Label(), nullptr);
	fButton->SetLabel("again");
	EXPECT_STREQ(fButton->Label(), "again");
	fButton->SetLabel(nullptr);
	EXPECT_EQ(fButton->Label(), nullptr);
	EXPECT_EQ(fButton->Frame(), BRect(10, 10, 89, 34));
}


TEST_F(ButtonTest, AttachingTakesTheParentsColours)
{
	fBackground->SetViewColor(make_color(10, 200, 30));
	BButton* button = Add(new BButton("late", nullptr));
	EXPECT_EQ(button->ViewColor(), make_color(10, 200, 30));
	EXPECT_EQ(button->LowColor(), make_color(10, 200, 30));

	fBackground->SetViewColor(B_TRANSPARENT_COLOR);
	BButton* onTransparent = Add(new BButton("later", nullptr));
	EXPECT_EQ(onTransparent->ViewColor(), ui_color(B_PANEL_BACKGROUND_COLOR));

	BButton* direct = new BButton("direct", nullptr);
	fWindow->AddChild(direct);
	EXPECT_EQ(direct->ViewColor(), ui_color(B_PANEL_BACKGROUND_COLOR));
}


TEST_F(ButtonTest, PreferredWidthIsAtLeastTheUsualOne)
{
	BFont font;
	fButton->GetFont(&font);
	ASSERT_EQ(font.Size(), 12);
	float width, height;
	fButton->GetPreferredSize(&width, &height);
	EXPECT_EQ(width, 75);
	fButton->SetLabel("A label that needs far more room than usual");
	fButton->GetPreferredSize(&width, nullptr);
	EXPECT_GT(width, fButton->StringWidth(fButton->Label()) + 20);
	fButton->ResizeToPreferred();
	EXPECT_EQ(fButton->Bounds().Width(), width);
	EXPECT_EQ(fButton->Bounds().Height(), height);
}


TEST_F(ButtonTest, MakeDefaultGrowsTheFrameAndBack)
{
	fButton->MakeDefault(true);
	EXPECT_TRUE(fButton->IsDefault());
	EXPECT_EQ(fWindow->DefaultButton(), fButton);
	EXPECT_EQ(fButton->Frame(), BRect(7, 7, 92, 37));
	fButton->MakeDefault(true);
	EXPECT_EQ(fButton->Frame(), BRect(7, 7, 92, 37));
	fButton->MakeDefault(false);
	EXPECT_EQ(fWindow->DefaultButton(), nullptr);
	EXPECT_EQ(fButton->Frame(), BRect(10, 10, 89, 34));
}


TEST_F(ButtonTest, WindowHasOneDefaultButton)
{
	fButton->MakeDefault(true);
	fOther->MakeDefault(true);
	EXPECT_FALSE(fButton->IsDefault());
	EXPECT_EQ(fButton->Frame(), BRect(10, 10, 89, 34));
	EXPECT_EQ(fWindow->DefaultButton(), fOther);
	fWindow->SetDefaultButton(fButton);
	EXPECT_TRUE(fButton->IsDefault());
	EXPECT_FALSE(fOther->IsDefault());
	fWindow->SetDefaultButton(nullptr);
	EXPECT_FALSE(fButton->IsDefault());
}


TEST_F(ButtonTest, DefaultButtonRegistersWhenItIsAttached)
{
	BButton* button = new BButton(BRect(10, 50, 89, 74), "late", "Late", nullptr);
	button->MakeDefault(true);
	EXPECT_EQ(fWindow->DefaultButton(), nullptr);
	Add(button);
	EXPECT_EQ(fWindow->DefaultButton(), button);
	EXPECT_EQ(button->Frame(), BRect(7, 47, 92, 77));
}


TEST_F(ButtonTest, RemovedDefaultButtonIsNoneAnyMore)
{
	fButton->MakeDefault(true);
	fButton->RemoveSelf();
	EXPECT_EQ(fWindow->DefaultButton(), nullptr);
	EXPECT_EQ(fButton->Value(), 0);
	delete fButton;
}


TEST_F(ButtonTest, DeletedDefaultButtonIsNoneAnyMore)
{
	fButton->MakeDefault(true);
	delete fButton;
	EXPECT_EQ(fWindow->DefaultButton(), nullptr);
}


TEST_F(ButtonTest, EnterPressesTheDefaultButtonWhateverHasTheFocus)
{
	BCheckBox* box = Add(new BCheckBox(BRect(10, 50, 89, 70), "box", "Box", nullptr));
	fOther->MakeDefault(true);
	Show();
	Do([box] { box->MakeFocus(); });
	fRobot->Key("enter");
	EXPECT_EQ(TakeCodes(), "othr ");
	EXPECT_EQ(ValueOf(box), 0);
	Do([this] { fOther->SetEnabled(false); });
	fRobot->Key("enter");
	EXPECT_EQ(TakeCodes(), "");
}


TEST_F(ButtonTest, ButtonMayBeDeletedByItsUse)
{
	Add(new VanishingButton);
	Show();
	fRobot->Click(BPoint(40, 60));
	EXPECT_EQ(TakeCodes(), "gone ");
	EXPECT_EQ(Ask([this] { return fWindow->FindView("vanishing"); }), nullptr);
}


TEST_F(ButtonTest, ArchiveBringsBackTheState)
{
	fButton->SetEnabled(false);
	fButton->MakeDefault(true);
	fButton->SetValue(1);
	BMessage archive;
	ASSERT_EQ(fButton->Archive(&archive), B_OK);
	std::unique_ptr<BArchivable> object(BButton::Instantiate(&archive));
	BButton* copy = dynamic_cast<BButton*>(object.get());
	ASSERT_NE(copy, nullptr);
	EXPECT_STREQ(copy->Name(), "button");
	EXPECT_STREQ(copy->Label(), "Push");
	EXPECT_EQ(copy->Frame(), fButton->Frame());
	EXPECT_EQ(copy->Command(), 'push');
	EXPECT_EQ(copy->Value(), 1);
	EXPECT_TRUE(copy->IsDefault());
	EXPECT_FALSE(copy->IsEnabled());
	copy->SetEnabled(true);
	EXPECT_EQ(copy->Flags() & B_NAVIGABLE, B_NAVIGABLE);
}

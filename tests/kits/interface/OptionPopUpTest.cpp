// SPDX-License-Identifier: MIT
// Tests of BOptionPopUp and BOptionControl: options, the chosen one, and what a choice sends.
#include <OptionPopUp.h>

#include <MenuField.h>
#include <MenuItem.h>
#include <PopUpMenu.h>

#include "MenuFixture.h"

namespace {

class OptionPopUpTest : public MenuTrackingTest {
protected:
	void SetUp() override
	{
		MenuTrackingTest::SetUp();
		fOptions = Add(
			new BOptionPopUp(BRect(20, 100, 219, 124), "options", "Speed:", new BMessage('opti')));
		EXPECT_EQ(fOptions->AddOption("slow", 10), B_OK);
		EXPECT_EQ(fOptions->AddOption("fast", 100), B_OK);
	}

	std::string Chosen()
	{
		const char* name = "none";
		int32 value = -1;
		const int32 index = fOptions->SelectedOption(&name, &value);
		return std::to_string(index) + " " + name + " " + std::to_string(value);
	}

	BMenu* Menu() { return fOptions->MenuField()->Menu(); }

	BOptionPopUp* fOptions = nullptr;
};

} // namespace


TEST_F(OptionPopUpTest, FirstOptionIsChosen)
{
	EXPECT_EQ(fOptions->CountOptions(), 2);
	EXPECT_EQ(Chosen(), "0 slow 10");
	EXPECT_EQ(fOptions->Value(), 10);
	EXPECT_STREQ(fOptions->MenuField()->Label(), "Speed:");
	Show();
	EXPECT_EQ(
		Ask([this] { return std::string(fOptions->MenuField()->MenuItem()->Label()); }), "slow");
}


TEST_F(OptionPopUpTest, WithoutOptionsNothingIsChosen)
{
	BOptionPopUp options("options", nullptr, nullptr);
	EXPECT_EQ(options.SelectedOption(), B_ERROR);
	EXPECT_EQ(options.SelectOptionFor(1), B_ERROR);
	EXPECT_FALSE(options.GetOptionAt(0, nullptr, nullptr));
	options.RemoveOptionAt(0);
	EXPECT_EQ(options.CountOptions(), 0);
}


TEST_F(OptionPopUpTest, OptionsAreAddedInPlaceAndRemoved)
{
	EXPECT_EQ(fOptions->AddOptionAt("medium", 50, 1), B_OK);
	const char* name = nullptr;
	int32 value = 0;
	ASSERT_TRUE(fOptions->GetOptionAt(1, &name, &value));
	EXPECT_STREQ(name, "medium");
	EXPECT_EQ(value, 50);
	EXPECT_EQ(Chosen(), "0 slow 10");
	fOptions->RemoveOptionAt(0);
	EXPECT_EQ(fOptions->CountOptions(), 2);
	EXPECT_EQ(fOptions->SelectedOption(), B_ERROR) << "the chosen one has gone";
	EXPECT_EQ(fOptions->SelectOptionFor(100), B_OK);
	EXPECT_EQ(Chosen(), "1 fast 100");
}


TEST_F(OptionPopUpTest, BadOptionsAreRefused)
{
	EXPECT_EQ(fOptions->AddOption(nullptr, 1), B_BAD_VALUE);
	EXPECT_EQ(fOptions->AddOptionAt("x", 1, -1), B_BAD_VALUE);
	EXPECT_EQ(fOptions->AddOptionAt("x", 1, 3), B_BAD_VALUE);
	EXPECT_EQ(fOptions->CountOptions(), 2);
	EXPECT_FALSE(fOptions->GetOptionAt(2, nullptr, nullptr));
	EXPECT_FALSE(fOptions->GetOptionAt(-1, nullptr, nullptr));
}


TEST_F(OptionPopUpTest, OptionsAreChosenByValueAndName)
{
	Show();
	Do([this] {
		EXPECT_EQ(fOptions->SelectOptionFor("fast"), B_OK);
		EXPECT_EQ(Chosen(), "1 fast 100");
		EXPECT_EQ(fOptions->SelectOptionFor(10), B_OK);
		EXPECT_EQ(Chosen(), "0 slow 10");
		EXPECT_EQ(fOptions->SelectOptionFor("no such"), B_ERROR);
		EXPECT_EQ(fOptions->SelectOptionFor(static_cast<const char*>(nullptr)), B_ERROR);
		EXPECT_EQ(fOptions->SelectOptionFor(11), B_ERROR);
		EXPECT_EQ(Chosen(), "0 slow 10");
		fOptions->SetValue(100);
		EXPECT_EQ(Chosen(), "1 fast 100");
		fOptions->SetValue(7);
		EXPECT_EQ(fOptions->SelectedOption(), B_ERROR);
	});
	EXPECT_EQ(TakeCodes(), "") << "only the user's choices are sent";
}


TEST_F(OptionPopUpTest, ChoiceSendsTheValue)
{
	Show();
	Do([this] { fOptions->AddOption("faster", 200); });
	fRobot->ClickView("_mc_mb_");
	ASSERT_TRUE(Opens(Menu()));
	fRobot->ClickItem("faster");
	EXPECT_TRUE(Closes(Menu()));
	std::vector<BMessage> received = Take();
	ASSERT_EQ(received.size(), 1u);
	EXPECT_EQ(received[0].what, static_cast<uint32>('opti'));
	EXPECT_EQ(received[0].GetInt32("be:value", 0), 200);
	void* source = nullptr;
	received[0].FindPointer("source", &source);
	EXPECT_EQ(source, static_cast<BControl*>(fOptions));
	EXPECT_EQ(Ask([this] { return Chosen(); }), "2 faster 200");
}


TEST_F(OptionPopUpTest, OptionsWithTheSameValueAreToldApart)
{
	fOptions->AddOption("also fast", 100);
	Show();
	fRobot->ClickView("_mc_mb_");
	ASSERT_TRUE(Opens(Menu()));
	fRobot->ClickItem("also fast");
	EXPECT_TRUE(Closes(Menu()));
	EXPECT_EQ(TakeCodes(), "opti ");
	EXPECT_EQ(Ask([this] { return Chosen(); }), "2 also fast 100");
}


TEST_F(OptionPopUpTest, KeysBeginAtTheChoice)
{
	Show();
	Do([this] {
		fOptions->SelectOptionFor(100);
		fOptions->MenuField()->MakeFocus();
	});
	fRobot->Key("space");
	ASSERT_TRUE(Opens(Menu()));
	EXPECT_EQ(Selected(Menu()), "fast");
	fRobot->Key("up");
	fRobot->Key("enter");
	EXPECT_TRUE(Closes(Menu()));
	EXPECT_EQ(TakeCodes(), "opti ");
	EXPECT_EQ(Ask([this] { return fOptions->Value(); }), 10);
}


TEST_F(OptionPopUpTest, ValueMessageIsTaken)
{
	Show();
	BMessage value(B_OPTION_CONTROL_VALUE);
	value.AddInt32("be:value", 100);
	BMessenger(fOptions).SendMessage(&value);
	EXPECT_EQ(TakeCodes(), "opti ");
	EXPECT_EQ(Ask([this] { return Chosen(); }), "1 fast 100");
	BMessenger(fOptions).SendMessage(B_OPTION_CONTROL_VALUE);
	EXPECT_EQ(TakeCodes(), "") << "without a value";
}


TEST_F(OptionPopUpTest, DisabledFieldDoesNotOpen)
{
	fOptions->SetEnabled(false);
	EXPECT_FALSE(fOptions->MenuField()->IsEnabled());
	Show();
	fRobot->ClickView("_mc_mb_");
	EXPECT_FALSE(IsOpen(Menu()));
	Do([this] { fOptions->SetEnabled(true); });
	fRobot->ClickView("_mc_mb_");
	ASSERT_TRUE(Opens(Menu()));
	fRobot->Key("escape");
	EXPECT_TRUE(Closes(Menu()));
}


TEST_F(OptionPopUpTest, FieldIsAsWideAsItsOptions)
{
	Show();
	const auto width = [this] {
		return Ask([this] { return fOptions->MenuField()->MenuBar()->Frame().Width(); });
	};
	const float narrow = width();
	Do([this] { fOptions->AddOption("a longer option", 3); });
	const float wide = width();
	EXPECT_GT(wide, narrow);
	Do([this] { fOptions->RemoveOptionAt(2); });
	EXPECT_EQ(width(), narrow);
	Do([this] { fOptions->ResizeToPreferred(); });
	EXPECT_EQ(Ask([this] { return fOptions->MenuField()->Frame().Width(); }),
		Ask([this] { return fOptions->Frame().Width(); }));
	EXPECT_EQ(width(), narrow);

	Do([this] {
		BOptionPopUp* fixed =
			new BOptionPopUp(BRect(20, 140, 219, 164), "fixed", "Speed:", nullptr, true);
		fixed->AddOption("slow", 1);
		fBackground->AddChild(fixed);
		EXPECT_EQ(fixed->MenuField()->MenuBar()->Frame().right, 199);
	});
}


TEST_F(OptionPopUpTest, NewLabelMovesTheField)
{
	Show();
	const float divider = Ask([this] { return fOptions->MenuField()->Divider(); });
	Do([this] { fOptions->SetLabel("A longer label:"); });
	EXPECT_GT(Ask([this] { return fOptions->MenuField()->Divider(); }), divider);
	EXPECT_STREQ(fOptions->Label(), "A longer label:");
	Do([this] { fOptions->SetLabel(nullptr); });
	EXPECT_EQ(Ask([this] { return fOptions->MenuField()->Divider(); }), 0);
}

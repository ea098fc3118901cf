// SPDX-License-Identifier: MIT
// The property window without a mouse.

#include "PropertyWinTest.h"
#include "model/Event.h"
#include "props/FlagsProperty.h"
#include "props/StringProperty.h"
#include "props/TabView.h"

namespace {

class PropertyWinKeyTest : public PropertyWinTest {
protected:
	void SetUp() override
	{
		PropertyWinTest::SetUp();
		ShowControl();
		{
			WindowGuard guard(window);
			List("lvProperties")->MakeFocus(true);
		}
		robot.Settle();
	}

	void Press(const char* key, int32 count = 1)
	{
		for (int32 i = 0; i < count; i++)
			ASSERT_TRUE(robot.Key(key)) << key;
		robot.Settle();
	}

	/// Goes from the first row to that of the property.
	void GoTo(const char* property)
	{
		Press("home");
		Press("down", RowOf(property));
	}

	std::string SelectedName()
	{
		robot.Settle();
		WindowGuard guard(window);
		BListView* list = List("lvProperties");
		const auto* row = static_cast<TPropertyListItem*>(list->ItemAt(list->CurrentSelection()));
		return row != nullptr ? row->Name() : "";
	}

	void ExpectRoundTrip(const char* property, const char* editor)
	{
		GoTo(property);
		EXPECT_EQ(SelectedName(), property);
		EXPECT_EQ(FocusName(), "lvProperties");
		Press("tab");
		EXPECT_EQ(FocusName(), editor);
		Press("tab");
		EXPECT_EQ(FocusName(), "tabView");
		Press("tab");
		EXPECT_EQ(FocusName(), "lvProperties");
		Press("shift+tab");
		EXPECT_EQ(FocusName(), "tabView");
		Press("shift+tab");
		EXPECT_EQ(FocusName(), editor);
		Press("shift+tab");
		EXPECT_EQ(FocusName(), "lvProperties");
	}
};

} // namespace

TEST_F(PropertyWinKeyTest, TabGoesFromTheListToTheFieldToTheTabsAndBack)
{
	ExpectRoundTrip("Label", "efStringEdit");
}


TEST_F(PropertyWinKeyTest, TabReachesTheButtonOfADialog)
{
	ExpectRoundTrip("Flags", "btnModalEdit");
}


TEST_F(PropertyWinKeyTest, TabReachesTheMenuOfAChoice)
{
	ExpectRoundTrip("ResizingMode", "mfPickEdit");
}


TEST_F(PropertyWinKeyTest, ArrowsShowTheEditorOfEachRow)
{
	GoTo("Left");
	EXPECT_TRUE(IsShown("efStringEdit"));
	GoTo("Flags");
	EXPECT_TRUE(IsShown("efModalEdit"));
	EXPECT_FALSE(IsShown("efStringEdit"));
	GoTo("Enabled");
	EXPECT_TRUE(IsShown("mfPickEdit"));
	EXPECT_EQ(FocusName(), "lvProperties");
	Press("end");
	EXPECT_EQ(SelectedName(), "ResizingMode");
}


TEST_F(PropertyWinKeyTest, ATextIsTypedAndCommitted)
{
	GoTo("Top");
	Press("enter");
	EXPECT_EQ(FocusName(), "efStringEdit");
	// The old text is selected.
	robot.Type("31");
	EXPECT_EQ(Value("Top"), "0");
	Press("enter");
	EXPECT_EQ(Value("Top"), "31");
	EXPECT_EQ(ShownValue("Top"), "31");
	EXPECT_EQ(FocusName(), "efStringEdit");
}


TEST_F(PropertyWinKeyTest, EscapeTakesBackWhatWasTyped)
{
	{
		WindowGuard guard(surface);
		control->FindProperty("Label")->Editor()->SetValue("stored", true);
	}
	GoTo("Label");
	Press("enter");
	robot.Type("typed");
	EXPECT_EQ(robot.Text("efStringEdit"), "typed");
	Press("escape");
	EXPECT_EQ(robot.Text("efStringEdit"), "stored");
	EXPECT_EQ(FocusName(), "efStringEdit");
	EXPECT_EQ(SelectedName(), "Label");

	// Leaving the field now sets nothing, and the next text takes the old one's place.
	control->notes.clear();
	Press("tab");
	EXPECT_TRUE(control->notes.empty());
	Press("shift+tab");
	robot.Type("second");
	Press("enter");
	EXPECT_EQ(Value("Label"), "second");
}


TEST_F(PropertyWinKeyTest, KeysPressedRightAfterEscapeCountAfterIt)
{
	GoTo("Top");
	Press("enter");
	robot.Type("5\x1b"
			   "31");
	Press("enter");
	EXPECT_EQ(Value("Top"), "31");
}


TEST_F(PropertyWinKeyTest, EscapeWithNothingTypedReturnsToTheList)
{
	control->notes.clear();
	GoTo("Top");
	Press("enter");
	Press("escape");
	EXPECT_EQ(FocusName(), "lvProperties");
	EXPECT_EQ(SelectedName(), "Top");
	// There it does nothing.
	Press("escape");
	EXPECT_EQ(FocusName(), "lvProperties");
	Press("down");
	EXPECT_EQ(SelectedName(), control->PropertyAt(RowOf("Top") + 1)->Name());
	EXPECT_TRUE(control->notes.empty());
}


TEST_F(PropertyWinKeyTest, EscapeShowsTheValueAgainThatARefusalKept)
{
	GoTo("Top");
	Press("enter");
	control->refuses = true;
	robot.Type("12");
	Press("enter");
	EXPECT_EQ(robot.Text("efStringEdit"), "12");
	Press("escape");
	EXPECT_EQ(robot.Text("efStringEdit"), "0");
	EXPECT_EQ(Value("Top"), "0");
}


TEST_F(PropertyWinKeyTest, EscapeInTheFieldOfAComponentThatIsGoneDoesNothing)
{
	GoTo("Label");
	Press("enter");
	robot.Type("typed");
	Show(nullptr, nullptr);
	{
		WindowGuard guard(surface);
		control.reset();
	}
	Press("escape");
	EXPECT_EQ(FocusName(), "lvProperties");
}


TEST_F(PropertyWinKeyTest, TheSelectedRowIsAlwaysInSight)
{
	while (control->CountProperties() < 60) {
		const std::string name = "Own" + std::to_string(control->CountProperties());
		TProperty* property = new TProperty(control.get(), name.c_str(), "", nullptr, true);
		control->AddPropAndEditor(
			property, new TStringProperty(control.get(), property), nullptr, nullptr, true);
	}
	Show(nullptr, nullptr);
	ShowControl();
	const auto expectInSight = [&](const char* key) {
		Press(key);
		WindowGuard guard(window);
		BListView* list = List("lvProperties");
		const BRect row = list->ItemFrame(list->CurrentSelection());
		EXPECT_LE(list->Bounds().top, row.top) << key;
		EXPECT_GE(list->Bounds().bottom, row.bottom) << key;
	};
	for (int32 i = 0; i < 59; i++)
		expectInSight("down");
	EXPECT_EQ(SelectedName(), "Own59");
	for (int32 i = 0; i < 59; i++)
		expectInSight("up");
	EXPECT_EQ(SelectedName(), "Name");
	expectInSight("end");
	expectInSight("home");
	// A page is scrolled without the selection.
	Press("page-down", 2);
	expectInSight("down");
	EXPECT_EQ(SelectedName(), control->PropertyAt(1)->Name());
}


TEST_F(PropertyWinKeyTest, EnterFlipsABoolean)
{
	GoTo("Enabled");
	Press("enter");
	EXPECT_EQ(Value("Enabled"), "false");
	EXPECT_EQ(FocusName(), "mfPickEdit");
}


TEST_F(PropertyWinKeyTest, AChoiceIsPickedFromItsMenu)
{
	control->FindProperty("ResizingMode")->SetValue("B_FOLLOW_LEFT");
	GoTo("Left");
	GoTo("ResizingMode");
	Press("tab");
	Press("space");
	Press("down");
	Press("enter");
	EXPECT_EQ(Value("ResizingMode"), "B_FOLLOW_RIGHT");
}


TEST_F(PropertyWinKeyTest, EscapeClosesTheMenuOfAChoice)
{
	const std::string before = Value("ResizingMode");
	GoTo("ResizingMode");
	Press("tab");
	Press("space");
	Press("down");
	Press("escape");
	EXPECT_EQ(Value("ResizingMode"), before);
	EXPECT_EQ(FocusName(), "mfPickEdit");
}


TEST_F(PropertyWinKeyTest, ADialogIsOpenedUsedAndConfirmed)
{
	{
		WindowGuard guard(surface);
		control->FindProperty("Flags")->SetValue("");
	}
	GoTo("Flags");
	Press("tab");
	Press("space");
	ASSERT_TRUE(robot.WaitForWindow("View Flags"));
	Press("tab");
	Press("space");
	EXPECT_EQ(robot.Value("Will Draw"), 1);
	EXPECT_TRUE(robot.Key("enter"));
	ASSERT_TRUE(robot.WaitForNoWindow("View Flags"));
	EXPECT_EQ(Value("Flags"), "B_WILL_DRAW");
}


TEST_F(PropertyWinKeyTest, EscapeLeavesADialogWithoutAChange)
{
	const std::string before = Value("Flags");
	GoTo("Flags");
	Press("enter");
	ASSERT_TRUE(robot.WaitForWindow("View Flags"));
	Press("tab");
	Press("space");
	EXPECT_TRUE(robot.Key("escape"));
	ASSERT_TRUE(robot.WaitForNoWindow("View Flags"));
	EXPECT_EQ(Value("Flags"), before);
}


TEST_F(PropertyWinKeyTest, EventsAreReachedAndTicked)
{
	Press("shift+tab");
	EXPECT_EQ(FocusName(), "tabView");
	Press("right");
	EXPECT_FALSE(IsShown("lvProperties"));
	EXPECT_TRUE(IsShown("lvEvents"));
	Press("tab");
	EXPECT_EQ(FocusName(), "lvEvents");
	Press("down");
	Press("down");
	Press("enter");
	{
		WindowGuard guard(surface);
		EXPECT_FALSE(control->EventAt(0)->selected);
		EXPECT_TRUE(control->EventAt(1)->selected);
	}
	Press("enter");
	{
		WindowGuard guard(surface);
		EXPECT_FALSE(control->EventAt(1)->selected);
	}
	Press("tab");
	EXPECT_EQ(FocusName(), "tabView");
	Press("left");
	EXPECT_TRUE(IsShown("lvProperties"));
}


TEST_F(PropertyWinKeyTest, TheFocusLeavesAPaneThatIsHidden)
{
	// A component whose first property is no text.
	const auto other = NewComponent("Other");
	other->ClearProperties(true);
	TProperty* flags = new TProperty(other.get(), "OwnFlags", "", nullptr, true);
	other->AddPropAndEditor(
		flags, new TViewFlagsProperty(other.get(), flags), nullptr, nullptr, true);

	GoTo("Label");
	Press("enter");
	robot.Type("never committed");
	Show(other.get(), surface->surface);
	EXPECT_TRUE(IsShown("efModalEdit"));
	EXPECT_EQ(FocusName(), "lvProperties");
	Press("tab");
	Press("tab");
	EXPECT_STREQ(flags->Value(), "");
	EXPECT_EQ(Value("Label"), "");
	EXPECT_EQ(Value("Flags").find("never"), std::string::npos);
	Show(nullptr, nullptr);
}

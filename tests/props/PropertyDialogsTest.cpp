// SPDX-License-Identifier: MIT
// Tests of the dialogs of flags and colours.

#include <CheckBox.h>
#include <ColorControl.h>
#include <OS.h>

#include "WindowTest.h"
#include "model/ColorText.h"
#include "props/FlagsProperty.h"
#include "props/RGBColorProperty.h"
#include "props/WindowFlagsWin.h"
#include "support/CapturedOutput.h"

namespace {

/// A component on a surface, and the dialog of one of its properties' editors.
class PropertyDialogsTest : public WindowTest {
protected:
	void SetUp() override
	{
		window = new SurfaceWindow;
		control = std::make_unique<PlainControl>(window->surface);
		window->Show();
		ASSERT_TRUE(robot.WaitForWindow("Surface"));
	}

	void TearDown() override
	{
		QuitWindow(window);
		control.reset();
	}

	TPropertyEditor* EditorOf(const char* name, const char* value)
	{
		window->Lock();
		TProperty* property = control->FindProperty(name);
		property->SetValue(value);
		control->SetModified(false);
		TPropertyEditor* editor = property->Editor();
		window->Unlock();
		return editor;
	}

	/// Opens the dialog for the flags in \a value.
	void Open(const char* property, const char* value, const char* title)
	{
		EXPECT_TRUE(EditorOf(property, value)->ModalEdit());
		ASSERT_TRUE(robot.WaitForWindow(title));
	}

	void CloseBy(const char* button, const char* title)
	{
		EXPECT_TRUE(robot.ClickView(button));
		EXPECT_TRUE(robot.WaitForNoWindow(title));
	}

	std::string Value(const char* name)
	{
		window->Lock();
		const std::string value = control->Value(name);
		window->Unlock();
		return value;
	}

	SurfaceWindow* window = nullptr;
	std::unique_ptr<PlainControl> control;
	Robot robot;
};

} // namespace

TEST_F(PropertyDialogsTest, ViewFlagsOpenTickedAndComeBackUnchanged)
{
	Open("Flags", "B_WILL_DRAW|B_NAVIGABLE", "View Flags");
	EXPECT_EQ(robot.Value("Will Draw"), 1);
	EXPECT_EQ(robot.Value("Navigable"), 1);
	EXPECT_EQ(robot.Value("Pulse Needed"), 0);
	EXPECT_EQ(robot.Value("Navigable Jump"), 0);
	CloseBy("btnOK", "View Flags");
	EXPECT_EQ(Value("Flags"), "B_WILL_DRAW|B_NAVIGABLE");
	EXPECT_FALSE(control->Modified());
}


TEST_F(PropertyDialogsTest, TheJumpFlagTicksNavigableToo)
{
	Open("Flags", "B_NAVIGABLE_JUMP", "View Flags");
	EXPECT_EQ(robot.Value("Navigable"), 1);
	CloseBy("btnOK", "View Flags");
	EXPECT_EQ(Value("Flags"), "B_NAVIGABLE|B_NAVIGABLE_JUMP");
}


TEST_F(PropertyDialogsTest, NoTickWritesNoText)
{
	Open("Flags", "", "View Flags");
	EXPECT_EQ(robot.Value("Will Draw"), 0);
	CloseBy("btnOK", "View Flags");
	EXPECT_EQ(Value("Flags"), "");
}


TEST_F(PropertyDialogsTest, ConfirmedFlagsReachTheComponentInTheOrderOfTheBoxes)
{
	Open("Flags", "B_SUBPIXEL_PRECISE|B_UNKNOWN", "View Flags");
	EXPECT_TRUE(robot.ClickView("Frame events"));
	EXPECT_TRUE(robot.ClickView("Pulse Needed"));
	CapturedOutput output;
	CloseBy("btnOK", "View Flags");
	EXPECT_EQ(Value("Flags"), "B_PULSE_NEEDED|B_FRAME_EVENTS|B_SUBPIXEL_PRECISE");
	EXPECT_NE(output.Text().find("B_PULSE_NEEDED|B_FRAME_EVENTS|B_SUBPIXEL_PRECISE\n"),
		std::string::npos);
	EXPECT_TRUE(control->Modified());
	EXPECT_TRUE(control->GetPropertyValue("Flags") != nullptr);
}


TEST_F(PropertyDialogsTest, TheVetoIsNotAsked)
{
	control->refuses = true;
	Open("Flags", "", "View Flags");
	EXPECT_TRUE(robot.ClickView("Will Draw"));
	CloseBy("btnOK", "View Flags");
	EXPECT_EQ(Value("Flags"), "B_WILL_DRAW");
}


TEST_F(PropertyDialogsTest, CancelLeavesTheValue)
{
	Open("Flags", "B_WILL_DRAW", "View Flags");
	EXPECT_TRUE(robot.ClickView("Will Draw"));
	CloseBy("btnCancel", "View Flags");
	EXPECT_EQ(Value("Flags"), "B_WILL_DRAW");
}


TEST_F(PropertyDialogsTest, EscapeCancelsAndEnterConfirms)
{
	Open("Flags", "B_WILL_DRAW", "View Flags");
	EXPECT_TRUE(robot.ClickView("Navigable"));
	EXPECT_TRUE(robot.Key("escape"));
	EXPECT_TRUE(robot.WaitForNoWindow("View Flags"));
	EXPECT_EQ(Value("Flags"), "B_WILL_DRAW");

	Open("Flags", "B_WILL_DRAW", "View Flags");
	EXPECT_TRUE(robot.ClickView("Navigable"));
	EXPECT_TRUE(robot.Key("enter"));
	EXPECT_TRUE(robot.WaitForNoWindow("View Flags"));
	EXPECT_EQ(Value("Flags"), "B_WILL_DRAW|B_NAVIGABLE");
}


TEST_F(PropertyDialogsTest, ADialogOutlivesItsComponent)
{
	Open("Flags", "B_WILL_DRAW", "View Flags");
	EXPECT_TRUE(robot.ClickView("Navigable"));
	window->Lock();
	control.reset();
	window->Unlock();
	CloseBy("btnOK", "View Flags");
}


TEST_F(PropertyDialogsTest, ADialogOutlivesTheFormsWindow)
{
	Open("Flags", "B_WILL_DRAW", "View Flags");
	QuitWindow(window);
	control.reset();
	CloseBy("btnOK", "View Flags");
	window = new SurfaceWindow;
	window->Show();
}


TEST_F(PropertyDialogsTest, TheDialogConfirmedLastWins)
{
	TPropertyEditor* editor = EditorOf("Flags", "");
	editor->ModalEdit();
	ASSERT_TRUE(robot.WaitForWindow("View Flags"));
	const BMessenger first = robot.Window();
	editor->ModalEdit();
	ASSERT_TRUE(robot.Settle());
	ASSERT_EQ(first.SendMessage(1), B_OK);
	for (int32 i = 0; first.IsValid() && i < 10000; i++)
		snooze(1000);
	ASSERT_FALSE(first.IsValid());
	// The other one is left.
	ASSERT_TRUE(robot.WaitForWindow("View Flags"));
	ASSERT_TRUE(robot.Settle());
	EXPECT_EQ(Value("Flags"), "");
	EXPECT_TRUE(robot.ClickView("Will Draw"));
	CloseBy("btnOK", "View Flags");
	EXPECT_EQ(Value("Flags"), "B_WILL_DRAW");
}


TEST_F(PropertyDialogsTest, AvoidFocusAlsoTicksOutlineResizeAndIsWrittenOnce)
{
	TProperty property(nullptr, "WindowFlags", "B_AVOID_FOCUS", nullptr, true);
	TWindowFlagsProperty editor(nullptr, &property);
	EXPECT_TRUE(editor.ModalEdit());
	ASSERT_TRUE(robot.WaitForWindow("Window Flags"));
	EXPECT_EQ(robot.Value("Avoids focus"), 1);
	EXPECT_EQ(robot.Value("Outline resize"), 1);
	EXPECT_EQ(robot.Value("Not movable"), 0);
	CapturedOutput output;
	CloseBy("btnOK", "Window Flags");
	EXPECT_STREQ(property.Value(), "B_AVOID_FOCUS");
	EXPECT_EQ(output.Text(), "B_AVOID_FOCUS\n");
}


TEST_F(PropertyDialogsTest, WindowFlagsAreWrittenInTheOrderOfTheBoxes)
{
	TProperty property(nullptr, "WindowFlags", "", nullptr, true);
	TWindowFlagsProperty editor(nullptr, &property);
	EXPECT_TRUE(editor.ModalEdit());
	ASSERT_TRUE(robot.WaitForWindow("Window Flags"));
	EXPECT_TRUE(robot.ClickView("Outline resize"));
	EXPECT_TRUE(robot.ClickView("Not anchored on activate"));
	EXPECT_TRUE(robot.ClickView("Not resizable"));
	EXPECT_TRUE(robot.ClickView("Not V. resizable"));
	CloseBy("btnOK", "Window Flags");
	EXPECT_STREQ(property.Value(), "B_NOT_V_RESIZABLE|B_NOT_RESIZABLE|B_NOT_ANCHORED_ON_ACTIVATE");
}


TEST_F(PropertyDialogsTest, WindowFlagsCanBeCancelled)
{
	TProperty property(nullptr, "WindowFlags", "B_NOT_MOVABLE", nullptr, true);
	TWindowFlagsProperty editor(nullptr, &property);
	EXPECT_TRUE(editor.ModalEdit());
	ASSERT_TRUE(robot.WaitForWindow("Window Flags"));
	EXPECT_TRUE(robot.ClickView("Not closable"));
	CloseBy("btnCancel", "Window Flags");
	EXPECT_STREQ(property.Value(), "B_NOT_MOVABLE");
}


TEST_F(PropertyDialogsTest, TheSynchronousWindowFlagsEditDoesNothing)
{
	uint32 flags = 7;
	char text[8] = "text";
	EXPECT_EQ(WFWModalEdit(&flags, text, sizeof(text)), 0);
	EXPECT_EQ(flags, 7u);
	EXPECT_STREQ(text, "text");
}


TEST_F(PropertyDialogsTest, AConfirmedColorIsWrittenAsText)
{
	CapturedOutput output;
	Open("ViewColor", "{216,216,216,255}", "Color");
	CloseBy("btnOK", "Color");
	EXPECT_EQ(Value("ViewColor"), "{216,216,216,255}");
	const std::string printed = output.Text();
	EXPECT_NE(printed.find("rgb_color = {216,216,216,255}\n"), std::string::npos);
	EXPECT_NE(printed.find("\n{216,216,216,255}\n"), std::string::npos);
}


TEST_F(PropertyDialogsTest, AChosenColorIsShownAndReachesTheView)
{
	Open("ViewColor", "{10,20,30,255}", "Color");
	BPoint preview;
	ASSERT_TRUE(robot.FindView("boxPreview", &preview));
	const WindowPicture before = robot.Picture();
	const rgb_color shown = before.At(static_cast<int32>(preview.x), static_cast<int32>(preview.y));
	EXPECT_EQ(shown.red, 10);
	EXPECT_EQ(shown.green, 20);
	EXPECT_EQ(shown.blue, 30);

	// A click on the first ramp changes the colour, and the box follows.
	BPoint colors;
	ASSERT_TRUE(robot.FindView("ccColors", &colors));
	robot.Click(BPoint(colors.x - 60, colors.y));
	ASSERT_TRUE(robot.Settle());
	const WindowPicture after = robot.Picture();
	const rgb_color changed =
		after.At(static_cast<int32>(preview.x), static_cast<int32>(preview.y));
	EXPECT_FALSE(changed == shown);
	CloseBy("btnOK", "Color");
	char text[kColorTextSize];
	EXPECT_EQ(Value("ViewColor"), RGBColorToStr(changed, text));
	window->Lock();
	EXPECT_TRUE(control->DTView()->ViewColor() == changed);
	window->Unlock();
}


TEST_F(PropertyDialogsTest, ACancelledColorIsForgotten)
{
	Open("HighColor", "{1,2,3,255}", "Color");
	BPoint colors;
	ASSERT_TRUE(robot.FindView("ccColors", &colors));
	robot.Click(colors);
	CloseBy("btnCancel", "Color");
	EXPECT_EQ(Value("HighColor"), "{1,2,3,255}");
}

// SPDX-License-Identifier: MIT
// Tests of the form component.

#include "model/FormComponent.h"

#include <String.h>
#include <gtest/gtest.h>

#include "model/Event.h"
#include "model/Property.h"
#include "model/PropertyStore.h"
#include "props/FlagsProperty.h"
#include "props/PickListProperty.h"
#include "props/StringProperty.h"
#include "support/CapturedOutput.h"
#include "support/TidyComponent.h"

namespace {

class FormComponentTest : public testing::Test {
protected:
	FormComponentTest()
	{
		fForm.SetComponentName("Form1");
		fForm.InitPropertyList();
		fForm.InitEventList();
	}

	CapturedOutput fOutput;
	TidyComponent<TFormComponent> fForm;
};

} // namespace

TEST_F(FormComponentTest, ANewOneIsEmptyUntilItIsSetUp)
{
	const TFormComponent form;
	EXPECT_EQ(form.Owner(), nullptr);
	EXPECT_EQ(form.Designer(), nullptr);
	EXPECT_EQ(form.ComponentType(), 0);
	EXPECT_EQ(form.CountProperties(), 0);
	EXPECT_EQ(form.CountEvents(), 0);
}


TEST_F(FormComponentTest, TheWindowsPropertiesFollowThoseOfAView)
{
	const struct {
		const char* name;
		const char* value;
		bool quoted;
	} kRows[] = {
		{"Title", "Form", true},
		{"WindowLook", "B_TITLED_WINDOW_LOOK", false},
		{"WindowFeel", "B_NORMAL_WINDOW_FEEL", false},
		{"WindowFlags", "", false},
	};
	ASSERT_EQ(fForm.CountProperties(), 16);
	EXPECT_STREQ(fForm.PropertyAt(11)->Name(), "FontSize");
	for (int32 i = 0; i < 4; i++) {
		const TProperty* property = fForm.PropertyAt(12 + i);
		EXPECT_STREQ(property->Name(), kRows[i].name);
		EXPECT_STREQ(property->Value(), kRows[i].value) << kRows[i].name;
		EXPECT_TRUE(property->IsGenerated()) << kRows[i].name;
		EXPECT_EQ(property->IsQuoted(), kRows[i].quoted) << kRows[i].name;
	}
	EXPECT_NE(dynamic_cast<TStringProperty*>(fForm.PropertyAt(12)->Editor()), nullptr);
	EXPECT_NE(dynamic_cast<TWindowLookProperty*>(fForm.PropertyAt(13)->Editor()), nullptr);
	EXPECT_NE(dynamic_cast<TWindowFeelProperty*>(fForm.PropertyAt(14)->Editor()), nullptr);
	EXPECT_NE(dynamic_cast<TWindowFlagsProperty*>(fForm.PropertyAt(15)->Editor()), nullptr);
}


TEST_F(FormComponentTest, TheTitleIsGeneratedQuotedAndTheLookPlain)
{
	EXPECT_STREQ(
		fForm.FindProperty("Title")->SetStatement().String(), "Form1->SetTitle(\"Form\");");
	EXPECT_STREQ(fForm.FindProperty("WindowLook")->SetStatement().String(),
		"Form1->SetWindowLook(B_TITLED_WINDOW_LOOK);");
}


TEST_F(FormComponentTest, TheWindowFlagsAreDefaultUntilOneIsChosen)
{
	const TProperty* flags = fForm.FindProperty("WindowFlags");
	EXPECT_TRUE(flags->IsDefValue());
	fForm.SetPropertyValue("WindowFlags", "B_NOT_MOVABLE");
	EXPECT_FALSE(flags->IsDefValue());
	fForm.SetPropertyValue("WindowFlags", "");
	EXPECT_TRUE(flags->IsDefValue());
}


TEST_F(FormComponentTest, TheEventsFollowThoseOfAView)
{
	const struct {
		const char* name;
		const char* parameters;
		const char* returnType;
	} kRows[] = {
		{"OnMenusBeginning", "", ""},
		{"OnMenusEnded", "", ""},
		{"OnOpenViewTransaction", "", ""},
		{"OnCommitViewTransaction", "", ""},
		{"OnQuit", "", ""},
		{"OnScreenChanged", "BRect frame, color_space mode", ""},
		{"OnShow", "", ""},
		{"OnHide", "", ""},
		{"OnMinimize", "bool minimize", ""},
		{"OnZoom", "BPoint origin, float width, float height", ""},
		{"OnWindowActivated", "bool active", ""},
		{"OnWorkspaceActivated", "int32 workspace, bool active", ""},
		{"OnWorkspacesChanged", "uint32 oldWorkspaces, uint32 newWorkspaces", ""},
		{"OnQuitRequested", "", "bool"},
	};
	ASSERT_EQ(fForm.CountEvents(), 27);
	EXPECT_STREQ(fForm.EventAt(0)->name, "OnAllAttached");
	EXPECT_STREQ(fForm.EventAt(12)->name, "OnMouseMoved");
	for (int32 i = 0; i < 14; i++) {
		const TEvent* event = fForm.EventAt(13 + i);
		EXPECT_STREQ(event->name, kRows[i].name);
		EXPECT_STREQ(event->parameters != nullptr ? event->parameters : "", kRows[i].parameters);
		EXPECT_STREQ(event->returnType != nullptr ? event->returnType : "", kRows[i].returnType);
		EXPECT_FALSE(event->selected) << event->name;
	}
}


TEST_F(FormComponentTest, WindowValuesHaveFallbacksButNotTheFlags)
{
	EXPECT_STREQ(fForm.GetPropertyValue("Title"), "Form");
	EXPECT_STREQ(fForm.GetPropertyValue("WindowLook"), "B_TITLED_WINDOW_LOOK");
	EXPECT_STREQ(fForm.GetPropertyValue("WindowFeel"), "B_NORMAL_WINDOW_FEEL");
	EXPECT_EQ(fForm.GetPropertyValue("WindowFlags"), nullptr);
	EXPECT_EQ(fOutput.Text(), "");
}


TEST_F(FormComponentTest, WindowValuesAreStored)
{
	for (const char* name : {"Title", "WindowLook", "WindowFeel", "WindowFlags"}) {
		fForm.SetPropertyValue(name, "value");
		EXPECT_STREQ(fForm.GetPropertyValue(name), "value") << name;
		EXPECT_STREQ(fForm.FindProperty(name)->Value(), "value") << name;
	}
	EXPECT_TRUE(fForm.Modified());
	EXPECT_EQ(fOutput.Text(), "");
}


TEST_F(FormComponentTest, OtherNamesAreThoseOfAView)
{
	EXPECT_STREQ(fForm.GetPropertyValue("ViewColor"), "{216,216,216,255}");
	fForm.SetPropertyValue("Left", "20");
	EXPECT_STREQ(fForm.GetPropertyValue("Left"), "20");
	fForm.SetPropertyValue("Title", nullptr);
	fForm.SetPropertyValue(nullptr, "x");
	EXPECT_EQ(fForm.GetPropertyValue(nullptr), nullptr);
	EXPECT_STREQ(fForm.GetPropertyValue("Title"), "Form");
}

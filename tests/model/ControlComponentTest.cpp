// SPDX-License-Identifier: MIT
// Tests of the control component without a view. Those that need a window are in DesignViewTest.cpp.

#include "model/ControlComponent.h"

#include <String.h>
#include <gtest/gtest.h>

#include "model/Property.h"
#include "model/PropertyStore.h"
#include "props/PickListProperty.h"
#include "props/StringProperty.h"
#include "support/CapturedOutput.h"
#include "support/TidyComponent.h"

namespace {

class TKnobComponent : public TidyComponent<TControlComponent> {
public:
	TKnobComponent()
		: TidyComponent<TControlComponent>(nullptr, nullptr, CT_APPLICATION)
	{
	}
};


class ControlComponentTest : public testing::Test {
protected:
	ControlComponentTest()
	{
		fControl.SetComponentName("Knob1");
		fControl.InitPropertyList();
		fControl.InitEventList();
	}

	CapturedOutput fOutput;
	TKnobComponent fControl;
};

} // namespace

TEST_F(ControlComponentTest, TheTypeArgumentIsIgnored)
{
	EXPECT_EQ(fControl.ComponentType(), 0);
}


TEST_F(ControlComponentTest, ThreePropertiesFollowThoseOfAView)
{
	ASSERT_EQ(fControl.CountProperties(), 15);
	const TProperty* enabled = fControl.PropertyAt(12);
	const TProperty* label = fControl.PropertyAt(13);
	const TProperty* mode = fControl.PropertyAt(14);

	EXPECT_STREQ(enabled->Name(), "Enabled");
	EXPECT_STREQ(enabled->Value(), "true");
	EXPECT_TRUE(enabled->IsGenerated());
	EXPECT_FALSE(enabled->IsQuoted());
	EXPECT_NE(dynamic_cast<TBoolProperty*>(enabled->Editor()), nullptr);

	EXPECT_STREQ(label->Name(), "Label");
	EXPECT_STREQ(label->Value(), "");
	EXPECT_TRUE(label->IsGenerated());
	EXPECT_TRUE(label->IsQuoted());
	EXPECT_STREQ(label->SetStatement().String(), "Knob1->SetLabel(\"\");");
	EXPECT_NE(dynamic_cast<TStringProperty*>(label->Editor()), nullptr);

	EXPECT_STREQ(mode->Name(), "ResizingMode");
	EXPECT_STREQ(mode->Value(), "B_FOLLOW_NONE");
	EXPECT_TRUE(mode->IsGenerated());
	EXPECT_FALSE(mode->IsQuoted());
	EXPECT_NE(dynamic_cast<TResizingModeProperty*>(mode->Editor()), nullptr);
}


TEST_F(ControlComponentTest, ItAddsNoEvents)
{
	EXPECT_EQ(fControl.CountEvents(), 13);
}


TEST_F(ControlComponentTest, ValuesHaveFallbacks)
{
	EXPECT_STREQ(fControl.GetPropertyValue("ResizingMode"), "B_FOLLOW_NONE");
	EXPECT_STREQ(fControl.GetPropertyValue("Enabled"), "true");
	EXPECT_STREQ(fControl.GetPropertyValue("Flags"), "B_WILL_DRAW|B_NAVIGABLE");
	EXPECT_EQ(fOutput.Text(),
		"TControlComponent::GetPropertyValue('ResizingMode')\n"
		"TControlComponent::GetPropertyValue('Enabled')\n"
		"TControlComponent::GetPropertyValue('Flags')\n");
}


TEST_F(ControlComponentTest, StoredValuesWin)
{
	for (const char* name : {"ResizingMode", "Enabled", "Flags", "ViewColor", "Label"}) {
		fControl.SetPropertyValue(name, "value");
		EXPECT_STREQ(fControl.GetPropertyValue(name), "value") << name;
	}
}


TEST_F(ControlComponentTest, ALabelWithoutAViewWarnsAndIsStored)
{
	fControl.SetPropertyValue("Label", "OK");
	EXPECT_EQ(fOutput.Text(),
		"TControlComponent::SetPropertyValue('Label', 'OK')\n"
		"Warning: TKnobComponent::DTView() not set\n");
	EXPECT_STREQ(fControl.FindProperty("Label")->Value(), "OK");
	EXPECT_STREQ(fControl.PropertyStore()->FindString("Label"), "OK");
	EXPECT_TRUE(fControl.Modified());
}


TEST_F(ControlComponentTest, OtherNamesAreThoseOfAView)
{
	fControl.SetPropertyValue("Name", "Wheel");
	fControl.SetPropertyValue("Left", "20");
	EXPECT_STREQ(fControl.ComponentName(), "Wheel");
	EXPECT_STREQ(fControl.FindProperty("Left")->Value(), "20");
	EXPECT_EQ(fOutput.Text(),
		"TControlComponent::SetPropertyValue('Name', 'Wheel')\n"
		"TComponent::SetPropertyValue('Name', 'Wheel')\n"
		"TControlComponent::SetPropertyValue('Left', '20')\n"
		"TComponent::SetPropertyValue('Left', '20')\n");
}


TEST_F(ControlComponentTest, MissingNamesAndValuesDoNothing)
{
	fControl.SetPropertyValue("Label", nullptr);
	fControl.SetPropertyValue(nullptr, "x");
	EXPECT_TRUE(fControl.PropertyStore()->IsEmpty());
	EXPECT_EQ(fOutput.Text(),
		"TControlComponent::SetPropertyValue('Label', '(null)')\n"
		"TControlComponent::SetPropertyValue('(null)', 'x')\n");
}

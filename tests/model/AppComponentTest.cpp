// SPDX-License-Identifier: MIT
// Tests of the application component.

#include "model/AppComponent.h"

#include <string>

#include <String.h>
#include <gtest/gtest.h>

#include "model/Event.h"
#include "model/Property.h"
#include "model/PropertyStore.h"
#include "props/PickListProperty.h"
#include "props/StringProperty.h"
#include "support/CapturedOutput.h"
#include "support/TidyComponent.h"

namespace {

class AppComponentTest : public testing::Test {
protected:
	CapturedOutput fOutput;
	TidyComponent<TAppComponent> fApp;
};

} // namespace

TEST_F(AppComponentTest, ANewOneHasTypeAndClassName)
{
	EXPECT_EQ(fApp.ComponentType(), 1);
	EXPECT_STREQ(fApp.ClassName(), "TMyApplication");
	EXPECT_STREQ(fApp.ComponentName(), "");
	EXPECT_EQ(fApp.Owner(), nullptr);
	EXPECT_EQ(fApp.Designer(), nullptr);
	EXPECT_FALSE(fApp.Modified());
	EXPECT_EQ(fApp.CountComponents(), 0);
}


TEST_F(AppComponentTest, ThePropertiesStandInOrder)
{
	const struct {
		const char* name;
		const char* value;
		bool generated;
		bool quoted;
	} kRows[] = {
		{"Name", "", false, true},
		{"ClassName", "TMyApplication", true, false},
		{"Signature", "application/x-vnd.MyApp", true, false},
		{"LaunchFlags", "B_SINGLE_LAUNCH", true, false},
		{"GenerationPath", "/boot/home/MyApp", true, false},
	};
	ASSERT_EQ(fApp.CountProperties(), 5);
	for (int32 i = 0; i < 5; i++) {
		const TProperty* property = fApp.PropertyAt(i);
		EXPECT_STREQ(property->Name(), kRows[i].name);
		EXPECT_STREQ(property->Value(), kRows[i].value) << kRows[i].name;
		EXPECT_TRUE(property->IsDefValue()) << kRows[i].name;
		EXPECT_EQ(property->IsGenerated(), kRows[i].generated) << kRows[i].name;
		EXPECT_EQ(property->IsQuoted(), kRows[i].quoted) << kRows[i].name;
		EXPECT_NE(property->Editor(), nullptr) << kRows[i].name;
	}
	EXPECT_NE(dynamic_cast<TLaunchFlagsProperty*>(fApp.PropertyAt(3)->Editor()), nullptr);
	for (int32 i : {1, 2, 4})
		EXPECT_NE(dynamic_cast<TStringProperty*>(fApp.PropertyAt(i)->Editor()), nullptr);
}


TEST_F(AppComponentTest, TheEventsStandInOrder)
{
	const struct {
		const char* name;
		const char* parameters;
		const char* returnType;
	} kRows[] = {
		{"OnAboutRequested", "", ""},
		{"OnAppActivated", "bool active", ""},
		{"OnArgvReceived", "int32 argc, char **argv", ""},
		{"OnPulse", "", ""},
		{"OnQuitRequested", "", "bool"},
		{"OnReadyToRun", "", ""},
		{"OnRefsReceived", "BMessage *message", ""},
	};
	ASSERT_EQ(fApp.CountEvents(), 7);
	for (int32 i = 0; i < 7; i++) {
		const TEvent* event = fApp.EventAt(i);
		EXPECT_STREQ(event->name, kRows[i].name);
		EXPECT_STREQ(event->parameters != nullptr ? event->parameters : "", kRows[i].parameters);
		EXPECT_STREQ(event->returnType != nullptr ? event->returnType : "", kRows[i].returnType);
		EXPECT_FALSE(event->selected);
	}
	EXPECT_FALSE(fApp.EventSelection("OnQuitRequested"));
}


TEST_F(AppComponentTest, UnstoredValuesDifferFromTheProperties)
{
	EXPECT_STREQ(fApp.GetPropertyValue("ClassName"), "TMyApp");
	EXPECT_STREQ(fApp.GetPropertyValue("Signature"), "application/x-vnd.MyApp");
	EXPECT_STREQ(fApp.GetPropertyValue("LaunchFlags"), "B_SINGLE_LAUNCH");
	EXPECT_STREQ(fApp.GetPropertyValue("GenerationPath"), "./MyApp");
	EXPECT_STREQ(fApp.FindProperty("ClassName")->Value(), "TMyApplication");
	EXPECT_TRUE(fApp.FindProperty("ClassName")->IsDefValue());
}


TEST_F(AppComponentTest, InitPropertyValuesShowsTheUnstoredValues)
{
	fApp.InitPropertyValues();
	EXPECT_STREQ(fApp.FindProperty("ClassName")->Value(), "TMyApp");
	EXPECT_STREQ(fApp.FindProperty("GenerationPath")->Value(), "./MyApp");
	EXPECT_STREQ(fApp.FindProperty("ClassName")->DefValue(), "TMyApplication");
}


TEST_F(AppComponentTest, AStoredValueWins)
{
	fApp.SetPropertyValue("Signature", "application/x-vnd.Mine");
	EXPECT_STREQ(fApp.GetPropertyValue("Signature"), "application/x-vnd.Mine");
	EXPECT_STREQ(fApp.FindProperty("Signature")->Value(), "application/x-vnd.Mine");
	EXPECT_TRUE(fApp.Modified());
}


TEST_F(AppComponentTest, TheClassNameOfTheComponentStays)
{
	fApp.SetPropertyValue("ClassName", "TOther");
	EXPECT_STREQ(fApp.GetPropertyValue("ClassName"), "TOther");
	EXPECT_STREQ(fApp.ClassName(), "TMyApplication");
}


TEST_F(AppComponentTest, SettingTheNameRenames)
{
	fApp.SetPropertyValue("Name", "Painter");
	EXPECT_STREQ(fApp.ComponentName(), "Painter");
	EXPECT_STREQ(fApp.GetPropertyValue("Name"), "Painter");
}


TEST_F(AppComponentTest, OtherNamesAreStored)
{
	fApp.SetPropertyValue("Extra", "x");
	EXPECT_STREQ(fApp.GetPropertyValue("Extra"), "x");
	EXPECT_EQ(fApp.GetPropertyValue("Unknown"), nullptr);
	fApp.SetPropertyValue("ClassName", nullptr);
	fApp.SetPropertyValue(nullptr, nullptr);
	EXPECT_STREQ(fApp.GetPropertyValue("ClassName"), "TMyApp");
}


TEST_F(AppComponentTest, ReadingAndWritingArePrinted)
{
	fApp.GetPropertyValue("ClassName");
	fApp.GetPropertyValue("Name");
	fApp.SetPropertyValue("Signature", "s");
	fApp.SetPropertyValue("Name", "n");
	EXPECT_EQ(fOutput.Text(),
		"TAppComponent::GetPropertyValue('ClassName')\n"
		"TAppComponent::GetPropertyValue('Name')\n"
		"TComponent::GetPropertyValue('Name')\n"
		"TAppComponent::SetPropertyValue('Signature', 's')\n"
		"TAppComponent::SetPropertyValue('Name', 'n')\n"
		"TComponent::SetPropertyValue('Name', 'n')\n");
}


TEST_F(AppComponentTest, ItOwnsForms)
{
	TComponent form(nullptr, nullptr, CT_VISUAL);
	fApp.AddComponent(&form);
	EXPECT_EQ(form.Owner(), static_cast<TComponentOwner*>(&fApp));
	EXPECT_EQ(fApp.ComponentAt(0), &form);
}

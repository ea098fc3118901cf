// SPDX-License-Identifier: MIT
// Tests of what every component has: names, lists, stored values, hooks.

#include "model/Component.h"

#include <cstring>
#include <memory>
#include <string>
#include <vector>

#include <Point.h>
#include <Rect.h>
#include <String.h>
#include <gtest/gtest.h>

#include "model/ComponentOwner.h"
#include "model/Event.h"
#include "model/Property.h"
#include "model/PropertyStore.h"
#include "props/StringProperty.h"
#include "support/CapturedOutput.h"
#include "support/TidyComponent.h"

namespace {

/// Writes down what it is asked, and may refuse.
class TVetoComponent : public TComponent {
public:
	TVetoComponent()
		: TComponent(nullptr, nullptr, CT_VISUAL)
	{
	}

	bool PropertyModified(const char* name, const char* oldValue, const char* newValue) override
	{
		fAsked.push_back(std::string(name) + ": " + oldValue + " -> "
			+ (newValue != nullptr ? newValue : "(none)"));
		return fAccepts;
	}

	bool fAccepts = true;
	std::vector<std::string> fAsked;
};


class TVetoOwner : public TComponentOwner {
public:
	bool ComponentPropertyModified(TComponent* component, const char* name, const char* oldValue,
		const char* newValue) override
	{
		fAsked.push_back(std::string(component->ComponentName()) + "." + name + ": " + oldValue
			+ " -> " + newValue + (component->Modified() ? " (modified)" : ""));
		return fAccepts;
	}

	bool fAccepts = true;
	std::vector<std::string> fAsked;
};


class ComponentTest : public testing::Test {
protected:
	ComponentTest()
		: fLabel(&fComponent, "Label", "OK", nullptr, true)
	{
		fComponent.SetComponentName("Button1");
		fComponent.AddProperty(&fLabel);
	}

	~ComponentTest() override
	{
		// Of what a test put into the list, the component deletes only what it made itself.
		TProperty* first = fComponent.PropertyAt(0);
		fComponent.ClearProperties(false);
		if (first != nullptr && first != &fLabel)
			fComponent.AddProperty(first);
	}

	const char* Stored(const char* name) { return fComponent.PropertyStore()->FindString(name); }

	CapturedOutput fOutput;
	TidyComponent<TVetoComponent> fComponent;
	TProperty fLabel;
};

} // namespace

TEST_F(ComponentTest, ANewComponentIsBlank)
{
	TComponentOwner owner;
	const TComponent component(&owner, nullptr, CT_APPLICATION);
	EXPECT_STREQ(component.ComponentName(), "");
	EXPECT_STREQ(component.ClassName(), "");
	EXPECT_EQ(component.Owner(), &owner);
	EXPECT_EQ(owner.CountComponents(), 0);
	EXPECT_EQ(component.Designer(), nullptr);
	EXPECT_EQ(component.ComponentType(), CT_APPLICATION);
	EXPECT_EQ(component.ComponentMode(), 1);
	EXPECT_FALSE(component.Modified());
	EXPECT_FALSE(component.IsDesignerSelected());
	EXPECT_EQ(component.DTView(), nullptr);
	EXPECT_EQ(component.CountProperties(), 0);
	EXPECT_EQ(component.CountEvents(), 0);
	ASSERT_NE(component.PropertyStore(), nullptr);
	EXPECT_EQ(component.PropertyStore()->Component(), &component);
	EXPECT_EQ(component.PropertyStore()->what, uint32('prop'));
}


TEST_F(ComponentTest, AccessorsReturnWhatWasSet)
{
	fComponent.SetComponentType(static_cast<TComponentType>(7));
	fComponent.SetComponentMode(static_cast<TComponentMode>(9));
	fComponent.DesignerSelect(true);
	fComponent.SetModified(true);
	TComponentOwner owner;
	fComponent.SetOwner(&owner);
	EXPECT_EQ(fComponent.ComponentType(), 7);
	EXPECT_EQ(fComponent.ComponentMode(), 9);
	EXPECT_TRUE(fComponent.IsDesignerSelected());
	EXPECT_TRUE(fComponent.Modified());
	EXPECT_EQ(fComponent.Owner(), &owner);
}


TEST_F(ComponentTest, NamesAreCutAndNullIsIgnored)
{
	fComponent.SetComponentName(std::string(2000, 'n').c_str());
	EXPECT_EQ(fComponent.ComponentName(), std::string(1023, 'n'));
	fComponent.SetComponentName(nullptr);
	EXPECT_EQ(fComponent.ComponentName(), std::string(1023, 'n'));
	fComponent.SetComponentName(fComponent.ComponentName() + 1000);
	EXPECT_EQ(fComponent.ComponentName(), std::string(23, 'n'));

	fComponent.SetClassName(std::string(40, 'c').c_str());
	EXPECT_EQ(fComponent.ClassName(), std::string(31, 'c'));
	fComponent.SetClassName(nullptr);
	EXPECT_EQ(fComponent.ClassName(), std::string(31, 'c'));
	fComponent.SetClassName("TButton");
	EXPECT_STREQ(fComponent.ClassName(), "TButton");
}


TEST_F(ComponentTest, NamesOfAnyLengthTakeTurns)
{
	for (size_t length : {0, 1, 38, 39, 40, 41, 1023, 5, 200}) {
		const std::string name(length, 'n');
		fComponent.SetComponentName(name.c_str());
		EXPECT_EQ(fComponent.ComponentName(), name);
	}
	// A part of the short name, and one that stays valid when a long one comes.
	fComponent.SetComponentName(fComponent.ComponentName() + 195);
	EXPECT_STREQ(fComponent.ComponentName(), "nnnnn");
	TComponent other(nullptr, nullptr, CT_VISUAL);
	other.SetComponentName("short");
	const char* given = other.ComponentName();
	other.SetComponentName(std::string(100, 'l').c_str());
	EXPECT_STREQ(given, "short");
}


TEST_F(ComponentTest, TheBaseListHasTheNameOnly)
{
	fComponent.ClearProperties(false);
	fComponent.PropertyStore()->SetString("Left", "5");
	fComponent.InitPropertyList();

	EXPECT_TRUE(fComponent.PropertyStore()->IsEmpty());
	ASSERT_EQ(fComponent.CountProperties(), 1);
	TProperty* name = fComponent.PropertyAt(0);
	EXPECT_STREQ(name->Name(), "Name");
	EXPECT_STREQ(name->Value(), "Button1");
	EXPECT_STREQ(name->DefValue(), "Button1");
	EXPECT_FALSE(name->IsGenerated());
	EXPECT_TRUE(name->IsQuoted());
	EXPECT_STREQ(name->SetStatement().String(), "Button1->SetName(\"Button1\");");
	ASSERT_NE(dynamic_cast<TNameProperty*>(name->Editor()), nullptr);
	EXPECT_EQ(name->Editor()->Property(), name);
	EXPECT_EQ(name->Editor()->Component(), &fComponent);
}


TEST_F(ComponentTest, SettingTheNameRenames)
{
	fComponent.ClearProperties(false);
	fComponent.InitPropertyList();
	fComponent.SetPropertyValue("Name", "Knob");
	EXPECT_STREQ(fComponent.ComponentName(), "Knob");
	EXPECT_STREQ(fComponent.FindProperty("Name")->Value(), "Knob");
	EXPECT_STREQ(Stored("Name"), "Knob");
	EXPECT_STREQ(fComponent.GetPropertyValue("Name"), "Knob");
}


TEST_F(ComponentTest, AnUnlistedPropertyIsKeptInTheStore)
{
	EXPECT_EQ(fComponent.GetPropertyValue("Extra"), nullptr);
	fComponent.SetPropertyValue("Extra", "value");
	EXPECT_STREQ(fComponent.GetPropertyValue("Extra"), "value");
	EXPECT_EQ(fComponent.FindProperty("Extra"), nullptr);
	EXPECT_TRUE(fComponent.fAsked.empty());
	EXPECT_FALSE(fComponent.Modified());
}


TEST_F(ComponentTest, StoringAChangeAsksAndMarksModified)
{
	TVetoOwner owner;
	fComponent.SetOwner(&owner);
	fComponent.StoreProperty("Label", "Cancel");

	EXPECT_STREQ(fLabel.Value(), "Cancel");
	EXPECT_STREQ(Stored("Label"), "Cancel");
	EXPECT_TRUE(fComponent.Modified());
	EXPECT_EQ(fComponent.fAsked, std::vector<std::string>{"Label: OK -> Cancel"});
	EXPECT_EQ(owner.fAsked, std::vector<std::string>{"Button1.Label: OK -> Cancel"});
}


TEST_F(ComponentTest, StoringTheSameValueNotifiesNobody)
{
	TVetoOwner owner;
	fComponent.SetOwner(&owner);
	fComponent.StoreProperty("Label", "OK");

	EXPECT_STREQ(Stored("Label"), "OK");
	EXPECT_FALSE(fComponent.Modified());
	EXPECT_TRUE(fComponent.fAsked.empty());
	EXPECT_TRUE(owner.fAsked.empty());
}


TEST_F(ComponentTest, ARefusalByTheComponentStoresNothing)
{
	TVetoOwner owner;
	fComponent.SetOwner(&owner);
	fComponent.fAccepts = false;
	fComponent.StoreProperty("Label", "Cancel");

	EXPECT_STREQ(fLabel.Value(), "OK");
	EXPECT_EQ(Stored("Label"), nullptr);
	EXPECT_FALSE(fComponent.Modified());
	EXPECT_TRUE(owner.fAsked.empty());
}


TEST_F(ComponentTest, ARefusalByTheOwnerStoresButDoesNotMarkModified)
{
	TVetoOwner owner;
	owner.fAccepts = false;
	fComponent.SetOwner(&owner);
	fComponent.StoreProperty("Label", "Cancel");

	EXPECT_STREQ(fLabel.Value(), "Cancel");
	EXPECT_STREQ(Stored("Label"), "Cancel");
	EXPECT_FALSE(fComponent.Modified());
	EXPECT_EQ(owner.fAsked.size(), 1u);
}


TEST_F(ComponentTest, TheStoreHasWhatWasStoredInTheOrderOfStoring)
{
	TProperty color(&fComponent, "Color", "red", nullptr, true);
	fComponent.AddProperty(&color);
	fComponent.StoreProperty("Color", "blue");
	fComponent.StoreProperty("Label", "Cancel");
	fComponent.StoreProperty("Color", "green");
	EXPECT_STREQ(color.Value(), "green");
	fComponent.StoreProperty("Unlisted", "kept");
	fComponent.StoreProperty("Label", "Close");

	const char* const names[] = {"Color", "Label", "Unlisted"};
	const char* const values[] = {"green", "Close", "kept"};
	EXPECT_EQ(fComponent.PropertyStore()->CountNames(B_ANY_TYPE), 3);
	for (int32 i = 0; i < 3; i++) {
		char* name;
		type_code type;
		ASSERT_EQ(fComponent.PropertyStore()->GetInfo(B_STRING_TYPE, i, &name, &type), B_OK);
		EXPECT_STREQ(name, names[i]);
		EXPECT_STREQ(Stored(name), values[i]);
	}
	fComponent.StoreProperty("Color", "white");
	EXPECT_STREQ(Stored("Color"), "white");
	fComponent.RemoveProperty(&color);
}


TEST_F(ComponentTest, TheStoreKeepsWhatThePropertyHasNoLonger)
{
	fComponent.StoreProperty("Label", "Cancel");
	fLabel.SetValue("typed");
	EXPECT_STREQ(Stored("Label"), "Cancel");

	TComponent filled(nullptr, nullptr, CT_VISUAL);
	TProperty* label = new TProperty(&filled, "Label", "", nullptr, true);
	filled.AddProperty(label);
	filled.StoreProperty("Label", "Cancel");
	label->FillValue("typed");
	EXPECT_STREQ(filled.PropertyStore()->FindString("Label"), "Cancel");

	TComponent emptied(nullptr, nullptr, CT_VISUAL);
	emptied.AddProperty(new TProperty(&emptied, "Label", "", nullptr, true));
	emptied.AddProperty(new TProperty(&emptied, "Text", "", nullptr, true));
	emptied.StoreProperty("Text", "stored");
	emptied.StoreProperty("Label", "Cancel");
	emptied.AddProperty(emptied.RemoveProperty(int32(1)));
	EXPECT_STREQ(emptied.PropertyStore()->FindString("Text"), "stored");
	emptied.StoreProperty("Label", "Close");
	emptied.ClearProperties(true);
	EXPECT_STREQ(emptied.PropertyStore()->FindString("Label"), "Close");
	emptied.InitPropertyList();
	EXPECT_TRUE(emptied.PropertyStore()->IsEmpty());
}


TEST_F(ComponentTest, TheStoreIsFilledWhenAPropertyThatWasNeverStoredHasGone)
{
	// Not in the memory that properties share, so that a checker of memory sees it go.
	auto gone = std::make_shared<TProperty>(&fComponent, "Gone", "", nullptr, true);
	fComponent.AddProperty(gone.get());
	fComponent.StoreProperty("Label", "Cancel");
	gone.reset();
	EXPECT_STREQ(Stored("Label"), "Cancel");
	EXPECT_EQ(fComponent.PropertyStore()->CountNames(B_ANY_TYPE), 1);
}


TEST_F(ComponentTest, APropertyOfAnotherComponentIsStoredHere)
{
	TComponent other(nullptr, nullptr, CT_VISUAL);
	TProperty foreign(&other, "Foreign", "", nullptr, true);
	fComponent.AddProperty(&foreign);
	fComponent.StoreProperty("Foreign", "value");
	foreign.SetValue("typed");
	EXPECT_STREQ(Stored("Foreign"), "value");
	EXPECT_TRUE(other.PropertyStore()->IsEmpty());
	fComponent.RemoveProperty(&foreign);
}


TEST_F(ComponentTest, ValueAndStoreAgreeForLongTexts)
{
	fComponent.StoreProperty("Label", std::string(2000, 'x').c_str());
	EXPECT_EQ(fLabel.Value(), std::string(1023, 'x'));
	EXPECT_EQ(Stored("Label"), std::string(1023, 'x'));

	// The part that does not fit makes no change.
	fComponent.fAsked.clear();
	fComponent.StoreProperty("Label", std::string(3000, 'x').c_str());
	EXPECT_TRUE(fComponent.fAsked.empty());
}


TEST_F(ComponentTest, MissingNamesAndValuesDoNothing)
{
	fComponent.StoreProperty(nullptr, "x");
	fComponent.StoreProperty("Label", nullptr);
	fComponent.SetPropertyValue(nullptr, "x");
	fComponent.SetPropertyValue("Label", nullptr);
	fComponent.SetPropertyValue("Name", nullptr);
	EXPECT_EQ(fComponent.GetPropertyValue(nullptr), nullptr);
	fComponent.SetEventSelection(nullptr, true);
	EXPECT_FALSE(fComponent.EventSelection(nullptr));
	EXPECT_EQ(fComponent.FindProperty(nullptr), nullptr);
	EXPECT_EQ(fComponent.FindEvent(nullptr), nullptr);
	EXPECT_STREQ(fLabel.Value(), "OK");
	EXPECT_STREQ(fComponent.ComponentName(), "Button1");
	EXPECT_TRUE(fComponent.PropertyStore()->IsEmpty());
}


TEST_F(ComponentTest, ReadingAndWritingArePrinted)
{
	fComponent.GetPropertyValue("Label");
	fComponent.SetPropertyValue("Label", "100%");
	fComponent.SetPropertyValue("Label", nullptr);
	EXPECT_EQ(fOutput.Text(),
		"TComponent::GetPropertyValue('Label')\n"
		"TComponent::SetPropertyValue('Label', '100%')\n"
		"TComponent::SetPropertyValue('Label', '(null)')\n");
}


TEST_F(ComponentTest, AnEditorIsLinkedBothWays)
{
	TStringProperty editor(&fComponent, nullptr);
	TProperty property(&fComponent, "Text", "", nullptr, true);
	fComponent.AddPropAndEditor(&property, &editor, "set", nullptr, true);

	EXPECT_EQ(property.Editor(), &editor);
	EXPECT_EQ(editor.Property(), &property);
	EXPECT_STREQ(property.SetStatement().String(), "set");
	EXPECT_STREQ(property.GetStatement().String(), "Button1->Text()");
	EXPECT_TRUE(property.IsQuoted());
	EXPECT_EQ(fComponent.PropertyAt(1), &property);
	fComponent.ClearProperties(false);
}


TEST_F(ComponentTest, APropertyWithoutEditorIsOnlyAppended)
{
	TProperty property(&fComponent, "Text", "", nullptr, true);
	fComponent.AddPropAndEditor(&property, nullptr, "set", "get", true);

	EXPECT_EQ(fComponent.FindProperty("Text"), &property);
	EXPECT_FALSE(property.IsQuoted());
	EXPECT_STREQ(property.SetStatement().String(), "Button1->SetText();");
}


TEST_F(ComponentTest, TheFirstOfSeveralPropertiesWithOneNameIsFound)
{
	TProperty first(&fComponent, "Twin", "1", nullptr, true);
	TProperty second(&fComponent, "Twin", "2", nullptr, true);
	fComponent.AddProperty(&first);
	EXPECT_EQ(fComponent.FindProperty("Twin"), &first);
	fComponent.AddProperty(&second);
	EXPECT_EQ(fComponent.FindProperty("Twin"), &first);
	EXPECT_EQ(fComponent.FindProperty("twin"), nullptr);
	EXPECT_EQ(fComponent.FindProperty("Twins"), nullptr);
	EXPECT_EQ(fComponent.FindProperty("T"), nullptr);
	EXPECT_EQ(fComponent.FindProperty(""), nullptr);

	EXPECT_TRUE(fComponent.RemoveProperty(&first));
	EXPECT_EQ(fComponent.FindProperty("Twin"), &second);
	fComponent.AddProperty(&first);
	EXPECT_EQ(fComponent.FindProperty("Twin"), &second);
	EXPECT_EQ(fComponent.RemoveProperty(fComponent.CountProperties() - 2), &second);
	EXPECT_EQ(fComponent.FindProperty("Twin"), &first);
	fComponent.ClearProperties(false);
	EXPECT_EQ(fComponent.FindProperty("Twin"), nullptr);
}


TEST_F(ComponentTest, ARepeatedNameIsFoundFirstWhateverWasFoundBefore)
{
	TComponent component(nullptr, nullptr, CT_VISUAL);
	for (const char* name : {"A", "B", "A", "C", "B"})
		component.AddProperty(new TProperty(&component, name, "", nullptr, true));
	for (const char* name : {"A", "B", "A", "C", "B", "A", "A", "C", "A", "B", "C", "B", "A"}) {
		int32 first = 0;
		while (strcmp(component.PropertyAt(first)->Name(), name) != 0)
			first++;
		EXPECT_EQ(component.FindProperty(name), component.PropertyAt(first));
	}
	EXPECT_EQ(component.FindProperty("D"), nullptr);

	// What was found last moves when an entry before it goes.
	TProperty* const moved = component.PropertyAt(1);
	EXPECT_EQ(component.FindProperty("B"), moved);
	component.AddProperty(component.RemoveProperty(int32(0)));
	EXPECT_EQ(component.FindProperty("A"), component.PropertyAt(1));
	EXPECT_EQ(component.FindProperty("B"), moved);
	EXPECT_EQ(component.FindProperty("C"), component.PropertyAt(2));

	component.AddEvent(new TEvent("OnA", nullptr, nullptr, false));
	component.AddEvent(new TEvent("OnB", nullptr, nullptr, false));
	component.AddEvent(new TEvent("OnA", nullptr, nullptr, false));
	for (int32 round = 0; round < 2; round++) {
		EXPECT_EQ(component.FindEvent("OnB"), component.EventAt(1));
		EXPECT_EQ(component.FindEvent("OnA"), component.EventAt(0));
	}
}


TEST_F(ComponentTest, ANullPropertyIsHarmless)
{
	TStringProperty editor(&fComponent, nullptr);
	fComponent.AddPropAndEditor(nullptr, &editor, "set", "get", true);
	fComponent.AddPropAndEditor(nullptr, nullptr, nullptr, nullptr, false);
	TProperty behind(&fComponent, "Behind", "b", nullptr, true);
	fComponent.AddProperty(&behind);

	EXPECT_EQ(fComponent.CountProperties(), 4);
	EXPECT_EQ(fComponent.PropertyAt(1), nullptr);
	EXPECT_EQ(editor.Property(), nullptr);
	EXPECT_EQ(fComponent.FindProperty("Behind"), &behind);
	fComponent.InitPropertyValues();
	fComponent.StoreProperty("Behind", "c");
	EXPECT_STREQ(behind.Value(), "c");
}


TEST_F(ComponentTest, ClearingDeletesUpToTheFirstEmptyEntry)
{
	fComponent.ClearProperties(false);
	TProperty behind(&fComponent, "Behind", "b", nullptr, true);
	fComponent.AddProperty(new TProperty(&fComponent, "First", "", nullptr, true));
	fComponent.AddProperty(nullptr);
	fComponent.AddProperty(&behind);
	fComponent.ClearProperties(true);
	EXPECT_EQ(fComponent.CountProperties(), 0);
	EXPECT_STREQ(behind.Name(), "Behind");
}


TEST_F(ComponentTest, RemovedPropertiesAreNotDeleted)
{
	EXPECT_EQ(fComponent.RemoveProperty(int32(1)), nullptr);
	EXPECT_EQ(fComponent.RemoveProperty(int32(-1)), nullptr);
	EXPECT_FALSE(fComponent.RemoveProperty(static_cast<TProperty*>(nullptr)));
	EXPECT_TRUE(fComponent.RemoveProperty(&fLabel));
	EXPECT_FALSE(fComponent.RemoveProperty(&fLabel));
	EXPECT_EQ(fComponent.CountProperties(), 0);
	EXPECT_EQ(fComponent.PropertyAt(0), nullptr);

	fComponent.AddProperty(&fLabel);
	EXPECT_EQ(fComponent.RemoveProperty(int32(0)), &fLabel);
	EXPECT_STREQ(fLabel.Value(), "OK");
}


TEST_F(ComponentTest, FindingIsExactAndTakesTheFirst)
{
	TProperty second(&fComponent, "Label", "second", nullptr, true);
	fComponent.AddProperty(&second);
	EXPECT_EQ(fComponent.FindProperty("Label"), &fLabel);
	EXPECT_EQ(fComponent.FindProperty("label"), nullptr);
	EXPECT_EQ(fComponent.FindProperty("Label "), nullptr);
}


TEST_F(ComponentTest, EventsAreSelectedByName)
{
	fComponent.AddEvent(new TEvent("OnClick", nullptr, nullptr, false));
	fComponent.AddEvent(new TEvent("OnQuit", "bool now", "bool", false));
	EXPECT_FALSE(fComponent.EventSelection("OnQuit"));
	fComponent.SetEventSelection("OnQuit", true);
	fComponent.SetEventSelection("OnNothing", true);
	EXPECT_TRUE(fComponent.EventSelection("OnQuit"));
	EXPECT_FALSE(fComponent.EventSelection("OnClick"));
	EXPECT_FALSE(fComponent.EventSelection("OnNothing"));
	EXPECT_FALSE(fComponent.EventSelection("onquit"));

	const TEvent* event = fComponent.FindEvent("OnQuit");
	EXPECT_STREQ(event->parameters, "bool now");
	EXPECT_STREQ(event->returnType, "bool");
	EXPECT_EQ(fComponent.EventAt(1), event);

	fComponent.InitEventList();
	EXPECT_EQ(fComponent.CountEvents(), 0);
}


TEST_F(ComponentTest, RemovedEventsAreNotDeleted)
{
	TEvent event("OnClick", nullptr, nullptr, true);
	fComponent.AddEvent(&event);
	EXPECT_FALSE(fComponent.RemoveEvent(static_cast<TEvent*>(nullptr)));
	EXPECT_EQ(fComponent.RemoveEvent(int32(3)), nullptr);
	EXPECT_TRUE(fComponent.RemoveEvent(&event));
	fComponent.AddEvent(&event);
	EXPECT_EQ(fComponent.RemoveEvent(int32(0)), &event);
	EXPECT_EQ(fComponent.CountEvents(), 0);
	fComponent.AddEvent(&event);
	fComponent.ClearEvents(false);
	EXPECT_EQ(fComponent.EventAt(0), nullptr);
}


TEST_F(ComponentTest, InitPropertyValuesPassesStoredValuesToTheEditors)
{
	fComponent.ClearProperties(false);
	fComponent.InitPropertyList();
	TStringProperty editor(&fComponent, nullptr);
	TProperty text(&fComponent, "Text", "default", nullptr, true);
	fComponent.AddPropAndEditor(&text, &editor, nullptr, nullptr, false);
	fComponent.PropertyStore()->SetString("Text", "stored");
	fComponent.SetComponentName("Renamed");

	fComponent.InitPropertyValues();
	EXPECT_STREQ(text.Value(), "stored");
	EXPECT_STREQ(fComponent.FindProperty("Name")->Value(), "Renamed");
	EXPECT_STREQ(Stored("Name"), "Renamed");
	fComponent.RemoveProperty(&text);
}


TEST_F(ComponentTest, InitPropertyValuesKeepsWhatHasNoStoredValue)
{
	TStringProperty editor(&fComponent, nullptr);
	TProperty text(&fComponent, "Text", "default", nullptr, true);
	fComponent.AddPropAndEditor(&text, &editor, nullptr, nullptr, false);
	fComponent.InitPropertyValues();
	EXPECT_STREQ(text.Value(), "default");
	EXPECT_FALSE(fComponent.PropertyStore()->HasString("Text"));
	fComponent.ClearProperties(false);
}


TEST_F(ComponentTest, HooksAreNeutral)
{
	TComponent component(nullptr, nullptr, CT_VISUAL);
	BString text("kept");
	EXPECT_TRUE(component.PropertyModified("Label", "a", "b"));
	EXPECT_TRUE(component.CanDropOnDesignerAt(BPoint(1, 1)));
	EXPECT_FALSE(component.DefaultEditAction(BPoint(1, 1)));
	EXPECT_FALSE(component.HandleComponentContextMessage(nullptr));
	EXPECT_EQ(component.HeaderFile(), nullptr);
	EXPECT_FALSE(component.OnGenConstructorCall(text));
	EXPECT_FALSE(component.OnGenHeaderFileTop(text));
	EXPECT_FALSE(component.OnGenInitForm(text));
	EXPECT_FALSE(component.OnGenDestroyForm(text));
	component.OnSetConstructorParams(text);
	EXPECT_STREQ(text.String(), "kept");
}


TEST_F(ComponentTest, OperationsOnAMissingViewDoNothing)
{
	fComponent.MoveComponentTo(BPoint(1, 1));
	fComponent.MoveComponentTo(nullptr, BPoint(1, 1));
	fComponent.ResizeComponentTo(BRect(0, 0, 9, 9));
	fComponent.ResizeComponentTo(nullptr, BRect(0, 0, 9, 9));
	fComponent.DesignerDrawSelection();
	EXPECT_FALSE(fComponent.HandleComponentDesignMessage(nullptr));
}


namespace scope {

template <class Argument>
class TTemplate : public TComponent {
public:
	TTemplate()
		: TComponent(nullptr, nullptr, CT_VISUAL)
	{
	}
};

} // namespace scope


TEST_F(ComponentTest, DiagnosticsNameThePlainClass)
{
	const TComponent base(nullptr, nullptr, CT_VISUAL);
	const TVetoComponent scoped;
	const scope::TTemplate<int> scopedTemplate;
	EXPECT_STREQ(ClassTypeName(&base).String(), "TComponent");
	EXPECT_STREQ(ClassTypeName(&scoped).String(), "TVetoComponent");
	EXPECT_STREQ(ClassTypeName(&scopedTemplate).String(), "TTemplate<int>");
	EXPECT_STREQ(ClassTypeName(nullptr).String(), "");
}


TEST_F(ComponentTest, ADerivedPropertyMayHaveFieldsOfItsOwn)
{
	class TLargeProperty : public TProperty {
	public:
		explicit TLargeProperty(TComponent* component)
			: TProperty(component, "Large", "", nullptr, true)
		{
		}

		int fNumbers[100] = {};
	};

	fComponent.ClearProperties(false);
	fComponent.AddProperty(new TLargeProperty(&fComponent));
	fComponent.ClearProperties(true);
	EXPECT_EQ(fComponent.CountProperties(), 0);
}

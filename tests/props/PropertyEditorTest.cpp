// SPDX-License-Identifier: MIT
// Tests of how editors pass a value on.

#include "props/PropertyEditor.h"

#include <algorithm>
#include <cstring>
#include <string>
#include <vector>

#include <gtest/gtest.h>

#include "model/Component.h"
#include "model/ComponentOwner.h"
#include "model/Property.h"
#include "model/PropertyStore.h"
#include "props/StringList.h"
#include "props/StringProperty.h"
#include "support/CapturedOutput.h"

namespace {

std::string
Shown(const char* text)
{
	return text != nullptr ? text : "(none)";
}


class TRecorder : public TComponent {
public:
	TRecorder()
		: TComponent(nullptr, nullptr, CT_VISUAL)
	{
	}

	bool PropertyModified(const char* name, const char* oldValue, const char* newValue) override
	{
		fCalls.push_back("modified " + Shown(name) + ": " + Shown(oldValue) + " -> "
			+ Shown(newValue) + ", holds " + FindProperty(name)->Value());
		return fAccepts;
	}

	void SetPropertyValue(const char* name, const char* value) override
	{
		fCalls.push_back(
			"set " + Shown(name) + ": " + Shown(value) + ", holds " + FindProperty(name)->Value());
		TComponent::SetPropertyValue(name, fReplacement != nullptr ? fReplacement : value);
	}

	void SetModified(bool modified) override
	{
		fCalls.push_back(modified ? "marked" : "unmarked");
		TComponent::SetModified(modified);
	}

	bool fAccepts = true;
	const char* fReplacement = nullptr;
	std::vector<std::string> fCalls;
};


class TRecordingOwner : public TComponentOwner {
public:
	bool ComponentPropertyModified(
		TComponent*, const char* name, const char* oldValue, const char* newValue) override
	{
		fAsked.push_back(Shown(name) + ": " + Shown(oldValue) + " -> " + Shown(newValue));
		return fAccepts;
	}

	bool fAccepts = true;
	std::vector<std::string> fAsked;
};


class PropertyEditorTest : public testing::Test {
protected:
	PropertyEditorTest()
		: fLabel(&fComponent, "Label", "OK", nullptr, true),
		  fEditor(&fComponent, &fLabel, PET_STRING),
		  fFreeEditor(nullptr, &fLabel, PET_STRING)
	{
		fComponent.AddPropAndEditor(&fLabel, &fEditor, nullptr, nullptr, true);
		fComponent.SetOwner(&fOwner);
	}

	~PropertyEditorTest() override { fComponent.ClearProperties(false); }

	using Calls = std::vector<std::string>;

	CapturedOutput fOutput;
	TRecordingOwner fOwner;
	TRecorder fComponent;
	TProperty fLabel;
	TPropertyEditor fEditor;
	TPropertyEditor fFreeEditor;
};

} // namespace

TEST_F(PropertyEditorTest, TheBaseDoesLittle)
{
	TStringList list;
	list.Add("kept");
	EXPECT_EQ(fEditor.Type(), PET_STRING);
	EXPECT_EQ(fEditor.Component(), &fComponent);
	EXPECT_EQ(fEditor.Property(), &fLabel);
	EXPECT_EQ(fEditor.EditLimit(), 1024);
	EXPECT_FALSE(fEditor.ModalEdit());
	EXPECT_EQ(fEditor.GetValue(), fLabel.Value());
	EXPECT_STREQ(fEditor.GetDisplayValue(), "OK");
	fEditor.Activate();
	fEditor.Modified();
	fEditor.Initialize();
	fEditor.GetValuePickList(&list);
	fEditor.GetValueList(&list);
	EXPECT_EQ(list.CountItems(), 1);
}


TEST_F(PropertyEditorTest, EditTypesHaveTheirNumbers)
{
	EXPECT_EQ(PET_STRING, 0);
	EXPECT_EQ(PET_MODAL, 1);
	EXPECT_EQ(PET_LIST, 2);
	EXPECT_EQ(PET_PICKLIST, 3);
	EXPECT_EQ(PET_NONE, 4);
}


TEST_F(PropertyEditorTest, TheVetoSeesTheOldTextAndTheApplyHookTheNew)
{
	fEditor.SetValue("Cancel", true);
	EXPECT_EQ(fComponent.fCalls,
		(Calls{"modified Label: OK -> Cancel, holds OK", "set Label: Cancel, holds Cancel",
			"marked"}));
	EXPECT_STREQ(fComponent.PropertyStore()->FindString("Label"), "Cancel");
}


TEST_F(PropertyEditorTest, AnEditMarksTheComponentModifiedOnce)
{
	fEditor.SetValue("Cancel", true);
	EXPECT_TRUE(fComponent.Modified());
	EXPECT_EQ(fOwner.fAsked, Calls{"Label: OK -> Cancel"});
}


TEST_F(PropertyEditorTest, ARefusingOwnerKeepsTheComponentUnmarkedButTheValueStored)
{
	fOwner.fAccepts = false;
	fEditor.SetValue("Cancel", true);
	EXPECT_FALSE(fComponent.Modified());
	EXPECT_STREQ(fLabel.Value(), "Cancel");
	EXPECT_STREQ(fComponent.PropertyStore()->FindString("Label"), "Cancel");
}


TEST_F(PropertyEditorTest, WithoutAnOwnerAnEditMarksModified)
{
	fComponent.SetOwner(nullptr);
	fEditor.SetValue("Cancel", true);
	EXPECT_TRUE(fComponent.Modified());
}


TEST_F(PropertyEditorTest, TheSameTextIsAppliedButMarksNothing)
{
	fEditor.SetValue("OK", true);
	EXPECT_EQ(fComponent.fCalls,
		(Calls{"modified Label: OK -> OK, holds OK", "set Label: OK, holds OK"}));
	EXPECT_TRUE(fOwner.fAsked.empty());
	EXPECT_FALSE(fComponent.Modified());
	EXPECT_STREQ(fComponent.PropertyStore()->FindString("Label"), "OK");
}


TEST_F(PropertyEditorTest, AVetoKeepsEverything)
{
	fComponent.fAccepts = false;
	fEditor.SetValue("Cancel", true);
	EXPECT_EQ(fComponent.fCalls, Calls{"modified Label: OK -> Cancel, holds OK"});
	EXPECT_STREQ(fLabel.Value(), "OK");
	EXPECT_FALSE(fComponent.Modified());
	EXPECT_TRUE(fOwner.fAsked.empty());
}


TEST_F(PropertyEditorTest, WithoutNotifyingOnlyThePropertyChanges)
{
	fEditor.SetValue("Cancel", false);
	EXPECT_EQ(fComponent.fCalls, Calls{"modified Label: OK -> Cancel, holds OK"});
	EXPECT_STREQ(fLabel.Value(), "Cancel");
	EXPECT_FALSE(fComponent.PropertyStore()->HasString("Label"));
	EXPECT_FALSE(fComponent.Modified());
	EXPECT_TRUE(fOwner.fAsked.empty());
}


TEST_F(PropertyEditorTest, ANullValueIsAskedAndAppliedButChangesNoText)
{
	fEditor.SetValue(nullptr, true);
	EXPECT_EQ(fComponent.fCalls,
		(Calls{"modified Label: OK -> (none), holds OK", "set Label: (none), holds OK"}));
	EXPECT_STREQ(fLabel.Value(), "OK");
	EXPECT_FALSE(fComponent.Modified());
}


TEST_F(PropertyEditorTest, AComponentThatStoresAnotherTextIsMarkedOnce)
{
	fComponent.fReplacement = "CANCEL";
	fEditor.SetValue("cancel", true);
	EXPECT_STREQ(fLabel.Value(), "CANCEL");
	EXPECT_EQ(fOwner.fAsked, Calls{"Label: cancel -> CANCEL"});
	EXPECT_EQ(std::count(fComponent.fCalls.begin(), fComponent.fCalls.end(), "marked"), 1);
}


TEST_F(PropertyEditorTest, WithoutAComponentThePropertyTakesTheText)
{
	fFreeEditor.SetValue("free", true);
	EXPECT_STREQ(fLabel.Value(), "free");
	fFreeEditor.SetValue(nullptr, true);
	EXPECT_STREQ(fLabel.Value(), "free");
	EXPECT_TRUE(fComponent.fCalls.empty());
	EXPECT_TRUE(fComponent.PropertyStore()->IsEmpty());
}


TEST_F(PropertyEditorTest, AValueOf1024BytesFillsTheBufferWithoutATerminator)
{
	const std::string full(1024, 'x');
	fFreeEditor.SetValue(full.c_str(), true);
	EXPECT_EQ(memchr(fLabel.Value(), '\0', 1024), nullptr);
	EXPECT_EQ(std::string(fLabel.Value(), 1024), full);

	fEditor.SetValue(std::string(1024, 'y').c_str(), false);
	EXPECT_EQ(memchr(fLabel.Value(), '\0', 1024), nullptr);
	EXPECT_EQ(fLabel.Value()[1023], 'y');
}


TEST_F(PropertyEditorTest, LongerValuesAreCutAt1024Bytes)
{
	fFreeEditor.SetValue((std::string(1024, 'x') + "more").c_str(), true);
	EXPECT_EQ(strnlen(fLabel.Value(), 2000), 1024u);
	fFreeEditor.SetValue(std::string(1023, 'z').c_str(), true);
	EXPECT_EQ(fLabel.Value(), std::string(1023, 'z'));
}


TEST_F(PropertyEditorTest, ALongEditMarksModifiedOnceToo)
{
	fEditor.SetValue(std::string(5000, 'x').c_str(), true);
	EXPECT_EQ(fOwner.fAsked.size(), 1u);
	EXPECT_EQ(std::count(fComponent.fCalls.begin(), fComponent.fCalls.end(), "marked"), 1);
	EXPECT_EQ(fLabel.Value(), std::string(fComponent.PropertyStore()->FindString("Label")));
}


TEST_F(PropertyEditorTest, AValueOfThePropertyItselfCanBeSet)
{
	fLabel.SetValue("first second");
	fEditor.SetValue(fLabel.Value() + 6, true);
	EXPECT_STREQ(fLabel.Value(), "second");
}


TEST_F(PropertyEditorTest, AnEditorWithoutPropertyIsHarmless)
{
	TPropertyEditor editor(&fComponent, nullptr, PET_STRING);
	editor.SetValue("x", true);
	EXPECT_EQ(editor.GetValue(), nullptr);
	EXPECT_EQ(editor.GetDisplayValue(), nullptr);
	EXPECT_TRUE(fComponent.fCalls.empty());
	editor.SetProperty(&fLabel);
	EXPECT_STREQ(editor.GetValue(), "OK");
}


TEST_F(PropertyEditorTest, AnEditorOutlivesItsComponent)
{
	TPropertyEditor* editor;
	{
		TComponent component(nullptr, nullptr, CT_VISUAL);
		component.InitPropertyList();
		editor = component.PropertyAt(0)->Editor();
	}
	EXPECT_EQ(editor->Type(), PET_STRING);
	delete editor;
}


TEST_F(PropertyEditorTest, AComponentMayRebuildItsListWhileAValueIsApplied)
{
	class TRebuilder : public TComponent {
	public:
		TRebuilder()
			: TComponent(nullptr, nullptr, CT_VISUAL)
		{
		}

		void SetPropertyValue(const char*, const char*) override { InitPropertyList(); }
	};

	TRebuilder component;
	component.InitPropertyList();
	TPropertyEditor* first = component.PropertyAt(0)->Editor();
	first->SetValue("New", true);
	EXPECT_EQ(component.CountProperties(), 1);
	delete component.PropertyAt(0)->Editor();
	delete first;
}

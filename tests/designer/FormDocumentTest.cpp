// SPDX-License-Identifier: MIT
// Saving and loading forms.

#include <cmath>
#include <cstring>

#include "designer/DesignerTest.h"
#include "designer/FormFile.h"
#include "designer/LoadReport.h"
#include "model/Event.h"
#include "support/Printers.h"
#include "support/TracerComponent.h"

class FormDocumentTest : public DesignerTest {
protected:
	/// The names of a message's fields, in their order.
	static std::vector<std::string> Names(const BMessage& message)
	{
		std::vector<std::string> names;
		char* name;
		type_code type;
		for (int32 i = 0; message.GetInfo(B_ANY_TYPE, i, &name, &type) == B_OK; i++)
			names.push_back(name);
		return names;
	}

	/// The record of a component in a saved form.
	BMessage Record(const std::string& path, const char* name)
	{
		TPLIMFormFile file(path.c_str());
		BMessage components;
		BMessage record;
		EXPECT_EQ(file.FindMessage("Components", &components), B_OK);
		EXPECT_EQ(components.FindMessage(name, &record), B_OK);
		return record;
	}

	/// Saves \a form, lets \a change change the "Components" of the document, and writes it again.
	template <class Change>
	std::string SaveChanged(TDesignForm* form, Change change)
	{
		const std::string path = fFolder / "changed.frm";
		Save(form, path);
		TPLIMFormFile file(path.c_str());
		BMessage components;
		EXPECT_EQ(file.FindMessage("Components", &components), B_OK);
		change(components);
		EXPECT_EQ(file.ReplaceMessage("Components", &components), B_OK);
		EXPECT_TRUE(file.SaveFile());
		return path;
	}

	/// Replaces a field of a component's "Properties" in the collection.
	template <typename Change>
	static void ChangeProperties(BMessage& components, const char* component, Change change)
	{
		BMessage record;
		BMessage properties;
		ASSERT_EQ(components.FindMessage(component, &record), B_OK);
		ASSERT_EQ(record.FindMessage("Properties", &properties), B_OK);
		change(properties);
		record.ReplaceMessage("Properties", &properties);
		components.ReplaceMessage(component, &record);
	}

	static void SetRecordString(
		BMessage& components, const char* component, const char* name, const char* value)
	{
		ChangeProperties(components, component, [&](BMessage& properties) {
			properties.RemoveName(name);
			if (value != nullptr)
				properties.AddString(name, value);
		});
	}
};


TEST_F(FormDocumentTest, TheDocumentHoldsItsThreePartsInOrder)
{
	TDesignForm* form = NewForm();
	Save(form, fFolder / "form.frm");
	ASSERT_TRUE(fResult);

	TPLIMFormFile file((fFolder / "form.frm").c_str());
	EXPECT_EQ(
		Names(file), (std::vector<std::string>{"_FormProperties", "_FormEvents", "Components"}));
	BMessage part;
	ASSERT_EQ(file.FindMessage("_FormProperties", &part), B_OK);
	EXPECT_EQ(part.what, static_cast<uint32>('cprp'));
	ASSERT_EQ(Names(part).size(), static_cast<size_t>(form->CountProperties()));
	for (int32 i = 0; i < form->CountProperties(); i++)
		EXPECT_EQ(Names(part)[i], form->PropertyAt(i)->Name());
	ASSERT_EQ(file.FindMessage("_FormEvents", &part), B_OK);
	EXPECT_EQ(part.what, static_cast<uint32>('evts'));
	ASSERT_EQ(Names(part).size(), static_cast<size_t>(form->CountEvents()));
	for (int32 i = 0; i < form->CountEvents(); i++)
		EXPECT_EQ(Names(part)[i], form->EventAt(i)->name);
	ASSERT_EQ(file.FindMessage("Components", &part), B_OK);
	EXPECT_EQ(part.what, static_cast<uint32>('PCmp'));
}


TEST_F(FormDocumentTest, AFormWithoutComponentsLoadsSilently)
{
	Save(NewForm(), fFolder / "form.frm");
	TDesignForm* loaded = NewForm("Other");
	const std::string output = Load(loaded, fFolder / "form.frm");
	EXPECT_TRUE(fResult);
	EXPECT_EQ(loaded->CountComponents(), 0);
	EXPECT_EQ(output.find("Warning"), std::string::npos) << output;
	EXPECT_EQ(output.find("No components"), std::string::npos) << output;
}


TEST_F(FormDocumentTest, ADocumentWithoutComponentsFieldLoadsTheFormItself)
{
	TDesignForm* form = NewForm();
	form->SetPropertyValue("Title", "Saved title");
	form->SetEventSelection("OnShow", true);
	Save(form, fFolder / "form.frm");
	TPLIMFormFile file((fFolder / "form.frm").c_str());
	file.RemoveName("Components");
	ASSERT_TRUE(file.SaveFile());

	TDesignForm* loaded = NewForm("Other");
	const std::string output = Load(loaded, fFolder / "form.frm");
	EXPECT_TRUE(fResult);
	EXPECT_NE(output.find("No components found for 'Form1'\n"), std::string::npos) << output;
	EXPECT_STREQ(loaded->ComponentName(), "Form1");
	EXPECT_STREQ(loaded->Title(), "Saved title");
	EXPECT_TRUE(loaded->EventSelection("OnShow"));
	EXPECT_FALSE(loaded->EventSelection("OnHide"));
}


TEST_F(FormDocumentTest, EverythingOfAComponentComesBack)
{
	TDesignForm* form = NewForm();
	TComponent* button = Place(form, "TButton", "CountButton", BRect(12, 20, 112, 48));
	button->SetPropertyValue("Label", "Count");
	button->SetPropertyValue("HighColor", "{1,2,3,255}");
	button->SetEventSelection("OnClick", true);
	Save(form, fFolder / "form.frm");

	TDesignForm* loaded = NewForm("Other");
	Load(loaded, fFolder / "form.frm");
	ASSERT_EQ(loaded->CountComponents(), 1);
	TComponent* copy = loaded->ComponentAt(0);
	EXPECT_STREQ(copy->ComponentName(), "CountButton");
	EXPECT_STREQ(copy->ClassName(), "TButton");
	EXPECT_EQ(copy->DTView()->Frame(), BRect(12, 20, 112, 48));
	EXPECT_EQ(copy->DTView()->Parent(), loaded->View());
	EXPECT_TRUE(copy->EventSelection("OnClick"));
	EXPECT_FALSE(copy->EventSelection("OnMouseDown"));
	ASSERT_EQ(copy->CountProperties(), button->CountProperties());
	for (int32 i = 0; i < copy->CountProperties(); i++) {
		EXPECT_STREQ(copy->PropertyAt(i)->Value(), button->PropertyAt(i)->Value())
			<< copy->PropertyAt(i)->Name();
	}
	EXPECT_FALSE(loaded->Modified());
}


TEST_F(FormDocumentTest, SavingWhatWasLoadedGivesTheSameBytes)
{
	TDesignForm* form = NewForm();
	TComponent* box = Place(form, "TBox", "Box1", BRect(10, 10, 200, 150));
	Place(form, "TButton", "Button1", BRect(20, 30, 90, 55), box);
	Place(form, "TTextControl", "Field1", BRect(10, 160, 200, 184));
	Place(form, "TStringView", "Text1");
	Place(form, "TCheckBox", "Check1");
	Save(form, fFolder / "first.frm");
	TDesignForm* loaded = NewForm("Other");
	Load(loaded, fFolder / "first.frm");
	Save(loaded, fFolder / "second.frm");
	EXPECT_TRUE(fFolder.Read("second.frm") == fFolder.Read("first.frm"));
}


TEST_F(FormDocumentTest, AComponentInABoxComesBackInsideIt)
{
	TDesignForm* form = NewForm();
	TComponent* box = Place(form, "TBox", "Box1", BRect(10, 10, 200, 150));
	Place(form, "TButton", "Button1", BRect(20, 30, 90, 55), box);
	Save(form, fFolder / "form.frm");

	BMessage record = Record(fFolder / "form.frm", "Button1");
	BMessage properties;
	ASSERT_EQ(record.FindMessage("Properties", &properties), B_OK);
	EXPECT_STREQ(properties.FindString("_OwnerName"), "Box1");

	TDesignForm* loaded = NewForm("Other");
	Load(loaded, fFolder / "form.frm");
	TComponent* loadedBox = Find(loaded, "Box1");
	TComponent* loadedButton = Find(loaded, "Button1");
	ASSERT_NE(loadedBox, nullptr);
	ASSERT_NE(loadedButton, nullptr);
	EXPECT_EQ(loadedButton->DTView()->Parent(), loadedBox->DTView());
	EXPECT_EQ(loadedButton->DTView()->Frame(), BRect(20, 30, 90, 55));
	TComponentOwner* owner = dynamic_cast<TComponentOwner*>(loadedBox);
	ASSERT_EQ(owner->CountComponents(), 1);
	EXPECT_EQ(owner->ComponentAt(0), loadedButton);
	EXPECT_EQ(loadedButton->Owner(), owner);
	EXPECT_EQ(loaded->CountComponents(), 2);
}


TEST_F(FormDocumentTest, OnlyAComponentInsideAnotherHasAnOwnerName)
{
	TDesignForm* form = NewForm();
	Place(form, "TButton", "Button1");
	Save(form, fFolder / "form.frm");
	BMessage record = Record(fFolder / "form.frm", "Button1");
	EXPECT_EQ(Names(record), (std::vector<std::string>{"Properties", "Events"}));
	EXPECT_EQ(record.what, static_cast<uint32>('info'));
	BMessage properties;
	ASSERT_EQ(record.FindMessage("Properties", &properties), B_OK);
	EXPECT_FALSE(properties.HasString("_OwnerName"));
	EXPECT_EQ(Names(properties)[0], "_ClassName");
	EXPECT_EQ(Names(properties)[1], "_Frame");
	EXPECT_EQ(Names(properties)[2], "Name");
}


TEST_F(FormDocumentTest, UnknownClassesAreLeftOutAndTheRestIsLoaded)
{
	TDesignForm* form = NewForm();
	Place(form, "TButton", "Button1");
	Place(form, "TButton", "Button2");
	Place(form, "TButton", "Button3");
	const std::string path = SaveChanged(form, [](BMessage& components) {
		SetRecordString(components, "Button1", "_ClassName", "TUnheardOf");
		SetRecordString(components, "Button2", "_ClassName", "TNone");
	});

	TDesignForm* loaded = NewForm("Other");
	TLoadReport report;
	const std::string output = Load(loaded, path, &report);
	EXPECT_TRUE(fResult);
	EXPECT_NE(output.find("Warning: No palette entry found for 'TUnheardOf'\n"), std::string::npos);
	EXPECT_NE(output.find("Warning: Unable to create component 'Button2'\n"), std::string::npos);
	ASSERT_EQ(loaded->CountComponents(), 1);
	EXPECT_STREQ(loaded->ComponentAt(0)->ComponentName(), "Button3");
	ASSERT_EQ(report.Problems().size(), 2u);
	EXPECT_EQ(report.Problems()[0].kind, LOAD_CLASS_UNKNOWN);
	EXPECT_STREQ(report.Problems()[0].file.String(), path.c_str());
	EXPECT_EQ(report.Problems()[1].kind, LOAD_COMPONENT_DAMAGED);
}


TEST_F(FormDocumentTest, AComponentWhoseFrameIsNoNumbersIsLeftOut)
{
	TDesignForm* form = NewForm();
	Place(form, "TButton", "Button1");
	Place(form, "TButton", "Button2");
	Place(form, "TButton", "Button3");
	const std::string path = SaveChanged(form, [](BMessage& components) {
		const auto setFrame = [&](const char* component, BRect frame) {
			ChangeProperties(components, component, [&](BMessage& properties) {
				ASSERT_EQ(properties.ReplaceRect("_Frame", frame), B_OK);
			});
		};
		setFrame("Button1", BRect(std::nanf(""), 10, 20, 30));
		setFrame("Button3", BRect(10, 10, HUGE_VALF, 30));
	});

	TDesignForm* loaded = NewForm("Other");
	TLoadReport report;
	const std::string output = Load(loaded, path, &report);
	EXPECT_TRUE(fResult);
	EXPECT_NE(output.find("Warning: No class name/location for 'Button1'\n"), std::string::npos);
	EXPECT_NE(output.find("Warning: No class name/location for 'Button3'\n"), std::string::npos);
	ASSERT_EQ(loaded->CountComponents(), 1);
	EXPECT_STREQ(loaded->ComponentAt(0)->ComponentName(), "Button2");
	ASSERT_EQ(report.Problems().size(), 2u);
	EXPECT_EQ(report.Problems()[0].kind, LOAD_COMPONENT_DAMAGED);
}


TEST_F(FormDocumentTest, DamagedRecordsAreToldAndLeftOut)
{
	TDesignForm* form = NewForm();
	Place(form, "TButton", "Button1");
	Place(form, "TButton", "Button2");
	Place(form, "TButton", "Button3");
	Place(form, "TButton", "Button4");
	const std::string path = SaveChanged(form, [](BMessage& components) {
		BMessage record;
		components.FindMessage("Button1", &record);
		record.RemoveName("Properties");
		components.ReplaceMessage("Button1", &record);
		SetRecordString(components, "Button2", "_ClassName", nullptr);
		components.FindMessage("Button3", &record);
		record.RemoveName("Events");
		components.ReplaceMessage("Button3", &record);
		components.AddData("Torn", B_MESSAGE_TYPE, "HMF1 and then nothing", 21, false);
	});

	TDesignForm* loaded = NewForm("Other");
	const std::string output = Load(loaded, path);
	EXPECT_NE(output.find("Warning: Unable to extract component Properties message\n"),
		std::string::npos);
	EXPECT_NE(output.find("Warning: No class name/location for 'Button2'\n"), std::string::npos);
	EXPECT_NE(output.find("Warning: Unable to extract event information for 'Button3'\n"),
		std::string::npos);
	EXPECT_NE(output.find("Warning: Unable to extract Component message\n"), std::string::npos);
	EXPECT_EQ(loaded->CountComponents(), 2);
	EXPECT_NE(Find(loaded, "Button3"), nullptr);
	EXPECT_NE(Find(loaded, "Button4"), nullptr);
}


TEST_F(FormDocumentTest, AComponentWhoseOwnerIsUnknownStaysOnTheForm)
{
	TDesignForm* form = NewForm();
	TComponent* box = Place(form, "TBox", "Box1", BRect(10, 10, 200, 150));
	Place(form, "TButton", "Button1", BRect(20, 30, 90, 55), box);
	const std::string path = SaveChanged(form, [](BMessage& components) {
		SetRecordString(components, "Button1", "_OwnerName", "Nobody");
	});
	TDesignForm* loaded = NewForm("Other");
	Load(loaded, path);
	TComponent* button = Find(loaded, "Button1");
	ASSERT_NE(button, nullptr);
	EXPECT_EQ(button->DTView()->Parent(), loaded->View());
	EXPECT_TRUE(loaded->IsForm(button->Owner()));
}


TEST_F(FormDocumentTest, AnOwnerThatCannotHoldComponentsHoldsNone)
{
	TDesignForm* form = NewForm();
	Place(form, "TButton", "Button1");
	Place(form, "TButton", "Button2");
	const std::string path = SaveChanged(form, [](BMessage& components) {
		SetRecordString(components, "Button2", "_OwnerName", "Button1");
	});
	TDesignForm* loaded = NewForm("Other");
	Load(loaded, path);
	EXPECT_EQ(Find(loaded, "Button2")->DTView()->Parent(), loaded->View());
}


TEST_F(FormDocumentTest, NothingGoesInsideItself)
{
	TDesignForm* form = NewForm();
	for (const char* name : {"Box1", "Box2", "Box3", "Own"})
		Place(form, "TBox", name, BRect(10, 10, 200, 150));
	const std::string path = SaveChanged(form, [](BMessage& components) {
		SetRecordString(components, "Own", "_OwnerName", "Own");
		SetRecordString(components, "Box1", "_OwnerName", "Box2");
		SetRecordString(components, "Box2", "_OwnerName", "Box3");
		SetRecordString(components, "Box3", "_OwnerName", "Box1");
	});

	TDesignForm* loaded = NewForm("Other");
	TLoadReport report;
	testing::internal::CaptureStderr();
	Load(loaded, path, &report);
	const std::string errors = testing::internal::GetCapturedStderr();
	EXPECT_TRUE(fResult);
	EXPECT_EQ(loaded->CountComponents(), 4);
	EXPECT_EQ(Find(loaded, "Own")->DTView()->Parent(), loaded->View());
	EXPECT_EQ(Find(loaded, "Box1")->DTView()->Parent(), Find(loaded, "Box2")->DTView());
	EXPECT_EQ(Find(loaded, "Box2")->DTView()->Parent(), Find(loaded, "Box3")->DTView());
	EXPECT_EQ(Find(loaded, "Box3")->DTView()->Parent(), loaded->View());
	ASSERT_EQ(report.Problems().size(), 2u);
	EXPECT_EQ(report.Problems()[0].kind, LOAD_OWNER_REFUSED);
	EXPECT_NE(errors.find(path), std::string::npos) << errors;
	EXPECT_NE(errors.find("'Own'"), std::string::npos) << errors;
}


TEST_F(FormDocumentTest, NamesWithAnUnderscoreNeverReachAComponent)
{
	TDesignForm* form = NewForm();
	Place(form, "TTracer", "Tracer1");
	const std::string path = SaveChanged(form, [](BMessage& components) {
		SetRecordString(components, "Tracer1", "_Secret", "value");
		SetRecordString(components, "Tracer1", "", "value");
		SetRecordString(components, "Tracer1", "Unknown", "value");
	});
	TDesignForm* loaded = NewForm("Other");
	Load(loaded, path);
	const TracerComponent* tracer = dynamic_cast<TracerComponent*>(Find(loaded, "Tracer1"));
	ASSERT_NE(tracer, nullptr);
	EXPECT_EQ(tracer->NamesSet(), (std::vector<std::string>{"Name", "A", "B", "Unknown"}));
}


TEST_F(FormDocumentTest, ExtendedDataIsWrittenByThePropertyAtTheComponentsPlace)
{
	TDesignForm* form = NewForm();
	for (const char* name : {"Tracer1", "Tracer2", "Tracer3", "Tracer4"})
		Place(form, "TTracer", name);
	Save(form, fFolder / "form.frm");

	// Properties of a tracer: "Name", "A", "B"; the fourth has none at its place.
	const struct {
		const char* name;
		int32 a;
		int32 b;
	} kCases[] = {{"Tracer1", 0, 0}, {"Tracer2", 3, 0}, {"Tracer3", 0, 3}, {"Tracer4", 0, 0}};
	for (const auto& row : kCases) {
		BMessage properties;
		ASSERT_EQ(
			Record(fFolder / "form.frm", row.name).FindMessage("Properties", &properties), B_OK);
		type_code type;
		int32 a = 0;
		int32 b = 0;
		properties.GetInfo("extendedA", &type, &a);
		properties.GetInfo("extendedB", &type, &b);
		EXPECT_EQ(a, row.a) << row.name;
		EXPECT_EQ(b, row.b) << row.name;
	}
}


TEST_F(FormDocumentTest, ExtendedDataOfPropertiesAndComponentsIsReadBack)
{
	TDesignForm* form = NewForm();
	Place(form, "TTracer", "Tracer1");
	Save(form, fFolder / "form.frm");
	EXPECT_EQ(Names(Record(fFolder / "form.frm", "Tracer1")),
		(std::vector<std::string>{"tracer", "Properties", "Events"}));

	TDesignForm* loaded = NewForm("Other");
	Load(loaded, fFolder / "form.frm");
	const TracerComponent* tracer = dynamic_cast<TracerComponent*>(Find(loaded, "Tracer1"));
	ASSERT_NE(tracer, nullptr);
	EXPECT_EQ(tracer->OwnData(), "own data");
	EXPECT_EQ(tracer->A()->CountRead(), 1);
	EXPECT_EQ(tracer->B()->CountRead(), 1);
}


TEST_F(FormDocumentTest, TheDiagnosticsTellWhatIsWritten)
{
	TDesignForm* form = NewForm();
	TComponent* box = Place(form, "TBox", "Box1", BRect(10, 10, 200, 150));
	Place(form, "TTracer", "Tracer1", BRect(20, 30, 90, 55), box);
	const std::string output = Save(form, fFolder / "form.frm");
	for (const char* line :
		{"Writing form property Name: Form1\n", "Writing form event OnShow: false\n",
			"*** Tracer1 info ***\n", "  Writing Owner name for Tracer1: Box1\n",
			">> Tracer1 Properties:\n", "  Tracer1.Name(Tracer1)\n", "\n>> Tracer1 Events:\n",
			"  Writing Box1.OnClick(false)\n"})
		EXPECT_NE(output.find(line), std::string::npos) << line << "is missing in\n" << output;
}


TEST_F(FormDocumentTest, AFailedSaveKeepsNameAndModifiedState)
{
	TDesignForm* form = NewForm();
	Save(form, fFolder / "form.frm");
	form->View()->SetModified(true);
	Save(form, fFolder / "missing/form.frm");
	EXPECT_FALSE(fResult);
	EXPECT_STREQ(form->Filename(), (fFolder / "form.frm").c_str());
	EXPECT_TRUE(form->Modified());
}


TEST_F(FormDocumentTest, AFileThatCannotBeReadChangesNothing)
{
	TDesignForm* form = NewForm();
	Place(form, "TButton", "Button1");
	fFolder.Write("foreign.frm", "this is not a form, but it is long enough to be looked at");
	for (const char* name : {"foreign.frm", "missing.frm"}) {
		Load(form, fFolder / name);
		EXPECT_FALSE(fResult) << name;
		EXPECT_EQ(form->CountComponents(), 1) << name;
		EXPECT_STREQ(form->Filename(), "") << name;
	}
}


TEST_F(FormDocumentTest, AComponentWhoseNameNoFieldCanHaveIsToldAndLeftOut)
{
	TDesignForm* form = NewForm();
	Place(form, "TButton", std::string(2000, 'n').c_str());
	Place(form, "TButton", "Button1");
	EXPECT_EQ(strlen(form->ComponentAt(0)->ComponentName()), 1023u);
	const std::string output = Save(form, fFolder / "form.frm");
	EXPECT_TRUE(fResult);
	EXPECT_NE(
		output.find("Warning: Unable to add the component to the collection\n"), std::string::npos);
	TDesignForm* loaded = NewForm("Other");
	Load(loaded, fFolder / "form.frm");
	EXPECT_TRUE(fResult);
	ASSERT_EQ(loaded->CountComponents(), 1);
	EXPECT_STREQ(loaded->ComponentAt(0)->ComponentName(), "Button1");
}

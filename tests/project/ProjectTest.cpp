// SPDX-License-Identifier: MIT

#include "project/Project.h"

#include <cstring>
#include <filesystem>

#include <Node.h>

#include "app/Dialogs.h"
#include "designer/DesignerTest.h"
#include "designer/DocumentFile.h"
#include "designer/LoadReport.h"
#include "model/AppComponent.h"
#include "model/Property.h"
#include "support/CapturedOutput.h"

namespace {

std::vector<std::string> sBoxes;

int32
NoteBox(const char* title, const char* text, const char* button)
{
	sBoxes.push_back(std::string(title) + "|" + text + "|" + button);
	return 0;
}

} // namespace

class ProjectTest : public DesignerTest {
protected:
	ProjectTest()
	{
		sBoxes.clear();
		SetMessageBoxHook(NoteBox);
	}

	~ProjectTest() { SetMessageBoxHook(nullptr); }

	/// Adds a form of that name, to be saved under \a file in the test's folder.
	TDesignForm* AddForm(TProject& project, const char* name, const char* file)
	{
		CapturedOutput output;
		TDesignForm* form = project.NewForm();
		form->SetPropertyValue("Name", name);
		if (file != nullptr)
			form->SetFilename((fFolder / file).c_str());
		return form;
	}

	std::string Save(TProject& project, const std::string& path, bool saveForms = true)
	{
		CapturedOutput output;
		fResult = project.SaveToFile(path.c_str(), saveForms);
		return output.Text();
	}

	std::string Load(TProject& project, const std::string& path, TLoadReport* report = nullptr)
	{
		CapturedOutput output;
		fResult = project.LoadFromFile(path.c_str(), report);
		return output.Text();
	}

	static std::vector<std::string> FormNames(const TProject& project)
	{
		std::vector<std::string> names;
		for (int32 i = 0; i < project.CountForms(); i++)
			names.push_back(project.FormAt(i)->ComponentName());
		return names;
	}
};


TEST_F(ProjectTest, ANewProjectHasAnUnmodifiedApplication)
{
	CapturedOutput output;
	TProject project(FORM_HIDDEN);
	project.NewProject(false);
	EXPECT_STREQ(project.App()->ComponentName(), "Application");
	EXPECT_STREQ(project.App()->FindProperty("Name")->Value(), "Application");
	EXPECT_STREQ(project.App()->ClassName(), "TMyApplication");
	EXPECT_FALSE(project.App()->Modified());
	EXPECT_STREQ(project.Filename(), "");
	EXPECT_EQ(project.CountForms(), 0);
}


TEST_F(ProjectTest, ANewProjectWithAFormHasItAsMainForm)
{
	CapturedOutput output;
	TProject project(FORM_HIDDEN);
	project.NewProject(true);
	ASSERT_EQ(FormNames(project), (std::vector<std::string>{"Form1"}));
	EXPECT_TRUE(project.FormAt(0)->IsMainForm());
	ASSERT_EQ(project.App()->CountComponents(), 1);
	EXPECT_EQ(project.App()->ComponentAt(0), static_cast<TComponent*>(project.FormAt(0)));
	EXPECT_FALSE(project.App()->Modified());
}


TEST_F(ProjectTest, NewFormsTakeTheFirstFreeName)
{
	CapturedOutput output;
	TProject project(FORM_HIDDEN);
	project.NewProject(true);
	TDesignForm* second = project.NewForm();
	EXPECT_STREQ(second->ComponentName(), "Form2");
	EXPECT_STREQ(second->FindProperty("Name")->Value(), "Form2");
	EXPECT_TRUE(project.App()->Modified());
}


TEST_F(ProjectTest, TheDocumentHoldsTheApplicationAndThenTheFormsInOrder)
{
	TProject project(FORM_HIDDEN);
	AddForm(project, "Zebra", "z.frm");
	AddForm(project, "Ant", "a.frm");
	Save(project, fFolder / "test.plim");
	ASSERT_TRUE(fResult);

	TPLIMFile file(nullptr, (fFolder / "test.plim").c_str());
	EXPECT_EQ(file.what, static_cast<uint32>('PPrj'));
	const char* const kNames[] = {"AppProperties", "AppEvents", "Zebra", "Ant"};
	char* name;
	type_code type;
	for (int32 i = 0; i < 4; i++) {
		ASSERT_EQ(file.GetInfo(B_ANY_TYPE, i, &name, &type), B_OK);
		EXPECT_STREQ(name, kNames[i]);
	}
	EXPECT_EQ(file.FindString("Ant"), fFolder / "a.frm");
	BMessage part;
	ASSERT_EQ(file.FindMessage("AppProperties", &part), B_OK);
	EXPECT_EQ(part.what, static_cast<uint32>('appP'));
	EXPECT_EQ(part.CountNames(B_STRING_TYPE), project.App()->CountProperties());
	ASSERT_EQ(file.FindMessage("AppEvents", &part), B_OK);
	EXPECT_EQ(part.what, static_cast<uint32>('appE'));
	EXPECT_EQ(part.CountNames(B_BOOL_TYPE), project.App()->CountEvents());
}


TEST_F(ProjectTest, EverythingComesBack)
{
	TProject project(FORM_HIDDEN);
	AddForm(project, "Zebra", "z.frm");
	TDesignForm* ant = AddForm(project, "Ant", "a.frm");
	Place(ant, "TButton", "Button1");
	{
		CapturedOutput output;
		project.App()->SetPropertyValue("Signature", "application/x-vnd.Test");
		project.App()->SetEventSelection("OnPulse", true);
	}
	Save(project, fFolder / "test.plim");
	EXPECT_FALSE(project.App()->Modified());

	TProject loaded(FORM_HIDDEN);
	const std::string output = Load(loaded, fFolder / "test.plim");
	ASSERT_TRUE(fResult);
	EXPECT_EQ(output.find("** filename = '" + (fFolder / "test.plim") + "'\n"), 0u);
	EXPECT_EQ(FormNames(loaded), (std::vector<std::string>{"Zebra", "Ant"}));
	EXPECT_EQ(loaded.FormAt(1)->CountComponents(), 1);
	EXPECT_STREQ(loaded.App()->GetPropertyValue("Signature"), "application/x-vnd.Test");
	EXPECT_TRUE(loaded.App()->EventSelection("OnPulse"));
	EXPECT_FALSE(loaded.App()->EventSelection("OnReadyToRun"));
	EXPECT_FALSE(loaded.App()->Modified());
	EXPECT_STREQ(loaded.Filename(), (fFolder / "test.plim").c_str());
	EXPECT_TRUE(sBoxes.empty());
}


TEST_F(ProjectTest, SavingWhatWasLoadedGivesTheSameBytes)
{
	TProject project(FORM_HIDDEN);
	AddForm(project, "Form1", "1.frm");
	AddForm(project, "Form2", "2.frm");
	Save(project, fFolder / "test.plim");
	const std::string first = fFolder.Read("test.plim");
	TProject loaded(FORM_HIDDEN);
	Load(loaded, fFolder / "test.plim");
	Save(loaded, fFolder / "test.plim");
	EXPECT_TRUE(fFolder.Read("test.plim") == first);
}


TEST_F(ProjectTest, WithoutFormsToSaveNoneIsRecorded)
{
	TProject project(FORM_HIDDEN);
	AddForm(project, "Form1", "1.frm");
	Save(project, fFolder / "test.plim", false);
	EXPECT_TRUE(fResult);
	EXPECT_FALSE(std::filesystem::exists(fFolder / "1.frm"));
	TProject loaded(FORM_HIDDEN);
	Load(loaded, fFolder / "test.plim");
	EXPECT_EQ(loaded.CountForms(), 0);
}


TEST_F(ProjectTest, AFormThatWasNeverSavedIsToldAndLost)
{
	TProject project(FORM_HIDDEN);
	AddForm(project, "Unsaved", nullptr);
	AddForm(project, "Saved", "saved.frm");
	Save(project, fFolder / "test.plim");
	EXPECT_TRUE(fResult);
	EXPECT_EQ(sBoxes,
		(std::vector<std::string>{
			"Information|There's a form with no filename. Better save that.|OK"}));
	TProject loaded(FORM_HIDDEN);
	Load(loaded, fFolder / "test.plim");
	EXPECT_EQ(FormNames(loaded), (std::vector<std::string>{"Saved"}));
}


TEST_F(ProjectTest, AFormWhoseFileIsMissingStaysEmpty)
{
	TProject project(FORM_HIDDEN);
	AddForm(project, "Form1", "1.frm");
	AddForm(project, "Form2", "2.frm");
	Save(project, fFolder / "test.plim");
	std::filesystem::remove(fFolder / "1.frm");

	TProject loaded(FORM_HIDDEN);
	TLoadReport report;
	Load(loaded, fFolder / "test.plim", &report);
	EXPECT_TRUE(fResult);
	EXPECT_EQ(FormNames(loaded), (std::vector<std::string>{"Form1", "Form2"}));
	EXPECT_EQ(sBoxes,
		(std::vector<std::string>{
			"Error|Unable to load the file '" + (fFolder / "1.frm") + "'. Sorry.|OK"}));
	ASSERT_EQ(report.Problems().size(), 1u);
	EXPECT_EQ(report.Problems()[0].kind, LOAD_FILE_UNREADABLE);
}


TEST_F(ProjectTest, AProjectThatCannotBeOpenedLeavesANewEmptyOne)
{
	fFolder.Write("foreign.plim", "this is no project, but it is long enough to be looked at");
	for (const char* name : {"missing.plim", "foreign.plim"}) {
		TProject project(FORM_HIDDEN);
		AddForm(project, "Form1", "1.frm");
		Load(project, fFolder / name);
		EXPECT_FALSE(fResult) << name;
		EXPECT_NE(project.OpenStatus(), B_OK) << name;
		EXPECT_EQ(project.CountForms(), 0) << name;
		EXPECT_STREQ(project.App()->ComponentName(), "Application") << name;
		EXPECT_STREQ(project.Filename(), "") << name;
	}
	EXPECT_TRUE(sBoxes.empty());
}


TEST_F(ProjectTest, MissingPartsAreToldAndTheRestIsLoaded)
{
	TPLIMFile file("application/x-plim-project");
	file.what = 'PPrj';
	file.SetFilename((fFolder / "test.plim").c_str());
	ASSERT_TRUE(file.SaveFile());
	TProject project(FORM_HIDDEN);
	const std::string output = Load(project, fFolder / "test.plim");
	EXPECT_TRUE(fResult);
	EXPECT_NE(output.find("Warning: Unable to load app properties.\n"
						  "Warning: Unable to load app events.\n"),
		std::string::npos)
		<< output;
	EXPECT_STREQ(project.App()->GetPropertyValue("ClassName"), "TMyApp");
}


TEST_F(ProjectTest, AnUnknownPropertyStillReachesTheApplication)
{
	TPLIMFile file("application/x-plim-project");
	BMessage properties('appP');
	properties.AddString("Unknown", "value");
	file.AddMessage("AppProperties", &properties);
	file.SetFilename((fFolder / "test.plim").c_str());
	ASSERT_TRUE(file.SaveFile());
	TProject project(FORM_HIDDEN);
	const std::string output = Load(project, fFolder / "test.plim");
	EXPECT_NE(
		output.find("TAppComponent::SetPropertyValue('Unknown', 'value')\n"), std::string::npos)
		<< output;
	EXPECT_STREQ(project.App()->GetPropertyValue("Unknown"), "value");
}


TEST_F(ProjectTest, FormPathsThatAreNotAbsoluteStartAtTheProjectsFolder)
{
	TProject project(FORM_HIDDEN);
	AddForm(project, "Form1", "1.frm");
	Save(project, fFolder / "test.plim");
	TPLIMFile file("application/x-plim-project", (fFolder / "test.plim").c_str());
	file.SetString("Form1", "1.frm");
	file.SetFilename((fFolder / "relative.plim").c_str());
	ASSERT_TRUE(file.SaveFile());

	TProject loaded(FORM_HIDDEN);
	Load(loaded, fFolder / "relative.plim");
	EXPECT_TRUE(sBoxes.empty());
	ASSERT_EQ(FormNames(loaded), (std::vector<std::string>{"Form1"}));
	EXPECT_EQ(loaded.FormAt(0)->Filename(), fFolder / "1.frm");

	Save(loaded, fFolder / "relative.plim");
	TPLIMFile again("application/x-plim-project", (fFolder / "relative.plim").c_str());
	EXPECT_STREQ(again.FindString("Form1"), "1.frm");
}


TEST_F(ProjectTest, TheMainFormIsRememberedBesideTheDocument)
{
	SKIP_WITHOUT_ATTRIBUTES(fFolder);
	TProject project(FORM_HIDDEN);
	AddForm(project, "Form1", "1.frm");
	AddForm(project, "Form2", "2.frm");
	Save(project, fFolder / "test.plim");
	const std::string without = fFolder.Read("test.plim");
	project.SetMainForm(project.FindForm("Form1"));
	Save(project, fFolder / "test.plim");
	EXPECT_TRUE(fFolder.Read("test.plim") == without);

	TProject loaded(FORM_HIDDEN);
	Load(loaded, fFolder / "test.plim");
	EXPECT_TRUE(loaded.FindForm("Form1")->IsMainForm());
	EXPECT_FALSE(loaded.FindForm("Form2")->IsMainForm());

	loaded.SetMainForm(nullptr);
	Save(loaded, fFolder / "test.plim");
	Load(loaded, fFolder / "test.plim");
	EXPECT_FALSE(loaded.FindForm("Form1")->IsMainForm());
}


TEST_F(ProjectTest, AMainFormThatIsGoneIsNoMainForm)
{
	SKIP_WITHOUT_ATTRIBUTES(fFolder);
	TProject project(FORM_HIDDEN);
	AddForm(project, "Form1", "1.frm");
	Save(project, fFolder / "test.plim");
	BNode node((fFolder / "test.plim").c_str());
	ASSERT_EQ(node.WriteAttr("PLIM:MainForm", B_STRING_TYPE, 0, "Gone", 5), 5);
	TProject loaded(FORM_HIDDEN);
	Load(loaded, fFolder / "test.plim");
	EXPECT_FALSE(loaded.FindForm("Form1")->IsMainForm());
}


TEST_F(ProjectTest, AFailedSaveLeavesTheOldDocumentAndTheProjectModified)
{
	TProject project(FORM_HIDDEN);
	Save(project, fFolder / "test.plim");
	const std::string before = fFolder.Read("test.plim");
	project.App()->SetModified(true);
	Save(project, fFolder / "missing/test.plim");
	EXPECT_FALSE(fResult);
	EXPECT_TRUE(project.App()->Modified());
	EXPECT_STREQ(project.Filename(), (fFolder / "test.plim").c_str());
	EXPECT_TRUE(fFolder.Read("test.plim") == before);
}


TEST_F(ProjectTest, AProjectIsSavedToAndLoadedFromItsOwnFilename)
{
	TProject project(FORM_HIDDEN);
	AddForm(project, "Form1", "1.frm");
	Save(project, fFolder / "test.plim");
	CapturedOutput output;
	EXPECT_TRUE(project.SaveToFile(project.Filename(), true));
	EXPECT_STREQ(project.Filename(), (fFolder / "test.plim").c_str());
	EXPECT_TRUE(project.LoadFromFile(project.Filename()));
	EXPECT_STREQ(project.Filename(), (fFolder / "test.plim").c_str());
	EXPECT_EQ(FormNames(project), (std::vector<std::string>{"Form1"}));
}

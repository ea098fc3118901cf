// SPDX-License-Identifier: MIT

#include "app/PlimApp.h"

#include <filesystem>

#include <Entry.h>
#include <MimeType.h>
#include <Path.h>

#include "app/DesignerRun.h"
#include "app/MainWindow.h"
#include "designer/FormFile.h"
#include "model/AppComponent.h"
#include "model/Property.h"
#include "project/Project.h"
#include "project/ProjectWin.h"
#include "support/CapturedOutput.h"

namespace {

typedef std::vector<std::string> boxes;

class PlimAppTest : public DesignerTest {
protected:
	/// A project file with an application called \a name and no form.
	std::string WriteProject(const char* name)
	{
		TProject project(FORM_HIDDEN);
		project.NewProject(false);
		project.App()->FindProperty("Name")->SetValue(name);
		project.App()->SetPropertyValue("Name", name);
		const std::string path = fFolder / (std::string(name) + ".plim");
		EXPECT_TRUE(project.SaveToFile(path.c_str(), true));
		return path;
	}

	static ProjectWin* Window() { return MainWindow()->ProjectWindow(); }

	static void Save(uint32 command) { Tell(be_app_messenger, command); }

	/// As the save panel does.
	void ChooseSavePlace(const std::string& folder, const char* name)
	{
		BMessage request(B_SAVE_REQUESTED);
		entry_ref ref;
		EXPECT_EQ(get_ref_for_path(folder.c_str(), &ref), B_OK);
		request.AddRef("directory", &ref);
		request.AddString("name", name);
		Tell(be_app_messenger, &request);
		// It sends the application another command, which is handled before this.
		Tell(be_app_messenger, B_ABOUT_REQUESTED + 1);
	}

	static void Open(const std::vector<std::string>& paths)
	{
		BMessage refs(B_REFS_RECEIVED);
		for (const std::string& path : paths) {
			entry_ref ref;
			get_ref_for_path(path.c_str(), &ref);
			refs.AddRef("refs", &ref);
		}
		Tell(be_app_messenger, &refs);
	}

	/// As the program is started with \a arguments.
	static void Start(const std::vector<std::string>& arguments)
	{
		BMessage message(B_ARGV_RECEIVED);
		message.AddString("argv", "plimworks");
		for (const std::string& argument : arguments)
			message.AddString("argv", argument.c_str());
		Tell(be_app_messenger, &message);
	}

	static std::string AppName() { return Window()->Project()->App()->ComponentName(); }
};

} // namespace


TEST_F(PlimAppTest, HasTheSignatureOfTheDesigner)
{
	Run([] {
		EXPECT_STREQ(APP_SIG, "application/x-qtx.Plim");
		PlimApp* app = static_cast<PlimApp*>(be_app);
		EXPECT_STREQ(app->AppSignature(), APP_SIG);
		EXPECT_STREQ(app->Signature(), APP_SIG);
	});
}


TEST_F(PlimAppTest, InstallsTheTypesOfItsDocuments)
{
	Run([] {
		char text[B_MIME_TYPE_LENGTH];
		BMimeType form(kFormFileType);
		EXPECT_TRUE(form.IsInstalled());
		EXPECT_EQ(form.GetShortDescription(text), B_OK);
		EXPECT_STREQ(text, "Plim++ Form");
		BMimeType project(kProjectFileType);
		EXPECT_TRUE(project.IsInstalled());
		EXPECT_EQ(project.GetLongDescription(text), B_OK);
		EXPECT_STREQ(text, "Plim++ Project");
	});
}


TEST_F(PlimAppTest, LeavesInstalledTypesAsTheyAre)
{
	BMimeType mine(kFormFileType);
	mine.SetShortDescription("Mine");
	ASSERT_EQ(mine.Install() == B_OK || mine.IsInstalled(), true);
	Run([] {
		char text[B_MIME_TYPE_LENGTH];
		EXPECT_EQ(BMimeType(kFormFileType).GetShortDescription(text), B_OK);
		EXPECT_STREQ(text, "Mine");
	});
}


TEST_F(PlimAppTest, OpensTheProjectsOfAMessageInTurn)
{
	const std::string first = WriteProject("First");
	const std::string second = WriteProject("Second");
	Run([&] {
		Open({first, second});
		EXPECT_EQ(AppName(), "Second");
		EXPECT_STREQ(Window()->Filename(), second.c_str());
		EXPECT_TRUE(Boxes().empty());
	});
}


TEST_F(PlimAppTest, WhatIsNoProjectIsToldAndTheDesignerGoesOn)
{
	const std::string bad = fFolder.Write("bad.plim", "no message");
	const std::string good = WriteProject("Good");
	Run([&] {
		Open({bad});
		EXPECT_EQ(Boxes(), (boxes{"Warning|Unable to open project file '" + bad + "'."}));
		EXPECT_EQ(Window()->Project()->CountForms(), 0);
		Open({bad, good});
		EXPECT_EQ(Boxes().size(), 2u);
		EXPECT_EQ(AppName(), "Good");
	});
}


TEST_F(PlimAppTest, TheTextAboutABadProjectIsCut)
{
	const std::string folder = fFolder.Make(std::string(200, 'a'));
	const std::string bad = fFolder.Write(std::string(200, 'a') + "/" + std::string(200, 'b'), "");
	Run([&] {
		Open({bad});
		ASSERT_EQ(Boxes().size(), 1u);
		EXPECT_EQ(Boxes()[0].size(), std::string("Warning|").size() + 285);
	});
}


TEST_F(PlimAppTest, ArgumentsThatNameNothingAreSkipped)
{
	const std::string project = WriteProject("Named");
	const std::string missing = fFolder / "missing.plim";
	Run([&] {
		CapturedOutput output;
		Start({missing});
		EXPECT_EQ(output.Text().find("Opening"), std::string::npos);
		EXPECT_EQ(AppName(), "Application");

		Start({missing, project, fFolder / "missing/too.plim"});
		EXPECT_EQ(AppName(), "Named");
		EXPECT_TRUE(Boxes().empty());
	});
}


TEST_F(PlimAppTest, ReferencesAreAnnounced)
{
	const std::string project = WriteProject("Announced");
	Run([&] {
		CapturedOutput output;
		Open({project});
		const std::string text = output.Text();
		EXPECT_NE(text.find("Opening " + project + "\n"), std::string::npos);
		EXPECT_NE(text.find("Unable to locate refs in message\n"), std::string::npos);
	});
}


TEST_F(PlimAppTest, AProjectThatWasNeverSavedIsSavedWhereThePanelSays)
{
	Run([this] {
		Window()->NewProject(false);
		Save(3);
		ASSERT_TRUE(fRobot.WaitForWindow("Save Project"));
		EXPECT_EQ(fRobot.Text("text view"), "Project1.plim");
		ChooseSavePlace(fFolder.Path(), "Chosen.plim");
		EXPECT_TRUE(fRobot.WaitForNoWindow("Save Project"));
		EXPECT_TRUE(std::filesystem::exists(fFolder / "Chosen.plim"));
		EXPECT_EQ(Window()->Filename(), fFolder / "Chosen.plim");

		// From now on without asking.
		std::filesystem::remove(fFolder / "Chosen.plim");
		Save(3);
		EXPECT_TRUE(std::filesystem::exists(fFolder / "Chosen.plim"));
		EXPECT_TRUE(Boxes().empty());
	});
}


TEST_F(PlimAppTest, SaveAsAsksEachTime)
{
	Run([this] {
		Window()->NewProject(false);
		for (const char* name : {"One.plim", "Two.plim"}) {
			Save(4);
			ASSERT_TRUE(fRobot.WaitForWindow("Save Project"));
			ChooseSavePlace(fFolder.Path(), name);
			EXPECT_TRUE(std::filesystem::exists(fFolder / name)) << name;
		}
		EXPECT_EQ(Window()->Filename(), fFolder / "Two.plim");
	});
}


TEST_F(PlimAppTest, AFailedSaveIsTold)
{
	const std::string folder = fFolder.Make("gone");
	Run([&] {
		Window()->NewProject(false);
		ChooseSavePlace(folder, "Project.plim");
		std::filesystem::remove_all(folder);
		Save(3);
		EXPECT_EQ(Boxes(), (boxes{"Error|Unable to save the file."}));
		EXPECT_EQ(Window()->Filename(), folder + "/Project.plim");
	});
}


TEST_F(PlimAppTest, ASaveRequestWithoutAPlaceIsIgnored)
{
	Run([] {
		Tell(be_app_messenger, B_SAVE_REQUESTED);
		EXPECT_STREQ(Window()->Filename(), "");
		EXPECT_TRUE(Boxes().empty());
	});
}


TEST_F(PlimAppTest, ANewProjectAsksAboutAChangedOne)
{
	const std::string project = WriteProject("Changed");
	Run([&] {
		Open({project});
		Window()->Project()->App()->SetModified(true);
		Answer(2);
		Tell(be_app_messenger, 1);
		EXPECT_EQ(Boxes().size(), 1u);
		EXPECT_EQ(AppName(), "Changed");

		Answer(1);
		Tell(be_app_messenger, 1);
		EXPECT_EQ(AppName(), "Application");
		EXPECT_STREQ(Window()->Filename(), "");
		EXPECT_EQ(Window()->Project()->CountForms(), 1);
		EXPECT_TRUE(Window()->Project()->FormAt(0)->IsMainForm());
	});
}


TEST_F(PlimAppTest, OpenShowsThePanel)
{
	Run([this] {
		Tell(be_app_messenger, 2);
		EXPECT_TRUE(fRobot.WaitForWindow("Open Project"));
	});
}


TEST_F(PlimAppTest, AboutTellsOfTheProduct)
{
	Run([this] {
		Tell(be_app_messenger, 12);
		ASSERT_TRUE(fRobot.WaitForWindow("Plim App"));
		EXPECT_TRUE(fRobot.ClickView("Good Enough"));
		EXPECT_TRUE(fRobot.WaitForNoWindow("Plim App"));
	});
}


TEST_F(PlimAppTest, HelpIsNobodysCommand)
{
	Run([] {
		Tell(be_app_messenger, 11);
		EXPECT_TRUE(Boxes().empty());
	});
}


TEST_F(PlimAppTest, CommandsWaitWhileTheGenerateDialogIsOpen)
{
	Run([this] {
		Tell(be_app_messenger, 5);
		ASSERT_TRUE(fRobot.WaitForWindow("Generate Source files"));
		Answer(1);
		Tell(be_app_messenger, 1);
		Tell(be_app_messenger, 5);
		EXPECT_TRUE(Boxes().empty());
		EXPECT_EQ(fRobot.Text("efName"), "Application");
		EXPECT_TRUE(fRobot.ClickView("Cancel"));
		EXPECT_TRUE(fRobot.WaitForNoWindow("Generate Source files"));
		Tell(be_app_messenger, 1);
		EXPECT_EQ(Boxes().size(), 1u);
	});
}

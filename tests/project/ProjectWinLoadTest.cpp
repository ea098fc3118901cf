// SPDX-License-Identifier: MIT
// The project window while projects are loaded and saved, also by other threads.

#include <atomic>
#include <filesystem>
#include <thread>

#include <OS.h>

#include "app/Dialogs.h"
#include "app/WindowGuard.h"
#include "designer/DesignForm.h"
#include "designer/DesignFormView.h"
#include "designer/DocumentFile.h"
#include "model/AppComponent.h"
#include "project/Project.h"
#include "project/ProjectOperation.h"
#include "project/ProjectViewItem.h"
#include "project/ProjectWinTest.h"
#include "support/CapturedOutput.h"

namespace {

using Texts = std::vector<std::string>;

class ProjectWinLoadTest : public ProjectWinTest {};

} // namespace

TEST_F(ProjectWinLoadTest, WhatWasSavedIsListedAgain)
{
	const std::string path = WriteProject("test.plim", 3);
	ASSERT_TRUE(fWindow->LoadFromFile(path.c_str()));
	Settle();
	EXPECT_EQ(Rows(), (Texts{"Application", "Form1", "Form2", "Form3"}));
	EXPECT_EQ(fWindow->Filename(), path);
	EXPECT_FALSE(fWindow->ProjectDirty());
	EXPECT_TRUE(Boxes().empty());
}


TEST_F(ProjectWinLoadTest, RowsHaveTheNamesOfTheFormsFiles)
{
	TPLIMFile file("application/x-plim-project");
	file.SetString("Old", WriteForm("form.frm", "New").c_str());
	file.SetFilename((fFolder / "test.plim").c_str());
	ASSERT_TRUE(file.SaveFile());
	ASSERT_TRUE(fWindow->LoadFromFile(file.Filename()));
	Settle();
	EXPECT_EQ(Rows(), (Texts{"Application", "New"}));
}


TEST_F(ProjectWinLoadTest, TheApplicationsRowHasItsSavedName)
{
	ASSERT_TRUE(fWindow->Lock());
	fWindow->View()->AppComponent()->SetPropertyValue("Name", "Hello");
	fWindow->Unlock();
	SaveNewProject("other.plim");
	ASSERT_TRUE(fWindow->Lock());
	fWindow->View()->AppComponent()->SetPropertyValue("Name", "Hello");
	fWindow->Unlock();
	ASSERT_TRUE(fWindow->SaveToFile((fFolder / "test.plim").c_str(), true));
	ASSERT_TRUE(fWindow->LoadFromFile((fFolder / "test.plim").c_str()));
	Settle();
	EXPECT_EQ(Rows(), (Texts{"Hello", "Form1"}));
	EXPECT_FALSE(fWindow->View()->AppComponent()->Modified());
}


TEST_F(ProjectWinLoadTest, FormsThatCannotBeReadStayEmptyAndAreTold)
{
	const std::string path = WriteProject("test.plim", 3);
	std::filesystem::remove(fFolder / "form1.frm");
	fFolder.Write("form3.frm", fFolder.Read("form3.frm").substr(0, 100));
	ASSERT_TRUE(fWindow->LoadFromFile(path.c_str()));
	Settle();
	EXPECT_EQ(Rows(), (Texts{"Application", "Form1", "Form2", "Form3"}));
	EXPECT_EQ(Boxes(),
		(Texts{"Error|Unable to load the file '" + (fFolder / "form1.frm") + "'. Sorry.|OK",
			"Error|Unable to load the file '" + (fFolder / "form3.frm") + "'. Sorry.|OK"}));
	EXPECT_EQ(FormAt(1)->Filename(), fFolder / "form2.frm");
	EXPECT_STREQ(FormAt(0)->Filename(), "");
	EXPECT_TRUE(fWindow->ProjectDirty());
}


TEST_F(ProjectWinLoadTest, WhatIsNoProjectLeavesANewEmptyOne)
{
	const std::string form = WriteForm("form.frm", "Form");
	const std::string formBytes = fFolder.Read("form.frm");
	for (const std::string& path :
		{fFolder / "missing.plim", fFolder.Make("folder.plim"), fFolder.Write("empty.plim"),
			fFolder.Write("text.plim", "neither project nor form"), form}) {
		fWindow->NewProject(true);
		EXPECT_FALSE(fWindow->LoadFromFile(path.c_str())) << path;
		Settle();
		EXPECT_EQ(Rows(), (Texts{"Application"})) << path;
		EXPECT_STREQ(fWindow->Filename(), "") << path;
	}
	EXPECT_TRUE(Boxes().empty());
	EXPECT_TRUE(fFolder.Read("form.frm") == formBytes);
}


TEST_F(ProjectWinLoadTest, FormsOfOneNameAllComeBack)
{
	const std::string first = WriteForm("first.frm", "Form1");
	const std::string second = WriteForm("second.frm", "Form1");
	fWindow->NewProject(false);
	ASSERT_TRUE(fWindow->View()->AddForm(first.c_str()));
	ASSERT_TRUE(fWindow->View()->AddForm(second.c_str()));
	ASSERT_TRUE(fWindow->SaveToFile((fFolder / "test.plim").c_str(), true));
	ASSERT_TRUE(fWindow->LoadFromFile((fFolder / "test.plim").c_str()));
	Settle();
	EXPECT_EQ(Rows(), (Texts{"Application", "Form1", "Form1"}));
	EXPECT_EQ(FormAt(0)->Filename(), first);
	EXPECT_EQ(FormAt(1)->Filename(), second);
}


TEST_F(ProjectWinLoadTest, AFormWhoseNameCannotBeRecordedStopsTheSave)
{
	SaveNewProject("test.plim");
	const std::string before = fFolder.Read("test.plim");
	Change(FormAt(0), [&] { FormAt(0)->SetPropertyValue("Name", "AppProperties"); });
	EXPECT_FALSE(fWindow->SaveToFile((fFolder / "test.plim").c_str(), true));
	EXPECT_TRUE(fFolder.Read("test.plim") == before);
	EXPECT_EQ(Rows(), (Texts{"Application", "AppProperties"}));
}


TEST_F(ProjectWinLoadTest, ADocumentIsNotWrittenOverAFolder)
{
	SaveNewProject("test.plim");
	EXPECT_FALSE(fWindow->SaveToFile(fFolder.Make("folder.plim").c_str(), true));
	EXPECT_FALSE(fWindow->SaveToFile((fFolder / "missing/test.plim").c_str(), true));
	EXPECT_EQ(fWindow->Filename(), fFolder / "test.plim");
	EXPECT_EQ(Rows(), (Texts{"Application", "Form1"}));
}


TEST_F(ProjectWinLoadTest, ANameThatIsTooLongIsRefusedRatherThanCut)
{
	SaveNewProject("test.plim");
	const std::string name = fFolder / (std::string(200, 'x') + "/" + std::string(100, 'y'));
	fFolder.Make(std::string(200, 'x'));
	fWindow->SetFilename(name.c_str());
	EXPECT_EQ(fWindow->Filename(), name.substr(0, 255));
	EXPECT_FALSE(fWindow->SaveToFile(fWindow->Filename(), true));
	EXPECT_FALSE(fWindow->SaveToFile(name.c_str(), true));
	EXPECT_FALSE(std::filesystem::exists(name.substr(0, 255)));
	EXPECT_TRUE(fWindow->SaveToFile((fFolder / "test.plim").c_str(), true));
	EXPECT_TRUE(fWindow->SaveToFile(fWindow->Filename(), true));
}


TEST_F(ProjectWinLoadTest, AProjectWithoutANameIsNotSaved)
{
	EXPECT_FALSE(fWindow->SaveToFile("", true));
	EXPECT_EQ(Rows(), (Texts{"Application", "Form1"}));
}


TEST_F(ProjectWinLoadTest, CommandsAreRefusedWhileAnotherThreadWorksOnTheProject)
{
	const std::string form = WriteForm("form.frm", "Form");
	std::atomic<bool> begun{false};
	std::atomic<bool> end{false};
	SelectRow(0);
	std::thread worker([&] {
		TProjectOperation operation(fWindow->Project());
		begun = true;
		WaitFor([&] { return end.load(); });
	});
	ASSERT_TRUE(WaitFor([&] { return begun.load(); }));

	SelectRow(1);
	for (uint32 command : {PM_OPEN_FORM, PM_NEW_FORM, PM_REMOVE_FORM, PM_NEW_PROJECT,
			 PM_ADD_TO_PROJECT, PM_SET_MAIN_FORM})
		EXPECT_FALSE(IsEnabled(command)) << command;
	EXPECT_FALSE(IsMarked(PM_SET_MAIN_FORM));
	for (uint32 command : {PM_NEW_FORM, PM_REMOVE_FORM, PM_NEW_PROJECT, PM_SET_MAIN_FORM})
		Send(command);
	EXPECT_FALSE(fWindow->View()->AddForm(form.c_str()));
	EXPECT_EQ(Rows(), (Texts{"Application", "Form1"}));
	EXPECT_TRUE(Boxes().empty());

	end = true;
	worker.join();
	// The selection made meanwhile takes effect.
	EXPECT_TRUE(WaitFor([&] { return IsEnabled(PM_OPEN_FORM); }));
	Settle();
	EXPECT_TRUE(IsMarked(PM_SET_MAIN_FORM));
	Send(PM_NEW_FORM);
	EXPECT_EQ(Rows(), (Texts{"Application", "Form1", "Form2"}));
}


TEST_F(ProjectWinLoadTest, TheApplicationWaitsForACommandOfTheWindow)
{
	SaveNewProject("test.plim");
	Change(FormAt(0), [&] { FormAt(0)->SetPropertyValue("Title", "A new title"); });
	SelectRow(1);
	SetMessageBoxHook(nullptr);
	fMessenger.SendMessage(PM_REMOVE_FORM);
	Robot robot;
	ASSERT_TRUE(robot.WaitForWindow("Form1 has changed. Save?"));

	std::atomic<bool> done{false};
	std::thread application([&] {
		fWindow->NewProject(true);
		done = true;
	});
	EXPECT_FALSE(done);
	ASSERT_TRUE(robot.ClickView("Yes"));
	application.join();
	EXPECT_TRUE(done);
	EXPECT_NE(fFolder.Read("Form1.frm").find("A new title"), std::string::npos);
	Settle();
	EXPECT_EQ(Rows(), (Texts{"Application", "Form1"}));
}


TEST_F(ProjectWinLoadTest, TheWindowIsUsedWhileTwentyFormsAreLoaded)
{
	CapturedOutput output;
	const std::string path = WriteProject("test.plim", 20);
	const std::string extra = WriteForm("extra.frm", "Extra");
	// No form that the first load must count is removed by what goes on meanwhile.
	SetAnswers({});
	std::atomic<int32> loads{0};
	std::atomic<bool> ok{true};
	std::thread application([&] {
		for (int32 i = 0; i < 3; i++) {
			if (!fWindow->LoadFromFile(path.c_str()))
				ok = false;
			loads++;
		}
	});

	size_t longest = 0;
	bool grew = false;
	for (int32 i = 0; loads < 3; i++) {
		const size_t rows = Rows().size();
		grew |= rows > 2 && rows < 21;
		longest = std::max(longest, rows);
		ASSERT_TRUE(fWindow->Lock());
		fWindow->View()->Select(i % fWindow->View()->FullListCountItems());
		fWindow->Unlock();
		fMessenger.SendMessage(i % 2 == 0 ? PM_OPEN_FORM : PM_SET_MAIN_FORM);
		for (TDesignForm* form : fWindow->Forms()) {
			WindowGuard guard(form, 10000);
			if (guard.IsLocked())
				form->View()->Invalidate();
		}
		snooze(3000);
	}
	application.join();
	EXPECT_TRUE(ok);
	EXPECT_TRUE(grew);
	Settle();
	const Texts rows = Rows();
	ASSERT_EQ(rows.size(), 21u);
	for (int32 i = 1; i <= 20; i++)
		EXPECT_EQ(rows[i], "Form" + std::to_string(i));
	EXPECT_EQ(fWindow->Forms().size(), 20u);
	EXPECT_TRUE(Boxes().empty());
}


TEST_F(ProjectWinLoadTest, SeveralThreadsStartAndChangeProjects)
{
	CapturedOutput output;
	const std::string path = WriteProject("test.plim", 3);
	const std::string form = WriteForm("extra.frm", "Extra");
	SetAnswers(std::vector<int32>(200, 1));
	std::thread loading([&] {
		for (int32 i = 0; i < 5; i++)
			EXPECT_TRUE(fWindow->LoadFromFile(path.c_str()));
	});
	std::thread starting([&] {
		for (int32 i = 0; i < 5; i++) {
			fWindow->CloseProject();
			fWindow->NewProject(true);
		}
	});
	for (int32 i = 0; i < 10; i++) {
		fMessenger.SendMessage(PM_NEW_FORM);
		fWindow->View()->AddForm(form.c_str());
		SelectRow(1);
		fMessenger.SendMessage(PM_REMOVE_FORM);
	}
	loading.join();
	starting.join();
	Settle();

	// The list, the project and the application agree in the end.
	const Texts rows = Rows();
	const std::vector<TDesignForm*> forms = fWindow->Forms();
	ASSERT_EQ(rows.size(), forms.size() + 1);
	ASSERT_EQ(fWindow->View()->AppComponent()->CountComponents(), static_cast<int32>(forms.size()));
	for (size_t i = 0; i < forms.size(); i++) {
		Change(forms[i], [&] { EXPECT_EQ(rows[i + 1], forms[i]->ComponentName()); });
		EXPECT_EQ(
			fWindow->View()->AppComponent()->ComponentAt(i), static_cast<TComponent*>(forms[i]));
	}
}

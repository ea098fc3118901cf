// SPDX-License-Identifier: MIT

#include "project/ProjectWinTest.h"

#include <filesystem>
#include <optional>

#include <Application.h>
#include <Entry.h>
#include <MenuItem.h>
#include <MessageQueue.h>
#include <PopUpMenu.h>
#include <Screen.h>

#include "app/Dialogs.h"
#include "app/Preferences.h"
#include "designer/DesignForm.h"
#include "designer/DesignFormView.h"
#include "model/AppComponent.h"
#include "project/Project.h"
#include "project/ProjectViewItem.h"
#include "support/CapturedOutput.h"
#include "support/Printers.h"

namespace {

using Texts = std::vector<std::string>;


BMessage
Refs(uint32 what, const Texts& paths)
{
	BMessage message(what);
	for (const std::string& path : paths) {
		entry_ref ref;
		EXPECT_EQ(get_ref_for_path(path.c_str(), &ref), B_OK);
		message.AddRef("refs", &ref);
	}
	return message;
}


/// How many messages of that code the application has been sent and not handled.
int32
CountAppMessages(uint32 what)
{
	BMessageQueue* queue = be_app->MessageQueue();
	int32 count = 0;
	while (queue->FindMessage(what, count) != nullptr)
		count++;
	return count;
}

} // namespace

TEST_F(ProjectWinTest, IsNamedAndHasTheRightEdgeOfTheScreen)
{
	ASSERT_TRUE(fWindow->Lock());
	EXPECT_STREQ(fWindow->Title(), "Project");
	const BRect screen = BScreen(fWindow).Frame();
	EXPECT_TRUE(screen.Contains(fWindow->Frame()));
	EXPECT_GT(fWindow->Frame().left, screen.right / 2);
	fWindow->Unlock();
}


TEST_F(ProjectWinTest, IsMadeHiddenAndListsTheApplication)
{
	ProjectWin* window = new ProjectWin;
	ASSERT_TRUE(window->Lock());
	EXPECT_TRUE(window->IsHidden());
	EXPECT_EQ(window->View()->FullListCountItems(), 1);
	EXPECT_STREQ(window->View()->RowAt(0)->Text(), "Application");
	EXPECT_EQ(window->View()->RowAt(0)->Component(), window->View()->AppComponent());
	window->Quit();
}


TEST_F(ProjectWinTest, ANewProjectHasOneMainForm)
{
	EXPECT_EQ(Rows(), (Texts{"Application", "Form1"}));
	ASSERT_EQ(fWindow->Forms().size(), 1u);
	EXPECT_TRUE(fWindow->Project()->IsMainForm(FormAt(0)));
	EXPECT_STREQ(fWindow->Filename(), "");
	EXPECT_EQ(fWindow->View()->AppComponent()->CountComponents(), 1);
	EXPECT_FALSE(fWindow->View()->AppComponent()->Modified());
	ASSERT_TRUE(fWindow->Lock());
	EXPECT_EQ(fWindow->View()->RowAt(0)->Form(), nullptr);
	EXPECT_EQ(fWindow->View()->RowAt(1)->Form(), FormAt(0));
	EXPECT_EQ(fWindow->View()->RowAt(1)->Component(), static_cast<TComponent*>(FormAt(0)));
	fWindow->Unlock();
}


TEST_F(ProjectWinTest, AnotherNewProjectClosesTheFormsOfTheLast)
{
	const BMessenger old(FormAt(0));
	fWindow->NewProject(false);
	EXPECT_FALSE(old.IsValid());
	EXPECT_EQ(Rows(), (Texts{"Application"}));
}


TEST_F(ProjectWinTest, TheMenuHasItsItemsInOrder)
{
	const struct {
		const char* label;
		uint32 command;
	} kItems[] = {{"New Project", 5}, {"Add to project...", 6}, {nullptr, 0}, {"New Form", 2},
		{"Open", 1}, {"Remove From Project", 4}, {nullptr, 0}, {"Set as Main form", 7}};
	ASSERT_TRUE(fWindow->Lock());
	BPopUpMenu* menu = fWindow->View()->Menu();
	EXPECT_STREQ(menu->Name(), "pmProject");
	EXPECT_FALSE(menu->IsRadioMode());
	ASSERT_EQ(menu->CountItems(), 8);
	for (int32 i = 0; i < 8; i++) {
		BMenuItem* item = menu->ItemAt(i);
		if (kItems[i].label == nullptr) {
			EXPECT_NE(dynamic_cast<BSeparatorItem*>(item), nullptr) << i;
			continue;
		}
		EXPECT_STREQ(item->Label(), kItems[i].label);
		EXPECT_EQ(item->Command(), kItems[i].command) << item->Label();
		EXPECT_EQ(item->Messenger(), fMessenger) << item->Label();
	}
	fWindow->Unlock();
}


TEST_F(ProjectWinTest, NewFormsTakeTheFirstFreeName)
{
	Send(PM_NEW_FORM);
	EXPECT_EQ(Rows(), (Texts{"Application", "Form1", "Form2"}));
	EXPECT_TRUE(fWindow->View()->AppComponent()->Modified());
	EXPECT_FALSE(fWindow->Project()->IsMainForm(FormAt(1)));
	Change(FormAt(0), [&] {
		FormAt(0)->SetPropertyValue("Name", "First");
		EXPECT_STREQ(FormAt(1)->ComponentName(), "Form2");
	});
	Send(PM_NEW_FORM);
	EXPECT_EQ(Rows(), (Texts{"Application", "First", "Form2", "Form1"}));
	EXPECT_STREQ(FormAt(2)->GetPropertyValue("Name"), "Form1");
}


TEST_F(ProjectWinTest, TheSelectedRowDecidesWhatCanBeDone)
{
	Send(PM_NEW_FORM);
	EXPECT_FALSE(IsEnabled(PM_OPEN_FORM));
	for (int32 row : {0, 1, 2}) {
		SelectRow(row);
		for (uint32 command : {PM_OPEN_FORM, PM_REMOVE_FORM, PM_SET_MAIN_FORM})
			EXPECT_EQ(IsEnabled(command), row > 0) << row << " " << command;
		for (uint32 command : {PM_NEW_PROJECT, PM_ADD_TO_PROJECT, PM_NEW_FORM})
			EXPECT_TRUE(IsEnabled(command)) << row << " " << command;
		EXPECT_EQ(IsMarked(PM_SET_MAIN_FORM), row == 1) << row;
	}
}


TEST_F(ProjectWinTest, OpeningAFormShowsIt)
{
	for (uint32 command : {PM_OPEN_FORM, PM_INVOKED}) {
		Change(FormAt(0), [&] { FormAt(0)->Hide(); });
		SelectRow(1);
		Send(command);
		Change(FormAt(0), [&] { EXPECT_FALSE(FormAt(0)->IsHidden()) << command; });
		// Once more changes nothing.
		Send(command);
		Change(FormAt(0), [&] { EXPECT_FALSE(FormAt(0)->IsHidden()) << command; });
	}
}


TEST_F(ProjectWinTest, WithoutAFormSelectedNothingIsOpenedOrRemoved)
{
	for (int32 row : {-1, 0}) {
		if (row >= 0)
			SelectRow(row);
		for (uint32 command : {PM_OPEN_FORM, PM_INVOKED, PM_REMOVE_FORM})
			Send(command);
	}
	EXPECT_EQ(Rows(), (Texts{"Application", "Form1"}));
	EXPECT_TRUE(Boxes().empty());
}


TEST_F(ProjectWinTest, SettingTheMainFormTakesItFromTheOthers)
{
	Send(PM_NEW_FORM);
	SelectRow(2);
	Send(PM_SET_MAIN_FORM);
	EXPECT_FALSE(fWindow->Project()->IsMainForm(FormAt(0)));
	EXPECT_TRUE(fWindow->Project()->IsMainForm(FormAt(1)));
	EXPECT_TRUE(IsMarked(PM_SET_MAIN_FORM));
}


TEST_F(ProjectWinTest, WithoutASelectionTheMainFormStays)
{
	Send(PM_SET_MAIN_FORM);
	EXPECT_TRUE(fWindow->Project()->IsMainForm(FormAt(0)));
}


TEST_F(ProjectWinTest, AFormWithoutChangesIsRemovedWithoutAQuestion)
{
	SaveNewProject("test.plim");
	Send(PM_NEW_FORM);
	const BMessenger first(FormAt(0));
	SelectRow(1);
	Send(PM_REMOVE_FORM);
	EXPECT_TRUE(Boxes().empty());
	EXPECT_EQ(Rows(), (Texts{"Application", "Form2"}));
	EXPECT_FALSE(first.IsValid());
	ASSERT_EQ(fWindow->View()->AppComponent()->CountComponents(), 1);
	EXPECT_EQ(fWindow->View()->AppComponent()->ComponentAt(0), static_cast<TComponent*>(FormAt(0)));
	// It was the main form: there is none now.
	EXPECT_FALSE(fWindow->Project()->IsMainForm(FormAt(0)));
}


TEST_F(ProjectWinTest, ANewFormWithoutChangesIsRemovedWithoutAQuestion)
{
	Send(PM_NEW_FORM);
	SelectRow(2);
	Send(PM_REMOVE_FORM);
	EXPECT_TRUE(Boxes().empty());
	EXPECT_EQ(Rows(), (Texts{"Application", "Form1"}));
}


TEST_F(ProjectWinTest, AChangedFormIsSavedBeforeItIsRemoved)
{
	SaveNewProject("test.plim");
	Change(FormAt(0), [&] { FormAt(0)->SetPropertyValue("Title", "A new title"); });
	SelectRow(1);
	Send(PM_REMOVE_FORM);
	EXPECT_EQ(Boxes(), (Texts{"Form1 has changed. Save?|Form1 has changed. Save?|Yes"}));
	EXPECT_EQ(Rows(), (Texts{"Application"}));
	EXPECT_NE(fFolder.Read("Form1.frm").find("A new title"), std::string::npos);
}


TEST_F(ProjectWinTest, AChangedFormIsRemovedUnsavedOnNo)
{
	SaveNewProject("test.plim");
	Change(FormAt(0), [&] { FormAt(0)->SetPropertyValue("Title", "A new title"); });
	SelectRow(1);
	SetAnswers({1});
	Send(PM_REMOVE_FORM);
	EXPECT_EQ(Boxes().size(), 1u);
	EXPECT_EQ(Rows(), (Texts{"Application"}));
	EXPECT_EQ(fFolder.Read("Form1.frm").find("A new title"), std::string::npos);
}


TEST_F(ProjectWinTest, AFormThatCannotBeSavedIsNotRemoved)
{
	SaveNewProject("test.plim");
	const std::string folder = fFolder.Make("folder.frm");
	for (const std::string& file : {std::string(), fFolder / "missing/form.frm", folder}) {
		Change(FormAt(0), [&] {
			FormAt(0)->SetFilename(file.c_str());
			FormAt(0)->SetPropertyValue("Title", ("saved to '" + file + "'").c_str());
		});
		SelectRow(1);
		Send(PM_REMOVE_FORM);
		EXPECT_EQ(Rows(), (Texts{"Application", "Form1"})) << file;
		Change(FormAt(0), [&] { EXPECT_TRUE(TProject::IsChanged(FormAt(0))) << file; });
	}
	EXPECT_EQ(Boxes().size(), 3u);
}


TEST_F(ProjectWinTest, AFormFileIsAddedUnderTheNameThatItHas)
{
	const std::string path = WriteForm("any.frm", "Greeting");
	EXPECT_TRUE(fWindow->View()->AddForm(path.c_str()));
	Settle();
	EXPECT_EQ(Rows(), (Texts{"Application", "Form1", "Greeting"}));
	EXPECT_TRUE(fWindow->View()->AppComponent()->Modified());
	EXPECT_EQ(fWindow->View()->AppComponent()->CountComponents(), 2);
	EXPECT_EQ(FormAt(1)->Filename(), path);
	EXPECT_FALSE(fWindow->Project()->IsMainForm(FormAt(1)));
}


TEST_F(ProjectWinTest, AFileIsNotAddedTwice)
{
	const std::string path = WriteForm("any.frm", "Greeting");
	EXPECT_TRUE(fWindow->View()->AddForm(path.c_str()));
	EXPECT_FALSE(fWindow->View()->AddForm(path.c_str()));
	EXPECT_EQ(Rows(), (Texts{"Application", "Form1", "Greeting"}));
}


TEST_F(ProjectWinTest, WhatIsNoFormFileIsNotAdded)
{
	const int32 windows = be_app->CountWindows();
	const std::string form = WriteForm("form.frm", "Form");
	const std::string whole = fFolder.Read("form.frm");
	for (const std::string& path : {fFolder / "missing.frm", fFolder.Write("empty.frm"),
			 fFolder.Write("text.frm", "this is no form, but long enough to be looked at"),
			 fFolder.Write("cut.frm", whole.substr(0, whole.size() / 2)),
			 fFolder.Make("folder.frm"), WriteProject("project.plim", 1), std::string()}) {
		EXPECT_FALSE(fWindow->View()->AddForm(path.c_str())) << path;
		EXPECT_EQ(Rows(), (Texts{"Application", "Form1"})) << path;
	}
	EXPECT_FALSE(fWindow->View()->AppComponent()->Modified());
	EXPECT_EQ(be_app->CountWindows(), windows);
}


TEST_F(ProjectWinTest, ADroppedFormIsAdded)
{
	BMessage drop = Refs(B_SIMPLE_DATA, {WriteForm("any.frm", "Greeting")});
	BMessage reply;
	ASSERT_EQ(BMessenger(fWindow->View()).SendMessage(&drop, &reply), B_OK);
	Settle();
	EXPECT_EQ(Rows(), (Texts{"Application", "Form1", "Greeting"}));
	EXPECT_TRUE(Boxes().empty());
}


TEST_F(ProjectWinTest, ADroppedFileThatIsNoFormIsTold)
{
	Change(FormAt(0), [&] { FormAt(0)->SetPropertyValue("Title", "unsaved"); });
	const std::string path = WriteProject("project.plim", 2);
	BMessage drop = Refs(B_SIMPLE_DATA, {path});
	Send(&drop);
	EXPECT_EQ(Boxes(), (Texts{"Warning|Unable to add " + path + " to the project.|OK"}));
	EXPECT_EQ(Rows(), (Texts{"Application", "Form1"}));
	Change(FormAt(0), [&] { EXPECT_STREQ(FormAt(0)->Title(), "unsaved"); });
}


TEST_F(ProjectWinTest, ADropWithoutFilesIsIgnored)
{
	BMessage drop(B_SIMPLE_DATA);
	Send(&drop);
	drop.AddString("refs", "text");
	Send(&drop);
	EXPECT_TRUE(Boxes().empty());
	EXPECT_EQ(Rows().size(), 2u);
}


TEST_F(ProjectWinTest, FilesOfThePanelAreAddedOneByOne)
{
	const Texts paths = {
		WriteForm("1.frm", "One"), fFolder.Write("text.frm", "no form"), WriteForm("2.frm", "Two")};
	BMessage chosen = Refs(PM_FORMS_CHOSEN, paths);
	CapturedOutput output;
	Send(&chosen);
	const std::string printed = output.Text();
	size_t at = 0;
	for (const std::string& path : paths) {
		at = printed.find("Adding " + path + " to project\n", at);
		ASSERT_NE(at, std::string::npos) << path;
	}
	EXPECT_EQ(Boxes(), (Texts{"Warning|Unable to add '" + paths[1] + "' to the project.|OK"}));
	EXPECT_EQ(Rows(), (Texts{"Application", "Form1", "One", "Two"}));
}


TEST_F(ProjectWinTest, TheFilePanelIsShown)
{
	Send(PM_ADD_TO_PROJECT);
	const int32 windows = be_app->CountWindows();
	EXPECT_GE(windows, 3);
	// The same one again.
	Send(PM_ADD_TO_PROJECT);
	EXPECT_EQ(be_app->CountWindows(), windows);
}


TEST_F(ProjectWinTest, RowsFollowNewNames)
{
	Change(FormAt(0), [&] { FormAt(0)->SetPropertyValue("Name", "Renamed"); });
	EXPECT_EQ(Rows(), (Texts{"Application", "Renamed"}));
	ASSERT_TRUE(fWindow->Lock());
	fWindow->View()->AppComponent()->SetPropertyValue("Name", "Hello");
	fWindow->Unlock();
	Settle();
	EXPECT_EQ(Rows(), (Texts{"Hello", "Renamed"}));
	EXPECT_TRUE(fWindow->View()->AppComponent()->Modified());
}


TEST_F(ProjectWinTest, NamesOfFormsThatAreNotListedAreIgnored)
{
	TDesignForm* form = new TDesignForm("Stray", FORM_HIDDEN);
	fWindow->ObjectNameChanged(form);
	Settle();
	EXPECT_EQ(Rows(), (Texts{"Application", "Form1"}));
	form->Lock();
	form->Quit();
}


TEST_F(ProjectWinTest, LongNamesAreCutInTheirRowsBetweenCharacters)
{
	std::string name;
	for (int i = 0; i < 200; i++)
		name += "\xc3\xa4";
	TProjectViewItem row(nullptr, nullptr, ("x" + name).c_str());
	EXPECT_EQ(row.Text(), "x" + name.substr(0, 254));
	row.SetName(name.c_str());
	EXPECT_EQ(row.Text(), name.substr(0, 254));
}


TEST_F(ProjectWinTest, ClosingTheWindowHidesItUntilTheProgramEnds)
{
	fMessenger.SendMessage(B_QUIT_REQUESTED);
	Settle();
	ASSERT_TRUE(fWindow->Lock());
	EXPECT_TRUE(fWindow->IsHidden());
	EXPECT_FALSE(fWindow->QuitRequested());
	fWindow->Show();
	EXPECT_FALSE(fWindow->IsHidden());
	fWindow->Unlock();

	fWindow->OKToClose(true);
	ASSERT_TRUE(fWindow->Lock());
	fWindow->MoveTo(77, 88);
	EXPECT_TRUE(fWindow->QuitRequested());
	BRect stored;
	EXPECT_EQ(AppSettings.FindRect("ProjectWinFrame", &stored), B_OK);
	EXPECT_EQ(stored, fWindow->Frame());
	fWindow->Unlock();
	Change(FormAt(0), [&] { EXPECT_TRUE(FormAt(0)->QuitRequested()); });

	ProjectWin* next = new ProjectWin;
	ASSERT_TRUE(next->Lock());
	EXPECT_EQ(next->Frame(), stored);
	next->Quit();
	AppSettings.RemoveName("ProjectWinFrame");
}


TEST_F(ProjectWinTest, TheMenuIsOpenedByASecondaryPressOnItsRow)
{
	Send(PM_NEW_FORM);
	BPoint row;
	ASSERT_TRUE(fWindow->Lock());
	const BRect frame = fWindow->View()->ItemFrame(2);
	row = fWindow->View()->ConvertToScreen(BPoint(40, (frame.top + frame.bottom) / 2));
	fWindow->ConvertFromScreen(&row);
	fWindow->Unlock();

	Robot robot(fWindow);
	robot.Click(row, 1, 2);
	ASSERT_TRUE(robot.WaitForWindow("pmProject"));
	ASSERT_TRUE(robot.ClickItem("Set as Main form"));
	EXPECT_TRUE(WaitFor([&] { return fWindow->Project()->IsMainForm(FormAt(1)); }));
	EXPECT_FALSE(fWindow->Project()->IsMainForm(FormAt(0)));

	// On no row, the selection stays.
	Robot again(fWindow);
	again.Click(BPoint(100, 250), 1, 2);
	ASSERT_TRUE(again.WaitForWindow("pmProject"));
	ASSERT_TRUE(again.ClickItem("Remove From Project"));
	EXPECT_TRUE(WaitFor([&] { return Rows() == Texts{"Application", "Form1"}; }));
}


TEST_F(ProjectWinTest, ADoubleClickOpensTheForm)
{
	Change(FormAt(0), [&] { FormAt(0)->Hide(); });
	BPoint row;
	ASSERT_TRUE(fWindow->Lock());
	const BRect frame = fWindow->View()->ItemFrame(1);
	row = fWindow->View()->ConvertToScreen(BPoint(40, (frame.top + frame.bottom) / 2));
	fWindow->ConvertFromScreen(&row);
	fWindow->Unlock();
	Robot(fWindow).Click(row, 2);
	EXPECT_TRUE(WaitFor([&] {
		bool shown = false;
		Change(FormAt(0), [&] { shown = !FormAt(0)->IsHidden(); });
		return shown;
	}));
}


TEST_F(ProjectWinTest, TheUserAnswersTheQuestionBeforeRemoving)
{
	SaveNewProject("test.plim");
	Change(FormAt(0), [&] { FormAt(0)->SetPropertyValue("Title", "A new title"); });
	SelectRow(1);
	SetMessageBoxHook(nullptr);
	fMessenger.SendMessage(PM_REMOVE_FORM);
	Robot robot;
	ASSERT_TRUE(robot.WaitForWindow("Form1 has changed. Save?"));
	ASSERT_TRUE(robot.ClickView("No"));
	EXPECT_TRUE(WaitFor([&] { return Rows() == Texts{"Application"}; }));
	EXPECT_EQ(fFolder.Read("Form1.frm").find("A new title"), std::string::npos);
}


TEST_F(ProjectWinTest, AProjectWithAFormWithoutAFileIsDirty)
{
	EXPECT_TRUE(fWindow->ProjectDirty());
	fWindow->NewProject(false);
	EXPECT_FALSE(fWindow->ProjectDirty());
}


TEST_F(ProjectWinTest, ASavedProjectIsDirtyOnceSomethingChanged)
{
	SaveNewProject("test.plim");
	EXPECT_FALSE(fWindow->ProjectDirty());
	Change(FormAt(0), [&] { FormAt(0)->SetPropertyValue("Title", "A new title"); });
	EXPECT_TRUE(fWindow->ProjectDirty());
	SaveNewProject("test.plim");
	EXPECT_FALSE(fWindow->ProjectDirty());
	ASSERT_TRUE(fWindow->Lock());
	fWindow->View()->AppComponent()->SetPropertyValue("Signature", "application/x-vnd.Test");
	fWindow->Unlock();
	EXPECT_TRUE(fWindow->ProjectDirty());
}


TEST_F(ProjectWinTest, AProjectWithoutChangesClosesWithoutAQuestion)
{
	SaveNewProject("test.plim");
	EXPECT_TRUE(fWindow->CloseProject());
	EXPECT_TRUE(Boxes().empty());
	EXPECT_EQ(Rows(), (Texts{"Application"}));
	EXPECT_STREQ(fWindow->Filename(), "");
}


TEST_F(ProjectWinTest, CancelKeepsTheProject)
{
	const std::string kQuestion = "The 'Application' project has changed. Save before closing?";
	SetAnswers({2});
	EXPECT_FALSE(fWindow->CloseProject());
	EXPECT_EQ(Boxes(), (Texts{kQuestion + "|" + kQuestion + "|Yes"}));
	EXPECT_EQ(Rows(), (Texts{"Application", "Form1"}));
}


TEST_F(ProjectWinTest, NoClosesTheProjectUnsaved)
{
	SetAnswers({1});
	EXPECT_TRUE(fWindow->CloseProject());
	EXPECT_EQ(Rows(), (Texts{"Application"}));
}


TEST_F(ProjectWinTest, YesSavesTheProjectAndItsForms)
{
	SaveNewProject("test.plim");
	Change(FormAt(0), [&] { FormAt(0)->SetPropertyValue("Title", "A new title"); });
	EXPECT_TRUE(fWindow->CloseProject());
	EXPECT_EQ(Boxes().size(), 1u);
	EXPECT_EQ(Rows(), (Texts{"Application"}));
	EXPECT_NE(fFolder.Read("Form1.frm").find("A new title"), std::string::npos);
}


TEST_F(ProjectWinTest, YesAsksForAPlaceWhenTheProjectHasNone)
{
	const int32 before = CountAppMessages(4);
	EXPECT_FALSE(fWindow->CloseProject());
	EXPECT_EQ(CountAppMessages(4), before + 1);
	EXPECT_EQ(Rows(), (Texts{"Application", "Form1"}));
}


TEST_F(ProjectWinTest, YesKeepsWhatCannotBeSaved)
{
	SaveNewProject("test.plim");
	Change(FormAt(0), [&] { FormAt(0)->SetPropertyValue("Title", "A new title"); });
	const std::string before = fFolder.Read("test.plim");

	// The project's own file.
	fWindow->SetFilename((fFolder / "missing/test.plim").c_str());
	EXPECT_FALSE(fWindow->CloseProject());
	EXPECT_EQ(Rows(), (Texts{"Application", "Form1"}));

	// A form's.
	fWindow->SetFilename((fFolder / "test.plim").c_str());
	Change(FormAt(0), [&] {
		FormAt(0)->SetFilename(fFolder.Make("folder.frm").c_str());
		FormAt(0)->SetPropertyValue("Title", "Another title");
	});
	EXPECT_FALSE(fWindow->CloseProject());
	EXPECT_EQ(Rows(), (Texts{"Application", "Form1"}));
	EXPECT_EQ(Boxes().back(), "Warning|Unable to save the form.|OK");
	Change(FormAt(0), [&] { EXPECT_STREQ(FormAt(0)->Title(), "Another title"); });
}


TEST_F(ProjectWinTest, TheNewProjectCommandAsksAndStartsOneWithAForm)
{
	Send(PM_NEW_FORM);
	SetAnswers({2, 1});
	Send(PM_NEW_PROJECT);
	EXPECT_EQ(Rows(), (Texts{"Application", "Form1", "Form2"}));
	Send(PM_NEW_PROJECT);
	EXPECT_EQ(Rows(), (Texts{"Application", "Form1"}));
	EXPECT_TRUE(fWindow->Project()->IsMainForm(FormAt(0)));
	EXPECT_EQ(Boxes().size(), 2u);
}

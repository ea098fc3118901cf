// SPDX-License-Identifier: MIT

#include "project/ProjectWin.h"

#include <cstdio>

#include <Application.h>
#include <Entry.h>
#include <FilePanel.h>
#include <Message.h>
#include <Messenger.h>
#include <Path.h>
#include <Screen.h>
#include <ScrollBar.h>
#include <ScrollView.h>

#include "app/Dialogs.h"
#include "app/WindowFrame.h"
#include "app/WindowGuard.h"
#include "designer/DesignFormView.h"
#include "designer/Inspector.h"
#include "designer/RefFilters.h"
#include "project/Project.h"
#include "project/ProjectOperation.h"
#include "project/ProjectView.h"
#include "project/ProjectViewItem.h"

namespace {

const char* const kFrameKey = "ProjectWinFrame";
// At the right edge of the screen, as high as the property window at the left.
const BPoint kFromRightTop(230, 150);
constexpr float kWidth = 200;
constexpr float kHeight = 300;

// The application's "Save Project As...".
constexpr uint32 kMsgSaveProjectAs = 4;

// "component" (pointer), "name" (string), "started" (int32): how many projects were started before.
constexpr uint32 kMsgNameChanged = 'name';
constexpr uint32 kMsgOperationEnded = 'oper';

} // namespace

ProjectWin::ProjectWin()
	: BWindow(BRect(0, 0, kWidth, kHeight), "Project", B_TITLED_WINDOW,
		B_ASYNCHRONOUS_CONTROLS | B_WILL_ACCEPT_FIRST_CLICK),
	  fProject(std::make_unique<TProject>()),
	  fView(nullptr),
	  fFormFilter(std::make_unique<TFormRefFilter>()),
	  fStarted(0),
	  fSelectionWaits(false),
	  fClosing(false)
{
	InitControls();
	PlaceOnScreen();
	fView->AddRow(fProject->App(), nullptr, fProject->AppName().String());
	fProject->SetObserver(this, this);
	// Runs, but is not shown yet.
	Hide();
	Show();
}


ProjectWin::~ProjectWin()
{
	{
		TProjectOperation operation(fProject.get());
		fProject->SetObserver(nullptr, nullptr);
	}
	fProject.reset();
	WindowRelease release;
	fAddPanel.reset();
}


void
ProjectWin::NewProject(bool withForm)
{
	fProject->NewProject(withForm);
}


bool
ProjectWin::LoadFromFile(const char* path)
{
	return fProject->LoadFromFile(path);
}


bool
ProjectWin::SaveToFile(const char* path, bool saveForms)
{
	return fProject->SaveToFile(path, saveForms);
}


const char*
ProjectWin::Filename() const
{
	return fProject->Filename();
}


void
ProjectWin::SetFilename(const char* name)
{
	fProject->SetFilename(name);
}


bool
ProjectWin::CloseProject()
{
	TProjectOperation operation(fProject.get());
	if (ProjectDirty()) {
		BString text;
		text << "The '" << fProject->AppName() << "' project has changed. Save before closing?";
		const int32 answer = YesNoCancelBox(text.String());
		if (answer == 2 || (answer == 0 && !SaveBeforeClosing()))
			return false;
		if (answer == 1)
			fProject->ForgetCopies();
	}
	NewProject(false);
	return true;
}


bool
ProjectWin::ProjectDirty()
{
	return fProject->IsDirty();
}


void
ProjectWin::ObjectNameChanged(TComponent* object)
{
	fProject->ObjectNameChanged(object);
}


void
ProjectWin::OKToClose(bool closing)
{
	{
		WindowGuard guard(this);
		fClosing = closing;
	}
	fProject->SetFormsClosing(closing);
}


std::vector<TDesignForm*>
ProjectWin::Forms() const
{
	return fProject->Forms();
}


void
ProjectWin::MessageReceived(BMessage* message)
{
	switch (message->what) {
		case PM_OPEN_FORM:
		case PM_INVOKED:
		case PM_NEW_FORM:
		case PM_REMOVE_FORM:
		case PM_NEW_PROJECT:
		case PM_SET_MAIN_FORM:
			HandleCommand(message->what);
			break;

		case PM_ADD_TO_PROJECT:
			ShowAddPanel();
			break;

		case PM_FORMS_CHOSEN:
			AddChosenForms(message);
			break;

		case PM_SELECTED:
			ShowSelection();
			break;

		case kMsgNameChanged:
			FollowName(message);
			break;

		case kMsgOperationEnded:
			if (fSelectionWaits)
				ShowSelection();
			break;

		case B_SIMPLE_DATA:
			// Beside the list.
			if (message->HasRef("refs"))
				fView->MessageReceived(message);
			else
				BWindow::MessageReceived(message);
			break;

		default:
			BWindow::MessageReceived(message);
			break;
	}
}


bool
ProjectWin::QuitRequested()
{
	if (fClosing) {
		StoreWindowFrame(this, kFrameKey);
		return true;
	}
	if (!IsHidden())
		Hide();
	return false;
}


void
ProjectWin::ProjectStarted(TAppComponent* app)
{
	{
		WindowGuard guard(this, B_INFINITE_TIMEOUT);
		if (!guard.IsLocked())
			return;
		fStarted++;
		fView->ClearRows();
		fView->AddRow(app, nullptr, app->ComponentName());
	}
	Inspector::Load(app, fView);
}


void
ProjectWin::FormAdded(TDesignForm* form, const char* name)
{
	WindowGuard guard(this, B_INFINITE_TIMEOUT);
	if (guard.IsLocked())
		fView->AddRow(form, form, name);
}


void
ProjectWin::FormRemoved(TDesignForm* form)
{
	WindowGuard guard(this, B_INFINITE_TIMEOUT);
	if (guard.IsLocked())
		fView->RemoveRow(form);
}


void
ProjectWin::NameChanged(TComponent* object, const char* name)
{
	BMessage changed(kMsgNameChanged);
	changed.AddPointer("component", object);
	changed.AddString("name", name);
	changed.AddInt32("started", fStarted);
	PostMessage(&changed);
}


void
ProjectWin::OperationEnded()
{
	PostMessage(kMsgOperationEnded);
}


void
ProjectWin::PlaceOnScreen()
{
	const BRect screen = BScreen(this).Frame();
	const BPoint place(screen.right - kFromRightTop.x, screen.top + kFromRightTop.y);
	if (screen.Contains(place))
		MoveTo(place);
	RestoreWindowFrame(this, kFrameKey);
}


void
ProjectWin::InitControls()
{
	BRect frame = Bounds();
	frame.right -= B_V_SCROLL_BAR_WIDTH;
	fView = new ProjectView(frame, fProject.get());
	AddChild(new BScrollView("svProject", fView, B_FOLLOW_ALL_SIDES, 0, false, true, B_NO_BORDER));
}


/// Carries out what works on the project, unless another thread does.
void
ProjectWin::HandleCommand(uint32 command)
{
	TProjectOperation operation(fProject.get(), 0);
	if (!operation.IsBegun())
		return;

	switch (command) {
		case PM_OPEN_FORM:
		case PM_INVOKED:
			OpenForm();
			break;

		case PM_NEW_FORM:
			fProject->NewForm();
			break;

		case PM_REMOVE_FORM:
			RemoveForm();
			break;

		case PM_NEW_PROJECT:
			if (CloseProject())
				NewProject(true);
			break;

		case PM_SET_MAIN_FORM:
			SetMainForm();
			break;
	}
}


void
ProjectWin::OpenForm()
{
	const TProjectViewItem* row = fView->SelectedRow();
	TDesignForm* form = row != nullptr ? row->Form() : nullptr;
	WindowGuard guard(form);
	if (!guard.IsLocked())
		return;
	if (form->IsHidden())
		form->Show();
	if (form->IsMinimized())
		form->Minimize(false);
	form->Activate();
}


void
ProjectWin::RemoveForm()
{
	const TProjectViewItem* row = fView->SelectedRow();
	TDesignForm* form = row != nullptr ? row->Form() : nullptr;
	if (form == nullptr)
		return;

	BString question;
	{
		WindowGuard guard(form, B_INFINITE_TIMEOUT);
		if (guard.IsLocked() && TProject::IsChanged(form))
			question << form->ComponentName() << " has changed. Save?";
	}
	if (!question.IsEmpty() && YesNoBox(question.String()) == 0 && !fProject->SaveForm(form))
		return;
	fProject->RemoveForm(form);
}


void
ProjectWin::SetMainForm()
{
	const TProjectViewItem* row = fView->SelectedRow();
	if (row == nullptr)
		return;
	fProject->SetMainForm(row->Form());
	fView->UpdateMenu();
}


void
ProjectWin::ShowSelection()
{
	fView->UpdateMenu();
	TProjectOperation operation(fProject.get(), 0);
	// A form that is being loaded is left alone; this is made up for afterwards.
	fSelectionWaits = !operation.IsBegun();
	const TProjectViewItem* row = fView->SelectedRow();
	if (fSelectionWaits || row == nullptr)
		return;
	TDesignForm* form = row->Form();
	Inspector::Load(row->Component(), form != nullptr ? form->View() : static_cast<BView*>(fView));
}


void
ProjectWin::ShowAddPanel()
{
	WindowRelease release;
	if (fAddPanel == nullptr) {
		BMessenger target(this);
		BMessage chosen(PM_FORMS_CHOSEN);
		fAddPanel = std::make_unique<BFilePanel>(
			B_OPEN_PANEL, &target, nullptr, 0, true, &chosen, fFormFilter.get());
	}
	fAddPanel->Show();
}


void
ProjectWin::AddChosenForms(BMessage* message)
{
	entry_ref ref;
	for (int32 i = 0; message->FindRef("refs", i, &ref) == B_OK; i++) {
		const BPath path(&ref);
		if (path.InitCheck() != B_OK)
			continue;
		printf("Adding %s to project\n", path.Path());
		if (fView->AddForm(path.Path()))
			continue;
		BString text;
		text << "Unable to add '" << path.Path() << "' to the project.";
		MsgBox("Warning", text.String(), "OK");
	}
}


/// Gives a row its new name. The object of the message may be gone.
void
ProjectWin::FollowName(BMessage* message)
{
	TComponent* component;
	const char* name;
	if (message->FindPointer("component", reinterpret_cast<void**>(&component)) != B_OK
		|| message->FindString("name", &name) != B_OK
		|| message->GetInt32("started", -1) != fStarted)
		return;

	BString present(name);
	if (TDesignForm* form = fView->FormOf(component)) {
		// A later form may lie where that one was: what counts is its name now.
		WindowGuard guard(form);
		if (!guard.IsLocked())
			return;
		present = form->ComponentName();
	}
	fView->RenameRow(component, present.String());
}


/// Saves the project that is to be closed; false when it must stay.
bool
ProjectWin::SaveBeforeClosing()
{
	const BString filename(Filename());
	if (filename.IsEmpty()) {
		be_app->PostMessage(kMsgSaveProjectAs);
		return false;
	}
	// Forms that could not be written were told about, and would be lost.
	return SaveToFile(filename.String(), true) && !fProject->HasUnsavedForms();
}

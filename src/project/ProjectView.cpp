// SPDX-License-Identifier: MIT

#include "project/ProjectView.h"

#include <memory>

#include <Entry.h>
#include <Menu.h>
#include <MenuItem.h>
#include <Message.h>
#include <Path.h>
#include <PopUpMenu.h>
#include <Window.h>

#include "app/Dialogs.h"
#include "project/Project.h"
#include "project/ProjectOperation.h"
#include "project/ProjectViewItem.h"

ProjectView::ProjectView(BRect frame, TProject* project)
	: BOutlineListView(frame, "lvProject", B_SINGLE_SELECTION_LIST, B_FOLLOW_ALL_SIDES),
	  fProject(project),
	  fMenu(new BPopUpMenu("pmProject", false, false))
{
	SetSelectionMessage(new BMessage(PM_SELECTED));
	SetInvocationMessage(new BMessage(PM_INVOKED));
	MakeMenu();
}


ProjectView::~ProjectView()
{
	ClearRows();
	delete fMenu;
}


void
ProjectView::AttachedToWindow()
{
	BOutlineListView::AttachedToWindow();
	fMenu->SetTargetForItems(Window());
}


void
ProjectView::MouseDown(BPoint where)
{
	int32 buttons = 0;
	const BMessage* message = Window()->CurrentMessage();
	if (message == nullptr || message->FindInt32("buttons", &buttons) != B_OK
		|| (buttons & B_SECONDARY_MOUSE_BUTTON) == 0) {
		BOutlineListView::MouseDown(where);
		return;
	}
	// The menu is about the row that it is opened on.
	const int32 row = IndexOf(where);
	if (row >= 0)
		Select(row);
	OpenMenu(where);
}


// The codes of the window's messages have no meaning here: messages that are sent to the list itself
// are the base class's business.
void
ProjectView::MessageReceived(BMessage* message)
{
	if (message->what == B_SIMPLE_DATA && message->HasRef("refs"))
		AddDroppedForm(message);
	else
		BOutlineListView::MessageReceived(message);
}


TAppComponent*
ProjectView::AppComponent() const
{
	return fProject->App();
}


bool
ProjectView::AddForm(const char* path)
{
	TProjectOperation operation(fProject, 0);
	return operation.IsBegun() && fProject->AddFormFile(path) != nullptr;
}


void
ProjectView::ClearRows()
{
	std::vector<std::unique_ptr<BListItem>> rows;
	for (int32 i = 0; i < FullListCountItems(); i++)
		rows.emplace_back(FullListItemAt(i));
	MakeEmpty();
}


void
ProjectView::AddRow(TComponent* component, TDesignForm* form, const char* name)
{
	AddItem(new TProjectViewItem(component, form, name));
}


void
ProjectView::RemoveRow(TDesignForm* form)
{
	for (int32 i = 0; i < FullListCountItems(); i++) {
		TProjectViewItem* row = RowAt(i);
		if (row->Form() == form) {
			RemoveItem(i);
			delete row;
			return;
		}
	}
}


void
ProjectView::RenameRow(const TComponent* component, const char* name)
{
	for (int32 i = 0; i < FullListCountItems(); i++) {
		TProjectViewItem* row = RowAt(i);
		if (row->Component() == component) {
			row->SetName(name);
			InvalidateItem(IndexOf(row));
			return;
		}
	}
}


TDesignForm*
ProjectView::FormOf(const TComponent* component) const
{
	for (int32 i = 0; i < FullListCountItems(); i++) {
		if (RowAt(i)->Component() == component)
			return RowAt(i)->Form();
	}
	return nullptr;
}


TProjectViewItem*
ProjectView::RowAt(int32 index) const
{
	return static_cast<TProjectViewItem*>(FullListItemAt(index));
}


TProjectViewItem*
ProjectView::SelectedRow() const
{
	const int32 index = FullListCurrentSelection();
	return index >= 0 ? RowAt(index) : nullptr;
}


void
ProjectView::UpdateMenu()
{
	TProjectOperation operation(fProject, 0);
	const bool isFree = operation.IsBegun();
	const TProjectViewItem* row = SelectedRow();
	TDesignForm* form = isFree && row != nullptr ? row->Form() : nullptr;

	for (uint32 command : {PM_NEW_PROJECT, PM_ADD_TO_PROJECT, PM_NEW_FORM})
		fMenu->FindItem(command)->SetEnabled(isFree);
	for (uint32 command : {PM_OPEN_FORM, PM_REMOVE_FORM, PM_SET_MAIN_FORM})
		fMenu->FindItem(command)->SetEnabled(form != nullptr);
	fMenu->FindItem(PM_SET_MAIN_FORM)->SetMarked(form != nullptr && fProject->IsMainForm(form));
}


void
ProjectView::MakeMenu()
{
	struct menu_item {
		const char* label;
		uint32 command;
	};
	const menu_item kItems[] = {{"New Project", PM_NEW_PROJECT},
		{"Add to project...", PM_ADD_TO_PROJECT}, {nullptr, 0}, {"New Form", PM_NEW_FORM},
		{"Open", PM_OPEN_FORM}, {"Remove From Project", PM_REMOVE_FORM}, {nullptr, 0},
		{"Set as Main form", PM_SET_MAIN_FORM}};
	for (const menu_item& item : kItems) {
		if (item.label == nullptr)
			fMenu->AddSeparatorItem();
		else
			fMenu->AddItem(new BMenuItem(item.label, new BMessage(item.command)));
	}
	UpdateMenu();
}


void
ProjectView::OpenMenu(BPoint where)
{
	const BPoint onScreen = ConvertToScreen(where);
	UpdateMenu();
	// The window goes on meanwhile: another thread may add the forms of a project that it loads.
	fMenu->Go(onScreen, true, true, true);
}


void
ProjectView::AddDroppedForm(BMessage* message)
{
	entry_ref ref;
	BPath path;
	if (message->FindRef("refs", &ref) != B_OK || path.SetTo(&ref) != B_OK)
		return;
	if (AddForm(path.Path()))
		return;
	BString text;
	text << "Unable to add " << path.Path() << " to the project.";
	MsgBox("Warning", text.String(), "OK");
}

// SPDX-License-Identifier: MIT
// The list of a project's application and forms.

#pragma once

#include <OutlineListView.h>

class BPopUpMenu;
class TAppComponent;
class TComponent;
class TDesignForm;
class TProject;
class TProjectViewItem;

/// Codes of the project window's messages.
enum {
	PM_OPEN_FORM = 1,
	PM_NEW_FORM = 2,
	PM_REMOVE_FORM = 4,
	PM_NEW_PROJECT = 5,
	PM_ADD_TO_PROJECT = 6,
	PM_SET_MAIN_FORM = 7,
	PM_SELECTED = 8,
	PM_INVOKED = 9,
	PM_FORMS_CHOSEN = 10 // "refs" (entry_ref, several): from the file panel
};

/// The list "lvProject": the first row is the application's, then comes one for each form.
///
/// A secondary press opens the menu "pmProject". Form files that are dropped are added to the project.
/// Lock the window unless an operation says otherwise.
class ProjectView : public BOutlineListView {
public:
	/// \a project: not owned.
	ProjectView(BRect frame, TProject* project);
	/// Deletes the rows.
	virtual ~ProjectView();

	// BView
	void AttachedToWindow() override;
	void MouseDown(BPoint where) override;
	void MessageReceived(BMessage* message) override;

	/// The application component of the project. Any thread, without a lock; it goes when another project is
	/// started, which a TProjectOperation keeps from happening.
	TAppComponent* AppComponent() const;

	/// Adds the form in the file at \a path to the project, and its row to the list.
	///
	/// The file is read in the new form's thread; meanwhile the thread that calls gives up its lock. False, with
	/// nothing added, when it is no form file or cannot be read, and while another thread loads or saves
	/// the project.
	bool AddForm(const char* path);

	/// Removes and deletes all rows.
	void ClearRows();
	void AddRow(TComponent* component, TDesignForm* form, const char* name);
	void RemoveRow(TDesignForm* form);
	/// Gives the component's row its new text; without such a row nothing happens.
	void RenameRow(const TComponent* component, const char* name);

	/// The form whose row stands for \a component; none for the application and what has no row.
	TDesignForm* FormOf(const TComponent* component) const;

	TProjectViewItem* RowAt(int32 index) const;
	/// None when no row is selected.
	TProjectViewItem* SelectedRow() const;

	/// Enables the menu's items that need a form, and marks "Set as Main form", by the selected row.
	void UpdateMenu();
	BPopUpMenu* Menu() const { return fMenu; }

private:
	void MakeMenu();
	void OpenMenu(BPoint where);
	void AddDroppedForm(BMessage* message);

	TProject* fProject;
	BPopUpMenu* fMenu;
};

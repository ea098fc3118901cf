// SPDX-License-Identifier: MIT
// The window of the project.

#pragma once

#include <atomic>
#include <memory>
#include <vector>

#include <Window.h>

#include "project/ProjectObserver.h"

class BFilePanel;
class BRefFilter;
class ProjectView;
class TProject;

/// Shows the open project as a list, and carries out what is done to it as a whole.
///
/// The window owns the project. The operations up to CloseProject() are called from any thread: one at a time
/// works on the project, the others wait for it, giving up the lock that they hold. They lock the windows that
/// they need, one at a time, so call them with no window locked but by a WindowGuard, or from within a window's own
/// hooks. While another thread's operation is under way, the window's own commands are refused.
///
/// The window is made hidden, without a project; show it with Show().
class ProjectWin : public BWindow, private TProjectObserver {
public:
	ProjectWin();
	/// Closes the forms.
	virtual ~ProjectWin();

	/// Starts a new project, without asking: an application, and with \a withForm the main form "Form1".
	void NewProject(bool withForm);

	/// Reads the project from \a path, without asking. False, with a new, empty project, when it cannot be opened.
	/// A form that cannot be read is told about in a box.
	bool LoadFromFile(const char* path);

	/// Writes the project to \a path, which becomes its file; with \a saveForms the forms, too, to theirs. False when
	/// the project's file cannot be written.
	bool SaveToFile(const char* path, bool saveForms);

	/// The project's file, at most 255 bytes; empty for a project that was never saved. Valid until the next
	/// operation of the calling thread that changes it.
	const char* Filename() const;
	void SetFilename(const char* name);

	/// Asks whether to save a project that has changed, and starts a new, empty one.
	///
	/// False, with the project as it is, when the user cancels, when it could not be saved, and when it has no
	/// file: the application is then told to ask for one.
	bool CloseProject();

	/// Whether the application or a form has changed, or a form has no file.
	bool ProjectDirty();

	/// A form or the application has a new name: its row follows. The object's own thread, locked.
	void ObjectNameChanged(TComponent* object);

	/// Lets the window and its forms really close from now on. Any thread, no lock but one by a WindowGuard.
	void OKToClose(bool closing);

	/// The list, from which the application component is had. Any thread, without a lock.
	ProjectView* View() const { return fView; }
	TProject* Project() const { return fProject.get(); }

	/// The project's forms, in its order, as they are now. Any thread, without a lock; see TFormHost::Forms().
	std::vector<TDesignForm*> Forms() const;

	// BWindow
	void MessageReceived(BMessage* message) override;
	bool QuitRequested() override;

private:
	// TProjectObserver
	void ProjectStarted(TAppComponent* app) override;
	void FormAdded(TDesignForm* form, const char* name) override;
	void FormRemoved(TDesignForm* form) override;
	void NameChanged(TComponent* object, const char* name) override;
	void OperationEnded() override;

	void PlaceOnScreen();
	void InitControls();
	void HandleCommand(uint32 command);
	void OpenForm();
	void RemoveForm();
	void SetMainForm();
	void ShowSelection();
	void ShowAddPanel();
	void AddChosenForms(BMessage* message);
	void FollowName(BMessage* message);
	bool SaveBeforeClosing();

	std::unique_ptr<TProject> fProject;
	ProjectView* fView;
	std::unique_ptr<BRefFilter> fFormFilter;
	std::unique_ptr<BFilePanel> fAddPanel;
	// How many projects were started: names of objects of an earlier one concern nobody any more.
	std::atomic<int32> fStarted;
	// A row was selected while another thread worked on the project.
	bool fSelectionWaits;
	bool fClosing;
};

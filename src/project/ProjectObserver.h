// SPDX-License-Identifier: MIT
// Who shows a project and hears of its changes.

#pragma once

class TAppComponent;
class TComponent;
class TDesignForm;

/// Hears of the changes of a project as they happen, so that a list of its forms fills while it is loaded.
///
/// Except for names, the hooks are called by the thread whose operation changes the project, with no
/// window's lock held, and the project waits for them.
class TProjectObserver {
public:
	/// \a app is the application from now on. There are no forms; those that were there are about to go.
	virtual void ProjectStarted(TAppComponent* app) = 0;

	/// The project has another form, at the end of its list.
	virtual void FormAdded(TDesignForm* form, const char* name) = 0;

	/// The form is no longer one of the project, and about to go.
	virtual void FormRemoved(TDesignForm* form) = 0;

	/// \a object, the application or a form, is now called \a name. Any thread, with any window locked: lock
	/// none, wait for none.
	virtual void NameChanged(TComponent* object, const char* name) = 0;

	/// The thread that worked on the project is done. Any thread, with any window locked: lock none, wait for none.
	virtual void OperationEnded() = 0;

protected:
	~TProjectObserver() = default;
};

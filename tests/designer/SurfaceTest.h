// SPDX-License-Identifier: MIT
// The designer within a test, with a form that is used with the mouse.

#pragma once

#include <functional>
#include <string>
#include <thread>
#include <vector>

#include <gtest/gtest.h>

#include <Rect.h>

#include "designer/DesignForm.h"
#include "designer/DesignFormView.h"
#include "project/ProjectWin.h"
#include "props/PropertyWin.h"
#include "support/Robot.h"
#include "support/TemporaryFolder.h"

/// The designer with the standard components and the new project's form, "Form1", which the robot works on.
///
/// Boxes are answered by Answer() and noted. Coordinates are the form's. What looks at windows locks them.
class SurfaceTest : public testing::Test {
protected:
	SurfaceTest();
	~SurfaceTest();

	/// A second form of the project, beside the first; the robot goes on with the first.
	TDesignForm* NewForm();
	/// The robot works on \a form, which becomes active.
	void WorkOn(TDesignForm* form);
	/// The form that the robot works on.
	TDesignForm* Form() const { return fForm; }

	/// Chooses a class on the palette; it waits then.
	static void Choose(const char* className);
	/// Chooses a class and draws a component's frame with the mouse; the new component, or none.
	TComponent* Draw(const char* className, BRect frame);

	/// Runs \a task with the form locked.
	void Locked(const std::function<void()>& task) const;
	TComponent* Find(const char* name) const;
	/// The names of the form's components, in order, divided by blanks.
	std::string Names() const;
	/// Of the component's view, in its parent's coordinates, and in the form's.
	BRect Frame(TComponent* component) const;
	BRect FrameOnForm(TComponent* component) const;
	/// The frame that the component's properties tell.
	BRect ToldFrame(TComponent* component) const;
	std::string Value(TComponent* component, const char* property) const;
	bool IsSelected(TComponent* component) const;
	/// The name of the component in whose view the component's view lies; "" for the form itself.
	std::string Parent(TComponent* component) const;
	/// The names of the components that \a container lists.
	std::string Children(TComponent* container) const;
	bool IsModified() const;
	void SetModified(bool modified) const;

	PropertyWin* Inspector() const;
	/// What the property window shows.
	TComponent* Shown() const;
	/// Double-clicks the property's row in the property window, which the robot works on then.
	void Invoke(const char* property);

	/// Chooses an item of the menu that the secondary button opens at \a where.
	bool ChooseFromMenu(BPoint where, const char* label);

	/// What boxes get for an answer from here on; the first button to begin with.
	static void Answer(int32 button);
	/// The boxes so far, "TITLE|TEXT" each.
	static std::vector<std::string> Boxes();

	TemporaryFolder fFolder;
	Robot fRobot;

private:
	TDesignForm* fForm;
	std::thread fApplication;
};

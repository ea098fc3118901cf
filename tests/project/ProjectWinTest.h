// SPDX-License-Identifier: MIT
// What tests of the project window share: the window, shown, and answers to its boxes.

#pragma once

#include <gtest/gtest.h>

#include <functional>
#include <string>
#include <vector>

#include <Messenger.h>

#include "project/ProjectView.h"
#include "project/ProjectWin.h"
#include "support/Robot.h"
#include "support/TemporaryFolder.h"

class TDesignForm;

/// Tests with a project window and forms that are really shown.
///
/// Boxes are answered by SetAnswers(), in order, and with their first button once those are used up; what they
/// said is in Boxes(). At the end no thread may have held two windows' locks.
class ProjectWinTest : public testing::Test {
protected:
	static void SetUpTestSuite();

	ProjectWinTest();
	~ProjectWinTest();

	void SetUp() override;
	void TearDown() override;

	/// Sends the window a message, and waits until it has handled it and what came of that.
	void Send(uint32 what);
	void Send(BMessage* message);

	/// Lets the windows come to rest.
	void Settle();

	/// The rows' texts, from the top.
	std::vector<std::string> Rows();
	void SelectRow(int32 index);
	TDesignForm* FormAt(int32 index);

	/// Writes a form of that name to a file and returns its path.
	std::string WriteForm(const std::string& file, const char* name);

	/// Writes a project with the forms "Form1" to "FormN", in files of those names.
	std::string WriteProject(const std::string& file, int32 forms);

	/// Starts a project of "Form1" that is saved under \a file.
	void SaveNewProject(const std::string& file);

	/// Runs \a change with the form locked.
	void Change(TDesignForm* form, const std::function<void()>& change);

	/// Whether a menu's item can be chosen, or is marked.
	bool IsEnabled(uint32 command);
	bool IsMarked(uint32 command);

	static void SetAnswers(std::vector<int32> answers);
	static std::vector<std::string> Boxes();

	/// Tries until \a condition holds; false when it does not within half a minute.
	static bool WaitFor(const std::function<bool()>& condition);

	TemporaryFolder fFolder;
	ProjectWin* fWindow;
	BMessenger fMessenger;

private:
	int32 fViolationsBefore;
};

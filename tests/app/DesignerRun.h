// SPDX-License-Identifier: MIT
// The designer within a test.

#pragma once

#include <functional>
#include <string>
#include <vector>

#include <gtest/gtest.h>

#include <Messenger.h>

#include "app/PlimApp.h"
#include "support/Robot.h"
#include "support/TemporaryFolder.h"

/// Runs the designer, without component libraries and with settings of its own, for the length of a test.
///
/// Boxes are answered by Answer() and noted.
class DesignerTest : public testing::Test {
protected:
	DesignerTest();
	~DesignerTest();

	/// Starts the designer and runs its loop, while \a user works with it in a thread of its own. Quits it in the
	/// end. Returns when it has gone.
	void Run(const std::function<void()>& user);

	/// What boxes get for an answer from here on; the first button to begin with.
	static void Answer(int32 button);
	/// The boxes so far, "TITLE|TEXT" each.
	static std::vector<std::string> Boxes();

	/// Sends \a message and waits until it was handled.
	static void Tell(const BMessenger& target, BMessage* message);
	static void Tell(const BMessenger& target, uint32 what);

	TemporaryFolder fFolder;
	Robot fRobot;
};

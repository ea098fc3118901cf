// SPDX-License-Identifier: MIT
// Waiting for what the property window shows with the next frame.

#pragma once

#include <OS.h>
#include <gtest/gtest.h>

#include "app/WindowGuard.h"
#include "props/PropertyWin.h"
#include "support/Patience.h"
#include "support/Robot.h"

/// Waits until \a window shows the values of now. No window is locked.
inline void
WaitForLatestValues(PropertyWin* window, Robot& robot)
{
	robot.Settle();
	const auto isWaiting = [window] {
		WindowGuard guard(window);
		return !window->ShowsLatestValues();
	};
	for (int i = 0; isWaiting() && i < 2000 * Patience(); i++)
		snooze(1000);
	EXPECT_FALSE(isWaiting());
	// It may have begun to show them.
	robot.Settle();
}

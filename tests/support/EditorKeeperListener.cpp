// SPDX-License-Identifier: MIT
// Deletes the property editors at the end of a test program. Linked to those whose leaks are checked.

#include <gtest/gtest.h>

#include "support/EditorKeeper.h"

namespace {

class EditorKeeperListener : public testing::EmptyTestEventListener {
public:
	void OnTestProgramEnd(const testing::UnitTest&) override { DeleteForgottenEditors(); }
};


[[maybe_unused]] const bool sListens = [] {
	testing::UnitTest::GetInstance()->listeners().Append(new EditorKeeperListener);
	return true;
}();

} // namespace

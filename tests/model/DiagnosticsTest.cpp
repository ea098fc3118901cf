// SPDX-License-Identifier: MIT

#include <string>

#include <gtest/gtest.h>

#include "model/Diagnostics.h"
#include "support/CapturedOutput.h"

namespace {

class DiagnosticsTest : public testing::Test {
protected:
	~DiagnosticsTest() override { ShowDiagnostics(true); }
};

} // namespace

TEST_F(DiagnosticsTest, ADiagnosticIsPrintedAsFormatted)
{
	CapturedOutput output;
	PrintDiagnostic("%s: %ld\n", "Button1", 12L);
	EXPECT_EQ(output.Text(), "Button1: 12\n");
}


TEST_F(DiagnosticsTest, ACallIsPrintedWithItsTexts)
{
	const std::string longText(2000, 'x');
	CapturedOutput output;
	PrintCall("Set", "Label", "OK");
	PrintCall("Set", nullptr, nullptr);
	PrintCall("Set", "Label", longText.c_str());
	EXPECT_EQ(output.Text(),
		"Set('Label', 'OK')\nSet('(null)', '(null)')\nSet('Label', '" + longText + "')\n");
}


TEST_F(DiagnosticsTest, NothingIsPrintedUnlessShown)
{
	CapturedOutput output;
	ShowDiagnostics(false);
	PrintDiagnostic("%s\n", "Button1");
	PrintCall("Set", "Label", "OK");
	ShowDiagnostics(true);
	PrintDiagnostic("again\n");
	EXPECT_EQ(output.Text(), "again\n");
}

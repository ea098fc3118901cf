// SPDX-License-Identifier: MIT
// Patches.

#include "codegen/UnifiedDiff.h"

#include <gtest/gtest.h>

namespace {

std::string
Diff(const char* oldText, const char* newText)
{
	return UnifiedDiff("old", "new", oldText, newText);
}

} // namespace


TEST(UnifiedDiffTest, OfEqualTextsIsEmpty)
{
	EXPECT_EQ(Diff("a\nb\n", "a\nb\n"), "");
	EXPECT_EQ(Diff("", ""), "");
}


TEST(UnifiedDiffTest, ShowsAChangedLineInItsContext)
{
	EXPECT_EQ(Diff("1\n2\n3\n4\n5\n6\n7\n8\n9\n", "1\n2\n3\n4\nfive\n6\n7\n8\n9\n"),
		"--- old\n+++ new\n@@ -2,7 +2,7 @@\n 2\n 3\n 4\n-5\n+five\n 6\n 7\n 8\n");
}


TEST(UnifiedDiffTest, OfANewFileAddsEveryLine)
{
	EXPECT_EQ(UnifiedDiff("/dev/null", "f", "", "a\nb\n"),
		"--- /dev/null\n+++ f\n@@ -0,0 +1,2 @@\n+a\n+b\n");
	EXPECT_EQ(Diff("a\n", ""), "--- old\n+++ new\n@@ -1 +0,0 @@\n-a\n");
}


TEST(UnifiedDiffTest, JoinsChangesWhoseContextsTouch)
{
	EXPECT_EQ(Diff("a\n1\n2\n3\n4\n5\n6\nb\n", "A\n1\n2\n3\n4\n5\n6\nB\n"),
		"--- old\n+++ new\n@@ -1,8 +1,8 @@\n-a\n+A\n 1\n 2\n 3\n 4\n 5\n 6\n-b\n+B\n");
	EXPECT_EQ(Diff("a\n1\n2\n3\n4\n5\n6\n7\nb\n", "A\n1\n2\n3\n4\n5\n6\n7\nB\n"),
		"--- old\n+++ new\n@@ -1,4 +1,4 @@\n-a\n+A\n 1\n 2\n 3\n@@ -6,4 +6,4 @@\n 5\n 6\n "
		"7\n-b\n+B\n");
}


TEST(UnifiedDiffTest, TellsOfAMissingLastLineBreak)
{
	EXPECT_EQ(Diff("a\nb", "a\nb\n"),
		"--- old\n+++ new\n@@ -1,2 +1,2 @@\n a\n-b\n\\ No newline at end of file\n+b\n");
}


TEST(UnifiedDiffTest, KeepsSharedLinesApartFromChanges)
{
	EXPECT_EQ(Diff("a\nb\nc\na\nb\nb\na\n", "c\nb\na\nb\na\nc\n"),
		"--- old\n+++ new\n@@ -1,7 +1,6 @@\n-a\n-b\n c\n+b\n a\n b\n-b\n a\n+c\n");
}


TEST(UnifiedDiffTest, OfTextsWithNothingInCommonReplacesAllInReasonableTime)
{
	std::string oldText;
	std::string newText;
	for (int i = 0; i < 20000; i++) {
		oldText += "old" + std::to_string(i) + "\n";
		newText += "new" + std::to_string(i) + "\n";
	}
	const std::string diff = UnifiedDiff("old", "new", oldText, newText);
	EXPECT_EQ(
		diff.find("@@ -1,20000 +1,20000 @@\n-old0\n"), std::string("--- old\n+++ new\n").length());
	EXPECT_NE(diff.find("-old19999\n+new0\n"), std::string::npos);
}

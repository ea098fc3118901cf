// SPDX-License-Identifier: MIT
// Marked sections, placeholders, lines and function bodies.

#include "codegen/SourceText.h"

#include <string>

#include <gtest/gtest.h>

namespace {

std::string
Normalized(const std::string& data, int32* cutLine = nullptr)
{
	BString text;
	const int32 cut = AppendNormalizedLines(data.data(), data.length(), text);
	if (cutLine != nullptr)
		*cutLine = cut;
	return text.String();
}


std::string
Merged(const char* oldText, const char* content)
{
	BString text(oldText);
	WriteMachineSection("PART", BString(content), true, text);
	return text.String();
}


std::string
Body(const char* text, long start = 0)
{
	return FunctionBody(BString(text), start).String();
}

} // namespace


TEST(MachineSectionTest, OfANewFileIsAppendedWithBothMarkersAndAnEmptyLine)
{
	BString text("before\n");
	EXPECT_TRUE(WriteMachineSection("PART", BString("content\n"), false, text));
	EXPECT_STREQ(text.String(), "before\n// [PART]\ncontent\n// [END_PART]\n\n");
}


TEST(MachineSectionTest, OfANewFileIsAppendedEvenWhenTheTextHoldsTheMarkers)
{
	BString text("// [PART]\n// [END_PART]\n");
	WriteMachineSection("PART", BString("new\n"), false, text);
	EXPECT_STREQ(text.String(), "// [PART]\n// [END_PART]\n// [PART]\nnew\n// [END_PART]\n\n");
}


TEST(MachineSectionTest, OfAnExistingFileIsReplacedBetweenItsMarkers)
{
	struct merge_case {
		const char* name;
		const char* before;
		const char* after;
	} const cases[] = {
		{"content", "a\n// [PART]\nold\nold\n// [END_PART]\nz\n",
			"a\n// [PART]\nnew\n// [END_PART]\nz\n"},
		{"no content", "// [PART]\n// [END_PART]", "// [PART]\nnew\n// [END_PART]"},
		{"markers in other letter case", "// [part]\nold\n// [End_Part]\n",
			"// [part]\nnew\n// [End_Part]\n"},
		{"indented markers", "\t// [PART]\nold\n\t// [END_PART]\n",
			"\t// [PART]\nnew\n// [END_PART]\n"},
		{"the first of two sections", "// [PART]\n1\n// [END_PART]\n// [PART]\n2\n// [END_PART]\n",
			"// [PART]\nnew\n// [END_PART]\n// [PART]\n2\n// [END_PART]\n"},
		{"two start markers", "// [PART]\n1\n// [PART]\n2\n// [END_PART]\n",
			"// [PART]\nnew\n// [END_PART]\n"},
		{"another section whose name begins alike", "// [PARTS]\n1\n// [PART]\n2\n// [END_PART]\n",
			"// [PARTS]\n1\n// [PART]\nnew\n// [END_PART]\n"},
		{"a carriage return before the line break", "// [PART]\r\nold\r\n// [END_PART]\r\n",
			"// [PART]\r"
			"new\n// [END_PART]\r\n"},
		{"text behind the start marker", "// [PART]; mine\nold\n// [END_PART]\n",
			"// [PART];new\n// [END_PART]\n"},
		{"markers one character apart", "// [PART] // [END_PART]", "// [PART] new\n// [END_PART]"},
	};
	for (const merge_case& each : cases)
		EXPECT_EQ(Merged(each.before, "new\n"), each.after) << each.name;
}


TEST(MachineSectionTest, WithoutBothMarkersInOrderKeepsTheTextAndDropsTheContent)
{
	const char* const texts[] = {
		"",
		"no marker\n",
		"// [PART]\nthe end marker is gone\n",
		"the start marker is gone\n// [END_PART]\n",
		"// [END_PART]\nthe wrong way round\n// [PART]\n",
		"// [END_PART]\n// [PART]\nan end marker comes first\n// [END_PART]\n",
		"// [PART]// [END_PART]\n",
		"//[PART]\nno blank\n//[END_PART]\n",
	};
	for (const char* each : texts) {
		BString text(each);
		EXPECT_FALSE(WriteMachineSection("PART", BString("new\n"), true, text)) << each;
		EXPECT_STREQ(text.String(), each);
	}
}


TEST(MachineSectionTest, TakesNamesOfAnyLength)
{
	const std::string name(300, 'N');
	BString text;
	WriteMachineSection(name.c_str(), BString("old\n"), false, text);
	EXPECT_TRUE(WriteMachineSection(name.c_str(), BString("new\n"), true, text));
	EXPECT_EQ(text.String(), "// [" + name + "]\nnew\n// [END_" + name + "]\n\n");
}


TEST(UserSectionTest, KeepsTheOldContent)
{
	BString out("before\n");
	WriteUserSection("MINE", true, BString("x\n// [mine]\n  kept\n\n// [END_MINE]\ny\n"), out);
	EXPECT_STREQ(out.String(), "before\n// [MINE]\n  kept\n\n// [END_MINE]\n\n");
}


TEST(UserSectionTest, IsEmptyInANewFileAndWithoutBothMarkersInOrder)
{
	const char* const empty = "// [MINE]\n// [END_MINE]\n\n";
	BString out;
	WriteUserSection("MINE", false, BString("// [MINE]\nold\n// [END_MINE]\n"), out);
	EXPECT_STREQ(out.String(), empty) << "new file";

	const char* const texts[] = {"", "// [MINE]\nno end\n", "no start\n// [END_MINE]\n",
		"// [END_MINE]\n// [MINE]\n", "// [MINE]// [END_MINE]\n"};
	for (const char* each : texts) {
		out = "";
		WriteUserSection("MINE", true, BString(each), out);
		EXPECT_STREQ(out.String(), empty) << each;
	}
}


TEST(ReplacePlaceholderTest, ReplacesEveryOccurrenceInAnyLetterCase)
{
	BString text("$TAB$tab-$Tab $TA $$TAB");
	ReplacePlaceholder(text, "$TAB", "  ");
	EXPECT_STREQ(text.String(), "    -   $TA $  ");
}


TEST(ReplacePlaceholderTest, DoesNotSearchWhatItPutIn)
{
	BString text("$VALUE$VALUE");
	ReplacePlaceholder(text, "$VALUE", "a$VALUE");
	EXPECT_STREQ(text.String(), "a$VALUEa$VALUE");
}


TEST(ReplacePlaceholderTest, ReplacesInsideLongerWords)
{
	BString text("T$FORMNAMEView _$FORMNAME_H");
	ReplacePlaceholder(text, "$FORMNAME", "Form1");
	EXPECT_STREQ(text.String(), "TForm1View _Form1_H");
}


TEST(ReplacePlaceholderTest, LeavesTextWithoutThePlaceholderAlone)
{
	BString text("no $ placeholder");
	ReplacePlaceholder(text, "$TAB", "  ");
	EXPECT_STREQ(text.String(), "no $ placeholder");
	BString empty;
	ReplacePlaceholder(empty, "$TAB", "  ");
	EXPECT_STREQ(empty.String(), "");
}


TEST(ReplacePlaceholderTest, ReplacesSeveralOneAfterTheOther)
{
	struct replace_case {
		const char* text;
		const char* first;
		const char* second;
		const char* expected;
	} const cases[] = {
		{"$ONE $two $THREE", "1", "2", "1 2 $THREE"},
		{"$one", "$TWO", "2", "2"},
		{"$TWO $ONE", "1", "$ONE", "$ONE 1"},
		{"$$ONE$TWO$", "", "x", "$x$"},
	};
	for (const replace_case& each : cases) {
		BString text(each.text);
		ReplacePlaceholders(text, {{"$ONE", each.first}, {"$TWO", each.second}});
		EXPECT_STREQ(text.String(), each.expected) << each.text;
	}
}


TEST(ReplacePlaceholderTest, DoesNotJoinAPlaceholderFromWhatItPutInAndWhatFollows)
{
	// In two passes the second finds what the first left behind: "$T" and "AB".
	BString text("$ONEAB");
	ReplacePlaceholders(text, {{"$ONE", "$T"}, {"$TAB", "  "}});
	EXPECT_STREQ(text.String(), "  ");
	BString split("$$ONETAB");
	ReplacePlaceholders(split, {{"$ONE", ""}, {"$TAB", "  "}});
	EXPECT_STREQ(split.String(), "  ");
}


TEST(ReplacePlaceholderTest, SeveralAtOnceComeToWhatTheyDoOneByOne)
{
	// Every text of three of these pieces, which can join into placeholders in many ways.
	const char* const pieces[] = {"$ONE", "$on", "E", "$TAB", "$ta", "b", "$", "$Other", ""};
	const placeholder_value one = {"$ONE", "b"};
	const placeholder_value tab = {"$TAB", "E"};
	const placeholder_value other = {"$OTHER", "A$ONE"};
	for (const char* first : pieces) {
		for (const char* second : pieces) {
			for (const char* third : pieces) {
				BString text(first);
				text << second << third;
				BString atOnce(text);
				ReplacePlaceholders(atOnce, {one, tab});
				BString oneByOne(text);
				ReplacePlaceholders(oneByOne, {one});
				ReplacePlaceholders(oneByOne, {tab});
				EXPECT_STREQ(atOnce.String(), oneByOne.String()) << text.String();

				atOnce = text;
				ReplacePlaceholders(atOnce, {other, one, tab});
				oneByOne = text;
				ReplacePlaceholders(oneByOne, {other});
				ReplacePlaceholders(oneByOne, {one});
				ReplacePlaceholders(oneByOne, {tab});
				EXPECT_STREQ(atOnce.String(), oneByOne.String()) << text.String();
			}
		}
	}
}


TEST(IndentContinuationLinesTest, IndentsEveryLineButTheFirst)
{
	BString text("one\ntwo\n\nfour");
	IndentContinuationLines(text);
	EXPECT_STREQ(text.String(), "one\n  two\n  \n  four");
}


TEST(NormalizedLinesTest, GiveTextThatEndsWithALineBreakAnEmptyLine)
{
	EXPECT_EQ(Normalized("a\nb\n"), "a\nb\n\n");
	EXPECT_EQ(Normalized(Normalized("a\n")), "a\n\n\n");
}


TEST(NormalizedLinesTest, EndTheLastLineWithALineBreak)
{
	EXPECT_EQ(Normalized("a\nb"), "a\nb\n");
	EXPECT_EQ(Normalized(""), "\n");
	EXPECT_EQ(Normalized("\n"), "\n\n");
}


TEST(NormalizedLinesTest, TurnTabsIntoTwoSpaces)
{
	EXPECT_EQ(Normalized("\ta\t\tb\t\n\t"), "  a    b  \n  \n");
}


TEST(NormalizedLinesTest, KeepCarriageReturnsAndBytesBeyondAscii)
{
	EXPECT_EQ(Normalized("a\r\n\xc3\xa4\xff\n"), "a\r\n\xc3\xa4\xff\n\n");
}


TEST(NormalizedLinesTest, TakeLinesOf1023BytesWhole)
{
	const std::string longest(1023, 'x');
	int32 cutLine = -1;
	EXPECT_EQ(Normalized(longest + "\nnext\n", &cutLine), longest + "\nnext\n\n");
	EXPECT_EQ(cutLine, 0);
	EXPECT_EQ(Normalized(longest, &cutLine), longest + "\n");
	EXPECT_EQ(cutLine, 0);
}


TEST(NormalizedLinesTest, KeepTheStartOfALongerLineAndNothingBehindIt)
{
	int32 cutLine = 0;
	const std::string text = "first\n" + std::string(1024, 'x') + "\nlast\n";
	EXPECT_EQ(Normalized(text, &cutLine), "first\n" + std::string(1023, 'x') + "\n");
	EXPECT_EQ(cutLine, 2);
	EXPECT_EQ(Normalized(std::string(1024, 'x'), &cutLine), std::string(1023, 'x') + "\n");
	EXPECT_EQ(cutLine, 1);
}


TEST(NormalizedLinesTest, CountTheLimitBeforeTabsGrow)
{
	int32 cutLine = -1;
	EXPECT_EQ(Normalized(std::string(1023, '\t'), &cutLine), std::string(2046, ' ') + "\n");
	EXPECT_EQ(cutLine, 0);
}


TEST(NormalizedLinesTest, CutALineAtAZeroByteAndSaySo)
{
	int32 cutLine = 0;
	EXPECT_EQ(Normalized(std::string("a\nb\0c\nd\n", 8), &cutLine), "a\nb\nd\n\n");
	EXPECT_EQ(cutLine, 2);
}


TEST(FunctionBodyTest, EndsWithTheBraceThatClosesTheFirst)
{
	EXPECT_EQ(Body("void f()\n{\n  if (x) { y(); }\n}\nvoid g() {}"),
		"void f()\n{\n  if (x) { y(); }\n}");
	EXPECT_EQ(Body("x {} y {}", 4), " y {}");
}


TEST(FunctionBodyTest, DoesNotCountBracesInComments)
{
	EXPECT_EQ(Body("{ // }\n}x"), "{ // }\n}");
	EXPECT_EQ(Body("{ /* } \n } */ }x"), "{ /* } \n } */ }");
	EXPECT_EQ(Body("// {\n{}x"), "// {\n{}");
}


TEST(FunctionBodyTest, CountsBracesInLiterals)
{
	EXPECT_EQ(Body("{ \"}\" }"), "{ \"}");
	EXPECT_EQ(Body("{ '{' } }x"), "{ '{' } }");
}


TEST(FunctionBodyTest, LetsALineCommentStartInsideABlockComment)
{
	// The line break ends the comment, so the brace behind it counts.
	EXPECT_EQ(Body("{ /* a // b\n } */ }"), "{ /* a // b\n }");
}


TEST(FunctionBodyTest, LetsABlockCommentStartInsideALineComment)
{
	EXPECT_EQ(Body("{ // /* a\n } */ }x"), "{ // /* a\n } */ }");
}


TEST(FunctionBodyTest, IsTheWholeRestWithoutAClosingBrace)
{
	EXPECT_EQ(Body("{ {}"), "{ {}");
	EXPECT_EQ(Body("no brace", 3), "brace");
}


TEST(FunctionBodyTest, OfAStartOutsideTheTextIsEmptyOrTheWhole)
{
	EXPECT_EQ(Body("{}", 2), "");
	EXPECT_EQ(Body("{}", 100), "");
	EXPECT_EQ(Body("{}", -5), "{}");
	EXPECT_EQ(Body(""), "");
}


TEST(NormalizedLinesTest, OfNoDataAtAllAreAnEmptyLine)
{
	BString text;
	EXPECT_EQ(AppendNormalizedLines(nullptr, 0, text), 0);
	EXPECT_EQ(std::string(text.String()), Normalized(""));
}

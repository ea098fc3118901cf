// SPDX-License-Identifier: MIT
// Texts as standard C++ writes them.

#include "codegen/StandardText.h"

#include <string>
#include <vector>

#include <gtest/gtest.h>

#include "codegen/SourceParts.h"

namespace {

struct text_case {
	std::string text;
	std::string expected;
};


/// The parts of a source, each as its kind's letter and its text.
std::vector<std::string>
PartsOf(const std::string& source)
{
	std::vector<std::string> result;
	TSourceParts parts(source);
	source_part part;
	while (parts.Next(&part))
		result.push_back("csrk/"[part.kind] + (":" + std::string(part.text)));
	return result;
}

} // namespace


TEST(StandardTextTest, EscapedTextsStandOnOneLineAndMeanWhatTheyWere)
{
	const text_case cases[] = {
		{"", ""},
		{"plain, 'single' 100%", "plain, 'single' 100%"},
		{"say \"hi\"", "say \\\"hi\\\""},
		{"C:\\new\\", "C:\\\\new\\\\"},
		{"a\nb\tc\rd", "a\\nb\\tc\\rd"},
		{"bell\a1", "bell\\0071"},
		{"\x7f", "\\177"},
		{"what?", "what?"},
		{"what?\?!", "what?\\?!"},
		{"???\?/", "?\\?\\?\\?/"},
		{"gr\xc3\xbc\xc3\x9f \xe6\x97\xa5\xe6\x9c\xac \xf0\x9f\x98\x80",
			"gr\xc3\xbc\xc3\x9f \xe6\x97\xa5\xe6\x9c\xac \xf0\x9f\x98\x80"},
		{"no\xc2\xa0"
		 "break",
			"no\xc2\xa0"
			"break"},
		{"bad \xc3(", "bad \\303("},
		{"cut \xe6\x97", "cut \\346\\227"},
		{"long form \xc0\xaf", "long form \\300\\257"},
		{"half \xed\xa0\x80", "half \\355\\240\\200"},
		{"turned \xe2\x80\xae"
		 "1",
			"turned \\342\\200\\2561"},
		{"line \xe2\x80\xa8 next \xc2\x85", "line \\342\\200\\250 next \\302\\205"},
		{"$5, $ and $", "$5, $ and $"},
		{"$TAB$formname", "\\044TAB\\044formname"},
	};
	for (const text_case& each : cases)
		EXPECT_EQ(EscapedText(each.text).String(), each.expected) << each.text;
}


TEST(StandardTextTest, LiteralsAreQuoted)
{
	EXPECT_STREQ(StringLiteral("").String(), "\"\"");
	EXPECT_STREQ(StringLiteral("a\"").String(), "\"a\\\"\"");
}


TEST(StandardTextTest, LongLiteralsAreDividedIntoLinesThatCanBeReadAgain)
{
	const BString literal = StringLiteral(std::string(1023, '\x01'));
	const std::string text(literal.String());
	size_t start = 0;
	int lines = 0;
	for (size_t end = text.find('\n'); end != std::string::npos; end = text.find('\n', start)) {
		EXPECT_LT(end - start, 600u);
		start = end + 1;
		lines++;
	}
	EXPECT_GT(lines, 5);
	BString joined(literal);
	joined.ReplaceAll("\"\n    \"", "");
	EXPECT_EQ(joined, (BString("\"") << EscapedText(std::string(1023, '\x01')) << "\""));
}


TEST(StandardTextTest, CommentsCannotEndOrGoOn)
{
	const text_case cases[] = {
		{"Form1", "Form1"},
		{"a\nint b;", "a int b;"},
		{"ends\\", "ends/"},
		{"trigraph?\?/", "trigraph? /"},
		{"gr\xc3\xbcn \xe2\x80\xae\xff", "gr\xc3\xbcn   "},
		{"*/", "*/"},
	};
	for (const text_case& each : cases)
		EXPECT_EQ(CommentText(each.text).String(), each.expected) << each.text;
}


TEST(StandardTextTest, ASourceIsCutIntoItsParts)
{
	const struct {
		std::string source;
		std::vector<std::string> parts;
	} cases[] = {
		{"", {}},
		{"a = 1;", {"c:a = 1;"}},
		{"f(\"a\\\"b\", 'c')", {"c:f(", "s:\"a\\\"b\"", "c:, ", "k:'c'", "c:)"}},
		{"1'000'000 + '\\''", {"c:1'000'000 + ", "k:'\\''"}},
		{"u8'a'", {"c:u8", "k:'a'"}},
		{"'\\1'2'x'", {"k:'\\1'", "c:2'x'"}},
		{"'1'x'y'", {"k:'1'", "c:x", "k:'y'"}},
		{"R\"x(a)\" )x\" + b", {"c:R", "r:\"x(a)\" )x\"", "c: + b"}},
		{"u8R\"(\\)\"", {"c:u8R", "r:\"(\\)\""}},
		{"a // \"b\\\nc\nd", {"c:a ", "/:// \"b\\\nc", "c:\nd"}},
		{"a /* \" */ b", {"c:a ", "/:/* \" */", "c: b"}},
		{"a / b", {"c:a / b"}},
		{"\"open", {"s:\"open"}},
		{"\"open\\", {"s:\"open\\"}},
		{"R\"(open", {"c:R", "r:\"(open"}},
		{"R\"open", {"c:R", "r:\"open"}},
		{"/* open", {"/:/* open"}},
		{"// open", {"/:// open"}},
		{"//", {"/://"}},
	};
	for (const auto& each : cases)
		EXPECT_EQ(PartsOf(each.source), each.parts) << each.source;
}


TEST(StandardTextTest, PlainSourcesHavePlainSpacesAndCleanLiterals)
{
	const text_case cases[] = {
		{"const\xc2\xa0"
		 "BMessage\xe3\x80\x80*m",
			"const BMessage *m"},
		{"f(\"a\xc2\xa0"
		 "b\")",
			"f(\"a\xc2\xa0"
			"b\")"},
		{"f(\"one\\ttwo\\\\\", '\\n')", "f(\"one\\ttwo\\\\\", '\\n')"},
		{"f(\"a\nb\tc\rd?\?/\")", "f(\"a\\nb\\tc\\rd?\\?/\")"},
		{"// keep\xc2\xa0this ?\?/ as it is", "// keep\xc2\xa0this ?\?/ as it is"},
		{"R\"(keep\nthis?\?/)\"", "R\"(keep\nthis?\?/)\""},
		{"gr\xc3\xbcn", "gr\xc3\xbcn"},
		{"f(\"$TAB\")", "f(\"$TAB\")"},
	};
	for (const text_case& each : cases)
		EXPECT_EQ(PlainSource(each.text).String(), each.expected) << each.text;
}


TEST(StandardTextTest, ValuesAreEscapedInTheLiteralsOfStatementsOnly)
{
	const struct {
		const char* statement;
		const char* value;
		const char* expected;
	} cases[] = {
		{"$COMPONENT->Set(\"$VALUE\");", "a\"b\\", "Button1->Set(\"a\\\"b\\\\\");"},
		{"$component->Set($value);", "\"x\"", "Button1->Set(\"x\");"},
		{"{T v(\"$VALUE\", $VALUE);\n$COMPONENT->Set(v);}", "1",
			"{T v(\"1\", 1);\nButton1->Set(v);}"},
		{"$COMPONENT->Set(\"$VALUE\");", "$VALUE$COMPONENT",
			"Button1->Set(\"\\044VALUE\\044COMPONENT\");"},
		{"$COMPONENT->Set(A\xc2\xa0| $VALUE);", "B\xc2\xa0| C", "Button1->Set(A | B | C);"},
	};
	for (const auto& each : cases)
		EXPECT_STREQ(FilledStatement(each.statement, "Button1", each.value).String(), each.expected)
			<< each.statement;
}

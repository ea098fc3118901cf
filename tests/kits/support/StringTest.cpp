// SPDX-License-Identifier: MIT
// BString: what each operation does, and what it leaves alone.

#include <String.h>

#include <string.h>

#include <gtest/gtest.h>

namespace {

TEST(StringTest, IsEmptyWithoutAText)
{
	BString string;
	EXPECT_STREQ(string.String(), "");
	EXPECT_EQ(string.Length(), 0);
	EXPECT_TRUE(string.IsEmpty());
	EXPECT_STREQ(BString(static_cast<const char*>(nullptr)).String(), "");
	EXPECT_STREQ(BString(nullptr, 4).String(), "");
}


TEST(StringTest, TakesAtMostTheGivenBytes)
{
	EXPECT_STREQ(BString("window", 3).String(), "win");
	EXPECT_STREQ(BString("window", 100).String(), "window");
	EXPECT_STREQ(BString("window", 0).String(), "");
	EXPECT_STREQ(BString("window", -1).String(), "");
	const char unterminated[] = {'a', 'b', 'c'};
	EXPECT_STREQ(BString(unterminated, 3).String(), "abc");
}


TEST(StringTest, CopiesAreValuesOfTheirOwn)
{
	BString a("one");
	BString b(a);
	b << " more";
	EXPECT_STREQ(a.String(), "one");
	EXPECT_STREQ(b.String(), "one more");
	BString c(std::move(b));
	EXPECT_STREQ(c.String(), "one more");
	EXPECT_STREQ(b.String(), "");
}


TEST(StringTest, SetsItselfToPartsOfItself)
{
	BString string("0123456789");
	string.SetTo(string.String() + 4);
	EXPECT_STREQ(string.String(), "456789");
	string.SetTo(string.String() + 1, 3);
	EXPECT_STREQ(string.String(), "567");
	string = string;
	EXPECT_STREQ(string.String(), "567");
	string.SetTo(string, 2);
	EXPECT_STREQ(string.String(), "56");
	string.SetTo('x', 3);
	EXPECT_STREQ(string.String(), "xxx");
	string.SetTo('x', -3);
	EXPECT_STREQ(string.String(), "");
	string = 'c';
	EXPECT_STREQ(string.String(), "c");
	string = static_cast<const char*>(nullptr);
	EXPECT_STREQ(string.String(), "");
}


TEST(StringTest, CountsCharactersNotBytes)
{
	BString string("a\xc3\xa4\xe2\x82\xac\xf0\x9f\x98\x80");
	EXPECT_EQ(string.Length(), 10);
	EXPECT_EQ(string.CountChars(), 4);
}


TEST(StringTest, CopiesOutWhatIsThere)
{
	BString string("component");
	BString part("old");
	EXPECT_STREQ(string.CopyInto(part, 3, 4).String(), "pone");
	EXPECT_STREQ(string.CopyInto(part, 5, 100).String(), "nent");
	EXPECT_STREQ(string.CopyInto(part, 100, 2).String(), "");
	EXPECT_STREQ(string.CopyInto(part, 0, -2).String(), "");

	char buffer[] = "......";
	string.CopyInto(buffer, 0, 3);
	EXPECT_STREQ(buffer, "com...");
	string.CopyInto(buffer, 7, 100);
	EXPECT_STREQ(buffer, "ntm...");
	string.CopyInto(static_cast<char*>(nullptr), 0, 3);

	BString self("abcdef");
	self.CopyInto(self, 2, 2);
	EXPECT_STREQ(self.String(), "cd");
}


TEST(StringTest, MovesOutWhatIsThere)
{
	BString string("component");
	BString part;
	EXPECT_STREQ(string.MoveInto(part, 0, 3).String(), "com");
	EXPECT_STREQ(string.String(), "ponent");
	char buffer[] = "....";
	string.MoveInto(buffer, 4, 10);
	EXPECT_STREQ(buffer, "nt..");
	EXPECT_STREQ(string.String(), "pone");
}


TEST(StringTest, AppendsTextsAndItself)
{
	BString string("a");
	string += "b";
	string += BString("c");
	string += 'd';
	string.Append("efgh", 2).Append(BString("ijk"), 1).Append('z', 2).Append("!");
	EXPECT_STREQ(string.String(), "abcdefizz!");
	string.SetTo("xy");
	string.Append(string).Append(string.String());
	EXPECT_STREQ(string.String(), "xyxyxyxy");
	string.SetTo("q");
	string.Append(static_cast<const char*>(nullptr)).Append(nullptr, 5).Append('c', -1);
	EXPECT_STREQ(string.String(), "q");
}


TEST(StringTest, Prepends)
{
	BString string("z");
	string.Prepend("y").Prepend(BString("x")).Prepend("wv", 1).Prepend(BString("uv"), 1);
	string.Prepend('-', 2);
	EXPECT_STREQ(string.String(), "--uwxyz");
	string.SetTo("ab");
	string.Prepend(string);
	EXPECT_STREQ(string.String(), "abab");
}


TEST(StringTest, InsertsAtAPosition)
{
	const struct {
		const char* inserted;
		int32 position;
		const char* expected;
	} kCases[] = {
		{"XY", 0, "XYabc"},
		{"XY", 2, "abXYc"},
		{"XY", 3, "abcXY"},
		{"XY", 4, "abc"},
		{"XY", -1, "Yabc"},
		{"XY", -2, "abc"},
		{"XY", -100, "abc"},
		{"XY", INT32_MIN, "abc"},
		{nullptr, 1, "abc"},
	};
	for (const auto& row : kCases) {
		BString string("abc");
		EXPECT_STREQ(string.Insert(row.inserted, row.position).String(), row.expected)
			<< row.position;
	}
}


TEST(StringTest, InsertsPartsAndRepeatedBytes)
{
	BString string("abc");
	EXPECT_STREQ(string.Insert("12345", 2, 1).String(), "a12bc");
	EXPECT_STREQ(string.Insert("12345", 3, 2, 0).String(), "45a12bc");
	EXPECT_STREQ(string.Insert("12345", 9, 2, 0).String(), "45a12bc");
	EXPECT_STREQ(string.Insert(BString("xyz"), 1, 1, 7).String(), "45a12bcy");
	EXPECT_STREQ(string.Insert('-', 2, 0).String(), "--45a12bcy");
	EXPECT_STREQ(string.Insert('+', 3, -2).String(), "+--45a12bcy");
	EXPECT_STREQ(string.Insert('+', 3, 100).String(), "+--45a12bcy");
	string.SetTo("abcd");
	EXPECT_STREQ(string.Insert(string, 2).String(), "ababcdcd");
	EXPECT_STREQ(string.Insert(string.String() + 6, 1, 0).String(), "cababcdcd");
}


TEST(StringTest, TruncatesAndRemoves)
{
	BString string("0123456789");
	EXPECT_STREQ(string.Truncate(20).String(), "0123456789");
	EXPECT_STREQ(string.Truncate(8, false).String(), "01234567");
	EXPECT_STREQ(string.Remove(6, 100).String(), "012345");
	EXPECT_STREQ(string.Remove(6, 1).String(), "012345");
	EXPECT_STREQ(string.Remove(2, 2).String(), "0145");
	EXPECT_STREQ(string.Remove(-1, 2).String(), "145");
	EXPECT_STREQ(string.Remove(0, -2).String(), "145");
	EXPECT_STREQ(string.Remove(1, INT32_MAX).String(), "1");
	EXPECT_STREQ(string.Truncate(-3).String(), "");
}


TEST(StringTest, RemovesTextsAndSets)
{
	BString string("a-b-c-d");
	EXPECT_STREQ(string.RemoveFirst("-").String(), "ab-c-d");
	EXPECT_STREQ(string.RemoveLast(BString("-")).String(), "ab-cd");
	EXPECT_STREQ(string.RemoveAll("x").String(), "ab-cd");
	EXPECT_STREQ(string.RemoveSet("-ad").String(), "bc");
	EXPECT_STREQ(string.RemoveSet(nullptr).String(), "bc");
	string.SetTo("xx");
	EXPECT_STREQ(string.RemoveAll(string).String(), "");
}


TEST(StringTest, ComparesByBytes)
{
	BString string("beta");
	EXPECT_TRUE(string == "beta" && "beta" == string && string == BString("beta"));
	EXPECT_TRUE(string != "Beta" && "Beta" != string);
	EXPECT_TRUE(string < "gamma" && "alpha" < string && string <= "beta" && "beta" <= string);
	EXPECT_TRUE(string > "alpha" && "gamma" > string && string >= "beta" && "beta" >= string);
	EXPECT_GT(BString("\xc3\xa4").Compare("z"), 0);
	EXPECT_LT(string.Compare("betas"), 0);
	EXPECT_EQ(string.Compare("bet the rest", 3), 0);
	EXPECT_NE(string.Compare("bet the rest", 4), 0);
	EXPECT_EQ(string.ICompare("BETA"), 0);
	EXPECT_LT(string.ICompare("GAMMA"), 0);
	EXPECT_EQ(string.ICompare(BString("BETs"), 3), 0);
	EXPECT_GT(string.Compare(static_cast<const char*>(nullptr)), 0);
	EXPECT_EQ(BString().Compare(static_cast<const char*>(nullptr)), 0);
}


TEST(StringTest, FindsFromAnOffset)
{
	BString string("abcabc");
	EXPECT_EQ(string.FindFirst("bc"), 1);
	EXPECT_EQ(string.FindFirst("bc", 1), 1);
	EXPECT_EQ(string.FindFirst("bc", 2), 4);
	EXPECT_EQ(string.FindFirst("bc", 5), B_ERROR);
	EXPECT_EQ(string.FindFirst("bc", 7), B_ERROR);
	EXPECT_EQ(string.FindFirst("bc", -1), B_ERROR);
	EXPECT_EQ(string.FindFirst("abcabcd"), B_ERROR);
	EXPECT_EQ(string.FindFirst(BString("ca")), 2);
	EXPECT_EQ(string.FindFirst('c', 3), 5);
	EXPECT_EQ(string.FindFirst('z'), B_ERROR);
	EXPECT_EQ(string.FindFirst(static_cast<const char*>(nullptr)), B_BAD_VALUE);
	EXPECT_EQ(string.IFindFirst("BC", 2), 4);
	EXPECT_EQ(string.IFindFirst(BString("CA")), 2);
	EXPECT_EQ(string.IFindFirst("x"), B_ERROR);

	const BString marked("/ //A //aB \xc3\xa4/");
	EXPECT_EQ(marked.IFindFirst("//Ab"), 6);
	EXPECT_EQ(marked.IFindFirst("//A", 3), 6);
	EXPECT_EQ(marked.IFindFirst(" //a", 2), 5);
	EXPECT_EQ(marked.IFindFirst("\xc3\xa4/"), 11);
	EXPECT_EQ(marked.IFindFirst("//x"), B_ERROR);
	EXPECT_EQ(marked.IFindFirst("/", 14), B_ERROR);
	EXPECT_EQ(marked.IFindFirst("/ab"), 7);
	EXPECT_EQ(marked.IFindFirst("//AAAAAAAAAAAAAAA"), B_ERROR);
	EXPECT_EQ(string.IFindFirst(static_cast<const char*>(nullptr)), B_BAD_VALUE);
}


TEST(StringTest, FindsTheLastThatEndsBeforeAnOffset)
{
	BString string("abcabc");
	EXPECT_EQ(string.FindLast("abc"), 3);
	EXPECT_EQ(string.FindLast("abc", 6), 3);
	EXPECT_EQ(string.FindLast("abc", 5), 0);
	EXPECT_EQ(string.FindLast("abc", 3), 0);
	EXPECT_EQ(string.FindLast("abc", 2), B_ERROR);
	EXPECT_EQ(string.FindLast("abc", -1), B_ERROR);
	EXPECT_EQ(string.FindLast("abc", 100), 3);
	EXPECT_EQ(string.FindLast('c'), 5);
	EXPECT_EQ(string.FindLast('c', 5), 2);
	EXPECT_EQ(string.FindLast(static_cast<const char*>(nullptr)), B_BAD_VALUE);
	EXPECT_EQ(string.IFindLast("ABC"), 3);
	EXPECT_EQ(string.IFindLast(BString("ABC"), 5), 0);
	EXPECT_EQ(string.IFindLast("X"), B_ERROR);
}


TEST(StringTest, ReplacesInOnePass)
{
	BString string("aaa");
	EXPECT_STREQ(string.ReplaceAll("a", "aa").String(), "aaaaaa");
	EXPECT_STREQ(string.ReplaceAll("aa", "b", 1).String(), "abba");
	EXPECT_STREQ(string.ReplaceFirst("b", "").String(), "aba");
	EXPECT_STREQ(string.ReplaceLast("a", "cd").String(), "abcd");
	EXPECT_STREQ(string.ReplaceAll('b', 'x').String(), "axcd");
	EXPECT_STREQ(string.ReplaceAll("", "boo").String(), "axcd");
	EXPECT_STREQ(string.ReplaceAll(nullptr, "boo").String(), "axcd");
	EXPECT_STREQ(string.ReplaceAll("c", nullptr).String(), "axd");
	EXPECT_STREQ(string.ReplaceAll("d", "y", 100).String(), "axd");
	EXPECT_STREQ(string.ReplaceFirst('z', 'q').String(), "axd");
	EXPECT_STREQ(string.ReplaceLast('a', 'q').String(), "qxd");
	EXPECT_STREQ(string.ReplaceAll(string.String(), string.String() + 1).String(), "xd");
}


TEST(StringTest, ReplacesIgnoringCase)
{
	BString string("AbaB");
	EXPECT_STREQ(string.IReplaceFirst('B', 'x').String(), "AxaB");
	EXPECT_STREQ(string.IReplaceAll('a', 'y').String(), "yxyB");
	string.SetTo("OneoneONE");
	EXPECT_STREQ(string.IReplaceAll("one", "1", 3).String(), "One11");
	EXPECT_STREQ(string.IReplaceFirst("ONE", "2").String(), "211");
	EXPECT_STREQ(string.IReplaceFirst("", "2").String(), "211");
}


TEST(StringTest, ReplacesSets)
{
	BString string("a b\tc");
	EXPECT_STREQ(string.ReplaceSet(" \t", '_').String(), "a_b_c");
	EXPECT_STREQ(string.ReplaceSet("_", "::").String(), "a::b::c");
	EXPECT_STREQ(string.ReplaceSet(":", static_cast<const char*>(nullptr)).String(), "abc");
}


TEST(StringTest, GivesBytes)
{
	BString string("ab");
	EXPECT_EQ(string[1], 'b');
	EXPECT_EQ(string[2], '\0');
	EXPECT_EQ(string.ByteAt(0), 'a');
	EXPECT_EQ(string.ByteAt(2), 0);
	EXPECT_EQ(string.ByteAt(-1), 0);
	string.SetByteAt(1, 'x').SetByteAt(2, 'y').SetByteAt(-1, 'z');
	EXPECT_STREQ(string.String(), "ax");
}


TEST(StringTest, TheLockedBufferHoldsTheText)
{
	BString string("abc");
	char* buffer = string.LockBuffer(10);
	EXPECT_STREQ(buffer, "abc");
	strcpy(buffer + 3, "defghij");
	string.UnlockBuffer();
	EXPECT_STREQ(string.String(), "abcdefghij");
	EXPECT_EQ(string.Length(), 10);

	strcpy(string.LockBuffer(4), "xyz");
	string.UnlockBuffer(2);
	EXPECT_STREQ(string.String(), "xy");
	string.LockBuffer(100);
	string.UnlockBuffer(-1);
	EXPECT_EQ(string.Length(), 2);
}


TEST(StringTest, ChangesCase)
{
	EXPECT_STREQ(BString("MiX \xc3\x84").ToLower().String(), "mix \xc3\x84");
	EXPECT_STREQ(BString("MiX \xc3\xa4").ToUpper().String(), "MIX \xc3\xa4");
	EXPECT_STREQ(BString("hELLO World").Capitalize().String(), "Hello world");
	EXPECT_STREQ(BString("hELLO my-world").CapitalizeEachWord().String(), "Hello My-World");
	EXPECT_STREQ(BString("").Capitalize().String(), "");
}


TEST(StringTest, TrimsBothEnds)
{
	EXPECT_STREQ(BString(" \t a b\n ").Trim().String(), "a b");
	EXPECT_STREQ(BString("   ").Trim().String(), "");
	EXPECT_STREQ(BString("").Trim().String(), "");
	EXPECT_STREQ(BString("x").Trim().String(), "x");
}


TEST(StringTest, AppendsValues)
{
	BString string;
	string << "s" << BString("t") << 'c' << true << false;
	EXPECT_STREQ(string.String(), "stctruefalse");
	string.SetTo("");
	string << -5 << " " << 7u << " " << -8l << " " << 9ul << " " << INT64_MIN << " " << UINT64_MAX;
	EXPECT_STREQ(string.String(), "-5 7 -8 9 -9223372036854775808 18446744073709551615");
	string.SetTo("");
	string << 1.005f << " " << -2.5 << " " << -8ll << " " << 9ull;
	EXPECT_STREQ(string.String(), "1.00 -2.50 -8 9");
	string.SetTo("");
	string << 1e308;
	EXPECT_EQ(string.Length(), 309 + 3);
}


TEST(StringTest, ConvertsToAText)
{
	BString string("abc");
	const char* text = string;
	EXPECT_STREQ(text, "abc");
}

} // namespace

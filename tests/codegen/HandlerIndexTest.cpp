// SPDX-License-Identifier: MIT
// Finding the functions that a source already holds.

#include "codegen/HandlerIndex.h"

#include <string>

#include <gtest/gtest.h>

#include <String.h>

namespace {

bool
Contains(const char* text, const char* result, const char* function)
{
	return THandlerIndex(text, "TForm1").Contains(result, function);
}

} // namespace


TEST(HandlerIndexTest, FindsADefinition)
{
	EXPECT_TRUE(Contains("void TForm1::Button1Click(void)\n{\n}\n", "void", "Button1Click"));
	EXPECT_FALSE(Contains("void TForm1::Button1Click(void)\n{\n}\n", "void", "Button2Click"));
	EXPECT_FALSE(Contains("void TForm2::Button1Click(void)\n{\n}\n", "void", "Button1Click"));
	EXPECT_FALSE(Contains("", "void", "Button1Click"));
}


TEST(HandlerIndexTest, FindsItInAnyLetterCaseAndInComments)
{
	EXPECT_TRUE(Contains("// VOID TFORM1::button1CLICK", "void", "Button1Click"));
}


TEST(HandlerIndexTest, DoesNotFindAnotherReturnType)
{
	EXPECT_FALSE(Contains("status_t TForm1::Close(void)", "bool", "Close"));
	EXPECT_FALSE(Contains("void  TForm1::Close(void)", "void", "Close"));
	EXPECT_FALSE(Contains("void TForm1 ::Close(void)", "void", "Close"));
}


TEST(HandlerIndexTest, TakesLongerNamesAndTypesThatContainTheKey)
{
	EXPECT_TRUE(Contains("void TForm1::CloseAll()", "void", "Close"));
	EXPECT_TRUE(Contains("myvoid TForm1::Close()", "void", "Close"));
	EXPECT_TRUE(Contains("unsigned int TForm1::Count()", "unsigned int", "Count"));
}


TEST(HandlerIndexTest, TellsApartFunctionsOfOneNameByTheirReturnType)
{
	const char* const text = "int TForm1::Close(int)\nbool TForm1::Close(void)\n";
	EXPECT_TRUE(Contains(text, "bool", "Close"));
	EXPECT_TRUE(Contains(text, "int", "Close"));
	EXPECT_FALSE(Contains(text, "void", "Close"));
}


TEST(HandlerIndexTest, AgreesWithASearchForEachKey)
{
	const std::string words[] = {
		"void", "bool", " ", "TForm1::", "TForm1", "::", "A", "AB", "b", "\n"};
	unsigned int random = 12345;
	std::string text;
	for (int i = 0; i < 4000; i++) {
		random = random * 1103515245 + 12345;
		text += words[(random >> 16) % 10];
	}
	const THandlerIndex index(text.c_str(), "TForm1");
	const BString whole(text.c_str());
	for (const char* result : {"void", "bool", "", "A"}) {
		for (const char* function : {"A", "AB", "Ab", "ABB", "bvoid", "", "AA A"}) {
			BString key(result);
			key << " TForm1::" << function;
			EXPECT_EQ(index.Contains(result, function), whole.IFindFirst(key) >= 0) << key.String();
		}
	}
}


TEST(HandlerIndexTest, FindsEachOfManyFunctions)
{
	constexpr int kCount = 20000;
	std::string text;
	for (int i = 0; i < kCount; i++)
		text += "void TForm1::Button" + std::to_string(i) + "Click(void)\n{\n  body();\n}\n\n";
	const THandlerIndex index(text.c_str(), "TForm1");
	int found = 0;
	for (int i = 0; i < kCount; i++)
		found += index.Contains("void", ("Button" + std::to_string(i) + "Click").c_str());
	EXPECT_EQ(found, kCount);
}

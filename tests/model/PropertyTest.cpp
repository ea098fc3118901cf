// SPDX-License-Identifier: MIT
// Tests of properties.

#include "model/Property.h"

#include <cstring>
#include <string>

#include <String.h>
#include <gtest/gtest.h>

#include "model/Component.h"
#include "props/StringProperty.h"

namespace {

class PropertyTest : public testing::Test {
protected:
	PropertyTest()
		: fComponent(nullptr, nullptr, CT_VISUAL)
	{
		fComponent.SetComponentName("Button1");
	}

	std::string SetStatement(const char* value, bool quoted)
	{
		TProperty property(&fComponent, "Label", value, nullptr, true);
		property.SetQuoted(quoted);
		return property.SetStatement().String();
	}

	TComponent fComponent;
};


std::string
Repeat(char character, size_t count)
{
	return std::string(count, character);
}

} // namespace

TEST_F(PropertyTest, ANewPropertyHasTheValueAsItsDefault)
{
	TStringProperty editor(&fComponent, nullptr);
	const TProperty property(&fComponent, "Label", "OK", &editor, true);

	EXPECT_STREQ(property.Name(), "Label");
	EXPECT_STREQ(property.Value(), "OK");
	EXPECT_STREQ(property.DefValue(), "OK");
	EXPECT_TRUE(property.IsDefValue());
	EXPECT_EQ(property.Owner(), &fComponent);
	EXPECT_EQ(property.Editor(), &editor);
	EXPECT_TRUE(property.IsGenerated());
	EXPECT_FALSE(property.IsQuoted());
}


TEST_F(PropertyTest, ANullValueGivesEmptyTexts)
{
	const TProperty property(&fComponent, "Label", nullptr, nullptr, false);
	EXPECT_STREQ(property.Value(), "");
	EXPECT_STREQ(property.DefValue(), "");
	EXPECT_TRUE(property.IsDefValue());
	EXPECT_FALSE(property.IsGenerated());
}


TEST_F(PropertyTest, ANullNameGivesAnEmptyName)
{
	const TProperty property(nullptr, nullptr, "x", nullptr, false);
	EXPECT_STREQ(property.Name(), "");
	EXPECT_STREQ(property.GetStatement().String(), "->()");
}


TEST_F(PropertyTest, TheTextsAreCopies)
{
	char name[] = "Left";
	char value[] = "5";
	const TProperty property(&fComponent, name, value, nullptr, false);
	name[0] = value[0] = '?';
	EXPECT_STREQ(property.Name(), "Left");
	EXPECT_STREQ(property.Value(), "5");
}


TEST_F(PropertyTest, TheDefaultStaysWhenTheValueChanges)
{
	TProperty property(&fComponent, "Label", "OK", nullptr, true);
	property.SetValue("Cancel");
	EXPECT_STREQ(property.Value(), "Cancel");
	EXPECT_STREQ(property.DefValue(), "OK");
	EXPECT_FALSE(property.IsDefValue());
}


TEST_F(PropertyTest, TheDefaultCanBeSetApart)
{
	TProperty property(&fComponent, "Label", "OK", nullptr, true);
	property.SetDefValue("Other");
	EXPECT_STREQ(property.Value(), "OK");
	EXPECT_STREQ(property.DefValue(), "Other");
	property.SetValue("Cancel");
	EXPECT_STREQ(property.DefValue(), "Other");
	property.SetDefValue("");
	EXPECT_STREQ(property.DefValue(), "");
	EXPECT_EQ(std::string(property.Value()), "Cancel");
}


TEST_F(PropertyTest, TheDefaultStaysWhenAnEditorFillsTheValue)
{
	TProperty property(&fComponent, "Label", "OK", nullptr, true);
	property.FillValue("Cancel");
	EXPECT_STREQ(property.DefValue(), "OK");
	EXPECT_FALSE(property.IsDefValue());
	const TProperty copy(property);
	EXPECT_STREQ(copy.DefValue(), "OK");
}


TEST_F(PropertyTest, TheTextOfTheDefaultIsTheDefaultAgain)
{
	TProperty property(&fComponent, "Label", "OK", nullptr, true);
	property.SetValue("Cancel");
	property.SetValue("OK");
	EXPECT_TRUE(property.IsDefValue());
}


TEST_F(PropertyTest, TheDefaultIsComparedByteForByte)
{
	TProperty property(&fComponent, "Enabled", "true", nullptr, true);
	for (const char* other : {"True", "true ", " true", "tru", ""}) {
		property.SetValue(other);
		EXPECT_FALSE(property.IsDefValue()) << "'" << other << "'";
	}
}


TEST_F(PropertyTest, ANullValueIsIgnoredWhenSet)
{
	TProperty property(&fComponent, "Label", "OK", nullptr, true);
	property.SetValue(nullptr);
	property.FillValue(nullptr);
	property.SetDefValue(nullptr);
	EXPECT_STREQ(property.Value(), "OK");
	EXPECT_STREQ(property.DefValue(), "OK");
}


TEST_F(PropertyTest, TextsAreCutTo1023Bytes)
{
	const std::string longText = Repeat('x', 3000);
	TProperty property(&fComponent, "Label", longText.c_str(), nullptr, true);
	EXPECT_EQ(property.Value(), Repeat('x', 1023));
	EXPECT_EQ(property.DefValue(), Repeat('x', 1023));

	property.SetSetStatement(longText.c_str());
	property.SetGetStatement(longText.c_str());
	EXPECT_EQ(property.SetStatement().String(), Repeat('x', 1023));
	EXPECT_EQ(property.GetStatement().String(), Repeat('x', 1023));
}


TEST_F(PropertyTest, TextsOf1023BytesAreKeptWhole)
{
	for (size_t length : {0, 1, 22, 23, 24, 25, 63, 64, 65, 1022, 1023}) {
		TProperty property(&fComponent, "Label", Repeat('y', length).c_str(), nullptr, true);
		EXPECT_EQ(property.Value(), Repeat('y', length));
		property.SetValue(Repeat('z', length).c_str());
		EXPECT_EQ(property.Value(), Repeat('z', length));
	}
}


TEST_F(PropertyTest, NamesAreCutTo31Bytes)
{
	const TProperty property(&fComponent, Repeat('n', 40).c_str(), "", nullptr, true);
	EXPECT_EQ(property.Name(), Repeat('n', 31));
}


TEST_F(PropertyTest, FillingTakes1024BytesWithoutATerminatorAmongThem)
{
	TProperty property(&fComponent, "Label", "", nullptr, true);
	property.FillValue(Repeat('x', 1024).c_str());
	EXPECT_EQ(memchr(property.Value(), '\0', 1024), nullptr);
	EXPECT_EQ(std::string(property.Value(), 1024), Repeat('x', 1024));

	property.FillValue((Repeat('a', 1024) + "rest").c_str());
	EXPECT_EQ(std::string(property.Value(), 1024), Repeat('a', 1024));
	EXPECT_EQ(memchr(property.Value(), '\0', 1024), nullptr);
}


TEST_F(PropertyTest, FillingUpTo1023BytesTerminatesTheText)
{
	TProperty property(&fComponent, "Label", Repeat('x', 1000).c_str(), nullptr, true);
	property.FillValue("short");
	EXPECT_STREQ(property.Value(), "short");
	property.FillValue(Repeat('x', 1023).c_str());
	EXPECT_EQ(property.Value(), Repeat('x', 1023));
}


TEST_F(PropertyTest, AValueCanBeSetToAPartOfItself)
{
	TProperty property(&fComponent, "Label", "abcdef", nullptr, true);
	property.SetValue(property.Value() + 2);
	EXPECT_STREQ(property.Value(), "cdef");

	property.SetValue((Repeat('x', 500) + "tail").c_str());
	property.SetValue(property.Value() + 500);
	EXPECT_STREQ(property.Value(), "tail");

	property.SetValue(property.Value());
	EXPECT_STREQ(property.Value(), "tail");
}


TEST_F(PropertyTest, TheStandardSetStatementCallsTheSetter)
{
	EXPECT_EQ(SetStatement("OK", true), "Button1->SetLabel(\"OK\");");
	EXPECT_EQ(SetStatement("B_WILL_DRAW", false), "Button1->SetLabel(B_WILL_DRAW);");
}


TEST_F(PropertyTest, AnEmptyValueGivesAnEmptyArgument)
{
	EXPECT_EQ(SetStatement("", false), "Button1->SetLabel();");
	EXPECT_EQ(SetStatement("", true), "Button1->SetLabel(\"\");");
}


TEST_F(PropertyTest, ValuesAreNotEscaped)
{
	EXPECT_EQ(SetStatement("a\"b\\%s", true), "Button1->SetLabel(\"a\"b\\%s\");");
}


TEST_F(PropertyTest, TheStandardGetStatementCallsTheGetter)
{
	const TProperty property(&fComponent, "Frame", "", nullptr, true);
	EXPECT_STREQ(property.GetStatement().String(), "Button1->Frame()");
}


TEST_F(PropertyTest, StatementsFollowTheComponentsName)
{
	const TProperty property(&fComponent, "Flags", "1", nullptr, true);
	fComponent.SetComponentName("View1");
	EXPECT_STREQ(property.SetStatement().String(), "View1->SetFlags(1);");
}


TEST_F(PropertyTest, StoredStatementsAreReturnedUnchanged)
{
	TProperty property(&fComponent, "ViewColor", "{1,2,3,4}", nullptr, true);
	property.SetQuoted(true);
	property.SetSetStatement("{rgb_color clr = $VALUE;\n$COMPONENT->SetViewColor(clr);}");
	property.SetGetStatement("$COMPONENT->ViewColor()");
	EXPECT_STREQ(property.SetStatement().String(),
		"{rgb_color clr = $VALUE;\n$COMPONENT->SetViewColor(clr);}");
	EXPECT_STREQ(property.GetStatement().String(), "$COMPONENT->ViewColor()");

	property.SetSetStatement(nullptr);
	property.SetGetStatement(nullptr);
	EXPECT_STREQ(property.GetStatement().String(), "$COMPONENT->ViewColor()");

	property.SetSetStatement("");
	property.SetGetStatement("");
	EXPECT_STREQ(property.SetStatement().String(), "Button1->SetViewColor(\"{1,2,3,4}\");");
	EXPECT_STREQ(property.GetStatement().String(), "Button1->ViewColor()");
}


TEST_F(PropertyTest, TheSetStatementHasAtMost1103Bytes)
{
	fComponent.SetComponentName(Repeat('c', 1000).c_str());
	EXPECT_EQ(SetStatement(Repeat('v', 1023).c_str(), true).size(), 1103u);
}


TEST_F(PropertyTest, ACopySharesTheEditorAndHasTheRest)
{
	TStringProperty editor(&fComponent, nullptr);
	TProperty property(&fComponent, "Label", "OK", &editor, true);
	property.SetQuoted(true);
	property.SetValue("Cancel");
	property.SetSetStatement("set");
	property.SetGetStatement("get");

	const TProperty copy(property);
	property.SetValue("changed");
	EXPECT_STREQ(copy.Name(), "Label");
	EXPECT_EQ(copy.Owner(), &fComponent);
	EXPECT_EQ(copy.Editor(), &editor);
	EXPECT_STREQ(copy.Value(), "Cancel");
	EXPECT_STREQ(copy.DefValue(), "OK");
	EXPECT_STREQ(copy.SetStatement().String(), "set");
	EXPECT_STREQ(copy.GetStatement().String(), "get");
	EXPECT_TRUE(copy.IsQuoted());
	EXPECT_TRUE(copy.IsGenerated());
}


TEST_F(PropertyTest, FlagsAreStored)
{
	TProperty property(&fComponent, "Label", "", nullptr, false);
	property.SetGenerated(true);
	property.SetQuoted(true);
	EXPECT_TRUE(property.IsGenerated());
	EXPECT_TRUE(property.IsQuoted());
	property.SetGenerated(false);
	property.SetQuoted(false);
	EXPECT_FALSE(property.IsGenerated());
	EXPECT_FALSE(property.IsQuoted());
}

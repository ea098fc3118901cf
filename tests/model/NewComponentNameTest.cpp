// SPDX-License-Identifier: MIT
// Tests of the names for new components.

#include <memory>
#include <string>
#include <vector>

#include <gtest/gtest.h>

#include "model/Component.h"
#include "model/ComponentOwner.h"
#include "support/CapturedOutput.h"

namespace {

class NewComponentNameTest : public testing::Test {
protected:
	NewComponentNameTest()
		: fNew(nullptr, nullptr, CT_VISUAL)
	{
	}

	void AddNamed(const std::string& name)
	{
		fComponents.push_back(std::make_unique<TComponent>(nullptr, nullptr, CT_VISUAL));
		fComponents.back()->SetComponentName(name.c_str());
		fOwner.AddComponent(fComponents.back().get());
	}

	std::string NewName(const std::string& stem, int32 size = 80)
	{
		fNew.SetComponentName(stem.c_str());
		std::vector<char> buffer(size + 1, '?');
		EXPECT_TRUE(GetNewComponentName(&fNew, &fOwner, buffer.data(), size));
		EXPECT_EQ(buffer[size], '?');
		return buffer.data();
	}

	CapturedOutput fOutput;
	TComponentOwner fOwner;
	std::vector<std::unique_ptr<TComponent>> fComponents;
	TComponent fNew;
};

} // namespace

TEST_F(NewComponentNameTest, TheFirstThreeAreNumberedFromOne)
{
	EXPECT_EQ(NewName("Button"), "Button1");
	AddNamed("Button1");
	EXPECT_EQ(NewName("Button"), "Button2");
	AddNamed("Button2");
	EXPECT_EQ(NewName("Button"), "Button3");
}


TEST_F(NewComponentNameTest, TheFirstGapIsFilled)
{
	AddNamed("View1");
	AddNamed("View3");
	EXPECT_EQ(NewName("View"), "View2");
}


TEST_F(NewComponentNameTest, ARemovedNameComesBack)
{
	AddNamed("Button1");
	AddNamed("Button2");
	AddNamed("Button3");
	fOwner.RemoveComponent(int32(1));
	EXPECT_EQ(NewName("Button"), "Button2");
}


TEST_F(NewComponentNameTest, TheNumberFollowsTheWholeName)
{
	AddNamed("Button11");
	EXPECT_EQ(NewName("Button1"), "Button12");
}


TEST_F(NewComponentNameTest, NamesAreComparedExactly)
{
	AddNamed("button1");
	AddNamed("Button1 ");
	EXPECT_EQ(NewName("Button"), "Button1");
}


TEST_F(NewComponentNameTest, EachAttemptIsPrinted)
{
	AddNamed("View1");
	AddNamed("View2");
	NewName("View");
	EXPECT_EQ(fOutput.Text(), "before\nafter\nbefore\nafter\nbefore\nafter\n");
}


TEST_F(NewComponentNameTest, ASmallBufferCutsTheName)
{
	EXPECT_EQ(NewName("Button", 4), "But");
	EXPECT_EQ(NewName("Button", 1), "");
}


TEST_F(NewComponentNameTest, ALongStemLeavesRoomForTheNumber)
{
	const std::string stem(1000, 's');
	for (int32 i = 1; i <= 12; i++) {
		const std::string name = NewName(stem, 200);
		EXPECT_EQ(name.size(), 79u);
		EXPECT_EQ(name.substr(name.size() - std::to_string(i).size()), std::to_string(i));
		AddNamed(name);
	}
}


TEST_F(NewComponentNameTest, WithoutAnOwnerTheFirstNumberIsFree)
{
	fNew.SetComponentName("Button");
	char buffer[80];
	EXPECT_TRUE(GetNewComponentName(&fNew, nullptr, buffer, sizeof(buffer)));
	EXPECT_STREQ(buffer, "Button1");
}


TEST_F(NewComponentNameTest, MissingArgumentsAreRefused)
{
	char buffer[80] = "kept";
	EXPECT_FALSE(GetNewComponentName(nullptr, &fOwner, buffer, sizeof(buffer)));
	EXPECT_FALSE(GetNewComponentName(&fNew, &fOwner, nullptr, 80));
	EXPECT_FALSE(GetNewComponentName(&fNew, &fOwner, buffer, 0));
	EXPECT_STREQ(buffer, "kept");
}


TEST_F(NewComponentNameTest, AThousandTakenNamesArePassedOver)
{
	for (int32 i = 1; i < 1000; i++)
		AddNamed("Button" + std::to_string(i));
	EXPECT_EQ(NewName("Button"), "Button1000");
}

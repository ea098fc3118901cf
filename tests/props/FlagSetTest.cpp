// SPDX-License-Identifier: MIT
// Tests of the flags and their texts.

#include "props/FlagSet.h"

#include <string>

#include <String.h>
#include <View.h>
#include <Window.h>
#include <gtest/gtest.h>

namespace {

std::string
Confirmed(const TFlagSet& flags, const char* text)
{
	return flags.TextFor(flags.BitsFor(text)).String();
}


/// The labels of the boxes that a text ticks, separated by commas.
std::string
Ticked(const TFlagSet& flags, const char* text)
{
	std::string labels;
	const uint32 bits = flags.BitsFor(text);
	for (int32 i = 0; i < flags.CountBoxes(); i++) {
		if ((bits & flags.BoxAt(i).bit) != 0)
			labels += std::string(labels.empty() ? "" : ",") + flags.BoxAt(i).label;
	}
	return labels;
}

} // namespace

TEST(FlagSetTest, TheViewFlagsStandInOrder)
{
	const struct {
		const char* label;
		const char* name;
		uint32 bit;
	} kRows[] = {
		{"Will Draw", "B_WILL_DRAW", B_WILL_DRAW},
		{"Pulse Needed", "B_PULSE_NEEDED", B_PULSE_NEEDED},
		{"Frame events", "B_FRAME_EVENTS", B_FRAME_EVENTS},
		{"Full Update on resize", "B_FULL_UPDATE_ON_RESIZE", B_FULL_UPDATE_ON_RESIZE},
		{"Navigable", "B_NAVIGABLE", B_NAVIGABLE},
		{"Navigable Jump", "B_NAVIGABLE_JUMP", B_NAVIGABLE_JUMP},
		{"Sub-pixel precise", "B_SUBPIXEL_PRECISE", B_SUBPIXEL_PRECISE},
	};
	const TFlagSet& flags = TFlagSet::ViewFlags();
	ASSERT_EQ(flags.CountBoxes(), 7);
	for (int32 i = 0; i < 7; i++) {
		EXPECT_STREQ(flags.BoxAt(i).label, kRows[i].label);
		EXPECT_STREQ(flags.BoxAt(i).name, kRows[i].name);
		EXPECT_STREQ(flags.BoxAt(i).tickedBy, kRows[i].name);
		EXPECT_EQ(flags.BoxAt(i).bit, kRows[i].bit) << kRows[i].label;
	}
}


TEST(FlagSetTest, TheWindowFlagsStandInOrder)
{
	const struct {
		const char* label;
		uint32 bit;
		const char* name;
	} kRows[] = {
		{"Not movable", 0x00001, "B_NOT_MOVABLE"},
		{"Not H. resizable", 0x00004, "B_NOT_H_RESIZABLE"},
		{"Not V. resizable", 0x00008, "B_NOT_V_RESIZABLE"},
		{"Not resizable", 0x00002, "B_NOT_RESIZABLE"},
		{"Not closable", 0x00020, "B_NOT_CLOSABLE"},
		{"Not zoomable", 0x00040, "B_NOT_ZOOMABLE"},
		{"Not minimizable", 0x04000, "B_NOT_MINIMIZABLE"},
		{"Accepts first click", 0x00010, "B_WILL_ACCEPT_FIRST_CLICK"},
		{"Avoids front", 0x00080, "B_AVOID_FRONT"},
		{"Avoids focus", 0x02000, "B_AVOID_FOCUS"},
		{"Outline resize", 0x01000, nullptr},
		{"No workspace activation", 0x00100, "B_NO_WORKSPACE_ACTIVATION"},
		{"Not anchored on activate", 0x20000, "B_NOT_ANCHORED_ON_ACTIVATE"},
	};
	const TFlagSet& flags = TFlagSet::WindowFlags();
	ASSERT_EQ(flags.CountBoxes(), 13);
	for (int32 i = 0; i < 13; i++) {
		EXPECT_STREQ(flags.BoxAt(i).label, kRows[i].label);
		EXPECT_EQ(flags.BoxAt(i).bit, kRows[i].bit) << kRows[i].label;
		if (kRows[i].name != nullptr)
			EXPECT_STREQ(flags.BoxAt(i).name, kRows[i].name);
		else
			EXPECT_EQ(flags.BoxAt(i).name, nullptr);
	}
}


TEST(FlagSetTest, NoBoxGivesTheEmptyText)
{
	EXPECT_EQ(Confirmed(TFlagSet::ViewFlags(), ""), "");
	EXPECT_EQ(Confirmed(TFlagSet::WindowFlags(), ""), "");
	EXPECT_EQ(Confirmed(TFlagSet::WindowFlags(), nullptr), "");
	EXPECT_EQ(Ticked(TFlagSet::ViewFlags(), ""), "");
}


TEST(FlagSetTest, NamesAreJoinedInTableOrder)
{
	const TFlagSet& flags = TFlagSet::ViewFlags();
	EXPECT_STREQ(flags.TextFor(B_WILL_DRAW).String(), "B_WILL_DRAW");
	EXPECT_STREQ(flags.TextFor(B_NAVIGABLE | B_WILL_DRAW).String(), "B_WILL_DRAW|B_NAVIGABLE");
	EXPECT_STREQ(flags.TextFor(B_NAVIGABLE).String(), "B_NAVIGABLE");
	EXPECT_EQ(Confirmed(flags, "B_NAVIGABLE | B_WILL_DRAW"), "B_WILL_DRAW|B_NAVIGABLE");
}


TEST(FlagSetTest, TheDefaultViewFlagsAreWrittenBackUnchanged)
{
	EXPECT_EQ(Ticked(TFlagSet::ViewFlags(), "B_WILL_DRAW|B_NAVIGABLE"), "Will Draw,Navigable");
	EXPECT_EQ(
		Confirmed(TFlagSet::ViewFlags(), "B_WILL_DRAW|B_NAVIGABLE"), "B_WILL_DRAW|B_NAVIGABLE");
}


TEST(FlagSetTest, ANavigableJumpAlsoTicksNavigable)
{
	EXPECT_EQ(Ticked(TFlagSet::ViewFlags(), "B_NAVIGABLE_JUMP"), "Navigable,Navigable Jump");
	EXPECT_EQ(Confirmed(TFlagSet::ViewFlags(), "B_NAVIGABLE_JUMP"), "B_NAVIGABLE|B_NAVIGABLE_JUMP");
}


TEST(FlagSetTest, AvoidingFocusTicksTheDeadBoxToo)
{
	const TFlagSet& flags = TFlagSet::WindowFlags();
	EXPECT_EQ(Ticked(flags, "B_AVOID_FOCUS"), "Avoids focus,Outline resize");
	EXPECT_EQ(Confirmed(flags, "B_AVOID_FOCUS"), "B_AVOID_FOCUS");
	EXPECT_STREQ(flags.TextFor(0x01000).String(), "");
	EXPECT_EQ(Ticked(flags, "B_OUTLINE_RESIZE"), "");
}


TEST(FlagSetTest, UnknownNamesAreLost)
{
	EXPECT_EQ(Confirmed(TFlagSet::ViewFlags(), "B_MINE|B_PULSE_NEEDED|0x20"), "B_PULSE_NEEDED");
	EXPECT_EQ(Confirmed(TFlagSet::WindowFlags(), "B_ASYNCHRONOUS_CONTROLS"), "");
}


TEST(FlagSetTest, NamesAreCaseSensitive)
{
	EXPECT_EQ(Confirmed(TFlagSet::ViewFlags(), "b_will_draw"), "");
}


TEST(FlagSetTest, AllBoxesFitAProperty)
{
	EXPECT_LT(TFlagSet::ViewFlags().TextFor(0xffffffff).Length(), 1024);
	EXPECT_LT(TFlagSet::WindowFlags().TextFor(0xffffffff).Length(), 1024);
	EXPECT_EQ(
		Confirmed(TFlagSet::WindowFlags(), TFlagSet::WindowFlags().TextFor(0xffffffff).String()),
		TFlagSet::WindowFlags().TextFor(0xffffffff).String());
}

// SPDX-License-Identifier: MIT
// Tests of the editor classes: types, limits, display texts and lists.

#include <string>
#include <vector>

#include <gtest/gtest.h>

#include "model/Property.h"
#include "props/FlagsProperty.h"
#include "props/PickListProperty.h"
#include "props/RGBColorProperty.h"
#include "props/StringList.h"
#include "props/StringListProperty.h"
#include "props/StringProperty.h"

namespace {

using Texts = std::vector<std::string>;


Texts
TextsOf(const TStringList& list)
{
	Texts texts;
	for (int32 i = 0; i < list.CountItems(); i++)
		texts.push_back(list.StringAt(i));
	return texts;
}


/// The choices of an editor, asked for twice into a list that holds something.
template <class Editor>
Texts
Choices()
{
	TProperty property(nullptr, "Choice", "value", nullptr, true);
	Editor editor(nullptr, &property);
	TStringList list(20);
	list.Add("old");
	editor.GetValuePickList(&list);
	editor.GetValuePickList(&list);
	editor.GetValuePickList(nullptr);
	EXPECT_EQ(editor.Type(), PET_PICKLIST);
	return TextsOf(list);
}


template <class Editor>
std::string
DisplayOf(const char* value)
{
	TProperty property(nullptr, "Any", value, nullptr, true);
	Editor editor(nullptr, &property);
	return editor.GetDisplayValue();
}


template <class Editor>
long
LimitOf()
{
	Editor editor(nullptr, nullptr);
	return editor.EditLimit();
}


template <class Editor>
TPropEditType
TypeOf()
{
	Editor editor(nullptr, nullptr);
	return editor.Type();
}

} // namespace

TEST(StringListTest, TheListHoldsTheCallersPointers)
{
	const char* text = "text";
	TStringList list(20);
	list.Add(text);
	list.Add(nullptr);
	list.Add("second");
	EXPECT_EQ(list.CountItems(), 2);
	EXPECT_EQ(list.ItemAt(0), text);
	EXPECT_STREQ(list.StringAt(1), "second");
	EXPECT_EQ(list.StringAt(2), nullptr);
	EXPECT_EQ(list.StringAt(-1), nullptr);
}


TEST(EditorClassesTest, TypedEditorsHaveTheirLimits)
{
	EXPECT_EQ(LimitOf<TStringProperty>(), 1024);
	EXPECT_EQ(LimitOf<TNameProperty>(), 32);
	EXPECT_EQ(LimitOf<TIntProperty>(), 63);
	EXPECT_EQ(LimitOf<TBoolProperty>(), 1024);
	EXPECT_EQ(LimitOf<TViewColorProperty>(), 1024);
}


TEST(EditorClassesTest, EveryClassHasItsType)
{
	EXPECT_EQ(TypeOf<TStringProperty>(), PET_STRING);
	EXPECT_EQ(TypeOf<TNameProperty>(), PET_STRING);
	EXPECT_EQ(TypeOf<TIntProperty>(), PET_STRING);
	EXPECT_EQ(TypeOf<TPickListProperty>(), PET_PICKLIST);
	EXPECT_EQ(TypeOf<TStringListProperty>(), PET_LIST);
	EXPECT_EQ(TypeOf<TRGBColorProperty>(), PET_MODAL);
	EXPECT_EQ(TypeOf<TViewColorProperty>(), PET_MODAL);
	EXPECT_EQ(TypeOf<TViewFlagsProperty>(), PET_MODAL);
	EXPECT_EQ(TypeOf<TWindowFlagsProperty>(), PET_MODAL);
}


TEST(EditorClassesTest, OnlyBooleansAndTypedTextsShowTheirValue)
{
	EXPECT_EQ(DisplayOf<TStringProperty>("text"), "text");
	EXPECT_EQ(DisplayOf<TIntProperty>("12"), "12");
	EXPECT_EQ(DisplayOf<TBoolProperty>("true"), "true");
	EXPECT_EQ(DisplayOf<TBoolProperty>("false"), "false");
	EXPECT_EQ(DisplayOf<TPickListProperty>("value"), "(Pick List)");
	EXPECT_EQ(DisplayOf<TFontProperty>("be_plain_font"), "(Pick List)");
	EXPECT_EQ(DisplayOf<TFontSizeProperty>("10"), "(Pick List)");
	EXPECT_EQ(DisplayOf<TLaunchFlagsProperty>("x"), "(Pick List)");
	EXPECT_EQ(DisplayOf<TWindowLookProperty>("x"), "(Pick List)");
	EXPECT_EQ(DisplayOf<TWindowFeelProperty>("x"), "(Pick List)");
	EXPECT_EQ(DisplayOf<TResizingModeProperty>("x"), "(Pick List)");
	EXPECT_EQ(DisplayOf<TStringListProperty>("x"), "(Strings)");
	EXPECT_EQ(DisplayOf<TRGBColorProperty>("x"), "(rgb_color)");
	EXPECT_EQ(DisplayOf<TViewColorProperty>("x"), "(rgb_color)");
	EXPECT_EQ(DisplayOf<TViewFlagsProperty>("x"), "(Flags)");
	EXPECT_EQ(DisplayOf<TWindowFlagsProperty>("x"), "(Flags)");
}


TEST(EditorClassesTest, ThePlainPickListOffersNothing)
{
	EXPECT_EQ(Choices<TPickListProperty>(), Texts{});
}


TEST(EditorClassesTest, EveryPickListOffersItsChoicesOnce)
{
	EXPECT_EQ(Choices<TBoolProperty>(), (Texts{"true", "false"}));
	EXPECT_EQ(Choices<TFontProperty>(), (Texts{"be_plain_font", "be_bold_font", "be_fixed_font"}));
	EXPECT_EQ(Choices<TLaunchFlagsProperty>(),
		(Texts{"B_SINGLE_LAUNCH", "B_MULTIPLE_LAUNCH", "B_EXCLUSIVE_LAUNCH"}));
	EXPECT_EQ(Choices<TWindowLookProperty>(),
		(Texts{"B_BORDERED_WINDOW_LOOK", "B_TITLED_WINDOW_LOOK", "B_DOCUMENT_WINDOW_LOOK",
			"B_MODAL_WINDOW_LOOK", "B_FLOATING_WINDOW_LOOK"}));
	EXPECT_EQ(Choices<TWindowFeelProperty>(),
		(Texts{"B_NORMAL_WINDOW_FEEL", "B_MODAL_SUBSET_WINDOW_FEEL", "B_MODAL_APP_WINDOW_FEEL",
			"B_MODAL_ALL_WINDOW_FEEL", "B_FLOATING_SUBSET_WINDOW_FEEL",
			"B_FLOATING_APP_WINDOW_FEEL", "B_FLOATING_ALL_WINDOW_FEEL"}));
	EXPECT_EQ(Choices<TResizingModeProperty>(),
		(Texts{"B_FOLLOW_LEFT", "B_FOLLOW_RIGHT", "B_FOLLOW_LEFT_RIGHT", "B_FOLLOW_H_CENTER",
			"B_FOLLOW_TOP", "B_FOLLOW_BOTTOM", "B_FOLLOW_TOP_BOTTOM", "B_FOLLOW_V_CENTER",
			"B_FOLLOW_ALL_SIDES", "B_FOLLOW_NONE"}));
}


TEST(EditorClassesTest, FontSizesRunFrom6To24)
{
	Texts sizes;
	for (int size = 6; size <= 24; size++)
		sizes.push_back(std::to_string(size));
	EXPECT_EQ(Choices<TFontSizeProperty>(), sizes);
}


TEST(EditorClassesTest, TheStringListHasThreeItems)
{
	TStringListProperty editor(nullptr, nullptr);
	TStringList list;
	editor.GetValueList(&list);
	editor.GetValueList(nullptr);
	EXPECT_EQ(TextsOf(list), (Texts{"Item 1", "Item 2", "Item 3"}));
}

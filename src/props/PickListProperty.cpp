// SPDX-License-Identifier: MIT
// The editors of properties that are chosen from a list.

#include "props/PickListProperty.h"

#include "props/StringList.h"

static const char* const kBools[] = {"true", "false"};

static const char* const kFonts[] = {"be_plain_font", "be_bold_font", "be_fixed_font"};

static const char* const kFontSizes[] = {"6", "7", "8", "9", "10", "11", "12", "13", "14", "15",
	"16", "17", "18", "19", "20", "21", "22", "23", "24"};

static const char* const kLaunchFlags[] = {
	"B_SINGLE_LAUNCH", "B_MULTIPLE_LAUNCH", "B_EXCLUSIVE_LAUNCH"};

static const char* const kWindowLooks[] = {"B_BORDERED_WINDOW_LOOK", "B_TITLED_WINDOW_LOOK",
	"B_DOCUMENT_WINDOW_LOOK", "B_MODAL_WINDOW_LOOK", "B_FLOATING_WINDOW_LOOK"};

static const char* const kWindowFeels[] = {"B_NORMAL_WINDOW_FEEL", "B_MODAL_SUBSET_WINDOW_FEEL",
	"B_MODAL_APP_WINDOW_FEEL", "B_MODAL_ALL_WINDOW_FEEL", "B_FLOATING_SUBSET_WINDOW_FEEL",
	"B_FLOATING_APP_WINDOW_FEEL", "B_FLOATING_ALL_WINDOW_FEEL"};

static const char* const kResizingModes[] = {"B_FOLLOW_LEFT", "B_FOLLOW_RIGHT",
	"B_FOLLOW_LEFT_RIGHT", "B_FOLLOW_H_CENTER", "B_FOLLOW_TOP", "B_FOLLOW_BOTTOM",
	"B_FOLLOW_TOP_BOTTOM", "B_FOLLOW_V_CENTER", "B_FOLLOW_ALL_SIDES", "B_FOLLOW_NONE"};


template <int N>
static void
Offer(TStringList* list, const char* const (&values)[N])
{
	if (list == nullptr)
		return;
	list->MakeEmpty();
	for (const char* value : values)
		list->Add(value);
}


TPickListProperty::TPickListProperty(TComponent* component, TProperty* property)
	: TPropertyEditor(component, property, PET_PICKLIST)
{
}


const char*
TPickListProperty::GetDisplayValue() const
{
	return "(Pick List)";
}


void
TPickListProperty::GetValuePickList(TStringList* list)
{
	if (list != nullptr)
		list->MakeEmpty();
}


TBoolProperty::TBoolProperty(TComponent* component, TProperty* property)
	: TPickListProperty(component, property)
{
}


const char*
TBoolProperty::GetDisplayValue() const
{
	return GetValue();
}


void
TBoolProperty::GetValuePickList(TStringList* list)
{
	Offer(list, kBools);
}


TFontProperty::TFontProperty(TComponent* component, TProperty* property)
	: TPickListProperty(component, property)
{
}


void
TFontProperty::GetValuePickList(TStringList* list)
{
	Offer(list, kFonts);
}


TFontSizeProperty::TFontSizeProperty(TComponent* component, TProperty* property)
	: TPickListProperty(component, property)
{
}


void
TFontSizeProperty::GetValuePickList(TStringList* list)
{
	Offer(list, kFontSizes);
}


TLaunchFlagsProperty::TLaunchFlagsProperty(TComponent* component, TProperty* property)
	: TPickListProperty(component, property)
{
}


void
TLaunchFlagsProperty::GetValuePickList(TStringList* list)
{
	Offer(list, kLaunchFlags);
}


TWindowLookProperty::TWindowLookProperty(TComponent* component, TProperty* property)
	: TPickListProperty(component, property)
{
}


void
TWindowLookProperty::GetValuePickList(TStringList* list)
{
	Offer(list, kWindowLooks);
}


TWindowFeelProperty::TWindowFeelProperty(TComponent* component, TProperty* property)
	: TPickListProperty(component, property)
{
}


void
TWindowFeelProperty::GetValuePickList(TStringList* list)
{
	Offer(list, kWindowFeels);
}


TResizingModeProperty::TResizingModeProperty(TComponent* component, TProperty* property)
	: TPickListProperty(component, property)
{
}


void
TResizingModeProperty::GetValuePickList(TStringList* list)
{
	Offer(list, kResizingModes);
}

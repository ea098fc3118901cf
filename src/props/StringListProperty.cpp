// SPDX-License-Identifier: MIT
// The editor of properties that are lists of strings.

#include "props/StringListProperty.h"

#include <Alert.h>

#include "props/StringList.h"


TStringListProperty::TStringListProperty(TComponent* component, TProperty* property)
	: TPropertyEditor(component, property, PET_LIST)
{
}


bool
TStringListProperty::ModalEdit()
{
	BAlert* alert = new BAlert("TStringListProperty", "Implement me!", "Okey-dokey");
	alert->Go();
	return false;
}


const char*
TStringListProperty::GetDisplayValue() const
{
	return "(Strings)";
}


void
TStringListProperty::GetValueList(TStringList* list)
{
	if (list == nullptr)
		return;
	list->Add("Item 1");
	list->Add("Item 2");
	list->Add("Item 3");
}

// SPDX-License-Identifier: MIT
// The editors of properties that are typed into a text field.

#include "props/StringProperty.h"


TStringProperty::TStringProperty(TComponent* component, TProperty* property)
	: TPropertyEditor(component, property, PET_STRING)
{
}


TNameProperty::TNameProperty(TComponent* component, TProperty* property)
	: TStringProperty(component, property)
{
}


long
TNameProperty::EditLimit()
{
	return 32;
}


TIntProperty::TIntProperty(TComponent* component, TProperty* property)
	: TPropertyEditor(component, property, PET_STRING)
{
}


long
TIntProperty::EditLimit()
{
	return 63;
}

// SPDX-License-Identifier: MIT
// The editors of properties that are colours.

#include "props/RGBColorProperty.h"


TRGBColorProperty::TRGBColorProperty(TComponent* component, TProperty* property)
	: TPropertyEditor(component, property, PET_MODAL)
{
}


const char*
TRGBColorProperty::GetDisplayValue() const
{
	return "(rgb_color)";
}


TViewColorProperty::TViewColorProperty(TComponent* component, TProperty* property)
	: TRGBColorProperty(component, property)
{
}


const char*
TViewColorProperty::GetDisplayValue() const
{
	return "(rgb_color)";
}

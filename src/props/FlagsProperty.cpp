// SPDX-License-Identifier: MIT
// The editors of properties that are sets of flags.

#include "props/FlagsProperty.h"


TViewFlagsProperty::TViewFlagsProperty(TComponent* component, TProperty* property)
	: TPropertyEditor(component, property, PET_MODAL)
{
}


const char*
TViewFlagsProperty::GetDisplayValue() const
{
	return "(Flags)";
}


TWindowFlagsProperty::TWindowFlagsProperty(TComponent* component, TProperty* property)
	: TPropertyEditor(component, property, PET_MODAL)
{
}


const char*
TWindowFlagsProperty::GetDisplayValue() const
{
	return "(Flags)";
}

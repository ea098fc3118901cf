// SPDX-License-Identifier: MIT
// The editors of properties that are colours.

#include "props/RGBColorProperty.h"

#include "props/RGBColorWin.h"


TRGBColorProperty::TRGBColorProperty(TComponent* component, TProperty* property)
	: TPropertyEditor(component, property, PET_MODAL)
{
}


bool
TRGBColorProperty::ModalEdit()
{
	const TPendingEdit edit(this);
	BString value;
	if (!edit.Read(&value))
		return false;
	RGBColorWin* dialog = new RGBColorWin(value.String(), edit);
	dialog->InitWindow();
	dialog->InitControls();
	dialog->Show();
	return true;
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

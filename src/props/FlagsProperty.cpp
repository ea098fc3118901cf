// SPDX-License-Identifier: MIT
// The editors of properties that are sets of flags.

#include "props/FlagsProperty.h"

#include "props/ViewFlagsWin.h"
#include "props/WindowFlagsWin.h"


TViewFlagsProperty::TViewFlagsProperty(TComponent* component, TProperty* property)
	: TPropertyEditor(component, property, PET_MODAL)
{
}


bool
TViewFlagsProperty::ModalEdit()
{
	const TPendingEdit edit(this);
	BString value;
	if (!edit.Read(&value))
		return false;
	ViewFlagsWin* dialog = new ViewFlagsWin(value.String(), edit);
	dialog->InitWindow();
	dialog->InitControls();
	dialog->Show();
	return true;
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


bool
TWindowFlagsProperty::ModalEdit()
{
	const TPendingEdit edit(this);
	BString value;
	if (!edit.Read(&value))
		return false;
	(new WindowFlagsWin(value.String(), edit))->Show();
	return true;
}


const char*
TWindowFlagsProperty::GetDisplayValue() const
{
	return "(Flags)";
}

// SPDX-License-Identifier: MIT
// The base of the components for controls.

#include "model/ControlComponent.h"

#include <cstring>

#include <Control.h>
#include <String.h>

#include "model/ColorText.h"
#include "model/Diagnostics.h"
#include "model/NameCompare.h"
#include "model/PropertyStore.h"
#include "model/PropertyTable.h"
#include "model/ViewLock.h"
#include "props/PickListProperty.h"
#include "props/StringProperty.h"

/// What a property is before a value has been stored.
static const struct {
	const char* name;
	const char* value;
} kFallbacks[] = {
	{"ResizingMode", "B_FOLLOW_NONE"},
	{"Enabled", "true"},
	{"Flags", "B_WILL_DRAW|B_NAVIGABLE"},
};


TControlComponent::TControlComponent(
	TComponentOwner* owner, TFormDesigner* designer, TComponentType)
	: TViewComponent(owner, designer)
{
}


void
TControlComponent::InitPropertyList()
{
	TViewComponent::InitPropertyList();
	AddEditedProperty<TBoolProperty>(this, "Enabled", "true", Generation::kPlain);
	AddEditedProperty<TStringProperty>(this, "Label", "", Generation::kQuoted);
	AddEditedProperty<TResizingModeProperty>(
		this, "ResizingMode", "B_FOLLOW_NONE", Generation::kPlain);
}


const char*
TControlComponent::GetPropertyValue(const char* name)
{
	PrintDiagnostic("TControlComponent::GetPropertyValue('%s')\n", ShownText(name));
	if (name == nullptr)
		return TViewComponent::GetPropertyValue(name);

	for (const auto& fallback : kFallbacks) {
		if (IsSameName(name, fallback.name)) {
			const char* value;
			return PropertyStore()->FindString(name, &value) == B_OK ? value : fallback.value;
		}
	}

	const BControl* control = dynamic_cast<const BControl*>(DTView());
	if (IsSameName(name, "Label") && control != nullptr)
		return control->Label();
	return TViewComponent::GetPropertyValue(name);
}


void
TControlComponent::SetPropertyValue(const char* name, const char* value)
{
	PrintCall("TControlComponent::SetPropertyValue", name, value);
	if (name == nullptr || value == nullptr)
		return;

	if (!IsSameName(name, "Label") && !IsSameName(name, "Enabled")
		&& !IsSameName(name, "ViewColor")) {
		TViewComponent::SetPropertyValue(name, value);
		return;
	}
	ApplyToControl(name, value);
	StoreProperty(name, value);
}


void
TControlComponent::ApplyToControl(const char* name, const char* value)
{
	TViewLock lock(DTView());
	if (!lock.IsLocked()) {
		PrintDiagnostic("Warning: %s::DTView() not set\n", ClassTypeName(this).String());
		return;
	}

	if (IsSameName(name, "ViewColor")) {
		rgb_color color = DTView()->ViewColor();
		DTView()->SetViewColor(StrToRGBColor(value, &color));
		DTView()->Invalidate();
		return;
	}

	BControl* control = dynamic_cast<BControl*>(DTView());
	if (control == nullptr)
		return;
	if (IsSameName(name, "Label")) {
		control->SetLabel(value);
		return;
	}
	control->SetEnabled(strcmp(value, "true") == 0);
	control->Invalidate();
}

// SPDX-License-Identifier: MIT

#include "CheckBoxComponent.h"

#include <CheckBox.h>


namespace {

void
ShowTick(BView* view, const char* value, const property_row&)
{
	static_cast<BCheckBox*>(view)->SetValue(
		strcmp(value, "true") == 0 ? B_CONTROL_ON : B_CONTROL_OFF);
}


constexpr property_row kProperties[] = {
	{"Checked", "false", PropertyKind::kBool, "$COMPONENT->SetValue($VALUE);", {}, ShowTick},
};

constexpr event_row kEvents[] = {{"OnChange", nullptr}};
constexpr const char* kParameters[] = {"Label"};
constexpr component_description kDescription = {
	"CheckBox", "TCheckBox", "CheckBox.h", kProperties, kEvents, kParameters};

} // namespace

TCheckBoxComponent::TCheckBoxComponent(TFormDesigner* designer, BRect frame)
	: TStandardComponent(designer, kDescription)
{
	SetDesignView(new DesignView<BCheckBox>(this, frame, "TCheckBox", "", nullptr));
}

// SPDX-License-Identifier: MIT

#include "ButtonComponent.h"

#include <Button.h>


namespace {

// The mark of a default button lies around its frame.
constexpr property_row kProperties[] = {
	{"Default", "false", PropertyKind::kBool, "$COMPONENT->MakeDefault($VALUE);", {}, nullptr},
};

constexpr event_row kEvents[] = {{"OnClick", nullptr}};
constexpr const char* kParameters[] = {"Label"};
constexpr component_description kDescription = {
	"Button", "TButton", "Button.h", kProperties, kEvents, kParameters};

} // namespace

TButtonComponent::TButtonComponent(TFormDesigner* designer, BRect frame)
	: TStandardComponent(designer, kDescription)
{
	SetDesignView(new DesignView<BButton>(this, frame, "TButton", "", nullptr));
}

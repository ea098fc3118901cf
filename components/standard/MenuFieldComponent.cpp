// SPDX-License-Identifier: MIT

#include "MenuFieldComponent.h"

#include <ormi/views/MenuItems.h>

#include "Choices.h"

namespace {

constexpr property_row kProperties[] = {
	ShownBy<&BMenuField::SetEnabled>("Enabled", "true"),
	ShownBy<&BMenuField::SetLabel>("Label", ""),
	ShownBy<&Ormi::ChoiceField::SetItems>("Items", ""),
	ShownBy<&Ormi::ChoiceField::SetSelected>("Selected", "0"),
	ShownBy<&BMenuField::SetAlignment>("Alignment", "B_ALIGN_LEFT", nullptr, kAlignments),
	ShownBy<&BMenuField::SetDivider>("Divider", "0"),
	ResizingModeRow(),
};

constexpr event_row kEvents[] = {{"OnChange", nullptr}};
constexpr const char* kParameters[] = {"Label"};
constexpr component_description kDescription = {
	"MenuField", "TMenuField", "MenuField.h", kProperties, kEvents, kParameters};

} // namespace

TMenuFieldComponent::TMenuFieldComponent(TFormDesigner* designer, BRect frame)
	: TStandardComponent(designer, kDescription)
{
	BView* view = new DesignView<Ormi::ChoiceField>(this, frame, "TMenuField", "");
	new DesignGlass(this, view);
	SetDesignView(view);
}

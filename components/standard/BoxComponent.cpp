// SPDX-License-Identifier: MIT

#include "BoxComponent.h"

#include <Box.h>

#include "Choices.h"

namespace {

void
ShowLabel(BView* view, const char* text, const property_row&)
{
	static_cast<BBox*>(view)->SetLabel(text);
}


constexpr property_row kProperties[] = {
	{"Label", "", PropertyKind::kText, nullptr, {}, ShowLabel},
	ShownBy<&BBox::SetBorder>("Border", "B_FANCY_BORDER", nullptr, kBorders),
	ResizingModeRow(),
};

constexpr event_row kEvents[] = {{"OnClick", nullptr}};
constexpr const char* kParameters[] = {"Label"};
constexpr component_description kDescription = {
	"Box", "TBox", "Box.h", kProperties, kEvents, kParameters};

} // namespace

TBoxComponent::TBoxComponent(TFormDesigner* designer, BRect frame)
	: TStandardComponent(designer, kDescription)
{
	SetDesignView(new DesignView<BBox>(this, frame, "TBox"));
}

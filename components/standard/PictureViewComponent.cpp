// SPDX-License-Identifier: MIT

#include "PictureViewComponent.h"

#include <ormi/views/PicturePane.h>


namespace {

constexpr property_row kProperties[] = {
	ShownBy<&Ormi::PicturePane::SetFile>("File", ""),
	ShownBy<&Ormi::PicturePane::SetStretched>("Stretched", "false"),
	ShownBy<&Ormi::PicturePane::SetCentered>("Centered", "false"),
	ResizingModeRow(),
};

constexpr event_row kEvents[] = {{"OnClick", nullptr}};
constexpr component_description kDescription = {
	"PictureView", "TPictureView", "View.h", kProperties, kEvents};

} // namespace

TPictureViewComponent::TPictureViewComponent(TFormDesigner* designer, BRect frame)
	: TStandardComponent(designer, kDescription)
{
	SetDesignView(new DesignView<Ormi::PicturePane>(this, frame, "TPictureView"));
}

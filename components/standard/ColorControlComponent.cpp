// SPDX-License-Identifier: MIT

#include "ColorControlComponent.h"

#include <ormi/views/Gauges.h>


namespace {

constexpr choice kLayouts[] = {{"B_CELLS_4x64", B_CELLS_4x64}, {"B_CELLS_8x32", B_CELLS_8x32},
	{"B_CELLS_16x16", B_CELLS_16x16}, {"B_CELLS_32x8", B_CELLS_32x8},
	{"B_CELLS_64x4", B_CELLS_64x4}};

constexpr property_row kProperties[] = {
	ShownBy<&BColorControl::SetLayout>("Layout", "B_CELLS_32x8", nullptr, kLayouts),
	ShownBy<&BColorControl::SetCellSize>("CellSize", "8"),
	ShownBy<&Ormi::ColorPanel::SetColor>(
		"Color", "{0,0,0,255}", "{rgb_color clr = $VALUE;\n$COMPONENT->SetColor(clr);}"),
};

constexpr event_row kEvents[] = {{"OnChange", nullptr}};
constexpr component_description kDescription = {
	"ColorControl", "TColorControl", "ColorControl.h", kProperties, kEvents};

} // namespace

TColorControlComponent::TColorControlComponent(TFormDesigner* designer, BRect frame)
	: TStandardComponent(designer, kDescription)
{
	BView* view = new DesignView<Ormi::ColorPanel>(this, frame, "TColorControl");
	new DesignGlass(this, view);
	SetDesignView(view);
}

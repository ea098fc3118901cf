// SPDX-License-Identifier: MIT

#include "StatusBarComponent.h"

#include <ormi/views/Gauges.h>


namespace {

constexpr property_row kProperties[] = {
	ShownBy<&Ormi::ProgressBar::SetLabel>("Label", ""),
	ShownBy<&Ormi::ProgressBar::SetTrailingLabel>("TrailingLabel", ""),
	ShownBy<&BStatusBar::SetText>("Text", ""),
	ShownBy<&BStatusBar::SetTrailingText>("TrailingText", ""),
	ShownBy<&BStatusBar::SetMaxValue>("MaxValue", "100"),
	ShownBy<&Ormi::ProgressBar::SetValue>("Value", "0"),
	ShownBy<&BStatusBar::SetBarHeight>("BarHeight", "16"),
	ShownBy<&BStatusBar::SetBarColor>(
		"BarColor", "{50,150,255,255}", "{rgb_color clr = $VALUE;\n$COMPONENT->SetBarColor(clr);}"),
	ResizingModeRow(),
};

constexpr event_row kEvents[] = {{"OnClick", nullptr}};
constexpr component_description kDescription = {
	"StatusBar", "TStatusBar", "StatusBar.h", kProperties, kEvents};

} // namespace

TStatusBarComponent::TStatusBarComponent(TFormDesigner* designer, BRect frame)
	: TStandardComponent(designer, kDescription)
{
	SetDesignView(new DesignView<Ormi::ProgressBar>(this, frame, "TStatusBar"));
}

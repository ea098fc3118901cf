// SPDX-License-Identifier: MIT

#include "SliderComponent.h"

#include <ormi/views/Gauges.h>


namespace {

constexpr choice kOrientations[] = {{"B_HORIZONTAL", B_HORIZONTAL}, {"B_VERTICAL", B_VERTICAL}};
constexpr choice kStyles[] = {
	{"B_BLOCK_THUMB", B_BLOCK_THUMB}, {"B_TRIANGLE_THUMB", B_TRIANGLE_THUMB}};
constexpr choice kHashMarks[] = {{"B_HASH_MARKS_NONE", B_HASH_MARKS_NONE},
	{"B_HASH_MARKS_TOP", B_HASH_MARKS_TOP}, {"B_HASH_MARKS_BOTTOM", B_HASH_MARKS_BOTTOM},
	{"B_HASH_MARKS_BOTH", B_HASH_MARKS_BOTH}};

constexpr property_row kProperties[] = {
	ShownBy<&Ormi::RangeSlider::SetMinimum>("Minimum", "0"),
	ShownBy<&Ormi::RangeSlider::SetMaximum>("Maximum", "100"),
	ShownBy<&BSlider::SetValue>("Value", "0"),
	ShownBy<&BSlider::SetOrientation>("Orientation", "B_HORIZONTAL", nullptr, kOrientations),
	ShownBy<&BSlider::SetStyle>("Style", "B_BLOCK_THUMB", nullptr, kStyles),
	ShownBy<&BSlider::SetHashMarks>("HashMarks", "B_HASH_MARKS_NONE", nullptr, kHashMarks),
	ShownBy<&BSlider::SetHashMarkCount>("HashMarkCount", "0"),
	ShownBy<&BSlider::SetKeyIncrementValue>(
		"KeyIncrement", "1", "$COMPONENT->SetKeyIncrementValue($VALUE);"),
	ShownBy<&Ormi::RangeSlider::SetMinimumLabel>("MinimumLabel", ""),
	ShownBy<&Ormi::RangeSlider::SetMaximumLabel>("MaximumLabel", ""),
	ShownBy<&BSlider::SetBarThickness>("BarThickness", "6"),
	ShownBy<&BSlider::SetBarColor>("BarColor", "{172,172,172,255}",
		"{rgb_color clr = $VALUE;\n$COMPONENT->SetBarColor(clr);}"),
	ShownBy<&Ormi::RangeSlider::SetFilled>("Filled", "false"),
	ShownBy<&Ormi::RangeSlider::SetFillColor>("FillColor", "{102,152,203,255}",
		"{rgb_color clr = $VALUE;\n$COMPONENT->SetFillColor(clr);}"),
};

constexpr event_row kEvents[] = {{"OnChange", nullptr}, {"OnModify", nullptr}};
constexpr const char* kParameters[] = {"Label"};
constexpr component_description kDescription = {
	"Slider", "TSlider", "Slider.h", kProperties, kEvents, kParameters};

} // namespace

TSliderComponent::TSliderComponent(TFormDesigner* designer, BRect frame)
	: TStandardComponent(designer, kDescription)
{
	SetDesignView(new DesignView<Ormi::RangeSlider>(this, frame, "TSlider", ""));
}

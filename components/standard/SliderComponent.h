// SPDX-License-Identifier: MIT
// The component for a slider.

#pragma once

#include "StandardComponent.h"

/// A BSlider. Properties beside those of every control: "Minimum", "Maximum", "Value", "Orientation",
/// "Style" (of the thumb), "HashMarks", "HashMarkCount", "KeyIncrement", "MinimumLabel", "MaximumLabel",
/// "BarThickness", "BarColor", "Filled" (bool), "FillColor". Events: "OnChange", when the user gave it
/// another value, and "OnModify", each time that the value follows the thumb which is held.
class TSliderComponent : public TStandardComponent<TControlComponent> {
public:
	TSliderComponent(TFormDesigner* designer, BRect frame);
};

// SPDX-License-Identifier: MIT
// The component for a check box.

#pragma once

#include "StandardComponent.h"

/// A BCheckBox. Properties beside those of every control: "Checked" (bool). Events: "OnChange", when
/// the user ticks or unticks it.
class TCheckBoxComponent : public TStandardComponent<TControlComponent> {
public:
	TCheckBoxComponent(TFormDesigner* designer, BRect frame);
};

// SPDX-License-Identifier: MIT
// The component for a radio button.

#pragma once

#include "StandardComponent.h"

/// A BRadioButton: one of its container's is on. Properties beside those of every control: "Checked"
/// (bool); of several checked ones the last one in the container is on, as in the program. Events:
/// "OnChange", when the user chooses it.
class TRadioButtonComponent : public TStandardComponent<TControlComponent> {
public:
	TRadioButtonComponent(TFormDesigner* designer, BRect frame);
};

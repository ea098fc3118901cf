// SPDX-License-Identifier: MIT
// The component for a push button.

#pragma once

#include "StandardComponent.h"

/// A BButton. Properties beside those of every control: "Default" (bool). Events: "OnClick".
///
/// A default button's mark lies around its frame and shows when the program runs, not at design time.
class TButtonComponent : public TStandardComponent<TControlComponent> {
public:
	TButtonComponent(TFormDesigner* designer, BRect frame);
};

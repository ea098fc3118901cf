// SPDX-License-Identifier: MIT
// The component for a colour control.

#pragma once

#include "StandardComponent.h"

/// A BColorControl. Properties beside those of every control: "Color", "Layout", "CellSize" (pixels).
/// Events: "OnChange", when the user changes the colour.
class TColorControlComponent : public TStandardComponent<TControlComponent> {
public:
	TColorControlComponent(TFormDesigner* designer, BRect frame);
};

// SPDX-License-Identifier: MIT
// The component for a box around other components.

#pragma once

#include "StandardComponent.h"

/// A BBox, which holds other components. Properties beside those of every view: "Label", "Border",
/// "ResizingMode". Events: "OnClick".
class TBoxComponent : public TStandardComponent<TViewComponent>, public TComponentOwner {
public:
	TBoxComponent(TFormDesigner* designer, BRect frame);
};

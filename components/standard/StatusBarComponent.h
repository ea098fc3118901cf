// SPDX-License-Identifier: MIT
// The component for a status bar.

#pragma once

#include "StandardComponent.h"

/// A BStatusBar. Properties beside those of every view: "Label", "TrailingLabel", "Text", "TrailingText",
/// "MaxValue", "Value", "BarHeight", "BarColor", "ResizingMode". Events: "OnClick".
class TStatusBarComponent : public TStandardComponent<TViewComponent> {
public:
	TStatusBarComponent(TFormDesigner* designer, BRect frame);
};

// SPDX-License-Identifier: MIT
// The component for a plain view.

#pragma once

#include "StandardComponent.h"

/// A BView, which holds other components. Properties beside those of every view: "ResizingMode". Events:
/// "OnClick". Like in the program, nothing is seen of it but its colour.
class TPlainViewComponent : public TStandardComponent<TViewComponent>, public TComponentOwner {
public:
	TPlainViewComponent(TFormDesigner* designer, BRect frame);
};

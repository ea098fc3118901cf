// SPDX-License-Identifier: MIT
// The component for a line of text.

#pragma once

#include "StandardComponent.h"

/// A BStringView. Properties beside those of every view: "Text", "Alignment", "ResizingMode". Events:
/// "OnClick".
class TStringViewComponent : public TStandardComponent<TViewComponent> {
public:
	TStringViewComponent(TFormDesigner* designer, BRect frame);
};

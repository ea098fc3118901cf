// SPDX-License-Identifier: MIT
// The component for a text field.

#pragma once

#include "StandardComponent.h"

/// A BTextControl. Properties beside those of every control: "Text", and "Divider" (where the field
/// begins, in pixels from the left edge). Events: "OnChange", at each change of the text, and "OnEnter",
/// when Enter is pressed or the focus leaves after a change.
class TTextControlComponent : public TStandardComponent<TControlComponent> {
public:
	TTextControlComponent(TFormDesigner* designer, BRect frame);
};

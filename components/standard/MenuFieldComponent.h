// SPDX-License-Identifier: MIT
// The component for a menu field.

#pragma once

#include "StandardComponent.h"

/// A BMenuField with a pop-up menu. Properties beside those of every view: "Label", "Enabled", "Items"
/// ("One|Two|>Under two|-|Three", see Ormi::AddMenuItems()), "Selected" (an index), "Alignment" (of the
/// label), "Divider" (where the menu begins, in pixels from the left edge), "ResizingMode". Events:
/// "OnChange", when the user chooses an item.
class TMenuFieldComponent : public TStandardComponent<TViewComponent> {
public:
	TMenuFieldComponent(TFormDesigner* designer, BRect frame);
};

// SPDX-License-Identifier: MIT
// The base of the components for controls.

#pragma once

#include "model/ViewComponent.h"

/// A control: a view with "Enabled", "Label" and "ResizingMode".
class TControlComponent : public TViewComponent {
public:
	/// The type argument is ignored: a control is always of type CT_VISUAL.
	TControlComponent(
		TComponentOwner* owner, TFormDesigner* designer, TComponentType type = CT_VISUAL);

	void InitPropertyList() override;

	/// "Label" is the label of the design-time control.
	const char* GetPropertyValue(const char* name) override;
	void SetPropertyValue(const char* name, const char* value) override;

private:
	void ApplyToControl(const char* name, const char* value);
};

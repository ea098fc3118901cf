// SPDX-License-Identifier: MIT
// The component for a box around other components.

#pragma once

#include <ComponentKit.h>

/// A BBox, which holds other components. Properties beside those of every view: "Label", "Border",
/// "ResizingMode". Events: "OnClick".
class TBoxComponent : public TViewComponent, public TComponentOwner {
public:
	TBoxComponent(TFormDesigner* designer, BRect frame);

	void InitPropertyList() override;
	void InitEventList() override;
	void SetPropertyValue(const char* name, const char* value) override;
	const char* HeaderFile() override;
	void OnSetConstructorParams(BString& text) override;
};

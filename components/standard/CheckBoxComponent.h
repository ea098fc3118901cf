// SPDX-License-Identifier: MIT
// The component for a check box.

#pragma once

#include <ComponentKit.h>

/// A BCheckBox. Properties beside those of every control: "Checked" (bool). Events: "OnChange", when
/// the user ticks or unticks it.
class TCheckBoxComponent : public TControlComponent {
public:
	TCheckBoxComponent(TFormDesigner* designer, BRect frame);

	void InitPropertyList() override;
	void InitEventList() override;
	void SetPropertyValue(const char* name, const char* value) override;
	const char* HeaderFile() override;
	void OnSetConstructorParams(BString& text) override;
};

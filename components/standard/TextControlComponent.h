// SPDX-License-Identifier: MIT
// The component for a text field.

#pragma once

#include <ComponentKit.h>

/// A BTextControl. Properties beside those of every control: "Text", and "Divider" (where the field
/// begins, in pixels from the left edge). Events: "OnChange", at each change of the text, and "OnEnter",
/// when Enter is pressed or the focus leaves after a change.
class TTextControlComponent : public TControlComponent {
public:
	TTextControlComponent(TFormDesigner* designer, BRect frame);

	void InitPropertyList() override;
	void InitEventList() override;
	void SetPropertyValue(const char* name, const char* value) override;
	const char* HeaderFile() override;
	void OnSetConstructorParams(BString& text) override;
};

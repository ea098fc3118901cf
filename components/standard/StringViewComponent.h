// SPDX-License-Identifier: MIT
// The component for a line of text.

#pragma once

#include <ComponentKit.h>

/// A BStringView. Properties beside those of every view: "Text", "Alignment", "ResizingMode". Events:
/// "OnClick".
class TStringViewComponent : public TViewComponent {
public:
	TStringViewComponent(TFormDesigner* designer, BRect frame);

	void InitPropertyList() override;
	void InitEventList() override;
	void SetPropertyValue(const char* name, const char* value) override;
	const char* HeaderFile() override;
	void OnSetConstructorParams(BString& text) override;
};

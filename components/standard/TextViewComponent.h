// SPDX-License-Identifier: MIT
// The component for a text of several lines.

#pragma once

#include "StandardComponent.h"

/// A BTextView. Properties beside those of every view: "Text", "Editable", "Selectable", "WordWrap",
/// "Alignment", "Autoindent", "Undo", "Stylable", "HideTyping", "MaxBytes", "TabWidth", "TextColor",
/// "ResizingMode". Events: "OnChange", at each change of the text.
class TTextViewComponent : public TStandardComponent<TViewComponent> {
public:
	TTextViewComponent(TFormDesigner* designer, BRect frame);
};

// SPDX-License-Identifier: MIT
// The component that stands for a form itself.

#pragma once

#include "model/VisualComponent.h"

/// A form: a visual component with the title, look, feel and flags of a window, and its events.
///
/// It is made without owner and designer and with empty lists; the design form sets it up.
class TFormComponent : public TVisualComponent {
public:
	TFormComponent();

	void InitPropertyList() override;
	void InitEventList() override;
	const char* GetPropertyValue(const char* name) override;

	/// The window's properties are stored only: the design form applies them to its window.
	void SetPropertyValue(const char* name, const char* value) override;
};

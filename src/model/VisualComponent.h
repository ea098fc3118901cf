// SPDX-License-Identifier: MIT
// The base of the components that are seen on a form.

#pragma once

#include "model/Component.h"

/// A component with a design-time view: geometry, flags, colours, font, and the events of a view.
///
/// Setting a property applies it to the view, with the view's window locked, and stores it. Without a
/// view, or when its window cannot be locked, it is stored only.
class TVisualComponent : public TComponent {
public:
	TVisualComponent(TComponentOwner* owner, TFormDesigner* designer);

	void InitPropertyList() override;
	void InitEventList() override;

	/// Colours have a value before one is stored. The edges come from the rectangle "Frame" of the
	/// property store when a library keeps one there; such a text lasts until the same edge is asked
	/// for again in this thread.
	const char* GetPropertyValue(const char* name) override;
	void SetPropertyValue(const char* name, const char* value) override;

	/// Nothing: the code generator itself knows what a view is constructed from.
	void OnSetConstructorParams(BString& text) override;

private:
	// The view is there, its window locked.
	void ApplyToView(const char* name, const char* value);
};

// SPDX-License-Identifier: MIT
// The component for a view that scrolls.

#pragma once

#include "StandardComponent.h"

/// A BScrollView, which holds other components. Properties beside those of every view: "Horizontal",
/// "Vertical" (whether it has these bars), "Border", "ResizingMode".
///
/// A list or a text that is its first component fills it, and is scrolled; it gets that frame whatever
/// the user draws. Otherwise its components lie on a page that the bars scroll in the program.
class TScrollViewComponent : public TStandardComponent<TViewComponent>, public TComponentOwner {
public:
	TScrollViewComponent(TFormDesigner* designer, BRect frame);

	void SetPropertyValue(const char* name, const char* value) override;
	bool HandleComponentDesignMessage(BMessage* message) override;

	void AddComponent(TComponent* component) override;
	bool RemoveComponent(TComponent* component) override;
	TComponent* RemoveComponent(int32 index) override;

	/// Fits the component that fills the view into it, or the bars to those that lie in it. Locks the
	/// view's window.
	void Fit();

private:
	void ReleaseBars();
	TComponent* Filler() const;
	void FitFiller(TComponent* filler, BRect frame);
};

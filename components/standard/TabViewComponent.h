// SPDX-License-Identifier: MIT
// The component for pages with tabs.

#pragma once

#include "StandardComponent.h"

/// A BTabView, which holds other components on its pages. Properties beside those of every view: "Tabs"
/// ("One|Two", the labels), "Selection" (the page that is shown, from 0), "TabWidth", "TabSide",
/// "ResizingMode". Events: "OnChange", when another page is selected.
///
/// Each component that comes into it gets a property "Page", at first the page that is shown. A double
/// click on a tab shows its page.
class TTabViewComponent : public TStandardComponent<TViewComponent>, public TComponentOwner {
public:
	TTabViewComponent(TFormDesigner* designer, BRect frame);

	void SetPropertyValue(const char* name, const char* value) override;
	bool DefaultEditAction(BPoint where) override;
	bool OnGenInitForm(BString& text) override;

	bool ComponentPropertyModified(TComponent* component, const char* name, const char* oldValue,
		const char* newValue) override;
	void AddComponent(TComponent* component) override;
	bool RemoveComponent(TComponent* component) override;
	TComponent* RemoveComponent(int32 index) override;

	/// Shows the components of the selected page and hides the others.
	void ShowPage();

private:
	int32 PageOf(TComponent* component) const;
	void PutOnPage(TComponent* component);
	void ShowAgain(TComponent* component);
};

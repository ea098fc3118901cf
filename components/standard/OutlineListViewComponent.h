// SPDX-License-Identifier: MIT
// The component for a list in levels.

#pragma once

#include "StandardComponent.h"

/// A BOutlineListView that owns its items. Properties beside those of every view: "Items" ("One|>Under one|Two",
/// see Ormi::ParseItems()), "ListType", "ResizingMode". Events: "OnSelect", at another selection, "OnInvoke",
/// at a double click or Enter, and "OnExpand", with the item whose subitems are shown now or no longer.
class TOutlineListViewComponent : public TStandardComponent<TViewComponent> {
public:
	TOutlineListViewComponent(TFormDesigner* designer, BRect frame);
};

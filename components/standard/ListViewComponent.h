// SPDX-License-Identifier: MIT
// The component for a list.

#pragma once

#include "StandardComponent.h"

/// A BListView that owns its items. Properties beside those of every view: "Items" ("One|>Under one|Two",
/// see Ormi::ParseItems()), "ListType", "ResizingMode". Events: "OnSelect", at another selection, "OnInvoke", at a double click or Enter.
class TListViewComponent : public TStandardComponent<TViewComponent> {
public:
	TListViewComponent(TFormDesigner* designer, BRect frame);
};

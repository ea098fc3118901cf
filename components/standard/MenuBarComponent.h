// SPDX-License-Identifier: MIT
// The component for a menu bar.

#pragma once

#include "StandardComponent.h"

/// A BMenuBar. Properties beside those of every view: "Enabled", "Items" ("File|>Open|>-|>Quit|Edit|>Copy",
/// see Ormi::AddMenuItems()), "Border", "ResizingMode". Events: "OnInvoke", with the item that the user
/// chose.
class TMenuBarComponent : public TStandardComponent<TViewComponent> {
public:
	TMenuBarComponent(TFormDesigner* designer, BRect frame);
};

// SPDX-License-Identifier: MIT
// The component for a plain view.

#pragma once

#include "model/VisualComponent.h"

/// A plain view: properties and events are those of every visual component.
class TViewComponent : public TVisualComponent {
public:
	TViewComponent(TComponentOwner* owner, TFormDesigner* designer);
};

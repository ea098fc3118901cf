// SPDX-License-Identifier: MIT
// The component for a plain view.

#include "model/ViewComponent.h"


TViewComponent::TViewComponent(TComponentOwner* owner, TFormDesigner* designer)
	: TVisualComponent(owner, designer)
{
}

// SPDX-License-Identifier: MIT
// The component for a picture.

#pragma once

#include "StandardComponent.h"

/// A view that shows a picture from a file. Properties beside those of every view: "File" (a path),
/// "Stretched", "Centered" (both bool), "ResizingMode". Events: "OnClick".
class TPictureViewComponent : public TStandardComponent<TViewComponent> {
public:
	TPictureViewComponent(TFormDesigner* designer, BRect frame);
};

// SPDX-License-Identifier: MIT
// The component for a button with pictures.

#pragma once

#include "StandardComponent.h"

/// A BPictureButton with pictures from files. Properties beside those of every control: "OffFile",
/// "OnFile" (paths), "Behavior". Events: "OnClick".
class TPictureButtonComponent : public TStandardComponent<TControlComponent> {
public:
	TPictureButtonComponent(TFormDesigner* designer, BRect frame);
};

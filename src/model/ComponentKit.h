// SPDX-License-Identifier: MIT
// The one header that a component library includes.

#pragma once

#include "model/AppComponent.h"
#include "model/ColorText.h"
#include "model/Component.h"
#include "model/ComponentOwner.h"
#include "model/ControlComponent.h"
#include "model/DesignMessages.h"
#include "model/Event.h"
#include "model/FormComponent.h"
#include "model/FormDesigner.h"
#include "model/Property.h"
#include "model/PropertyStore.h"
#include "model/ViewComponent.h"
#include "model/VisualComponent.h"
#include "palette/PaletteEntry.h"
#include "props/FlagsProperty.h"
#include "props/PickListProperty.h"
#include "props/PropertyEditor.h"
#include "props/RGBColorProperty.h"
#include "props/StringList.h"
#include "props/StringListProperty.h"
#include "props/StringProperty.h"

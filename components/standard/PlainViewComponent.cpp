// SPDX-License-Identifier: MIT

#include "PlainViewComponent.h"

#include <View.h>


namespace {

constexpr property_row kProperties[] = {ResizingModeRow()};
constexpr event_row kEvents[] = {{"OnClick", nullptr}};
constexpr component_description kDescription = {"View", "TView", "View.h", kProperties, kEvents};

} // namespace

TPlainViewComponent::TPlainViewComponent(TFormDesigner* designer, BRect frame)
	: TStandardComponent(designer, kDescription)
{
	SetDesignView(new DesignView<BView>(this, frame, "TView", B_FOLLOW_NONE, B_WILL_DRAW));
}

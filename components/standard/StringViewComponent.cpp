// SPDX-License-Identifier: MIT

#include "StringViewComponent.h"

#include <StringView.h>

#include "Choices.h"

namespace {

constexpr property_row kProperties[] = {
	ShownBy<&BStringView::SetText>("Text", ""),
	ShownBy<&BStringView::SetAlignment>("Alignment", "B_ALIGN_LEFT", nullptr, kAlignments),
	ResizingModeRow(),
};

constexpr event_row kEvents[] = {{"OnClick", nullptr}};
constexpr const char* kParameters[] = {"Text"};
constexpr component_description kDescription = {
	"StringView", "TStringView", "StringView.h", kProperties, kEvents, kParameters};

} // namespace

TStringViewComponent::TStringViewComponent(TFormDesigner* designer, BRect frame)
	: TStandardComponent(designer, kDescription)
{
	SetDesignView(new DesignView<BStringView>(this, frame, "TStringView", ""));
}

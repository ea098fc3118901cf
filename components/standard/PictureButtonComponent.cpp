// SPDX-License-Identifier: MIT

#include "PictureButtonComponent.h"

#include <ormi/views/FileButton.h>


namespace {

constexpr choice kBehaviors[] = {
	{"B_ONE_STATE_BUTTON", B_ONE_STATE_BUTTON}, {"B_TWO_STATE_BUTTON", B_TWO_STATE_BUTTON}};

void
ShowBehavior(BView* view, const char* name, const property_row&)
{
	static_cast<BPictureButton*>(view)->SetBehavior(
		ChoiceValue<uint32>(kBehaviors, name, B_ONE_STATE_BUTTON));
}


constexpr property_row kProperties[] = {
	ShownBy<&Ormi::FileButton::SetOffFile>("OffFile", ""),
	ShownBy<&Ormi::FileButton::SetOnFile>("OnFile", ""),
	{"Behavior", "B_ONE_STATE_BUTTON", PropertyKind::kChoice, nullptr, kBehaviors, ShowBehavior},
};

constexpr event_row kEvents[] = {{"OnClick", nullptr}};
constexpr component_description kDescription = {
	"PictureButton", "TPictureButton", "PictureButton.h", kProperties, kEvents};

} // namespace

TPictureButtonComponent::TPictureButtonComponent(TFormDesigner* designer, BRect frame)
	: TStandardComponent(designer, kDescription)
{
	SetDesignView(new DesignView<Ormi::FileButton>(this, frame, "TPictureButton"));
}

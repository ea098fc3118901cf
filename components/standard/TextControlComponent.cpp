// SPDX-License-Identifier: MIT

#include "TextControlComponent.h"

#include <TextControl.h>


namespace {

constexpr property_row kProperties[] = {
	ShownBy<&BTextControl::SetText>("Text", ""),
	ShownBy<&BTextControl::SetDivider>("Divider", "0"),
};

constexpr event_row kEvents[] = {{"OnChange", nullptr}, {"OnEnter", nullptr}};
constexpr const char* kParameters[] = {"Label", "Text"};
constexpr component_description kDescription = {
	"TextControl", "TTextControl", "TextControl.h", kProperties, kEvents, kParameters};

} // namespace

TTextControlComponent::TTextControlComponent(TFormDesigner* designer, BRect frame)
	: TStandardComponent(designer, kDescription)
{
	BTextControl* view = new DesignView<BTextControl>(this, frame, "TTextControl", "", "", nullptr);
	// A text control makes itself as high as its font needs, but the frame is what the user drew and
	// what the document keeps.
	view->ResizeTo(frame.Width(), frame.Height());
	new DesignGlass(this, view);
	SetDesignView(view);
}

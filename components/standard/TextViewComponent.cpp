// SPDX-License-Identifier: MIT

#include "TextViewComponent.h"

#include <ormi/views/TextPane.h>

#include "Choices.h"

namespace {

void
ShowText(BView* view, const char* text, const property_row&)
{
	static_cast<BTextView*>(view)->SetText(text);
}


constexpr property_row kProperties[] = {
	ShownBy<&BTextView::MakeEditable>("Editable", "true", "$COMPONENT->MakeEditable($VALUE);"),
	ShownBy<&BTextView::MakeSelectable>(
		"Selectable", "true", "$COMPONENT->MakeSelectable($VALUE);"),
	ShownBy<&BTextView::SetWordWrap>("WordWrap", "true"),
	ShownBy<&BTextView::SetAlignment>("Alignment", "B_ALIGN_LEFT", nullptr, kAlignments),
	ShownBy<&BTextView::SetAutoindent>("Autoindent", "false"),
	ShownBy<&BTextView::SetDoesUndo>("Undo", "true", "$COMPONENT->SetDoesUndo($VALUE);"),
	ShownBy<&BTextView::SetStylable>("Stylable", "false"),
	ShownBy<&BTextView::HideTyping>("HideTyping", "false", "$COMPONENT->HideTyping($VALUE);"),
	ShownBy<&BTextView::SetMaxBytes>("MaxBytes", "2147483647"),
	ShownBy<&BTextView::SetTabWidth>("TabWidth", "28"),
	{"Text", "", PropertyKind::kText, nullptr, {}, ShowText},
	ShownBy<&Ormi::TextPane::SetTextColor>(
		"TextColor", "{0,0,0,255}", "{rgb_color clr = $VALUE;\n$COMPONENT->SetTextColor(clr);}"),
	ResizingModeRow(),
};

constexpr event_row kEvents[] = {{"OnChange", nullptr}};
constexpr default_row kDefaults[] = {{"ViewColor", "{255,255,255,255}"}};
constexpr component_description kDescription = {
	"TextView", "TTextView", "TextView.h", kProperties, kEvents, {}, kDefaults};

} // namespace

TTextViewComponent::TTextViewComponent(TFormDesigner* designer, BRect frame)
	: TStandardComponent(designer, kDescription)
{
	SetDesignView(new DesignView<Ormi::TextPane>(this, frame, "TTextView"));
}

// SPDX-License-Identifier: MIT

#include "BoxComponent.h"

#include <cstring>

#include <Box.h>

#include "ChoiceProperty.h"
#include "DesignView.h"
#include "SourceText.h"

namespace {

constexpr choice kBorders[] = {{"B_FANCY_BORDER", B_FANCY_BORDER},
	{"B_PLAIN_BORDER", B_PLAIN_BORDER}, {"B_NO_BORDER", B_NO_BORDER}};

} // namespace

TBoxComponent::TBoxComponent(TFormDesigner* designer, BRect frame)
	: TViewComponent(nullptr, designer)
{
	SetComponentName("Box");
	SetClassName("TBox");
	InitPropertyList();
	InitEventList();
	SetDTView(new DesignView<BBox>(this, frame, "TBox"));
}


void
TBoxComponent::InitPropertyList()
{
	TViewComponent::InitPropertyList();
	TProperty* label = new TProperty(this, "Label", "", nullptr, true);
	AddPropAndEditor(label, new TStringProperty(this, label), nullptr, nullptr, true);
	TProperty* border = new TProperty(this, "Border", "B_FANCY_BORDER", nullptr, true);
	AddPropAndEditor(border, new TChoiceProperty(this, border, kBorders), nullptr, nullptr, false);
	TProperty* resizing = new TProperty(this, "ResizingMode", "B_FOLLOW_NONE", nullptr, true);
	AddPropAndEditor(resizing, new TResizingModeProperty(this, resizing), nullptr, nullptr, false);
}


void
TBoxComponent::InitEventList()
{
	TViewComponent::InitEventList();
	AddEvent(new TEvent("OnClick", nullptr, nullptr, false));
}


void
TBoxComponent::SetPropertyValue(const char* name, const char* value)
{
	TViewComponent::SetPropertyValue(name, value);
	if (name == nullptr || value == nullptr || !DTView()->LockLooper())
		return;
	BBox* view = static_cast<BBox*>(DTView());
	if (strcmp(name, "Label") == 0)
		view->SetLabel(value);
	else if (strcmp(name, "Border") == 0)
		view->SetBorder(ChoiceValue(kBorders, value, B_FANCY_BORDER));
	DTView()->UnlockLooper();
}


const char*
TBoxComponent::HeaderFile()
{
	return "Box.h";
}


void
TBoxComponent::OnSetConstructorParams(BString& text)
{
	AppendLiteral(text, FindProperty("Label")->Value());
}

// SPDX-License-Identifier: MIT

#include "StringViewComponent.h"

#include <cstring>

#include <StringView.h>

#include "ChoiceProperty.h"
#include "DesignView.h"
#include "SourceText.h"

namespace {

constexpr choice kAlignments[] = {{"B_ALIGN_LEFT", B_ALIGN_LEFT}, {"B_ALIGN_RIGHT", B_ALIGN_RIGHT},
	{"B_ALIGN_CENTER", B_ALIGN_CENTER}};

} // namespace

TStringViewComponent::TStringViewComponent(TFormDesigner* designer, BRect frame)
	: TViewComponent(nullptr, designer)
{
	SetComponentName("StringView");
	SetClassName("TStringView");
	InitPropertyList();
	InitEventList();
	SetDTView(new DesignView<BStringView>(this, frame, "TStringView", ""));
}


void
TStringViewComponent::InitPropertyList()
{
	TViewComponent::InitPropertyList();
	TProperty* text = new TProperty(this, "Text", "", nullptr, true);
	AddPropAndEditor(text, new TStringProperty(this, text), nullptr, nullptr, true);
	TProperty* alignment = new TProperty(this, "Alignment", "B_ALIGN_LEFT", nullptr, true);
	AddPropAndEditor(
		alignment, new TChoiceProperty(this, alignment, kAlignments), nullptr, nullptr, false);
	TProperty* resizing = new TProperty(this, "ResizingMode", "B_FOLLOW_NONE", nullptr, true);
	AddPropAndEditor(resizing, new TResizingModeProperty(this, resizing), nullptr, nullptr, false);
}


void
TStringViewComponent::InitEventList()
{
	TViewComponent::InitEventList();
	AddEvent(new TEvent("OnClick", nullptr, nullptr, false));
}


void
TStringViewComponent::SetPropertyValue(const char* name, const char* value)
{
	TViewComponent::SetPropertyValue(name, value);
	if (name == nullptr || value == nullptr || !DTView()->LockLooper())
		return;
	BStringView* view = static_cast<BStringView*>(DTView());
	if (strcmp(name, "Text") == 0)
		view->SetText(value);
	else if (strcmp(name, "Alignment") == 0)
		view->SetAlignment(ChoiceValue(kAlignments, value, B_ALIGN_LEFT));
	DTView()->UnlockLooper();
}


const char*
TStringViewComponent::HeaderFile()
{
	return "StringView.h";
}


void
TStringViewComponent::OnSetConstructorParams(BString& text)
{
	AppendLiteral(text, FindProperty("Text")->Value());
}

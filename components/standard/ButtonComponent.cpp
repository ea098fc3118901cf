// SPDX-License-Identifier: MIT

#include "ButtonComponent.h"

#include <Button.h>

#include "DesignView.h"
#include "SourceText.h"

TButtonComponent::TButtonComponent(TFormDesigner* designer, BRect frame)
	: TControlComponent(nullptr, designer)
{
	SetComponentName("Button");
	SetClassName("TButton");
	InitPropertyList();
	InitEventList();
	SetDTView(new DesignView<BButton>(this, frame, "TButton", "", nullptr));
}


void
TButtonComponent::InitPropertyList()
{
	TControlComponent::InitPropertyList();
	TProperty* isDefault = new TProperty(this, "Default", "false", nullptr, true);
	AddPropAndEditor(isDefault, new TBoolProperty(this, isDefault),
		"$COMPONENT->MakeDefault($VALUE);", nullptr, false);
}


void
TButtonComponent::InitEventList()
{
	TControlComponent::InitEventList();
	AddEvent(new TEvent("OnClick", nullptr, nullptr, false));
}


const char*
TButtonComponent::HeaderFile()
{
	return "Button.h";
}


void
TButtonComponent::OnSetConstructorParams(BString& text)
{
	AppendLiteral(text, FindProperty("Label")->Value());
}

// SPDX-License-Identifier: MIT

#include "CheckBoxComponent.h"

#include <cstring>

#include <CheckBox.h>

#include "DesignView.h"
#include "SourceText.h"

TCheckBoxComponent::TCheckBoxComponent(TFormDesigner* designer, BRect frame)
	: TControlComponent(nullptr, designer)
{
	SetComponentName("CheckBox");
	SetClassName("TCheckBox");
	InitPropertyList();
	InitEventList();
	SetDTView(new DesignView<BCheckBox>(this, frame, "TCheckBox", "", nullptr));
}


void
TCheckBoxComponent::InitPropertyList()
{
	TControlComponent::InitPropertyList();
	TProperty* checked = new TProperty(this, "Checked", "false", nullptr, true);
	AddPropAndEditor(
		checked, new TBoolProperty(this, checked), "$COMPONENT->SetValue($VALUE);", nullptr, false);
}


void
TCheckBoxComponent::InitEventList()
{
	TControlComponent::InitEventList();
	AddEvent(new TEvent("OnChange", nullptr, nullptr, false));
}


void
TCheckBoxComponent::SetPropertyValue(const char* name, const char* value)
{
	TControlComponent::SetPropertyValue(name, value);
	if (name == nullptr || value == nullptr || strcmp(name, "Checked") != 0)
		return;
	if (DTView()->LockLooper()) {
		static_cast<BCheckBox*>(DTView())->SetValue(
			strcmp(value, "true") == 0 ? B_CONTROL_ON : B_CONTROL_OFF);
		DTView()->UnlockLooper();
	}
}


const char*
TCheckBoxComponent::HeaderFile()
{
	return "CheckBox.h";
}


void
TCheckBoxComponent::OnSetConstructorParams(BString& text)
{
	AppendLiteral(text, FindProperty("Label")->Value());
}

// SPDX-License-Identifier: MIT

#include "TextControlComponent.h"

#include <cstdlib>
#include <cstring>

#include <TextControl.h>

#include "DesignView.h"
#include "SourceText.h"

TTextControlComponent::TTextControlComponent(TFormDesigner* designer, BRect frame)
	: TControlComponent(nullptr, designer)
{
	SetComponentName("TextControl");
	SetClassName("TTextControl");
	InitPropertyList();
	InitEventList();
	BTextControl* view = new DesignView<BTextControl>(this, frame, "TTextControl", "", "", nullptr);
	view->SetDivider(0);
	// A text control makes itself as high as its font needs, but the frame is what the user drew and
	// what the document keeps.
	view->ResizeTo(frame.Width(), frame.Height());
	new DesignGlass(this, view);
	SetDTView(view);
}


void
TTextControlComponent::InitPropertyList()
{
	TControlComponent::InitPropertyList();
	TProperty* text = new TProperty(this, "Text", "", nullptr, true);
	AddPropAndEditor(text, new TStringProperty(this, text), nullptr, nullptr, true);
	TProperty* divider = new TProperty(this, "Divider", "0", nullptr, true);
	AddPropAndEditor(divider, new TIntProperty(this, divider), nullptr, nullptr, false);
}


void
TTextControlComponent::InitEventList()
{
	TControlComponent::InitEventList();
	AddEvent(new TEvent("OnChange", nullptr, nullptr, false));
	AddEvent(new TEvent("OnEnter", nullptr, nullptr, false));
}


void
TTextControlComponent::SetPropertyValue(const char* name, const char* value)
{
	TControlComponent::SetPropertyValue(name, value);
	if (name == nullptr || value == nullptr || !DTView()->LockLooper())
		return;
	BTextControl* view = static_cast<BTextControl*>(DTView());
	if (strcmp(name, "Text") == 0)
		view->SetText(value);
	else if (strcmp(name, "Divider") == 0)
		view->SetDivider(strtol(value, nullptr, 10));
	DTView()->UnlockLooper();
}


const char*
TTextControlComponent::HeaderFile()
{
	return "TextControl.h";
}


void
TTextControlComponent::OnSetConstructorParams(BString& text)
{
	AppendLiteral(text, FindProperty("Label")->Value());
	text << ",";
	AppendLiteral(text, FindProperty("Text")->Value());
}

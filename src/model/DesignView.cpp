// SPDX-License-Identifier: MIT

#include "model/DesignView.h"

#include <cstring>

#include <Message.h>
#include <Window.h>

#include "model/ColorText.h"
#include "model/ComponentOwner.h"
#include "model/DesignMessages.h"
#include "model/NumberText.h"
#include "model/Property.h"

namespace {

/// The value of the property; null when the component has none of that name.
const char*
ValueOf(TComponent* component, const char* name)
{
	const TProperty* property = component->FindProperty(name);
	return property != nullptr ? property->Value() : nullptr;
}


const BFont*
FontOf(TComponent* component)
{
	const char* name = ValueOf(component, "Font");
	if (name != nullptr && strcmp(name, "be_bold_font") == 0)
		return be_bold_font;
	if (name != nullptr && strcmp(name, "be_fixed_font") == 0)
		return be_fixed_font;
	return be_plain_font;
}

} // namespace

void
ShowLook(TComponent* component, BView* view)
{
	const char* color = ValueOf(component, "ViewColor");
	rgb_color present = view->ViewColor();
	if (color != nullptr)
		view->SetViewColor(StrToRGBColor(color, &present));
	color = ValueOf(component, "HighColor");
	present = view->HighColor();
	if (color != nullptr)
		view->SetHighColor(StrToRGBColor(color, &present));
	color = ValueOf(component, "LowColor");
	present = view->LowColor();
	if (color != nullptr)
		view->SetLowColor(StrToRGBColor(color, &present));
	view->SetFont(FontOf(component));
}


BFont
InDesignedSize(TComponent* component, const BFont* font)
{
	BFont sized(*font);
	const bool isSystems = font == be_plain_font || font == be_bold_font || font == be_fixed_font;
	const char* size = ValueOf(component, "FontSize");
	const long points = isSystems && size != nullptr ? NumberIn(size) : 0;
	if (points > 0)
		sized.SetSize(points);
	return sized;
}


void
RestoreFrame(BView* view, BRect frame)
{
	if (view->Frame() == frame)
		return;
	view->MoveTo(frame.LeftTop());
	view->ResizeTo(frame.Width(), frame.Height());
}


void
TakeFromKeyboard(BView* view)
{
	// Also of a view that hands the flags on to one inside.
	view->SetFlags(view->Flags() & ~(B_NAVIGABLE | B_NAVIGABLE_JUMP));
	for (BView* child = view->ChildAt(0); child != nullptr; child = child->NextSibling())
		TakeFromKeyboard(child);
}


bool
OfferDesignMessage(TComponent* component, BMessage* message)
{
	if (message->what != DTM_COMPONENT_MOVE)
		return component->HandleComponentDesignMessage(message);

	BView* view = component->DTView();
	void* dragged;
	BPoint corner;
	// Dropped on itself, the component knows what to do.
	const bool isForOthers = dynamic_cast<TComponentOwner*>(component) == nullptr
		&& message->FindPointer("component", &dragged) == B_OK && dragged != component
		&& FindDroppedCorner(message, view, &corner);
	if (isForOthers && view->Parent() != nullptr) {
		BMessage copy(*message);
		view->Window()->PostMessage(&copy, view->Parent());
	} else
		component->HandleComponentDesignMessage(message);
	// A view passes on to its parent by itself what it does not handle, and the parent has it by now.
	return true;
}


DesignGlass::DesignGlass(TComponent* component, BView* covered)
	: BView(covered->Bounds(), "glass", B_FOLLOW_ALL_SIDES, B_WILL_DRAW),
	  fComponent(component)
{
	// Else the control draws nothing where the glass is, which is everywhere.
	covered->SetFlags(covered->Flags() | B_DRAW_ON_CHILDREN);
	SetViewColor(B_TRANSPARENT_COLOR);
	covered->AddChild(this);
}


void
DesignGlass::Draw(BRect)
{
	// Again, as the control's children lie over what it has drawn itself.
	fComponent->DesignerDrawSelection();
}


void
DesignGlass::MouseDown(BPoint where)
{
	// The glass lies exactly over the component's view, so the coordinates are the same.
	fComponent->DesignerMouseDown(where, Bounds(), fComponent->DTView());
}


void
DesignGlass::MessageReceived(BMessage* message)
{
	if (!OfferDesignMessage(fComponent, message))
		BView::MessageReceived(message);
}

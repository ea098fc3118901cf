// SPDX-License-Identifier: MIT

#include "DesignView.h"

#include <Message.h>
#include <Window.h>

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
	: BView(covered->Bounds(), "glass", B_FOLLOW_ALL_SIDES, 0),
	  fComponent(component)
{
	SetViewColor(B_TRANSPARENT_COLOR);
	covered->AddChild(this);
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

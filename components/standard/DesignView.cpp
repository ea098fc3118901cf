// SPDX-License-Identifier: MIT

#include "DesignView.h"

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

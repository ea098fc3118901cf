// SPDX-License-Identifier: MIT
// The designer of a form, as its components and the palette entries see it.

#include "model/FormDesigner.h"

#include <Point.h>
#include <Rect.h>


TFormDesigner::TFormDesigner()
	: fDTFormView(nullptr)
{
}


void
TFormDesigner::DesignFormShown(bool)
{
}


void
TFormDesigner::DesignFormActivated(bool)
{
}


void
TFormDesigner::ComponentSelected(TComponent*)
{
}


void
TFormDesigner::ComponentMoved(TComponent*, BPoint)
{
}


void
TFormDesigner::ComponentResized(TComponent*, float, float)
{
}


bool
TFormDesigner::IsDropWaiting()
{
	return false;
}


TComponent*
TFormDesigner::CreateComponent(BView*, BRect)
{
	return nullptr;
}


void
TFormDesigner::DoneDroppingComponent()
{
}


void
TFormDesigner::SetDTFormView(BView* view)
{
	fDTFormView = view;
}


bool
TFormDesigner::AdoptComponent(TComponent*)
{
	return true;
}


void
TFormDesigner::ComponentModified(TComponent*)
{
}


bool
TFormDesigner::IsForm(const TComponentOwner* owner) const
{
	if (owner == nullptr)
		return false;
	if (owner == this)
		return true;

	const TFormDesigner* designer = dynamic_cast<const TFormDesigner*>(owner);
	return designer != nullptr && fDTFormView != nullptr && designer->fDTFormView == fDTFormView;
}

// SPDX-License-Identifier: MIT
// The hooks that component libraries override, as they are without one: neutral. Those that concern the
// design-time view are in ComponentDesign.cpp.

#include "model/Component.h"


bool
TComponent::PropertyModified(const char*, const char*, const char*)
{
	return true;
}


void
TComponent::AddComponentContextMenuItems(BPopUpMenu*)
{
}


bool
TComponent::HandleComponentContextMessage(BMessage*)
{
	return false;
}


void
TComponent::SelectedInFormDesigner()
{
}


void
TComponent::InvokedInFormDesigner()
{
}


void
TComponent::PopupMenuInvokedInFormDesigner(BPopUpMenu*)
{
}


void
TComponent::MenuItemSelectedInFormDesigner(BMenuItem*)
{
}


void
TComponent::DeletedFromFormDesigner()
{
}


void
TComponent::AddedToPalette()
{
}


void
TComponent::PopupMenuInvokedInPalette(BPopUpMenu*)
{
}


void
TComponent::MenuItemSelectedInPalette(BMenuItem*)
{
}


void
TComponent::DeletedFromPalette()
{
}


void
TComponent::InitEventValues()
{
}


void
TComponent::WriteExtendedComponentDataTo(BMessage*)
{
}


void
TComponent::ReadExtendedComponentDataFrom(const BMessage*)
{
}


const char*
TComponent::HeaderFile()
{
	return nullptr;
}


bool
TComponent::OnGenConstructorCall(BString&)
{
	return false;
}


void
TComponent::OnSetConstructorParams(BString&)
{
}


bool
TComponent::OnGenHeaderFileTop(BString&)
{
	return false;
}


bool
TComponent::OnGenInitForm(BString&)
{
	return false;
}


bool
TComponent::OnGenDestroyForm(BString&)
{
	return false;
}

// SPDX-License-Identifier: MIT

#include "project/InspectorLink.h"

#include <algorithm>
#include <vector>

#include "app/MainWindow.h"
#include "app/WindowGuard.h"
#include "designer/DesignForm.h"
#include "designer/DesignFormView.h"
#include "props/PropertyWin.h"

namespace {

PropertyWin*
Inspector()
{
	PlimWin* mainWindow = MainWindow();
	return mainWindow != nullptr ? mainWindow->PropertyWindow() : nullptr;
}

} // namespace

void
ShowInInspector(TComponent* component, BView* designView)
{
	PropertyWin* inspector = Inspector();
	WindowGuard guard(inspector);
	if (!guard.IsLocked() || inspector->Component() == component)
		return;
	// First, since the values of the component are read with its window locked.
	inspector->SetDesignView(designView);
	inspector->SetComponent(component);
}


inspected_form
WhatIsInspected(TDesignForm* form)
{
	inspected_form inspected;
	WindowGuard guard(form);
	if (!guard.IsLocked())
		return inspected;
	inspected.view = form->View();
	inspected.components.push_back(form);
	for (int32 i = 0; i < form->CountComponents(); i++)
		inspected.components.push_back(form->ComponentAt(i));
	return inspected;
}


void
ForgetInInspector(const inspected_form& form)
{
	PropertyWin* inspector = Inspector();
	if (inspector == nullptr || form.view == nullptr)
		return;
	WindowGuard guard(inspector);
	if (!guard.IsLocked())
		return;
	const std::vector<TComponent*>& components = form.components;
	if (std::find(components.begin(), components.end(), inspector->Component()) != components.end())
		inspector->SetComponent(nullptr);
	if (inspector->DesignView() == form.view)
		inspector->SetDesignView(nullptr);
}


void
RefreshInspector()
{
	PropertyWin* inspector = Inspector();
	if (inspector != nullptr)
		inspector->UpdateDisplayValues();
}

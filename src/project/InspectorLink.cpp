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


void
ForgetInInspector(TDesignForm* form)
{
	PropertyWin* inspector = Inspector();
	if (inspector == nullptr)
		return;

	BView* view;
	std::vector<TComponent*> components;
	{
		WindowGuard guard(form);
		if (!guard.IsLocked())
			return;
		view = form->View();
		components.push_back(form);
		for (int32 i = 0; i < form->CountComponents(); i++)
			components.push_back(form->ComponentAt(i));
	}

	WindowGuard guard(inspector);
	if (!guard.IsLocked())
		return;
	if (std::find(components.begin(), components.end(), inspector->Component()) != components.end())
		inspector->SetComponent(nullptr);
	if (inspector->DesignView() == view)
		inspector->SetDesignView(nullptr);
}


void
RefreshInspector()
{
	PropertyWin* inspector = Inspector();
	if (inspector != nullptr)
		inspector->UpdateDisplayValues();
}

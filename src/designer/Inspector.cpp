// SPDX-License-Identifier: MIT
// The property window as design forms and the project use it.

#include "designer/Inspector.h"

#include <algorithm>

#include "app/MainWindow.h"
#include "app/WindowGuard.h"
#include "props/ForgottenEditors.h"
#include "props/PropertyWin.h"

namespace {

PropertyWin*
Window()
{
	PlimWin* mainWindow = MainWindow();
	return mainWindow != nullptr ? mainWindow->PropertyWindow() : nullptr;
}


/// Calls \a use with the property window locked, if there is one.
template <typename Use>
void
WithWindow(Use use)
{
	PropertyWin* window = Window();
	if (window == nullptr)
		return;
	WindowGuard guard(window);
	if (guard.IsLocked())
		use(window);
}


void
LoadInto(PropertyWin* window, TComponent* component, BView* designView)
{
	// First, since the values of the component are read with its window locked.
	window->SetDesignView(designView);
	window->SetComponent(component);
}


void
ShowIn(PropertyWin* window, TComponent* component, BView* designView)
{
	LoadInto(window, component, designView);
	if (window->IsHidden())
		window->Show();
}

} // namespace

namespace Inspector {

TComponent*
Component()
{
	TComponent* component = nullptr;
	WithWindow([&](PropertyWin* window) { component = window->Component(); });
	return component;
}


void
Show(TComponent* component, BView* designView)
{
	WithWindow([=](PropertyWin* window) { ShowIn(window, component, designView); });
}


void
ShowUnlessShown(TComponent* component, BView* designView)
{
	WithWindow([=](PropertyWin* window) {
		if (window->Component() != component)
			ShowIn(window, component, designView);
	});
}


void
Load(TComponent* component, BView* designView)
{
	WithWindow([=](PropertyWin* window) {
		if (window->Component() != component)
			LoadInto(window, component, designView);
	});
}


void
Leave(const TComponent* component)
{
	WithWindow([=](PropertyWin* window) {
		if (component != nullptr && window->Component() == component)
			window->SetComponent(nullptr);
	});
}


void
LeaveForm(const TComponent* form, const std::vector<const TComponent*>& components)
{
	WithWindow([&](PropertyWin* window) {
		const TComponent* shown = window->Component();
		const bool isForm = shown == form;
		if (!isForm && std::find(components.begin(), components.end(), shown) == components.end())
			return;
		window->SetComponent(nullptr);
		if (isForm)
			window->SetDesignView(nullptr);
	});
}


void
Forget(const std::vector<const TComponent*>& components, const BView* designView)
{
	WithWindow([&](PropertyWin* window) {
		if (std::find(components.begin(), components.end(), window->Component())
			!= components.end())
			window->SetComponent(nullptr);
		if (window->DesignView() == designView)
			window->SetDesignView(nullptr);
	});
}


void
Bury(std::unique_ptr<TForgottenEditors> editors)
{
	PropertyWin* window = Window();
	if (window != nullptr)
		window->Bury(std::move(editors));
	else
		editors->Spare();
}


void
Refresh()
{
	PropertyWin* window = Window();
	if (window != nullptr)
		window->UpdateDisplayValues();
}


void
Activate()
{
	WithWindow([](PropertyWin* window) {
		if (window->IsHidden())
			window->Show();
		window->Activate();
	});
}

} // namespace Inspector

// SPDX-License-Identifier: MIT
// The component that stands for the generated application.

#include "model/AppComponent.h"

#include <cstring>

#include "model/Diagnostics.h"
#include "model/PropertyStore.h"
#include "model/PropertyTable.h"
#include "props/PickListProperty.h"
#include "props/StringProperty.h"

/// The properties of an application, and what they are before a value has been stored. Two differ from
/// the initial values of the property list, which existing projects rely on.
static const struct {
	const char* name;
	const char* value;
} kAppProperties[] = {
	{"ClassName", "TMyApp"},
	{"Signature", "application/x-vnd.MyApp"},
	{"LaunchFlags", "B_SINGLE_LAUNCH"},
	{"GenerationPath", "./MyApp"},
};

static const EventRow kEvents[] = {
	{"OnAboutRequested", nullptr, nullptr},
	{"OnAppActivated", "bool active", nullptr},
	{"OnArgvReceived", "int32 argc, char **argv", nullptr},
	{"OnPulse", nullptr, nullptr},
	{"OnQuitRequested", nullptr, "bool"},
	{"OnReadyToRun", nullptr, nullptr},
	{"OnRefsReceived", "BMessage *message", nullptr},
};


TAppComponent::TAppComponent()
	: TComponent(nullptr, nullptr, CT_APPLICATION)
{
	SetClassName("TMyApplication");
	TAppComponent::InitPropertyList();
	TAppComponent::InitEventList();
}


void
TAppComponent::InitPropertyList()
{
	TComponent::InitPropertyList();
	AddEditedProperty<TStringProperty>(this, "ClassName", "TMyApplication", Generation::kPlain);
	AddEditedProperty<TStringProperty>(
		this, "Signature", "application/x-vnd.MyApp", Generation::kPlain);
	AddEditedProperty<TLaunchFlagsProperty>(
		this, "LaunchFlags", "B_SINGLE_LAUNCH", Generation::kPlain);
	AddEditedProperty<TStringProperty>(
		this, "GenerationPath", "/boot/home/MyApp", Generation::kPlain);
}


void
TAppComponent::InitEventList()
{
	TComponent::InitEventList();
	AddEvents(this, kEvents);
}


const char*
TAppComponent::GetPropertyValue(const char* name)
{
	PrintDiagnostic("TAppComponent::GetPropertyValue('%s')\n", ShownText(name));
	for (const auto& property : kAppProperties) {
		if (name != nullptr && strcmp(name, property.name) == 0) {
			const char* value;
			return PropertyStore()->FindString(name, &value) == B_OK ? value : property.value;
		}
	}
	return TComponent::GetPropertyValue(name);
}


void
TAppComponent::SetPropertyValue(const char* name, const char* value)
{
	PrintCall("TAppComponent::SetPropertyValue", name, value);
	for (const auto& property : kAppProperties) {
		if (name != nullptr && strcmp(name, property.name) == 0) {
			StoreProperty(name, value);
			return;
		}
	}
	TComponent::SetPropertyValue(name, value);
}

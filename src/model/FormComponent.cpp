// SPDX-License-Identifier: MIT
// The component that stands for a form itself.

#include "model/FormComponent.h"

#include <cstring>

#include "model/PropertyStore.h"
#include "model/PropertyTable.h"
#include "props/FlagsProperty.h"
#include "props/PickListProperty.h"
#include "props/StringProperty.h"

/// The properties of the window, and what they are before a value has been stored.
static const struct {
	const char* name;
	const char* value;
} kWindowProperties[] = {
	{"Title", "Form"},
	{"WindowLook", "B_TITLED_WINDOW_LOOK"},
	{"WindowFeel", "B_NORMAL_WINDOW_FEEL"},
	{"WindowFlags", nullptr},
};

static const EventRow kEvents[] = {
	{"OnMenusBeginning", nullptr, nullptr},
	{"OnMenusEnded", nullptr, nullptr},
	{"OnOpenViewTransaction", nullptr, nullptr},
	{"OnCommitViewTransaction", nullptr, nullptr},
	{"OnQuit", nullptr, nullptr},
	{"OnScreenChanged", "BRect frame, color_space mode", nullptr},
	{"OnShow", nullptr, nullptr},
	{"OnHide", nullptr, nullptr},
	{"OnMinimize", "bool minimize", nullptr},
	{"OnZoom", "BPoint origin, float width, float height", nullptr},
	{"OnWindowActivated", "bool active", nullptr},
	{"OnWorkspaceActivated", "int32 workspace, bool active", nullptr},
	{"OnWorkspacesChanged", "uint32 oldWorkspaces, uint32 newWorkspaces", nullptr},
	{"OnQuitRequested", nullptr, "bool"},
};


TFormComponent::TFormComponent()
	: TVisualComponent(nullptr, nullptr)
{
}


void
TFormComponent::InitPropertyList()
{
	TVisualComponent::InitPropertyList();
	AddEditedProperty<TStringProperty>(this, "Title", "Form", Generation::kQuoted);
	AddEditedProperty<TWindowLookProperty>(
		this, "WindowLook", "B_TITLED_WINDOW_LOOK", Generation::kPlain);
	AddEditedProperty<TWindowFeelProperty>(
		this, "WindowFeel", "B_NORMAL_WINDOW_FEEL", Generation::kPlain);
	AddEditedProperty<TWindowFlagsProperty>(this, "WindowFlags", "", Generation::kPlain);
}


void
TFormComponent::InitEventList()
{
	TVisualComponent::InitEventList();
	AddEvents(this, kEvents);
}


const char*
TFormComponent::GetPropertyValue(const char* name)
{
	for (const auto& property : kWindowProperties) {
		if (name != nullptr && strcmp(name, property.name) == 0) {
			const char* value;
			return PropertyStore()->FindString(name, &value) == B_OK ? value : property.value;
		}
	}
	return TVisualComponent::GetPropertyValue(name);
}


void
TFormComponent::SetPropertyValue(const char* name, const char* value)
{
	for (const auto& property : kWindowProperties) {
		if (name != nullptr && strcmp(name, property.name) == 0) {
			StoreProperty(name, value);
			return;
		}
	}
	TVisualComponent::SetPropertyValue(name, value);
}

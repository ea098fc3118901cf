// SPDX-License-Identifier: MIT

#include "designer/FormReader.h"

#include <cstdio>
#include <cstring>
#include <string_view>

#include <View.h>

#include "designer/DesignForm.h"
#include "designer/DesignFormView.h"
#include "designer/FormFile.h"
#include "designer/LoadReport.h"
#include "model/Diagnostics.h"
#include "model/Event.h"
#include "model/FiniteRect.h"
#include "model/Property.h"
#include "model/ViewLock.h"
#include "model/ViewTree.h"
#include "palette/PaletteCatalog.h"
#include "palette/PaletteEntry.h"

TFormReader::TFormReader(TDesignFormView* form, TLoadReport* report)
	: fForm(form),
	  fReport(report),
	  fIsIncomplete(false)
{
}


bool
TFormReader::Read(const char* path)
{
	TPLIMFormFile file;
	file.SetFilename(path);
	if (!file.OpenFile())
		return false;
	fStamp = file.Stamp();
	return ReadDocument(file, path);
}


bool
TFormReader::ReadDocument(const BMessage& document, const char* path)
{
	fPath = path;
	BMessage part;
	{
		TViewLock lock(fForm);
		if (!lock.IsLocked())
			return false;
		if (document.FindMessage("_FormProperties", &part) == B_OK)
			ReadFormProperties(part);
		if (document.FindMessage("_FormEvents", &part) == B_OK)
			ReadFormEvents(part);
	}

	if (document.FindMessage("Components", &part) != B_OK) {
		PrintDiagnostic("No components found for '%s'\n", fForm->DesignWindow()->ComponentName());
		return true;
	}
	CreateComponents(part);
	NestComponents();
	return true;
}


void
TFormReader::ReadFormProperties(const BMessage& properties)
{
	TDesignForm* form = fForm->DesignWindow();
	char* name;
	type_code type;
	for (int32 i = 0; properties.GetInfo(B_STRING_TYPE, i, &name, &type) == B_OK; i++) {
		TProperty* property = form->FindProperty(name);
		const char* value;
		if (property == nullptr || properties.FindString(name, &value) != B_OK)
			continue;
		property->SetValue(value);
		form->SetPropertyValue(name, value);
	}
}


void
TFormReader::ReadFormEvents(const BMessage& events)
{
	char* name;
	type_code type;
	for (int32 i = 0; events.GetInfo(B_BOOL_TYPE, i, &name, &type) == B_OK; i++) {
		TEvent* event = fForm->DesignWindow()->FindEvent(name);
		bool selected;
		if (event != nullptr && events.FindBool(name, &selected) == B_OK)
			event->selected = selected;
	}
}


void
TFormReader::CreateComponents(const BMessage& collection)
{
	char* name;
	type_code type;
	// Asking for the fields of one type would walk over all fields before each of them.
	for (int32 i = 0; collection.GetInfo(B_ANY_TYPE, i, &name, &type) == B_OK; i++) {
		if (type != B_MESSAGE_TYPE)
			continue;
		BMessage record;
		if (collection.FindMessage(name, &record) != B_OK) {
			PrintDiagnostic("Warning: Unable to extract Component message\n");
			DropComponent(name, "its record cannot be read");
			continue;
		}
		CreateComponent(name, record);
	}
}


void
TFormReader::CreateComponent(const char* savedName, const BMessage& record)
{
	BMessage properties;
	if (record.FindMessage("Properties", &properties) != B_OK) {
		PrintDiagnostic("Warning: Unable to extract component Properties message\n");
		DropComponent(savedName, "it has no properties");
		return;
	}

	const char* className;
	BRect frame(0, 0, -1, -1);
	const bool hasFrame = properties.FindRect("_Frame", &frame) == B_OK && IsFinite(frame);
	if (properties.FindString("_ClassName", &className) != B_OK || !hasFrame) {
		PrintDiagnostic("Warning: No class name/location for '%s'\n", savedName);
		DropComponent(savedName, "it has no class name or no frame");
		return;
	}

	TPaletteEntry* entry = PaletteCatalog().FindPalEntry(className);
	if (entry == nullptr) {
		PrintDiagnostic("Warning: No palette entry found for '%s'\n", className);
		fIsIncomplete = true;
		if (fReport != nullptr) {
			BString text;
			text << "component '" << savedName
				 << "' is left out: no component library offers the class '" << className << "'";
			fReport->Add(LOAD_CLASS_UNKNOWN, fPath.String(), text);
		}
		return;
	}

	TComponent* component = nullptr;
	{
		TViewLock lock(fForm);
		if (lock.IsLocked())
			component = entry->CreateComponent(fForm, fForm, frame);
	}
	if (component == nullptr) {
		PrintDiagnostic("Warning: Unable to create component '%s'\n", savedName);
		DropComponent(savedName, "its component library did not create it");
		return;
	}
	fForm->AddComponent(component);
	ReadProperties(component, properties);

	BMessage events;
	if (record.FindMessage("Events", &events) == B_OK)
		ReadEvents(component, events);
	else
		PrintDiagnostic("Warning: Unable to extract event information for '%s'\n", savedName);
	component->ReadExtendedComponentDataFrom(&record);

	const char* owner;
	if (properties.FindString("_OwnerName", &owner) == B_OK)
		fPlacements[savedName] = {owner, frame};
}


void
TFormReader::ReadProperties(TComponent* component, const BMessage& properties)
{
	TViewLock lock(fForm);
	if (!lock.IsLocked())
		return;
	char* name;
	type_code type;
	for (int32 i = 0; properties.GetInfo(B_STRING_TYPE, i, &name, &type) == B_OK; i++) {
		const char* value;
		// Names that begin with "_" are the document's own fields.
		if (*name == '\0' || *name == '_' || properties.FindString(name, &value) != B_OK)
			continue;
		component->SetPropertyValue(name, value);
		TProperty* property = component->FindProperty(name);
		if (property != nullptr)
			property->ReadExtendedData(&properties);
	}
}


void
TFormReader::ReadEvents(TComponent* component, const BMessage& events)
{
	TViewLock lock(fForm);
	if (!lock.IsLocked())
		return;
	char* name;
	type_code type;
	for (int32 i = 0; events.GetInfo(B_BOOL_TYPE, i, &name, &type) == B_OK; i++) {
		bool selected;
		if (*name != '\0' && events.FindBool(name, &selected) == B_OK)
			component->SetEventSelection(name, selected);
	}
}


void
TFormReader::NestComponents()
{
	if (fPlacements.empty())
		return;

	std::unordered_map<std::string_view, TComponent*> components;
	components.reserve(fForm->CountComponents());
	for (int32 i = 0; i < fForm->CountComponents(); i++) {
		TComponent* component = fForm->ComponentAt(i);
		components.emplace(component->ComponentName(), component);
	}

	for (int32 i = 0; i < fForm->CountComponents(); i++) {
		TComponent* child = fForm->ComponentAt(i);
		const auto place = fPlacements.find(child->ComponentName());
		if (place == fPlacements.end())
			continue;
		const auto owner = components.find(place->second.owner);
		if (owner != components.end())
			Nest(child, owner->second, place->second);
	}
}


void
TFormReader::Nest(TComponent* child, TComponent* owner, const placement& place)
{
	TComponentOwner* container = dynamic_cast<TComponentOwner*>(owner);
	if (container == nullptr || owner->DTView() == nullptr || child->DTView() == nullptr)
		return;
	if (IsInside(owner->DTView(), child->DTView())) {
		BString text;
		text << "component '" << child->ComponentName() << "' stays on the form: '"
			 << owner->ComponentName() << "' cannot hold it, being the same or inside it";
		fprintf(stderr, "%s: %s\n", fPath.String(), text.String());
		if (fReport != nullptr)
			fReport->Add(LOAD_OWNER_REFUSED, fPath.String(), text);
		return;
	}

	TViewLock lock(fForm);
	if (!lock.IsLocked())
		return;
	BView* view = child->DTView();
	view->RemoveSelf();
	owner->DTView()->AddChild(view);
	container->AddComponent(child);
	view->MoveTo(place.frame.LeftTop());
	view->ResizeTo(place.frame.right - place.frame.left, place.frame.bottom - place.frame.top);
}


void
TFormReader::DropComponent(const char* savedName, const char* reason)
{
	fIsIncomplete = true;
	if (fReport == nullptr)
		return;
	BString text;
	text << "component '" << savedName << "' is left out: " << reason;
	fReport->Add(LOAD_COMPONENT_DAMAGED, fPath.String(), text);
}

// SPDX-License-Identifier: MIT
// The base of everything that can be designed: names, owners, properties and events. What it does with its
// view and the mouse, and its hooks, are in the other files of its name.

#include "model/Component.h"

#include <cstring>

#include "model/ComponentDrag.h"
#include "model/ComponentOwner.h"
#include "model/Diagnostics.h"
#include "model/Event.h"
#include "model/FixedText.h"
#include "model/FormDesigner.h"
#include "model/NameCompare.h"
#include "model/Property.h"
#include "model/PropertyStore.h"
#include "model/PropertyTable.h"
#include "props/PropertyEditor.h"
#include "props/StringProperty.h"

/// The step by which the lists grow, in entries.
static const int32 kListStep = 20;


static void
DeleteProperty(TProperty* property)
{
	// The class has no virtual destructor, on purpose: it would take a slot of the binary interface.
#pragma GCC diagnostic push
#pragma GCC diagnostic ignored "-Wdelete-non-virtual-dtor"
	delete property;
#pragma GCC diagnostic pop
}


TComponent::TComponent(TComponentOwner* owner, TFormDesigner* designer, TComponentType type)
	: fOwner(owner),
	  fDesigner(designer),
	  fComponentType(type),
	  fProperties(new BList(kListStep)),
	  fEvents(new BList(kListStep)),
	  fComponentMode(CM_DESIGN),
	  fModified(false),
	  fPropertyStore(new TPropertyStore(this)),
	  fDesignerSelected(false),
	  fLastFound(kNoProperty),
	  fDTView(nullptr)
{
	// Clearing all of the name would touch memory that nobody uses, in each of thousands of components.
	fComponentName[0] = '\0';
	fClassName[0] = '\0';
}


TComponent::~TComponent()
{
	ComponentDrag::Forget(this);
	// Not the overrides of derived classes: those are gone.
	TComponent::ClearProperties(true);
	delete fProperties;
	TComponent::ClearEvents(true);
	delete fEvents;
	delete fPropertyStore;
}


void
TComponent::SetComponentName(const char* name)
{
	SetFixedText(fComponentName, name);
}


const char*
TComponent::ComponentName() const
{
	return fComponentName;
}


void
TComponent::SetComponentType(TComponentType type)
{
	fComponentType = type;
}


TComponentType
TComponent::ComponentType() const
{
	return fComponentType;
}


void
TComponent::SetOwner(TComponentOwner* owner)
{
	fOwner = owner;
}


TComponentOwner*
TComponent::Owner() const
{
	return fOwner;
}


void
TComponent::SetComponentMode(TComponentMode mode)
{
	fComponentMode = mode;
}


TComponentMode
TComponent::ComponentMode() const
{
	return fComponentMode;
}


void
TComponent::SetDesigner(TFormDesigner* designer)
{
	fDesigner = designer;
}


TFormDesigner*
TComponent::Designer() const
{
	return fDesigner;
}


void
TComponent::DesignerSelect(bool selected)
{
	fDesignerSelected = selected;
}


bool
TComponent::IsDesignerSelected() const
{
	return fDesignerSelected;
}


void
TComponent::SetModified(bool modified)
{
	fModified = modified;
	if (modified && fDesigner != nullptr)
		fDesigner->ComponentModified(this);
}


bool
TComponent::Modified() const
{
	return fModified;
}


const char*
TComponent::GetPropertyValue(const char* name)
{
	PrintDiagnostic("TComponent::GetPropertyValue('%s')\n", ShownText(name));
	if (name == nullptr)
		return nullptr;
	if (IsSameName(name, "Name"))
		return ComponentName();

	const char* value;
	return fPropertyStore->FindString(name, &value) == B_OK ? value : nullptr;
}


void
TComponent::SetPropertyValue(const char* name, const char* value)
{
	PrintCall("TComponent::SetPropertyValue", name, value);
	if (name == nullptr || value == nullptr)
		return;
	if (IsSameName(name, "Name"))
		SetComponentName(value);
	StoreProperty(name, value);
}


bool
TComponent::EventSelection(const char* name)
{
	const TEvent* event = FindEvent(name);
	return event != nullptr && event->selected;
}


void
TComponent::SetEventSelection(const char* name, bool selected)
{
	TEvent* event = FindEvent(name);
	if (event != nullptr)
		event->selected = selected;
}


void
TComponent::InitPropertyList()
{
	fPropertyStore->MakeEmpty();
	ClearProperties(true);

	TProperty* name = new TProperty(this, "Name", ComponentName(), nullptr, false);
	AddPropAndEditor(name, new TNameProperty(this, name), nullptr, nullptr, true);
}


void
TComponent::InitEventList()
{
	ClearEvents(true);
}


void
TComponent::InitPropertyValues()
{
	for (int32 i = 0; i < CountProperties(); i++) {
		const TProperty* property = PropertyAt(i);
		if (property == nullptr || property->Editor() == nullptr)
			continue;
		property->Editor()->SetValue(GetPropertyValue(property->Name()), true);
	}
}


void
TComponent::AddProperty(TProperty* property)
{
	fProperties->AddItem(property);
}


void
TComponent::AddPropAndEditor(TProperty* property, TPropertyEditor* editor, const char* setStatement,
	const char* getStatement, bool quoted)
{
	if (property != nullptr && editor != nullptr) {
		property->SetEditor(editor);
		editor->SetProperty(property);
		property->SetSetStatement(setStatement);
		property->SetGetStatement(getStatement);
		property->SetQuoted(quoted);
	}
	AddProperty(property);
}


bool
TComponent::RemoveProperty(TProperty* property)
{
	fLastFound = kNoProperty;
	return fProperties->RemoveItem(property);
}


TProperty*
TComponent::RemoveProperty(int32 index)
{
	fLastFound = kNoProperty;
	return static_cast<TProperty*>(fProperties->RemoveItem(index));
}


void
TComponent::ClearProperties(bool deleteProperties)
{
	for (int32 i = 0; deleteProperties && PropertyAt(i) != nullptr; i++)
		DeleteProperty(PropertyAt(i));
	fLastFound = kNoProperty;
	fProperties->MakeEmpty();
}


void
TComponent::AddEvent(TEvent* event)
{
	fEvents->AddItem(event);
}


bool
TComponent::RemoveEvent(TEvent* event)
{
	return fEvents->RemoveItem(event);
}


TEvent*
TComponent::RemoveEvent(int32 index)
{
	return static_cast<TEvent*>(fEvents->RemoveItem(index));
}


void
TComponent::ClearEvents(bool deleteEvents)
{
	for (int32 i = 0; deleteEvents && EventAt(i) != nullptr; i++)
		delete EventAt(i);
	fEvents->MakeEmpty();
}


void
TComponent::SetClassName(const char* name)
{
	SetFixedText(fClassName, name);
}


int32
TComponent::CountProperties() const
{
	return fProperties->CountItems();
}


TProperty*
TComponent::PropertyAt(int32 index) const
{
	return static_cast<TProperty*>(fProperties->ItemAt(index));
}


TProperty*
TComponent::FindProperty(const char* name) const
{
	if (name == nullptr)
		return nullptr;
	const int32 count = CountProperties();
	void* const* properties = static_cast<void* const*>(fProperties->Items());
	// What was found last is asked for again while a form is loaded: it was the first of its name, and
	// still is.
	const int32 last = fLastFound.load(std::memory_order_relaxed);
	if (last >= 0 && last < count
		&& IsSameName(static_cast<TProperty*>(properties[last])->Name(), name))
		return static_cast<TProperty*>(properties[last]);

	for (int32 i = 0; i < count; i++) {
		TProperty* property = static_cast<TProperty*>(properties[i]);
		if (property != nullptr && IsSameName(property->Name(), name)) {
			fLastFound.store(i, std::memory_order_relaxed);
			return property;
		}
	}
	return nullptr;
}


int32
TComponent::CountEvents() const
{
	return fEvents->CountItems();
}


TEvent*
TComponent::EventAt(int32 index) const
{
	return static_cast<TEvent*>(fEvents->ItemAt(index));
}


TEvent*
TComponent::FindEvent(const char* name) const
{
	if (name == nullptr)
		return nullptr;
	const int32 count = CountEvents();
	void* const* events = static_cast<void* const*>(fEvents->Items());
	for (int32 i = 0; i < count; i++) {
		TEvent* event = static_cast<TEvent*>(events[i]);
		if (event != nullptr && event->name != nullptr && IsSameName(event->name, name))
			return event;
	}
	return nullptr;
}


void
TComponent::StoreProperty(const char* name, const char* value)
{
	if (name == nullptr || value == nullptr)
		return;

	TProperty* property = FindProperty(name);
	if (property == nullptr) {
		fPropertyStore->SetString(name, value);
		return;
	}

	// Compared as far as the property can hold it: the rest of a longer text is no change.
	if (strncmp(property->Value(), value, TPropertyText::kSize - 1) != 0) {
		if (!PropertyModified(name, property->Value(), value))
			return;
		// The owner's refusal does not keep the value out.
		if (Owner() == nullptr
			|| Owner()->ComponentPropertyModified(this, name, property->Value(), value))
			SetModified(true);
	}
	property->SetValue(value);
	// Not by the store's own setter: that takes precautions for texts of the store.
	fPropertyStore->BMessage::SetString(name, property->Value());
}

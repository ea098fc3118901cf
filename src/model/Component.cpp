// SPDX-License-Identifier: MIT
// The base of everything that can be designed: names, owners, properties and events. What it does with its
// view and the mouse, and its hooks, are in the other files of its name.

#include "model/Component.h"

#include <cstring>
#include <mutex>
#include <utility>

#include "model/ComponentDrag.h"
#include "model/ComponentOwner.h"
#include "model/Diagnostics.h"
#include "model/Event.h"
#include "model/FixedText.h"
#include "model/FormDesigner.h"
#include "model/NameCompare.h"
#include "model/NamedList.h"
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


/// The lists are of that class, which component libraries do not know.
static TNamedList*
Named(BList* list)
{
	return static_cast<TNamedList*>(list);
}


static const char*
PropertyName(const TProperty* property)
{
	return property->Name();
}


static const char*
EventName(const TEvent* event)
{
	return event->name;
}


TComponent::TComponent(TComponentOwner* owner, TFormDesigner* designer, TComponentType type)
	: fLongName(nullptr),
	  fOwner(owner),
	  fDesigner(designer),
	  fComponentType(type),
	  fProperties(new TNamedList(kListStep)),
	  fEvents(new TNamedList(kListStep)),
	  fComponentMode(CM_DESIGN),
	  fModified(false),
	  fStoreIsLate(true),
	  fPropertyStore(new TPropertyStore(this)),
	  fDesignerSelected(false),
	  fLastStored(nullptr),
	  fDTView(nullptr)
{
	fShortName[0] = '\0';
	fClassName[0] = '\0';
}


TComponent::~TComponent()
{
	ComponentDrag::Forget(this);
	// Nobody will ask for the store any more.
	fLastStored = nullptr;
	// Not the overrides of derived classes: those are gone.
	TComponent::ClearProperties(true);
	delete fProperties;
	TComponent::ClearEvents(true);
	delete fEvents;
	delete fPropertyStore;
	delete[] fLongName;
}


void
TComponent::SetComponentName(const char* name)
{
	if (name == nullptr)
		return;
	const size_t length = strnlen(name, kComponentNameSize - 1);
	char* text = fLongName != nullptr ? fLongName : fShortName;
	// Room for every name would be a tenth of the memory of a form's thousands of components. Once it is there, it stays:
	// so do the names that were given out.
	if (fLongName == nullptr && length >= kShortNameSize)
		text = new char[kComponentNameSize];
	memmove(text, name, length);
	text[length] = '\0';
	if (text != fShortName)
		fLongName = text;
}


const char*
TComponent::ComponentName() const
{
	return fLongName != nullptr ? fLongName : fShortName;
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
	return PropertyStore()->FindString(name, &value) == B_OK ? value : nullptr;
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
	KeepStored();
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
	const char* name = property != nullptr ? property->Name() : nullptr;
	if (name != nullptr && Named(fProperties)->NoteName(name) && FindProperty(name) != nullptr)
		Named(fProperties)->SetRepeats();
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
	KeepStored();
	Named(fProperties)->SetLast(-1);
	return fProperties->RemoveItem(property);
}


TProperty*
TComponent::RemoveProperty(int32 index)
{
	KeepStored();
	Named(fProperties)->SetLast(-1);
	return static_cast<TProperty*>(fProperties->RemoveItem(index));
}


void
TComponent::ClearProperties(bool deleteProperties)
{
	KeepStored();
	for (int32 i = 0; deleteProperties && PropertyAt(i) != nullptr; i++)
		DeleteProperty(PropertyAt(i));
	Named(fProperties)->Forget();
}


void
TComponent::AddEvent(TEvent* event)
{
	const char* name = event != nullptr ? event->name : nullptr;
	if (name != nullptr && Named(fEvents)->NoteName(name) && FindEvent(name) != nullptr)
		Named(fEvents)->SetRepeats();
	fEvents->AddItem(event);
}


bool
TComponent::RemoveEvent(TEvent* event)
{
	Named(fEvents)->SetLast(-1);
	return fEvents->RemoveItem(event);
}


TEvent*
TComponent::RemoveEvent(int32 index)
{
	Named(fEvents)->SetLast(-1);
	return static_cast<TEvent*>(fEvents->RemoveItem(index));
}


void
TComponent::ClearEvents(bool deleteEvents)
{
	for (int32 i = 0; deleteEvents && EventAt(i) != nullptr; i++)
		delete EventAt(i);
	Named(fEvents)->Forget();
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
	return FindNamed<TProperty>(Named(fProperties), name, PropertyName);
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
	return FindNamed<TEvent>(Named(fEvents), name, EventName);
}


void
TComponent::StoreProperty(const char* name, const char* value)
{
	if (name == nullptr || value == nullptr)
		return;

	TProperty* property = FindProperty(name);
	if (property == nullptr) {
		PropertyStore()->SetString(name, value);
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
	property->TakeValue(value);
	if (fStoreIsLate.load(std::memory_order_relaxed) && property->fComponent == this) {
		if (property->fNextStored == nullptr) {
			property->fNextStored = property;
			if (fLastStored != nullptr)
				std::swap(property->fNextStored, fLastStored->fNextStored);
			fLastStored = property;
		}
		return;
	}
	// Not by the store's own setter: that takes precautions for texts of the store.
	PropertyStore()->BMessage::SetString(name, property->Value());
}


/// Puts into the store what the properties have kept for it. A form that is loaded and generated has thousands of
/// stores that nobody asks for.
void
TComponent::FillStore() const
{
	static std::mutex sMutex;
	const std::lock_guard<std::mutex> lock(sMutex);
	if (!fStoreIsLate.load(std::memory_order_relaxed))
		return;

	// In the order in which they were stored.
	TProperty* last = std::exchange(fLastStored, nullptr);
	TProperty* property = last != nullptr ? std::exchange(last->fNextStored, nullptr) : nullptr;
	while (property != nullptr) {
		fPropertyStore->BMessage::SetString(property->Name(), property->Value());
		property = std::exchange(property->fNextStored, nullptr);
	}
	fStoreIsLate.store(false, std::memory_order_release);
}


/// Before properties go: what they have kept for the store is put there.
void
TComponent::KeepStored()
{
	if (fLastStored != nullptr)
		PropertyStore();
}

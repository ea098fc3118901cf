// SPDX-License-Identifier: MIT

#include "StandardComponent.h"

#include <String.h>
#include <View.h>
#include <ormi/views/FrameKeeper.h>

#include "SourceText.h"

namespace {

TPropertyEditor*
NewEditor(TComponent* component, TProperty* property, const property_row& row)
{
	switch (row.kind) {
		case PropertyKind::kNumber:
			return new TIntProperty(component, property);

		case PropertyKind::kBool:
			return new TBoolProperty(component, property);

		case PropertyKind::kColor:
			return new TViewColorProperty(component, property);

		case PropertyKind::kChoice:
			return new TChoiceProperty(component, property, row.choices);

		case PropertyKind::kResizing:
			return new TResizingModeProperty(component, property);

		default:
			return new TStringProperty(component, property);
	}
}


const property_row*
FindRow(const component_description& description, const char* name)
{
	for (const property_row& row : description.properties) {
		if (row.name[0] == name[0] && strcmp(row.name, name) == 0)
			return &row;
	}
	return nullptr;
}

} // namespace

void
AddDescribedProperties(TComponent* component, const component_description& description)
{
	for (const property_row& row : description.properties) {
		TProperty* property =
			new TProperty(component, row.name, row.value, nullptr, row.isGenerated);
		component->AddPropAndEditor(property, NewEditor(component, property, row), row.statement,
			nullptr, row.kind == PropertyKind::kText);
	}
	for (const default_row& row : description.defaults) {
		TProperty* property = component->FindProperty(row.name);
		if (property == nullptr)
			continue;
		property->SetValue(row.value);
		property->SetDefValue(row.value);
		// The base classes answer from the store before they fall back on values of their own.
		component->PropertyStore()->SetString(row.name, row.value);
	}
}


void
AddDescribedEvents(TComponent* component, const component_description& description)
{
	for (const event_row& row : description.events)
		component->AddEvent(new TEvent(row.name, row.parameters, nullptr, false));
}


void
ShowDescribedProperty(TComponent* component, const component_description& description,
	const char* name, const char* value)
{
	if (name == nullptr || value == nullptr || component->DTView() == nullptr)
		return;
	const property_row* row = FindRow(description, name);
	BView* view = component->DTView();
	if (row == nullptr || row->show == nullptr || !view->LockLooper())
		return;
	{
		Ormi::FrameKeeper keeper(view);
		row->show(view, value, *row);
	}
	view->Invalidate();
	view->UnlockLooper();
}


void
ShowDescribedDefaults(BView* view, const component_description& description)
{
	Ormi::FrameKeeper keeper(view);
	for (const property_row& row : description.properties) {
		if (row.show != nullptr)
			row.show(view, row.value, row);
	}
}


void
AppendDescribedParameters(
	const TComponent* component, const component_description& description, BString& text)
{
	bool isFirst = true;
	for (const char* name : description.parameters) {
		const TProperty* property = component->FindProperty(name);
		if (property == nullptr)
			continue;
		if (!isFirst)
			text << ",";
		isFirst = false;
		if (property->IsQuoted())
			AppendLiteral(text, property->Value());
		else
			text << property->Value();
	}
}

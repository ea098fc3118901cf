// SPDX-License-Identifier: MIT
// How the built-in components build their lists of properties. Not for component libraries.

#pragma once

#include "model/Component.h"
#include "model/Event.h"
#include "model/Property.h"

/// What becomes of a property in generated source.
enum class Generation {
	kNone,   ///< not generated
	kPlain,  ///< the value as it stands
	kQuoted, ///< the value as a string literal
};


/// Appends a property with an editor of class \a Editor to \a component. A null \a setStatement stands
/// for the standard form.
template <class Editor>
void
AddEditedProperty(TComponent* component, const char* name, const char* value, Generation generation,
	const char* setStatement = nullptr)
{
	TProperty* property =
		new TProperty(component, name, value, nullptr, generation != Generation::kNone);
	component->AddPropAndEditor(property, new Editor(component, property), setStatement, nullptr,
		generation == Generation::kQuoted);
}


/// A row of a component's table of events, all of which start unselected.
struct EventRow {
	const char* name;
	const char* parameters;
	const char* returnType;
};


template <int N>
void
AddEvents(TComponent* component, const EventRow (&rows)[N])
{
	for (const EventRow& row : rows)
		component->AddEvent(new TEvent(row.name, row.parameters, row.returnType, false));
}

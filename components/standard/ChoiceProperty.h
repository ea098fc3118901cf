// SPDX-License-Identifier: MIT
// Properties whose values are names of the platform's constants.

#pragma once

#include <cstring>
#include <span>

#include <ComponentKit.h>

/// A constant of the platform, of one of its enumerations, and its name.
struct choice {
	const char* name;
	int32 value;
};

/// The value of the choice called \a name; \a otherwise when there is none.
template <class Value>
Value
ChoiceValue(std::span<const choice> choices, const char* name, Value otherwise)
{
	for (const choice& one : choices) {
		if (strcmp(one.name, name) == 0)
			return static_cast<Value>(one.value);
	}
	return otherwise;
}


/// The editor of such a property: it offers the names in the order of the table.
class TChoiceProperty : public TPickListProperty {
public:
	/// \a choices must outlive the editor.
	TChoiceProperty(TComponent* component, TProperty* property, std::span<const choice> choices)
		: TPickListProperty(component, property),
		  fChoices(choices)
	{
	}

	void GetValuePickList(TStringList* list) override
	{
		TPickListProperty::GetValuePickList(list);
		for (const choice& one : fChoices)
			list->Add(one.name);
	}

private:
	std::span<const choice> fChoices;
};

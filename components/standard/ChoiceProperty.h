// SPDX-License-Identifier: MIT
// Properties whose values are names of the platform's constants.

#pragma once

#include <cstring>

#include <ComponentKit.h>

/// A constant of the platform, of one of its enumerations, and its name.
struct choice {
	const char* name;
	int32 value;
};

/// The value of the choice called \a name; \a otherwise when there is none.
template <class Value, size_t count>
Value
ChoiceValue(const choice (&choices)[count], const char* name, Value otherwise)
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
	template <size_t count>
	TChoiceProperty(TComponent* component, TProperty* property, const choice (&choices)[count])
		: TPickListProperty(component, property),
		  fChoices(choices),
		  fCount(count)
	{
	}

	void GetValuePickList(TStringList* list) override
	{
		TPickListProperty::GetValuePickList(list);
		for (size_t i = 0; i < fCount; i++)
			list->Add(fChoices[i].name);
	}

private:
	const choice* fChoices;
	size_t fCount;
};

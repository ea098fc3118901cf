// SPDX-License-Identifier: MIT
// Tables of properties: how each is edited, generated and shown.

#pragma once

#include <cstdlib>
#include <cstring>
#include <span>
#include <type_traits>

#include <ComponentKit.h>
#include <GraphicsDefs.h>
#include <SupportDefs.h>

#include "ChoiceProperty.h"

class BView;

enum class PropertyKind { kText, kNumber, kBool, kColor, kChoice, kResizing };

/// A property of a component beside those of its base class. Texts are generated as literals, the others
/// as they stand.
struct property_row {
	const char* name;
	const char* value; ///< the initial one
	PropertyKind kind;
	const char* statement; ///< that sets it in generated source; null for the standard form
	std::span<const choice> choices; ///< of kChoice

	/// Shows \a value in the design-time view, whose window is locked; null when it does not show.
	void (*show)(BView* view, const char* value, const property_row& row);

	bool isGenerated = true; ///< false when the constructor alone can set it
};

/// The class and the parameter of a member function that sets something.
template <class Setter>
struct setter_types;

template <class Class, class Result, class Parameter>
struct setter_types<Result (Class::*)(Parameter)> {
	typedef Class View;
	typedef Parameter Value;
};

/// Calls the setter with the value that the text stands for.
template <auto setter>
void
ShowBySetter(BView* view, const char* text, const property_row& row)
{
	typedef typename setter_types<decltype(setter)>::View View;
	typedef typename setter_types<decltype(setter)>::Value Value;
	View* target = static_cast<View*>(view);
	if constexpr (std::is_enum_v<Value>) {
		const int32 otherwise = ChoiceValue<int32>(row.choices, row.value, 0);
		(target->*setter)(static_cast<Value>(ChoiceValue<int32>(row.choices, text, otherwise)));
	} else if constexpr (std::is_same_v<Value, bool>)
		(target->*setter)(strcmp(text, "true") == 0);
	else if constexpr (std::is_same_v<Value, const char*>)
		(target->*setter)(text);
	else if constexpr (std::is_same_v<Value, rgb_color>) {
		rgb_color color = {0, 0, 0, 255};
		(target->*setter)(StrToRGBColor(text, &color));
	} else
		(target->*setter)(static_cast<Value>(strtol(text, nullptr, 10)));
}


/// The kind of property that a setter with such a parameter has.
template <class Value>
constexpr PropertyKind
KindOf()
{
	if (std::is_enum_v<Value>)
		return PropertyKind::kChoice;
	if (std::is_same_v<Value, bool>)
		return PropertyKind::kBool;
	if (std::is_same_v<Value, const char*>)
		return PropertyKind::kText;
	if (std::is_same_v<Value, rgb_color>)
		return PropertyKind::kColor;
	return PropertyKind::kNumber;
}


/// A property that a setter of the platform's view, or of the runtime library's, shows.
template <auto setter>
constexpr property_row
ShownBy(const char* name, const char* value, const char* statement = nullptr,
	std::span<const choice> choices = {})
{
	typedef typename setter_types<decltype(setter)>::Value Value;
	return {name, value, KindOf<Value>(), statement, choices, ShowBySetter<setter>};
}


/// How the component follows its parent's size, which it does in the program only.
constexpr property_row
ResizingModeRow()
{
	return {"ResizingMode", "B_FOLLOW_NONE", PropertyKind::kResizing, nullptr, {}, nullptr};
}

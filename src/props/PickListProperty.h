// SPDX-License-Identifier: MIT
// The editors of properties that are chosen from a list.

#pragma once

#include "props/PropertyEditor.h"

/// A choice. The lists are offers: a property may hold a value that is in none.
///
/// GetValuePickList() empties the list before it fills it. The base class offers nothing.
class TPickListProperty : public TPropertyEditor {
public:
	TPickListProperty(TComponent* component, TProperty* property);

	const char* GetDisplayValue() const override;
	void GetValuePickList(TStringList* list) override;
};


/// "true" or "false".
class TBoolProperty : public TPickListProperty {
public:
	TBoolProperty(TComponent* component, TProperty* property);

	const char* GetDisplayValue() const override;
	void GetValuePickList(TStringList* list) override;
};


/// One of the system's three fonts.
class TFontProperty : public TPickListProperty {
public:
	TFontProperty(TComponent* component, TProperty* property);

	void GetValuePickList(TStringList* list) override;
};


/// A whole font size from 6 to 24.
class TFontSizeProperty : public TPickListProperty {
public:
	TFontSizeProperty(TComponent* component, TProperty* property);

	void GetValuePickList(TStringList* list) override;
};


/// How often an application may be launched.
class TLaunchFlagsProperty : public TPickListProperty {
public:
	TLaunchFlagsProperty(TComponent* component, TProperty* property);

	void GetValuePickList(TStringList* list) override;
};


/// The look of a window.
class TWindowLookProperty : public TPickListProperty {
public:
	TWindowLookProperty(TComponent* component, TProperty* property);

	void GetValuePickList(TStringList* list) override;
};


/// The feel of a window.
class TWindowFeelProperty : public TPickListProperty {
public:
	TWindowFeelProperty(TComponent* component, TProperty* property);

	void GetValuePickList(TStringList* list) override;
};


/// How a view follows its parent's size: one constant, no combination.
class TResizingModeProperty : public TPickListProperty {
public:
	TResizingModeProperty(TComponent* component, TProperty* property);

	void GetValuePickList(TStringList* list) override;
};

// SPDX-License-Identifier: MIT
// The editors of properties that are typed into a text field.

#pragma once

#include "props/PropertyEditor.h"

/// Any text.
class TStringProperty : public TPropertyEditor {
public:
	TStringProperty(TComponent* component, TProperty* property);
};


/// A name: at most 32 bytes, not checked to be an identifier.
class TNameProperty : public TStringProperty {
public:
	TNameProperty(TComponent* component, TProperty* property);

	long EditLimit() override;
};


/// A whole number: at most 63 bytes, not checked to be a number.
class TIntProperty : public TPropertyEditor {
public:
	TIntProperty(TComponent* component, TProperty* property);

	long EditLimit() override;
};

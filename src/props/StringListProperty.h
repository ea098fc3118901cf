// SPDX-License-Identifier: MIT
// The editor of properties that are lists of strings.

#pragma once

#include "props/PropertyEditor.h"

/// A list of strings. Editing one is not offered yet: ModalEdit() says so and returns false.
class TStringListProperty : public TPropertyEditor {
public:
	TStringListProperty(TComponent* component, TProperty* property);

	bool ModalEdit() override;
	const char* GetDisplayValue() const override;
	void GetValueList(TStringList* list) override;
};

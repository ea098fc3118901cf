// SPDX-License-Identifier: MIT
// The editors of properties that are colours.

#pragma once

#include "props/PropertyEditor.h"

/// A colour, as RGBColorToStr() writes it.
class TRGBColorProperty : public TPropertyEditor {
public:
	TRGBColorProperty(TComponent* component, TProperty* property);

	/// Opens the dialog; it changes the property when the user confirms. True at once.
	bool ModalEdit() override;
	const char* GetDisplayValue() const override;
};


/// A colour of a view.
class TViewColorProperty : public TRGBColorProperty {
public:
	TViewColorProperty(TComponent* component, TProperty* property);

	const char* GetDisplayValue() const override;
};

// SPDX-License-Identifier: MIT
// The editors of properties that are sets of flags.

#pragma once

#include "props/PropertyEditor.h"

/// The flags of a view, names joined by "|" (see TFlagSet).
class TViewFlagsProperty : public TPropertyEditor {
public:
	TViewFlagsProperty(TComponent* component, TProperty* property);

	/// Opens the dialog; it changes the property when the user confirms. True at once.
	bool ModalEdit() override;
	const char* GetDisplayValue() const override;
};


/// The flags of a window, names joined by "|".
class TWindowFlagsProperty : public TPropertyEditor {
public:
	TWindowFlagsProperty(TComponent* component, TProperty* property);

	/// Opens the dialog; it changes the property when the user confirms. True at once.
	bool ModalEdit() override;
	const char* GetDisplayValue() const override;
};

// SPDX-License-Identifier: MIT
// The editor of a dial's zones.

#pragma once

#include <ComponentKit.h>

/// Opens a dialog with a line for each zone.
class TZonesEditor : public TPropertyEditor {
public:
	TZonesEditor(TComponent* component, TProperty* property);

	bool ModalEdit() override;
	/// How many zones there are: "3 zones".
	const char* GetDisplayValue() const override;

private:
	mutable BString fShown;
};

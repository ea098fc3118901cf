// SPDX-License-Identifier: MIT
// A row of the property window's list of properties.

#pragma once

#include <ListItem.h>
#include <String.h>

#include "props/PropertyWatch.h"

class TPropertyEditor;

/// A property's name and value in two columns.
///
/// The row keeps copies of the texts, as they were when it was made, so that drawing needs the list's window
/// alone. The property is not owned.
class TPropertyListItem : public BListItem {
public:
	/// \a property: its component's form is locked.
	explicit TPropertyListItem(TProperty* property);
	virtual ~TPropertyListItem();

	/// Null after Clear(), or when the property is gone.
	TProperty* Property() const { return fProperty.Property(); }

	/// The property, if it still exists, and its editor, which may be null. Both may be asked for at any time.
	void GetProperty(TPropertyWatch* property, TPropertyEditor** editor) const;

	void Clear() { fProperty.SetTo(nullptr); }

	/// Takes over what \a fresh shows. True when that is something else.
	bool TakeOver(const TPropertyListItem& fresh);

	const char* Name() const { return fName.String(); }
	const char* DisplayValue() const { return fValue.String(); }

	// BListItem
	void DrawItem(BView* owner, BRect frame, bool complete = false) override;

private:
	TPropertyWatch fProperty;
	TPropertyEditor* fEditor;
	BString fName;
	BString fValue;
};

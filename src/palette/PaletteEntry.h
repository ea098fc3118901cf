// SPDX-License-Identifier: MIT
// One kind of component that the user can place.

#pragma once

#include <Point.h>
#include <Rect.h>

class BButton;
class BView;
class TComponent;
class TFormDesigner;

/// The message of a palette button: "palEntry" (pointer to the TPaletteEntry).
const uint32 kPaletteEntryPressed = 'PalE';

/// The factory of one component class, shown as a button in the component palette.
///
/// Component libraries derive from it and keep ownership of their entries. The order of the virtual
/// operations and of the fields is a binary interface.
class TPaletteEntry {
public:
	/// \a componentName: the kind's name on the button, and the stem of new components' names.
	/// \a className: the class name of the components. Both texts must outlive the entry.
	TPaletteEntry(int32 entryNumber, const char* componentName, const char* className);
	/// Deletes neither the button, which belongs to the palette, nor the component.
	virtual ~TPaletteEntry();

	/// A component held by the entry; none in the base class.
	virtual TComponent* Component() const;

	/// Makes a component of the entry's class in \a parent for the form that \a designer designs.
	///
	/// \a frame: in \a parent's coordinates. The component is the caller's. Lock \a parent's window.
	/// Returns none on failure; the base class returns Component().
	virtual TComponent* CreateComponent(BView* parent, TFormDesigner* designer, BRect frame);

	virtual const char* ComponentName() const;

	/// Makes the entry's button, 100 by 24 pixels with its left top at \a position in \a palette's
	/// coordinates, and adds it to \a palette, which it sends kPaletteEntryPressed to.
	///
	/// Locks \a palette's window.
	virtual void Init(BView* palette, BPoint position);

	/// Sets \a size to the button's preferred width and height; leaves it alone without a button.
	virtual void GetButtonSize(BPoint* size);

	/// The library's credit text.
	virtual const char* Copyright() const;

	/// Shows the credit text in an alert and returns at once.
	virtual void About();

	const char* ClassName() const { return fClassName; }
	int32 EntryNumber() const { return fEntryNumber; }

private:
	int32 fEntryNumber;
	const char* fComponentName;
	const char* fClassName;
	BButton* fButton;
	TComponent* fComponent;
};

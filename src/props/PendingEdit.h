// SPDX-License-Identifier: MIT
// An edit that is confirmed later.

#pragma once

#include <Messenger.h>
#include <String.h>

#include "props/PropertyWatch.h"

class BLooper;
class TPropertyEditor;

/// What a dialog keeps of the editor that opened it: a way to give the property its new text, which does nothing
/// once the property is gone.
class TPendingEdit {
public:
	/// \a editor: may be null; not owned, and lives as long as this. Its property exists now.
	TPendingEdit(TPropertyEditor* editor);
	TPendingEdit(const TPendingEdit& other);
	TPendingEdit& operator=(const TPendingEdit&) = delete;

	/// The property's text, read as Confirm() writes it. False when the property is gone.
	bool Read(BString* text) const;

	/// Gives the property \a text, without asking the component, and lets the component apply it. Locks the window
	/// of the component's form; the thread's own lock is given up meanwhile.
	void Confirm(const BString& text);

private:
	TPropertyEditor* fEditor;
	TPropertyWatch fProperty;
	BLooper* fFormWindow;
	BMessenger fInspector; // it goes before the dialogs do when the program ends
};

// SPDX-License-Identifier: MIT
// The base of the dialogs that edit one property.

#pragma once

#include <String.h>
#include <Window.h>

#include "props/PendingEdit.h"

/// A modal dialog on a copy of a property's text, which the property gets when the user confirms.
///
/// After construction call InitWindow() and InitControls(), then Show(). The dialog deletes itself when it closes.
class TPropertyModalEdit : public BWindow {
public:
	/// \a frame: its size; the dialog is centred on the screen when it is shown. \a value: the text to edit, cut to
	/// EditLimit() bytes. \a edit: gets the result.
	TPropertyModalEdit(BRect frame, const char* title, const char* value, const TPendingEdit& edit);
	virtual ~TPropertyModalEdit();

	// BWindow
	void MessageReceived(BMessage* message) override;
	void Show() override;

	/// Makes the controls. Nothing here.
	virtual void InitWindow();

	/// Sets the controls from Text(). Nothing here.
	virtual void InitControls();

	/// Turns the controls into Text().
	virtual void OnApply() = 0;

	/// Closes the window.
	virtual void OnCancel();

	/// Offered every message but those of OK and Cancel; true when it was handled.
	virtual bool OnMessage(BMessage* message);

	/// The longest text, in bytes.
	long EditLimit() const { return 1024; }

	const char* Text() const { return fText.String(); }
	void SetText(const char* text);

protected:
	enum { PME_OK = 1, PME_CANCEL = 2 };

private:
	BString fText;
	TPendingEdit fEdit;
};

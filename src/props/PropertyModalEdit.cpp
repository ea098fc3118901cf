// SPDX-License-Identifier: MIT
// The base of the dialogs that edit one property.

#include "props/PropertyModalEdit.h"

#include "app/Dialogs.h"


TPropertyModalEdit::TPropertyModalEdit(
	BRect frame, const char* title, const char* value, const TPendingEdit& edit)
	: BWindow(frame, title, B_TITLED_WINDOW_LOOK, B_MODAL_APP_WINDOW_FEEL,
		B_NOT_ZOOMABLE | B_NOT_RESIZABLE | B_NOT_MINIMIZABLE),
	  fEdit(edit)
{
	SetText(value);
}


TPropertyModalEdit::~TPropertyModalEdit() {}


void
TPropertyModalEdit::MessageReceived(BMessage* message)
{
	switch (message->what) {
		case PME_OK:
			OnApply();
			fEdit.Confirm(fText);
			PostMessage(B_QUIT_REQUESTED);
			break;

		case PME_CANCEL:
			OnCancel();
			break;

		default:
			if (!OnMessage(message))
				BWindow::MessageReceived(message);
			break;
	}
}


void
TPropertyModalEdit::Show()
{
	CenterWindowOnScreen(this);
	BWindow::Show();
}


void
TPropertyModalEdit::InitWindow()
{
}


void
TPropertyModalEdit::InitControls()
{
}


void
TPropertyModalEdit::OnCancel()
{
	PostMessage(B_QUIT_REQUESTED);
}


bool
TPropertyModalEdit::OnMessage(BMessage*)
{
	return false;
}


void
TPropertyModalEdit::SetText(const char* text)
{
	fText.SetTo(text, static_cast<int32>(EditLimit()));
}

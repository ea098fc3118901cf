// SPDX-License-Identifier: MIT

#include <ormi/FormView.h>

#include <ormi/Form.h>

TFormView::TFormView(TForm* parent, const char* name)
	: BView(parent->Bounds(), name, B_FOLLOW_ALL_SIDES, B_WILL_DRAW | B_FRAME_EVENTS),
	  fForm(parent),
	  fHasFocus(false)
{
}


TFormView::~TFormView() {}


void
TFormView::FormAttached()
{
	fForm->AttachedToWindow();
}


void
TFormView::FormAllAttached()
{
	fForm->AllAttached();
}


void
TFormView::FormFocusChanged(bool hasFocus)
{
	if (hasFocus == fHasFocus)
		return;
	fHasFocus = hasFocus;
	if (hasFocus)
		fForm->GotFocus();
	else
		fForm->LostFocus();
}


void
TFormView::FormInnerDispatched(const BView*, const BMessage*)
{
	// What a program put on the form by itself is no part of the form.
}


void
TFormView::AllAttached()
{
	BView::AllAttached();
	if (fForm->IsOpen())
		fForm->AllAttached();
}


void
TFormView::AttachedToWindow()
{
	BView::AttachedToWindow();
	if (fForm->IsOpen())
		fForm->AttachedToWindow();
}


void
TFormView::AllDetached()
{
	BView::AllDetached();
	if (fForm->IsOpen())
		fForm->AllDetached();
}


void
TFormView::Draw(BRect updateRect)
{
	BView::Draw(updateRect);
	if (fForm->IsOpen())
		fForm->Draw(updateRect);
}


void
TFormView::KeyDown(const char* bytes, int32 numBytes)
{
	BView::KeyDown(bytes, numBytes);
	if (fForm->IsOpen())
		fForm->KeyDown();
}


void
TFormView::KeyUp(const char* bytes, int32 numBytes)
{
	BView::KeyUp(bytes, numBytes);
	if (fForm->IsOpen())
		fForm->KeyUp();
}


void
TFormView::MouseUp(BPoint where)
{
	BView::MouseUp(where);
	if (fForm->IsOpen())
		fForm->MouseUp(where);
}


void
TFormView::MouseDown(BPoint where)
{
	BView::MouseDown(where);
	if (fForm->IsOpen())
		fForm->MouseDown(where);
}


void
TFormView::MouseMoved(BPoint where, uint32 transit, const BMessage* message)
{
	BView::MouseMoved(where, transit, message);
	if (fForm->IsOpen())
		fForm->MouseMoved(where, transit, message);
}

// SPDX-License-Identifier: MIT

#include <ormi/FormView.h>

#include <ormi/Form.h>

TFormView::TFormView(TForm* parent, const char* name)
	: BView(parent->Bounds(), name, B_FOLLOW_ALL_SIDES, B_WILL_DRAW | B_FRAME_EVENTS),
	  fForm(parent)
{
}


TFormView::~TFormView() {}


void
TFormView::AllAttached()
{
	BView::AllAttached();
	fForm->AllAttached();
}


void
TFormView::AttachedToWindow()
{
	BView::AttachedToWindow();
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
	fForm->Draw(updateRect);
}


void
TFormView::KeyDown(const char* bytes, int32 numBytes)
{
	BView::KeyDown(bytes, numBytes);
	fForm->KeyDown();
}


void
TFormView::KeyUp(const char* bytes, int32 numBytes)
{
	BView::KeyUp(bytes, numBytes);
	fForm->KeyUp();
}


void
TFormView::MakeFocus(bool focus)
{
	const bool hadFocus = IsFocus();
	BView::MakeFocus(focus);
	if (IsFocus() == hadFocus)
		return;
	if (hadFocus)
		fForm->LostFocus();
	else
		fForm->GotFocus();
}


void
TFormView::MouseUp(BPoint where)
{
	BView::MouseUp(where);
	fForm->MouseUp(where);
}


void
TFormView::MouseDown(BPoint where)
{
	BView::MouseDown(where);
	fForm->MouseDown(where);
}


void
TFormView::MouseMoved(BPoint where, uint32 transit, const BMessage* message)
{
	BView::MouseMoved(where, transit, message);
	fForm->MouseMoved(where, transit, message);
}

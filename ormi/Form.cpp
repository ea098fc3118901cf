// SPDX-License-Identifier: MIT

#include <ormi/Form.h>

#include <Application.h>

#include <ormi/FormView.h>
#include <ormi/Part.h>

namespace {

/// Calls the handlers of \a view and the views in it, in the order in which the platform attaches.
void
TellAttached(BView* view)
{
	TFormPart* part = dynamic_cast<TFormPart*>(view);
	if (part != nullptr)
		part->FormAttached();
	for (BView* child = view->ChildAt(0); child != nullptr; child = child->NextSibling())
		TellAttached(child);
	if (part != nullptr)
		part->FormAllAttached();
}

} // namespace

TForm::TForm(BRect frame, const char* title, window_look look, window_feel feel, uint32 flags)
	: BWindow(frame, title, look, feel, flags),
	  fFormView(nullptr),
	  fIsMainForm(false),
	  fIsOpen(false)
{
}


TForm::~TForm()
{
	// The generated class is gone already: no handler may be called any more.
	fIsOpen = false;
	if (fFormView != nullptr) {
		fFormView->RemoveSelf();
		delete fFormView;
	}
	if (fIsMainForm)
		be_app->PostMessage(B_QUIT_REQUESTED);
}


void
TForm::MessageReceived(BMessage* message)
{
	BWindow::MessageReceived(message);
}


void
TForm::Show()
{
	if (!fIsOpen) {
		fIsOpen = true;
		if (fFormView != nullptr)
			TellAttached(fFormView);
	}
	BWindow::Show();
}


void
TForm::Quit()
{
	if (fFormView != nullptr)
		fFormView->RemoveSelf();
	BWindow::Quit();
}


void
TForm::FormCreate()
{
}


void
TForm::FormDestroy()
{
}


void
TForm::SetFormView(TFormView* view)
{
	if (fFormView != nullptr || view == nullptr)
		return;
	fFormView = view;
	AddChild(view);
}


void
TForm::MakeMainForm(bool isMainForm)
{
	fIsMainForm = isMainForm;
}


void
TForm::AllAttached()
{
}


void
TForm::AttachedToWindow()
{
}


void
TForm::AllDetached()
{
}


void
TForm::Draw(BRect)
{
}


void
TForm::KeyDown()
{
}


void
TForm::KeyUp()
{
}


void
TForm::GotFocus()
{
}


void
TForm::LostFocus()
{
}


void
TForm::MouseUp(BPoint)
{
}


void
TForm::MouseDown(BPoint)
{
}


void
TForm::MouseMoved(BPoint, uint32, const BMessage*)
{
}


void
TForm::OpenViewTransaction()
{
	BeginViewTransaction();
}


void
TForm::CommitViewTransaction()
{
	EndViewTransaction();
}

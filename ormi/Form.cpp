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


/// Tells \a view and the views in it where the focus of their form is.
void
TellFocusChanged(BView* view, const BView* focus)
{
	TFormPart* part = dynamic_cast<TFormPart*>(view);
	if (part != nullptr)
		part->FormFocusChanged(focus);
	for (BView* child = view->ChildAt(0); child != nullptr; child = child->NextSibling())
		TellFocusChanged(child, focus);
}


/// Tells the part around \a view, which is no part itself, of a message that \a view got.
void
TellDispatched(const BMessage* message, BView* view)
{
	if (view == nullptr || dynamic_cast<TFormPart*>(view) != nullptr)
		return;
	TFormPart* part = dynamic_cast<TFormPart*>(view->Parent());
	if (part != nullptr)
		part->FormChildDispatched(view, message);
}

} // namespace

TForm::TForm(BRect frame, const char* title, window_look look, window_feel feel, uint32 flags)
	: BWindow(frame, title, look, feel, flags | B_ASYNCHRONOUS_CONTROLS),
	  fFormView(nullptr),
	  fLastFocus(nullptr),
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
	if (fIsMainForm && be_app != nullptr)
		be_app->PostMessage(B_QUIT_REQUESTED);
}


void
TForm::DispatchMessage(BMessage* message, BHandler* handler)
{
	BWindow::DispatchMessage(message, handler);
	// What was called may have removed the view.
	if (fIsOpen && IndexOf(handler) >= 0)
		TellDispatched(message, dynamic_cast<BView*>(handler));
	TellFocus();
}


void
TForm::MessageReceived(BMessage* message)
{
	BWindow::MessageReceived(message);
}


void
TForm::Show()
{
	if (!fIsOpen)
		Open();
	BWindow::Show();
}


void
TForm::Quit()
{
	if (fFormView != nullptr && IsLocked())
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


void
TForm::Open()
{
	fIsOpen = true;
	if (fFormView == nullptr)
		return;
	TellAttached(fFormView);
	if (CurrentFocus() == nullptr)
		fFormView->MakeFocus();
	TellFocus();
}


// The focus of a text field is that of the view in it, whose hooks are out of reach: so the form looks
// where the focus went, after each message. The part that lost it is told first.
void
TForm::TellFocus()
{
	const BView* focus = CurrentFocus();
	if (!fIsOpen || fFormView == nullptr || focus == fLastFocus)
		return;
	fLastFocus = focus;
	TellFocusChanged(fFormView, nullptr);
	TellFocusChanged(fFormView, focus);
}

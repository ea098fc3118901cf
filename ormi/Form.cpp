// SPDX-License-Identifier: MIT

#include <ormi/Form.h>

#include <atomic>

#include <Application.h>

#include <ormi/FormView.h>
#include <ormi/Part.h>

namespace {

// Of the program.
std::atomic<int32> sForms = 0;
std::atomic<bool> sMainFormIsGone = false;

/// How often handlers may move the focus on while they are told of it. The rest waits for the next message.
const int32 kFocusRounds = 8;

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


/// The part that \a view is, or the nearest one around it; null when there is none.
TFormPart*
PartAround(BView* view)
{
	for (; view != nullptr; view = view->Parent()) {
		TFormPart* part = dynamic_cast<TFormPart*>(view);
		if (part != nullptr)
			return part;
	}
	return nullptr;
}


/// The part of \a view or the views in it whose address is \a wanted, which may be gone.
TFormPart*
FindPart(BView* view, const TFormPart* wanted)
{
	TFormPart* part = dynamic_cast<TFormPart*>(view);
	if (part != nullptr && part == wanted)
		return part;
	for (BView* child = view->ChildAt(0); child != nullptr; child = child->NextSibling()) {
		part = FindPart(child, wanted);
		if (part != nullptr)
			return part;
	}
	return nullptr;
}


/// Tells the part around \a view, which is no part itself, of a message that \a view got.
void
TellDispatched(const BMessage* message, BView* view)
{
	if (view == nullptr || dynamic_cast<TFormPart*>(view) != nullptr)
		return;
	TFormPart* part = PartAround(view);
	if (part != nullptr)
		part->FormInnerDispatched(view, message);
}

} // namespace

TForm::TForm(BRect frame, const char* title, window_look look, window_feel feel, uint32 flags)
	: BWindow(frame, title, look, feel, flags | B_ASYNCHRONOUS_CONTROLS),
	  fFormView(nullptr),
	  fLastFocus(nullptr),
	  fFocusedPart(nullptr),
	  fIsMainForm(false),
	  fIsOpen(false)
{
	sForms++;
}


TForm::~TForm()
{
	// The generated class is gone already: no handler may be called any more.
	fIsOpen = false;
	if (fFormView != nullptr) {
		fFormView->RemoveSelf();
		delete fFormView;
	}
	// A form that refused to go with the main form ends the program when it is the last.
	const bool isLast = --sForms == 0;
	if (fIsMainForm)
		sMainFormIsGone = true;
	if ((fIsMainForm || (isLast && sMainFormIsGone)) && be_app != nullptr)
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
	if (isMainForm)
		sMainFormIsGone = false;
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
// where the focus went, after each message. The part that lost it is told first; its handler may move the
// focus again, or take parts away.
void
TForm::TellFocus()
{
	for (int32 round = 0; round < kFocusRounds; round++) {
		BView* focus = CurrentFocus();
		if (!fIsOpen || fFormView == nullptr || focus == fLastFocus)
			return;
		fLastFocus = focus;
		TFormPart* focused = PartAround(focus);
		if (focused == fFocusedPart)
			continue;
		TFormPart* before = FindPart(fFormView, fFocusedPart);
		fFocusedPart = focused;
		if (before != nullptr)
			before->FormFocusChanged(false);
		if (focused != nullptr && CurrentFocus() == focus)
			focused->FormFocusChanged(true);
	}
}

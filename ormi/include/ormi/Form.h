// SPDX-License-Identifier: MIT
// The window of a form.

#pragma once

#include <Window.h>

class TFormPart;
class TFormView;

/// A form: a window with one view that fills it and carries the form's components.
///
/// A generated form class derives from it, creates the components in its constructor, and overrides the
/// hooks of the events that it has handlers for. The hooks run with the window locked, in the window's
/// thread; those that Show() and Quit() call run in the thread of their caller. Make forms on the heap: a
/// form deletes itself when it is closed. The main form's end is the program's.
class TForm : public BWindow {
public:
	/// \a frame: the content's, in screen coordinates. The window is hidden until Show(). Without
	/// B_ASYNCHRONOUS_CONTROLS controls would swallow the mouse events of a press, so it is always set.
	TForm(BRect frame, const char* title, window_look look, window_feel feel, uint32 flags);
	virtual ~TForm();

	void DispatchMessage(BMessage* message, BHandler* handler) override;
	void MessageReceived(BMessage* message) override;

	/// The first call opens the form: its view and the components are told that they are attached, which
	/// they could not be before they had handlers, and the view gets the focus if nothing else has it.
	/// The window must be locked for that call, as it is in the thread that made the form.
	void Show() override;

	/// Takes the components off the window, which calls their handlers, and deletes the form.
	void Quit() override;

	/// The last thing that a generated constructor does, and the first of a generated destructor.
	virtual void FormCreate();
	virtual void FormDestroy();

	/// Puts \a view, which is the form's from now on, under the window. A form has one view for life.
	void SetFormView(TFormView* view);
	TFormView* FormView() const { return fFormView; }

	/// When the main form is gone, the application is asked to quit, and once more when the last form is
	/// gone that refused then.
	void MakeMainForm(bool isMainForm);
	bool IsMainForm() const { return fIsMainForm; }

	/// Whether the form was shown and is not being deleted: whether events have handlers to call.
	bool IsOpen() const { return fIsOpen; }

	// The events of the form's view; nothing here. Those of the window are BWindow's own hooks.
	virtual void AllAttached();
	virtual void AttachedToWindow();
	virtual void AllDetached();
	virtual void Draw(BRect updateRect);
	virtual void KeyDown();
	virtual void KeyUp();
	virtual void GotFocus();
	virtual void LostFocus();
	virtual void MouseUp(BPoint point);
	virtual void MouseDown(BPoint point);
	virtual void MouseMoved(BPoint point, uint32 transit, const BMessage* message);

	/// BWindow's transactions, as hooks that a form may add to.
	virtual void OpenViewTransaction();
	virtual void CommitViewTransaction();

private:
	void Open();
	void TellFocus();

	TFormView* fFormView;
	// Only compared: they may be gone.
	const BView* fLastFocus;
	const TFormPart* fFocusedPart;
	bool fIsMainForm;
	bool fIsOpen;
};

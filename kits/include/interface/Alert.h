// SPDX-License-Identifier: MIT
// A small modal window with a message and up to three buttons.
#ifndef _ALERT_H
#define _ALERT_H

#include <memory>

#include <Window.h>

class BButton;
class BInvoker;
class BTextView;

enum alert_type {
	B_EMPTY_ALERT = 0,
	B_INFO_ALERT = 1,
	B_IDEA_ALERT = 2,
	B_WARNING_ALERT = 3,
	B_STOP_ALERT = 4,
};

enum button_spacing {
	B_EVEN_SPACING = 0,
	B_OFFSET_SPACING = 1,
};

/// A message to the user, or a question, answered by one of its buttons.
///
/// Made on the heap and given away by Go(): it deletes itself when it is answered.
class BAlert : public BWindow {
public:
	BAlert();
	/// The texts are copied; a button without a label is left out and not counted. The right-most
	/// button is the default one.
	BAlert(const char* title, const char* text, const char* button1, const char* button2 = NULL,
		const char* button3 = NULL, button_width width = B_WIDTH_AS_USUAL,
		alert_type type = B_INFO_ALERT);
	BAlert(const char* title, const char* text, const char* button1, const char* button2,
		const char* button3, button_width width, button_spacing spacing,
		alert_type type = B_INFO_ALERT);
	BAlert(BMessage* archive);
	virtual ~BAlert();

	static BArchivable* Instantiate(BMessage* archive);
	status_t Archive(BMessage* archive, bool deep = true) const override;

	void MessageReceived(BMessage* message) override;
	void FrameResized(float newWidth, float newHeight) override;
	void DispatchMessage(BMessage* message, BHandler* handler) override;
	void Quit() override;
	bool QuitRequested() override;

	alert_type Type() const;
	void SetType(alert_type type);
	void SetText(const char* text);
	void SetButtonSpacing(button_spacing spacing);
	void SetButtonWidth(button_width width);

	/// Lets \a key, a character such as B_ESCAPE, press a button. Before Go().
	void SetShortcut(int32 buttonIndex, char key);
	char Shortcut(int32 buttonIndex) const;

	/// Shows the alert, waits for the answer and returns the index of the pressed button; -1 when the
	/// alert ended without an answer. The alert has gone then. One without buttons gets an "OK".
	///
	/// In a window's thread that window is repainted meanwhile, and its messages wait.
	int32 Go();
	/// Shows the alert and returns; \a invoker's message is sent with "which" (int32) added. The
	/// invoker, which may be null, stays the caller's.
	status_t Go(BInvoker* invoker);

	/// Null when there is no such button.
	BButton* ButtonAt(int32 index) const;
	BTextView* TextView() const;

private:
	static const int32 kMostButtons = 3;

	struct Outcome;

	void Build(const char* text, const char* const labels[kMostButtons]);
	void AddButton(const char* label);
	void Prepare();
	void LayOut();
	void Place();
	void Answer(int32 index);

	alert_type fType;
	button_width fButtonWidth;
	button_spacing fSpacing;
	BTextView* fTextView;
	BButton* fButtons[kMostButtons];
	char fShortcuts[kMostButtons];
	BInvoker* fInvoker;
	bool fAnswered;
	// Shared with the thread that waits, which may touch the alert no more.
	std::shared_ptr<Outcome> fOutcome;
};

#endif // _ALERT_H

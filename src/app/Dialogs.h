// SPDX-License-Identifier: MIT
// Questions and notices to the user, and small helpers of windows.

#pragma once

#include <Alert.h>

class BView;
class BWindow;

/// Shows \a text in a modal box with up to three buttons and waits for the answer.
///
/// Escape presses the first button. Never call it with another window's lock held. Returns the index
/// of the pressed button, 0 for the first.
int32 MsgBox(const char* title, const char* text, const char* button1,
	const char* button2 = nullptr, const char* button3 = nullptr,
	button_width width = B_WIDTH_AS_USUAL, alert_type type = B_INFO_ALERT);

/// MsgBox with "Yes" (0) and "No" (1); \a text is the title, too.
int32 YesNoBox(const char* text, alert_type type = B_INFO_ALERT);

/// MsgBox with "Yes" (0), "No" (1) and "Cancel" (2); \a text is the title, too.
int32 YesNoCancelBox(const char* text, alert_type type = B_INFO_ALERT);

/// MsgBox with "OK" (0) and "Cancel" (1); \a text is the title, too.
int32 OKCancelBox(const char* text, alert_type type = B_INFO_ALERT);

/// Answers a box in place of the user: gets title, text and first button, returns a button's index.
typedef int32 (*message_box_hook)(const char* title, const char* text, const char* button1);

/// Sends every box to \a hook from now on, for programs without windows; null brings the boxes back.
///
/// Call it before other threads run. Returns the hook so far.
message_box_hook SetMessageBoxHook(message_box_hook hook);

/// Moves \a window to the centre of the main screen; one larger than the screen stays where it is.
///
/// Lock the window.
void CenterWindowOnScreen(BWindow* window);

/// The height of \a view's font in pixels: ascent and descent, and with \a leading the leading too.
float FontHeight(const BView* view, bool leading);

/// Writes the file name of the form called \a formName, "NAME.frm", into \a fileName.
///
/// The caller provides room for the name, five more bytes, and nothing else.
void MakeFormFileName(const char* formName, char* fileName);

// SPDX-License-Identifier: MIT
// What the dialogs of property editors have in common.

#pragma once

#include <Point.h>
#include <SupportDefs.h>

class BView;
class BWindow;

/// Space between the parts of a dialog and around them, in pixels.
constexpr float kDialogSpace = 10;

/// Adds the buttons "btnOK" and "btnCancel" to \a parent, which fills \a window, side by side at the right edge of
/// what lies above them. Enter presses OK, Escape Cancel.
///
/// \a content: how wide and how far down \a parent is used. The window, which is not running yet, gets the size that
/// all of it needs.
void AddDialogButtons(
	BWindow* window, BView* parent, BPoint content, uint32 okCommand, uint32 cancelCommand);

/// The view that fills a dialog's window and gives it its ground.
BView* AddDialogGround(BWindow* window);

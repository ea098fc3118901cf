// SPDX-License-Identifier: MIT
// What a file panel says and asks, without waiting for the answer.
#ifndef INTERFACE_PANEL_ALERTS_H
#define INTERFACE_PANEL_ALERTS_H

#include <string>

#include <Messenger.h>

class BMessage;

namespace BPrivate {

/// Tells the user something in an alert titled "File panel". Returns the alert, which may be gone any time.
BMessenger ShowPanelNotice(const std::string& text);

/// Asks whether to do something. \a answer gets "which" (int32): 0 for the button "Cancel", 1 for \a button; it is
/// copied, and sent to \a target. Returns the alert, which may be gone any time.
BMessenger AskInPanel(
	const std::string& text, const char* button, const BMessage& answer, const BMessenger& target);

} // namespace BPrivate

#endif // INTERFACE_PANEL_ALERTS_H

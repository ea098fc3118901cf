// SPDX-License-Identifier: MIT
// The dialog for the flags of a window.

#pragma once

#include <memory>

#include <String.h>
#include <Window.h>

#include "props/PendingEdit.h"

class TFlagBoxes;

/// A check box for each flag of TFlagSet::WindowFlags(). The dialog deletes itself when it closes.
class WindowFlagsWin : public BWindow {
public:
	/// \a value: the text to edit, at most 1024 bytes are used. \a edit: gets the result.
	WindowFlagsWin(const char* value, const TPendingEdit& edit);
	virtual ~WindowFlagsWin();

	/// Ticks the boxes from the text first.
	void Show() override;
	void MessageReceived(BMessage* message) override;

private:
	enum { WFW_OK = 0, WFW_CANCEL = 1 };

	void Apply();

	BString fText;
	TPendingEdit fEdit;
	std::unique_ptr<TFlagBoxes> fBoxes;
};

/// Meant for editing window flags in \a flags and \a text while the caller waits. Does nothing and returns 0.
int32 WFWModalEdit(uint32* flags, char* text, int32 length);

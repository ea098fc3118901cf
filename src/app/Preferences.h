// SPDX-License-Identifier: MIT
// The settings that the designer keeps between runs.

#pragma once

#include <mutex>

#include <Path.h>

#include "app/TypedMessage.h"

/// A settings file as a message: read when it is made, written when it is destroyed.
///
/// The fields of the message are the settings; read them with the Find... operations.
class TPreferences : public TTypedMessage {
public:
	/// Reads \a fileName from the settings folder; see InitCheck(). A missing file leaves no fields.
	explicit TPreferences(const char* fileName);
	/// Writes the file; a failure is not reported.
	virtual ~TPreferences();

	/// The first failure of finding the folder, opening the file and reading the message.
	status_t InitCheck() const { return fStatus; }

	/// Leaves the file as it is when this object is destroyed, for programs that only read settings.
	void LeaveFileAlone() { fSaved = false; }

private:
	status_t Load(const char* fileName);

	BPath fPath;
	status_t fStatus;
	bool fSaved;
};

/// The designer's settings. They exist from before main() until after it.
///
/// Window frames, in screen coordinates: "MainWindowFrame", "PaletteFrame", "PropertyWinFrame",
/// "ProjectWinFrame" (rectangles). The dialect of generated sources: "Dialect" (a text, see codegen/Dialect.h).
extern TPreferences AppSettings;

/// Windows read and store their settings in their own threads: held for each use of AppSettings, and no longer.
extern std::mutex AppSettingsLock;

// SPDX-License-Identifier: MIT
// The window from which the user takes components.

#pragma once

#include <atomic>

#include <Window.h>

class ComponentPaletteView;
class TPaletteEntry;

/// The floating window "Components": a button for each palette entry. A pressed button's entry becomes the
/// drop entry, which the next drag on a design surface creates.
class ComponentPalette : public BWindow {
public:
	/// Hidden, at its stored frame.
	ComponentPalette();
	virtual ~ComponentPalette();

	ComponentPaletteView* View() const { return fView; }

	/// The entry that waits to be dropped, or none; that of PaletteCatalog(). Any thread.
	TPaletteEntry* DropEntry() const;
	void SetDropEntry(TPaletteEntry* entry);

	/// Lets the window really close from now on. Any thread.
	void OKToClose(bool closing) { fOKToClose = closing; }

	void MessageReceived(BMessage* message) override;

	/// Hides the window, unless OKToClose(true): then stores the frame and agrees.
	bool QuitRequested() override;

private:
	ComponentPaletteView* fView;
	std::atomic<bool> fOKToClose;
};

// SPDX-License-Identifier: MIT
// The column of buttons in the component palette.

#pragma once

#include <Box.h>

class TPaletteEntry;

/// The content of the palette window: shows the entries' buttons and knows all entries, those of
/// PaletteCatalog(). Lock the window.
class ComponentPaletteView : public BBox {
public:
	ComponentPaletteView(BRect frame, const char* name);
	virtual ~ComponentPaletteView();

	/// Appends \a entry, which is not owned.
	void AddPalEntry(TPaletteEntry* entry);

	/// The first entry whose class name is exactly \a className; none when there is none, or no text. Any thread.
	TPaletteEntry* FindPalEntry(const char* className) const;

	/// The height of the column of buttons in pixels: how far the view scrolls.
	void SetColumnHeight(float height);

	void MessageReceived(BMessage* message) override;
	void FrameResized(float width, float height) override;

private:
	void UpdateScrollBar();

	float fColumnHeight;
};

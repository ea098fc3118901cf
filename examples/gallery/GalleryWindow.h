// SPDX-License-Identifier: MIT
// The gallery's window: a tab for each kind of control.
#ifndef GALLERY_WINDOW_H
#define GALLERY_WINDOW_H

#include <Window.h>

class BTabView;

/// Command-1, -2, ... show the pages. Closing it quits the program.
class GalleryWindow : public BWindow {
public:
	GalleryWindow();

	void MessageReceived(BMessage* message) override;
	bool QuitRequested() override;

private:
	BTabView* fPages;
};

#endif // GALLERY_WINDOW_H

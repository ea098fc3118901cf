// SPDX-License-Identifier: MIT
// The gallery's window: a tab for each kind of control.
#ifndef GALLERY_WINDOW_H
#define GALLERY_WINDOW_H

#include <memory>

#include <Window.h>

class BFilePanel;
class BStringView;
class BTabView;

/// The line at its foot tells what was sent last, and by which control. Closing it quits the program.
class GalleryWindow : public BWindow {
public:
	GalleryWindow();
	~GalleryWindow() override;

	void MessageReceived(BMessage* message) override;
	bool QuitRequested() override;

private:
	void BuildPages();
	void ShowAlert(const BMessage* message);
	void ShowPanel(std::unique_ptr<BFilePanel>* panel, bool save);
	void TellFiles(const BMessage* message);
	void TellSaved(const BMessage* message);
	void TellSender(const BMessage* message);

	BTabView* fPages;
	BStringView* fStatus;
	std::unique_ptr<BFilePanel> fOpenPanel;
	std::unique_ptr<BFilePanel> fSavePanel;
};

#endif // GALLERY_WINDOW_H

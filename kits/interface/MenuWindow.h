// SPDX-License-Identifier: MIT
// The little window of an open menu.
#ifndef INTERFACE_MENU_WINDOW_H
#define INTERFACE_MENU_WINDOW_H

#include <Messenger.h>
#include <Window.h>

class BMenu;
class BMenuItem;

namespace BPrivate {

/// A menu's window told its tracker: "window" (messenger), "frame" (rect, screen).
const uint32 kMsgMenuPlaced = '_MPl';

/// Shows one menu, whole or as much of it as fits on the screen, and hands all input to the tracker.
///
/// Its lock is the last one that a thread may take: whoever has it takes no lock of a window that is no
/// menu's. It goes when its menu is taken out.
class MenuWindow : public BWindow {
public:
	/// Shows \a menu with its left-top at \a location, or near to it on the screen; the menu above it
	/// locked. \a tracker gets the input. Null when the menu is in a window already.
	static MenuWindow* Open(BMenu* menu, BPoint location, const BMessenger& tracker = BMessenger());

	~MenuWindow() override;

	void DispatchMessage(BMessage* message, BHandler* handler) override;
	bool QuitRequested() override;

	/// Takes the menu out; the window goes. Locked.
	void Close(BMenu* menu);
	/// Sizes itself for the menu's items as they are now. Locked.
	void Refit(BMenu* menu);
	/// All pointer input and the keys come here. Locked.
	void GrabInput();

	/// -1 or 1 where pointing scrolls up or down, as long as there is more; 0 elsewhere. Screen coordinates.
	int32 ScrollDirectionAt(BPoint where) const;
	/// By \a distance pixels, as far as there is more.
	void ScrollItems(float distance);
	void Reveal(const BMenuItem* item);

private:
	class FrameView;

	MenuWindow(BMenu* menu, const BMessenger& tracker);
	BRect FittingFrame(BMenu* menu) const;
	void PlaceMenu(BMenu* menu);

	FrameView* fFrameView;
	BMessenger fTracker;
	BPoint fLocation;
	// The item that leads to the menu, in screen coordinates; invalid for none that it must not cover.
	BRect fItem;
	bool fIsBelowItem;
};

} // namespace BPrivate

#endif // INTERFACE_MENU_WINDOW_H

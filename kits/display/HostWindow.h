// SPDX-License-Identifier: MIT
// A window of the host's display, and what the display tells its owner.
#ifndef DISPLAY_HOST_WINDOW_H
#define DISPLAY_HOST_WINDOW_H

#include <memory>

#include <Rect.h>
#include <String.h>
#include <SupportDefs.h>

class BMessage;
class BRegion;

namespace BPrivate {

class Canvas;
struct CursorShape;
struct Picture;

/// What a host window looks like and how it behaves.
struct HostWindowStyle {
	/// window_look, window_feel and the flags of <Window.h>.
	uint32 look = 1;
	uint32 feel = 0;
	uint32 flags = 0;
	/// A menu's window: no border, above all others, never active, never blocked by a modal window.
	bool isMenu = false;
};


/// Smallest and largest size, in the right - left sense.
struct HostSizeLimits {
	float minWidth = 0;
	float maxWidth = 32768;
	float minHeight = 0;
	float maxHeight = 32768;
};


/// In a report of a move or size (int32): how often MoveTo(), or ResizeTo(), had been called by then. A report with another
/// number than the caller's is older than its last request.
inline const char* const kTimesAsked = "be:times_asked";


/// Who hears from a host window. The calls come from the display's thread, or from a thread that injects
/// input: hand the message to the looper and return. Take no looper's lock here and do not call the
/// display, which holds its own lock. After the host window's destructor has begun nothing more comes.
class HostWindowClient {
public:
	virtual ~HostWindowClient() = default;

	/// One of the messages below; coordinates are the API's pixels.
	///
	/// B_MOUSE_DOWN, B_MOUSE_UP, B_MOUSE_MOVED, B_MOUSE_WHEEL_CHANGED: "when", "screen_where", "where"
	/// (window), "buttons", "modifiers"; "clicks" for down, and "be:activates" (bool) when
	/// that press made the window active; "be:drag_message" while dragging;
	/// "be:wheel_delta_x" and "_y". A move with "be:transit" B_EXITED_VIEW says that the pointer left
	/// the window. While a button is held its moves and its release go to the window of the press.
	/// B_KEY_DOWN, B_KEY_UP, B_UNMAPPED_KEY_DOWN, B_UNMAPPED_KEY_UP, B_MODIFIERS_CHANGED: as in the API,
	/// to the active window.
	/// B_WINDOW_ACTIVATED: "active". B_WINDOW_MOVED: "where". B_WINDOW_RESIZED: "width", "height". Both come
	/// of the host's or the user's doing only, and have kTimesAsked.
	/// B_MINIMIZE: "minimize" (the host already did it). B_ZOOM: the host's zoom button; the new frame has
	/// come as a move and a resize before.
	/// B_SCREEN_CHANGED: "frame", "mode". B_QUIT_REQUESTED: the close button.
	virtual void Deliver(std::unique_ptr<BMessage> message) = 0;

	/// \a message was dropped on the window: what BView::DragMessage() dragged, or B_SIMPLE_DATA with
	/// "refs" for files and "text/plain" (B_MIME_TYPE) for text from another program.
	/// \a offset: of the pointer in the dragged rect.
	virtual void Dropped(std::unique_ptr<BMessage> message, BPoint screenWhere, BPoint offset) = 0;

	/// The buffer does not fit any more (another scale): make a new canvas with HostWindow::Scale() and
	/// draw all.
	virtual void NeedsRedraw() = 0;
};


/// A window of the host. Frames are content areas in screen coordinates, without border.
///
/// Any thread, usually the window's; each call may wait for the display's thread, which never waits for
/// its callers. The host may do less than asked (a tiling window manager, Wayland): what became of it
/// comes as messages.
class HostWindow {
public:
	/// Takes the window off the screen; the client hears nothing from here on.
	virtual ~HostWindow() = default;

	/// Asks for a place or a size. Nothing is reported where the host does as asked.
	virtual void MoveTo(BPoint leftTop) = 0;
	virtual void ResizeTo(BSize size) = 0;
	virtual void SetTitle(const char* title) = 0;
	virtual void SetStyle(const HostWindowStyle& style) = 0;
	virtual void SetSizeLimits(const HostSizeLimits& limits) = 0;

	/// On the screen, above the program's others (as its feel has it); active unless it avoids focus.
	virtual void Show() = 0;
	virtual void Hide() = 0;
	virtual void SetMinimized(bool minimized) = 0;
	/// Brings it to the front and gives it the keyboard.
	virtual void Activate() = 0;
	virtual void Deactivate() = 0;
	/// Below \a other; null: behind all.
	virtual void SendBehind(HostWindow* other) = 0;
	virtual bool IsFront() const = 0;
	/// For the subset feels: \a member is one of the windows that this one floats above or blocks.
	virtual void AddToSubset(HostWindow* member) = 0;
	virtual void RemoveFromSubset(HostWindow* member) = 0;

	/// The frame with tab and border; the frame itself where the host does not tell.
	virtual BRect DecoratorFrame() const = 0;
	/// Device pixels for each of the API's: 1, 1.5, 2, ... What the canvas must be made with.
	virtual float Scale() const = 0;

	/// Shows what \a canvas, of Display::MakeCanvas() with a scale, has in \a region (window coordinates):
	/// all that was drawn since it was presented last; the canvas need not keep the rest. Copies the
	/// pixels under a short lock and returns; the picture is kept, so that the host needs nobody to show
	/// it again. Another canvas than the last one is shown whole.
	virtual void Present(const Canvas& canvas, const BRegion& region) = 0;
	/// Waits until the display has shown what was presented.
	virtual void Sync() = 0;
	/// The picture as it was last presented; empty before that, and where nothing is drawn.
	virtual Picture ReadPicture() const = 0;

	/// The cursor over this window; null: the application's.
	virtual void SetCursor(std::shared_ptr<const CursorShape> cursor) = 0;
	/// All pointer input comes here, wherever the pointer is, as far as the host allows: for open menus.
	virtual void SetPointerGrab(bool grab) = 0;

	/// As if the user did it by the window's border and buttons, for tests and scripts: the client hears
	/// of it as of the user's doing.
	virtual void InjectFrame(BRect frame) = 0;
	virtual void InjectMinimized(bool minimized) = 0;
	/// The zoom button; a second time brings the frame back. Nothing where there is none.
	virtual void InjectZoom() = 0;
};

} // namespace BPrivate

#endif // DISPLAY_HOST_WINDOW_H

// SPDX-License-Identifier: MIT
// The seam between the kits and what shows windows: windows, screens, input, clipboard, pictures.
#ifndef DISPLAY_DISPLAY_H
#define DISPLAY_DISPLAY_H

#include <memory>

#include <InterfaceDefs.h>
#include <Rect.h>

#include "app/ClipboardPrivate.h"
#include "app/CursorPrivate.h"

class BMessage;

namespace BPrivate {

class Canvas;
class FontEngine;
class HostWindow;
class HostWindowClient;
struct HostWindowStyle;
struct Picture;
struct PixelBuffer;

/// A key for InjectKey(): a raw key code and the text it gives (empty: none).
struct InjectedKey {
	int32 rawKey;
	const char* bytes;
	/// B_SHIFT_KEY, B_COMMAND_KEY, ... held meanwhile.
	uint32 modifiers;
};


/// One display. Calls come from any thread and may wait for the display's own thread, which takes no
/// looper's lock and waits for nobody.
class Display : public CursorHost, public ClipboardExchange {
public:
	/// The program's display, chosen at the first call by the environment: BE_DISPLAY=none for the
	/// built-in one that draws nothing, BE_DISPLAY=qt or unset for the module libbe_display_qt.so beside
	/// this library. Where that cannot be had, a line on standard error says why and it is the built-in one.
	static Display& Get();
	/// Whether Get() has been called: asks nothing of the host.
	static bool IsConnected();

	/// "none" or "qt".
	virtual const char* Name() const = 0;
	/// Whether canvases hold pixels and fonts are real.
	virtual bool DrawsPixels() const = 0;

	/// A hidden window; \a client hears of it until the window is deleted. Null when the display has gone.
	virtual std::unique_ptr<HostWindow> MakeWindow(
		BRect frame, const char* title, const HostWindowStyle& style, HostWindowClient* client) = 0;

	/// An opaque white buffer of \a width times \a height of the API's pixels (at least 1 each).
	virtual std::unique_ptr<Canvas> MakeCanvas(int32 width, int32 height, float scale) = 0;
	/// Draws into \a buffer, which stays the caller's and must outlive the canvas. Scale 1.
	virtual std::unique_ptr<Canvas> MakeCanvas(const PixelBuffer& buffer) = 0;
	virtual FontEngine& Fonts() = 0;

	/// At least 1; 0 is the main screen, whose frame starts at (0, 0).
	virtual int32 CountScreens() = 0;
	virtual BRect ScreenFrame(int32 index) = 0;
	/// The screen that the middle of \a frame is on, else the main one.
	int32 ScreenAt(BRect frame);
	/// What the screen shows in \a frame. B_UNSUPPORTED where the host does not tell.
	virtual status_t ReadScreen(BRect frame, Picture* picture) = 0;
	virtual void Beep() = 0;

	/// The pointer and the keys as they are now, without waiting for anything.
	virtual void GetPointer(BPoint* screenWhere, uint32* buttons) = 0;
	virtual void GetKeys(key_info* info) = 0;
	/// Microseconds since the last input.
	virtual bigtime_t IdleTime() = 0;

	/// An outline in screen coordinates that follows the pointer: B_TRACK_WHOLE_RECT moves it,
	/// B_TRACK_RECT_CORNER keeps its left-top. It ends with EndRectTracking() or the release of the buttons.
	/// \a from: where the pointer was when it took hold of \a rect.
	virtual void BeginRectTracking(BRect rect, uint32 style, BPoint from) = 0;
	virtual void EndRectTracking() = 0;

	/// Drags \a message while a button is held: moves carry it, the window under the release gets it by
	/// HostWindowClient::Dropped(). Without a held button it is dropped at once.
	/// \a image (may be null, copied) or the outline of \a rect (screen) moves with the pointer;
	/// \a offset: the pointer's place in it.
	virtual void BeginDrag(
		const BMessage& message, BRect rect, const PixelBuffer* image, BPoint offset) = 0;

	/// B_OK; B_BAD_DATA for what is no picture; B_UNSUPPORTED. PNG, JPEG, BMP, PPM, XPM, GIF.
	virtual status_t DecodePicture(const void* data, size_t size, Picture* picture) = 0;
	/// Writes a PNG file. B_OK; B_BAD_VALUE for an empty picture; an error of the file; B_UNSUPPORTED.
	virtual status_t SavePicture(const Picture& picture, const char* path) = 0;

	/// Returns when the display's thread has done what it was asked to before: what was presented is shown.
	virtual void Sync() = 0;

	/// Input as if from the user, for tests and scripts: the messages are with the loopers on return.
	/// Moves the pointer and sets which buttons are held.
	virtual void InjectPointer(BPoint screenWhere, uint32 buttons) = 0;
	virtual void InjectWheel(float deltaX, float deltaY) = 0;
	/// Goes to the active window.
	virtual void InjectKey(const InjectedKey& key, bool down) = 0;
	/// Drops files or text from "another program" at a place.
	virtual void InjectDrop(std::unique_ptr<BMessage> message, BPoint screenWhere) = 0;
};

} // namespace BPrivate

#endif // DISPLAY_DISPLAY_H

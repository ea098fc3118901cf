// SPDX-License-Identifier: MIT
// Uses the test's windows like a person, and reads back what they show.
#ifndef TESTS_SUPPORT_ROBOT_H
#define TESTS_SUPPORT_ROBOT_H

#include <memory>
#include <string>
#include <vector>

#include <GraphicsDefs.h>
#include <Messenger.h>
#include <Point.h>
#include <Rect.h>

class BWindow;

namespace BPrivate {
class Robot;
} // namespace BPrivate

/// A window's picture in device pixels (those of the API times the scale).
class WindowPicture {
public:
	int32 width = 0;
	int32 height = 0;
	std::vector<uint32> pixels;

	/// Opaque; transparent black outside.
	rgb_color At(int32 x, int32 y) const;
	/// How many pixels of \a rect have this colour.
	int32 Count(BRect rect, rgb_color color) const;
	/// Whether the pixels of \a rect are the same in both.
	bool SameIn(const WindowPicture& other, BRect rect) const;
	bool SavePng(const char* path) const;
};


/// Works on one window at a time, the one given or the one waited for last. Coordinates are the window's.
///
/// Call it from the test's thread, with no window locked. Each step waits, within the limit, until the
/// windows have handled what they were sent and drawn; steps that name a view wait for the view. Those that
/// return bool are false when it cannot be done in time.
class Robot {
public:
	Robot();
	explicit Robot(BWindow* window);
	~Robot();

	/// Seconds; 10 to begin with. Longer where a sanitizer makes programs slow.
	void SetLimit(double seconds);
	/// The shown window with this title ("Untitled*": that begins so) becomes the one to work on.
	bool WaitForWindow(const char* title);
	bool WaitForNoWindow(const char* title);
	/// The window to work on from here on.
	void SetWindow(const BMessenger& window) { fWindow = window; }
	const BMessenger& Window() const { return fWindow; }

	void MoveTo(BPoint where);
	void Press(uint32 button = 1);
	void Release();
	void Click(BPoint where, int32 count = 1, uint32 button = 1);
	void Drag(BPoint from, BPoint to, int32 steps = 8);
	void Wheel(float down, float right = 0);
	/// B_SHIFT_KEY, B_COMMAND_KEY, ... are held during what follows, until Hold(0).
	void Hold(uint32 modifiers);
	/// A view's name, or the label of a control.
	bool ClickView(const char* view, int32 count = 1);
	/// In an open menu or a menu bar; waits for it.
	bool ClickItem(const char* label);
	/// The item's middle, in the coordinates of the window that is worked on.
	bool FindItem(const char* label, BPoint* middle);
	/// The middle of the view's visible part; false when there is none.
	bool FindView(const char* view, BPoint* middle);

	void Type(const char* text);
	/// "enter", "shift+tab", "command+s", ...
	bool Key(const char* key);

	/// Waits until every window has handled its messages and drawn.
	bool Settle();
	std::string Text(const char* view);
	/// -1 for what is no control.
	int32 Value(const char* view);
	bool WaitForText(const char* view, const char* text);
	/// Empty where nothing is drawn.
	WindowPicture Picture();

private:
	BPoint OnScreen(BPoint where);

	std::unique_ptr<BPrivate::Robot> fRobot;
	BMessenger fWindow;
	uint32 fHeld = 0;
	// The window whose place was asked for last, and its left-top on the screen.
	BMessenger fKnownWindow;
	BPoint fKnownPlace;
};

#endif // TESTS_SUPPORT_ROBOT_H

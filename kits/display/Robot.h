// SPDX-License-Identifier: MIT
// Uses the program's windows like a person: moves the pointer, types, and looks at what came of it.
#ifndef DISPLAY_ROBOT_H
#define DISPLAY_ROBOT_H

#include <functional>
#include <vector>

#include <Messenger.h>
#include <Rect.h>
#include <String.h>

#include "display/PixelBuffer.h"

class BLooper;
class BView;
class BWindow;

namespace BPrivate {

class HostWindow;

/// Input goes through the display's injection, so it takes the way of real input from there on. After
/// each step the robot waits, within its limit, until the windows have handled what they were sent and
/// their pictures are up to date; a window that is busy (an alert, a tracking loop) is not waited for.
///
/// Use it from a thread that runs no looper and holds no lock. Views are named by their name, or by the
/// label of a control where no view has that name.
class Robot {
public:
	/// \a limit: the longest wait for anything, in microseconds.
	explicit Robot(bigtime_t limit = 10000000);

	bigtime_t Limit() const { return fLimit; }
	void SetLimit(bigtime_t limit) { fLimit = limit; }

	// Windows. B_TIMED_OUT when it did not come, or go, in time.
	/// The shown window with this title; the last word may be cut short with "*". An open menu is a
	/// window too, with the menu's name for its title.
	status_t WaitForWindow(const char* title, BMessenger* window);
	status_t WaitForNoWindow(const char* title);
	std::vector<BString> WindowTitles();
	/// Runs \a task with the window locked. B_BAD_VALUE when it is gone, B_TIMED_OUT when it is busy.
	status_t WithWindow(const BMessenger& window, const std::function<void(BWindow*)>& task);
	/// The same with a view; waits for it to appear. B_NAME_NOT_FOUND without it.
	status_t WithView(
		const BMessenger& window, const char* view, const std::function<void(BView*)>& task);

	// The window's border: what the user does with it. B_BAD_VALUE when the window is gone,
	// B_TIMED_OUT when the host does not do it.
	/// \a frame: of the content, on the screen.
	status_t PlaceWindow(const BMessenger& window, BRect frame);
	status_t MinimizeWindow(const BMessenger& window, bool minimize);
	/// Presses the zoom button.
	status_t ZoomWindow(const BMessenger& window);

	// Places, in screen coordinates
	status_t GetWindowFrame(const BMessenger& window, BRect* frame);
	/// The visible part of the view.
	status_t GetViewFrame(const BMessenger& window, const char* view, BRect* frame);
	/// Of the item with this label in an open menu, the last opened first, or in a menu bar; waits for it.
	status_t GetItemFrame(const char* label, BRect* frame);

	// Pointer; screen coordinates
	void MoveTo(BPoint where);
	void Press(uint32 button = 1);
	void Release();
	void Click(BPoint where, int32 count = 1, uint32 button = 1);
	/// Presses at \a from, goes to \a to in \a steps steps, releases.
	void Drag(BPoint from, BPoint to, int32 steps = 8);
	void Wheel(float deltaX, float deltaY);
	status_t ClickView(const BMessenger& window, const char* view, int32 count = 1);
	status_t ClickItem(const char* label);

	// Keys; to the active window
	void Type(const char* text);
	/// \a key: a name such as "enter", "left", "f1", "a", with "shift+", "command+", "control+",
	/// "option+" before it. B_BAD_VALUE for an unknown one.
	status_t Key(const char* key);

	// What came of it
	/// Waits until all windows have handled what they were sent, and drawn. False when one did not.
	bool Settle();
	/// The text of a text view, text control or string view; the label of other controls.
	status_t GetText(const BMessenger& window, const char* view, BString* text);
	/// The value of a control. B_BAD_TYPE for a view that has none.
	status_t GetValue(const BMessenger& window, const char* view, int32* value);
	/// Waits until GetText() gives \a text. B_TIMED_OUT, \a found being what it gave last.
	status_t WaitForText(
		const BMessenger& window, const char* view, const char* text, BString* found);
	/// The window's picture in device pixels. B_UNSUPPORTED where nothing is drawn.
	status_t ReadWindow(const BMessenger& window, Picture* picture);
	status_t SaveWindow(const BMessenger& window, const char* path);

private:
	status_t WithHost(const BMessenger& window, const std::function<void(HostWindow&)>& task);
	status_t WaitForHost(const BMessenger& window, const std::function<bool(BWindow*)>& isDone);
	/// \a limit: for each window.
	bool SettleOnce(bigtime_t limit);
	bool SettleWindow(BWindow* window, bigtime_t limit);
	/// Waits until the windows have handled what they were sent; \a time, where one does not answer.
	void Look(bigtime_t time);
	/// Whether \a target, the looper itself, answers or waits for the user.
	bool Ping(const BLooper* looper, const BMessenger& target, bigtime_t limit);
	void PressKey(int32 rawKey, const char* bytes, uint32 modifiers);
	void Pause(bigtime_t time);

	bigtime_t fLimit;
	BPoint fWhere;
	uint32 fButtons;
};

} // namespace BPrivate

#endif // DISPLAY_ROBOT_H

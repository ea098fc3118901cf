// SPDX-License-Identifier: MIT
// How a control that is clicked follows the mouse and the keys.
#ifndef KITS_INTERFACE_CLICK_TRACKING_H
#define KITS_INTERFACE_CLICK_TRACKING_H

#include <Point.h>

class BControl;

namespace BPrivate {

/// One control's press: it begins on the control, is shown while the pointer is inside, and is a click
/// when it ends there. The control's hooks pass on to it, with the window locked.
class ClickTracking {
public:
	explicit ClickTracking(BControl* control);

	/// Whether the control is to be shown pressed.
	bool IsPressed() const { return fPressed; }

	/// Begins; nothing for a disabled control.
	void MouseDown();
	void MouseMoved(BPoint where);
	/// True for a click, which the control then carries out.
	bool MouseUp(BPoint where);
	/// Ends without a click, as the control leaves its window.
	void Cancel();

	/// Whether these bytes of KeyDown() are a key that clicks.
	static bool IsClickKey(const char* bytes, int32 numBytes);

private:
	void SetPressed(bool pressed);

	BControl* fControl;
	bool fPressed;
};

} // namespace BPrivate

#endif // KITS_INTERFACE_CLICK_TRACKING_H

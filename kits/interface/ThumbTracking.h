// SPDX-License-Identifier: MIT
// How a control with thumbs follows the mouse and the keys.
#ifndef KITS_INTERFACE_THUMB_TRACKING_H
#define KITS_INTERFACE_THUMB_TRACKING_H

#include <Point.h>

class BControl;
class BRect;

namespace BPrivate {

/// What the user changes with a thumb: it begins with a press or a key, and ends when that is released. The
/// control's hooks pass on to it, with the window locked.
class ThumbTracking {
public:
	explicit ThumbTracking(BControl* control);
	virtual ~ThumbTracking();

	/// A press of an enabled control, for a thumb whose frame and middle are given. A thumb that is taken hold of
	/// stays under the pointer; beside it, it comes there. \a options: of the mouse event mask.
	void MouseDown(BPoint where, BRect thumb, BPoint middle, uint32 options);
	void MouseMoved(BPoint where);
	void MouseUp(BPoint where);
	/// The key that moves the thumb is released, or goes elsewhere with the focus.
	void KeyReleased();
	/// The control takes no more input.
	void Disabled();
	/// The control leaves its window.
	void Cancel();

	/// The user is about to change the control, until FinishChange().
	void BeginChange();
	void FinishChange();

protected:
	/// Notes what the control's values are before a change.
	virtual void ChangeBegins() = 0;
	/// Gives the control the values for the thumb's middle being there.
	virtual void MoveThumb(BPoint middle) = 0;
	/// Tells of the values that are others now. That may have the control deleted, and this with it.
	virtual void ChangeEnds() = 0;

private:
	BControl* fControl;
	bool fIsChanging;
	// From the pointer to the middle of the thumb that it holds.
	BPoint fGrabOffset;
};

} // namespace BPrivate

#endif // KITS_INTERFACE_THUMB_TRACKING_H

// SPDX-License-Identifier: MIT
// Where a window's mouse and key messages go, and what the pointer is doing in it.
#ifndef INTERFACE_WINDOW_INPUT_H
#define INTERFACE_WINDOW_INPUT_H

#include <memory>
#include <vector>

#include <Rect.h>
#include <SupportDefs.h>

class BBitmap;
class BHandler;
class BMessage;
class BView;
class BWindow;

namespace BPrivate {

struct CursorShape;

/// The input side of one window. Window locked, except for what says otherwise.
class WindowInput {
public:
	explicit WindowInput(BWindow* window);
	~WindowInput();

	/// Finds the view that an input message is for, and adds the fields that depend on it. Loop thread.
	/// \a target: what the message names. Null drops the message.
	BHandler* TargetFor(BMessage* message, BHandler* target);
	/// Calls the hook for an input message; false for other messages and for handlers without hooks.
	bool Dispatch(BMessage* message, BHandler* handler);

	/// The top-most visible view there (window coordinates), null when there is none.
	BView* ViewAt(BPoint where) const;
	void ViewRemoved(BView* view);
	void EventMaskChanged(BView* view);
	void MouseEventMaskChanged(BView* view);
	bool IsInMouseDown() const { return fInMouseDown; }
	void CursorChanged(BView* view);

	/// BView::GetMouse(); \a where in screen coordinates.
	void GetMouse(BView* view, BPoint* where, uint32* buttons, bool checkMessageQueue);
	void NavigateByKeyboard();

	/// Screen coordinates; only one rect is tracked at a time.
	void BeginRectTracking(BRect rect, uint32 style);
	void EndRectTracking();
	/// \a outline: screen coordinates, when there is no \a image.
	void StartDrag(BView* source, const BMessage& message, BRect outline, const BBitmap* image,
		BPoint offset, BHandler* replyTo);

private:
	// One more view that gets the message that is being dispatched.
	struct Recipient {
		BView* view;
		int32 transit;
	};

	struct PointerState {
		BPoint where; // on the screen
		uint32 buttons;
	};

	PointerState PointerOfHook() const;
	bool HandToMenus(BMessage* message);
	BHandler* MouseTarget(BMessage* message);
	bool TakeMouseMessage(BView* view, BPoint* where, uint32* buttons);
	BHandler* KeyTarget(BMessage* message);
	void ChooseMovedRecipients(BMessage* message, BView* under);
	void ButtonsReleased();
	BView* MouseMaskView() const;
	void ForwardToOtherWindows(const BMessage& message, uint32 eventMask);

	void DispatchToOthers(BMessage* message);
	bool DispatchMouse(BMessage* message, BView* view);
	bool DispatchMoved(BMessage* message, BView* view, BPoint where);
	bool DispatchKey(BMessage* message, BHandler* handler);
	bool HandleSpecialKey(BMessage* message);
	bool InvokeShortcut(uint32 key, uint32 modifiers);
	BView* NextNavigable(BView* from, uint32 flag, bool forward) const;
	void ShowCursorOf(BView* view);

	BWindow* fWindow;
	// The view that was last told that the pointer entered it.
	BView* fPointerView;
	std::shared_ptr<const CursorShape> fCursor;
	std::vector<BView*> fMouseMaskViews;
	std::vector<BView*> fMaskViews;
	std::vector<Recipient> fOthers;
	bool fInMouseDown;
	bool fIsTracking;
	bool fIsDispatchingToOthers;
};

} // namespace BPrivate

#endif // INTERFACE_WINDOW_INPUT_H

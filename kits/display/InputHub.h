// SPDX-License-Identifier: MIT
// Turns what a pointer and a keyboard do into the messages of the windows they are meant for.
#ifndef DISPLAY_INPUT_HUB_H
#define DISPLAY_INPUT_HUB_H

#include <functional>
#include <memory>
#include <mutex>
#include <optional>

#include <InterfaceDefs.h>
#include <Message.h>

#include "display/WindowStack.h"

namespace BPrivate {

struct InjectedKey;

/// A key as the host reports it.
struct KeyInput {
	int32 rawKey = 0;
	/// UTF-8 of the key with its modifiers; empty: an unmapped key.
	BString bytes;
	/// The character without modifiers.
	int32 rawChar = 0;
	uint32 modifiers = 0;
	int32 repeat = 0;
};


/// What the display paints over the windows: the outline that follows the pointer.
struct InputOverlay {
	/// Screen coordinates; invalid: none.
	BRect tracking;
	BRect dragged;
	/// The dragged picture's left-top is that of dragged.
	std::shared_ptr<const Picture> image;

	/// An image is nowhere without a valid rect.
	bool IsEmpty() const { return !tracking.IsValid() && !dragged.IsValid(); }
};


/// Keeps the windows' order and the state of pointer and keys, and delivers the input messages.
///
/// Any thread: one lock inside, held while clients are told, so that a removed window hears nothing more.
/// While a button is held, moves and the release go to the window of the press. A press in a window that a
/// modal one blocks brings the modal one to the front and is lost. Escape ends a drag without a drop.
class InputHub {
public:
	/// \a managesFocus: nobody else raises and activates windows, so showing and pressing do.
	explicit InputHub(bool managesFocus);

	/// Called (hub locked) after the overlay has changed.
	void SetOverlayListener(std::function<void()> listener);
	/// Called (hub locked) when a window was put in front by the hub itself.
	void SetRaiseListener(std::function<void(StackedWindow*)> listener);

	void AddWindow(StackedWindow* window);
	void RemoveWindow(StackedWindow* window);
	void SetFrame(StackedWindow* window, BRect frame);
	BRect Frame(const StackedWindow* window) const;
	void SetStyle(StackedWindow* window, const HostWindowStyle& style);
	void SetVisible(StackedWindow* window, bool visible);
	void SetMinimized(StackedWindow* window, bool minimized);
	void Raise(StackedWindow* window);
	void SendBehind(StackedWindow* window, const StackedWindow* other);
	void AddToSubset(StackedWindow* window, const StackedWindow* member);
	void RemoveFromSubset(StackedWindow* window, const StackedWindow* member);
	bool IsFront(const StackedWindow* window) const;
	/// From the lowest to the topmost.
	std::vector<const StackedWindow*> ShownWindows() const;
	/// From the next lower one to the lowest.
	std::vector<StackedWindow*> WindowsBelow(const StackedWindow* window) const;

	/// The window with the keyboard, null: none. Tells the old one and the new one.
	void SetActive(StackedWindow* window);
	/// Makes \a window active unless it may not be.
	void Activate(StackedWindow* window);
	void Deactivate(StackedWindow* window);
	void SetGrab(StackedWindow* window, bool grab);

	/// Delivers a message that is about one window, such as B_WINDOW_MOVED.
	void Deliver(StackedWindow* window, std::unique_ptr<BMessage> message);
	void NeedsRedraw(StackedWindow* window);
	/// The close button: B_QUIT_REQUESTED, or the modal window that blocks it comes to the front. Nothing
	/// for a window that has no such button.
	void RequestClose(StackedWindow* window);

	/// \a under: the window under the pointer if the host knows it.
	/// \a when: the time of the input by the host's clock, in microseconds: a busy program hears of it later.
	void PointerAt(BPoint screenWhere, uint32 buttons, std::optional<StackedWindow*> under,
		std::optional<bigtime_t> when = std::nullopt);
	/// The pointer has left the program's windows.
	void PointerLeft();
	void Wheel(float deltaX, float deltaY, std::optional<StackedWindow*> under);
	void Key(const KeyInput& key, bool down);
	void InjectKey(const InjectedKey& key, bool down);
	void SetModifiers(uint32 modifiers);
	/// Drops what another program gave, B_SIMPLE_DATA or a message of its own; ends its visit.
	void Drop(std::unique_ptr<BMessage> message, BPoint screenWhere,
		std::optional<StackedWindow*> under = std::nullopt);
	/// Another program drags over \a window. \a message: what it drags; null: the same as before.
	/// False when a drop would be refused.
	bool VisitorAt(StackedWindow* window, std::unique_ptr<BMessage> message, BPoint screenWhere);
	/// What another program drags has left, or is dragged no more.
	void VisitorLeft();

	void GetPointer(BPoint* screenWhere, uint32* buttons) const;
	void GetKeys(key_info* info) const;
	bigtime_t IdleTime() const;

	void BeginTracking(BRect rect, uint32 style, BPoint from);
	void EndTracking();
	void BeginDrag(
		const BMessage& message, BRect rect, std::shared_ptr<const Picture> image, BPoint offset);
	bool IsDragging() const;
	/// Nothing is dropped.
	void CancelDrag();
	InputOverlay Overlay() const;

private:
	struct DragState {
		BMessage message;
		std::shared_ptr<const Picture> image;
		BRect rect;
		BPoint offset;
	};

	struct TrackingState {
		BRect rect;
		BPoint start;
		uint32 style;
	};

	StackedWindow* Under(std::optional<StackedWindow*> known) const;
	StackedWindow* KeyTarget() const;
	/// The menu's window that has grabbed the input, null for none.
	StackedWindow* OpenMenu() const;
	void Moved(StackedWindow* under);
	void Pressed(StackedWindow* under, bool isFirst);
	void Released(StackedWindow* under);
	void FinishDrag(StackedWindow* under);
	void CancelDragLocked();
	void AddDragged(BMessage* message) const;
	void LeaveWindow(StackedWindow* next);
	void ActivateLocked(StackedWindow* window);
	void SetActiveLocked(StackedWindow* window);
	void ActivateNext();
	void SetModifiersLocked(uint32 modifiers);
	void KeyLocked(const KeyInput& key, bool down);
	void OverlayMayHaveChanged();
	std::unique_ptr<BMessage> MakePointerMessage(uint32 what, const StackedWindow* window) const;
	void SendMove(StackedWindow* window);

	mutable std::mutex fMutex;
	const bool fManagesFocus;
	WindowStack fStack;
	std::function<void()> fOverlayListener;
	std::function<void(StackedWindow*)> fRaiseListener;

	StackedWindow* fActive;
	StackedWindow* fGrabber;
	StackedWindow* fPressWindow;
	StackedWindow* fLastUnder;
	BPoint fWhere;
	uint32 fButtons;
	key_info fKeys;
	bigtime_t fLastInput;

	BPoint fClickWhere;
	bigtime_t fClickTime;
	uint32 fClickButton;
	StackedWindow* fClickWindow;
	int32 fClicks;

	std::unique_ptr<DragState> fDrag;
	/// What another program drags over the windows.
	std::unique_ptr<BMessage> fVisitor;
	std::optional<TrackingState> fTracking;
};

} // namespace BPrivate

#endif // DISPLAY_INPUT_HUB_H

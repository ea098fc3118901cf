// SPDX-License-Identifier: MIT
// WindowInput: the way of a window's input messages to its views.
#include "interface/WindowInput.h"

#include <algorithm>
#include <cmath>
#include <cstring>
#include <memory>
#include <mutex>

#include <Application.h>
#include <Message.h>
#include <MessageQueue.h>
#include <Messenger.h>
#include <OS.h>
#include <Window.h>

#include "app/LooperPrivate.h"
#include "display/Display.h"
#include "display/DragFields.h"
#include "display/HostWindow.h"
#include "display/PixelBuffer.h"
#include "interface/DrawableBitmap.h"
#include "interface/ViewPrivate.h"
#include "interface/WindowClient.h"
#include "interface/WindowPrivate.h"

namespace BPrivate {

namespace {

// A moved message that waited longer is left out when a newer one for the same view waits.
const bigtime_t kLateMove = 20000;
// GetMouse() leaves out moves that waited longer.
const bigtime_t kOldMove = 10000;


// The views that asked for events of all windows, by address: no window is locked to reach another.
struct Listener {
	BWindow* window;
	port_id port;
	int32 token;
	uint32 mask;
};

std::mutex sListenersLock;


std::vector<Listener>&
Listeners()
{
	static auto* listeners = new std::vector<Listener>;
	return *listeners;
}


bool
IsMouseMessage(uint32 what)
{
	return what == B_MOUSE_DOWN || what == B_MOUSE_UP || what == B_MOUSE_MOVED
		|| what == B_MOUSE_WHEEL_CHANGED;
}


bool
IsKeyMessage(uint32 what)
{
	return what == B_KEY_DOWN || what == B_KEY_UP || what == B_UNMAPPED_KEY_DOWN
		|| what == B_UNMAPPED_KEY_UP || what == B_MODIFIERS_CHANGED;
}


BPoint
ViewWhere(BMessage* message, BView* view)
{
	BPoint where;
	if (message->FindPoint("be:view_where", &where) == B_OK)
		return where;
	if (message->FindPoint("screen_where", &where) == B_OK)
		return view->ConvertFromScreen(where);
	message->FindPoint("where", &where);
	return where;
}


// "where" of a press or release is in the view's coordinates, of a move in the window's.
void
AddWhere(BMessage* message, BView* view)
{
	BPoint screenWhere = message->GetPoint("screen_where", B_ORIGIN);
	BPoint viewWhere = view->ConvertFromScreen(screenWhere);
	message->SetPoint("be:view_where", viewWhere);
	message->SetPoint("where",
		message->what == B_MOUSE_MOVED ? view->Window()->ConvertFromScreen(screenWhere)
									   : viewWhere);
}

} // namespace


WindowInput::WindowInput(BWindow* window)
	: fWindow(window),
	  fPointerView(nullptr),
	  fInMouseDown(false),
	  fIsTracking(false),
	  fIsDispatchingToOthers(false)
{
}


WindowInput::~WindowInput()
{
	if (fIsTracking)
		EndRectTracking();
	std::lock_guard lock(sListenersLock);
	std::erase_if(
		Listeners(), [&](const Listener& listener) { return listener.window == fWindow; });
}


BHandler*
WindowInput::TargetFor(BMessage* message, BHandler* target)
{
	fOthers.clear();
	// A menu's window hands on all input, also that where it has no view.
	if (LooperAccess::Kind(fWindow) == kMenuWindowLooper)
		return target;
	if (message->WasDropped() && target == fWindow) {
		BView* view = ViewAt(fWindow->ConvertFromScreen(message->DropPoint()));
		return view != nullptr ? view : target;
	}
	// What the program posts itself, and what another window forwards, names its view.
	if (target != fWindow)
		return target;
	if (fWindow->fData->openBar != nullptr && HandToMenus(message))
		return nullptr;
	if (IsMouseMessage(message->what))
		return MouseTarget(message);
	if (IsKeyMessage(message->what))
		return KeyTarget(message);
	return target;
}


// While the user chooses from the menu bar the views get none of the pointer, nor keys that are pressed.
bool
WindowInput::HandToMenus(BMessage* message)
{
	bool isKey = message->what == B_KEY_DOWN || message->what == B_UNMAPPED_KEY_DOWN;
	if (!isKey && !IsMouseMessage(message->what))
		return false;
	const BMessenger& tracker = fWindow->fData->menuTracker;
	if (!tracker.IsValid())
		return false;

	tracker.SendMessage(message);
	if (message->what == B_MOUSE_UP && message->GetInt32("buttons", 0) == 0)
		ButtonsReleased();
	return true;
}


BHandler*
WindowInput::MouseTarget(BMessage* message)
{
	BPoint screenWhere;
	if (message->FindPoint("screen_where", &screenWhere) != B_OK)
		return fWindow;

	ForwardToOtherWindows(*message, B_POINTER_EVENTS);
	// A press that made the window active does nothing else, unless the window takes first clicks.
	if (message->GetBool("be:activates", false)
		&& (fWindow->Flags() & B_WILL_ACCEPT_FIRST_CLICK) == 0)
		return nullptr;

	// The host says so when the pointer left: there may be another window on top.
	bool left = message->what == B_MOUSE_MOVED
		&& message->GetInt32("be:transit", B_INSIDE_VIEW) == B_EXITED_VIEW;
	BView* under = left ? nullptr : ViewAt(fWindow->ConvertFromScreen(screenWhere));
	BView* holder = MouseMaskView();

	if (message->what == B_MOUSE_MOVED) {
		ChooseMovedRecipients(message, under);
	} else {
		BView* primary = holder != nullptr ? holder : under;
		for (BView* view : fMaskViews) {
			if (view != primary && (view->fEventMask & B_POINTER_EVENTS) != 0)
				fOthers.push_back({view, B_OUTSIDE_VIEW});
		}
		if (primary != nullptr)
			fOthers.push_back({primary, B_INSIDE_VIEW});
	}
	if (message->what == B_MOUSE_UP && message->GetInt32("buttons", 0) == 0)
		ButtonsReleased();
	if (fOthers.empty())
		return nullptr;

	Recipient primary = fOthers.back();
	fOthers.pop_back();
	AddWhere(message, primary.view);
	if (message->what == B_MOUSE_MOVED)
		message->SetInt32("be:transit", primary.transit);
	return primary.view;
}


// The one that holds the pointer is told of every move. The others are told of what happens in them:
// while somebody holds the pointer only what is dragged can be there for them.
void
WindowInput::ChooseMovedRecipients(BMessage* message, BView* under)
{
	BView* holder = MouseMaskView();
	bool isDrag = message->HasMessage("be:drag_message");
	BView* inside = holder != nullptr && !isDrag && under != holder ? nullptr : under;
	BView* last = fPointerView;
	fPointerView = inside;

	auto transitOf = [&](BView* view) -> int32 {
		if (view == inside)
			return last == view ? B_INSIDE_VIEW : B_ENTERED_VIEW;
		return last == view ? B_EXITED_VIEW : B_OUTSIDE_VIEW;
	};
	auto add = [&](BView* view) {
		bool isNew = std::none_of(fOthers.begin(), fOthers.end(),
			[&](const Recipient& recipient) { return recipient.view == view; });
		if (view != nullptr && isNew)
			fOthers.push_back({view, transitOf(view)});
	};

	// The last one is the message's own target.
	if (last != inside && last != holder)
		add(last);
	for (BView* view : fMaskViews) {
		if ((view->fEventMask & B_POINTER_EVENTS) != 0 && view != inside && view != holder)
			add(view);
	}
	if (inside != holder)
		add(inside);
	add(holder);

	if (holder == nullptr)
		ShowCursorOf(inside);
}


BHandler*
WindowInput::KeyTarget(BMessage* message)
{
	ForwardToOtherWindows(*message, B_KEYBOARD_EVENTS);
	BView* focus = fWindow->CurrentFocus();
	for (BView* view : fMaskViews) {
		if (view != focus && (view->fEventMask & B_KEYBOARD_EVENTS) != 0)
			fOthers.push_back({view, B_OUTSIDE_VIEW});
	}
	BView* suspender = nullptr;
	for (BView* view : fMouseMaskViews) {
		bool isNew = view != focus && (view->fEventMask & B_KEYBOARD_EVENTS) == 0;
		if ((view->fMouseEventMask & B_KEYBOARD_EVENTS) == 0)
			continue;
		if ((view->fMouseEventOptions & B_SUSPEND_VIEW_FOCUS) != 0)
			suspender = view;
		else if (isNew)
			fOthers.push_back({view, B_OUTSIDE_VIEW});
	}
	// Until the release the focus hears nothing.
	if (suspender != nullptr) {
		std::erase_if(fOthers, [&](const Recipient& other) { return other.view == suspender; });
		return suspender;
	}

	const uint32 kHeldModifiers = B_SHIFT_KEY | B_COMMAND_KEY | B_CONTROL_KEY | B_OPTION_KEY;
	if (message->what == B_KEY_DOWN && fWindow->DefaultButton() != nullptr
		&& message->GetInt32("raw_char", 0) == B_ENTER
		&& (message->GetInt32("modifiers", 0) & kHeldModifiers) == 0)
		return fWindow->fData->DefaultButtonView();
	return focus != nullptr ? static_cast<BHandler*>(focus) : fWindow;
}


bool
WindowInput::Dispatch(BMessage* message, BHandler* handler)
{
	if (IsMouseMessage(message->what)) {
		DispatchToOthers(message);
		// A hook of the others may have removed the target.
		if (fWindow->IndexOf(handler) < 0)
			return true;
		BView* view = dynamic_cast<BView*>(handler);
		return view != nullptr && DispatchMouse(message, view);
	}
	if (!IsKeyMessage(message->what))
		return false;

	DispatchToOthers(message);
	return fWindow->IndexOf(handler) < 0 || DispatchKey(message, handler);
}


// Each copy goes through the window's DispatchMessage() as the message itself does.
void
WindowInput::DispatchToOthers(BMessage* message)
{
	if (fIsDispatchingToOthers)
		return;

	fIsDispatchingToOthers = true;
	while (!fOthers.empty()) {
		Recipient other = fOthers.front();
		fOthers.erase(fOthers.begin());

		BMessage copy(*message);
		if (IsMouseMessage(message->what))
			AddWhere(&copy, other.view);
		if (message->what == B_MOUSE_MOVED)
			copy.SetInt32("be:transit", other.transit);
		fWindow->DispatchMessage(&copy, other.view);
	}
	fIsDispatchingToOthers = false;
}


bool
WindowInput::DispatchMouse(BMessage* message, BView* view)
{
	BPoint where = ViewWhere(message, view);
	switch (message->what) {
		case B_MOUSE_DOWN:
			fInMouseDown = true;
			view->MouseDown(where);
			fInMouseDown = false;
			return true;

		case B_MOUSE_UP:
			view->MouseUp(where);
			return true;

		case B_MOUSE_MOVED:
			return DispatchMoved(message, view, where);

		default:
			return false;
	}
}


bool
WindowInput::DispatchMoved(BMessage* message, BView* view, BPoint where)
{
	int32 transit = message->GetInt32("be:transit", B_OUTSIDE_VIEW);
	uint32 options = view->fEventOptions | view->fMouseEventOptions;
	bool isPlainMove = transit == B_INSIDE_VIEW || transit == B_OUTSIDE_VIEW;
	bool isLate = system_time() - message->GetInt64("when", system_time()) > kLateMove;
	if (isPlainMove
		&& ((options & B_NO_POINTER_HISTORY) != 0
			|| (isLate && (options & B_FULL_POINTER_HISTORY) == 0))
		&& fWindow->MessageQueue()->FindMessage(B_MOUSE_MOVED) != nullptr)
		return true;

	BMessage dragMessage;
	bool isDrag = message->FindMessage("be:drag_message", &dragMessage) == B_OK;
	dragMessage.RemoveName(kDragReplyTo);
	view->MouseMoved(where, transit, isDrag ? &dragMessage : nullptr);
	return true;
}


bool
WindowInput::DispatchKey(BMessage* message, BHandler* handler)
{
	if (message->what == B_KEY_DOWN && HandleSpecialKey(message))
		return true;

	BView* view = dynamic_cast<BView*>(handler);
	const char* bytes;
	bool hasHook = message->what == B_KEY_DOWN || message->what == B_KEY_UP;
	if (view == nullptr || !hasHook || message->FindString("bytes", &bytes) != B_OK) {
		handler->MessageReceived(message);
		return true;
	}

	// A key may give a zero byte, which no terminator is.
	int32 length = 0;
	while (message->HasInt8("byte", length))
		length++;
	if (length == 0)
		length = static_cast<int32>(std::strlen(bytes));
	if (message->what == B_KEY_DOWN)
		view->KeyDown(bytes, length);
	else
		view->KeyUp(bytes, length);
	return true;
}


bool
WindowInput::HandleSpecialKey(BMessage* message)
{
	const char* bytes;
	if (message->FindString("bytes", &bytes) != B_OK)
		return false;

	uint32 key = static_cast<uint8>(bytes[0]);
	uint32 rawChar = message->GetInt32("raw_char", key);
	uint32 modifiers = message->GetInt32("modifiers", 0);
	bool isCommand = (modifiers & B_COMMAND_KEY) != 0;

	if (key == B_ESCAPE && isCommand && fWindow->KeyMenuBar() != nullptr) {
		fWindow->fData->OpenKeyMenuBar();
		return true;
	}
	// Where no view has the focus, none of them could navigate on a Tab.
	const bool hasNoFocus = fWindow->CurrentFocus() == nullptr && !isCommand;
	if (key == B_TAB && ((modifiers & B_OPTION_KEY) != 0 || hasNoFocus)) {
		NavigateByKeyboard();
		return true;
	}
	if (key == B_ESCAPE && (fWindow->Flags() & B_CLOSE_ON_ESCAPE) != 0) {
		BMessage quit(B_QUIT_REQUESTED);
		quit.AddBool("shortcut", true);
		fWindow->PostMessage(&quit);
		return true;
	}
	if (!isCommand)
		return InvokeShortcut(key, modifiers) || InvokeShortcut(rawChar, modifiers);

	if ((rawChar == 'q' || rawChar == 'Q') && !fWindow->IsModal()) {
		BMessage quit(B_QUIT_REQUESTED);
		quit.AddBool("shortcut", true);
		be_app->PostMessage(&quit);
		return true;
	}
	// As if the user opened the menus: a program may bring its shortcuts up to date now.
	fWindow->MenusBeginning();
	if (!InvokeShortcut(key, modifiers))
		InvokeShortcut(rawChar, modifiers);
	fWindow->MenusEnded();
	return true;
}


bool
WindowInput::InvokeShortcut(uint32 key, uint32 modifiers)
{
	const Shortcut* shortcut = fWindow->fData->shortcuts.Find(key, modifiers);
	if (shortcut == nullptr)
		return false;
	if (shortcut->invoke) {
		// The call may change the table.
		std::function<void()> invoke = shortcut->invoke;
		invoke();
		return true;
	}
	if (shortcut->message == nullptr)
		return true;

	BHandler* target = fWindow;
	if (shortcut->target == ShortcutTarget::kFocus)
		target = fWindow->CurrentFocus();
	else if (shortcut->target == ShortcutTarget::kHandler)
		target = LooperAccess::HandlerFor(fWindow, shortcut->handlerToken);
	if (target == nullptr && shortcut->target == ShortcutTarget::kHandler)
		return true;

	BMessage message(*shortcut->message);
	message.SetInt64("when", system_time());
	message.SetBool("shortcut", true);
	fWindow->PostMessage(&message, target);
	return true;
}


void
WindowInput::NavigateByKeyboard()
{
	BMessage* message = fWindow->CurrentMessage();
	uint32 held = message != nullptr ? message->GetInt32("modifiers", 0) : modifiers();
	uint32 flag = (held & B_OPTION_KEY) != 0 ? B_NAVIGABLE_JUMP : B_NAVIGABLE;
	BView* focus = fWindow->CurrentFocus();
	BView* next = NextNavigable(focus, flag, (held & B_SHIFT_KEY) == 0);
	if (next != nullptr && next != focus)
		next->MakeFocus(true);
}


// Depth first and around; hidden views are left out with all that is in them.
BView*
WindowInput::NextNavigable(BView* from, uint32 flag, bool forward) const
{
	std::vector<BView*> order;
	auto gather = [&](auto& self, BView* view) -> void {
		if (view->fShowLevel > 0)
			return;
		if ((view->fFlags & flag) != 0 || view == from)
			order.push_back(view);
		for (BView* child = view->fFirstChild; child != nullptr; child = child->fNextSibling)
			self(self, child);
	};
	gather(gather, fWindow->fData->topView);
	if (order.empty())
		return nullptr;

	size_t count = order.size();
	size_t place = std::find(order.begin(), order.end(), from) - order.begin();
	for (size_t step = 1; step <= count; step++) {
		// Without a place in the order the first, or from behind the last, is next.
		size_t index = place < count ? (forward ? place + step : place + count - step) % count
									 : (forward ? step - 1 : count - step);
		if ((order[index]->fFlags & flag) != 0)
			return order[index];
	}
	return nullptr;
}


BView*
WindowInput::ViewAt(BPoint where) const
{
	BPoint point(std::floor(where.x), std::floor(where.y));
	auto find = [](auto& self, BView* view, BPoint place) -> BView* {
		if (view->fShowLevel > 0 || !view->fBounds.OffsetToCopy(view->fLeftTop).Contains(place))
			return nullptr;
		place -= view->fLeftTop - view->fBounds.LeftTop();
		for (BView* child = view->fLastChild; child != nullptr; child = child->fPreviousSibling) {
			if (BView* found = self(self, child, place))
				return found;
		}
		return view;
	};

	BView* view = find(find, fWindow->fData->topView, point);
	return view == fWindow->fData->topView ? nullptr : view;
}


BView*
WindowInput::MouseMaskView() const
{
	for (BView* view : fMouseMaskViews) {
		if ((view->fMouseEventMask & B_POINTER_EVENTS) != 0)
			return view;
	}
	return nullptr;
}


void
WindowInput::ButtonsReleased()
{
	for (BView* view : fMouseMaskViews) {
		view->fMouseEventMask = 0;
		view->fMouseEventOptions = 0;
	}
	fMouseMaskViews.clear();
}


void
WindowInput::ViewRemoved(BView* view)
{
	if (fPointerView == view)
		fPointerView = nullptr;
	view->fMouseEventMask = 0;
	view->fMouseEventOptions = 0;
	std::erase(fMouseMaskViews, view);
	std::erase_if(fOthers, [&](const Recipient& other) { return other.view == view; });
	if (std::erase(fMaskViews, view) == 0)
		return;

	int32 token = LooperAccess::Token(view);
	std::lock_guard lock(sListenersLock);
	std::erase_if(Listeners(), [&](const Listener& listener) { return listener.token == token; });
}


void
WindowInput::EventMaskChanged(BView* view)
{
	int32 token = LooperAccess::Token(view);
	std::erase(fMaskViews, view);
	std::lock_guard lock(sListenersLock);
	std::erase_if(Listeners(), [&](const Listener& listener) { return listener.token == token; });
	if (view->fEventMask == 0)
		return;

	fMaskViews.push_back(view);
	Listeners().push_back({fWindow, LooperAccess::Port(fWindow), token, view->fEventMask});
}


void
WindowInput::MouseEventMaskChanged(BView* view)
{
	std::erase(fMouseMaskViews, view);
	if (view->fMouseEventMask != 0 || view->fMouseEventOptions != 0)
		fMouseMaskViews.push_back(view);
}


void
WindowInput::ForwardToOtherWindows(const BMessage& message, uint32 eventMask)
{
	std::lock_guard lock(sListenersLock);
	for (const Listener& listener : Listeners()) {
		if (listener.window != fWindow && (listener.mask & eventMask) != 0)
			LooperAccess::PostOwned(listener.port, listener.token, new BMessage(message));
	}
}


// Messages that wait are older than the present state: a loop that polls must see each press and release.
void
WindowInput::GetMouse(BView* view, BPoint* where, uint32* buttons, bool checkMessageQueue)
{
	if (checkMessageQueue) {
		fWindow->UpdateIfNeeded();
		if (TakeMouseMessage(view, where, buttons))
			return;
	}
	fWindow->fData->painter.Present();
	Display::Get().GetPointer(where, buttons);
}


bool
WindowInput::TakeMouseMessage(BView* view, BPoint* where, uint32* buttons)
{
	bool fullHistory =
		((view->fEventOptions | view->fMouseEventOptions) & B_FULL_POINTER_HISTORY) != 0;
	BMessageQueue* queue = fWindow->MessageQueue();
	queue->Lock();
	std::unique_ptr<BMessage> taken;
	int32 index = 0;
	while (BMessage* message = queue->FindMessage(index)) {
		bool isMove = message->what == B_MOUSE_MOVED;
		if ((!isMove && message->what != B_MOUSE_DOWN && message->what != B_MOUSE_UP)
			|| message->WasDropped() || !message->HasPoint("screen_where")) {
			index++;
			continue;
		}
		queue->RemoveMessage(message);
		taken.reset(message);
		bigtime_t age = system_time() - message->GetInt64("when", 0);
		if (!isMove || fullHistory || age <= kOldMove)
			break;
		taken.reset();
	}
	queue->Unlock();
	if (taken == nullptr)
		return false;

	*where = taken->GetPoint("screen_where", B_ORIGIN);
	*buttons = taken->GetInt32("buttons", 0);
	if (taken->what == B_MOUSE_UP && *buttons == 0)
		ButtonsReleased();
	return true;
}


/// Inside a hook, the pointer as it was when that was called for: it may have gone on since.
WindowInput::PointerState
WindowInput::PointerOfHook() const
{
	PointerState pointer;
	Display::Get().GetPointer(&pointer.where, &pointer.buttons);
	BMessage* current = fWindow->CurrentMessage();
	if (current != nullptr && IsMouseMessage(current->what)) {
		pointer.where = current->GetPoint("screen_where", pointer.where);
		pointer.buttons = current->GetInt32("buttons", pointer.buttons);
	}
	return pointer;
}


void
WindowInput::BeginRectTracking(BRect rect, uint32 style)
{
	fIsTracking = true;
	Display::Get().BeginRectTracking(rect, style, PointerOfHook().where);
}


void
WindowInput::EndRectTracking()
{
	if (!fIsTracking)
		return;
	fIsTracking = false;
	Display::Get().EndRectTracking();
}


void
WindowInput::StartDrag(BView* source, const BMessage& message, BRect outline, const BBitmap* image,
	BPoint offset, BHandler* replyTo)
{
	const PointerState pointer = PointerOfHook();
	BMessage dragged(message);
	if (!dragged.HasInt32("buttons"))
		dragged.AddInt32("buttons", pointer.buttons);
	dragged.RemoveName(kDragReplyTo);
	dragged.AddMessenger(kDragReplyTo, BMessenger(replyTo != nullptr ? replyTo : source));
	if (image == nullptr) {
		Display::Get().BeginDrag(dragged, outline, nullptr, pointer.where - outline.LeftTop());
		return;
	}
	DrawableBitmap drawable(*image);
	Display::Get().BeginDrag(dragged, BRect(), &drawable.Buffer(), offset);
}


void
WindowInput::CursorChanged(BView* view)
{
	if (view == fPointerView)
		ShowCursorOf(view);
}


// The host is asked only for another cursor than the one it shows.
void
WindowInput::ShowCursorOf(BView* view)
{
	std::shared_ptr<const CursorShape> shape;
	if (view != nullptr && view->fDrawing != nullptr && view->fDrawing->cursor != nullptr)
		shape = CursorAccess::Shape(*view->fDrawing->cursor);
	HostWindow* host = fWindow->fData->host.get();
	if (host == nullptr || shape == fCursor)
		return;
	fCursor = shape;
	host->SetCursor(shape);
}

} // namespace BPrivate

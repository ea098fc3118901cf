// SPDX-License-Identifier: MIT
// Turns what a pointer and a keyboard do into the messages of the windows they are meant for.
#include "display/InputHub.h"

#include <algorithm>
#include <cmath>
#include <cstring>

#include <Application.h>
#include <OS.h>
#include <View.h>
#include <Window.h>

#include "display/PixelBuffer.h"

namespace BPrivate {

namespace {

// How far apart, in pixels, the presses of a double click may be.
const float kClickDistance = 4;
const bigtime_t kDoubleClickTime = 500000;

} // namespace


InputHub::InputHub(bool managesFocus)
	: fManagesFocus(managesFocus),
	  fActive(nullptr),
	  fGrabber(nullptr),
	  fPressWindow(nullptr),
	  fLastUnder(nullptr),
	  fButtons(0),
	  fKeys(),
	  fLastInput(system_time()),
	  fClickTime(0),
	  fClickButton(0),
	  fClickWindow(nullptr),
	  fClicks(0)
{
}


void
InputHub::SetOverlayListener(std::function<void()> listener)
{
	std::lock_guard<std::mutex> lock(fMutex);
	fOverlayListener = std::move(listener);
}


void
InputHub::SetRaiseListener(std::function<void(StackedWindow*)> listener)
{
	std::lock_guard<std::mutex> lock(fMutex);
	fRaiseListener = std::move(listener);
}


// #pragma mark - windows


void
InputHub::AddWindow(StackedWindow* window)
{
	std::lock_guard<std::mutex> lock(fMutex);
	fStack.Add(window);
}


void
InputHub::RemoveWindow(StackedWindow* window)
{
	std::lock_guard<std::mutex> lock(fMutex);
	fStack.Remove(window);
	for (StackedWindow** kept : {&fActive, &fGrabber, &fPressWindow, &fLastUnder, &fClickWindow}) {
		bool wasActive = kept == &fActive && *kept == window;
		if (*kept == window)
			*kept = nullptr;
		if (wasActive && fManagesFocus)
			ActivateNext();
	}
}


void
InputHub::SetFrame(StackedWindow* window, BRect frame)
{
	std::lock_guard<std::mutex> lock(fMutex);
	window->frame = frame;
}


BRect
InputHub::Frame(const StackedWindow* window) const
{
	std::lock_guard<std::mutex> lock(fMutex);
	return window->frame;
}


void
InputHub::SetStyle(StackedWindow* window, const HostWindowStyle& style)
{
	std::lock_guard<std::mutex> lock(fMutex);
	window->style = style;
	fStack.Reorder();
}


void
InputHub::SetVisible(StackedWindow* window, bool visible)
{
	std::lock_guard<std::mutex> lock(fMutex);
	if (window->isVisible == visible)
		return;

	window->isVisible = visible;
	if (visible) {
		fStack.Raise(window);
		if (fManagesFocus && !window->IsFloating())
			ActivateLocked(window);
		return;
	}
	if (fGrabber == window)
		fGrabber = nullptr;
	if (fLastUnder == window)
		fLastUnder = nullptr;
	if (fActive == window && fManagesFocus)
		ActivateNext();
}


void
InputHub::SetMinimized(StackedWindow* window, bool minimized)
{
	std::lock_guard<std::mutex> lock(fMutex);
	if (window->isMinimized == minimized)
		return;

	window->isMinimized = minimized;
	if (!fManagesFocus)
		return;
	if (minimized && fActive == window)
		ActivateNext();
	else if (!minimized && window->isVisible) {
		fStack.Raise(window);
		ActivateLocked(window);
	}
}


void
InputHub::Raise(StackedWindow* window)
{
	std::lock_guard<std::mutex> lock(fMutex);
	fStack.Raise(window);
}


void
InputHub::SendBehind(StackedWindow* window, const StackedWindow* other)
{
	std::lock_guard<std::mutex> lock(fMutex);
	fStack.SendBehind(window, other);
	if (fActive == window && fManagesFocus)
		ActivateNext();
}


void
InputHub::AddToSubset(StackedWindow* window, const StackedWindow* member)
{
	std::lock_guard<std::mutex> lock(fMutex);
	if (std::find(window->subset.begin(), window->subset.end(), member) == window->subset.end())
		window->subset.push_back(member);
	fStack.Reorder();
}


void
InputHub::RemoveFromSubset(StackedWindow* window, const StackedWindow* member)
{
	std::lock_guard<std::mutex> lock(fMutex);
	std::erase(window->subset, member);
}


bool
InputHub::IsFront(const StackedWindow* window) const
{
	std::lock_guard<std::mutex> lock(fMutex);
	return fStack.IsFront(window);
}


std::vector<const StackedWindow*>
InputHub::ShownWindows() const
{
	std::lock_guard<std::mutex> lock(fMutex);
	std::vector<const StackedWindow*> shown;
	for (const StackedWindow* window : fStack.Windows()) {
		if (window->IsShown())
			shown.push_back(window);
	}
	return shown;
}


std::vector<StackedWindow*>
InputHub::WindowsBelow(const StackedWindow* window) const
{
	std::lock_guard<std::mutex> lock(fMutex);
	std::vector<StackedWindow*> below;
	for (StackedWindow* other : fStack.Windows()) {
		if (other == window)
			break;
		below.insert(below.begin(), other);
	}
	return below;
}


void
InputHub::SetActive(StackedWindow* window)
{
	std::lock_guard<std::mutex> lock(fMutex);
	SetActiveLocked(window);
}


void
InputHub::Activate(StackedWindow* window)
{
	std::lock_guard<std::mutex> lock(fMutex);
	if (!window->isVisible)
		return;
	if ((window->style.flags & B_AVOID_FRONT) == 0)
		fStack.Raise(window);
	ActivateLocked(window);
}


void
InputHub::Deactivate(StackedWindow* window)
{
	std::lock_guard<std::mutex> lock(fMutex);
	if (fActive != window)
		return;
	SetActiveLocked(nullptr);
}


void
InputHub::SetGrab(StackedWindow* window, bool grab)
{
	std::lock_guard<std::mutex> lock(fMutex);
	if (grab)
		fGrabber = window;
	else if (fGrabber == window)
		fGrabber = nullptr;
}


void
InputHub::ActivateLocked(StackedWindow* window)
{
	StackedWindow* blocker = fStack.BlockerOf(window);
	if (blocker != nullptr)
		window = blocker;
	if (window->IsShown() && window->TakesFocus())
		SetActiveLocked(window);
}


void
InputHub::ActivateNext()
{
	SetActiveLocked(fStack.TopFocus());
}


void
InputHub::SetActiveLocked(StackedWindow* window)
{
	if (fActive == window)
		return;

	StackedWindow* changed[] = {fActive, window};
	fActive = window;
	for (StackedWindow* one : changed) {
		if (one == nullptr)
			continue;
		auto message = std::make_unique<BMessage>(B_WINDOW_ACTIVATED);
		message->AddInt64("when", system_time());
		message->AddBool("active", one == fActive);
		one->client->Deliver(std::move(message));
	}
	if (fManagesFocus && be_app != nullptr && (changed[0] == nullptr || changed[1] == nullptr)) {
		BMessage activated(B_APP_ACTIVATED);
		activated.AddBool("active", fActive != nullptr);
		be_app->PostMessage(&activated);
	}
}


void
InputHub::Deliver(StackedWindow* window, std::unique_ptr<BMessage> message)
{
	std::lock_guard<std::mutex> lock(fMutex);
	message->AddInt64("when", system_time());
	if (fStack.Has(window))
		window->client->Deliver(std::move(message));
}


void
InputHub::RequestClose(StackedWindow* window)
{
	std::lock_guard<std::mutex> lock(fMutex);
	StackedWindow* blocker = fStack.BlockerOf(window);
	if (blocker == nullptr) {
		// A window manager may offer it all the same.
		if ((window->style.flags & B_NOT_CLOSABLE) != 0)
			return;
		auto message = std::make_unique<BMessage>(B_QUIT_REQUESTED);
		message->AddInt64("when", system_time());
		window->client->Deliver(std::move(message));
		return;
	}
	fStack.Raise(blocker);
	if (fRaiseListener)
		fRaiseListener(blocker);
}


void
InputHub::NeedsRedraw(StackedWindow* window)
{
	std::lock_guard<std::mutex> lock(fMutex);
	if (fStack.Has(window))
		window->client->NeedsRedraw();
}


// #pragma mark - pointer


StackedWindow*
InputHub::Under(std::optional<StackedWindow*> known) const
{
	return known.has_value() ? *known : fStack.WindowAt(fWhere);
}


std::unique_ptr<BMessage>
InputHub::MakePointerMessage(uint32 what, const StackedWindow* window) const
{
	auto message = std::make_unique<BMessage>(what);
	message->AddInt64("when", fLastInput);
	message->AddPoint("screen_where", fWhere);
	message->AddPoint("where", fWhere - window->frame.LeftTop());
	message->AddInt32("buttons", static_cast<int32>(fButtons));
	message->AddInt32("modifiers", static_cast<int32>(fKeys.modifiers));
	return message;
}


void
InputHub::SendMove(StackedWindow* window)
{
	if (fStack.BlockerOf(window) != nullptr)
		return;
	auto message = MakePointerMessage(B_MOUSE_MOVED, window);
	AddDragged(message.get());
	window->client->Deliver(std::move(message));
}


void
InputHub::LeaveWindow(StackedWindow* next)
{
	StackedWindow* left = fLastUnder;
	fLastUnder = next;
	if (left == nullptr || left == next || fStack.BlockerOf(left) != nullptr)
		return;

	auto message = MakePointerMessage(B_MOUSE_MOVED, left);
	message->AddInt32("be:transit", B_EXITED_VIEW);
	AddDragged(message.get());
	left->client->Deliver(std::move(message));
}


void
InputHub::PointerAt(BPoint screenWhere, uint32 buttons, std::optional<StackedWindow*> under,
	std::optional<bigtime_t> when)
{
	std::lock_guard<std::mutex> lock(fMutex);
	fLastInput = system_time();
	const bigtime_t pressTime = when.value_or(fLastInput);
	bool moved = screenWhere != fWhere;
	fWhere = screenWhere;
	if (moved)
		Moved(Under(under));

	// Each button by itself, as a mouse would report it.
	for (uint32 bit = 1; bit <= (1u << (B_MAX_MOUSE_BUTTONS - 1)); bit <<= 1) {
		if ((buttons & bit) == (fButtons & bit))
			continue;
		bool isFirst = fButtons == 0;
		fButtons ^= bit;
		if ((buttons & bit) != 0) {
			bool again = fClickButton == bit && pressTime - fClickTime <= kDoubleClickTime
				&& std::fabs(fWhere.x - fClickWhere.x) <= kClickDistance
				&& std::fabs(fWhere.y - fClickWhere.y) <= kClickDistance
				&& fClickWindow == Under(under);
			fClicks = again ? fClicks + 1 : 1;
			fClickButton = bit;
			fClickTime = pressTime;
			fClickWhere = fWhere;
			fClickWindow = Under(under);
			Pressed(Under(under), isFirst);
		} else
			Released(Under(under));
	}
}


void
InputHub::Moved(StackedWindow* under)
{
	OverlayMayHaveChanged();
	StackedWindow* target = fButtons != 0 ? fPressWindow : fGrabber;
	if (target == nullptr && fButtons == 0)
		target = under;

	if (fButtons == 0 || fDrag != nullptr)
		LeaveWindow(fDrag != nullptr || fGrabber == nullptr ? under : fGrabber);
	if (target != nullptr)
		SendMove(target);
	StackedWindow* menu = OpenMenu();
	if (menu != nullptr && menu != target)
		SendMove(menu);
	if (fDrag != nullptr && under != nullptr && under != target)
		SendMove(under);
}


void
InputHub::Pressed(StackedWindow* under, bool isFirst)
{
	StackedWindow* wasActive = fActive;
	if (isFirst) {
		fPressWindow = fGrabber != nullptr ? fGrabber : under;
		if (under != nullptr && under->style.isMenu)
			fPressWindow = under;
		StackedWindow* blocker = fPressWindow != nullptr ? fStack.BlockerOf(fPressWindow) : nullptr;
		StackedWindow* front = blocker != nullptr ? blocker : fPressWindow;
		if (front != nullptr && fManagesFocus && (front->style.flags & B_AVOID_FRONT) == 0)
			fStack.Raise(front);
		if (front != nullptr && fManagesFocus)
			ActivateLocked(front);
		if (blocker != nullptr) {
			if (fRaiseListener)
				fRaiseListener(blocker);
			fPressWindow = nullptr;
		}
	}
	if (fPressWindow == nullptr)
		return;

	fLastUnder = fPressWindow;
	auto message = MakePointerMessage(B_MOUSE_DOWN, fPressWindow);
	message->AddInt32("clicks", fClicks);
	if (fActive == fPressWindow && fActive != wasActive)
		message->AddBool("be:activates", true);
	fPressWindow->client->Deliver(std::move(message));
}


void
InputHub::Released(StackedWindow* under)
{
	StackedWindow* target = fPressWindow;
	if (fButtons == 0)
		fPressWindow = nullptr;
	if (target != nullptr)
		target->client->Deliver(MakePointerMessage(B_MOUSE_UP, target));
	StackedWindow* menu = OpenMenu();
	if (menu != nullptr && menu != target)
		menu->client->Deliver(MakePointerMessage(B_MOUSE_UP, menu));
	if (fButtons != 0)
		return;

	if (fTracking.has_value()) {
		fTracking.reset();
		OverlayMayHaveChanged();
	}
	FinishDrag(under);
	// The grab of the press has ended: the pointer may be over another window.
	if (under != nullptr && under != target && fGrabber == nullptr) {
		LeaveWindow(under);
		SendMove(under);
	}
}


// The window of the press goes on getting the press's moves and its release; a menu that opened since follows them too.
StackedWindow*
InputHub::OpenMenu() const
{
	return fGrabber != nullptr && fGrabber->style.isMenu ? fGrabber : nullptr;
}


void
InputHub::PointerLeft()
{
	std::lock_guard<std::mutex> lock(fMutex);
	if (fButtons == 0)
		LeaveWindow(nullptr);
}


void
InputHub::Wheel(float deltaX, float deltaY, std::optional<StackedWindow*> known)
{
	std::lock_guard<std::mutex> lock(fMutex);
	fLastInput = system_time();
	StackedWindow* under = Under(known);
	if (under == nullptr || fStack.BlockerOf(under) != nullptr)
		return;

	auto message = MakePointerMessage(B_MOUSE_WHEEL_CHANGED, under);
	message->AddFloat("be:wheel_delta_x", deltaX);
	message->AddFloat("be:wheel_delta_y", deltaY);
	under->client->Deliver(std::move(message));
}


void
InputHub::GetPointer(BPoint* screenWhere, uint32* buttons) const
{
	std::lock_guard<std::mutex> lock(fMutex);
	*screenWhere = fWhere;
	*buttons = fButtons;
}


bigtime_t
InputHub::IdleTime() const
{
	std::lock_guard<std::mutex> lock(fMutex);
	return system_time() - fLastInput;
}

} // namespace BPrivate

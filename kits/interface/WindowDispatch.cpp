// SPDX-License-Identifier: MIT
// BWindow: what the system's messages do, and the hooks behind them.
#include <Window.h>

#include <algorithm>
#include <cstdio>
#include <cstdlib>

#include <Application.h>
#include <Button.h>
#include <MenuBar.h>
#include <MessageQueue.h>
#include <MessageRunner.h>
#include <Messenger.h>
#include <OS.h>

#include "app/LooperPrivate.h"
#include "app/MessagePrivate.h"
#include "display/Canvas.h"
#include "display/HostWindow.h"
#include "interface/MenuTracker.h"
#include "interface/PixelFormat.h"
#include "interface/WholePixels.h"
#include "interface/WindowClient.h"
#include "interface/WindowPrivate.h"

BHandler*
BWindow::ChooseTarget(BMessage* message, BHandler* target, bool preferred)
{
	if (preferred && target == nullptr)
		target = fData->focus != nullptr ? static_cast<BHandler*>(fData->focus) : this;
	return fData->input.TargetFor(message, target);
}


void
BWindow::QueueRanEmpty()
{
}


void
BWindow::DispatchMessage(BMessage* message, BHandler* handler)
{
	if (handler == nullptr)
		return;

	if (!fData->input.Dispatch(message, handler) && !fData->DispatchWindowMessage(message, handler)
		&& !fData->DispatchViewMessage(message, handler))
		BLooper::DispatchMessage(message, handler);
	fData->painter.Present();
}


void
BWindow::MessageReceived(BMessage* message)
{
	BLooper::MessageReceived(message);
}


void
BWindow::FrameMoved(BPoint)
{
}


void
BWindow::FrameResized(float, float)
{
}


void
BWindow::WorkspacesChanged(uint32, uint32)
{
}


void
BWindow::WorkspaceActivated(int32, bool)
{
}


void
BWindow::ScreenChanged(BRect, color_space)
{
}


void
BWindow::WindowActivated(bool)
{
}


void
BWindow::MenusBeginning()
{
}


void
BWindow::MenusEnded()
{
}


namespace BPrivate {

void
ReportMisuse(const char* what, const char* name)
{
	std::fprintf(stderr, "libbe: %s (\"%s\")\n", what, name != nullptr ? name : "");
#ifndef NDEBUG
	std::abort();
#endif
}


WindowData::WindowData(BWindow* window)
	: window(window),
	  input(window),
	  painter(window)
{
}


WindowData::~WindowData() = default;


// Messages to the window itself; they do not reach its MessageReceived().
bool
WindowData::DispatchWindowMessage(BMessage* message, BHandler* handler)
{
	if (handler != window)
		return false;

	switch (message->what) {
		case B_WINDOW_MOVED:
		case B_WINDOW_RESIZED:
			FrameReported(message);
			return true;

		case B_WINDOW_ACTIVATED:
			Activated(message->GetBool("active", false));
			return true;

		case B_MINIMIZE:
			// The host's own button did it already: the hook only hears of it.
			if (message->GetBool(kFromHost, false))
				minimized = message->GetBool("minimize", true);
			window->Minimize(message->GetBool("minimize", true));
			return true;

		case B_ZOOM:
			// The host's own button did it already: the window has the frame, and the hook only hears of it.
			if (message->GetBool(kFromHost, false))
				window->Zoom(frame.LeftTop(), frame.Width(), frame.Height());
			else
				window->Zoom();
			return true;

		case _MENUS_DONE_:
			window->MenusEnded();
			return true;

		case kMsgCanvasOutdated:
			if (painter.HasCanvas())
				painter.MakeCanvas();
			return true;

		case B_SCREEN_CHANGED:
			window->ScreenChanged(message->GetRect("frame", BRect()),
				ColorSpaceOf(message->GetInt32("mode", B_RGB32)));
			return true;

		case B_WORKSPACE_ACTIVATED:
			window->WorkspaceActivated(
				message->GetInt32("workspace", 0), message->GetBool("active", false));
			return true;

		case B_WORKSPACES_CHANGED:
			window->WorkspacesChanged(message->GetInt32("old", 0), message->GetInt32("new", 0));
			return true;

		case B_PULSE:
			if (pulseRunner != nullptr)
				Pulse(topView);
			return true;

		case _UPDATE_:
			painter.Update();
			return true;

		default:
			return false;
	}
}


bool
WindowData::DispatchViewMessage(BMessage* message, BHandler* handler)
{
	if (message->what != B_VIEW_MOVED && message->what != B_VIEW_RESIZED)
		return false;

	BView* view = dynamic_cast<BView*>(handler);
	if (view == nullptr)
		return false;
	if (message->what == B_VIEW_MOVED)
		view->FrameMoved(message->GetPoint("where", B_ORIGIN));
	else
		view->FrameResized(message->GetInt32("width", 0), message->GetInt32("height", 0));
	return true;
}


// A change that the program made is the frame already when its message comes; one that the user made is
// adopted here. A newer report in the queue makes an older one of the user's outdated.
void
WindowData::FrameReported(BMessage* message)
{
	bool fromHost = message->GetBool(kFromHost, false);
	// The window has asked for something else since the host told of this, and is told what comes of that.
	const int32 timesAsked = message->what == B_WINDOW_MOVED ? movesAsked : sizesAsked;
	if (fromHost && message->GetInt32(kTimesAsked, timesAsked) != timesAsked)
		return;
	BMessage* newer = window->MessageQueue()->FindMessage(message->what);
	if (fromHost && newer != nullptr && newer->GetBool(kFromHost, false))
		return;

	if (message->what == B_WINDOW_MOVED) {
		BPoint where;
		if (message->FindPoint("where", &where) != B_OK)
			return;
		if (fromHost) {
			if (where == frame.LeftTop())
				return;
			AdoptFrame(frame.OffsetToCopy(where));
		}
		window->FrameMoved(where);
		return;
	}

	int32 width, height;
	if (message->FindInt32("width", &width) != B_OK
		|| message->FindInt32("height", &height) != B_OK)
		return;
	if (fromHost) {
		if (frame.Size() == BSize(width, height))
			return;
		AdoptFrame(BRect(frame.LeftTop(), BSize(width, height)));
	}
	window->FrameResized(width, height);
	painter.Update();
}


void
WindowData::AdoptFrame(BRect newFrame)
{
	BRect oldBounds = frame.OffsetToCopy(B_ORIGIN);
	frame = newFrame;
	BRect bounds = frame.OffsetToCopy(B_ORIGIN);
	if (bounds == oldBounds)
		return;

	topView->ResizeTo(bounds.Width(), bounds.Height());
	if (painter.HasCanvas())
		painter.MakeCanvas();
}


void
WindowData::PostMoved()
{
	BMessage message(B_WINDOW_MOVED);
	message.AddInt64("when", system_time());
	message.AddPoint("where", frame.LeftTop());
	window->PostMessage(&message);
}


void
WindowData::PostResized()
{
	BMessage message(B_WINDOW_RESIZED);
	message.AddInt64("when", system_time());
	message.AddInt32("width", WholePixels(frame.Width()));
	message.AddInt32("height", WholePixels(frame.Height()));
	window->PostMessage(&message);
}


BSize
WindowData::Limited(float width, float height) const
{
	return BSize(std::max(std::min(width, maxWidth), minWidth),
		std::max(std::min(height, maxHeight), minHeight));
}


void
WindowData::Activated(bool nowActive)
{
	if (active == nowActive)
		return;

	active = nowActive;
	if (!active && openBar != nullptr)
		MenuTracker::End(menuTracker);
	window->WindowActivated(active);
	auto tell = [&](auto& self, BView* view) -> void {
		view->WindowActivated(active);
		for (BView* child = view->fFirstChild; child != nullptr; child = child->fNextSibling)
			self(self, child);
	};
	tell(tell, topView);
}


void
WindowData::SendStyle()
{
	if (host != nullptr)
		host->SetStyle(Style());
}


HostWindowStyle
WindowData::Style() const
{
	HostWindowStyle style;
	style.look = look;
	style.feel = feel;
	style.flags = flags;
	style.isMenu = LooperAccess::Kind(window) == kMenuWindowLooper;
	return style;
}


BView*
WindowData::DefaultButtonView() const
{
	return defaultButton;
}


// The menu bar handles it as its own message: it may open windows, which a key's dispatch must not wait for.
void
WindowData::OpenKeyMenuBar()
{
	window->PostMessage(kMsgOpenMenuBar, keyMenuBar);
}


void
WindowData::ViewAdded(BView* view)
{
	if (view->fEventMask != 0)
		input.EventMaskChanged(view);
	if ((view->fFlags & B_PULSE_NEEDED) != 0)
		UpdatePulse();
}


void
WindowData::ViewRemoved(BView* view)
{
	input.ViewRemoved(view);
}


// The pulse starts with the first view that needs it, and then goes on: it costs a message only.
void
WindowData::UpdatePulse()
{
	if (pulseRate <= 0 || pulseRunner != nullptr)
		return;

	BMessage pulse(B_PULSE);
	pulseRunner = std::make_unique<BMessageRunner>(BMessenger(window), &pulse, pulseRate);
}


void
WindowData::Pulse(BView* view)
{
	if ((view->fFlags & B_PULSE_NEEDED) != 0)
		view->Pulse();
	for (BView* child = view->fFirstChild; child != nullptr; child = child->fNextSibling)
		Pulse(child);
}

} // namespace BPrivate

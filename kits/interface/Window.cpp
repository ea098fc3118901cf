// SPDX-License-Identifier: MIT
// BWindow: its making and ending, its views, visibility and properties.
#include <Window.h>

#include <algorithm>
#include <cmath>

#include <Application.h>
#include <Autolock.h>
#include <Bitmap.h>
#include <Button.h>
#include <MenuBar.h>
#include <Message.h>
#include <MessageRunner.h>
#include <OS.h>

#include "app/LooperPrivate.h"
#include "display/Canvas.h"
#include "display/Display.h"
#include "display/HostWindow.h"
#include "display/PixelBuffer.h"
#include "interface/WindowClient.h"
#include "interface/WindowPrivate.h"

using BPrivate::Display;
using BPrivate::Shortcut;
using BPrivate::ShortcutTarget;
using BPrivate::WindowData;

namespace {

struct TypeParts {
	window_type type;
	window_look look;
	window_feel feel;
};

const TypeParts kTypes[] = {
	{B_TITLED_WINDOW, B_TITLED_WINDOW_LOOK, B_NORMAL_WINDOW_FEEL},
	{B_DOCUMENT_WINDOW, B_DOCUMENT_WINDOW_LOOK, B_NORMAL_WINDOW_FEEL},
	{B_BORDERED_WINDOW, B_BORDERED_WINDOW_LOOK, B_NORMAL_WINDOW_FEEL},
	{B_MODAL_WINDOW, B_MODAL_WINDOW_LOOK, B_MODAL_APP_WINDOW_FEEL},
	{B_FLOATING_WINDOW, B_FLOATING_WINDOW_LOOK, B_FLOATING_APP_WINDOW_FEEL},
};


TypeParts
PartsOf(window_type type)
{
	for (const TypeParts& parts : kTypes) {
		if (parts.type == type)
			return parts;
	}
	return {type, B_TITLED_WINDOW_LOOK, B_NORMAL_WINDOW_FEEL};
}


Shortcut
MakeShortcut(uint32 key, uint32 modifiers, uint32 command, ShortcutTarget target)
{
	Shortcut shortcut;
	shortcut.key = key;
	shortcut.modifiers = modifiers;
	shortcut.message = std::make_unique<BMessage>(command);
	shortcut.target = target;
	return shortcut;
}

} // namespace


BWindow::BWindow(BRect frame, const char* title, window_type type, uint32 flags, uint32 workspace)
	: BWindow(frame, title, PartsOf(type).look, PartsOf(type).feel, flags, workspace)
{
}


BWindow::BWindow(BRect frame, const char* title, window_look look, window_feel feel, uint32 flags,
	uint32 workspace)
	: BLooper(this, title, B_DISPLAY_PRIORITY, B_LOOPER_PORT_DEFAULT_CAPACITY),
	  fData(std::make_unique<WindowData>(this))
{
	Init(frame, title, look, feel, flags, workspace);
	fData->client = std::make_unique<BPrivate::WindowClient>(BPrivate::LooperAccess::Port(this));
	fData->host = Display::Get().MakeWindow(
		fData->frame, fData->title.c_str(), fData->Style(), fData->client.get());
}


BWindow::BWindow(BBitmap* bitmap)
	: BLooper(this, "offscreen bitmap", B_DISPLAY_PRIORITY, B_LOOPER_PORT_DEFAULT_CAPACITY),
	  fData(std::make_unique<WindowData>(this))
{
	BPrivate::LooperAccess::SetKind(this, BPrivate::kOffscreenWindowLooper);
	Init(bitmap->Bounds(), "offscreen bitmap", B_NO_BORDER_WINDOW_LOOK, B_NORMAL_WINDOW_FEEL, 0, 0);
	fData->topView->SetViewColor(B_TRANSPARENT_COLOR);
	fData->isOffscreen = true;
	fData->hideLevel = 0;
	fData->painter.MakeCanvas(bitmap);
}


BWindow::~BWindow()
{
	fData->pulseRunner.reset();
	fData->topView->RemoveSelf();
	delete fData->topView;
	fData->topView = nullptr;
	fData->painter.CloseCanvas();
	fData->host.reset();
}


void
BWindow::Init(BRect frame, const char* title, window_look look, window_feel feel, uint32 flags,
	uint32 workspace)
{
	fData->frame.Set(std::round(frame.left), std::round(frame.top),
		std::round(frame.left) + std::round(frame.Width()),
		std::round(frame.top) + std::round(frame.Height()));
	fData->frameBeforeZoom = fData->frame;
	fData->title = title != nullptr ? title : "";
	fData->look = look;
	fData->feel = feel;
	fData->flags = flags | B_ASYNCHRONOUS_CONTROLS;
	fData->workspaces = workspace;

	fData->topView = new BView(fData->frame.OffsetToCopy(B_ORIGIN), nullptr, B_FOLLOW_ALL, 0);
	fData->topView->fTopLevel = true;
	fData->topView->SetOwner(this);
	fData->topView->CallAttachedHooks();

	BPrivate::ShortcutTable& shortcuts = fData->shortcuts;
	shortcuts.Add(MakeShortcut('x', 0, B_CUT, ShortcutTarget::kFocus));
	shortcuts.Add(MakeShortcut('c', 0, B_COPY, ShortcutTarget::kFocus));
	shortcuts.Add(MakeShortcut('v', 0, B_PASTE, ShortcutTarget::kFocus));
	shortcuts.Add(MakeShortcut('a', 0, B_SELECT_ALL, ShortcutTarget::kFocus));
	if ((flags & B_NOT_CLOSABLE) == 0 && !IsModal())
		shortcuts.Add(MakeShortcut('w', 0, B_QUIT_REQUESTED, ShortcutTarget::kWindow));
}


thread_id
BWindow::Run()
{
	return BLooper::Run();
}


void
BWindow::Quit()
{
	if (!IsLocked()) {
		// The looper says so, and takes the lock.
		BLooper::Quit();
		return;
	}

	while (!IsHidden())
		Hide();
	if ((fData->flags & B_QUIT_ON_WINDOW_CLOSE) != 0 && be_app != nullptr)
		be_app->PostMessage(B_QUIT_REQUESTED);
	BLooper::Quit();
}


bool
BWindow::QuitRequested()
{
	return BLooper::QuitRequested();
}


void
BWindow::AddChild(BView* child, BView* before)
{
	BAutolock lock(this);
	fData->topView->AddChild(child, before);
}


bool
BWindow::RemoveChild(BView* child)
{
	BAutolock lock(this);
	return fData->topView->RemoveChild(child);
}


int32
BWindow::CountChildren() const
{
	BAutolock lock(const_cast<BWindow*>(this));
	return fData->topView->CountChildren();
}


BView*
BWindow::ChildAt(int32 index) const
{
	BAutolock lock(const_cast<BWindow*>(this));
	return fData->topView->ChildAt(index);
}


BView*
BWindow::FindView(const char* viewName) const
{
	BAutolock lock(const_cast<BWindow*>(this));
	return fData->topView->FindView(viewName);
}


BView*
BWindow::FindView(BPoint point) const
{
	BAutolock lock(const_cast<BWindow*>(this));
	return fData->input.ViewAt(point);
}


BView*
BWindow::CurrentFocus() const
{
	return fData->focus;
}


void
BWindow::SetFocus(BView* focus)
{
	fData->focus = focus;
	SetPreferredHandler(focus);
}


void
BWindow::ViewDetached(BView* view)
{
	if (fData->focus == view) {
		view->MakeFocus(false);
		if (fData->focus == view)
			SetFocus(nullptr);
	}
	if (fData->DefaultButtonView() == view)
		SetDefaultButton(nullptr);
	if (fData->keyMenuBar == view)
		SetKeyMenuBar(nullptr);
}


void
BWindow::Show()
{
	if (!Lock())
		return;
	fData->hideLevel--;
	if (fData->hideLevel == 0 && fData->host != nullptr) {
		fData->minimized = false;
		// Most windows of a program that shows none need no pixels.
		if (fData->painter.HasCanvas())
			fData->topView->Invalidate();
		else
			fData->painter.MakeCanvas();
		fData->host->Show();
	}
	bool isRunning = BPrivate::LooperAccess::IsRunning(this);
	Unlock();

	// A window that does not run is still its creator's: Run() gives up that lock.
	if (!isRunning && !fData->isOffscreen)
		Run();
}


void
BWindow::Hide()
{
	if (!Lock())
		return;
	fData->hideLevel++;
	if (fData->hideLevel == 1 && fData->host != nullptr)
		fData->host->Hide();
	Unlock();
}


bool
BWindow::IsHidden() const
{
	return fData->hideLevel > 0;
}


bool
BWindow::IsMinimized() const
{
	return fData->minimized;
}


void
BWindow::Minimize(bool minimize)
{
	if (IsModal() || IsHidden() || fData->minimized == minimize)
		return;

	fData->minimized = minimize;
	if (fData->host != nullptr)
		fData->host->SetMinimized(minimize);
}


void
BWindow::Activate(bool active)
{
	if (IsHidden() || fData->host == nullptr)
		return;
	if (active) {
		// What is in front is to be seen.
		if (fData->minimized) {
			fData->minimized = false;
			fData->host->SetMinimized(false);
		}
		fData->host->Activate();
	} else
		fData->host->Deactivate();
}


bool
BWindow::IsActive() const
{
	return fData->active;
}


bool
BWindow::IsFront() const
{
	return fData->host != nullptr && fData->host->IsFront();
}


status_t
BWindow::SendBehind(const BWindow* window)
{
	if (window == this || fData->host == nullptr)
		return B_BAD_VALUE;

	fData->host->SendBehind(window != nullptr ? window->fData->host.get() : nullptr);
	return B_OK;
}


const char*
BWindow::Title() const
{
	return fData->title.c_str();
}


void
BWindow::SetTitle(const char* title)
{
	fData->title = title != nullptr ? title : "";
	SetName(fData->title.c_str());
	if (BPrivate::LooperAccess::IsRunning(this)) {
		std::string threadName = "w>" + fData->title;
		threadName.resize(std::min<size_t>(threadName.size(), B_OS_NAME_LENGTH - 1));
		rename_thread(Thread(), threadName.c_str());
	}
	if (fData->host != nullptr)
		fData->host->SetTitle(fData->title.c_str());
}


status_t
BWindow::SetType(window_type type)
{
	TypeParts parts = PartsOf(type);
	status_t status = SetLook(parts.look);
	return status == B_OK ? SetFeel(parts.feel) : status;
}


window_type
BWindow::Type() const
{
	for (const TypeParts& parts : kTypes) {
		if (parts.look == fData->look && parts.feel == fData->feel)
			return parts.type;
	}
	return B_UNTYPED_WINDOW;
}


status_t
BWindow::SetLook(window_look look)
{
	fData->look = look;
	fData->SendStyle();
	return B_OK;
}


window_look
BWindow::Look() const
{
	return fData->look;
}


status_t
BWindow::SetFeel(window_feel feel)
{
	fData->feel = feel;
	fData->SendStyle();
	return B_OK;
}


window_feel
BWindow::Feel() const
{
	return fData->feel;
}


status_t
BWindow::SetFlags(uint32 flags)
{
	fData->flags = flags | B_ASYNCHRONOUS_CONTROLS;
	fData->SendStyle();
	return B_OK;
}


uint32
BWindow::Flags() const
{
	return fData->flags;
}


bool
BWindow::IsModal() const
{
	return fData->feel == B_MODAL_SUBSET_WINDOW_FEEL || fData->feel == B_MODAL_APP_WINDOW_FEEL
		|| fData->feel == B_MODAL_ALL_WINDOW_FEEL;
}


bool
BWindow::IsFloating() const
{
	return fData->feel == B_FLOATING_SUBSET_WINDOW_FEEL || fData->feel == B_FLOATING_APP_WINDOW_FEEL
		|| fData->feel == B_FLOATING_ALL_WINDOW_FEEL;
}


status_t
BWindow::AddToSubset(BWindow* window)
{
	bool hasSubset =
		fData->feel == B_MODAL_SUBSET_WINDOW_FEEL || fData->feel == B_FLOATING_SUBSET_WINDOW_FEEL;
	if (window == nullptr || window == this || !hasSubset || window->Feel() != B_NORMAL_WINDOW_FEEL)
		return B_BAD_VALUE;
	if (fData->host != nullptr && window->fData->host != nullptr)
		fData->host->AddToSubset(window->fData->host.get());
	return B_OK;
}


status_t
BWindow::RemoveFromSubset(BWindow* window)
{
	if (window == nullptr)
		return B_BAD_VALUE;
	if (fData->host != nullptr && window->fData->host != nullptr)
		fData->host->RemoveFromSubset(window->fData->host.get());
	return B_OK;
}


// The host shows one workspace: a window is on it, or was asked to be elsewhere too.
uint32
BWindow::Workspaces() const
{
	if (fData->workspaces == B_CURRENT_WORKSPACE)
		return 1u << current_workspace();
	return fData->workspaces;
}


void
BWindow::SetWorkspaces(uint32 workspaces)
{
	uint32 old = Workspaces();
	fData->workspaces = workspaces;
	if (Workspaces() == old)
		return;

	BMessage message(B_WORKSPACES_CHANGED);
	message.AddInt64("when", system_time());
	message.AddInt32("old", old);
	message.AddInt32("new", Workspaces());
	PostMessage(&message);
}


void
BWindow::AddShortcut(uint32 key, uint32 modifiers, BMessage* message)
{
	AddShortcut(key, modifiers, message, this);
}


void
BWindow::AddShortcut(uint32 key, uint32 modifiers, BMessage* message, BHandler* target)
{
	std::unique_ptr<BMessage> owned(message);
	if (message == nullptr)
		return;

	Shortcut shortcut;
	shortcut.key = key;
	shortcut.modifiers = modifiers;
	shortcut.message = std::move(owned);
	if (target == nullptr) {
		shortcut.target = ShortcutTarget::kFocus;
	} else if (target != this) {
		shortcut.target = ShortcutTarget::kHandler;
		shortcut.handlerToken = BPrivate::LooperAccess::Token(target);
	}
	fData->shortcuts.Add(std::move(shortcut));
}


bool
BWindow::HasShortcut(uint32 key, uint32 modifiers)
{
	return fData->shortcuts.Has(key, modifiers);
}


void
BWindow::RemoveShortcut(uint32 key, uint32 modifiers)
{
	fData->shortcuts.Remove(key, modifiers);
}


void
BWindow::SetDefaultButton(BButton* button)
{
	if (fData->defaultButton == button)
		return;

	BButton* old = fData->defaultButton;
	fData->defaultButton = button;
	if (old != nullptr)
		old->MakeDefault(false);
	if (button != nullptr)
		button->MakeDefault(true);
}


BButton*
BWindow::DefaultButton() const
{
	return fData->defaultButton;
}


void
BWindow::SetKeyMenuBar(BMenuBar* bar)
{
	fData->keyMenuBar = bar;
}


BMenuBar*
BWindow::KeyMenuBar() const
{
	return fData->keyMenuBar;
}


void
BWindow::SetPulseRate(bigtime_t rate)
{
	if (rate < 0 || rate == fData->pulseRate)
		return;
	fData->pulseRate = rate;
	fData->pulseRunner.reset();
	fData->UpdatePulse();
}


bigtime_t
BWindow::PulseRate() const
{
	return fData->pulseRate;
}


bool
BWindow::NeedsUpdate() const
{
	return fData->painter.NeedsUpdate();
}


void
BWindow::UpdateIfNeeded()
{
	if (find_thread(nullptr) == Thread())
		fData->painter.Update();
}


void
BWindow::DisableUpdates()
{
	fData->painter.DisableUpdates();
}


void
BWindow::EnableUpdates()
{
	fData->painter.EnableUpdates();
}


// What is drawn in a transaction appears together: nothing is presented before its end.
void
BWindow::BeginViewTransaction()
{
	fData->transactions++;
}


void
BWindow::EndViewTransaction()
{
	if (fData->transactions > 0 && --fData->transactions == 0)
		fData->painter.Present();
}


bool
BWindow::InViewTransaction() const
{
	return fData->transactions > 0;
}


void
BWindow::Flush() const
{
	fData->painter.Present();
}


void
BWindow::Sync() const
{
	fData->painter.Present();
	if (fData->host != nullptr)
		fData->host->Sync();
}

// SPDX-License-Identifier: MIT
// The robot's eyes: windows and views by name, their texts and pictures.
#include <cmath>
#include <cstring>

#include <Control.h>
#include <Menu.h>
#include <MenuItem.h>
#include <OS.h>
#include <StringView.h>
#include <TextControl.h>
#include <TextView.h>
#include <View.h>
#include <Window.h>

#include "app/LooperPrivate.h"
#include "display/Display.h"
#include "display/HostWindow.h"
#include "display/Robot.h"
#include "interface/WindowPrivate.h"

namespace BPrivate {

namespace {

const bigtime_t kRetryTime = 10000;
const bigtime_t kLockTime = 200000;
const bigtime_t kZoomTime = 150000;


bool
TitleMatches(const char* title, const char* wanted)
{
	size_t length = strlen(wanted);
	if (length > 0 && wanted[length - 1] == '*')
		return strncmp(title, wanted, length - 1) == 0;
	return strcmp(title, wanted) == 0;
}


BView*
FindByLabel(BView* view, const char* label)
{
	auto control = dynamic_cast<BControl*>(view);
	if (control != nullptr && control->Label() != nullptr && strcmp(control->Label(), label) == 0
		&& !view->IsHidden())
		return view;
	for (int32 i = 0; i < view->CountChildren(); i++) {
		BView* found = FindByLabel(view->ChildAt(i), label);
		if (found != nullptr)
			return found;
	}
	return nullptr;
}


BView*
FindView(BWindow* window, const char* name)
{
	BView* view = window->FindView(name);
	for (int32 i = 0; view == nullptr && i < window->CountChildren(); i++)
		view = FindByLabel(window->ChildAt(i), name);
	return view;
}


BRect
VisiblePart(BView* view)
{
	BRect frame = view->ConvertToScreen(view->Bounds());
	for (BView* parent = view->Parent(); parent != nullptr; parent = parent->Parent())
		frame = frame & parent->ConvertToScreen(parent->Bounds());
	return frame & view->Window()->Frame();
}


/// The same for the windows of open menus, the last one first.
bool
ForEachMenuWindow(const std::function<bool(BWindow*)>& task)
{
	std::vector<BMessenger> menus = LooperAccess::LoopersOfKind(kMenuWindowLooper, kLockTime);
	for (auto menu = menus.rbegin(); menu != menus.rend(); ++menu) {
		if (menu->LockTargetWithTimeout(kLockTime) != B_OK)
			continue;
		BLooper* looper;
		menu->Target(&looper);
		auto window = dynamic_cast<BWindow*>(looper);
		bool isDone = window != nullptr && !window->IsHidden() && task(window);
		looper->Unlock();
		if (isDone)
			return true;
	}
	return false;
}


/// Calls \a task, window locked, for each window until it returns true. Busy ones are left out.
bool
ForEachWindow(const std::function<bool(BWindow*)>& task)
{
	for (BWindow* window : LooperAccess::Windows()) {
		if (LooperAccess::LockIfThere(window, kLockTime) != B_OK)
			continue;
		bool isDone = task(window);
		window->Unlock();
		if (isDone)
			return true;
	}
	return ForEachMenuWindow(task);
}


/// The item's frame on the screen, as far as the view's menus are in its window.
bool
FindItem(BView* view, const char* label, BRect* frame)
{
	auto menu = dynamic_cast<BMenu*>(view);
	for (int32 i = 0; menu != nullptr && !menu->IsHidden() && i < menu->CountItems(); i++) {
		BMenuItem* item = menu->ItemAt(i);
		if (strcmp(item->Label(), label) != 0)
			continue;
		*frame = menu->ConvertToScreen(item->Frame());
		return true;
	}
	for (int32 i = 0; i < view->CountChildren(); i++) {
		if (FindItem(view->ChildAt(i), label, frame))
			return true;
	}
	return false;
}


bool
TextOf(BView* view, BString* text)
{
	auto string = dynamic_cast<BStringView*>(view);
	auto textView = dynamic_cast<BTextView*>(view);
	auto textControl = dynamic_cast<BTextControl*>(view);
	auto control = dynamic_cast<BControl*>(view);
	const char* found = nullptr;
	if (string != nullptr)
		found = string->Text();
	else if (textView != nullptr)
		found = textView->Text();
	else if (textControl != nullptr)
		found = textControl->Text();
	else if (control != nullptr)
		found = control->Label();
	else
		return false;
	*text = found;
	return true;
}

} // namespace


// #pragma mark - windows and views


status_t
Robot::WaitForWindow(const char* title, BMessenger* window)
{
	bigtime_t end = system_time() + fLimit;
	do {
		bool found = ForEachWindow([&](BWindow* candidate) {
			if (candidate->IsHidden() || !TitleMatches(candidate->Title(), title))
				return false;
			*window = BMessenger(candidate);
			return true;
		});
		if (found) {
			Settle();
			return B_OK;
		}
		Pause(kRetryTime);
	} while (system_time() < end);
	return B_TIMED_OUT;
}


status_t
Robot::WaitForNoWindow(const char* title)
{
	bigtime_t end = system_time() + fLimit;
	do {
		bool found = ForEachWindow([&](BWindow* candidate) {
			return !candidate->IsHidden() && TitleMatches(candidate->Title(), title);
		});
		if (!found)
			return B_OK;
		Pause(kRetryTime);
	} while (system_time() < end);
	return B_TIMED_OUT;
}


std::vector<BString>
Robot::WindowTitles()
{
	std::vector<BString> titles;
	ForEachWindow([&](BWindow* window) {
		if (!window->IsHidden())
			titles.emplace_back(window->Title());
		return false;
	});
	return titles;
}


status_t
Robot::GetItemFrame(const char* label, BRect* frame)
{
	auto find = [&](BWindow* window) {
		for (int32 i = 0; !window->IsHidden() && i < window->CountChildren(); i++) {
			if (FindItem(window->ChildAt(i), label, frame))
				return true;
		}
		return false;
	};
	bigtime_t end = system_time() + fLimit;
	do {
		// The open menus are above the bars.
		if (ForEachMenuWindow(find) || ForEachWindow(find))
			return B_OK;
		Pause(kRetryTime);
	} while (system_time() < end);
	return B_NAME_NOT_FOUND;
}


status_t
Robot::ClickItem(const char* label)
{
	BRect frame;
	status_t status = GetItemFrame(label, &frame);
	if (status != B_OK)
		return status;
	Click(BPoint(
		std::floor((frame.left + frame.right) / 2), std::floor((frame.top + frame.bottom) / 2)));
	return B_OK;
}


status_t
Robot::WithWindow(const BMessenger& window, const std::function<void(BWindow*)>& task)
{
	status_t status = window.LockTargetWithTimeout(fLimit);
	if (status != B_OK)
		return status;
	BLooper* looper;
	window.Target(&looper);
	auto target = dynamic_cast<BWindow*>(looper);
	if (target != nullptr)
		task(target);
	looper->Unlock();
	return target != nullptr ? B_OK : B_BAD_VALUE;
}


status_t
Robot::WithView(const BMessenger& window, const char* name, const std::function<void(BView*)>& task)
{
	bigtime_t end = system_time() + fLimit;
	do {
		bool found = false;
		status_t status = WithWindow(window, [&](BWindow* target) {
			BView* view = FindView(target, name);
			found = view != nullptr;
			if (found)
				task(view);
		});
		if (status != B_OK || found)
			return status;
		Pause(kRetryTime);
	} while (system_time() < end);
	return B_NAME_NOT_FOUND;
}


status_t
Robot::WithHost(const BMessenger& window, const std::function<void(HostWindow&)>& task)
{
	bool hasHost = false;
	status_t status = WithWindow(window, [&](BWindow* target) {
		HostWindow* host = WindowData::Of(target).host.get();
		hasHost = host != nullptr;
		if (hasHost)
			task(*host);
	});
	return status == B_OK && !hasHost ? B_BAD_VALUE : status;
}


/// The host's answer comes in its own time: waits until \a isDone holds for the window.
status_t
Robot::WaitForHost(const BMessenger& window, const std::function<bool(BWindow*)>& isDone)
{
	bool done = false;
	const bigtime_t end = system_time() + fLimit;
	while (!done) {
		status_t status = WithWindow(window, [&](BWindow* target) { done = isDone(target); });
		if (status != B_OK)
			return status;
		if (!done && system_time() > end)
			return B_TIMED_OUT;
		if (!done)
			Pause(kRetryTime);
	}
	Settle();
	return B_OK;
}


status_t
Robot::PlaceWindow(const BMessenger& window, BRect frame)
{
	status_t status = WithHost(window, [frame](HostWindow& host) { host.InjectFrame(frame); });
	if (status != B_OK)
		return status;
	return WaitForHost(window, [frame](BWindow* target) { return target->Frame() == frame; });
}


status_t
Robot::MinimizeWindow(const BMessenger& window, bool minimize)
{
	status_t status =
		WithHost(window, [minimize](HostWindow& host) { host.InjectMinimized(minimize); });
	if (status != B_OK)
		return status;
	return WaitForHost(
		window, [minimize](BWindow* target) { return target->IsMinimized() == minimize; });
}


status_t
Robot::ZoomWindow(const BMessenger& window)
{
	BRect before;
	status_t status = GetWindowFrame(window, &before);
	if (status == B_OK)
		status = WithHost(window, [](HostWindow& host) { host.InjectZoom(); });
	if (status != B_OK)
		return status;
	status = WaitForHost(window, [before](BWindow* target) { return target->Frame() != before; });
	// The window hears of the button after the frame.
	Pause(kZoomTime);
	Settle();
	return status;
}


status_t
Robot::GetWindowFrame(const BMessenger& window, BRect* frame)
{
	return WithWindow(window, [&](BWindow* target) { *frame = target->Frame(); });
}


status_t
Robot::GetViewFrame(const BMessenger& window, const char* name, BRect* frame)
{
	return WithView(window, name, [&](BView* view) { *frame = VisiblePart(view); });
}


status_t
Robot::ClickView(const BMessenger& window, const char* name, int32 count)
{
	BRect frame;
	status_t status = GetViewFrame(window, name, &frame);
	if (status != B_OK)
		return status;
	if (!frame.IsValid())
		return B_BAD_VALUE;
	Click(BPoint((frame.left + frame.right) / 2, (frame.top + frame.bottom) / 2), count);
	return B_OK;
}


// #pragma mark - what came of it


status_t
Robot::GetText(const BMessenger& window, const char* name, BString* text)
{
	bool hasText = false;
	status_t status = WithView(window, name, [&](BView* view) { hasText = TextOf(view, text); });
	return status == B_OK && !hasText ? B_BAD_TYPE : status;
}


status_t
Robot::GetValue(const BMessenger& window, const char* name, int32* value)
{
	bool hasValue = false;
	status_t status = WithView(window, name, [&](BView* view) {
		auto control = dynamic_cast<BControl*>(view);
		hasValue = control != nullptr;
		if (hasValue)
			*value = control->Value();
	});
	return status == B_OK && !hasValue ? B_BAD_TYPE : status;
}


status_t
Robot::WaitForText(const BMessenger& window, const char* name, const char* text, BString* found)
{
	bigtime_t end = system_time() + fLimit;
	do {
		status_t status = GetText(window, name, found);
		if (status != B_OK || *found == text)
			return status;
		Pause(kRetryTime);
	} while (system_time() < end);
	return B_TIMED_OUT;
}


status_t
Robot::ReadWindow(const BMessenger& window, Picture* picture)
{
	status_t status = WithWindow(window, [&](BWindow* target) {
		HostWindow* host = WindowData::Of(target).host.get();
		if (host != nullptr)
			*picture = host->ReadPicture();
	});
	return status == B_OK && picture->pixels.empty() ? B_UNSUPPORTED : status;
}


status_t
Robot::SaveWindow(const BMessenger& window, const char* path)
{
	Picture picture;
	status_t status = ReadWindow(window, &picture);
	return status == B_OK ? Display::Get().SavePicture(picture, path) : status;
}

} // namespace BPrivate

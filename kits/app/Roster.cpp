// SPDX-License-Identifier: MIT
// Which applications run: this program's own. See RosterLaunch.cpp for starting others.

#include <Roster.h>

#include <algorithm>
#include <cstring>
#include <mutex>
#include <optional>
#include <vector>

#include <climits>
#include <unistd.h>

#include <List.h>
#include <Message.h>
#include <Messenger.h>

#include "app/Delivery.h"
#include "app/MessagePrivate.h"
#include "app/RosterPrivate.h"

namespace {

struct Watcher {
	BMessenger target;
	uint32 events;
};


/// What is known. Made at the first use, never deleted.
struct RosterState {
	std::mutex mutex;
	std::optional<app_info> application;
	bool active = false;
	std::vector<Watcher> watchers;
};


RosterState&
State()
{
	static RosterState* state = new RosterState;
	return *state;
}


std::optional<app_info>
RunningApplication()
{
	std::lock_guard<std::mutex> lock(State().mutex);
	return State().application;
}


bool
HasSignature(const app_info& info, const char* signature)
{
	return strcasecmp(info.signature, signature) == 0;
}


/// Tells the watchers of \a event about the application.
void
Notify(uint32 what, uint32 event, const app_info& info)
{
	std::vector<Watcher> watchers;
	{
		std::lock_guard<std::mutex> lock(State().mutex);
		watchers = State().watchers;
	}
	BMessage message(what);
	message.AddString("be:signature", info.signature);
	message.AddInt32("be:team", info.team);
	message.AddInt32("be:thread", info.thread);
	message.AddInt32("be:flags", int32(info.flags));
	message.AddRef("be:ref", &info.ref);
	for (const Watcher& watcher : watchers) {
		if ((watcher.events & event) != 0)
			watcher.target.SendMessage(&message);
	}
}


BRoster sRoster;

} // namespace

const BRoster* be_roster = &sRoster;


app_info::app_info()
	: thread(-1),
	  team(-1),
	  port(-1),
	  flags(B_SINGLE_LAUNCH)
{
	signature[0] = '\0';
}


app_info::~app_info() {}


void
BPrivate::RegisterApplication(const char* signature, thread_id thread, port_id port)
{
	app_info info;
	info.thread = thread;
	info.team = ThisTeam();
	info.port = port;
	strncpy(info.signature, signature, B_MIME_TYPE_LENGTH - 1);
	info.signature[B_MIME_TYPE_LENGTH - 1] = '\0';
	char path[PATH_MAX];
	ssize_t length = readlink("/proc/self/exe", path, sizeof(path) - 1);
	if (length > 0) {
		path[length] = '\0';
		get_ref_for_path(path, &info.ref);
	}
	{
		std::lock_guard<std::mutex> lock(State().mutex);
		State().application = info;
		State().active = false;
	}
	Notify(B_SOME_APP_LAUNCHED, B_REQUEST_LAUNCHED, info);
}


void
BPrivate::UnregisterApplication()
{
	std::optional<app_info> info = RunningApplication();
	if (!info.has_value())
		return;
	{
		std::lock_guard<std::mutex> lock(State().mutex);
		State().application.reset();
		State().active = false;
	}
	Notify(B_SOME_APP_QUIT, B_REQUEST_QUIT, *info);
}


void
BPrivate::SetApplicationActive(bool active)
{
	{
		std::lock_guard<std::mutex> lock(State().mutex);
		if (active == State().active)
			return;
		State().active = active;
	}
	std::optional<app_info> info = RunningApplication();
	if (active && info.has_value())
		Notify(B_SOME_APP_ACTIVATED, B_REQUEST_ACTIVATED, *info);
}


BRoster::BRoster() {}


BRoster::~BRoster() {}


bool
BRoster::IsRunning(const char* signature) const
{
	return TeamFor(signature) >= 0;
}


bool
BRoster::IsRunning(entry_ref* ref) const
{
	return TeamFor(ref) >= 0;
}


team_id
BRoster::TeamFor(const char* signature) const
{
	app_info info;
	status_t status = GetAppInfo(signature, &info);
	return status == B_OK ? info.team : status;
}


team_id
BRoster::TeamFor(entry_ref* ref) const
{
	app_info info;
	status_t status = GetAppInfo(ref, &info);
	return status == B_OK ? info.team : status;
}


void
BRoster::GetAppList(BList* teamIDList) const
{
	std::optional<app_info> info = RunningApplication();
	if (teamIDList != nullptr && info.has_value())
		teamIDList->AddItem(reinterpret_cast<void*>(intptr_t(info->team)));
}


void
BRoster::GetAppList(const char* signature, BList* teamIDList) const
{
	if (signature != nullptr && IsRunning(signature))
		GetAppList(teamIDList);
}


status_t
BRoster::GetAppInfo(const char* signature, app_info* info) const
{
	if (signature == nullptr || info == nullptr)
		return B_BAD_VALUE;

	std::optional<app_info> running = RunningApplication();
	if (!running.has_value() || !HasSignature(*running, signature))
		return B_ERROR;
	*info = *running;
	return B_OK;
}


status_t
BRoster::GetAppInfo(entry_ref* ref, app_info* info) const
{
	if (ref == nullptr || info == nullptr)
		return B_BAD_VALUE;

	std::optional<app_info> running = RunningApplication();
	if (!running.has_value() || running->ref != *ref)
		return B_ERROR;
	*info = *running;
	return B_OK;
}


status_t
BRoster::GetRunningAppInfo(team_id team, app_info* info) const
{
	if (info == nullptr)
		return B_BAD_VALUE;

	std::optional<app_info> running = RunningApplication();
	if (!running.has_value() || running->team != team)
		return B_BAD_TEAM_ID;
	*info = *running;
	return B_OK;
}


status_t
BRoster::GetActiveAppInfo(app_info* info) const
{
	if (info == nullptr)
		return B_BAD_VALUE;

	std::lock_guard<std::mutex> lock(State().mutex);
	if (!State().application.has_value() || !State().active)
		return B_ERROR;
	*info = *State().application;
	return B_OK;
}


status_t
BRoster::Broadcast(BMessage* message) const
{
	return Broadcast(message, BMessenger());
}


status_t
BRoster::Broadcast(BMessage* message, BMessenger replyTo) const
{
	if (message == nullptr)
		return B_BAD_VALUE;
	BMessenger application = BPrivate::MessengerFor(BPrivate::ApplicationAddress());
	return application.IsValid() ? application.SendMessage(message, replyTo) : B_OK;
}


status_t
BRoster::StartWatching(BMessenger target, uint32 eventMask) const
{
	if (!target.IsValid())
		return B_BAD_VALUE;

	StopWatching(target);
	std::lock_guard<std::mutex> lock(State().mutex);
	State().watchers.push_back({target, eventMask});
	return B_OK;
}


status_t
BRoster::StopWatching(BMessenger target) const
{
	std::lock_guard<std::mutex> lock(State().mutex);
	std::vector<Watcher>& watchers = State().watchers;
	auto found = std::find_if(watchers.begin(), watchers.end(),
		[&](const Watcher& watcher) { return watcher.target == target; });
	if (found == watchers.end())
		return B_BAD_VALUE;
	watchers.erase(found);
	return B_OK;
}


status_t
BRoster::ActivateApp(team_id team) const
{
	// Other programs' windows are the host's; the own ones are activated one by one.
	std::optional<app_info> running = RunningApplication();
	return running.has_value() && running->team == team ? B_NOT_SUPPORTED : B_BAD_TEAM_ID;
}

// SPDX-License-Identifier: MIT
// Which applications run and how to start one.

#ifndef _ROSTER_H
#define _ROSTER_H

#include <Entry.h>
#include <OS.h>
#include <StorageDefs.h>
#include <SupportDefs.h>

class BList;
class BMessage;
class BMessenger;


/// A running application. \a ref is its program file.
struct app_info {
	app_info();
	~app_info();

	thread_id thread;
	team_id team;
	port_id port;
	uint32 flags;
	entry_ref ref;
	char signature[B_MIME_TYPE_LENGTH];
};

/// How often a program runs, and more, in app_info::flags.
#define B_SINGLE_LAUNCH (0x0)
#define B_MULTIPLE_LAUNCH (0x1)
#define B_EXCLUSIVE_LAUNCH (0x2)
#define B_LAUNCH_MASK (0x3)
#define B_BACKGROUND_APP (0x4)
#define B_ARGV_ONLY (0x8)

/// What StartWatching() reports.
enum watching_request_flags {
	B_REQUEST_LAUNCHED = 0x00000001,
	B_REQUEST_QUIT = 0x00000002,
	B_REQUEST_ACTIVATED = 0x00000004
};

/// The reports: "be:signature" (string), "be:team", "be:thread", "be:flags" (int32), "be:ref" (entry_ref).
enum { B_SOME_APP_LAUNCHED = 'BRAS', B_SOME_APP_QUIT = 'BRAQ', B_SOME_APP_ACTIVATED = 'BRAW' };


/// Knows this program once it has an application object; other programs are not seen. Any thread.
class BRoster {
public:
	BRoster();
	~BRoster();

	bool IsRunning(const char* signature) const;
	bool IsRunning(entry_ref* ref) const;
	/// The team, B_ERROR when no such application runs.
	team_id TeamFor(const char* signature) const;
	team_id TeamFor(entry_ref* ref) const;
	/// Adds the teams as (void*)(addr_t)team.
	void GetAppList(BList* teamIDList) const;
	void GetAppList(const char* signature, BList* teamIDList) const;

	/// B_OK; B_ERROR when it does not run; B_BAD_VALUE for a null argument. The team's form: B_BAD_TEAM_ID.
	status_t GetAppInfo(const char* signature, app_info* info) const;
	status_t GetAppInfo(entry_ref* ref, app_info* info) const;
	status_t GetRunningAppInfo(team_id team, app_info* info) const;
	status_t GetActiveAppInfo(app_info* info) const;

	/// The program for a signature, or the one that is or opens a file. B_LAUNCH_FAILED_NO_PREFERRED_APP for a type
	/// without one, B_LAUNCH_FAILED_APP_NOT_FOUND for an unknown signature.
	status_t FindApp(const char* mimeType, entry_ref* app) const;
	status_t FindApp(entry_ref* ref, entry_ref* app) const;

	/// Sends to every running application. The reply goes to the application, or to \a replyTo.
	status_t Broadcast(BMessage* message) const;
	status_t Broadcast(BMessage* message, BMessenger replyTo) const;

	status_t StartWatching(
		BMessenger target, uint32 eventMask = B_REQUEST_LAUNCHED | B_REQUEST_QUIT) const;
	status_t StopWatching(BMessenger target) const;

	/// B_NOT_SUPPORTED for this program: activate a window instead. B_BAD_TEAM_ID for others.
	status_t ActivateApp(team_id team) const;

	/// Starts a program, or hands the message or arguments to this one when it is the one asked for and not
	/// B_MULTIPLE_LAUNCH (then B_ALREADY_RUNNING). Of the messages a new program can be given files only
	/// (B_REFS_RECEIVED); others give B_NOT_SUPPORTED and start nothing.
	status_t Launch(
		const char* mimeType, BMessage* initialMessage = NULL, team_id* _appTeam = NULL) const;
	status_t Launch(const char* mimeType, BList* messageList, team_id* _appTeam = NULL) const;
	status_t Launch(
		const char* mimeType, int argc, const char* const* args, team_id* _appTeam = NULL) const;
	status_t Launch(const entry_ref* ref, const BMessage* initialMessage = NULL,
		team_id* _appTeam = NULL) const;
	status_t Launch(const entry_ref* ref, const BList* messageList, team_id* _appTeam = NULL) const;
	status_t Launch(
		const entry_ref* ref, int argc, const char* const* args, team_id* _appTeam = NULL) const;
};

/// The roster; valid at any time.
extern const BRoster* be_roster;

#endif // _ROSTER_H

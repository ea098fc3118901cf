// SPDX-License-Identifier: MIT
// Finding and starting programs.

#include <Roster.h>

#include <cstdlib>
#include <cstring>
#include <string>
#include <thread>
#include <vector>

#include <spawn.h>
#include <sys/stat.h>
#include <sys/wait.h>
#include <unistd.h>

#include <AppDefs.h>
#include <List.h>
#include <Message.h>
#include <Messenger.h>
#include <Path.h>

#include "app/Delivery.h"
#include "app/MessagePrivate.h"
#include "app/StartArguments.h"

extern char** environ;


namespace {

/// What a program is started with: arguments, or files to open, or nothing.
struct LaunchRequest {
	std::vector<std::string> arguments;
	std::vector<const BMessage*> messages;
};


/// Adds the paths of the files that \a message is to open. B_NOT_SUPPORTED when it is not about files.
status_t
AddFiles(const BMessage& message, std::vector<std::string>* files)
{
	if (message.what != B_REFS_RECEIVED)
		return B_NOT_SUPPORTED;

	entry_ref ref;
	for (int32 i = 0; message.FindRef("refs", i, &ref) == B_OK; i++) {
		BPath path(&ref);
		if (path.InitCheck() != B_OK)
			return path.InitCheck();
		files->push_back(path.Path());
	}
	return B_OK;
}


/// Hands \a request to this program's own application.
status_t
DeliverToOwn(const char* path, const LaunchRequest& request)
{
	BMessenger application = BPrivate::MessengerFor(BPrivate::ApplicationAddress());
	for (const BMessage* message : request.messages) {
		BMessage copy(*message);
		application.SendMessage(&copy);
	}
	if (!request.arguments.empty()) {
		std::vector<const char*> argv{path};
		for (const std::string& argument : request.arguments)
			argv.push_back(argument.c_str());
		BMessage message;
		BPrivate::MakeArgvMessage(int(argv.size()), argv.data(), &message);
		application.SendMessage(&message);
	}
	return B_ALREADY_RUNNING;
}


status_t
StartProgram(const std::string& path, const LaunchRequest& request, team_id* team)
{
	std::vector<std::string> arguments = request.arguments;
	for (const BMessage* message : request.messages) {
		status_t status = AddFiles(*message, &arguments);
		if (status != B_OK)
			return status;
	}

	std::vector<char*> argv{const_cast<char*>(path.c_str())};
	for (const std::string& argument : arguments)
		argv.push_back(const_cast<char*>(argument.c_str()));
	argv.push_back(nullptr);

	std::string mark = std::string(BPrivate::kArgumentsAreFiles) + "=1";
	std::vector<char*> environment;
	for (char** variable = environ; *variable != nullptr; variable++)
		environment.push_back(*variable);
	if (!request.messages.empty())
		environment.push_back(mark.data());
	environment.push_back(nullptr);

	pid_t child;
	if (posix_spawn(&child, path.c_str(), nullptr, nullptr, argv.data(), environment.data()) != 0)
		return B_LAUNCH_FAILED_EXECUTABLE;

	// The host keeps an ended program until somebody asks for its result.
	std::thread([child] { waitpid(child, nullptr, 0); }).detach();
	if (team != nullptr)
		*team = child;
	return B_OK;
}


status_t
LaunchRef(const entry_ref* ref, const LaunchRequest& request, team_id* team)
{
	if (ref == nullptr)
		return B_BAD_VALUE;

	// A file that is no program is opened by the program for it.
	entry_ref document(*ref);
	entry_ref program;
	status_t status = be_roster->FindApp(&document, &program);
	if (status != B_OK)
		return status;
	BPath path(&program);
	if (path.InitCheck() != B_OK)
		return path.InitCheck();

	app_info own;
	if (be_roster->GetAppInfo(&program, &own) == B_OK) {
		if (team != nullptr)
			*team = own.team;
		return DeliverToOwn(path.Path(), request);
	}
	return StartProgram(path.Path(), request, team);
}


status_t
LaunchType(const char* mimeType, const LaunchRequest& request, team_id* team)
{
	entry_ref program;
	status_t status = be_roster->FindApp(mimeType, &program);
	return status == B_OK ? LaunchRef(&program, request, team) : status;
}


LaunchRequest
RequestFor(const BMessage* message)
{
	LaunchRequest request;
	if (message != nullptr)
		request.messages.push_back(message);
	return request;
}


LaunchRequest
RequestFor(const BList* messages)
{
	LaunchRequest request;
	for (int32 i = 0; messages != nullptr && i < messages->CountItems(); i++)
		request.messages.push_back(static_cast<const BMessage*>(messages->ItemAt(i)));
	return request;
}


LaunchRequest
RequestFor(int argc, const char* const* args)
{
	LaunchRequest request;
	for (int i = 0; args != nullptr && i < argc; i++)
		request.arguments.emplace_back(args[i] != nullptr ? args[i] : "");
	return request;
}

} // namespace


status_t
BRoster::FindApp(const char* mimeType, entry_ref* app) const
{
	if (mimeType == nullptr || app == nullptr)
		return B_BAD_VALUE;

	app_info info;
	if (GetAppInfo(mimeType, &info) == B_OK) {
		*app = info.ref;
		return B_OK;
	}
	return strncasecmp(mimeType, "application/", strlen("application/")) == 0
		? B_LAUNCH_FAILED_APP_NOT_FOUND
		: B_LAUNCH_FAILED_NO_PREFERRED_APP;
}


status_t
BRoster::FindApp(entry_ref* ref, entry_ref* app) const
{
	if (ref == nullptr || app == nullptr)
		return B_BAD_VALUE;

	BPath path(ref);
	if (path.InitCheck() != B_OK)
		return path.InitCheck();
	struct stat information;
	if (stat(path.Path(), &information) != 0)
		return B_ENTRY_NOT_FOUND;
	if (!S_ISREG(information.st_mode) || access(path.Path(), X_OK) != 0)
		return B_LAUNCH_FAILED_NO_PREFERRED_APP;
	*app = *ref;
	return B_OK;
}


status_t
BRoster::Launch(const char* mimeType, BMessage* initialMessage, team_id* _appTeam) const
{
	return LaunchType(mimeType, RequestFor(initialMessage), _appTeam);
}


status_t
BRoster::Launch(const char* mimeType, BList* messageList, team_id* _appTeam) const
{
	return LaunchType(mimeType, RequestFor(messageList), _appTeam);
}


status_t
BRoster::Launch(const char* mimeType, int argc, const char* const* args, team_id* _appTeam) const
{
	return LaunchType(mimeType, RequestFor(argc, args), _appTeam);
}


status_t
BRoster::Launch(const entry_ref* ref, const BMessage* initialMessage, team_id* _appTeam) const
{
	return LaunchRef(ref, RequestFor(initialMessage), _appTeam);
}


status_t
BRoster::Launch(const entry_ref* ref, const BList* messageList, team_id* _appTeam) const
{
	return LaunchRef(ref, RequestFor(messageList), _appTeam);
}


status_t
BRoster::Launch(const entry_ref* ref, int argc, const char* const* args, team_id* _appTeam) const
{
	return LaunchRef(ref, RequestFor(argc, args), _appTeam);
}

// SPDX-License-Identifier: MIT

#include "palette/LibraryTrial.h"

#include <signal.h>
#include <spawn.h>
#include <sys/stat.h>
#include <sys/wait.h>

#include <cstring>

#include <Application.h>
#include <Entry.h>
#include <File.h>
#include <FindDirectory.h>
#include <OS.h>
#include <Path.h>
#include <Roster.h>

#include "app/ReplacementFile.h"

#include <fcntl.h>
#include <unistd.h>

extern char** environ;

namespace {

constexpr uint32 kRecordCode = 'glib';
constexpr const char* kRecordName = "Plim_Libraries";
// The field of the record for the program that tried the libraries. All others are paths, which begin with "/".
constexpr const char* kTriedBy = "tried by";

constexpr bigtime_t kPatience = 20 * 1000000;
constexpr bigtime_t kPause = 1000;

/// A library that is being tried.
struct trial {
	std::string path;
	pid_t process;
};


/// What changes when the file does; "" without a file.
std::string
StampOf(const char* path)
{
	struct stat info;
	if (stat(path, &info) != 0)
		return "";
	std::string stamp;
	for (const int64 number : {int64(info.st_mtim.tv_sec), int64(info.st_mtim.tv_nsec),
			 int64(info.st_size), int64(info.st_ino)})
		stamp += std::to_string(number) + " ";
	return stamp;
}


bool
IsObjectFile(const char* path)
{
	char start[4];
	BFile file(path, B_READ_ONLY);
	return file.Read(start, sizeof(start)) == static_cast<ssize_t>(sizeof(start))
		&& memcmp(start, "\177ELF", sizeof(start)) == 0;
}


/// Starts \a program on \a path, with nothing to read and nobody to tell; -1 when it cannot be started.
pid_t
Start(const std::string& program, const std::string& path)
{
	posix_spawn_file_actions_t actions;
	posix_spawn_file_actions_init(&actions);
	for (const int stream : {STDIN_FILENO, STDOUT_FILENO, STDERR_FILENO})
		posix_spawn_file_actions_addopen(&actions, stream, "/dev/null", O_RDWR, 0);
	char* const arguments[] = {
		const_cast<char*>(program.c_str()), const_cast<char*>(path.c_str()), nullptr};
	pid_t process = -1;
	if (posix_spawn(&process, program.c_str(), &actions, nullptr, arguments, environ) != 0)
		process = -1;
	posix_spawn_file_actions_destroy(&actions);
	return process;
}


/// Waits for \a process until \a end and ends it then. False when it did not end by itself.
bool
WaitFor(pid_t process, bigtime_t end, int* status)
{
	while (waitpid(process, status, WNOHANG) == 0) {
		if (system_time() > end) {
			kill(process, SIGKILL);
			waitpid(process, status, 0);
			return false;
		}
		snooze(kPause);
	}
	return true;
}


std::string
ProgramBesideThis(const char* name)
{
	app_info info;
	if (be_app == nullptr || be_app->GetAppInfo(&info) != B_OK)
		return "";
	BEntry folder;
	BPath path;
	if (BEntry(&info.ref).GetParent(&folder) != B_OK || folder.GetPath(&path) != B_OK
		|| path.Append(name) != B_OK)
		return "";
	return path.Path();
}


std::string
RecordInTheCache()
{
	BPath path;
	if (find_directory(B_USER_CACHE_DIRECTORY, &path, true) != B_OK
		|| path.Append(kRecordName) != B_OK)
		return "";
	return path.Path();
}

} // namespace

TLibraryTrial::TLibraryTrial(const char* program, const char* record)
	: fProgram(access(program, X_OK) == 0 ? program : ""),
	  fRecord(record),
	  fPatience(kPatience),
	  fGood(kRecordCode)
{
	ReadRecord();
}


TLibraryTrial::TLibraryTrial()
	: TLibraryTrial(ProgramBesideThis("plimcheck").c_str(), RecordInTheCache().c_str())
{
}


void
TLibraryTrial::TryAll(const std::vector<std::string>& paths)
{
	if (fProgram.empty())
		return;

	std::vector<trial> trials;
	for (const std::string& path : paths) {
		const char* stamp;
		const bool isKnown = fGood.FindString(path.c_str(), &stamp) == B_OK
			&& !StampOf(path.c_str()).empty() && StampOf(path.c_str()) == stamp;
		if (isKnown || !IsObjectFile(path.c_str()))
			continue;
		const pid_t process = Start(fProgram, path);
		if (process >= 0)
			trials.push_back({path, process});
	}

	const bigtime_t end = system_time() + fPatience;
	std::vector<std::string> good;
	for (const trial& tried : trials) {
		int status = 0;
		if (!WaitFor(tried.process, end, &status))
			fDangerous[tried.path] = "it did not come to an end when it was tried";
		else if (WIFSIGNALED(status))
			fDangerous[tried.path] =
				"it crashed when it was tried (" + std::string(strsignal(WTERMSIG(status))) + ")";
		else if (WIFEXITED(status) && WEXITSTATUS(status) == 0)
			good.push_back(tried.path);
	}
	if (!good.empty())
		WriteRecord(good);
}


bool
TLibraryTrial::IsSafe(const char* path, std::string* reason) const
{
	const auto found = fDangerous.find(path);
	if (found == fDangerous.end())
		return true;
	*reason = found->second;
	return false;
}


void
TLibraryTrial::ReadRecord()
{
	BFile file(fRecord.c_str(), B_READ_ONLY);
	const char* triedBy;
	if (file.InitCheck() == B_OK && fGood.Unflatten(&file) == B_OK && fGood.what == kRecordCode
		&& fGood.FindString(kTriedBy, &triedBy) == B_OK && StampOf(fProgram.c_str()) == triedBy)
		return;
	// By another designer: what it could use may be of no use here.
	fGood.MakeEmpty();
	fGood.what = kRecordCode;
	fGood.AddString(kTriedBy, StampOf(fProgram.c_str()).c_str());
}


/// Remembers \a paths. A record that cannot be written costs a trial at the next start, and nothing else.
void
TLibraryTrial::WriteRecord(const std::vector<std::string>& paths)
{
	for (const std::string& path : paths) {
		fGood.RemoveName(path.c_str());
		fGood.AddString(path.c_str(), StampOf(path.c_str()).c_str());
	}
	TReplacementFile file(fRecord.c_str(), REPLACE_UNSYNCED);
	if (file.InitCheck() == B_OK && fGood.Flatten(file.Stream()) == B_OK)
		file.Replace();
}

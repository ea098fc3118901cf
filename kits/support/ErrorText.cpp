// SPDX-License-Identifier: MIT
// strerror() for status codes. The platform's own knows them; this host's only knows the errno numbers.

#include <string.h>

#include <Errors.h>

#include "support/HostError.h"

namespace {

struct ErrorText {
	status_t status;
	const char* text;
};

// Those that no errno number stands for.
constexpr ErrorText kTexts[] = {
	{B_ERROR, "General error"},
	{B_BAD_INDEX, "Index not in range"},
	{B_BAD_TYPE, "Bad type"},
	{B_MISMATCHED_VALUES, "Values do not match"},
	{B_NAME_NOT_FOUND, "Name not found"},
	{B_NAME_IN_USE, "Name in use"},
	{B_CANCELED, "Operation canceled"},
	{B_NO_INIT, "Not initialized"},
	{B_BAD_DATA, "Bad data"},
	{B_DONT_DO_THAT, "Operation makes no sense"},
	{B_BAD_SEM_ID, "Bad semaphore ID"},
	{B_NO_MORE_SEMS, "No more semaphores"},
	{B_BAD_THREAD_ID, "Bad thread ID"},
	{B_NO_MORE_THREADS, "No more threads"},
	{B_BAD_THREAD_STATE, "Thread is in the wrong state"},
	{B_BAD_TEAM_ID, "Bad team ID"},
	{B_NO_MORE_TEAMS, "No more teams"},
	{B_BAD_PORT_ID, "Bad port ID"},
	{B_NO_MORE_PORTS, "No more ports"},
	{B_BAD_IMAGE_ID, "Bad image ID"},
	{B_MISSING_SYMBOL, "Symbol not found"},
	{B_UNKNOWN_EXECUTABLE, "Unknown kind of executable"},
	{B_LEGACY_EXECUTABLE, "Executable of an old system"},
	{B_DEBUGGER_ALREADY_INSTALLED, "There is a debugger already"},
	{B_BAD_REPLY, "Bad reply"},
	{B_DUPLICATE_REPLY, "Message was replied to already"},
	{B_MESSAGE_TO_SELF, "Message to its own sender"},
	{B_BAD_HANDLER, "Bad handler"},
	{B_ALREADY_RUNNING, "Already running"},
	{B_LAUNCH_FAILED, "Launch failed"},
	{B_AMBIGUOUS_APP_LAUNCH, "Several applications could be launched"},
	{B_UNKNOWN_MIME_TYPE, "Unknown MIME type"},
	{B_BAD_SCRIPT_SYNTAX, "Bad scripting syntax"},
	{B_LAUNCH_FAILED_NO_RESOLVE_LINK, "Launch failed: the link leads nowhere"},
	{B_LAUNCH_FAILED_EXECUTABLE, "Launch failed: the file is no application"},
	{B_LAUNCH_FAILED_APP_NOT_FOUND, "Launch failed: application not found"},
	{B_LAUNCH_FAILED_APP_IN_TRASH, "Launch failed: the application is in the trash"},
	{B_LAUNCH_FAILED_NO_PREFERRED_APP, "Launch failed: the type has no application"},
	{B_LAUNCH_FAILED_FILES_APP_NOT_FOUND, "Launch failed: the file's application was not found"},
	{B_BAD_MIME_SNIFFER_RULE, "Bad MIME sniffer rule"},
	{B_NOT_A_MESSAGE, "Not a message"},
	{B_SHUTDOWN_CANCELLED, "Shutdown canceled"},
	{B_SHUTTING_DOWN, "The system is shutting down"},
	{B_TRANSLATION_BASE_ERROR, "Translation failed"},
	{B_NO_TRANSLATOR, "No translator found"},
	{B_ILLEGAL_DATA, "Data cannot be translated"},
	{B_UNSUPPORTED, "Not supported by the file system"},
	{B_PARTITION_TOO_SMALL, "Partition too small"},
	{B_PARTIAL_READ, "Read less than asked for"},
	{B_PARTIAL_WRITE, "Wrote less than asked for"},
	{B_POSIX_ENOMEM, "Out of memory"},
	{B_NO_PRINT_SERVER, "No print server"},
};


/// The host's text for one of its own numbers. Valid until the thread asks for the next one.
char*
HostText(int error)
{
	static thread_local char sUnknown[64];
	return strerror_r(error, sUnknown, sizeof(sUnknown));
}

} // namespace


// In the place of the C library's, for everything that is linked with the kits: status codes and the host's errno
// numbers have no value in common but 0.
extern "C" char*
strerror(int error) noexcept
{
	for (const ErrorText& each : kTexts) {
		if (each.status == error)
			return const_cast<char*>(each.text);
	}
	const int host = BPrivate::host_errno(error);
	return HostText(host != 0 ? host : error);
}

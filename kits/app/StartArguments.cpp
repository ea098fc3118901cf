// SPDX-License-Identifier: MIT
// What the program was started with.

#include "app/StartArguments.h"

#include <climits>
#include <cstdlib>

#include <unistd.h>

#include <AppDefs.h>
#include <Entry.h>
#include <Message.h>

// The C library's own array: a program that takes options out of it keeps them from the application object.
static char** sArguments = nullptr;


// The C library hands the arguments of main() to every constructor function.
__attribute__((constructor)) static void
KeepArguments(int, char** argv, char**)
{
	sArguments = argv;
}


void
BPrivate::MakeArgvMessage(int argc, const char* const* argv, BMessage* message)
{
	message->MakeEmpty();
	message->what = B_ARGV_RECEIVED;
	message->AddInt32("argc", argc);
	for (int i = 0; i < argc; i++)
		message->AddString("argv", argv[i]);

	char directory[PATH_MAX];
	if (getcwd(directory, sizeof(directory)) != nullptr)
		message->AddString("cwd", directory);
}


static void
MakeRefsMessage(int argc, const char* const* argv, BMessage* message)
{
	message->MakeEmpty();
	message->what = B_REFS_RECEIVED;
	for (int i = 1; i < argc; i++) {
		entry_ref ref;
		if (access(argv[i], F_OK) == 0 && get_ref_for_path(argv[i], &ref) == B_OK)
			message->AddRef("refs", &ref);
	}
}


bool
BPrivate::GetStartMessage(BMessage* message)
{
	int argc = 0;
	while (sArguments != nullptr && sArguments[argc] != nullptr)
		argc++;

	bool files = getenv(kArgumentsAreFiles) != nullptr;
	unsetenv(kArgumentsAreFiles);
	if (argc < 2)
		return false;

	if (!files) {
		MakeArgvMessage(argc, sArguments, message);
		return true;
	}
	MakeRefsMessage(argc, sArguments, message);
	return message->HasRef("refs");
}

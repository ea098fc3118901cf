// SPDX-License-Identifier: MIT
// plimcheck: tells whether component libraries can be used. The designer runs it on libraries that it does not know.

#include <sys/resource.h>
#include <unistd.h>

#include <cstdio>
#include <cstdlib>
#include <cstring>

#include <Application.h>

#include "app/Preferences.h"
#include "palette/ComponentLibrary.h"
#include "palette/PaletteEntry.h"

namespace {

constexpr const char* kHelp =
	"Usage: plimcheck LIBRARY...\n"
	"\n"
	"Loads each component library as the designer does, without a display, and tells\n"
	"which components it offers, or why it cannot be used.\n"
	"\n"
	"  --help      print this and exit\n"
	"  --version   print the version and exit\n"
	"\n"
	"Exit codes: 0 all can be used, 1 one cannot, 2 wrong usage.\n";


bool
Refuse(const char* path, const char* reason)
{
	printf("%s: cannot be used: %s\n", path, reason);
	return false;
}


/// Why an add-on was not loaded. The loader's own words, where there are some, are on standard error.
const char*
LoadFailure(status_t status)
{
	switch (status) {
		case B_NOT_AN_EXECUTABLE:
			return "it is no library for this machine";
		case B_MISSING_SYMBOL:
			return "it needs a function or a variable that is nowhere";
		case B_MISSING_LIBRARY:
			return "it needs a library that is not there";
		case B_ENTRY_NOT_FOUND:
			return "there is no such file";
		case B_PERMISSION_DENIED:
			return "it may not be read";
		default:
			return "it could not be loaded";
	}
}


bool
Check(const char* path)
{
	TComponentLibrary library(path);
	const status_t status = library.Load();
	if (status != B_OK)
		return Refuse(path, LoadFailure(status));
	if (!library.FindFunctions()) {
		BString reason("it exports no function ");
		reason << library.MissingFunction();
		return Refuse(path, reason.String());
	}
	BString difference;
	if (!library.IsForThisDesigner(&difference)) {
		difference.Prepend("it was built for another designer: ");
		return Refuse(path, difference.String());
	}
	if (!library.Init())
		return Refuse(path, "its InitComponentLib() failed");

	const uint32 count = library.CountComponents();
	printf("%s: good, components: %ld\n", path, static_cast<long>(count));
	bool isWhole = true;
	for (uint32 i = 0; i < count; i++) {
		const TPaletteEntry* entry = library.EntryAt(i);
		isWhole = isWhole && entry != nullptr;
		if (entry == nullptr)
			printf("  there is no entry %ld\n", static_cast<long>(i));
		else
			printf("  %s (%s)\n", entry->ComponentName(), entry->ClassName());
	}
	return isWhole;
}


/// Ends the program without what libraries would do at its end, which is not asked for here.
[[noreturn]] void
Leave(int code)
{
	fflush(nullptr);
	_exit(code);
}

} // namespace


int
main(int argc, char** argv)
{
	if (argc < 2 || strcmp(argv[1], "--help") == 0) {
		fputs(kHelp, argc < 2 ? stderr : stdout);
		Leave(argc < 2 ? 2 : 0);
	}
	if (strcmp(argv[1], "--version") == 0) {
		puts("plimcheck " PLIM_VERSION);
		Leave(0);
	}

	// A library that crashes is an answer and needs no core file.
	const rlimit none = {0, 0};
	setrlimit(RLIMIT_CORE, &none);
	setenv("BE_DISPLAY", "none", 1);
	setenv("BE_LOAD_VERBOSE", "1", 1);
	unsetenv("BE_ROBOT_SCRIPT");
	AppSettings.LeaveFileAlone();
	BApplication application("application/x-vnd.Plimworks-check");
	setvbuf(stdout, nullptr, _IONBF, 0);

	bool isGood = true;
	for (int i = 1; i < argc; i++)
		isGood = Check(argv[i]) && isGood;
	Leave(isGood ? 0 : 1);
}

// SPDX-License-Identifier: MIT
// plimworks: the designer.

#include <cstdio>
#include <cstring>

#include <AppDefs.h>

#include "app/PlimApp.h"
#include "app/Preferences.h"

namespace {

constexpr const char* kHelp =
	"Usage: plimworks [PROJECT]...\n"
	"\n"
	"Opens the designer, and the project file PROJECT in it; of several projects the last\n"
	"one stays open. Without a project it starts a new one.\n"
	"\n"
	"  --help      print this and exit\n"
	"  --version   print the version and exit\n";


/// Answers an option that needs no window; false when \a argument is none.
bool
Answered(const char* argument)
{
	if (strcmp(argument, "--help") == 0)
		fputs(kHelp, stdout);
	else if (strcmp(argument, "--version") == 0)
		puts("plimworks " PLIM_VERSION);
	else
		return false;

	AppSettings.LeaveFileAlone();
	return true;
}

} // namespace


int
main(int argc, char** argv)
{
	setvbuf(stdout, nullptr, _IONBF, 0);
	if (argc > 1 && Answered(argv[1]))
		return 0;

	PlimApp app;
	app.SetCursor(B_HAND_CURSOR);
	app.KeepRecoveryCopies();
	app.Run();
	return 0;
}

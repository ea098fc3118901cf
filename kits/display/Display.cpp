// SPDX-License-Identifier: MIT
// Chooses the program's display, and loads its module when pixels are first needed.
#include "display/Display.h"

#include <atomic>
#include <cstdio>
#include <cstdlib>
#include <cstring>
#include <string>

#include <dlfcn.h>

#include "display/DisplayModule.h"
#include "display/FontSettings.h"
#include "display/NoneDisplay.h"
#include "display/RobotScript.h"
#include "kernel/ProgramEnd.h"

namespace BPrivate {

namespace {

const char* const kModuleName = "libbe_display_qt.so";

std::atomic<bool> sConnected(false);
StopDisplay sStopModule = nullptr;


/// The module's path: in the folder that this library was loaded from.
std::string
ModulePath()
{
	Dl_info info;
	if (dladdr(reinterpret_cast<void*>(&Display::IsConnected), &info) == 0
		|| info.dli_fname == nullptr)
		return kModuleName;
	std::string path = info.dli_fname;
	size_t slash = path.rfind('/');
	return slash == std::string::npos ? kModuleName : path.substr(0, slash + 1) + kModuleName;
}


void
StopModule()
{
	SetCursorHost(nullptr);
	SetClipboardExchange(nullptr);
	sStopModule();
}


Display*
StartModule()
{
	ReadFontSettingsAhead();
	// Most functions of Qt that it refers to are never called: they are not looked up before they are.
	void* module = dlopen(ModulePath().c_str(), RTLD_LAZY | RTLD_LOCAL);
	if (module == nullptr) {
		fprintf(stderr, "libbe: no display: %s; nothing will be shown\n", dlerror());
		return nullptr;
	}

	auto start = reinterpret_cast<StartDisplay>(dlsym(module, "be_display_start"));
	sStopModule = reinterpret_cast<StopDisplay>(dlsym(module, "be_display_stop"));
	const char* reason = "the display module is not of this version";
	Display* display = start != nullptr && sStopModule != nullptr ? start(&reason) : nullptr;
	if (display == nullptr) {
		fprintf(stderr, "libbe: no display: %s; nothing will be shown\n", reason);
		return nullptr;
	}
	call_at_program_end(StopModule);
	return display;
}


Display*
Choose()
{
	const char* choice = getenv("BE_DISPLAY");
	bool isKnown = choice == nullptr || choice[0] == '\0' || strcmp(choice, "qt") == 0;
	if (!isKnown && strcmp(choice, "none") != 0) {
		fprintf(stderr,
			"libbe: BE_DISPLAY is \"%s\", but can be \"none\" or \"qt\"; taking \"qt\"\n", choice);
		isKnown = true;
	}
	Display* display = isKnown ? StartModule() : nullptr;
	return display != nullptr ? display : new NoneDisplay;
}


Display*
Connect()
{
	Display* display = Choose();
	SetCursorHost(display);
	SetClipboardExchange(display);
	sConnected = true;
	StartRobotScript();
	return display;
}

} // namespace


Display&
Display::Get()
{
	// Never deleted: other threads may still draw while the program ends.
	static Display* display = Connect();
	return *display;
}


bool
Display::IsConnected()
{
	return sConnected;
}


void
ConnectClipboardExchange()
{
	Display::Get();
}


int32
Display::ScreenAt(BRect frame)
{
	BPoint middle((frame.left + frame.right) / 2, (frame.top + frame.bottom) / 2);
	int32 count = CountScreens();
	for (int32 i = 0; i < count; i++) {
		if (ScreenFrame(i).Contains(middle))
			return i;
	}
	return 0;
}

} // namespace BPrivate

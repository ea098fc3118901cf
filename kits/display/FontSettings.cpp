// SPDX-License-Identifier: MIT
// The host's font settings, read beside what else a display needs to start.
#include "display/FontSettings.h"

#include <future>
#include <thread>

#include <dlfcn.h>
#include <locale.h>
#include <pthread.h>

namespace BPrivate {

namespace {

typedef int (*InitFontconfig)();

// Never deleted: the thread may still be at work when the program ends.
std::promise<void>* sDone = nullptr;
std::shared_future<void>* sReading = nullptr;


void
Read(InitFontconfig init)
{
	// Numbers are read by the locale, which the display's start changes for a moment for all other threads.
	uselocale(newlocale(LC_ALL_MASK, "C", nullptr));
	init();
	uselocale(LC_GLOBAL_LOCALE);
	sDone->set_value();
}

} // namespace


void
ReadFontSettingsAhead()
{
	void* library = dlopen("libfontconfig.so.1", RTLD_LAZY | RTLD_LOCAL);
	if (library == nullptr)
		return;
	auto init = reinterpret_cast<InitFontconfig>(dlsym(library, "FcInit"));
	if (init == nullptr)
		return;

	sDone = new std::promise<void>;
	sReading = new std::shared_future<void>(sDone->get_future());
	std::thread reader(Read, init);
	pthread_setname_np(reader.native_handle(), "font settings");
	reader.detach();
}


void
AwaitFontSettings()
{
	if (sReading != nullptr)
		sReading->wait();
}

} // namespace BPrivate

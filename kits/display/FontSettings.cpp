// SPDX-License-Identifier: MIT
// The host's font settings, read beside what else a display needs to start.
#include "display/FontSettings.h"

#include <future>
#include <string>
#include <thread>

#include <dlfcn.h>
#include <locale.h>
#include <pthread.h>

namespace BPrivate {

namespace {

/// What is used of fontconfig, whose patterns and settings nobody looks into here.
struct Fontconfig {
	int (*init)();
	void* (*makePattern)();
	int (*addString)(void* pattern, const char* object, const unsigned char* value);
	int (*substitute)(void* config, void* pattern, int kind);
	void (*substituteDefaults)(void* pattern);
	void* (*match)(void* config, void* pattern, int* result);
	int (*getString)(void* pattern, const char* object, int index, unsigned char** value);
	void (*destroyPattern)(void* pattern);

	bool Load();
	std::string FamilyFor(const char* name) const;
};


bool
Fontconfig::Load()
{
	void* library = dlopen("libfontconfig.so.1", RTLD_LAZY | RTLD_LOCAL);
	if (library == nullptr)
		return false;
	auto find = [library](const char* name, auto* function) {
		*reinterpret_cast<void**>(function) = dlsym(library, name);
		return *function != nullptr;
	};
	return find("FcInit", &init) && find("FcPatternCreate", &makePattern)
		&& find("FcPatternAddString", &addString) && find("FcConfigSubstitute", &substitute)
		&& find("FcDefaultSubstitute", &substituteDefaults) && find("FcFontMatch", &match)
		&& find("FcPatternGetString", &getString) && find("FcPatternDestroy", &destroyPattern);
}


/// The family that the host has for a generic \a name; empty when there is none.
std::string
Fontconfig::FamilyFor(const char* name) const
{
	const int kMatchPattern = 0;
	void* pattern = makePattern();
	addString(pattern, "family", reinterpret_cast<const unsigned char*>(name));
	substitute(nullptr, pattern, kMatchPattern);
	substituteDefaults(pattern);
	int result;
	void* found = match(nullptr, pattern, &result);
	destroyPattern(pattern);
	if (found == nullptr)
		return "";
	unsigned char* family = nullptr;
	const bool hasFamily = getString(found, "family", 0, &family) == 0;
	std::string answer = hasFamily ? reinterpret_cast<const char*>(family) : "";
	destroyPattern(found);
	return answer;
}


// Never deleted: the thread may still be at work when the program ends. The value is the plain family.
std::promise<std::string>* sDone = nullptr;
std::shared_future<std::string>* sReading = nullptr;


void
Read(Fontconfig fontconfig)
{
	// Numbers are read by the locale, which the display's start changes for a moment for all other threads.
	uselocale(newlocale(LC_ALL_MASK, "C", nullptr));
	fontconfig.init();
	const std::string family = fontconfig.FamilyFor("sans-serif");
	uselocale(LC_GLOBAL_LOCALE);
	sDone->set_value(family);
}

} // namespace


void
ReadFontSettingsAhead()
{
	Fontconfig fontconfig;
	if (!fontconfig.Load())
		return;

	sDone = new std::promise<std::string>;
	sReading = new std::shared_future<std::string>(sDone->get_future());
	std::thread reader(Read, fontconfig);
	pthread_setname_np(reader.native_handle(), "font settings");
	reader.detach();
}


std::string
AwaitFontSettings()
{
	return sReading != nullptr ? sReading->get() : "";
}

} // namespace BPrivate

// SPDX-License-Identifier: MIT
// A component library for tests; a definition on the command line picks what is wrong with it.

#include <cstdio>
#include <cstdlib>
#include <stdexcept>

#include <ComponentKit.h>
#include <OS.h>
#include <image.h>
#include <palette/LibraryBuild.h>

namespace {

TPaletteEntry sFirst(0, "First", "TFirst");
TPaletteEntry sThird(2, "Third", "TThird");

[[maybe_unused]] void
Crash()
{
	// As a library that is at fault would be stopped by the host, also under a sanitizer.
	abort();
}


#ifdef CRASHES_ON_LOAD
[[maybe_unused]] const bool kCrashed = (Crash(), true);
#endif


/// Appends a line to the file that the environment names, if any.
void
NoteInit()
{
	const char* name = getenv("TEST_NOTES");
	FILE* notes = name != nullptr ? fopen(name, "a") : nullptr;
	if (notes == nullptr)
		return;
	fputs("init\n", notes);
	fclose(notes);
}

} // namespace

#if defined(OTHER_BUILD) || defined(OTHER_CLASSES) || defined(OTHER_RECORD)
static library_build
OtherBuild()
{
	library_build build = ThisLibraryBuild();
#if defined(OTHER_BUILD)
	build.interfaceVersion += 41;
#elif defined(OTHER_CLASSES)
	build.classSizes[0] += 8;
#else
	build.size -= 4;
#endif
	return build;
}


extern "C" {
extern const library_build PlimComponentLibraryBuild;
const library_build PlimComponentLibraryBuild = OtherBuild();
}
#endif


extern "C" bool
InitComponentLib([[maybe_unused]] image_id image)
{
	NoteInit();
#if defined(REFUSES_INIT)
	return image < 0;
#elif defined(CRASHES)
	Crash();
	return image >= 0;
#elif defined(HANGS)
	snooze(B_INFINITE_TIMEOUT);
	return image >= 0;
#elif defined(THROWS)
	throw std::runtime_error("this library cannot be used");
#else
#ifdef PRINTS
	printf("a line of the library's own\n");
#endif
	return image >= 0;
#endif
}


#ifndef NO_UNINIT
extern "C" void
UnInitComponentLib()
{
}
#endif


extern "C" uint32
CountComponents()
{
	return 3;
}


extern "C" TPaletteEntry*
EntryAt(uint32 index)
{
	static TPaletteEntry sSecond(1, "Second", "TSecond");
	switch (index) {
		case 0:
			return &sFirst;
		case 2:
			return &sThird;
		default:
#if defined(MISSING_ENTRY)
			return nullptr;
#elif defined(ENTRY_THROWS)
			throw index;
#elif defined(NAMELESS)
			static TPaletteEntry sNameless(1, "Second", nullptr);
			return &sNameless;
#else
			return &sSecond;
#endif
	}
}

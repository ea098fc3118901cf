// SPDX-License-Identifier: MIT
// A component library for tests; a definition on the command line picks what is wrong with it.

#include <ComponentKit.h>
#include <image.h>

namespace {

TPaletteEntry sFirst(0, "First", "TFirst");
TPaletteEntry sThird(2, "Third", "TThird");

} // namespace

extern "C" bool
InitComponentLib(image_id image)
{
#ifdef REFUSES_INIT
	return image < 0;
#else
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
#ifdef MISSING_ENTRY
			return nullptr;
#else
			return &sSecond;
#endif
	}
}

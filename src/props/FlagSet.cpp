// SPDX-License-Identifier: MIT
// The flags that the flag dialogs offer, and their text.

#include "props/FlagSet.h"

#include <cstring>

#include <String.h>
#include <View.h>

static const TFlagBox kViewFlags[] = {
	{"Will Draw", B_WILL_DRAW, "B_WILL_DRAW", "B_WILL_DRAW"},
	{"Pulse Needed", B_PULSE_NEEDED, "B_PULSE_NEEDED", "B_PULSE_NEEDED"},
	{"Frame events", B_FRAME_EVENTS, "B_FRAME_EVENTS", "B_FRAME_EVENTS"},
	{"Full Update on resize", B_FULL_UPDATE_ON_RESIZE, "B_FULL_UPDATE_ON_RESIZE",
		"B_FULL_UPDATE_ON_RESIZE"},
	{"Navigable", B_NAVIGABLE, "B_NAVIGABLE", "B_NAVIGABLE"},
	{"Navigable Jump", B_NAVIGABLE_JUMP, "B_NAVIGABLE_JUMP", "B_NAVIGABLE_JUMP"},
	{"Sub-pixel precise", B_SUBPIXEL_PRECISE, "B_SUBPIXEL_PRECISE", "B_SUBPIXEL_PRECISE"},
};

// The bits are those that the dialog has always computed. The box "Outline resize" is dead: it writes
// nothing, and shows another box's flag.
static const TFlagBox kWindowFlags[] = {
	{"Not movable", 0x00001, "B_NOT_MOVABLE", "B_NOT_MOVABLE"},
	{"Not H. resizable", 0x00004, "B_NOT_H_RESIZABLE", "B_NOT_H_RESIZABLE"},
	{"Not V. resizable", 0x00008, "B_NOT_V_RESIZABLE", "B_NOT_V_RESIZABLE"},
	{"Not resizable", 0x00002, "B_NOT_RESIZABLE", "B_NOT_RESIZABLE"},
	{"Not closable", 0x00020, "B_NOT_CLOSABLE", "B_NOT_CLOSABLE"},
	{"Not zoomable", 0x00040, "B_NOT_ZOOMABLE", "B_NOT_ZOOMABLE"},
	{"Not minimizable", 0x04000, "B_NOT_MINIMIZABLE", "B_NOT_MINIMIZABLE"},
	{"Accepts first click", 0x00010, "B_WILL_ACCEPT_FIRST_CLICK", "B_WILL_ACCEPT_FIRST_CLICK"},
	{"Avoids front", 0x00080, "B_AVOID_FRONT", "B_AVOID_FRONT"},
	{"Avoids focus", 0x02000, "B_AVOID_FOCUS", "B_AVOID_FOCUS"},
	{"Outline resize", 0x01000, nullptr, "B_AVOID_FOCUS"},
	{"No workspace activation", 0x00100, "B_NO_WORKSPACE_ACTIVATION", "B_NO_WORKSPACE_ACTIVATION"},
	{"Not anchored on activate", 0x20000, "B_NOT_ANCHORED_ON_ACTIVATE",
		"B_NOT_ANCHORED_ON_ACTIVATE"},
};


const TFlagSet&
TFlagSet::ViewFlags()
{
	static const TFlagSet sFlags(kViewFlags, B_COUNT_OF(kViewFlags));
	return sFlags;
}


const TFlagSet&
TFlagSet::WindowFlags()
{
	static const TFlagSet sFlags(kWindowFlags, B_COUNT_OF(kWindowFlags));
	return sFlags;
}


uint32
TFlagSet::BitsFor(const char* text) const
{
	uint32 bits = 0;
	for (int32 i = 0; text != nullptr && i < fCount; i++) {
		if (strstr(text, fBoxes[i].tickedBy) != nullptr)
			bits |= fBoxes[i].bit;
	}
	return bits;
}


BString
TFlagSet::TextFor(uint32 bits) const
{
	BString text;
	for (int32 i = 0; i < fCount; i++) {
		if ((bits & fBoxes[i].bit) == 0 || fBoxes[i].name == nullptr)
			continue;
		if (text.Length() > 0)
			text << "|";
		text << fBoxes[i].name;
	}
	return text;
}

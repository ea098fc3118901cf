// SPDX-License-Identifier: MIT
// The keys of a US keyboard: raw codes, their names, and the text each gives.
#ifndef DISPLAY_KEY_MAP_H
#define DISPLAY_KEY_MAP_H

#include <SupportDefs.h>

namespace BPrivate {

enum {
	kRawEscape = 0x01,
	kRawF1 = 0x02,
	kRawF12 = 0x0d,
	kRawPrint = 0x0e,
	kRawScroll = 0x0f,
	kRawPause = 0x10,
	kRawBackspace = 0x1e,
	kRawInsert = 0x1f,
	kRawHome = 0x20,
	kRawPageUp = 0x21,
	kRawNumLock = 0x22,
	kRawTab = 0x26,
	kRawDelete = 0x34,
	kRawEnd = 0x35,
	kRawPageDown = 0x36,
	kRawCapsLock = 0x3b,
	kRawEnter = 0x47,
	kRawLeftShift = 0x4b,
	kRawRightShift = 0x56,
	kRawUp = 0x57,
	kRawNumEnter = 0x5b,
	kRawLeftControl = 0x5c,
	kRawLeftCommand = 0x5d,
	kRawSpace = 0x5e,
	kRawRightOption = 0x5f,
	kRawRightControl = 0x60,
	kRawLeft = 0x61,
	kRawDown = 0x62,
	kRawRight = 0x63,
	kRawLeftOption = 0x66,
	kRawRightCommand = 0x67,
	kRawMenu = 0x68
};

/// The character that a raw key gives without modifiers, 0 for none: "raw_char" of key messages.
int32 RawCharForKey(int32 rawKey);

/// What a raw key gives with \a modifiers on a US keyboard. Returns the number of bytes (0 or 1).
int32 BytesForKey(int32 rawKey, uint32 modifiers, char* byte);

/// The raw key that gives an ASCII \a character, and whether it needs Shift; 0 when none does.
int32 KeyForChar(char character, bool* needsShift);

/// The raw key called \a name ("enter", "tab", "left", "f1", "a", ...; any case), 0 for an unknown one.
int32 KeyForName(const char* name);

/// The modifiers that a raw key holds down, general bit included; 0 for other keys.
uint32 ModifiersForKey(int32 rawKey);

/// The raw key of a Linux input event code (KEY_A is 30), 0 for one that has none.
int32 KeyForEventCode(uint32 code);

} // namespace BPrivate

#endif // DISPLAY_KEY_MAP_H

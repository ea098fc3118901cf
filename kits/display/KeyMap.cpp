// SPDX-License-Identifier: MIT
// The keys of a US keyboard: raw codes, their names, and the text each gives.
#include "display/KeyMap.h"

#include <cstring>

#include <strings.h>

#include <InterfaceDefs.h>

namespace BPrivate {

namespace {

struct TextKey {
	uint8 rawKey;
	char plain;
	char shifted;
};

const TextKey kTextKeys[] = {{0x11, '`', '~'}, {0x12, '1', '!'}, {0x13, '2', '@'}, {0x14, '3', '#'},
	{0x15, '4', '$'}, {0x16, '5', '%'}, {0x17, '6', '^'}, {0x18, '7', '&'}, {0x19, '8', '*'},
	{0x1a, '9', '('}, {0x1b, '0', ')'}, {0x1c, '-', '_'}, {0x1d, '=', '+'}, {0x27, 'q', 'Q'},
	{0x28, 'w', 'W'}, {0x29, 'e', 'E'}, {0x2a, 'r', 'R'}, {0x2b, 't', 'T'}, {0x2c, 'y', 'Y'},
	{0x2d, 'u', 'U'}, {0x2e, 'i', 'I'}, {0x2f, 'o', 'O'}, {0x30, 'p', 'P'}, {0x31, '[', '{'},
	{0x32, ']', '}'}, {0x33, '\\', '|'}, {0x3c, 'a', 'A'}, {0x3d, 's', 'S'}, {0x3e, 'd', 'D'},
	{0x3f, 'f', 'F'}, {0x40, 'g', 'G'}, {0x41, 'h', 'H'}, {0x42, 'j', 'J'}, {0x43, 'k', 'K'},
	{0x44, 'l', 'L'}, {0x45, ';', ':'}, {0x46, '\'', '"'}, {0x4c, 'z', 'Z'}, {0x4d, 'x', 'X'},
	{0x4e, 'c', 'C'}, {0x4f, 'v', 'V'}, {0x50, 'b', 'B'}, {0x51, 'n', 'N'}, {0x52, 'm', 'M'},
	{0x53, ',', '<'}, {0x54, '.', '>'}, {0x55, '/', '?'}, {0x5e, ' ', ' '}, {0x69, '\\', '|'}};

// Keys that give the same byte whatever is held.
const TextKey kControlKeys[] = {{kRawEscape, B_ESCAPE, 0}, {kRawBackspace, B_BACKSPACE, 0},
	{kRawInsert, B_INSERT, 0}, {kRawHome, B_HOME, 0}, {kRawPageUp, B_PAGE_UP, 0},
	{kRawTab, B_TAB, 0}, {kRawDelete, B_DELETE, 0}, {kRawEnd, B_END, 0},
	{kRawPageDown, B_PAGE_DOWN, 0}, {kRawEnter, B_ENTER, 0}, {kRawNumEnter, B_ENTER, 0},
	{kRawUp, B_UP_ARROW, 0}, {kRawLeft, B_LEFT_ARROW, 0}, {kRawDown, B_DOWN_ARROW, 0},
	{kRawRight, B_RIGHT_ARROW, 0}, {kRawPrint, B_FUNCTION_KEY, 0}, {kRawScroll, B_FUNCTION_KEY, 0},
	{kRawPause, B_FUNCTION_KEY, 0}};

// The numeric keypad: the byte without and with Num Lock.
const TextKey kPadKeys[] = {{0x23, '/', '/'}, {0x24, '*', '*'}, {0x25, '-', '-'},
	{0x37, B_HOME, '7'}, {0x38, B_UP_ARROW, '8'}, {0x39, B_PAGE_UP, '9'}, {0x3a, '+', '+'},
	{0x48, B_LEFT_ARROW, '4'}, {0x49, '5', '5'}, {0x4a, B_RIGHT_ARROW, '6'}, {0x58, B_END, '1'},
	{0x59, B_DOWN_ARROW, '2'}, {0x5a, B_PAGE_DOWN, '3'}, {0x64, B_INSERT, '0'},
	{0x65, B_DELETE, '.'}};

struct NamedKey {
	const char* name;
	uint8 rawKey;
};

const NamedKey kNamedKeys[] = {{"escape", kRawEscape}, {"esc", kRawEscape},
	{"backspace", kRawBackspace}, {"insert", kRawInsert}, {"home", kRawHome},
	{"page-up", kRawPageUp}, {"tab", kRawTab}, {"delete", kRawDelete}, {"end", kRawEnd},
	{"page-down", kRawPageDown}, {"enter", kRawEnter}, {"return", kRawEnter}, {"up", kRawUp},
	{"left", kRawLeft}, {"down", kRawDown}, {"right", kRawRight}, {"space", kRawSpace},
	{"print", kRawPrint}, {"scroll-lock", kRawScroll}, {"pause", kRawPause}, {"menu", kRawMenu},
	{"caps-lock", kRawCapsLock}, {"num-lock", kRawNumLock}, {"shift", kRawLeftShift},
	{"command", kRawLeftCommand}, {"control", kRawLeftControl}, {"option", kRawLeftOption}};

struct ModifierKey {
	uint8 rawKey;
	uint32 modifiers;
};

const ModifierKey kModifierKeys[] = {{kRawLeftShift, B_SHIFT_KEY | B_LEFT_SHIFT_KEY},
	{kRawRightShift, B_SHIFT_KEY | B_RIGHT_SHIFT_KEY},
	{kRawLeftCommand, B_COMMAND_KEY | B_LEFT_COMMAND_KEY},
	{kRawRightCommand, B_COMMAND_KEY | B_RIGHT_COMMAND_KEY},
	{kRawLeftControl, B_CONTROL_KEY | B_LEFT_CONTROL_KEY},
	{kRawRightControl, B_CONTROL_KEY | B_RIGHT_CONTROL_KEY},
	{kRawLeftOption, B_OPTION_KEY | B_LEFT_OPTION_KEY},
	{kRawRightOption, B_OPTION_KEY | B_RIGHT_OPTION_KEY}, {kRawMenu, B_MENU_KEY}};

// By Linux input event code, from KEY_ESC (1) on; the order of <linux/input-event-codes.h>.
const uint8 kEventCodes[] = {0, 0x01, 0x12, 0x13, 0x14, 0x15, 0x16, 0x17, 0x18, 0x19, 0x1a, 0x1b,
	0x1c, 0x1d, 0x1e, 0x26, 0x27, 0x28, 0x29, 0x2a, 0x2b, 0x2c, 0x2d, 0x2e, 0x2f, 0x30, 0x31, 0x32,
	0x47, kRawLeftCommand, 0x3c, 0x3d, 0x3e, 0x3f, 0x40, 0x41, 0x42, 0x43, 0x44, 0x45, 0x46, 0x11,
	0x4b, 0x33, 0x4c, 0x4d, 0x4e, 0x4f, 0x50, 0x51, 0x52, 0x53, 0x54, 0x55, 0x56, 0x24,
	kRawLeftControl, 0x5e, 0x3b, 0x02, 0x03, 0x04, 0x05, 0x06, 0x07, 0x08, 0x09, 0x0a, 0x0b, 0x22,
	0x0f, 0x37, 0x38, 0x39, 0x25, 0x48, 0x49, 0x4a, 0x3a, 0x58, 0x59, 0x5a, 0x64, 0x65, 0, 0, 0x69,
	0x0c, 0x0d, 0, 0, 0, 0, 0, 0, 0, 0x5b, kRawRightCommand, 0x23, 0x0e, kRawRightControl, 0, 0x20,
	0x57, 0x21, 0x61, 0x63, 0x35, 0x62, 0x36, 0x1f, 0x34, 0, 0, 0, 0, 0, 0, 0, 0x10, 0, 0, 0, 0, 0,
	kRawLeftOption, kRawRightOption, kRawMenu};


template <size_t kCount>
const TextKey*
FindKey(const TextKey (&keys)[kCount], int32 rawKey)
{
	for (const TextKey& key : keys) {
		if (key.rawKey == rawKey)
			return &key;
	}
	return nullptr;
}

} // namespace


int32
RawCharForKey(int32 rawKey)
{
	char byte;
	return BytesForKey(rawKey, 0, &byte) == 1 ? static_cast<uint8>(byte) : 0;
}


int32
BytesForKey(int32 rawKey, uint32 modifiers, char* byte)
{
	if (rawKey >= kRawF1 && rawKey <= kRawF12) {
		*byte = B_FUNCTION_KEY;
		return 1;
	}
	const TextKey* control = FindKey(kControlKeys, rawKey);
	if (control != nullptr) {
		*byte = control->plain;
		return 1;
	}
	const TextKey* pad = FindKey(kPadKeys, rawKey);
	if (pad != nullptr) {
		*byte = (modifiers & B_NUM_LOCK) != 0 ? pad->shifted : pad->plain;
		return 1;
	}

	const TextKey* text = FindKey(kTextKeys, rawKey);
	if (text == nullptr)
		return 0;

	bool isLetter = text->plain >= 'a' && text->plain <= 'z';
	bool shifted = (modifiers & B_SHIFT_KEY) != 0;
	if (isLetter && (modifiers & B_CAPS_LOCK) != 0)
		shifted = !shifted;
	*byte = shifted ? text->shifted : text->plain;
	if ((modifiers & B_CONTROL_KEY) != 0 && *byte >= '@' && *byte != 0x7f)
		*byte &= 0x1f;
	return 1;
}


int32
KeyForChar(char character, bool* needsShift)
{
	*needsShift = false;
	if (character == '\r')
		character = B_ENTER;
	for (const TextKey& key : kTextKeys) {
		if (key.plain == character || key.shifted == character) {
			*needsShift = key.plain != character;
			return key.rawKey;
		}
	}
	for (const TextKey& key : kControlKeys) {
		if (key.plain == character)
			return key.rawKey;
	}
	return 0;
}


int32
KeyForName(const char* name)
{
	for (const NamedKey& key : kNamedKeys) {
		if (strcasecmp(key.name, name) == 0)
			return key.rawKey;
	}
	bool needsShift;
	if (strlen(name) == 1)
		return KeyForChar(name[0], &needsShift);

	if (name[0] == 'f' || name[0] == 'F') {
		for (int32 number = 1; number <= 12; number++) {
			char text[4] = {'1', 0};
			if (number < 10)
				text[0] = static_cast<char>('0' + number);
			else
				text[1] = static_cast<char>('0' + number - 10);
			if (strcmp(name + 1, text) == 0)
				return kRawF1 + number - 1;
		}
	}
	return 0;
}


uint32
ModifiersForKey(int32 rawKey)
{
	for (const ModifierKey& key : kModifierKeys) {
		if (key.rawKey == rawKey)
			return key.modifiers;
	}
	return 0;
}


int32
KeyForEventCode(uint32 code)
{
	return code < B_COUNT_OF(kEventCodes) ? kEventCodes[code] : 0;
}

} // namespace BPrivate

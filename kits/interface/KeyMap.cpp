// SPDX-License-Identifier: MIT
// The key map that programs may ask for: the US layout. What keys really give comes with their messages.
#include <InterfaceDefs.h>

#include <algorithm>
#include <cstdlib>
#include <cstring>
#include <string>

namespace {

// The characters of rows of neighbouring raw keys, without and with Shift.
struct KeyRow {
	uint8 firstKey;
	const char* normal;
	const char* shifted;
};

const KeyRow kCharacterRows[] = {
	{0x11, "`1234567890-=", "~!@#$%^&*()_+"},
	{0x23, "/*-", "/*-"},
	{0x27, "qwertyuiop[]\\", "QWERTYUIOP{}|"},
	{0x3c, "asdfghjkl;'", "ASDFGHJKL:\""},
	{0x4c, "zxcvbnm,./", "ZXCVBNM<>?"},
	{0x5e, " ", " "},
};


struct ControlKey {
	uint8 key;
	char code;
};

const ControlKey kControlKeys[] = {
	{0x01, B_ESCAPE},
	{0x1e, B_BACKSPACE},
	{0x1f, B_INSERT},
	{0x20, B_HOME},
	{0x21, B_PAGE_UP},
	{0x26, B_TAB},
	{0x34, B_DELETE},
	{0x35, B_END},
	{0x36, B_PAGE_DOWN},
	{0x37, B_HOME},
	{0x38, B_UP_ARROW},
	{0x39, B_PAGE_UP},
	{0x3a, '+'},
	{0x47, B_ENTER},
	{0x48, B_LEFT_ARROW},
	{0x4a, B_RIGHT_ARROW},
	{0x57, B_UP_ARROW},
	{0x58, B_END},
	{0x59, B_DOWN_ARROW},
	{0x5a, B_PAGE_DOWN},
	{0x5b, B_ENTER},
	{0x61, B_LEFT_ARROW},
	{0x62, B_DOWN_ARROW},
	{0x63, B_RIGHT_ARROW},
	{0x64, B_INSERT},
	{0x65, B_DELETE},
};

const uint8 kFirstFunctionKey = 0x02;
const uint8 kLastFunctionKey = 0x10;


// The map and its texts: each is a length byte and that many bytes; offset 0 is the empty text.
class KeyMapMaker {
public:
	KeyMapMaker()
		: fTexts(1, '\0')
	{
		std::memset(&fMap, 0, sizeof(fMap));
		fMap.version = 3;
		uint32* keys[] = {&fMap.caps_key, &fMap.scroll_key, &fMap.num_key, &fMap.left_shift_key,
			&fMap.right_shift_key, &fMap.left_command_key, &fMap.right_command_key,
			&fMap.left_control_key, &fMap.right_control_key, &fMap.left_option_key,
			&fMap.right_option_key, &fMap.menu_key};
		const uint32 modifiers[] = {B_CAPS_LOCK, B_SCROLL_LOCK, B_NUM_LOCK, B_LEFT_SHIFT_KEY,
			B_RIGHT_SHIFT_KEY, B_LEFT_COMMAND_KEY, B_RIGHT_COMMAND_KEY, B_LEFT_CONTROL_KEY,
			B_RIGHT_CONTROL_KEY, B_LEFT_OPTION_KEY, B_RIGHT_OPTION_KEY, B_MENU_KEY};
		for (size_t i = 0; i < std::size(keys); i++)
			get_modifier_key(modifiers[i], keys[i]);

		for (const KeyRow& row : kCharacterRows) {
			for (size_t i = 0; row.normal[i] != '\0'; i++)
				SetKey(row.firstKey + i, row.normal[i], row.shifted[i]);
		}
		for (const ControlKey& key : kControlKeys)
			SetKey(key.key, key.code, key.code);
		for (uint8 key = kFirstFunctionKey; key <= kLastFunctionKey; key++)
			SetKey(key, B_FUNCTION_KEY, B_FUNCTION_KEY);
	}

	const key_map& Map() const { return fMap; }
	const std::string& Texts() const { return fTexts; }

private:
	void SetKey(size_t key, char normal, char shifted)
	{
		bool isLetter = normal >= 'a' && normal <= 'z';
		int32 normalText = AddText(normal);
		int32 shiftedText = AddText(shifted);
		fMap.normal_map[key] = normalText;
		fMap.shift_map[key] = shiftedText;
		fMap.caps_map[key] = isLetter ? shiftedText : normalText;
		fMap.caps_shift_map[key] = isLetter ? normalText : shiftedText;
		fMap.option_map[key] = normalText;
		fMap.option_shift_map[key] = shiftedText;
		fMap.option_caps_map[key] = fMap.caps_map[key];
		fMap.option_caps_shift_map[key] = fMap.caps_shift_map[key];
		fMap.control_map[key] = isLetter ? AddText(normal - 'a' + 1) : normalText;
	}

	int32 AddText(char character)
	{
		int32 offset = static_cast<int32>(fTexts.size());
		fTexts += '\1';
		fTexts += character;
		return offset;
	}

	key_map fMap;
	std::string fTexts;
};

} // namespace


void
get_key_map(key_map** _map, char** _keyBuffer)
{
	if (_map == nullptr || _keyBuffer == nullptr)
		return;

	KeyMapMaker maker;
	*_map = static_cast<key_map*>(std::malloc(sizeof(key_map)));
	*_keyBuffer = static_cast<char*>(std::malloc(maker.Texts().size()));
	if (*_map == nullptr || *_keyBuffer == nullptr) {
		std::free(*_map);
		std::free(*_keyBuffer);
		*_map = nullptr;
		*_keyBuffer = nullptr;
		return;
	}
	**_map = maker.Map();
	std::memcpy(*_keyBuffer, maker.Texts().data(), maker.Texts().size());
}

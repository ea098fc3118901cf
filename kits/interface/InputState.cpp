// SPDX-License-Identifier: MIT
// The keys and the pointer as they are now, and the user's input settings.
#include <InterfaceDefs.h>

#include <array>
#include <atomic>

#include <Point.h>

#include "display/Display.h"

using BPrivate::Display;

namespace {

const bigtime_t kClickSpeed = 500000;
const int32 kKeyRepeatRate = 250;
const bigtime_t kKeyRepeatDelay = 250000;
const int32 kMouseButtons = 3;


struct ModifierKey {
	uint32 modifier;
	uint32 defaultKey;
};

const ModifierKey kModifierKeys[] = {
	{B_CAPS_LOCK, 0x3b},
	{B_SCROLL_LOCK, 0x0f},
	{B_NUM_LOCK, 0x22},
	{B_LEFT_SHIFT_KEY, 0x4b},
	{B_RIGHT_SHIFT_KEY, 0x56},
	{B_LEFT_COMMAND_KEY, 0x5d},
	{B_RIGHT_COMMAND_KEY, 0x67},
	{B_LEFT_CONTROL_KEY, 0x5c},
	{B_RIGHT_CONTROL_KEY, 0x60},
	{B_LEFT_OPTION_KEY, 0x66},
	{B_RIGHT_OPTION_KEY, 0x5f},
	{B_MENU_KEY, 0x68},
};


std::array<std::atomic<uint32>, std::size(kModifierKeys)>&
AssignedKeys()
{
	static auto* keys = [] {
		auto* made = new std::array<std::atomic<uint32>, std::size(kModifierKeys)>;
		for (size_t i = 0; i < made->size(); i++)
			(*made)[i] = kModifierKeys[i].defaultKey;
		return made;
	}();
	return *keys;
}

} // namespace


uint32
modifiers()
{
	key_info info;
	return get_key_info(&info) == B_OK ? info.modifiers : 0;
}


status_t
get_key_info(key_info* info)
{
	if (info == nullptr)
		return B_BAD_VALUE;
	Display::Get().GetKeys(info);
	return B_OK;
}


status_t
get_modifier_key(uint32 modifier, uint32* key)
{
	if (key == nullptr)
		return B_BAD_VALUE;
	for (size_t i = 0; i < std::size(kModifierKeys); i++) {
		if (kModifierKeys[i].modifier == modifier) {
			*key = AssignedKeys()[i];
			return B_OK;
		}
	}
	return B_BAD_VALUE;
}


// The host assigns the keys: this is what get_modifier_key() and get_key_map() tell.
void
set_modifier_key(uint32 modifier, uint32 key)
{
	for (size_t i = 0; i < std::size(kModifierKeys); i++) {
		if (kModifierKeys[i].modifier == modifier)
			AssignedKeys()[i] = key;
	}
}


status_t
get_key_repeat_rate(int32* rate)
{
	if (rate == nullptr)
		return B_BAD_VALUE;
	*rate = kKeyRepeatRate;
	return B_OK;
}


status_t
get_key_repeat_delay(bigtime_t* delay)
{
	if (delay == nullptr)
		return B_BAD_VALUE;
	*delay = kKeyRepeatDelay;
	return B_OK;
}


status_t
get_scroll_bar_info(scroll_bar_info* info)
{
	if (info == nullptr)
		return B_BAD_VALUE;
	*info = {true, false, 1, 15};
	return B_OK;
}


status_t
get_mouse_type(int32* type)
{
	if (type == nullptr)
		return B_BAD_VALUE;
	*type = kMouseButtons;
	return B_OK;
}


status_t
get_mouse_type(const char*, int32* type)
{
	return get_mouse_type(type);
}


status_t
get_click_speed(bigtime_t* speed)
{
	if (speed == nullptr)
		return B_BAD_VALUE;
	*speed = kClickSpeed;
	return B_OK;
}


status_t
get_click_speed(const char*, bigtime_t* speed)
{
	return get_click_speed(speed);
}


status_t
get_mouse(BPoint* screenWhere, uint32* buttons)
{
	BPoint where;
	uint32 pressed = 0;
	Display::Get().GetPointer(&where, &pressed);
	if (screenWhere != nullptr)
		*screenWhere = where;
	if (buttons != nullptr)
		*buttons = pressed;
	return B_OK;
}


bool
focus_follows_mouse()
{
	return false;
}


bigtime_t
idle_time()
{
	return Display::Get().IdleTime();
}


// The host's workspaces are not told: there is the one that windows are on.
int32
count_workspaces()
{
	return 1;
}


int32
current_workspace()
{
	return 0;
}


void
activate_workspace(int32)
{
}

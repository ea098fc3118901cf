// SPDX-License-Identifier: MIT
// Colours: mixing and tinting, the user's colours, and the palette of 256.
#include <GraphicsDefs.h>

#include <algorithm>
#include <array>
#include <atomic>
#include <bit>
#include <cmath>
#include <cstring>

#include <InterfaceDefs.h>

const pattern B_SOLID_HIGH = {{0xff, 0xff, 0xff, 0xff, 0xff, 0xff, 0xff, 0xff}};
const pattern B_MIXED_COLORS = {{0xaa, 0x55, 0xaa, 0x55, 0xaa, 0x55, 0xaa, 0x55}};
const pattern B_SOLID_LOW = {{0x00, 0x00, 0x00, 0x00, 0x00, 0x00, 0x00, 0x00}};

const rgb_color B_TRANSPARENT_COLOR = {119, 116, 119, 0};
const rgb_color B_TRANSPARENT_32_BIT = {119, 116, 119, 0};
const uint8 B_TRANSPARENT_8_BIT = 0xff;
const uint8 B_TRANSPARENT_MAGIC_CMAP8 = 0xff;
const uint16 B_TRANSPARENT_MAGIC_RGBA15 = 0x39ce;
const uint16 B_TRANSPARENT_MAGIC_RGBA15_BIG = 0xce39;
const uint32 B_TRANSPARENT_MAGIC_RGBA32 = 0x00777477;
const uint32 B_TRANSPARENT_MAGIC_RGBA32_BIG = 0x77747700;

const screen_id B_MAIN_SCREEN_ID = {0};

namespace {

struct NamedColor {
	color_which which;
	const char* name;
	rgb_color color;
};

const NamedColor kDefaultColors[] = {
	{B_PANEL_BACKGROUND_COLOR, "B_PANEL_BACKGROUND_COLOR", {216, 216, 216, 255}},
	{B_MENU_BACKGROUND_COLOR, "B_MENU_BACKGROUND_COLOR", {216, 216, 216, 255}},
	{B_WINDOW_TAB_COLOR, "B_WINDOW_TAB_COLOR", {255, 203, 0, 255}},
	{B_KEYBOARD_NAVIGATION_COLOR, "B_KEYBOARD_NAVIGATION_COLOR", {0, 0, 229, 255}},
	{B_DESKTOP_COLOR, "B_DESKTOP_COLOR", {51, 102, 152, 255}},
	{B_MENU_SELECTED_BACKGROUND_COLOR, "B_MENU_SELECTED_BACKGROUND_COLOR", {153, 153, 153, 255}},
	{B_MENU_ITEM_TEXT_COLOR, "B_MENU_ITEM_TEXT_COLOR", {0, 0, 0, 255}},
	{B_MENU_SELECTED_ITEM_TEXT_COLOR, "B_MENU_SELECTED_ITEM_TEXT_COLOR", {0, 0, 0, 255}},
	{B_MENU_SELECTED_BORDER_COLOR, "B_MENU_SELECTED_BORDER_COLOR", {0, 0, 0, 255}},
	{B_PANEL_TEXT_COLOR, "B_PANEL_TEXT_COLOR", {0, 0, 0, 255}},
	{B_DOCUMENT_BACKGROUND_COLOR, "B_DOCUMENT_BACKGROUND_COLOR", {255, 255, 255, 255}},
	{B_DOCUMENT_TEXT_COLOR, "B_DOCUMENT_TEXT_COLOR", {0, 0, 0, 255}},
	{B_CONTROL_BACKGROUND_COLOR, "B_CONTROL_BACKGROUND_COLOR", {222, 222, 222, 255}},
	{B_CONTROL_TEXT_COLOR, "B_CONTROL_TEXT_COLOR", {0, 0, 0, 255}},
	{B_CONTROL_BORDER_COLOR, "B_CONTROL_BORDER_COLOR", {172, 172, 172, 255}},
	{B_CONTROL_HIGHLIGHT_COLOR, "B_CONTROL_HIGHLIGHT_COLOR", {102, 152, 203, 255}},
	{B_NAVIGATION_PULSE_COLOR, "B_NAVIGATION_PULSE_COLOR", {0, 0, 0, 255}},
	{B_SHINE_COLOR, "B_SHINE_COLOR", {255, 255, 255, 255}},
	{B_SHADOW_COLOR, "B_SHADOW_COLOR", {0, 0, 0, 255}},
	{B_TOOL_TIP_BACKGROUND_COLOR, "B_TOOL_TIP_BACKGROUND_COLOR", {255, 255, 216, 255}},
	{B_TOOL_TIP_TEXT_COLOR, "B_TOOL_TIP_TEXT_COLOR", {0, 0, 0, 255}},
	{B_WINDOW_TEXT_COLOR, "B_WINDOW_TEXT_COLOR", {0, 0, 0, 255}},
	{B_WINDOW_INACTIVE_TAB_COLOR, "B_WINDOW_INACTIVE_TAB_COLOR", {232, 232, 232, 255}},
	{B_WINDOW_INACTIVE_TEXT_COLOR, "B_WINDOW_INACTIVE_TEXT_COLOR", {80, 80, 80, 255}},
	{B_WINDOW_BORDER_COLOR, "B_WINDOW_BORDER_COLOR", {224, 224, 224, 255}},
	{B_WINDOW_INACTIVE_BORDER_COLOR, "B_WINDOW_INACTIVE_BORDER_COLOR", {232, 232, 232, 255}},
	{B_CONTROL_MARK_COLOR, "B_CONTROL_MARK_COLOR", {27, 82, 140, 255}},
	{B_LIST_BACKGROUND_COLOR, "B_LIST_BACKGROUND_COLOR", {255, 255, 255, 255}},
	{B_LIST_SELECTED_BACKGROUND_COLOR, "B_LIST_SELECTED_BACKGROUND_COLOR", {190, 190, 190, 255}},
	{B_LIST_ITEM_TEXT_COLOR, "B_LIST_ITEM_TEXT_COLOR", {0, 0, 0, 255}},
	{B_LIST_SELECTED_ITEM_TEXT_COLOR, "B_LIST_SELECTED_ITEM_TEXT_COLOR", {0, 0, 0, 255}},
	{B_SCROLL_BAR_THUMB_COLOR, "B_SCROLL_BAR_THUMB_COLOR", {216, 216, 216, 255}},
	{B_LINK_TEXT_COLOR, "B_LINK_TEXT_COLOR", {51, 102, 187, 255}},
	{B_LINK_HOVER_COLOR, "B_LINK_HOVER_COLOR", {102, 152, 203, 255}},
	{B_LINK_VISITED_COLOR, "B_LINK_VISITED_COLOR", {145, 112, 155, 255}},
	{B_LINK_ACTIVE_COLOR, "B_LINK_ACTIVE_COLOR", {121, 142, 203, 255}},
	{B_STATUS_BAR_COLOR, "B_STATUS_BAR_COLOR", {50, 150, 255, 255}},
	{B_SUCCESS_COLOR, "B_SUCCESS_COLOR", {46, 204, 64, 255}},
	{B_FAILURE_COLOR, "B_FAILURE_COLOR", {255, 65, 54, 255}},
};

// The share of the colour that a disabled control keeps, of 255.
const uint8 kDisabledAmount = 185;


// The user's colours, in the order of kDefaultColors; whole words, so that any thread may read them.
std::array<std::atomic<uint32>, std::size(kDefaultColors)>&
UserColors()
{
	static auto* colors = [] {
		auto* made = new std::array<std::atomic<uint32>, std::size(kDefaultColors)>;
		for (size_t i = 0; i < made->size(); i++)
			(*made)[i] = std::bit_cast<uint32>(kDefaultColors[i].color);
		return made;
	}();
	return *colors;
}


int32
IndexOf(color_which which)
{
	for (size_t i = 0; i < std::size(kDefaultColors); i++) {
		if (kDefaultColors[i].which == which)
			return static_cast<int32>(i);
	}
	return -1;
}


uint8
Mix(uint8 first, uint8 second, uint8 amount)
{
	return static_cast<uint8>((first * (255 - amount) + second * amount) / 255);
}


int32
Distance(rgb_color a, rgb_color b)
{
	int32 red = a.red - b.red;
	int32 green = a.green - b.green;
	int32 blue = a.blue - b.blue;
	return red * red * 3 + green * green * 4 + blue * blue * 2;
}


// 32 greys, a cube of 6 x 6 x 6, and seven tones of the panel's grey; the last is transparent.
color_map*
MakeSystemColors()
{
	auto* map = new color_map();
	int32 index = 0;
	for (int32 i = 0; i < 32; i++) {
		uint8 level = static_cast<uint8>(i * 255 / 31);
		map->color_list[index++] = {level, level, level, 255};
	}
	for (int32 i = 0; i < 216; i++) {
		map->color_list[index++] = {static_cast<uint8>(i / 36 * 51),
			static_cast<uint8>(i / 6 % 6 * 51), static_cast<uint8>(i % 6 * 51), 255};
	}
	while (index < B_TRANSPARENT_MAGIC_CMAP8) {
		uint8 level = static_cast<uint8>(216 - (index - 248) * 8);
		map->color_list[index++] = {level, level, level, 255};
	}
	map->color_list[index] = B_TRANSPARENT_COLOR;

	for (int32 i = 0; i < 32768; i++) {
		auto widen = [](int32 five) { return static_cast<uint8>(five << 3 | five >> 2); };
		rgb_color color = {widen(i >> 10 & 31), widen(i >> 5 & 31), widen(i & 31), 255};
		int32 best = 0;
		for (int32 candidate = 1; candidate < B_TRANSPARENT_MAGIC_CMAP8; candidate++) {
			if (Distance(map->color_list[candidate], color)
				< Distance(map->color_list[best], color))
				best = candidate;
		}
		map->index_map[i] = static_cast<uint8>(best);
	}
	for (int32 i = 0; i < 256; i++) {
		rgb_color color = map->color_list[i];
		map->inversion_map[i] = map->index_map[(255 - color.red) >> 3 << 10
			| (255 - color.green) >> 3 << 5 | (255 - color.blue) >> 3];
	}
	return map;
}

} // namespace


int32
rgb_color::Brightness() const
{
	// The weights of the eye's sensitivity to each of the three.
	return static_cast<int32>(
		std::lround(std::sqrt(0.299f * red * red + 0.587f * green * green + 0.114f * blue * blue)));
}


rgb_color
mix_color(rgb_color color1, rgb_color color2, uint8 amount)
{
	return {Mix(color1.red, color2.red, amount), Mix(color1.green, color2.green, amount),
		Mix(color1.blue, color2.blue, amount), Mix(color1.alpha, color2.alpha, amount)};
}


rgb_color
blend_color(rgb_color color1, rgb_color color2, uint8 amount)
{
	int32 weight1 = color1.alpha * (255 - amount);
	int32 weight2 = color2.alpha * amount;
	int32 sum = weight1 + weight2;
	if (sum == 0)
		return {0, 0, 0, 0};

	auto blend = [&](uint8 first, uint8 second) {
		return static_cast<uint8>((first * weight1 + second * weight2) / sum);
	};
	return {blend(color1.red, color2.red), blend(color1.green, color2.green),
		blend(color1.blue, color2.blue), static_cast<uint8>(sum / 255)};
}


rgb_color
disable_color(rgb_color color, rgb_color background)
{
	return mix_color(background, color, kDisabledAmount);
}


rgb_color
tint_color(rgb_color color, float tint)
{
	tint = std::clamp(tint, B_LIGHTEN_MAX_TINT, B_DARKEN_MAX_TINT);
	auto change = [tint](uint8 part) {
		float value = tint < 1 ? 255 - (255 - part) * tint : part * (2 - tint);
		return static_cast<uint8>(value);
	};
	return {change(color.red), change(color.green), change(color.blue), color.alpha};
}


rgb_color
ui_color(color_which which)
{
	int32 index = IndexOf(which);
	if (index < 0)
		return {0, 0, 0, 255};
	return std::bit_cast<rgb_color>(UserColors()[index].load());
}


void
set_ui_color(const color_which& which, const rgb_color& color)
{
	int32 index = IndexOf(which);
	if (index >= 0)
		UserColors()[index] = std::bit_cast<uint32>(color);
}


const char*
ui_color_name(color_which which)
{
	int32 index = IndexOf(which);
	return index < 0 ? nullptr : kDefaultColors[index].name;
}


color_which
which_ui_color(const char* name)
{
	for (const NamedColor& color : kDefaultColors) {
		if (name != nullptr && std::strcmp(color.name, name) == 0)
			return color.which;
	}
	return B_NO_COLOR;
}


rgb_color
keyboard_navigation_color()
{
	return ui_color(B_KEYBOARD_NAVIGATION_COLOR);
}


const color_map*
system_colors()
{
	static const color_map* map = MakeSystemColors();
	return map;
}

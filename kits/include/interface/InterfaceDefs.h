// SPDX-License-Identifier: MIT
// Key codes, modifiers, alignments, system colours and input settings.
#ifndef _INTERFACE_DEFS_H
#define _INTERFACE_DEFS_H

#include <GraphicsDefs.h>
#include <OS.h>
#include <SupportDefs.h>

class BPoint;

/// The modifiers held and, one bit a raw key, the keys that are down: byte k >> 3, mask 0x80 >> (k & 7).
struct key_info {
	uint32 modifiers;
	uint8 key_states[16];
};

/// What each raw key gives with each set of modifiers: offsets into a buffer of counted UTF-8 texts.
struct key_map {
	uint32 version;
	uint32 caps_key;
	uint32 scroll_key;
	uint32 num_key;
	uint32 left_shift_key;
	uint32 right_shift_key;
	uint32 left_command_key;
	uint32 right_command_key;
	uint32 left_control_key;
	uint32 right_control_key;
	uint32 left_option_key;
	uint32 right_option_key;
	uint32 menu_key;
	uint32 lock_settings;
	int32 control_map[128];
	int32 option_caps_shift_map[128];
	int32 option_caps_map[128];
	int32 option_shift_map[128];
	int32 option_map[128];
	int32 caps_shift_map[128];
	int32 caps_map[128];
	int32 shift_map[128];
	int32 normal_map[128];
	int32 acute_dead_key[32];
	int32 grave_dead_key[32];
	int32 circumflex_dead_key[32];
	int32 dieresis_dead_key[32];
	int32 tilde_dead_key[32];
	uint32 acute_tables;
	uint32 grave_tables;
	uint32 circumflex_tables;
	uint32 dieresis_tables;
	uint32 tilde_tables;
};

struct scroll_bar_info {
	bool proportional;
	bool double_arrows;
	int32 knob;
	int32 min_knob_size;
};

enum {
	B_ASCII_NUL = 0,
	B_HOME = 1,
	B_ASCII_START_TEXT = 2,
	B_ASCII_END_TEXT = 3,
	B_END = 4,
	B_INSERT = 5,
	B_ASCII_ACKNOWLEDGE = 6,
	B_ASCII_BELL = 7,
	B_BACKSPACE = 8,
	B_TAB = 9,
	B_RETURN = 10,
	B_ENTER = 10,
	B_PAGE_UP = 11,
	B_PAGE_DOWN = 12,
	B_ASCII_CARRIAGE_RETURN = 13,
	B_ASCII_SHIFT_OUT = 14,
	B_ASCII_SHIFT_IN = 15,
	B_FUNCTION_KEY = 16,
	B_ASCII_XON = 17,
	B_DEVICE_CONTROL_2 = 18,
	B_ASCII_XOFF = 19,
	B_DEVICE_CONTROL_4 = 20,
	B_ASCII_NEGATIVE_ACK = 21,
	B_ASCII_SYNC_IDLE = 22,
	B_ASCII_END_TRANSMISSION_BLOCK = 23,
	B_ASCII_CANCEL = 24,
	B_ASCII_END_MEDIUM = 25,
	B_SUBSTITUTE = 26,
	B_ESCAPE = 27,
	B_LEFT_ARROW = 28,
	B_RIGHT_ARROW = 29,
	B_UP_ARROW = 30,
	B_DOWN_ARROW = 31,
	B_SPACE = 32,
	B_DELETE = 127,
	B_KATAKANA_HIRAGANA = 242,
	B_HANKAKU_ZENKAKU = 243,
};

enum {
	B_F1_KEY = 2,
	B_F2_KEY = 3,
	B_F3_KEY = 4,
	B_F4_KEY = 5,
	B_F5_KEY = 6,
	B_F6_KEY = 7,
	B_F7_KEY = 8,
	B_F8_KEY = 9,
	B_F9_KEY = 10,
	B_F10_KEY = 11,
	B_F11_KEY = 12,
	B_F12_KEY = 13,
	B_PRINT_KEY = 14,
	B_SCROLL_KEY = 15,
	B_PAUSE_KEY = 16,
	B_NUM_LOCK_KEY = 34,
	B_CAPS_LOCK_KEY = 59,
	B_SPACE_BAR_KEY = 94,
	B_NUMPAD_EQUAL_KEY = 106,
	B_HANGUL_KEY = 240,
	B_HANGUL_HANJA_KEY = 241,
};

enum {
	B_CONTROL_TABLE = 1,
	B_OPTION_CAPS_SHIFT_TABLE = 2,
	B_OPTION_CAPS_TABLE = 4,
	B_OPTION_SHIFT_TABLE = 8,
	B_OPTION_TABLE = 16,
	B_CAPS_SHIFT_TABLE = 32,
	B_CAPS_TABLE = 64,
	B_SHIFT_TABLE = 128,
	B_NORMAL_TABLE = 256,
};

enum {
	B_SHIFT_KEY = 1,
	B_COMMAND_KEY = 2,
	B_CONTROL_KEY = 4,
	B_CAPS_LOCK = 8,
	B_SCROLL_LOCK = 16,
	B_NUM_LOCK = 32,
	B_OPTION_KEY = 64,
	B_MENU_KEY = 128,
	B_LEFT_SHIFT_KEY = 256,
	B_RIGHT_SHIFT_KEY = 512,
	B_LEFT_COMMAND_KEY = 1024,
	B_RIGHT_COMMAND_KEY = 2048,
	B_LEFT_CONTROL_KEY = 4096,
	B_RIGHT_CONTROL_KEY = 8192,
	B_LEFT_OPTION_KEY = 16384,
	B_RIGHT_OPTION_KEY = 32768,
	B_NO_COMMAND_KEY = 65536,
};

enum mode_mouse {
	B_NORMAL_MOUSE = 0,
	B_CLICK_TO_FOCUS_MOUSE = -1,
	B_FOCUS_FOLLOWS_MOUSE = 1,
};

enum mode_focus_follows_mouse {
	B_NORMAL_FOCUS_FOLLOWS_MOUSE = 0,
	B_WARP_FOCUS_FOLLOWS_MOUSE = 1,
	B_INSTANT_WARP_FOCUS_FOLLOWS_MOUSE = 2,
};

enum border_style {
	B_PLAIN_BORDER = 0,
	B_FANCY_BORDER = 1,
	B_NO_BORDER = 2,
};

enum orientation {
	B_HORIZONTAL = 0,
	B_VERTICAL = 1,
};

enum button_width {
	B_WIDTH_AS_USUAL = 0,
	B_WIDTH_FROM_WIDEST = 1,
	B_WIDTH_FROM_LABEL = 2,
};

enum alignment {
	B_ALIGN_LEFT = 0,
	B_ALIGN_RIGHT = 1,
	B_ALIGN_CENTER = 2,
	B_ALIGN_HORIZONTAL_CENTER = 2,
	B_ALIGN_HORIZONTAL_UNSET = -1,
	B_ALIGN_USE_FULL_WIDTH = -2,
};

enum vertical_alignment {
	B_ALIGN_TOP = 16,
	B_ALIGN_MIDDLE = 32,
	B_ALIGN_BOTTOM = 48,
	B_ALIGN_VERTICAL_CENTER = 32,
	B_ALIGN_VERTICAL_UNSET = -1,
	B_ALIGN_NO_VERTICAL = -1,
	B_ALIGN_USE_FULL_HEIGHT = -2,
};

enum BSpacing {
	B_USE_DEFAULT_SPACING = -1002,
	B_USE_ITEM_SPACING = -1003,
	B_USE_ITEM_INSETS = -1003,
	B_USE_HALF_ITEM_SPACING = -1004,
	B_USE_HALF_ITEM_INSETS = -1004,
	B_USE_WINDOW_SPACING = -1005,
	B_USE_WINDOW_INSETS = -1005,
	B_USE_SMALL_SPACING = -1006,
	B_USE_SMALL_INSETS = -1006,
	B_USE_CORNER_SPACING = -1007,
	B_USE_CORNER_INSETS = -1007,
	B_USE_BIG_SPACING = -1008,
	B_USE_BIG_INSETS = -1008,
	B_USE_BORDER_SPACING = -1009,
	B_USE_BORDER_INSETS = -1009,
};

enum join_mode {
	B_ROUND_JOIN = 0,
	B_MITER_JOIN = 1,
	B_BEVEL_JOIN = 2,
	B_BUTT_JOIN = 3,
	B_SQUARE_JOIN = 4,
};

enum cap_mode {
	B_ROUND_CAP = 0,
	B_BUTT_CAP = 3,
	B_SQUARE_CAP = 4,
};

const float B_DEFAULT_MITER_LIMIT = 10.0f;
enum {
	B_EVEN_ODD = 0,
	B_NONZERO = 1,
};

enum bitmap_tiling {
	B_TILE_BITMAP_X = 1,
	B_TILE_BITMAP_Y = 2,
	B_TILE_BITMAP = 3,
};

enum overlay_options {
	B_OVERLAY_FILTER_HORIZONTAL = 65536,
	B_OVERLAY_FILTER_VERTICAL = 131072,
	B_OVERLAY_MIRROR = 262144,
	B_OVERLAY_TRANSFER_CHANNEL = 524288,
};

enum bitmap_drawing_options {
	B_FILTER_BITMAP_BILINEAR = 256,
	B_WAIT_FOR_RETRACE = 2048,
};

enum color_which {
	B_NO_COLOR = 0,
	B_PANEL_BACKGROUND_COLOR = 1,
	B_PANEL_TEXT_COLOR = 10,
	B_DOCUMENT_BACKGROUND_COLOR = 11,
	B_DOCUMENT_TEXT_COLOR = 12,
	B_CONTROL_BACKGROUND_COLOR = 13,
	B_CONTROL_TEXT_COLOR = 14,
	B_CONTROL_BORDER_COLOR = 15,
	B_CONTROL_HIGHLIGHT_COLOR = 16,
	B_CONTROL_MARK_COLOR = 27,
	B_NAVIGATION_BASE_COLOR = 4,
	B_NAVIGATION_PULSE_COLOR = 17,
	B_SHINE_COLOR = 18,
	B_SHADOW_COLOR = 19,
	B_LINK_TEXT_COLOR = 33,
	B_LINK_HOVER_COLOR = 34,
	B_LINK_VISITED_COLOR = 35,
	B_LINK_ACTIVE_COLOR = 36,
	B_MENU_BACKGROUND_COLOR = 2,
	B_MENU_SELECTED_BACKGROUND_COLOR = 6,
	B_MENU_ITEM_TEXT_COLOR = 7,
	B_MENU_SELECTED_ITEM_TEXT_COLOR = 8,
	B_MENU_SELECTED_BORDER_COLOR = 9,
	B_LIST_BACKGROUND_COLOR = 28,
	B_LIST_SELECTED_BACKGROUND_COLOR = 29,
	B_LIST_ITEM_TEXT_COLOR = 30,
	B_LIST_SELECTED_ITEM_TEXT_COLOR = 31,
	B_SCROLL_BAR_THUMB_COLOR = 32,
	B_TOOL_TIP_BACKGROUND_COLOR = 20,
	B_TOOL_TIP_TEXT_COLOR = 21,
	B_STATUS_BAR_COLOR = 37,
	B_SUCCESS_COLOR = 100,
	B_FAILURE_COLOR = 101,
	B_WINDOW_TAB_COLOR = 3,
	B_WINDOW_TEXT_COLOR = 22,
	B_WINDOW_INACTIVE_TAB_COLOR = 23,
	B_WINDOW_INACTIVE_TEXT_COLOR = 24,
	B_WINDOW_BORDER_COLOR = 25,
	B_WINDOW_INACTIVE_BORDER_COLOR = 26,
	B_KEYBOARD_NAVIGATION_COLOR = 4,
	B_MENU_SELECTION_BACKGROUND_COLOR = 6,
	B_DESKTOP_COLOR = 5,
};

const float B_LIGHTEN_MAX_TINT = 0.0f;
const float B_LIGHTEN_2_TINT = 0.385f;
const float B_LIGHTEN_1_TINT = 0.59f;
const float B_NO_TINT = 1.0f;
const float B_DARKEN_1_TINT = 1.147f;
const float B_DARKEN_2_TINT = 1.295f;
const float B_DARKEN_3_TINT = 1.407f;
const float B_DARKEN_4_TINT = 1.555f;
const float B_DARKEN_MAX_TINT = 2.0f;
const float B_DISABLED_LABEL_TINT = 1.407f;
const float B_HIGHLIGHT_BACKGROUND_TINT = 1.295f;
const float B_DISABLED_MARK_TINT = 0.385f;
enum {
	B_INACTIVE_ICON_BITMAP = 0,
	B_ACTIVE_ICON_BITMAP = 1,
	B_PARTIALLY_ACTIVATE_ICON_BITMAP = 2,
	B_DISABLED_ICON_BITMAP = 128,
};

enum {
	B_KEEP_ICON_BITMAP = 1,
};

enum {
	B_TRIM_ICON_BITMAP = 256,
	B_TRIM_ICON_BITMAP_KEEP_ASPECT = 512,
	B_CREATE_ACTIVE_ICON_BITMAP = 1024,
	B_CREATE_PARTIALLY_ACTIVE_ICON_BITMAP = 2048,
	B_CREATE_DISABLED_ICON_BITMAPS = 4096,
};

#define B_UTF8_BULLET "\xe2\x80\xa2"
#define B_UTF8_ELLIPSIS "\xe2\x80\xa6"
#define B_UTF8_OPEN_QUOTE "\xe2\x80\x9c"
#define B_UTF8_CLOSE_QUOTE "\xe2\x80\x9d"
#define B_UTF8_COPYRIGHT "\xc2\xa9"
#define B_UTF8_REGISTERED "\xc2\xae"
#define B_UTF8_TRADEMARK "\xe2\x84\xa2"
#define B_UTF8_SMILING_FACE "\xe2\x98\xbb"
#define B_UTF8_HIROSHI "\xe5\xbc\x98"
const uint32 B_MAX_MOUSE_BUTTONS = 0x00000010;

#define B_MOUSE_BUTTON(n) (1u << ((n)-1))

rgb_color tint_color(rgb_color color, float tint);

/// The user's colour for \a which; opaque black for an unknown one. Any thread.
rgb_color ui_color(color_which which);
void set_ui_color(const color_which& which, const rgb_color& color);

/// The constant's name in text, null for an unknown one; which_ui_color() is its inverse.
const char* ui_color_name(color_which which);
color_which which_ui_color(const char* name);
rgb_color keyboard_navigation_color();
const color_map* system_colors();

/// The modifier keys held now, locks included. Any thread.
uint32 modifiers();
status_t get_key_info(key_info* info);

/// Two blocks that the caller frees with free() (older code: delete). Null when there is no memory.
void get_key_map(key_map** _map, char** _keyBuffer);
status_t get_modifier_key(uint32 modifier, uint32* key);
void set_modifier_key(uint32 modifier, uint32 key);
status_t get_key_repeat_rate(int32* rate);
status_t get_key_repeat_delay(bigtime_t* delay);

status_t get_scroll_bar_info(scroll_bar_info* info);
status_t get_mouse_type(int32* type);
status_t get_mouse_type(const char* mouse_name, int32* type);

/// The longest time between the presses of a double click, in microseconds.
status_t get_click_speed(bigtime_t* speed);
status_t get_click_speed(const char* mouse_name, bigtime_t* speed);
status_t get_mouse(BPoint* screenWhere, uint32* buttons);
bool focus_follows_mouse();
bigtime_t idle_time();

int32 count_workspaces();
int32 current_workspace();
void activate_workspace(int32 workspace);

#endif // _INTERFACE_DEFS_H

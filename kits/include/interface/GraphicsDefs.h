// SPDX-License-Identifier: MIT
// Colours, patterns, colour spaces and drawing modes.
#ifndef _GRAPHICS_DEFS_H
#define _GRAPHICS_DEFS_H

#include <SupportDefs.h>

/// Eight rows of eight pixels, top row first, high bit left: 1 is the high colour, 0 the low one.
struct pattern {
	uint8 data[8];
};

extern const pattern B_SOLID_HIGH;
extern const pattern B_MIXED_COLORS;
extern const pattern B_SOLID_LOW;

inline bool
operator==(const pattern& a, const pattern& b)
{
	return __builtin_memcmp(a.data, b.data, sizeof(a.data)) == 0;
}


inline bool
operator!=(const pattern& a, const pattern& b)
{
	return !(a == b);
}


/// A colour with its opacity (255 is opaque). An aggregate: initialise it with braces.
struct rgb_color {
	uint8 red;
	uint8 green;
	uint8 blue;
	uint8 alpha;

	rgb_color& set_to(uint8 r, uint8 g, uint8 b, uint8 a = 255)
	{
		red = r;
		green = g;
		blue = b;
		alpha = a;
		return *this;
	}

	bool operator==(const rgb_color& other) const
	{
		return red == other.red && green == other.green && blue == other.blue
			&& alpha == other.alpha;
	}

	bool operator!=(const rgb_color& other) const { return !(*this == other); }

	/// The perceived brightness, 0 to 255; the opacity does not count.
	int32 Brightness() const;
	bool IsDark() const { return Brightness() <= 127; }
	bool IsLight() const { return !IsDark(); }
};

inline rgb_color
make_color(uint8 red, uint8 green, uint8 blue, uint8 alpha = 255)
{
	return rgb_color{red, green, blue, alpha};
}


/// The way from \a color1 (amount 0) to \a color2 (amount 255), opacities included.
rgb_color mix_color(rgb_color color1, rgb_color color2, uint8 amount);

/// As mix_color(), each colour counting by its opacity too.
rgb_color blend_color(rgb_color color1, rgb_color color2, uint8 amount);

/// \a color as a disabled control on \a background shows it.
rgb_color disable_color(rgb_color color, rgb_color background);

extern const rgb_color B_TRANSPARENT_COLOR;
extern const rgb_color B_TRANSPARENT_32_BIT;
extern const uint8 B_TRANSPARENT_8_BIT;

extern const uint8 B_TRANSPARENT_MAGIC_CMAP8;
extern const uint16 B_TRANSPARENT_MAGIC_RGBA15;
extern const uint16 B_TRANSPARENT_MAGIC_RGBA15_BIG;
extern const uint32 B_TRANSPARENT_MAGIC_RGBA32;
extern const uint32 B_TRANSPARENT_MAGIC_RGBA32_BIG;

/// The 256 colours of B_CMAP8, and the nearest of them for each 15 bit colour.
struct color_map {
	int32 id;
	rgb_color color_list[256];
	uint8 inversion_map[256];
	uint8 index_map[32768];
};

struct screen_id {
	int32 id;
};

extern const screen_id B_MAIN_SCREEN_ID;

enum color_space {
	B_NO_COLOR_SPACE = 0,
	B_RGBA64 = 8210,
	B_RGB48 = 17,
	B_RGB32 = 8,
	B_RGBA32 = 8200,
	B_RGB30 = 9,
	B_RGB24 = 3,
	B_RGB16 = 5,
	B_RGB15 = 16,
	B_RGBA15 = 8208,
	B_CMAP8 = 4,
	B_GRAY8 = 2,
	B_GRAY1 = 1,
	B_RGBA64_BIG = 12306,
	B_RGB48_BIG = 4113,
	B_RGB32_BIG = 4104,
	B_RGBA32_BIG = 12296,
	B_RGB30_BIG = 4105,
	B_RGB24_BIG = 4099,
	B_RGB16_BIG = 4101,
	B_RGB15_BIG = 4112,
	B_RGBA15_BIG = 12304,
	B_RGBA64_LITTLE = 8210,
	B_RGB48_LITTLE = 17,
	B_RGB32_LITTLE = 8,
	B_RGBA32_LITTLE = 8200,
	B_RGB30_LITTLE = 9,
	B_RGB24_LITTLE = 3,
	B_RGB16_LITTLE = 5,
	B_RGB15_LITTLE = 16,
	B_RGBA15_LITTLE = 8208,
	B_MONOCHROME_1_BIT = 1,
	B_GRAYSCALE_8_BIT = 2,
	B_COLOR_8_BIT = 4,
	B_RGB_32_BIT = 8,
	B_RGB_16_BIT = 16,
	B_BIG_RGB_32_BIT = 4104,
	B_BIG_RGB_16_BIT = 4112,
};

enum {
	B_VIEWS_SUPPORT_DRAW_BITMAP = 1,
	B_BITMAPS_SUPPORT_ATTACHED_VIEWS = 2,
	B_BITMAPS_SUPPORT_OVERLAY = 4,
};

enum buffer_orientation {
	B_BUFFER_TOP_TO_BOTTOM = 0,
	B_BUFFER_BOTTOM_TO_TOP = 1,
};

enum buffer_layout {
	B_BUFFER_NONINTERLEAVED = 1,
};

enum drawing_mode {
	B_OP_COPY = 0,
	B_OP_OVER = 1,
	B_OP_ERASE = 2,
	B_OP_INVERT = 3,
	B_OP_ADD = 4,
	B_OP_SUBTRACT = 5,
	B_OP_BLEND = 6,
	B_OP_MIN = 7,
	B_OP_MAX = 8,
	B_OP_SELECT = 9,
	B_OP_ALPHA = 10,
};

enum source_alpha {
	B_PIXEL_ALPHA = 0,
	B_CONSTANT_ALPHA = 1,
};

enum alpha_function {
	B_ALPHA_OVERLAY = 0,
	B_ALPHA_COMPOSITE = 1,
	B_ALPHA_COMPOSITE_SOURCE_OVER = 1,
	B_ALPHA_COMPOSITE_SOURCE_IN = 2,
	B_ALPHA_COMPOSITE_SOURCE_OUT = 3,
	B_ALPHA_COMPOSITE_SOURCE_ATOP = 4,
	B_ALPHA_COMPOSITE_DESTINATION_OVER = 5,
	B_ALPHA_COMPOSITE_DESTINATION_IN = 6,
	B_ALPHA_COMPOSITE_DESTINATION_OUT = 7,
	B_ALPHA_COMPOSITE_DESTINATION_ATOP = 8,
	B_ALPHA_COMPOSITE_XOR = 9,
	B_ALPHA_COMPOSITE_CLEAR = 10,
	B_ALPHA_COMPOSITE_DIFFERENCE = 11,
	B_ALPHA_COMPOSITE_LIGHTEN = 12,
	B_ALPHA_COMPOSITE_DARKEN = 13,
};

enum {
	B_8_BIT_640x480 = 1,
	B_8_BIT_800x600 = 2,
	B_8_BIT_1024x768 = 4,
	B_8_BIT_1280x1024 = 8,
	B_8_BIT_1600x1200 = 16,
	B_16_BIT_640x480 = 32,
	B_16_BIT_800x600 = 64,
	B_16_BIT_1024x768 = 128,
	B_16_BIT_1280x1024 = 256,
	B_16_BIT_1600x1200 = 512,
	B_32_BIT_640x480 = 1024,
	B_32_BIT_800x600 = 2048,
	B_32_BIT_1024x768 = 4096,
	B_32_BIT_1280x1024 = 8192,
	B_32_BIT_1600x1200 = 16384,
	B_8_BIT_1152x900 = 32768,
	B_16_BIT_1152x900 = 65536,
	B_32_BIT_1152x900 = 131072,
	B_15_BIT_640x480 = 262144,
	B_15_BIT_800x600 = 524288,
	B_15_BIT_1024x768 = 1048576,
	B_15_BIT_1280x1024 = 2097152,
	B_15_BIT_1600x1200 = 4194304,
	B_15_BIT_1152x900 = 8388608,
	B_8_BIT_640x400 = 2147483648,
};

#endif // _GRAPHICS_DEFS_H

// SPDX-License-Identifier: MIT
// Pixels of the colour spaces. A table by colour space, so that each is described in one place.
#include "interface/PixelFormat.h"

#include <algorithm>
#include <cstring>

#include <Errors.h>
#include <InterfaceDefs.h>

#include "interface/ArchivedEnum.h"

namespace BPrivate {

namespace {

int32
BitsPerPixel(color_space space)
{
	switch (space) {
		case B_RGB32:
		case B_RGBA32:
		case B_RGB32_BIG:
		case B_RGBA32_BIG:
			return 32;
		case B_RGB24:
		case B_RGB24_BIG:
			return 24;
		case B_RGB16:
		case B_RGB16_BIG:
		case B_RGB15:
		case B_RGBA15:
		case B_RGB15_BIG:
		case B_RGBA15_BIG:
			return 16;
		case B_CMAP8:
		case B_GRAY8:
			return 8;
		case B_GRAY1:
			return 1;
		default:
			return 0;
	}
}


uint16
Word(const uint8* bytes, bool big)
{
	return big ? bytes[0] << 8 | bytes[1] : bytes[1] << 8 | bytes[0];
}


void
PutWord(uint8* bytes, uint16 word, bool big)
{
	bytes[big ? 0 : 1] = static_cast<uint8>(word >> 8);
	bytes[big ? 1 : 0] = static_cast<uint8>(word);
}


uint8
Widen5(int32 five)
{
	five &= 31;
	return static_cast<uint8>(five << 3 | five >> 2);
}


uint8
Widen6(int32 six)
{
	six &= 63;
	return static_cast<uint8>(six << 2 | six >> 4);
}


// A colour that equals the transparent one in what its space keeps stays transparent.
bool
IsMagic(rgb_color color)
{
	return color.red == B_TRANSPARENT_COLOR.red && color.green == B_TRANSPARENT_COLOR.green
		&& color.blue == B_TRANSPARENT_COLOR.blue;
}

} // namespace


color_space
ColorSpaceOf(uint32 number)
{
	return EnumAmong(static_cast<int32>(number),
		{B_RGB32, B_RGBA32, B_RGB32_BIG, B_RGBA32_BIG, B_RGB24, B_RGB24_BIG, B_RGB16, B_RGB16_BIG,
			B_RGB15, B_RGBA15, B_RGB15_BIG, B_RGBA15_BIG, B_CMAP8, B_GRAY8, B_GRAY1},
		B_NO_COLOR_SPACE);
}


int32
RowLength(int32 width, color_space space)
{
	int64 bits = static_cast<int64>(BitsPerPixel(space)) * width;
	return static_cast<int32>((bits + 31) / 32 * 4);
}


rgb_color
ReadPixel(const uint8* row, int32 x, color_space space)
{
	const uint8* pixel = row + static_cast<size_t>(BitsPerPixel(space)) * x / 8;
	switch (space) {
		case B_RGB32:
		{
			rgb_color color = {pixel[2], pixel[1], pixel[0], 255};
			if (IsMagic(color) && pixel[3] == 0)
				color.alpha = 0;
			return color;
		}
		case B_RGBA32:
			return {pixel[2], pixel[1], pixel[0], pixel[3]};
		case B_RGB32_BIG:
			return {pixel[1], pixel[2], pixel[3], 255};
		case B_RGBA32_BIG:
			return {pixel[1], pixel[2], pixel[3], pixel[0]};
		case B_RGB24:
			return {pixel[2], pixel[1], pixel[0], 255};
		case B_RGB24_BIG:
			return {pixel[0], pixel[1], pixel[2], 255};
		case B_RGB16:
		case B_RGB16_BIG:
		{
			uint16 word = Word(pixel, space == B_RGB16_BIG);
			return {Widen5(word >> 11), Widen6(word >> 5), Widen5(word), 255};
		}
		case B_RGB15:
		case B_RGB15_BIG:
		case B_RGBA15:
		case B_RGBA15_BIG:
		{
			uint16 word = Word(pixel, space == B_RGB15_BIG || space == B_RGBA15_BIG);
			bool hasAlpha = space == B_RGBA15 || space == B_RGBA15_BIG;
			bool clear = hasAlpha ? (word & 0x8000) == 0 : word == B_TRANSPARENT_MAGIC_RGBA15;
			return {Widen5(word >> 10), Widen5(word >> 5), Widen5(word),
				static_cast<uint8>(clear ? 0 : 255)};
		}
		case B_CMAP8:
			return system_colors()->color_list[*pixel];
		case B_GRAY8:
			return {*pixel, *pixel, *pixel, 255};
		case B_GRAY1:
		{
			// A set bit is ink.
			uint8 level = (*pixel & 0x80 >> (x & 7)) != 0 ? 0 : 255;
			return {level, level, level, 255};
		}
		default:
			return {0, 0, 0, 0};
	}
}


void
WritePixel(uint8* row, int32 x, color_space space, rgb_color color)
{
	uint8* pixel = row + static_cast<size_t>(BitsPerPixel(space)) * x / 8;
	switch (space) {
		case B_RGB32:
		case B_RGBA32:
			pixel[0] = color.blue;
			pixel[1] = color.green;
			pixel[2] = color.red;
			pixel[3] = color.alpha;
			break;
		case B_RGB32_BIG:
		case B_RGBA32_BIG:
			pixel[0] = color.alpha;
			pixel[1] = color.red;
			pixel[2] = color.green;
			pixel[3] = color.blue;
			break;
		case B_RGB24:
			pixel[0] = color.blue;
			pixel[1] = color.green;
			pixel[2] = color.red;
			break;
		case B_RGB24_BIG:
			pixel[0] = color.red;
			pixel[1] = color.green;
			pixel[2] = color.blue;
			break;
		case B_RGB16:
		case B_RGB16_BIG:
			PutWord(pixel, (color.red >> 3) << 11 | (color.green >> 2) << 5 | color.blue >> 3,
				space == B_RGB16_BIG);
			break;
		case B_RGB15:
		case B_RGB15_BIG:
		case B_RGBA15:
		case B_RGBA15_BIG:
			PutWord(pixel,
				(color.alpha >= 128 ? 0x8000 : 0) | (color.red >> 3) << 10 | (color.green >> 3) << 5
					| color.blue >> 3,
				space == B_RGB15_BIG || space == B_RGBA15_BIG);
			break;
		case B_CMAP8:
			*pixel = color.alpha < 128 ? B_TRANSPARENT_MAGIC_CMAP8
									   : system_colors()->index_map[(color.red >> 3) << 10
										   | (color.green >> 3) << 5 | color.blue >> 3];
			break;
		case B_GRAY8:
			*pixel =
				static_cast<uint8>((color.red * 308 + color.green * 600 + color.blue * 116) >> 10);
			break;
		case B_GRAY1:
		{
			uint8 bit = 0x80 >> (x & 7);
			bool ink = color.red + color.green + color.blue < 3 * 128;
			*pixel = ink ? *pixel | bit : *pixel & ~bit;
			break;
		}
		default:
			break;
	}
}


status_t
ConvertPixels(const PixelRows& from, int32 fromX, int32 fromY, const PixelRows& to, int32 toX,
	int32 toY, int32 width, int32 height)
{
	int32 fromBits = BitsPerPixel(from.space), toBits = BitsPerPixel(to.space);
	if (fromBits == 0 || toBits == 0 || from.bytesPerRow <= 0 || to.bytesPerRow <= 0)
		return B_BAD_VALUE;

	width = std::min(
		{width, from.bytesPerRow * 8 / fromBits - fromX, to.bytesPerRow * 8 / toBits - toX});
	for (int32 y = 0; y < height; y++) {
		int64 fromStart = static_cast<int64>(from.bytesPerRow) * (fromY + y);
		int64 toStart = static_cast<int64>(to.bytesPerRow) * (toY + y);
		// The last row of what programs give is often not padded.
		int64 available = (from.length - fromStart) * 8 / fromBits - fromX;
		int32 count = static_cast<int32>(std::min<int64>(width, available));
		if (count <= 0 || toStart + to.bytesPerRow > to.length)
			break;

		const uint8* source = from.bits + fromStart;
		uint8* target = to.bits + toStart;
		if (from.space == to.space && fromBits >= 8) {
			std::memmove(target + toX * (toBits / 8), source + fromX * (fromBits / 8),
				static_cast<size_t>(count) * (fromBits / 8));
			continue;
		}
		for (int32 x = 0; x < count; x++)
			WritePixel(target, toX + x, to.space, ReadPixel(source, fromX + x, from.space));
	}
	return B_OK;
}

} // namespace BPrivate

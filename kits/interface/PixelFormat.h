// SPDX-License-Identifier: MIT
// Pixels of the colour spaces: how they lie in memory, and from one to the other.
#ifndef INTERFACE_PIXEL_FORMAT_H
#define INTERFACE_PIXEL_FORMAT_H

#include <GraphicsDefs.h>

namespace BPrivate {

/// Rows from the top; borrowed.
struct PixelRows {
	uint8* bits;
	int32 length;
	int32 bytesPerRow;
	color_space space;
};


/// The colour space that has \a number, which may be anything; B_NO_COLOR_SPACE for one that has no pixels here.
color_space ColorSpaceOf(uint32 number);

/// The bytes of a row of \a width pixels, a multiple of 4; 0 for a colour space that has no pixels here.
int32 RowLength(int32 width, color_space space);

rgb_color ReadPixel(const uint8* row, int32 x, color_space space);
void WritePixel(uint8* row, int32 x, color_space space, rgb_color color);

/// Copies a rectangle, converting it. Pixels that lie outside of either buffer are left out.
/// Returns B_OK; B_BAD_VALUE, nothing written, for an unknown colour space.
status_t ConvertPixels(const PixelRows& from, int32 fromX, int32 fromY, const PixelRows& to,
	int32 toX, int32 toY, int32 width, int32 height);

} // namespace BPrivate

#endif // INTERFACE_PIXEL_FORMAT_H

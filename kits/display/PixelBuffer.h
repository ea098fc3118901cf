// SPDX-License-Identifier: MIT
// A picture in memory that somebody else owns.
#ifndef DISPLAY_PIXEL_BUFFER_H
#define DISPLAY_PIXEL_BUFFER_H

#include <vector>

#include <GraphicsDefs.h>

namespace BPrivate {

/// Rows from the top; a pixel is a 32 bit word 0xAARRGGBB in the machine's order, which on a little
/// endian one are the bytes blue, green, red, alpha of B_RGB32 and B_RGBA32. Alpha is not multiplied in.
struct PixelBuffer {
	void* bits = nullptr;
	int32 width = 0;
	int32 height = 0;
	int32 bytesPerRow = 0;
	/// False: B_RGB32, the highest byte means nothing.
	bool hasAlpha = false;
};


/// A picture that owns its pixels: width * height words as in PixelBuffer, without padding.
struct Picture {
	int32 width = 0;
	int32 height = 0;
	bool hasAlpha = false;
	std::vector<uint32> pixels;

	PixelBuffer Buffer() { return {pixels.data(), width, height, width * 4, hasAlpha}; }
};

} // namespace BPrivate

#endif // DISPLAY_PIXEL_BUFFER_H

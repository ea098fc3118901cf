// SPDX-License-Identifier: MIT
// What the drawing modes make of one pixel.
#ifndef DISPLAY_QT_BLEND_H
#define DISPLAY_QT_BLEND_H

#include <GraphicsDefs.h>

namespace BPrivate {

/// A pixel 0xAARRGGBB of \a color.
inline uint32
PixelOf(rgb_color color)
{
	return static_cast<uint32>(color.alpha) << 24 | static_cast<uint32>(color.red) << 16
		| static_cast<uint32>(color.green) << 8 | color.blue;
}


inline rgb_color
ColorOf(uint32 pixel)
{
	return {static_cast<uint8>(pixel >> 16), static_cast<uint8>(pixel >> 8),
		static_cast<uint8>(pixel), static_cast<uint8>(pixel >> 24)};
}


/// \a from with \a amount of 255 parts of \a to, each channel rounded to the nearest value.
inline uint32
MixPixels(uint32 from, uint32 to, uint32 amount)
{
	// Two channels at a time, each with room for 16 bits; x / 255 is (x + x / 256) / 256, rounded.
	const uint32 kPair = 0x00ff00ff;
	const uint32 kHalf = 0x00800080;
	auto mix = [amount](uint32 one, uint32 other) {
		uint32 sum = one * (255 - amount) + other * amount + kHalf;
		return (sum + ((sum >> 8) & kPair)) >> 8 & kPair;
	};
	return mix(from & kPair, to & kPair) | mix(from >> 8 & kPair, to >> 8 & kPair) << 8;
}


/// A drawing mode with its colours, applied to single pixels.
///
/// The buffer's alpha is kept opaque unless \a hasAlpha.
class Blend {
public:
	drawing_mode mode = B_OP_COPY;
	source_alpha alphaSource = B_PIXEL_ALPHA;
	alpha_function alphaFunction = B_ALPHA_OVERLAY;
	rgb_color high = {0, 0, 0, 255};
	rgb_color low = {255, 255, 255, 255};
	bool hasAlpha = false;

	/// A pixel of a shape: \a isHigh by the pattern, \a coverage 1 to 255.
	uint32 Shape(uint32 below, bool isHigh, uint8 coverage) const;
	/// A pixel of a character, smoothed against the low colour in B_OP_COPY.
	uint32 Text(uint32 below, uint8 coverage) const;
	/// A pixel of a bitmap that is not left out (see IsLeftOut()).
	uint32 Bitmap(uint32 below, uint32 source) const;

	/// Whether a shape's pixel replaces what is there, and by what.
	bool IsPlainFill(bool isHigh, uint32* pixel) const;
	/// Whether the mode does nothing with a low pixel.
	bool LeavesLow() const;

private:
	uint32 Arithmetic(uint32 below, rgb_color source) const;
	uint32 Alpha(uint32 below, rgb_color source, uint8 alpha) const;
	uint32 Select(uint32 below) const;
	uint32 Finish(uint32 below, uint32 result, uint8 coverage) const;
};


/// Whether a bitmap's pixel is transparent: by its alpha, or the value that stands for it in B_RGB32.
bool IsTransparentPixel(uint32 pixel, bool hasAlpha);

} // namespace BPrivate

#endif // DISPLAY_QT_BLEND_H

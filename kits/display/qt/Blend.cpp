// SPDX-License-Identifier: MIT
// What the drawing modes make of one pixel.
#include "display/qt/Blend.h"

#include <algorithm>
#include <cmath>
#include <cstdlib>

namespace BPrivate {

namespace {

const uint32 kOpaque = 0xff000000;


uint8
Mix(uint8 from, uint8 to, uint8 amount)
{
	int32 scaled = (to - from) * amount;
	return static_cast<uint8>(from + (scaled + (scaled >= 0 ? 127 : -127)) / 255);
}


int32
Brightness(rgb_color color)
{
	return color.red * 308 + color.green * 600 + color.blue * 116;
}


/// How much of the source and of what is below the Porter-Duff operations take.
void
Factors(alpha_function function, float source, float below, float* ofSource, float* ofBelow)
{
	switch (function) {
		case B_ALPHA_COMPOSITE_SOURCE_IN:
			*ofSource = below;
			*ofBelow = 0;
			break;
		case B_ALPHA_COMPOSITE_SOURCE_OUT:
			*ofSource = 1 - below;
			*ofBelow = 0;
			break;
		case B_ALPHA_COMPOSITE_SOURCE_ATOP:
			*ofSource = below;
			*ofBelow = 1 - source;
			break;
		case B_ALPHA_COMPOSITE_DESTINATION_OVER:
			*ofSource = 1 - below;
			*ofBelow = 1;
			break;
		case B_ALPHA_COMPOSITE_DESTINATION_IN:
			*ofSource = 0;
			*ofBelow = source;
			break;
		case B_ALPHA_COMPOSITE_DESTINATION_OUT:
			*ofSource = 0;
			*ofBelow = 1 - source;
			break;
		case B_ALPHA_COMPOSITE_DESTINATION_ATOP:
			*ofSource = 1 - below;
			*ofBelow = source;
			break;
		case B_ALPHA_COMPOSITE_XOR:
			*ofSource = 1 - below;
			*ofBelow = 1 - source;
			break;
		case B_ALPHA_COMPOSITE_CLEAR:
			*ofSource = 0;
			*ofBelow = 0;
			break;
		default:
			*ofSource = 1;
			*ofBelow = 1 - source;
			break;
	}
}


/// One channel of the operations that compare source and below; values already multiplied by alpha.
float
Compare(alpha_function function, float source, float sourceAlpha, float below, float belowAlpha)
{
	float a = source * belowAlpha;
	float b = below * sourceAlpha;
	switch (function) {
		case B_ALPHA_COMPOSITE_DIFFERENCE:
			return source + below - 2 * std::min(a, b);
		case B_ALPHA_COMPOSITE_LIGHTEN:
			return source * (1 - belowAlpha) + below * (1 - sourceAlpha) + std::max(a, b);
		default:
			return source * (1 - belowAlpha) + below * (1 - sourceAlpha) + std::min(a, b);
	}
}


uint32
Composite(alpha_function function, uint32 belowPixel, rgb_color color, uint8 alpha)
{
	rgb_color dest = ColorOf(belowPixel);
	float source = alpha / 255.0f;
	float below = dest.alpha / 255.0f;
	float ofSource;
	float ofBelow;
	Factors(function, source, below, &ofSource, &ofBelow);
	bool compares = function >= B_ALPHA_COMPOSITE_DIFFERENCE;

	float outAlpha = source * ofSource + below * ofBelow;
	if (compares)
		outAlpha = source + below - source * below;
	auto channel = [&](uint8 s, uint8 d) {
		float value = compares ? Compare(function, s * source, source, d * below, below)
							   : s * source * ofSource + d * below * ofBelow;
		value = outAlpha > 0 ? value / outAlpha : 0;
		return static_cast<uint8>(std::clamp(std::lround(value), 0l, 255l));
	};
	rgb_color out = {channel(color.red, dest.red), channel(color.green, dest.green),
		channel(color.blue, dest.blue), static_cast<uint8>(std::lround(outAlpha * 255))};
	return PixelOf(out);
}

} // namespace


bool
IsTransparentPixel(uint32 pixel, bool hasAlpha)
{
	if (hasAlpha)
		return (pixel & kOpaque) == 0;
	return (pixel & ~kOpaque) == (B_TRANSPARENT_MAGIC_RGBA32 & ~kOpaque);
}


uint32
Blend::Finish(uint32 below, uint32 result, uint8 coverage) const
{
	result = MixPixels(below, result, coverage);
	return hasAlpha ? result : result | kOpaque;
}


uint32
Blend::Arithmetic(uint32 belowPixel, rgb_color source) const
{
	rgb_color below = ColorOf(belowPixel);
	auto each = [&](auto operation) {
		return PixelOf({static_cast<uint8>(operation(below.red, source.red)),
			static_cast<uint8>(operation(below.green, source.green)),
			static_cast<uint8>(operation(below.blue, source.blue)), 255});
	};
	switch (mode) {
		case B_OP_INVERT:
			return each([](int32 d, int32) { return 255 - d; });
		case B_OP_ADD:
			return each([](int32 d, int32 s) { return std::min(d + s, 255); });
		case B_OP_SUBTRACT:
			return each([](int32 d, int32 s) { return std::max(d - s, 0); });
		case B_OP_BLEND:
			return each([](int32 d, int32 s) { return (d + s) / 2; });
		case B_OP_MIN:
			return Brightness(source) < Brightness(below) ? PixelOf(source) : belowPixel;
		case B_OP_MAX:
			return Brightness(source) > Brightness(below) ? PixelOf(source) : belowPixel;
		default:
			return PixelOf(source);
	}
}


uint32
Blend::Alpha(uint32 below, rgb_color source, uint8 alpha) const
{
	if (!hasAlpha)
		below |= kOpaque;
	uint32 result = Composite(alphaFunction, below, source, alpha);
	return hasAlpha ? result : result | kOpaque;
}


uint32
Blend::Select(uint32 below) const
{
	uint32 color = below & ~kOpaque;
	if (color == (PixelOf(high) & ~kOpaque))
		return PixelOf(low);
	if (color == (PixelOf(low) & ~kOpaque))
		return PixelOf(high);
	return below;
}


bool
Blend::LeavesLow() const
{
	return mode == B_OP_OVER || mode == B_OP_ERASE || mode == B_OP_INVERT || mode == B_OP_SELECT;
}


bool
Blend::IsPlainFill(bool isHigh, uint32* pixel) const
{
	if (mode == B_OP_ERASE && isHigh)
		*pixel = PixelOf(low);
	else if (mode == B_OP_COPY || (mode == B_OP_OVER && isHigh && high != B_TRANSPARENT_COLOR))
		*pixel = PixelOf(isHigh ? high : low);
	else
		return false;
	if (!hasAlpha)
		*pixel |= kOpaque;
	return true;
}


uint32
Blend::Shape(uint32 below, bool isHigh, uint8 coverage) const
{
	if (!isHigh && LeavesLow())
		return below;

	rgb_color source = isHigh ? high : low;
	switch (mode) {
		case B_OP_OVER:
			return source == B_TRANSPARENT_COLOR ? below : Finish(below, PixelOf(source), coverage);
		case B_OP_ERASE:
			return Finish(below, PixelOf(low), coverage);
		case B_OP_SELECT:
			return Finish(below, Select(below), coverage);
		case B_OP_ALPHA:
		{
			uint8 alpha = alphaSource == B_CONSTANT_ALPHA ? high.alpha : source.alpha;
			return Alpha(below, source, Mix(0, alpha, coverage));
		}
		default:
			return Finish(below, Arithmetic(below, source), coverage);
	}
}


uint32
Blend::Text(uint32 below, uint8 coverage) const
{
	if (mode == B_OP_COPY)
		return Finish(below, MixPixels(PixelOf(low), PixelOf(high), coverage), 255);
	return Shape(below, true, coverage);
}


uint32
Blend::Bitmap(uint32 below, uint32 source) const
{
	rgb_color color = ColorOf(source);
	switch (mode) {
		case B_OP_COPY:
		case B_OP_OVER:
			return hasAlpha ? source : source | kOpaque;
		case B_OP_ERASE:
			return Finish(below, PixelOf(low), 255);
		case B_OP_SELECT:
			return Finish(below, Select(below), 255);
		case B_OP_ALPHA:
			return Alpha(below, color, alphaSource == B_CONSTANT_ALPHA ? high.alpha : color.alpha);
		default:
			return Finish(below, Arithmetic(below, color), 255);
	}
}

} // namespace BPrivate

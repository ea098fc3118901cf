// SPDX-License-Identifier: MIT
// DrawableBitmap: a view of a bitmap's pixels, or a converted copy.
#include "interface/DrawableBitmap.h"

#include <Bitmap.h>

#include "interface/PixelFormat.h"

namespace BPrivate {

DrawableBitmap::DrawableBitmap(const BBitmap& bitmap)
{
	int32 width = bitmap.Bounds().IntegerWidth() + 1;
	int32 height = bitmap.Bounds().IntegerHeight() + 1;
	if (bitmap.ColorSpace() == B_RGBA32) {
		fBuffer = {bitmap.Bits(), width, height, bitmap.BytesPerRow(), true};
		return;
	}

	fPixels.resize(static_cast<size_t>(width) * height * 4);
	fBuffer = {fPixels.data(), width, height, width * 4, true};
	PixelRows from{static_cast<uint8*>(bitmap.Bits()), bitmap.BitsLength(), bitmap.BytesPerRow(),
		bitmap.ColorSpace()};
	PixelRows to{fPixels.data(), static_cast<int32>(fPixels.size()), width * 4, B_RGBA32};
	ConvertPixels(from, 0, 0, to, 0, 0, width, height);
}

} // namespace BPrivate

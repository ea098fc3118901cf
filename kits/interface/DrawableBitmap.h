// SPDX-License-Identifier: MIT
// A bitmap in the form that displays take.
#ifndef INTERFACE_DRAWABLE_BITMAP_H
#define INTERFACE_DRAWABLE_BITMAP_H

#include <vector>

#include <SupportDefs.h>

#include "display/PixelBuffer.h"

class BBitmap;

namespace BPrivate {

/// The pixels of a good bitmap, of other colour spaces than B_RGBA32 a converted copy: their transparent
/// colour becomes transparency. Borrows the bitmap's memory.
class DrawableBitmap {
public:
	explicit DrawableBitmap(const BBitmap& bitmap);

	const PixelBuffer& Buffer() const { return fBuffer; }

private:
	std::vector<uint8> fPixels;
	PixelBuffer fBuffer;
};

} // namespace BPrivate

#endif // INTERFACE_DRAWABLE_BITMAP_H

// SPDX-License-Identifier: MIT
// Bitmaps on the canvas, and moving pixels within it.
#include <algorithm>
#include <cmath>
#include <cstring>

#include "display/qt/QtCanvas.h"

namespace BPrivate {

namespace {

/// Gives the pixels of a bitmap for places that need not be whole.
class BitmapSampler {
public:
	BitmapSampler(const PixelBuffer& bitmap, const QRect& area)
		: fBitmap(bitmap),
		  fArea(area)
	{
	}

	uint32 Nearest(double x, double y) const
	{
		return At(static_cast<int>(std::floor(x)), static_cast<int>(std::floor(y)));
	}

	uint32 Smooth(double x, double y) const
	{
		double left = std::floor(x - 0.5);
		double top = std::floor(y - 0.5);
		int column = static_cast<int>(left);
		int row = static_cast<int>(top);
		double right = x - 0.5 - left;
		double bottom = y - 0.5 - top;
		uint32 corners[] = {
			At(column, row), At(column + 1, row), At(column, row + 1), At(column + 1, row + 1)};
		double weights[] = {
			(1 - right) * (1 - bottom), right * (1 - bottom), (1 - right) * bottom, right * bottom};
		uint32 result = 0;
		for (int shift = 0; shift < 32; shift += 8) {
			double sum = 0;
			for (int i = 0; i < 4; i++)
				sum += weights[i] * ((corners[i] >> shift) & 0xff);
			result |= static_cast<uint32>(std::lround(sum)) << shift;
		}
		return result;
	}

private:
	uint32 At(int x, int y) const
	{
		x = std::clamp(x, fArea.left(), fArea.right());
		y = std::clamp(y, fArea.top(), fArea.bottom());
		const uint8* row =
			static_cast<const uint8*>(fBitmap.bits) + static_cast<size_t>(y) * fBitmap.bytesPerRow;
		return reinterpret_cast<const uint32*>(row)[x];
	}

	const PixelBuffer& fBitmap;
	const QRect fArea;
};

} // namespace


void
QtCanvas::DrawBitmap(const PixelBuffer& bitmap, BRect source, BRect destination, uint32 options)
{
	if (!source.IsValid() || !destination.IsValid() || bitmap.bits == nullptr)
		return;
	fSparseLines.clear();
	QRect all(0, 0, bitmap.width, bitmap.height);
	QRect from(static_cast<int>(std::floor(source.left)), static_cast<int>(std::floor(source.top)),
		static_cast<int>(source.Width()) + 1, static_cast<int>(source.Height()) + 1);
	QRect to = WholeRect(destination);
	QRect usable = from & all;
	if (usable.isEmpty() || to.isEmpty())
		return;

	bool isTiled = (options & B_TILE_BITMAP) != 0;
	double stepX = isTiled ? 1 : static_cast<double>(from.width()) / to.width();
	double stepY = isTiled ? 1 : static_cast<double>(from.height()) / to.height();
	bool isSmooth =
		(options & B_FILTER_BITMAP_BILINEAR) != 0 && (stepX != 1 || stepY != 1 || fScale != 1);
	bool skipsTransparent = fBlend.mode != B_OP_COPY && fBlend.mode != B_OP_ALPHA;
	BitmapSampler sampler(bitmap, usable);

	ForEachSpan(Device(to), [&](int y, int left, int right) {
		uint32* row = Row(y);
		double v = from.top() + ((y + 0.5) / fScale - to.top()) * stepY;
		if (isTiled)
			v = from.top() + std::fmod(v - from.top(), from.height());
		for (int x = left; x <= right; x++) {
			double u = from.left() + ((x + 0.5) / fScale - to.left()) * stepX;
			if (isTiled)
				u = from.left() + std::fmod(u - from.left(), from.width());
			// A source that reaches beyond the bitmap leaves the rest of the destination alone.
			if (!QRectF(usable).contains(QPointF(u, v)))
				continue;
			uint32 pixel = isSmooth ? sampler.Smooth(u, v) : sampler.Nearest(u, v);
			if (skipsTransparent && IsTransparentPixel(pixel, bitmap.hasAlpha))
				continue;
			if (!bitmap.hasAlpha)
				pixel |= 0xff000000;
			row[x] = fBlend.Bitmap(row[x], pixel);
		}
	});
}


void
QtCanvas::CopyBits(BRect source, BRect destination)
{
	if (!source.IsValid() || !destination.IsValid())
		return;
	fSparseLines.clear();
	QRect from = Device(WholeRect(source));
	QRect to = Device(WholeRect(destination));
	QRect usable = from & QRect(0, 0, fBuffer.width, fBuffer.height);
	if (usable.isEmpty() || to.isEmpty())
		return;

	// A copy first: the places may overlap, and the clip cuts them into pieces.
	std::vector<uint32> copy;
	copy.reserve(static_cast<size_t>(usable.width()) * usable.height());
	for (int y = usable.top(); y <= usable.bottom(); y++)
		copy.insert(copy.end(), Row(y) + usable.left(), Row(y) + usable.right() + 1);

	ForEachSpan(to, [&](int y, int left, int right) {
		uint32* row = Row(y);
		int64 sourceY = from.top() + static_cast<int64>(y - to.top()) * from.height() / to.height();
		if (sourceY < usable.top() || sourceY > usable.bottom())
			return;
		const uint32* copied = copy.data() + (sourceY - usable.top()) * usable.width();
		for (int x = left; x <= right; x++) {
			int64 sourceX =
				from.left() + static_cast<int64>(x - to.left()) * from.width() / to.width();
			if (sourceX >= usable.left() && sourceX <= usable.right())
				row[x] = copied[sourceX - usable.left()];
		}
	});
}

} // namespace BPrivate

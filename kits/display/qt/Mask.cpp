// SPDX-License-Identifier: MIT
// How much of each pixel a shape covers.
#include "display/qt/Mask.h"

#include <cstdlib>

namespace BPrivate {

Mask::Mask(const QRect& area)
	: fArea(area)
{
	if (area.isEmpty())
		return;
	fImage = QImage(area.size(), QImage::Format_Alpha8);
	fImage.fill(0);
}


const uint8*
Mask::Row(int x, int y) const
{
	return fImage.constScanLine(y - fArea.top()) + (x - fArea.left());
}


void
Mask::Set(int x, int y)
{
	if (fArea.contains(x, y))
		fImage.scanLine(y - fArea.top())[x - fArea.left()] = 255;
}


void
Mask::AddLine(QPoint from, QPoint to)
{
	int64 dx = std::abs(static_cast<int64>(to.x()) - from.x());
	int64 dy = std::abs(static_cast<int64>(to.y()) - from.y());
	// The same pixels in both directions.
	if (from.x() > to.x() || (from.x() == to.x() && from.y() > to.y()))
		std::swap(from, to);
	int stepY = from.y() <= to.y() ? 1 : -1;

	// Only the steps inside the area count, however far the ends are away.
	if (dx >= dy) {
		int first = std::max(from.x(), fArea.left());
		int last = std::min(to.x(), fArea.right());
		for (int x = first; x <= last; x++) {
			int64 along = static_cast<int64>(x) - from.x();
			int64 rise = dx == 0 ? 0 : (2 * along * dy + dx - 1) / (2 * dx);
			Set(x, static_cast<int>(from.y() + stepY * rise));
		}
		return;
	}
	int top = std::max(std::min(from.y(), to.y()), fArea.top());
	int bottom = std::min(std::max(from.y(), to.y()), fArea.bottom());
	for (int y = top; y <= bottom; y++) {
		int64 along = std::abs(static_cast<int64>(y) - from.y());
		int64 run = (2 * along * dx + dy - 1) / (2 * dy);
		Set(static_cast<int>(from.x() + run), y);
	}
}

} // namespace BPrivate

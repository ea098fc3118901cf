// SPDX-License-Identifier: MIT
// The corners of rounded rects, made once for each radius.
#include "display/qt/RoundedShape.h"

#include <algorithm>
#include <cmath>

#include <QPainter>
#include <QPainterPath>

#include "display/qt/Mask.h"

namespace BPrivate {

namespace {

const float kLargestRadius = 32;
// More kinds than a look of controls has.
const size_t kMostShapes = 16;

} // namespace


bool
RoundedShape::IsKept(float xRadius, float yRadius)
{
	return xRadius > 0 && yRadius > 0 && std::max(xRadius, yRadius) <= kLargestRadius;
}


const RoundedShape&
RoundedShape::Of(float xRadius, float yRadius, bool stroked)
{
	thread_local std::vector<RoundedShape> shapes;
	for (const RoundedShape& shape : shapes) {
		if (shape.fXRadius == xRadius && shape.fYRadius == yRadius && shape.fStroked == stroked)
			return shape;
	}
	if (shapes.size() == kMostShapes)
		shapes.erase(shapes.begin());
	shapes.push_back(RoundedShape(xRadius, yRadius, stroked));
	return shapes.back();
}


RoundedShape::RoundedShape(float xRadius, float yRadius, bool stroked)
	: fXRadius(xRadius),
	  fYRadius(yRadius),
	  fStroked(stroked),
	  fCorner(static_cast<int>(std::ceil(std::max(xRadius, yRadius))) + 1)
{
	const int side = Side();
	Mask mask(QRect(0, 0, side, side));
	QPainterPath path;
	const double inset = stroked ? 0.5 : 0;
	path.addRoundedRect(QRectF(inset, inset, side - 2 * inset, side - 2 * inset), xRadius, yRadius);
	QPainter painter(&mask.Image());
	painter.setRenderHint(QPainter::Antialiasing);
	if (stroked)
		painter.strokePath(path, QPen(Qt::white, 1, Qt::SolidLine, Qt::FlatCap, Qt::MiterJoin));
	else
		painter.fillPath(path, Qt::white);
	painter.end();

	for (int y = 0; y < side; y++) {
		const uint8* row = mask.Row(0, y);
		fCoverage.insert(fCoverage.end(), row, row + side);
	}
}


const uint8*
RoundedShape::Row(int y, int height) const
{
	if (y >= height - fCorner)
		y = Side() - (height - y);
	else
		y = std::min(y, fCorner);
	return fCoverage.data() + y * Side();
}

} // namespace BPrivate

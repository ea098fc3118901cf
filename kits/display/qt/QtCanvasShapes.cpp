// SPDX-License-Identifier: MIT
// Lines, rects, curves and outlines on the canvas.
#include <algorithm>
#include <cmath>
#include <utility>

#include <QPainter>
#include <QPainterPath>

#include <Region.h>

#include "display/qt/Mask.h"
#include "display/qt/QtCanvas.h"
#include "display/qt/QtUse.h"

namespace BPrivate {

namespace {

const double kFarthestPen = 1 << 20;


Qt::PenCapStyle
CapStyle(cap_mode mode)
{
	switch (mode) {
		case B_ROUND_CAP:
			return Qt::RoundCap;
		case B_SQUARE_CAP:
			return Qt::SquareCap;
		default:
			return Qt::FlatCap;
	}
}


Qt::PenJoinStyle
JoinStyle(join_mode mode)
{
	switch (mode) {
		case B_ROUND_JOIN:
			return Qt::RoundJoin;
		case B_MITER_JOIN:
			return Qt::MiterJoin;
		default:
			return Qt::BevelJoin;
	}
}


QPainterPath
ArcPath(const QRectF& box, float startAngle, float arcAngle, bool isSlice)
{
	QPainterPath path;
	if (isSlice)
		path.moveTo(box.center());
	else
		path.arcMoveTo(box, startAngle);
	path.arcTo(box, startAngle, arcAngle);
	if (isSlice)
		path.closeSubpath();
	return path;
}

} // namespace


// #pragma mark - lines and rects


void
QtCanvas::StrokeLine(BPoint start, BPoint end, const pattern& pattern)
{
	QPoint points[] = {WholePoint(start), WholePoint(end)};
	StrokeStraight(points, 2, false, pattern);
}


void
QtCanvas::StrokeLine(BPoint start, BPoint end, rgb_color color)
{
	fBlend.high = color;
	StrokeLine(start, end, B_SOLID_HIGH);
	fBlend.high = fState.highColor;
}


void
QtCanvas::StrokeThickLine(QPoint start, QPoint end, const pattern& pattern)
{
	int width = PenWidth();
	int before = (width - 1) / 2;
	int after = width / 2;
	QRect line = QRect(QPoint(std::min(start.x(), end.x()), std::min(start.y(), end.y())),
		QPoint(std::max(start.x(), end.x()), std::max(start.y(), end.y())));
	bool isVertical = start.x() == end.x() && start.y() != end.y();
	bool extends = fState.lineCap == B_SQUARE_CAP;
	if (isVertical || extends)
		line.adjust(-before, 0, after, 0);
	if (!isVertical || extends)
		line.adjust(0, -before, 0, after);

	QRect device = Device(line);
	// A point is the pixel that it names, so that pictures can be made of them.
	if (line.size() != QSize(1, 1)) {
		// The pen is a square: lines meet at their corners as its steps do.
		const QSize last = isVertical ? QSize(width, 1) : QSize(1, width);
		device.setRight(
			DeviceEdge(line.right() + 1 - last.width()) + StrokeWidth(last.width()) - 1);
		device.setBottom(
			DeviceEdge(line.bottom() + 1 - last.height()) + StrokeWidth(last.height()) - 1);
	}
	FillDevice(device, pattern);
	if (fScale != std::floor(fScale))
		JoinLines(line, device, pattern);
}


/// Lines side by side, as gradients and graphs are drawn with, leave nothing free. Two are an edge with a
/// light and a dark side; from the third one on they are an area.
void
QtCanvas::JoinLines(const QRect& whole, const QRect& device, const pattern& pattern)
{
	const SparseLine line = {whole, device, fBlend, pattern};
	auto isBeside = [](const QRect& one, const QRect& other) {
		if (one.size() == QSize(1, 1)
			|| (one.width() > one.height()) != (other.width() > other.height()))
			return false;
		if (one.width() > one.height())
			return (one.bottom() + 1 == other.top() || other.bottom() + 1 == one.top())
				&& one.left() <= other.right() && other.left() <= one.right();
		return (one.right() + 1 == other.left() || other.right() + 1 == one.left())
			&& one.top() <= other.bottom() && other.top() <= one.bottom();
	};
	if (!fSparseLines.empty() && !isBeside(fSparseLines.back().whole, whole))
		fSparseLines.clear();
	fSparseLines.push_back(line);
	if (fSparseLines.size() < 3)
		return;
	if (fSparseLines.size() == 3) {
		FillRest(fSparseLines[0]);
		FillRest(fSparseLines[1]);
	}
	FillRest(line);
	// The count is all that matters from here on.
	if (fSparseLines.size() > 4)
		fSparseLines.erase(fSparseLines.begin());
}


void
QtCanvas::FillRest(const SparseLine& line)
{
	const Blend blend = std::exchange(fBlend, line.blend);
	const QRect all = Device(line.whole);
	QRect beside = all;
	beside.setLeft(line.device.right() + 1);
	QRect below = all;
	below.setTop(line.device.bottom() + 1);
	below.setRight(line.device.right());
	for (const QRect& rest : {beside, below}) {
		if (!rest.isEmpty())
			FillDevice(rest, line.pattern);
	}
	fBlend = blend;
}


void
QtCanvas::StrokeStraight(const QPoint* points, int count, bool closed, const pattern& pattern)
{
	bool isAligned = count == 2
		&& (points[0].x() == points[1].x() || points[0].y() == points[1].y())
		&& (HasThinPen() || fState.lineCap != B_ROUND_CAP);
	if (isAligned) {
		StrokeThickLine(points[0], points[1], pattern);
		return;
	}

	if (HasThinPen() && fScale == 1) {
		QRect bounds(points[0], QSize(1, 1));
		for (int i = 1; i < count; i++)
			bounds |= QRect(points[i], QSize(1, 1));
		Mask mask(bounds & fClipBounds);
		for (int i = 0; i + 1 < count && !mask.IsEmpty(); i++)
			mask.AddLine(points[i], points[i + 1]);
		if (closed && !mask.IsEmpty())
			mask.AddLine(points[count - 1], points[0]);
		PaintMask(mask, pattern);
		return;
	}

	QPainterPath path(StrokeCenter(points[0]));
	for (int i = 1; i < count; i++)
		path.lineTo(StrokeCenter(points[i]));
	if (closed)
		path.closeSubpath();
	StrokeOutline(path, 1, pattern);
}


void
QtCanvas::StrokeRect(BRect rect, const pattern& pattern)
{
	if (!rect.IsValid())
		return;
	int width = PenWidth();
	int before = (width - 1) / 2;
	int after = width / 2;
	QRect outer = WholeRect(rect).adjusted(-before, -before, after, after);
	if (outer.width() <= 2 * width || outer.height() <= 2 * width) {
		FillWhole(outer, pattern);
		return;
	}
	fSparseLines.clear();
	// Four pieces that do not overlap: modes such as invert must meet each pixel once. They keep to the
	// outer sides, where a rect that is filled ends too.
	const QRect device = Device(outer);
	const int stroke = StrokeWidth(width);
	FillDevice(QRect(device.left(), device.top(), device.width(), stroke), pattern);
	FillDevice(QRect(device.left(), device.bottom() - stroke + 1, device.width(), stroke), pattern);
	const int sideTop = device.top() + stroke;
	const int sideHeight = device.height() - 2 * stroke;
	FillDevice(QRect(device.left(), sideTop, stroke, sideHeight), pattern);
	FillDevice(QRect(device.right() - stroke + 1, sideTop, stroke, sideHeight), pattern);
}


void
QtCanvas::FillRect(BRect rect, const pattern& pattern)
{
	if (rect.IsValid())
		FillWhole(WholeRect(rect), pattern);
}


void
QtCanvas::InvertRect(BRect rect)
{
	drawing_mode mode = fBlend.mode;
	fBlend.mode = B_OP_INVERT;
	FillRect(rect, B_SOLID_HIGH);
	fBlend.mode = mode;
}


void
QtCanvas::FillRegion(const BRegion& region, const pattern& pattern)
{
	int32 count = region.CountRects();
	for (int32 i = 0; i < count; i++)
		FillRect(region.RectAt(i), pattern);
}


// #pragma mark - curves


/// At a scale that is no whole number the sides of a rect of whole pixels go to device pixels, as those of
/// straight lines do; \a keepsShape: to the same number of them wherever it is.
QRectF
QtCanvas::CurveBox(BRect rect, bool stroked, bool keepsShape, double* scale) const
{
	*scale = fScale;
	const QRectF edges = EdgeRect(rect);
	const QRect whole = edges.toAlignedRect();
	if (fScale == std::floor(fScale) || QRectF(whole) != edges)
		return stroked ? CenterRect(rect) : edges;

	*scale = 1;
	QRectF device = Device(whole);
	if (keepsShape)
		device.setSize(QSizeF(StrokeWidth(whole.width()), StrokeWidth(whole.height())));
	if (stroked) {
		const double half = StrokeWidth(1) / 2.0;
		device.adjust(half, half, -half, -half);
	}
	return device;
}


void
QtCanvas::StrokeRoundRect(BRect rect, float xRadius, float yRadius, const pattern& pattern)
{
	if (!rect.IsValid() || PaintRounded(rect, xRadius, yRadius, true, pattern))
		return;
	double scale;
	const QRectF box = CurveBox(rect, true, false, &scale);
	const double zoom = fScale / scale;
	QPainterPath path;
	path.addRoundedRect(box, xRadius * zoom, yRadius * zoom);
	StrokeOutline(path, scale, pattern);
}


void
QtCanvas::FillRoundRect(BRect rect, float xRadius, float yRadius, const pattern& pattern)
{
	if (!rect.IsValid() || PaintRounded(rect, xRadius, yRadius, false, pattern))
		return;
	double scale;
	const QRectF box = CurveBox(rect, false, false, &scale);
	const double zoom = fScale / scale;
	QPainterPath path;
	path.addRoundedRect(box, xRadius * zoom, yRadius * zoom);
	FillOutline(path, scale, pattern);
}


void
QtCanvas::StrokeEllipse(BRect rect, const pattern& pattern)
{
	if (!rect.IsValid())
		return;
	double scale;
	QPainterPath path;
	path.addEllipse(CurveBox(rect, true, true, &scale));
	StrokeOutline(path, scale, pattern);
}


void
QtCanvas::FillEllipse(BRect rect, const pattern& pattern)
{
	if (!rect.IsValid())
		return;
	double scale;
	QPainterPath path;
	path.addEllipse(CurveBox(rect, false, true, &scale));
	FillOutline(path, scale, pattern);
}


void
QtCanvas::StrokeArc(BRect rect, float startAngle, float arcAngle, const pattern& pattern)
{
	if (!rect.IsValid())
		return;
	double scale;
	const QRectF box = CurveBox(rect, true, true, &scale);
	StrokeOutline(ArcPath(box, startAngle, arcAngle, false), scale, pattern);
}


void
QtCanvas::FillArc(BRect rect, float startAngle, float arcAngle, const pattern& pattern)
{
	if (!rect.IsValid())
		return;
	double scale;
	const QRectF box = CurveBox(rect, false, true, &scale);
	FillOutline(ArcPath(box, startAngle, arcAngle, true), scale, pattern);
}


// #pragma mark - outlines


void
QtCanvas::StrokePolygon(const BPoint* points, int32 count, bool closed, const pattern& pattern)
{
	if (count <= 0)
		return;
	std::vector<QPoint> whole;
	for (int32 i = 0; i < count; i++)
		whole.push_back(WholePoint(points[i]));
	if (count == 1)
		whole.push_back(whole[0]);
	StrokeStraight(whole.data(), static_cast<int>(whole.size()), closed && count > 2, pattern);
}


void
QtCanvas::FillPolygon(const BPoint* points, int32 count, const pattern& pattern)
{
	if (count <= 0)
		return;
	std::vector<QPoint> whole;
	QPolygonF polygon;
	for (int32 i = 0; i < count; i++) {
		whole.push_back(WholePoint(points[i]));
		polygon << StrokeCenter(whole.back());
	}

	// The corners name pixels, and each of these belongs to the polygon: it is filled without
	// smoothing, and its outline is added.
	const int reach = StrokeWidth(1);
	const QtUse use;
	if (!use)
		return;
	Mask mask(DeviceBounds(polygon.boundingRect().adjusted(-reach, -reach, reach, reach), 1));
	if (mask.IsEmpty())
		return;
	QPainter painter(&mask.Image());
	painter.setRenderHint(QPainter::Antialiasing, fScale != 1);
	painter.translate(-mask.Area().topLeft());
	painter.setBrush(Qt::white);
	painter.setPen(fScale == 1
			? QPen(Qt::NoPen)
			: QPen(Qt::white, StrokeWidth(1), Qt::SolidLine, Qt::SquareCap, Qt::MiterJoin));
	painter.drawPolygon(polygon, fState.fillRule == B_EVEN_ODD ? Qt::OddEvenFill : Qt::WindingFill);
	painter.end();
	for (size_t i = 0; fScale == 1 && i < whole.size(); i++)
		mask.AddLine(whole[i], whole[(i + 1) % whole.size()]);
	PaintMask(mask, pattern);
}


QPainterPath
QtCanvas::PathOf(const CanvasPath& path) const
{
	QPainterPath result;
	size_t next = 0;
	auto point = [&]() { return Center(path.points[next++]); };
	for (CanvasPath::Kind kind : path.kinds) {
		switch (kind) {
			case CanvasPath::kMoveTo:
				result.moveTo(point());
				break;
			case CanvasPath::kLineTo:
				result.lineTo(point());
				break;
			case CanvasPath::kBezierTo:
			{
				QPointF control1 = point();
				QPointF control2 = point();
				result.cubicTo(control1, control2, point());
				break;
			}
			case CanvasPath::kClose:
				result.closeSubpath();
				break;
		}
	}
	return result;
}


void
QtCanvas::StrokePath(const CanvasPath& path, const pattern& pattern)
{
	StrokeOutline(PathOf(path), fScale, pattern);
}


void
QtCanvas::FillPath(const CanvasPath& path, const pattern& pattern)
{
	QPainterPath outline = PathOf(path);
	outline.setFillRule(fState.fillRule == B_EVEN_ODD ? Qt::OddEvenFill : Qt::WindingFill);
	FillOutline(outline, fScale, pattern);
}


/// In device pixels; of whole pens the same as straight lines have.
double
QtCanvas::OutlineWidth() const
{
	const double width = std::max(fState.penSize, 1.0f);
	return width == std::floor(width) && width < kFarthestPen ? StrokeWidth(static_cast<int>(width))
															  : width * fScale;
}


void
QtCanvas::StrokeOutline(const QPainterPath& outline, double scale, const pattern& pattern)
{
	const QtUse use;
	if (!use)
		return;
	const double width = OutlineWidth() / scale;
	const double reach = width * std::max(fState.miterLimit, 2.0f) / 2 + 1;
	Mask mask(DeviceBounds(outline.boundingRect().adjusted(-reach, -reach, reach, reach), scale));
	if (mask.IsEmpty())
		return;

	QPen pen(Qt::white, width, Qt::SolidLine, CapStyle(fState.lineCap), JoinStyle(fState.lineJoin));
	pen.setMiterLimit(std::max(fState.miterLimit, 1.0f) / 2);
	QPainter painter(&mask.Image());
	painter.setRenderHint(QPainter::Antialiasing);
	painter.translate(-mask.Area().topLeft());
	painter.scale(scale, scale);
	painter.strokePath(outline, pen);
	painter.end();
	PaintMask(mask, pattern);
}


void
QtCanvas::FillOutline(const QPainterPath& outline, double scale, const pattern& pattern)
{
	const QtUse use;
	if (!use)
		return;
	Mask mask(DeviceBounds(outline.boundingRect(), scale));
	if (mask.IsEmpty())
		return;
	QPainter painter(&mask.Image());
	painter.setRenderHint(QPainter::Antialiasing);
	painter.translate(-mask.Area().topLeft());
	painter.scale(scale, scale);
	painter.fillPath(outline, Qt::white);
	painter.end();
	PaintMask(mask, pattern);
}

} // namespace BPrivate

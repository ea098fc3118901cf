// SPDX-License-Identifier: MIT
// Lines, rects, curves and outlines on the canvas.
#include <algorithm>
#include <cmath>

#include <QPainter>
#include <QPainterPath>

#include <Region.h>

#include "display/qt/Mask.h"
#include "display/qt/QtCanvas.h"

namespace BPrivate {

namespace {

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
	QRect line = QRect(start, end).normalized();
	line = QRect(QPoint(std::min(start.x(), end.x()), std::min(start.y(), end.y())),
		QPoint(std::max(start.x(), end.x()), std::max(start.y(), end.y())));
	bool isVertical = start.x() == end.x() && start.y() != end.y();
	bool extends = fState.lineCap == B_SQUARE_CAP;
	if (isVertical || extends)
		line.adjust(-before, 0, after, 0);
	if (!isVertical || extends)
		line.adjust(0, -before, 0, after);
	FillWhole(line, pattern);
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

	QPointF half(0.5, 0.5);
	QPainterPath path(points[0] + half);
	for (int i = 1; i < count; i++)
		path.lineTo(points[i] + half);
	if (closed)
		path.closeSubpath();
	StrokeOutline(path, pattern);
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
	// Four pieces that do not overlap: modes such as invert must meet each pixel once.
	FillWhole(QRect(outer.left(), outer.top(), outer.width(), width), pattern);
	FillWhole(QRect(outer.left(), outer.bottom() - width + 1, outer.width(), width), pattern);
	int sideHeight = outer.height() - 2 * width;
	FillWhole(QRect(outer.left(), outer.top() + width, width, sideHeight), pattern);
	FillWhole(QRect(outer.right() - width + 1, outer.top() + width, width, sideHeight), pattern);
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


void
QtCanvas::StrokeRoundRect(BRect rect, float xRadius, float yRadius, const pattern& pattern)
{
	if (!rect.IsValid() || PaintRounded(rect, xRadius, yRadius, true, pattern))
		return;
	QPainterPath path;
	path.addRoundedRect(CenterRect(rect), xRadius, yRadius);
	StrokeOutline(path, pattern);
}


void
QtCanvas::FillRoundRect(BRect rect, float xRadius, float yRadius, const pattern& pattern)
{
	if (!rect.IsValid() || PaintRounded(rect, xRadius, yRadius, false, pattern))
		return;
	QPainterPath path;
	path.addRoundedRect(EdgeRect(rect), xRadius, yRadius);
	FillOutline(path, pattern);
}


void
QtCanvas::StrokeEllipse(BRect rect, const pattern& pattern)
{
	if (!rect.IsValid())
		return;
	QPainterPath path;
	path.addEllipse(CenterRect(rect));
	StrokeOutline(path, pattern);
}


void
QtCanvas::FillEllipse(BRect rect, const pattern& pattern)
{
	if (!rect.IsValid())
		return;
	QPainterPath path;
	path.addEllipse(EdgeRect(rect));
	FillOutline(path, pattern);
}


void
QtCanvas::StrokeArc(BRect rect, float startAngle, float arcAngle, const pattern& pattern)
{
	if (rect.IsValid())
		StrokeOutline(ArcPath(CenterRect(rect), startAngle, arcAngle, false), pattern);
}


void
QtCanvas::FillArc(BRect rect, float startAngle, float arcAngle, const pattern& pattern)
{
	if (rect.IsValid())
		FillOutline(ArcPath(EdgeRect(rect), startAngle, arcAngle, true), pattern);
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
		polygon << whole.back() + QPointF(0.5, 0.5);
	}

	// The corners name pixels, and each of these belongs to the polygon: it is filled without
	// smoothing, and its outline is added.
	Mask mask(DeviceBounds(polygon.boundingRect().adjusted(-1, -1, 1, 1)));
	if (mask.IsEmpty())
		return;
	QPainter painter(&mask.Image());
	painter.setRenderHint(QPainter::Antialiasing, fScale != 1);
	painter.translate(-mask.Area().topLeft());
	painter.scale(fScale, fScale);
	painter.setBrush(Qt::white);
	painter.setPen(fScale == 1 ? QPen(Qt::NoPen)
							   : QPen(Qt::white, 1, Qt::SolidLine, Qt::SquareCap, Qt::MiterJoin));
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
	StrokeOutline(PathOf(path), pattern);
}


void
QtCanvas::FillPath(const CanvasPath& path, const pattern& pattern)
{
	QPainterPath outline = PathOf(path);
	outline.setFillRule(fState.fillRule == B_EVEN_ODD ? Qt::OddEvenFill : Qt::WindingFill);
	FillOutline(outline, pattern);
}


void
QtCanvas::StrokeOutline(const QPainterPath& outline, const pattern& pattern)
{
	qreal width = std::max(fState.penSize, 1.0f);
	qreal reach = width * std::max(fState.miterLimit, 2.0f) / 2 + 1;
	Mask mask(DeviceBounds(outline.boundingRect().adjusted(-reach, -reach, reach, reach)));
	if (mask.IsEmpty())
		return;

	QPen pen(Qt::white, width, Qt::SolidLine, CapStyle(fState.lineCap), JoinStyle(fState.lineJoin));
	pen.setMiterLimit(std::max(fState.miterLimit, 1.0f) / 2);
	QPainter painter(&mask.Image());
	painter.setRenderHint(QPainter::Antialiasing);
	painter.translate(-mask.Area().topLeft());
	painter.scale(fScale, fScale);
	painter.strokePath(outline, pen);
	painter.end();
	PaintMask(mask, pattern);
}


void
QtCanvas::FillOutline(const QPainterPath& outline, const pattern& pattern)
{
	Mask mask(DeviceBounds(outline.boundingRect()));
	if (mask.IsEmpty())
		return;
	QPainter painter(&mask.Image());
	painter.setRenderHint(QPainter::Antialiasing);
	painter.translate(-mask.Area().topLeft());
	painter.scale(fScale, fScale);
	painter.fillPath(outline, Qt::white);
	painter.end();
	PaintMask(mask, pattern);
}

} // namespace BPrivate

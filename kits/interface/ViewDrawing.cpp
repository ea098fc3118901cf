// SPDX-License-Identifier: MIT
// BView: lines, shapes and text.
#include <View.h>

#include <algorithm>
#include <cmath>
#include <cstring>

#include <Polygon.h>
#include <Region.h>
#include <Shape.h>
#include <Window.h>

#include "display/Canvas.h"
#include "interface/PictureCanvas.h"
#include "interface/ViewPrivate.h"
#include "interface/WindowPrivate.h"

using BPrivate::Canvas;
using BPrivate::CanvasPath;

namespace {

BRect
FrameOf(const BPoint* points, int32 count)
{
	BRect frame(points[0], points[0]);
	for (int32 i = 1; i < count; i++)
		frame = frame | BRect(points[i], points[i]);
	return frame;
}


BRect
EllipseRect(BPoint center, float xRadius, float yRadius)
{
	return BRect(center.x - xRadius, center.y - yRadius, center.x + xRadius, center.y + yRadius);
}


std::vector<BPoint>
Mapped(const BPoint* points, int32 count, BRect bounds)
{
	BPolygon polygon(points, count);
	std::vector<BPoint> mapped(points, points + count);
	BRect source = polygon.Frame();
	float scaleX = source.Width() != 0 ? bounds.Width() / source.Width() : 0;
	float scaleY = source.Height() != 0 ? bounds.Height() / source.Height() : 0;
	for (BPoint& point : mapped) {
		point.x = bounds.left + (point.x - source.left) * scaleX;
		point.y = bounds.top + (point.y - source.top) * scaleY;
	}
	return mapped;
}


CanvasPath
BezierPath(const BPoint* controlPoints)
{
	CanvasPath path;
	path.MoveTo(controlPoints[0]);
	path.BezierTo(controlPoints[1], controlPoints[2], controlPoints[3]);
	return path;
}


CanvasPath
MovedPath(const CanvasPath& path, BPoint by)
{
	CanvasPath moved(path);
	for (BPoint& point : moved.points)
		point += by;
	return moved;
}

} // namespace


// Null where nothing is to be drawn: no window, no pixels, or no visible part.
Canvas*
BView::BeginDrawing() const
{
	CheckLock();
	if (IsRecording())
		return BeginRecording();
	if (fOwner == nullptr)
		return nullptr;
	return fOwner->fData->painter.Begin(const_cast<BView*>(this));
}


bool
BView::IsRecording() const
{
	return fDrawing != nullptr && !fDrawing->recordings.empty();
}


Canvas*
BView::BeginRecording() const
{
	BPrivate::Recording& recording = fDrawing->recordings.back();
	if (recording.serial != fDrawing->serial) {
		recording.serial = fDrawing->serial;
		const BPrivate::GraphicsState& state = State();
		recording.canvas->SetState(ToCanvasState(*this, state, B_ORIGIN));
		recording.canvas->SetClip(state.clipping ? &*state.clipping : nullptr);
	}
	return recording.canvas.get();
}


void
BView::EndDrawing(BRect rect) const
{
	if (IsRecording())
		return;
	const BPrivate::GraphicsState& state = State();
	rect.OffsetBy(OffsetInWindow() + state.baseOrigin + state.origin);
	rect.Set(
		std::floor(rect.left), std::floor(rect.top), std::ceil(rect.right), std::ceil(rect.bottom));
	fOwner->fData->painter.Drawn(rect);
}


void
BView::EndStroking(BRect rect) const
{
	// Joins of thick lines may stick out further than half the pen.
	float reach = State().penSize + 1;
	EndDrawing(rect.InsetByCopy(-reach, -reach));
}


void
BView::StrokeLine(BPoint toPoint, ::pattern pattern)
{
	StrokeLine(PenLocation(), toPoint, pattern);
}


void
BView::StrokeLine(BPoint start, BPoint end, ::pattern pattern)
{
	if (Canvas* canvas = BeginDrawing()) {
		canvas->StrokeLine(start, end, pattern);
		const BPoint points[] = {start, end};
		EndStroking(FrameOf(points, 2));
	}
	SetPenLocation(end);
}


void
BView::BeginLineArray(int32 count)
{
	CheckLock();
	BPrivate::ViewDrawing& drawing = Drawing();
	drawing.lines.clear();
	drawing.maxLines = std::max<int32>(count, 0);
	drawing.lines.reserve(std::min<size_t>(drawing.maxLines, 1024));
}


void
BView::AddLine(BPoint start, BPoint end, rgb_color color)
{
	CheckLock();
	if (fDrawing != nullptr && fDrawing->lines.size() < fDrawing->maxLines)
		fDrawing->lines.push_back({start, end, color});
}


void
BView::EndLineArray()
{
	CheckLock();
	if (fDrawing == nullptr || fDrawing->lines.empty())
		return;

	std::vector<BPrivate::ColoredLine> lines;
	lines.swap(fDrawing->lines);
	fDrawing->maxLines = 0;
	Canvas* canvas = BeginDrawing();
	if (canvas == nullptr)
		return;

	BRect frame(lines[0].start, lines[0].start);
	for (const BPrivate::ColoredLine& line : lines) {
		canvas->StrokeLine(line.start, line.end, line.color);
		frame = frame | BRect(line.start, line.start) | BRect(line.end, line.end);
	}
	EndStroking(frame);
}


void
BView::StrokePolygon(const BPolygon* polygon, bool closed, ::pattern pattern)
{
	if (polygon != nullptr)
		StrokePolygon(polygon->fPoints.data(), polygon->CountPoints(), closed, pattern);
}


void
BView::StrokePolygon(const BPoint* pointArray, int32 numPoints, bool closed, ::pattern pattern)
{
	Canvas* canvas = BeginDrawing();
	if (canvas == nullptr || pointArray == nullptr || numPoints <= 0)
		return;
	canvas->StrokePolygon(pointArray, numPoints, closed, pattern);
	EndStroking(FrameOf(pointArray, numPoints));
}


void
BView::StrokePolygon(
	const BPoint* pointArray, int32 numPoints, BRect bounds, bool closed, ::pattern pattern)
{
	if (pointArray != nullptr && numPoints > 0)
		StrokePolygon(Mapped(pointArray, numPoints, bounds).data(), numPoints, closed, pattern);
}


void
BView::FillPolygon(const BPolygon* polygon, ::pattern pattern)
{
	if (polygon != nullptr)
		FillPolygon(polygon->fPoints.data(), polygon->CountPoints(), pattern);
}


void
BView::FillPolygon(const BPoint* pointArray, int32 numPoints, ::pattern pattern)
{
	Canvas* canvas = BeginDrawing();
	if (canvas == nullptr || pointArray == nullptr || numPoints <= 0)
		return;
	canvas->FillPolygon(pointArray, numPoints, pattern);
	EndStroking(FrameOf(pointArray, numPoints));
}


void
BView::FillPolygon(const BPoint* pointArray, int32 numPoints, BRect bounds, ::pattern pattern)
{
	if (pointArray != nullptr && numPoints > 0)
		FillPolygon(Mapped(pointArray, numPoints, bounds).data(), numPoints, pattern);
}


void
BView::StrokeTriangle(BPoint point1, BPoint point2, BPoint point3, BRect, ::pattern pattern)
{
	StrokeTriangle(point1, point2, point3, pattern);
}


void
BView::StrokeTriangle(BPoint point1, BPoint point2, BPoint point3, ::pattern pattern)
{
	const BPoint points[] = {point1, point2, point3};
	StrokePolygon(points, 3, true, pattern);
}


void
BView::FillTriangle(BPoint point1, BPoint point2, BPoint point3, ::pattern pattern)
{
	const BPoint points[] = {point1, point2, point3};
	FillPolygon(points, 3, pattern);
}


void
BView::FillTriangle(BPoint point1, BPoint point2, BPoint point3, BRect, ::pattern pattern)
{
	FillTriangle(point1, point2, point3, pattern);
}


void
BView::StrokeRect(BRect rect, ::pattern pattern)
{
	if (Canvas* canvas = BeginDrawing()) {
		canvas->StrokeRect(rect, pattern);
		EndStroking(rect);
	}
}


void
BView::FillRect(BRect rect, ::pattern pattern)
{
	if (Canvas* canvas = BeginDrawing()) {
		canvas->FillRect(rect, pattern);
		EndDrawing(rect);
	}
}


void
BView::FillRegion(BRegion* region, ::pattern pattern)
{
	Canvas* canvas = BeginDrawing();
	if (canvas == nullptr || region == nullptr || region->CountRects() == 0)
		return;
	canvas->FillRegion(*region, pattern);
	EndDrawing(region->Frame());
}


void
BView::InvertRect(BRect rect)
{
	if (Canvas* canvas = BeginDrawing()) {
		canvas->InvertRect(rect);
		EndDrawing(rect);
	}
}


void
BView::StrokeRoundRect(BRect rect, float xRadius, float yRadius, ::pattern pattern)
{
	if (Canvas* canvas = BeginDrawing()) {
		canvas->StrokeRoundRect(rect, xRadius, yRadius, pattern);
		EndStroking(rect);
	}
}


void
BView::FillRoundRect(BRect rect, float xRadius, float yRadius, ::pattern pattern)
{
	if (Canvas* canvas = BeginDrawing()) {
		canvas->FillRoundRect(rect, xRadius, yRadius, pattern);
		EndStroking(rect);
	}
}


void
BView::StrokeEllipse(BPoint center, float xRadius, float yRadius, ::pattern pattern)
{
	StrokeEllipse(EllipseRect(center, xRadius, yRadius), pattern);
}


void
BView::StrokeEllipse(BRect rect, ::pattern pattern)
{
	if (Canvas* canvas = BeginDrawing()) {
		canvas->StrokeEllipse(rect, pattern);
		EndStroking(rect);
	}
}


void
BView::FillEllipse(BPoint center, float xRadius, float yRadius, ::pattern pattern)
{
	FillEllipse(EllipseRect(center, xRadius, yRadius), pattern);
}


void
BView::FillEllipse(BRect rect, ::pattern pattern)
{
	if (Canvas* canvas = BeginDrawing()) {
		canvas->FillEllipse(rect, pattern);
		EndStroking(rect);
	}
}


void
BView::StrokeArc(BPoint center, float xRadius, float yRadius, float startAngle, float arcAngle,
	::pattern pattern)
{
	StrokeArc(EllipseRect(center, xRadius, yRadius), startAngle, arcAngle, pattern);
}


void
BView::StrokeArc(BRect rect, float startAngle, float arcAngle, ::pattern pattern)
{
	if (Canvas* canvas = BeginDrawing()) {
		canvas->StrokeArc(rect, startAngle, arcAngle, pattern);
		EndStroking(rect);
	}
}


void
BView::FillArc(BPoint center, float xRadius, float yRadius, float startAngle, float arcAngle,
	::pattern pattern)
{
	FillArc(EllipseRect(center, xRadius, yRadius), startAngle, arcAngle, pattern);
}


void
BView::FillArc(BRect rect, float startAngle, float arcAngle, ::pattern pattern)
{
	if (Canvas* canvas = BeginDrawing()) {
		canvas->FillArc(rect, startAngle, arcAngle, pattern);
		EndStroking(rect);
	}
}


void
BView::StrokeBezier(BPoint* controlPoints, ::pattern pattern)
{
	Canvas* canvas = BeginDrawing();
	if (canvas == nullptr || controlPoints == nullptr)
		return;
	canvas->StrokePath(BezierPath(controlPoints), pattern);
	EndStroking(FrameOf(controlPoints, 4));
}


void
BView::FillBezier(BPoint* controlPoints, ::pattern pattern)
{
	Canvas* canvas = BeginDrawing();
	if (canvas == nullptr || controlPoints == nullptr)
		return;
	canvas->FillPath(BezierPath(controlPoints), pattern);
	EndStroking(FrameOf(controlPoints, 4));
}


void
BView::DrawString(const char* string, escapement_delta* delta)
{
	DrawString(string, -1, PenLocation(), delta);
}


void
BView::DrawString(const char* string, BPoint location, escapement_delta* delta)
{
	DrawString(string, -1, location, delta);
}


void
BView::DrawString(const char* string, int32 length, escapement_delta* delta)
{
	DrawString(string, length, PenLocation(), delta);
}


void
BView::DrawString(const char* string, int32 length, BPoint location, escapement_delta* delta)
{
	CheckLock();
	if (string == nullptr || length == 0 || string[0] == '\0')
		return;

	int32 bytes = static_cast<int32>(length < 0 ? std::strlen(string) : strnlen(string, length));
	BPoint end;
	if (Canvas* canvas = BeginDrawing()) {
		end = canvas->DrawString(string, bytes, location, delta);
		EndDrawing(TextFrame(location, end));
	} else
		end = location + BPoint(StringWidth(string, bytes), 0);
	SetPenLocation(end);
}


void
BView::DrawString(const char* string, const BPoint* locations, int32 locationCount)
{
	DrawString(string, -1, locations, locationCount);
}


void
BView::DrawString(const char* string, int32 length, const BPoint* locations, int32 locationCount)
{
	Canvas* canvas = BeginDrawing();
	if (canvas == nullptr || string == nullptr || locations == nullptr || locationCount <= 0)
		return;

	int32 bytes = static_cast<int32>(length < 0 ? std::strlen(string) : strnlen(string, length));
	canvas->DrawString(string, bytes, locations, locationCount);
	BRect frame = FrameOf(locations, locationCount);
	EndDrawing(
		TextFrame(frame.LeftTop(), frame.RightBottom() + BPoint(StringWidth(string, bytes), 0)));
}


// Glyphs stick out of their cells, and rotated text goes anywhere around its start.
BRect
BView::TextFrame(BPoint start, BPoint end) const
{
	font_height height;
	GetFontHeight(&height);
	float reach = height.ascent + height.descent + height.leading;
	const BPoint points[] = {start, end};
	return FrameOf(points, 2).InsetByCopy(-reach, -reach);
}


// The pen's place is no part of what the canvas knows: it does not need to be set up anew.
void
BView::SetPenLocation(BPoint where)
{
	uint32 serial = fDrawing != nullptr ? fDrawing->serial : 0;
	Drawing().state.penLocation = where;
	if (serial != 0)
		fDrawing->serial = serial;
}


void
BView::Invalidate(BRect invalRect)
{
	CheckLock();
	// Without pixels there is nothing to draw anew.
	if (fOwner == nullptr || !fOwner->fData->painter.HasCanvas())
		return;
	invalRect.Set(std::trunc(invalRect.left), std::trunc(invalRect.top),
		std::trunc(invalRect.right), std::trunc(invalRect.bottom));
	fOwner->fData->painter.Invalidate(this, invalRect);
}


void
BView::Invalidate(const BRegion* invalRegion)
{
	CheckLock();
	if (fOwner != nullptr && invalRegion != nullptr)
		fOwner->fData->painter.Invalidate(this, *invalRegion);
}


void
BView::Invalidate()
{
	Invalidate(fBounds);
}


void
BView::Flush() const
{
	if (fOwner != nullptr)
		fOwner->Flush();
}


void
BView::Sync() const
{
	if (fOwner != nullptr)
		fOwner->Sync();
}


void
BView::GetClippingRegion(BRegion* region) const
{
	CheckLock();
	if (region == nullptr)
		return;

	region->MakeEmpty();
	if (fOwner == nullptr)
		return;
	*region = fOwner->fData->painter.DrawRegion(const_cast<BView*>(this));
	region->OffsetBy(-OffsetInWindow());
}


// A shape's coordinates start at the pen.
void
BView::StrokeShape(BShape* shape, ::pattern pattern)
{
	Canvas* canvas = BeginDrawing();
	if (canvas == nullptr || shape == nullptr || shape->fPath->kinds.empty())
		return;

	CanvasPath path = MovedPath(*shape->fPath, PenLocation());
	canvas->StrokePath(path, pattern);
	EndStroking(FrameOf(path.points.data(), static_cast<int32>(path.points.size())));
}


void
BView::FillShape(BShape* shape, ::pattern pattern)
{
	Canvas* canvas = BeginDrawing();
	if (canvas == nullptr || shape == nullptr || shape->fPath->kinds.empty())
		return;

	CanvasPath path = MovedPath(*shape->fPath, PenLocation());
	canvas->FillPath(path, pattern);
	EndStroking(FrameOf(path.points.data(), static_cast<int32>(path.points.size())));
}

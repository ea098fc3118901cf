// SPDX-License-Identifier: MIT
// What views draw on: the drawing operations of the API on one buffer of pixels.
#ifndef DISPLAY_CANVAS_H
#define DISPLAY_CANVAS_H

#include <vector>

#include <Font.h>
#include <GraphicsDefs.h>
#include <InterfaceDefs.h>
#include <Point.h>
#include <Rect.h>

class BRegion;

namespace BPrivate {

struct Picture;
struct PixelBuffer;

/// How the operations of a canvas draw.
struct CanvasState {
	rgb_color highColor = {0, 0, 0, 255};
	rgb_color lowColor = {255, 255, 255, 255};
	drawing_mode mode = B_OP_COPY;
	source_alpha alphaSource = B_PIXEL_ALPHA;
	alpha_function alphaFunction = B_ALPHA_OVERLAY;
	float penSize = 1;
	cap_mode lineCap = B_BUTT_CAP;
	join_mode lineJoin = B_MITER_JOIN;
	float miterLimit = B_DEFAULT_MITER_LIMIT;
	int32 fillRule = B_NONZERO;
	/// Added to every coordinate of an operation: the left-top of the view's bounds in the buffer.
	BPoint origin;
	BFont font;
};


/// An outline of straight and curved pieces.
struct CanvasPath {
	enum Kind : uint8 { kMoveTo, kLineTo, kBezierTo, kClose };

	std::vector<Kind> kinds;
	/// One point for kMoveTo and kLineTo, three for kBezierTo, none for kClose.
	std::vector<BPoint> points;

	void MoveTo(BPoint point) { Add(kMoveTo, point); }
	void LineTo(BPoint point) { Add(kLineTo, point); }
	void BezierTo(BPoint control1, BPoint control2, BPoint end)
	{
		kinds.push_back(kBezierTo);
		points.insert(points.end(), {control1, control2, end});
	}
	void Close() { kinds.push_back(kClose); }

private:
	void Add(Kind kind, BPoint point)
	{
		kinds.push_back(kind);
		points.push_back(point);
	}
};


/// One buffer of pixels and the drawing operations on it.
///
/// Coordinates are the API's: a point names the centre of a pixel, rects include all four sides. The
/// buffer has Scale() device pixels for each of these. Straight lines and rects of whole coordinates
/// cover whole pixels; curves and text are smoothed. An invalid rect draws nothing.
///
/// Where the scale is no whole number, a pixel of the API has sometimes one device pixel more than its
/// neighbour. What is filled covers all of them, so that fills side by side leave no gap. A stroke has the
/// same number everywhere, as many as fit: it lies at the left and top of the pixels that it names, those
/// of StrokeRect() at the outer sides. Three parallel lines side by side are an area and fill it.
///
/// Not locked: one thread at a time, usually the window's. Nothing here waits for the display's thread.
class Canvas {
public:
	virtual ~Canvas() = default;

	/// Of the buffer, in the API's pixels (not the right - left sense), and device pixels for each.
	virtual int32 Width() const = 0;
	virtual int32 Height() const = 0;
	virtual float Scale() const = 0;

	/// Lasts until the next call.
	virtual void SetState(const CanvasState& state) = 0;
	/// What may be drawn on, in the buffer's coordinates (no origin added); null: all. Copied.
	virtual void SetClip(const BRegion* clip) = 0;

	virtual void StrokeLine(BPoint start, BPoint end, const pattern& pattern) = 0;
	/// A solid line in its own colour; the rest as in the state.
	virtual void StrokeLine(BPoint start, BPoint end, rgb_color color) = 0;
	virtual void StrokeRect(BRect rect, const pattern& pattern) = 0;
	virtual void FillRect(BRect rect, const pattern& pattern) = 0;
	/// Inverts red, green and blue, whatever the mode.
	virtual void InvertRect(BRect rect) = 0;
	virtual void FillRegion(const BRegion& region, const pattern& pattern) = 0;

	virtual void StrokeRoundRect(
		BRect rect, float xRadius, float yRadius, const pattern& pattern) = 0;
	virtual void FillRoundRect(
		BRect rect, float xRadius, float yRadius, const pattern& pattern) = 0;
	virtual void StrokeEllipse(BRect rect, const pattern& pattern) = 0;
	virtual void FillEllipse(BRect rect, const pattern& pattern) = 0;
	/// Degrees, 0 at three o'clock, counter-clockwise. A filled arc is a slice of pie.
	virtual void StrokeArc(
		BRect rect, float startAngle, float arcAngle, const pattern& pattern) = 0;
	virtual void FillArc(BRect rect, float startAngle, float arcAngle, const pattern& pattern) = 0;

	/// Straight-edged outlines; filled ones cover their outline too. \a count 0 draws nothing.
	virtual void StrokePolygon(
		const BPoint* points, int32 count, bool closed, const pattern& pattern) = 0;
	virtual void FillPolygon(const BPoint* points, int32 count, const pattern& pattern) = 0;
	virtual void StrokePath(const CanvasPath& path, const pattern& pattern) = 0;
	virtual void FillPath(const CanvasPath& path, const pattern& pattern) = 0;

	/// \a length bytes of UTF-8 with the left end of the baseline at \a where, in the high colour
	/// (B_OP_ERASE: low); smoothed against the low colour in B_OP_COPY, else against what is there.
	/// \a delta: extra room, may be null. Returns where the next character would be.
	virtual BPoint DrawString(
		const char* text, int32 length, BPoint where, const escapement_delta* delta) = 0;
	/// Each character at its own place; those beyond \a count follow the last one.
	virtual void DrawString(
		const char* text, int32 length, const BPoint* locations, int32 count) = 0;

	/// The pixels \a source of \a bitmap (its own coordinates, left-top (0, 0)), stretched onto
	/// \a destination. \a options: B_FILTER_BITMAP_BILINEAR, B_TILE_BITMAP (repeated from the
	/// destination's left-top in its own size). B_OP_OVER leaves out transparent pixels, B_OP_ALPHA blends.
	virtual void DrawBitmap(
		const PixelBuffer& bitmap, BRect source, BRect destination, uint32 options) = 0;

	/// Moves pixels within the buffer, also onto overlapping places. The source may lie outside
	/// of the clip, but pixels from outside the buffer are not copied.
	virtual void CopyBits(BRect source, BRect destination) = 0;

	/// The pixel's colour, buffer coordinates; transparent black outside.
	virtual rgb_color PixelAt(BPoint where) const = 0;
	/// All device pixels.
	virtual Picture ReadPicture() const = 0;
};

} // namespace BPrivate

#endif // DISPLAY_CANVAS_H

// SPDX-License-Identifier: MIT
// The canvas with pixels: shapes and text become masks, the drawing modes put them into the buffer.
#ifndef DISPLAY_QT_CANVAS_H
#define DISPLAY_QT_CANVAS_H

#include <algorithm>
#include <memory>
#include <vector>

#include <QRect>

#include "display/Canvas.h"
#include "display/PixelBuffer.h"
#include "display/WindowPixels.h"
#include "display/qt/Blend.h"

class QPainterPath;

namespace BPrivate {

class Mask;
class QtFonts;

class QtCanvas : public Canvas {
public:
	QtCanvas(QtFonts& fonts, int32 width, int32 height, float scale);
	QtCanvas(QtFonts& fonts, const PixelBuffer& buffer);

	int32 Width() const override { return fWidth; }
	int32 Height() const override { return fHeight; }
	float Scale() const override { return fScale; }
	void SetState(const CanvasState& state) override;
	void SetClip(const BRegion* clip) override;

	void StrokeLine(BPoint start, BPoint end, const pattern& pattern) override;
	void StrokeLine(BPoint start, BPoint end, rgb_color color) override;
	void StrokeRect(BRect rect, const pattern& pattern) override;
	void FillRect(BRect rect, const pattern& pattern) override;
	void InvertRect(BRect rect) override;
	void FillRegion(const BRegion& region, const pattern& pattern) override;
	void StrokeRoundRect(BRect rect, float xRadius, float yRadius, const pattern& pattern) override;
	void FillRoundRect(BRect rect, float xRadius, float yRadius, const pattern& pattern) override;
	void StrokeEllipse(BRect rect, const pattern& pattern) override;
	void FillEllipse(BRect rect, const pattern& pattern) override;
	void StrokeArc(BRect rect, float startAngle, float arcAngle, const pattern& pattern) override;
	void FillArc(BRect rect, float startAngle, float arcAngle, const pattern& pattern) override;
	void StrokePolygon(
		const BPoint* points, int32 count, bool closed, const pattern& pattern) override;
	void FillPolygon(const BPoint* points, int32 count, const pattern& pattern) override;
	void StrokePath(const CanvasPath& path, const pattern& pattern) override;
	void FillPath(const CanvasPath& path, const pattern& pattern) override;
	BPoint DrawString(
		const char* text, int32 length, BPoint where, const escapement_delta* delta) override;
	void DrawString(const char* text, int32 length, const BPoint* locations, int32 count) override;
	void DrawBitmap(
		const PixelBuffer& bitmap, BRect source, BRect destination, uint32 options) override;
	void CopyBits(BRect source, BRect destination) override;
	rgb_color PixelAt(BPoint where) const override;
	Picture ReadPicture() const override;

	/// The device pixels.
	const PixelBuffer& Buffer() const { return fBuffer; }
	/// What they are in; null when they are somebody else's.
	const std::shared_ptr<WindowPixels>& Pixels() const { return fPixels; }
	/// The device pixels of a rect of whole pixels of the API.
	QRect DeviceRect(int left, int top, int right, int bottom) const;

private:
	/// A straight line that leaves device pixels of its pixels free.
	struct SparseLine {
		QRect whole;
		QRect device;
		Blend blend;
		struct pattern pattern;
	};

	/// A rect of the operation in whole pixels of the buffer's coordinates, origin added.
	QRect WholeRect(BRect rect) const;
	QPoint WholePoint(BPoint point) const;
	QPointF Center(BPoint point) const;
	QRectF CenterRect(BRect rect) const;
	QRectF EdgeRect(BRect rect) const;
	QRect Device(const QRect& whole) const;
	QRect DeviceBounds(const QRectF& area, double scale) const;
	/// Where the device pixels of a whole coordinate begin.
	int DeviceEdge(int coordinate) const;
	/// How many device pixels a stroke of \a pixels takes: the same number wherever it is.
	int StrokeWidth(int pixels) const;
	/// In the middle of the stroke's device pixels.
	QPointF StrokeCenter(QPoint whole) const;
	int PenWidth() const;
	bool HasThinPen() const;
	uint32* Row(int y) const;

	// Putting pixels into the buffer
	void FillWhole(const QRect& whole, const pattern& pattern);
	void FillDevice(const QRect& device, const pattern& pattern);
	void PaintMask(const Mask& mask, const pattern& pattern);
	void PaintTextMask(const Mask& mask);
	void PaintTextRow(uint32* pixels, const uint8* coverage, int count);
	/// A rounded rect of whole pixels by its corners alone; false where it needs its whole outline.
	bool PaintRounded(
		BRect rect, float xRadius, float yRadius, bool stroked, const pattern& pattern);
	template <typename Function>
	void ForEachSpan(const QRect& device, Function function);
	bool IsHigh(const pattern& pattern, int x, int y) const;

	void DrawRun(const char* text, int32 length, BPoint where, float width);
	bool DrawKnownRun(const char* text, int32 length, BPoint where);

	// Lines side by side, where each leaves device pixels free
	void JoinLines(const QRect& whole, const QRect& device, const pattern& pattern);
	void FillRest(const SparseLine& line);

	// Outlines
	/// \a outline: \a scale device pixels for each of its own.
	void StrokeOutline(const QPainterPath& outline, double scale, const pattern& pattern);
	void FillOutline(const QPainterPath& outline, double scale, const pattern& pattern);
	void StrokeStraight(const QPoint* points, int count, bool closed, const pattern& pattern);
	void StrokeThickLine(QPoint start, QPoint end, const pattern& pattern);
	/// The box that a curve is drawn in, and its device pixels for each of its own.
	QRectF CurveBox(BRect rect, bool stroked, bool keepsShape, double* scale) const;
	double OutlineWidth() const;
	QPainterPath PathOf(const CanvasPath& path) const;

	QtFonts& fFonts;
	std::shared_ptr<WindowPixels> fPixels;
	PixelBuffer fBuffer;
	const int32 fWidth;
	const int32 fHeight;
	const float fScale;
	CanvasState fState;
	Blend fBlend;
	/// Device rects, and the smallest one around them.
	std::vector<QRect> fClip;
	QRect fClipBounds;

	/// The latest ones, side by side.
	std::vector<SparseLine> fSparseLines;
};


template <typename Function>
void
QtCanvas::ForEachSpan(const QRect& device, Function function)
{
	if (!device.intersects(fClipBounds))
		return;
	if (fPixels != nullptr)
		fPixels->Begin();
	for (const QRect& clip : fClip) {
		const int left = std::max(clip.left(), device.left());
		const int right = std::min(clip.right(), device.right());
		const int bottom = std::min(clip.bottom(), device.bottom());
		if (left > right)
			continue;
		for (int y = std::max(clip.top(), device.top()); y <= bottom; y++)
			function(y, left, right);
	}
}

} // namespace BPrivate

#endif // DISPLAY_QT_CANVAS_H

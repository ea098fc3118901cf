// SPDX-License-Identifier: MIT
// The canvas's buffer, its clip, and how masks and rects get into the pixels.
#include "display/qt/QtCanvas.h"

#include <algorithm>
#include <cmath>
#include <cstring>

#include <Region.h>

#include "display/qt/CoverPixels.h"
#include "display/qt/Mask.h"
#include "display/qt/QtUse.h"
#include "display/qt/RoundedShape.h"

namespace BPrivate {

namespace {

// Beyond these the arithmetic of whole pixels could overflow; no buffer reaches so far.
const float kFarthest = 1 << 24;


int
Whole(float coordinate)
{
	// Written so that what is no number goes to a side too.
	if (!(coordinate > -kFarthest))
		return static_cast<int>(-kFarthest);
	return static_cast<int>(std::floor(std::min(coordinate, kFarthest)));
}


bool
IsSolid(const pattern& pattern, bool* isHigh)
{
	*isHigh = pattern == B_SOLID_HIGH;
	return *isHigh || pattern == B_SOLID_LOW;
}

} // namespace


QtCanvas::QtCanvas(QtFonts& fonts, int32 width, int32 height, float scale)
	: fFonts(fonts),
	  fWidth(std::max(width, 1)),
	  fHeight(std::max(height, 1)),
	  fScale(scale)
{
	fBuffer.width = static_cast<int32>(std::lround(fWidth * fScale));
	fBuffer.height = static_cast<int32>(std::lround(fHeight * fScale));
	fBuffer.bytesPerRow = fBuffer.width * 4;
	fPixels = std::make_shared<WindowPixels>(static_cast<size_t>(fBuffer.width) * fBuffer.height);
	fBuffer.bits = fPixels->Drawn();
	SetClip(nullptr);
	SetState(CanvasState());
}


QtCanvas::QtCanvas(QtFonts& fonts, const PixelBuffer& buffer)
	: fFonts(fonts),
	  fBuffer(buffer),
	  fWidth(buffer.width),
	  fHeight(buffer.height),
	  fScale(1)
{
	SetClip(nullptr);
	SetState(CanvasState());
}


void
QtCanvas::SetState(const CanvasState& state)
{
	fState = state;
	fBlend.mode = state.mode;
	fBlend.alphaSource = state.alphaSource;
	fBlend.alphaFunction = state.alphaFunction;
	fBlend.high = state.highColor;
	fBlend.low = state.lowColor;
	fBlend.hasAlpha = fBuffer.hasAlpha;
}


void
QtCanvas::SetClip(const BRegion* clip)
{
	QRect all(0, 0, fBuffer.width, fBuffer.height);
	fSparseLines.clear();
	fClip.clear();
	if (clip == nullptr) {
		fClip.push_back(all);
		fClipBounds = all;
		return;
	}

	fClipBounds = QRect();
	int32 count = clip->CountRects();
	fClip.reserve(count);
	for (int32 i = 0; i < count; i++) {
		clipping_rect rect = clip->RectAtInt(i);
		QRect device = DeviceRect(rect.left, rect.top, rect.right, rect.bottom) & all;
		if (device.isEmpty())
			continue;
		fClip.push_back(device);
		fClipBounds |= device;
	}
}


// #pragma mark - coordinates


QRect
QtCanvas::DeviceRect(int left, int top, int right, int bottom) const
{
	return QRect(QPoint(DeviceEdge(left), DeviceEdge(top)),
		QPoint(DeviceEdge(right + 1) - 1, DeviceEdge(bottom + 1) - 1));
}


int
QtCanvas::DeviceEdge(int coordinate) const
{
	return static_cast<int>(
		std::lround(std::clamp(static_cast<float>(coordinate), -kFarthest, kFarthest) * fScale));
}


int
QtCanvas::StrokeWidth(int pixels) const
{
	// Rounded down, so that no stroke leaves the pixels that it names. What the scale is short of a
	// whole number by its type's precision does not count.
	return std::max(1, static_cast<int>(std::floor(pixels * fScale + 0.001f)));
}


QPointF
QtCanvas::StrokeCenter(QPoint whole) const
{
	const double half = StrokeWidth(1) / 2.0;
	return QPointF(DeviceEdge(whole.x()) + half, DeviceEdge(whole.y()) + half);
}


QRect
QtCanvas::Device(const QRect& whole) const
{
	return DeviceRect(whole.left(), whole.top(), whole.right(), whole.bottom());
}


QPoint
QtCanvas::WholePoint(BPoint point) const
{
	return QPoint(Whole(point.x + fState.origin.x), Whole(point.y + fState.origin.y));
}


QRect
QtCanvas::WholeRect(BRect rect) const
{
	return QRect(WholePoint(rect.LeftTop()), WholePoint(rect.RightBottom()));
}


QPointF
QtCanvas::Center(BPoint point) const
{
	return QPointF(point.x + fState.origin.x + 0.5, point.y + fState.origin.y + 0.5);
}


QRectF
QtCanvas::CenterRect(BRect rect) const
{
	return QRectF(Center(rect.LeftTop()), Center(rect.RightBottom()));
}


QRectF
QtCanvas::EdgeRect(BRect rect) const
{
	QPointF half(0.5, 0.5);
	return QRectF(Center(rect.LeftTop()) - half, Center(rect.RightBottom()) + half);
}


QRect
QtCanvas::DeviceBounds(const QRectF& area, double scale) const
{
	// One pixel more on each side for what smoothing adds; clamped before it becomes integers.
	QRectF device(area.left() * scale - 1, area.top() * scale - 1, area.width() * scale + 2,
		area.height() * scale + 2);
	return (device & QRectF(fClipBounds)).toAlignedRect() & fClipBounds;
}


int
QtCanvas::PenWidth() const
{
	return std::max(1, static_cast<int>(std::lround(std::min(fState.penSize, 10000.0f))));
}


bool
QtCanvas::HasThinPen() const
{
	return PenWidth() == 1;
}


uint32*
QtCanvas::Row(int y) const
{
	return reinterpret_cast<uint32*>(
		static_cast<uint8*>(fBuffer.bits) + static_cast<size_t>(y) * fBuffer.bytesPerRow);
}


// #pragma mark - pixels


bool
QtCanvas::IsHigh(const pattern& pattern, int x, int y) const
{
	int column = static_cast<int>(std::floor(x / fScale)) - static_cast<int>(fState.origin.x);
	int row = static_cast<int>(std::floor(y / fScale)) - static_cast<int>(fState.origin.y);
	return (pattern.data[row & 7] & (0x80 >> (column & 7))) != 0;
}


void
QtCanvas::FillWhole(const QRect& whole, const pattern& pattern)
{
	fSparseLines.clear();
	if (!whole.isEmpty())
		FillDevice(Device(whole), pattern);
}


void
QtCanvas::FillDevice(const QRect& device, const pattern& pattern)
{
	bool isHigh;
	bool isSolid = IsSolid(pattern, &isHigh);
	uint32 pixel;
	if (isSolid && fBlend.IsPlainFill(isHigh, &pixel)) {
		ForEachSpan(device, [&](int y, int left, int right) {
			uint32* row = Row(y);
			std::fill(row + left, row + right + 1, pixel);
		});
		return;
	}
	ForEachSpan(device, [&](int y, int left, int right) {
		uint32* row = Row(y);
		for (int x = left; x <= right; x++) {
			bool high = isSolid ? isHigh : IsHigh(pattern, x, y);
			row[x] = fBlend.Shape(row[x], high, 255);
		}
	});
}


void
QtCanvas::PaintMask(const Mask& mask, const pattern& pattern)
{
	fSparseLines.clear();
	if (mask.IsEmpty())
		return;
	bool isHigh;
	bool isSolid = IsSolid(pattern, &isHigh);
	uint32 pixel;
	if (isSolid && fBlend.IsPlainFill(isHigh, &pixel)) {
		ForEachSpan(mask.Area(), [&](int y, int left, int right) {
			CoverPixels(
				Row(y) + left, mask.Row(left, y), right - left + 1, pixel, fBuffer.hasAlpha);
		});
		return;
	}
	ForEachSpan(mask.Area(), [&](int y, int left, int right) {
		uint32* row = Row(y);
		const uint8* coverage = mask.Row(left, y);
		for (int x = left; x <= right; x++, coverage++) {
			if (*coverage == 0)
				continue;
			bool high = isSolid ? isHigh : IsHigh(pattern, x, y);
			row[x] = fBlend.Shape(row[x], high, *coverage);
		}
	});
}


void
QtCanvas::PaintTextMask(const Mask& mask)
{
	if (mask.IsEmpty())
		return;
	ForEachSpan(mask.Area(), [&](int y, int left, int right) {
		PaintTextRow(Row(y) + left, mask.Row(left, y), right - left + 1);
	});
}


void
QtCanvas::PaintTextRow(uint32* pixels, const uint8* coverage, int count)
{
	uint32 pixel;
	if (fBlend.mode != B_OP_COPY && fBlend.IsPlainFill(true, &pixel)) {
		CoverPixels(pixels, coverage, count, pixel, fBuffer.hasAlpha);
		return;
	}
	for (int i = 0; i < count; i++) {
		if (coverage[i] != 0)
			pixels[i] = fBlend.Text(pixels[i], coverage[i]);
	}
}


bool
QtCanvas::PaintRounded(
	BRect rect, float xRadius, float yRadius, bool stroked, const pattern& pattern)
{
	const BPoint leftTop = rect.LeftTop() + fState.origin;
	const bool isWhole = fScale == 1 && leftTop.x == std::floor(leftTop.x)
		&& leftTop.y == std::floor(leftTop.y) && rect.Width() == std::floor(rect.Width())
		&& rect.Height() == std::floor(rect.Height());
	bool isHigh;
	uint32 pixel;
	if (!isWhole || (stroked && fState.penSize != 1) || !RoundedShape::IsKept(xRadius, yRadius)
		|| !IsSolid(pattern, &isHigh) || !fBlend.IsPlainFill(isHigh, &pixel))
		return false;

	const QtUse use;
	if (!use)
		return true;
	const QRect whole = WholeRect(rect);
	const RoundedShape& shape = RoundedShape::Of(xRadius, yRadius, stroked);
	if (whole.width() < shape.Side() || whole.height() < shape.Side())
		return false;

	const int corner = shape.Corner();
	const int firstRight = whole.right() - corner + 1;
	ForEachSpan(whole, [&](int y, int left, int right) {
		uint32* row = Row(y);
		const int line = y - whole.top();
		const bool isBetweenCorners = line >= corner && line < whole.height() - corner;
		if (isBetweenCorners && !stroked) {
			std::fill(row + left, row + right + 1, pixel);
			return;
		}
		if (isBetweenCorners) {
			for (int x : {whole.left(), whole.right()}) {
				if (x >= left && x <= right)
					row[x] = pixel;
			}
			return;
		}

		const uint8* coverage = shape.Row(line, whole.height());
		auto cover = [&](int first, const uint8* covered) {
			const int from = std::max(first, left);
			const int to = std::min(first + corner - 1, right);
			if (from <= to)
				CoverPixels(
					row + from, covered + from - first, to - from + 1, pixel, fBuffer.hasAlpha);
		};
		cover(whole.left(), coverage);
		cover(firstRight, coverage + corner + 1);
		const uint8 middle = coverage[corner];
		const int from = std::max(whole.left() + corner, left);
		const int to = std::min(firstRight - 1, right);
		if (middle == 255 && from <= to) {
			std::fill(row + from, row + to + 1, pixel);
			return;
		}
		for (int x = from; middle != 0 && x <= to; x++)
			row[x] = MixPixels(row[x], pixel, middle) | (fBuffer.hasAlpha ? 0 : pixel & 0xff000000);
	});
	return true;
}


rgb_color
QtCanvas::PixelAt(BPoint where) const
{
	QRect whole(QPoint(Whole(where.x), Whole(where.y)), QSize(1, 1));
	QPoint device = Device(whole).topLeft();
	if (!QRect(0, 0, fBuffer.width, fBuffer.height).contains(device))
		return {0, 0, 0, 0};
	rgb_color color = ColorOf(Row(device.y())[device.x()]);
	if (!fBuffer.hasAlpha)
		color.alpha = 255;
	return color;
}


Picture
QtCanvas::ReadPicture() const
{
	Picture picture{fBuffer.width, fBuffer.height, fBuffer.hasAlpha, {}};
	picture.pixels.reserve(static_cast<size_t>(fBuffer.width) * fBuffer.height);
	for (int32 y = 0; y < fBuffer.height; y++)
		picture.pixels.insert(picture.pixels.end(), Row(y), Row(y) + fBuffer.width);
	return picture;
}

} // namespace BPrivate

// SPDX-License-Identifier: MIT
// A canvas that writes down what is drawn on it, and the playing of that.
#ifndef INTERFACE_PICTURE_CANVAS_H
#define INTERFACE_PICTURE_CANVAS_H

#include <memory>
#include <vector>

#include <Region.h>

#include "display/Canvas.h"

class BPicture;

namespace BPrivate {

/// Records into bytes: an operation's code and its arguments, in the machine's order.
class PictureCanvas final : public Canvas {
public:
	/// Appends to \a operations, which stay the caller's.
	explicit PictureCanvas(std::vector<uint8>* operations);

	int32 Width() const override { return 0; }
	int32 Height() const override { return 0; }
	float Scale() const override { return 1; }

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

private:
	template <typename... Values>
	void Record(uint8 code, const Values&... values);
	template <typename Value>
	void Put(const Value& value);
	void PutBytes(const void* bytes, size_t size);
	void PutPoints(const BPoint* points, int32 count);
	void PutPath(const CanvasPath& path);

	std::vector<uint8>* fOperations;
	BFont fFont;
};


/// Draws recorded operations: \a offset is added to all coordinates, and nothing is drawn outside of
/// \a clip. Stops with B_BAD_DATA at what is no operation. A null \a canvas only checks.
status_t PlayOperations(
	const std::vector<uint8>& operations, Canvas* canvas, const BRegion& clip, BPoint offset);

} // namespace BPrivate

#endif // INTERFACE_PICTURE_CANVAS_H

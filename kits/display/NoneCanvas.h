// SPDX-License-Identifier: MIT
// A canvas without pixels: it draws nothing and only knows how far text goes.
#ifndef DISPLAY_NONE_CANVAS_H
#define DISPLAY_NONE_CANVAS_H

#include "display/Canvas.h"
#include "display/PixelBuffer.h"

namespace BPrivate {

class FontEngine;

class NoneCanvas : public Canvas {
public:
	NoneCanvas(FontEngine& fonts, int32 width, int32 height, float scale)
		: fFonts(fonts),
		  fWidth(width),
		  fHeight(height),
		  fScale(scale)
	{
	}

	int32 Width() const override { return fWidth; }
	int32 Height() const override { return fHeight; }
	float Scale() const override { return fScale; }
	void SetState(const CanvasState& state) override { fState = state; }
	void SetClip(const BRegion*) override {}
	void StrokeLine(BPoint, BPoint, const pattern&) override {}
	void StrokeLine(BPoint, BPoint, rgb_color) override {}
	void StrokeRect(BRect, const pattern&) override {}
	void FillRect(BRect, const pattern&) override {}
	void InvertRect(BRect) override {}
	void FillRegion(const BRegion&, const pattern&) override {}
	void StrokeRoundRect(BRect, float, float, const pattern&) override {}
	void FillRoundRect(BRect, float, float, const pattern&) override {}
	void StrokeEllipse(BRect, const pattern&) override {}
	void FillEllipse(BRect, const pattern&) override {}
	void StrokeArc(BRect, float, float, const pattern&) override {}
	void FillArc(BRect, float, float, const pattern&) override {}
	void StrokePolygon(const BPoint*, int32, bool, const pattern&) override {}
	void FillPolygon(const BPoint*, int32, const pattern&) override {}
	void StrokePath(const CanvasPath&, const pattern&) override {}
	void FillPath(const CanvasPath&, const pattern&) override {}
	BPoint DrawString(
		const char* text, int32 length, BPoint where, const escapement_delta* delta) override;
	void DrawString(const char*, int32, const BPoint*, int32) override {}
	void DrawBitmap(const PixelBuffer&, BRect, BRect, uint32) override {}
	void CopyBits(BRect, BRect) override {}
	rgb_color PixelAt(BPoint) const override { return {0, 0, 0, 0}; }
	Picture ReadPicture() const override { return {}; }

private:
	FontEngine& fFonts;
	const int32 fWidth;
	const int32 fHeight;
	const float fScale;
	CanvasState fState;
};

} // namespace BPrivate

#endif // DISPLAY_NONE_CANVAS_H

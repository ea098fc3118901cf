// SPDX-License-Identifier: MIT
// BView: bitmaps in and behind the view, and copying what is drawn.
#include <View.h>

#include <algorithm>
#include <cmath>

#include <Bitmap.h>
#include <Region.h>
#include <Window.h>

#include "display/Canvas.h"
#include "interface/DrawableBitmap.h"
#include "interface/ViewPrivate.h"
#include "interface/WindowPrivate.h"

using BPrivate::Canvas;
using BPrivate::DrawableBitmap;

void
BPrivate::ViewBackground::Draw(Canvas& canvas, BRect bounds, BPoint offset) const
{
	CanvasState state;
	state.mode = B_OP_OVER;
	state.origin = offset;
	canvas.SetState(state);

	BRect place = destination;
	if ((followFlags & 0xf) == _VIEW_RIGHT_)
		place.OffsetBy(bounds.Width() - place.right, 0);
	if ((followFlags >> 4 & 0xf) == _VIEW_BOTTOM_)
		place.OffsetBy(0, bounds.Height() - place.bottom);
	DrawableBitmap drawable(*bitmap);
	float stepX = place.Width() + 1, stepY = place.Height() + 1;
	if (stepX < 1 || stepY < 1)
		return;

	bool tileX = (options & B_TILE_BITMAP_X) != 0, tileY = (options & B_TILE_BITMAP_Y) != 0;
	float firstX =
		tileX ? place.left - std::ceil((place.left - bounds.left) / stepX) * stepX : place.left;
	float firstY =
		tileY ? place.top - std::ceil((place.top - bounds.top) / stepY) * stepY : place.top;
	float lastX = tileX ? bounds.right : firstX, lastY = tileY ? bounds.bottom : firstY;
	for (float y = firstY; y <= lastY; y += stepY) {
		for (float x = firstX; x <= lastX; x += stepX)
			canvas.DrawBitmap(drawable.Buffer(), source, place.OffsetToCopy(x, y),
				options & B_FILTER_BITMAP_BILINEAR);
	}
}


void
BView::SetViewBitmap(
	const BBitmap* bitmap, BRect srcRect, BRect dstRect, uint32 followFlags, uint32 options)
{
	CheckLock();
	if (bitmap == nullptr || bitmap->InitCheck() != B_OK) {
		ClearViewBitmap();
		return;
	}
	auto background = std::make_unique<BPrivate::ViewBackground>();
	background->bitmap =
		std::make_unique<BBitmap>(*bitmap, bitmap->Flags() & ~B_BITMAP_ACCEPTS_VIEWS);
	background->source = srcRect.OffsetByCopy(-bitmap->Bounds().LeftTop());
	background->destination = dstRect;
	background->followFlags = followFlags;
	background->options = options;
	Drawing().background = std::move(background);
	Invalidate();
}


void
BView::SetViewBitmap(const BBitmap* bitmap, uint32 followFlags, uint32 options)
{
	BRect rect;
	if (bitmap != nullptr)
		rect = bitmap->Bounds();
	SetViewBitmap(bitmap, rect, rect.OffsetToCopy(B_ORIGIN), followFlags, options);
}


void
BView::ClearViewBitmap()
{
	CheckLock();
	if (fDrawing == nullptr || fDrawing->background == nullptr)
		return;
	fDrawing->background.reset();
	Invalidate();
}


void
BView::CopyBits(BRect src, BRect dst)
{
	Canvas* canvas = BeginDrawing();
	if (canvas == nullptr || !src.IsValid() || !dst.IsValid())
		return;

	canvas->CopyBits(src, dst);
	if (IsRecording())
		return;
	EndDrawing(dst);

	// Pixels of the source that are not there to be copied have to be drawn.
	BRegion missing(dst);
	BRegion visible = fOwner->fData->painter.VisibleRegion(this);
	visible.OffsetBy(-OffsetInWindow());
	bool stretched = src.Width() != dst.Width() || src.Height() != dst.Height();
	if (!stretched || visible.Contains(src.LeftTop())) {
		BRegion copied(src);
		copied.IntersectWith(&visible);
		if (!stretched)
			copied.OffsetBy(dst.LeftTop() - src.LeftTop());
		else
			copied.Set(dst);
		missing.Exclude(&copied);
	}
	Invalidate(&missing);
}


void
BView::DrawBitmapAsync(const BBitmap* aBitmap, BRect bitmapRect, BRect viewRect, uint32 options)
{
	Canvas* canvas = BeginDrawing();
	if (canvas == nullptr || aBitmap == nullptr || aBitmap->InitCheck() != B_OK)
		return;

	DrawableBitmap drawable(*aBitmap);
	canvas->DrawBitmap(drawable.Buffer(), bitmapRect.OffsetByCopy(-aBitmap->Bounds().LeftTop()),
		viewRect, options);
	EndDrawing(viewRect);
}


void
BView::DrawBitmapAsync(const BBitmap* aBitmap, BRect bitmapRect, BRect viewRect)
{
	DrawBitmapAsync(aBitmap, bitmapRect, viewRect, 0);
}


void
BView::DrawBitmapAsync(const BBitmap* aBitmap, BRect viewRect)
{
	if (aBitmap != nullptr)
		DrawBitmapAsync(aBitmap, aBitmap->Bounds(), viewRect, 0);
}


void
BView::DrawBitmapAsync(const BBitmap* aBitmap, BPoint where)
{
	if (aBitmap != nullptr)
		DrawBitmapAsync(aBitmap, aBitmap->Bounds(), aBitmap->Bounds().OffsetToCopy(where), 0);
}


void
BView::DrawBitmapAsync(const BBitmap* aBitmap)
{
	DrawBitmapAsync(aBitmap, PenLocation());
}


void
BView::DrawBitmap(const BBitmap* aBitmap, BRect bitmapRect, BRect viewRect, uint32 options)
{
	DrawBitmapAsync(aBitmap, bitmapRect, viewRect, options);
}


void
BView::DrawBitmap(const BBitmap* aBitmap, BRect bitmapRect, BRect viewRect)
{
	DrawBitmapAsync(aBitmap, bitmapRect, viewRect);
}


void
BView::DrawBitmap(const BBitmap* aBitmap, BRect viewRect)
{
	DrawBitmapAsync(aBitmap, viewRect);
}


void
BView::DrawBitmap(const BBitmap* aBitmap, BPoint where)
{
	DrawBitmapAsync(aBitmap, where);
}


void
BView::DrawBitmap(const BBitmap* aBitmap)
{
	DrawBitmapAsync(aBitmap);
}


// \a phase: the place of a tile's left-top, any tile's.
void
BView::DrawTiledBitmap(const BBitmap* aBitmap, BRect viewRect, BPoint phase)
{
	if (aBitmap == nullptr || aBitmap->InitCheck() != B_OK || !viewRect.IsValid())
		return;

	float stepX = aBitmap->Bounds().Width() + 1, stepY = aBitmap->Bounds().Height() + 1;
	float firstX = phase.x + std::floor((viewRect.left - phase.x) / stepX) * stepX;
	float firstY = phase.y + std::floor((viewRect.top - phase.y) / stepY) * stepY;
	BRegion clip(viewRect);
	PushState();
	ConstrainClippingRegion(&clip);
	for (float y = firstY; y <= viewRect.bottom; y += stepY) {
		for (float x = firstX; x <= viewRect.right; x += stepX)
			DrawBitmapAsync(aBitmap, BPoint(x, y));
	}
	PopState();
}

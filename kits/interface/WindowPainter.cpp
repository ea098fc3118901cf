// SPDX-License-Identifier: MIT
// WindowPainter: regions that wait for redraw, the walk that draws them, and clipping.
#include "interface/WindowPainter.h"

#include <algorithm>
#include <cmath>
#include <vector>

#include <Bitmap.h>
#include <Message.h>
#include <OS.h>
#include <Window.h>

#include "display/Canvas.h"
#include "display/Display.h"
#include "display/HostWindow.h"
#include "display/PixelBuffer.h"
#include "interface/ViewPrivate.h"
#include "interface/WindowClient.h"
#include "interface/WindowPrivate.h"

namespace BPrivate {

namespace {

// With more rects than this their frame is presented: a copy too much is cheaper than the bookkeeping.
const int32 kMaxDrawnRects = 32;


/// Each of the regions meets others of its size: one after the other would take the square of their number.
BRegion
Union(std::vector<BRegion>& regions)
{
	for (size_t step = 1; step < regions.size(); step *= 2) {
		for (size_t i = 0; i + step < regions.size(); i += 2 * step)
			regions[i].Include(&regions[i + step]);
	}
	return std::move(regions[0]);
}

} // namespace


WindowPainter::WindowPainter(BWindow* window)
	: fWindow(window),
	  fBitmap(nullptr),
	  fUpdating(nullptr),
	  fBegunView(nullptr),
	  fBegunState(0),
	  fBegunIsClipped(false),
	  fBegunGeneration(0),
	  fGeneration(1),
	  fDisabled(0),
	  fUpdatePosted(false)
{
}


WindowPainter::~WindowPainter() = default;


void
WindowPainter::MakeCanvas()
{
	HostWindow* host = fWindow->fData->host.get();
	if (host == nullptr || !Display::Get().DrawsPixels())
		return;

	BRect bounds = fWindow->Bounds();
	fCanvas = Display::Get().MakeCanvas(std::max<int32>(bounds.IntegerWidth() + 1, 1),
		std::max<int32>(bounds.IntegerHeight() + 1, 1), host->Scale());
	fDrawn.MakeEmpty();
	fBegunView = nullptr;
	ClippingChanged();
	fWindow->fData->topView->Invalidate();
}


void
WindowPainter::MakeCanvas(BBitmap* bitmap)
{
	color_space space = bitmap->ColorSpace();
	if ((space != B_RGB32 && space != B_RGBA32) || !Display::Get().DrawsPixels())
		return;

	fBitmap = bitmap;
	fCanvas =
		Display::Get().MakeCanvas(PixelBuffer{bitmap->Bits(), bitmap->Bounds().IntegerWidth() + 1,
			bitmap->Bounds().IntegerHeight() + 1, bitmap->BytesPerRow(), space == B_RGBA32});
	ClippingChanged();
}


void
WindowPainter::CloseCanvas()
{
	fCanvas.reset();
	fBegunView = nullptr;
}


void
WindowPainter::ViewRemoved(BView* view)
{
	ClippingChanged();
	if (fBegunView == view)
		fBegunView = nullptr;
}


Canvas*
WindowPainter::Begin(BView* view)
{
	if (fCanvas == nullptr)
		return nullptr;

	uint32 state = view->fDrawing != nullptr ? view->fDrawing->serial : 0;
	const bool isAnother = view != fBegunView || fBegunGeneration != fGeneration;
	if (isAnother || fBegunState != state) {
		const bool isClipped = view->State().clipping.has_value();
		if (isAnother || isClipped || fBegunIsClipped) {
			fClip = DrawRegion(view);
			fCanvas->SetClip(&fClip);
			fBegunIsClipped = isClipped;
		}
		fCanvas->SetState(ToCanvasState(*view, view->State(), view->OffsetInWindow()));
		fBegunView = view;
		fBegunState = state;
		fBegunGeneration = fGeneration;
	}
	return fClip.CountRects() != 0 ? fCanvas.get() : nullptr;
}


void
WindowPainter::Invalidate(BView* view, BRect rect)
{
	if (fCanvas == nullptr || fBitmap != nullptr || !rect.IsValid())
		return;

	rect.OffsetBy(view->OffsetInWindow());
	rect = rect & VisibleFrame(view);
	if (rect.IsValid())
		InvalidateWindow(BRegion(rect));
}


void
WindowPainter::Invalidate(BView* view, const BRegion& region)
{
	if (fCanvas == nullptr || fBitmap != nullptr)
		return;

	BRegion dirty(region);
	dirty.OffsetBy(view->OffsetInWindow());
	BRegion visible(VisibleFrame(view));
	dirty.IntersectWith(&visible);
	InvalidateWindow(dirty);
}


void
WindowPainter::InvalidateWindow(const BRegion& region)
{
	if (region.CountRects() == 0)
		return;
	fDirty.Include(&region);
	if (fDisabled == 0)
		PostUpdate();
}


void
WindowPainter::PostUpdate()
{
	if (fUpdatePosted)
		return;
	fUpdatePosted = fWindow->PostMessage(_UPDATE_, fWindow) == B_OK;
}


void
WindowPainter::DisableUpdates()
{
	fDisabled++;
}


void
WindowPainter::EnableUpdates()
{
	if (fDisabled > 0 && --fDisabled == 0 && NeedsUpdate())
		PostUpdate();
}


void
WindowPainter::Update()
{
	fUpdatePosted = false;
	if (fUpdating != nullptr || fDisabled > 0 || fCanvas == nullptr || fWindow->IsHidden()) {
		Present();
		return;
	}
	if (!NeedsUpdate()) {
		Present();
		return;
	}

	BRegion region;
	std::swap(region, fDirty);
	BRegion bounds(fWindow->Bounds());
	region.IntersectWith(&bounds);

	fUpdating = &region;
	ClippingChanged();
	DrawTree(fWindow->fData->topView, region);
	fUpdating = nullptr;
	ClippingChanged();
	fDrawn.Include(&region);
	Present();
}


// Parents before children, a view's later children over its earlier ones. The hooks may change the tree:
// a view that is not where it was any more ends the walk there, as the change has marked its place anew.
void
WindowPainter::DrawTree(BView* view, const BRegion& region)
{
	if (view->fShowLevel > 0 || !region.Intersects(VisibleFrame(view)))
		return;

	DrawView(view, region);
	BView* child = view->fFirstChild;
	while (child != nullptr && child->fParent == view) {
		BView* next = child->fNextSibling;
		DrawTree(child, region);
		child = next;
	}
	if ((view->fFlags & B_DRAW_ON_CHILDREN) != 0 && (view->fFlags & B_WILL_DRAW) != 0) {
		BRegion part = VisibleRegion(view);
		part.IntersectWith(&region);
		view->PushState();
		view->DrawAfterChildren(part.Frame().OffsetByCopy(-view->OffsetInWindow()));
		view->PopState();
	}
}


void
WindowPainter::DrawView(BView* view, const BRegion& region)
{
	BRegion part = VisibleRegion(view);
	part.IntersectWith(&region);
	if (part.CountRects() == 0)
		return;

	DrawBackground(view, part);
	if ((view->fFlags & B_WILL_DRAW) == 0)
		return;

	size_t depth = view->fDrawing != nullptr ? view->fDrawing->savedStates.size() : 0;
	view->PushState();
	view->Draw(part.Frame().OffsetByCopy(-view->OffsetInWindow()));
	// Whatever the hook pushed and did not pop goes too.
	while (view->fDrawing->savedStates.size() > depth)
		view->PopState();
}


void
WindowPainter::DrawBackground(BView* view, const BRegion& region)
{
	rgb_color color = view->ViewColor();
	ViewBackground* background =
		view->fDrawing != nullptr ? view->fDrawing->background.get() : nullptr;
	CanvasState state;
	state.highColor = color;
	fBegunView = nullptr;
	fCanvas->SetClip(&region);
	fCanvas->SetState(state);
	if (color != B_TRANSPARENT_COLOR)
		fCanvas->FillRect(region.Frame(), B_SOLID_HIGH);
	if (background != nullptr)
		background->Draw(*fCanvas, view->fBounds, view->OffsetInWindow());
}


// The view's rect, as far as its ancestors show it.
BRect
WindowPainter::VisibleFrame(BView* view) const
{
	BRect visible = view->fBounds;
	for (BView* ancestor = view; ancestor != nullptr; ancestor = ancestor->fParent) {
		visible = visible & ancestor->fBounds;
		visible.OffsetBy(ancestor->fLeftTop - ancestor->fBounds.LeftTop());
	}
	return visible;
}


// Siblings that overlap do not clip each other: the later one is drawn over the earlier one.
BRegion
WindowPainter::VisibleRegion(BView* view) const
{
	if (view->IsHidden(fWindow->fData->topView))
		return BRegion();

	BRegion visible(VisibleFrame(view));
	if ((view->fFlags & B_DRAW_ON_CHILDREN) != 0)
		return visible;
	BPoint offset = view->OffsetInWindow();
	std::vector<BRegion> covered;
	for (BView* child = view->fFirstChild; child != nullptr; child = child->fNextSibling) {
		if (child->fShowLevel <= 0 && (child->fFlags & B_TRANSPARENT_BACKGROUND) == 0)
			covered.emplace_back(child->fBounds.OffsetToCopy(child->fLeftTop + offset));
	}
	if (!covered.empty()) {
		BRegion all = Union(covered);
		visible.Exclude(&all);
	}
	return visible;
}


BRegion
WindowPainter::DrawRegion(BView* view) const
{
	BRegion region = VisibleRegion(view);
	if (fUpdating != nullptr)
		region.IntersectWith(fUpdating);

	const GraphicsState& state = view->State();
	if (state.clipping) {
		BRegion own(*state.clipping);
		own.OffsetBy(view->OffsetInWindow());
		region.IntersectWith(&own);
	}
	return region;
}


void
WindowPainter::FrameChanged(BView* view, BRect oldFrame)
{
	ClippingChanged();
	if (fCanvas == nullptr || fBitmap != nullptr || view->fShowLevel > 0)
		return;

	BRect frame = view->Frame();
	BView* parent = view->fParent;
	bool moved = frame.LeftTop() != oldFrame.LeftTop();
	if (parent == nullptr || moved || (view->fFlags & B_FULL_UPDATE_ON_RESIZE) != 0) {
		BRegion all(frame);
		all.Include(oldFrame);
		if (parent != nullptr)
			Invalidate(parent, all);
		else
			Invalidate(view, view->fBounds);
		return;
	}

	// What one of the two covers and the other does not.
	BRegion changed(frame);
	changed.Exclude(oldFrame);
	BRegion uncovered(oldFrame);
	uncovered.Exclude(frame);
	changed.Include(&uncovered);
	Invalidate(parent, changed);
}


// Pixels that stay visible are moved where each goes to one of the device; what comes into sight is drawn.
void
WindowPainter::ViewScrolled(BView* view, BPoint delta)
{
	ClippingChanged();
	if (fCanvas == nullptr || view->IsHidden())
		return;

	BRect visible = VisibleFrame(view);
	if (!visible.IsValid())
		return;
	BRect kept = visible & visible.OffsetByCopy(delta);
	BRegion exposed(visible);
	const float deviceX = delta.x * fCanvas->Scale();
	const float deviceY = delta.y * fCanvas->Scale();
	const bool fits = deviceX == std::floor(deviceX) && deviceY == std::floor(deviceY);
	if (kept.IsValid() && fits) {
		BRegion clip(visible);
		fBegunView = nullptr;
		fCanvas->SetClip(&clip);
		fCanvas->SetState(CanvasState());
		fCanvas->CopyBits(kept, kept.OffsetByCopy(-delta));
		exposed.Exclude(kept.OffsetByCopy(-delta));

		// What waited for redraw moved along.
		BRegion waiting(fDirty);
		waiting.IntersectWith(&clip);
		fDirty.Exclude(&waiting);
		waiting.OffsetBy(-delta);
		waiting.IntersectWith(&clip);
		InvalidateWindow(waiting);
		fClip = clip;
		Drawn(visible);
	}
	InvalidateWindow(exposed);
}


void
WindowPainter::Drawn(BRect rect)
{
	// The update presents all of itself; a bitmap has nothing to present.
	if (fUpdating != nullptr || fBitmap != nullptr)
		return;

	rect = rect & fClip.Frame();
	if (!rect.IsValid())
		return;
	fDrawn.Include(rect);
	if (fDrawn.CountRects() > kMaxDrawnRects)
		fDrawn.Set(fDrawn.Frame());
	// The window's thread presents after each message; another one's drawing needs one.
	if (find_thread(nullptr) != fWindow->Thread())
		PostUpdate();
}


void
WindowPainter::Present()
{
	HostWindow* host = fWindow->fData->host.get();
	if (fDrawn.CountRects() == 0 || fCanvas == nullptr || host == nullptr || fUpdating != nullptr
		|| fWindow->fData->transactions > 0 || fWindow->IsHidden())
		return;

	host->Present(*fCanvas, fDrawn);
	fDrawn.MakeEmpty();
}

} // namespace BPrivate

// SPDX-License-Identifier: MIT
// What of a window waits for redraw, the drawing of it, and the way of pixels to the screen.
#ifndef INTERFACE_WINDOW_PAINTER_H
#define INTERFACE_WINDOW_PAINTER_H

#include <memory>

#include <Rect.h>
#include <Region.h>

class BBitmap;
class BView;
class BWindow;

namespace BPrivate {

class Canvas;

/// The drawing side of one window: coordinates are the window's. Window locked.
class WindowPainter {
public:
	explicit WindowPainter(BWindow* window);
	~WindowPainter();

	/// Makes the canvas anew and marks all of it for redraw, for the window's size or for a bitmap's memory;
	/// none where nothing is drawn.
	void MakeCanvas();
	void MakeCanvas(BBitmap* bitmap);
	void CloseCanvas();
	bool HasCanvas() const { return fCanvas != nullptr; }

	/// The canvas set up for a view: its state, and what of it may be drawn on. Null when that is nothing.
	Canvas* Begin(BView* view);
	/// The canvas was set up for something else: the next Begin() does it anew.
	void Forget() { fBegunView = nullptr; }
	/// What Begin() found, window coordinates.
	const BRegion& Clip() const { return fClip; }

	/// Marks for redraw; the update follows as a message.
	void Invalidate(BView* view, BRect rect);
	void Invalidate(BView* view, const BRegion& region);
	bool NeedsUpdate() const { return fDirty.CountRects() != 0; }
	/// Window thread: draws what waits and presents it.
	void Update();
	void DisableUpdates();
	void EnableUpdates();

	/// A frame, the visibility or the order of views changed.
	void ClippingChanged() { fGeneration++; }
	void ViewRemoved(BView* view);
	/// After a view changed its place or size; \a oldFrame in its parent.
	void FrameChanged(BView* view, BRect oldFrame);
	/// After the bounds of \a view moved by \a delta.
	void ViewScrolled(BView* view, BPoint delta);
	/// The part of \a view that is not hidden, clipped or covered by its own children.
	BRegion VisibleRegion(BView* view) const;
	/// Where \a view may draw now: the visible part, inside an update what is updated, and its own clipping.
	BRegion DrawRegion(BView* view) const;

	/// Something was drawn in \a rect, within the last Begin()'s region.
	void Drawn(BRect rect);
	/// Brings what was drawn to the screen, when nothing holds it back.
	void Present();

private:
	BRect VisibleFrame(BView* view) const;
	void InvalidateWindow(const BRegion& region);
	void PostUpdate();
	void DrawTree(BView* view, const BRegion& region);
	void DrawView(BView* view, const BRegion& region);
	void DrawBackground(BView* view, const BRegion& region);

	BWindow* fWindow;
	BBitmap* fBitmap;
	std::unique_ptr<Canvas> fCanvas;
	BRegion fDirty;
	BRegion fDrawn;
	// What the running update draws, null outside of one.
	const BRegion* fUpdating;
	// What the canvas was last set up for.
	BView* fBegunView;
	uint32 fBegunState;
	bool fBegunIsClipped;
	uint32 fBegunGeneration;
	BRegion fClip;
	// Counts what changes the visible parts of views, updates that begin and end included.
	uint32 fGeneration;
	int32 fDisabled;
	bool fUpdatePosted;
};

} // namespace BPrivate

#endif // INTERFACE_WINDOW_PAINTER_H

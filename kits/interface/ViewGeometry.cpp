// SPDX-License-Identifier: MIT
// BView: frames, coordinates, resizing with the parent, and scrolling.
#include <View.h>

#include <algorithm>
#include <cmath>

#include <Message.h>
#include <OS.h>
#include <Window.h>

#include "interface/ScrollBarLink.h"
#include "interface/WholePixels.h"
#include "interface/WindowPrivate.h"

using BPrivate::WholePixels;

namespace {

// One side's nibble of a resizing mode: how far it goes when the parent grows by delta.
int32
SideMove(uint32 tiedTo, uint32 farSide, int32 delta)
{
	if (tiedTo == farSide)
		return delta;
	return tiedTo == _VIEW_CENTER_ ? delta / 2 : 0;
}


float
Limited(float value, const BPrivate::ScrollBarLink* bar)
{
	if (bar == nullptr)
		return value;

	float minimum, maximum;
	bar->GetRange(&minimum, &maximum);
	return std::max(std::min(value, maximum), minimum);
}

} // namespace


BRect
BView::Bounds() const
{
	CheckLock();
	return fBounds;
}


BRect
BView::Frame() const
{
	CheckLock();
	return fBounds.OffsetToCopy(fLeftTop);
}


BPoint
BView::LeftTop() const
{
	return Bounds().LeftTop();
}


void
BView::ConvertToParent(BPoint* point) const
{
	*point += fLeftTop - fBounds.LeftTop();
}


BPoint
BView::ConvertToParent(BPoint point) const
{
	ConvertToParent(&point);
	return point;
}


void
BView::ConvertFromParent(BPoint* point) const
{
	*point -= fLeftTop - fBounds.LeftTop();
}


BPoint
BView::ConvertFromParent(BPoint point) const
{
	ConvertFromParent(&point);
	return point;
}


void
BView::ConvertToParent(BRect* rect) const
{
	rect->OffsetBy(fLeftTop - fBounds.LeftTop());
}


BRect
BView::ConvertToParent(BRect rect) const
{
	ConvertToParent(&rect);
	return rect;
}


void
BView::ConvertFromParent(BRect* rect) const
{
	rect->OffsetBy(fBounds.LeftTop() - fLeftTop);
}


BRect
BView::ConvertFromParent(BRect rect) const
{
	ConvertFromParent(&rect);
	return rect;
}


// What view coordinates need to become the window's.
BPoint
BView::OffsetInWindow() const
{
	BPoint offset;
	for (const BView* view = this; view != nullptr; view = view->fParent)
		offset += view->fLeftTop - view->fBounds.LeftTop();
	return offset;
}


void
BView::ConvertToScreen(BPoint* point) const
{
	CheckLock();
	*point += OffsetInWindow();
	if (fOwner != nullptr)
		fOwner->ConvertToScreen(point);
}


BPoint
BView::ConvertToScreen(BPoint point) const
{
	ConvertToScreen(&point);
	return point;
}


void
BView::ConvertFromScreen(BPoint* point) const
{
	CheckLock();
	*point -= OffsetInWindow();
	if (fOwner != nullptr)
		fOwner->ConvertFromScreen(point);
}


BPoint
BView::ConvertFromScreen(BPoint point) const
{
	ConvertFromScreen(&point);
	return point;
}


void
BView::ConvertToScreen(BRect* rect) const
{
	rect->OffsetBy(ConvertToScreen(B_ORIGIN));
}


BRect
BView::ConvertToScreen(BRect rect) const
{
	ConvertToScreen(&rect);
	return rect;
}


void
BView::ConvertFromScreen(BRect* rect) const
{
	rect->OffsetBy(ConvertFromScreen(B_ORIGIN));
}


BRect
BView::ConvertFromScreen(BRect rect) const
{
	ConvertFromScreen(&rect);
	return rect;
}


void
BView::MoveBy(float dh, float dv)
{
	MoveTo(fLeftTop.x + std::round(dh), fLeftTop.y + std::round(dv));
}


void
BView::MoveTo(BPoint where)
{
	MoveTo(where.x, where.y);
}


void
BView::MoveTo(float x, float y)
{
	CheckLock();
	SetFrame(BPoint(std::round(x), std::round(y)), fBounds.Width(), fBounds.Height());
}


void
BView::ResizeBy(float dh, float dv)
{
	ResizeTo(fBounds.Width() + std::round(dh), fBounds.Height() + std::round(dv));
}


void
BView::ResizeTo(float width, float height)
{
	CheckLock();
	SetFrame(fLeftTop, std::round(width), std::round(height));
}


void
BView::ResizeTo(BSize size)
{
	ResizeTo(size.width, size.height);
}


void
BView::ScrollBy(float dh, float dv)
{
	ScrollTo(BPoint(fBounds.left + dh, fBounds.top + dv));
}


void
BView::ScrollTo(float x, float y)
{
	ScrollTo(BPoint(x, y));
}


void
BView::ScrollTo(BPoint where)
{
	CheckLock();
	where.x = std::round(Limited(where.x, fHorizontalBar));
	where.y = std::round(Limited(where.y, fVerticalBar));
	BPoint delta = where - fBounds.LeftTop();
	if (delta == B_ORIGIN)
		return;

	fBounds.OffsetTo(where);
	if (fOwner != nullptr)
		fOwner->fData->painter.ViewScrolled(this, delta);

	if (delta.x != 0 && fHorizontalBar != nullptr)
		fHorizontalBar->TargetScrolled(where.x);
	if (delta.y != 0 && fVerticalBar != nullptr)
		fVerticalBar->TargetScrolled(where.y);
}


void
BView::SetFrame(BPoint leftTop, float width, float height)
{
	BRect oldFrame = Frame();
	bool moved = leftTop != fLeftTop;
	int32 dx = WholePixels(width - fBounds.Width());
	int32 dy = WholePixels(height - fBounds.Height());
	bool resized = dx != 0 || dy != 0;
	if (!moved && !resized)
		return;

	fLeftTop = leftTop;
	fBounds.right = fBounds.left + width;
	fBounds.bottom = fBounds.top + height;
	if (fOwner == nullptr)
		return;

	if (resized) {
		for (BView* child = fFirstChild; child != nullptr; child = child->fNextSibling)
			child->ParentResized(dx, dy);
	}
	fOwner->fData->painter.FrameChanged(this, oldFrame);
	PostFrameMessages(moved, resized);
}


// The window is locked and the parent attached. Invalidation is up to the view whose resizing began it.
void
BView::ParentResized(int32 dx, int32 dy)
{
	uint32 mode = ResizingMode();
	BRect frame = Frame();
	BRect newFrame(frame.left + SideMove(mode >> 8 & 0xf, _VIEW_RIGHT_, dx),
		frame.top + SideMove(mode >> 12 & 0xf, _VIEW_BOTTOM_, dy),
		frame.right + SideMove(mode & 0xf, _VIEW_RIGHT_, dx),
		frame.bottom + SideMove(mode >> 4 & 0xf, _VIEW_BOTTOM_, dy));
	if (newFrame != frame)
		SetFrame(newFrame.LeftTop(), newFrame.Width(), newFrame.Height());
}


void
BView::PostFrameMessages(bool moved, bool resized)
{
	if ((fFlags & B_FRAME_EVENTS) == 0)
		return;

	if (moved) {
		BMessage message(B_VIEW_MOVED);
		message.AddInt64("when", system_time());
		message.AddPoint("where", fLeftTop);
		fOwner->PostMessage(&message, this);
	}
	if (resized) {
		BMessage message(B_VIEW_RESIZED);
		message.AddInt64("when", system_time());
		message.AddInt32("width", WholePixels(fBounds.Width()));
		message.AddInt32("height", WholePixels(fBounds.Height()));
		fOwner->PostMessage(&message, this);
	}
}


// The part of the parent that a view covers, or covered: shows what is there now.
void
BView::InvalidateFrame(BRect frame)
{
	fOwner->fData->painter.ClippingChanged();
	if (fParent != nullptr)
		fParent->Invalidate(frame);
	else
		Invalidate();
}

// SPDX-License-Identifier: MIT
// BWindow: place and size, size limits, zooming, and screen coordinates.
#include <Window.h>

#include <algorithm>
#include <cmath>

#include <Message.h>
#include <OS.h>
#include <Screen.h>

#include "display/Canvas.h"
#include "display/HostWindow.h"
#include "interface/WindowClient.h"
#include "interface/WindowPrivate.h"

BRect
BWindow::Bounds() const
{
	return fData->frame.OffsetToCopy(B_ORIGIN);
}


BRect
BWindow::Frame() const
{
	return fData->frame;
}


BSize
BWindow::Size() const
{
	return fData->frame.Size();
}


BRect
BWindow::DecoratorFrame() const
{
	return fData->host != nullptr ? fData->host->DecoratorFrame() : fData->frame;
}


void
BWindow::ConvertToScreen(BPoint* point) const
{
	*point += fData->frame.LeftTop();
}


BPoint
BWindow::ConvertToScreen(BPoint point) const
{
	return point + fData->frame.LeftTop();
}


void
BWindow::ConvertFromScreen(BPoint* point) const
{
	*point -= fData->frame.LeftTop();
}


BPoint
BWindow::ConvertFromScreen(BPoint point) const
{
	return point - fData->frame.LeftTop();
}


void
BWindow::ConvertToScreen(BRect* rect) const
{
	rect->OffsetBy(fData->frame.LeftTop());
}


BRect
BWindow::ConvertToScreen(BRect rect) const
{
	return rect.OffsetByCopy(fData->frame.LeftTop());
}


void
BWindow::ConvertFromScreen(BRect* rect) const
{
	rect->OffsetBy(-fData->frame.LeftTop());
}


BRect
BWindow::ConvertFromScreen(BRect rect) const
{
	return rect.OffsetByCopy(-fData->frame.LeftTop());
}


void
BWindow::MoveBy(float dx, float dy)
{
	if (!Lock())
		return;
	MoveTo(fData->frame.left + std::round(dx), fData->frame.top + std::round(dy));
	Unlock();
}


void
BWindow::MoveTo(BPoint where)
{
	MoveTo(where.x, where.y);
}


void
BWindow::MoveTo(float x, float y)
{
	if (!Lock())
		return;
	BPoint where(std::round(x), std::round(y));
	if (where != fData->frame.LeftTop()) {
		fData->AdoptFrame(fData->frame.OffsetToCopy(where));
		fData->movesAsked++;
		if (fData->host != nullptr)
			fData->host->MoveTo(where);
		fData->PostMoved();
	}
	Unlock();
}


void
BWindow::ResizeBy(float dx, float dy)
{
	if (!Lock())
		return;
	ResizeTo(fData->frame.Width() + std::round(dx), fData->frame.Height() + std::round(dy));
	Unlock();
}


void
BWindow::ResizeTo(float width, float height)
{
	if (!Lock())
		return;
	BSize size = fData->Limited(std::round(width), std::round(height));
	if (size != fData->frame.Size()) {
		fData->AdoptFrame(BRect(fData->frame.LeftTop(), size));
		fData->sizesAsked++;
		if (fData->host != nullptr)
			fData->host->ResizeTo(size);
		fData->PostResized();
	}
	Unlock();
}


void
BWindow::CenterOnScreen()
{
	CenterOnScreen(B_MAIN_SCREEN_ID);
}


void
BWindow::CenterOnScreen(screen_id id)
{
	BRect screen = BScreen(id).Frame();
	MoveTo(screen.left + std::floor((screen.Width() - fData->frame.Width()) / 2),
		screen.top + std::floor((screen.Height() - fData->frame.Height()) / 2));
}


void
BWindow::SetSizeLimits(float minWidth, float maxWidth, float minHeight, float maxHeight)
{
	if (minWidth > maxWidth || minHeight > maxHeight || !Lock())
		return;

	fData->minWidth = std::round(minWidth);
	fData->maxWidth = std::round(maxWidth);
	fData->minHeight = std::round(minHeight);
	fData->maxHeight = std::round(maxHeight);
	if (fData->host != nullptr)
		fData->host->SetSizeLimits(
			{fData->minWidth, fData->maxWidth, fData->minHeight, fData->maxHeight});
	ResizeTo(fData->frame.Width(), fData->frame.Height());
	Unlock();
}


void
BWindow::GetSizeLimits(float* minWidth, float* maxWidth, float* minHeight, float* maxHeight)
{
	if (minWidth != nullptr)
		*minWidth = fData->minWidth;
	if (maxWidth != nullptr)
		*maxWidth = fData->maxWidth;
	if (minHeight != nullptr)
		*minHeight = fData->minHeight;
	if (maxHeight != nullptr)
		*maxHeight = fData->maxHeight;
}


void
BWindow::SetZoomLimits(float maxWidth, float maxHeight)
{
	fData->maxZoomWidth = std::min(maxWidth, fData->maxWidth);
	fData->maxZoomHeight = std::min(maxHeight, fData->maxHeight);
}


// The second zoom brings the frame back that the first one found, unless the user changed it between.
void
BWindow::Zoom()
{
	BRect screen = BScreen(this).Frame();
	BRect border = DecoratorFrame();
	BRect room(screen.left + fData->frame.left - border.left,
		screen.top + fData->frame.top - border.top,
		screen.right + fData->frame.right - border.right,
		screen.bottom + fData->frame.bottom - border.bottom);
	BSize size = fData->Limited(
		std::min(room.Width(), fData->maxZoomWidth), std::min(room.Height(), fData->maxZoomHeight));
	BRect zoomed(room.LeftTop(), size);

	if (fData->frame == zoomed) {
		BRect before = fData->frameBeforeZoom;
		Zoom(before.LeftTop(), before.Width(), before.Height());
		return;
	}
	fData->frameBeforeZoom = fData->frame;
	Zoom(zoomed.LeftTop(), zoomed.Width(), zoomed.Height());
}


void
BWindow::Zoom(BPoint origin, float width, float height)
{
	MoveTo(origin);
	ResizeTo(width, height);
}

// SPDX-License-Identifier: MIT
// The input hub's side of tracking outlines, dragging and dropping.
#include <View.h>

#include "display/DragFields.h"
#include "display/InputHub.h"
#include "display/PixelBuffer.h"

namespace BPrivate {

void
InputHub::BeginTracking(BRect rect, uint32 style, BPoint from)
{
	std::lock_guard<std::mutex> lock(fMutex);
	fTracking = TrackingState{rect, from, style};
	OverlayMayHaveChanged();
}


void
InputHub::EndTracking()
{
	std::lock_guard<std::mutex> lock(fMutex);
	fTracking.reset();
	if (fOverlayListener)
		fOverlayListener();
}


void
InputHub::BeginDrag(
	const BMessage& message, BRect rect, std::shared_ptr<const Picture> image, BPoint offset)
{
	std::lock_guard<std::mutex> lock(fMutex);
	fDrag = std::make_unique<DragState>(DragState{message, std::move(image), rect, offset});
	if (!fDrag->message.HasInt32("buttons"))
		fDrag->message.AddInt32("buttons", static_cast<int32>(fButtons));
	if (fButtons == 0) {
		FinishDrag(fStack.WindowAt(fWhere));
		return;
	}
	OverlayMayHaveChanged();
}


InputOverlay
InputHub::Overlay() const
{
	std::lock_guard<std::mutex> lock(fMutex);
	InputOverlay overlay;
	if (fTracking.has_value()) {
		BPoint moved = fWhere - fTracking->start;
		overlay.tracking = fTracking->rect;
		if (fTracking->style == B_TRACK_RECT_CORNER)
			overlay.tracking.SetRightBottom(fTracking->rect.RightBottom() + moved);
		else
			overlay.tracking.OffsetBy(moved);
	}
	if (fDrag != nullptr) {
		overlay.image = fDrag->image;
		overlay.dragged = fDrag->rect;
		overlay.dragged.OffsetTo(fWhere - fDrag->offset);
	}
	return overlay;
}


void
InputHub::OverlayMayHaveChanged()
{
	if (fOverlayListener)
		fOverlayListener();
}


void
InputHub::AddDragged(BMessage* message) const
{
	if (fDrag != nullptr)
		message->AddMessage("be:drag_message", &fDrag->message);
	else if (fVisitor != nullptr)
		message->AddMessage("be:drag_message", fVisitor.get());
}


bool
InputHub::IsDragging() const
{
	std::lock_guard<std::mutex> lock(fMutex);
	return fDrag != nullptr;
}


void
InputHub::CancelDrag()
{
	std::lock_guard<std::mutex> lock(fMutex);
	CancelDragLocked();
}


// The button is still held: its moves go on to the window of the press, and nobody else.
void
InputHub::CancelDragLocked()
{
	if (fDrag == nullptr)
		return;
	LeaveWindow(fPressWindow);
	fDrag.reset();
	OverlayMayHaveChanged();
	if (fPressWindow != nullptr)
		SendMove(fPressWindow);
}


void
InputHub::FinishDrag(StackedWindow* under)
{
	if (fDrag == nullptr)
		return;
	std::unique_ptr<DragState> drag = std::move(fDrag);
	OverlayMayHaveChanged();
	if (under == nullptr || fStack.BlockerOf(under) != nullptr)
		return;
	under->client->Dropped(std::make_unique<BMessage>(drag->message), fWhere, drag->offset);
}


bool
InputHub::VisitorAt(StackedWindow* window, std::unique_ptr<BMessage> message, BPoint screenWhere)
{
	std::lock_guard<std::mutex> lock(fMutex);
	fLastInput = system_time();
	fWhere = screenWhere;
	if (message != nullptr)
		fVisitor = std::move(message);
	// A release that the host kept to itself, or gave to the other program.
	fButtons = 0;
	fPressWindow = nullptr;
	Moved(window);
	return fStack.BlockerOf(window) == nullptr;
}


void
InputHub::VisitorLeft()
{
	std::lock_guard<std::mutex> lock(fMutex);
	LeaveWindow(nullptr);
	fVisitor.reset();
}


void
InputHub::Drop(
	std::unique_ptr<BMessage> message, BPoint screenWhere, std::optional<StackedWindow*> known)
{
	std::lock_guard<std::mutex> lock(fMutex);
	fWhere = screenWhere;
	fVisitor.reset();
	StackedWindow* under = Under(known);
	if (under == nullptr || fStack.BlockerOf(under) != nullptr)
		return;
	BPoint offset = message->GetPoint(kDragOffset, B_ORIGIN);
	message->RemoveName(kDragOffset);
	under->client->Dropped(std::move(message), screenWhere, offset);
}

} // namespace BPrivate

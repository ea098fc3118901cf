// SPDX-License-Identifier: MIT
// The frame of a window as its program and its host have to agree upon it.
#include "display/SharedFrame.h"

#include <memory>

#include <AppDefs.h>
#include <Message.h>

#include "display/InputHub.h"

namespace BPrivate {

SharedFrame::SharedFrame(BRect frame)
	: fKnown(frame),
	  fIsAsking(false),
	  fMovesAsked(0),
	  fSizesAsked(0)
{
}


void
SharedFrame::MoveTo(BPoint leftTop)
{
	fMovesAsked++;
	fKnown.OffsetTo(leftTop);
}


void
SharedFrame::ResizeTo(BSize size)
{
	fSizesAsked++;
	fKnown = BRect(fKnown.LeftTop(), size);
}


void
SharedFrame::BeginAsking()
{
	fAsked = fKnown;
	fIsAsking = true;
}


bool
SharedFrame::EndAsking(std::optional<BRect> frame)
{
	fIsAsking = false;
	const bool hasMoved = fKnown.LeftTop() != fAsked.LeftTop();
	const bool hasResized = fKnown.Size() != fAsked.Size();
	if (frame) {
		HostHas(BRect(hasMoved ? fKnown.LeftTop() : frame->LeftTop(),
			hasResized ? fKnown.Size() : frame->Size()));
	}
	return hasMoved || hasResized;
}


void
SharedFrame::HostHas(BRect frame)
{
	if (!fIsAsking)
		fKnown = frame;
}


void
TellFrame(InputHub& hub, StackedWindow* window, const SharedFrame& frame, BRect before)
{
	const BRect now = frame.Known();
	hub.SetFrame(window, now);
	if (now.LeftTop() != before.LeftTop()) {
		auto message = std::make_unique<BMessage>(B_WINDOW_MOVED);
		message->AddPoint("where", now.LeftTop());
		message->AddInt32(kTimesAsked, frame.MovesAsked());
		hub.Deliver(window, std::move(message));
	}
	if (now.Size() != before.Size()) {
		auto message = std::make_unique<BMessage>(B_WINDOW_RESIZED);
		message->AddInt32("width", now.IntegerWidth());
		message->AddInt32("height", now.IntegerHeight());
		message->AddInt32(kTimesAsked, frame.SizesAsked());
		hub.Deliver(window, std::move(message));
	}
}

} // namespace BPrivate

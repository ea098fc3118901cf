// SPDX-License-Identifier: MIT

#include "ThumbTracking.h"

#include <Control.h>
#include <InterfaceDefs.h>

namespace BPrivate {

ThumbTracking::ThumbTracking(BControl* control)
	: fControl(control),
	  fIsChanging(false)
{
}


ThumbTracking::~ThumbTracking() = default;


void
ThumbTracking::MouseDown(BPoint where, BRect thumb, BPoint middle, uint32 options)
{
	fControl->SetMouseEventMask(B_POINTER_EVENTS, options);
	fControl->SetTracking(true);
	BeginChange();
	const bool holdsThumb = thumb.Contains(where);
	fGrabOffset = holdsThumb ? middle - where : B_ORIGIN;
	if (!holdsThumb)
		MoveThumb(where);
	fControl->Invalidate();
}


void
ThumbTracking::MouseMoved(BPoint where)
{
	if (fControl->IsTracking())
		MoveThumb(where + fGrabOffset);
}


void
ThumbTracking::MouseUp(BPoint where)
{
	if (!fControl->IsTracking())
		return;
	MoveThumb(where + fGrabOffset);
	fControl->SetTracking(false);
	fControl->Invalidate();
	FinishChange();
}


void
ThumbTracking::KeyReleased()
{
	if (!fControl->IsTracking())
		FinishChange();
}


void
ThumbTracking::Disabled()
{
	if (!fControl->IsTracking())
		return;
	fControl->SetTracking(false);
	FinishChange();
}


void
ThumbTracking::Cancel()
{
	fIsChanging = false;
}


void
ThumbTracking::BeginChange()
{
	if (fIsChanging)
		return;
	fIsChanging = true;
	ChangeBegins();
}


void
ThumbTracking::FinishChange()
{
	if (!fIsChanging)
		return;
	fIsChanging = false;
	ChangeEnds();
}

} // namespace BPrivate

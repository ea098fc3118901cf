// SPDX-License-Identifier: MIT

#include "ClickTracking.h"

#include <Control.h>
#include <InterfaceDefs.h>

namespace BPrivate {

ClickTracking::ClickTracking(BControl* control)
	: fControl(control),
	  fPressed(false)
{
}


void
ClickTracking::MouseDown()
{
	if (!fControl->IsEnabled())
		return;
	fControl->SetMouseEventMask(B_POINTER_EVENTS, B_NO_POINTER_HISTORY | B_SUSPEND_VIEW_FOCUS);
	fControl->SetTracking(true);
	SetPressed(true);
}


void
ClickTracking::MouseMoved(BPoint where)
{
	if (fControl->IsTracking())
		SetPressed(fControl->Bounds().Contains(where));
}


bool
ClickTracking::MouseUp(BPoint where)
{
	if (!fControl->IsTracking())
		return false;
	fControl->SetTracking(false);
	SetPressed(false);
	return fControl->IsEnabled() && fControl->Bounds().Contains(where);
}


void
ClickTracking::Cancel()
{
	fPressed = false;
}


bool
ClickTracking::IsClickKey(const char* bytes, int32 numBytes)
{
	return numBytes == 1 && (bytes[0] == B_ENTER || bytes[0] == B_SPACE);
}


void
ClickTracking::SetPressed(bool pressed)
{
	if (pressed == fPressed)
		return;
	fPressed = pressed;
	fControl->Invalidate();
}

} // namespace BPrivate

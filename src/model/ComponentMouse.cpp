// SPDX-License-Identifier: MIT
// What the mouse does to a component on the design surface, and how a selected component is drawn. All of
// it but the drawing runs inside the MouseDown() of the component's view.

#include "model/Component.h"

#include <Message.h>
#include <OS.h>
#include <String.h>
#include <View.h>
#include <Window.h>

#include "model/ComponentDrag.h"
#include "model/ComponentOwner.h"
#include "model/DesignMessages.h"
#include "model/Diagnostics.h"
#include "model/FormDesigner.h"
#include "model/RectTracking.h"
#include "model/ViewLock.h"

/// The side of the square at the right bottom corner that resizes, in pixels.
static const float kHandleSize = 5;

/// The least width and height that the mouse gives a component.
static const float kMinimumSize = 8;

static const rgb_color kSelectionColor = {0, 200, 200, 255};


static bool
IsOnHandle(BPoint where, BRect frame)
{
	return where.x >= frame.right - kHandleSize && where.y >= frame.bottom - kHandleSize;
}


void
TComponent::DesignerMouseDown(BPoint where, BRect frame, BView* view)
{
	SelectAlone();
	if (view == nullptr || view->Window() == nullptr)
		return;

	int32 clicks = 1;
	int32 pressed = 0;
	const BMessage* press = view->Window()->CurrentMessage();
	if (press != nullptr) {
		press->FindInt32("clicks", &clicks);
		press->FindInt32("buttons", &pressed);
	}
	if (clicks > 1) {
		DefaultEditAction(where);
		return;
	}

	TComponentOwner* container = dynamic_cast<TComponentOwner*>(this);
	if (container != nullptr && Designer() != nullptr && Designer()->IsDropWaiting()) {
		CreateChild(container, where, view);
		return;
	}

	BPoint point;
	uint32 buttons;
	view->GetMouse(&point, &buttons);
	if ((buttons & B_PRIMARY_MOUSE_BUTTON) == 0) {
		// A quick click is over by now, and asks for the menu all the same.
		const bool isSecondaryClick = buttons == 0 && (pressed & B_PRIMARY_MOUSE_BUTTON) == 0
			&& (pressed & B_SECONDARY_MOUSE_BUTTON) != 0;
		if (isSecondaryClick || (buttons & B_SECONDARY_MOUSE_BUTTON) != 0)
			AskForContextMenu(point, view);
		return;
	}

	if (!frame.Contains(where))
		return;
	if (IsOnHandle(where, frame)) {
		ResizeByMouse(frame, view);
		return;
	}
	BMessage move(DTM_COMPONENT_MOVE);
	ComponentDrag::Begin(this, &move);
	view->DragMessage(&move, frame);
}


void
TComponent::SelectAlone()
{
	DesignerSelect(true);
	if (Owner() != nullptr)
		Owner()->DeselectComponents(this);
	if (fDTView != nullptr) {
		fDTView->Invalidate();
		for (BView* child = fDTView->ChildAt(0); child != nullptr; child = child->NextSibling())
			child->Invalidate();
	}

	if (Designer() != nullptr) {
		SelectedInFormDesigner();
		Designer()->ComponentSelected(this);
	}
}


void
TComponent::CreateChild(TComponentOwner* container, BPoint where, BView* view)
{
	BRect frame(where, where);
	if (!TrackCorner(view, &frame))
		return;
	if (frame.Width() < kMinimumSize)
		frame.right = frame.left + kMinimumSize;
	if (frame.Height() < kMinimumSize)
		frame.bottom = frame.top + kMinimumSize;

	TComponent* child = Designer()->CreateComponent(view, frame);
	if (child == nullptr)
		return;
	container->AddComponent(child);
	PrintDiagnostic(
		"%s: Created component '%s'\n", ClassTypeName(this).String(), child->ComponentName());
	Designer()->DoneDroppingComponent();
}


void
TComponent::AskForContextMenu(BPoint where, BView* view)
{
	BMessage message(DTM_COMPONENT_CONTEXTMENU);
	message.AddPoint("where", where);
	message.AddPointer("view", view);
	message.AddPointer("component", this);
	view->Window()->PostMessage(&message, view->Parent());
}


void
TComponent::ResizeByMouse(BRect frame, BView* view)
{
	// Too small a frame is dropped, not clamped.
	BRect newFrame(frame);
	if (!TrackCorner(view, &newFrame))
		return;
	if (newFrame.Width() >= kMinimumSize && newFrame.Height() >= kMinimumSize)
		ResizeComponentTo(view, newFrame);

	BMessage message(DTM_COMPONENT_RESIZE);
	message.AddPointer("component", this);
	message.AddRect("frame", view->Frame());
	view->Window()->PostMessage(&message, view->Parent());
}


void
TComponent::DesignerDrawSelection()
{
	if (!IsDesignerSelected())
		return;
	TViewLock lock(fDTView);
	if (!lock.IsLocked())
		return;

	const rgb_color oldColor = fDTView->HighColor();
	const float width = fDTView->Bounds().Width();
	const float height = fDTView->Bounds().Height();
	fDTView->SetHighColor(kSelectionColor);
	fDTView->StrokeLine(BPoint(0, 0), BPoint(width, 0));
	fDTView->StrokeLine(BPoint(width, 0), BPoint(width, height));
	fDTView->StrokeLine(BPoint(width, height), BPoint(0, height));
	fDTView->StrokeLine(BPoint(0, height), BPoint(0, 0));
	fDTView->FillRect(BRect(width - kHandleSize, height - kHandleSize, width, height));
	fDTView->SetHighColor(oldColor);
}

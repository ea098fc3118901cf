// SPDX-License-Identifier: MIT
// What a component does on the design surface: moving, resizing, taking in another component.

#include "model/Component.h"

#include <Message.h>
#include <String.h>
#include <View.h>
#include <Window.h>

#include "model/ComponentDrag.h"
#include "model/ComponentOwner.h"
#include "model/DesignMessages.h"
#include "model/Diagnostics.h"
#include "model/FormDesigner.h"
#include "model/ViewLock.h"
#include "model/ViewTree.h"


/// Posts a copy of a design message to the view beneath \a view, which may be none.
static void
PassToParent(BMessage* message, const BView* view)
{
	BView* parent = view != nullptr ? view->Parent() : nullptr;
	if (parent == nullptr || parent->Window() == nullptr)
		return;
	BMessage copy(*message);
	parent->Window()->PostMessage(&copy, parent);
}


bool
TComponent::DefaultEditAction(BPoint)
{
	return false;
}


bool
TComponent::CanDropOnDesignerAt(BPoint)
{
	return true;
}


void
TComponent::DroppedOnFormDesigner(BRect)
{
}


void
TComponent::MoveComponentTo(BView* view, BPoint point)
{
	if (view != nullptr)
		view->MoveTo(point);
}


void
TComponent::MoveComponentTo(BPoint point)
{
	TViewLock lock(fDTView);
	if (lock.IsLocked())
		MoveComponentTo(fDTView, point);
}


void
TComponent::ResizeComponentTo(BView* view, BRect frame)
{
	if (view != nullptr)
		view->ResizeTo(frame.Width(), frame.Height());
}


void
TComponent::ResizeComponentTo(BRect frame)
{
	ResizeComponentTo(fDTView, frame);
}


bool
TComponent::HandleComponentDesignMessage(BMessage* message)
{
	if (message == nullptr || message->what != DTM_COMPONENT_MOVE)
		return false;
	void* pointer;
	if (message->FindPointer("component", &pointer) != B_OK || pointer == nullptr)
		return false;

	// A drop may come late, when the component is gone, or from another program.
	TComponent* dragged = static_cast<TComponent*>(pointer);
	BPoint corner;
	const bool dropped = fDTView != nullptr && FindDroppedCorner(message, fDTView, &corner);
	if (dropped ? ComponentDrag::Find(message) != dragged : !IsOnSameForm(dragged))
		return false;
	if (dragged == this) {
		PrintDiagnostic("%s selected\n", ClassTypeName(this).String());
		PassToParent(message, fDTView);
		return false;
	}

	// From here on the dragged one belongs to this form, whose window is locked.
	if (dropped && Designer() != nullptr && !Designer()->AdoptComponent(dragged))
		return false;
	BView* view = dragged->DTView();
	if (fDTView == nullptr || view == nullptr)
		return false;

	if (dropped) {
		// What holds this component cannot go into it, nor need another view look at the drop.
		if (IsInside(fDTView, view))
			return true;
		TakeIn(dragged);
		dragged->MoveComponentTo(corner);
	}

	BPoint leftTop;
	{
		TViewLock lock(view);
		leftTop = view->Frame().LeftTop();
	}
	if (Designer() != nullptr)
		Designer()->ComponentMoved(dragged, leftTop);
	return true;
}


/// Whether \a component, which may be gone, is one of the form of this one; true where that has no form.
bool
TComponent::IsOnSameForm(const TComponent* component) const
{
	const TFormDesigner* designer = Designer();
	if (designer == nullptr || component == this)
		return true;
	for (int32 i = 0; i < designer->CountComponents(); i++) {
		if (designer->ComponentAt(i) == component)
			return true;
	}
	return false;
}


void
TComponent::TakeIn(TComponent* component)
{
	BView* view = component->DTView();
	if (view->Parent() == fDTView)
		return;

	PrintDiagnostic("%s Adding child from other parent\n", ClassTypeName(this).String());
	TComponentOwner* newOwner = dynamic_cast<TComponentOwner*>(this);
	if (newOwner != nullptr) {
		// The designer lists every component of the form, containers list their direct children.
		TComponentOwner* oldOwner = component->Owner();
		TFormDesigner* designer = component->Designer();
		if (oldOwner != nullptr && (designer == nullptr || !designer->IsForm(oldOwner)))
			oldOwner->RemoveComponent(component);
		newOwner->AddComponent(component);
	}

	{
		TViewLock lock(view);
		view->RemoveSelf();
	}
	TViewLock lock(fDTView);
	fDTView->AddChild(view);
}

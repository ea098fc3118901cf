// SPDX-License-Identifier: MIT
// What the mouse does on the design surface: placing, selecting, moving and resizing.

#include <cstdio>
#include <cstring>
#include <vector>

#include <Message.h>
#include <Region.h>
#include <Window.h>

#include "app/WindowGuard.h"
#include "designer/DesignForm.h"
#include "designer/DesignFormView.h"
#include "designer/FormHost.h"
#include "designer/Inspector.h"
#include "model/ComponentDrag.h"
#include "model/DesignMessages.h"
#include "model/Diagnostics.h"
#include "model/Property.h"
#include "model/RectTracking.h"
#include "model/ViewTree.h"
#include "palette/PaletteCatalog.h"
#include "palette/PaletteEntry.h"
#include "props/PropertyEditor.h"

namespace {

constexpr int32 kNameSize = 80;

/// The least width and height of a component that is placed with the mouse.
constexpr float kMinimumSize = 8;

void
WriteValue(TComponent* component, const char* name, const char* text, bool notify)
{
	const TProperty* property = component->FindProperty(name);
	if (property != nullptr && property->Editor() != nullptr)
		property->Editor()->SetValue(text, notify);
}

} // namespace

void
TDesignFormView::MouseDown(BPoint where)
{
	int32 buttons = B_PRIMARY_MOUSE_BUTTON;
	const BMessage* press = Window()->CurrentMessage();
	if (press != nullptr)
		press->FindInt32("buttons", &buttons);

	if ((buttons & B_PRIMARY_MOUSE_BUTTON) == 0) {
		if ((buttons & B_SECONDARY_MOUSE_BUTTON) != 0)
			OpenFormMenu(where);
	} else if (IsDropWaiting())
		PlaceComponent(where);
	else
		SelectForm();
}


/// Lets the user drag the frame of the waiting palette entry's component, and places that.
void
TDesignFormView::PlaceComponent(BPoint where)
{
	BRect frame(where, where);
	if (!TrackCorner(this, &frame))
		return;
	if (frame.Width() < kMinimumSize)
		frame.right = frame.left + kMinimumSize;
	if (frame.Height() < kMinimumSize)
		frame.bottom = frame.top + kMinimumSize;

	TPaletteEntry* entry = PaletteCatalog().DropEntry();
	if (entry == nullptr)
		return;
	TComponent* component = entry->CreateComponent(this, this, frame);
	if (component == nullptr)
		PrintDiagnostic("No component returned from CreateComponent()\n");
	else {
		NameComponent(component, frame);
		PrintDiagnostic(
			"Adding Component '%s'(%s)\n", component->ComponentName(), component->ClassName());
		AddComponent(component);
		SetModified(true);
	}
	// Before anything is shown: meanwhile the user may choose anew.
	DoneDroppingComponent();
	if (component != nullptr)
		SelectNew(component);
}


/// Gives a new component the first free name, and shows its \a frame, in its parent's coordinates.
void
TDesignFormView::NameComponent(TComponent* component, BRect frame)
{
	char name[kNameSize];
	GetNewComponentName(component, this, name, sizeof(name));
	component->SetComponentName(name);
	component->SetPropertyValue("Name", name);
	fForm->UpdateComponentPosition(component, frame);
}


void
TDesignFormView::SelectNew(TComponent* component)
{
	component->DesignerSelect(true);
	ComponentSelected(component);
}


void
TDesignFormView::SelectForm()
{
	DeselectForms();
	MarkForm(true);
	PrintDiagnostic("%ld Components\n", static_cast<long>(TFormDesigner::CountComponents()));
	if (!fForm->IsActive())
		fForm->Activate();
	DeselectComponents(nullptr);
	fForm->DesignFormActivated(true);
}


void
TDesignFormView::DeselectForms()
{
	if (fForm->Host() == nullptr)
		return;
	for (TDesignForm* form : fForm->Host()->Forms()) {
		WindowGuard guard(form);
		if (guard.IsLocked())
			form->View()->MarkForm(false);
	}
}


void
TDesignFormView::MarkForm(bool selected)
{
	const bool changes = fForm->IsDesignerSelected() != selected;
	fForm->DesignerSelect(selected);
	if (!changes)
		return;
	const BRect bounds = Bounds();
	BRegion mark(bounds);
	mark.Exclude(bounds.InsetByCopy(1, 1));
	Invalidate(&mark);
}


void
TDesignFormView::ComponentSelected(TComponent* component)
{
	MarkForm(false);
	DeselectComponents(component);
	// The caller selected it, but may not have had it drawn.
	if (component != nullptr && component->DTView() != nullptr)
		component->DTView()->Invalidate();
	Inspector::ShowUnlessShown(component, this);
}


void
TDesignFormView::ComponentMoved(TComponent* component, BPoint)
{
	PrintDiagnostic("TDesignFormView::ComponentMoved()\n");
	if (component == nullptr || !Lists(component) || component->DTView() == nullptr)
		return;
	if (Inspector::Component() == component)
		WriteValue(component, "Visible", IsHidden() ? "false" : "true", true);
	// A component that is not shown needs its edges, too: they are what a document keeps.
	fForm->UpdateComponentPosition(component, component->DTView()->Frame());
	// It may lie in another container now, in the same place.
	SetModified(true);
}


bool
TDesignFormView::Lists(const TComponent* component) const
{
	for (int32 i = 0; i < TFormDesigner::CountComponents(); i++) {
		if (TFormDesigner::ComponentAt(i) == component)
			return true;
	}
	return false;
}


/// The component that \a message is about: the dragged one when it was dropped here, \a corner is its new left-top
/// corner then; otherwise one of this form's. Null when it can no longer be trusted.
TComponent*
TDesignFormView::FindComponent(const BMessage* message, bool* dropped, BPoint* corner) const
{
	*dropped = FindDroppedCorner(message, this, corner);
	if (*dropped)
		return ComponentDrag::Find(message);
	void* pointer;
	if (message->FindPointer("component", &pointer) != B_OK)
		return nullptr;
	TComponent* component = static_cast<TComponent*>(pointer);
	return Lists(component) ? component : nullptr;
}


void
TDesignFormView::MoveComponent(BMessage* message)
{
	PrintDiagnostic("%s got DTM_COMPONENT_MOVE\n", Name());
	bool dropped;
	BPoint corner;
	TComponent* component = FindComponent(message, &dropped, &corner);
	if (component == nullptr || (dropped && !AdoptComponent(component))
		|| component->DTView() == nullptr)
		return;

	if (dropped) {
		TakeFromContainer(component);
		component->MoveComponentTo(corner);
	}
	fForm->UpdateComponentPosition(component, component->DTView()->Frame());
}


void
TDesignFormView::ResizeComponent(BMessage* message)
{
	PrintDiagnostic("TDesignFormView Got DTM_COMPONENT_RESIZE message\n");
	bool dropped;
	BPoint corner;
	TComponent* component = FindComponent(message, &dropped, &corner);
	if (component == nullptr || component->DTView() == nullptr || !Lists(component))
		return;

	BRect frame;
	if (dropped) {
		component->MoveComponentTo(corner);
		frame = component->DTView()->Frame();
	} else if (message->FindRect("frame", &frame) != B_OK)
		return;
	fForm->UpdateComponentPosition(component, frame);
	// A view that grew draws only what is new, and leaves the handle where it was.
	component->DTView()->Invalidate();
}


/// Makes \a component, one of this form's, a direct child of the surface.
void
TDesignFormView::TakeFromContainer(TComponent* component)
{
	BView* view = component->DTView();
	if (view->Parent() == this)
		return;
	PrintDiagnostic("TDesignForm adding child from other parent\n");
	TComponentOwner* owner = component->Owner();
	if (owner != nullptr && !IsForm(owner))
		owner->RemoveComponent(component);
	component->SetOwner(nullptr);
	view->RemoveSelf();
	AddChild(view);
	SetModified(true);
}


bool
TDesignFormView::AdoptComponent(TComponent* component)
{
	if (Lists(component))
		return true;

	// Its values are read and edited with the lock of the window that it leaves.
	Inspector::Leave(component);
	// The component comes first, then what is inside it.
	std::vector<TComponent*> family;
	std::vector<TComponentOwner*> owners;
	{
		// Until that window is locked the component may go.
		BLooper* window = ComponentDrag::WindowOf(component);
		WindowGuard guard(window);
		TDesignForm* home = guard.IsLocked() ? dynamic_cast<TDesignForm*>(window) : nullptr;
		if (home == nullptr || !home->View()->Lists(component) || component->DTView() == nullptr)
			return false;
		BView* view = component->DTView();
		for (int32 i = 0; i < home->CountComponents(); i++) {
			TComponent* member = home->ComponentAt(i);
			if (member != component && IsInside(member->DTView(), view))
				family.push_back(member);
		}
		family.insert(family.begin(), component);
		for (TComponent* member : family)
			owners.push_back(member->Owner());
		if (owners[0] != nullptr && !home->IsForm(owners[0]))
			owners[0]->RemoveComponent(component);
		for (TComponent* member : family)
			home->RemoveComponent(member);
		view->RemoveSelf();
		home->View()->SetModified(true);
	}

	for (size_t i = 0; i < family.size(); i++) {
		TComponent* member = family[i];
		const TComponent* namesake = nullptr;
		for (int32 k = 0; k < TFormDesigner::CountComponents(); k++) {
			if (strcmp(TFormDesigner::ComponentAt(k)->ComponentName(), member->ComponentName())
				== 0)
				namesake = TFormDesigner::ComponentAt(k);
		}
		if (namesake != nullptr) {
			char name[kNameSize];
			GetNewComponentName(member, this, name, sizeof(name));
			member->SetComponentName(name);
			member->SetPropertyValue("Name", name);
		}
		AddComponent(member);
		member->SetDesigner(this);
		if (i > 0)
			member->SetOwner(owners[i]);
	}
	SetModified(true);
	SelectNew(component);
	return true;
}

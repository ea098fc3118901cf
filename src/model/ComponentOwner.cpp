// SPDX-License-Identifier: MIT
// What holds child components.

#include "model/ComponentOwner.h"

#include <View.h>

#include "model/Component.h"


TComponentOwner::TComponentOwner()
	: fComponents(20)
{
}


TComponentOwner::~TComponentOwner() {}


bool
TComponentOwner::ComponentPropertyModified(TComponent*, const char*, const char*, const char*)
{
	return true;
}


int32
TComponentOwner::CountComponents() const
{
	return fComponents.CountItems();
}


TComponent*
TComponentOwner::ComponentAt(int32 index) const
{
	return static_cast<TComponent*>(fComponents.ItemAt(index));
}


void
TComponentOwner::AddComponent(TComponent* component)
{
	if (component == nullptr)
		return;
	fComponents.AddItem(component);
	component->SetOwner(this);
}


bool
TComponentOwner::RemoveComponent(TComponent* component)
{
	if (component == nullptr || !fComponents.RemoveItem(component))
		return false;
	component->SetOwner(nullptr);
	return true;
}


TComponent*
TComponentOwner::RemoveComponent(int32 index)
{
	TComponent* component = static_cast<TComponent*>(fComponents.RemoveItem(index));
	if (component != nullptr)
		component->SetOwner(nullptr);
	return component;
}


void
TComponentOwner::ClearComponents(bool deleteComponents)
{
	if (deleteComponents) {
		// A component's destructor may ask its owner what else there is, so the list stays whole.
		for (int32 i = 0; i < fComponents.CountItems(); i++) {
			TComponent* component = ComponentAt(i);
			if (component == nullptr)
				break;
			delete component;
		}
	}
	fComponents.MakeEmpty();
}


void
TComponentOwner::DeselectComponents(const TComponent* kept)
{
	for (int32 i = 0; i < CountComponents(); i++) {
		TComponent* component = ComponentAt(i);
		if (component == nullptr || component == kept)
			continue;
		// A form may have a thousand of them: only the one that looks otherwise then is drawn anew.
		const bool wasMarked = component->IsDesignerSelected();
		component->DesignerSelect(false);
		if (wasMarked && component->DTView() != nullptr)
			component->DTView()->Invalidate();
	}
}

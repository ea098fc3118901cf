// SPDX-License-Identifier: MIT
// The rows that show a component in the property window.

#include "props/ComponentRows.h"

#include <View.h>

#include "app/WindowGuard.h"
#include "model/Component.h"
#include "props/EventListItem.h"
#include "props/PropertyListItem.h"


TComponentRows::TComponentRows()
	: lock(nullptr)
{
}


TComponentRows::~TComponentRows() {}


bool
TComponentRows::Read(TComponent* component, BLooper* otherLock, const std::atomic<uint32>& count)
{
	const uint32 countBefore = count;
	const BView* view = component->DTView();
	lock = view != nullptr && view->Looper() != nullptr ? view->Looper() : otherLock;
	WindowGuard guard(lock);
	if (count != countBefore)
		return false;
	for (int32 i = 0; i < component->CountProperties(); i++) {
		if (component->PropertyAt(i) != nullptr)
			properties.push_back(std::make_unique<TPropertyListItem>(component->PropertyAt(i)));
	}
	for (int32 i = 0; i < component->CountEvents(); i++) {
		if (component->EventAt(i) != nullptr)
			events.push_back(std::make_unique<TEventListItem>(component->EventAt(i)));
	}
	return true;
}

// SPDX-License-Identifier: MIT
// What holds child components.

#pragma once

#include <List.h>

class TComponent;

/// An object with child components: a form's designer, a container component, the application
/// component (its children are the forms).
///
/// The components are not owned unless ClearComponents() is told to delete them. Component libraries
/// derive from it: the order of the virtual operations is a binary interface. Use it in the thread of
/// the form that the components live on.
class TComponentOwner {
public:
	TComponentOwner();
	virtual ~TComponentOwner();
	TComponentOwner(const TComponentOwner&) = delete;
	TComponentOwner& operator=(const TComponentOwner&) = delete;

	/// Asked before a property of the child \a component changes. False does not keep the value out: it
	/// keeps the component from being marked modified. True here.
	virtual bool ComponentPropertyModified(
		TComponent* component, const char* name, const char* oldValue, const char* newValue);

	virtual int32 CountComponents() const;

	/// Null when \a index is out of range.
	virtual TComponent* ComponentAt(int32 index) const;

	/// Appends \a component and makes this its owner. Null is ignored.
	virtual void AddComponent(TComponent* component);

	/// Takes the component out of the list without deleting it, and leaves it without owner. False, or
	/// null, when it is not in the list.
	virtual bool RemoveComponent(TComponent* component);
	virtual TComponent* RemoveComponent(int32 index);

	/// Empties the list; with \a deleteComponents destroys the components first, in list order.
	virtual void ClearComponents(bool deleteComponents);

	/// Deselects every component but \a kept, which may be null. Those that were selected are drawn anew.
	void DeselectComponents(const TComponent* kept);

private:
	BList fComponents;
};

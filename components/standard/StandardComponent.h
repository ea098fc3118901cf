// SPDX-License-Identifier: MIT
// What the components of this library have in common: they are described by tables.

#pragma once

#include <span>

#include <ComponentKit.h>

#include "PropertyRow.h"

/// An event beside those of every view. Its handler returns nothing.
struct event_row {
	const char* name;
	const char* parameters; ///< null for none
};

/// Another initial value for a property of the base class.
struct default_row {
	const char* name;
	const char* value;
};

/// What a component class is. The tables must outlive the components.
struct component_description {
	const char* name; ///< the stem of the names of new components
	const char* className;
	const char* headerFile; ///< of the platform's class
	std::span<const property_row> properties;
	std::span<const event_row> events;
	std::span<const char* const> parameters = {}; ///< properties that the constructor takes, too
	std::span<const default_row> defaults = {};
};

/// Adds the properties of \a description to \a component.
void AddDescribedProperties(TComponent* component, const component_description& description);

/// Adds its events.
void AddDescribedEvents(TComponent* component, const component_description& description);

/// Shows the property in the component's view, if the description says how. Locks its window.
void ShowDescribedProperty(TComponent* component, const component_description& description,
	const char* name, const char* value);

/// Shows the initial values in \a view, which is in no window.
void ShowDescribedDefaults(BView* view, const component_description& description);

/// Appends its constructor parameters to \a text, each after a comma but the first.
void AppendDescribedParameters(
	const TComponent* component, const component_description& description, BString& text);

/// A component of the base class \a Base, a TViewComponent or TControlComponent, with what its
/// description adds. Derived classes make the design-time view.
template <class Base>
class TStandardComponent : public Base {
public:
	/// \a description must outlive the component.
	TStandardComponent(TFormDesigner* designer, const component_description& description)
		: Base(nullptr, designer),
		  fDescription(description)
	{
		this->SetComponentName(description.name);
		this->SetClassName(description.className);
		TStandardComponent::InitPropertyList();
		TStandardComponent::InitEventList();
	}

	void InitPropertyList() override
	{
		Base::InitPropertyList();
		AddDescribedProperties(this, fDescription);
	}

	void InitEventList() override
	{
		Base::InitEventList();
		AddDescribedEvents(this, fDescription);
	}

	void SetPropertyValue(const char* name, const char* value) override
	{
		Base::SetPropertyValue(name, value);
		ShowDescribedProperty(this, fDescription, name, value);
	}

	const char* HeaderFile() override { return fDescription.headerFile; }

	void OnSetConstructorParams(BString& text) override
	{
		AppendDescribedParameters(this, fDescription, text);
	}

protected:
	/// Makes \a view the design-time view, and shows the properties in it.
	void SetDesignView(BView* view)
	{
		this->SetDTView(view);
		ShowDescribedDefaults(view, fDescription);
	}

private:
	const component_description& fDescription;
};

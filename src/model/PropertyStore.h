// SPDX-License-Identifier: MIT
// The property values of one component, by name.

#pragma once

#include "app/TypedMessage.h"

class TComponent;

/// A message, code 'prop', that mirrors the property values of its component: one string field for
/// each property that has been stored.
///
/// The program itself stores strings alone; the setters of the other types are there for component
/// libraries. Use it in the thread of the form that the component lives on.
class TPropertyStore : public TTypedMessage {
public:
	explicit TPropertyStore(TComponent* component);
	virtual ~TPropertyStore();

	TComponent* Component() const { return fComponent; }
	void SetComponent(TComponent* component) { fComponent = component; }

	/// As the base's, but a null \a value stores "". The value may be a text that this store handed out.
	status_t SetString(const char* name, const char* value);

private:
	TComponent* fComponent;
};

// SPDX-License-Identifier: MIT
// The property values of one component, by name.

#pragma once

#include <Message.h>

class BFlattenable;
class TComponent;

/// A message, code 'prop', that mirrors the property values of its component: one string field for
/// each property that has been stored.
///
/// The program itself stores strings alone; the setters of the other types are there for component
/// libraries. Each setter replaces the first item of the field of that name and type, or adds the
/// field, and returns the message's status: B_BAD_TYPE when the name is taken by another type,
/// B_BAD_VALUE for a null name. Use it in the thread of the form that the component lives on.
class TPropertyStore : public BMessage {
public:
	explicit TPropertyStore(TComponent* component);
	virtual ~TPropertyStore();

	TComponent* Component() const { return fComponent; }
	void SetComponent(TComponent* component) { fComponent = component; }

	status_t SetBool(const char* name, bool value);
	status_t SetInt8(const char* name, int8 value);
	status_t SetInt16(const char* name, int16 value);
	status_t SetInt32(const char* name, int32 value);
	status_t SetInt64(const char* name, int64 value);
	status_t SetFloat(const char* name, float value);
	status_t SetDouble(const char* name, double value);

	/// A null \a value stores "". The value may be a text that this store handed out.
	status_t SetString(const char* name, const char* value);

	status_t SetPoint(const char* name, BPoint value);
	status_t SetRect(const char* name, BRect value);

	/// \a value is copied; null gives B_BAD_VALUE.
	status_t SetMessage(const char* name, const BMessage* value);
	status_t SetFlat(const char* name, const BFlattenable* value);

private:
	TComponent* fComponent;
};

// SPDX-License-Identifier: MIT
// A message whose fields hold one value each.

#pragma once

#include <Message.h>

class BFlattenable;

/// A message that is used as a record: setting a field a second time replaces its value.
///
/// Each setter replaces item 0 of the named field when the message has that field with that type, and
/// adds the field otherwise. It returns the status of the replacing or adding: B_BAD_TYPE when the
/// field exists with another type, B_BAD_VALUE for a missing value.
class TTypedMessage : public BMessage {
public:
	explicit TTypedMessage(uint32 what);
	virtual ~TTypedMessage();

	status_t SetBool(const char* name, bool value);
	status_t SetInt8(const char* name, int8 value);
	status_t SetInt16(const char* name, int16 value);
	status_t SetInt32(const char* name, int32 value);
	status_t SetInt64(const char* name, int64 value);
	status_t SetFloat(const char* name, float value);
	status_t SetDouble(const char* name, double value);
	status_t SetString(const char* name, const char* value);
	status_t SetPoint(const char* name, BPoint value);
	status_t SetRect(const char* name, BRect value);
	status_t SetMessage(const char* name, const BMessage* value);
	status_t SetFlat(const char* name, const BFlattenable* value);
};

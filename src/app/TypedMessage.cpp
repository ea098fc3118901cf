// SPDX-License-Identifier: MIT

#include "app/TypedMessage.h"

#include <Flattenable.h>
#include <Point.h>
#include <Rect.h>

TTypedMessage::TTypedMessage(uint32 what)
	: BMessage(what)
{
}


TTypedMessage::~TTypedMessage() {}


status_t
TTypedMessage::SetBool(const char* name, bool value)
{
	return HasBool(name) ? ReplaceBool(name, value) : AddBool(name, value);
}


status_t
TTypedMessage::SetInt8(const char* name, int8 value)
{
	return HasInt8(name) ? ReplaceInt8(name, value) : AddInt8(name, value);
}


status_t
TTypedMessage::SetInt16(const char* name, int16 value)
{
	return HasInt16(name) ? ReplaceInt16(name, value) : AddInt16(name, value);
}


status_t
TTypedMessage::SetInt32(const char* name, int32 value)
{
	return HasInt32(name) ? ReplaceInt32(name, value) : AddInt32(name, value);
}


status_t
TTypedMessage::SetInt64(const char* name, int64 value)
{
	return HasInt64(name) ? ReplaceInt64(name, value) : AddInt64(name, value);
}


status_t
TTypedMessage::SetFloat(const char* name, float value)
{
	return HasFloat(name) ? ReplaceFloat(name, value) : AddFloat(name, value);
}


status_t
TTypedMessage::SetDouble(const char* name, double value)
{
	return HasDouble(name) ? ReplaceDouble(name, value) : AddDouble(name, value);
}


status_t
TTypedMessage::SetString(const char* name, const char* value)
{
	return HasString(name) ? ReplaceString(name, value) : AddString(name, value);
}


status_t
TTypedMessage::SetPoint(const char* name, BPoint value)
{
	return HasPoint(name) ? ReplacePoint(name, value) : AddPoint(name, value);
}


status_t
TTypedMessage::SetRect(const char* name, BRect value)
{
	return HasRect(name) ? ReplaceRect(name, value) : AddRect(name, value);
}


status_t
TTypedMessage::SetMessage(const char* name, const BMessage* value)
{
	if (value == nullptr)
		return B_BAD_VALUE;
	return HasMessage(name) ? ReplaceMessage(name, value) : AddMessage(name, value);
}


status_t
TTypedMessage::SetFlat(const char* name, const BFlattenable* value)
{
	if (value == nullptr)
		return B_BAD_VALUE;
	// The platform's operation takes an object that it may change, though it only reads it.
	if (HasFlat(name, value))
		return ReplaceFlat(name, const_cast<BFlattenable*>(value));
	return AddFlat(name, value);
}

// SPDX-License-Identifier: MIT
// The property values of one component, by name.

#include "model/PropertyStore.h"

#include <cstring>

#include <Flattenable.h>
#include <String.h>


TPropertyStore::TPropertyStore(TComponent* component)
	: BMessage('prop'),
	  fComponent(component)
{
}


TPropertyStore::~TPropertyStore() {}


status_t
TPropertyStore::SetBool(const char* name, bool value)
{
	return HasBool(name) ? ReplaceBool(name, value) : AddBool(name, value);
}


status_t
TPropertyStore::SetInt8(const char* name, int8 value)
{
	return HasInt8(name) ? ReplaceInt8(name, value) : AddInt8(name, value);
}


status_t
TPropertyStore::SetInt16(const char* name, int16 value)
{
	return HasInt16(name) ? ReplaceInt16(name, value) : AddInt16(name, value);
}


status_t
TPropertyStore::SetInt32(const char* name, int32 value)
{
	return HasInt32(name) ? ReplaceInt32(name, value) : AddInt32(name, value);
}


status_t
TPropertyStore::SetInt64(const char* name, int64 value)
{
	return HasInt64(name) ? ReplaceInt64(name, value) : AddInt64(name, value);
}


status_t
TPropertyStore::SetFloat(const char* name, float value)
{
	return HasFloat(name) ? ReplaceFloat(name, value) : AddFloat(name, value);
}


status_t
TPropertyStore::SetDouble(const char* name, double value)
{
	return HasDouble(name) ? ReplaceDouble(name, value) : AddDouble(name, value);
}


status_t
TPropertyStore::SetString(const char* name, const char* value)
{
	if (name == nullptr)
		return B_BAD_VALUE;
	if (value == nullptr)
		value = "";

	const char* present;
	const bool replaces = FindString(name, &present) == B_OK;
	if (replaces && strcmp(present, value) == 0)
		return B_OK;

	// A text of this store moves when the store grows. Most texts are short enough for the stack.
	char copy[256];
	const size_t size = strlen(value) + 1;
	if (size <= sizeof(copy)) {
		memcpy(copy, value, size);
		return replaces ? ReplaceString(name, copy) : AddString(name, copy);
	}
	const BString longCopy(value);
	return replaces ? ReplaceString(name, longCopy.String()) : AddString(name, longCopy.String());
}


status_t
TPropertyStore::SetPoint(const char* name, BPoint value)
{
	return HasPoint(name) ? ReplacePoint(name, value) : AddPoint(name, value);
}


status_t
TPropertyStore::SetRect(const char* name, BRect value)
{
	return HasRect(name) ? ReplaceRect(name, value) : AddRect(name, value);
}


status_t
TPropertyStore::SetMessage(const char* name, const BMessage* value)
{
	if (value == nullptr)
		return B_BAD_VALUE;
	return HasMessage(name) ? ReplaceMessage(name, value) : AddMessage(name, value);
}


status_t
TPropertyStore::SetFlat(const char* name, const BFlattenable* value)
{
	if (value == nullptr)
		return B_BAD_VALUE;

	// Replacing flattens the object without changing it, but the platform does not promise so.
	return HasData(name, value->TypeCode()) ? ReplaceFlat(name, const_cast<BFlattenable*>(value))
											: AddFlat(name, value);
}

// SPDX-License-Identifier: MIT
// The property values of one component, by name.

#include "model/PropertyStore.h"

#include <cstring>

#include <String.h>


TPropertyStore::TPropertyStore(TComponent* component)
	: TTypedMessage('prop'),
	  fComponent(component)
{
}


TPropertyStore::~TPropertyStore() {}


status_t
TPropertyStore::SetString(const char* name, const char* value)
{
	if (name == nullptr)
		return B_BAD_VALUE;
	if (value == nullptr)
		value = "";

	// A text of this store moves when the store grows. Most texts are short enough for the stack.
	char copy[256];
	const size_t size = strlen(value) + 1;
	if (size <= sizeof(copy)) {
		memcpy(copy, value, size);
		return BMessage::SetString(name, copy);
	}
	const BString longCopy(value);
	return BMessage::SetString(name, longCopy.String());
}

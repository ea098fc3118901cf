// SPDX-License-Identifier: MIT
// The texts of editors as the property window shows them.

#include "props/ShownValue.h"

#include <String.h>

#include "model/PropertyText.h"


BString
ShownValue(const char* text)
{
	return text != nullptr ? BString(text, TPropertyText::kSize) : BString();
}

// SPDX-License-Identifier: MIT
// The storage of the texts of a property.

#include "model/PropertyText.h"

#include <algorithm>
#include <cstring>

#include "model/BlockPool.h"


TPropertyText::~TPropertyText()
{
	if (fText != fShort)
		delete[] fText;
}


void
TPropertyText::SetTo(const char* text)
{
	if (text != nullptr)
		Assign(text, strnlen(text, kSize - 1));
}


void
TPropertyText::Fill(const char* text)
{
	if (text != nullptr)
		Assign(text, strnlen(text, kSize));
}


void
TPropertyText::Assign(const char* text, size_t length)
{
	const size_t capacity = fText == fShort ? kShortSize : fCapacity;
	if (length < capacity) {
		memmove(fText, text, length);
		fText[length] = '\0';
		return;
	}

	// Room for a little more, as typed texts tend to grow. The old text goes last: the new one may be
	// a part of it.
	const size_t newCapacity = std::min((length + 64) & ~size_t(63), kSize + 1);
	char* newText = new char[newCapacity];
	memcpy(newText, text, length);
	newText[length] = '\0';

	if (fText != fShort)
		delete[] fText;
	fText = newText;
	fCapacity = newCapacity;
}


TRarePropertyText::~TRarePropertyText()
{
	TBlockPool::Free(fText);
}


void
TRarePropertyText::Assign(const char* text)
{
	const size_t length = strnlen(text, TPropertyText::kSize - 1);
	char* newText = static_cast<char*>(TBlockPool::Allocate(length + 1));
	memcpy(newText, text, length);
	newText[length] = '\0';
	TBlockPool::Free(fText);
	fText = newText;
}

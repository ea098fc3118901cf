// SPDX-License-Identifier: MIT
// A list of texts.

#include "props/StringList.h"


TStringList::TStringList(int32 blockSize)
	: BList(blockSize)
{
}


TStringList::~TStringList() {}


void
TStringList::Add(const char* text)
{
	// The list of the platform knows pointers to variable things only.
	if (text != nullptr)
		AddItem(const_cast<char*>(text));
}


const char*
TStringList::StringAt(int32 index) const
{
	return static_cast<const char*>(ItemAt(index));
}

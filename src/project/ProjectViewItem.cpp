// SPDX-License-Identifier: MIT

#include "project/ProjectViewItem.h"

#include <cstring>

TProjectViewItem::TProjectViewItem(TComponent* component, TDesignForm* form, const char* name)
	: BStringItem(""),
	  fComponent(component),
	  fForm(form),
	  fText()
{
	SetName(name);
}


TProjectViewItem::~TProjectViewItem() {}


void
TProjectViewItem::SetName(const char* name)
{
	size_t length = strnlen(name, sizeof(fText));
	if (length == sizeof(fText)) {
		// Never in the middle of a character.
		for (length--; length > 0 && (name[length] & 0xc0) == 0x80; length--) {
		}
	}
	memcpy(fText, name, length);
	fText[length] = '\0';
	SetText(fText);
}

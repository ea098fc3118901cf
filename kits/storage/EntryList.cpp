// SPDX-License-Identifier: MIT
// BEntryList: what walks a list of entries.

#include <EntryList.h>


BEntryList::BEntryList() {}


BEntryList::~BEntryList() {}

// SPDX-License-Identifier: MIT
// BEntryList: what walks a list of entries.

#ifndef _ENTRY_LIST_H
#define _ENTRY_LIST_H

#include <SupportDefs.h>

class BEntry;
struct entry_ref;

/// A list of entries that is walked from its beginning.
class BEntryList {
public:
	BEntryList();
	virtual ~BEntryList();

	/// Both give B_ENTRY_NOT_FOUND at the end.
	virtual status_t GetNextEntry(BEntry* entry, bool traverse = false) = 0;
	virtual status_t GetNextRef(entry_ref* ref) = 0;
	virtual status_t Rewind() = 0;
	/// The number of entries, or an error. The walk starts over.
	virtual int32 CountEntries() = 0;
};

#endif

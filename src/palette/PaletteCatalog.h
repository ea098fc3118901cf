// SPDX-License-Identifier: MIT
// All palette entries of the running program.

#pragma once

#include <atomic>

#include <List.h>

class TPaletteEntry;

/// The palette entries that the component libraries offer, and the one chosen for the next placement.
///
/// The entries are not owned. The list is filled at start-up, before other threads read it; the drop
/// entry may be read and set from any thread.
class TPaletteCatalog {
public:
	TPaletteCatalog();
	~TPaletteCatalog();

	void AddPalEntry(TPaletteEntry* entry);

	/// The first entry whose class name is exactly \a className; none when there is none, or no text.
	TPaletteEntry* FindPalEntry(const char* className) const;

	int32 CountPalEntries() const;
	TPaletteEntry* PalEntryAt(int32 index) const;

	/// The entry that the next drag on a design surface places; none when nothing waits.
	TPaletteEntry* DropEntry() const { return fDropEntry; }
	void SetDropEntry(TPaletteEntry* entry) { fDropEntry = entry; }

private:
	BList fEntries;
	std::atomic<TPaletteEntry*> fDropEntry;
};

/// The catalog of this program.
TPaletteCatalog& PaletteCatalog();

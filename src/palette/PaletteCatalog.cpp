// SPDX-License-Identifier: MIT

#include "palette/PaletteCatalog.h"

#include <cstring>

#include "palette/PaletteEntry.h"

namespace {

constexpr int32 kListStep = 20;

} // namespace

TPaletteCatalog::TPaletteCatalog()
	: fEntries(kListStep),
	  fDropEntry(nullptr)
{
}


TPaletteCatalog::~TPaletteCatalog() {}


void
TPaletteCatalog::AddPalEntry(TPaletteEntry* entry)
{
	fEntries.AddItem(entry);
}


TPaletteEntry*
TPaletteCatalog::FindPalEntry(const char* className) const
{
	if (className == nullptr)
		return nullptr;
	for (int32 i = 0; i < CountPalEntries(); i++) {
		TPaletteEntry* entry = PalEntryAt(i);
		if (strcmp(entry->ClassName(), className) == 0)
			return entry;
	}
	return nullptr;
}


int32
TPaletteCatalog::CountPalEntries() const
{
	return fEntries.CountItems();
}


TPaletteEntry*
TPaletteCatalog::PalEntryAt(int32 index) const
{
	return static_cast<TPaletteEntry*>(fEntries.ItemAt(index));
}


TPaletteCatalog&
PaletteCatalog()
{
	static TPaletteCatalog sCatalog;
	return sCatalog;
}

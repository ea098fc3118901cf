// SPDX-License-Identifier: MIT
// Loading component libraries.

#pragma once

#include <SupportDefs.h>

class BPath;
class BView;
class TComponentLibrary;
class TLibraryTrial;
class TPaletteCatalog;

/// Loads component libraries and collects their palette entries.
///
/// A library is an add-on image that exports, unmangled,
/// `bool InitComponentLib(image_id)`, `void UnInitComponentLib()`, `uint32 CountComponents()` and
/// `TPaletteEntry* EntryAt(uint32 index)`. What cannot be used is reported on standard output and left
/// out. Loaded libraries stay loaded until the program ends. A library that tells what it was built for (see
/// LibraryBuild.h) is left out, too, when that is another designer.
class TLibraryLoader {
public:
	/// \a catalog gets the entries. \a palette, if any, gets their buttons, in one column. \a trial, if any, is asked
	/// which libraries may be loaded. Neither is owned.
	explicit TLibraryLoader(
		TPaletteCatalog* catalog, BView* palette = nullptr, TLibraryTrial* trial = nullptr);

	/// Loads each library in \a folder, in the folder's own order; B_ENTRY_NOT_FOUND without a folder.
	status_t LoadFolder(const char* folder);

	/// The number of entries placed so far, and the height of their column in pixels.
	int32 CountEntries() const { return fEntryCount; }
	float ColumnHeight() const { return fColumnHeight; }

private:
	void LoadLibrary(const char* path);
	void AddEntries(const TComponentLibrary& library, const char* path);

	TPaletteCatalog* fCatalog;
	BView* fPalette;
	TLibraryTrial* fTrial;
	int32 fEntryCount;
	float fColumnHeight;
};

/// Sets \a path to the "Components" folder beside the running program.
status_t FindComponentsFolder(BPath* path);

// SPDX-License-Identifier: MIT

#include "palette/LibraryLoader.h"

#include <string>
#include <vector>

#include <Application.h>
#include <Directory.h>
#include <Entry.h>
#include <Path.h>
#include <Roster.h>
#include <String.h>

#include "model/Diagnostics.h"
#include "palette/ComponentLibrary.h"
#include "palette/LibraryTrial.h"
#include "palette/PaletteCatalog.h"
#include "palette/PaletteEntry.h"

namespace {

/// The paths of the entries in \a directory, in its order.
std::vector<std::string>
PathsIn(BDirectory* directory)
{
	std::vector<std::string> paths;
	BEntry entry;
	BPath path;
	while (directory->GetNextEntry(&entry, true) == B_OK) {
		if (entry.GetPath(&path) == B_OK)
			paths.emplace_back(path.Path());
	}
	directory->Rewind();
	return paths;
}

} // namespace

TLibraryLoader::TLibraryLoader(TPaletteCatalog* catalog, BView* palette, TLibraryTrial* trial)
	: fCatalog(catalog),
	  fPalette(palette),
	  fTrial(trial),
	  fEntryCount(0),
	  fColumnHeight(0)
{
}


status_t
TLibraryLoader::LoadFolder(const char* folder)
{
	BDirectory directory(folder);
	if (directory.InitCheck() != B_OK)
		return directory.InitCheck();
	if (fTrial != nullptr)
		fTrial->TryAll(PathsIn(&directory));

	BEntry entry;
	while (directory.GetNextEntry(&entry, true) == B_OK) {
		BPath path;
		if (entry.GetPath(&path) != B_OK) {
			PrintDiagnostic("entry.GetPath failed\n");
			continue;
		}
		LoadLibrary(path.Path());
	}
	return B_OK;
}


void
TLibraryLoader::LoadLibrary(const char* path)
{
	std::string reason;
	if (fTrial != nullptr && !fTrial->IsSafe(path, &reason)) {
		PrintDiagnostic("Component library %s is left out: %s\n", path, reason.c_str());
		return;
	}

	TComponentLibrary library(path);
	if (library.Load() != B_OK)
		return;
	PrintDiagnostic("load_add_on(%s) success\n", path);

	if (!library.FindFunctions()) {
		PrintDiagnostic("get_image_symbol() failed\n");
		library.Unload();
		return;
	}

	BString difference;
	if (!library.IsForThisDesigner(&difference)) {
		PrintDiagnostic(
			"Component library %s was built for another designer: %s\n", path, difference.String());
		library.Unload();
		return;
	}

	if (!library.Init()) {
		PrintDiagnostic("Failed to initialize component library %s\n", path);
		library.Unload();
		return;
	}
	PrintDiagnostic("InitComponentLib() success\n%ld Components in %s\n",
		static_cast<long>(library.CountComponents()), path);
	AddEntries(library, path);
}


void
TLibraryLoader::AddEntries(const TComponentLibrary& library, const char* path)
{
	for (uint32 i = 0; i < library.CountComponents(); i++) {
		TPaletteEntry* entry = library.EntryAt(i);
		if (entry == nullptr) {
			PrintDiagnostic("Failed to create palette entry %ld\n", static_cast<long>(i));
			continue;
		}
		// Both get a button, but a form knows its components by their class alone.
		if (fCatalog->FindPalEntry(entry->ClassName()) != nullptr)
			PrintDiagnostic(
				"Warning: Another library offers the class '%s' of %s; forms get that one's\n",
				entry->ClassName(), path);

		BPoint size(0, 0);
		if (fPalette != nullptr) {
			entry->Init(fPalette, BPoint(0, fColumnHeight));
			entry->GetButtonSize(&size);
		}
		fCatalog->AddPalEntry(entry);
		fColumnHeight += size.y;
		fEntryCount++;
	}
}


status_t
FindComponentsFolder(BPath* path)
{
	app_info info;
	status_t status = be_app->GetAppInfo(&info);
	if (status != B_OK)
		return status;
	BEntry program(&info.ref);
	BEntry folder;
	status = program.GetParent(&folder);
	if (status == B_OK)
		status = folder.GetPath(path);
	return status == B_OK ? path->Append("Components") : status;
}

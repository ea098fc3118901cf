// SPDX-License-Identifier: MIT

#include "palette/LibraryLoader.h"

#include <Application.h>
#include <Directory.h>
#include <Entry.h>
#include <Path.h>
#include <Roster.h>
#include <image.h>

#include "model/Diagnostics.h"
#include "palette/PaletteCatalog.h"
#include "palette/PaletteEntry.h"

namespace {

typedef bool (*init_library)(image_id image);
typedef void (*uninit_library)();
typedef uint32 (*count_components)();
typedef TPaletteEntry* (*entry_at)(uint32 index);

/// Looks up the code symbol \a name in \a image; false when it is missing.
template <typename Function>
bool
FindFunction(image_id image, const char* name, Function* function)
{
	void* address = nullptr;
	if (get_image_symbol(image, name, B_SYMBOL_TYPE_TEXT, &address) != B_OK)
		return false;
	*function = reinterpret_cast<Function>(address);
	return true;
}

} // namespace

TLibraryLoader::TLibraryLoader(TPaletteCatalog* catalog, BView* palette)
	: fCatalog(catalog),
	  fPalette(palette),
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
	const image_id image = load_add_on(path);
	if (image < B_OK)
		return;
	PrintDiagnostic("load_add_on(%s) success\n", path);

	init_library init;
	uninit_library uninit;
	count_components count;
	entry_at entryAt;
	if (!FindFunction(image, "InitComponentLib", &init)
		|| !FindFunction(image, "UnInitComponentLib", &uninit)
		|| !FindFunction(image, "CountComponents", &count)
		|| !FindFunction(image, "EntryAt", &entryAt)) {
		PrintDiagnostic("get_image_symbol() failed\n");
		unload_add_on(image);
		return;
	}

	if (!init(image)) {
		PrintDiagnostic("Failed to initialize component library %s\n", path);
		unload_add_on(image);
		return;
	}
	PrintDiagnostic(
		"InitComponentLib() success\n%ld Components in %s\n", static_cast<long>(count()), path);
	AddEntries(count, entryAt);
}


void
TLibraryLoader::AddEntries(uint32 (*count)(), TPaletteEntry* (*entryAt)(uint32 index))
{
	for (uint32 i = 0; i < count(); i++) {
		TPaletteEntry* entry = entryAt(i);
		if (entry == nullptr) {
			PrintDiagnostic("Failed to create palette entry %ld\n", static_cast<long>(i));
			continue;
		}

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

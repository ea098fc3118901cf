// SPDX-License-Identifier: MIT
// One component library.

#pragma once

#include <String.h>
#include <image.h>

class TPaletteEntry;

/// An add-on that offers palette entries, taken step by step: Load(), FindFunctions(), IsForThisDesigner(), Init().
/// It stays loaded when this object goes.
///
/// An exception of the library's never leaves it: it counts as a failure.
class TComponentLibrary {
public:
	explicit TComponentLibrary(const char* path);

	/// Loads the add-on. B_NOT_AN_EXECUTABLE, B_MISSING_SYMBOL, ... when that does not work.
	status_t Load();
	void Unload();

	/// Looks up the four functions; false when one is missing.
	bool FindFunctions();
	/// The function that is missing; "" when none is.
	const char* MissingFunction() const { return fMissing.String(); }

	/// Whether the library was built with the same classes, as far as it tells; \a difference says what is not the same.
	bool IsForThisDesigner(BString* difference) const;

	/// False when the library does not want to be used.
	bool Init();

	/// After Init().
	uint32 CountComponents() const;
	/// None when the library gives none, or one without names.
	TPaletteEntry* EntryAt(uint32 index) const;

private:
	template <typename Function>
	void FindFunction(const char* name, Function* function);

	BString fPath;
	image_id fImage;
	BString fMissing;
	bool (*fInit)(image_id image);
	void (*fUnInit)();
	uint32 (*fCount)();
	TPaletteEntry* (*fEntryAt)(uint32 index);
};

// SPDX-License-Identifier: MIT

#include "palette/ComponentLibrary.h"

#include "palette/LibraryBuild.h"
#include "palette/PaletteEntry.h"

namespace {

/// What \a function returns; \a otherwise when it throws something.
template <typename Result, typename Function, typename... Arguments>
Result
CallOr(Result otherwise, Function function, Arguments... arguments)
{
	try {
		return function(arguments...);
	} catch (...) {
		return otherwise;
	}
}


BString&
operator<<(BString& text, const library_build& build)
{
	const BString standardLibrary(build.standardLibrary, sizeof(build.standardLibrary));
	return text << "interface " << build.interfaceVersion << ", " << standardLibrary;
}

} // namespace

TComponentLibrary::TComponentLibrary(const char* path)
	: fPath(path),
	  fImage(B_ERROR),
	  fInit(nullptr),
	  fUnInit(nullptr),
	  fCount(nullptr),
	  fEntryAt(nullptr)
{
}


status_t
TComponentLibrary::Load()
{
	fImage = load_add_on(fPath.String());
	return fImage < B_OK ? fImage : B_OK;
}


void
TComponentLibrary::Unload()
{
	unload_add_on(fImage);
	fImage = B_ERROR;
}


template <typename Function>
void
TComponentLibrary::FindFunction(const char* name, Function* function)
{
	void* address = nullptr;
	if (!fMissing.IsEmpty())
		return;
	if (get_image_symbol(fImage, name, B_SYMBOL_TYPE_TEXT, &address) == B_OK)
		*function = reinterpret_cast<Function>(address);
	else
		fMissing = name;
}


bool
TComponentLibrary::FindFunctions()
{
	fMissing = "";
	FindFunction("InitComponentLib", &fInit);
	FindFunction("UnInitComponentLib", &fUnInit);
	FindFunction("CountComponents", &fCount);
	FindFunction("EntryAt", &fEntryAt);
	return fMissing.IsEmpty();
}


bool
TComponentLibrary::IsForThisDesigner(BString* difference) const
{
	void* address = nullptr;
	if (get_image_symbol(fImage, kLibraryBuildSymbol, B_SYMBOL_TYPE_DATA, &address) != B_OK)
		return true;

	constexpr library_build kOwn = ThisLibraryBuild();
	const library_build* build = static_cast<const library_build*>(address);
	// A record of another length is not read beyond its length.
	if (build->size != kOwn.size) {
		*difference = "the record of its build is another one";
		return false;
	}
	if (*build == kOwn)
		return true;
	*difference = "";
	*difference << *build << ", and not " << kOwn;
	if (build->interfaceVersion == kOwn.interfaceVersion
		&& strncmp(build->standardLibrary, kOwn.standardLibrary, sizeof(kOwn.standardLibrary)) == 0)
		*difference = "its classes have other sizes";
	return false;
}


bool
TComponentLibrary::Init()
{
	return CallOr(false, fInit, fImage);
}


uint32
TComponentLibrary::CountComponents() const
{
	return CallOr<uint32>(0, fCount);
}


TPaletteEntry*
TComponentLibrary::EntryAt(uint32 index) const
{
	TPaletteEntry* entry = CallOr<TPaletteEntry*>(nullptr, fEntryAt, index);
	if (entry == nullptr || entry->ClassName() == nullptr || entry->ComponentName() == nullptr)
		return nullptr;
	return entry;
}

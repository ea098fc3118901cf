// SPDX-License-Identifier: MIT
// An ELF file: before it is loaded, and in memory.

#ifndef _ELF_IMAGE_H
#define _ELF_IMAGE_H

#include <link.h>

#include <SupportDefs.h>

namespace BPrivate {

/// Whether the file is a whole library for this kind of machine: loading a damaged one could end
/// the program. B_OK, B_ENTRY_NOT_FOUND, B_NOT_AN_EXECUTABLE, or why it cannot be read.
status_t check_library_file(const char* path);


/// A symbol that a loaded image defines.
struct ImageSymbol {
	const char* name;
	/// B_SYMBOL_TYPE_TEXT or B_SYMBOL_TYPE_DATA.
	int32 type;
	void* location;
};


/// The table of symbols of a loaded image. It is the image's own memory.
class ImageSymbols {
public:
	/// \a base: what its addresses are relative to; \a dynamic: its dynamic section.
	ImageSymbols(ElfW(Addr) base, const ElfW(Dyn) * dynamic);

	/// \a type: one of the symbol types, or B_SYMBOL_TYPE_ANY.
	bool Find(const char* name, int32 type, ImageSymbol* symbol) const;
	/// The symbol at \a index among the functions and variables that the image defines.
	bool SymbolAt(int32 index, ImageSymbol* symbol) const;

private:
	uint32 CountByGnuHash(const uint32* table) const;
	bool Describe(uint32 entry, ImageSymbol* symbol) const;

	ElfW(Addr) fBase;
	const ElfW(Sym) * fSymbols;
	const char* fNames;
	uint32 fCount;
};

} // namespace BPrivate

#endif // _ELF_IMAGE_H

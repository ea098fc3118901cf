// SPDX-License-Identifier: MIT
// An ELF file: before it is loaded, and in memory.

#include "kernel/ElfImage.h"

#include <elf.h>
#include <fcntl.h>
#include <string.h>
#include <sys/stat.h>
#include <unistd.h>

#include <vector>

#include <image.h>

#include "support/HostError.h"

// The header of this library, put here by the linker: what fits it fits the machine.
extern const ElfW(Ehdr) __ehdr_start __attribute__((visibility("hidden")));

namespace BPrivate {

namespace {

/// A descriptor that is closed at the end of the block.
class OpenFile {
public:
	explicit OpenFile(const char* path)
		: fFd(open(path, O_RDONLY | O_CLOEXEC | O_NONBLOCK))
	{
	}
	~OpenFile()
	{
		if (fFd >= 0)
			close(fFd);
	}

	int Fd() const { return fFd; }
	bool ReadAt(uint64 offset, void* buffer, size_t size) const
	{
		return pread(fFd, buffer, size, offset) == static_cast<ssize_t>(size);
	}

private:
	int fFd;
};


bool
is_library_header(const ElfW(Ehdr) & header)
{
	const ElfW(Ehdr)& own = __ehdr_start;
	return memcmp(header.e_ident, own.e_ident, EI_VERSION + 1) == 0
		&& header.e_machine == own.e_machine && header.e_type == ET_DYN
		&& header.e_phentsize == sizeof(ElfW(Phdr)) && header.e_phnum > 0;
}


/// Whether everything that is mapped lies in the file: a page beyond its end kills who touches it.
bool
has_all_segments(const OpenFile& file, const ElfW(Ehdr) & header, uint64 size)
{
	std::vector<ElfW(Phdr)> segments(header.e_phnum);
	if (!file.ReadAt(header.e_phoff, segments.data(), segments.size() * sizeof(segments[0])))
		return false;
	for (const ElfW(Phdr) & segment : segments) {
		if (segment.p_type != PT_LOAD && segment.p_type != PT_DYNAMIC)
			continue;
		if (segment.p_offset > size || segment.p_filesz > size - segment.p_offset)
			return false;
	}
	return true;
}

} // namespace


status_t
check_library_file(const char* path)
{
	OpenFile file(path);
	if (file.Fd() < 0)
		return host_error();
	struct stat node;
	if (fstat(file.Fd(), &node) != 0)
		return host_error();

	ElfW(Ehdr) header;
	if (!S_ISREG(node.st_mode) || !file.ReadAt(0, &header, sizeof(header))
		|| !is_library_header(header) || !has_all_segments(file, header, node.st_size))
		return B_NOT_AN_EXECUTABLE;
	return B_OK;
}


// #pragma mark - ImageSymbols


ImageSymbols::ImageSymbols(ElfW(Addr) base, const ElfW(Dyn) * dynamic)
	: fBase(base),
	  fSymbols(nullptr),
	  fNames(nullptr),
	  fCount(0)
{
	// The loader turns most of these into addresses, but not those of every image.
	auto address = [base](const ElfW(Dyn) * entry) {
		ElfW(Addr) value = entry->d_un.d_ptr;
		return value < base ? value + base : value;
	};

	const uint32* hash = nullptr;
	const uint32* gnuHash = nullptr;
	for (const ElfW(Dyn)* entry = dynamic; entry != nullptr && entry->d_tag != DT_NULL; entry++) {
		switch (entry->d_tag) {
			case DT_SYMTAB:
				fSymbols = reinterpret_cast<const ElfW(Sym)*>(address(entry));
				break;
			case DT_STRTAB:
				fNames = reinterpret_cast<const char*>(address(entry));
				break;
			case DT_HASH:
				hash = reinterpret_cast<const uint32*>(address(entry));
				break;
			case DT_GNU_HASH:
				gnuHash = reinterpret_cast<const uint32*>(address(entry));
				break;
		}
	}
	if (fSymbols == nullptr || fNames == nullptr)
		return;
	if (gnuHash != nullptr)
		fCount = CountByGnuHash(gnuHash);
	else if (hash != nullptr)
		fCount = hash[1];
}


/// The table tells no count: the last chain ends at the last symbol.
uint32
ImageSymbols::CountByGnuHash(const uint32* table) const
{
	uint32 bucketCount = table[0];
	uint32 firstHashed = table[1];
	uint32 bloomWords = table[2];
	const uint32* buckets = table + 4 + bloomWords * (sizeof(ElfW(Addr)) / sizeof(uint32));
	const uint32* chains = buckets + bucketCount;

	uint32 last = 0;
	for (uint32 i = 0; i < bucketCount; i++)
		last = max_c(last, buckets[i]);
	if (last < firstHashed)
		return firstHashed;
	while ((chains[last - firstHashed] & 1) == 0)
		last++;
	return last + 1;
}


bool
ImageSymbols::Find(const char* name, int32 type, ImageSymbol* symbol) const
{
	for (uint32 i = 1; i < fCount; i++) {
		if (strcmp(fNames + fSymbols[i].st_name, name) != 0 || !Describe(i, symbol))
			continue;
		if (type == B_SYMBOL_TYPE_ANY || type == symbol->type)
			return true;
	}
	return false;
}


bool
ImageSymbols::SymbolAt(int32 index, ImageSymbol* symbol) const
{
	for (uint32 i = 1; i < fCount; i++) {
		if (Describe(i, symbol) && index-- == 0)
			return true;
	}
	return false;
}


bool
ImageSymbols::Describe(uint32 entry, ImageSymbol* symbol) const
{
	const ElfW(Sym)& found = fSymbols[entry];
	if (found.st_shndx == SHN_UNDEF || found.st_shndx == SHN_ABS)
		return false;
	int binding = found.st_info >> 4;
	if (binding != STB_GLOBAL && binding != STB_WEAK && binding != STB_GNU_UNIQUE)
		return false;

	symbol->name = fNames + found.st_name;
	symbol->location = reinterpret_cast<void*>(fBase + found.st_value);
	switch (found.st_info & 0xf) {
		case STT_OBJECT:
		case STT_COMMON:
			symbol->type = B_SYMBOL_TYPE_DATA;
			return true;
		case STT_FUNC:
			symbol->type = B_SYMBOL_TYPE_TEXT;
			return true;
		case STT_GNU_IFUNC:
			// The symbol is a function that tells where the function is.
			symbol->type = B_SYMBOL_TYPE_TEXT;
			symbol->location = reinterpret_cast<void* (*)()>(symbol->location)();
			return true;
		default:
			return false;
	}
}

} // namespace BPrivate

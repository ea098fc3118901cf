// SPDX-License-Identifier: MIT
// Images: what is loaded into this process, and add-ons.

#include <image.h>

#include <dlfcn.h>
#include <errno.h>
#include <limits.h>
#include <link.h>
#include <locale.h>
#include <stdio.h>
#include <stdlib.h>
#include <string.h>
#include <sys/auxv.h>
#include <sys/stat.h>
#include <unistd.h>

#include <map>
#include <mutex>
#include <string>
#include <vector>

#include "kernel/ElfImage.h"
#include "kernel/Kernel.h"
#include "support/HostError.h"

using namespace BPrivate;

namespace {

/// An image as the host's loader shows it. Its dynamic section tells it from all others.
struct LoadedImage {
	const ElfW(Dyn) * dynamic = nullptr;
	ElfW(Addr) base = 0;
	std::string path;
	image_type type = B_LIBRARY_IMAGE;
	void* text = nullptr;
	int32 textSize = 0;
	void* data = nullptr;
	int32 dataSize = 0;
};


struct Image {
	LoadedImage loaded;
	/// Of an add-on.
	void* handle = nullptr;
	int32 loadCount = 0;
};


struct ImageTable {
	std::mutex lock;
	std::map<image_id, Image> images;
	image_id nextId = 1;
};


ImageTable&
table()
{
	static ImageTable* sTable = new ImageTable;
	return *sTable;
}


std::string
program_path()
{
	char path[PATH_MAX];
	ssize_t length = readlink("/proc/self/exe", path, sizeof(path));
	return length > 0 ? std::string(path, length) : std::string();
}


void
add_segment(const ElfW(Phdr) & segment, LoadedImage* image)
{
	void* start = reinterpret_cast<void*>(image->base + segment.p_vaddr);
	int32 size = static_cast<int32>(segment.p_memsz);
	if (segment.p_type == PT_DYNAMIC)
		image->dynamic = static_cast<const ElfW(Dyn)*>(start);
	if (segment.p_type != PT_LOAD)
		return;
	if ((segment.p_flags & PF_X) != 0 && image->text == nullptr) {
		image->text = start;
		image->textSize = size;
	}
	if ((segment.p_flags & PF_W) != 0 && image->data == nullptr) {
		image->data = start;
		image->dataSize = size;
	}
}


int
collect_image(dl_phdr_info* info, size_t, void* list)
{
	LoadedImage image;
	image.base = info->dlpi_addr;
	for (int i = 0; i < info->dlpi_phnum; i++)
		add_segment(info->dlpi_phdr[i], &image);

	auto* images = static_cast<std::vector<LoadedImage>*>(list);
	// The loader shows the program first, and without a name.
	if (images->empty()) {
		image.type = B_APP_IMAGE;
		image.path = program_path();
	} else {
		image.path = info->dlpi_name;
		ElfW(Addr) vdso = getauxval(AT_SYSINFO_EHDR);
		if (vdso != 0 && vdso == image.base)
			image.type = B_SYSTEM_IMAGE;
	}
	images->push_back(image);
	return 0;
}


std::map<image_id, Image>::iterator
find_loaded(const ElfW(Dyn) * dynamic)
{
	auto found = table().images.begin();
	while (found != table().images.end() && found->second.loaded.dynamic != dynamic)
		++found;
	return found;
}


/// Brings the table up to date with the host's loader. The list was made before the lock was taken,
/// since the loader has a lock of its own: add-ons are kept, they come and go by our functions.
void
update_images(const std::vector<LoadedImage>& loaded)
{
	std::erase_if(table().images, [&](const auto& entry) {
		const Image& image = entry.second;
		if (image.loadCount > 0)
			return false;
		for (const LoadedImage& other : loaded) {
			if (other.dynamic == image.loaded.dynamic && other.path == image.loaded.path)
				return false;
		}
		return true;
	});
	for (const LoadedImage& image : loaded) {
		if (find_loaded(image.dynamic) == table().images.end())
			table().images[table().nextId++].loaded = image;
	}
}


std::vector<LoadedImage>
loaded_images()
{
	std::vector<LoadedImage> loaded;
	dl_iterate_phdr(&collect_image, &loaded);
	return loaded;
}


void
fill_info(image_id id, const Image& image, image_info* info)
{
	*info = image_info();
	info->id = id;
	info->type = image.loadCount > 0 ? B_ADD_ON_IMAGE : image.loaded.type;
	snprintf(info->name, sizeof(info->name), "%s", image.loaded.path.c_str());
	info->text = image.loaded.text;
	info->text_size = image.loaded.textSize;
	info->data = image.loaded.data;
	info->data_size = image.loaded.dataSize;

	struct stat node;
	if (stat(info->name, &node) == 0) {
		info->device = node.st_dev;
		info->node = node.st_ino;
	}
}


/// Why the host's loader failed. It tells by a text only, which is English in the C locale.
status_t
loader_status()
{
	locale_t english = newlocale(LC_ALL_MASK, "C", nullptr);
	locale_t before = uselocale(english);
	const char* error = dlerror();
	std::string text = error == nullptr ? "" : error;
	uselocale(before);
	freelocale(english);

	if (getenv("BE_LOAD_VERBOSE") != nullptr)
		fprintf(stderr, "load_add_on: %s\n", text.c_str());
	auto tells = [&text](const char* part) { return text.find(part) != std::string::npos; };
	if (tells("undefined symbol") || tells("version `"))
		return B_MISSING_SYMBOL;
	if (tells("cannot open shared object file"))
		return B_MISSING_LIBRARY;
	if (tells("ELF") || tells("executable") || tells("file too short"))
		return B_NOT_AN_EXECUTABLE;
	return tells("memory") ? B_NO_MEMORY : B_ERROR;
}


/// Copies what is needed to look at the image's symbols; false when there is no such image.
bool
find_image(image_id id, LoadedImage* loaded)
{
	std::vector<LoadedImage> current = loaded_images();
	std::lock_guard lock(table().lock);
	update_images(current);
	auto found = table().images.find(id);
	if (found == table().images.end())
		return false;
	*loaded = found->second.loaded;
	return true;
}

} // namespace


image_id
load_add_on(const char* path)
{
	if (path == nullptr)
		return B_BAD_VALUE;
	char file[PATH_MAX];
	if (realpath(path, file) == nullptr)
		return host_error();
	status_t status = check_library_file(file);
	if (status != B_OK)
		return status;

	// The host's loader has locks that must not stay locked.
	StopShield shield;
	void* handle = dlopen(file, RTLD_NOW | RTLD_LOCAL);
	if (handle == nullptr)
		return loader_status();
	link_map* map = nullptr;
	dlinfo(handle, RTLD_DI_LINKMAP, &map);

	std::vector<LoadedImage> loaded = loaded_images();
	std::lock_guard lock(table().lock);
	update_images(loaded);
	auto found = find_loaded(map->l_ld);
	if (found == table().images.end()) {
		dlclose(handle);
		return B_ERROR;
	}
	found->second.handle = handle;
	found->second.loadCount++;
	return found->first;
}


status_t
unload_add_on(image_id id)
{
	StopShield shield;
	void* handle;
	{
		std::lock_guard lock(table().lock);
		auto found = table().images.find(id);
		if (found == table().images.end() || found->second.loadCount == 0)
			return B_BAD_IMAGE_ID;
		handle = found->second.handle;
		found->second.loadCount--;
		// Something else may hold it: then it is found again, as a library.
		if (found->second.loadCount == 0)
			table().images.erase(found);
	}
	// Without the lock: the add-on's destructors may use this kit.
	return dlclose(handle) == 0 ? B_OK : B_ERROR;
}


status_t
get_image_symbol(image_id image, const char* name, int32 symbolType, void** _symbolLocation)
{
	if (name == nullptr || _symbolLocation == nullptr)
		return B_BAD_VALUE;
	LoadedImage loaded;
	if (!find_image(image, &loaded))
		return B_BAD_IMAGE_ID;

	ImageSymbol symbol;
	if (!ImageSymbols(loaded.base, loaded.dynamic).Find(name, symbolType, &symbol))
		return B_ENTRY_NOT_FOUND;
	*_symbolLocation = symbol.location;
	return B_OK;
}


status_t
get_nth_image_symbol(image_id image, int32 n, char* nameBuffer, int32* _nameLength,
	int32* _symbolType, void** _symbolLocation)
{
	if (nameBuffer != nullptr && _nameLength == nullptr)
		return B_BAD_VALUE;
	LoadedImage loaded;
	if (!find_image(image, &loaded))
		return B_BAD_IMAGE_ID;

	ImageSymbol symbol;
	if (n < 0 || !ImageSymbols(loaded.base, loaded.dynamic).SymbolAt(n, &symbol))
		return B_BAD_INDEX;
	if (nameBuffer != nullptr && *_nameLength > 0)
		snprintf(nameBuffer, *_nameLength, "%s", symbol.name);
	if (_nameLength != nullptr)
		*_nameLength = static_cast<int32>(strlen(symbol.name));
	if (_symbolType != nullptr)
		*_symbolType = symbol.type;
	if (_symbolLocation != nullptr)
		*_symbolLocation = symbol.location;
	return B_OK;
}


status_t
get_image_info(image_id id, image_info* info)
{
	if (info == nullptr)
		return B_BAD_VALUE;
	std::vector<LoadedImage> loaded = loaded_images();
	std::lock_guard lock(table().lock);
	update_images(loaded);
	auto found = table().images.find(id);
	if (found == table().images.end())
		return B_BAD_IMAGE_ID;
	fill_info(id, found->second, info);
	return B_OK;
}


status_t
get_next_image_info(team_id team, int32* cookie, image_info* info)
{
	if (cookie == nullptr || info == nullptr)
		return B_BAD_VALUE;
	if (team != B_CURRENT_TEAM && team != getpid())
		return B_BAD_TEAM_ID;

	std::vector<LoadedImage> loaded = loaded_images();
	std::lock_guard lock(table().lock);
	update_images(loaded);
	auto next = table().images.upper_bound(*cookie);
	if (next == table().images.end())
		return B_BAD_VALUE;
	*cookie = next->first;
	fill_info(next->first, next->second, info);
	return B_OK;
}

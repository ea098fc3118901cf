// SPDX-License-Identifier: MIT
// An entry_ref as bytes, for messages and flattened paths.

#include "storage/EntryRefFlattening.h"

#include <stdlib.h>
#include <string.h>
#include <sys/stat.h>

#include <Entry.h>
#include <Errors.h>

#include "storage/KnownNodes.h"

namespace BPrivate {

namespace {

const size_t kNumbersSize = sizeof(uint32) + sizeof(uint64);


// Takes a text with its terminator off the front of the bytes.
bool
TakeText(const char** bytes, size_t* size, std::string* text)
{
	const void* end = memchr(*bytes, '\0', *size);
	if (end == nullptr)
		return false;
	text->assign(*bytes);
	*bytes += text->size() + 1;
	*size -= text->size() + 1;
	return true;
}


// The path comes from outside: it counts only when it is clean and names that very folder.
void
RememberIfTrue(const std::string& folder, dev_t device, ino_t directory)
{
	if (folder.empty() || folder[0] != '/')
		return;
	char* real = realpath(folder.c_str(), nullptr);
	if (real == nullptr)
		return;
	struct stat stat;
	if (folder == real && lstat(real, &stat) == 0 && stat.st_dev == device
		&& stat.st_ino == directory)
		remember_node(stat, folder);
	free(real);
}

} // namespace


std::string
flatten_entry_ref(const entry_ref& ref)
{
	// The host's device numbers have 32 bits, in a wider type.
	const uint32 device = (uint32)ref.device;
	const uint64 directory = ref.directory;
	std::string bytes((const char*)&device, sizeof(device));
	bytes.append((const char*)&directory, sizeof(directory));
	if (ref.name == nullptr)
		return bytes;

	bytes.append(ref.name, strlen(ref.name) + 1);
	std::string folder;
	if (find_node_path(ref.device, ref.directory, &folder) == B_OK)
		bytes.append(folder.c_str(), folder.size() + 1);
	return bytes;
}


status_t
unflatten_entry_ref(const void* buffer, size_t size, entry_ref* ref)
{
	if (buffer == nullptr || ref == nullptr)
		return B_BAD_VALUE;
	if (size < kNumbersSize)
		return B_BAD_DATA;

	const char* bytes = (const char*)buffer;
	uint32 device;
	uint64 directory;
	memcpy(&device, bytes, sizeof(device));
	memcpy(&directory, bytes + sizeof(device), sizeof(directory));
	bytes += kNumbersSize;
	size -= kNumbersSize;
	// An unset reference has -1 for its device.
	const dev_t hostDevice = device == (uint32)-1 ? (dev_t)-1 : (dev_t)device;
	if (size == 0) {
		*ref = entry_ref(hostDevice, directory, nullptr);
		return B_OK;
	}

	std::string name;
	std::string folder;
	if (!TakeText(&bytes, &size, &name))
		return B_BAD_DATA;
	if (size > 0 && !TakeText(&bytes, &size, &folder))
		return B_BAD_DATA;

	RememberIfTrue(folder, hostDevice, (ino_t)directory);
	*ref = entry_ref(hostDevice, directory, name.c_str());
	return B_OK;
}

} // namespace BPrivate

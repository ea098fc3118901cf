// SPDX-License-Identifier: MIT
// From a path to an entry_ref and back.

#include "storage/EntryResolving.h"

#include <stdlib.h>
#include <string.h>
#include <sys/stat.h>
#include <unistd.h>

#include <Entry.h>
#include <Errors.h>
#include <StorageDefs.h>

#include "storage/KnownNodes.h"
#include "storage/StorageStatus.h"

namespace BPrivate {

namespace {

status_t
RealPath(const std::string& path, std::string* real)
{
	char* resolved = realpath(path.c_str(), nullptr);
	if (resolved == nullptr)
		return status_from_errno(errno);
	*real = resolved;
	free(resolved);
	return B_OK;
}


// Takes the path apart at its last slash; the folder of a bare name is ".".
void
SplitPath(std::string path, std::string* folder, std::string* leaf)
{
	while (path.size() > 1 && path.back() == '/')
		path.pop_back();

	const size_t slash = path.rfind('/');
	if (slash == std::string::npos)
		*folder = ".";
	else
		*folder = slash == 0 ? "/" : path.substr(0, slash);
	*leaf = slash == std::string::npos ? path : path.substr(slash + 1);
}


status_t
ResolveFolder(const std::string& folder, const std::string& leaf, entry_ref* ref, std::string* path)
{
	std::string real;
	const status_t status = RealPath(folder, &real);
	if (status != B_OK)
		return status;

	struct stat stat;
	if (::stat(real.c_str(), &stat) != 0)
		return status_from_errno(errno);
	if (!S_ISDIR(stat.st_mode))
		return B_NOT_A_DIRECTORY;

	*path = join_path(real, leaf);
	if (path->size() >= B_PATH_NAME_LENGTH)
		return B_NAME_TOO_LONG;

	remember_node(stat, real);
	ref->device = stat.st_dev;
	ref->directory = stat.st_ino;
	return ref->set_name(leaf.c_str());
}


// Resolves everything but the leaf.
status_t
ResolveOnce(const std::string& path, entry_ref* ref, std::string* absolute)
{
	if (path.empty())
		return B_ENTRY_NOT_FOUND;
	if (path.size() >= B_PATH_NAME_LENGTH)
		return B_NAME_TOO_LONG;

	std::string folder;
	std::string leaf;
	SplitPath(path, &folder, &leaf);
	if (leaf == "." || leaf == "..") {
		std::string real;
		const status_t status = RealPath(path, &real);
		if (status != B_OK)
			return status;
		SplitPath(real, &folder, &leaf);
	}
	if (leaf.empty()) {
		// The root has no folder: it is its own entry.
		const status_t status = ResolveFolder("/", ".", ref, absolute);
		*absolute = "/";
		return status;
	}
	if (leaf.size() >= B_FILE_NAME_LENGTH)
		return B_NAME_TOO_LONG;
	return ResolveFolder(folder, leaf, ref, absolute);
}


bool
ReadLinkAt(const std::string& path, std::string* target)
{
	char buffer[PATH_MAX];
	const ssize_t length = readlink(path.c_str(), buffer, sizeof(buffer));
	if (length <= 0)
		return false;
	target->assign(buffer, length);
	return true;
}

} // namespace


std::string
join_path(const std::string& folder, const std::string& leaf)
{
	return folder.back() == '/' ? folder + leaf : folder + "/" + leaf;
}


status_t
resolve_path(const char* path, bool traverse, entry_ref* ref)
{
	if (path == nullptr)
		return B_BAD_VALUE;

	entry_ref resolved;
	std::string absolute;
	status_t status = ResolveOnce(path, &resolved, &absolute);
	std::string target;
	for (int32 links = 0; traverse && status == B_OK && ReadLinkAt(absolute, &target); links++) {
		if (links == B_MAX_SYMLINKS)
			return B_LINK_LIMIT;
		if (target[0] != '/')
			target = join_path(absolute.substr(0, absolute.rfind('/') + 1), target);
		status = ResolveOnce(target, &resolved, &absolute);
	}
	if (status == B_OK)
		*ref = resolved;
	return status;
}


status_t
find_ref_path(const entry_ref& ref, std::string* path)
{
	if (ref.name == nullptr || ref.name[0] == '\0' || strchr(ref.name, '/') != nullptr)
		return B_BAD_VALUE;
	if (strlen(ref.name) >= B_FILE_NAME_LENGTH)
		return B_NAME_TOO_LONG;

	std::string folder;
	const status_t status = find_node_path(ref.device, ref.directory, &folder);
	if (status != B_OK)
		return status;

	const bool isFolderItself = strcmp(ref.name, ".") == 0;
	*path = isFolderItself ? folder : join_path(folder, ref.name);
	return path->size() < B_PATH_NAME_LENGTH ? B_OK : B_NAME_TOO_LONG;
}

} // namespace BPrivate

// SPDX-License-Identifier: MIT
// What a file panel makes of the paths and names that are typed into it.

#include "interface/panel/PanelPaths.h"

#include <cerrno>
#include <cstdlib>

#include <dirent.h>
#include <sys/stat.h>
#include <unistd.h>

#include <Entry.h>
#include <Path.h>
#include <StorageDefs.h>

#include "interface/panel/PanelText.h"
#include "storage/EntryResolving.h"
#include "storage/KnownNodes.h"
#include "storage/StorageStatus.h"
#include "storage/XdgDirectories.h"

namespace BPrivate {

namespace {

bool
IsFolder(const std::string& path)
{
	struct stat stat;
	return ::stat(path.c_str(), &stat) == 0 && S_ISDIR(stat.st_mode);
}


/// How many bytes at the start are the same, characters not cut.
size_t
CommonLength(const std::string& a, const std::string& b)
{
	size_t length = 0;
	while (length < a.size() && length < b.size() && a[length] == b[length])
		length++;
	while (length > 0 && length < a.size() && (a[length] & 0xc0) == 0x80)
		length--;
	return length;
}

} // namespace


std::string
NameProblem(const std::string& name)
{
	if (name.empty())
		return "Please type a name.";
	if (name == "." || name == "..")
		return "\"" + name + "\" is no name for a file.";
	if (name.find('/') != std::string::npos)
		return "A name cannot contain a slash (\"/\").";
	if (name.size() >= B_FILE_NAME_LENGTH)
		return "The name is too long.";
	return "";
}


std::string
TypedPath(const std::string& text, const std::string& folder)
{
	const size_t first = text.find_first_not_of(" \t");
	if (first == std::string::npos)
		return "";
	std::string path = text.substr(first, text.find_last_not_of(" \t") + 1 - first);
	if (path[0] == '/')
		return path;
	if (path == "~" || path.starts_with("~/"))
		return home_directory() + path.substr(1);
	return join_path(folder, path);
}


std::string
PathCompletion(const std::string& text, const std::string& folder)
{
	const std::string path = TypedPath(text, folder);
	const size_t slash = path.rfind('/');
	// A blank at the end belongs to a name that is being typed.
	if (slash == std::string::npos || !text.ends_with(path.back()))
		return "";
	const std::string start = path.substr(slash + 1);
	if (start.empty())
		return "";

	const std::string searched = path.substr(0, slash + 1);
	DIR* listing = opendir(searched.c_str());
	if (listing == nullptr)
		return "";
	std::string common;
	int32 count = 0;
	while (const dirent* entry = readdir(listing)) {
		const std::string name = entry->d_name;
		if (name == "." || name == ".." || !name.starts_with(start) || !IsValidText(name)
			|| !IsFolder(searched + name))
			continue;
		common = count == 0 ? name : common.substr(0, CommonLength(common, name));
		count++;
	}
	closedir(listing);
	// What is typed may end within a character.
	if (count == 0 || common.size() < start.size())
		return "";
	return common.substr(start.size()) + (count == 1 ? "/" : "");
}


std::string
ParentPath(const std::string& path)
{
	const size_t slash = path.rfind('/');
	return slash == std::string::npos || slash == 0 ? "/" : path.substr(0, slash);
}


std::string
LeafName(const std::string& path)
{
	return path == "/" ? path : path.substr(path.rfind('/') + 1);
}


std::string
NearestFolder(std::string path)
{
	while (path.size() > 1 && !IsFolder(path))
		path = ParentPath(path);
	return path;
}


status_t
FindFolder(const std::string& path, std::string* resolved)
{
	if (path.empty())
		return B_ENTRY_NOT_FOUND;
	char* real = realpath(path.c_str(), nullptr);
	if (real == nullptr)
		return status_from_errno(errno);
	const std::string found = real;
	free(real);

	struct stat stat;
	if (::stat(found.c_str(), &stat) != 0)
		return status_from_errno(errno);
	if (!S_ISDIR(stat.st_mode))
		return B_NOT_A_DIRECTORY;
	// Whether it can be read shows only when it is opened.
	DIR* listing = opendir(found.c_str());
	if (listing == nullptr)
		return status_from_errno(errno);
	closedir(listing);
	remember_node(stat, found);
	*resolved = found;
	return B_OK;
}


status_t
FindFolder(const entry_ref& ref, std::string* resolved)
{
	std::string path;
	const status_t status = find_ref_path(ref, &path);
	return status == B_OK ? FindFolder(path, resolved) : status;
}


std::string
UnusedName(const std::string& folder, const std::string& name)
{
	struct stat stat;
	std::string unused = name;
	for (int32 number = 2; lstat(join_path(folder, unused).c_str(), &stat) == 0; number++)
		unused = name + " " + std::to_string(number);
	return unused;
}

} // namespace BPrivate

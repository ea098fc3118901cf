// SPDX-License-Identifier: MIT
// The way from device and inode back to a path, which the host does not offer.

#include "storage/KnownNodes.h"

#include <map>
#include <mutex>
#include <utility>

#include <dirent.h>
#include <mntent.h>
#include <stdio.h>
#include <unistd.h>

#include <Errors.h>
#include <StorageDefs.h>

namespace BPrivate {

namespace {

using node_key = std::pair<dev_t, ino_t>;

struct known_node {
	std::string path;
	node_key parent;
};

using node_map = std::map<node_key, known_node>;

/// What is no folder is kept in two generations: a saved document is a new node each time.
struct node_table {
	std::mutex lock;
	node_map folders;
	node_map files;
	node_map olderFiles;
};

const size_t kMostFiles = 1000; // of a generation

// A path has at most this many folders; more steps upward would be a loop in the table.
const int kMaxDepth = B_PATH_NAME_LENGTH / 2;


// Never destroyed: objects with static storage use it after main().
node_table&
Table()
{
	static node_table* sTable = new node_table;
	return *sTable;
}


std::string
ParentPath(const std::string& path)
{
	const size_t slash = path.rfind('/');
	return slash == 0 || slash == std::string::npos ? "/" : path.substr(0, slash);
}


std::string
JoinPath(const std::string& folder, const std::string& name)
{
	return folder.back() == '/' ? folder + name : folder + "/" + name;
}


bool
IsNodeAt(const std::string& path, const node_key& key)
{
	struct stat stat;
	return lstat(path.c_str(), &stat) == 0 && node_key(stat.st_dev, stat.st_ino) == key;
}


// What is known of a node, which then belongs to those that were asked for last.
known_node*
Lookup(node_table& table, const node_key& key)
{
	for (node_map* nodes : {&table.folders, &table.files}) {
		const auto found = nodes->find(key);
		if (found != nodes->end())
			return &found->second;
	}
	auto older = table.olderFiles.extract(key);
	return older.empty() ? nullptr : &table.files.insert(std::move(older)).position->second;
}


known_node&
LookupOrAdd(node_table& table, const struct stat& stat)
{
	const node_key key(stat.st_dev, stat.st_ino);
	// Numbers of nodes that are gone are used again.
	if (S_ISDIR(stat.st_mode)) {
		table.files.erase(key);
		table.olderFiles.erase(key);
		return table.folders[key];
	}

	table.folders.erase(key);
	known_node* const known = Lookup(table, key);
	if (known != nullptr)
		return *known;
	if (table.files.size() >= kMostFiles) {
		table.olderFiles.swap(table.files);
		table.files.clear();
	}
	return table.files[key];
}


void
RememberLocked(node_table& table, const struct stat& stat, const std::string& path, int depth)
{
	const node_key key(stat.st_dev, stat.st_ino);
	known_node& node = LookupOrAdd(table, stat);
	if (node.path == path)
		return;

	node.path = path;
	node.parent = key;
	if (path == "/" || depth == 0)
		return;

	const std::string parentPath = ParentPath(path);
	struct stat parentStat;
	if (lstat(parentPath.c_str(), &parentStat) != 0)
		return;
	node.parent = node_key(parentStat.st_dev, parentStat.st_ino);
	RememberLocked(table, parentStat, parentPath, depth - 1);
}


// Looks for the node under another name in the folder.
bool
FindInFolder(const std::string& folder, const node_key& key, std::string* path)
{
	DIR* listing = opendir(folder.c_str());
	if (listing == nullptr)
		return false;

	bool found = false;
	while (!found) {
		const dirent* entry = readdir(listing);
		if (entry == nullptr)
			break;
		if (entry->d_ino != key.second)
			continue;
		const std::string name = entry->d_name;
		if (name == "." || name == "..")
			continue;
		*path = JoinPath(folder, name);
		found = IsNodeAt(*path, key);
	}
	closedir(listing);
	return found;
}


bool
FindLocked(node_table& table, const node_key& key, std::string* path, int depth)
{
	known_node* const found = Lookup(table, key);
	if (found == nullptr || depth == 0)
		return false;

	known_node& node = *found;
	if (IsNodeAt(node.path, key)) {
		*path = node.path;
		return true;
	}

	std::string folder;
	if (node.parent == key || !FindLocked(table, node.parent, &folder, depth - 1))
		return false;

	std::string place = JoinPath(folder, node.path.substr(node.path.rfind('/') + 1));
	if (!IsNodeAt(place, key) && !FindInFolder(folder, key, &place))
		return false;
	node.path = place;
	*path = place;
	return true;
}


bool
FindCurrentDirectory(const node_key& key, std::string* path)
{
	char buffer[PATH_MAX];
	if (getcwd(buffer, sizeof(buffer)) == nullptr || buffer[0] != '/' || !IsNodeAt(buffer, key))
		return false;
	*path = buffer;
	return true;
}


bool
FindMountPoint(const node_key& key, std::string* path)
{
	// The list of mounts does not have the root of a program that was given another one.
	bool found = IsNodeAt("/", key);
	if (found)
		*path = "/";
	FILE* mounts = setmntent("/proc/self/mounts", "re");
	if (mounts == nullptr)
		return found;

	char buffer[4 * PATH_MAX];
	struct mntent entry;
	while (!found && getmntent_r(mounts, &entry, buffer, sizeof(buffer)) != nullptr) {
		found = IsNodeAt(entry.mnt_dir, key);
		if (found)
			*path = entry.mnt_dir;
	}
	endmntent(mounts);
	return found;
}

} // namespace


void
remember_node(const struct stat& stat, const std::string& path)
{
	if (path.empty() || path[0] != '/')
		return;
	node_table& table = Table();
	std::lock_guard<std::mutex> lock(table.lock);
	RememberLocked(table, stat, path, kMaxDepth);
}


status_t
find_node_path(dev_t device, ino_t node, std::string* path)
{
	const node_key key(device, node);
	node_table& table = Table();
	std::lock_guard<std::mutex> lock(table.lock);
	if (FindLocked(table, key, path, kMaxDepth))
		return B_OK;
	if (!FindCurrentDirectory(key, path) && !FindMountPoint(key, path))
		return B_ENTRY_NOT_FOUND;

	struct stat stat;
	if (lstat(path->c_str(), &stat) == 0)
		RememberLocked(table, stat, *path, kMaxDepth);
	return B_OK;
}


status_t
find_descriptor_path(int fd, std::string* path)
{
	struct stat stat;
	if (fstat(fd, &stat) != 0)
		return B_FILE_ERROR;

	char buffer[PATH_MAX];
	const std::string link = "/proc/self/fd/" + std::to_string(fd);
	const ssize_t length = readlink(link.c_str(), buffer, sizeof(buffer));
	if (length > 0 && length < (ssize_t)sizeof(buffer)) {
		const std::string place(buffer, length);
		if (place[0] == '/' && IsNodeAt(place, node_key(stat.st_dev, stat.st_ino))) {
			remember_node(stat, place);
			*path = place;
			return B_OK;
		}
	}
	return find_node_path(stat.st_dev, stat.st_ino, path);
}

} // namespace BPrivate

// SPDX-License-Identifier: MIT
// Reads the entries of a folder bit by bit, and puts them in order.

#include "interface/panel/FolderReader.h"

#include <algorithm>
#include <cerrno>

#include <fcntl.h>
#include <sys/stat.h>
#include <unistd.h>

#include <Entry.h>
#include <FilePanel.h>
#include <NodeInfo.h>
#include <OS.h>

#include "storage/StorageStatus.h"

namespace BPrivate {

FolderEntry::FolderEntry(const std::string& name)
	: key(name),
	  shownName(DisplayName(name))
{
}


bool
FolderEntry::operator==(const FolderEntry& other) const
{
	return Name() == other.Name() && inode == other.inode && isFolder == other.isFolder
		&& isLink == other.isLink && isBroken == other.isBroken && isProgram == other.isProgram
		&& size == other.size && modified == other.modified;
}


void
SortEntries(std::vector<FolderEntry>* entries, FolderOrder order, bool descending)
{
	const auto before = [order](const FolderEntry& a, const FolderEntry& b) {
		if (order == FolderOrder::kSize && !a.isFolder && a.size != b.size)
			return a.size < b.size;
		if (order == FolderOrder::kModified && a.modified != b.modified)
			return a.modified < b.modified;
		return a.key < b.key;
	};
	std::sort(entries->begin(), entries->end(), [&](const FolderEntry& a, const FolderEntry& b) {
		if (a.isFolder != b.isFolder)
			return a.isFolder;
		return descending ? before(b, a) : before(a, b);
	});
}


FolderReader::FolderReader()
	: fListing(nullptr)
{
}


FolderReader::~FolderReader()
{
	Close();
}


status_t
FolderReader::Open(const std::string& path)
{
	Close();
	fEntries.clear();
	const int fd = open(path.c_str(), O_RDONLY | O_DIRECTORY | O_CLOEXEC);
	if (fd < 0)
		return status_from_errno(errno);
	struct stat stat;
	fListing = fstat(fd, &stat) == 0 ? fdopendir(fd) : nullptr;
	if (fListing == nullptr) {
		const status_t status = status_from_errno(errno);
		close(fd);
		return status;
	}
	fNode = node_ref(stat.st_dev, stat.st_ino);
	return B_OK;
}


bool
FolderReader::ReadSome(const FolderRules& rules, bigtime_t until)
{
	while (fListing != nullptr) {
		const dirent* next = readdir(fListing);
		if (next == nullptr) {
			Close();
			break;
		}
		const std::string name = next->d_name;
		if (name != "." && name != ".." && (name[0] != '.' || rules.showHidden))
			ReadEntry(rules, name);
		if (system_time() >= until)
			break;
	}
	return fListing != nullptr;
}


void
FolderReader::Close()
{
	if (fListing != nullptr)
		closedir(fListing);
	fListing = nullptr;
}


void
FolderReader::ReadEntry(const FolderRules& rules, const std::string& name)
{
	// One that has gone meanwhile is none.
	struct stat stat;
	const int folder = dirfd(fListing);
	if (fstatat(folder, name.c_str(), &stat, AT_SYMLINK_NOFOLLOW) != 0)
		return;

	FolderEntry entry(name);
	entry.inode = stat.st_ino;
	entry.isLink = S_ISLNK(stat.st_mode);
	if (entry.isLink) {
		struct stat target;
		entry.isBroken = fstatat(folder, name.c_str(), &target, 0) != 0;
		if (!entry.isBroken)
			stat = target;
	}
	entry.isFolder = S_ISDIR(stat.st_mode);
	entry.isProgram = S_ISREG(stat.st_mode) && (stat.st_mode & 0111) != 0;
	entry.size = entry.isFolder ? 0 : stat.st_size;
	entry.modified = stat.st_mtime;

	const bool asLink = entry.isLink && (rules.flavors & B_SYMLINK_NODE) != 0;
	const bool asFile = !entry.isFolder && !entry.isBroken && (rules.flavors & B_FILE_NODE) != 0;
	if ((entry.isFolder || asFile || asLink) && IsAccepted(rules, entry))
		fEntries.push_back(std::move(entry));
}


bool
FolderReader::IsAccepted(const FolderRules& rules, const FolderEntry& entry) const
{
	if (rules.filter == nullptr)
		return true;

	const entry_ref ref(fNode.device, fNode.node, entry.Name().c_str());
	const BEntry target(&ref, !entry.isBroken);
	BNode node(&target);
	struct stat_beos stat = {};
	if (node.GetStat(&stat) != B_OK)
		return false;
	char type[B_MIME_TYPE_LENGTH];
	if (BNodeInfo(&node).GetType(type) != B_OK)
		type[0] = '\0';
	return rules.filter->Filter(&ref, &node, &stat, type);
}

} // namespace BPrivate

// SPDX-License-Identifier: MIT
// Reads the entries of a folder bit by bit, and puts them in order.
#ifndef INTERFACE_PANEL_FOLDER_READER_H
#define INTERFACE_PANEL_FOLDER_READER_H

#include <string>
#include <vector>

#include <dirent.h>

#include <Node.h>
#include <StorageDefs.h>

#include "interface/panel/PanelText.h"

class BRefFilter;

namespace BPrivate {

/// What a file panel knows of one entry. For a link size, time and kind are those of what it points at.
struct FolderEntry {
	explicit FolderEntry(const std::string& name);

	bool operator==(const FolderEntry& other) const;

	const std::string& Name() const { return key.name; }

	NameKey key;
	std::string shownName;
	ino_t inode = 0;
	bool isFolder = false;
	bool isLink = false;
	/// A link to nothing.
	bool isBroken = false;
	bool isProgram = false;
	off_t size = 0;
	time_t modified = 0;
};


/// Which entries are wanted. Folders are always, as they lead to others, unless the filter refuses them.
struct FolderRules {
	/// node_flavor bits of what can be chosen. Links are wanted for what they point at; those to nothing,
	/// or to what is not wanted itself, for B_SYMLINK_NODE.
	uint32 flavors = B_FILE_NODE;
	/// Those whose name begins with a dot, too.
	bool showHidden = false;
	/// Null takes all. For a link it is asked about the node that it points at.
	BRefFilter* filter = nullptr;
};


enum class FolderOrder { kName, kSize, kModified };

/// Folders first, then in \a order; equal ones by name.
void SortEntries(std::vector<FolderEntry>* entries, FolderOrder order, bool descending);


/// One pass over a folder.
class FolderReader {
public:
	FolderReader();
	~FolderReader();

	/// Begins a pass over the folder at \a path, which FindFolder() gave. What is read already goes. B_OK, or
	/// why it cannot be read; nothing is read then.
	status_t Open(const std::string& path);
	/// Reads on, at least one entry, until \a until (system_time()) or the end. True when more is left.
	bool ReadSome(const FolderRules& rules, bigtime_t until);
	/// Gives up what is left.
	void Close();
	bool IsReading() const { return fListing != nullptr; }

	/// The folder's own node.
	const node_ref& Node() const { return fNode; }
	/// In the order of the file system.
	const std::vector<FolderEntry>& Entries() const { return fEntries; }
	std::vector<FolderEntry>& Entries() { return fEntries; }

private:
	FolderReader(const FolderReader&) = delete;
	FolderReader& operator=(const FolderReader&) = delete;

	void ReadEntry(const FolderRules& rules, const std::string& name);
	bool IsAccepted(const FolderRules& rules, const FolderEntry& entry) const;

	DIR* fListing;
	node_ref fNode;
	std::vector<FolderEntry> fEntries;
};

} // namespace BPrivate

#endif // INTERFACE_PANEL_FOLDER_READER_H

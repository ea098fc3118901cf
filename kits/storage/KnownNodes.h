// SPDX-License-Identifier: MIT
// The way from device and inode back to a path, which the host does not offer.

#ifndef _KNOWN_NODES_H
#define _KNOWN_NODES_H

#include <string>

#include <sys/stat.h>

#include <SupportDefs.h>

namespace BPrivate {

/// Remembers the path of a node, and of every folder on the way to it.
///
/// Folders, which entries are found by, for this process's life; of other nodes the last thousand at least.
/// \a path: absolute and without links in its folders. Any thread.
void remember_node(const struct stat& stat, const std::string& path);

/// The present path of a node, verified by its device and inode.
///
/// Nodes are found where they were last seen, elsewhere in the same folder after a renaming (of the
/// node or of a folder above it), as the current directory, or as the root of a volume.
/// B_ENTRY_NOT_FOUND otherwise. Any thread.
status_t find_node_path(dev_t device, ino_t node, std::string* path);

/// The path that an open descriptor stands for, verified. B_ENTRY_NOT_FOUND when the node has been
/// removed.
status_t find_descriptor_path(int fd, std::string* path);

} // namespace BPrivate

#endif

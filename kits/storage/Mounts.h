// SPDX-License-Identifier: MIT
// The file systems that the host has mounted.

#ifndef _MOUNTS_H
#define _MOUNTS_H

#include <string>
#include <vector>

#include <sys/types.h>

#include <SupportDefs.h>

namespace BPrivate {

struct mount_point {
	dev_t device;
	std::string path;
	/// The host's word for the kind of file system.
	std::string type;
};

/// Every device once, at the first of its places, in the host's order. Places that cannot be reached,
/// and those that another file system covers, are left out.
std::vector<mount_point> list_mounts();

/// B_DEVICE_NOT_FOUND, \a mount unchanged, when the device is mounted nowhere.
status_t find_mount(dev_t device, mount_point* mount);

bool is_memory_file_system(const std::string& type);
bool is_network_file_system(const std::string& type);
/// One that shows the host's inside, not files.
bool is_system_file_system(const std::string& type);

} // namespace BPrivate

#endif

// SPDX-License-Identifier: MIT
// The file systems that the host has mounted.

#include "storage/Mounts.h"

#include <algorithm>
#include <initializer_list>

#include <limits.h>
#include <mntent.h>
#include <stdio.h>
#include <sys/stat.h>

#include <Errors.h>

namespace BPrivate {

namespace {

bool
IsOneOf(const std::string& type, std::initializer_list<const char*> types)
{
	return std::any_of(
		types.begin(), types.end(), [&type](const char* candidate) { return type == candidate; });
}

/// Puts the root in front when it is no mount point of its own, as for a program that was given
/// another root: it stands for its whole device.
void
AddMissingRoot(std::vector<mount_point>& mounts)
{
	struct stat stat;
	const auto isRoot = [](const mount_point& mount) { return mount.path == "/"; };
	if (std::any_of(mounts.begin(), mounts.end(), isRoot) || ::stat("/", &stat) != 0)
		return;

	const auto sameDevice = [&](const mount_point& mount) { return mount.device == stat.st_dev; };
	const auto same = std::find_if(mounts.begin(), mounts.end(), sameDevice);
	const std::string type = same != mounts.end() ? same->type : std::string();
	if (same != mounts.end())
		mounts.erase(same);
	mounts.insert(mounts.begin(), {stat.st_dev, "/", type});
}

} // namespace


std::vector<mount_point>
list_mounts()
{
	std::vector<mount_point> mounts;
	FILE* list = setmntent("/proc/self/mounts", "re");
	if (list == nullptr)
		return mounts;

	char buffer[4 * PATH_MAX];
	struct mntent entry;
	while (getmntent_r(list, &entry, buffer, sizeof(buffer)) != nullptr) {
		struct stat stat;
		if (::stat(entry.mnt_dir, &stat) != 0)
			continue;
		const auto isKnown = [&](const mount_point& mount) {
			return mount.device == stat.st_dev || mount.path == entry.mnt_dir;
		};
		if (std::none_of(mounts.begin(), mounts.end(), isKnown))
			mounts.push_back({stat.st_dev, entry.mnt_dir, entry.mnt_type});
	}
	endmntent(list);
	AddMissingRoot(mounts);
	return mounts;
}


status_t
find_mount(dev_t device, mount_point* mount)
{
	for (const mount_point& candidate : list_mounts()) {
		if (candidate.device == device) {
			*mount = candidate;
			return B_OK;
		}
	}
	return B_DEVICE_NOT_FOUND;
}


bool
is_memory_file_system(const std::string& type)
{
	return IsOneOf(type, {"tmpfs", "ramfs"}) || is_system_file_system(type);
}


bool
is_network_file_system(const std::string& type)
{
	return IsOneOf(type,
		{"nfs", "nfs4", "cifs", "smb3", "smbfs", "afs", "9p", "ceph", "fuse.sshfs",
			"fuse.glusterfs", "davfs", "ncpfs", "coda"});
}


bool
is_system_file_system(const std::string& type)
{
	return IsOneOf(type,
		{"proc", "sysfs", "devtmpfs", "devpts", "cgroup", "cgroup2", "securityfs", "pstore", "bpf",
			"debugfs", "tracefs", "configfs", "mqueue", "hugetlbfs", "autofs", "binfmt_misc",
			"fusectl", "efivarfs", "rpc_pipefs", "nsfs"});
}

} // namespace BPrivate

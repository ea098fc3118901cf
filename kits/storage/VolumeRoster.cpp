// SPDX-License-Identifier: MIT
// BVolumeRoster: the mounted file systems.

#include <VolumeRoster.h>

#include <sys/stat.h>

#include <Errors.h>
#include <NodeMonitor.h>
#include <Volume.h>

#include "storage/Mounts.h"
#include "storage/StorageStatus.h"


BVolumeRoster::BVolumeRoster()
	: fIndex(0),
	  fTarget(nullptr)
{
}


BVolumeRoster::~BVolumeRoster()
{
	StopWatching();
}


status_t
BVolumeRoster::GetNextVolume(BVolume* volume)
{
	if (volume == nullptr)
		return B_BAD_VALUE;
	std::vector<BPrivate::mount_point> mounts = BPrivate::list_mounts();
	std::erase_if(mounts, [](const BPrivate::mount_point& mount) {
		return BPrivate::is_system_file_system(mount.type);
	});
	if (fIndex >= (int32)mounts.size()) {
		volume->Unset();
		return B_BAD_VALUE;
	}
	return volume->SetTo(mounts[fIndex++].device);
}


void
BVolumeRoster::Rewind()
{
	fIndex = 0;
}


status_t
BVolumeRoster::GetBootVolume(BVolume* volume)
{
	if (volume == nullptr)
		return B_BAD_VALUE;
	struct stat stat;
	if (::stat("/", &stat) != 0)
		return BPrivate::status_from_errno(errno);
	return volume->SetTo(stat.st_dev);
}


status_t
BVolumeRoster::StartWatching(BMessenger messenger)
{
	StopWatching();
	const status_t status = watch_node(nullptr, B_WATCH_MOUNT, messenger);
	if (status == B_OK)
		fTarget = new BMessenger(messenger);
	return status;
}


void
BVolumeRoster::StopWatching()
{
	if (fTarget == nullptr)
		return;
	stop_watching(*fTarget);
	delete fTarget;
	fTarget = nullptr;
}


BMessenger
BVolumeRoster::Messenger() const
{
	return fTarget == nullptr ? BMessenger() : *fTarget;
}

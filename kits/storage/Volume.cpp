// SPDX-License-Identifier: MIT
// BVolume: a mounted file system.

#include <Volume.h>

#include <stdio.h>
#include <stdlib.h>
#include <string.h>
#include <sys/stat.h>
#include <sys/statvfs.h>
#include <sys/sysmacros.h>

#include <Directory.h>
#include <Errors.h>
#include <StorageDefs.h>

#include "storage/Mounts.h"
#include "storage/StorageStatus.h"

using BPrivate::mount_point;


namespace {

/// Finds the volume's place and asks for its figures.
status_t
GetFigures(dev_t device, struct statvfs* figures)
{
	mount_point mount;
	const status_t status = BPrivate::find_mount(device, &mount);
	return status == B_OK ? BPrivate::status_of(statvfs(mount.path.c_str(), figures)) : status;
}

} // namespace


BVolume::BVolume()
	: fDevice((dev_t)-1),
	  fStatus(B_NO_INIT)
{
}


BVolume::BVolume(dev_t device)
	: fDevice((dev_t)-1),
	  fStatus(B_NO_INIT)
{
	SetTo(device);
}


BVolume::BVolume(const BVolume& volume) = default;


BVolume::~BVolume() {}


status_t
BVolume::InitCheck() const
{
	return fStatus;
}


status_t
BVolume::SetTo(dev_t device)
{
	mount_point mount;
	fStatus = BPrivate::find_mount(device, &mount);
	fDevice = fStatus == B_OK ? device : (dev_t)-1;
	return fStatus;
}


void
BVolume::Unset()
{
	fDevice = (dev_t)-1;
	fStatus = B_NO_INIT;
}


dev_t
BVolume::Device() const
{
	return fDevice;
}


status_t
BVolume::GetRootDirectory(BDirectory* directory) const
{
	if (directory == nullptr)
		return B_BAD_VALUE;
	if (fStatus != B_OK)
		return fStatus;
	mount_point mount;
	const status_t status = BPrivate::find_mount(fDevice, &mount);
	return status == B_OK ? directory->SetTo(mount.path.c_str()) : status;
}


off_t
BVolume::Capacity() const
{
	struct statvfs figures;
	const status_t status = fStatus == B_OK ? GetFigures(fDevice, &figures) : fStatus;
	return status == B_OK ? (off_t)(figures.f_blocks * figures.f_frsize) : status;
}


off_t
BVolume::FreeBytes() const
{
	struct statvfs figures;
	const status_t status = fStatus == B_OK ? GetFigures(fDevice, &figures) : fStatus;
	return status == B_OK ? (off_t)(figures.f_bavail * figures.f_frsize) : status;
}


off_t
BVolume::BlockSize() const
{
	struct statvfs figures;
	const status_t status = fStatus == B_OK ? GetFigures(fDevice, &figures) : fStatus;
	return status == B_OK ? (off_t)figures.f_frsize : status;
}


status_t
BVolume::GetName(char* name) const
{
	if (name == nullptr)
		return B_BAD_VALUE;
	if (fStatus != B_OK)
		return fStatus;
	mount_point mount;
	const status_t status = BPrivate::find_mount(fDevice, &mount);
	if (status != B_OK)
		return status;
	const std::string leaf = mount.path.substr(mount.path.rfind('/') + 1);
	const std::string& text = leaf.empty() ? mount.path : leaf;
	if (text.size() >= B_FILE_NAME_LENGTH)
		return B_NAME_TOO_LONG;
	memcpy(name, text.c_str(), text.size() + 1);
	return B_OK;
}


bool
BVolume::IsRemovable() const
{
	if (fStatus != B_OK)
		return false;
	// A partition has the answer in the folder of its disk.
	const std::string device =
		"/sys/dev/block/" + std::to_string(major(fDevice)) + ":" + std::to_string(minor(fDevice));
	for (const char* place : {"/removable", "/../removable"}) {
		FILE* file = fopen((device + place).c_str(), "re");
		if (file == nullptr)
			continue;
		const int answer = fgetc(file);
		fclose(file);
		return answer == '1';
	}
	return false;
}


bool
BVolume::IsReadOnly() const
{
	struct statvfs figures;
	return fStatus == B_OK && GetFigures(fDevice, &figures) == B_OK
		&& (figures.f_flag & ST_RDONLY) != 0;
}


bool
BVolume::IsPersistent() const
{
	mount_point mount;
	return fStatus == B_OK && BPrivate::find_mount(fDevice, &mount) == B_OK
		&& !BPrivate::is_memory_file_system(mount.type);
}


bool
BVolume::IsShared() const
{
	mount_point mount;
	return fStatus == B_OK && BPrivate::find_mount(fDevice, &mount) == B_OK
		&& BPrivate::is_network_file_system(mount.type);
}


bool
BVolume::operator==(const BVolume& volume) const
{
	return fStatus == volume.fStatus && fDevice == volume.fDevice;
}


bool
BVolume::operator!=(const BVolume& volume) const
{
	return !(*this == volume);
}


BVolume& BVolume::operator=(const BVolume& volume) = default;

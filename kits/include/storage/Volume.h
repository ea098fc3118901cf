// SPDX-License-Identifier: MIT
// BVolume: a mounted file system.

#ifndef _VOLUME_H
#define _VOLUME_H

#include <sys/types.h>

#include <SupportDefs.h>

class BDirectory;

/// A mounted file system, named by its device.
class BVolume {
public:
	BVolume();
	BVolume(dev_t device);
	BVolume(const BVolume& volume);
	virtual ~BVolume();

	/// B_NO_INIT when unset; B_DEVICE_NOT_FOUND when nothing is mounted with that device.
	status_t InitCheck() const;
	status_t SetTo(dev_t device);
	void Unset();
	/// -1 when unset.
	dev_t Device() const;

	status_t GetRootDirectory(BDirectory* directory) const;
	/// Bytes, or a negative error.
	off_t Capacity() const;
	/// What an ordinary user can still fill.
	off_t FreeBytes() const;
	off_t BlockSize() const;
	/// The last name of the place where it is mounted, "/" for the root. B_FILE_NAME_LENGTH bytes.
	status_t GetName(char* name) const;

	bool IsRemovable() const;
	bool IsReadOnly() const;
	bool IsPersistent() const;
	/// Whether it is reached through a network.
	bool IsShared() const;

	bool operator==(const BVolume& volume) const;
	bool operator!=(const BVolume& volume) const;
	BVolume& operator=(const BVolume& volume);

private:
	dev_t fDevice;
	status_t fStatus;
};

#endif

// SPDX-License-Identifier: MIT
// BVolumeRoster: the mounted file systems.

#ifndef _VOLUME_ROSTER_H
#define _VOLUME_ROSTER_H

#include <Messenger.h>

class BVolume;

extern BMessenger be_app_messenger;

/// Walks the mounted file systems, and watches for new and vanished ones.
class BVolumeRoster {
public:
	BVolumeRoster();
	virtual ~BVolumeRoster();

	/// B_BAD_VALUE behind the last one; the volume is then unset.
	status_t GetNextVolume(BVolume* volume);
	void Rewind();
	/// The one that the root folder is on.
	status_t GetBootVolume(BVolume* volume);

	/// Sends B_NODE_MONITOR with "opcode" B_DEVICE_MOUNTED or B_DEVICE_UNMOUNTED.
	status_t StartWatching(BMessenger messenger = be_app_messenger);
	void StopWatching();
	BMessenger Messenger() const;

private:
	BVolumeRoster(const BVolumeRoster&) = delete;
	BVolumeRoster& operator=(const BVolumeRoster&) = delete;

	int32 fIndex;
	BMessenger* fTarget;
};

#endif

// SPDX-License-Identifier: MIT
// Watching nodes and volumes: what B_NODE_MONITOR messages tell.

#ifndef _NODE_MONITOR_H
#define _NODE_MONITOR_H

#include <sys/types.h>

#include <SupportDefs.h>

class BHandler;
class BLooper;
class BMessenger;
struct node_ref;

/// What to watch, in "flags".
enum {
	B_STOP_WATCHING = 0x0000,
	B_WATCH_NAME = 0x0001,
	B_WATCH_STAT = 0x0002,
	B_WATCH_ATTR = 0x0004,
	B_WATCH_DIRECTORY = 0x0008,
	B_WATCH_ALL = 0x000f,
	B_WATCH_MOUNT = 0x0010,
	B_WATCH_INTERIM_STAT = 0x0020,
	B_WATCH_CHILDREN = 0x0040
};

/// What changed, in "fields" of B_STAT_CHANGED.
enum {
	B_STAT_MODE = 0x0001,
	B_STAT_UID = 0x0002,
	B_STAT_GID = 0x0004,
	B_STAT_SIZE = 0x0008,
	B_STAT_ACCESS_TIME = 0x0010,
	B_STAT_MODIFICATION_TIME = 0x0020,
	B_STAT_CREATION_TIME = 0x0040,
	B_STAT_CHANGE_TIME = 0x0080,
	B_STAT_INTERIM_UPDATE = 0x1000
};

/// "opcode".
#define B_ENTRY_CREATED 1
#define B_ENTRY_REMOVED 2
#define B_ENTRY_MOVED 3
#define B_STAT_CHANGED 4
#define B_ATTR_CHANGED 5
#define B_DEVICE_MOUNTED 6
#define B_DEVICE_UNMOUNTED 7
/// "cause" of B_ATTR_CHANGED; its third value is B_ATTR_CHANGED.
#define B_ATTR_CREATED 1
#define B_ATTR_REMOVED 2

/// Sends \a target a B_NODE_MONITOR message for each change of the kinds in \a flags.
///
/// A message has "opcode" (int32), "device" (int32), "directory" and "node" (int64) and "name"
/// (string), as far as they apply. B_STOP_WATCHING ends it for this node. A node of which the kits
/// never saw the path cannot be watched: B_ENTRY_NOT_FOUND. Any thread.
status_t watch_node(const node_ref* node, uint32 flags, BMessenger target);
status_t watch_node(
	const node_ref* node, uint32 flags, const BHandler* handler, const BLooper* looper = NULL);
/// The host cannot watch every node of a volume: anything but B_WATCH_MOUNT is B_NOT_SUPPORTED.
status_t watch_volume(dev_t volume, uint32 flags, BMessenger target);
status_t watch_volume(
	dev_t volume, uint32 flags, const BHandler* handler, const BLooper* looper = NULL);
/// Ends everything that the target watches.
status_t stop_watching(BMessenger target);
status_t stop_watching(const BHandler* handler, const BLooper* looper = NULL);

#endif

// SPDX-License-Identifier: MIT
// Watching nodes and volumes, by way of the host's inotify and of its list of mounts.

#include <NodeMonitor.h>

#include <algorithm>
#include <list>
#include <map>
#include <mutex>
#include <string>
#include <thread>
#include <utility>
#include <vector>

#include <dirent.h>
#include <fcntl.h>
#include <limits.h>
#include <poll.h>
#include <sys/inotify.h>
#include <sys/stat.h>
#include <unistd.h>

#include <AppDefs.h>
#include <Errors.h>
#include <Message.h>
#include <Messenger.h>
#include <Node.h>

#include "storage/KnownNodes.h"
#include "storage/Mounts.h"
#include "storage/StorageStatus.h"

namespace {

const uint32 kEvents = IN_CREATE | IN_DELETE | IN_MOVED_FROM | IN_MOVED_TO | IN_ATTRIB | IN_MODIFY
	| IN_DELETE_SELF | IN_MOVE_SELF;
const uint32 kNodeFlags = B_WATCH_ALL | B_WATCH_INTERIM_STAT;
// A target that does not empty its port loses messages rather than stopping those of the others.
const bigtime_t kSendTimeout = 100000;


struct watch_target {
	BMessenger messenger;
	uint32 flags;
};

/// A node that somebody watches, and how it was when it was last looked at.
struct watched_node {
	node_ref ref;
	std::string path;
	struct stat stat;
	// The entries of a folder, so that the node of a removed one can be told.
	std::map<std::string, ino_t> entries;
	std::list<watch_target> targets;
};


BMessage
NoticeMessage(int32 opcode, const node_ref& node)
{
	BMessage message(B_NODE_MONITOR);
	message.AddInt32("opcode", opcode);
	message.AddInt32("device", (int32)node.device);
	message.AddInt64("node", (int64)node.node);
	return message;
}


BMessage
EntryMessage(int32 opcode, const node_ref& folder, ino_t node, const char* name)
{
	BMessage message = NoticeMessage(opcode, node_ref(folder.device, node));
	message.AddInt64("directory", (int64)folder.node);
	message.AddString("name", name);
	return message;
}


/// Which parts of a status differ, as the bits of B_STAT_CHANGED. That of the last change is left out.
uint32
ChangedFields(const struct stat& before, const struct stat& now)
{
	uint32 fields = 0;
	if (before.st_mode != now.st_mode)
		fields |= B_STAT_MODE;
	if (before.st_uid != now.st_uid)
		fields |= B_STAT_UID;
	if (before.st_gid != now.st_gid)
		fields |= B_STAT_GID;
	if (before.st_size != now.st_size)
		fields |= B_STAT_SIZE;
	if (before.st_mtim.tv_sec != now.st_mtim.tv_sec
		|| before.st_mtim.tv_nsec != now.st_mtim.tv_nsec)
		fields |= B_STAT_MODIFICATION_TIME;
	if (before.st_atim.tv_sec != now.st_atim.tv_sec
		|| before.st_atim.tv_nsec != now.st_atim.tv_nsec)
		fields |= B_STAT_ACCESS_TIME;
	return fields;
}


std::map<std::string, ino_t>
ReadEntries(const std::string& path)
{
	std::map<std::string, ino_t> entries;
	DIR* listing = opendir(path.c_str());
	if (listing == nullptr)
		return entries;
	while (const dirent* entry = readdir(listing))
		entries[entry->d_name] = entry->d_ino;
	closedir(listing);
	return entries;
}


/// All that is watched, and the thread that looks. Lasts as long as the process.
class NodeMonitor {
public:
	static NodeMonitor& Default()
	{
		static NodeMonitor* sMonitor = new NodeMonitor;
		return *sMonitor;
	}

	status_t Watch(const node_ref& ref, uint32 flags, const BMessenger& target);
	void WatchMounts(const BMessenger& target);
	void StopNode(const node_ref& ref, const BMessenger& target);
	void Stop(const BMessenger& target);
	status_t Start();

private:
	void Run();
	void ReadEvents();
	void HandleEvent(const inotify_event& event);
	void HandleMove(const inotify_event& from, const inotify_event* to);
	void HandleOwnEvent(watched_node* node, uint32 mask);
	void HandleMounts();
	void Send(const watched_node& node, const BMessage& message, uint32 flag);
	void Deliver();
	void DropIdle();

	std::mutex fLock;
	int fInotify = -1;
	int fMountList = -1;
	std::map<int, watched_node> fNodes;
	std::vector<BMessenger> fMountTargets;
	std::vector<BPrivate::mount_point> fMounts;
	std::vector<std::pair<BMessenger, BMessage>> fPending;
	// The first half of a move, until the second comes.
	std::string fMoveBytes;
};


status_t
NodeMonitor::Start()
{
	std::lock_guard<std::mutex> lock(fLock);
	if (fInotify >= 0)
		return B_OK;
	fInotify = inotify_init1(IN_CLOEXEC | IN_NONBLOCK);
	if (fInotify < 0)
		return BPrivate::status_from_errno(errno);
	fMountList = open("/proc/self/mounts", O_RDONLY | O_CLOEXEC);
	std::thread([this] { Run(); }).detach();
	return B_OK;
}


status_t
NodeMonitor::Watch(const node_ref& ref, uint32 flags, const BMessenger& target)
{
	std::lock_guard<std::mutex> lock(fLock);
	std::string path;
	const status_t status = BPrivate::find_node_path(ref.device, ref.node, &path);
	if (status != B_OK)
		return status;
	const int watch = inotify_add_watch(fInotify, path.c_str(), kEvents | IN_DONT_FOLLOW);
	if (watch < 0)
		return BPrivate::status_from_errno(errno);

	watched_node& node = fNodes[watch];
	if (node.targets.empty()) {
		node.ref = ref;
		node.path = path;
		lstat(path.c_str(), &node.stat);
		if (S_ISDIR(node.stat.st_mode))
			node.entries = ReadEntries(path);
	}
	for (watch_target& known : node.targets) {
		if (known.messenger == target) {
			known.flags |= flags;
			return B_OK;
		}
	}
	node.targets.push_back({target, flags});
	return B_OK;
}


void
NodeMonitor::WatchMounts(const BMessenger& target)
{
	std::lock_guard<std::mutex> lock(fLock);
	if (fMountTargets.empty())
		fMounts = BPrivate::list_mounts();
	if (std::find(fMountTargets.begin(), fMountTargets.end(), target) == fMountTargets.end())
		fMountTargets.push_back(target);
}


void
NodeMonitor::StopNode(const node_ref& ref, const BMessenger& target)
{
	std::lock_guard<std::mutex> lock(fLock);
	for (auto& [watch, node] : fNodes) {
		if (node.ref == ref)
			node.targets.remove_if(
				[&target](const watch_target& known) { return known.messenger == target; });
	}
	DropIdle();
}


void
NodeMonitor::Stop(const BMessenger& target)
{
	std::lock_guard<std::mutex> lock(fLock);
	std::erase(fMountTargets, target);
	for (auto& [watch, node] : fNodes)
		node.targets.remove_if(
			[&target](const watch_target& known) { return known.messenger == target; });
	DropIdle();
}


void
NodeMonitor::DropIdle()
{
	std::erase_if(fNodes, [this](const auto& item) {
		if (!item.second.targets.empty())
			return false;
		inotify_rm_watch(fInotify, item.first);
		return true;
	});
}


void
NodeMonitor::Run()
{
	struct pollfd polled[] = {{fInotify, POLLIN, 0}, {fMountList, POLLPRI, 0}};
	while (true) {
		// The second half of a move follows the first at once, or never.
		const int count = poll(polled, 2, fMoveBytes.empty() ? -1 : 10);
		if (count < 0 && errno != EINTR)
			return;
		{
			std::lock_guard<std::mutex> lock(fLock);
			if (count == 0 && !fMoveBytes.empty())
				HandleMove(*(const inotify_event*)fMoveBytes.data(), nullptr);
			if (count > 0 && (polled[0].revents & POLLIN) != 0)
				ReadEvents();
			if (count > 0 && (polled[1].revents & (POLLPRI | POLLERR)) != 0)
				HandleMounts();
		}
		Deliver();
	}
}


void
NodeMonitor::ReadEvents()
{
	alignas(inotify_event) char buffer[16384];
	const ssize_t size = read(fInotify, buffer, sizeof(buffer));
	for (ssize_t position = 0; position < size;) {
		const inotify_event& event = *(const inotify_event*)(buffer + position);
		HandleEvent(event);
		position += sizeof(inotify_event) + event.len;
	}
}


void
NodeMonitor::HandleEvent(const inotify_event& event)
{
	if (!fMoveBytes.empty()) {
		const std::string bytes = fMoveBytes;
		const inotify_event& from = *(const inotify_event*)bytes.data();
		const bool isPair = (event.mask & IN_MOVED_TO) != 0 && event.cookie == from.cookie;
		HandleMove(from, isPair ? &event : nullptr);
		if (isPair)
			return;
	}
	if ((event.mask & IN_MOVED_FROM) != 0) {
		fMoveBytes.assign((const char*)&event, sizeof(event) + event.len);
		return;
	}

	const auto found = fNodes.find(event.wd);
	if (found == fNodes.end())
		return;
	watched_node& node = found->second;
	if (event.len == 0) {
		HandleOwnEvent(&node, event.mask);
		return;
	}
	if ((event.mask & (IN_CREATE | IN_MOVED_TO)) != 0) {
		struct stat stat;
		const std::string path = node.path + "/" + event.name;
		const ino_t inode = lstat(path.c_str(), &stat) == 0 ? stat.st_ino : 0;
		node.entries[event.name] = inode;
		Send(node, EntryMessage(B_ENTRY_CREATED, node.ref, inode, event.name), B_WATCH_DIRECTORY);
	} else if ((event.mask & IN_DELETE) != 0) {
		const ino_t inode = node.entries[event.name];
		node.entries.erase(event.name);
		Send(node, EntryMessage(B_ENTRY_REMOVED, node.ref, inode, event.name), B_WATCH_DIRECTORY);
	}
}


void
NodeMonitor::HandleMove(const inotify_event& from, const inotify_event* to)
{
	const auto source = fNodes.find(from.wd);
	const auto target = to == nullptr ? fNodes.end() : fNodes.find(to->wd);
	if (source != fNodes.end()) {
		watched_node& folder = source->second;
		const ino_t inode = folder.entries[from.name];
		folder.entries.erase(from.name);
		if (target == fNodes.end()) {
			Send(folder, EntryMessage(B_ENTRY_REMOVED, folder.ref, inode, from.name),
				B_WATCH_DIRECTORY);
		} else {
			target->second.entries[to->name] = inode;
			BMessage message = NoticeMessage(B_ENTRY_MOVED, node_ref(folder.ref.device, inode));
			message.AddInt64("from directory", (int64)folder.ref.node);
			message.AddInt64("to directory", (int64)target->second.ref.node);
			message.AddString("from name", from.name);
			message.AddString("name", to->name);
			Send(folder, message, B_WATCH_DIRECTORY);
			if (target != source)
				Send(target->second, message, B_WATCH_DIRECTORY);
		}
	}
	fMoveBytes.clear();
}


void
NodeMonitor::HandleOwnEvent(watched_node* node, uint32 mask)
{
	if ((mask & IN_DELETE_SELF) != 0) {
		Send(*node, NoticeMessage(B_ENTRY_REMOVED, node->ref), B_WATCH_NAME);
		return;
	}
	if ((mask & IN_MOVE_SELF) != 0) {
		BMessage message = NoticeMessage(B_ENTRY_MOVED, node->ref);
		std::string path;
		status_t status = BPrivate::find_node_path(node->ref.device, node->ref.node, &path);
		if (status != B_OK) {
			// Many other files may have been looked at since this one was.
			BPrivate::remember_node(node->stat, node->path);
			status = BPrivate::find_node_path(node->ref.device, node->ref.node, &path);
		}
		if (status == B_OK) {
			node->path = path;
			message.AddString("name", path.substr(path.rfind('/') + 1).c_str());
		}
		Send(*node, message, B_WATCH_NAME);
		return;
	}

	struct stat stat;
	if ((mask & (IN_ATTRIB | IN_MODIFY)) == 0 || lstat(node->path.c_str(), &stat) != 0
		|| stat.st_ino != node->ref.node)
		return;
	const uint32 fields = ChangedFields(node->stat, stat);
	const bool isAttribute =
		(mask & IN_ATTRIB) != 0 && fields == 0 && stat.st_nlink == node->stat.st_nlink;
	node->stat = stat;
	if (fields != 0) {
		BMessage message = NoticeMessage(B_STAT_CHANGED, node->ref);
		message.AddInt32("fields", (int32)(fields | B_STAT_CHANGE_TIME));
		Send(*node, message, B_WATCH_STAT);
	} else if (isAttribute) {
		// The host does not tell which attribute.
		Send(*node, NoticeMessage(B_ATTR_CHANGED, node->ref), B_WATCH_ATTR);
	}
}


void
NodeMonitor::HandleMounts()
{
	const auto isIn = [](const std::vector<BPrivate::mount_point>& mounts, dev_t device) {
		return std::any_of(mounts.begin(), mounts.end(),
			[device](const BPrivate::mount_point& mount) { return mount.device == device; });
	};
	if (fMountTargets.empty())
		return;
	const std::vector<BPrivate::mount_point> now = BPrivate::list_mounts();
	std::vector<BMessage> messages;
	for (const BPrivate::mount_point& mount : now) {
		if (isIn(fMounts, mount.device))
			continue;
		BMessage message(B_NODE_MONITOR);
		message.AddInt32("opcode", B_DEVICE_MOUNTED);
		message.AddInt32("new device", (int32)mount.device);
		messages.push_back(message);
	}
	for (const BPrivate::mount_point& mount : fMounts) {
		if (isIn(now, mount.device))
			continue;
		BMessage message(B_NODE_MONITOR);
		message.AddInt32("opcode", B_DEVICE_UNMOUNTED);
		message.AddInt32("device", (int32)mount.device);
		messages.push_back(message);
	}
	fMounts = now;
	for (const BMessenger& target : fMountTargets) {
		for (const BMessage& message : messages)
			fPending.emplace_back(target, message);
	}
}


void
NodeMonitor::Send(const watched_node& node, const BMessage& message, uint32 flag)
{
	for (const watch_target& target : node.targets) {
		if ((target.flags & flag) != 0)
			fPending.emplace_back(target.messenger, message);
	}
}


// Without the lock: a target's looper may be just about to stop watching.
void
NodeMonitor::Deliver()
{
	std::vector<std::pair<BMessenger, BMessage>> pending;
	{
		std::lock_guard<std::mutex> lock(fLock);
		pending.swap(fPending);
	}
	for (auto& [target, message] : pending)
		target.SendMessage(&message, (BHandler*)nullptr, kSendTimeout);
}

} // namespace


status_t
watch_node(const node_ref* node, uint32 flags, BMessenger target)
{
	if (!target.IsValid())
		return B_BAD_VALUE;
	if (flags == B_STOP_WATCHING) {
		if (node == nullptr)
			return B_BAD_VALUE;
		NodeMonitor::Default().StopNode(*node, target);
		return B_OK;
	}
	if ((flags & kNodeFlags) != 0 && node == nullptr)
		return B_BAD_VALUE;
	if ((flags & B_WATCH_CHILDREN) != 0)
		return B_NOT_SUPPORTED;

	status_t status = NodeMonitor::Default().Start();
	if (status == B_OK && (flags & kNodeFlags) != 0)
		status = NodeMonitor::Default().Watch(*node, flags & kNodeFlags, target);
	if (status == B_OK && (flags & B_WATCH_MOUNT) != 0)
		NodeMonitor::Default().WatchMounts(target);
	return status;
}


status_t
watch_node(const node_ref* node, uint32 flags, const BHandler* handler, const BLooper* looper)
{
	return watch_node(node, flags, BMessenger(handler, looper));
}


status_t
watch_volume(dev_t, uint32 flags, BMessenger target)
{
	if ((flags & ~(uint32)B_WATCH_MOUNT) != 0)
		return B_NOT_SUPPORTED;
	return watch_node(nullptr, flags, target);
}


status_t
watch_volume(dev_t volume, uint32 flags, const BHandler* handler, const BLooper* looper)
{
	return watch_volume(volume, flags, BMessenger(handler, looper));
}


status_t
stop_watching(BMessenger target)
{
	NodeMonitor::Default().Stop(target);
	return B_OK;
}


status_t
stop_watching(const BHandler* handler, const BLooper* looper)
{
	return stop_watching(BMessenger(handler, looper));
}

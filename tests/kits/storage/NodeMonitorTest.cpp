// SPDX-License-Identifier: MIT
// Watching nodes: each change of the kinds asked for gives a message.

#include <NodeMonitor.h>

#include <sys/xattr.h>

#include <chrono>
#include <condition_variable>
#include <deque>
#include <mutex>

#include <gtest/gtest.h>

#include <AppDefs.h>
#include <Directory.h>
#include <Entry.h>
#include <Errors.h>
#include <Looper.h>
#include <Message.h>
#include <Messenger.h>
#include <Node.h>

#include "support/TemporaryFolder.h"

namespace {

/// Keeps the messages of the monitor until the test asks for them.
class Listener : public BLooper {
public:
	void MessageReceived(BMessage* message) override
	{
		if (message->what != B_NODE_MONITOR) {
			BLooper::MessageReceived(message);
			return;
		}
		const std::lock_guard<std::mutex> lock(fMutex);
		fMessages.push_back(*message);
		fArrived.notify_all();
	}

	/// The next message with the code; other messages are passed over. Its what is 0 when none comes.
	BMessage Wait(int32 opcode)
	{
		std::unique_lock<std::mutex> lock(fMutex);
		const auto end = std::chrono::steady_clock::now() + std::chrono::seconds(10);
		while (true) {
			while (!fMessages.empty()) {
				const BMessage message = fMessages.front();
				fMessages.pop_front();
				if (message.FindInt32("opcode") == opcode)
					return message;
			}
			if (fArrived.wait_until(lock, end) == std::cv_status::timeout)
				return BMessage(uint32(0));
		}
	}

private:
	std::mutex fMutex;
	std::condition_variable fArrived;
	std::deque<BMessage> fMessages;
};


class NodeMonitorTest : public testing::Test {
protected:
	void SetUp() override
	{
		fListener = new Listener;
		fListener->Run();
		fTarget = BMessenger(fListener);
	}
	void TearDown() override
	{
		stop_watching(fTarget);
		if (fListener->Lock())
			fListener->Quit();
	}

	status_t Watch(const std::string& path, uint32 flags)
	{
		node_ref node;
		const status_t status = BEntry(path.c_str()).GetNodeRef(&node);
		return status == B_OK ? watch_node(&node, flags, fTarget) : status;
	}

	TemporaryFolder fFolder;
	Listener* fListener;
	BMessenger fTarget;
};

} // namespace


TEST_F(NodeMonitorTest, FolderTellsOfItsEntries)
{
	ASSERT_EQ(Watch(fFolder.Path(), B_WATCH_DIRECTORY), B_OK);
	fFolder.Write("file");
	node_ref folder;
	node_ref file;
	BEntry(fFolder.Path().c_str()).GetNodeRef(&folder);
	BEntry((fFolder / "file").c_str()).GetNodeRef(&file);

	BMessage message = fListener->Wait(B_ENTRY_CREATED);
	EXPECT_STREQ(message.FindString("name"), "file");
	EXPECT_EQ(message.FindInt64("directory"), (int64)folder.node);
	EXPECT_EQ(message.FindInt64("node"), (int64)file.node);
	EXPECT_EQ(message.FindInt32("device"), (int32)folder.device);

	std::filesystem::rename(fFolder / "file", fFolder / "renamed");
	message = fListener->Wait(B_ENTRY_MOVED);
	EXPECT_STREQ(message.FindString("from name"), "file");
	EXPECT_STREQ(message.FindString("name"), "renamed");
	EXPECT_EQ(message.FindInt64("node"), (int64)file.node);

	std::filesystem::remove(fFolder / "renamed");
	message = fListener->Wait(B_ENTRY_REMOVED);
	EXPECT_STREQ(message.FindString("name"), "renamed");
	EXPECT_EQ(message.FindInt64("node"), (int64)file.node);
}


TEST_F(NodeMonitorTest, EntryThatMovesAwayIsRemoved)
{
	fFolder.Make("watched");
	fFolder.Write("watched/file");
	ASSERT_EQ(Watch(fFolder / "watched", B_WATCH_DIRECTORY), B_OK);
	std::filesystem::rename(fFolder / "watched/file", fFolder / "file");
	EXPECT_STREQ(fListener->Wait(B_ENTRY_REMOVED).FindString("name"), "file");
}


TEST_F(NodeMonitorTest, FileTellsOfItsStatusAndName)
{
	ASSERT_EQ(Watch(fFolder.Write("file"), B_WATCH_STAT | B_WATCH_NAME), B_OK);
	fFolder.Write("file", "more");
	BMessage message = fListener->Wait(B_STAT_CHANGED);
	EXPECT_EQ(message.what, (uint32)B_NODE_MONITOR);
	std::filesystem::rename(fFolder / "file", fFolder / "renamed");
	EXPECT_STREQ(fListener->Wait(B_ENTRY_MOVED).FindString("name"), "renamed");
	std::filesystem::remove(fFolder / "renamed");
	EXPECT_EQ(fListener->Wait(B_ENTRY_REMOVED).what, (uint32)B_NODE_MONITOR);
}


TEST_F(NodeMonitorTest, FileTellsOfItsNameHoweverManyOthersWereLookedAt)
{
	const std::string other = fFolder.Write("other");
	node_ref otherNode;
	ASSERT_EQ(BEntry(other.c_str()).GetNodeRef(&otherNode), B_OK);
	ASSERT_EQ(Watch(fFolder.Write("file"), B_WATCH_NAME), B_OK);

	fFolder.Make("many");
	for (int i = 0; i < 2001; i++) {
		const std::string path = fFolder.Write("many/" + std::to_string(i));
		node_ref node;
		ASSERT_EQ(BEntry(path.c_str()).GetNodeRef(&node), B_OK);
	}
	// One that nobody cares for is forgotten: programs that save for days look at as many.
	EXPECT_EQ(watch_node(&otherNode, B_WATCH_NAME, fTarget), B_ENTRY_NOT_FOUND);
	ASSERT_EQ(Watch(other, B_WATCH_NAME), B_OK);

	std::filesystem::rename(fFolder / "file", fFolder / "renamed");
	EXPECT_STREQ(fListener->Wait(B_ENTRY_MOVED).FindString("name"), "renamed");
}


TEST_F(NodeMonitorTest, FileTellsOfItsAttributes)
{
	const std::string path = fFolder.Write("file");
	if (setxattr(path.c_str(), "user.probe", "", 0, 0) != 0)
		GTEST_SKIP() << "the temporary folder has no extended attributes";
	ASSERT_EQ(Watch(path, B_WATCH_ATTR), B_OK);
	BNode(path.c_str()).WriteAttr("a", 'RAWT', 0, "x", 1);
	EXPECT_EQ(fListener->Wait(B_ATTR_CHANGED).what, (uint32)B_NODE_MONITOR);
}


TEST_F(NodeMonitorTest, StoppedNodeIsSilent)
{
	fFolder.Make("one");
	fFolder.Make("two");
	node_ref node;
	BEntry((fFolder / "one").c_str()).GetNodeRef(&node);
	ASSERT_EQ(watch_node(&node, B_WATCH_DIRECTORY, fTarget), B_OK);
	ASSERT_EQ(Watch(fFolder / "two", B_WATCH_DIRECTORY), B_OK);
	ASSERT_EQ(watch_node(&node, B_STOP_WATCHING, fTarget), B_OK);
	fFolder.Write("one/silent");
	fFolder.Write("two/loud");
	EXPECT_STREQ(fListener->Wait(B_ENTRY_CREATED).FindString("name"), "loud");
}


TEST_F(NodeMonitorTest, WhatCannotBeWatchedIsRefused)
{
	const node_ref unknown(0xfffffff0, 1);
	EXPECT_EQ(watch_node(&unknown, B_WATCH_STAT, fTarget), B_ENTRY_NOT_FOUND);
	EXPECT_EQ(watch_node(nullptr, B_WATCH_STAT, fTarget), B_BAD_VALUE);
	EXPECT_EQ(watch_node(&unknown, B_WATCH_STAT, BMessenger()), B_BAD_VALUE);
	EXPECT_EQ(watch_volume(1, B_WATCH_ALL, fTarget), B_NOT_SUPPORTED);
	EXPECT_EQ(watch_volume(1, B_WATCH_MOUNT, fTarget), B_OK);
}

// SPDX-License-Identifier: MIT
// BMessageQueue: first in, first out.

#include <MessageQueue.h>

#include <thread>

#include <gtest/gtest.h>

#include <Message.h>


TEST(MessageQueueTest, GivesMessagesInTheOrderOfAdding)
{
	BMessageQueue queue;
	EXPECT_TRUE(queue.IsEmpty());
	EXPECT_EQ(queue.NextMessage(), nullptr);
	for (uint32 what = 1; what <= 3; what++)
		queue.AddMessage(new BMessage(what));
	EXPECT_EQ(queue.CountMessages(), 3);
	for (uint32 what = 1; what <= 3; what++) {
		BMessage* message = queue.NextMessage();
		ASSERT_NE(message, nullptr);
		EXPECT_EQ(message->what, what);
		delete message;
	}
	EXPECT_TRUE(queue.IsEmpty());
}


TEST(MessageQueueTest, FindsByIndexAndByCode)
{
	BMessageQueue queue;
	for (uint32 what : {5, 6, 5})
		queue.AddMessage(new BMessage(what));
	EXPECT_EQ(queue.FindMessage(int32(1))->what, 6u);
	EXPECT_EQ(queue.FindMessage(int32(3)), nullptr);
	EXPECT_EQ(queue.FindMessage(int32(-1)), nullptr);
	EXPECT_EQ(queue.FindMessage(uint32(5), 1), queue.FindMessage(int32(2)));
	EXPECT_EQ(queue.FindMessage(uint32(5), 2), nullptr);
	EXPECT_TRUE(queue.IsNextMessage(queue.FindMessage(int32(0))));
	EXPECT_FALSE(queue.IsNextMessage(queue.FindMessage(int32(1))));
}


TEST(MessageQueueTest, ARemovedMessageIsTheCallers)
{
	BMessageQueue queue;
	BMessage stranger(9);
	BMessage* message = new BMessage(1);
	queue.AddMessage(message);
	queue.RemoveMessage(&stranger);
	EXPECT_EQ(queue.CountMessages(), 1);
	queue.RemoveMessage(message);
	EXPECT_TRUE(queue.IsEmpty());
	delete message;
}


TEST(MessageQueueTest, ItsLockIsRecursiveAndOneThreads)
{
	BMessageQueue queue;
	EXPECT_FALSE(queue.IsLocked());
	queue.Unlock();
	EXPECT_TRUE(queue.Lock());
	EXPECT_TRUE(queue.Lock());
	queue.AddMessage(new BMessage(1));
	queue.Unlock();
	EXPECT_TRUE(queue.IsLocked());
	std::thread([&] { EXPECT_FALSE(queue.IsLocked()); }).join();
	queue.Unlock();
	EXPECT_FALSE(queue.IsLocked());
}

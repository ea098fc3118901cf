// SPDX-License-Identifier: MIT
// BMessageRunner: how often, how many, until when.

#include <MessageRunner.h>

#include <gtest/gtest.h>

#include <Message.h>

#include "Recorder.h"

static constexpr bigtime_t kInterval = 5000;


class MessageRunnerTest : public testing::Test {
protected:
	MessageRunnerTest() { looper->Run(); }
	~MessageRunnerTest() override { QuitLooper(looper); }

	RecordingLooper* looper = new RecordingLooper;
	BMessenger target{looper};
	BMessage message{uint32(7)};
};


TEST_F(MessageRunnerTest, SendsAsManyAsWereAskedFor)
{
	bigtime_t start = system_time();
	BMessageRunner runner(target, &message, kInterval, 3);
	ASSERT_EQ(runner.InitCheck(), B_OK);
	ASSERT_TRUE(looper->record.Wait(3));
	EXPECT_GE(system_time() - start, 3 * kInterval);

	// When it has sent all there is nothing left to change.
	while (runner.GetInfo(NULL, NULL) == B_OK)
		snooze(500);
	EXPECT_EQ(runner.SetCount(5), B_BAD_VALUE);
	EXPECT_EQ(runner.SetInterval(kInterval), B_BAD_VALUE);
	EXPECT_EQ(looper->record.Codes(), (std::vector<uint32>{7, 7, 7}));
}


TEST_F(MessageRunnerTest, SendsForEverUntilItIsDeleted)
{
	BMessageRunner* runner = new BMessageRunner(target, message, kInterval);
	ASSERT_TRUE(looper->record.Wait(5));
	bigtime_t interval;
	int32 count;
	EXPECT_EQ(runner->GetInfo(&interval, &count), B_OK);
	EXPECT_EQ(interval, kInterval);
	EXPECT_EQ(count, -1);
	delete runner;

	// What was sent before the deletion is in the queue ahead of the question.
	BMessage reply;
	target.SendMessage(1, &reply);
	size_t received = looper->record.Codes().size();
	snooze(10 * kInterval);
	EXPECT_EQ(looper->record.Codes().size(), received);
}


TEST_F(MessageRunnerTest, InfoTellsWhatIsLeftAndCanBeChanged)
{
	BMessageRunner runner(target, &message, 3600 * 1000000LL, 4);
	bigtime_t interval;
	int32 count;
	ASSERT_EQ(runner.GetInfo(&interval, &count), B_OK);
	EXPECT_EQ(count, 4);
	EXPECT_EQ(runner.SetCount(2), B_OK);
	EXPECT_EQ(runner.SetInterval(kInterval), B_OK);
	EXPECT_TRUE(looper->record.Wait(2));
}


TEST_F(MessageRunnerTest, RefusesWhatMakesNoSense)
{
	EXPECT_EQ(
		BMessageRunner(target, static_cast<BMessage*>(NULL), kInterval).InitCheck(), B_BAD_VALUE);
	EXPECT_EQ(BMessageRunner(target, &message, 0).InitCheck(), B_BAD_VALUE);
	EXPECT_EQ(BMessageRunner(target, &message, -1).InitCheck(), B_BAD_VALUE);
	EXPECT_EQ(BMessageRunner(target, &message, kInterval, 0).InitCheck(), B_ERROR);
	EXPECT_EQ(BMessageRunner(BMessenger(), &message, kInterval).InitCheck(), B_BAD_VALUE);
	EXPECT_EQ(BMessageRunner::StartSending(target, NULL, kInterval, 1), B_BAD_VALUE);
}


TEST_F(MessageRunnerTest, StopsWhenItsTargetHasGone)
{
	RecordingLooper* mortal = new RecordingLooper;
	mortal->Run();
	BMessageRunner runner(BMessenger(mortal), &message, kInterval);
	ASSERT_TRUE(mortal->record.Wait());
	QuitLooper(mortal);
	bigtime_t end = system_time() + kLimit;
	while (runner.GetInfo(NULL, NULL) == B_OK && system_time() < end)
		snooze(500);
	EXPECT_EQ(runner.GetInfo(NULL, NULL), B_BAD_VALUE);
}


TEST_F(MessageRunnerTest, StartSendingNeedsNoRunnerAndRepliesGoWhereTheyAreAskedFor)
{
	RecordingLooper* replies = new RecordingLooper;
	replies->Run();
	looper->Lock();
	looper->hook = [](BMessage* received) { received->SendReply(8); };
	looper->Unlock();
	EXPECT_EQ(
		BMessageRunner::StartSending(target, &message, kInterval, 2, BMessenger(replies)), B_OK);
	EXPECT_TRUE(replies->record.Wait(2));
	EXPECT_EQ(replies->record.Codes(), (std::vector<uint32>{8, 8}));
	QuitLooper(replies);
}

// SPDX-License-Identifier: MIT
// BHandler: names, chains, observers.

#include <Handler.h>

#include <atomic>

#include <gtest/gtest.h>

#include <Messenger.h>

#include "Recorder.h"


TEST(HandlerTest, ItsNameIsCopiedAndMayBeNull)
{
	char name[] = "first";
	BHandler handler(name);
	name[0] = 'F';
	EXPECT_STREQ(handler.Name(), "first");
	handler.SetName("second");
	EXPECT_STREQ(handler.Name(), "second");
	handler.SetName(handler.Name());
	EXPECT_STREQ(handler.Name(), "second");
	handler.SetName(NULL);
	EXPECT_EQ(handler.Name(), nullptr);
}


TEST(HandlerTest, HasNoLooperAndNoNextHandlerAtFirst)
{
	BHandler handler;
	BHandler other;
	EXPECT_EQ(handler.Looper(), nullptr);
	EXPECT_EQ(handler.NextHandler(), nullptr);
	handler.SetNextHandler(&other);
	EXPECT_EQ(handler.NextHandler(), nullptr);
}


TEST(HandlerTest, TheNextHandlerIsOneOfTheSameLooper)
{
	BLooper* looper = new BLooper;
	BHandler handler;
	BHandler inside;
	BHandler outside;
	looper->AddHandler(&handler);
	looper->AddHandler(&inside);
	handler.SetNextHandler(&outside);
	EXPECT_EQ(handler.NextHandler(), looper);
	handler.SetNextHandler(&inside);
	EXPECT_EQ(handler.NextHandler(), &inside);
	handler.SetNextHandler(NULL);
	EXPECT_EQ(handler.NextHandler(), nullptr);
	looper->Quit();
}


/// A looper with a subject and an observer that keeps the notices it gets.
class ObserverTest : public testing::Test {
protected:
	ObserverTest()
	{
		looper->AddHandler(&subject);
		looper->AddHandler(&observer);
		observer.hook = [this](BMessage* message) {
			changes.push_back(message->FindInt32(B_OBSERVE_WHAT_CHANGE));
			original = message->FindInt32(B_OBSERVE_ORIGINAL_WHAT);
			value = message->FindInt32("value");
		};
	}
	~ObserverTest() override { QuitLooper(looper); }

	/// Lets the looper deliver what was sent; then nothing more comes.
	void Deliver()
	{
		looper->Run();
		BMessage reply;
		BMessenger(looper).SendMessage('sync', &reply);
		looper->Lock();
	}

	RecordingLooper* looper = new RecordingLooper;
	BHandler subject;
	RecordingHandler observer;
	std::vector<int32> changes;
	int32 original = 0;
	int32 value = 0;
};


TEST_F(ObserverTest, GetsTheChangeItWatchesWithTheOriginalMessage)
{
	EXPECT_FALSE(subject.IsWatched());
	EXPECT_EQ(subject.StartWatching(&observer, 5), B_OK);
	EXPECT_TRUE(subject.IsWatched());

	BMessage notice('orig');
	notice.AddInt32("value", 17);
	subject.SendNotices(5, &notice);
	subject.SendNotices(6, &notice);
	Deliver();
	EXPECT_EQ(observer.record.Codes(), (std::vector<uint32>{B_OBSERVER_NOTICE_CHANGE}));
	EXPECT_EQ(changes, (std::vector<int32>{5}));
	EXPECT_EQ(original, int32('orig'));
	EXPECT_EQ(value, 17);
}


TEST_F(ObserverTest, OfEverythingGetsEachChange)
{
	EXPECT_EQ(subject.StartWatchingAll(BMessenger(&observer)), B_OK);
	subject.SendNotices(5);
	subject.SendNotices(6);
	Deliver();
	EXPECT_EQ(changes, (std::vector<int32>{5, 6}));
}


TEST_F(ObserverTest, GetsNothingAfterStopping)
{
	subject.StartWatching(&observer, 5);
	subject.StartWatchingAll(&observer);
	EXPECT_EQ(subject.StopWatching(&observer, 5), B_OK);
	EXPECT_EQ(subject.StopWatching(&observer, 5), B_BAD_HANDLER);
	EXPECT_EQ(subject.StopWatchingAll(&observer), B_OK);
	EXPECT_FALSE(subject.IsWatched());
	subject.SendNotices(5);
	Deliver();
	EXPECT_TRUE(changes.empty());
}


TEST_F(ObserverTest, MayJoinALooperAfterItBeganToWatch)
{
	RecordingHandler late;
	EXPECT_EQ(subject.StartWatching(&late, 5), B_OK);
	subject.SendNotices(5);
	looper->AddHandler(&late);
	subject.SendNotices(5);
	Deliver();
	EXPECT_EQ(late.record.Codes().size(), 1u);
	looper->RemoveHandler(&late);
}


TEST_F(ObserverTest, ThatHasGoneIsLeftOut)
{
	{
		BHandler gone;
		looper->AddHandler(&gone);
		subject.StartWatching(&gone, 5);
	}
	subject.StartWatching(&observer, 5);
	subject.SendNotices(5);
	Deliver();
	EXPECT_EQ(changes, (std::vector<int32>{5}));
}


TEST_F(ObserverTest, MustExist)
{
	EXPECT_EQ(subject.StartWatching(static_cast<BHandler*>(NULL), 5), B_BAD_VALUE);
	EXPECT_EQ(subject.StartWatching(BMessenger(), 5), B_BAD_HANDLER);
	EXPECT_FALSE(subject.IsWatched());
}

// SPDX-License-Identifier: MIT
// The lock of BLooper, also of one that goes while it is waited for.

#include <Looper.h>

#include <atomic>
#include <thread>
#include <vector>

#include <gtest/gtest.h>

#include <Messenger.h>

#include "Recorder.h"

/// A running looper whose thread is held in a message until Release().
class BusyLooper {
public:
	BusyLooper()
	{
		fLooper->gone = &gone;
		fLooper->hook = [this](BMessage*) {
			fBusy.Raise();
			fRelease.Wait();
		};
		fLooper->Run();
		fLooper->PostMessage(1);
		fBusy.Wait();
	}

	BLooper* Get() { return fLooper; }
	void Release() { fRelease.Raise(); }

	Signal gone;

private:
	Signal fBusy;
	Signal fRelease;
	RecordingLooper* fLooper = new RecordingLooper("busy");
};


TEST(LooperLockTest, IsRecursive)
{
	BLooper* looper = new BLooper;
	EXPECT_TRUE(looper->Lock());
	EXPECT_EQ(looper->CountLocks(), 2);
	looper->Unlock();
	EXPECT_TRUE(looper->IsLocked());
	looper->Unlock();
	EXPECT_FALSE(looper->IsLocked());
	looper->Unlock();
	EXPECT_TRUE(looper->Lock());
	looper->Quit();
}


TEST(LooperLockTest, ATimeoutEndsTheWaitForABusyLooper)
{
	BusyLooper busy;
	EXPECT_EQ(busy.Get()->LockWithTimeout(0), B_WOULD_BLOCK);
	bigtime_t start = system_time();
	EXPECT_EQ(busy.Get()->LockWithTimeout(20000), B_TIMED_OUT);
	EXPECT_GE(system_time() - start, 20000);
	EXPECT_EQ(BMessenger(busy.Get()).LockTargetWithTimeout(1000), B_TIMED_OUT);
	EXPECT_EQ(busy.Get()->LockLooperWithTimeout(1000), B_TIMED_OUT);
	EXPECT_FALSE(busy.Get()->IsLocked());

	busy.Release();
	EXPECT_EQ(busy.Get()->LockWithTimeout(kLimit), B_OK);
	busy.Get()->Quit();
}


TEST(LooperLockTest, WaitersFailWhenTheLooperQuits)
{
	Signal gone;
	Signal start;
	RecordingLooper* looper = new RecordingLooper;
	looper->gone = &gone;
	looper->hook = [&](BMessage*) {
		start.Raise();
		while (looper->CountLockRequests() < 4)
			snooze(1000);
		looper->Quit();
	};
	looper->Run();
	BMessenger messenger(looper);
	messenger.SendMessage(1);
	ASSERT_TRUE(start.Wait());

	std::atomic<int32> failed(0);
	std::vector<std::thread> threads;
	threads.emplace_back([&] { failed += looper->Lock() ? 0 : 1; });
	threads.emplace_back([&] { failed += messenger.LockTarget() ? 0 : 1; });
	threads.emplace_back([&] { failed += looper->LockWithTimeout(kLimit) == B_BAD_VALUE ? 1 : 0; });
	for (std::thread& thread : threads)
		thread.join();
	EXPECT_EQ(failed, 3);
	EXPECT_EQ(gone.Count(), 1);
}


TEST(LooperLockTest, ADeletedLooperDoesNotLock)
{
	BLooper* looper = new BLooper;
	BMessenger messenger(looper);
	looper->Quit();
	EXPECT_FALSE(looper->Lock());
	EXPECT_FALSE(looper->IsLocked());
	EXPECT_EQ(looper->LockWithTimeout(1000), B_BAD_VALUE);
	EXPECT_FALSE(messenger.LockTarget());
	EXPECT_EQ(messenger.LockTargetWithTimeout(1000), B_BAD_VALUE);
	looper->Unlock();
}


TEST(LooperLockTest, NothingCanBePostedToADeletedLooper)
{
	BLooper* looper = new BLooper;
	BHandler handler;
	BMessage message(1);
	looper->Quit();
	EXPECT_EQ(looper->PostMessage(1), B_BAD_PORT_ID);
	EXPECT_EQ(looper->PostMessage(&message), B_BAD_PORT_ID);
	EXPECT_EQ(looper->PostMessage(&message, &handler), B_BAD_PORT_ID);
	EXPECT_EQ(looper->PostMessage(1, NULL), B_BAD_PORT_ID);
}


TEST(LooperLockTest, AnotherThreadDoesNotHoldTheCreatorsLock)
{
	BLooper* looper = new BLooper;
	std::thread([&] {
		EXPECT_FALSE(looper->IsLocked());
		EXPECT_EQ(looper->LockWithTimeout(0), B_WOULD_BLOCK);
		looper->Unlock();
	}).join();
	EXPECT_TRUE(looper->IsLocked());
	looper->Quit();
}


TEST(LooperLockTest, ABusyLoopDoesNotKeepOthersFromTheLock)
{
	RecordingLooper* looper = new RecordingLooper;
	looper->hook = [&](BMessage*) { looper->PostMessage(1); };
	looper->PostMessage(1);
	looper->Run();
	for (int32 i = 0; i < 100; i++) {
		ASSERT_EQ(looper->LockWithTimeout(kLimit), B_OK);
		looper->Unlock();
	}
	QuitLooper(looper);
}


TEST(LooperLockTest, AHandlerLocksTheLooperThatItBelongsTo)
{
	BHandler handler;
	EXPECT_FALSE(handler.LockLooper());

	BLooper* looper = new BLooper;
	looper->AddHandler(&handler);
	EXPECT_TRUE(handler.LockLooper());
	EXPECT_EQ(looper->CountLocks(), 2);
	handler.UnlockLooper();
	EXPECT_EQ(looper->CountLocks(), 1);
	looper->RemoveHandler(&handler);
	looper->Quit();
}


TEST(LooperLockTest, AHandlerThatMovesWhileItsLooperIsWaitedForIsAMismatch)
{
	BHandler handler;
	BLooper* looper = new BLooper;
	looper->AddHandler(&handler);
	std::atomic<status_t> status(B_OK);
	std::thread waiter([&] { status = handler.LockLooperWithTimeout(kLimit); });
	while (looper->CountLockRequests() < 2)
		snooze(1000);
	looper->RemoveHandler(&handler);
	looper->Unlock();
	waiter.join();
	EXPECT_EQ(status, B_MISMATCHED_VALUES);
	QuitLooper(looper);
}

// SPDX-License-Identifier: MIT
// Many loopers at once: posting, locking, asking and quitting.

#include <atomic>
#include <thread>
#include <vector>

#include <time.h>

#include <gtest/gtest.h>

#include <Looper.h>
#include <Message.h>
#include <Messenger.h>

#include "Recorder.h"

static constexpr int32 kLoopers = 8;
static constexpr int32 kRounds = 200;


TEST(LooperStressTest, EightLoopersPostToAndLockEachOther)
{
	std::atomic<int32> handled(0);
	std::atomic<int32> locked(0);
	Signal done;
	std::vector<RecordingLooper*> loopers;
	for (int32 i = 0; i < kLoopers; i++)
		loopers.push_back(new RecordingLooper("stress"));

	for (int32 i = 0; i < kLoopers; i++) {
		RecordingLooper* self = loopers[i];
		RecordingLooper* next = loopers[(i + 1) % kLoopers];
		self->hook = [&, self, next](BMessage* message) {
			handled++;
			// The own lock is given up first: two locks at once could wait for each other.
			self->Unlock();
			if (next->Lock()) {
				locked++;
				next->Unlock();
			}
			self->Lock();
			int32 left = message->FindInt32("left");
			BMessage onward(message->what);
			onward.AddInt32("left", left - 1);
			if (left == 0 || next->PostMessage(&onward) != B_OK)
				done.Raise();
		};
	}
	for (RecordingLooper* looper : loopers)
		looper->Run();
	for (RecordingLooper* looper : loopers) {
		BMessage first(1);
		first.AddInt32("left", kRounds);
		looper->PostMessage(&first);
	}

	EXPECT_TRUE(done.Wait(kLoopers));
	for (RecordingLooper* looper : loopers)
		QuitLooper(looper);
	EXPECT_EQ(handled, kLoopers * (kRounds + 1));
	EXPECT_EQ(locked, handled);
}


TEST(LooperStressTest, LoopersMayQuitWhileOthersPostLockAndAsk)
{
	static constexpr int32 kWorkers = 4;
	for (int32 round = 0; round < 50; round++) {
		RecordingLooper* looper = new RecordingLooper("short-lived");
		BMessenger messenger(looper);
		looper->Run();
		std::atomic<bool> stop(false);
		std::atomic<int32> wrong(0);
		std::vector<std::thread> workers;
		for (int32 i = 0; i < kWorkers; i++) {
			workers.emplace_back([&, i] {
				while (!stop) {
					BMessage reply;
					status_t status = B_OK;
					switch (i) {
						case 0:
							status = messenger.SendMessage(1);
							break;
						case 1:
							if (messenger.LockTarget())
								looper->Unlock();
							break;
						case 2:
							status = messenger.SendMessage(2, &reply);
							break;
						default:
							if (looper->LockWithTimeout(100) == B_OK)
								looper->Unlock();
							break;
					}
					if (status != B_OK && status != B_BAD_PORT_ID)
						wrong++;
				}
			});
		}
		if (round % 2 == 0)
			QuitLooper(looper);
		else
			messenger.SendMessage(B_QUIT_REQUESTED);
		while (messenger.IsValid())
			snooze(500);
		stop = true;
		for (std::thread& worker : workers)
			worker.join();
		EXPECT_EQ(wrong, 0);
	}
}


TEST(LooperStressTest, IdleLoopersUseNoProcessorTime)
{
	std::vector<RecordingLooper*> loopers;
	for (int32 i = 0; i < kLoopers; i++) {
		loopers.push_back(new RecordingLooper("idle"));
		loopers.back()->PostMessage(1);
		loopers.back()->Run();
	}
	for (RecordingLooper* looper : loopers)
		ASSERT_TRUE(looper->record.Wait());

	// On a busy machine the loopers may come to rest late, but they have to.
	double used = 1;
	for (int32 i = 0; i < 50 && used > 0.02; i++) {
		timespec before;
		timespec after;
		clock_gettime(CLOCK_PROCESS_CPUTIME_ID, &before);
		snooze(200000);
		clock_gettime(CLOCK_PROCESS_CPUTIME_ID, &after);
		used = (after.tv_sec - before.tv_sec) + (after.tv_nsec - before.tv_nsec) * 1e-9;
	}
	EXPECT_LT(used, 0.02);
	for (RecordingLooper* looper : loopers)
		QuitLooper(looper);
}

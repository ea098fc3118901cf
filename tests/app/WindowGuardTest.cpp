// SPDX-License-Identifier: MIT

#include "app/WindowGuard.h"

#include <atomic>

#include <gtest/gtest.h>

#include <Application.h>
#include <Autolock.h>
#include <Looper.h>
#include <Message.h>
#include <Messenger.h>
#include <OS.h>
#include <Window.h>

extern "C" int32 be_count_lock_violations();

namespace {

constexpr uint32 kMsgReach = 'rech';
constexpr bigtime_t kLimit = 60 * 1000000;

/// A window that reaches for another one, and counts what the other does to it.
class ReachingWindow : public BWindow {
public:
	explicit ReachingWindow(const char* name)
		: BWindow(BRect(0, 0, 99, 99), name, B_TITLED_WINDOW, 0)
	{
	}

	void MessageReceived(BMessage* message) override
	{
		if (message->what != kMsgReach) {
			BWindow::MessageReceived(message);
			return;
		}
		{
			WindowGuard guard(other);
			if (guard.IsLocked()) {
				other->touched++;
				heldTwo |= IsLocked();
				// And back, as one who is told of a change asks the teller.
				WindowGuard back(this);
				if (back.IsLocked())
					touched++;
				heldTwo |= other->IsLocked();
			}
			lost |= !guard.IsLocked();
		}
		lost |= !IsLocked();
		reached++;
	}

	ReachingWindow* other = nullptr;
	// Each is protected by this window's lock.
	int32 touched = 0;
	bool heldTwo = false;
	bool lost = false;
	std::atomic<int32> reached = 0;
};


class WindowGuardTest : public testing::Test {
protected:
	BApplication application{"application/x-qtx.WindowGuardTest"};
};


void
Close(BWindow* window)
{
	ASSERT_TRUE(window->Lock());
	window->Quit();
}

} // namespace

TEST_F(WindowGuardTest, LocksATargetAndReleasesIt)
{
	BLooper* looper = new BLooper("target");
	looper->Run();
	{
		WindowGuard guard(looper);
		EXPECT_TRUE(guard.IsLocked());
		EXPECT_TRUE(looper->IsLocked());
	}
	EXPECT_FALSE(looper->IsLocked());
	looper->Lock();
	looper->Quit();
}


TEST_F(WindowGuardTest, IsNotLockedWithoutATarget)
{
	WindowGuard guard(nullptr);
	EXPECT_FALSE(guard.IsLocked());
}


TEST_F(WindowGuardTest, IsNotLockedWhenTheTargetIsGone)
{
	BLooper* looper = new BLooper("target");
	looper->Run();
	looper->Lock();
	looper->Quit();
	WindowGuard guard(looper);
	EXPECT_FALSE(guard.IsLocked());
}


TEST_F(WindowGuardTest, SurvivesATargetThatQuitsInsideTheBlock)
{
	BLooper* looper = new BLooper("target");
	looper->Run();
	WindowGuard guard(looper);
	ASSERT_TRUE(guard.IsLocked());
	looper->Quit();
}


TEST_F(WindowGuardTest, GivesUpWaitingInTime)
{
	BLooper* busy = new BLooper("busy");
	busy->Run();
	ASSERT_TRUE(busy->Lock());
	std::atomic<int32> result = -1;
	struct job {
		BLooper* looper;
		std::atomic<int32>* result;
	} work = {busy, &result};
	thread_id thread = spawn_thread(
		[](void* data) -> int32 {
			job* work = static_cast<job*>(data);
			WindowGuard guard(work->looper, 1000);
			*work->result = guard.IsLocked() ? 1 : 0;
			return 0;
		},
		"waiter", B_NORMAL_PRIORITY, &work);
	resume_thread(thread);
	int32 status;
	wait_for_thread(thread, &status);
	EXPECT_EQ(result, 0);
	busy->Quit();
}


TEST_F(WindowGuardTest, GivesUpAllLevelsOfTheThreadsOwnLockAndTakesThemBack)
{
	class Owner : public BLooper {
	public:
		void MessageReceived(BMessage*) override
		{
			Lock();
			Lock();
			{
				WindowGuard guard(target);
				gaveUp = guard.IsLocked() && !IsLocked();
			}
			levelsAfter = CountLocks();
			Unlock();
			Unlock();
		}
		BLooper* target = nullptr;
		bool gaveUp = false;
		int32 levelsAfter = 0;
	};
	Owner* owner = new Owner;
	BLooper* target = new BLooper("target");
	target->Run();
	owner->target = target;
	owner->Run();
	BMessage reply;
	BMessage message('test');
	BMessenger(owner).SendMessage(&message, &reply, kLimit, kLimit);

	ASSERT_TRUE(owner->Lock());
	EXPECT_TRUE(owner->gaveUp);
	EXPECT_EQ(owner->levelsAfter, 3);
	owner->Quit();
	target->Lock();
	target->Quit();
}


TEST_F(WindowGuardTest, KeepsALockThatTheThreadHasAlready)
{
	BLooper* looper = new BLooper("target");
	looper->Run();
	WindowGuard outer(looper);
	{
		WindowGuard inner(looper);
		EXPECT_TRUE(inner.IsLocked());
		EXPECT_EQ(looper->CountLocks(), 1);
	}
	EXPECT_TRUE(looper->IsLocked());
	EXPECT_EQ(looper->CountLocks(), 1);
}


TEST_F(WindowGuardTest, NestedGuardsHoldOneLockAtATime)
{
	BLooper* first = new BLooper("first");
	BLooper* second = new BLooper("second");
	first->Run();
	second->Run();
	{
		WindowGuard outer(first);
		{
			WindowGuard inner(second);
			EXPECT_TRUE(second->IsLocked());
			EXPECT_FALSE(first->IsLocked());
			{
				WindowGuard innermost(first);
				EXPECT_TRUE(first->IsLocked());
				EXPECT_FALSE(second->IsLocked());
			}
			EXPECT_TRUE(second->IsLocked());
		}
		EXPECT_TRUE(first->IsLocked());
		EXPECT_FALSE(second->IsLocked());
	}
	for (BLooper* looper : {first, second}) {
		looper->Lock();
		looper->Quit();
	}
}


TEST_F(WindowGuardTest, TwoWindowsReachForEachOtherThousandsOfTimes)
{
	constexpr int32 kTimes = 5000;
	const int32 violations = be_count_lock_violations();
	ReachingWindow* left = new ReachingWindow("left");
	ReachingWindow* right = new ReachingWindow("right");
	left->other = right;
	right->other = left;
	left->Show();
	right->Show();

	const bigtime_t deadline = system_time() + kLimit;
	for (int32 i = 0; i < kTimes; i++) {
		while ((left->reached < i - 50 || right->reached < i - 50) && system_time() < deadline)
			snooze(100);
		left->PostMessage(kMsgReach);
		right->PostMessage(kMsgReach);
	}
	while ((left->reached < kTimes || right->reached < kTimes) && system_time() < deadline)
		snooze(1000);
	ASSERT_EQ(left->reached, kTimes);
	ASSERT_EQ(right->reached, kTimes);

	for (ReachingWindow* window : {left, right}) {
		ASSERT_TRUE(window->Lock());
		EXPECT_EQ(window->touched, 2 * kTimes);
		EXPECT_FALSE(window->heldTwo);
		EXPECT_FALSE(window->lost);
		window->Unlock();
	}
	EXPECT_EQ(be_count_lock_violations(), violations);
	Close(left);
	Close(right);
}


TEST_F(WindowGuardTest, AReleaseGivesUpTheLockOfTheGuardAroundIt)
{
	BLooper* looper = new BLooper("target");
	looper->Run();
	{
		WindowGuard guard(looper);
		BAutolock again(looper);
		{
			WindowRelease release;
			EXPECT_FALSE(looper->IsLocked());
			WindowGuard inside(looper);
			EXPECT_TRUE(inside.IsLocked());
			EXPECT_EQ(looper->CountLocks(), 1);
		}
		EXPECT_EQ(looper->CountLocks(), 2);
	}
	EXPECT_FALSE(looper->IsLocked());
	looper->Lock();
	looper->Quit();
}


TEST_F(WindowGuardTest, AReleaseGivesUpTheLockOfTheWindowWhoseThreadItIs)
{
	class WaitingLooper : public BLooper {
	public:
		void MessageReceived(BMessage* message) override
		{
			WindowRelease release;
			wasFree = !IsLocked();
			BMessage reply;
			BMessenger(other).SendMessage(message, &reply);
		}
		BLooper* other = nullptr;
		bool wasFree = false;
	};
	class LockingLooper : public BLooper {
	public:
		void MessageReceived(BMessage* message) override
		{
			WindowGuard guard(other);
			reached = guard.IsLocked();
			message->SendReply(kMsgReach);
		}
		BLooper* other = nullptr;
		bool reached = false;
	};

	// The one that answers needs the lock of the one that waits.
	WaitingLooper* waiting = new WaitingLooper;
	LockingLooper* locking = new LockingLooper;
	waiting->other = locking;
	locking->other = waiting;
	waiting->Run();
	locking->Run();
	BMessage reply;
	BMessenger(waiting).SendMessage(kMsgReach, &reply);
	ASSERT_TRUE(waiting->Lock());
	EXPECT_TRUE(waiting->wasFree);
	waiting->Quit();
	ASSERT_TRUE(locking->Lock());
	EXPECT_TRUE(locking->reached);
	locking->Quit();
}


TEST_F(WindowGuardTest, AReleaseWithoutALockDoesNothing)
{
	BLooper* looper = new BLooper("target");
	looper->Run();
	{
		WindowRelease release;
		WindowGuard guard(looper);
		EXPECT_TRUE(guard.IsLocked());
	}
	EXPECT_FALSE(looper->IsLocked());
	looper->Lock();
	looper->Quit();
}

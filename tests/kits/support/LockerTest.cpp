// SPDX-License-Identifier: MIT
// BLocker and BAutolock, with one thread and with several.

#include <Autolock.h>
#include <Locker.h>

#include <memory>
#include <vector>

#include <gtest/gtest.h>

namespace {

/// Runs a function in a thread of its own and waits for its result.
template <typename Function>
status_t
in_thread(Function function)
{
	thread_id thread = spawn_thread(
		[](void* data) { return static_cast<status_t>((*static_cast<Function*>(data))()); },
		"in_thread", B_NORMAL_PRIORITY, &function);
	status_t result = B_ERROR;
	EXPECT_EQ(wait_for_thread(thread, &result), B_OK);
	return result;
}


class LockerTest : public testing::TestWithParam<bool> {};

INSTANTIATE_TEST_SUITE_P(Styles, LockerTest, testing::Bool());


TEST_P(LockerTest, IsRecursive)
{
	BLocker locker("test", GetParam());
	EXPECT_EQ(locker.InitCheck(), B_OK);
	EXPECT_FALSE(locker.IsLocked());
	EXPECT_LT(locker.LockingThread(), 0);
	EXPECT_TRUE(locker.Lock());
	EXPECT_TRUE(locker.Lock());
	EXPECT_EQ(locker.CountLocks(), 2);
	EXPECT_EQ(locker.CountLockRequests(), 1);
	EXPECT_EQ(locker.LockingThread(), find_thread(nullptr));
	locker.Unlock();
	EXPECT_TRUE(locker.IsLocked());
	locker.Unlock();
	EXPECT_FALSE(locker.IsLocked());
	EXPECT_EQ(locker.CountLocks(), 0);
	EXPECT_EQ(locker.CountLockRequests(), 0);
}


TEST_P(LockerTest, KeepsOthersOut)
{
	BLocker locker("test", GetParam());
	ASSERT_TRUE(locker.Lock());
	bigtime_t start = system_time();
	EXPECT_EQ(in_thread([&] { return locker.LockWithTimeout(20000); }), B_TIMED_OUT);
	EXPECT_GE(system_time() - start, 20000);
	EXPECT_EQ(in_thread([&] { return locker.LockWithTimeout(0); }), B_TIMED_OUT);
	EXPECT_EQ(in_thread([&] { return locker.IsLocked() ? 1 : 0; }), 0);
	locker.Unlock();
	// What timed out before must not have spoilt the lock.
	for (int i = 0; i < 3; i++) {
		EXPECT_EQ(in_thread([&] {
			status_t status = locker.LockWithTimeout(5000000);
			locker.Unlock();
			return status;
		}),
			B_OK);
	}
	ASSERT_TRUE(locker.Lock());
	EXPECT_EQ(in_thread([&] { return locker.LockWithTimeout(0); }), B_TIMED_OUT);
	locker.Unlock();
}


TEST_P(LockerTest, UnlockByAnotherThreadDoesNothing)
{
	BLocker locker("test", GetParam());
	ASSERT_TRUE(locker.Lock());
	in_thread([&] {
		locker.Unlock();
		return B_OK;
	});
	EXPECT_TRUE(locker.IsLocked());
	EXPECT_EQ(locker.CountLocks(), 1);
	locker.Unlock();
	locker.Unlock();
	EXPECT_EQ(locker.CountLocks(), 0);
	EXPECT_EQ(locker.LockWithTimeout(1000), B_OK);
	locker.Unlock();
}


TEST_P(LockerTest, DeletingItWakesThoseWhoWait)
{
	auto locker = std::make_unique<BLocker>("test", GetParam());
	ASSERT_TRUE(locker->Lock());
	sem_id semaphore = locker->Sem();
	BLocker* shared = locker.get();
	struct Data {
		BLocker* locker;
	} data = {shared};
	thread_id thread = spawn_thread(
		[](void* argument) -> status_t { return static_cast<Data*>(argument)->locker->Lock(); },
		"waiter", B_NORMAL_PRIORITY, &data);
	resume_thread(thread);
	int32 count = 0;
	for (int i = 0; i < 500 && count == 0; i++) {
		snooze(2000);
		ASSERT_EQ(get_sem_count(semaphore, &count), B_OK);
	}
	ASSERT_EQ(count, -1);

	locker.reset();
	status_t locked = 1;
	EXPECT_EQ(wait_for_thread(thread, &locked), B_OK);
	EXPECT_EQ(locked, 0);
}


struct Counter {
	BLocker* locker;
	int64 value;
};


status_t
count_up(void* data)
{
	Counter* counter = static_cast<Counter*>(data);
	for (int i = 0; i < 5000; i++) {
		BAutolock lock(counter->locker);
		counter->value++;
		if (i % 512 == 0)
			snooze(10);
	}
	return B_OK;
}


TEST_P(LockerTest, NoCountIsLost)
{
	BLocker locker(GetParam());
	Counter counter = {&locker, 0};
	std::vector<thread_id> threads;
	for (int i = 0; i < 4; i++) {
		threads.push_back(spawn_thread(&count_up, "counter", B_NORMAL_PRIORITY, &counter));
		ASSERT_EQ(resume_thread(threads.back()), B_OK);
	}
	for (thread_id thread : threads)
		EXPECT_EQ(wait_for_thread(thread, nullptr), B_OK);
	EXPECT_EQ(counter.value, 20000);
	EXPECT_EQ(locker.CountLockRequests(), 0);
}


TEST(AutolockTest, LocksForItsBlock)
{
	BLocker locker;
	{
		BAutolock lock(locker);
		EXPECT_TRUE(lock.IsLocked());
		EXPECT_TRUE(locker.IsLocked());
		EXPECT_TRUE(lock.Lock());
		EXPECT_EQ(locker.CountLocks(), 1);
		lock.Unlock();
		EXPECT_FALSE(lock.IsLocked());
		EXPECT_FALSE(locker.IsLocked());
		EXPECT_TRUE(lock.Lock());
	}
	EXPECT_FALSE(locker.IsLocked());
}


TEST(AutolockTest, WithoutAnObjectItIsNotLocked)
{
	BAutolock lock(static_cast<BLocker*>(nullptr));
	EXPECT_FALSE(lock.IsLocked());
	EXPECT_FALSE(lock.Lock());
	lock.Unlock();
}

} // namespace

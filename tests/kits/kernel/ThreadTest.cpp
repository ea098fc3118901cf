// SPDX-License-Identifier: MIT
// Threads: their life, their names and results, and the data they hand each other.

#include <OS.h>

#include <string.h>
#include <unistd.h>

#include <atomic>
#include <string>
#include <thread>
#include <vector>

#include <gtest/gtest.h>

namespace {

constexpr bigtime_t kSoon = 20000;
constexpr bigtime_t kLimit = 10000000;


/// Waits with a limit until \a condition holds.
template <typename Condition>
bool
eventually(Condition condition)
{
	bigtime_t end = system_time() + kLimit;
	while (!condition()) {
		if (system_time() > end)
			return false;
		snooze(1000);
	}
	return true;
}


thread_state
state_of(thread_id thread)
{
	thread_info info;
	return get_thread_info(thread, &info) == B_OK ? info.state : thread_state(0);
}


status_t
give_number(void* data)
{
	return *static_cast<int32*>(data);
}


thread_id
start(thread_func function, void* data = nullptr, const char* name = "test")
{
	thread_id thread = spawn_thread(function, name, B_NORMAL_PRIORITY, data);
	EXPECT_GT(thread, 0);
	EXPECT_EQ(resume_thread(thread), B_OK);
	return thread;
}


status_t
result_of(thread_id thread)
{
	status_t result = -77;
	EXPECT_EQ(wait_for_thread_etc(thread, B_RELATIVE_TIMEOUT, kLimit, &result), B_OK);
	return result;
}


TEST(ThreadTest, WaitingStartsTheThreadAndGivesItsResult)
{
	int32 number = 17;
	thread_id thread = spawn_thread(&give_number, "giver", B_LOW_PRIORITY, &number);
	ASSERT_GT(thread, 0);
	status_t result = 0;
	EXPECT_EQ(wait_for_thread(thread, &result), B_OK);
	EXPECT_EQ(result, 17);
	EXPECT_EQ(wait_for_thread(thread, &result), B_BAD_THREAD_ID);
	EXPECT_EQ(wait_for_thread(-1, nullptr), B_BAD_THREAD_ID);
}


TEST(ThreadTest, TheResultCanBeFetchedLater)
{
	int32 number = 3;
	thread_id thread = start(&give_number, &number);
	ASSERT_TRUE(eventually([=] { return state_of(thread) == 0; }));
	EXPECT_EQ(result_of(thread), 3);
}


TEST(ThreadTest, IsSuspendedUntilResumed)
{
	int32 number = 1;
	thread_id thread = spawn_thread(&give_number, "sleeper", B_NORMAL_PRIORITY, &number);
	EXPECT_EQ(state_of(thread), B_THREAD_SUSPENDED);
	snooze(kSoon);
	EXPECT_EQ(state_of(thread), B_THREAD_SUSPENDED);
	EXPECT_EQ(resume_thread(thread), B_OK);
	EXPECT_EQ(result_of(thread), 1);
	EXPECT_EQ(resume_thread(thread), B_BAD_THREAD_ID);
}


TEST(ThreadTest, RefusesBadArguments)
{
	EXPECT_EQ(spawn_thread(nullptr, "none", B_NORMAL_PRIORITY, nullptr), B_BAD_VALUE);
	EXPECT_EQ(resume_thread(-1), B_BAD_THREAD_ID);
	EXPECT_EQ(suspend_thread(-1), B_BAD_THREAD_ID);
	EXPECT_EQ(kill_thread(-1), B_BAD_THREAD_ID);
	EXPECT_EQ(rename_thread(-1, "x"), B_BAD_THREAD_ID);
	EXPECT_EQ(rename_thread(find_thread(nullptr), nullptr), B_BAD_VALUE);
	EXPECT_EQ(set_thread_priority(-1, 5), B_BAD_THREAD_ID);
	EXPECT_EQ(get_thread_info(-1, nullptr), B_BAD_VALUE);
	EXPECT_EQ(on_exit_thread(nullptr, nullptr), B_BAD_VALUE);
	EXPECT_EQ(resume_thread(find_thread(nullptr)), B_BAD_THREAD_STATE);
	EXPECT_EQ(kill_thread(find_thread(nullptr)), B_NOT_ALLOWED);
	EXPECT_LT(wait_for_thread(find_thread(nullptr), nullptr), 0);
}


status_t
give_own_id(void*)
{
	return find_thread(nullptr);
}


TEST(ThreadTest, KnowsItself)
{
	EXPECT_EQ(find_thread(nullptr), getpid());
	thread_id thread = start(&give_own_id);
	EXPECT_EQ(result_of(thread), thread);
}


TEST(ThreadTest, IsFoundByItsName)
{
	int32 number = 0;
	const char* longName = "a name that has more than 31 bytes, by far";
	thread_id thread = spawn_thread(&give_number, longName, B_NORMAL_PRIORITY, &number);
	thread_info info;
	ASSERT_EQ(get_thread_info(thread, &info), B_OK);
	EXPECT_EQ(std::string(info.name), std::string(longName).substr(0, 31));
	EXPECT_EQ(find_thread(longName), thread);
	EXPECT_EQ(rename_thread(thread, "short"), B_OK);
	EXPECT_EQ(find_thread("short"), thread);
	EXPECT_EQ(find_thread(longName), B_NAME_NOT_FOUND);
	EXPECT_EQ(result_of(thread), 0);
	EXPECT_EQ(find_thread("short"), B_NAME_NOT_FOUND);
}


TEST(ThreadTest, ThePriorityFromBeforeIsGiven)
{
	int32 number = 0;
	thread_id thread = spawn_thread(&give_number, "x", B_LOW_PRIORITY, &number);
	EXPECT_EQ(set_thread_priority(thread, B_DISPLAY_PRIORITY), B_LOW_PRIORITY);
	thread_info info;
	ASSERT_EQ(get_thread_info(thread, &info), B_OK);
	EXPECT_EQ(info.priority, B_DISPLAY_PRIORITY);
	EXPECT_EQ(info.team, getpid());
	EXPECT_EQ(result_of(thread), 0);
}


std::atomic<int64> sSpins{0};


status_t
spin(void*)
{
	for (;;)
		sSpins++;
}


TEST(ThreadTest, StandsStillWhileSuspended)
{
	thread_id thread = start(&spin);
	int64 before = sSpins;
	ASSERT_TRUE(eventually([=] { return sSpins > before; }));
	EXPECT_EQ(suspend_thread(thread), B_OK);
	// It may need a moment to see it.
	int64 seen;
	do {
		seen = sSpins;
		snooze(kSoon);
	} while (sSpins != seen);
	EXPECT_EQ(state_of(thread), B_THREAD_SUSPENDED);
	EXPECT_EQ(resume_thread(thread), B_OK);
	EXPECT_TRUE(eventually([=] { return sSpins > seen; }));
	EXPECT_EQ(kill_thread(thread), B_OK);
	EXPECT_EQ(result_of(thread), B_INTERRUPTED);
}


status_t
suspend_self(void* data)
{
	suspend_thread(find_thread(nullptr));
	static_cast<std::atomic<bool>*>(data)->store(true);
	return 4;
}


TEST(ThreadTest, CanSuspendItself)
{
	std::atomic<bool> wentOn{false};
	thread_id thread = start(&suspend_self, &wentOn);
	ASSERT_TRUE(eventually([=] { return state_of(thread) == B_THREAD_SUSPENDED; }));
	snooze(kSoon);
	EXPECT_FALSE(wentOn);
	EXPECT_EQ(resume_thread(thread), B_OK);
	EXPECT_EQ(result_of(thread), 4);
	EXPECT_TRUE(wentOn);
}


status_t
sleep_long(void*)
{
	return snooze(kLimit * 10);
}


status_t
wait_for_sem(void* data)
{
	return acquire_sem(*static_cast<sem_id*>(data));
}


TEST(ThreadTest, IsKilledWhereverItIs)
{
	sem_id semaphore = create_sem(0, "never");
	const struct {
		const char* where;
		thread_func function;
		thread_state state;
	} kCases[] = {
		{"running", &spin, B_THREAD_RUNNING},
		{"asleep", &sleep_long, B_THREAD_ASLEEP},
		{"waiting", &wait_for_sem, B_THREAD_WAITING},
	};
	for (const auto& row : kCases) {
		thread_id thread = start(row.function, &semaphore);
		ASSERT_TRUE(eventually([&] { return state_of(thread) == row.state; })) << row.where;
		EXPECT_EQ(kill_thread(thread), B_OK) << row.where;
		EXPECT_EQ(result_of(thread), B_INTERRUPTED) << row.where;
	}
	int32 count = -1;
	EXPECT_EQ(get_sem_count(semaphore, &count), B_OK);
	EXPECT_EQ(count, 0);
	delete_sem(semaphore);
}


TEST(ThreadTest, IsKilledBeforeItStarted)
{
	int32 number = 0;
	thread_id thread = spawn_thread(&give_number, "x", B_NORMAL_PRIORITY, &number);
	EXPECT_EQ(kill_thread(thread), B_OK);
	EXPECT_EQ(result_of(thread), B_INTERRUPTED);
}


void
append_letter(void* data)
{
	*static_cast<std::string*>(data) += 'b';
}


status_t
exit_early(void* data)
{
	auto* text = static_cast<std::string*>(data);
	on_exit_thread(&append_letter, text);
	on_exit_thread([](void* argument) { *static_cast<std::string*>(argument) += 'a'; }, text);
	exit_thread(23);
	*text += "not reached";
	return 1;
}


TEST(ThreadTest, ExitRunsTheCallbacksLastOneFirst)
{
	std::string text;
	EXPECT_EQ(result_of(start(&exit_early, &text)), 23);
	EXPECT_EQ(text, "ab");
}


TEST(ThreadTest, ThreadsOfOthersHaveIdsToo)
{
	thread_id first = -1;
	std::string text;
	std::thread([&] {
		first = find_thread(nullptr);
		on_exit_thread(&append_letter, &text);
		EXPECT_EQ(find_thread(nullptr), first);
		EXPECT_EQ(rename_thread(first, "a guest"), B_OK);
		EXPECT_EQ(find_thread("a guest"), first);
	}).join();
	EXPECT_GT(first, 0);
	EXPECT_NE(first, find_thread(nullptr));
	EXPECT_EQ(find_thread("a guest"), B_NAME_NOT_FOUND);
	EXPECT_EQ(text, "b");
}


TEST(ThreadTest, WaitingTimesOut)
{
	thread_id thread = start(&sleep_long);
	EXPECT_EQ(wait_for_thread_etc(thread, B_RELATIVE_TIMEOUT, kSoon, nullptr), B_TIMED_OUT);
	EXPECT_EQ(wait_for_thread_etc(thread, B_RELATIVE_TIMEOUT, 0, nullptr), B_WOULD_BLOCK);
	EXPECT_EQ(wait_for_thread_etc(thread, B_ABSOLUTE_TIMEOUT, system_time() + kSoon, nullptr),
		B_TIMED_OUT);
	kill_thread(thread);
	EXPECT_EQ(result_of(thread), B_INTERRUPTED);
}


TEST(ThreadTest, SeveralCanWaitForOne)
{
	thread_id target = spawn_thread(
		[](void*) -> status_t {
			snooze(kSoon * 2);
			return 9;
		},
		"target", B_NORMAL_PRIORITY, nullptr);
	std::vector<thread_id> waiters;
	for (int i = 0; i < 3; i++) {
		waiters.push_back(start(
			[](void* data) -> status_t {
				status_t result = 0;
				status_t status = wait_for_thread(*static_cast<thread_id*>(data), &result);
				return status == B_OK ? result : status;
			},
			&target));
	}
	ASSERT_TRUE(eventually([&] {
		for (thread_id waiter : waiters) {
			if (state_of(waiter) != B_THREAD_WAITING && state_of(waiter) != 0)
				return false;
		}
		return true;
	}));
	for (thread_id waiter : waiters) {
		status_t result = result_of(waiter);
		EXPECT_TRUE(result == 9 || result == B_BAD_THREAD_ID) << result;
	}
}


TEST(ThreadTest, ThousandsComeAndGo)
{
	std::atomic<int32> count{0};
	for (int i = 0; i < 2000; i++) {
		thread_id thread = spawn_thread(
			[](void* data) -> status_t { return ++*static_cast<std::atomic<int32>*>(data); },
			"brief", B_NORMAL_PRIORITY, &count);
		ASSERT_GT(thread, 0) << i;
		ASSERT_EQ(resume_thread(thread), B_OK);
		// Every second one is never waited for.
		if (i % 2 == 0) {
			ASSERT_EQ(wait_for_thread(thread, nullptr), B_OK);
		}
	}
	EXPECT_TRUE(eventually([&] { return count == 2000; }));
}


TEST(ThreadTest, AllAreListed)
{
	thread_id thread = start(&sleep_long);
	bool self = false;
	bool other = false;
	int32 cookie = 0;
	thread_info info;
	while (get_next_thread_info(B_CURRENT_TEAM, &cookie, &info) == B_OK) {
		self |= info.thread == find_thread(nullptr);
		other |= info.thread == thread;
	}
	EXPECT_TRUE(self);
	EXPECT_TRUE(other);
	team_info team;
	ASSERT_EQ(get_team_info(B_CURRENT_TEAM, &team), B_OK);
	EXPECT_EQ(team.team, getpid());
	EXPECT_GE(team.thread_count, 2);
	EXPECT_GE(team.image_count, 2);
	EXPECT_NE(strstr(team.args, "kernel_kit_test"), nullptr) << team.args;
	EXPECT_EQ(get_team_info(1, &team), B_BAD_TEAM_ID);
	EXPECT_EQ(get_next_thread_info(1, &cookie, &info), B_BAD_TEAM_ID);
	kill_thread(thread);
	EXPECT_EQ(result_of(thread), B_INTERRUPTED);
}


TEST(ThreadTest, ItsProcessorTimeAndStackAreKnown)
{
	thread_id thread = start(&spin);
	thread_info info;
	ASSERT_TRUE(
		eventually([&] { return get_thread_info(thread, &info) == B_OK && info.user_time > 0; }));
	EXPECT_LT(info.stack_base, info.stack_end);
	kill_thread(thread);
	EXPECT_EQ(result_of(thread), B_INTERRUPTED);
}


// #pragma mark - data


status_t
receive_three(void* data)
{
	auto* text = static_cast<std::string*>(data);
	for (int i = 0; i < 3; i++) {
		char buffer[8] = "";
		thread_id sender = -1;
		int32 code = receive_data(&sender, buffer, 3);
		if (code != i || sender != getpid())
			return B_ERROR;
		*text += buffer;
	}
	return B_OK;
}


TEST(ThreadDataTest, ArrivesInOrderAndCutToTheBuffer)
{
	std::string text;
	thread_id thread = spawn_thread(&receive_three, "receiver", B_NORMAL_PRIORITY, &text);
	EXPECT_FALSE(has_data(thread));
	// Before the thread runs there is room for one.
	EXPECT_EQ(send_data(thread, 0, "abcdef", 6), B_OK);
	EXPECT_TRUE(has_data(thread));
	EXPECT_EQ(resume_thread(thread), B_OK);
	EXPECT_EQ(send_data(thread, 1, "12", 2), B_OK);
	EXPECT_EQ(send_data(thread, 2, nullptr, 0), B_OK);
	EXPECT_EQ(result_of(thread), B_OK);
	EXPECT_EQ(text, "abc12");
	EXPECT_FALSE(has_data(thread));
}


status_t
send_twice(void* data)
{
	thread_id to = *static_cast<thread_id*>(data);
	send_data(to, 1, "x", 1);
	return send_data(to, 2, "y", 1);
}


TEST(ThreadDataTest, ASenderIsToldThatTheReceiverHasEnded)
{
	thread_id receiver = start(&sleep_long);
	thread_id sender = start(&send_twice, &receiver);
	ASSERT_TRUE(eventually([=] { return state_of(sender) == B_THREAD_WAITING; }));
	kill_thread(receiver);
	EXPECT_EQ(result_of(sender), B_BAD_THREAD_ID);
	EXPECT_EQ(result_of(receiver), B_INTERRUPTED);
}


TEST(ThreadDataTest, RefusesBadArguments)
{
	EXPECT_EQ(send_data(-1, 0, "x", 1), B_BAD_THREAD_ID);
	EXPECT_EQ(send_data(find_thread(nullptr), 0, nullptr, 1), B_BAD_VALUE);
	std::vector<char> large(64 * 1024 + 1);
	EXPECT_EQ(send_data(find_thread(nullptr), 0, large.data(), large.size()), B_NO_MEMORY);
	EXPECT_EQ(receive_data(nullptr, nullptr, 1), B_BAD_VALUE);
	EXPECT_FALSE(has_data(-1));
}

} // namespace

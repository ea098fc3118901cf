// SPDX-License-Identifier: MIT
// Semaphores, ports and time.

#include <OS.h>

#include <signal.h>
#include <string.h>
#include <time.h>

#include <algorithm>
#include <atomic>
#include <string>
#include <vector>

#include <gtest/gtest.h>

namespace {

constexpr bigtime_t kSoon = 20000;
constexpr bigtime_t kLimit = 10000000;


thread_id
start(thread_func function, void* data)
{
	thread_id thread = spawn_thread(function, "test", B_NORMAL_PRIORITY, data);
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


bool
waits(thread_id thread)
{
	bigtime_t end = system_time() + kLimit;
	thread_info info;
	while (get_thread_info(thread, &info) == B_OK && system_time() < end) {
		if (info.state == B_THREAD_WAITING)
			return true;
		snooze(1000);
	}
	return false;
}


int32
count_of(sem_id semaphore)
{
	int32 count = INT32_MIN;
	EXPECT_EQ(get_sem_count(semaphore, &count), B_OK);
	return count;
}


// #pragma mark - semaphores


TEST(SemaphoreTest, CountsItsPlaces)
{
	sem_id semaphore = create_sem(2, "test");
	ASSERT_GT(semaphore, 0);
	EXPECT_EQ(acquire_sem(semaphore), B_OK);
	EXPECT_EQ(acquire_sem(semaphore), B_OK);
	EXPECT_EQ(acquire_sem_etc(semaphore, 1, B_RELATIVE_TIMEOUT, 0), B_WOULD_BLOCK);
	EXPECT_EQ(release_sem_etc(semaphore, 3, 0), B_OK);
	EXPECT_EQ(count_of(semaphore), 3);
	EXPECT_EQ(acquire_sem_etc(semaphore, 3, 0, 0), B_OK);
	EXPECT_EQ(delete_sem(semaphore), B_OK);
	EXPECT_EQ(delete_sem(semaphore), B_BAD_SEM_ID);
	EXPECT_EQ(acquire_sem(semaphore), B_BAD_SEM_ID);
	EXPECT_EQ(release_sem(semaphore), B_BAD_SEM_ID);
}


TEST(SemaphoreTest, RefusesBadArguments)
{
	EXPECT_EQ(create_sem(-1, "test"), B_BAD_VALUE);
	sem_id semaphore = create_sem(INT32_MAX, nullptr);
	EXPECT_EQ(acquire_sem_etc(semaphore, 0, 0, 0), B_BAD_VALUE);
	EXPECT_EQ(acquire_sem_etc(semaphore, -1, 0, 0), B_BAD_VALUE);
	EXPECT_EQ(release_sem_etc(semaphore, 0, 0), B_BAD_VALUE);
	EXPECT_EQ(release_sem(semaphore), B_BAD_VALUE);
	EXPECT_EQ(count_of(semaphore), INT32_MAX);
	EXPECT_EQ(get_sem_count(semaphore, nullptr), B_BAD_VALUE);
	int32 count;
	EXPECT_EQ(get_sem_count(-3, &count), B_BAD_SEM_ID);
	delete_sem(semaphore);
}


TEST(SemaphoreTest, TimesOutNeitherEarlyNorLeavingATrace)
{
	sem_id semaphore = create_sem(0, "test");
	bigtime_t before = system_time();
	EXPECT_EQ(acquire_sem_etc(semaphore, 1, B_RELATIVE_TIMEOUT, kSoon), B_TIMED_OUT);
	EXPECT_GE(system_time() - before, kSoon);
	before = system_time();
	EXPECT_EQ(acquire_sem_etc(semaphore, 1, B_ABSOLUTE_TIMEOUT, before + kSoon), B_TIMED_OUT);
	EXPECT_GE(system_time() - before, kSoon);
	EXPECT_EQ(acquire_sem_etc(semaphore, 1, B_ABSOLUTE_TIMEOUT, 0), B_TIMED_OUT);
	EXPECT_EQ(acquire_sem_etc(semaphore, 1, B_ABSOLUTE_TIMEOUT, -5), B_TIMED_OUT);
	EXPECT_EQ(acquire_sem_etc(semaphore, 1, B_RELATIVE_TIMEOUT, -5), B_WOULD_BLOCK);
	before = real_time_clock_usecs();
	EXPECT_EQ(
		acquire_sem_etc(semaphore, 1, B_ABSOLUTE_REAL_TIME_TIMEOUT, before + kSoon), B_TIMED_OUT);
	EXPECT_GE(real_time_clock_usecs() - before, kSoon);
	EXPECT_EQ(count_of(semaphore), 0);
	delete_sem(semaphore);
}


status_t
acquire_one(void* data)
{
	return acquire_sem(*static_cast<sem_id*>(data));
}


status_t
acquire_forever(void* data)
{
	return acquire_sem_etc(*static_cast<sem_id*>(data), 1, B_RELATIVE_TIMEOUT, B_INFINITE_TIMEOUT);
}


TEST(SemaphoreTest, DeletingItWakesThoseWhoWait)
{
	sem_id semaphore = create_sem(0, "test");
	thread_id first = start(&acquire_one, &semaphore);
	thread_id second = start(&acquire_forever, &semaphore);
	ASSERT_TRUE(waits(first));
	ASSERT_TRUE(waits(second));
	EXPECT_EQ(count_of(semaphore), -2);
	thread_info info;
	ASSERT_EQ(get_thread_info(first, &info), B_OK);
	EXPECT_EQ(info.sem, semaphore);
	delete_sem(semaphore);
	EXPECT_EQ(result_of(first), B_BAD_SEM_ID);
	EXPECT_EQ(result_of(second), B_BAD_SEM_ID);
}


TEST(SemaphoreTest, ReleaseAllLeavesNoPlacesBehind)
{
	sem_id semaphore = create_sem(0, "test");
	thread_id first = start(&acquire_one, &semaphore);
	thread_id second = start(&acquire_one, &semaphore);
	ASSERT_TRUE(waits(first));
	ASSERT_TRUE(waits(second));
	EXPECT_EQ(release_sem_etc(semaphore, 0, B_RELEASE_ALL), B_OK);
	EXPECT_EQ(result_of(first), B_OK);
	EXPECT_EQ(result_of(second), B_OK);
	EXPECT_EQ(count_of(semaphore), 0);
	EXPECT_EQ(release_sem_etc(semaphore, 5, B_RELEASE_IF_WAITING_ONLY), B_OK);
	EXPECT_EQ(count_of(semaphore), 0);
	delete_sem(semaphore);
}


status_t
acquire_three_for_a_moment(void* data)
{
	return acquire_sem_etc(*static_cast<sem_id*>(data), 3, B_RELATIVE_TIMEOUT, kSoon * 3);
}


TEST(SemaphoreTest, ALargeRequestThatGivesUpLetsTheNextPass)
{
	sem_id semaphore = create_sem(1, "test");
	thread_id large = start(&acquire_three_for_a_moment, &semaphore);
	ASSERT_TRUE(waits(large));
	EXPECT_EQ(count_of(semaphore), -2);
	thread_id small = start(&acquire_one, &semaphore);
	EXPECT_EQ(result_of(large), B_TIMED_OUT);
	EXPECT_EQ(result_of(small), B_OK);
	EXPECT_EQ(count_of(semaphore), 0);
	delete_sem(semaphore);
}


struct PingPong {
	sem_id mine;
	sem_id other;
};


status_t
play(void* data)
{
	PingPong* game = static_cast<PingPong*>(data);
	for (int i = 0; i < 2000; i++) {
		if (acquire_sem(game->mine) != B_OK || release_sem(game->other) != B_OK)
			return B_ERROR;
	}
	return B_OK;
}


TEST(SemaphoreTest, NoWakeUpIsLost)
{
	sem_id a = create_sem(1, "a");
	sem_id b = create_sem(0, "b");
	PingPong first = {a, b};
	PingPong second = {b, a};
	thread_id one = start(&play, &first);
	thread_id two = start(&play, &second);
	EXPECT_EQ(result_of(one), B_OK);
	EXPECT_EQ(result_of(two), B_OK);
	EXPECT_EQ(count_of(a), 1);
	delete_sem(a);
	delete_sem(b);
}


TEST(SemaphoreTest, ASuspendedWaiterGoesOnWaiting)
{
	sem_id semaphore = create_sem(0, "test");
	thread_id thread = start(&acquire_one, &semaphore);
	ASSERT_TRUE(waits(thread));
	EXPECT_EQ(suspend_thread(thread), B_OK);
	snooze(kSoon);
	EXPECT_EQ(resume_thread(thread), B_OK);
	snooze(kSoon);
	EXPECT_EQ(count_of(semaphore), -1);
	release_sem(semaphore);
	EXPECT_EQ(result_of(thread), B_OK);
	delete_sem(semaphore);
}


TEST(SemaphoreTest, ASignalInterruptsTheWait)
{
	struct sigaction action = {};
	action.sa_handler = [](int) {};
	sigaction(SIGALRM, &action, nullptr);
	timer_t timer;
	sigevent event = {};
	event.sigev_notify = SIGEV_SIGNAL;
	event.sigev_signo = SIGALRM;
	ASSERT_EQ(timer_create(CLOCK_MONOTONIC, &event, &timer), 0);
	itimerspec often = {{0, 20000000}, {0, 20000000}};
	timer_settime(timer, 0, &often, nullptr);

	sem_id semaphore = create_sem(0, "test");
	EXPECT_EQ(acquire_sem_etc(semaphore, 1, B_RELATIVE_TIMEOUT, kLimit), B_INTERRUPTED);
	EXPECT_EQ(count_of(semaphore), 0);
	EXPECT_EQ(snooze(kLimit), B_INTERRUPTED);
	timer_delete(timer);
	delete_sem(semaphore);
}


// #pragma mark - ports


TEST(PortTest, GivesMessagesInOrder)
{
	port_id port = create_port(3, "test port");
	ASSERT_GT(port, 0);
	EXPECT_EQ(find_port("test port"), port);
	EXPECT_EQ(write_port(port, 1, "one", 3), B_OK);
	EXPECT_EQ(write_port(port, 2, nullptr, 0), B_OK);
	EXPECT_EQ(write_port(port, 3, "three", 5), B_OK);
	EXPECT_EQ(port_count(port), 3);
	EXPECT_EQ(port_buffer_size(port), 3);
	EXPECT_EQ(write_port_etc(port, 4, "x", 1, B_RELATIVE_TIMEOUT, 0), B_WOULD_BLOCK);
	EXPECT_EQ(write_port_etc(port, 4, "x", 1, B_RELATIVE_TIMEOUT, kSoon), B_TIMED_OUT);

	char buffer[8] = "";
	int32 code = 0;
	EXPECT_EQ(read_port(port, &code, buffer, sizeof(buffer)), 3);
	EXPECT_EQ(code, 1);
	EXPECT_STREQ(buffer, "one");
	EXPECT_EQ(read_port(port, &code, buffer, sizeof(buffer)), 0);
	EXPECT_EQ(code, 2);
	EXPECT_EQ(read_port(port, &code, buffer, 2), 2);
	EXPECT_EQ(std::string(buffer, 3), "the");
	EXPECT_EQ(read_port_etc(port, &code, buffer, 2, B_RELATIVE_TIMEOUT, 0), B_WOULD_BLOCK);
	EXPECT_EQ(port_buffer_size_etc(port, B_RELATIVE_TIMEOUT, kSoon), B_TIMED_OUT);
	EXPECT_EQ(delete_port(port), B_OK);
	EXPECT_EQ(find_port("test port"), B_NAME_NOT_FOUND);
}


TEST(PortTest, AClosedPortCanBeEmptied)
{
	port_id port = create_port(3, "test");
	write_port(port, 1, "a", 1);
	EXPECT_EQ(close_port(port), B_OK);
	EXPECT_EQ(write_port(port, 2, "b", 1), B_BAD_PORT_ID);
	char byte;
	EXPECT_EQ(read_port(port, nullptr, &byte, 1), 1);
	EXPECT_EQ(read_port(port, nullptr, &byte, 1), B_BAD_PORT_ID);
	EXPECT_EQ(delete_port(port), B_OK);
	EXPECT_EQ(delete_port(port), B_BAD_PORT_ID);
	EXPECT_EQ(close_port(port), B_BAD_PORT_ID);
	EXPECT_EQ(port_count(port), B_BAD_PORT_ID);
}


TEST(PortTest, RefusesBadArguments)
{
	EXPECT_EQ(create_port(0, "test"), B_BAD_VALUE);
	EXPECT_EQ(create_port(4097, "test"), B_BAD_VALUE);
	EXPECT_EQ(find_port(nullptr), B_BAD_VALUE);
	port_id port = create_port(1, "test");
	EXPECT_EQ(write_port(port, 1, nullptr, 1), B_BAD_VALUE);
	std::vector<char> large(256 * 1024 + 1);
	EXPECT_EQ(write_port(port, 1, large.data(), large.size()), B_BAD_VALUE);
	EXPECT_EQ(write_port(port, 1, large.data(), large.size() - 1), B_OK);
	EXPECT_EQ(read_port(port, nullptr, nullptr, 1), B_BAD_VALUE);
	delete_port(port);
}


status_t
read_one(void* data)
{
	char byte;
	return read_port(*static_cast<port_id*>(data), nullptr, &byte, 1);
}


status_t
write_one(void* data)
{
	return write_port(*static_cast<port_id*>(data), 5, "x", 1);
}


TEST(PortTest, DeletingItWakesReadersAndWriters)
{
	port_id empty = create_port(1, "empty");
	port_id full = create_port(1, "full");
	write_port(full, 1, "x", 1);
	thread_id reader = start(&read_one, &empty);
	thread_id writer = start(&write_one, &full);
	ASSERT_TRUE(waits(reader));
	ASSERT_TRUE(waits(writer));
	delete_port(empty);
	delete_port(full);
	EXPECT_EQ(result_of(reader), B_BAD_PORT_ID);
	EXPECT_EQ(result_of(writer), B_BAD_PORT_ID);
}


struct Stream {
	port_id port;
	std::atomic<int64> sum;
};


status_t
produce(void* data)
{
	Stream* stream = static_cast<Stream*>(data);
	for (int32 i = 1; i <= 1000; i++) {
		if (write_port(stream->port, i, &i, sizeof(i)) != B_OK)
			return B_ERROR;
	}
	return B_OK;
}


status_t
consume(void* data)
{
	Stream* stream = static_cast<Stream*>(data);
	for (int32 i = 0; i < 1000; i++) {
		int32 code;
		int32 value;
		if (read_port(stream->port, &code, &value, sizeof(value)) != sizeof(value) || code != value)
			return B_ERROR;
		stream->sum += value;
	}
	return B_OK;
}


TEST(PortTest, NothingIsLostBetweenManyThreads)
{
	Stream stream = {create_port(2, "stream"), {0}};
	std::vector<thread_id> threads;
	for (int i = 0; i < 3; i++) {
		threads.push_back(start(&produce, &stream));
		threads.push_back(start(&consume, &stream));
	}
	for (thread_id thread : threads)
		EXPECT_EQ(result_of(thread), B_OK);
	EXPECT_EQ(stream.sum, 3 * 500500);
	delete_port(stream.port);
}


// #pragma mark - time


TEST(TimeTest, SnoozesAtLeastAsLongAsAsked)
{
	bigtime_t before = system_time();
	EXPECT_EQ(snooze(kSoon), B_OK);
	EXPECT_GE(system_time() - before, kSoon);
	before = system_time();
	EXPECT_EQ(snooze_until(before + kSoon, B_SYSTEM_TIMEBASE), B_OK);
	EXPECT_GE(system_time(), before + kSoon);
	EXPECT_EQ(snooze(0), B_OK);
	EXPECT_EQ(snooze(-5), B_OK);
	EXPECT_EQ(snooze_until(0, B_SYSTEM_TIMEBASE), B_OK);
	EXPECT_EQ(snooze_until(0, 5), B_ERROR);
}


TEST(TimeTest, TheClocksAreThoseOfTheHost)
{
	EXPECT_LE(real_time_clock(), static_cast<unsigned long>(time(nullptr)));
	EXPECT_GE(real_time_clock() + 2, static_cast<unsigned long>(time(nullptr)));
	bigtime_t before = system_time();
	EXPECT_LE(before, system_time());
	system_info info;
	ASSERT_EQ(get_system_info(&info), B_OK);
	EXPECT_GE(info.cpu_count, 1u);
	EXPECT_GT(info.max_pages, info.used_pages);
	EXPECT_LT(std::abs(info.boot_time + system_time() - real_time_clock_usecs()), 5000000);
	EXPECT_EQ(get_system_info(nullptr), B_BAD_VALUE);
	EXPECT_EQ(is_computer_on(), 1);
}


TEST(DebuggerTest, PrintsAndStops)
{
	EXPECT_EXIT(debugger("it is broken"), testing::KilledBySignal(SIGABRT), "it is broken");
}

} // namespace

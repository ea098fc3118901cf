// SPDX-License-Identifier: MIT
// Threads, semaphores, ports and time. All objects are those of this process; ids are above 0.

#ifndef _OS_H
#define _OS_H

#include <SupportDefs.h>

typedef int32 area_id;
typedef int32 port_id;
typedef int32 sem_id;
typedef int32 team_id;
typedef int32 thread_id;

/// Bytes of a name with its null byte: longer names are cut.
#define B_OS_NAME_LENGTH 32
#define B_PAGE_SIZE 4096
#define B_INFINITE_TIMEOUT (9223372036854775807LL)

// How a timeout (microseconds) is meant; without any of these there is no limit.
enum {
	B_TIMEOUT = 0x8,
	B_RELATIVE_TIMEOUT = 0x8,
	B_ABSOLUTE_TIMEOUT = 0x10,
	B_TIMEOUT_REAL_TIME_BASE = 0x40,
	B_ABSOLUTE_REAL_TIME_TIMEOUT = B_ABSOLUTE_TIMEOUT | B_TIMEOUT_REAL_TIME_BASE
};

// Flags of acquire_sem_etc() and release_sem_etc().
enum {
	B_CAN_INTERRUPT = 0x01,
	B_CHECK_PERMISSION = 0x04,
	B_KILL_CAN_INTERRUPT = 0x20,
	B_DO_NOT_RESCHEDULE = 0x02,
	B_RELEASE_ALL = 0x08,
	B_RELEASE_IF_WAITING_ONLY = 0x10
};

enum { B_TEAM_USAGE_SELF = 0, B_TEAM_USAGE_CHILDREN = -1 };

enum { B_ONE_SHOT_ABSOLUTE_ALARM = 1, B_ONE_SHOT_RELATIVE_ALARM, B_PERIODIC_ALARM };

#define B_ANY_ADDRESS 0
#define B_EXACT_ADDRESS 1
#define B_BASE_ADDRESS 2
#define B_CLONE_ADDRESS 3

#define B_READ_AREA 0x001
#define B_WRITE_AREA 0x002
#define B_EXECUTE_AREA 0x004
#define B_STACK_AREA 0x008
#define B_CLONEABLE_AREA 0x100

#define B_CURRENT_TEAM 0
#define B_SYSTEM_TEAM 1

#define B_IDLE_PRIORITY 0
#define B_LOWEST_ACTIVE_PRIORITY 1
#define B_LOW_PRIORITY 5
#define B_NORMAL_PRIORITY 10
#define B_DISPLAY_PRIORITY 15
#define B_URGENT_DISPLAY_PRIORITY 20
#define B_FIRST_REAL_TIME_PRIORITY 100
#define B_REAL_TIME_DISPLAY_PRIORITY 100
#define B_URGENT_PRIORITY 110
#define B_REAL_TIME_PRIORITY 120

#define B_SYSTEM_TIMEBASE 0

// Threads

typedef enum {
	B_THREAD_RUNNING = 1,
	B_THREAD_READY,
	B_THREAD_RECEIVING,
	B_THREAD_ASLEEP,
	B_THREAD_SUSPENDED,
	B_THREAD_WAITING
} thread_state;

typedef status_t (*thread_func)(void* data);
typedef thread_func thread_entry;

typedef struct {
	thread_id thread;
	team_id team;
	char name[B_OS_NAME_LENGTH];
	thread_state state;
	int32 priority;
	/// What a B_THREAD_WAITING thread waits for, or -1.
	sem_id sem;
	/// Processor time, microseconds.
	bigtime_t user_time;
	bigtime_t kernel_time;
	void* stack_base;
	void* stack_end;
} thread_info;

typedef struct {
	team_id team;
	int32 thread_count;
	int32 image_count;
	int32 area_count;
	thread_id debugger_nub_thread;
	port_id debugger_nub_port;
	int32 argc;
	char args[64];
	uid_t uid;
	gid_t gid;
} team_info;

typedef struct {
	/// Microseconds since 1970.
	bigtime_t boot_time;
	uint32 cpu_count;
	uint64 max_pages;
	uint64 used_pages;
	uint64 free_memory;
	uint32 max_sems;
	uint32 used_sems;
	uint32 max_ports;
	uint32 used_ports;
	uint32 max_threads;
	uint32 used_threads;
	uint32 max_teams;
	uint32 used_teams;
	char kernel_name[256];
	char kernel_build_date[B_OS_NAME_LENGTH];
	char kernel_build_time[B_OS_NAME_LENGTH];
	int64 kernel_version;
	uint32 abi;
} system_info;

/// Makes a thread, suspended until resume_thread() or wait_for_thread().
///
/// \a priority is kept for get_thread_info(); the host's scheduler treats all threads alike.
/// Returns its id, B_BAD_VALUE for a null function, or B_NO_MORE_THREADS.
thread_id spawn_thread(thread_func function, const char* name, int32 priority, void* data);
/// Ends a thread where it is: nothing that it holds is released, no destructor runs, its exit
/// callbacks are not called. B_NOT_ALLOWED for the main thread and those not made by spawn_thread().
status_t kill_thread(thread_id thread);
/// B_BAD_THREAD_STATE when the thread is not suspended.
status_t resume_thread(thread_id thread);
/// May be the calling thread. A thread that waits for an object stops when it has got it.
status_t suspend_thread(thread_id thread);
status_t rename_thread(thread_id thread, const char* newName);
/// The priority from before.
status_t set_thread_priority(thread_id thread, int32 newPriority);
/// Ends the calling thread without running destructors of its blocks; in the main thread, the
/// program.
void exit_thread(status_t status);
/// Resumes the thread when it is suspended, and waits until it has ended.
///
/// \a returnValue, unless null: what its function returned, or B_INTERRUPTED when it was killed.
/// The result can be fetched once, later too. B_BAD_THREAD_ID for a thread that is gone.
status_t wait_for_thread(thread_id thread, status_t* returnValue);
status_t wait_for_thread_etc(thread_id id, uint32 flags, bigtime_t timeout, status_t* _returnCode);
/// Calls \a callback in the calling thread at its end, the last one set first.
status_t on_exit_thread(void (*callback)(void*), void* data);

/// The first thread of that name, the calling one for null; B_NAME_NOT_FOUND.
thread_id find_thread(const char* name);
status_t get_thread_info(thread_id id, thread_info* info);
/// \a cookie: 0 before the first call. B_BAD_VALUE after the last thread.
status_t get_next_thread_info(team_id team, int32* cookie, thread_info* info);

/// Hands a copy of the data to a thread; waits while it has not received the one before.
/// B_BAD_THREAD_ID; B_NO_MEMORY for more than 64 KiB; B_INTERRUPTED.
status_t send_data(thread_id thread, int32 code, const void* buffer, size_t bufferSize);
/// Waits for send_data() to the calling thread and returns its code. What does not fit is lost.
int32 receive_data(thread_id* sender, void* buffer, size_t bufferSize);
bool has_data(thread_id thread);

// Time, in microseconds

/// Also for 0 and less, which do not wait. B_INTERRUPTED when a signal came.
status_t snooze(bigtime_t amount);
/// \a timeBase: B_SYSTEM_TIMEBASE, or B_ERROR is returned.
status_t snooze_until(bigtime_t time, int timeBase);
/// Since start-up of the machine, never backwards.
bigtime_t system_time();
/// Seconds since 1970.
unsigned long real_time_clock();
bigtime_t real_time_clock_usecs();

// Semaphores: a count of free places. Threads wait in the order of their coming.

sem_id create_sem(int32 count, const char* name);
/// Wakes the waiting threads with B_BAD_SEM_ID.
status_t delete_sem(sem_id id);
status_t acquire_sem(sem_id id);
/// B_OK, B_TIMED_OUT, B_WOULD_BLOCK (a relative timeout of 0), B_INTERRUPTED (by a signal),
/// B_BAD_SEM_ID, or B_BAD_VALUE for a count below 1.
status_t acquire_sem_etc(sem_id id, int32 count, uint32 flags, bigtime_t timeout);
status_t release_sem(sem_id id);
/// B_RELEASE_ALL wakes every waiting thread whatever the count; B_RELEASE_IF_WAITING_ONLY gives no
/// more than what is waited for.
status_t release_sem_etc(sem_id id, int32 count, uint32 flags);
/// The free places; negative: what is waited for and missing.
status_t get_sem_count(sem_id id, int32* threadCount);

// Ports: queues of messages, each a code and up to 256 KiB

/// \a capacity: messages, 1 to 4096. A write to a full port waits.
port_id create_port(int32 capacity, const char* name);
port_id find_port(const char* name);
/// The bytes copied; what does not fit is lost. B_BAD_PORT_ID, B_TIMED_OUT, B_WOULD_BLOCK,
/// B_INTERRUPTED.
ssize_t read_port(port_id port, int32* code, void* buffer, size_t bufferSize);
ssize_t read_port_etc(
	port_id port, int32* code, void* buffer, size_t bufferSize, uint32 flags, bigtime_t timeout);
status_t write_port(port_id port, int32 code, const void* buffer, size_t bufferSize);
status_t write_port_etc(port_id port, int32 code, const void* buffer, size_t bufferSize,
	uint32 flags, bigtime_t timeout);
/// No more writes; what is queued can still be read.
status_t close_port(port_id port);
/// Wakes the waiting threads with B_BAD_PORT_ID.
status_t delete_port(port_id port);
/// Waits for a message and returns its size; the message stays.
ssize_t port_buffer_size(port_id port);
ssize_t port_buffer_size_etc(port_id port, uint32 flags, bigtime_t timeout);
/// The messages queued.
ssize_t port_count(port_id port);

// The team (this process) and the machine

/// \a id: B_CURRENT_TEAM or the process's own id, or B_BAD_TEAM_ID.
status_t get_team_info(team_id id, team_info* info);
status_t get_system_info(system_info* info);
/// 1.
int32 is_computer_on();
/// Prints \a message to the error output and stops the program with SIGABRT, where a debugger
/// waits for it.
void debugger(const char* message);

#endif // _OS_H

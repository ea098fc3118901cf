// SPDX-License-Identifier: MIT
// Threads.

#include <OS.h>

#include <errno.h>
#include <signal.h>
#include <stdlib.h>
#include <string.h>
#include <unistd.h>

#include "kernel/Kernel.h"
#include "kernel/ProgramEnd.h"
#include "kernel/Team.h"
#include "support/HostError.h"

using namespace BPrivate;

namespace {

// Read without the lock: find_thread(NULL) is in the way of every lock and message.
thread_local thread_id tThreadId = -1;


/// Runs the thread's function and its exit callbacks. A thread that ends itself, or is killed,
/// comes back here by a jump.
void
run_thread(Thread* thread)
{
	int reason = sigsetjmp(thread->exit, 1);
	if (reason == 0) {
		thread->killable = true;
		stop_if_asked();
		thread->result = thread->function(thread->argument);
	}
	if (reason == kThreadKilled)
		thread->result = B_INTERRUPTED;
	else
		run_exit_callbacks(thread);
	thread->killable = false;
}


void*
thread_main(void* argument)
{
	std::unique_ptr<std::shared_ptr<Thread>> record(
		static_cast<std::shared_ptr<Thread>*>(argument));
	adopt_thread_record(*record);
	Thread* thread = record->get();
	tThreadId = thread->id;
	record.reset();

	ThreadEndWatch watch;
	run_thread(thread);
	return nullptr;
}


/// The host's names are shorter than ours. The main thread's is the process's: that stays.
void
set_host_name(Thread* thread)
{
	char name[16] = "";
	memcpy(name, thread->name, sizeof(name) - 1);
	if (thread->kind == Thread::Kind::kSpawned)
		pthread_setname_np(thread->pthread, name);
}


/// Lets a suspended thread go on; false when it is not suspended.
bool
resume(Thread* thread)
{
	if (thread->kind == Thread::Kind::kTeam)
		return resume_team(thread);
	if (thread->suspended == 0)
		return false;
	thread->suspended = 0;
	wake_sleepers(&thread->suspended);
	return true;
}

} // namespace


thread_id
spawn_thread(thread_func function, const char* name, int32 priority, void* data)
{
	if (function == nullptr)
		return B_BAD_VALUE;

	KernelSection section;
	auto thread = std::make_shared<Thread>();
	thread->kind = Thread::Kind::kSpawned;
	copy_name(thread->name, name == nullptr ? "thread" : name);
	thread->priority = priority;
	thread->function = function;
	thread->argument = data;
	thread->suspended = 1;
	add_thread_record(thread);

	auto argument = std::make_unique<std::shared_ptr<Thread>>(thread);
	pthread_attr_t attributes;
	pthread_attr_init(&attributes);
	pthread_attr_setdetachstate(&attributes, PTHREAD_CREATE_DETACHED);
	int error = pthread_create(&thread->pthread, &attributes, &thread_main, argument.get());
	pthread_attr_destroy(&attributes);
	if (error != 0) {
		remove_thread_record(thread);
		return B_NO_MORE_THREADS;
	}
	static_cast<void>(argument.release());
	set_host_name(thread.get());
	return thread->id;
}


status_t
kill_thread(thread_id id)
{
	KernelSection section;
	std::shared_ptr<Thread> thread = find_thread_record(id);
	if (thread == nullptr)
		return B_BAD_THREAD_ID;
	if (thread->kind == Thread::Kind::kTeam)
		return signal_team(thread.get(), SIGKILL);
	if (thread->kind == Thread::Kind::kForeign)
		return B_NOT_ALLOWED;

	thread->killed = true;
	resume(thread.get());
	if (thread.get() != section.Current())
		interrupt_thread(thread.get());
	return B_OK;
}


status_t
resume_thread(thread_id id)
{
	KernelSection section;
	std::shared_ptr<Thread> thread = find_thread_record(id);
	if (thread == nullptr)
		return B_BAD_THREAD_ID;
	return resume(thread.get()) ? B_OK : B_BAD_THREAD_STATE;
}


status_t
suspend_thread(thread_id id)
{
	KernelSection section;
	std::shared_ptr<Thread> thread = find_thread_record(id);
	if (thread == nullptr)
		return B_BAD_THREAD_ID;
	if (thread->kind == Thread::Kind::kTeam)
		return suspend_team(thread.get());

	thread->suspended = 1;
	if (thread.get() != section.Current())
		interrupt_thread(thread.get());
	return B_OK;
}


status_t
rename_thread(thread_id id, const char* newName)
{
	if (newName == nullptr)
		return B_BAD_VALUE;

	KernelSection section;
	std::shared_ptr<Thread> thread = find_thread_record(id);
	if (thread == nullptr)
		return B_BAD_THREAD_ID;
	copy_name(thread->name, newName);
	set_host_name(thread.get());
	return B_OK;
}


status_t
set_thread_priority(thread_id id, int32 newPriority)
{
	KernelSection section;
	std::shared_ptr<Thread> thread = find_thread_record(id);
	if (thread == nullptr)
		return B_BAD_THREAD_ID;
	return std::exchange(thread->priority, newPriority);
}


void
exit_thread(status_t status)
{
	Thread* thread;
	{
		KernelSection section;
		thread = section.Current();
	}
	if (thread->killable) {
		thread->result = status;
		siglongjmp(thread->exit, kThreadExited);
	}
	if (gettid() == getpid()) {
		run_exit_callbacks(thread);
		exit(status);
	}
	pthread_exit(nullptr);
}


status_t
wait_for_thread(thread_id id, status_t* returnValue)
{
	return wait_for_thread_etc(id, 0, 0, returnValue);
}


status_t
wait_for_thread_etc(thread_id id, uint32 flags, bigtime_t timeout, status_t* _returnCode)
{
	KernelSection section;
	std::shared_ptr<Thread> thread = find_thread_record(id, true);
	if (thread == nullptr)
		return B_BAD_THREAD_ID;
	if (thread.get() == section.Current())
		return host_error(EDEADLK);

	if (thread->dead)
		remove_thread_record(thread);
	else {
		resume(thread.get());
		Waiter waiter;
		status_t status =
			section.Wait(thread->joiners, waiter, KernelDeadline(flags, timeout), B_THREAD_WAITING);
		if (status != B_OK)
			return status;
	}
	if (_returnCode != nullptr)
		*_returnCode = thread->result;
	return B_OK;
}


void
BPrivate::announce_thread_end()
{
	KernelSection section;
	Thread* thread = section.Current();
	thread->leaving = thread->kind == Thread::Kind::kSpawned;
}


status_t
BPrivate::wait_for_announced_ends(bigtime_t timeout)
{
	KernelSection section;
	KernelDeadline deadline(B_RELATIVE_TIMEOUT, timeout);
	for (const std::shared_ptr<Thread>& thread : live_threads()) {
		if (!thread->leaving || thread->dead || thread.get() == section.Current())
			continue;
		Waiter waiter;
		status_t status = section.Wait(thread->joiners, waiter, deadline, B_THREAD_WAITING);
		if (status != B_OK)
			return status;
	}
	return B_OK;
}


status_t
on_exit_thread(void (*callback)(void*), void* data)
{
	if (callback == nullptr)
		return B_BAD_VALUE;
	KernelSection section;
	section.Current()->exitCallbacks.emplace_back(callback, data);
	return B_OK;
}


thread_id
find_thread(const char* name)
{
	if (name == nullptr) {
		if (tThreadId < 0) {
			KernelSection section;
			tThreadId = section.Current()->id;
		}
		return tThreadId;
	}

	KernelSection section;
	for (const std::shared_ptr<Thread>& thread : live_threads()) {
		if (strncmp(thread->name, name, B_OS_NAME_LENGTH - 1) == 0)
			return thread->id;
	}
	return B_NAME_NOT_FOUND;
}

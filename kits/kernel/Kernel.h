// SPDX-License-Identifier: MIT
// The machinery under threads, semaphores and ports: one lock, threads that wait, threads that stop.
//
// Nothing here is ever destroyed, so that static objects may use the kit before main() and after it.

#ifndef _KERNEL_H
#define _KERNEL_H

#include <pthread.h>
#include <setjmp.h>
#include <time.h>

#include <atomic>
#include <memory>
#include <utility>
#include <vector>

#include <OS.h>

namespace BPrivate {

struct Thread;

/// One thread in a queue. Lives on the waiting thread's stack.
struct Waiter {
	Thread* thread = nullptr;
	/// How many places of a semaphore it wants.
	int32 wanted = 1;
	status_t result = B_OK;
	bool done = false;
	Waiter* previous = nullptr;
	Waiter* next = nullptr;
};


/// Waiting threads in the order of their coming. Used inside a KernelSection.
class WaitQueue {
public:
	Waiter* First() const { return fFirst; }

	void Append(Waiter* waiter);
	void Remove(Waiter* waiter);

	/// Takes the waiter out and lets it go on with \a result.
	void Wake(Waiter* waiter, status_t result);
	void WakeAll(status_t result);

private:
	Waiter* fFirst = nullptr;
	Waiter* fLast = nullptr;
};


/// When a wait ends without success, and with which status.
class KernelDeadline {
public:
	/// Never.
	KernelDeadline() = default;
	/// \a flags: as acquire_sem_etc() takes them; \a timeout: microseconds.
	KernelDeadline(uint32 flags, bigtime_t timeout);

	bool IsImmediate() const { return fIsImmediate; }
	status_t Status() const { return fIsImmediate ? B_WOULD_BLOCK : B_TIMED_OUT; }

	/// Sleeps while \a word is \a value: 0, ETIMEDOUT, EINTR or EAGAIN.
	int Wait(std::atomic<uint32>* word, uint32 value) const;

private:
	bool fIsImmediate = false;
	bool fIsInfinite = true;
	bool fIsRealTime = false;
	timespec fTime = {};
};


/// Everything that is known about a thread. Used inside a KernelSection, but for the atomics.
struct Thread {
	enum class Kind {
		kSpawned, // by spawn_thread()
		kForeign, // the main thread, and those that other libraries make
		kTeam     // stands for the process that load_image() made
	};

	thread_id id = -1;
	Kind kind = Kind::kForeign;
	char name[B_OS_NAME_LENGTH] = "";
	int32 priority = B_NORMAL_PRIORITY;

	pthread_t pthread = {};
	std::atomic<pid_t> hostId{0};
	thread_func function = nullptr;
	void* argument = nullptr;
	/// Where a thread that ends itself or is killed goes on.
	sigjmp_buf exit;

	/// Changes when something is to be looked at by a waiting thread.
	std::atomic<uint32> wake{0};
	/// 1 while the thread is to stand still.
	std::atomic<uint32> suspended{0};
	std::atomic<bool> killed{false};
	/// Whether exit can be jumped to.
	std::atomic<bool> killable{false};
	std::atomic<int32> activity{B_THREAD_RUNNING};
	sem_id waitsFor = -1;

	std::vector<std::pair<void (*)(void*), void*>> exitCallbacks;

	bool hasData = false;
	int32 dataCode = 0;
	thread_id dataSender = -1;
	std::vector<char> data;
	WaitQueue senders;
	WaitQueue receivers;

	/// On its way out: its work is done.
	bool leaving = false;
	bool dead = false;
	status_t result = B_OK;
	WaitQueue joiners;

	/// For a team: what starts it, and whether it did.
	int gate = -1;
	bool started = false;
};


/// A stretch of code in which the calling thread is neither killed nor suspended from outside.
/// What was asked of it meanwhile happens at the end of the outermost one.
class StopShield {
public:
	StopShield();
	~StopShield();

private:
	StopShield(const StopShield&) = delete;
	StopShield& operator=(const StopShield&) = delete;
};


/// Holds the one lock of the kernel for the length of a block.
class KernelSection {
public:
	KernelSection();
	~KernelSection();

	/// The calling thread.
	Thread* Current() const { return fCurrent; }

	/// Waits in \a queue until somebody wakes the waiter; the lock is free meanwhile.
	///
	/// \a activity: what get_thread_info() tells. Returns the status of the waking, of the
	/// deadline, or B_INTERRUPTED. Afterwards the waiter is in no queue.
	status_t Wait(
		WaitQueue& queue, Waiter& waiter, const KernelDeadline& deadline, thread_state activity);

private:
	StopShield fShield;
	Thread* fCurrent;
};


/// The thread of an id, null when it is gone; with \a dead also one whose end was not fetched yet.
std::shared_ptr<Thread> find_thread_record(thread_id id, bool dead = false);
/// Gives the thread an id, unless it has one, and makes it known.
void add_thread_record(const std::shared_ptr<Thread>& thread);
/// Forgets a thread whose end was fetched, or that never started.
void remove_thread_record(const std::shared_ptr<Thread>& thread);
/// Marks the thread as ended and tells those who wait. Its result can be fetched for a while.
void end_thread_record(Thread* thread);
/// All threads that have not ended, in the order of their ids.
std::vector<std::shared_ptr<Thread>> live_threads();

/// Says that the calling thread, if made by spawn_thread(), has done its work and is about to end.
void announce_thread_end();
/// Waits until nothing is left of the other threads that have announced their end.
///
/// \a timeout: microseconds, for all of them. Returns B_OK, B_TIMED_OUT or B_INTERRUPTED.
status_t wait_for_announced_ends(bigtime_t timeout);

/// Ends the calling thread, if made by spawn_thread(), for all who wait for it, and keeps it as it is until the
/// process goes: for a thread that cannot be taken apart, as what that needs is gone. Returns in other threads.
void stay_until_program_end();

/// Makes \a thread the calling one's record until its end.
void adopt_thread_record(const std::shared_ptr<Thread>& thread);
/// Lets the thread look at its flags now.
void interrupt_thread(Thread* thread);
/// Stands still while suspended, and does not return when killed.
void stop_if_asked();
/// Whether the last EINTR came from interrupt_thread(); asking forgets it.
bool was_own_interrupt();

/// Lets the threads that sleep on \a word look at it again.
void wake_sleepers(std::atomic<uint32>* word);

/// Calls what on_exit_thread() was given, in the calling thread.
void run_exit_callbacks(Thread* thread);

/// Cuts \a name to what fits.
void copy_name(char (&to)[B_OS_NAME_LENGTH], const char* name);

/// The value that Thread::exit is jumped to with.
constexpr int kThreadExited = 1;
constexpr int kThreadKilled = 2;

} // namespace BPrivate

#endif // _KERNEL_H

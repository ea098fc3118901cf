// SPDX-License-Identifier: MIT
// The kernel's lock, waiting, and the records of threads.

#include "kernel/Kernel.h"

#include <errno.h>
#include <limits.h>
#include <linux/futex.h>
#include <signal.h>
#include <string.h>
#include <sys/syscall.h>
#include <unistd.h>

#include <deque>
#include <map>
#include <mutex>

namespace BPrivate {

namespace {

// How many ended threads keep their result for a late wait_for_thread().
constexpr size_t kMaxDeadThreads = 64;

// Above every process id, as the main thread's id is the process's.
constexpr thread_id kFirstThreadId = 1 << 24;

// A std::mutex has a trivial destructor: it works until the very end.
std::mutex sLock;

#define KERNEL_TLS thread_local __attribute__((tls_model("initial-exec")))

KERNEL_TLS Thread* tThread = nullptr;
KERNEL_TLS volatile sig_atomic_t tShieldDepth = 0;
KERNEL_TLS volatile sig_atomic_t tOwnInterrupt = 0;
KERNEL_TLS bool tIsEnding = false;


struct ThreadTable {
	ThreadTable();

	std::map<thread_id, std::shared_ptr<Thread>> threads;
	std::deque<std::shared_ptr<Thread>> dead;
	thread_id nextId = kFirstThreadId;
	pthread_key_t key;
};


ThreadTable&
table()
{
	static ThreadTable* sTable = new ThreadTable;
	return *sTable;
}


int
stop_signal()
{
	return SIGRTMIN + 6;
}


void
handle_stop_signal(int)
{
	int error = errno;
	tOwnInterrupt = 1;
	if (tShieldDepth == 0)
		stop_if_asked();
	errno = error;
}


/// The end of a thread of the host. The destructors of its thread-local objects have run: nothing
/// of an add-on's code is in it any more when those who wait for it are told.
void
release_current_thread(void* value)
{
	// Libraries of the host clean up by keys of their own, in an order that nobody promises. The value
	// is kept for one more round, which comes after theirs.
	if (!tIsEnding && pthread_setspecific(table().key, value) == 0) {
		tIsEnding = true;
		return;
	}
	std::unique_ptr<std::shared_ptr<Thread>> thread(static_cast<std::shared_ptr<Thread>*>(value));
	if ((*thread)->kind == Thread::Kind::kForeign)
		run_exit_callbacks(thread->get());
	{
		KernelSection section;
		end_thread_record(thread->get());
	}
	tThread = nullptr;
}


ThreadTable::ThreadTable()
{
	pthread_key_create(&key, &release_current_thread);

	struct sigaction action = {};
	action.sa_handler = &handle_stop_signal;
	action.sa_flags = SA_RESTART;
	sigemptyset(&action.sa_mask);
	sigaction(stop_signal(), &action, nullptr);
}


/// Makes a thread known that was not made here.
Thread*
register_foreign_thread()
{
	auto thread = std::make_shared<Thread>();
	if (gettid() == getpid())
		thread->id = getpid();
	thread->pthread = pthread_self();
	pthread_getname_np(pthread_self(), thread->name, sizeof(thread->name));
	adopt_thread_record(thread);
	add_thread_record(thread);
	return thread.get();
}


long
futex(std::atomic<uint32>* word, int operation, uint32 value, const timespec* time)
{
	return syscall(SYS_futex, word, operation | FUTEX_PRIVATE_FLAG, value, time, nullptr,
		FUTEX_BITSET_MATCH_ANY);
}

} // namespace


// #pragma mark - WaitQueue


void
WaitQueue::Append(Waiter* waiter)
{
	waiter->next = nullptr;
	waiter->previous = fLast;
	if (fLast == nullptr)
		fFirst = waiter;
	else
		fLast->next = waiter;
	fLast = waiter;
}


void
WaitQueue::Remove(Waiter* waiter)
{
	if (waiter->previous == nullptr)
		fFirst = waiter->next;
	else
		waiter->previous->next = waiter->next;
	if (waiter->next == nullptr)
		fLast = waiter->previous;
	else
		waiter->next->previous = waiter->previous;
}


void
WaitQueue::Wake(Waiter* waiter, status_t result)
{
	Remove(waiter);
	waiter->result = result;
	waiter->done = true;
	waiter->thread->wake++;
	wake_sleepers(&waiter->thread->wake);
}


void
WaitQueue::WakeAll(status_t result)
{
	while (fFirst != nullptr)
		Wake(fFirst, result);
}


// #pragma mark - KernelDeadline


KernelDeadline::KernelDeadline(uint32 flags, bigtime_t timeout)
{
	if ((flags & (B_RELATIVE_TIMEOUT | B_ABSOLUTE_TIMEOUT)) == 0 || timeout == B_INFINITE_TIMEOUT)
		return;

	if ((flags & B_RELATIVE_TIMEOUT) != 0) {
		fIsImmediate = timeout <= 0;
		if (__builtin_add_overflow(timeout, system_time(), &timeout))
			return;
	} else
		fIsRealTime = (flags & B_TIMEOUT_REAL_TIME_BASE) != 0;

	fIsInfinite = false;
	timeout = timeout < 0 ? 0 : timeout;
	fTime.tv_sec = timeout / 1000000;
	fTime.tv_nsec = timeout % 1000000 * 1000;
}


int
KernelDeadline::Wait(std::atomic<uint32>* word, uint32 value) const
{
	int operation = FUTEX_WAIT_BITSET | (fIsRealTime ? FUTEX_CLOCK_REALTIME : 0);
	return futex(word, operation, value, fIsInfinite ? nullptr : &fTime) == 0 ? 0 : errno;
}


void
wake_sleepers(std::atomic<uint32>* word)
{
	futex(word, FUTEX_WAKE, INT_MAX, nullptr);
}


// #pragma mark - StopShield, KernelSection


StopShield::StopShield()
{
	tShieldDepth = tShieldDepth + 1;
	std::atomic_signal_fence(std::memory_order_seq_cst);
}


StopShield::~StopShield()
{
	std::atomic_signal_fence(std::memory_order_seq_cst);
	tShieldDepth = tShieldDepth - 1;
	if (tShieldDepth == 0)
		stop_if_asked();
}


KernelSection::KernelSection()
{
	sLock.lock();
	fCurrent = tThread != nullptr ? tThread : register_foreign_thread();
}


KernelSection::~KernelSection()
{
	sLock.unlock();
}


status_t
KernelSection::Wait(
	WaitQueue& queue, Waiter& waiter, const KernelDeadline& deadline, thread_state activity)
{
	if (deadline.IsImmediate())
		return deadline.Status();

	waiter.thread = fCurrent;
	waiter.done = false;
	queue.Append(&waiter);
	fCurrent->activity = activity;
	was_own_interrupt();

	status_t status = B_OK;
	while (!waiter.done && status == B_OK) {
		// Whoever changes something for this thread does it with the lock held, so that the
		// word cannot change unseen between here and the sleep.
		uint32 word = fCurrent->wake;
		if (fCurrent->killed) {
			status = B_INTERRUPTED;
			break;
		}

		sLock.unlock();
		int error = deadline.Wait(&fCurrent->wake, word);
		sLock.lock();
		if (error == ETIMEDOUT)
			status = deadline.Status();
		else if (error == EINTR && !was_own_interrupt())
			status = B_INTERRUPTED;
	}

	fCurrent->activity = B_THREAD_RUNNING;
	if (waiter.done)
		return waiter.result;
	queue.Remove(&waiter);
	return status;
}


// #pragma mark - stopping


void
stop_if_asked()
{
	Thread* thread = tThread;
	if (thread == nullptr)
		return;

	KernelDeadline never;
	while (thread->suspended != 0 && !thread->killed)
		never.Wait(&thread->suspended, 1);
	if (thread->killed && thread->killable)
		siglongjmp(thread->exit, kThreadKilled);
}


void
interrupt_thread(Thread* thread)
{
	thread->wake++;
	wake_sleepers(&thread->wake);
	if (!thread->dead && thread->kind != Thread::Kind::kTeam)
		pthread_kill(thread->pthread, stop_signal());
}


bool
was_own_interrupt()
{
	bool own = tOwnInterrupt != 0;
	tOwnInterrupt = 0;
	return own;
}


// #pragma mark - the records


void
run_exit_callbacks(Thread* thread)
{
	while (!thread->exitCallbacks.empty()) {
		auto [callback, data] = thread->exitCallbacks.back();
		thread->exitCallbacks.pop_back();
		callback(data);
	}
}


void
copy_name(char (&to)[B_OS_NAME_LENGTH], const char* name)
{
	size_t length = strnlen(name, sizeof(to) - 1);
	memcpy(to, name, length);
	to[length] = '\0';
}


void
stay_until_program_end()
{
	{
		KernelSection section;
		Thread* thread = section.Current();
		if (thread->kind != Thread::Kind::kSpawned)
			return;
		end_thread_record(thread);
	}
	for (;;)
		pause();
}


void
adopt_thread_record(const std::shared_ptr<Thread>& thread)
{
	thread->hostId = gettid();
	tThread = thread.get();
	pthread_setspecific(table().key, new std::shared_ptr<Thread>(thread));
}


void
add_thread_record(const std::shared_ptr<Thread>& thread)
{
	if (thread->id < 0)
		thread->id = table().nextId++;
	table().threads[thread->id] = thread;
}


void
remove_thread_record(const std::shared_ptr<Thread>& thread)
{
	std::erase(table().dead, thread);
	table().threads.erase(thread->id);
}


void
end_thread_record(Thread* thread)
{
	thread->dead = true;
	// Nobody could resume it any more.
	thread->suspended = 0;
	thread->senders.WakeAll(B_BAD_THREAD_ID);
	bool fetched = thread->joiners.First() != nullptr;
	thread->joiners.WakeAll(B_OK);

	std::shared_ptr<Thread> record = table().threads[thread->id];
	if (thread->kind == Thread::Kind::kForeign || fetched) {
		table().threads.erase(thread->id);
		return;
	}

	std::deque<std::shared_ptr<Thread>>& dead = table().dead;
	dead.push_back(record);
	if (dead.size() <= kMaxDeadThreads)
		return;
	table().threads.erase(dead.front()->id);
	dead.pop_front();
}


std::shared_ptr<Thread>
find_thread_record(thread_id id, bool dead)
{
	auto found = table().threads.find(id);
	if (found == table().threads.end() || (found->second->dead && !dead))
		return nullptr;
	return found->second;
}


std::vector<std::shared_ptr<Thread>>
live_threads()
{
	std::vector<std::shared_ptr<Thread>> threads;
	for (const auto& entry : table().threads) {
		if (!entry.second->dead)
			threads.push_back(entry.second);
	}
	return threads;
}

} // namespace BPrivate

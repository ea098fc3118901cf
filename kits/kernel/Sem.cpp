// SPDX-License-Identifier: MIT
// Semaphores.

#include <OS.h>

#include <unordered_map>

#include "kernel/Kernel.h"

using namespace BPrivate;

namespace {

struct Semaphore {
	/// Free places, never negative.
	int32 available = 0;
	/// What the waiting threads want together.
	int32 wanted = 0;
	char name[B_OS_NAME_LENGTH];
	WaitQueue waiters;
};


struct SemaphoreTable {
	std::unordered_map<sem_id, std::unique_ptr<Semaphore>> semaphores;
	sem_id nextId = 1;
};


SemaphoreTable&
table()
{
	static SemaphoreTable* sTable = new SemaphoreTable;
	return *sTable;
}


Semaphore*
find_semaphore(sem_id id)
{
	auto found = table().semaphores.find(id);
	return found == table().semaphores.end() ? nullptr : found->second.get();
}


/// Gives free places to those who wait, strictly in the order of their coming.
void
serve(Semaphore* semaphore)
{
	while (Waiter* first = semaphore->waiters.First()) {
		if (first->wanted > semaphore->available)
			return;
		semaphore->available -= first->wanted;
		semaphore->wanted -= first->wanted;
		semaphore->waiters.Wake(first, B_OK);
	}
}

} // namespace


sem_id
create_sem(int32 count, const char* name)
{
	if (count < 0)
		return B_BAD_VALUE;

	KernelSection section;
	auto semaphore = std::make_unique<Semaphore>();
	semaphore->available = count;
	copy_name(semaphore->name, name == nullptr ? "unnamed semaphore" : name);
	sem_id id = table().nextId++;
	table().semaphores[id] = std::move(semaphore);
	return id;
}


status_t
delete_sem(sem_id id)
{
	KernelSection section;
	Semaphore* semaphore = find_semaphore(id);
	if (semaphore == nullptr)
		return B_BAD_SEM_ID;
	semaphore->waiters.WakeAll(B_BAD_SEM_ID);
	table().semaphores.erase(id);
	return B_OK;
}


status_t
acquire_sem(sem_id id)
{
	return acquire_sem_etc(id, 1, 0, 0);
}


status_t
acquire_sem_etc(sem_id id, int32 count, uint32 flags, bigtime_t timeout)
{
	if (count < 1)
		return B_BAD_VALUE;

	KernelSection section;
	Semaphore* semaphore = find_semaphore(id);
	if (semaphore == nullptr)
		return B_BAD_SEM_ID;
	if (semaphore->waiters.First() == nullptr && semaphore->available >= count) {
		semaphore->available -= count;
		return B_OK;
	}

	KernelDeadline deadline(flags, timeout);
	if (deadline.IsImmediate())
		return deadline.Status();

	Waiter waiter;
	waiter.wanted = count;
	semaphore->wanted += count;
	section.Current()->waitsFor = id;
	status_t status = section.Wait(semaphore->waiters, waiter, deadline, B_THREAD_WAITING);
	section.Current()->waitsFor = -1;
	if (!waiter.done) {
		// A large request that gives up may have been in the way of smaller ones. The semaphore
		// is still there: deleting it would have woken us.
		semaphore->wanted -= count;
		serve(semaphore);
	}
	return status;
}


status_t
release_sem(sem_id id)
{
	return release_sem_etc(id, 1, 0);
}


status_t
release_sem_etc(sem_id id, int32 count, uint32 flags)
{
	bool all = (flags & B_RELEASE_ALL) != 0;
	if (count < 1 && !all)
		return B_BAD_VALUE;

	KernelSection section;
	Semaphore* semaphore = find_semaphore(id);
	if (semaphore == nullptr)
		return B_BAD_SEM_ID;

	if (all)
		count = semaphore->wanted;
	else if ((flags & B_RELEASE_IF_WAITING_ONLY) != 0)
		count = std::min(count, std::max(semaphore->wanted - semaphore->available, 0));
	if (__builtin_add_overflow(semaphore->available, count, &count))
		return B_BAD_VALUE;
	semaphore->available = count;
	serve(semaphore);
	return B_OK;
}


status_t
get_sem_count(sem_id id, int32* threadCount)
{
	if (threadCount == nullptr)
		return B_BAD_VALUE;

	KernelSection section;
	Semaphore* semaphore = find_semaphore(id);
	if (semaphore == nullptr)
		return B_BAD_SEM_ID;
	*threadCount = semaphore->available - semaphore->wanted;
	return B_OK;
}

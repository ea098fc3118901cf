// SPDX-License-Identifier: MIT
// Data handed from thread to thread.

#include <OS.h>

#include <string.h>

#include <algorithm>

#include "kernel/Kernel.h"

using namespace BPrivate;

namespace {

constexpr size_t kMaxDataSize = 64 * 1024;

} // namespace


status_t
send_data(thread_id id, int32 code, const void* buffer, size_t bufferSize)
{
	if (buffer == nullptr && bufferSize > 0)
		return B_BAD_VALUE;
	if (bufferSize > kMaxDataSize)
		return B_NO_MEMORY;

	KernelSection section;
	std::shared_ptr<Thread> thread = find_thread_record(id);
	if (thread == nullptr || thread->kind == Thread::Kind::kTeam)
		return B_BAD_THREAD_ID;

	while (thread->hasData) {
		Waiter waiter;
		status_t status = section.Wait(thread->senders, waiter, KernelDeadline(), B_THREAD_WAITING);
		if (status != B_OK)
			return status;
		if (thread->dead)
			return B_BAD_THREAD_ID;
	}

	const char* bytes = static_cast<const char*>(buffer);
	thread->data.assign(bytes, bytes + bufferSize);
	thread->dataCode = code;
	thread->dataSender = section.Current()->id;
	thread->hasData = true;
	thread->receivers.WakeAll(B_OK);
	return B_OK;
}


int32
receive_data(thread_id* sender, void* buffer, size_t bufferSize)
{
	if (buffer == nullptr && bufferSize > 0)
		return B_BAD_VALUE;

	KernelSection section;
	Thread* thread = section.Current();
	while (!thread->hasData) {
		Waiter waiter;
		status_t status =
			section.Wait(thread->receivers, waiter, KernelDeadline(), B_THREAD_RECEIVING);
		if (status != B_OK)
			return status;
	}

	size_t size = std::min(bufferSize, thread->data.size());
	if (size > 0)
		memcpy(buffer, thread->data.data(), size);
	if (sender != nullptr)
		*sender = thread->dataSender;
	thread->hasData = false;
	thread->data.clear();
	if (thread->senders.First() != nullptr)
		thread->senders.Wake(thread->senders.First(), B_OK);
	return thread->dataCode;
}


bool
has_data(thread_id id)
{
	KernelSection section;
	std::shared_ptr<Thread> thread = find_thread_record(id);
	return thread != nullptr && thread->hasData;
}

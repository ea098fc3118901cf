// SPDX-License-Identifier: MIT
// The part of a looper that outlives it: its lock and the messages that arrive.

#include "app/LooperPort.h"

#include <algorithm>
#include <utility>

#include <Message.h>
#include <MessageQueue.h>

#include "app/Deadline.h"
#include "app/LockChecker.h"

namespace BPrivate {

namespace {

constexpr thread_id kNobody = -1;

// Locking asks for these all the time, and no program loads this library late.
#define LOOPER_TLS thread_local __attribute__((tls_model("initial-exec")))

// Plain data, so that they can be used from the destructors of static and thread objects.
LOOPER_TLS thread_id sCurrentThread = kNobody;
LOOPER_TLS LooperPort* sNewestHeld = nullptr;

} // namespace


struct LooperPort::Waiter {
	thread_id thread;
	std::condition_variable condition;
	bool granted = false;
	bool failed = false;
};


thread_id
CurrentThread()
{
	if (sCurrentThread == kNobody)
		sCurrentThread = find_thread(nullptr);
	return sCurrentThread;
}


LooperPort::LooperPort(port_id id, BLooper* looper, BWindow* window)
	: fId(id),
	  fLooper(looper),
	  fWindow(window),
	  fKind(window != nullptr ? kWindowLooper : kPlainLooper),
	  fThread(kNobody),
	  fRunning(false),
	  fUserWaits(0),
	  fClosed(false),
	  fMovedByOthers(false),
	  fOwner(kNobody),
	  fLevels(0),
	  fOlderHeld(nullptr)
{
}


LooperPort::~LooperPort()
{
	for (BMessage* message : fMessages)
		delete message;
}


status_t
LooperPort::Lock(bigtime_t timeout)
{
	if (IsLockedByCaller()) {
		fLevels++;
		return B_OK;
	}

	std::unique_lock<std::mutex> lock(fMutex);
	if (fClosed)
		return B_BAD_VALUE;

	if (fOwner != kNobody) {
		Deadline deadline(timeout);
		Waiter waiter;
		waiter.thread = CurrentThread();
		fWaiters.push_back(&waiter);
		deadline.Wait(waiter.condition, lock, [&] { return waiter.granted || waiter.failed; });
		if (waiter.failed)
			return B_BAD_VALUE;
		if (!waiter.granted) {
			fWaiters.erase(std::find(fWaiters.begin(), fWaiters.end(), &waiter));
			return deadline.Error();
		}
	} else {
		fOwner = CurrentThread();
		fLevels = 1;
	}
	lock.unlock();

	Taken();
	return B_OK;
}


void
LooperPort::Unlock()
{
	if (!IsLockedByCaller())
		return;
	if (fLevels > 1) {
		fLevels--;
		return;
	}
	Released();
}


int32
LooperPort::UnlockFully()
{
	if (!IsLockedByCaller())
		return 0;

	int32 levels = fLevels;
	Released();
	return levels;
}


status_t
LooperPort::LockAgain(int32 levels)
{
	if (levels <= 0)
		return B_OK;

	status_t status = Lock(B_INFINITE_TIMEOUT);
	if (status == B_OK)
		fLevels += levels - 1;
	return status;
}


bool
LooperPort::IsLockedByCaller() const
{
	return fOwner.load(std::memory_order_relaxed) == CurrentThread();
}


int32
LooperPort::CountLockRequests() const
{
	std::lock_guard<std::mutex> lock(fMutex);
	return int32(fWaiters.size()) + (fOwner != kNobody ? 1 : 0);
}


status_t
LooperPort::Post(BMessage* message)
{
	std::lock_guard<std::mutex> lock(fMutex);
	if (fClosed)
		return B_BAD_PORT_ID;

	fMessages.push_back(message);
	fArrived.notify_one();
	return B_OK;
}


bool
LooperPort::HasMessages() const
{
	std::lock_guard<std::mutex> lock(fMutex);
	return !fMessages.empty();
}


bool
LooperPort::WaitForMessage(bigtime_t timeout)
{
	Deadline deadline(timeout);
	std::unique_lock<std::mutex> lock(fMutex);
	const bool arrived =
		deadline.Wait(fArrived, lock, [this] { return !fMessages.empty() || fMovedByOthers; });
	fMovedByOthers = false;
	return arrived;
}


BMessage*
LooperPort::Take()
{
	std::lock_guard<std::mutex> lock(fMutex);
	if (fMessages.empty())
		return nullptr;

	BMessage* message = fMessages.front();
	fMessages.pop_front();
	return message;
}


void
LooperPort::MoveInto(BMessageQueue* queue)
{
	// Under the queue's lock: two threads that move at the same time must not change the order.
	queue->Lock();
	std::deque<BMessage*> arrived;
	{
		std::lock_guard<std::mutex> lock(fMutex);
		arrived.swap(fMessages);
	}
	for (BMessage* message : arrived)
		queue->AddMessage(message);
	queue->Unlock();

	// The looper may be about to wait for what it does not know to be in its queue.
	if (!arrived.empty() && CurrentThread() != fThread) {
		std::lock_guard<std::mutex> lock(fMutex);
		fMovedByOthers = true;
		fArrived.notify_all();
	}
}


std::deque<BMessage*>
LooperPort::Close()
{
	{
		std::lock_guard<std::mutex> lock(fMutex);
		fClosed = true;
		for (Waiter* waiter : fWaiters) {
			waiter->failed = true;
			waiter->condition.notify_one();
		}
		fWaiters.clear();
	}
	UnlockFully();

	std::deque<BMessage*> left;
	std::lock_guard<std::mutex> lock(fMutex);
	left.swap(fMessages);
	fClosedCondition.notify_all();
	return left;
}


void
LooperPort::WaitUntilClosed()
{
	std::unique_lock<std::mutex> lock(fMutex);
	fClosedCondition.wait(lock, [this] { return fClosed; });
}


LooperPort*
LooperPort::HeldPort(const BLooper* looper)
{
	for (LooperPort* port = sNewestHeld; port != nullptr; port = port->fOlderHeld) {
		if (port->fLooper == looper)
			return port;
	}
	return nullptr;
}


LooperPort*
LooperPort::NewestHeld()
{
	return sNewestHeld;
}


void
LooperPort::Taken()
{
	if (LockCheckerIsOn())
		CheckTaken(this, sNewestHeld);
	fKeepWhileHeld = shared_from_this();
	fOlderHeld = sNewestHeld;
	sNewestHeld = this;
}


void
LooperPort::Released()
{
	LooperPort** link = &sNewestHeld;
	while (*link != this)
		link = &(*link)->fOlderHeld;
	*link = fOlderHeld;
	fOlderHeld = nullptr;

	// The next owner sets it again, so it must be out of the way before the lock is.
	std::shared_ptr<LooperPort> keep = std::move(fKeepWhileHeld);
	std::lock_guard<std::mutex> lock(fMutex);
	HandOver();
}


void
LooperPort::HandOver()
{
	if (fWaiters.empty()) {
		fOwner = kNobody;
		fLevels = 0;
		return;
	}

	Waiter* next = fWaiters.front();
	fWaiters.pop_front();
	fOwner = next->thread;
	fLevels = 1;
	next->granted = true;
	next->condition.notify_one();
}

} // namespace BPrivate

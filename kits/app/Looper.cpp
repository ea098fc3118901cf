// SPDX-License-Identifier: MIT
// A looper's making and ending, its handlers, its lock and what is posted to it. See LooperLoop.cpp for its loop.

#include <Looper.h>

#include <algorithm>
#include <cstring>

#include <List.h>
#include <MessageFilter.h>
#include <MessageQueue.h>
#include <Messenger.h>

#include "app/Delivery.h"
#include "app/LooperPort.h"
#include "app/MessagePrivate.h"
#include "app/Registry.h"

using BPrivate::LooperPort;
using BPrivate::Registry;

static const char* const kPriorityField = "_prio";
static const char* const kCapacityField = "_port_cap";


BLooper::BLooper(const char* name, int32 priority, int32 portCapacity)
	: BLooper(nullptr, name, priority, portCapacity)
{
}


BLooper::BLooper(BMessage* archive)
	: BHandler(archive),
	  fQueue(new BMessageQueue),
	  fLastMessage(nullptr),
	  fPreferred(nullptr),
	  fCommonFilters(nullptr),
	  fPriority(B_NORMAL_PRIORITY),
	  fPortCapacity(B_LOOPER_PORT_DEFAULT_CAPACITY),
	  fRunCalled(false),
	  fLoopsInCaller(false),
	  fTerminating(false),
	  fOutlivesLoop(false)
{
	archive->FindInt32(kPriorityField, &fPriority);
	archive->FindInt32(kCapacityField, &fPortCapacity);
	Register(nullptr);
}


BLooper::BLooper(BWindow* window, const char* name, int32 priority, int32 portCapacity)
	: BHandler(name),
	  fQueue(new BMessageQueue),
	  fLastMessage(nullptr),
	  fPreferred(nullptr),
	  fCommonFilters(nullptr),
	  fPriority(priority),
	  fPortCapacity(portCapacity),
	  fRunCalled(false),
	  fLoopsInCaller(false),
	  fTerminating(false),
	  fOutlivesLoop(false)
{
	Register(window);
}


BLooper::~BLooper()
{
	if (fRunCalled && !fTerminating)
		debugger("You can't call delete on a BLooper object once it is running.");

	Lock();
	delete fLastMessage;
	fLastMessage = nullptr;

	// The looper itself is the first; it goes with the registration.
	while (fHandlers.size() > 1)
		RemoveHandler(fHandlers.back());
	BLooper::SetCommonFilterList(nullptr);
	SetLooper(nullptr, nullptr);

	Registry::Default().RemoveLooper(this);
	std::deque<BMessage*> left = fPort->Close();
	delete fQueue;
	for (BMessage* message : left)
		delete message;
}


BArchivable*
BLooper::Instantiate(BMessage* archive)
{
	return validate_instantiation(archive, "BLooper") ? new BLooper(archive) : nullptr;
}


status_t
BLooper::Archive(BMessage* archive, bool deep) const
{
	status_t status = BHandler::Archive(archive, deep);
	if (status == B_OK)
		status = archive->AddInt32(kCapacityField, fPortCapacity);
	if (status == B_OK)
		status = archive->AddInt32(kPriorityField, fPriority);
	return status;
}


status_t
BLooper::PostMessage(uint32 command)
{
	BMessage message(command);
	return PostTo(this, &message, this, nullptr);
}


status_t
BLooper::PostMessage(BMessage* message)
{
	return PostTo(this, message, this, nullptr);
}


status_t
BLooper::PostMessage(uint32 command, BHandler* handler, BHandler* replyTo)
{
	BMessage message(command);
	return PostTo(this, &message, handler, replyTo);
}


status_t
BLooper::PostMessage(BMessage* message, BHandler* handler, BHandler* replyTo)
{
	return PostTo(this, message, handler, replyTo);
}


status_t
BLooper::PostTo(const BLooper* looper, BMessage* message, BHandler* handler, BHandler* replyTo)
{
	if (message == nullptr)
		return B_BAD_VALUE;

	std::shared_ptr<LooperPort> port = Registry::Default().PortFor(looper);
	if (port == nullptr)
		return B_BAD_PORT_ID;

	BPrivate::MessageAddress to{port->Id(), kPreferredToken, BPrivate::ThisTeam()};
	if (handler == looper) {
		to.token = kNoToken;
	} else if (handler != nullptr) {
		to.token = handler->fToken;
		if (Registry::Default().HandlerPort(to.token) != to.port)
			return B_MISMATCHED_VALUES;
	}
	return BPrivate::Deliver(to, *message, BPrivate::AddressOf(BMessenger(replyTo)));
}


BMessageQueue*
BLooper::MessageQueue() const
{
	fPort->MoveInto(fQueue);
	return fQueue;
}


bool
BLooper::IsMessageWaiting() const
{
	return !fQueue->IsEmpty() || fPort->HasMessages();
}


void
BLooper::AddHandler(BHandler* handler)
{
	if (handler == nullptr || handler->Looper() != nullptr || !Lock())
		return;

	handler->SetLooper(this, fPort.get());
	handler->SetNextHandler(this);
	fHandlers.push_back(handler);
	Unlock();
}


bool
BLooper::RemoveHandler(BHandler* handler)
{
	if (handler == nullptr || handler == this || handler->Looper() != this || !Lock())
		return false;

	if (handler == fPreferred)
		fPreferred = nullptr;
	// A large window closes from either end of the list.
	if (fHandlers.back() == handler)
		fHandlers.pop_back();
	else
		fHandlers.erase(std::find(fHandlers.begin(), fHandlers.end(), handler));
	// Whoever passed its messages on through it passes them to the one behind it.
	if (handler->fIsNext) {
		for (BHandler* other : fHandlers) {
			if (other->fNextHandler == handler)
				other->fNextHandler = handler->fNextHandler;
		}
	}
	handler->SetLooper(nullptr, nullptr);
	Unlock();
	return true;
}


int32
BLooper::CountHandlers() const
{
	return int32(fHandlers.size());
}


BHandler*
BLooper::HandlerAt(int32 index) const
{
	return index >= 0 && index < CountHandlers() ? fHandlers[index] : nullptr;
}


int32
BLooper::IndexOf(BHandler* handler) const
{
	auto found = std::find(fHandlers.begin(), fHandlers.end(), handler);
	return found != fHandlers.end() ? int32(found - fHandlers.begin()) : -1;
}


BHandler*
BLooper::PreferredHandler() const
{
	return fPreferred;
}


void
BLooper::SetPreferredHandler(BHandler* handler)
{
	fPreferred = handler != nullptr && handler->Looper() == this ? handler : nullptr;
}


bool
BLooper::Lock()
{
	return LockPortOf(this, B_INFINITE_TIMEOUT) == B_OK;
}


void
BLooper::Unlock()
{
	LooperPort* port = LooperPort::HeldPort(this);
	if (port != nullptr)
		port->Unlock();
}


bool
BLooper::IsLocked() const
{
	return LooperPort::HeldPort(this) != nullptr;
}


status_t
BLooper::LockWithTimeout(bigtime_t timeout)
{
	return LockPortOf(this, timeout);
}


status_t
BLooper::LockPortOf(const BLooper* looper, bigtime_t timeout)
{
	LooperPort* held = LooperPort::HeldPort(looper);
	if (held != nullptr)
		return held->Lock(timeout);

	std::shared_ptr<LooperPort> port = Registry::Default().PortFor(looper);
	return port != nullptr ? port->Lock(timeout) : B_BAD_VALUE;
}


thread_id
BLooper::Thread() const
{
	return fPort->Thread();
}


team_id
BLooper::Team() const
{
	return BPrivate::ThisTeam();
}


BLooper*
BLooper::LooperForThread(thread_id thread)
{
	std::shared_ptr<LooperPort> port = Registry::Default().PortForThread(thread);
	return port != nullptr ? port->Looper() : nullptr;
}


thread_id
BLooper::LockingThread() const
{
	return fPort->LockingThread();
}


int32
BLooper::CountLocks() const
{
	return fPort->CountLocks();
}


int32
BLooper::CountLockRequests() const
{
	return fPort->CountLockRequests();
}


void
BLooper::AddCommonFilter(BMessageFilter* filter)
{
	if (filter == nullptr || filter->fLooper != nullptr || filter->fHandler != nullptr)
		return;

	if (fCommonFilters == nullptr)
		fCommonFilters = new BList;
	fCommonFilters->AddItem(filter);
	filter->fLooper = this;
}


bool
BLooper::RemoveCommonFilter(BMessageFilter* filter)
{
	if (fCommonFilters == nullptr || !fCommonFilters->RemoveItem(static_cast<void*>(filter)))
		return false;

	filter->fLooper = nullptr;
	return true;
}


void
BLooper::SetCommonFilterList(BList* filters)
{
	if (filters == fCommonFilters)
		return;

	if (fCommonFilters != nullptr) {
		for (int32 i = 0; i < fCommonFilters->CountItems(); i++)
			delete static_cast<BMessageFilter*>(fCommonFilters->ItemAt(i));
		delete fCommonFilters;
	}
	fCommonFilters = filters;
	for (int32 i = 0; filters != nullptr && i < filters->CountItems(); i++)
		static_cast<BMessageFilter*>(filters->ItemAt(i))->fLooper = this;
}


BList*
BLooper::CommonFilterList() const
{
	return fCommonFilters;
}


/// Makes the looper known, locked by the calling thread, and its own first handler.
void
BLooper::Register(BWindow* window)
{
	fPort = Registry::Default().AddLooper(this, window);
	SetLooper(this, fPort.get());
	fHandlers.push_back(this);
}

// SPDX-License-Identifier: MIT
// An object that a looper hands messages to.

#include <Handler.h>

#include <cstdlib>
#include <cstring>

#include <List.h>
#include <Looper.h>
#include <Message.h>
#include <MessageFilter.h>
#include <Messenger.h>

#include "app/LooperPort.h"
#include "app/ObserverList.h"
#include "app/Registry.h"

using BPrivate::LooperPort;
using BPrivate::Registry;

static const char* const kNameField = "_name";


BHandler::BHandler(const char* name)
	: fToken(Registry::Default().AddHandler(this)),
	  fName(nullptr),
	  fLooper(nullptr),
	  fNextHandler(nullptr),
	  fIsNext(false),
	  fFilters(nullptr),
	  fObservers(nullptr)
{
	SetName(name);
}


BHandler::BHandler(BMessage* archive)
	: BArchivable(archive),
	  fToken(Registry::Default().AddHandler(this)),
	  fName(nullptr),
	  fLooper(nullptr),
	  fNextHandler(nullptr),
	  fIsNext(false),
	  fFilters(nullptr),
	  fObservers(nullptr)
{
	const char* name;
	if (archive != nullptr && archive->FindString(kNameField, &name) == B_OK)
		SetName(name);
}


BHandler::~BHandler()
{
	if (LockLooper()) {
		BLooper* looper = Looper();
		looper->RemoveHandler(this);
		looper->Unlock();
	}
	Registry::Default().RemoveHandler(fToken);

	BHandler::SetFilterList(nullptr);
	delete fObservers;
	free(fName);
}


BArchivable*
BHandler::Instantiate(BMessage* archive)
{
	return validate_instantiation(archive, "BHandler") ? new BHandler(archive) : nullptr;
}


status_t
BHandler::Archive(BMessage* archive, bool deep) const
{
	status_t status = BArchivable::Archive(archive, deep);
	if (status == B_OK && fName != nullptr)
		status = archive->AddString(kNameField, fName);
	return status;
}


void
BHandler::MessageReceived(BMessage* message)
{
	if (fNextHandler != nullptr) {
		fNextHandler->MessageReceived(message);
		return;
	}
	AnswerNotUnderstood(message);
}


BLooper*
BHandler::Looper() const
{
	return fLooper;
}


void
BHandler::SetName(const char* name)
{
	char* copy = name != nullptr ? strdup(name) : nullptr;
	free(fName);
	fName = copy;
}


const char*
BHandler::Name() const
{
	return fName;
}


void
BHandler::SetNextHandler(BHandler* handler)
{
	// The chain must not leave the looper: its lock would not cover the end of it.
	if (Looper() == nullptr || (handler != nullptr && handler->Looper() != Looper()))
		return;
	fNextHandler = handler;
	if (handler != nullptr)
		handler->fIsNext = true;
}


BHandler*
BHandler::NextHandler() const
{
	return fNextHandler;
}


void
BHandler::AddFilter(BMessageFilter* filter)
{
	if (filter == nullptr || filter->fHandler != nullptr || filter->fLooper != nullptr)
		return;

	if (fFilters == nullptr)
		fFilters = new BList;
	fFilters->AddItem(filter);
	filter->fHandler = this;
	filter->fLooper = Looper();
}


bool
BHandler::RemoveFilter(BMessageFilter* filter)
{
	if (fFilters == nullptr || !fFilters->RemoveItem(static_cast<void*>(filter)))
		return false;

	filter->fHandler = nullptr;
	filter->fLooper = nullptr;
	return true;
}


void
BHandler::SetFilterList(BList* filters)
{
	if (filters == fFilters)
		return;

	if (fFilters != nullptr) {
		for (int32 i = 0; i < fFilters->CountItems(); i++)
			delete static_cast<BMessageFilter*>(fFilters->ItemAt(i));
		delete fFilters;
	}
	fFilters = filters;
	for (int32 i = 0; filters != nullptr && i < filters->CountItems(); i++) {
		BMessageFilter* filter = static_cast<BMessageFilter*>(filters->ItemAt(i));
		filter->fHandler = this;
		filter->fLooper = Looper();
	}
}


BList*
BHandler::FilterList()
{
	return fFilters;
}


bool
BHandler::LockLooper()
{
	return LockLooperWithTimeout(B_INFINITE_TIMEOUT) == B_OK;
}


status_t
BHandler::LockLooperWithTimeout(bigtime_t timeout)
{
	// A handler whose looper this thread has locked stays where it is: no need to ask the registry.
	LooperPort* held = LooperPort::HeldPort(fLooper);
	if (held != nullptr)
		return held->Lock(timeout);

	Registry& registry = Registry::Default();
	port_id id = registry.HandlerPort(fToken);
	std::shared_ptr<LooperPort> port = registry.PortFor(id);
	if (port == nullptr)
		return B_BAD_VALUE;

	status_t status = port->Lock(timeout);
	if (status != B_OK)
		return status;
	if (registry.HandlerPort(fToken) == id)
		return B_OK;

	port->Unlock();
	return B_MISMATCHED_VALUES;
}


void
BHandler::UnlockLooper()
{
	LooperPort* port = LooperPort::HeldPort(Looper());
	if (port != nullptr)
		port->Unlock();
}


status_t
BHandler::StartWatching(BMessenger target, uint32 what)
{
	return Observers()->Add(target, what);
}


status_t
BHandler::StartWatchingAll(BMessenger target)
{
	return StartWatching(target, B_OBSERVER_OBSERVE_ALL);
}


status_t
BHandler::StopWatching(BMessenger target, uint32 what)
{
	return Observers()->Remove(target, what);
}


status_t
BHandler::StopWatchingAll(BMessenger target)
{
	return StopWatching(target, B_OBSERVER_OBSERVE_ALL);
}


status_t
BHandler::StartWatching(BHandler* observer, uint32 what)
{
	return observer != nullptr ? Observers()->Add(observer->fToken, what) : B_BAD_VALUE;
}


status_t
BHandler::StartWatchingAll(BHandler* observer)
{
	return StartWatching(observer, B_OBSERVER_OBSERVE_ALL);
}


status_t
BHandler::StopWatching(BHandler* observer, uint32 what)
{
	return observer != nullptr ? Observers()->Remove(observer->fToken, what) : B_BAD_VALUE;
}


status_t
BHandler::StopWatchingAll(BHandler* observer)
{
	return StopWatching(observer, B_OBSERVER_OBSERVE_ALL);
}


void
BHandler::SendNotices(uint32 what, const BMessage* notice)
{
	if (!IsWatched())
		return;

	BMessage copy;
	if (notice != nullptr) {
		copy = *notice;
		copy.AddInt32(B_OBSERVE_ORIGINAL_WHAT, int32(notice->what));
	}
	copy.what = B_OBSERVER_NOTICE_CHANGE;
	copy.AddInt32(B_OBSERVE_WHAT_CHANGE, int32(what));
	fObservers->Send(what, &copy);
}


bool
BHandler::IsWatched() const
{
	return fObservers != nullptr && !fObservers->IsEmpty();
}


void
BHandler::SetLooper(BLooper* looper, const LooperPort* port)
{
	fLooper = looper;
	fNextHandler = nullptr;
	for (int32 i = 0; fFilters != nullptr && i < fFilters->CountItems(); i++)
		static_cast<BMessageFilter*>(fFilters->ItemAt(i))->fLooper = looper;
	// Last: without a looper's lock to wait for, the handler is the other thread's.
	Registry::Default().SetHandlerPort(fToken, port != nullptr ? port->Id() : -1);
}


BPrivate::ObserverList*
BHandler::Observers()
{
	if (fObservers == nullptr)
		fObservers = new BPrivate::ObserverList;
	return fObservers;
}


void
BHandler::AnswerNotUnderstood(BMessage* message)
{
	bool scripting = message->HasSpecifiers();
	switch (message->what) {
		case B_SET_PROPERTY:
		case B_GET_PROPERTY:
		case B_CREATE_PROPERTY:
		case B_DELETE_PROPERTY:
		case B_COUNT_PROPERTIES:
		case B_EXECUTE_PROPERTY:
		case B_GET_SUPPORTED_SUITES:
			scripting = true;
			break;
	}
	if (!scripting && !message->WasDropped())
		return;

	message->PrintToStream();
	BMessage reply(B_MESSAGE_NOT_UNDERSTOOD);
	reply.AddInt32("error", scripting ? B_BAD_SCRIPT_SYNTAX : B_ERROR);
	reply.AddString(
		"message", scripting ? "Didn't understand the specifier(s)" : "Didn't understand the drop");
	message->SendReply(&reply);
}

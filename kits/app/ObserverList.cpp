// SPDX-License-Identifier: MIT
// Who watches a handler, and for what.

#include "app/ObserverList.h"

#include <algorithm>

#include <Handler.h>
#include <Message.h>

#include "app/MessagePrivate.h"
#include "app/Registry.h"

namespace BPrivate {

bool
ObserverList::Observer::operator==(const Observer& other) const
{
	return token == other.token && messenger == other.messenger;
}


bool
ObserverList::Observer::Find(BMessenger* target) const
{
	*target = messenger;
	if (token != kNoToken) {
		MessageAddress address = AddressOf(messenger);
		address.port = Registry::Default().HandlerPort(token);
		address.token = token;
		*target = MessengerFor(address);
	}
	return target->IsValid();
}


status_t
ObserverList::Add(const BMessenger& target, uint32 what)
{
	if (!target.IsValid())
		return B_BAD_HANDLER;
	return Add(Observer{target, kNoToken}, what);
}


status_t
ObserverList::Add(int32 handlerToken, uint32 what)
{
	return Add(Observer{BMessenger(), handlerToken}, what);
}


status_t
ObserverList::Remove(const BMessenger& target, uint32 what)
{
	return Remove(Observer{target, kNoToken}, what);
}


status_t
ObserverList::Remove(int32 handlerToken, uint32 what)
{
	return Remove(Observer{BMessenger(), handlerToken}, what);
}


void
ObserverList::Send(uint32 what, BMessage* notice)
{
	SendTo(what, notice);
	if (what != B_OBSERVER_OBSERVE_ALL)
		SendTo(B_OBSERVER_OBSERVE_ALL, notice);
}


status_t
ObserverList::Add(const Observer& observer, uint32 what)
{
	std::vector<Observer>& observers = fObservers[what];
	if (std::find(observers.begin(), observers.end(), observer) == observers.end())
		observers.push_back(observer);
	return B_OK;
}


status_t
ObserverList::Remove(const Observer& observer, uint32 what)
{
	auto list = fObservers.find(what);
	if (list == fObservers.end())
		return B_BAD_HANDLER;

	auto found = std::find(list->second.begin(), list->second.end(), observer);
	if (found == list->second.end())
		return B_BAD_HANDLER;

	list->second.erase(found);
	if (list->second.empty())
		fObservers.erase(list);
	return B_OK;
}


void
ObserverList::SendTo(uint32 list, BMessage* notice)
{
	auto found = fObservers.find(list);
	if (found == fObservers.end())
		return;

	for (const Observer& observer : found->second) {
		BMessenger target;
		if (observer.Find(&target))
			target.SendMessage(notice);
	}
}

} // namespace BPrivate

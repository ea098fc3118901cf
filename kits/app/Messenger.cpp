// SPDX-License-Identifier: MIT
// The address of a handler.

#include <Messenger.h>

#include <cstring>

#include <Handler.h>
#include <Looper.h>
#include <Message.h>
#include <Roster.h>

#include "app/Delivery.h"
#include "app/LooperPort.h"
#include "app/MessagePrivate.h"
#include "app/Registry.h"

using BPrivate::LooperPort;
using BPrivate::MessageAddress;
using BPrivate::Registry;

struct BPrivate::MessengerAccess {
	static MessageAddress Address(const BMessenger& messenger)
	{
		return {messenger.fPort, messenger.fHandlerToken, messenger.fTeam};
	}

	static BMessenger Make(const MessageAddress& address)
	{
		BMessenger messenger;
		messenger.fPort = address.port;
		messenger.fHandlerToken = address.token;
		messenger.fTeam = address.team;
		return messenger;
	}
};


MessageAddress
BPrivate::AddressOf(const BMessenger& messenger)
{
	return MessengerAccess::Address(messenger);
}


BMessenger
BPrivate::MessengerFor(const MessageAddress& address)
{
	return MessengerAccess::Make(address);
}


BMessenger::BMessenger(const char* signature, team_id team, status_t* result)
	: BMessenger()
{
	status_t status = SetTo(signature, team);
	if (result != nullptr)
		*result = status;
}


BMessenger::BMessenger(const BHandler* handler, const BLooper* looper, status_t* result)
	: BMessenger()
{
	status_t status = SetTo(handler, looper);
	if (result != nullptr)
		*result = status;
}


bool
BMessenger::IsTargetLocal() const
{
	return fPort >= 0 && fTeam == BPrivate::ThisTeam();
}


BHandler*
BMessenger::Target(BLooper** looper) const
{
	std::shared_ptr<LooperPort> port = Registry::Default().PortFor(fPort);
	if (looper != nullptr)
		*looper = port != nullptr ? port->Looper() : nullptr;
	return port != nullptr ? Registry::Default().HandlerIn(fPort, fHandlerToken) : nullptr;
}


bool
BMessenger::LockTarget() const
{
	return LockTargetWithTimeout(B_INFINITE_TIMEOUT) == B_OK;
}


status_t
BMessenger::LockTargetWithTimeout(bigtime_t timeout) const
{
	std::shared_ptr<LooperPort> port = Registry::Default().PortFor(fPort);
	return port != nullptr ? port->Lock(timeout) : B_BAD_VALUE;
}


status_t
BMessenger::SendMessage(uint32 command, BHandler* replyTo) const
{
	BMessage message(command);
	return SendMessage(&message, replyTo);
}


status_t
BMessenger::SendMessage(BMessage* message, BHandler* replyTo, bigtime_t timeout) const
{
	return SendMessage(message, BMessenger(replyTo), timeout);
}


status_t
BMessenger::SendMessage(BMessage* message, BMessenger replyTo, bigtime_t) const
{
	if (message == nullptr)
		return B_BAD_VALUE;
	return BPrivate::Deliver(BPrivate::AddressOf(*this), *message, BPrivate::AddressOf(replyTo));
}


status_t
BMessenger::SendMessage(uint32 command, BMessage* reply) const
{
	BMessage message(command);
	return SendMessage(&message, reply);
}


status_t
BMessenger::SendMessage(BMessage* message, BMessage* reply, bigtime_t, bigtime_t replyTimeout) const
{
	if (message == nullptr || reply == nullptr)
		return B_BAD_VALUE;
	return BPrivate::DeliverAndWait(BPrivate::AddressOf(*this), *message, reply, replyTimeout);
}


status_t
BMessenger::SetTo(const char* signature, team_id team)
{
	*this = BMessenger();
	if (signature == nullptr && team < 0)
		return B_BAD_VALUE;

	app_info info;
	status_t status = team < 0 ? be_roster->GetAppInfo(signature, &info)
							   : be_roster->GetRunningAppInfo(team, &info);
	if (status != B_OK)
		return status;
	if (signature != nullptr && strcasecmp(signature, info.signature) != 0)
		return B_MISMATCHED_VALUES;

	*this = BPrivate::MessengerFor(BPrivate::ApplicationAddress());
	return B_OK;
}


status_t
BMessenger::SetTo(const BHandler* handler, const BLooper* looper)
{
	*this = BMessenger();
	Registry& registry = Registry::Default();
	std::shared_ptr<LooperPort> port = registry.PortFor(looper);
	if (handler == nullptr) {
		if (looper == nullptr)
			return B_BAD_VALUE;
		if (port == nullptr)
			return B_BAD_PORT_ID;
		*this = BPrivate::MessengerFor({port->Id(), kPreferredToken, BPrivate::ThisTeam()});
		return B_OK;
	}

	port_id owner = registry.HandlerPort(handler->fToken);
	if (owner < 0 || (looper != nullptr && (port == nullptr || port->Id() != owner)))
		return B_MISMATCHED_VALUES;
	*this = BPrivate::MessengerFor({owner, handler->fToken, BPrivate::ThisTeam()});
	return B_OK;
}


bool
BMessenger::operator==(const BMessenger& other) const
{
	return BPrivate::AddressOf(*this) == BPrivate::AddressOf(other);
}


bool
BMessenger::IsValid() const
{
	return fPort >= 0 && Registry::Default().PortFor(fPort) != nullptr;
}


team_id
BMessenger::Team() const
{
	return fTeam;
}

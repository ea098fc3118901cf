// SPDX-License-Identifier: MIT
// What other kits may do with loopers, handlers and messengers beyond the public classes.

#include "app/LooperPrivate.h"

#include "app/Delivery.h"
#include "app/LooperPort.h"
#include "app/MessagePrivate.h"
#include "app/Registry.h"

namespace BPrivate {

void
LooperAccess::SetKind(BLooper* looper, looper_kind kind)
{
	looper->fPort->SetKind(kind);
}


looper_kind
LooperAccess::Kind(const BLooper* looper)
{
	return looper->fPort->Kind();
}


BWindow*
LooperAccess::Window(BLooper* looper)
{
	return looper->fPort->Window();
}


std::vector<BMessenger>
LooperAccess::LoopersOfKind(looper_kind kind, bigtime_t timeout)
{
	std::vector<BMessenger> loopers;
	for (const std::shared_ptr<LooperPort>& port : Registry::Default().Loopers()) {
		if (port->Kind() != kind || !port->IsRunning())
			continue;
		// It may go at any moment: only its port tells whether it is still there.
		if (port->Lock(timeout) != B_OK)
			continue;
		loopers.emplace_back(nullptr, port->Looper());
		port->Unlock();
	}
	return loopers;
}


BMessenger
LooperAccess::RunningApplication()
{
	const port_id id = Registry::Default().ApplicationPort();
	const std::shared_ptr<LooperPort> port = Registry::Default().PortFor(id);
	return port != nullptr && port->IsRunning() ? MessengerFor({id, kNoToken, ThisTeam()})
												: BMessenger();
}


std::vector<BWindow*>
LooperAccess::Windows()
{
	std::vector<BWindow*> windows;
	for (const std::shared_ptr<LooperPort>& port : Registry::Default().Loopers()) {
		if (port->Kind() == kWindowLooper || port->Kind() == kFilePanelWindowLooper)
			windows.push_back(port->Window());
	}
	return windows;
}


status_t
LooperAccess::LockIfThere(const BLooper* looper, bigtime_t timeout)
{
	return BLooper::LockPortOf(looper, timeout);
}


void
LooperAccess::BeginUserWait(BLooper* looper)
{
	looper->fPort->ChangeUserWaits(1);
}


void
LooperAccess::EndUserWait(BLooper* looper)
{
	looper->fPort->ChangeUserWaits(-1);
}


bool
LooperAccess::IsInUserWait(const BLooper* looper)
{
	const std::shared_ptr<LooperPort> port = Registry::Default().PortFor(looper);
	return port != nullptr && port->CountUserWaits() > 0;
}


int32
LooperAccess::UnlockFully(BLooper* looper)
{
	LooperPort* port = LooperPort::HeldPort(looper);
	return port != nullptr ? port->UnlockFully() : 0;
}


status_t
LooperAccess::LockAgain(BLooper* looper, int32 levels)
{
	std::shared_ptr<LooperPort> port = Registry::Default().PortFor(looper);
	return port != nullptr ? port->LockAgain(levels) : B_BAD_VALUE;
}


status_t
LooperAccess::PostOwned(port_id id, int32 token, BMessage* message)
{
	BMessage::Private(message).SetTarget(token);
	std::shared_ptr<LooperPort> port = Registry::Default().PortFor(id);
	status_t status = port != nullptr ? port->Post(message) : B_BAD_PORT_ID;
	if (status != B_OK)
		delete message;
	return status;
}


port_id
LooperAccess::Port(const BLooper* looper)
{
	return looper->fPort->Id();
}


int32
LooperAccess::Token(const BHandler* handler)
{
	return handler->fToken;
}


BHandler*
LooperAccess::HandlerFor(const BLooper* looper, int32 token)
{
	return Registry::Default().HandlerIn(looper->fPort->Id(), token);
}


bool
LooperAccess::IsRunning(const BLooper* looper)
{
	return looper->fPort->IsRunning();
}

} // namespace BPrivate

// SPDX-License-Identifier: MIT
// Bringing messages to loopers and replies to those who wait for them.

#include "app/Delivery.h"

#include <unistd.h>

#include <Messenger.h>

#include "app/Deadline.h"
#include "app/LooperPort.h"
#include "app/LooperPrivate.h"
#include "app/Registry.h"

namespace BPrivate {

namespace {

/// The copy of \a message that its receiver gets.
std::unique_ptr<BMessage>
MakeCopy(const BMessage& message, const MessageAddress& to, const MessageAddress& replyTo)
{
	auto copy = std::make_unique<BMessage>(message);
	BMessage::Private access(*copy);
	access.ClearDelivery();
	access.SetTarget(to.token);
	access.SetReplyAddress(replyTo);
	return copy;
}


/// Gives \a copy to the looper or the waiting sender at \a to.
status_t
Hand(const MessageAddress& to, std::unique_ptr<BMessage> copy)
{
	Registry& registry = Registry::Default();
	status_t status = B_BAD_PORT_ID;
	if (std::shared_ptr<LooperPort> port = registry.PortFor(to.port); port != nullptr)
		status = port->Post(copy.get());
	else if (std::shared_ptr<ReplyPort> reply = registry.ReplyPortFor(to.port); reply != nullptr)
		status = reply->Put(copy.get()) ? B_OK : B_BAD_PORT_ID;

	if (status == B_OK) {
		static_cast<void>(copy.release());
		return B_OK;
	}
	// Nobody has seen it, so nobody is to be told that it is answered.
	BMessage::Private(*copy).ClearDelivery();
	return status;
}


/// Makes \a answer the message that \a arrived is, its obligations to its sender included.
void
MoveAnswer(BMessage* arrived, BMessage* answer)
{
	BMessage::Private from(arrived);
	BMessage::Private to(answer);
	*answer = *arrived;
	to.SetTarget(from.Target());
	to.SetReplyAddress(from.ReplyAddress());
	to.MarkReply(nullptr);
	to.MarkDelivered((from.Flags() & BMessage::Private::kReplyRequired) != 0);
	from.ClearDelivery();
}


/// A reply port that others can find as long as this exists.
class PublishedReplyPort {
public:
	PublishedReplyPort()
		: fId(Registry::Default().NewPortId()),
		  fPort(std::make_shared<ReplyPort>())
	{
		Registry::Default().AddReplyPort(fId, fPort);
	}
	~PublishedReplyPort() { Registry::Default().RemoveReplyPort(fId); }

	MessageAddress Address() const { return {fId, kNoToken, ThisTeam()}; }

	status_t Wait(BMessage* answer, bigtime_t timeout)
	{
		std::unique_ptr<BMessage> arrived(fPort->Wait(timeout));
		if (arrived == nullptr)
			return Deadline(timeout).Error();
		if (answer != nullptr)
			MoveAnswer(arrived.get(), answer);
		return B_OK;
	}

private:
	const port_id fId;
	std::shared_ptr<ReplyPort> fPort;
};

} // namespace


team_id
ThisTeam()
{
	// Every view asks for it when it gets a window.
	static const team_id sTeam = getpid();
	return sTeam;
}


MessageAddress
ApplicationAddress()
{
	port_id port = Registry::Default().ApplicationPort();
	return port >= 0 ? MessageAddress{port, kPreferredToken, ThisTeam()} : MessageAddress();
}


status_t
Deliver(const MessageAddress& to, const BMessage& message, const MessageAddress& replyTo)
{
	std::unique_ptr<BMessage> copy =
		MakeCopy(message, to, replyTo.port >= 0 ? replyTo : ApplicationAddress());
	BMessage::Private(*copy).MarkDelivered();
	return Hand(to, std::move(copy));
}


status_t
DeliverAndWait(
	const MessageAddress& to, const BMessage& message, BMessage* answer, bigtime_t replyTimeout)
{
	CheckWait("a reply");

	PublishedReplyPort port;
	std::unique_ptr<BMessage> copy = MakeCopy(message, to, port.Address());
	BMessage::Private(*copy).MarkDelivered(true);
	status_t status = Hand(to, std::move(copy));
	return status == B_OK ? port.Wait(answer, replyTimeout) : status;
}


status_t
DeliverReply(const MessageAddress& to, const BMessage& reply, const BMessage* original,
	const BMessenger& replyTo, bigtime_t)
{
	MessageAddress replyAddress = AddressOf(replyTo);
	std::unique_ptr<BMessage> copy =
		MakeCopy(reply, to, replyAddress.port >= 0 ? replyAddress : ApplicationAddress());
	BMessage::Private(*copy).MarkReply(original);
	BMessage::Private(*copy).MarkDelivered();
	return Hand(to, std::move(copy));
}


status_t
DeliverReplyAndWait(const MessageAddress& to, const BMessage& reply, const BMessage* original,
	BMessage* answer, bigtime_t, bigtime_t replyTimeout)
{
	CheckWait("a reply to a reply");

	PublishedReplyPort port;
	std::unique_ptr<BMessage> copy = MakeCopy(reply, to, port.Address());
	BMessage::Private(*copy).MarkReply(original);
	BMessage::Private(*copy).MarkDelivered(true);
	status_t status = Hand(to, std::move(copy));
	return status == B_OK ? port.Wait(answer, replyTimeout) : status;
}


ReplyPort::ReplyPort()
	: fAnswer(nullptr),
	  fOver(false)
{
}


ReplyPort::~ReplyPort()
{
	delete fAnswer;
}


bool
ReplyPort::Put(BMessage* answer)
{
	std::lock_guard<std::mutex> lock(fMutex);
	if (fOver)
		return false;

	fAnswer = answer;
	fOver = true;
	fArrived.notify_one();
	return true;
}


BMessage*
ReplyPort::Wait(bigtime_t timeout)
{
	Deadline deadline(timeout);
	std::unique_lock<std::mutex> lock(fMutex);
	deadline.Wait(fArrived, lock, [this] { return fAnswer != nullptr; });
	fOver = true;
	BMessage* answer = fAnswer;
	fAnswer = nullptr;
	return answer;
}

} // namespace BPrivate

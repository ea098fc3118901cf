// SPDX-License-Identifier: MIT
// WindowClient: the host's reports become messages of the window.
#include "interface/WindowClient.h"

#include <Message.h>
#include <Messenger.h>

#include "app/LooperPrivate.h"
#include "app/MessagePrivate.h"
#include "display/DragFields.h"
#include "interface/WindowPrivate.h"

namespace BPrivate {

WindowClient::WindowClient(port_id port)
	: fPort(port)
{
}


void
WindowClient::Deliver(std::unique_ptr<BMessage> message)
{
	switch (message->what) {
		case B_WINDOW_MOVED:
		case B_WINDOW_RESIZED:
		case B_MINIMIZE:
		case B_ZOOM:
			message->SetBool(kFromHost, true);
			break;

		default:
			break;
	}
	LooperAccess::PostOwned(fPort, kNoToken, message.release());
}


void
WindowClient::Dropped(std::unique_ptr<BMessage> message, BPoint screenWhere, BPoint offset)
{
	BMessenger replyTo;
	message->FindMessenger(kDragReplyTo, &replyTo);
	message->RemoveName(kDragReplyTo);
	message->RemoveName("_drop_point_");
	message->RemoveName("_drop_offset_");
	message->AddPoint("_drop_point_", screenWhere);
	message->AddPoint("_drop_offset_", offset);

	BMessage::Private access(*message);
	access.ClearDelivery();
	access.SetReplyAddress(AddressOf(replyTo));
	access.MarkDelivered();
	access.MarkDropped();
	LooperAccess::PostOwned(fPort, kNoToken, message.release());
}


void
WindowClient::NeedsRedraw()
{
	LooperAccess::PostOwned(fPort, kNoToken, new BMessage(kMsgCanvasOutdated));
}

} // namespace BPrivate

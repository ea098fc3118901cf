// SPDX-License-Identifier: MIT

#include "app/PlimView.h"

#include <Message.h>


PlimView::PlimView(BRect frame, const char* name)
	: BView(frame, name, B_FOLLOW_ALL_SIDES, B_WILL_DRAW)
{
}


PlimView::~PlimView() = default;


void
PlimView::MessageReceived(BMessage* message)
{
	message->PrintToStream();
	if (message->what == B_SIMPLE_DATA && message->HasRef("refs"))
		return;
	BView::MessageReceived(message);
}

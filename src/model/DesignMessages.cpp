// SPDX-License-Identifier: MIT
// The messages that components send to the design surface.

#include "model/DesignMessages.h"

#include <Message.h>
#include <View.h>


bool
FindDroppedCorner(const BMessage* message, const BView* view, BPoint* corner)
{
	// The fields, and not BMessage::WasDropped(), which is false for a copy that was posted on.
	BPoint dropPoint;
	if (message->FindPoint("_drop_point_", &dropPoint) != B_OK)
		return false;
	BPoint offset;
	if (message->FindPoint("_drop_offset_", &offset) != B_OK)
		offset = BPoint(0, 0);

	*corner = view->ConvertFromScreen(dropPoint) - offset;
	return true;
}

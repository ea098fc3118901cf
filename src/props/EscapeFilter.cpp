// SPDX-License-Identifier: MIT
// The Escape key, taken before the view that has the keyboard focus gets it.

#include "props/EscapeFilter.h"

#include <utility>

#include <InterfaceDefs.h>
#include <Message.h>


TEscapeFilter::TEscapeFilter(std::function<bool()> action)
	: BMessageFilter(B_ANY_DELIVERY, B_ANY_SOURCE, B_KEY_DOWN),
	  fAction(std::move(action))
{
}


filter_result
TEscapeFilter::Filter(BMessage* message, BHandler**)
{
	int8 byte;
	if (message->FindInt8("byte", &byte) != B_OK || byte != B_ESCAPE)
		return B_DISPATCH_MESSAGE;
	return fAction() ? B_SKIP_MESSAGE : B_DISPATCH_MESSAGE;
}

// SPDX-License-Identifier: MIT
// A look at messages before their handler gets them.

#include <MessageFilter.h>

#include <Message.h>


BMessageFilter::BMessageFilter(uint32 what, filter_hook func)
	: BMessageFilter(B_ANY_DELIVERY, B_ANY_SOURCE, what, func)
{
}


BMessageFilter::BMessageFilter(message_delivery delivery, message_source source, filter_hook func)
	: BMessageFilter(delivery, source, 0, func)
{
	fFiltersAny = true;
}


BMessageFilter::BMessageFilter(
	message_delivery delivery, message_source source, uint32 what, filter_hook func)
	: fFiltersAny(false),
	  fWhat(what),
	  fDelivery(delivery),
	  fSource(source),
	  fFunction(func),
	  fLooper(nullptr),
	  fHandler(nullptr)
{
}


BMessageFilter::BMessageFilter(const BMessageFilter& filter)
	: BMessageFilter(filter.fDelivery, filter.fSource, filter.fWhat, filter.fFunction)
{
	fFiltersAny = filter.fFiltersAny;
}


BMessageFilter::BMessageFilter(const BMessageFilter* filter)
	: BMessageFilter(*filter)
{
}


BMessageFilter::~BMessageFilter() {}


BMessageFilter&
BMessageFilter::operator=(const BMessageFilter& from)
{
	if (this == &from)
		return *this;
	fFiltersAny = from.fFiltersAny;
	fWhat = from.fWhat;
	fDelivery = from.fDelivery;
	fSource = from.fSource;
	fFunction = from.fFunction;
	return *this;
}


filter_result
BMessageFilter::Filter(BMessage*, BHandler**)
{
	return B_DISPATCH_MESSAGE;
}


message_delivery
BMessageFilter::MessageDelivery() const
{
	return fDelivery;
}


message_source
BMessageFilter::MessageSource() const
{
	return fSource;
}


uint32
BMessageFilter::Command() const
{
	return fWhat;
}


bool
BMessageFilter::FiltersAnyCommand() const
{
	return fFiltersAny;
}


BLooper*
BMessageFilter::Looper() const
{
	return fLooper;
}


bool
BMessageFilter::Applies(const BMessage* message) const
{
	if (!fFiltersAny && message->what != fWhat)
		return false;
	if (fDelivery != B_ANY_DELIVERY && message->WasDropped() != (fDelivery == B_DROPPED_DELIVERY))
		return false;
	return fSource == B_ANY_SOURCE || message->IsSourceRemote() == (fSource == B_REMOTE_SOURCE);
}


filter_result
BMessageFilter::Run(BMessage* message, BHandler** target)
{
	return fFunction != nullptr ? fFunction(message, target, this) : Filter(message, target);
}

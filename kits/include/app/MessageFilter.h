// SPDX-License-Identifier: MIT
// A look at messages before their handler gets them.

#ifndef _MESSAGE_FILTER_H
#define _MESSAGE_FILTER_H

#include <SupportDefs.h>

class BHandler;
class BLooper;
class BMessage;
class BMessageFilter;

/// What a filter says: drop the message, or pass it on.
enum filter_result { B_SKIP_MESSAGE, B_DISPATCH_MESSAGE };

/// A filter function; may redirect the message by changing \a target to another handler of the same looper.
typedef filter_result (*filter_hook)(BMessage* message, BHandler** target, BMessageFilter* filter);

/// Which messages a filter looks at, by the way they came: any, by drag and drop, or sent by a program.
enum message_delivery { B_ANY_DELIVERY, B_DROPPED_DELIVERY, B_PROGRAMMED_DELIVERY };

/// Which messages a filter looks at, by who sent them: anybody, another program, or this one.
enum message_source { B_ANY_SOURCE, B_REMOTE_SOURCE, B_LOCAL_SOURCE };


/// Runs before a handler gets a message, in its looper's thread. Belongs to the list that it is in, one at most.
class BMessageFilter {
public:
	BMessageFilter(uint32 what, filter_hook func = NULL);
	BMessageFilter(message_delivery delivery, message_source source, filter_hook func = NULL);
	BMessageFilter(
		message_delivery delivery, message_source source, uint32 what, filter_hook func = NULL);
	BMessageFilter(const BMessageFilter& filter);
	BMessageFilter(const BMessageFilter* filter);
	virtual ~BMessageFilter();

	/// Takes over the conditions and the function, not the looper.
	BMessageFilter& operator=(const BMessageFilter& from);

	/// Called when there is no function. \a _target: as filter_hook's. The base lets everything pass.
	virtual filter_result Filter(BMessage* message, BHandler** _target);

	message_delivery MessageDelivery() const;
	message_source MessageSource() const;
	uint32 Command() const;
	bool FiltersAnyCommand() const;
	/// The looper whose messages it sees, NULL when it is in no list.
	BLooper* Looper() const;

private:
	friend class BHandler;
	friend class BLooper;

	bool Applies(const BMessage* message) const;
	filter_result Run(BMessage* message, BHandler** target);

	bool fFiltersAny;
	uint32 fWhat;
	message_delivery fDelivery;
	message_source fSource;
	filter_hook fFunction;
	/// Set while in a common list of a looper, or in the list of a handler.
	BLooper* fLooper;
	BHandler* fHandler;
};

#endif // _MESSAGE_FILTER_H

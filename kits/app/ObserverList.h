// SPDX-License-Identifier: MIT
// Who watches a handler, and for what.

#ifndef _OBSERVER_LIST_H
#define _OBSERVER_LIST_H

#include <map>
#include <vector>

#include <Messenger.h>

class BMessage;

namespace BPrivate {

/// The observers of one handler. An observer given as a handler is looked up when a notice goes out: it need not
/// belong to a looper before.
class ObserverList {
public:
	status_t Add(const BMessenger& target, uint32 what);
	status_t Add(int32 handlerToken, uint32 what);
	/// B_BAD_HANDLER when it does not watch for \a what.
	status_t Remove(const BMessenger& target, uint32 what);
	status_t Remove(int32 handlerToken, uint32 what);

	/// Sends \a notice to those who watch for \a what and, once more each, to those who watch for everything.
	void Send(uint32 what, BMessage* notice);
	bool IsEmpty() const { return fObservers.empty(); }

private:
	struct Observer {
		BMessenger messenger;
		int32 token; // kNoToken: the messenger counts

		bool operator==(const Observer& other) const;
		bool Find(BMessenger* target) const;
	};

	status_t Add(const Observer& observer, uint32 what);
	status_t Remove(const Observer& observer, uint32 what);
	void SendTo(uint32 list, BMessage* notice);

	std::map<uint32, std::vector<Observer>> fObservers;
};

} // namespace BPrivate

#endif // _OBSERVER_LIST_H

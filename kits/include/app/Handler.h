// SPDX-License-Identifier: MIT
// An object that a looper hands messages to.

#ifndef _HANDLER_H
#define _HANDLER_H

#include <atomic>

#include <Archivable.h>
#include <OS.h>
#include <SupportDefs.h>

class BList;
class BLooper;
class BMessage;
class BMessageFilter;
class BMessenger;

namespace BPrivate {
class LooperPort;
class ObserverList;
struct LooperAccess;
} // namespace BPrivate

#define B_OBSERVE_WHAT_CHANGE "be:observe_change_what"
#define B_OBSERVE_ORIGINAL_WHAT "be:observe_orig_what"
#define B_OBSERVER_OBSERVE_ALL 0xffffffff


/// Receives messages in the thread of the looper that it belongs to.
///
/// A handler belongs to at most one looper (BLooper::AddHandler(); a view by being attached to a window). Its hooks
/// run in that looper's thread with the looper locked; so must everybody else hold the lock who changes it.
class BHandler : public BArchivable {
public:
	BHandler(const char* name = NULL);
	BHandler(BMessage* archive);
	virtual ~BHandler();

	static BArchivable* Instantiate(BMessage* archive);
	virtual status_t Archive(BMessage* archive, bool deep = true) const override;

	/// Handles a message. The base passes it to the next handler; at the end of the chain a message is dropped, and a
	/// dragged or scripting one printed and answered with B_MESSAGE_NOT_UNDERSTOOD.
	virtual void MessageReceived(BMessage* message);

	/// The looper this belongs to, NULL when none. Any thread.
	BLooper* Looper() const;

	void SetName(const char* name);
	/// The name, NULL when there is none; valid until it is changed.
	const char* Name() const;

	/// Sets who gets the messages that this does not handle: a handler of the same looper, or NULL.
	virtual void SetNextHandler(BHandler* handler);
	BHandler* NextHandler() const;

	/// Gives \a filter to the handler: it then runs on every message for it and is deleted with it.
	virtual void AddFilter(BMessageFilter* filter);
	/// Takes \a filter back; returns false when it is not one of this handler's.
	virtual bool RemoveFilter(BMessageFilter* filter);
	/// Replaces all filters; takes over the list and what is in it. NULL removes all.
	virtual void SetFilterList(BList* filters);
	/// The filters in the order in which they run, NULL when none was ever added.
	BList* FilterList();

	/// Locks the looper and makes sure that it still owns this; false when there is none. Any thread.
	bool LockLooper();
	/// As LockLooper(), waiting \a timeout microseconds at most. B_OK, B_TIMED_OUT; B_BAD_VALUE without a looper;
	/// B_MISMATCHED_VALUES when the handler changed loopers meanwhile.
	status_t LockLooperWithTimeout(bigtime_t timeout);
	void UnlockLooper();

	/// Registers an observer: SendNotices(\a what) then reaches it. B_BAD_VALUE for a null handler, B_BAD_HANDLER for
	/// a messenger without a target. The stop functions give B_BAD_HANDLER when it did not watch.
	status_t StartWatching(BMessenger target, uint32 what);
	status_t StartWatchingAll(BMessenger target);
	status_t StopWatching(BMessenger target, uint32 what);
	status_t StopWatchingAll(BMessenger target);
	status_t StartWatching(BHandler* observer, uint32 what);
	status_t StartWatchingAll(BHandler* observer);
	status_t StopWatching(BHandler* observer, uint32 what);
	status_t StopWatchingAll(BHandler* observer);

	/// Sends a copy of \a notice (what B_OBSERVER_NOTICE_CHANGE) to the observers of \a what and of everything.
	virtual void SendNotices(uint32 what, const BMessage* notice = NULL);
	bool IsWatched() const;

private:
	friend class BLooper;
	friend class BMessageFilter;
	friend class BMessenger;
	friend struct BPrivate::LooperAccess;

	BHandler(const BHandler&) = delete;
	BHandler& operator=(const BHandler&) = delete;

	void SetLooper(BLooper* looper, const BPrivate::LooperPort* port);
	BPrivate::ObserverList* Observers();
	void AnswerNotUnderstood(BMessage* message);

	const int32 fToken;
	char* fName;
	std::atomic<BLooper*> fLooper;
	BHandler* fNextHandler;
	bool fIsNext; // another handler's next one has been this
	BList* fFilters;
	BPrivate::ObserverList* fObservers;
};

#endif // _HANDLER_H

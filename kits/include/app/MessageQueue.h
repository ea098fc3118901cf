// SPDX-License-Identifier: MIT
// A queue of messages, first in, first out.

#ifndef _MESSAGE_QUEUE_H
#define _MESSAGE_QUEUE_H

#include <atomic>
#include <deque>
#include <mutex>

#include <OS.h>
#include <SupportDefs.h>

class BMessage;


/// Messages in the order in which they were added; deletes what is left in it. Every operation locks for itself;
/// Lock() holds off the other threads over several of them.
class BMessageQueue {
public:
	BMessageQueue();
	virtual ~BMessageQueue();

	/// Gives \a message to the queue.
	void AddMessage(BMessage* message);
	/// Takes it out again; the caller owns it. Nothing happens when it is not in the queue.
	void RemoveMessage(BMessage* message);

	int32 CountMessages() const;
	bool IsEmpty() const;

	/// The message stays the queue's. NULL when there is none.
	BMessage* FindMessage(int32 index) const;
	/// The \a index-th message with this code.
	BMessage* FindMessage(uint32 what, int32 index = 0) const;

	bool Lock();
	void Unlock();
	/// Whether the calling thread holds the lock.
	bool IsLocked() const;

	/// Takes out the oldest message; the caller owns it. NULL when empty.
	BMessage* NextMessage();
	bool IsNextMessage(const BMessage* message) const;

private:
	BMessageQueue(const BMessageQueue&) = delete;
	BMessageQueue& operator=(const BMessageQueue&) = delete;

	mutable std::recursive_mutex fLock;
	std::atomic<thread_id> fOwner;
	int32 fOwnerCount;
	std::deque<BMessage*> fMessages;
};

#endif // _MESSAGE_QUEUE_H

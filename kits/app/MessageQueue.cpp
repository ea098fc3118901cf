// SPDX-License-Identifier: MIT
// A queue of messages, first in, first out.

#include <MessageQueue.h>

#include <algorithm>

#include <Message.h>

#include "app/LooperPort.h"

using BPrivate::CurrentThread;


BMessageQueue::BMessageQueue()
	: fOwner(-1),
	  fOwnerCount(0)
{
}


BMessageQueue::~BMessageQueue()
{
	// One by one: a message that is deleted may send a reply, and that must not find a half-deleted queue.
	for (BMessage* message = NextMessage(); message != nullptr; message = NextMessage())
		delete message;
}


void
BMessageQueue::AddMessage(BMessage* message)
{
	if (message == nullptr)
		return;

	std::lock_guard<std::recursive_mutex> lock(fLock);
	fMessages.push_back(message);
}


void
BMessageQueue::RemoveMessage(BMessage* message)
{
	std::lock_guard<std::recursive_mutex> lock(fLock);
	auto found = std::find(fMessages.begin(), fMessages.end(), message);
	if (found != fMessages.end())
		fMessages.erase(found);
}


int32
BMessageQueue::CountMessages() const
{
	std::lock_guard<std::recursive_mutex> lock(fLock);
	return int32(fMessages.size());
}


bool
BMessageQueue::IsEmpty() const
{
	return CountMessages() == 0;
}


BMessage*
BMessageQueue::FindMessage(int32 index) const
{
	std::lock_guard<std::recursive_mutex> lock(fLock);
	return index >= 0 && index < int32(fMessages.size()) ? fMessages[index] : nullptr;
}


BMessage*
BMessageQueue::FindMessage(uint32 what, int32 index) const
{
	std::lock_guard<std::recursive_mutex> lock(fLock);
	for (BMessage* message : fMessages) {
		if (message->what == what && index-- == 0)
			return message;
	}
	return nullptr;
}


bool
BMessageQueue::Lock()
{
	fLock.lock();
	fOwner = CurrentThread();
	fOwnerCount++;
	return true;
}


void
BMessageQueue::Unlock()
{
	if (!IsLocked())
		return;

	if (--fOwnerCount == 0)
		fOwner = -1;
	fLock.unlock();
}


bool
BMessageQueue::IsLocked() const
{
	return fOwner == CurrentThread();
}


BMessage*
BMessageQueue::NextMessage()
{
	std::lock_guard<std::recursive_mutex> lock(fLock);
	if (fMessages.empty())
		return nullptr;

	BMessage* message = fMessages.front();
	fMessages.pop_front();
	return message;
}


bool
BMessageQueue::IsNextMessage(const BMessage* message) const
{
	std::lock_guard<std::recursive_mutex> lock(fLock);
	return !fMessages.empty() && fMessages.front() == message;
}

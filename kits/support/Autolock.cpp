// SPDX-License-Identifier: MIT
// BAutolock.

#include <Autolock.h>

#include <Looper.h>

BAutolock::BAutolock(BLooper* looper)
	: fLocker(nullptr),
	  fLooper(looper),
	  fIsLocked(false)
{
	Lock();
}


BAutolock::BAutolock(BLocker* locker)
	: fLocker(locker),
	  fLooper(nullptr),
	  fIsLocked(false)
{
	Lock();
}


BAutolock::BAutolock(BLocker& locker)
	: BAutolock(&locker)
{
}


BAutolock::~BAutolock()
{
	Unlock();
}


bool
BAutolock::IsLocked()
{
	return fIsLocked;
}


bool
BAutolock::Lock()
{
	if (fIsLocked)
		return true;
	if (fLocker != nullptr)
		fIsLocked = fLocker->Lock();
	else if (fLooper != nullptr)
		fIsLocked = fLooper->Lock();
	return fIsLocked;
}


void
BAutolock::Unlock()
{
	if (!fIsLocked)
		return;
	fIsLocked = false;
	if (fLocker != nullptr)
		fLocker->Unlock();
	else
		fLooper->Unlock();
}

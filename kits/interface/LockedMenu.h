// SPDX-License-Identifier: MIT
// A menu of a tracker's session while the tracker looks at it.
#ifndef INTERFACE_LOCKED_MENU_H
#define INTERFACE_LOCKED_MENU_H

#include <Looper.h>
#include <Menu.h>
#include <Messenger.h>

#include "interface/MenuTracker.h"

namespace BPrivate {

/// The menu at a messenger, with its looper locked; null when it is in no window any more.
class MenuTracker::LockedMenu {
public:
	explicit LockedMenu(const BMessenger& messenger)
		: fMenu(nullptr),
		  fLooper(nullptr)
	{
		if (!messenger.LockTarget())
			return;
		fMenu = dynamic_cast<BMenu*>(messenger.Target(&fLooper));
	}

	~LockedMenu()
	{
		if (fLooper != nullptr)
			fLooper->Unlock();
	}

	LockedMenu(const LockedMenu&) = delete;
	LockedMenu& operator=(const LockedMenu&) = delete;

	operator BMenu*() const { return fMenu; }
	BMenu* operator->() const { return fMenu; }

private:
	BMenu* fMenu;
	BLooper* fLooper;
};

} // namespace BPrivate

#endif // INTERFACE_LOCKED_MENU_H

// SPDX-License-Identifier: MIT
// What a file panel and its window share.
#ifndef INTERFACE_PANEL_LINK_H
#define INTERFACE_PANEL_LINK_H

#include <mutex>
#include <string>
#include <vector>

#include <Entry.h>
#include <FilePanel.h>
#include <Message.h>
#include <Messenger.h>

namespace BPrivate {

/// What a panel tells its window.
enum {
	kMsgPanelShow = '_PSh',
	kMsgPanelHide = '_PHi',
	/// The panel has been deleted.
	kMsgPanelGone = '_PGo',
	kMsgPanelRefresh = '_PRf',
	/// Flavours or filter are others.
	kMsgPanelRules = '_PRu',
	/// "folder" (string): its path. Or "error" (string): why there is none.
	kMsgPanelFolder = '_PFo',
	kMsgPanelSaveText = '_PTx', // "text" (string)
	kMsgPanelLabel = '_PLb',    // "button" (int32), "label" (string)
};


/// The settings of a panel. \a lock guards them; nobody waits while holding it.
///
/// A panel's functions touch these and post messages to the window, and never take the window's lock: they may
/// be called with any window locked.
struct PanelLink {
	mutable std::mutex lock;
	BMessenger target;
	/// With the code and fields that a choice is sent with.
	BMessage message;
	uint32 flavors = 0;
	bool hideWhenDone = true;
	bool isShowing = false;
	/// The path of the folder that is shown, or will be.
	std::string folder;
	std::vector<entry_ref> selection;
	size_t nextSelected = 0;

	/// Held while the program's hooks and its filter run. Taken before \a lock.
	std::recursive_mutex hooks;
	/// Null once it is deleted. \a hooks held.
	BFilePanel* panel = nullptr;
	BRefFilter* filter = nullptr;

	/// Set once, before the window runs.
	BMessenger window;
};

} // namespace BPrivate

#endif // INTERFACE_PANEL_LINK_H

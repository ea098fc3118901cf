// SPDX-License-Identifier: MIT
// What the views of a file panel tell its window.
#ifndef INTERFACE_PANEL_WINDOW_MESSAGES_H
#define INTERFACE_PANEL_WINDOW_MESSAGES_H

#include <SupportDefs.h>

namespace BPrivate {

enum : uint32 {
	kMsgDefault = '_PDf',
	kMsgCancel = '_PCn',
	/// Into the selected folder.
	kMsgPathEdited = '_PPe',
	kMsgHiddenChanged = '_PHc',
	kMsgToggleHidden = '_PHt',
	kMsgNewFolder = '_PNf',
	/// "which" (int32), "folder", "name" (strings).
	kMsgReplaceAnswer = '_PRa',
};

} // namespace BPrivate

#endif // INTERFACE_PANEL_WINDOW_MESSAGES_H

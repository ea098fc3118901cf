// SPDX-License-Identifier: MIT
// Asks a file panel's user for the name of a new folder, and makes it.
#ifndef INTERFACE_PANEL_FOLDER_NAME_WINDOW_H
#define INTERFACE_PANEL_FOLDER_NAME_WINDOW_H

#include <string>

#include <Messenger.h>
#include <Window.h>

class BTextControl;

namespace BPrivate {

/// Sent to the panel's window once the folder is there: "name" (string), "folder" (string: that of the new one).
constexpr uint32 kMsgFolderMade = '_PFm';

/// Stays open until the folder could be made or the user gives up.
class FolderNameWindow : public BWindow {
public:
	/// \a over: the panel's frame, screen coordinates. \a folder: where the new one is made.
	FolderNameWindow(BRect over, const std::string& folder, const BMessenger& panel);

	void MessageReceived(BMessage* message) override;

private:
	void MakeFolder();

	const std::string fFolder;
	const BMessenger fPanel;
	BTextControl* fName;
};

} // namespace BPrivate

#endif // INTERFACE_PANEL_FOLDER_NAME_WINDOW_H

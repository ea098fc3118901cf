// SPDX-License-Identifier: MIT
// BFilePanel: the window for choosing files; BRefFilter: which entries it shows.

#ifndef _FILE_PANEL_H
#define _FILE_PANEL_H

#include <memory>

#include <sys/stat.h>

#include <Entry.h>
#include <StorageDefs.h>

class BDirectory;
class BMessage;
class BMessenger;
class BNode;
class BRefFilter;
class BWindow;

namespace BPrivate {
struct PanelLink;
} // namespace BPrivate

/// The status of a node as a filter gets it: the host's own.
struct stat_beos : public stat {};

enum file_panel_mode { B_OPEN_PANEL, B_SAVE_PANEL };
enum file_panel_button { B_CANCEL_BUTTON, B_DEFAULT_BUTTON };

/// Decides which entries a file panel shows. Must outlive the panel.
class BRefFilter {
public:
	virtual ~BRefFilter() {}

	/// True shows the entry. Called in the panel's thread for each entry as it is read.
	///
	/// \a mimeType: the node's type or a guess; "application/x-vnd.Be-directory" for folders.
	virtual bool Filter(
		const entry_ref* ref, BNode* node, struct stat_beos* stat, const char* mimeType) = 0;
};

/// A window in which the user chooses files to open, or where to save one.
///
/// Hidden until Show(). The target is copied (null: the application), a null directory is the current
/// one, flavours 0 mean files, the message is copied, the filter is not owned. All functions may be
/// called from any thread without a lock; do not delete a panel from within its own hooks.
class BFilePanel {
public:
	BFilePanel(file_panel_mode mode = B_OPEN_PANEL, BMessenger* target = NULL,
		const entry_ref* directory = NULL, uint32 nodeFlavors = 0,
		bool allowMultipleSelection = true, BMessage* message = NULL, BRefFilter* refFilter = NULL,
		bool modal = false, bool hideWhenDone = true);
	virtual ~BFilePanel();

	void Show();
	void Hide();
	bool IsShowing() const;

	/// Hook: the panel was hidden, by the user or by Hide().
	virtual void WasHidden();
	/// Hook: the selection is another.
	virtual void SelectionChanged();
	/// Hook: sends \a message to \a target.
	virtual void SendMessage(const BMessenger* target, BMessage* message);

	BWindow* Window() const;
	BMessenger Messenger() const;
	BRefFilter* RefFilter() const;
	file_panel_mode PanelMode() const;

	void SetTarget(BMessenger target);
	void SetMessage(BMessage* message);
	/// The folder is read anew through \a filter, null for none. Call Refresh() when a filter accepts other
	/// entries than before. On return the old filter is not in use any more.
	void SetRefFilter(BRefFilter* filter);
	/// The proposed name of a save panel, which is selected.
	void SetSaveText(const char* text);
	void SetButtonLabel(file_panel_button button, const char* label);
	void SetNodeFlavors(uint32 flavors);
	/// What is no folder, or cannot be read, changes nothing; the panel says so. Links are followed.
	void SetPanelDirectory(const BEntry* newDirectory);
	void SetPanelDirectory(const BDirectory* newDirectory);
	void SetPanelDirectory(const entry_ref* newDirectory);
	void SetPanelDirectory(const char* newDirectory);
	void GetPanelDirectory(entry_ref* ref) const;
	void SetHideWhenDone(bool hideWhenDone);
	bool HidesWhenDone() const;

	/// Reads the shown folder again.
	void Refresh();
	/// The selection is walked from its first item; B_ENTRY_NOT_FOUND at the end.
	void Rewind();
	status_t GetNextSelectedRef(entry_ref* ref);

private:
	BFilePanel(const BFilePanel&) = delete;
	BFilePanel& operator=(const BFilePanel&) = delete;

	std::shared_ptr<BPrivate::PanelLink> fLink;
	const file_panel_mode fMode;
	BWindow* fWindow;
};

#endif

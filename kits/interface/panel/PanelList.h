// SPDX-License-Identifier: MIT
// The list of a folder's entries in a file panel.
#ifndef INTERFACE_PANEL_LIST_H
#define INTERFACE_PANEL_LIST_H

#include <memory>
#include <set>
#include <string>
#include <vector>

#include <ListView.h>

#include "interface/panel/FolderReader.h"

namespace BPrivate {

class PanelItem;
struct PanelLink;

/// What a list tells its window.
enum {
	kMsgEntryInvoked = '_PIn',
	kMsgGoUp = '_PUp',
	/// The keys of a path were typed: "text" (string).
	kMsgPathTyped = '_PTy',
};

/// Called in the window's thread, window locked.
class PanelListListener {
public:
	virtual void EntriesSelected() = 0;
	/// Reading has come on or ended, or the folder is another one than the list was told: see Folder().
	virtual void EntriesChanged() = 0;

protected:
	~PanelListListener() = default;
};


/// Shows a folder, and what changes in it.
///
/// The folder is read in pieces between the window's other messages. It is read again when the node monitor
/// reports a change, and keeps its selection then.
class PanelList : public BListView {
public:
	PanelList(BRect frame, list_view_type type, PanelLink* link, PanelListListener* listener);
	~PanelList() override;

	/// Begins to read \a path, which FindFolder() gave. \a select: the name that gets selected.
	void SetFolder(const std::string& path, const std::string& select = "");
	const std::string& Folder() const { return fFolder; }
	const node_ref& FolderNode() const { return fNode; }
	/// Reads the folder again.
	void Reread();
	/// Reads it again unless that takes long and no names in it have changed.
	void CheckForChanges();
	/// Nobody looks: neither reads on nor follows changes until Reread() or SetFolder().
	void Rest();
	/// Selects the entry of this name as soon as it is there.
	void SelectNamed(const std::string& name);

	void SetFlavors(uint32 flavors);
	bool ShowsHidden() const { return fRules.showHidden; }
	void SetShowsHidden(bool shows);
	FolderOrder Order() const { return fOrder; }
	bool IsDescending() const { return fDescending; }
	void SetOrder(FolderOrder order, bool descending);

	bool IsReading() const { return fReader.IsReading(); }
	/// How many are read so far.
	size_t CountRead() const { return fReader.Entries().size(); }
	/// Why the folder could not be read, B_OK when it could.
	status_t Status() const { return fStatus; }
	/// In the order of the rows. Valid until the list changes.
	std::vector<const FolderEntry*> SelectedEntries() const;
	/// The name of the entry that is shown as \a shownName, or an empty text.
	std::string NameShownAs(const std::string& shownName) const;

	void Draw(BRect updateRect) override;
	void FrameResized(float newWidth, float newHeight) override;
	void KeyDown(const char* bytes, int32 numBytes) override;
	void MessageReceived(BMessage* message) override;
	void DetachedFromWindow() override;
	void SelectionChanged() override;

private:
	std::set<std::string> SelectedNames() const;
	void StartReading();
	void ReadOn();
	void Publish(std::vector<FolderEntry> entries);
	void SelectNames(const std::set<std::string>& names);
	void SelectWanted();
	void FolderVanished();
	void NodeChanged(const BMessage& message);
	void ScheduleReading();
	void Watch();
	void StopWatching();

	PanelLink* fLink;
	PanelListListener* fListener;
	std::string fFolder;
	node_ref fNode;
	time_t fFolderChanged;
	FolderRules fRules;
	FolderOrder fOrder;
	bool fDescending;

	FolderReader fReader;
	status_t fStatus;
	bool fReadPosted;
	bool fRereadScheduled;
	bool fChangedWhileReading;
	bigtime_t fReadStart;
	bigtime_t fReadTime;
	bigtime_t fNextPublish;

	std::vector<FolderEntry> fShown;
	std::vector<std::unique_ptr<PanelItem>> fItems;
	std::string fWanted;
	bool fPublishing;
	bool fWatching;
	bool fResting;
};

} // namespace BPrivate

#endif // INTERFACE_PANEL_LIST_H

// SPDX-License-Identifier: MIT
// The list of a folder's entries in a file panel.

#include "interface/panel/PanelList.h"

#include <algorithm>
#include <cmath>
#include <ctime>

#include <sys/stat.h>

#include <List.h>
#include <MessageRunner.h>
#include <Messenger.h>
#include <NodeMonitor.h>
#include <Window.h>

#include "interface/ControlLook.h"
#include "interface/ListTyping.h"
#include "interface/panel/PanelItem.h"
#include "interface/panel/PanelLink.h"
#include "interface/panel/PanelPaths.h"

namespace BPrivate {

namespace {

constexpr uint32 kMsgReadOn = '_PRd';
constexpr uint32 kMsgReread = '_PRr';

// The window does other things after so much reading.
constexpr bigtime_t kReadSlice = 10000;
// What is read so far is shown after this time, then after twice as long and so on.
constexpr bigtime_t kFirstPublish = 300000;
// Changes that follow each other closely cost one reading.
constexpr bigtime_t kChangeDelay = 150000;
// What takes no longer is read again whenever it may have changed.
constexpr bigtime_t kShortReading = 100000;


/// When the names in the folder changed last; 0 for one that is gone or another node.
time_t
ChangeTime(const std::string& path, const node_ref& node)
{
	struct stat stat;
	if (::stat(path.c_str(), &stat) != 0 || node != node_ref(stat.st_dev, stat.st_ino))
		return 0;
	return stat.st_mtime;
}

} // namespace


PanelList::PanelList(BRect frame, list_view_type type, PanelLink* link, PanelListListener* listener)
	: BListView(
		frame, "PoseView", type, B_FOLLOW_ALL_SIDES, B_WILL_DRAW | B_FRAME_EVENTS | B_NAVIGABLE),
	  fLink(link),
	  fListener(listener),
	  fFolderChanged(0),
	  fOrder(FolderOrder::kName),
	  fDescending(false),
	  fStatus(B_OK),
	  fReadPosted(false),
	  fRereadScheduled(false),
	  fChangedWhileReading(false),
	  fReadStart(0),
	  fReadTime(0),
	  fNextPublish(0),
	  fPublishing(false),
	  fWatching(false),
	  fResting(true)
{
	SetInvocationMessage(new BMessage(kMsgEntryInvoked));
}


PanelList::~PanelList()
{
	MakeEmpty();
}


void
PanelList::SetFolder(const std::string& path, const std::string& select)
{
	StopWatching();
	// What was typed was meant for the entries of the other folder.
	fTyping->Clear();
	fFolder = path;
	fWanted = select;
	fChangedWhileReading = false;
	if (!fShown.empty()) {
		DeselectAll();
		Publish({});
	}
	BListView::ScrollTo(0, 0);
	StartReading();
}


void
PanelList::Reread()
{
	if (!fFolder.empty())
		StartReading();
}


void
PanelList::CheckForChanges()
{
	if (fResting || IsReading())
		return;
	// Sizes and times of files change without a sign, as does what follows a change within its second.
	const time_t changed = ChangeTime(fFolder, fNode);
	if (fReadTime < kShortReading || changed != fFolderChanged || changed + 1 >= time(nullptr))
		StartReading();
}


void
PanelList::Rest()
{
	StopWatching();
	fReader.Close();
	fResting = true;
}


void
PanelList::SelectNamed(const std::string& name)
{
	fWanted = name;
	if (!IsReading())
		SelectWanted();
}


void
PanelList::SetFlavors(uint32 flavors)
{
	fRules.flavors = flavors;
}


void
PanelList::SetShowsHidden(bool shows)
{
	if (shows == fRules.showHidden)
		return;
	fRules.showHidden = shows;
	Reread();
}


void
PanelList::SetOrder(FolderOrder order, bool descending)
{
	fOrder = order;
	fDescending = descending;
	std::vector<FolderEntry> entries = fShown;
	Publish(std::move(entries));
	ScrollToSelection();
}


std::vector<const FolderEntry*>
PanelList::SelectedEntries() const
{
	std::vector<const FolderEntry*> entries;
	for (int32 i = 0; i < CountItems(); i++) {
		if (ItemAt(i)->IsSelected())
			entries.push_back(&static_cast<PanelItem*>(ItemAt(i))->Entry());
	}
	return entries;
}


std::string
PanelList::NameShownAs(const std::string& shownName) const
{
	for (const FolderEntry& entry : fShown) {
		if (entry.shownName == shownName)
			return entry.Name();
	}
	return "";
}


void
PanelList::Draw(BRect updateRect)
{
	BListView::Draw(updateRect);
	if (!IsEmpty() || fFolder.empty() || IsReading())
		return;

	const std::string text = fStatus == B_OK
		? "There is nothing to show in this folder."
		: "This folder cannot be read: " + StatusSentence(fStatus);
	font_height height;
	GetFontHeight(&height);
	const rgb_color background = ui_color(B_LIST_BACKGROUND_COLOR);
	SetLowColor(background);
	SetHighColor(BlendColors(background, ui_color(B_LIST_ITEM_TEXT_COLOR), 0.6f));
	SetDrawingMode(B_OP_OVER);
	DrawString(text.c_str(),
		BPoint(std::max(6.0f, std::floor((Bounds().Width() - StringWidth(text.c_str())) / 2)),
			std::floor(24 + height.ascent)));
	SetDrawingMode(B_OP_COPY);
}


void
PanelList::FrameResized(float newWidth, float newHeight)
{
	BListView::FrameResized(newWidth, newHeight);
	// The columns are placed from the right.
	Invalidate();
}


/// What changes where keys go is done by the window at once, and not when a message comes: keys that wait in the
/// queue were typed for afterwards.
void
PanelList::KeyDown(const char* bytes, int32 numBytes)
{
	switch (bytes[0]) {
		case B_BACKSPACE:
		{
			BMessage goUp(kMsgGoUp);
			Window()->MessageReceived(&goUp);
			break;
		}

		case '/':
		case '~':
		{
			BMessage typed(kMsgPathTyped);
			typed.AddString("text", bytes);
			Window()->MessageReceived(&typed);
			break;
		}

		default:
			BListView::KeyDown(bytes, numBytes);
			break;
	}
}


void
PanelList::MessageReceived(BMessage* message)
{
	switch (message->what) {
		case kMsgReadOn:
			fReadPosted = false;
			ReadOn();
			break;

		case kMsgReread:
			fRereadScheduled = false;
			if (fResting)
				break;
			if (IsReading())
				fChangedWhileReading = true;
			else
				Reread();
			break;

		case B_NODE_MONITOR:
			if (!fResting)
				NodeChanged(*message);
			break;

		case B_SELECT_ALL:
			if (ListType() == B_MULTIPLE_SELECTION_LIST && !IsEmpty())
				Select(0, CountItems() - 1);
			break;

		default:
			BListView::MessageReceived(message);
			break;
	}
}


void
PanelList::DetachedFromWindow()
{
	StopWatching();
	fReader.Close();
	BListView::DetachedFromWindow();
}


void
PanelList::SelectionChanged()
{
	if (!fPublishing)
		fListener->EntriesSelected();
}


std::set<std::string>
PanelList::SelectedNames() const
{
	std::set<std::string> names;
	for (const FolderEntry* entry : SelectedEntries())
		names.insert(entry->Name());
	return names;
}


void
PanelList::StartReading()
{
	fResting = false;
	fReadStart = system_time();
	fNextPublish = fReadStart + kFirstPublish;
	fStatus = fReader.Open(fFolder);
	if (fStatus != B_OK) {
		struct stat stat;
		if (::stat(fFolder.c_str(), &stat) != 0 || !S_ISDIR(stat.st_mode))
			FolderVanished();
		else {
			Publish({});
			Invalidate();
			fListener->EntriesChanged();
		}
		return;
	}
	if (fNode != fReader.Node())
		StopWatching();
	fNode = fReader.Node();
	// First: no change after what is read now must be missed.
	Watch();
	fFolderChanged = ChangeTime(fFolder, fNode);
	ReadOn();
}


/// Reads for a while; posts a message for the rest.
void
PanelList::ReadOn()
{
	if (!IsReading())
		return;

	bool more;
	{
		// The filter is the program's, and may be exchanged by another thread.
		std::lock_guard<std::recursive_mutex> hooks(fLink->hooks);
		fRules.filter = fLink->filter;
		more = fReader.ReadSome(fRules, system_time() + kReadSlice);
		fRules.filter = nullptr;
	}
	const bigtime_t now = system_time();
	if (!more) {
		fReadTime = now - fReadStart;
		Publish(std::move(fReader.Entries()));
		SelectWanted();
		fWanted.clear();
		if (IsEmpty())
			Invalidate();
		if (fChangedWhileReading) {
			fChangedWhileReading = false;
			ScheduleReading();
		}
	} else {
		// When it is read again the old rows stay until the new ones are complete.
		if (now >= fNextPublish && fReader.Entries().size() > fShown.size()) {
			Publish(fReader.Entries());
			fNextPublish = now + 2 * (now - fReadStart);
		}
		if (!fReadPosted)
			fReadPosted = Looper()->PostMessage(kMsgReadOn, this) == B_OK;
	}
	fListener->EntriesChanged();
}


/// Shows \a entries in the list's order. Selected ones, and the place that is scrolled to, stay.
void
PanelList::Publish(std::vector<FolderEntry> entries)
{
	SortEntries(&entries, fOrder, fDescending);
	if (entries == fShown)
		return;

	const std::set<std::string> selected = SelectedNames();
	const float top = Bounds().top;
	std::vector<std::unique_ptr<PanelItem>> items;
	items.reserve(entries.size());
	BList list(static_cast<int32>(entries.size()));
	for (const FolderEntry& entry : entries) {
		items.push_back(std::make_unique<PanelItem>(&entry));
		list.AddItem(items.back().get());
	}

	fPublishing = true;
	MakeEmpty();
	fItems = std::move(items);
	fShown = std::move(entries);
	AddList(&list);
	SelectNames(selected);
	const float lowest =
		fItems.empty() ? 0 : std::max(0.0f, ItemFrame(CountItems() - 1).bottom - Bounds().Height());
	BListView::ScrollTo(0, std::min(top, lowest));
	fPublishing = false;
	if (SelectedNames() != selected)
		fListener->EntriesSelected();
}


void
PanelList::SelectNames(const std::set<std::string>& names)
{
	if (names.empty())
		return;
	for (int32 i = 0; i < CountItems(); i++) {
		if (names.find(static_cast<PanelItem*>(ItemAt(i))->Entry().Name()) != names.end())
			Select(i, true);
	}
}


void
PanelList::SelectWanted()
{
	if (fWanted.empty())
		return;
	for (int32 i = 0; i < CountItems(); i++) {
		if (static_cast<PanelItem*>(ItemAt(i))->Entry().Name() == fWanted) {
			Select(i);
			ScrollToSelection();
			fWanted.clear();
			return;
		}
	}
}


/// Goes on with what is left of the path.
void
PanelList::FolderVanished()
{
	std::string nearest;
	std::string path = NearestFolder(fFolder);
	while (FindFolder(path, &nearest) != B_OK && path != "/")
		path = ParentPath(path);
	if (nearest.empty() || nearest == fFolder) {
		Publish({});
		fListener->EntriesChanged();
		return;
	}
	SetFolder(nearest);
	fListener->EntriesChanged();
}


void
PanelList::NodeChanged(const BMessage& message)
{
	int64 node;
	const bool isFolder =
		message.FindInt64("node", &node) == B_OK && static_cast<ino_t>(node) == fNode.node;
	if (isFolder && message.GetInt32("opcode", 0) == B_ENTRY_MOVED) {
		std::string path;
		// It was renamed in its folder, or moved to where nobody knows.
		if (FindFolder(entry_ref(fNode.device, fNode.node, "."), &path) == B_OK
			&& path != fFolder) {
			fFolder = path;
			fListener->EntriesChanged();
		}
	}
	ScheduleReading();
}


void
PanelList::ScheduleReading()
{
	if (fRereadScheduled)
		return;
	// A folder that takes long to read is not read all the time.
	const BMessage reread(kMsgReread);
	fRereadScheduled = BMessageRunner::StartSending(
						   BMessenger(this), &reread, std::max(kChangeDelay, 2 * fReadTime), 1)
		== B_OK;
}


void
PanelList::Watch()
{
	if (!fWatching)
		fWatching = watch_node(&fNode, B_WATCH_NAME | B_WATCH_DIRECTORY, this) == B_OK;
}


void
PanelList::StopWatching()
{
	if (fWatching)
		stop_watching(this);
	fWatching = false;
}

} // namespace BPrivate

// SPDX-License-Identifier: MIT
// The window of a file panel: its views and what they show.

#include "interface/panel/PanelWindow.h"

#include <algorithm>
#include <cmath>

#include <Button.h>
#include <CheckBox.h>
#include <InterfaceDefs.h>
#include <Screen.h>
#include <ScrollView.h>
#include <StringView.h>
#include <TextControl.h>

#include "interface/ControlLook.h"
#include "interface/panel/PanelColumns.h"
#include "interface/panel/PanelLink.h"
#include "interface/panel/PanelMemory.h"
#include "interface/panel/PanelPaths.h"
#include "interface/panel/PanelPlaces.h"
#include "interface/panel/PanelText.h"
#include "interface/panel/PanelWindowMessages.h"

namespace BPrivate {

namespace {

constexpr float kMargin = 12;
constexpr float kGap = 8;
constexpr float kPlacesWidth = 140;
constexpr float kSmallestWidth = 560;
constexpr float kSmallestHeight = 300;
constexpr float kButtonWidth = 80;


/// As wide as its label needs, at least \a width.
void
FitButton(BButton* button, float width)
{
	float preferredWidth;
	float preferredHeight;
	button->GetPreferredSize(&preferredWidth, &preferredHeight);
	button->ResizeTo(std::max(width, std::ceil(preferredWidth)), std::ceil(preferredHeight));
}

} // namespace


void
PanelWindow::Build(bool multiple)
{
	fBackground = new BView(Bounds(), "background", B_FOLLOW_ALL_SIDES, B_WILL_DRAW);
	fBackground->SetViewColor(ui_color(B_PANEL_BACKGROUND_COLOR));
	fBackground->SetLowColor(fBackground->ViewColor());
	AddChild(fBackground);
	BuildTop();
	BuildMiddle(multiple);
	BuildBottom();
	LayOut();
}


BButton*
PanelWindow::AddButton(const char* name, const char* label, uint32 what, uint32 resizingMode)
{
	BButton* button =
		new BButton(BRect(0, 0, 40, 20), name, label, new BMessage(what), resizingMode);
	fBackground->AddChild(button);
	return button;
}


void
PanelWindow::BuildTop()
{
	fUpButton = AddButton("up", "Up", kMsgGoUp, B_FOLLOW_LEFT_TOP);
	fPath = new BTextControl(
		BRect(0, 0, 100, 20), "path", "Folder:", "", NULL, B_FOLLOW_LEFT_RIGHT | B_FOLLOW_TOP);
	fPath->SetModificationMessage(new BMessage(kMsgPathEdited));
	fBackground->AddChild(fPath);
	fPath->SetDivider(std::ceil(fPath->StringWidth("Folder:")) + 6);
	fFolderButton =
		AddButton("new folder", "New folder", kMsgNewFolder, B_FOLLOW_RIGHT | B_FOLLOW_TOP);
}


void
PanelWindow::BuildMiddle(bool multiple)
{
	// The lists keep the size that they have when their scroll views are made: LayOut() gives them theirs.
	fPlaces = new PanelPlaces(BRect(0, 0, 100, 100));
	fPlacesScroll = new BScrollView("places scroll", fPlaces, B_FOLLOW_LEFT | B_FOLLOW_TOP_BOTTOM,
		0, false, true, B_PLAIN_BORDER);
	fBackground->AddChild(fPlacesScroll);
	fHeader = new PanelHeader(BRect(0, 0, 100, 20));
	fBackground->AddChild(fHeader);
	fList = new PanelList(BRect(0, 0, 100, 100),
		multiple && !IsSaving() ? B_MULTIPLE_SELECTION_LIST : B_SINGLE_SELECTION_LIST, fLink.get(),
		this);
	fListScroll =
		new BScrollView("list scroll", fList, B_FOLLOW_ALL_SIDES, 0, false, true, B_PLAIN_BORDER);
	fBackground->AddChild(fListScroll);
}


void
PanelWindow::BuildBottom()
{
	fName = nullptr;
	if (IsSaving()) {
		fName = new BTextControl(BRect(0, 0, 100, 20), "text view", "Name:", "", NULL,
			B_FOLLOW_LEFT_RIGHT | B_FOLLOW_BOTTOM);
		fBackground->AddChild(fName);
		fName->SetDivider(std::ceil(fName->StringWidth("Name:")) + 6);
	}
	fHiddenBox = new BCheckBox(BRect(0, 0, 100, 20), "hidden files", "Hidden files",
		new BMessage(kMsgHiddenChanged), B_FOLLOW_LEFT | B_FOLLOW_BOTTOM);
	fBackground->AddChild(fHiddenBox);
	fStatus =
		new BStringView(BRect(0, 0, 100, 20), "status", "", B_FOLLOW_LEFT_RIGHT | B_FOLLOW_BOTTOM);
	fStatus->SetTruncation(B_TRUNCATE_END);
	fBackground->AddChild(fStatus);
	fCancelButton =
		AddButton("cancel button", "Cancel", kMsgCancel, B_FOLLOW_RIGHT | B_FOLLOW_BOTTOM);
	fDefaultButton = AddButton("default button", IsSaving() ? "Save" : "Open", kMsgDefault,
		B_FOLLOW_RIGHT | B_FOLLOW_BOTTOM);
	fDefaultButton->MakeDefault(true);
}


/// Places everything for the window's present size, from the edges to the lists.
void
PanelWindow::LayOut()
{
	const BRect bounds = Bounds();
	const float left = kMargin;
	const float right = bounds.right - kMargin;
	const auto centre = [](BView* view, float x, float middle) {
		view->MoveTo(x, std::floor(middle - view->Bounds().Height() / 2));
	};

	FitButton(fUpButton, 0);
	FitButton(fFolderButton, 0);
	const float topHeight = std::max(fUpButton->Bounds().Height(), fPath->Bounds().Height());
	float middle = kMargin + std::ceil(topHeight / 2);
	centre(fUpButton, left, middle);
	centre(fFolderButton, right - fFolderButton->Bounds().Width(), middle);
	centre(fPath, fUpButton->Frame().right + kGap, middle);
	fPath->ResizeTo(
		fFolderButton->Frame().left - kGap - fPath->Frame().left, fPath->Bounds().Height());
	const float top = kMargin + topHeight + kGap;

	FitButton(fCancelButton, kButtonWidth);
	// The mark of the default button lies around it.
	FitButton(fDefaultButton, kButtonWidth + 6);
	const float rowHeight = fDefaultButton->Bounds().Height();
	middle = bounds.bottom - kMargin - std::floor(rowHeight / 2);
	centre(fDefaultButton, right - fDefaultButton->Bounds().Width(), middle);
	centre(fCancelButton, fDefaultButton->Frame().left - kGap - fCancelButton->Bounds().Width(),
		middle);
	fHiddenBox->ResizeToPreferred();
	centre(fHiddenBox, left, middle);
	float statusHeight;
	fStatus->GetPreferredSize(NULL, &statusHeight);
	const float statusLeft = fHiddenBox->Frame().right + 2 * kGap;
	fStatus->ResizeTo(
		std::max(0.0f, fCancelButton->Frame().left - kGap - statusLeft), statusHeight);
	centre(fStatus, statusLeft, middle);

	float bottom = bounds.bottom - kMargin - rowHeight - kGap;
	if (fName != nullptr) {
		fName->ResizeTo(right - left, fName->Bounds().Height());
		fName->MoveTo(left, bottom - fName->Bounds().Height());
		bottom = fName->Frame().top - kGap;
	}

	const float listLeft = left + kPlacesWidth + kGap;
	const float headerHeight = PanelHeader::NeededHeight(fBackground);
	fPlacesScroll->MoveTo(left, top);
	fPlacesScroll->ResizeTo(kPlacesWidth, bottom - top);
	fHeader->MoveTo(listLeft, top);
	fHeader->ResizeTo(right - listLeft, headerHeight);
	fListScroll->MoveTo(listLeft, top + headerHeight);
	fListScroll->ResizeTo(right - listLeft, bottom - top - headerHeight);
}


void
PanelWindow::AddShortcuts()
{
	AddShortcut('n', B_COMMAND_KEY, new BMessage(kMsgNewFolder));
	AddShortcut('h', B_COMMAND_KEY, new BMessage(kMsgToggleHidden));
	AddShortcut('w', B_COMMAND_KEY, new BMessage(kMsgCancel));
}


/// The first time it is shown: as large as the last panel was, in the middle of the screen.
void
PanelWindow::Place()
{
	fPlaced = true;
	PanelMemory memory(ApplicationSignature());
	memory.Load();
	SetSizeLimits(kSmallestWidth, 32768, kSmallestHeight, 32768);
	const BRect screen = BScreen(this).Frame();
	if (memory.Width() > 0 && memory.Height() > 0)
		ResizeTo(
			std::clamp(memory.Width(), kSmallestWidth, std::max(kSmallestWidth, screen.Width())),
			std::clamp(
				memory.Height(), kSmallestHeight, std::max(kSmallestHeight, screen.Height())));
	CenterOnScreen();
	fPlacedSize = Size();
	fPlaces->SetPlaces(memory.Folders());
	fHiddenBox->SetValue(memory.ShowsHidden() ? B_CONTROL_ON : B_CONTROL_OFF);
	fList->SetShowsHidden(memory.ShowsHidden());
}


void
PanelWindow::EntriesSelected()
{
	const std::vector<const FolderEntry*> selected = fList->SelectedEntries();
	const node_ref folder = fList->FolderNode();
	{
		std::lock_guard<std::mutex> lock(fLink->lock);
		fLink->selection.clear();
		for (const FolderEntry* entry : selected)
			fLink->selection.emplace_back(folder.device, folder.node, entry->Name().c_str());
		fLink->nextSelected = 0;
	}
	// The name of a file that may be replaced is one to save under.
	if (IsSaving() && selected.size() == 1 && !selected[0]->isFolder) {
		fSaveName = selected[0]->Name();
		fName->SetText(selected[0]->shownName.c_str());
	}
	fNotice.clear();
	UpdateState();
	CallPanel([](BFilePanel* panel) { panel->SelectionChanged(); });
}


void
PanelWindow::EntriesChanged()
{
	if (fShownFolder != fList->Folder()) {
		if (!fShownFolder.empty() && NearestFolder(fShownFolder) != fShownFolder)
			fNotice = "The folder \"" + DisplayName(LeafName(fShownFolder)) + "\" is gone.";
		UpdateFolder();
	}
	UpdateState();
}


/// The folder is another one: shows where it is.
void
PanelWindow::UpdateFolder()
{
	fShownFolder = fList->Folder();
	{
		std::lock_guard<std::mutex> lock(fLink->lock);
		fLink->folder = fShownFolder;
	}
	const std::string shown = DisplayName(fShownFolder);
	fPathLength = shown.size();
	fPath->SetText(shown.c_str());
	fUpButton->SetEnabled(fShownFolder != "/");
	fPlaces->ShowFolder(fShownFolder);
}


void
PanelWindow::UpdateState()
{
	bool canChoose = IsSaving();
	if (!canChoose) {
		const std::vector<const FolderEntry*> selected = fList->SelectedEntries();
		canChoose =
			selected.empty() ? IsFolderWanted() : selected.size() == 1 && selected[0]->isFolder;
		for (const FolderEntry* entry : selected)
			canChoose = canChoose || IsWanted(*entry);
	}
	fDefaultButton->SetEnabled(canChoose);
	UpdateStatus();
}


void
PanelWindow::UpdateStatus()
{
	std::string text = fNotice;
	const int32 count = fList->CountItems();
	if (text.empty() && fList->IsReading())
		text = "Reading: " + std::to_string(fList->CountRead()) + " so far";
	if (text.empty()) {
		const size_t selected = fList->SelectedEntries().size();
		text = std::to_string(count) + (count == 1 ? " item" : " items");
		if (selected > 1)
			text += ", " + std::to_string(selected) + " selected";
	}
	fStatus->SetHighColor(fNotice.empty() ? ControlTextColor(true, fBackground->ViewColor())
										  : ui_color(B_FAILURE_COLOR));
	if (text != fStatus->Text())
		fStatus->SetText(text.c_str());
}


/// Keeps what the next panel begins with. \a chosen: something was, in the shown folder.
void
PanelWindow::UpdateMemory(bool chosen)
{
	PanelMemory memory(ApplicationSignature());
	// Other panels, and other runs of the program, have been there since.
	memory.Load();
	const std::vector<std::string> folders = memory.Folders();
	const bool isNewest = !folders.empty() && folders.front() == fShownFolder;
	const bool isResized = Size() != fPlacedSize;
	const bool shows = fList->ShowsHidden();
	if ((!chosen || isNewest) && !isResized && memory.ShowsHidden() == shows)
		return;

	if (chosen)
		memory.AddFolder(fShownFolder);
	if (isResized)
		memory.SetSize(Bounds().Width(), Bounds().Height());
	fPlacedSize = Size();
	memory.SetShowsHidden(shows);
	memory.Save();
	if (chosen) {
		fPlaces->SetPlaces(memory.Folders());
		fPlaces->ShowFolder(fShownFolder);
	}
}

} // namespace BPrivate

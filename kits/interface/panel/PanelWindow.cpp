// SPDX-License-Identifier: MIT
// The window of a file panel: what it hears from its panel, the program and the user.

#include "interface/panel/PanelWindow.h"

#include <algorithm>
#include <cstring>

#include <Button.h>
#include <CheckBox.h>
#include <InterfaceDefs.h>
#include <Screen.h>
#include <TextControl.h>
#include <TextView.h>

#include "app/LooperPrivate.h"
#include "interface/panel/FolderNameWindow.h"
#include "interface/panel/PanelAlerts.h"
#include "interface/panel/PanelColumns.h"
#include "interface/panel/PanelLink.h"
#include "interface/panel/PanelMemory.h"
#include "interface/panel/PanelPaths.h"
#include "interface/panel/PanelPlaces.h"
#include "interface/panel/PanelText.h"
#include "interface/panel/PanelWindowMessages.h"

namespace BPrivate {

namespace {

constexpr float kUsualWidth = 640;
constexpr float kUsualHeight = 420;


std::string
UsualTitle(file_panel_mode mode)
{
	const std::string program = ProgramName();
	const char* what = mode == B_SAVE_PANEL ? "Save" : "Open";
	return program.empty() ? what : program + ": " + what;
}

} // namespace


PanelWindow::PanelWindow(
	file_panel_mode mode, bool multiple, bool modal, std::shared_ptr<PanelLink> link)
	: BWindow(BRect(0, 0, kUsualWidth, kUsualHeight), UsualTitle(mode).c_str(),
		B_TITLED_WINDOW_LOOK, modal ? B_MODAL_APP_WINDOW_FEEL : B_NORMAL_WINDOW_FEEL,
		B_ASYNCHRONOUS_CONTROLS | B_CLOSE_ON_ESCAPE),
	  fMode(mode),
	  fLink(std::move(link)),
	  fPlaced(false),
	  fPathLength(0)
{
	LooperAccess::SetKind(this, kFilePanelWindowLooper);
	Build(multiple);
	AddShortcuts();
	SetRules();
}


void
PanelWindow::MessageReceived(BMessage* message)
{
	switch (message->what) {
		case kMsgDefault:
			Choose();
			break;

		case kMsgCancel:
			PostMessage(B_QUIT_REQUESTED);
			break;

		case kMsgEntryInvoked:
			Invoked();
			break;

		case kMsgGoUp:
			GoUp();
			break;

		case kMsgPathTyped:
			EditPath(message->GetString("text", ""));
			break;

		case kMsgPathEdited:
			PathEdited();
			break;

		case kMsgPlaceChosen:
		{
			const std::string folder = fPlaces->ChosenFolder();
			if (!folder.empty() && folder != fList->Folder() && !TryFolder(folder))
				fPlaces->ShowFolder(fList->Folder());
			break;
		}

		case kMsgOrderChosen:
			SetOrder(*message);
			break;

		case kMsgHiddenChanged:
			fList->SetShowsHidden(fHiddenBox->Value() == B_CONTROL_ON);
			break;

		case kMsgToggleHidden:
			fHiddenBox->SetValue(!fHiddenBox->Value());
			fList->SetShowsHidden(fHiddenBox->Value() == B_CONTROL_ON);
			break;

		case kMsgNewFolder:
			AskForFolderName();
			break;

		case kMsgFolderMade:
			FolderMade(*message);
			break;

		case kMsgReplaceAnswer:
			ReplaceAnswered(*message);
			break;

		case B_SIMPLE_DATA:
			HandleDrop(*message);
			break;

		default:
			if (!HandlePanelMessage(message))
				BWindow::MessageReceived(message);
			break;
	}
}


void
PanelWindow::DispatchMessage(BMessage* message, BHandler* handler)
{
	if (message->what == B_KEY_DOWN && HandleKey(*message))
		return;
	BWindow::DispatchMessage(message, handler);
}


/// The panel keeps its window: it is hidden, and the program hears of it.
bool
PanelWindow::QuitRequested()
{
	HidePanel();
	return false;
}


void
PanelWindow::WindowActivated(bool active)
{
	BWindow::WindowActivated(active);
	if (active)
		fList->CheckForChanges();
}


void
PanelWindow::Show()
{
	// A program may show the window itself.
	std::string folder;
	{
		std::lock_guard<std::mutex> lock(fLink->lock);
		fLink->isShowing = true;
		folder = fLink->folder;
	}
	if (!fPlaced)
		Place();
	if (fList->Folder() != folder)
		GoTo(NearestFolder(folder));
	else
		fList->Reread();
	if (IsSaving())
		fName->MakeFocus(true);
	else
		fList->MakeFocus(true);
	BWindow::Show();
}


void
PanelWindow::Hide()
{
	{
		std::lock_guard<std::mutex> lock(fLink->lock);
		fLink->isShowing = false;
	}
	fList->Rest();
	BWindow::Hide();
}


bool
PanelWindow::HandlePanelMessage(BMessage* message)
{
	switch (message->what) {
		case kMsgPanelShow:
			ShowPanel();
			return true;

		case kMsgPanelHide:
			HidePanel();
			return true;

		case kMsgPanelGone:
			CloseDialogs();
			// Does not return.
			Quit();
			return true;

		// A hidden panel reads its folder when it is shown.
		case kMsgPanelRefresh:
			if (!IsHidden())
				fList->Reread();
			return true;

		case kMsgPanelRules:
			SetRules();
			if (!IsHidden())
				fList->Reread();
			return true;

		case kMsgPanelFolder:
		{
			const char* error;
			if (message->FindString("error", &error) == B_OK) {
				fNotice = error;
				UpdateStatus();
			} else if (!IsHidden())
				GoTo(message->GetString("folder", "/"));
			return true;
		}

		case kMsgPanelSaveText:
			SetSaveText(message->GetString("text", ""));
			return true;

		case kMsgPanelLabel:
			SetButtonLabel(*message);
			return true;

		default:
			return false;
	}
}


void
PanelWindow::ShowPanel()
{
	if (IsHidden()) {
		Show();
		return;
	}
	if (IsMinimized())
		Minimize(false);
	Activate();
}


/// Hides the window, and tells the panel and its target.
void
PanelWindow::HidePanel()
{
	if (IsHidden())
		return;
	CloseDialogs();
	Hide();
	UpdateMemory(false);
	CallPanel([](BFilePanel* panel) { panel->WasHidden(); });
	SendCancel();
}


void
PanelWindow::SetButtonLabel(const BMessage& message)
{
	BButton* button =
		message.GetInt32("button", -1) == B_CANCEL_BUTTON ? fCancelButton : fDefaultButton;
	button->SetLabel(message.GetString("label", ""));
	LayOut();
}


/// A name that is no text is proposed as it can be shown; what is sent in the end is the name itself.
void
PanelWindow::SetSaveText(const std::string& text)
{
	fSaveName = text;
	if (fName == nullptr)
		return;
	fName->SetText(DisplayName(text).c_str());
	fName->TextView()->SelectAll();
}


void
PanelWindow::SetRules()
{
	std::lock_guard<std::mutex> lock(fLink->lock);
	// Where something is to be saved all files are worth seeing.
	fList->SetFlavors(IsSaving() ? fLink->flavors | B_FILE_NODE : fLink->flavors);
}


/// Calls a hook of the panel, unless it is gone.
void
PanelWindow::CallPanel(const std::function<void(BFilePanel*)>& hook)
{
	std::lock_guard<std::recursive_mutex> lock(fLink->hooks);
	if (fLink->panel != nullptr)
		hook(fLink->panel);
}


/// Files that are dropped here are gone to.
void
PanelWindow::HandleDrop(const BMessage& message)
{
	entry_ref ref;
	std::string folder;
	if (message.FindRef("refs", &ref) != B_OK)
		return;
	if (FindFolder(ref, &folder) == B_OK)
		GoTo(folder);
	else if (FindFolder(entry_ref(ref.device, ref.directory, "."), &folder) == B_OK)
		GoTo(folder, ref.name);
}


void
PanelWindow::SetOrder(const BMessage& message)
{
	const FolderOrder order = static_cast<FolderOrder>(message.GetInt32("order", 0));
	// A second click on the same column turns the order round.
	const bool descending = order == fList->Order() && !fList->IsDescending();
	fList->SetOrder(order, descending);
	fHeader->SetOrder(order, descending);
}


/// Enter means what the focus is about, before the default button gets it; Escape first takes back a path that is
/// being typed. Keys that move the focus do so before the next key comes, which a shortcut's message would not.
/// True when it is done.
bool
PanelWindow::HandleKey(const BMessage& message)
{
	const uint32 kHeldModifiers = B_SHIFT_KEY | B_COMMAND_KEY | B_CONTROL_KEY | B_OPTION_KEY;
	const int32 key = message.GetInt32("raw_char", 0);
	const uint32 held = message.GetInt32("modifiers", 0) & kHeldModifiers;
	if (held == B_COMMAND_KEY || held == B_CONTROL_KEY)
		return HandleFocusKey(key, held == B_COMMAND_KEY);
	if (held != 0)
		return false;

	const bool isInPath = CurrentFocus() == fPath->TextView();
	if (key == B_ESCAPE && isInPath && fPath->Text() != DisplayName(fShownFolder)) {
		UpdateFolder();
		fList->MakeFocus(true);
		return true;
	}
	if (key == B_ENTER && isInPath) {
		GoToTypedPath();
		return true;
	}
	return key == B_ENTER && CurrentFocus() == fList && EnterSelected(false);
}


bool
PanelWindow::HandleFocusKey(int32 key, bool isCommand)
{
	switch (key) {
		case B_UP_ARROW:
			GoUp();
			return true;

		case B_DOWN_ARROW:
			EnterSelected(true);
			return true;

		case 'l':
		case 'L':
			if (isCommand)
				fPath->MakeFocus(true);
			return isCommand;

		default:
			return false;
	}
}


void
PanelWindow::GoTo(const std::string& folder, const std::string& select)
{
	fNotice.clear();
	fList->SetFolder(folder, select);
	UpdateFolder();
	UpdateState();
}


/// Goes to \a path, or says why not and stays.
bool
PanelWindow::TryFolder(const std::string& path, const std::string& select)
{
	std::string folder;
	const status_t status = FindFolder(path, &folder);
	if (status == B_OK)
		GoTo(folder, select);
	else
		Notice(
			"The folder \"" + DisplayName(path) + "\" cannot be opened. " + StatusSentence(status));
	return status == B_OK;
}


void
PanelWindow::GoUp()
{
	const std::string folder = fList->Folder();
	if (folder != "/" && TryFolder(ParentPath(folder), LeafName(folder)))
		fList->MakeFocus(true);
}


/// The path of a folder leads into it; that of a file to the file, where it is selected.
void
PanelWindow::GoToTypedPath()
{
	const std::string path = TypedPath(fPath->Text(), fList->Folder());
	std::string folder;
	status_t status = FindFolder(path, &folder);
	if (status == B_OK) {
		GoTo(folder);
		fList->MakeFocus(true);
		return;
	}
	if (status == B_NOT_A_DIRECTORY && FindFolder(ParentPath(path), &folder) == B_OK) {
		GoTo(folder, LeafName(path));
		fList->MakeFocus(true);
		return;
	}
	Notice("\"" + std::string(fPath->Text()) + "\" cannot be opened. " + StatusSentence(status));
}


void
PanelWindow::EditPath(const std::string& text)
{
	fPath->MakeFocus(true);
	fPathLength = 0;
	fPath->SetText(text.c_str());
	BTextView* view = fPath->TextView();
	view->Select(view->TextLength(), view->TextLength());
}


/// Completes what is being typed. The rest is selected, so that typing on replaces it.
void
PanelWindow::PathEdited()
{
	BTextView* view = fPath->TextView();
	const std::string text = view->Text();
	const bool grows = text.size() > fPathLength;
	fPathLength = text.size();
	int32 start;
	int32 end;
	view->GetSelection(&start, &end);
	if (!grows || CurrentFocus() != view || start != end || size_t(end) != text.size())
		return;

	const std::string rest = PathCompletion(text, fList->Folder());
	if (rest.empty())
		return;
	view->Insert(end, rest.c_str(), static_cast<int32>(rest.size()));
	view->Select(end, end + static_cast<int32>(rest.size()));
}


void
PanelWindow::AskForFolderName()
{
	if (fNameWindow.IsValid() || fList->Folder().empty())
		return;
	FolderNameWindow* window = new FolderNameWindow(Frame(), fList->Folder(), BMessenger(this));
	fNameWindow = BMessenger(window);
	window->Show();
}


void
PanelWindow::FolderMade(const BMessage& message)
{
	if (fList->Folder() != message.GetString("folder", ""))
		return;
	fList->SelectNamed(message.GetString("name", ""));
	fList->Reread();
	fList->MakeFocus(true);
}


void
PanelWindow::Notice(const std::string& text)
{
	if (fAlert.IsValid())
		fAlert.SendMessage(B_QUIT_REQUESTED);
	fAlert = ShowPanelNotice(text);
}


/// What belongs to the panel goes with it.
void
PanelWindow::CloseDialogs()
{
	for (BMessenger* dialog : {&fAlert, &fNameWindow}) {
		if (dialog->IsValid())
			dialog->SendMessage(B_QUIT_REQUESTED);
		*dialog = BMessenger();
	}
}

} // namespace BPrivate

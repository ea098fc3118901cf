// SPDX-License-Identifier: MIT
// The window of a file panel: what is chosen, and whom it is sent to.

#include "interface/panel/PanelWindow.h"

#include <fcntl.h>
#include <sys/stat.h>
#include <unistd.h>

#include <TextControl.h>

#include "interface/panel/PanelAlerts.h"
#include "interface/panel/PanelLink.h"
#include "interface/panel/PanelPaths.h"
#include "interface/panel/PanelText.h"
#include "interface/panel/PanelWindowMessages.h"
#include "storage/EntryResolving.h"

namespace BPrivate {

namespace {

std::string
Quoted(const std::string& name)
{
	return "\"" + DisplayName(name) + "\"";
}

} // namespace


/// Whether an entry is of a kind that the program asked for.
bool
PanelWindow::IsWanted(const FolderEntry& entry) const
{
	std::lock_guard<std::mutex> lock(fLink->lock);
	if (entry.isLink && (fLink->flavors & B_SYMLINK_NODE) != 0)
		return true;
	if (entry.isBroken)
		return false;
	return (fLink->flavors & (entry.isFolder ? B_DIRECTORY_NODE : B_FILE_NODE)) != 0;
}


bool
PanelWindow::IsFolderWanted() const
{
	std::lock_guard<std::mutex> lock(fLink->lock);
	return (fLink->flavors & B_DIRECTORY_NODE) != 0;
}


/// Goes into the selected folder; false when no single one is selected that is not to be chosen itself.
bool
PanelWindow::EnterSelected(bool evenWanted)
{
	const std::vector<const FolderEntry*> selected = fList->SelectedEntries();
	if (selected.size() != 1 || !selected[0]->isFolder)
		return false;
	if (!evenWanted && !IsSaving() && IsWanted(*selected[0]))
		return false;
	TryFolder(join_path(fList->Folder(), selected[0]->Name()));
	return true;
}


/// A row was double-clicked.
void
PanelWindow::Invoked()
{
	if (!EnterSelected(true))
		Choose();
}


void
PanelWindow::Choose()
{
	if (IsSaving())
		SaveChosen();
	else
		OpenChosen();
}


void
PanelWindow::OpenChosen()
{
	const std::vector<const FolderEntry*> selected = fList->SelectedEntries();
	if (selected.empty()) {
		if (IsFolderWanted())
			ChooseFolder();
		return;
	}
	if (EnterSelected(false))
		return;

	BMessage message;
	{
		std::lock_guard<std::mutex> lock(fLink->lock);
		message = fLink->message;
	}
	const node_ref folder = fList->FolderNode();
	bool any = false;
	for (const FolderEntry* entry : selected) {
		if (!IsWanted(*entry))
			continue;
		struct stat stat;
		if (lstat(join_path(fList->Folder(), entry->Name()).c_str(), &stat) != 0) {
			Notice(Quoted(entry->Name()) + " does not exist any more.");
			fList->Reread();
			return;
		}
		const entry_ref ref(folder.device, folder.node, entry->Name().c_str());
		message.AddRef("refs", &ref);
		any = true;
	}
	if (any)
		SendChoice(&message);
}


/// The folder that is shown is the choice.
void
PanelWindow::ChooseFolder()
{
	entry_ref ref;
	if (get_ref_for_path(fList->Folder().c_str(), &ref) != B_OK) {
		fList->Reread();
		return;
	}
	BMessage message;
	{
		std::lock_guard<std::mutex> lock(fLink->lock);
		message = fLink->message;
	}
	message.AddRef("refs", &ref);
	SendChoice(&message);
}


void
PanelWindow::SaveChosen()
{
	const std::string text = fName->Text();
	// What was proposed or selected counts as it is, also where it could not be shown.
	std::string name = text;
	if (text == DisplayName(fSaveName))
		name = fSaveName;
	else if (!fList->NameShownAs(text).empty())
		name = fList->NameShownAs(text);

	std::string problem = NameProblem(name);
	if (name.find_first_not_of(' ') == std::string::npos)
		problem = NameProblem("");
	if (!problem.empty()) {
		Notice(problem);
		fName->MakeFocus(true);
		return;
	}

	const std::string& folder = fList->Folder();
	std::string found;
	const status_t status = FindFolder(folder, &found);
	if (status != B_OK) {
		Notice("The folder " + Quoted(folder) + " cannot be used. " + StatusSentence(status));
		fList->Reread();
		return;
	}

	const std::string path = join_path(folder, name);
	struct stat stat;
	if (::stat(path.c_str(), &stat) == 0 && S_ISDIR(stat.st_mode)) {
		Notice("There is a folder named " + Quoted(name) + " already. Please choose another name.");
		fName->MakeFocus(true);
		return;
	}
	if (lstat(path.c_str(), &stat) == 0) {
		BMessage answer(kMsgReplaceAnswer);
		answer.AddString("folder", folder.c_str());
		answer.AddString("name", name.c_str());
		fAlert =
			AskInPanel("The file " + Quoted(name) + " exists already. Do you want to replace it?",
				"Replace", answer, BMessenger(this));
		return;
	}
	if (faccessat(AT_FDCWD, folder.c_str(), W_OK | X_OK, AT_EACCESS) != 0) {
		Notice("Nothing can be saved in the folder " + Quoted(LeafName(folder))
			+ ": you may not write there. Please choose another folder.");
		return;
	}
	SaveAs(folder, name);
}


void
PanelWindow::ReplaceAnswered(const BMessage& answer)
{
	// A panel that was hidden meanwhile has told that nothing was chosen.
	if (answer.GetInt32("which", 0) == 1 && !IsHidden())
		SaveAs(answer.GetString("folder", ""), answer.GetString("name", ""));
	else if (fName != nullptr)
		fName->MakeFocus(true);
}


void
PanelWindow::SaveAs(const std::string& folder, const std::string& name)
{
	entry_ref directory;
	const status_t status = get_ref_for_path(folder.c_str(), &directory);
	if (status != B_OK) {
		Notice("The folder " + Quoted(folder) + " cannot be used. " + StatusSentence(status));
		return;
	}
	BMessage message;
	{
		std::lock_guard<std::mutex> lock(fLink->lock);
		message = fLink->message;
	}
	message.AddRef("directory", &directory);
	message.AddString("name", name.c_str());
	SendChoice(&message);
}


/// Sends what was chosen, and hides the panel if it is to.
void
PanelWindow::SendChoice(BMessage* message)
{
	UpdateMemory(true);
	BMessenger target;
	bool hides;
	{
		std::lock_guard<std::mutex> lock(fLink->lock);
		target = fLink->target;
		hides = fLink->hideWhenDone;
	}
	CallPanel([&](BFilePanel* panel) { panel->SendMessage(&target, message); });
	if (hides)
		HidePanel();
}


/// Tells the target that the panel is hidden.
void
PanelWindow::SendCancel()
{
	BMessage message;
	BMessenger target;
	{
		std::lock_guard<std::mutex> lock(fLink->lock);
		message = fLink->message;
		target = fLink->target;
	}
	const int32 choice = static_cast<int32>(message.what);
	message.what = B_CANCEL;
	message.AddInt32("old_what", choice);
	CallPanel([&](BFilePanel* panel) {
		message.AddPointer("source", panel);
		target.SendMessage(&message);
	});
}

} // namespace BPrivate

// SPDX-License-Identifier: MIT
// BFilePanel: passes on to its window, and never waits for it.

#include <FilePanel.h>

#include <Application.h>
#include <Directory.h>
#include <Message.h>

#include "interface/panel/PanelLink.h"
#include "interface/panel/PanelMemory.h"
#include "interface/panel/PanelPaths.h"
#include "interface/panel/PanelText.h"
#include "interface/panel/PanelWindow.h"

using namespace BPrivate;

namespace {

uint32
UsualCode(file_panel_mode mode)
{
	return mode == B_SAVE_PANEL ? uint32(B_SAVE_REQUESTED) : uint32(B_REFS_RECEIVED);
}


uint32
KnownFlavors(uint32 flavors)
{
	return (flavors & B_ANY_NODE) != 0 ? flavors & B_ANY_NODE : uint32(B_FILE_NODE);
}


std::string
UsualFolder()
{
	PanelMemory memory(ApplicationSignature());
	memory.Load();
	return StartFolder(memory);
}


/// Goes to \a folder; where \a status says that there is none, the panel stays where it is and says so.
void
GoToFolder(PanelLink& link, status_t status, const char* name, const std::string& folder)
{
	BMessage message(kMsgPanelFolder);
	if (status == B_OK) {
		std::lock_guard<std::mutex> lock(link.lock);
		link.folder = folder;
		message.AddString("folder", folder.c_str());
	} else {
		const std::string error = "The folder \"" + DisplayName(name != NULL ? name : "")
			+ "\" cannot be opened. " + StatusSentence(status);
		message.AddString("error", error.c_str());
	}
	link.window.SendMessage(&message);
}

} // namespace


BFilePanel::BFilePanel(file_panel_mode mode, BMessenger* target, const entry_ref* directory,
	uint32 nodeFlavors, bool allowMultipleSelection, BMessage* message, BRefFilter* refFilter,
	bool modal, bool hideWhenDone)
	: fLink(std::make_shared<PanelLink>()),
	  fMode(mode)
{
	fLink->target = target != NULL ? *target : be_app_messenger;
	fLink->message = message != NULL ? *message : BMessage(UsualCode(mode));
	fLink->flavors = KnownFlavors(nodeFlavors);
	fLink->hideWhenDone = hideWhenDone;
	fLink->panel = this;
	fLink->filter = refFilter;
	if (directory == NULL || FindFolder(*directory, &fLink->folder) != B_OK)
		fLink->folder = UsualFolder();

	fWindow = new PanelWindow(mode, allowMultipleSelection, modal, fLink);
	fLink->window = BMessenger(fWindow);
	// Hidden, and its own from here on.
	fWindow->Run();
}


BFilePanel::~BFilePanel()
{
	{
		// From here on no hook and no filter is called.
		std::lock_guard<std::recursive_mutex> hooks(fLink->hooks);
		fLink->panel = NULL;
		fLink->filter = NULL;
	}
	fLink->window.SendMessage(kMsgPanelGone);
}


void
BFilePanel::Show()
{
	{
		std::lock_guard<std::mutex> lock(fLink->lock);
		fLink->isShowing = true;
	}
	fLink->window.SendMessage(kMsgPanelShow);
}


void
BFilePanel::Hide()
{
	{
		std::lock_guard<std::mutex> lock(fLink->lock);
		fLink->isShowing = false;
	}
	fLink->window.SendMessage(kMsgPanelHide);
}


bool
BFilePanel::IsShowing() const
{
	std::lock_guard<std::mutex> lock(fLink->lock);
	return fLink->isShowing;
}


void
BFilePanel::WasHidden()
{
}


void
BFilePanel::SelectionChanged()
{
}


void
BFilePanel::SendMessage(const BMessenger* target, BMessage* message)
{
	if (target != NULL)
		target->SendMessage(message);
}


BWindow*
BFilePanel::Window() const
{
	return fWindow;
}


BMessenger
BFilePanel::Messenger() const
{
	std::lock_guard<std::mutex> lock(fLink->lock);
	return fLink->target;
}


BRefFilter*
BFilePanel::RefFilter() const
{
	std::lock_guard<std::recursive_mutex> hooks(fLink->hooks);
	return fLink->filter;
}


file_panel_mode
BFilePanel::PanelMode() const
{
	return fMode;
}


void
BFilePanel::SetTarget(BMessenger target)
{
	std::lock_guard<std::mutex> lock(fLink->lock);
	fLink->target = target;
}


void
BFilePanel::SetMessage(BMessage* message)
{
	std::lock_guard<std::mutex> lock(fLink->lock);
	fLink->message = message != NULL ? *message : BMessage(UsualCode(fMode));
}


void
BFilePanel::SetRefFilter(BRefFilter* filter)
{
	{
		// Waits until the old one is not being asked any more.
		std::lock_guard<std::recursive_mutex> hooks(fLink->hooks);
		fLink->filter = filter;
	}
	fLink->window.SendMessage(kMsgPanelRules);
}


void
BFilePanel::SetSaveText(const char* text)
{
	BMessage message(kMsgPanelSaveText);
	message.AddString("text", text != NULL ? text : "");
	fLink->window.SendMessage(&message);
}


void
BFilePanel::SetButtonLabel(file_panel_button button, const char* label)
{
	BMessage message(kMsgPanelLabel);
	message.AddInt32("button", button);
	message.AddString("label", label != NULL ? label : "");
	fLink->window.SendMessage(&message);
}


void
BFilePanel::SetNodeFlavors(uint32 flavors)
{
	{
		std::lock_guard<std::mutex> lock(fLink->lock);
		fLink->flavors = KnownFlavors(flavors);
	}
	fLink->window.SendMessage(kMsgPanelRules);
}


void
BFilePanel::SetPanelDirectory(const BEntry* newDirectory)
{
	entry_ref ref;
	if (newDirectory != NULL && newDirectory->GetRef(&ref) == B_OK)
		SetPanelDirectory(&ref);
}


void
BFilePanel::SetPanelDirectory(const BDirectory* newDirectory)
{
	BEntry entry;
	if (newDirectory != NULL && newDirectory->GetEntry(&entry) == B_OK)
		SetPanelDirectory(&entry);
}


void
BFilePanel::SetPanelDirectory(const entry_ref* newDirectory)
{
	if (newDirectory == NULL)
		return;
	std::string folder;
	const status_t status = FindFolder(*newDirectory, &folder);
	GoToFolder(*fLink, status, newDirectory->name, folder);
}


void
BFilePanel::SetPanelDirectory(const char* newDirectory)
{
	if (newDirectory == NULL)
		return;
	std::string folder;
	const status_t status = FindFolder(newDirectory, &folder);
	GoToFolder(*fLink, status, newDirectory, folder);
}


void
BFilePanel::GetPanelDirectory(entry_ref* ref) const
{
	if (ref == NULL)
		return;
	std::string folder;
	{
		std::lock_guard<std::mutex> lock(fLink->lock);
		folder = fLink->folder;
	}
	get_ref_for_path(folder.c_str(), ref);
}


void
BFilePanel::SetHideWhenDone(bool hideWhenDone)
{
	std::lock_guard<std::mutex> lock(fLink->lock);
	fLink->hideWhenDone = hideWhenDone;
}


bool
BFilePanel::HidesWhenDone() const
{
	std::lock_guard<std::mutex> lock(fLink->lock);
	return fLink->hideWhenDone;
}


void
BFilePanel::Refresh()
{
	fLink->window.SendMessage(kMsgPanelRefresh);
}


void
BFilePanel::Rewind()
{
	std::lock_guard<std::mutex> lock(fLink->lock);
	fLink->nextSelected = 0;
}


status_t
BFilePanel::GetNextSelectedRef(entry_ref* ref)
{
	if (ref == NULL)
		return B_BAD_VALUE;
	std::lock_guard<std::mutex> lock(fLink->lock);
	if (fLink->nextSelected >= fLink->selection.size())
		return B_ENTRY_NOT_FOUND;
	*ref = fLink->selection[fLink->nextSelected++];
	return B_OK;
}

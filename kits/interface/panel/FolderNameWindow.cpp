// SPDX-License-Identifier: MIT
// Asks a file panel's user for the name of a new folder, and makes it.

#include "interface/panel/FolderNameWindow.h"

#include <algorithm>
#include <cerrno>
#include <cmath>

#include <sys/stat.h>

#include <Button.h>
#include <TextControl.h>

#include "interface/panel/PanelAlerts.h"
#include "interface/panel/PanelPaths.h"
#include "interface/panel/PanelText.h"
#include "storage/EntryResolving.h"
#include "storage/StorageStatus.h"

namespace BPrivate {

namespace {

constexpr uint32 kMsgMake = 'make';
constexpr float kMargin = 12;
constexpr float kWidth = 340;
constexpr float kButtonWidth = 80;

} // namespace


FolderNameWindow::FolderNameWindow(BRect over, const std::string& folder, const BMessenger& panel)
	: BWindow(BRect(0, 0, kWidth, 90), "New folder", B_TITLED_WINDOW_LOOK, B_MODAL_APP_WINDOW_FEEL,
		B_NOT_RESIZABLE | B_NOT_ZOOMABLE | B_NOT_MINIMIZABLE | B_CLOSE_ON_ESCAPE),
	  fFolder(folder),
	  fPanel(panel)
{
	BView* background = new BView(Bounds(), "background", B_FOLLOW_ALL_SIDES, B_WILL_DRAW);
	background->SetViewColor(ui_color(B_PANEL_BACKGROUND_COLOR));
	background->SetLowColor(background->ViewColor());
	AddChild(background);

	fName = new BTextControl(BRect(kMargin, kMargin, kWidth - kMargin, kMargin + 20), "name",
		"Name:", UnusedName(folder, "New folder").c_str(), NULL);
	background->AddChild(fName);
	fName->SetDivider(std::ceil(fName->StringWidth("Name:")) + 8);

	BButton* create =
		new BButton(BRect(0, 0, kButtonWidth, 20), "create", "Create", new BMessage(kMsgMake));
	BButton* cancel = new BButton(
		BRect(0, 0, kButtonWidth, 20), "cancel", "Cancel", new BMessage(B_QUIT_REQUESTED));
	background->AddChild(cancel);
	background->AddChild(create);
	float height;
	create->GetPreferredSize(NULL, &height);
	const float top = fName->Frame().bottom + kMargin;
	cancel->ResizeTo(kButtonWidth, height);
	create->ResizeTo(kButtonWidth, height);
	create->MoveTo(kWidth - kMargin - kButtonWidth, top);
	cancel->MoveTo(kWidth - 2 * kMargin - 2 * kButtonWidth, top);
	create->MakeDefault(true);
	ResizeTo(kWidth, top + height + kMargin);
	MoveTo(std::floor(over.left + (over.Width() - kWidth) / 2),
		std::floor(over.top + std::max(0.0f, over.Height() - Bounds().Height()) / 3));
	fName->MakeFocus(true);
}


void
FolderNameWindow::MessageReceived(BMessage* message)
{
	if (message->what == kMsgMake)
		MakeFolder();
	else
		BWindow::MessageReceived(message);
}


void
FolderNameWindow::MakeFolder()
{
	const std::string name = fName->Text();
	const std::string problem = NameProblem(name);
	if (!problem.empty()) {
		ShowPanelNotice(problem);
		return;
	}
	if (mkdir(join_path(fFolder, name).c_str(), 0777) != 0) {
		const status_t status = status_from_errno(errno);
		ShowPanelNotice("The folder \"" + DisplayName(name) + "\" could not be made. "
			+ StatusSentence(status));
		return;
	}

	BMessage made(kMsgFolderMade);
	made.AddString("name", name.c_str());
	made.AddString("folder", fFolder.c_str());
	fPanel.SendMessage(&made);
	PostMessage(B_QUIT_REQUESTED);
}

} // namespace BPrivate

// SPDX-License-Identifier: MIT

#include "GalleryWindow.h"

#include <algorithm>

#include <Alert.h>
#include <Application.h>
#include <Control.h>
#include <FilePanel.h>
#include <Invoker.h>
#include <MenuBar.h>
#include <Message.h>
#include <StringView.h>
#include <TabView.h>

#include "Commands.h"
#include "GalleryMenus.h"
#include "Pages.h"

namespace {

const uint32 kMsgAlertAnswered = 'answ';
const float kStatusHeight = 22;

BView* (*const kPages[])(BRect) = {MakeButtonsPage, MakeTextPage, MakeSlidersPage, MakeBarsPage,
	MakeColorsPage, MakeTabsPage, MakeListsPage, MakeMenusPage, MakeDialogsPage};

} // namespace

GalleryWindow::GalleryWindow()
	: BWindow(BRect(80, 60, 679, 499), "Gallery", B_TITLED_WINDOW, 0),
	  fPages(nullptr),
	  fStatus(nullptr)
{
	BuildPages();
}


GalleryWindow::~GalleryWindow() {}


void
GalleryWindow::MessageReceived(BMessage* message)
{
	switch (message->what) {
		case GM_SHOW_PAGE:
			fPages->Select(message->GetInt32("index", -1));
			break;

		case GM_SHOW_ALERT:
			ShowAlert(message);
			break;

		case GM_OPEN_FILES:
			ShowPanel(&fOpenPanel, false);
			break;

		case GM_SAVE_FILE:
			ShowPanel(&fSavePanel, true);
			break;

		case B_REFS_RECEIVED:
			TellFiles(message);
			break;

		case B_SAVE_REQUESTED:
			TellSaved(message);
			break;

		case GM_TELL:
			fStatus->SetText(message->GetString("text", ""));
			break;

		case kMsgAlertAnswered:
		{
			BString text("The alert was answered with button ");
			fStatus->SetText((text << message->GetInt32("which", -1) + 1).String());
			break;
		}

		default:
			TellSender(message);
			BWindow::MessageReceived(message);
			break;
	}
}


bool
GalleryWindow::QuitRequested()
{
	be_app->PostMessage(B_QUIT_REQUESTED);
	return true;
}


void
GalleryWindow::BuildPages()
{
	BView* background = MakePage(Bounds(), "background");
	background->SetResizingMode(B_FOLLOW_ALL);
	AddChild(background);

	BMenuBar* menuBar = MakeMenuBar(this);
	background->AddChild(menuBar);
	BRect frame = Bounds();
	frame.top = menuBar->Frame().bottom + 1;
	frame.bottom -= kStatusHeight;
	frame.InsetBy(8, 8);
	fPages = new BTabView(frame, "pages", B_WIDTH_FROM_LABEL, B_FOLLOW_ALL);
	const BRect pageFrame = fPages->ContainerView()->Bounds();
	for (BView* (*makePage)(BRect) : kPages)
		fPages->AddTab(makePage(pageFrame));
	background->AddChild(fPages);

	fStatus = new BStringView(BRect(10, frame.bottom + 6, frame.right, frame.bottom + 24),
		"svStatus", "Nothing was used yet", B_FOLLOW_LEFT_RIGHT | B_FOLLOW_BOTTOM);
	fStatus->SetTruncation(B_TRUNCATE_END);
	background->AddChild(fStatus);
}


void
GalleryWindow::ShowAlert(const BMessage* message)
{
	const char* const kLabels[] = {"First", "Second", "Third"};
	const int32 count = std::clamp<int32>(message->GetInt32("buttons", 1), 1, 3);
	BAlert* alert = new BAlert("Alert",
		"An alert tells something or asks a question. This text is long enough for more than one "
		"line.",
		kLabels[0], count > 1 ? kLabels[1] : nullptr, count > 2 ? kLabels[2] : nullptr,
		B_WIDTH_AS_USUAL, static_cast<alert_type>(message->GetInt32("type", B_INFO_ALERT)));
	// No alert owns it, and one may outlive this window.
	static BInvoker sAnswer(new BMessage(kMsgAlertAnswered), this);
	alert->Go(&sAnswer);
}


void
GalleryWindow::ShowPanel(std::unique_ptr<BFilePanel>* panel, bool save)
{
	if (*panel == nullptr) {
		BMessenger target(this);
		panel->reset(new BFilePanel(save ? B_SAVE_PANEL : B_OPEN_PANEL, &target));
	}
	(*panel)->Show();
}


void
GalleryWindow::TellFiles(const BMessage* message)
{
	BString text("Chosen:");
	entry_ref ref;
	for (int32 i = 0; message->FindRef("refs", i, &ref) == B_OK; i++)
		text << ' ' << ref.name;
	fStatus->SetText(text.String());
}


void
GalleryWindow::TellSaved(const BMessage* message)
{
	BString text("To be saved as: ");
	fStatus->SetText((text << message->GetString("name", "")).String());
}


/// What a control, a list or a menu sent.
void
GalleryWindow::TellSender(const BMessage* message)
{
	BMessenger sender;
	if (message->FindMessenger("be:sender", &sender) != B_OK)
		return;
	BLooper* looper = nullptr;
	const BHandler* handler = sender.Target(&looper);
	BString text("Used: ");
	text << (looper == this && handler != nullptr && handler->Name() != nullptr ? handler->Name()
																				: "a menu");
	int32 number;
	if (message->FindInt32("be:value", &number) == B_OK)
		text << ", value " << number;
	if (message->FindInt32("index", &number) == B_OK)
		text << ", item " << number;
	fStatus->SetText(text.String());
}

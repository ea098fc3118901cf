// SPDX-License-Identifier: MIT

#include "GalleryWindow.h"

#include <Application.h>
#include <Message.h>
#include <StringView.h>
#include <TabView.h>

#include "Pages.h"

namespace {

const uint32 kMsgShowPage = 'page'; // "index" (int32)

BView* (*const kPages[])(BRect) = {
	MakeButtonsPage, MakeTextPage, MakeSlidersPage, MakeBarsPage, MakeColorsPage, MakeTabsPage};

} // namespace

GalleryWindow::GalleryWindow()
	: BWindow(BRect(80, 60, 639, 439), "Gallery", B_TITLED_WINDOW, 0),
	  fPages(nullptr)
{
	BView* background = MakePage(Bounds(), "background");
	background->SetResizingMode(B_FOLLOW_ALL);
	AddChild(background);

	fPages = new BTabView(Bounds().InsetByCopy(8, 8), "pages", B_WIDTH_FROM_LABEL, B_FOLLOW_ALL);
	const BRect frame = fPages->ContainerView()->Bounds();
	for (BView* (*makePage)(BRect) : kPages) {
		fPages->AddTab(makePage(frame));
		BMessage* message = new BMessage(kMsgShowPage);
		message->AddInt32("index", fPages->CountTabs() - 1);
		AddShortcut('0' + fPages->CountTabs(), B_COMMAND_KEY, message);
	}
	background->AddChild(fPages);
}


void
GalleryWindow::MessageReceived(BMessage* message)
{
	switch (message->what) {
		case kMsgShowPage:
			fPages->Select(message->GetInt32("index", -1));
			break;

		default:
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


BView*
MakePage(BRect frame, const char* name)
{
	BView* page = new BView(frame, name, B_FOLLOW_LEFT_TOP, B_WILL_DRAW);
	page->SetViewColor(ui_color(B_PANEL_BACKGROUND_COLOR));
	return page;
}


void
AddCaption(BView* page, float left, float top, const char* text)
{
	BStringView* caption = new BStringView(BRect(left, top, left + 10, top + 10), nullptr, text);
	caption->SetFont(be_bold_font);
	caption->ResizeToPreferred();
	page->AddChild(caption);
}

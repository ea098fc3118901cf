// SPDX-License-Identifier: MIT
// The dialog for the flags of a window.

#include "props/WindowFlagsWin.h"

#include <cstdio>

#include <OS.h>

#include "app/Dialogs.h"
#include "model/PropertyText.h"
#include "props/DialogParts.h"
#include "props/FlagBoxes.h"
#include "props/FlagSet.h"

static const bigtime_t kPause = 30000; // microseconds, on either side of the printed text


WindowFlagsWin::WindowFlagsWin(const char* value, const TPendingEdit& edit)
	: BWindow(BRect(0, 0, 100, 100), "Window Flags", B_TITLED_WINDOW_LOOK, B_MODAL_APP_WINDOW_FEEL,
		B_NOT_ZOOMABLE | B_NOT_RESIZABLE | B_NOT_MINIMIZABLE),
	  fText(value, TPropertyText::kSize),
	  fEdit(edit)
{
	BView* ground = AddDialogGround(this);
	fBoxes = std::make_unique<TFlagBoxes>(ground, TFlagSet::WindowFlags());
	AddDialogButtons(this, ground, fBoxes->Extent(), WFW_OK, WFW_CANCEL);
}


WindowFlagsWin::~WindowFlagsWin() {}


void
WindowFlagsWin::Show()
{
	fBoxes->SetBits(TFlagSet::WindowFlags().BitsFor(fText.String()));
	CenterWindowOnScreen(this);
	BWindow::Show();
}


void
WindowFlagsWin::MessageReceived(BMessage* message)
{
	switch (message->what) {
		case WFW_OK:
			Apply();
			PostMessage(B_QUIT_REQUESTED);
			break;

		case WFW_CANCEL:
			PostMessage(B_QUIT_REQUESTED);
			break;

		default:
			BWindow::MessageReceived(message);
			break;
	}
}


void
WindowFlagsWin::Apply()
{
	fText = TFlagSet::WindowFlags().TextFor(fBoxes->Bits());
	snooze(kPause);
	printf("%s\n", fText.String());
	snooze(kPause);
	fEdit.Confirm(fText);
}


int32
WFWModalEdit(uint32*, char*, int32)
{
	return 0;
}

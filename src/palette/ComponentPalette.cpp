// SPDX-License-Identifier: MIT

#include "palette/ComponentPalette.h"

#include <Screen.h>
#include <ScrollView.h>

#include "app/WindowFrame.h"
#include "palette/ComponentPaletteView.h"
#include "palette/PaletteCatalog.h"

namespace {

const BRect kFirstFrame(100, 100, 100, 300);
constexpr float kWidth = 115;
constexpr float kHeight = 300;
constexpr float kTop = 120;

} // namespace


ComponentPalette::ComponentPalette()
	: BWindow(kFirstFrame, "Components", B_TITLED_WINDOW, 0),
	  fView(nullptr),
	  fOKToClose(false)
{
	SetFlags(Flags() | B_NOT_ZOOMABLE | B_NOT_H_RESIZABLE | B_WILL_ACCEPT_FIRST_CLICK);
	SetFeel(B_FLOATING_APP_WINDOW_FEEL);

	BRect frame = Bounds();
	frame.right -= B_V_SCROLL_BAR_WIDTH;
	fView = new ComponentPaletteView(frame, "vwComponentPalette");
	AddChild(new BScrollView("svPalette", fView, B_FOLLOW_ALL_SIDES, 0, false, true));

	const BRect screen = BScreen(B_MAIN_SCREEN_ID).Frame();
	const BPoint corner((screen.right - screen.left) / 2 - 50, kTop);
	corner.PrintToStream();
	if (screen.Contains(corner)) {
		MoveTo(corner);
		ResizeTo(kWidth, kHeight);
	}
	RestoreWindowFrame(this, "PaletteFrame");
}


ComponentPalette::~ComponentPalette() = default;


TPaletteEntry*
ComponentPalette::DropEntry() const
{
	return PaletteCatalog().DropEntry();
}


void
ComponentPalette::SetDropEntry(TPaletteEntry* entry)
{
	PaletteCatalog().SetDropEntry(entry);
}


void
ComponentPalette::MessageReceived(BMessage* message)
{
	// Files dropped on the palette are not opened.
	if (message->what == B_SIMPLE_DATA && message->HasRef("refs"))
		return;
	BWindow::MessageReceived(message);
}


bool
ComponentPalette::QuitRequested()
{
	if (!fOKToClose) {
		Hide();
		return false;
	}
	StoreWindowFrame(this, "PaletteFrame");
	return true;
}

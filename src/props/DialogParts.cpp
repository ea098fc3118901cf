// SPDX-License-Identifier: MIT
// What the dialogs of property editors have in common.

#include "props/DialogParts.h"

#include <algorithm>

#include <Button.h>
#include <InterfaceDefs.h>
#include <Message.h>
#include <View.h>
#include <Window.h>

#include "props/EscapeFilter.h"

namespace {

constexpr float kButtonWidth = 70;
constexpr float kButtonHeight = 25;

} // namespace

void
AddDialogButtons(
	BWindow* window, BView* parent, BPoint content, uint32 okCommand, uint32 cancelCommand)
{
	const float width = std::max(content.x, 3 * kDialogSpace + 2 * kButtonWidth);
	const BRect frame(0, 0, kButtonWidth, kButtonHeight);
	BButton* cancel = new BButton(frame, "btnCancel", "Cancel", new BMessage(cancelCommand));
	BButton* ok = new BButton(frame, "btnOK", "OK", new BMessage(okCommand));
	const float top = content.y + kDialogSpace;
	const float okLeft = width - kDialogSpace - kButtonWidth;
	ok->MoveTo(okLeft, top);
	cancel->MoveTo(okLeft - kDialogSpace - kButtonWidth, top);

	window->ResizeTo(width, top + kButtonHeight + kDialogSpace);
	parent->AddChild(cancel);
	parent->AddChild(ok);
	ok->MakeDefault(true);
	window->AddCommonFilter(new TEscapeFilter([cancel] {
		cancel->Invoke();
		return true;
	}));
}


BView*
AddDialogGround(BWindow* window)
{
	BView* ground = new BView(window->Bounds(), "ground", B_FOLLOW_ALL_SIDES, B_WILL_DRAW);
	ground->SetViewUIColor(B_PANEL_BACKGROUND_COLOR);
	ground->SetLowUIColor(B_PANEL_BACKGROUND_COLOR);
	window->AddChild(ground);
	return ground;
}

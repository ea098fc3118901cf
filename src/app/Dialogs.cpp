// SPDX-License-Identifier: MIT

#include "app/Dialogs.h"

#include <cstdio>

#include <Font.h>
#include <InterfaceDefs.h>
#include <Screen.h>
#include <View.h>
#include <Window.h>

namespace {

message_box_hook sHook = nullptr;

} // namespace

int32
MsgBox(const char* title, const char* text, const char* button1, const char* button2,
	const char* button3, button_width width, alert_type type)
{
	if (sHook != nullptr)
		return sHook(title, text, button1);

	BAlert* alert = new BAlert(title, text, button1, button2, button3, width, type);
	alert->SetShortcut(0, B_ESCAPE);
	return alert->Go();
}


int32
YesNoBox(const char* text, alert_type type)
{
	return MsgBox(text, text, "Yes", "No", nullptr, B_WIDTH_AS_USUAL, type);
}


int32
YesNoCancelBox(const char* text, alert_type type)
{
	return MsgBox(text, text, "Yes", "No", "Cancel", B_WIDTH_AS_USUAL, type);
}


int32
OKCancelBox(const char* text, alert_type type)
{
	return MsgBox(text, text, "OK", "Cancel", nullptr, B_WIDTH_AS_USUAL, type);
}


message_box_hook
SetMessageBoxHook(message_box_hook hook)
{
	message_box_hook previous = sHook;
	sHook = hook;
	return previous;
}


void
CenterWindowOnScreen(BWindow* window)
{
	const BRect screen = BScreen(B_MAIN_SCREEN_ID).Frame();
	const BRect bounds = window->Bounds();
	const BPoint corner((screen.right - screen.left) / 2 - (bounds.right - bounds.left) / 2,
		(screen.bottom - screen.top) / 2 - (bounds.bottom - bounds.top) / 2);
	if (screen.Contains(corner))
		window->MoveTo(corner);
}


float
FontHeight(const BView* view, bool leading)
{
	BFont font;
	view->GetFont(&font);
	font_height height;
	font.GetHeight(&height);
	return height.ascent + height.descent + (leading ? height.leading : 0);
}


void
MakeFormFileName(const char* formName, char* fileName)
{
	sprintf(fileName, "%s.frm", formName);
}

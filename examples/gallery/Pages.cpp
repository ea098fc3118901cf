// SPDX-License-Identifier: MIT

#include "Pages.h"

#include <StringView.h>

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

// SPDX-License-Identifier: MIT
// Menu fields and a menu bar inside a page.

#include <MenuBar.h>
#include <MenuField.h>
#include <MenuItem.h>
#include <Message.h>
#include <OptionPopUp.h>
#include <PopUpMenu.h>

#include "GalleryMenus.h"
#include "Pages.h"

namespace {

BPopUpMenu*
MakeSizes(const char* name)
{
	BPopUpMenu* menu = new BPopUpMenu(name);
	for (const char* size : {"Small", "Medium", "Large", "As large as it gets"})
		menu->AddItem(new BMenuItem(size, new BMessage('size')));
	menu->ItemAt(1)->SetMarked(true);
	return menu;
}


void
AddFields(BView* page)
{
	AddCaption(page, 10, 8, "Menu fields");
	BMenuField* fitted =
		new BMenuField(BRect(10, 30, 250, 54), "mfFitted", "Size:", MakeSizes("size"));
	BMenuField* fixed =
		new BMenuField(BRect(10, 62, 250, 86), "mfFixed", "Fixed:", MakeSizes("fixed"), true);
	BMenuField* disabled =
		new BMenuField(BRect(10, 94, 250, 118), "mfDisabled", "Disabled:", MakeSizes("off"));
	disabled->SetEnabled(false);
	BMenu* colours = new BMenu("Colour");
	colours->AddItem(new BMenuItem("Light red", new BMessage('colr')));
	colours->AddItem(new BMenuItem("Light green", new BMessage('colr')));
	BMenuField* plain = new BMenuField(BRect(10, 126, 250, 150), "mfPlain", "Plain:", colours);
	for (BMenuField* field : {fitted, fixed, disabled, plain}) {
		field->SetDivider(70);
		page->AddChild(field);
	}
}

void
AddOptions(BView* page)
{
	AddCaption(page, 10, 168, "Options");
	BOptionPopUp* speed =
		new BOptionPopUp(BRect(10, 190, 250, 214), "opSpeed", "Speed:", new BMessage('opti'));
	BOptionPopUp* fixed =
		new BOptionPopUp(BRect(10, 222, 250, 246), "opFixed", "Fixed:", new BMessage('opti'), true);
	for (BOptionPopUp* options : {speed, fixed}) {
		options->AddOption("Slow", 10);
		options->AddOption("As usual", 50);
		options->AddOption("Fast", 100);
		options->SelectOptionFor(50);
		page->AddChild(options);
	}
	fixed->SetEnabled(false);
}

} // namespace


BView*
MakeMenusPage(BRect frame)
{
	BView* page = MakePage(frame, "Menus");
	AddFields(page);
	AddOptions(page);
	AddCaption(page, 280, 8, "A menu bar of its own");
	BMenuBar* bar =
		new BMenuBar(BRect(280, 30, 500, 50), "mbSample", B_FOLLOW_LEFT_TOP, B_ITEMS_IN_ROW, false);
	bar->AddItem(MakeSampleMenu("Sample"));
	BMenu* disabled = MakeSampleMenu("Disabled");
	disabled->SetEnabled(false);
	bar->AddItem(disabled);
	page->AddChild(bar);
	return page;
}

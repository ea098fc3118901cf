// SPDX-License-Identifier: MIT

#include "GalleryMenus.h"

#include <Alert.h>
#include <Application.h>
#include <MenuBar.h>
#include <MenuItem.h>
#include <Message.h>
#include <Window.h>

#include "Commands.h"

namespace {

BMenu*
MakeFileMenu()
{
	BMenu* menu = new BMenu("File");
	menu->AddItem(new BMenuItem("Open\xe2\x80\xa6", new BMessage(GM_OPEN_FILES), 'O'));
	menu->AddItem(new BMenuItem("Save\xe2\x80\xa6", new BMessage(GM_SAVE_FILE), 'S'));
	menu->AddSeparatorItem();
	BMenuItem* quit = new BMenuItem("Quit", new BMessage(B_QUIT_REQUESTED), 'Q');
	quit->SetTarget(be_app);
	menu->AddItem(quit);
	return menu;
}


/// For the view that has the focus.
BMenu*
MakeEditMenu(BWindow* window)
{
	BMenu* menu = new BMenu("Edit");
	const struct {
		const char* label;
		uint32 command;
		char shortcut;
	} kItems[] = {{"Undo", B_UNDO, 'Z'}, {"Cut", B_CUT, 'X'}, {"Copy", B_COPY, 'C'},
		{"Paste", B_PASTE, 'V'}, {"Select all", B_SELECT_ALL, 'A'}};
	for (const auto& row : kItems) {
		BMenuItem* item = new BMenuItem(row.label, new BMessage(row.command), row.shortcut);
		item->SetTarget(nullptr, window);
		menu->AddItem(item);
	}
	menu->AddItem(new BSeparatorItem, 1);
	return menu;
}


BMenu*
MakePagesMenu()
{
	BMenu* menu = new BMenu("Page");
	const char* const kLabels[] = {"Buttons", "Text", "Sliders", "Status bars", "Colours", "Tabs",
		"Lists", "Menus", "Dialogs"};
	for (const char* label : kLabels) {
		BMessage* message = new BMessage(GM_SHOW_PAGE);
		message->AddInt32("index", menu->CountItems());
		const char shortcut = static_cast<char>('1' + menu->CountItems());
		menu->AddItem(new BMenuItem(label, message, shortcut));
	}
	return menu;
}


BMenu*
MakeAlertsMenu()
{
	BMenu* menu = new BMenu("Alert");
	const struct {
		const char* label;
		alert_type type;
		int32 buttons;
	} kItems[] = {{"Empty", B_EMPTY_ALERT, 1}, {"Info", B_INFO_ALERT, 1}, {"Idea", B_IDEA_ALERT, 2},
		{"Warning", B_WARNING_ALERT, 3}, {"Stop", B_STOP_ALERT, 1}};
	for (const auto& row : kItems) {
		BMessage* message = new BMessage(GM_SHOW_ALERT);
		message->AddInt32("type", row.type);
		message->AddInt32("buttons", row.buttons);
		menu->AddItem(new BMenuItem(row.label, message));
	}
	return menu;
}

} // namespace


BMenuBar*
MakeMenuBar(BWindow* window)
{
	BMenuBar* bar = new BMenuBar(BRect(0, 0, window->Bounds().right, 20), "menuBar");
	bar->AddItem(MakeFileMenu());
	bar->AddItem(MakeEditMenu(window));
	bar->AddItem(MakePagesMenu());
	bar->AddItem(MakeAlertsMenu());
	bar->AddItem(MakeSampleMenu("Sample"));
	return bar;
}


BMenu*
MakeSampleMenu(const char* name)
{
	BMenu* menu = new BMenu(name);
	menu->AddItem(new BMenuItem("A choice", new BMessage('chos')));
	BMenuItem* marked = new BMenuItem("Marked", new BMessage('chos'));
	marked->SetMarked(true);
	menu->AddItem(marked);
	BMenuItem* disabled = new BMenuItem("Disabled", new BMessage('chos'));
	disabled->SetEnabled(false);
	menu->AddItem(disabled);
	menu->AddSeparatorItem();
	menu->AddItem(new BMenuItem("With a shortcut", new BMessage('chos'), 'K'));
	menu->AddItem(new BMenuItem("With more keys", new BMessage('chos'), 'K', B_SHIFT_KEY));

	BMenu* radio = new BMenu("One of several");
	radio->SetRadioMode(true);
	for (const char* label : {"First", "Second", "Third"})
		radio->AddItem(new BMenuItem(label, new BMessage('chos')));
	radio->ItemAt(1)->SetMarked(true);
	menu->AddItem(radio);
	BMenu* closed = new BMenu("Not now");
	closed->AddItem(new BMenuItem("Never seen", nullptr));
	closed->SetEnabled(false);
	menu->AddItem(closed);
	return menu;
}

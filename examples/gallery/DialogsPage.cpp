// SPDX-License-Identifier: MIT
// Alerts, file panels, and what is dropped.

#include <Alert.h>
#include <Button.h>
#include <Message.h>

#include "Commands.h"
#include "DropView.h"
#include "Pages.h"

namespace {

void
AddButton(
	BView* page, float left, float top, const char* name, const char* label, BMessage* message)
{
	page->AddChild(new BButton(BRect(left, top, left + 95, top + 26), name, label, message));
}


BMessage*
MakeAlertMessage(alert_type type, int32 buttons)
{
	BMessage* message = new BMessage(GM_SHOW_ALERT);
	message->AddInt32("type", type);
	message->AddInt32("buttons", buttons);
	return message;
}

} // namespace


BView*
MakeDialogsPage(BRect frame)
{
	BView* page = MakePage(frame, "Dialogs");

	AddCaption(page, 10, 8, "Alerts");
	const struct {
		const char* name;
		const char* label;
		alert_type type;
		int32 buttons;
	} kAlerts[] = {{"btnEmpty", "Empty", B_EMPTY_ALERT, 1}, {"btnInfo", "Info", B_INFO_ALERT, 1},
		{"btnIdea", "Idea", B_IDEA_ALERT, 2}, {"btnWarning", "Warning", B_WARNING_ALERT, 3},
		{"btnStop", "Stop", B_STOP_ALERT, 1}};
	float left = 10;
	for (const auto& row : kAlerts) {
		AddButton(page, left, 32, row.name, row.label, MakeAlertMessage(row.type, row.buttons));
		left += 105;
	}

	AddCaption(page, 10, 76, "File panels");
	AddButton(page, 10, 100, "btnOpen", "Open\xe2\x80\xa6", new BMessage(GM_OPEN_FILES));
	AddButton(page, 115, 100, "btnSave", "Save\xe2\x80\xa6", new BMessage(GM_SAVE_FILE));

	AddCaption(page, 10, 144, "Drag and drop");
	page->AddChild(new DropView(BRect(10, 168, 300, 280), "drop"));
	return page;
}

// SPDX-License-Identifier: MIT
// What a file panel says and asks, without waiting for the answer.

#include "interface/panel/PanelAlerts.h"

#include <Alert.h>
#include <Invoker.h>
#include <Message.h>

namespace BPrivate {

namespace {

const char* const kTitle = "File panel";

/// An alert that owns who it tells, since nobody else lasts as long as it does.
class PanelQuestion : public BAlert {
public:
	PanelQuestion(
		const char* text, const char* button, const BMessage& answer, const BMessenger& target)
		: BAlert(kTitle, text, "Cancel", button, NULL, B_WIDTH_AS_USUAL, B_WARNING_ALERT),
		  fInvoker(new BMessage(answer), target)
	{
		SetShortcut(0, B_ESCAPE);
	}

	void Ask() { Go(&fInvoker); }

private:
	BInvoker fInvoker;
};

} // namespace


BMessenger
ShowPanelNotice(const std::string& text)
{
	BAlert* alert =
		new BAlert(kTitle, text.c_str(), "OK", NULL, NULL, B_WIDTH_AS_USUAL, B_INFO_ALERT);
	alert->SetShortcut(0, B_ESCAPE);
	const BMessenger messenger(alert);
	alert->Go(NULL);
	return messenger;
}


BMessenger
AskInPanel(
	const std::string& text, const char* button, const BMessage& answer, const BMessenger& target)
{
	PanelQuestion* question = new PanelQuestion(text.c_str(), button, answer, target);
	const BMessenger messenger(question);
	question->Ask();
	return messenger;
}

} // namespace BPrivate

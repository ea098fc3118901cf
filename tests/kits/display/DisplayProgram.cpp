// SPDX-License-Identifier: MIT
// A program for the tests of the display's choice and of robot scripts: one window with a few controls.
#include <cstdio>
#include <cstring>

#include <Application.h>
#include <Button.h>
#include <CheckBox.h>
#include <StringView.h>
#include <TextControl.h>
#include <View.h>
#include <Window.h>

#include "display/Display.h"

namespace {

class DemoWindow : public BWindow {
public:
	DemoWindow()
		: BWindow(BRect(100, 100, 399, 299), "Robot demo", B_TITLED_WINDOW, B_QUIT_ON_WINDOW_CLOSE)
	{
		auto back = new BView(Bounds(), "back", B_FOLLOW_ALL, B_WILL_DRAW);
		back->SetViewColor(216, 216, 216);
		AddChild(back);
		back->AddChild(new BButton(BRect(10, 10, 109, 39), "greet", "Greet", new BMessage('gret')));
		back->AddChild(new BCheckBox(BRect(10, 50, 199, 69), "box", "Loud", new BMessage('loud')));
		back->AddChild(
			new BTextControl(BRect(10, 80, 199, 104), "name", "Name:", "", new BMessage('name')));
		fAnswer = new BStringView(BRect(10, 120, 289, 139), "answer", "nothing yet");
		back->AddChild(fAnswer);
	}

	void MessageReceived(BMessage* message) override
	{
		if (message->what == 'gret')
			fAnswer->SetText("Hello");
		else
			BWindow::MessageReceived(message);
	}

private:
	BStringView* fAnswer;
};

} // namespace


int
main(int argc, char** argv)
{
	BApplication application("application/x-vnd.display-program");
	printf("display %s\n", BPrivate::Display::Get().Name());
	bool staysOpen = argc > 1 && strcmp(argv[1], "stay") == 0;
	auto window = new DemoWindow;
	window->Show();
	if (!staysOpen)
		application.PostMessage(B_QUIT_REQUESTED);
	application.Run();
	printf("clean end\n");
	return 0;
}

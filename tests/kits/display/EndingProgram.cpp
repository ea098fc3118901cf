// SPDX-License-Identifier: MIT
// A program that ends while its windows are open and busy drawing.
//
// usage: ending_program return|exit|quit|close
#include <cstdio>
#include <cstdlib>
#include <cstring>
#include <string>

#include <pthread.h>

#include <Application.h>
#include <Button.h>
#include <Font.h>
#include <OS.h>
#include <View.h>
#include <Window.h>

namespace {

const int32 kWindows = 4;
const uint32 kDrawAgain = 'draw';
const uint32 kExit = 'exit';

sem_id sDrawn;


/// Never done with drawing: new texts in new sizes, and curves.
class BusyView : public BView {
public:
	explicit BusyView(BRect frame)
		: BView(frame, "busy", B_FOLLOW_ALL, B_WILL_DRAW)
	{
	}

	void Draw(BRect) override
	{
		fCount++;
		for (int32 line = 0; line < 10; line++) {
			SetFontSize(8 + (fCount * 7 + line * 3) % 40 / 2.0f);
			const std::string text = "Line " + std::to_string(fCount * 10 + line);
			DrawString(text.c_str(), BPoint(5, 15 + line * 14));
			StrokeEllipse(BPoint(150, 80), 5 + line * 3, 10 + fCount % 50);
		}
		if (fCount == 2)
			release_sem(sDrawn);
		Window()->PostMessage(kDrawAgain, this);
	}

	void MessageReceived(BMessage* message) override
	{
		if (message->what == kDrawAgain)
			Invalidate();
		else
			BView::MessageReceived(message);
	}

private:
	int32 fCount = 0;
};


class BusyWindow : public BWindow {
public:
	explicit BusyWindow(int32 index)
		: BWindow(BRect(20 + index * 40, 20 + index * 30, 239 + index * 40, 179 + index * 30),
			"Busy", B_TITLED_WINDOW, 0)
	{
		AddChild(new BusyView(Bounds()));
		AddChild(new BButton(BRect(10, 120, 109, 149), "button", "Button", nullptr));
	}

	void MessageReceived(BMessage* message) override
	{
		if (message->what == kExit)
			exit(0);
		BWindow::MessageReceived(message);
	}
};


/// Threads that end in any way but with the program. Whether the fonts still answer afterwards.
bool
FontsOutlastThreads()
{
	thread_func functions[] = {
		[](void*) -> status_t { return B_OK; },
		[](void*) -> status_t {
			exit_thread(B_OK);
			return B_ERROR;
		},
		[](void*) -> status_t { pthread_exit(nullptr); },
	};
	float size = 33;
	for (thread_func function : functions) {
		const thread_id thread = spawn_thread(function, "short", B_NORMAL_PRIORITY, nullptr);
		status_t result;
		wait_for_thread(thread, &result);
		BFont font(be_plain_font);
		font.SetSize(size++);
		if (font.StringWidth("Wide") <= 0)
			return false;
	}
	return true;
}


/// Asks for a text's width when the program is nearly over.
struct LateObject {
	~LateObject() { BFont().StringWidth("A text that nobody has asked for before"); }
};

} // namespace


int
main(int argc, char** argv)
{
	const std::string way = argc > 1 ? argv[1] : "";
	sDrawn = create_sem(0, "drawn");
	auto application = new BApplication("application/x-vnd.ending-program");
	BWindow* windows[kWindows];
	for (int32 i = 0; i < kWindows; i++) {
		windows[i] = new BusyWindow(i);
		windows[i]->Show();
	}
	static LateObject sLate;
	if (!FontsOutlastThreads())
		return 4;
	if (acquire_sem_etc(sDrawn, kWindows, B_RELATIVE_TIMEOUT, 30000000) != B_OK)
		return 2;

	if (way == "exit") {
		windows[kWindows / 2]->PostMessage(kExit);
		application->Run();
	} else if (way == "quit") {
		application->PostMessage(B_QUIT_REQUESTED);
		application->Run();
		delete application;
	} else if (way == "close") {
		// Threads that end meanwhile.
		for (BWindow* window : windows)
			window->PostMessage(B_QUIT_REQUESTED);
	} else if (way != "return")
		return 3;
	return 0;
}

// SPDX-License-Identifier: MIT
// A window full of buttons, by FLTK; see ButtonWindow.h.

#include <string>

#include <FL/Fl.H>
#include <FL/Fl_Button.H>
#include <FL/Fl_Double_Window.H>
#include <FL/fl_draw.H>
#include <unistd.h>

#include "ButtonWindow.h"

namespace {

class Mark : public Fl_Widget {
public:
	explicit Mark(const ButtonWindow::Frame& frame)
		: Fl_Widget(frame.left, frame.top, frame.width, frame.height)
	{
	}

	void Change() { fPaintings++; }

	void draw() override
	{
		const unsigned color = ButtonWindow::MarkColor(fPaintings);
		fl_color(color >> 16, color >> 8 & 0xff, color & 0xff);
		fl_rectf(x(), y(), w(), h());
	}

private:
	int fPaintings = 0;
};


int sCount;
Fl_Double_Window* sLarge;
Mark* sMark;


void
OpenWindow(const ButtonWindow::Frame& frame, int count)
{
	sLarge = new Fl_Double_Window(frame.left, frame.top, frame.width, frame.height, "Buttons");
	for (int i = 0; i < count; i++) {
		const ButtonWindow::Frame place = ButtonWindow::ButtonAt(i);
		Fl_Button* button = new Fl_Button(place.left, place.top, place.width, place.height);
		button->copy_label(ButtonWindow::LabelOf(i).c_str());
		button->labelsize(ButtonWindow::kFontSize);
	}
	sMark = new Mark(ButtonWindow::MarkIn(frame));
	sLarge->end();
	sLarge->show();
}


void
TakeOrders(FL_SOCKET file, void*)
{
	static std::string input;
	char buffer[256];
	const ssize_t got = read(static_cast<int>(file), buffer, sizeof(buffer));
	if (got <= 0)
		exit(0);
	input.append(buffer, static_cast<size_t>(got));
	for (size_t end = input.find('\n'); end != std::string::npos; end = input.find('\n')) {
		const std::string order = input.substr(0, end);
		input.erase(0, end + 1);
		ButtonWindow::Tell(order.c_str());
		if (order == "open")
			OpenWindow(ButtonWindow::kLarge, sCount);
		else if (order == "repaint") {
			sMark->Change();
			sLarge->redraw();
		}
	}
}

} // namespace


int
main(int argc, char** argv)
{
	sCount = ButtonWindow::CountFrom(argc, argv);
	OpenWindow(ButtonWindow::kSmall, 1);
	Fl::add_fd(STDIN_FILENO, FL_READ, TakeOrders);
	return Fl::run();
}

// SPDX-License-Identifier: MIT
// A window full of buttons, by the kits; see ButtonWindow.h.

#include <iostream>
#include <string>
#include <thread>

#include <Application.h>
#include <Autolock.h>
#include <Button.h>
#include <View.h>
#include <Window.h>

#include "ButtonWindow.h"

namespace {

BRect
RectOf(const ButtonWindow::Frame& frame)
{
	return BRect(frame.left, frame.top, frame.left + frame.width - 1, frame.top + frame.height - 1);
}


class MarkView : public BView {
public:
	explicit MarkView(const ButtonWindow::Frame& window)
		: BView(RectOf(ButtonWindow::MarkIn(window)), "mark", B_FOLLOW_NONE, B_WILL_DRAW),
		  fPaintings(0)
	{
		SetViewColor(B_TRANSPARENT_COLOR);
	}

	void Change() { fPaintings++; }

	void Draw(BRect) override
	{
		const unsigned color = ButtonWindow::MarkColor(fPaintings);
		SetHighColor(color >> 16, color >> 8 & 0xff, color & 0xff);
		FillRect(Bounds());
	}

private:
	int fPaintings;
};


class BenchWindow : public BWindow {
public:
	BenchWindow(const ButtonWindow::Frame& frame, int count)
		: BWindow(RectOf(frame), "Buttons", B_TITLED_WINDOW, 0),
		  fBackground(new BView(Bounds(), "background", B_FOLLOW_ALL, B_WILL_DRAW)),
		  fMark(new MarkView(frame))
	{
		fBackground->SetViewColor(ui_color(B_PANEL_BACKGROUND_COLOR));
		for (int i = 0; i < count; i++) {
			const std::string label = ButtonWindow::LabelOf(i);
			fBackground->AddChild(new BButton(
				RectOf(ButtonWindow::ButtonAt(i)), label.c_str(), label.c_str(), nullptr));
		}
		fBackground->AddChild(fMark);
		AddChild(fBackground);
	}

	void Repaint()
	{
		BAutolock lock(this);
		fMark->Change();
		fBackground->Invalidate();
	}

private:
	BView* fBackground;
	MarkView* fMark;
};


void
TakeOrders(int count)
{
	BenchWindow* window = nullptr;
	std::string order;
	while (std::getline(std::cin, order)) {
		ButtonWindow::Tell(order.c_str());
		if (order == "open") {
			window = new BenchWindow(ButtonWindow::kLarge, count);
			window->Show();
		} else if (order == "repaint" && window != nullptr)
			window->Repaint();
	}
	be_app->PostMessage(B_QUIT_REQUESTED);
}

} // namespace


int
main(int argc, char** argv)
{
	const int count = ButtonWindow::CountFrom(argc, argv);
	BApplication app("application/x-vnd.Plimworks-BenchWindow");
	(new BenchWindow(ButtonWindow::kSmall, 1))->Show();
	std::thread orders(TakeOrders, count);
	app.Run();
	orders.join();
	return 0;
}

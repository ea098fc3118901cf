// SPDX-License-Identifier: MIT
// A window full of buttons, by Qt Widgets; see ButtonWindow.h.

#include <string>

#include <unistd.h>

#include <QApplication>
#include <QPainter>
#include <QPushButton>
#include <QSocketNotifier>
#include <QWidget>

#include "ButtonWindow.h"

namespace {

QRect
RectOf(const ButtonWindow::Frame& frame)
{
	return QRect(frame.left, frame.top, frame.width, frame.height);
}


class Mark : public QWidget {
public:
	explicit Mark(QWidget* parent)
		: QWidget(parent)
	{
	}

	void Change() { fPaintings++; }

protected:
	void paintEvent(QPaintEvent*) override
	{
		QPainter(this).fillRect(rect(), QColor(QRgb(ButtonWindow::MarkColor(fPaintings))));
	}

private:
	int fPaintings = 0;
};


QWidget* sWindow;
Mark* sMark;


void
OpenWindow(const ButtonWindow::Frame& frame, int count)
{
	sWindow = new QWidget;
	sWindow->setWindowTitle("Buttons");
	sWindow->setGeometry(RectOf(frame));
	for (int i = 0; i < count; i++) {
		auto button = new QPushButton(QString::fromStdString(ButtonWindow::LabelOf(i)), sWindow);
		button->setGeometry(RectOf(ButtonWindow::ButtonAt(i)));
	}
	sMark = new Mark(sWindow);
	sMark->setGeometry(RectOf(ButtonWindow::MarkIn(frame)));
	sWindow->show();
}


void
TakeOrders(int count)
{
	static std::string input;
	char buffer[256];
	const ssize_t got = read(STDIN_FILENO, buffer, sizeof(buffer));
	if (got <= 0) {
		QApplication::quit();
		return;
	}
	input.append(buffer, static_cast<size_t>(got));
	for (size_t end = input.find('\n'); end != std::string::npos; end = input.find('\n')) {
		const std::string order = input.substr(0, end);
		input.erase(0, end + 1);
		ButtonWindow::Tell(order.c_str());
		if (order == "open")
			OpenWindow(ButtonWindow::kLarge, count);
		else if (order == "repaint") {
			sMark->Change();
			sWindow->update();
		}
	}
}

} // namespace


int
main(int argc, char** argv)
{
	const int count = ButtonWindow::CountFrom(argc, argv);
	QApplication app(argc, argv);
	QFont font;
	font.setPixelSize(ButtonWindow::kFontSize);
	QApplication::setFont(font);
	OpenWindow(ButtonWindow::kSmall, 1);
	QSocketNotifier notifier(STDIN_FILENO, QSocketNotifier::Read);
	QObject::connect(&notifier, &QSocketNotifier::activated, [count] { TakeOrders(count); });
	return QApplication::exec();
}

// SPDX-License-Identifier: MIT
// The least that a program with a window of Qt Gui is: no widgets, the window's whole picture painted at once. What
// this takes of memory is Qt's own share of what a program of the kits takes. See ButtonWindow.h; COUNT is 0.

#include <QBackingStore>
#include <QGuiApplication>
#include <QPainter>
#include <QSocketNotifier>
#include <QWindow>

#include <unistd.h>

#include "ButtonWindow.h"

namespace {

class BareWindow : public QWindow {
public:
	explicit BareWindow(const ButtonWindow::Frame& frame)
		: fFrame(frame),
		  fStore(this)
	{
		setGeometry(frame.left, frame.top, frame.width, frame.height);
	}

protected:
	void exposeEvent(QExposeEvent*) override
	{
		if (!isExposed())
			return;
		const QRect all(QPoint(0, 0), size());
		fStore.resize(size());
		fStore.beginPaint(all);
		QPainter painter(fStore.paintDevice());
		painter.fillRect(all, Qt::lightGray);
		painter.drawText(QPoint(8, 24), "Button1");
		const ButtonWindow::Frame mark = ButtonWindow::MarkIn(fFrame);
		painter.fillRect(QRect(mark.left, mark.top, mark.width, mark.height),
			QColor(QRgb(ButtonWindow::MarkColor(0))));
		painter.end();
		fStore.endPaint();
		fStore.flush(all);
	}

private:
	const ButtonWindow::Frame fFrame;
	QBackingStore fStore;
};

} // namespace


int
main(int argc, char** argv)
{
	QGuiApplication app(argc, argv);
	BareWindow small(ButtonWindow::kSmall);
	small.show();
	BareWindow large(ButtonWindow::kLarge);
	QSocketNotifier notifier(STDIN_FILENO, QSocketNotifier::Read);
	QObject::connect(&notifier, &QSocketNotifier::activated, [&large] {
		char buffer[256];
		if (read(STDIN_FILENO, buffer, sizeof(buffer)) <= 0) {
			QGuiApplication::quit();
			return;
		}
		ButtonWindow::Tell("open");
		large.show();
	});
	return QGuiApplication::exec();
}

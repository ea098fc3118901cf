// SPDX-License-Identifier: MIT
// Dragging: within the program the input hub does it; the host carries it over other programs.
#include <QCursor>
#include <QDrag>
#include <QGuiApplication>
#include <QMouseEvent>
#include <QPixmap>
#include <QTimer>

#include "display/DragFields.h"
#include "display/PixelBuffer.h"
#include "display/qt/DropData.h"
#include "display/qt/QtCanvas.h"
#include "display/qt/QtDisplay.h"
#include "display/qt/QtWindow.h"

namespace BPrivate {

namespace {

/// Sees the pointer's events before Qt's drag takes them: the hub goes on as without it.
class DragWatcher : public QObject {
public:
	DragWatcher(QtDisplay& display, InputHub& hub)
		: fDisplay(display),
		  fHub(hub),
		  fIsPending(false),
		  fButtons(0)
	{
	}

	bool eventFilter(QObject*, QEvent* event) override
	{
		switch (event->type()) {
			case QEvent::MouseMove:
				// Which window is there Qt's drag finds out only now.
				Note(static_cast<QMouseEvent*>(event));
				if (!fIsPending)
					QCoreApplication::postEvent(this, new QEvent(QEvent::User));
				fIsPending = true;
				break;

			case QEvent::MouseButtonPress:
			case QEvent::MouseButtonRelease:
				Note(static_cast<QMouseEvent*>(event));
				Tell();
				break;

			case QEvent::KeyPress:
				if (static_cast<QKeyEvent*>(event)->key() == Qt::Key_Escape)
					fHub.CancelDrag();
				break;

			default:
				break;
		}
		return false;
	}

	bool event(QEvent* event) override
	{
		if (event->type() != QEvent::User)
			return QObject::event(event);
		if (fIsPending)
			Tell();
		return true;
	}

private:
	void Note(const QMouseEvent* event)
	{
		QPoint place = event->globalPosition().toPoint();
		fPlace.Set(place.x(), place.y());
		fButtons = QtWindow::ButtonsOf(event->buttons());
	}

	void Tell()
	{
		fIsPending = false;
		fHub.PointerAt(fPlace, fButtons, fDisplay.WindowUnderDrag());
	}

	QtDisplay& fDisplay;
	InputHub& fHub;
	bool fIsPending;
	BPoint fPlace;
	uint32 fButtons;
};

} // namespace


void
QtDisplay::BeginDrag(const BMessage& message, BRect rect, const PixelBuffer* image, BPoint offset)
{
	std::shared_ptr<Picture> picture;
	if (image != nullptr && image->bits != nullptr) {
		QtCanvas canvas(fFonts, *image);
		picture = std::make_shared<Picture>(canvas.ReadPicture());
	}
	if (picture != nullptr)
		rect = BRect(0, 0, picture->width - 1, picture->height - 1);

	fThread.Run([&] {
		bool goesOut = CanDragOut();
		fHub.BeginDrag(message, rect, picture, offset);
		if (!goesOut)
			return;
		// The host's drag has an event loop of its own, which must not begin inside of a task.
		QTimer::singleShot(0, QCoreApplication::instance(),
			[this, message = BMessage(message), offset] { DragOut(message, offset); });
	});
}


// Injected input holds no button that the host knows of.
bool
QtDisplay::CanDragOut() const
{
	return !fIsDraggingOut && QGuiApplication::platformName() == QLatin1String("xcb")
		&& QGuiApplication::mouseButtons() != Qt::NoButton;
}


void
QtDisplay::DragOut(const BMessage& message, BPoint offset)
{
	if (!fHub.IsDragging())
		return;

	BMessage carried(message);
	carried.RemoveName(kDragReplyTo);
	carried.RemoveName(kDragOffset);
	carried.AddPoint(kDragOffset, offset);

	// The window that it began in may go at any time, the application stays.
	auto drag = new QDrag(QCoreApplication::instance());
	drag->setMimeData(MakeMimeData(carried));
	// What is dragged the windows show themselves, wherever they are; without a compositor the host's own
	// picture could not be seen through. Beside them the pointer tells.
	QPixmap nothing(1, 1);
	nothing.fill(Qt::transparent);
	drag->setPixmap(nothing);
	drag->setHotSpot(QPoint(0, 0));

	DragWatcher watcher(*this, fHub);
	// Qt installs its own filter first; the later one comes first.
	QTimer::singleShot(
		0, &watcher, [&watcher] { QCoreApplication::instance()->installEventFilter(&watcher); });
	fIsDraggingOut = true;
	drag->exec(Qt::CopyAction);
	fIsDraggingOut = false;
	fWindowUnderDrag = nullptr;

	// Whatever ended it: no button is left held.
	QPoint place = QCursor::pos();
	if (QGuiApplication::mouseButtons() == Qt::NoButton)
		fHub.PointerAt(BPoint(place.x(), place.y()), 0, WindowUnder(place));
	fHub.CancelDrag();
}

} // namespace BPrivate

// SPDX-License-Identifier: MIT
// Dragging: within the program the input hub does it; the host carries it over other programs.
#include <algorithm>

#include <QCursor>
#include <QDrag>
#include <QGuiApplication>
#include <QImage>
#include <QMouseEvent>
#include <QPainter>
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

const double kDraggedOpacity = 0.7;


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


QPixmap
PixmapOf(const Picture* image, BRect rect)
{
	if (image != nullptr) {
		QImage shown(QSize(image->width, image->height), QImage::Format_ARGB32_Premultiplied);
		shown.fill(Qt::transparent);
		QPainter painter(&shown);
		painter.setOpacity(kDraggedOpacity);
		painter.drawImage(QPointF(0, 0),
			QImage(reinterpret_cast<const uchar*>(image->pixels.data()), image->width,
				image->height, image->hasAlpha ? QImage::Format_ARGB32 : QImage::Format_RGB32));
		painter.end();
		return QPixmap::fromImage(shown);
	}

	QPixmap outline(std::max(rect.IntegerWidth() + 1, 1), std::max(rect.IntegerHeight() + 1, 1));
	outline.fill(Qt::transparent);
	QPainter painter(&outline);
	QtWindow::PaintOutline(painter, QRectF(0.5, 0.5, outline.width() - 1, outline.height() - 1));
	painter.end();
	return outline;
}

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
		fHub.BeginDrag(message, rect, picture, offset, goesOut);
		if (!goesOut)
			return;
		// The host's drag has an event loop of its own, which must not begin inside of a task.
		QTimer::singleShot(0, QCoreApplication::instance(),
			[this, message = BMessage(message), rect, picture, offset] {
				DragOut(message, rect, picture, offset);
			});
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
QtDisplay::DragOut(
	const BMessage& message, BRect rect, std::shared_ptr<const Picture> image, BPoint offset)
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
	drag->setPixmap(PixmapOf(image.get(), rect));
	drag->setHotSpot(QPoint(static_cast<int>(offset.x), static_cast<int>(offset.y)));

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

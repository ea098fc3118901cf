// SPDX-License-Identifier: MIT
// The host's screens.
#include <cmath>

#include <QGuiApplication>
#include <QImage>
#include <QPainter>
#include <QPixmap>
#include <QScreen>

#include <AppDefs.h>

#include "display/qt/QtCanvas.h"
#include "display/qt/QtDisplay.h"
#include "display/qt/QtHostWindow.h"
#include "display/qt/QtWindow.h"

namespace BPrivate {

void
QtDisplay::ConnectScreens()
{
	auto application = static_cast<QGuiApplication*>(QCoreApplication::instance());
	auto watch = [this, application](QScreen* screen) {
		QObject::connect(
			screen, &QScreen::geometryChanged, application, [this] { ScreensChanged(); });
	};
	for (QScreen* screen : QGuiApplication::screens())
		watch(screen);
	QObject::connect(
		application, &QGuiApplication::screenAdded, application, [this, watch](QScreen* screen) {
			watch(screen);
			ScreensChanged();
		});
	QObject::connect(
		application, &QGuiApplication::screenRemoved, application, [this] { ScreensChanged(); });
	QObject::connect(application, &QGuiApplication::primaryScreenChanged, application,
		[this] { ScreensChanged(); });
	ReadScreens();
}


void
QtDisplay::ReadScreens()
{
	std::vector<BRect> frames;
	QScreen* primary = QGuiApplication::primaryScreen();
	if (primary != nullptr)
		frames.push_back(QtWindow::RectOf(primary->geometry()));
	for (QScreen* screen : QGuiApplication::screens()) {
		if (screen != primary)
			frames.push_back(QtWindow::RectOf(screen->geometry()));
	}
	// For a moment a host may have none at all: what was there before stays.
	std::lock_guard<std::mutex> lock(fScreensMutex);
	if (!frames.empty())
		fScreens.swap(frames);
	else if (fScreens.empty())
		fScreens.emplace_back(0, 0, 1023, 767);
}


void
QtDisplay::ScreensChanged()
{
	ReadScreens();
	for (QtHostWindow* window : fWindows) {
		QtWindow* host = window->Window();
		if (host == nullptr)
			continue;
		auto message = std::make_unique<BMessage>(B_SCREEN_CHANGED);
		BRect frame = fHub.Frame(host->Stacked());
		message->AddRect("frame", ScreenFrame(ScreenAt(frame)));
		message->AddInt32("mode", B_RGB32);
		fHub.Deliver(host->Stacked(), std::move(message));
		host->CheckScale();
	}
}


int32
QtDisplay::CountScreens()
{
	std::lock_guard<std::mutex> lock(fScreensMutex);
	return static_cast<int32>(fScreens.size());
}


BRect
QtDisplay::ScreenFrame(int32 index)
{
	std::lock_guard<std::mutex> lock(fScreensMutex);
	bool isKnown = index >= 0 && index < static_cast<int32>(fScreens.size());
	return fScreens[isKnown ? index : 0];
}


status_t
QtDisplay::ReadScreen(BRect frame, Picture* picture)
{
	QImage image;
	fThread.Run([&] {
		QScreen* screen = QGuiApplication::primaryScreen();
		if (screen == nullptr)
			return;
		// Qt's screen in memory puts its windows to wrong places where there is a scale.
		const double ratio = screen->devicePixelRatio();
		if (ratio != 1 && QGuiApplication::platformName() == QLatin1String("offscreen")) {
			image = PutScreenTogether(frame, ratio);
			return;
		}
		QPixmap pixmap = screen->grabWindow(0, static_cast<int>(frame.left),
			static_cast<int>(frame.top), frame.IntegerWidth() + 1, frame.IntegerHeight() + 1);
		image = pixmap.toImage().convertToFormat(QImage::Format_RGB32);
	});
	if (image.isNull())
		return B_UNSUPPORTED;

	PixelBuffer buffer{image.bits(), image.width(), image.height(),
		static_cast<int32>(image.bytesPerLine()), false};
	*picture = QtCanvas(fFonts, buffer).ReadPicture();
	return B_OK;
}


/// Display thread. What of \a frame the windows cover, \a ratio device pixels for each pixel; the rest is black.
QImage
QtDisplay::PutScreenTogether(BRect frame, double ratio) const
{
	QImage image(static_cast<int>(std::lround((frame.IntegerWidth() + 1) * ratio)),
		static_cast<int>(std::lround((frame.IntegerHeight() + 1) * ratio)), QImage::Format_RGB32);
	if (image.isNull())
		return image;
	image.fill(Qt::black);
	image.setDevicePixelRatio(ratio);

	QPainter painter(&image);
	for (const StackedWindow* stacked : fHub.ShownWindows()) {
		QtWindow* window = WindowOf(stacked);
		if (window == nullptr || !window->isVisible())
			continue;
		const BPoint place = fHub.Frame(stacked).LeftTop() - frame.LeftTop();
		painter.save();
		// To whole device pixels, or the picture would be blurred.
		painter.translate(std::round(place.x * ratio) / ratio, std::round(place.y * ratio) / ratio);
		painter.setClipRect(QRect(QPoint(0, 0), window->size()));
		window->PaintPicture(painter);
		painter.restore();
	}
	painter.end();
	image.setDevicePixelRatio(1);
	return image;
}

} // namespace BPrivate

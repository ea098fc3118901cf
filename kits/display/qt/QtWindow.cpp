// SPDX-License-Identifier: MIT
// The host's window: shows the finished picture and hands events to the input hub. Display thread only.
#include "display/qt/QtWindow.h"

#include <algorithm>
#include <cmath>
#include <optional>

#include <QBackingStore>
#include <QGuiApplication>
#include <QKeyEvent>
#include <QMouseEvent>
#include <QPainter>
#include <QScreen>
#include <QWheelEvent>

#include <AppDefs.h>
#include <View.h>
#include <Window.h>

#include "display/InputHub.h"
#include "display/qt/DropData.h"
#include "display/qt/HostEcho.h"
#include "display/qt/KeyTranslation.h"
#include "display/qt/QtDisplay.h"
#include "display/qt/Surface.h"

namespace BPrivate {

namespace {

// Where the window's thread has not drawn yet, as after a resize: the colour of panels.
const QColor kUndrawnColor(216, 216, 216);
const int kWheelStep = 120;
const int kLargestSize = 32767;
// Milliseconds.
const int kZoomDelay = 100;
// Without a change for so long a window gives memory back.
const int kRestDelay = 1000;


BPoint
PointOf(QPointF point)
{
	return BPoint(std::floor(point.x()), std::floor(point.y()));
}


Qt::WindowFlags
FlagsOf(const HostWindowStyle& style)
{
	if (style.isMenu)
		return Qt::ToolTip | Qt::FramelessWindowHint | Qt::WindowDoesNotAcceptFocus;

	StackedWindow stacked;
	stacked.style = style;
	// Only dialogs tell the window manager whose they are, and so stay above it.
	Qt::WindowFlags flags = stacked.IsModal() ? Qt::Dialog : Qt::Window;
	switch (style.look) {
		case B_BORDERED_WINDOW_LOOK:
		case B_NO_BORDER_WINDOW_LOOK:
			flags |= Qt::FramelessWindowHint;
			break;
		case B_FLOATING_WINDOW_LOOK:
			flags = Qt::Tool;
			break;
		case B_MODAL_WINDOW_LOOK:
			flags = Qt::Dialog;
			break;
		default:
			break;
	}
	flags |= Qt::CustomizeWindowHint | Qt::WindowTitleHint | Qt::WindowSystemMenuHint;
	if ((style.flags & B_NOT_CLOSABLE) == 0)
		flags |= Qt::WindowCloseButtonHint;
	if ((style.flags & B_NOT_ZOOMABLE) == 0)
		flags |= Qt::WindowMaximizeButtonHint;
	if ((style.flags & B_NOT_MINIMIZABLE) == 0)
		flags |= Qt::WindowMinimizeButtonHint;
	if ((style.flags & B_AVOID_FOCUS) != 0)
		flags |= Qt::WindowDoesNotAcceptFocus;

	if (stacked.IsFloating() || style.feel == B_MODAL_ALL_WINDOW_FEEL)
		flags |= Qt::WindowStaysOnTopHint;
	return flags;
}


bool
Covers(const QImage& image, QSize size)
{
	const QSizeF covered = image.isNull() ? QSizeF() : image.deviceIndependentSize();
	return covered.width() >= size.width() && covered.height() >= size.height();
}


void
PaintOutline(QPainter& painter, const QRectF& rect)
{
	// Black and white by turns, to be seen on everything; as wide on all sides as the views' own lines.
	const double width = std::max(std::floor(painter.device()->devicePixelRatio()), 1.0);
	QPen light(Qt::white, width);
	light.setCosmetic(true);
	QPen dark(Qt::black, width, Qt::CustomDashLine);
	dark.setDashPattern({3, 3});
	dark.setCosmetic(true);
	for (const QPen& pen : {light, dark}) {
		painter.setPen(pen);
		painter.drawRect(rect);
	}
}


void
PaintOverlay(QPainter& painter, const InputOverlay& overlay, BPoint leftTop)
{
	painter.translate(-leftTop.x, -leftTop.y);
	bool showsImage = overlay.image != nullptr;
	if (showsImage) {
		const Picture& picture = *overlay.image;
		QImage image(reinterpret_cast<const uchar*>(picture.pixels.data()), picture.width,
			picture.height, picture.hasAlpha ? QImage::Format_ARGB32 : QImage::Format_RGB32);
		painter.setOpacity(0.7);
		painter.drawImage(QPointF(overlay.dragged.left, overlay.dragged.top), image);
		painter.setOpacity(1);
	}
	for (const BRect& rect : {overlay.tracking, showsImage ? BRect() : overlay.dragged}) {
		if (!rect.IsValid())
			continue;
		PaintOutline(painter, QRectF(rect.left + 0.5, rect.top + 0.5, rect.Width(), rect.Height()));
	}
}

} // namespace


QtWindow::QtWindow(QtDisplay& display, std::shared_ptr<Surface> surface, StackedWindow* stacked)
	: scale(1),
	  fDisplay(display),
	  fSurface(std::move(surface)),
	  fStacked(stacked),
	  fIsMinimized(false),
	  fIsZoomed(false),
	  fIsAway(false),
	  fFrame(stacked->frame)
{
	setSurfaceType(QSurface::RasterSurface);
	Apply(stacked->style);
	setGeometry(GeometryOf(stacked->frame));
	scale = static_cast<float>(devicePixelRatio());
	fRestTimer.setSingleShot(true);
	QObject::connect(&fRestTimer, &QTimer::timeout, this, [this] { Rest(); });
}


QtWindow::~QtWindow() = default;


BRect
QtWindow::RectOf(const QRect& geometry)
{
	return BRect(geometry.left(), geometry.top(), geometry.right(), geometry.bottom());
}


QRect
QtWindow::GeometryOf(BRect frame)
{
	return QRect(static_cast<int>(frame.left), static_cast<int>(frame.top),
		std::max(frame.IntegerWidth() + 1, 1), std::max(frame.IntegerHeight() + 1, 1));
}


uint32
QtWindow::ButtonsOf(Qt::MouseButtons pressed)
{
	uint32 buttons = 0;
	if ((pressed & Qt::LeftButton) != 0)
		buttons |= B_PRIMARY_MOUSE_BUTTON;
	if ((pressed & Qt::RightButton) != 0)
		buttons |= B_SECONDARY_MOUSE_BUTTON;
	if ((pressed & Qt::MiddleButton) != 0)
		buttons |= B_TERTIARY_MOUSE_BUTTON;
	if ((pressed & Qt::BackButton) != 0)
		buttons |= B_MOUSE_BUTTON(4);
	if ((pressed & Qt::ForwardButton) != 0)
		buttons |= B_MOUSE_BUTTON(5);
	return buttons;
}


// #pragma mark - what the program wants


void
QtWindow::Apply(const HostWindowStyle& style)
{
	fStyle = style;
	Qt::WindowFlags flags = FlagsOf(style);
	if (flags != this->flags()) {
		bool wasVisible = isVisible();
		setFlags(flags);
		if (wasVisible)
			setVisible(true);
	}
	ApplyLimits();
}


void
QtWindow::SetLimits(const HostSizeLimits& limits)
{
	fLimits = limits;
	ApplyLimits();
}


void
QtWindow::ApplyLimits()
{
	auto pixels = [](float size) {
		return std::clamp(static_cast<int>(std::min(size, 32768.0f)) + 1, 1, kLargestSize);
	};
	QSize least(pixels(fLimits.minWidth), pixels(fLimits.minHeight));
	QSize most(pixels(fLimits.maxWidth), pixels(fLimits.maxHeight));
	// A window manager knows no flag for this: limits that leave no choice do the same.
	bool fixedWidth = (fStyle.flags & (B_NOT_RESIZABLE | B_NOT_H_RESIZABLE)) != 0;
	bool fixedHeight = (fStyle.flags & (B_NOT_RESIZABLE | B_NOT_V_RESIZABLE)) != 0;
	BRect frame = fDisplay.Hub().Frame(fStacked);
	QSize size(frame.IntegerWidth() + 1, frame.IntegerHeight() + 1);
	if (fixedWidth) {
		least.setWidth(size.width());
		most.setWidth(size.width());
	}
	if (fixedHeight) {
		least.setHeight(size.height());
		most.setHeight(size.height());
	}
	setMinimumSize(least);
	setMaximumSize(most.expandedTo(least));
}


void
QtWindow::MoveTo(BPoint leftTop)
{
	fFrame.MoveTo(leftTop);
	fDisplay.Hub().SetFrame(fStacked, fFrame.Known());
	AskHost();
}


void
QtWindow::ResizeTo(BSize size)
{
	fFrame.ResizeTo(size);
	fDisplay.Hub().SetFrame(fStacked, fFrame.Known());
	ApplyLimits();
	AskHost();
}


// One request at a time, see SharedFrame.
void
QtWindow::AskHost()
{
	if (fFrame.IsAsking())
		return;
	setGeometry(GeometryOf(fFrame.Known()));
	// A host has nothing to say before there is a window.
	if (handle() == nullptr || fDisplay.Echo() == nullptr)
		return;
	fFrame.BeginAsking();
	fDisplay.Echo()->WhenAnswered(this, [this] { HostAnswered(); });
}


void
QtWindow::HostAnswered()
{
	const BRect before = fFrame.Known();
	const bool asksAgain =
		fFrame.EndAsking(isVisible() ? std::optional<BRect>(RectOf(geometry())) : std::nullopt);
	TellFrame(fDisplay.Hub(), fStacked, fFrame, before);
	if (asksAgain)
		AskHost();
}


void
QtWindow::ShowWindow()
{
	StackedWindow kind;
	kind.style = fStyle;
	if (fStyle.isMenu || kind.IsModal() || kind.IsFloating()) {
		QWindow* parent = fDisplay.WindowForTransients(this);
		if (parent != nullptr)
			setTransientParent(parent);
	}
	if ((fStyle.flags & B_AVOID_FRONT) == 0)
		raise();
	setVisible(true);
	CheckScale();
	// What the host told of a hidden window was not heard, and it may have nothing new to tell.
	if (fDisplay.Echo() != nullptr)
		fDisplay.Echo()->WhenAnswered(this, [this] { GeometryChanged(); });
}


void
QtWindow::HideWhileInactive()
{
	StackedWindow kind;
	kind.style = fStyle;
	if (fStyle.feel == B_FLOATING_ALL_WINDOW_FEEL || !kind.IsFloating() || !isVisible())
		return;
	fIsAway = true;
	setVisible(false);
}


void
QtWindow::ShowAgain()
{
	if (!fIsAway)
		return;
	fIsAway = false;
	// Minimized along with its parent it would come back so, and take the parent with it again.
	if ((windowStates() & Qt::WindowMinimized) != 0)
		setWindowStates(windowStates() & ~Qt::WindowMinimized);
	// A window manager gives the focus to what appears, but it is the window that the user went to that has it.
	setProperty("_q_showWithoutActivating", true);
	setVisible(true);
	setProperty("_q_showWithoutActivating", QVariant());
}


void
QtWindow::HideWindow()
{
	fIsAway = false;
	setVisible(false);
}


void
QtWindow::Minimize(bool minimized)
{
	// Set first: the host's answer is no news then.
	fIsMinimized = minimized;
	Qt::WindowStates states = windowStates();
	states.setFlag(Qt::WindowMinimized, minimized);
	setWindowStates(states);
}


void
QtWindow::MinimizeByUser(bool minimized)
{
	Qt::WindowStates states = windowStates();
	states.setFlag(Qt::WindowMinimized, minimized);
	setWindowStates(states);
}


void
QtWindow::ZoomByUser()
{
	if ((fStyle.flags & B_NOT_ZOOMABLE) != 0)
		return;
	Qt::WindowStates states = windowStates();
	states.setFlag(Qt::WindowMaximized, (states & Qt::WindowMaximized) == 0);
	setWindowStates(states);
}


BRect
QtWindow::FrameWithBorder() const
{
	return RectOf(GeometryOf(fFrame.Known()).marginsAdded(frameMargins()));
}


// #pragma mark - showing


void
QtWindow::ShowDamage()
{
	QRegion damage = fSurface->TakeDamage();
	PlanRest();
	if (!damage.isEmpty() && isExposed())
		Paint(damage);
}


void
QtWindow::Paint(const QRegion& wanted)
{
	QRect all(QPoint(0, 0), size());
	QRegion region = wanted & all;
	if (region.isEmpty())
		return;
	PlanRest();
	if (LetServerShow(region))
		return;
	// After a rest the host still has the other parts; for the first picture it has asked for all of them.
	if (fBackingStore == nullptr) {
		fBackingStore = std::make_unique<QBackingStore>(this);
		fBackingStore->resize(size());
	} else if (fBackingStore->size() != size()) {
		fBackingStore->resize(size());
		region = all;
	}

	fBackingStore->beginPaint(region);
	QPaintDevice* device = fBackingStore->paintDevice();
	if (device != nullptr) {
		QPainter painter(device);
		painter.setClipRegion(region);
		PaintPicture(painter);
	}
	fBackingStore->endPaint();
	fBackingStore->flush(region);
	fPaintedSize = size();
}


// Not what only Qt does: a new size, after which it answers the window manager, and what follows the pointer.
bool
QtWindow::LetServerShow(const QRegion& region)
{
	if (fPaintedSize != size() || !fDisplay.Hub().Overlay().IsEmpty())
		return false;
	bool isShown = false;
	fSurface->Paint([&](const QImage& image, const std::shared_ptr<WindowPixels>& pixels) {
		const qreal ratio = devicePixelRatio();
		if (image.devicePixelRatio() != ratio || !Covers(image, size()))
			return;
		QRegion device;
		for (const QRect& rect : region) {
			device += QRectF(rect.x() * ratio, rect.y() * ratio, rect.width() * ratio,
						  rect.height() * ratio)
						  .toAlignedRect()
				& image.rect();
		}
		isShown = fServerPixels.Show(pixels, image.size(), device, static_cast<uint32>(winId()));
	});
	return isShown;
}


void
QtWindow::PaintPicture(QPainter& painter)
{
	fSurface->Paint([&](const QImage& image, const std::shared_ptr<WindowPixels>&) {
		if (!Covers(image, size()))
			painter.fillRect(QRect(QPoint(0, 0), size()), kUndrawnColor);
		if (!image.isNull())
			painter.drawImage(QPointF(0, 0), image);
	});
	PaintOverlay(painter, fDisplay.Hub().Overlay(), fDisplay.Hub().Frame(fStacked).LeftTop());
}


// Not a timer started anew for every change: that would cost more than the change.
void
QtWindow::PlanRest()
{
	fLastChange.start();
	if (!fRestTimer.isActive())
		fRestTimer.start(kRestDelay);
}


void
QtWindow::Rest()
{
	const qint64 left = kRestDelay - fLastChange.elapsed();
	if (left > 0) {
		fRestTimer.start(static_cast<int>(left));
		return;
	}
	fSurface->Rest();
	// An X server has its own picture of the window by now, and takes any part of it anew; others show this one.
	if (QGuiApplication::platformName() == QLatin1String("xcb"))
		fBackingStore.reset();
}


void
QtWindow::CheckScale()
{
	float now = static_cast<float>(devicePixelRatio());
	if (now == scale)
		return;
	scale = now;
	fDisplay.Hub().NeedsRedraw(fStacked);
}


// #pragma mark - what the host tells


void
QtWindow::exposeEvent(QExposeEvent*)
{
	CheckScale();
	if (!isExposed())
		return;
	fSurface->TakeDamage();
	Paint(QRect(QPoint(0, 0), size()));
}


void
QtWindow::resizeEvent(QResizeEvent*)
{
	GeometryChanged();
}


void
QtWindow::moveEvent(QMoveEvent*)
{
	GeometryChanged();
}


void
QtWindow::GeometryChanged()
{
	CheckScale();
	if (!isVisible())
		return;
	const BRect before = fFrame.Known();
	fFrame.HostHas(RectOf(geometry()));
	TellFrame(fDisplay.Hub(), fStacked, fFrame, before);
}


bool
QtWindow::event(QEvent* event)
{
	InputHub& hub = fDisplay.Hub();
	switch (event->type()) {
		case QEvent::Close:
			// The program decides.
			event->ignore();
			hub.RequestClose(fStacked);
			return true;

		case QEvent::MouseButtonPress:
		case QEvent::MouseButtonDblClick:
		case QEvent::MouseButtonRelease:
		case QEvent::MouseMove:
			HandleMouse(static_cast<QMouseEvent*>(event));
			return true;

		case QEvent::Wheel:
			HandleWheel(static_cast<QWheelEvent*>(event));
			return true;

		case QEvent::Leave:
			hub.PointerLeft();
			return true;

		case QEvent::KeyPress:
		case QEvent::KeyRelease:
			fDisplay.HandleKey(*static_cast<QKeyEvent*>(event));
			return true;

		case QEvent::DragEnter:
		case QEvent::DragMove:
			HandleDragOver(static_cast<QDragMoveEvent*>(event));
			return true;

		case QEvent::DragLeave:
			if (fDisplay.IsDraggingOut())
				fDisplay.SetWindowUnderDrag(nullptr);
			else
				hub.VisitorLeft();
			return true;

		case QEvent::Drop:
			HandleDrop(static_cast<QDropEvent*>(event));
			return true;

		case QEvent::FocusIn:
		case QEvent::FocusOut:
			// The display hears of it elsewhere. Qt would only tell screen readers, of a window without any of its
			// own widgets, and connect to the session bus for it.
			return true;

		case QEvent::WindowStateChange:
			HandleState();
			return QWindow::event(event);

		default:
			return QWindow::event(event);
	}
}


void
QtWindow::HandleMouse(QMouseEvent* event)
{
	InputHub& hub = fDisplay.Hub();
	BPoint where = hub.Frame(fStacked).LeftTop() + PointOf(event->position());
	uint32 buttons = ButtonsOf(event->buttons());
	BPoint before;
	uint32 held;
	hub.GetPointer(&before, &held);
	// Qt repeats the release of a drag, at a place of its own.
	if (event->type() == QEvent::MouseButtonRelease && held == 0)
		return;
	fDisplay.PointerMoved();
	hub.SetModifiers(fDisplay.ModifiersNow(event->modifiers()));
	std::optional<bigtime_t> when;
	if (event->timestamp() != 0)
		when = static_cast<bigtime_t>(event->timestamp()) * 1000;
	// Without a button it is surely over this window; with one, the host sends it here all the same.
	if (held == 0)
		hub.PointerAt(where, buttons, fStacked, when);
	else
		hub.PointerAt(
			where, buttons, fDisplay.WindowUnder(event->globalPosition().toPoint()), when);
}


// What this program drags itself the hub follows already. Of other programs nothing is moved away: a copy.
void
QtWindow::HandleDragOver(QDragMoveEvent* event)
{
	event->setDropAction(Qt::CopyAction);
	if (fDisplay.IsDraggingOut()) {
		fDisplay.SetWindowUnderDrag(fStacked);
		event->accept();
		return;
	}
	if (!IsUsableDrop(*event->mimeData())) {
		event->ignore();
		return;
	}
	InputHub& hub = fDisplay.Hub();
	std::unique_ptr<BMessage> message;
	if (event->type() == QEvent::DragEnter)
		message = MakeDropMessage(*event->mimeData());
	BPoint where = hub.Frame(fStacked).LeftTop() + PointOf(event->position());
	event->setAccepted(hub.VisitorAt(fStacked, std::move(message), where));
}


void
QtWindow::HandleDrop(QDropEvent* event)
{
	event->setDropAction(Qt::CopyAction);
	event->accept();
	if (fDisplay.IsDraggingOut())
		return;
	InputHub& hub = fDisplay.Hub();
	BPoint where = hub.Frame(fStacked).LeftTop() + PointOf(event->position());
	hub.Drop(MakeDropMessage(*event->mimeData()), where, fStacked);
}


void
QtWindow::HandleWheel(QWheelEvent* event)
{
	QPoint turned = event->angleDelta();
	fDisplay.Hub().SetModifiers(fDisplay.ModifiersNow(event->modifiers()));
	fDisplay.Hub().Wheel(-static_cast<float>(turned.x()) / kWheelStep,
		-static_cast<float>(turned.y()) / kWheelStep, fStacked);
}


void
QtWindow::HandleState()
{
	bool zoomed = (windowStates() & Qt::WindowMaximized) != 0;
	if (zoomed != fIsZoomed) {
		fIsZoomed = zoomed;
		// The host tells of the new frame before or after the state, in one step or two.
		const auto tell = [this] {
			GeometryChanged();
			fDisplay.Hub().Deliver(fStacked, std::make_unique<BMessage>(B_ZOOM));
		};
		if (fDisplay.Echo() != nullptr)
			fDisplay.Echo()->WhenAnswered(this, tell);
		else
			QTimer::singleShot(kZoomDelay, this, tell);
	}

	bool minimized = (windowStates() & Qt::WindowMinimized) != 0;
	if (minimized == fIsMinimized)
		return;
	fIsMinimized = minimized;
	fDisplay.Hub().SetMinimized(fStacked, minimized);
	auto message = std::make_unique<BMessage>(B_MINIMIZE);
	message->AddBool("minimize", minimized);
	fDisplay.Hub().Deliver(fStacked, std::move(message));
}

} // namespace BPrivate

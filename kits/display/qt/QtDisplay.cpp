// SPDX-License-Identifier: MIT
// The display on Qt: its thread, windows, input state, pictures and the clipboard.
#include "display/qt/QtDisplay.h"

#include <algorithm>
#include <cstdio>

#include <unistd.h>

#include <QBuffer>
#include <QClipboard>
#include <QDrag>
#include <QGuiApplication>
#include <QImage>
#include <QImageReader>
#include <QKeyEvent>
#include <QMimeData>
#include <QTimer>

#include <Application.h>
#include <Window.h>

#include "display/qt/CursorShapes.h"
#include "display/qt/DropData.h"
#include "display/qt/HostEcho.h"
#include "display/qt/KeyTranslation.h"
#include "display/qt/QtCanvas.h"
#include "display/qt/QtHostWindow.h"
#include "display/qt/QtUse.h"
#include "display/qt/QtWindow.h"

namespace BPrivate {

namespace {

// The focus goes from window to window by way of none: only when it stays away is the program inactive.
const int kDeactivationDelay = 200;


Picture
PictureOf(const QImage& image)
{
	bool hasAlpha = image.hasAlphaChannel();
	QImage converted =
		image.convertToFormat(hasAlpha ? QImage::Format_ARGB32 : QImage::Format_RGB32);
	Picture picture{converted.width(), converted.height(), hasAlpha, {}};
	picture.pixels.reserve(static_cast<size_t>(picture.width) * picture.height);
	for (int y = 0; y < picture.height; y++) {
		auto row = reinterpret_cast<const uint32*>(converted.constScanLine(y));
		picture.pixels.insert(picture.pixels.end(), row, row + picture.width);
	}
	return picture;
}

} // namespace


QtDisplay::QtDisplay(bool managesFocus)
	: fManagesFocus(managesFocus),
	  fHub(managesFocus),
	  fApplicationCursor(std::make_shared<CursorShape>()),
	  fCursorHidden(false),
	  fCursorObscured(false),
	  fLastRepeatKey(0),
	  fRepeats(0),
	  fIsActive(true),
	  fToldActive(false),
	  fIsDraggingOut(false),
	  fWindowUnderDrag(nullptr),
	  fOverlayIsPending(false),
	  fIsLost(false)
{
}


// Never called for one that has started.
QtDisplay::~QtDisplay() = default;


bool
QtDisplay::Start(const std::string& platforms)
{
	return fThread.Start(platforms, [this] { Connect(); });
}


void
QtDisplay::Connect()
{
	ConnectScreens();
	if (QGuiApplication::platformName() == QLatin1String("xcb"))
		fEcho = std::make_unique<HostEcho>();
	auto application = static_cast<QGuiApplication*>(QCoreApplication::instance());
	QObject::connect(application, &QGuiApplication::focusWindowChanged, application,
		[this](QWindow* window) { FocusChanged(window); });
	QObject::connect(application, &QGuiApplication::applicationStateChanged, application,
		[this](Qt::ApplicationState state) {
			ApplicationStateChanged(state == Qt::ApplicationActive);
		});
	QClipboard* clipboard = QGuiApplication::clipboard();
	QObject::connect(clipboard, &QClipboard::dataChanged, clipboard, [clipboard] {
		if (!clipboard->ownsClipboard())
			ClipboardChangedElsewhere();
	});
	fHub.SetOverlayListener([this] { OverlayChanged(); });
	fHub.SetRaiseListener([this](StackedWindow* stacked) {
		fThread.Post([this, stacked] {
			for (QtHostWindow* window : fWindows) {
				if (window->Window() != nullptr && window->Window()->Stacked() == stacked)
					window->Activate();
			}
		});
	});
}


void
QtDisplay::Stop()
{
	// The program cannot say any more that it failed: its threads may be in the middle of anything.
	if (fIsLost) {
		fflush(nullptr);
		_exit(1);
	}
	fThread.Stop([this] {
		// A window must not go under its own drag.
		if (fIsDraggingOut)
			QDrag::cancel();
		for (QtHostWindow* window : fWindows)
			window->Detach();
	});
	QtUse::EndAll();
}


void
QtDisplay::Lost()
{
	fIsLost = true;
	fThread.Abandon([] {
		fprintf(stderr, "libbe: the connection to the display is broken; the program quits\n");
		if (be_app != nullptr)
			be_app->PostMessage(B_QUIT_REQUESTED);
	});
}


const char*
QtDisplay::Name() const
{
	return "qt";
}


bool
QtDisplay::DrawsPixels() const
{
	return true;
}


FontEngine&
QtDisplay::Fonts()
{
	return fFonts;
}


// #pragma mark - windows


std::unique_ptr<HostWindow>
QtDisplay::MakeWindow(
	BRect frame, const char* title, const HostWindowStyle& style, HostWindowClient* client)
{
	auto window = std::make_unique<QtHostWindow>(*this, frame, title, style, client);
	return window->IsThere() ? std::move(window) : nullptr;
}


std::unique_ptr<Canvas>
QtDisplay::MakeCanvas(int32 width, int32 height, float scale)
{
	return std::make_unique<QtCanvas>(fFonts, width, height, scale);
}


std::unique_ptr<Canvas>
QtDisplay::MakeCanvas(const PixelBuffer& buffer)
{
	return std::make_unique<QtCanvas>(fFonts, buffer);
}


void
QtDisplay::Add(QtHostWindow* window)
{
	fWindows.push_back(window);
	UpdateCursor(*window->Window());
}


void
QtDisplay::Remove(QtHostWindow* window)
{
	std::erase(fWindows, window);
	if (window->Window() != nullptr && window->Window()->Stacked() == fWindowUnderDrag)
		fWindowUnderDrag = nullptr;
}


bool
QtDisplay::Has(const QtHostWindow* window) const
{
	return std::find(fWindows.begin(), fWindows.end(), window) != fWindows.end();
}


QtWindow*
QtDisplay::WindowOf(const StackedWindow* stacked) const
{
	for (QtHostWindow* window : fWindows) {
		if (window->Window() != nullptr && window->Window()->Stacked() == stacked)
			return window->Window();
	}
	return nullptr;
}


std::optional<StackedWindow*>
QtDisplay::WindowUnder(QPoint globalPosition) const
{
	if (fManagesFocus || QGuiApplication::platformName() != QLatin1String("xcb"))
		return std::nullopt;
	auto window = dynamic_cast<QtWindow*>(QGuiApplication::topLevelAt(globalPosition));
	return window != nullptr ? window->Stacked() : nullptr;
}


QWindow*
QtDisplay::WindowForTransients(const QtWindow* window) const
{
	auto focus = dynamic_cast<QtWindow*>(QGuiApplication::focusWindow());
	bool hasFocus = focus != nullptr && focus != window;
	// A modal window belongs above the floating ones, which window managers keep above the others.
	if (window->Stacked()->IsModal() && !(hasFocus && focus->Stacked()->IsModal())) {
		QtWindow* floating = FloatingWindow();
		if (floating != nullptr)
			return floating;
	}
	if (hasFocus)
		return focus;
	for (auto other = fWindows.rbegin(); other != fWindows.rend(); ++other) {
		QtWindow* candidate = (*other)->Window();
		if (candidate != nullptr && candidate != window && candidate->isVisible()
			&& candidate->type() == Qt::Window)
			return candidate;
	}
	return nullptr;
}


/// The youngest floating window that is shown, or none.
QtWindow*
QtDisplay::FloatingWindow() const
{
	for (auto other = fWindows.rbegin(); other != fWindows.rend(); ++other) {
		QtWindow* candidate = (*other)->Window();
		if (candidate != nullptr && candidate->isVisible() && candidate->Stacked()->IsFloating())
			return candidate;
	}
	return nullptr;
}


void
QtDisplay::FocusChanged(QWindow* focus)
{
	if (fManagesFocus)
		return;
	auto window = dynamic_cast<QtWindow*>(focus);
	if (window != nullptr)
		fHub.Raise(window->Stacked());
	fHub.SetActive(window != nullptr ? window->Stacked() : nullptr);
}


void
QtDisplay::ApplicationStateChanged(bool active)
{
	if (fManagesFocus)
		return;
	if (!active) {
		QTimer::singleShot(kDeactivationDelay, QCoreApplication::instance(), [this] {
			if (fIsActive && QGuiApplication::applicationState() != Qt::ApplicationActive)
				HideFloatingWindows();
		});
		return;
	}
	TellActive(true);
	if (fIsActive)
		return;
	fIsActive = true;
	for (QtHostWindow* window : fWindows) {
		if (window->Window() != nullptr)
			window->Window()->ShowAgain();
	}
}


void
QtDisplay::HideFloatingWindows()
{
	fIsActive = false;
	for (QtHostWindow* window : fWindows) {
		if (window->Window() != nullptr)
			window->Window()->HideWhileInactive();
	}
	TellActive(false);
}


// A program is not active before its first window is, but its floating windows are shown from the beginning.
void
QtDisplay::TellActive(bool active)
{
	if (fToldActive == active)
		return;
	fToldActive = active;
	BMessage activated(B_APP_ACTIVATED);
	activated.AddBool("active", active);
	if (be_app != nullptr)
		be_app->PostMessage(&activated);
}


// #pragma mark - input


void
QtDisplay::GetPointer(BPoint* screenWhere, uint32* buttons)
{
	fHub.GetPointer(screenWhere, buttons);
}


void
QtDisplay::GetKeys(key_info* info)
{
	fHub.GetKeys(info);
}


bigtime_t
QtDisplay::IdleTime()
{
	return fHub.IdleTime();
}


uint32
QtDisplay::ModifiersNow(int qtModifiers)
{
	key_info keys;
	fHub.GetKeys(&keys);
	uint32 now = ModifiersOf(qtModifiers, keys.modifiers);
	// Qt knows no sides: what is held on the right stays there.
	const uint32 kGeneral = B_SHIFT_KEY | B_COMMAND_KEY | B_CONTROL_KEY | B_OPTION_KEY;
	return (now & kGeneral) == (keys.modifiers & kGeneral) ? keys.modifiers : now;
}


void
QtDisplay::HandleKey(const QKeyEvent& event)
{
	key_info keys;
	fHub.GetKeys(&keys);
	KeyInput key = TranslateKey(event, keys.modifiers);
	bool down = event.type() == QEvent::KeyPress;
	if (event.isAutoRepeat()) {
		// Only the last release ends a held key.
		if (!down)
			return;
		fRepeats = key.rawKey == fLastRepeatKey ? fRepeats + 1 : 1;
		key.repeat = fRepeats;
	} else
		fRepeats = 0;
	fLastRepeatKey = key.rawKey;
	fHub.Key(key, down);
}


void
QtDisplay::BeginRectTracking(BRect rect, uint32 style, BPoint from)
{
	fHub.BeginTracking(rect, style, from);
}


void
QtDisplay::EndRectTracking()
{
	fHub.EndTracking();
}


void
QtDisplay::OverlayChanged()
{
	// Called with the hub locked, so the painting, which asks the hub, comes later.
	if (fOverlayIsPending.exchange(true))
		return;
	fThread.Post([this] {
		fOverlayIsPending = false;
		RepaintOverlay();
	});
}


void
QtDisplay::RepaintOverlay()
{
	InputOverlay overlay = fHub.Overlay();
	BRect covered;
	for (const BRect& rect : {overlay.tracking, overlay.dragged}) {
		if (rect.IsValid())
			covered = covered.IsValid() ? covered | rect : rect;
	}
	BRect changed = covered;
	if (fOverlayArea.IsValid())
		changed = changed.IsValid() ? changed | fOverlayArea : fOverlayArea;
	fOverlayArea = covered;
	if (!changed.IsValid())
		return;

	for (QtHostWindow* window : fWindows) {
		QtWindow* host = window->Window();
		if (host == nullptr || !host->isExposed())
			continue;
		BRect part = changed.OffsetByCopy(-fHub.Frame(host->Stacked()).LeftTop());
		host->Paint(QRect(QPoint(static_cast<int>(part.left) - 1, static_cast<int>(part.top) - 1),
			QPoint(static_cast<int>(part.right) + 2, static_cast<int>(part.bottom) + 2)));
	}
}


void
QtDisplay::Sync()
{
	fThread.Run([] {});
}


void
QtDisplay::InjectPointer(BPoint screenWhere, uint32 buttons)
{
	fThread.Run([&] {
		PointerMoved();
		fHub.PointerAt(screenWhere, buttons, std::nullopt);
	});
}


void
QtDisplay::InjectWheel(float deltaX, float deltaY)
{
	fThread.Run([&] { fHub.Wheel(deltaX, deltaY, std::nullopt); });
}


void
QtDisplay::InjectKey(const InjectedKey& key, bool down)
{
	fThread.Run([&] { fHub.InjectKey(key, down); });
}


void
QtDisplay::InjectDrop(std::unique_ptr<BMessage> message, BPoint screenWhere)
{
	fThread.Run([&] { fHub.Drop(std::move(message), screenWhere); });
}


// #pragma mark - cursors


void
QtDisplay::SetApplicationCursor(std::shared_ptr<const CursorShape> shape)
{
	fThread.Post([this, shape = std::move(shape)] {
		fApplicationCursor = shape;
		UpdateCursors();
	});
}


void
QtDisplay::SetCursorHidden(bool hidden)
{
	fThread.Post([this, hidden] {
		fCursorHidden = hidden;
		UpdateCursors();
	});
}


void
QtDisplay::ObscureCursor()
{
	fThread.Post([this] {
		fCursorObscured = true;
		UpdateCursors();
	});
}


void
QtDisplay::PointerMoved()
{
	if (!fCursorObscured)
		return;
	fCursorObscured = false;
	UpdateCursors();
}


void
QtDisplay::UpdateCursors()
{
	for (QtHostWindow* window : fWindows) {
		if (window->Window() != nullptr)
			UpdateCursor(*window->Window());
	}
}


void
QtDisplay::UpdateCursor(QtWindow& window)
{
	if (fCursorHidden || fCursorObscured) {
		window.setCursor(Qt::BlankCursor);
		return;
	}
	bool hasOwn = window.cursorShape != nullptr;
	window.setCursor(QtCursorFor(hasOwn ? *window.cursorShape : *fApplicationCursor));
}


// #pragma mark - clipboard and pictures


status_t
QtDisplay::Get(BMessage* data)
{
	status_t status = B_ENTRY_NOT_FOUND;
	fThread.Run([&] {
		QClipboard* clipboard = QGuiApplication::clipboard();
		const QMimeData* content = clipboard->mimeData();
		if (content != nullptr && !clipboard->ownsClipboard())
			status = ReadMimeData(*content, data);
	});
	if (status == B_TIMED_OUT) {
		data->MakeEmpty();
		fprintf(stderr, "libbe: the program that has the clipboard does not answer\n");
	}
	return status;
}


status_t
QtDisplay::Put(const BMessage& data)
{
	bool done = fThread.Run([&] { QGuiApplication::clipboard()->setMimeData(MakeMimeData(data)); });
	return done ? B_OK : B_ERROR;
}


void
QtDisplay::Beep()
{
	// Only a terminal gives a sound without a sound system.
	if (isatty(STDERR_FILENO))
		fputc('\a', stderr);
}


status_t
QtDisplay::DecodePicture(const void* data, size_t size, Picture* picture)
{
	const QtUse use;
	if (!use)
		return B_ERROR;
	QByteArray bytes =
		QByteArray::fromRawData(static_cast<const char*>(data), static_cast<qsizetype>(size));
	QBuffer buffer(&bytes);
	QImageReader reader(&buffer);
	reader.setDecideFormatFromContent(true);
	QImage image = reader.read();
	if (image.isNull())
		return B_BAD_DATA;
	*picture = PictureOf(image);
	return B_OK;
}


status_t
QtDisplay::SavePicture(const Picture& picture, const char* path)
{
	if (picture.width <= 0 || picture.height <= 0)
		return B_BAD_VALUE;
	const QtUse use;
	if (!use)
		return B_ERROR;
	QImage image(reinterpret_cast<const uchar*>(picture.pixels.data()), picture.width,
		picture.height, picture.hasAlpha ? QImage::Format_ARGB32 : QImage::Format_RGB32);
	return image.save(QString::fromUtf8(path), "PNG") ? B_OK : B_ERROR;
}

} // namespace BPrivate

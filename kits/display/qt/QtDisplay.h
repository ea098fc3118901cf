// SPDX-License-Identifier: MIT
// The display on Qt: its thread, its windows, screens, cursors and the clipboard.
#ifndef DISPLAY_QT_DISPLAY_H
#define DISPLAY_QT_DISPLAY_H

#include <atomic>
#include <memory>
#include <mutex>
#include <optional>
#include <string>
#include <vector>

#include <QPoint>

#include "display/Display.h"
#include "display/InputHub.h"
#include "display/qt/DisplayThread.h"
#include "display/qt/QtFonts.h"

class QCursor;
class QImage;
class QKeyEvent;
class QWindow;

namespace BPrivate {

class HostEcho;
class QtHostWindow;
class QtWindow;

class QtDisplay : public Display {
public:
	/// \a managesFocus: the platform has no window manager.
	explicit QtDisplay(bool managesFocus);
	~QtDisplay() override;

	/// False when Qt cannot have any of \a platforms.
	bool Start(const std::string& platforms);
	/// At the program's end. When the connection was lost, that is with code 1 and at once.
	void Stop();
	/// Display thread: the connection to the host is broken. Asks the program to quit; does not return.
	[[noreturn]] void Lost();

	// Display
	const char* Name() const override;
	bool DrawsPixels() const override;
	std::unique_ptr<HostWindow> MakeWindow(BRect frame, const char* title,
		const HostWindowStyle& style, HostWindowClient* client) override;
	std::unique_ptr<Canvas> MakeCanvas(int32 width, int32 height, float scale) override;
	std::unique_ptr<Canvas> MakeCanvas(const PixelBuffer& buffer) override;
	FontEngine& Fonts() override;
	int32 CountScreens() override;
	BRect ScreenFrame(int32 index) override;
	status_t ReadScreen(BRect frame, Picture* picture) override;
	void Beep() override;
	void GetPointer(BPoint* screenWhere, uint32* buttons) override;
	void GetKeys(key_info* info) override;
	bigtime_t IdleTime() override;
	void BeginRectTracking(BRect rect, uint32 style, BPoint from) override;
	void EndRectTracking() override;
	void BeginDrag(
		const BMessage& message, BRect rect, const PixelBuffer* image, BPoint offset) override;
	status_t DecodePicture(const void* data, size_t size, Picture* picture) override;
	status_t SavePicture(const Picture& picture, const char* path) override;
	void Sync() override;
	void InjectPointer(BPoint screenWhere, uint32 buttons) override;
	void InjectWheel(float deltaX, float deltaY) override;
	void InjectKey(const InjectedKey& key, bool down) override;
	void InjectDrop(std::unique_ptr<BMessage> message, BPoint screenWhere) override;

	// CursorHost
	void SetApplicationCursor(std::shared_ptr<const CursorShape> shape) override;
	void SetCursorHidden(bool hidden) override;
	void ObscureCursor() override;

	// ClipboardExchange
	status_t Get(BMessage* data) override;
	status_t Put(const BMessage& data) override;

	// For the windows; display thread unless said otherwise.
	DisplayThread& Thread() { return fThread; }
	InputHub& Hub() { return fHub; }
	bool ManagesFocus() const { return fManagesFocus; }
	void Add(QtHostWindow* window);
	void Remove(QtHostWindow* window);
	bool Has(const QtHostWindow* window) const;
	/// Null when it has gone.
	QtWindow* WindowOf(const StackedWindow* stacked) const;
	/// Null where the host does at once what it is asked.
	HostEcho* Echo() const { return fEcho.get(); }
	/// The program's window at a place of the screen; not known where the host does not tell.
	std::optional<StackedWindow*> WindowUnder(QPoint globalPosition) const;
	/// Above which window \a window belongs.
	QWindow* WindowForTransients(const QtWindow* window) const;
	uint32 ModifiersNow(int qtModifiers);
	void HandleKey(const QKeyEvent& event);
	/// Whether the host carries what this program drags over other programs, too.
	bool IsDraggingOut() const { return fIsDraggingOut; }
	/// The program's window that the host's drag is over.
	StackedWindow* WindowUnderDrag() const { return fWindowUnderDrag; }
	void SetWindowUnderDrag(StackedWindow* window) { fWindowUnderDrag = window; }
	/// An obscured cursor shows again.
	void PointerMoved();
	void UpdateCursor(QtWindow& window);

private:
	void Connect();
	void ConnectScreens();
	void ReadScreens();
	void ScreensChanged();
	QImage PutScreenTogether(BRect frame, double ratio) const;
	void FocusChanged(QWindow* focus);
	void ApplicationStateChanged(bool active);
	QtWindow* FloatingWindow() const;
	void HideFloatingWindows();
	void TellActive(bool active);
	void OverlayChanged();
	void RepaintOverlay();
	bool CanDragOut() const;
	void DragOut(const BMessage& message, BPoint offset);
	void UpdateCursors();

	const bool fManagesFocus;
	DisplayThread fThread;
	InputHub fHub;
	QtFonts fFonts;
	std::vector<QtHostWindow*> fWindows;

	mutable std::mutex fScreensMutex;
	std::vector<BRect> fScreens;

	// Display thread only
	/// Left to the server in the end: Qt destroys no windows once the program is on its way out.
	std::unique_ptr<HostEcho> fEcho;
	std::shared_ptr<const CursorShape> fApplicationCursor;
	bool fCursorHidden;
	bool fCursorObscured;
	int32 fLastRepeatKey;
	int32 fRepeats;
	bool fIsActive;
	bool fToldActive;
	bool fIsDraggingOut;
	StackedWindow* fWindowUnderDrag;

	/// Where the last overlay was painted; screen coordinates.
	BRect fOverlayArea;

	std::atomic<bool> fOverlayIsPending;
	std::atomic<bool> fIsLost;
};

} // namespace BPrivate

#endif // DISPLAY_QT_DISPLAY_H

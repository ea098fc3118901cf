// SPDX-License-Identifier: MIT
// The host's window: shows the finished picture and hands events to the input hub. Display thread only.
#ifndef DISPLAY_QT_WINDOW_H
#define DISPLAY_QT_WINDOW_H

#include <atomic>
#include <memory>

#include <QElapsedTimer>
#include <QTimer>
#include <QWindow>

#include "display/HostWindow.h"
#include "display/SharedFrame.h"
#include "display/qt/ServerPixels.h"

class QBackingStore;
class QDragMoveEvent;
class QDropEvent;
class QMouseEvent;
class QPainter;
class QWheelEvent;

namespace BPrivate {

class QtDisplay;
class Surface;
struct StackedWindow;

class QtWindow : public QWindow {
public:
	QtWindow(QtDisplay& display, std::shared_ptr<Surface> surface, StackedWindow* stacked);
	~QtWindow() override;

	StackedWindow* Stacked() const { return fStacked; }
	void Apply(const HostWindowStyle& style);
	void SetLimits(const HostSizeLimits& limits);
	void MoveTo(BPoint leftTop);
	void ResizeTo(BSize size);
	void ShowWindow();
	void HideWindow();
	/// A floating window goes while another program is active, and comes back.
	void HideWhileInactive();
	void ShowAgain();
	void Minimize(bool minimized);
	/// The same as the user's doing, which the host reports.
	void MinimizeByUser(bool minimized);
	void ZoomByUser();
	/// Shows what has changed in the surface.
	void ShowDamage();
	/// Paints \a region of the picture, and what follows the pointer on top.
	void Paint(const QRegion& region);
	/// All of it, with the window's left-top at (0, 0).
	void PaintPicture(QPainter& painter);
	void CheckScale();

	BRect FrameWithBorder() const;
	static BRect RectOf(const QRect& geometry);
	static QRect GeometryOf(BRect frame);
	/// B_PRIMARY_MOUSE_BUTTON, ...
	static uint32 ButtonsOf(Qt::MouseButtons pressed);

	/// The shape over this window, null: the application's.
	std::shared_ptr<const CursorShape> cursorShape;
	std::atomic<float> scale;

protected:
	bool event(QEvent* event) override;
	void exposeEvent(QExposeEvent* event) override;
	void resizeEvent(QResizeEvent* event) override;
	void moveEvent(QMoveEvent* event) override;

private:
	void AskHost();
	void HostAnswered();
	bool LetServerShow(const QRegion& region);
	void PlanRest();
	void Rest();
	void GeometryChanged();
	void ApplyLimits();
	void HandleMouse(QMouseEvent* event);
	void HandleWheel(QWheelEvent* event);
	void HandleState();
	void HandleDragOver(QDragMoveEvent* event);
	void HandleDrop(QDropEvent* event);

	QtDisplay& fDisplay;
	/// What is on its way to the host. Null before the first painting, and after a rest.
	std::unique_ptr<QBackingStore> fBackingStore;
	/// The window's size when Qt painted it last.
	QSize fPaintedSize;
	ServerPixels fServerPixels;
	std::shared_ptr<Surface> fSurface;
	QElapsedTimer fLastChange;
	QTimer fRestTimer;
	StackedWindow* fStacked;
	HostWindowStyle fStyle;
	HostSizeLimits fLimits;
	bool fIsMinimized;
	bool fIsZoomed;
	bool fIsAway;
	SharedFrame fFrame;
};

} // namespace BPrivate

#endif // DISPLAY_QT_WINDOW_H

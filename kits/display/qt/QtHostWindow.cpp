// SPDX-License-Identifier: MIT
// A host window as the kits see it: each call is carried to the display thread.
#include "display/qt/QtHostWindow.h"

#include <QGuiApplication>
#include <QString>

#include <Region.h>
#include <Window.h>

#include "display/FontEngine.h"
#include "display/qt/DisplayThread.h"
#include "display/qt/QtCanvas.h"
#include "display/qt/QtDisplay.h"
#include "display/qt/QtWindow.h"
#include "display/qt/Surface.h"

namespace BPrivate {

QtHostWindow::QtHostWindow(QtDisplay& display, BRect frame, const char* title,
	const HostWindowStyle& style, HostWindowClient* client)
	: fDisplay(display),
	  fSurface(std::make_shared<Surface>()),
	  fIsThere(false)
{
	fStacked.client = client;
	fStacked.frame = frame;
	fStacked.style = style;
	fIsThere = fDisplay.Thread().Run([&] {
		fDisplay.Hub().AddWindow(&fStacked);
		fWindow = std::make_unique<QtWindow>(fDisplay, fSurface, &fStacked);
		fWindow->setTitle(QString::fromUtf8(title));
		fDisplay.Add(this);
	});
}


QtHostWindow::~QtHostWindow()
{
	fDisplay.Hub().RemoveWindow(&fStacked);
	bool removed = fDisplay.Thread().Run([&] {
		fDisplay.Remove(this);
		fWindow.reset();
		// The host's events that were under way, word of the focus above all, have named it again.
		fDisplay.Hub().RemoveWindow(&fStacked);
	});
	if (removed)
		return;
	// The display has ended, which took the host's window apart and may have named it, too; or it is lost: without
	// its thread the window cannot be taken apart.
	static_cast<void>(fWindow.release());
	fDisplay.Hub().RemoveWindow(&fStacked);
}


void
QtHostWindow::Detach()
{
	fWindow.reset();
}


void
QtHostWindow::WithWindow(const std::function<void(QtWindow&)>& task) const
{
	fDisplay.Thread().Run([&] {
		if (fWindow != nullptr)
			task(*fWindow);
	});
}


void
QtHostWindow::MoveTo(BPoint leftTop)
{
	WithWindow([&](QtWindow& window) { window.MoveTo(leftTop); });
}


void
QtHostWindow::ResizeTo(BSize size)
{
	WithWindow([&](QtWindow& window) { window.ResizeTo(size); });
}


void
QtHostWindow::SetTitle(const char* title)
{
	WithWindow([&](QtWindow& window) { window.setTitle(QString::fromUtf8(title)); });
}


void
QtHostWindow::SetStyle(const HostWindowStyle& style)
{
	fDisplay.Hub().SetStyle(&fStacked, style);
	WithWindow([&](QtWindow& window) { window.Apply(style); });
}


void
QtHostWindow::SetSizeLimits(const HostSizeLimits& limits)
{
	WithWindow([&](QtWindow& window) { window.SetLimits(limits); });
}


void
QtHostWindow::Show()
{
	auto show = [&] {
		if (fWindow == nullptr)
			return;
		fWindow->ShowWindow();
		fDisplay.Hub().SetVisible(&fStacked, true);
	};
	// The first window's text needs the font, and looking for it takes as long as the host takes for the window.
	fDisplay.Thread().Run(show, [&] {
		uint16 family;
		uint16 style;
		float size;
		fDisplay.Fonts().GetStandardFont(kPlainFont, &family, &style, &size);
	});
}


void
QtHostWindow::Hide()
{
	WithWindow([&](QtWindow& window) {
		fDisplay.Hub().SetVisible(&fStacked, false);
		window.HideWindow();
	});
}


void
QtHostWindow::SetMinimized(bool minimized)
{
	WithWindow([&](QtWindow& window) {
		fDisplay.Hub().SetMinimized(&fStacked, minimized);
		window.Minimize(minimized);
	});
}


void
QtHostWindow::Activate()
{
	WithWindow([&](QtWindow& window) {
		if (!window.isVisible())
			return;
		if ((fStacked.style.flags & B_AVOID_FRONT) == 0)
			window.raise();
		if ((window.flags() & Qt::WindowDoesNotAcceptFocus) == 0)
			window.requestActivate();
		if (fDisplay.ManagesFocus())
			fDisplay.Hub().Activate(&fStacked);
		else if ((fStacked.style.flags & B_AVOID_FRONT) == 0)
			fDisplay.Hub().Raise(&fStacked);
	});
}


void
QtHostWindow::Deactivate()
{
	fDisplay.Hub().Deactivate(&fStacked);
}


void
QtHostWindow::SendBehind(HostWindow* other)
{
	auto above = static_cast<QtHostWindow*>(other);
	WithWindow([&](QtWindow& window) {
		fDisplay.Hub().SendBehind(&fStacked, above != nullptr ? &above->fStacked : nullptr);
		window.lower();
		// A host has no "below that one": all that belong below follow.
		for (StackedWindow* below : fDisplay.Hub().WindowsBelow(&fStacked)) {
			QtWindow* lower = fDisplay.WindowOf(below);
			if (lower != nullptr)
				lower->lower();
		}
	});
}


bool
QtHostWindow::IsFront() const
{
	return fDisplay.Hub().IsFront(&fStacked);
}


void
QtHostWindow::AddToSubset(HostWindow* member)
{
	fDisplay.Hub().AddToSubset(&fStacked, &static_cast<QtHostWindow*>(member)->fStacked);
}


void
QtHostWindow::RemoveFromSubset(HostWindow* member)
{
	fDisplay.Hub().RemoveFromSubset(&fStacked, &static_cast<QtHostWindow*>(member)->fStacked);
}


BRect
QtHostWindow::DecoratorFrame() const
{
	BRect frame = fDisplay.Hub().Frame(&fStacked);
	WithWindow([&](QtWindow& window) {
		if (window.isVisible())
			frame = window.FrameWithBorder();
	});
	return frame;
}


float
QtHostWindow::Scale() const
{
	float scale = 1;
	WithWindow([&](QtWindow& window) { scale = window.scale; });
	return scale;
}


void
QtHostWindow::Present(const Canvas& canvas, const BRegion& region)
{
	if (!fSurface->Take(static_cast<const QtCanvas&>(canvas), region))
		return;
	fDisplay.Thread().Post([surface = fSurface, this, &display = fDisplay] {
		// The window may have gone before its turn came.
		if (display.Has(this) && fWindow != nullptr)
			fWindow->ShowDamage();
	});
}


void
QtHostWindow::Sync()
{
	fDisplay.Thread().Run([] {});
}


Picture
QtHostWindow::ReadPicture() const
{
	return fSurface->Copy();
}


void
QtHostWindow::SetCursor(std::shared_ptr<const CursorShape> cursor)
{
	fDisplay.Thread().Post([this, &display = fDisplay, cursor = std::move(cursor)] {
		if (!display.Has(this) || fWindow == nullptr)
			return;
		fWindow->cursorShape = cursor;
		display.UpdateCursor(*fWindow);
	});
}


void
QtHostWindow::SetPointerGrab(bool grab)
{
	fDisplay.Hub().SetGrab(&fStacked, grab);
	// Elsewhere there is nothing to grab, or no way to.
	WithWindow([&](QtWindow& window) {
		if (QGuiApplication::platformName() == QLatin1String("xcb"))
			window.setMouseGrabEnabled(grab);
	});
}


void
QtHostWindow::InjectFrame(BRect frame)
{
	WithWindow([&](QtWindow& window) {
		window.setGeometry(static_cast<int>(frame.left), static_cast<int>(frame.top),
			frame.IntegerWidth() + 1, frame.IntegerHeight() + 1);
	});
}


void
QtHostWindow::InjectMinimized(bool minimized)
{
	WithWindow([&](QtWindow& window) { window.MinimizeByUser(minimized); });
}


void
QtHostWindow::InjectZoom()
{
	WithWindow([](QtWindow& window) { window.ZoomByUser(); });
}

} // namespace BPrivate

// SPDX-License-Identifier: MIT
// A host window as the kits see it: each call is carried to the display thread.
#ifndef DISPLAY_QT_HOST_WINDOW_H
#define DISPLAY_QT_HOST_WINDOW_H

#include <functional>
#include <memory>

#include "display/HostWindow.h"
#include "display/WindowStack.h"

namespace BPrivate {

class QtDisplay;
class QtWindow;
class Surface;

class QtHostWindow : public HostWindow {
public:
	/// Makes the host's window; IsThere() is false when the display has gone.
	QtHostWindow(QtDisplay& display, BRect frame, const char* title, const HostWindowStyle& style,
		HostWindowClient* client);
	~QtHostWindow() override;

	/// Display thread.
	QtWindow* Window() const { return fWindow.get(); }
	bool IsThere() const { return fIsThere; }
	/// Display thread: the host's window goes now, this object stays.
	void Detach();

	void MoveTo(BPoint leftTop) override;
	void ResizeTo(BSize size) override;
	void SetTitle(const char* title) override;
	void SetStyle(const HostWindowStyle& style) override;
	void SetSizeLimits(const HostSizeLimits& limits) override;
	void Show() override;
	void Hide() override;
	void SetMinimized(bool minimized) override;
	void Activate() override;
	void Deactivate() override;
	void SendBehind(HostWindow* other) override;
	bool IsFront() const override;
	void AddToSubset(HostWindow* member) override;
	void RemoveFromSubset(HostWindow* member) override;
	BRect DecoratorFrame() const override;
	float Scale() const override;
	void Present(const Canvas& canvas, const BRegion& region) override;
	void Sync() override;
	Picture ReadPicture() const override;
	void SetCursor(std::shared_ptr<const CursorShape> cursor) override;
	void SetPointerGrab(bool grab) override;
	void InjectFrame(BRect frame) override;
	void InjectMinimized(bool minimized) override;
	void InjectZoom() override;

private:
	/// Runs in the display thread while the host's window is there, and waits.
	void WithWindow(const std::function<void(QtWindow&)>& task) const;

	QtDisplay& fDisplay;
	std::shared_ptr<Surface> fSurface;
	StackedWindow fStacked;
	/// Display thread only.
	std::unique_ptr<QtWindow> fWindow;
	bool fIsThere;
};

} // namespace BPrivate

#endif // DISPLAY_QT_HOST_WINDOW_H

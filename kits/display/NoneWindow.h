// SPDX-License-Identifier: MIT
// A window that is on no screen: it keeps its frame and states and says what became of them.
#ifndef DISPLAY_NONE_WINDOW_H
#define DISPLAY_NONE_WINDOW_H

#include <mutex>

#include "display/InputHub.h"
#include "display/SharedFrame.h"

namespace BPrivate {

class NoneWindow : public HostWindow {
public:
	NoneWindow(InputHub& hub, BRect frame, const HostWindowStyle& style, HostWindowClient* client);
	~NoneWindow() override;

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
	InputHub& fHub;
	StackedWindow fStacked;
	/// Taken before the hub's lock.
	std::mutex fFrameMutex;
	SharedFrame fFrame;
};

} // namespace BPrivate

#endif // DISPLAY_NONE_WINDOW_H

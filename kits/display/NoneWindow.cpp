// SPDX-License-Identifier: MIT
// A window that is on no screen: it keeps its frame and states and says what became of them.
#include "display/NoneWindow.h"

#include <AppDefs.h>

#include "display/PixelBuffer.h"

namespace BPrivate {

NoneWindow::NoneWindow(
	InputHub& hub, BRect frame, const HostWindowStyle& style, HostWindowClient* client)
	: fHub(hub),
	  fFrame(frame)
{
	fStacked.client = client;
	fStacked.frame = frame;
	fStacked.style = style;
	fHub.AddWindow(&fStacked);
}


NoneWindow::~NoneWindow()
{
	fHub.RemoveWindow(&fStacked);
}


void
NoneWindow::MoveTo(BPoint leftTop)
{
	std::lock_guard<std::mutex> lock(fFrameMutex);
	fFrame.MoveTo(leftTop);
	fHub.SetFrame(&fStacked, fFrame.Known());
}


void
NoneWindow::ResizeTo(BSize size)
{
	std::lock_guard<std::mutex> lock(fFrameMutex);
	fFrame.ResizeTo(size);
	fHub.SetFrame(&fStacked, fFrame.Known());
}


void
NoneWindow::SetTitle(const char*)
{
}


void
NoneWindow::SetStyle(const HostWindowStyle& style)
{
	fHub.SetStyle(&fStacked, style);
}


void
NoneWindow::SetSizeLimits(const HostSizeLimits&)
{
	// The window keeps its limits itself, and no user pulls at this one.
}


void
NoneWindow::Show()
{
	fHub.SetVisible(&fStacked, true);
}


void
NoneWindow::Hide()
{
	fHub.SetVisible(&fStacked, false);
}


void
NoneWindow::SetMinimized(bool minimized)
{
	fHub.SetMinimized(&fStacked, minimized);
}


void
NoneWindow::Activate()
{
	fHub.Activate(&fStacked);
}


void
NoneWindow::Deactivate()
{
	fHub.Deactivate(&fStacked);
}


void
NoneWindow::SendBehind(HostWindow* other)
{
	auto window = static_cast<NoneWindow*>(other);
	fHub.SendBehind(&fStacked, window != nullptr ? &window->fStacked : nullptr);
}


bool
NoneWindow::IsFront() const
{
	return fHub.IsFront(&fStacked);
}


void
NoneWindow::AddToSubset(HostWindow* member)
{
	fHub.AddToSubset(&fStacked, &static_cast<NoneWindow*>(member)->fStacked);
}


void
NoneWindow::RemoveFromSubset(HostWindow* member)
{
	fHub.RemoveFromSubset(&fStacked, &static_cast<NoneWindow*>(member)->fStacked);
}


BRect
NoneWindow::DecoratorFrame() const
{
	return fHub.Frame(&fStacked);
}


float
NoneWindow::Scale() const
{
	return 1;
}


void
NoneWindow::Present(const Canvas&, const BRegion&)
{
}


void
NoneWindow::Sync()
{
}


Picture
NoneWindow::ReadPicture() const
{
	return {};
}


void
NoneWindow::SetCursor(std::shared_ptr<const CursorShape>)
{
}


void
NoneWindow::SetPointerGrab(bool grab)
{
	fHub.SetGrab(&fStacked, grab);
}


void
NoneWindow::InjectFrame(BRect frame)
{
	std::lock_guard<std::mutex> lock(fFrameMutex);
	const BRect before = fFrame.Known();
	fFrame.HostHas(frame);
	TellFrame(fHub, &fStacked, fFrame, before);
}


void
NoneWindow::InjectMinimized(bool minimized)
{
	fHub.SetMinimized(&fStacked, minimized);
	auto message = std::make_unique<BMessage>(B_MINIMIZE);
	message->AddBool("minimize", minimized);
	fHub.Deliver(&fStacked, std::move(message));
}


void
NoneWindow::InjectZoom()
{
	// It has no buttons.
}

} // namespace BPrivate

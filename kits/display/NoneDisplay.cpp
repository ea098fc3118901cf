// SPDX-License-Identifier: MIT
// The display that draws nothing: windows have frames and states, input can be injected.
#include "display/NoneDisplay.h"

#include "display/NoneCanvas.h"
#include "display/NoneWindow.h"
#include "display/Utf8.h"

namespace BPrivate {

BPoint
NoneCanvas::DrawString(const char* text, int32 length, BPoint where, const escapement_delta* delta)
{
	where.x += fFonts.StringWidth(FontKey::Of(fState.font), text, length);
	const char* end = text + length;
	while (delta != nullptr && text < end)
		where.x += NextCharacter(&text, end) == ' ' ? delta->space : delta->nonspace;
	return where;
}


NoneDisplay::NoneDisplay()
	: fHub(true)
{
}


const char*
NoneDisplay::Name() const
{
	return "none";
}


bool
NoneDisplay::DrawsPixels() const
{
	return false;
}


std::unique_ptr<HostWindow>
NoneDisplay::MakeWindow(
	BRect frame, const char*, const HostWindowStyle& style, HostWindowClient* client)
{
	return std::make_unique<NoneWindow>(fHub, frame, style, client);
}


std::unique_ptr<Canvas>
NoneDisplay::MakeCanvas(int32 width, int32 height, float scale)
{
	return std::make_unique<NoneCanvas>(fFonts, width, height, scale);
}


std::unique_ptr<Canvas>
NoneDisplay::MakeCanvas(const PixelBuffer& buffer)
{
	return std::make_unique<NoneCanvas>(fFonts, buffer.width, buffer.height, 1);
}


FontEngine&
NoneDisplay::Fonts()
{
	return fFonts;
}


int32
NoneDisplay::CountScreens()
{
	return 1;
}


BRect
NoneDisplay::ScreenFrame(int32)
{
	return BRect(0, 0, 1023, 767);
}


status_t
NoneDisplay::ReadScreen(BRect, Picture*)
{
	return B_UNSUPPORTED;
}


void
NoneDisplay::Beep()
{
}


void
NoneDisplay::GetPointer(BPoint* screenWhere, uint32* buttons)
{
	fHub.GetPointer(screenWhere, buttons);
}


void
NoneDisplay::GetKeys(key_info* info)
{
	fHub.GetKeys(info);
}


bigtime_t
NoneDisplay::IdleTime()
{
	return fHub.IdleTime();
}


void
NoneDisplay::BeginRectTracking(BRect rect, uint32 style, BPoint from)
{
	fHub.BeginTracking(rect, style, from);
}


void
NoneDisplay::EndRectTracking()
{
	fHub.EndTracking();
}


void
NoneDisplay::BeginDrag(const BMessage& message, BRect rect, const PixelBuffer*, BPoint offset)
{
	fHub.BeginDrag(message, rect, nullptr, offset);
}


status_t
NoneDisplay::DecodePicture(const void*, size_t, Picture*)
{
	return B_UNSUPPORTED;
}


status_t
NoneDisplay::SavePicture(const Picture&, const char*)
{
	return B_UNSUPPORTED;
}


void
NoneDisplay::InjectPointer(BPoint screenWhere, uint32 buttons)
{
	fHub.PointerAt(screenWhere, buttons, std::nullopt);
}


void
NoneDisplay::InjectWheel(float deltaX, float deltaY)
{
	fHub.Wheel(deltaX, deltaY, std::nullopt);
}


void
NoneDisplay::InjectKey(const InjectedKey& key, bool down)
{
	fHub.InjectKey(key, down);
}


void
NoneDisplay::InjectDrop(std::unique_ptr<BMessage> message, BPoint screenWhere)
{
	fHub.Drop(std::move(message), screenWhere);
}


void
NoneDisplay::SetApplicationCursor(std::shared_ptr<const CursorShape>)
{
}


void
NoneDisplay::SetCursorHidden(bool)
{
}


void
NoneDisplay::ObscureCursor()
{
}


status_t
NoneDisplay::Get(BMessage*)
{
	return B_ENTRY_NOT_FOUND;
}


status_t
NoneDisplay::Put(const BMessage&)
{
	return B_OK;
}

} // namespace BPrivate

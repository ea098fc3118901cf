// SPDX-License-Identifier: MIT
// BScreen: the display's screens.
#include <Screen.h>

#include <algorithm>
#include <memory>

#include <Bitmap.h>
#include <InterfaceDefs.h>
#include <Window.h>

#include "display/Display.h"
#include "display/PixelBuffer.h"

using BPrivate::Display;
using BPrivate::Picture;

BScreen::BScreen(screen_id id)
	: fID(id)
{
}


BScreen::BScreen(BWindow* window)
	: fID(B_MAIN_SCREEN_ID)
{
	if (window != nullptr)
		fID.id = Display::Get().ScreenAt(window->Frame());
}


BScreen::~BScreen() {}


bool
BScreen::IsValid()
{
	return fID.id >= 0 && fID.id < Display::Get().CountScreens();
}


color_space
BScreen::ColorSpace()
{
	return B_RGB32;
}


BRect
BScreen::Frame()
{
	return IsValid() ? Display::Get().ScreenFrame(fID.id) : BRect();
}


screen_id
BScreen::ID()
{
	return fID;
}


status_t
BScreen::WaitForRetrace()
{
	return WaitForRetrace(B_INFINITE_TIMEOUT);
}


status_t
BScreen::WaitForRetrace(bigtime_t)
{
	return B_ERROR;
}


uint8
BScreen::IndexForColor(rgb_color color)
{
	return IndexForColor(color.red, color.green, color.blue, color.alpha);
}


uint8
BScreen::IndexForColor(uint8 red, uint8 green, uint8 blue, uint8 alpha)
{
	if (make_color(red, green, blue, alpha) == B_TRANSPARENT_COLOR)
		return B_TRANSPARENT_MAGIC_CMAP8;
	return system_colors()->index_map[(red >> 3) << 10 | (green >> 3) << 5 | blue >> 3];
}


rgb_color
BScreen::ColorForIndex(uint8 index)
{
	return system_colors()->color_list[index];
}


const color_map*
BScreen::ColorMap()
{
	return system_colors();
}


status_t
BScreen::GetBitmap(BBitmap** _bitmap, bool drawCursor, BRect* frame)
{
	if (_bitmap == nullptr)
		return B_BAD_VALUE;

	BRect area = frame != nullptr ? *frame : Frame();
	auto bitmap = std::make_unique<BBitmap>(area.OffsetToCopy(B_ORIGIN), B_RGB32);
	status_t status = bitmap->InitCheck();
	if (status == B_OK)
		status = ReadBitmap(bitmap.get(), drawCursor, &area);
	if (status == B_OK)
		*_bitmap = bitmap.release();
	return status;
}


status_t
BScreen::ReadBitmap(BBitmap* bitmap, bool, BRect* frame)
{
	if (bitmap == nullptr || bitmap->InitCheck() != B_OK)
		return B_BAD_VALUE;

	Picture picture;
	status_t status = Display::Get().ReadScreen(frame != nullptr ? *frame : Frame(), &picture);
	if (status != B_OK)
		return status;
	if (picture.width <= 0 || picture.height <= 0)
		return B_ERROR;
	return bitmap->ImportBits(picture.pixels.data(), picture.width * picture.height * 4,
		picture.width * 4, B_RGB32, B_ORIGIN, bitmap->Bounds().LeftTop(),
		BSize(picture.width - 1, picture.height - 1));
}


rgb_color
BScreen::DesktopColor()
{
	return ui_color(B_DESKTOP_COLOR);
}


rgb_color
BScreen::DesktopColor(uint32)
{
	return DesktopColor();
}


// The desktop is the host's: the colour is the one that programs of this kit are told.
void
BScreen::SetDesktopColor(rgb_color color, bool)
{
	set_ui_color(B_DESKTOP_COLOR, color);
}


void
BScreen::SetDesktopColor(rgb_color color, uint32, bool stick)
{
	SetDesktopColor(color, stick);
}

// SPDX-License-Identifier: MIT
// Uses the test's windows like a person, and reads back what they show.
#include "support/Robot.h"

#include <algorithm>

#include <String.h>
#include <Window.h>

#include "display/Display.h"
#include "display/KeyMap.h"
#include "display/Robot.h"
#include "support/Patience.h"

namespace {

const bigtime_t kLimit = 10000000;
// How long a window may be busy before it is not asked any more.
const bigtime_t kBusyTime = 300000;

} // namespace


rgb_color
WindowPicture::At(int32 x, int32 y) const
{
	if (x < 0 || y < 0 || x >= width || y >= height)
		return {0, 0, 0, 0};
	uint32 pixel = pixels[static_cast<size_t>(y) * width + x];
	return {static_cast<uint8>(pixel >> 16), static_cast<uint8>(pixel >> 8),
		static_cast<uint8>(pixel), 255};
}


int32
WindowPicture::Count(BRect rect, rgb_color color) const
{
	int32 count = 0;
	for (int32 y = static_cast<int32>(rect.top); y <= rect.bottom; y++) {
		for (int32 x = static_cast<int32>(rect.left); x <= rect.right; x++)
			count += At(x, y) == color ? 1 : 0;
	}
	return count;
}


bool
WindowPicture::SameIn(const WindowPicture& other, BRect rect) const
{
	for (int32 y = static_cast<int32>(rect.top); y <= rect.bottom; y++) {
		for (int32 x = static_cast<int32>(rect.left); x <= rect.right; x++) {
			if (At(x, y) != other.At(x, y))
				return false;
		}
	}
	return true;
}


bool
WindowPicture::SavePng(const char* path) const
{
	BPrivate::Picture picture{width, height, false, pixels};
	return BPrivate::Display::Get().SavePicture(picture, path) == B_OK;
}


// #pragma mark - Robot


Robot::Robot()
	: fRobot(std::make_unique<BPrivate::Robot>(kLimit * Patience()))
{
}


Robot::Robot(BWindow* window)
	: fRobot(std::make_unique<BPrivate::Robot>(kLimit * Patience())),
	  fWindow(window)
{
	fRobot->Settle();
}


Robot::~Robot() = default;


void
Robot::SetLimit(double seconds)
{
	fRobot->SetLimit(static_cast<bigtime_t>(seconds * 1000000) * Patience());
}


bool
Robot::WaitForWindow(const char* title)
{
	return fRobot->WaitForWindow(title, &fWindow) == B_OK;
}


bool
Robot::WaitForNoWindow(const char* title)
{
	return fRobot->WaitForNoWindow(title) == B_OK;
}


BPoint
Robot::OnScreen(BPoint where)
{
	// A window whose thread waits for a menu cannot be asked: it stands where it stood.
	const bigtime_t limit = fRobot->Limit();
	if (fKnownWindow == fWindow)
		fRobot->SetLimit(std::min<bigtime_t>(limit, kBusyTime));
	BRect frame;
	if (fRobot->GetWindowFrame(fWindow, &frame) == B_OK) {
		fKnownWindow = fWindow;
		fKnownPlace = frame.LeftTop();
	}
	fRobot->SetLimit(limit);
	return where + fKnownPlace;
}


void
Robot::MoveTo(BPoint where)
{
	fRobot->MoveTo(OnScreen(where));
}


void
Robot::Press(uint32 button)
{
	fRobot->Press(button);
}


void
Robot::Release()
{
	fRobot->Release();
}


void
Robot::Click(BPoint where, int32 count, uint32 button)
{
	fRobot->Click(OnScreen(where), count, button);
}


void
Robot::Drag(BPoint from, BPoint to, int32 steps)
{
	fRobot->Drag(OnScreen(from), OnScreen(to), steps);
}


void
Robot::Hold(uint32 modifiers)
{
	const struct {
		uint32 bits;
		int32 rawKey;
	} keys[] = {{B_SHIFT_KEY, BPrivate::kRawLeftShift}, {B_COMMAND_KEY, BPrivate::kRawLeftCommand},
		{B_CONTROL_KEY, BPrivate::kRawLeftControl}, {B_OPTION_KEY, BPrivate::kRawLeftOption}};
	for (const auto& key : keys) {
		const bool down = (modifiers & key.bits) != 0;
		if (down == ((fHeld & key.bits) != 0))
			continue;
		fHeld ^= key.bits;
		BPrivate::Display::Get().InjectKey({key.rawKey, "", fHeld}, down);
	}
	Settle();
}


void
Robot::Wheel(float down, float right)
{
	fRobot->Wheel(right, down);
}


bool
Robot::ClickView(const char* view, int32 count)
{
	return fRobot->ClickView(fWindow, view, count) == B_OK;
}


bool
Robot::ClickItem(const char* label)
{
	return fRobot->ClickItem(label) == B_OK;
}


bool
Robot::FindItem(const char* label, BPoint* middle)
{
	BRect frame;
	if (fRobot->GetItemFrame(label, &frame) != B_OK)
		return false;
	*middle = BPoint(static_cast<int32>(frame.left + frame.right) / 2,
				  static_cast<int32>(frame.top + frame.bottom) / 2)
		- OnScreen(B_ORIGIN);
	return true;
}


bool
Robot::FindView(const char* view, BPoint* middle)
{
	BRect frame;
	if (fRobot->GetViewFrame(fWindow, view, &frame) != B_OK || !frame.IsValid())
		return false;
	BPoint leftTop = OnScreen(BPoint(0, 0));
	middle->Set(
		(frame.left + frame.right) / 2 - leftTop.x, (frame.top + frame.bottom) / 2 - leftTop.y);
	return true;
}


void
Robot::Type(const char* text)
{
	fRobot->Type(text);
}


bool
Robot::Key(const char* key)
{
	return fRobot->Key(key) == B_OK;
}


bool
Robot::Settle()
{
	return fRobot->Settle();
}


std::string
Robot::Text(const char* view)
{
	BString text;
	fRobot->GetText(fWindow, view, &text);
	return text.String();
}


int32
Robot::Value(const char* view)
{
	int32 value = -1;
	fRobot->GetValue(fWindow, view, &value);
	return value;
}


bool
Robot::WaitForText(const char* view, const char* text)
{
	BString found;
	return fRobot->WaitForText(fWindow, view, text, &found) == B_OK;
}


WindowPicture
Robot::Picture()
{
	fRobot->Settle();
	BPrivate::Picture picture;
	fRobot->ReadWindow(fWindow, &picture);
	return {picture.width, picture.height, std::move(picture.pixels)};
}

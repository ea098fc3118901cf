// SPDX-License-Identifier: MIT
// The picture of the screen, at all scales.
#include <memory>

#include <gtest/gtest.h>

#include <Region.h>

#include "RecordingClient.h"
#include "display/Canvas.h"
#include "display/Display.h"
#include "display/HostWindow.h"
#include "display/PixelBuffer.h"
#include "support/Printers.h"

using BPrivate::Display;
using BPrivate::HostWindow;
using BPrivate::Picture;

namespace {

/// A window that is shown, all in one colour but for one rect.
std::unique_ptr<HostWindow>
ShowWindow(RecordingClient* client, BRect frame, rgb_color color, BRect part, rgb_color partColor)
{
	std::unique_ptr<HostWindow> window =
		Display::Get().MakeWindow(frame, "Test", BPrivate::HostWindowStyle(), client);
	const BRect bounds = frame.OffsetToCopy(0, 0);
	auto canvas = Display::Get().MakeCanvas(
		bounds.IntegerWidth() + 1, bounds.IntegerHeight() + 1, window->Scale());
	BPrivate::CanvasState state;
	state.highColor = color;
	canvas->SetState(state);
	canvas->FillRect(bounds, B_SOLID_HIGH);
	state.highColor = partColor;
	canvas->SetState(state);
	canvas->FillRect(part, B_SOLID_HIGH);
	window->Show();
	window->Present(*canvas, BRegion(bounds));
	return window;
}

} // namespace


TEST(ScreenPictureTest, EachWindowIsAtItsPlaceInTheirOrder)
{
	const rgb_color blue = {0, 0, 255, 255};
	const rgb_color green = {0, 255, 0, 255};
	const rgb_color red = {255, 0, 0, 255};
	RecordingClient client;
	auto lower = ShowWindow(&client, BRect(50, 40, 149, 99), blue, BRect(10, 10, 19, 19), red);
	auto upper = ShowWindow(&client, BRect(90, 50, 109, 69), green, BRect(0, 0, 1, 1), green);
	upper->Sync();

	Picture screen;
	const float scale = upper->Scale();
	ASSERT_EQ(Display::Get().ReadScreen(BRect(40, 30, 159, 109), &screen), B_OK);
	ASSERT_EQ(screen.width, 120 * scale);
	ASSERT_EQ(screen.height, 80 * scale);
	auto pixel = [&](int32 x, int32 y) {
		const int32 column = static_cast<int32>((x - 40) * scale);
		const int32 row = static_cast<int32>((y - 30) * scale);
		return screen.pixels[row * screen.width + column] & 0xffffff;
	};
	EXPECT_EQ(pixel(48, 42), 0x000000u);
	EXPECT_EQ(pixel(50, 40), 0x0000ffu);
	EXPECT_EQ(pixel(60, 50), 0xff0000u);
	EXPECT_EQ(pixel(68, 58), 0xff0000u);
	EXPECT_EQ(pixel(70, 58), 0x0000ffu);
	EXPECT_EQ(pixel(88, 60), 0x0000ffu);
	EXPECT_EQ(pixel(90, 50), 0x00ff00u);
	EXPECT_EQ(pixel(108, 68), 0x00ff00u);
	EXPECT_EQ(pixel(110, 70), 0x0000ffu);
	EXPECT_EQ(pixel(148, 98), 0x0000ffu);
	EXPECT_EQ(pixel(150, 98), 0x000000u);
}
